// SPDX-License-Identifier: MIT
#include "PtzPanel.h"

#include "Fleet.h"
#include "LiveWall.h"
#include "PtzPictures.h"
#include "Session.h"
#include "controls/DialButton.h"
#include "controls/JoystickViewWidget.h"
#include "popover/Manager.h"

#include <QtCore/QEvent>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QVBoxLayout>

#include <cmath>

namespace client
{
namespace
{
constexpr int s_stickSize = 150;
constexpr int s_dialSize = 68;
constexpr int s_dialPadding = 9;
constexpr int s_full = 100;
constexpr int s_balloonMillis = 1000;

QLabel* centredLabel()
{
    auto* const label = new QLabel;
    label->setProperty("role", QStringLiteral("hint"));
    label->setAlignment(Qt::AlignHCenter);
    return label;
}
}

PtzPanel::PtzPanel(LiveWall& wall, Session& session, QWidget* parent)
    : QWidget(parent)
    , m_wall(wall)
    , m_session(session)
    , m_controls(new QWidget)
    , m_heading(new QLabel)
    , m_hint(new QLabel)
    , m_stick(new JoystickViewWidget)
    , m_panName(centredLabel())
    , m_tiltName(centredLabel())
    , m_zoomName(centredLabel())
{
    // The dials show their values in balloons.
    vx::PopoverWidget::Manager::init(s_balloonMillis);

    m_heading->setObjectName(QStringLiteral("ptzHeading"));
    m_heading->setProperty("role", QStringLiteral("heading"));
    m_hint->setObjectName(QStringLiteral("ptzHint"));
    m_hint->setProperty("role", QStringLiteral("hint"));
    m_hint->setWordWrap(true);
    m_hint->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    m_controls->setObjectName(QStringLiteral("ptzControls"));
    m_stick->setFixedSize(s_stickSize, s_stickSize);
    m_stick->installEventFilter(this);
    m_pan = makeDial(QStringLiteral("panDial"));
    m_tilt = makeDial(QStringLiteral("tiltDial"));
    m_zoom = makeDial(QStringLiteral("zoomDial"));

    auto* const grid = new QGridLayout(m_controls);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setHorizontalSpacing(4);
    grid->setVerticalSpacing(2);
    grid->addWidget(m_stick, 0, 0, 1, 3, Qt::AlignHCenter);
    grid->setRowMinimumHeight(0, s_stickSize + 10);
    int column = 0;
    for (vx::DialButton* const dial : {m_pan, m_tilt, m_zoom}) {
        grid->addWidget(dial, 1, column++, Qt::AlignHCenter);
    }
    column = 0;
    for (QLabel* const name : {m_panName, m_tiltName, m_zoomName}) {
        grid->setColumnStretch(column, 1);
        grid->addWidget(name, 2, column++);
    }

    auto* const layout = new QVBoxLayout(this);
    layout->setContentsMargins(14, 10, 14, 12);
    layout->setSpacing(8);
    layout->addWidget(m_heading);
    layout->addWidget(m_controls);
    layout->addWidget(m_hint);
    layout->addStretch(1);

    connect(&wall, &LiveWall::currentChanged, this, &PtzPanel::checkRights);
    connect(&session, &Session::roleChanged, this, &PtzPanel::checkRights);
    connect(&wall.fleet(), &Fleet::onlineChanged, this, &PtzPanel::checkRights);
    connect(&wall.fleet(), &Fleet::renamed, this, &PtzPanel::checkRights);
    drawPictures();
    retranslate();
}

vx::DialButton* PtzPanel::makeDial(const QString& name)
{
    auto* const dial = new vx::DialButton(0, this);
    dial->setObjectName(name);
    dial->setRange(-s_full, s_full);
    dial->setValue(0);
    dial->setReboundEnabled(true);
    dial->setFixedSize(s_dialSize, s_dialSize);
    dial->setLeftPadding(s_dialPadding);
    dial->setRightPadding(s_dialPadding);
    dial->setTopPadding(s_dialPadding);
    dial->setBottomPadding(s_dialPadding);
    dial->setBalloonFeatures(vx::PopoverWidget::Balloon::ebfNoHeader);
    connect(dial, &QDial::valueChanged, this, &PtzPanel::steer);
    return dial;
}

// Anew for each palette, and for what can and cannot be used.
void PtzPanel::drawPictures()
{
    if (m_isDrawing) {
        return;
    }
    m_isDrawing = true;
    const double ratio = devicePixelRatioF();
    const bool enabled = m_controls->isEnabled();
    const QPixmap plate = PtzPictures::plate(palette(), int(s_dialSize * ratio));
    const QPixmap knob = PtzPictures::knob(palette(), int(s_dialSize * ratio), enabled);
    for (vx::DialButton* const dial : {m_pan, m_tilt, m_zoom}) {
        dial->setImage(plate);
        dial->setButton(knob);
    }
    m_stick->setPtzCrosshairImage(PtzPictures::crosshair(palette(), int(s_stickSize * ratio), enabled));
    m_stick->setPtzPointImage(PtzPictures::point(palette(), int(s_stickSize / 5 * ratio), enabled));
    m_isDrawing = false;
}

void PtzPanel::retranslate()
{
    m_panName->setText(tr("Pan"));
    m_tiltName->setText(tr("Tilt"));
    m_zoomName->setText(tr("Zoom"));
    m_stick->setAccessibleName(tr("Stick"));
    m_pan->setAccessibleName(m_panName->text());
    m_tilt->setAccessibleName(m_tiltName->text());
    m_zoom->setAccessibleName(m_zoomName->text());
    m_pan->setBalloonTextMap(
        {{vx::ValueRange(-s_full, -1), tr("to the left")}, {vx::ValueRange(1, s_full), tr("to the right")}});
    m_tilt->setBalloonTextMap({{vx::ValueRange(-s_full, -1), tr("down")}, {vx::ValueRange(1, s_full), tr("up")}});
    m_zoom->setBalloonTextMap({{vx::ValueRange(-s_full, -1), tr("farther")}, {vx::ValueRange(1, s_full), tr("closer")}});
    checkRights();
}

void PtzPanel::checkRights()
{
    const Camera* const camera = m_wall.fleet().camera(m_wall.currentCamera());
    QString hint;
    if (!camera) {
        hint = tr("Choose a camera.");
    } else if (m_session.isRightRefused(QStringLiteral("ptz"), true, false, false)) {
        hint = tr("You have no right to turn cameras. An administrator has.");
    } else if (!camera->steerable) {
        hint = tr("This camera has no motor. Choose another one.");
    } else if (!camera->online) {
        hint = tr("The camera is offline.");
    }
    const bool isAllowed = hint.isEmpty();
    m_heading->setText(camera ? camera->name : tr("No camera"));
    m_hint->setText(isAllowed ? tr("Drag the stick, or a dial sideways.") : hint);
    letGo();
    if (isAllowed != m_controls->isEnabled()) {
        m_controls->setEnabled(isAllowed);
        drawPictures();
    }
}

void PtzPanel::steer()
{
    const double pan = m_isHeld ? m_held.x() : double(m_pan->value()) / s_full;
    const double tilt = m_isHeld ? m_held.y() : double(m_tilt->value()) / s_full;
    m_stick->setPointPosition(float(pan), float(tilt));
    if (m_controls->isEnabled()) {
        m_wall.steer(pan, tilt, double(m_zoom->value()) / s_full);
    }
}

void PtzPanel::letGo()
{
    m_isHeld = false;
    for (vx::DialButton* const dial : {m_pan, m_tilt, m_zoom}) {
        const QSignalBlocker silence(dial);
        dial->setValue(0);
        dial->update();
    }
    steer();
}

bool PtzPanel::eventFilter(QObject* watched, QEvent* event)
{
    if (watched != m_stick || !m_controls->isEnabled()) {
        return QWidget::eventFilter(watched, event);
    }
    const QEvent::Type type = event->type();
    if (type != QEvent::MouseButtonPress && type != QEvent::MouseMove && type != QEvent::MouseButtonRelease) {
        return QWidget::eventFilter(watched, event);
    }
    const auto* const mouse = static_cast<QMouseEvent*>(event);
    if (type == QEvent::MouseButtonPress && mouse->button() == Qt::LeftButton) {
        m_isHeld = true;
    } else if (type == QEvent::MouseButtonRelease && mouse->button() == Qt::LeftButton && m_isHeld) {
        letGo();
        return true;
    }
    if (m_isHeld && (type == QEvent::MouseButtonPress || type == QEvent::MouseMove)) {
        const double reach = s_stickSize / 2.0 - double(m_stick->circleInset());
        m_held = (QPointF(mouse->pos()) - QPointF(s_stickSize, s_stickSize) / 2) / reach;
        const double length = std::hypot(m_held.x(), m_held.y());
        m_held = QPointF(m_held.x(), -m_held.y()) / qMax(1.0, length);
        steer();
        return true;
    }
    return QWidget::eventFilter(watched, event);
}

void PtzPanel::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        retranslate();
    } else if (event->type() == QEvent::PaletteChange || event->type() == QEvent::StyleChange) {
        drawPictures();
    }
}

void PtzPanel::hideEvent(QHideEvent* event)
{
    QWidget::hideEvent(event);
    letGo();
}
}
