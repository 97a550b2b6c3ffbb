// SPDX-License-Identifier: MIT
// A slider with any number of handles: what the user does with the mouse. Handles take no mouse events themselves.
#include "sliders/MultiNubsieSlider.h"
#include "sliders/NubsieDrag.h"
#include "sliders/NubsieGeometry.h"

#include <QtGui/QMouseEvent>

#include <cmath>

namespace vx
{
namespace
{
constexpr int c_ClickRadius = 3; // Manhattan length in pixels that is still no move
constexpr double c_FlickVelocity = 0.5; // units of the scale per second
constexpr qint64 c_FlickTime = 500; // ms

double sizeAlong(const QSize& size, bool horizontal)
{
    return horizontal ? size.width() : size.height();
}
}

// What is under the pointer ----------------------------------------------------------------------------------

Nubsie* MultiNubsieSlider::getNubsieForPos(const QPointF& point) const
{
    const QPointF inWindow = mapTo(window(), NubsieGeometry::truncated(point));
    for (const QPointer<Nubsie>& nubsie : m_nubsies) {
        if (nubsie && nubsie->isEnabled() && nubsie->isDraggable() && nubsie->externallyVisible()
            && nubsieRect(nubsie).contains(inWindow)) {
            return nubsie;
        }
    }
    return nullptr;
}

bool MultiNubsieSlider::nubsieImageClicked(const QRectF& rect, const QPointF& point) const
{
    return NubsieGeometry::discContains(rect, mapTo(window(), NubsieGeometry::rounded(point)));
}

Nubsie* MultiNubsieSlider::nubsieUnder(const QPoint& position) const
{
    Nubsie* const found = getNubsieForPos(position);
    return found != nullptr && nubsieImageClicked(nubsieRect(found), position) ? found : nullptr;
}

bool MultiNubsieSlider::flagHit(const QLabel* flag, const QPoint& position)
{
    return flag != nullptr && flag->isVisible() && flag->geometry().contains(position);
}

// Press ------------------------------------------------------------------------------------------------------

void MultiNubsieSlider::mousePressEvent(QMouseEvent* event)
{
    if (event->button() == Qt::LeftButton) {
        m_lastDragPos = QPointF();
        m_pressPos = event->pos();
        m_moved = false;
        if (Nubsie* const hit = nubsieUnder(event->pos())) {
            pressNubsie(hit, event);
            return;
        }
        if (flagHit(m_firstFlag, event->pos())) {
            m_flagLongClickTimer.start();
            m_firstFlagPressed = true;
            m_flagPressTime = QDateTime::currentDateTime();
            return;
        }
        if (flagHit(m_secondFlag, event->pos())) {
            m_flagLongClickTimer.start();
            m_secondFlagPressed = true;
            m_flagPressTime = QDateTime::currentDateTime();
            return;
        }
    } else if (event->button() == Qt::RightButton) {
        if (flagHit(m_firstFlag, event->pos())) {
            Q_EMIT firstFlagRightClicked();
            return;
        }
        if (flagHit(m_secondFlag, event->pos())) {
            Q_EMIT secondFlagRightClicked();
            return;
        }
    }
    event->ignore();
    QWidget::mousePressEvent(event);
}

void MultiNubsieSlider::pressNubsie(Nubsie* nubsie, QMouseEvent* event)
{
    const QPointer<MultiNubsieSlider> self(this);
    const QPointer<Nubsie> hit(nubsie);
    m_singleClickTimer.stop();
    if (m_currentNubsie && m_currentNubsie != hit) {
        // It waited for a second click, which has gone to another handle.
        m_currentNubsie->resetSize();
        enqueueNubsie(m_currentNubsie, true);
    }
    m_lastMoveTime = QDateTime::currentMSecsSinceEpoch();
    m_longClickTimer.start();
    setCurrentNubsie(hit);
    if (!self || !hit) {
        return;
    }
    m_grabbedNubsie = hit;
    // Handles held lately are found last: repeated presses go through a stack.
    const int index = m_nubsies.indexOf(hit);
    if (index >= 0) {
        m_nubsies.move(index, m_nubsies.size() - 1);
    }
    m_anchorPos = mapTo(window(), NubsieGeometry::rounded(event->localPos()));
    m_anchorNormalized = hit->normalizedValue();
    m_lastNormalized = m_anchorNormalized;
    m_anchorDisplay = hit->getDisplayValue();
    m_anchorMapped = true;
    m_grabOffset = distanceToNubsieCenter(hit, m_anchorPos);
    dequeueNubsie(hit);
    if (self && m_currentNubsie) {
        m_currentNubsie->performPress();
    }
}

void MultiNubsieSlider::setCurrentNubsie(Nubsie* nubsie)
{
    const QPointer<MultiNubsieSlider> self(this);
    const QPointer<Nubsie> guard(nubsie);
    m_currentNubsie = guard;
    guard->setCurrent();
    raiseNubsieOnSlider(guard);
    if (self && guard) {
        Q_EMIT nubsieDragStarted(guard->id());
    }
}

// Drag -------------------------------------------------------------------------------------------------------

void MultiNubsieSlider::mouseMoveEvent(QMouseEvent* event)
{
    if (!m_currentNubsie) {
        event->ignore();
        QWidget::mouseMoveEvent(event);
        return;
    }
    if (!m_moved && (m_pressPos - event->pos()).manhattanLength() > c_ClickRadius) {
        m_moved = true;
    }
    const QPointF away = m_anchorPos - event->windowPos();
    const double threshold = Nubsie::s_LongClickMaxMoveThreshold;
    if (std::abs(away.x()) > threshold || std::abs(away.y()) > threshold) {
        m_longClickTimer.stop();
    }
    dragNubsie(event);
}

void MultiNubsieSlider::dragNubsie(QMouseEvent* event)
{
    const bool horizontal = m_orientation == Qt::Horizontal;
    const QPointer<MultiNubsieSlider> self(this);
    const QPointer<Nubsie> held = m_currentNubsie;
    const QRectF bar = sliderBarRect();
    const double size = sizeAlong(held->getSize(), horizontal);
    const double display = held->getDisplayValue();
    const QRect before = rectOnSlider(held);

    // The pointer as if it had taken the handle exactly at its centre.
    const QPointF pointer
        = event->localPos() - (horizontal ? QPointF(m_grabOffset, 0.0) : QPointF(0.0, m_grabOffset));
    double target = horizontal
        ? NubsieDrag::placeUnder(pointer.x() - bar.left(), bar.width(), size, display)
        : 1.0 - NubsieDrag::placeUnder(pointer.y() - bar.top(), bar.height(), size, 1.0 - display);

    if (held->getCurrentFeature().testFlag(Nubsie::enfDiscreteSteps)) {
        dragNubsieInSteps(pointer, target);
        if (self) {
            updateAfterStep(before);
        }
        return;
    }

    const double speed = fineSpeed(pointer);
    if (speed < 1.0) {
        const double length = horizontal ? bar.width() : bar.height();
        const double way = horizontal ? pointer.x() - m_lastDragPos.x() : m_lastDragPos.y() - pointer.y();
        target = NubsieDrag::laggedTarget(speed, length > 0.0 ? way / length : 0.0, display, target);
    }
    m_lastDragPos = pointer;

    const NubsieDrag::Mapped mapped
        = NubsieDrag::mapped(target, {m_anchorDisplay, m_anchorNormalized, m_anchorMapped});
    m_anchorMapped = mapped.mapped;
    held->setNormalizedValue(qBound(0.0, mapped.value, 1.0));
    held->setDisplayValue(mapped.display);
    const bool changed = held->performDragAction();
    if (!self) {
        return;
    }

    // A step that has changed the integer value leaves a velocity of 0: only steps within one value count.
    if (changed) {
        m_lastNormalized = mapped.value;
    }
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    m_velocity = NubsieDrag::velocity(m_lastNormalized, mapped.value, now - m_lastMoveTime);
    m_lastNormalized = mapped.value;
    m_lastMoveTime = now;
    m_lastMoveStamp = now;
    updateNubsieLayer(m_currentNubsie);
    if (self) {
        updateAfterStep(before);
    }
}

QRect MultiNubsieSlider::rectOnSlider(const Nubsie* nubsie) const
{
    return QRect(mapFromGlobal(nubsie->mapToGlobal(QPoint(0, 0))), nubsie->size());
}

// Repainting the whole slider would repaint all the handles on it.
void MultiNubsieSlider::updateAfterStep(const QRect& before)
{
    if (!m_currentNubsie || m_features.testFlag(emfShowValueLabel) || m_features.testFlag(emfShowRangeLabels)) {
        update();
        return;
    }
    update(before);
    update(rectOnSlider(m_currentNubsie));
}

double MultiNubsieSlider::fineSpeed(const QPointF& pointer) const
{
    const bool horizontal = m_orientation == Qt::Horizontal;
    const double side = horizontal ? pointer.y() - height() * 0.5 : pointer.x() - width() * 0.5;
    if (std::abs(side) < s_SlidingAccuracyBorder) {
        return 1.0;
    }
    const QPoint origin = mapTo(window(), QPoint(0, 0));
    const double reach = horizontal ? NubsieDrag::reach(origin.y(), window()->height())
                                    : NubsieDrag::reach(origin.x(), window()->width());
    double slowest = NubsieDrag::s_MinimumSpeed;
    if (m_currentNubsie->getCurrentFeature().testFlag(Nubsie::enfDateMode)) {
        const QRectF bar = sliderBarRect();
        slowest = NubsieDrag::dateSpeed(horizontal ? bar.width() : bar.height(),
            m_currentNubsie->getStartDate().secsTo(m_currentNubsie->getEndDate()));
    }
    return NubsieDrag::speed(side, s_SlidingAccuracyBorder, reach, slowest);
}

void MultiNubsieSlider::dragNubsieInSteps(const QPointF& pointer, double target)
{
    const bool horizontal = m_orientation == Qt::Horizontal;
    const QPointer<MultiNubsieSlider> self(this);
    const QPointer<Nubsie> held = m_currentNubsie;
    const QPointF inWindow = mapTo(window(), NubsieGeometry::rounded(pointer));
    const QSize dragged = held->getDraggedSize();
    const double travel = NubsieDrag::stepTravel(horizontal ? width() : height(),
        horizontal ? dragged.width() : dragged.height(), held->minimum(), held->maximum());
    const double way = horizontal ? inWindow.x() - m_anchorPos.x() : m_anchorPos.y() - inWindow.y();

    // The handle goes with the pointer, its value by the way from the press.
    held->setDisplayValue(qBound(0.0, target, 1.0));
    held->setNormalizedValue(NubsieDrag::steppedValue(way, travel, m_anchorNormalized));
    held->performDragAction();
    if (self && m_currentNubsie) {
        updateNubsieLayer(m_currentNubsie);
    }
}

// Release ----------------------------------------------------------------------------------------------------

void MultiNubsieSlider::mouseReleaseEvent(QMouseEvent* event)
{
    m_grabbedNubsie = nullptr;
    bool clicked = false;
    if (releaseFlag(m_firstFlag, m_firstFlagPressed, event->pos(), clicked)) {
        if (clicked) {
            Q_EMIT firstFlagClicked();
        }
        return;
    }
    if (releaseFlag(m_secondFlag, m_secondFlagPressed, event->pos(), clicked)) {
        if (clicked) {
            Q_EMIT secondFlagClicked();
        }
        return;
    }
    if (event->button() == Qt::LeftButton && !m_currentNubsie && jumpOnTrack(event->localPos())) {
        return;
    }
    if (event->button() != Qt::LeftButton || !m_currentNubsie) {
        event->ignore();
        QWidget::mouseReleaseEvent(event);
        return;
    }
    const QPointer<MultiNubsieSlider> self(this);
    m_longClickTimer.stop();
    if (m_currentNubsie->normalizedValue() != m_anchorNormalized) {
        settleDrag(event->pos());
    } else if (!settleClick()) {
        if (self) {
            event->ignore();
            QWidget::mouseReleaseEvent(event);
        }
        return;
    }
    if (self) {
        closeGesture();
    }
}

// Whether the button was down on that flag.
bool MultiNubsieSlider::releaseFlag(const QLabel* flag, bool& pressed, const QPoint& position, bool& clicked)
{
    if (flag == nullptr || !pressed) {
        return false;
    }
    clicked = flag->geometry().contains(position);
    m_flagLongClickTimer.stop();
    pressed = false;
    return true;
}

void MultiNubsieSlider::settleDrag(const QPoint& position)
{
    const QPointer<MultiNubsieSlider> self(this);
    const QPointer<Nubsie> held = m_currentNubsie;
    if (!held->getCurrentFeature().testFlag(Nubsie::enfLiveDrag)) {
        Q_EMIT nubsieValueChangedByUser(held->id(), held->value(true));
        if (!self || !held) {
            return;
        }
    }
    const QFlags<Nubsie::ENubsieFeatures> features = held->getCurrentFeature();
    if (features.testFlag(Nubsie::enfStepOnFlick) && std::abs(m_velocity) > c_FlickVelocity
        && !features.testFlag(Nubsie::enfDiscreteSteps)) {
        // Down only at once after the last move, and otherwise up, even from a flick down: clients rely on it.
        if (m_velocity > 0.0 && QDateTime::currentMSecsSinceEpoch() - m_lastMoveStamp < c_FlickTime) {
            --*held;
        } else {
            ++*held;
        }
        if (!self || !held) {
            return;
        }
        Q_EMIT nubsieValueChangedByUser(held->id(), held->value(true));
        if (!self || !held) {
            return;
        }
    }
    held->performRelease(position);
    if (!self || !held || !held->getCurrentFeature().testFlag(Nubsie::enfResetOnRelease)) {
        return;
    }
    // The value is reported by the reset and once more, and so is the end of the drag: clients rely on it.
    resetNubsie(held);
    if (self && held) {
        Q_EMIT nubsieValueChangedByUser(held->id(), held->defaultValue());
    }
}

// Whether the gesture is over; otherwise a second click may follow.
bool MultiNubsieSlider::settleClick()
{
    const QPointer<MultiNubsieSlider> self(this);
    const QPointer<Nubsie> held = m_currentNubsie;
    const bool taken = held->performClick();
    if (!self) {
        return false;
    }
    if (held && taken) {
        held->setClickOrLongClickOccured(true);
    } else if (held) {
        const QFlags<Nubsie::ENubsieFeatures> features = held->getCurrentFeature();
        if (features.testFlag(Nubsie::enfStepOnClick) && !features.testFlag(Nubsie::enfDiscreteSteps)) {
            ++*held;
            if (!self) {
                return false;
            }
        }
    }
    if (m_doubleClicked) {
        m_doubleClicked = false;
        return true;
    }
    m_singleClickTimer.start();
    return false;
}

void MultiNubsieSlider::closeGesture()
{
    const QPointer<MultiNubsieSlider> self(this);
    const QPointer<Nubsie> held = m_currentNubsie;
    if (held) {
        enqueueNubsie(held, true);
        held->resetSize();
        Q_EMIT nubsieDragEnded(held->id());
        if (!self) {
            return;
        }
    }
    putBackCurrentNubsie();
}

// The last steps of a drag and of a click.
void MultiNubsieSlider::putBackCurrentNubsie()
{
    const QPointer<MultiNubsieSlider> self(this);
    const QPointer<Nubsie> held = m_currentNubsie;
    if (held && !held->getCurrentFeature().testFlag(Nubsie::enfDateMode)) {
        held->setValue(held->value(true), false, true);
    }
    if (!self) {
        return;
    }
    updateNubsiePositions(true);
    if (self) {
        m_currentNubsie = nullptr;
    }
}

bool MultiNubsieSlider::jumpOnTrack(const QPointF& position)
{
    if (!m_features.testFlag(emfJumpOnTrackClick) || m_nubsies.size() != 1 || !m_nubsies.constFirst()) {
        return false;
    }
    const QPointer<MultiNubsieSlider> self(this);
    const QPointer<Nubsie> nubsie = m_nubsies.constFirst();
    const QRectF bar = sliderBarRect();
    // The vertical form is not turned round, unlike the handle's own axis: clients rely on it.
    const double way = m_orientation == Qt::Horizontal ? position.x() : position.y();
    const double length = m_orientation == Qt::Horizontal ? bar.width() : bar.height();
    if (!(length > 0.0)) {
        return false;
    }
    nubsie->setNormalizedValue(way / length);
    nubsie->setDisplayValue(way / length);
    const int value = nubsie->value(true);
    // Reported here and once more by the handle.
    Q_EMIT nubsieValueChangedByUser(nubsie->id(), value);
    if (self && nubsie) {
        nubsie->setValue(value, true, true);
    }
    if (self && nubsie) {
        updateNubsieLayer(nubsie);
    }
    if (self) {
        update();
    }
    return true;
}

// Clicks -----------------------------------------------------------------------------------------------------

void MultiNubsieSlider::singleClickPerformed()
{
    if (!m_currentNubsie) {
        return;
    }
    const QPointer<MultiNubsieSlider> self(this);
    const QPointer<Nubsie> clicked = m_currentNubsie;
    if (!m_moved
        && clicked->getCurrentFeature().testFlag(Nubsie::enfValuePopover)
        // The key itself is looked up: only a range of exactly this one value opens the popover.
        && clicked->itemMap().contains(ValueRange(clicked->value(false)))) {
        clicked->showValuePopover();
        if (self && m_currentNubsie) {
            raiseNubsieOnSlider(m_currentNubsie);
        }
        return;
    }
    enqueueNubsie(clicked, true);
    clicked->resetSize();
    putBackCurrentNubsie();
}

void MultiNubsieSlider::nubsiePopoverClosing()
{
    if (m_currentNubsie) {
        m_currentNubsie->resetSize();
        enqueueNubsie(m_currentNubsie, true);
    }
    m_currentNubsie = nullptr;
}

void MultiNubsieSlider::mouseDoubleClickEvent(QMouseEvent* event)
{
    m_singleClickTimer.stop();
    m_doubleClicked = true;
    if (event->button() != Qt::LeftButton) {
        return;
    }
    const QPointer<MultiNubsieSlider> self(this);
    const QPointer<Nubsie> hit = nubsieUnder(event->pos());
    if (hit) {
        hit->performDoubleClick();
        if (!self || !hit || !hit->getCurrentFeature().testFlag(Nubsie::enfResetOnDoubleClick)) {
            return;
        }
        resetNubsie(hit);
        if (self && hit) {
            Q_EMIT nubsieValueChangedByUser(hit->id(), hit->defaultValue());
        }
        return;
    }
    if (flagHit(m_firstFlag, event->pos())) {
        event->accept();
        Q_EMIT firstFlagDoubleClicked();
        return;
    }
    if (flagHit(m_secondFlag, event->pos())) {
        event->accept();
        Q_EMIT secondFlagDoubleClicked();
        return;
    }
    QWidget::mouseDoubleClickEvent(event);
}

void MultiNubsieSlider::resetNubsie(Nubsie* nubsie)
{
    const QPointer<MultiNubsieSlider> self(this);
    const QPointer<Nubsie> guard(nubsie);
    guard->setValue(guard->defaultValue(), true, true);
    if (!self || !guard) {
        return;
    }
    const int id = guard->id();
    enqueueNubsie(guard, true);
    guard->resetSize();
    Q_EMIT triggerNubsieRepaintQueued(false);
    if (self) {
        Q_EMIT nubsieDragEnded(id);
    }
}

// Long clicks ------------------------------------------------------------------------------------------------

void MultiNubsieSlider::longClickEvent()
{
    if (!m_currentNubsie || !m_currentNubsie->getCurrentFeature().testFlag(Nubsie::enfLongClick)) {
        return;
    }
    const QPointer<MultiNubsieSlider> self(this);
    m_longClickTimer.stop();
    if (!m_currentNubsie->performLongClick() || !self || !m_currentNubsie) {
        return;
    }
    if (m_currentNubsie->getCurrentFeature().testFlag(Nubsie::enfHoldAfterLongClick)) {
        return;
    }
    enqueueNubsie(m_currentNubsie, true);
    m_currentNubsie->setClickOrLongClickOccured(true);
    m_currentNubsie->resetSize();
    m_currentNubsie->hideBalloon();
    if (self) {
        m_currentNubsie = nullptr;
    }
}

void MultiNubsieSlider::flagLongClickEvent()
{
    if (m_firstFlagPressed) {
        m_firstFlagPressed = false;
        Q_EMIT firstFlagLongClicked();
    } else if (m_secondFlagPressed) {
        m_secondFlagPressed = false;
        Q_EMIT secondFlagLongClicked();
    }
}

void MultiNubsieSlider::startLongClickTimer()
{
    m_longClickTimer.start();
}

void MultiNubsieSlider::stopLongClickTimer()
{
    m_longClickTimer.stop();
}

void MultiNubsieSlider::startFlagLongClickTimer()
{
    m_flagLongClickTimer.start();
}

void MultiNubsieSlider::stopFlagLongClickTimer()
{
    m_flagLongClickTimer.stop();
}
}
