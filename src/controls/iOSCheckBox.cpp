// SPDX-License-Identifier: MIT
// A check box that looks and works like a sliding switch.
#include "controls/iOSCheckBox.h"

#include "CoreQt/Connect.h"
#include "controls/SwitchGeometry.h"

#include <QtCore/QPointer>
#include <QtGui/QMouseEvent>
#include <QtGui/QPainter>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOptionButton>

namespace
{
// The strip is never seen in these left pixels.
constexpr int c_HiddenLeft = 10;
}

iOSCheckBox::iOSCheckBox(QWidget* parent, bool checked, QString path)
    : QCheckBox(parent)
    , m_pixmap(path)
    , m_animation(new QPropertyAnimation(this, "iconPosition", this))
{
    m_iconPosition = QPointF(-iOSCheckBox::getIconOffset(), iOSCheckBox::getControlRect().y());
    m_restPosition = m_iconPosition;
    m_animation->setLoopCount(1);
    m_animation->setEasingCurve(QEasingCurve::Linear);
    m_animation->setDuration(m_iconAnimationDuration);
    vx::connect(m_animation, "2valueChanged(const QVariant&)", this, "1update()", Qt::AutoConnection);
    setChecked(checked);
}

iOSCheckBox::~iOSCheckBox() = default;

QSize iOSCheckBox::sizeHint() const
{
    return {72, 18};
}

void iOSCheckBox::setVisible(bool visible)
{
    m_animation->stop();
    m_iconPosition = isChecked() ? maximumRightPosition() : maximumLeftPosition();
    m_restPosition = m_iconPosition;
    QCheckBox::setVisible(visible);
}

void iOSCheckBox::animateTo(bool on)
{
    animateTo(QPointF(on ? maximumRightPosition() : maximumLeftPosition()));
}

void iOSCheckBox::animateTo(const QPointF& target)
{
    m_animation->stop();
    m_animation->setStartValue(m_iconPosition);
    m_animation->setEndValue(target);
    m_animation->setDuration(getDurationForPosition(isChecked()));
    m_animation->start(QAbstractAnimation::KeepWhenStopped);
}

int iOSCheckBox::getDurationForPosition(bool right) const
{
    // The places are virtual and not const, for subclasses that compute them on demand.
    auto* const self = const_cast<iOSCheckBox*>(this);
    const double target = right ? self->maximumRightPosition().x() : self->maximumLeftPosition().x();
    return vx::SwitchGeometry::duration(
        m_iconPosition.x(), target, right, m_iconAnimationDuration, self->getControlRect().width());
}

bool iOSCheckBox::getAnimationModeOn() const
{
    return m_animationMode;
}

void iOSCheckBox::setAnimationMode(bool on)
{
    m_animationMode = on;
}

const QPixmap* iOSCheckBox::controlMacCheckBox() const
{
    return &m_pixmap;
}

int* iOSCheckBox::controlIconAnimationDuration()
{
    return &m_iconAnimationDuration;
}

QPointF* iOSCheckBox::controlIconPosition()
{
    return &m_iconPosition;
}

QPointF iOSCheckBox::getIconPosition() const
{
    return m_iconPosition;
}

void iOSCheckBox::setIconPosition(const QPointF& position)
{
    m_iconPosition = position;
    update();
}

QRect iOSCheckBox::getControlRect()
{
    QStyleOptionButton option;
    option.initFrom(this);
    return option.rect;
}

QPoint iOSCheckBox::maximumRightPosition()
{
    return vx::SwitchGeometry::onPosition(getControlRect());
}

QPoint iOSCheckBox::maximumLeftPosition()
{
    return {-getIconOffset(), getControlRect().y()};
}

int iOSCheckBox::getIconOffset() const
{
    return vx::SwitchGeometry::iconOffset(const_cast<iOSCheckBox*>(this)->getControlRect());
}

void iOSCheckBox::placeStrip(const QPointF& target)
{
    m_restPosition = target;
    if (m_animationMode) {
        animateTo(target);
    } else {
        m_animation->stop();
        m_iconPosition = target;
        update();
    }
}

void iOSCheckBox::checkStateSet()
{
    placeStrip(checkState() == Qt::Unchecked ? maximumLeftPosition() : maximumRightPosition());
    // Emits stateChanged().
    QCheckBox::checkStateSet();
}

void iOSCheckBox::nextCheckState()
{
    QCheckBox::nextCheckState();
}

// The button's own press logic never runs: no down state, no clicked().
void iOSCheckBox::mousePressEvent(QMouseEvent* event)
{
    m_pressed = true;
    m_lastPos = event->localPos();
}

void iOSCheckBox::mouseMoveEvent(QMouseEvent* event)
{
    if (!m_pressed) {
        return;
    }
    m_animation->stop();
    const double x = vx::SwitchGeometry::limited(m_iconPosition.x() + (event->localPos().x() - m_lastPos.x()),
        maximumLeftPosition().x(), maximumRightPosition().x());
    m_iconPosition = QPointF(x, getControlRect().y());
    update();
    m_dragged = true;
    m_lastPos = event->localPos();
}

void iOSCheckBox::mouseReleaseEvent(QMouseEvent*)
{
    const QPointer<iOSCheckBox> guard(this);
    if (m_dragged) {
        // Also where the state stays: the button then only has the strip snap back.
        setChecked(vx::SwitchGeometry::snapsToOn(m_iconPosition.x(), getIconOffset()));
    } else {
        setAnimationMode(true);
        setChecked(checkState() == Qt::Unchecked);
        if (guard) {
            setAnimationMode(false);
        }
    }
    if (guard) {
        m_pressed = false;
        m_dragged = false;
        m_lastPos = QPointF();
    }
}

void iOSCheckBox::paintEvent(QPaintEvent* event)
{
    if (!isVisible()) {
        return;
    }
    QPainter painter(this);
    draw(event, painter);
}

void iOSCheckBox::resizeEvent(QResizeEvent* event)
{
    QCheckBox::resizeEvent(event);
    // The ends depend on the width, and a switch in a layout gets its width after its state.
    if (!m_pressed && m_iconPosition == m_restPosition && m_animation->state() != QAbstractAnimation::Running) {
        m_iconPosition = checkState() == Qt::Unchecked ? maximumLeftPosition() : maximumRightPosition();
        m_restPosition = m_iconPosition;
    }
}

const QPixmap& iOSCheckBox::scaledStrip(const QSize& size)
{
    if (m_pixmap.isNull() || size.isEmpty()) {
        m_scaled = QPixmap();
    } else if (m_scaled.size() != size) {
        m_scaled = m_pixmap.scaled(size, Qt::IgnoreAspectRatio, Qt::FastTransformation);
    }
    return m_scaled;
}

void iOSCheckBox::draw(QPaintEvent*, QPainter& painter)
{
    ensurePolished();
    QStyleOptionButton option;
    option.initFrom(this);
    painter.setClipRect(option.rect.adjusted(c_HiddenLeft, 0, 0, 0), Qt::ReplaceClip);
    const QPixmap& strip = scaledStrip(vx::SwitchGeometry::stripSize(option.rect));
    if (!strip.isNull()) {
        painter.drawPixmap(m_iconPosition, strip);
    }
    style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
}
