// SPDX-License-Identifier: MIT
// A panel as it stands beside the picture of a camera that turns.
#include "PtzPage.h"

#include <functional>

#include <QtCore/QtMath>
#include <QtGui/QPainter>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QVBoxLayout>

#include "../Hand.h"
#include "PtzView.h"
#include "controls/DialButton.h"
#include "controls/JoystickViewWidget.h"
#include "popover/Manager.h"

namespace gallery
{
namespace
{
constexpr int s_dial = 108;
constexpr int s_stick = 164;
constexpr int s_balloon = 26;

// Pictures of a dial and a stick in the colours of the palette; an application has files and names them in its
// style sheet: qproperty-button: url(...).
QPixmap canvas(int size, const std::function<void(QPainter&)>& draw)
{
    QPixmap result(size, size);
    result.fill(Qt::transparent);
    QPainter painter(&result);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(size / 2.0, size / 2.0);
    draw(painter);
    return result;
}

QPixmap plate(const QPalette& colors, int size)
{
    return canvas(size, [&](QPainter& painter) {
        painter.setPen(QPen(colors.color(QPalette::Dark), size / 60.0, Qt::SolidLine, Qt::RoundCap));
        // The dial goes from the lower left over the top to the lower right.
        for (int i = 0; i <= 20; ++i) {
            const double angle = qDegreesToRadians(-240 + i * 15.0);
            const QPointF direction(qCos(angle), qSin(angle));
            painter.drawLine(direction * size * (i % 10 ? 0.45 : 0.42), direction * size * 0.48);
        }
    });
}

// Upright, it points at the value when it is turned.
QPixmap knob(const QPalette& colors, int size)
{
    return canvas(size, [&](QPainter& painter) {
        const double radius = size * 0.46;
        QLinearGradient face(0, -radius, 0, radius);
        face.setColorAt(0, colors.color(QPalette::Button).lighter(108));
        face.setColorAt(1, colors.color(QPalette::Button).darker(112));
        painter.setBrush(face);
        painter.setPen(QPen(colors.color(QPalette::Dark), size / 60.0));
        painter.drawEllipse(QPointF(), radius, radius);
        painter.setPen(QPen(colors.color(QPalette::Highlight), size / 16.0, Qt::SolidLine, Qt::RoundCap));
        painter.drawLine(QPointF(0, -radius * 0.84), QPointF(0, -radius * 0.45));
    });
}

QPixmap crosshair(const QPalette& colors, int size)
{
    return canvas(size, [&](QPainter& painter) {
        const double radius = size * 0.4;
        painter.setPen(QPen(colors.color(QPalette::Dark), size / 130.0));
        painter.drawEllipse(QPointF(), radius, radius);
        painter.drawEllipse(QPointF(), radius / 2, radius / 2);
        painter.drawLine(QPointF(-radius, 0), QPointF(radius, 0));
        painter.drawLine(QPointF(0, -radius), QPointF(0, radius));
    });
}

QPixmap point(const QPalette& colors, int size)
{
    return canvas(size, [&](QPainter& painter) {
        painter.setPen(QPen(colors.color(QPalette::Base), size / 16.0));
        painter.setBrush(colors.color(QPalette::Highlight));
        painter.drawEllipse(QPointF(), size * 0.36, size * 0.36);
    });
}
}

PtzPage::PtzPage(SignalLog& log, QWidget* parent)
    : Page(log, parent), m_view(new PtzView)
{
    // The dials show their values in balloons.
    vx::PopoverWidget::Manager::init(1000);

    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(16);
    layout->addWidget(m_view, 1);
    layout->addWidget(makePanel());
}

vx::DialButton* PtzPage::makeDial(const QString& name, int minimum, int maximum, int value)
{
    auto* dial = new vx::DialButton(value);
    dial->setRange(minimum, maximum);
    dial->setValue(value);
    dial->setFixedSize(s_dial, s_dial);
    const int pixels = int(s_dial * devicePixelRatioF());
    dial->setImage(plate(palette(), pixels));
    dial->setButton(knob(palette(), pixels));
    dial->setLeftPadding(14);
    dial->setRightPadding(14);
    dial->setTopPadding(14);
    dial->setBottomPadding(14);
    dial->setBalloonFeatures(vx::PopoverWidget::Balloon::ebfNoHeader);
    watch(dial, name);
    announcePlace(dial, name);
    return dial;
}

QWidget* PtzPage::makePanel()
{
    m_stick = new JoystickViewWidget;
    m_stick->setFixedSize(s_stick, s_stick);
    m_stick->setPtzCrosshairImage(crosshair(palette(), int(s_stick * devicePixelRatioF())));
    m_stick->setPtzPointImage(point(palette(), int(s_stick / 5 * devicePixelRatioF())));

    m_pan = makeDial(QStringLiteral("pan"), -100, 100, 0);
    m_tilt = makeDial(QStringLiteral("tilt"), -100, 100, 0);
    m_zoom = makeDial(QStringLiteral("zoom"), 10, 40, 10);
    for (vx::DialButton* dial : {m_pan, m_tilt}) {
        dial->setReboundEnabled(true);
        connect(dial, &QDial::valueChanged, this, &PtzPage::steer);
    }
    m_pan->setBalloonTextMap({{vx::ValueRange(-100, -1), tr("to the left")}, {vx::ValueRange(1, 100), tr("to the right")}});
    m_tilt->setBalloonTextMap({{vx::ValueRange(-100, -1), tr("down")}, {vx::ValueRange(1, 100), tr("up")}});
    connect(m_zoom, &QDial::valueChanged, m_view, [this](int value) { m_view->setZoom(value / 10.0); });

    QWidget* box = panel();
    auto* grid = new QGridLayout(box);
    grid->setContentsMargins(20, 16, 20, 16);
    grid->setHorizontalSpacing(24);
    grid->setVerticalSpacing(8);
    grid->addWidget(label(tr("Camera"), "heading"), 0, 0, 1, 2);
    grid->addWidget(m_stick, 1, 0, 1, 2, Qt::AlignHCenter | Qt::AlignTop);
    grid->setRowMinimumHeight(1, s_stick + s_balloon);
    grid->addWidget(m_pan, 2, 0, Qt::AlignHCenter);
    grid->addWidget(m_tilt, 2, 1, Qt::AlignHCenter);
    grid->addWidget(label(tr("Pan"), "hint"), 3, 0, Qt::AlignHCenter);
    grid->addWidget(label(tr("Tilt"), "hint"), 3, 1, Qt::AlignHCenter);
    grid->addWidget(m_zoom, 4, 0, Qt::AlignHCenter);
    grid->addWidget(label(tr("Zoom"), "hint"), 5, 0, Qt::AlignHCenter);
    auto* hint = label(tr("Drag a dial sideways. Pan and tilt spring back, zoom stays."), "hint");
    hint->setWordWrap(true);
    hint->setFixedWidth(s_dial);
    grid->addWidget(hint, 4, 1, Qt::AlignVCenter);
    grid->setRowStretch(6, 1);
    return box;
}

void PtzPage::steer()
{
    const double pan = m_pan->value() / 100.0;
    const double tilt = m_tilt->value() / 100.0;
    m_stick->setPointPosition(float(pan), float(tilt));
    m_view->setSpeed(pan, tilt);
}

void PtzPage::rehearse(Hand& hand)
{
    // Held, or it would spring back.
    hand.call(m_tilt, [this] { m_tilt->setValue(40); });
    const QPoint middle = m_pan->rect().center();
    hand.moveTo(m_pan, middle).press().glideTo(m_pan, middle + QPoint(90, 0), 300).wait(400);
}
}
