// SPDX-License-Identifier: MIT
// The four ways to stretch a picture, each with one that suits it.
#include "FramesPage.h"

#include <functional>

#include <QtGui/QPainter>
#include <QtGui/QRadialGradient>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QSlider>
#include <QtWidgets/QVBoxLayout>

#include "indicators/BorderIcon.h"

namespace gallery
{
namespace
{
constexpr int s_size = 48;
constexpr int s_border = 16;

const QRectF s_centre(s_border, s_border, s_size - 2 * s_border, s_size - 2 * s_border);

QPixmap picture(const std::function<void(QPainter&)>& draw)
{
    QPixmap result(s_size, s_size);
    result.fill(Qt::transparent);
    QPainter painter(&result);
    painter.setRenderHint(QPainter::Antialiasing);
    draw(painter);
    return result;
}

// Four brackets. The edges are empty: with a border that keeps its width they are drawn only once.
void drawFinder(QPainter& painter, const QColor& strong, const QColor& faint)
{
    QColor ground = faint;
    ground.setAlpha(70);
    painter.fillRect(s_centre, ground);
    painter.setPen(QPen(faint, 1.5));
    painter.setClipRect(s_centre);
    painter.drawLine(s_centre.bottomLeft(), s_centre.topRight());
    painter.setClipping(false);
    painter.setPen(QPen(strong, 3, Qt::SolidLine, Qt::SquareCap, Qt::MiterJoin));
    const double near = 2;
    const double far = s_size - 3;
    const double arm = s_border - 3;
    painter.drawPolyline(QPolygonF({{near, arm}, {near, near}, {arm, near}}));
    painter.drawPolyline(QPolygonF({{far - arm + near, near}, {far, near}, {far, arm}}));
    painter.drawPolyline(QPolygonF({{near, far - arm + near}, {near, far}, {arm, far}}));
    painter.drawPolyline(QPolygonF({{far - arm + near, far}, {far, far}, {far, far - arm + near}}));
}

void drawMark(QPainter& painter, const QColor& strong)
{
    painter.setPen(Qt::NoPen);
    painter.setBrush(strong);
    painter.drawEllipse(s_centre.adjusted(2, 2, -2, -2));
}

// A mark in the middle of a light that falls off to all sides. Nothing shines through: the parts overlap by a pixel.
void drawLight(QPainter& painter, const QColor& strong, const QColor& faint, const QColor& ground)
{
    QRadialGradient light(s_centre.center(), s_size / 2);
    light.setColorAt(0, faint);
    light.setColorAt(1, ground);
    painter.fillRect(QRect(0, 0, s_size, s_size), light);
    drawMark(painter, strong);
}

// A mark among dots.
void drawDots(QPainter& painter, const QColor& strong, const QColor& faint)
{
    painter.setPen(Qt::NoPen);
    painter.setBrush(faint);
    for (int x = s_border / 2; x < s_size; x += s_border) {
        for (int y = s_border / 2; y < s_size; y += s_border) {
            painter.drawEllipse(QPointF(x, y), 3, 3);
        }
    }
    drawMark(painter, strong);
}

// Anything that is painted can wear the icon.
class Framed : public QWidget
{
public:
    explicit Framed(const BorderIcon& icon)
        : m_icon(icon)
    {
        setMinimumSize(120, 90);
    }

    void setOpacity(double opacity)
    {
        m_icon.setOpacity(opacity);
        update();
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QPainter painter(this);
        painter.setRenderHint(QPainter::SmoothPixmapTransform);
        m_icon.paint(&painter, rect());
    }

private:
    BorderIcon m_icon;
};

}

FramesPage::FramesPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
{
    const QColor strong = palette().color(QPalette::Highlight);
    const QColor faint = palette().color(QPalette::Dark);
    const QColor ground = palette().color(QPalette::Base);
    const QMargins margins(s_border, s_border, s_border, s_border);
    auto* opacity = new QSlider(Qt::Horizontal);
    opacity->setRange(10, 100);
    opacity->setValue(100);

    auto* grid = new QGridLayout;
    grid->setSpacing(12);
    int number = 0;
    const auto add = [&](BorderIcon::Stretch stretch, const QPixmap& small, const QString& name, const QString& hint) {
        auto* frame = new Framed(BorderIcon(small, margins, stretch));
        connect(opacity, &QSlider::valueChanged, frame, [frame](int value) { frame->setOpacity(value / 100.0); });
        auto* original = new QLabel;
        original->setPixmap(small);
        original->setToolTip(tr("The picture: %1 × %1 pixels, cut %2 pixels from each side").arg(s_size).arg(s_border));

        QWidget* box = panel();
        auto* layout = new QGridLayout(box);
        layout->setContentsMargins(16, 12, 16, 16);
        layout->setHorizontalSpacing(14);
        layout->setVerticalSpacing(4);
        layout->addWidget(original, 0, 0, 2, 1);
        layout->addWidget(label(name, "heading"), 0, 1, Qt::AlignBottom);
        layout->addWidget(label(hint, "hint"), 1, 1, Qt::AlignTop);
        layout->addWidget(frame, 2, 0, 1, 2);
        layout->setColumnStretch(1, 1);
        layout->setRowStretch(2, 1);
        layout->setRowMinimumHeight(2, 100);
        grid->addWidget(box, number / 2, number % 2);
        ++number;
    };
    const QPixmap finder = picture([&](QPainter& painter) { drawFinder(painter, strong, faint); });
    add(BorderIcon::StretchCenter, finder, tr("Stretch the centre"), tr("The border keeps its width."));
    add(BorderIcon::TileCenter, finder, tr("Tile the centre"), tr("The border keeps its width."));
    add(BorderIcon::StretchBorder, picture([&](QPainter& painter) { drawLight(painter, strong, faint, ground); }),
        tr("Stretch the border"), tr("The centre keeps its size."));
    add(BorderIcon::TileBorder, picture([&](QPainter& painter) { drawDots(painter, strong, faint); }),
        tr("Tile the border"), tr("The centre keeps its size."));

    auto* row = new QHBoxLayout;
    row->setSpacing(12);
    row->addWidget(label(tr("Opacity"), "hint"));
    row->addWidget(opacity);
    row->addStretch(1);
    opacity->setFixedWidth(220);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(12);
    layout->addLayout(grid, 1);
    layout->addLayout(row);
}
}
