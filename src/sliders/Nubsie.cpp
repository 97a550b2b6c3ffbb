// SPDX-License-Identifier: MIT
// The handle of a slider with several handles: what it knows and what it calls. NubsieDisplay.cpp has its looks.
#include "sliders/Nubsie.h"

#include "CoreQt/Connect.h"
#include "popover/Container.h"
#include "popover/Controller.h"
#include "sliders/MultiNubsieSlider.h"
#include "sliders/NubsieMath.h"

#include <QtCore/QMetaObject>

namespace vx
{
namespace
{
template <typename Thing> Thing nubsieEntry(const QMap<ValueRange, Thing>& map, int value, const Thing& fallback)
{
    const Thing* const found = NubsieMath::entryFor(map, value);
    return found != nullptr ? *found : fallback;
}
}

unsigned int Nubsie::s_LongClickMaxMoveThreshold = 30;
const int Nubsie::qMetaTypes = nubsieIDMetaType();
int Nubsie::s_NubsieID = -1;

Nubsie::Nubsie(const QString& name, int value, int minimum, int maximum, int defaultValue, QWidget* parent, int id)
    : QWidget(parent)
    , PopoverBalloonWidget(this, QStringLiteral("sliderControlBalloon"), 0, QString())
    , m_id(id >= 0 ? id : ++s_NubsieID)
    , m_features(QFlags<ENubsieFeatures>(enfDraggable) | enfMoveable | enfLiveDrag)
    , m_sizeAnimator(this, "currentSize")
    , m_positionAnimator(this, "position")
    , m_textColor(255, 255, 255, 255)
    , m_backColor(236, 33, 33, 255)
    , m_defaultValue(defaultValue)
    , m_maximum(maximum)
    , m_minimum(minimum)
    , m_displayValue(NubsieMath::normalized(value, minimum, maximum))
    , m_normalizedValue(m_displayValue)
    , m_glow(QStringLiteral(":/glow.png"))
    , m_glowAnimator(this, "glowOpacity")
{
    setObjectName(name);
    initialize();
}

Nubsie::Nubsie(QWidget* parent)
    : QWidget(parent)
    , PopoverBalloonWidget(this, QStringLiteral("sliderControlBalloon"), 0, QString())
    , m_id(++s_NubsieID)
    , m_features(QFlags<ENubsieFeatures>(enfDraggable) | enfMoveable | enfLiveDrag)
    , m_sizeAnimator(this, "currentSize")
    , m_positionAnimator(this, "position")
    , m_textColor(255, 255, 255, 255)
    , m_backColor(236, 33, 33, 255)
    , m_defaultValue(-1)
    , m_maximum(2147483647)
    , m_minimum(-2147483647 - 1)
    , m_displayValue(2147483648.0)
    , m_normalizedValue(2147483648.0)
    , m_glow(QStringLiteral(":/glow.png"))
    , m_glowAnimator(this, "glowOpacity")
{
    initialize();
}

Nubsie::~Nubsie() = default;

void Nubsie::initialize()
{
    vx::connect(&m_glowAnimator, "2valueChanged(const QVariant&)", this, "1update()", Qt::AutoConnection);
    m_glowAnimator.setEasingCurve(QEasingCurve::SineCurve);
    m_glowAnimator.setDuration(static_cast<int>(s_DefaultBlinkDuration));
    m_glowAnimator.setLoopCount(-1);
    m_glowAnimator.setStartValue(0.0);
    m_glowAnimator.setEndValue(1.0);
    setAttribute(Qt::WA_TransparentForMouseEvents);
    vx::connect(&m_sizeAnimator, "2finished()", this, "1clearClickOrLongClickOccured()", Qt::UniqueConnection);
}

int Nubsie::id() const
{
    return m_id;
}

QString Nubsie::toolTipText() const
{
    return m_toolTipText;
}

void Nubsie::setToolTipText(const QString& text)
{
    m_toolTipText = text;
}

// Features -------------------------------------------------------------------------------------------------

void Nubsie::setFeatures(QFlags<ENubsieFeatures> features)
{
    m_features = features;
    updateNubsie(false);
}

QFlags<Nubsie::ENubsieFeatures> Nubsie::features() const
{
    return m_features;
}

void Nubsie::setFeatureMap(const QMap<ValueRange, ENubsieFeatures>& map)
{
    m_featureMap = map;
}

QFlags<Nubsie::ENubsieFeatures> Nubsie::getFeatureFromValue(int value) const
{
    const ENubsieFeatures* const found = NubsieMath::entryFor(m_featureMap, value);
    return found != nullptr ? QFlags<ENubsieFeatures>(*found) : m_features;
}

QFlags<Nubsie::ENubsieFeatures> Nubsie::getCurrentFeature() const
{
    return getFeatureFromValue(trueValue());
}

bool Nubsie::isDraggable() const
{
    return m_features.testFlag(enfDraggable);
}

bool Nubsie::isMoveable() const
{
    return m_features.testFlag(enfMoveable);
}

void Nubsie::setState(QFlags<ENubsieState> state)
{
    m_state = state;
}

void Nubsie::addState(QFlags<ENubsieState> state)
{
    m_state |= state;
}

void Nubsie::unsetState(QFlags<ENubsieState> state)
{
    m_state &= ~state;
}

QFlags<Nubsie::ENubsieState> Nubsie::getState() const
{
    return m_state;
}

// Value ----------------------------------------------------------------------------------------------------

double Nubsie::createNormalizedValue(int value) const
{
    return NubsieMath::normalized(value, m_minimum, m_maximum);
}

int Nubsie::valueFromNormalizedValue(double normalized) const
{
    return NubsieMath::denormalized(normalized, m_minimum, m_maximum);
}

int Nubsie::trueValue() const
{
    return valueFromNormalizedValue(m_normalizedValue);
}

int Nubsie::turnedRound(int value) const
{
    return m_features.testFlag(enfInverted) ? NubsieMath::turnedRound(value, m_minimum, m_maximum) : value;
}

int Nubsie::value(bool raw) const
{
    return raw ? trueValue() : turnedRound(trueValue());
}

void Nubsie::setValue(int value, bool emitSignal, bool updateDisplay)
{
    const double normalized = createNormalizedValue(value);
    if (updateDisplay) {
        m_displayValue = normalized;
    }
    m_previousValue = trueValue();
    m_normalizedValue = normalized;
    m_sizeAnimator.stop();
    setCurrentSize(m_size);
    m_positionAnimator.stop();
    setPosition(m_position);
    update();
    updateNubsie(false);
    if (emitSignal) {
        Q_EMIT valueChanged(trueValue());
    }
}

int Nubsie::previousValue() const
{
    return m_previousValue;
}

int Nubsie::defaultValue() const
{
    return m_defaultValue;
}

void Nubsie::setDefaultValue(int value)
{
    m_defaultValue = value;
}

int Nubsie::maximum() const
{
    return m_maximum;
}

void Nubsie::setMaximum(int maximum)
{
    m_maximum = maximum;
}

int Nubsie::minimum() const
{
    return m_minimum;
}

void Nubsie::setMinimum(int minimum)
{
    m_minimum = minimum;
}

void Nubsie::setRange(int minimum, int maximum)
{
    m_minimum = minimum;
    m_maximum = maximum;
}

double Nubsie::getDisplayValue() const
{
    return m_displayValue;
}

void Nubsie::setDisplayValue(double value)
{
    m_displayValue = value;
}

double Nubsie::normalizedValue() const
{
    return m_normalizedValue;
}

void Nubsie::setNormalizedValue(double value)
{
    m_previousValue = trueValue();
    m_normalizedValue = value;
}

void Nubsie::reset()
{
    setValue(m_defaultValue, true, true);
}

Nubsie& Nubsie::operator++()
{
    const QPointer<Nubsie> guard(this);
    // Around the end it goes on at 0, not at the minimum: clients rely on it.
    setValue(NubsieMath::steppedUp(trueValue(), m_maximum), true, true);
    if (!guard.isNull()) {
        updateNubsie(true);
    }
    return *this;
}

Nubsie& Nubsie::operator--()
{
    const QPointer<Nubsie> guard(this);
    setValue(NubsieMath::steppedDown(trueValue(), m_minimum, m_maximum), true, true);
    if (!guard.isNull()) {
        updateNubsie(true);
    }
    return *this;
}

// Dates ----------------------------------------------------------------------------------------------------

void Nubsie::setStartEndDate(const QDateTime& start, const QDateTime& end)
{
    m_startDate = start;
    m_endDate = end;
}

QDateTime Nubsie::getStartDate() const
{
    return m_startDate;
}

QDateTime Nubsie::getEndDate() const
{
    return m_endDate;
}

void Nubsie::setDate(const QDateTime& date)
{
    setValue(NubsieMath::valueOfDate(date.toMSecsSinceEpoch(), m_startDate.toMSecsSinceEpoch(),
                 m_endDate.toMSecsSinceEpoch(), m_minimum, m_maximum),
        true, true);
}

QDateTime Nubsie::getDate() const
{
    return QDateTime::fromMSecsSinceEpoch(
        NubsieMath::dateOfPlace(m_startDate.toMSecsSinceEpoch(), m_endDate.toMSecsSinceEpoch(), m_normalizedValue))
        .toLocalTime();
}

bool Nubsie::deltaTimeMode() const
{
    return m_deltaTimeMode;
}

void Nubsie::setDeltaTimeMode(bool on)
{
    m_deltaTimeMode = on;
    updateNubsie(on);
}

bool Nubsie::dateDiffer() const
{
    return m_dateDiffer;
}

void Nubsie::setDateDiffer(bool differ)
{
    m_dateDiffer = differ;
}

qint64 Nubsie::anchorTimeDiff() const
{
    return m_anchorTimeDiff;
}

void Nubsie::setAnchorTimeDiff(qint64 difference)
{
    m_anchorTimeDiff = difference;
}

// What is called -------------------------------------------------------------------------------------------

void Nubsie::setClickSlot(const QtSlot& slot)
{
    m_clickSlot = slot;
}

void Nubsie::setClickSlotMap(const QMap<ValueRange, QtSlot>& map)
{
    m_clickSlotMap = map;
}

void Nubsie::setDoubleClickSlot(const QtSlot& slot)
{
    m_doubleClickSlot = slot;
}

void Nubsie::setDoubleClickSlotMap(const QMap<ValueRange, QtSlot>& map)
{
    m_doubleClickSlotMap = map;
}

void Nubsie::setDragSlot(const QtSlot& slot)
{
    m_dragSlot = slot;
}

void Nubsie::setDragSlotMap(const QMap<ValueRange, QtSlot>& map)
{
    m_dragSlotMap = map;
}

void Nubsie::setLongPressSlot(const QtSlot& slot)
{
    m_longPressSlot = slot;
}

void Nubsie::setLongPressSlotMap(const QMap<ValueRange, QtSlot>& map)
{
    m_longPressSlotMap = map;
}

void Nubsie::setPressSlot(const QtSlot& slot)
{
    m_pressSlot = slot;
}

void Nubsie::setPressSlotMap(const QMap<ValueRange, QtSlot>& map)
{
    m_pressSlotMap = map;
}

void Nubsie::setReleaseSlot(const QtSlot& slot)
{
    m_releaseSlot = slot;
}

void Nubsie::setReleaseSlotMap(const QMap<ValueRange, QtSlot>& map)
{
    m_releaseSlotMap = map;
}

QtSlot Nubsie::getSlotFromValue(int value, const QMap<ValueRange, QtSlot>& map, const QtSlot& fallback) const
{
    return nubsieEntry(map, value, fallback);
}

bool Nubsie::invokeSlot(const QtSlot& slot) const
{
    QObject* const receiver = slot.receiver();
    if (receiver == nullptr || *slot.slotName() == '\0') {
        return false;
    }
    return QMetaObject::invokeMethod(receiver, slot.slotName(), slot.connectionType(), slot.parameter(0),
        slot.parameter(1), slot.parameter(2), slot.parameter(3), slot.parameter(4), slot.parameter(5),
        slot.parameter(6), slot.parameter(7), slot.parameter(8), slot.parameter(9));
}

bool Nubsie::performSlot(const QMap<ValueRange, QtSlot>& map, const QtSlot& fallback) const
{
    const int value = trueValue();
    QtSlot slot = getSlotFromValue(value, map, fallback);
    slot.setParameter(0, Q_ARG(int, value));
    return invokeSlot(slot);
}

bool Nubsie::performLongClick()
{
    return performSlot(m_longPressSlotMap, m_longPressSlot);
}

bool Nubsie::performClick()
{
    return performSlot(m_clickSlotMap, m_clickSlot);
}

bool Nubsie::performDrag()
{
    return performSlot(m_dragSlotMap, m_dragSlot);
}

bool Nubsie::performDoubleClick()
{
    return performSlot(m_doubleClickSlotMap, m_doubleClickSlot);
}

bool Nubsie::performPress()
{
    return performSlot(m_pressSlotMap, m_pressSlot);
}

bool Nubsie::performRelease(QPoint globalPos)
{
    const int value = trueValue();
    QtSlot slot = getSlotFromValue(value, m_releaseSlotMap, m_releaseSlot);
    slot.setParameter(0, Q_ARG(int, value));
    slot.setParameter(1, Q_ARG(QPoint, globalPos));
    return invokeSlot(slot);
}

bool Nubsie::performDragAction()
{
    const int value = trueValue();
    if (m_previousValue == value) {
        return false;
    }
    if (getFeatureFromValue(value).testFlag(enfLiveDrag)) {
        const QPointer<Nubsie> guard(this);
        performDrag();
        if (guard.isNull()) {
            return true;
        }
        Q_EMIT valueChanged(trueValue());
        if (guard.isNull()) {
            return true;
        }
    }
    m_deltaTimeMode = false;
    m_dateDiffer = false;
    updateNubsie(false);
    return true;
}

bool Nubsie::clickOrLongClickOccured() const
{
    return m_clickOrLongClickOccured;
}

void Nubsie::setClickOrLongClickOccured(bool occured)
{
    m_clickOrLongClickOccured = occured;
}

void Nubsie::clearClickOrLongClickOccured()
{
    m_clickOrLongClickOccured = false;
}

// Value popover --------------------------------------------------------------------------------------------

void Nubsie::setItemMap(const QMap<ValueRange, QPointer<PopoverWidget::Item>>& map)
{
    if (hasController()) {
        const QPointer<PopoverWidget::Controller> controller = getController();
        if (!controller.isNull() && controller->getContainer() != nullptr) {
            controller->getContainer()->clear();
        }
    }
    setBalloonItemMap(map);
    updateNubsie(false);
}

QMap<ValueRange, QPointer<PopoverWidget::Item>> Nubsie::itemMap() const
{
    return balloonItemMap();
}

Nubsie::EValuePopoverType Nubsie::getValuePopoverType() const
{
    return evptItems;
}

void Nubsie::showValuePopover()
{
    const QPointer<PopoverWidget::Controller> controller = getController();
    if (!controller.isNull()) {
        vx::connect(controller, "2itemPerformed(int,QVariant,QVariant,vx::PopoverWidget::EItemPerformedFlags)",
            this, "1handlePopoverAction(int,QVariant,QVariant,vx::PopoverWidget::EItemPerformedFlags)",
            Qt::UniqueConnection);
        vx::connect(controller, "2popoverWillDisappear()", this, "2valuePopoverClosing()", Qt::UniqueConnection);
    }
    setItemMapEnabled(true);
    PopoverBalloonWidget::updateBalloon(turnedRound(trueValue()), m_minimum, m_maximum);
}

void Nubsie::hideValuePopover()
{
    setItemMapEnabled(false);
}

void Nubsie::handlePopoverAction(
    int itemId, QVariant value, QVariant userData, vx::PopoverWidget::EItemPerformedFlags flags)
{
    Q_UNUSED(itemId)
    Q_UNUSED(value)
    Q_UNUSED(flags)
    if (userData.type() != QVariant::Int) {
        return;
    }
    setValue(turnedRound(userData.toInt()), false, false);
    Q_EMIT valueChangedbyPopover(trueValue());
}
}
