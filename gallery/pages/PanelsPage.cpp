// SPDX-License-Identifier: MIT
// Two panels over a moving picture, the lower one with a time line. They place themselves, so the page tells them
// when the view was resized.
#include "PanelsPage.h"

#include <QtCore/QDateTime>
#include <QtCore/QEvent>
#include <QtGui/QMouseEvent>
#include <QtGui/QPainter>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QVBoxLayout>

#include "../cameras/CameraTile.h"
#include "../cameras/Scene.h"
#include "../Hand.h"
#include "sliders/MultiNubsieSlider.h"
#include "views/FadeStripeView.h"

namespace gallery
{
namespace
{
const int s_frameMillis = 40;
const int s_openHeight = 118;
const int s_pictureCount = 8;
const QSize s_pictureSize(124, 72);
const int s_timeNubsie = 1;

QPixmap knob()
{
    QPixmap pixmap(44, 44);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(Qt::white, 4));
    painter.setBrush(QColor(70, 150, 245));
    painter.drawEllipse(QRectF(3, 3, 38, 38));
    return pixmap;
}

QVector<QPixmap> picturesOf(int seed, double ratio)
{
    QVector<QPixmap> result;
    for (int i = 0; i < s_pictureCount; ++i) {
        const QSize whole(qRound(s_pictureSize.width() / Scene::s_width), s_pictureSize.height());
        result.append(Scene(seed + i).ground(whole, ratio));
    }
    return result;
}
}

PictureRows::PictureRows(QWidget* parent)
    : QWidget(parent)
    , m_pictures(picturesOf(14, devicePixelRatioF()))
{
}

void PictureRows::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.fillRect(rect(), QColor(22, 26, 32));
    int number = 0;
    for (int y = 6; y < height(); y += s_rowHeight) {
        for (int x = 12; x < width(); x += s_pictureSize.width() + 8) {
            painter.drawPixmap(x, y, m_pictures.at(number++ % m_pictures.size()));
        }
    }
}

PicturePanel::PicturePanel(EPositions position, const QString& caption, int seed, QWidget* parent)
    : FadeView(position, nullptr, parent)
    , m_caption(caption)
{
    m_pictures = picturesOf(seed, devicePixelRatioF());
    setAutoFillBackground(false);
    setCursor(Qt::PointingHandCursor);
}

QRect PicturePanel::strip() const
{
    return m_position == ePositionTop ? QRect(0, height() - c_Bordersize, width(), c_Bordersize)
                                      : QRect(0, 0, width(), c_Bordersize);
}

void PicturePanel::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    // Over a picture the panel is dark in every theme.
    painter.fillRect(rect(), QColor(22, 26, 32, 248));
    const QRect bar = strip();
    painter.fillRect(bar, QColor(44, 50, 60));
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(160, 168, 180));
    painter.drawRoundedRect(QRectF(bar.center().x() - 17, bar.center().y() - 1, 36, 4), 2, 2);

    // The contents hang on the strip and come in with it.
    const int top = m_position == ePositionTop ? height() - s_openHeight + 6 : c_Bordersize + 6;
    painter.setPen(QColor(200, 206, 214));
    painter.drawText(QRect(12, top, width() - 24, 18), Qt::AlignLeft | Qt::AlignVCenter, m_caption);
    int x = 12;
    for (const QPixmap& picture : m_pictures) {
        painter.drawPixmap(x, top + 22, picture);
        x += s_pictureSize.width() + 8;
    }
}

void PicturePanel::mouseReleaseEvent(QMouseEvent* event)
{
    if (strip().contains(event->pos())) {
        Q_EMIT stripClicked();
    }
}

PanelsPage::PanelsPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
    , m_view(new QWidget)
{
    m_view->setMinimumHeight(300);
    m_camera = new CameraTile(tr("North gate"), 3, m_view);
    m_top = new PicturePanel(FadeView::ePositionTop, tr("Latest events"), 4, m_view);
    m_top->setFadeStripeAsPartOfLayout(false);
    m_top->setSizeHint(c_Bordersize, true);
    m_top->show();
    connect(m_top, &PicturePanel::stripClicked, this, [this] { toggle(m_top); });
    watch(m_top, QStringLiteral("top"), {QStringLiteral("geometryChanged")});
    m_view->installEventFilter(this);

    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(12);
    layout->addWidget(m_view, 1);
    m_bottom = makeStripe();
    layout->addWidget(makeSettings());

    m_frames.setInterval(s_frameMillis);
    connect(
        &m_frames, &QTimer::timeout, m_camera, [this] { m_camera->advance(QDateTime::currentMSecsSinceEpoch()); });
}

FadeStripeView* PanelsPage::makeStripe()
{
    auto* stripe = new FadeStripeView(FadeView::ePositionBottom, new PictureRows, m_view);
    stripe->setFadeStripeAsPartOfLayout(false);
    stripe->setMaximumHeight(c_Bordersize * 2 + PictureRows::s_rowHeight * 2);
    stripe->setContentsHeight(PictureRows::s_rowHeight);
    stripe->setStyleDefault();
    stripe->setRows(0);
    stripe->show();
    watch(stripe, QStringLiteral("bottom"),
        {QStringLiteral("geometryChanged"), QStringLiteral("sizeChanged"), QStringLiteral("heightChanged")});
    announcePlace(stripe, QStringLiteral("bottom"));
    return stripe;
}

QWidget* PanelsPage::makeSettings()
{
    auto* row = new QWidget;
    auto* layout = new QHBoxLayout(row);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    const auto add = [layout](const QString& text) {
        auto* button = new QPushButton(text);
        layout->addWidget(button);
        return button;
    };
    connect(add(tr("Upper panel")), &QPushButton::clicked, m_top, [this] { toggle(m_top); });
    connect(add(tr("Lower panel")), &QPushButton::clicked, m_bottom, [this] { toggle(m_bottom); });
    connect(add(tr("Full height")), &QPushButton::clicked, m_top, [this] {
        if (m_top->isFullscreen()) {
            m_top->exitFullscreen(true);
        } else {
            m_top->goFullscreen(true);
        }
    });
    m_animated = new QCheckBox(tr("Start at the edge"));
    m_animated->setToolTip(tr("fadein() and fadeout() with force: not from where the panel is"));
    layout->addSpacing(8);
    layout->addWidget(m_animated);
    layout->addSpacing(8);
    QLabel* const hint = label(tr("Click the handles, also while a panel moves; drag the lower one."), "hint");
    hint->setWordWrap(true);
    layout->addWidget(hint, 1);
    return row;
}

void PanelsPage::toggle(FadeView* panel)
{
    if (panel->isFullscreen()) {
        panel->exitFullscreen(true);
    } else if (panel->isFadedIn()) {
        panel->fadeout(true, m_animated->isChecked());
    } else {
        panel->fadein(true, m_animated->isChecked(), panel == m_top ? s_openHeight : -1);
    }
}

bool PanelsPage::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() == QEvent::Resize) {
        m_camera->setGeometry(m_view->rect());
        m_top->resize();
        m_bottom->resize();
        m_camera->advance(QDateTime::currentMSecsSinceEpoch());
    }
    return Page::eventFilter(object, event);
}

void PanelsPage::showEvent(QShowEvent* event)
{
    // Only now: the handles of a time line live in its window.
    vx::MultiNubsieSlider* slider = m_bottom->slider();
    if (!slider->nubsieExists(s_timeNubsie)) {
        slider->addNubsie(tr("Time"), 70, 0, 100, s_timeNubsie);
        slider->setStandardSize(s_timeNubsie, QSize(13, 13));
        slider->setDraggedSize(s_timeNubsie, QSize(22, 22));
        slider->setIcon(s_timeNubsie, knob());
    }
    m_frames.start();
    Page::showEvent(event);
}

void PanelsPage::hideEvent(QHideEvent* event)
{
    m_frames.stop();
    Page::hideEvent(event);
}

void PanelsPage::rehearse(Hand& hand)
{
    hand.click(m_top, m_top->rect().center()).wait(450);
    const QPoint bar(m_bottom->width() / 3, 7);
    hand.moveTo(m_bottom, bar).press();
    hand.glideTo(m_view, QPoint(bar.x(), m_view->height() - 190), 300).wait(40).release().wait(400);
}
}
