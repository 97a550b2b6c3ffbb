// SPDX-License-Identifier: MIT
// A slider with any number of handles: the operations by id. All leave it at that when no handle has the id.
#include "sliders/MultiNubsieSlider.h"

namespace vx
{
// State ------------------------------------------------------------------------------------------------------

bool MultiNubsieSlider::nubsieExists(const int& id) const
{
    return nubsie(id) != nullptr;
}

bool MultiNubsieSlider::nubsieGrabbed(const int& id) const
{
    const Nubsie* const found = nubsie(id);
    return found != nullptr && found == m_grabbedNubsie;
}

bool MultiNubsieSlider::nubsieMaximized(const int& id) const
{
    const Nubsie* const found = nubsie(id);
    return found != nullptr && found->isMaximized();
}

bool MultiNubsieSlider::nubsieVisible(int id) const
{
    const Nubsie* const found = nubsie(id);
    return found != nullptr && found->externallyVisible();
}

// Values -----------------------------------------------------------------------------------------------------

int MultiNubsieSlider::value(const int& id) const
{
    const Nubsie* const found = nubsie(id);
    return found != nullptr ? found->value(true) : 0;
}

int MultiNubsieSlider::minimum(const int& id) const
{
    const Nubsie* const found = nubsie(id);
    return found != nullptr ? found->minimum() : 0;
}

int MultiNubsieSlider::maximum(const int& id) const
{
    const Nubsie* const found = nubsie(id);
    return found != nullptr ? found->maximum() : 0;
}

void MultiNubsieSlider::setValue(const int& id, int value, bool animated, bool emitSignal)
{
    const QPointer<Nubsie> found = nubsie(id);
    if (!found || found->value(true) == value) {
        return;
    }
    const QPointer<MultiNubsieSlider> self(this);
    m_singleClickTimer.stop();
    found->setValue(value, emitSignal, found != m_grabbedNubsie);
    // The user's hand wins: a held handle is not laid out before its release.
    if (!self || !found || found == m_grabbedNubsie || !isVisible()) {
        return;
    }
    enqueueNubsie(found, animated);
    update();
}

void MultiNubsieSlider::setValues(const int& id, int value, int minimum, int maximum, int defaultValue)
{
    const QPointer<Nubsie> found = nubsie(id);
    if (!found) {
        return;
    }
    const QPointer<MultiNubsieSlider> self(this);
    found->setRange(minimum, maximum);
    found->setValue(value, true, true);
    if (!self || !found) {
        return;
    }
    found->setDefaultValue(defaultValue);
    enqueueNubsie(found, true);
}

void MultiNubsieSlider::setRange(const int& id, int minimum, int maximum)
{
    const QPointer<Nubsie> found = nubsie(id);
    if (!found || (found->minimum() == minimum && found->maximum() == maximum)) {
        return;
    }
    const QPointer<MultiNubsieSlider> self(this);
    const int value = found->value(true);
    found->setRange(minimum, maximum);
    // The same for a held handle: it jumps, and its next drag step puts it back under the pointer.
    found->setValue(value, true, true);
    if (!self || !found) {
        return;
    }
    enqueueNubsie(found, false);
    updateNubsieLayer(found);
}

void MultiNubsieSlider::setDefaultValues(const int& id, int value)
{
    Nubsie* const found = nubsie(id);
    if (found == nullptr) {
        return;
    }
    found->setDefaultValue(value);
    enqueueNubsie(found, false);
}

// Dates ------------------------------------------------------------------------------------------------------

QDateTime MultiNubsieSlider::getDate(const int& id) const
{
    const Nubsie* const found = nubsie(id);
    return found != nullptr ? found->getDate() : QDateTime();
}

QDateTime MultiNubsieSlider::startDate(const int& id) const
{
    const Nubsie* const found = nubsie(id);
    return found != nullptr ? found->getStartDate() : QDateTime();
}

QDateTime MultiNubsieSlider::endDate(const int& id) const
{
    const Nubsie* const found = nubsie(id);
    return found != nullptr ? found->getEndDate() : QDateTime();
}

void MultiNubsieSlider::setDate(const int& id, const QDateTime& date, bool animated)
{
    const QPointer<Nubsie> found = nubsie(id);
    if (!found) {
        return;
    }
    const QPointer<MultiNubsieSlider> self(this);
    found->setDate(date);
    if (!self || !found) {
        return;
    }
    enqueueNubsie(found, animated);
    if (found) {
        found->updateNubsie(false);
    }
}

void MultiNubsieSlider::setStartEndDates(const int& id, const QDateTime& start, const QDateTime& end)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setStartEndDate(start, end);
    }
}

void MultiNubsieSlider::setDateDiff(const int& id, qint64 milliseconds)
{
    Nubsie* const found = nubsie(id);
    if (found == nullptr || milliseconds == 0 || !found->getCurrentFeature().testFlag(Nubsie::enfDateMode)) {
        return;
    }
    found->setAnchorTimeDiff(milliseconds);
    found->setDateDiffer(true);
    // The last of the three, since it updates the handle.
    found->setDeltaTimeMode(true);
}

void MultiNubsieSlider::clearDateDiff(const int& id)
{
    const QPointer<Nubsie> found = nubsie(id);
    if (!found) {
        return;
    }
    const QPointer<MultiNubsieSlider> self(this);
    if (found->getCurrentFeature().testFlag(Nubsie::enfDateMode)) {
        found->setAnchorTimeDiff(0);
        found->setDateDiffer(false);
        found->setDeltaTimeMode(false);
        if (found) {
            found->hideBalloon();
        }
    }
    if (self) {
        updateNubsiePositions(false);
    }
}

// Features and looks -----------------------------------------------------------------------------------------

QFlags<Nubsie::ENubsieFeatures> MultiNubsieSlider::getFeatures(const int& id) const
{
    const Nubsie* const found = nubsie(id);
    return found != nullptr ? found->getCurrentFeature() : QFlags<Nubsie::ENubsieFeatures>();
}

void MultiNubsieSlider::setFeatures(const int& id, QFlags<Nubsie::ENubsieFeatures> features)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setFeatures(features);
    }
}

void MultiNubsieSlider::addFeatures(const int& id, QFlags<Nubsie::ENubsieFeatures> features)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setFeatures(found->getCurrentFeature() | features);
    }
}

void MultiNubsieSlider::setStandardSize(const int& id, QSize size)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setSize(size);
    }
}

void MultiNubsieSlider::setDraggedSize(const int& id, QSize size)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setDraggedSize(size);
    }
}

void MultiNubsieSlider::setIcon(const int& id, const QPixmap& icon)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setIcon(icon);
    }
}

void MultiNubsieSlider::setIconRed(const int& id, const QPixmap& icon)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setIconRed(icon);
    }
}

void MultiNubsieSlider::setIconMap(const int& id, const QMap<vx::ValueRange, QPixmap>& map)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setIconMap(map);
    }
}

void MultiNubsieSlider::setItemMap(
    const int& id, const QMap<vx::ValueRange, QPointer<vx::PopoverWidget::Item>>& map)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setItemMap(map);
    }
}

void MultiNubsieSlider::setText(const int& id, const QString& text)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setText(text);
    }
}

void MultiNubsieSlider::setTextMap(const int& id, const QMap<vx::ValueRange, QString>& map)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setTextMap(map);
    }
}

void MultiNubsieSlider::setToolTipText(const int& id, const QString& text)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setToolTipText(text);
    }
}

void MultiNubsieSlider::setTextColor(const int& id, const QColor& color)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setTextColor(color);
    }
}

void MultiNubsieSlider::setBackColor(const int& id, const QColor& color)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setBackColor(color);
    }
}

void MultiNubsieSlider::setBalloonTextMap(const int& id, const QMap<vx::ValueRange, QString>& map)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setBalloonTextMap(map);
    }
}

void MultiNubsieSlider::setPopoverFeatures(
    const int& id, QFlags<vx::PopoverWidget::Balloon::EBalloonFeature> features)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setBalloonFeatures(features);
    }
}

void MultiNubsieSlider::setPopoverID(const int& id, int controllerId, const QString& title)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setControllerID(controllerId);
        found->setBalloonTitle(title);
    }
}

void MultiNubsieSlider::startBlinkingNubsie(const int& id, int duration)
{
    if (Nubsie* const found = nubsie(id)) {
        found->startBlinking(duration);
    }
}

void MultiNubsieSlider::stopBlinkingNubsie(const int& id)
{
    if (Nubsie* const found = nubsie(id)) {
        found->stopBlinking();
    }
}

bool MultiNubsieSlider::isBlinkingNubsie(const int& id) const
{
    const Nubsie* const found = nubsie(id);
    return found != nullptr && found->isBlinking();
}

// What is called ---------------------------------------------------------------------------------------------

void MultiNubsieSlider::setClickSlot(const int& id, const vx::QtSlot& slot)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setClickSlot(slot);
    }
}

void MultiNubsieSlider::setClickSlotMap(const int& id, const QMap<vx::ValueRange, vx::QtSlot>& map)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setClickSlotMap(map);
    }
}

void MultiNubsieSlider::setDoubleClickSlot(const int& id, const vx::QtSlot& slot)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setDoubleClickSlot(slot);
    }
}

void MultiNubsieSlider::setDoubleClickSlotMap(const int& id, const QMap<vx::ValueRange, vx::QtSlot>& map)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setDoubleClickSlotMap(map);
    }
}

void MultiNubsieSlider::setDragSlot(const int& id, const vx::QtSlot& slot)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setDragSlot(slot);
    }
}

void MultiNubsieSlider::setDragSlotMap(const int& id, const QMap<vx::ValueRange, vx::QtSlot>& map)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setDragSlotMap(map);
    }
}

void MultiNubsieSlider::setLongPressSlot(const int& id, const vx::QtSlot& slot)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setLongPressSlot(slot);
    }
}

void MultiNubsieSlider::setLongPressSlotMap(const int& id, const QMap<vx::ValueRange, vx::QtSlot>& map)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setLongPressSlotMap(map);
    }
}

void MultiNubsieSlider::setPressSlot(const int& id, const vx::QtSlot& slot)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setPressSlot(slot);
    }
}

void MultiNubsieSlider::setPressSlotMap(const int& id, const QMap<vx::ValueRange, vx::QtSlot>& map)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setPressSlotMap(map);
    }
}

void MultiNubsieSlider::setReleaseSlot(const int& id, const vx::QtSlot& slot)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setReleaseSlot(slot);
    }
}

void MultiNubsieSlider::setReleaseSlotMap(const int& id, const QMap<vx::ValueRange, vx::QtSlot>& map)
{
    if (Nubsie* const found = nubsie(id)) {
        found->setReleaseSlotMap(map);
    }
}
}
