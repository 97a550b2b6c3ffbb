// SPDX-License-Identifier: MIT
// vx::PopoverWidget::Controller: clicks outside, keys, drops, and what happens to the widgets around it.
#include "popover/Controller.h"

#include "foundation/WidgetPrimitive.h"
#include "popover/Container.h"
#include "popover/ControllerVerdicts.h"

#include <QDragEnterEvent>
#include <QDragLeaveEvent>
#include <QDragMoveEvent>
#include <QDropEvent>
#include <QKeyEvent>
#include <QList>
#include <QMimeData>
#include <QMouseEvent>
#include <QResizeEvent>
#include <QShowEvent>

#include <algorithm>
#include <typeinfo>

namespace vx
{
namespace PopoverWidget
{
void Controller::mousePressEvent(QMouseEvent* event)
{
    if (m_balloon != nullptr) {
        // A press inside ends what a press outside has begun: its release may have gone to a nested popover.
        m_pressedOutside = isPressOutside(m_balloon->geometry().contains(event->pos()), m_closing, m_stayVisible);
    }
    FadableThing<QWidget>::mousePressEvent(event);
}

void Controller::mouseReleaseEvent(QMouseEvent* event)
{
    const bool pressedOutside = m_pressedOutside;
    m_pressedOutside = false;
    if (m_balloon == nullptr) {
        FadableThing<QWidget>::mouseReleaseEvent(event);
        return;
    }
    if (isClickOutside(pressedOutside, m_balloon->geometry().contains(event->pos()), m_closing, m_stayVisible)) {
        dismiss(true, false);
        event->accept();
    }
}

void Controller::keyReleaseEvent(QKeyEvent* event)
{
    switch (keyVerdict(event->key(), isVisible(), m_stayVisible, m_closing)) {
    case EKeyVerdict::NotOurs:
        FadableThing<QWidget>::keyReleaseEvent(event);
        return;
    case EKeyVerdict::Ignore:
        event->ignore();
        return;
    case EKeyVerdict::Reject:
        Q_EMIT shouldReject();
        break;
    case EKeyVerdict::Dismiss:
        // Forced: the container is not asked.
        dismiss(false, true);
        break;
    case EKeyVerdict::Accept:
        Q_EMIT shouldAccept();
        break;
    }
    event->accept();
}

bool Controller::eventFilter(QObject* watched, QEvent* event)
{
    if (!isVisible()) {
        return false;
    }
    const QPointer<Controller> self(this);
    const bool resized = event->type() == QEvent::Resize;
    if (resized && watched == m_inWidget) {
        resizeEvent(static_cast<QResizeEvent*>(event));
    }
    if (self != nullptr && (resized || event->type() == QEvent::Move) && watched == m_forWidget
        && m_balloon != nullptr) {
        m_balloon->setupLayout(false);
    }
    return false;
}

void Controller::resizeEvent(QResizeEvent* event)
{
    const QPointer<Controller> self(this);
    updateLayout(false);
    if (self == nullptr) {
        return;
    }
    FadableThing<QWidget>::resizeEvent(event);
    const QList<QPointer<Controller>> nested = nestedControllers();
    for (const QPointer<Controller>& controller : nested) {
        if (controller != nullptr) {
            controller->event(event);
        }
    }
}

void Controller::setVisible(bool visible)
{
    if (visible || !isUnseen()) {
        FadableThing<QWidget>::setVisible(visible);
        return;
    }
    const QPointer<Controller> self(this);
    setAttribute(Qt::WA_UpdatesDisabled, true);
    FadableThing<QWidget>::setVisible(false);
    if (self != nullptr) {
        setAttribute(Qt::WA_UpdatesDisabled, false);
    }
}

/// Whether the overlay is up without a picture of its own: the balloon has gone, and no style sheet paints it.
bool Controller::isUnseen() const
{
    if (!isVisible() || isWindow() || !updatesEnabled() || typeid(*this) != typeid(Controller)
        || WidgetPrimitive::isPaintedBy(*style()) || autoFillBackground() || graphicsEffect() != nullptr
        || testAttribute(Qt::WA_StyledBackground) || testAttribute(Qt::WA_OpaquePaintEvent)) {
        return false;
    }
    return std::none_of(children().cbegin(), children().cend(), [](const QObject* child) {
        const auto* const widget = qobject_cast<const QWidget*>(child);
        return widget != nullptr && !widget->isHidden();
    });
}

QList<QPointer<Controller>> Controller::nestedControllers() const
{
    // Most popovers hold none, and a search through all their rows would find that out with every resize.
    QList<QPointer<Controller>> nested;
    if (std::any_of(all().cbegin(), all().cend(), [this](const Controller* other) {
            const QObject* parent = other->parent();
            while (parent != nullptr && parent != this) {
                parent = parent->parent();
            }
            return parent != nullptr;
        })) {
        const QList<Controller*> found = findChildren<Controller*>();
        for (Controller* controller : found) {
            nested << controller;
        }
    }
    return nested;
}

void Controller::showEvent(QShowEvent* event)
{
    const QPointer<Controller> self(this);
    updateLayout(true);
    if (self != nullptr) {
        FadableThing<QWidget>::showEvent(event);
    }
}

void Controller::dragEnterEvent(QDragEnterEvent* event)
{
    if (event->mimeData()->hasFormat(Item::sPopoverWidgetItem)) {
        event->accept();
    }
    FadableThing<QWidget>::dragEnterEvent(event);
}

void Controller::dragMoveEvent(QDragMoveEvent* event)
{
    if (event->mimeData()->hasFormat(Item::sPopoverWidgetItem)) {
        event->accept();
    }
    FadableThing<QWidget>::dragMoveEvent(event);
}

void Controller::dragLeaveEvent(QDragLeaveEvent* event)
{
    FadableThing<QWidget>::dragLeaveEvent(event);
}

void Controller::dropEvent(QDropEvent* event)
{
    if (event->mimeData()->hasFormat(Item::sPopoverWidgetItem)) {
        event->accept();
        Q_EMIT itemDropped(qobject_cast<Item*>(event->source()), event, mapToGlobal(event->pos()));
    }
}
}
}
