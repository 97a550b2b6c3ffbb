// SPDX-License-Identifier: MIT
// vx::PopoverWidget::Manager: the registry of all popovers of the process.
#include "popover/Manager.h"

#include "CoreQt/Connect.h"
#include "foundation/LogStatement.h"
#include "popover/Container.h"
#include "popover/Item.h"

#include <QPointF>
#include <QWidget>

namespace vx
{
namespace PopoverWidget
{
Manager* Manager::s_ManagerInstance = nullptr;

namespace
{
bool isOpen(const Controller* controller)
{
    return controller != nullptr && (controller->isVisible() || controller->isActive());
}

bool isOfWindow(const QPointer<Controller>& controller, const QWidget* window)
{
    return controller != nullptr && (window == nullptr || controller->window() == window);
}
}

Manager::Manager(int firstId)
    : m_nextId(firstId)
{
}

Manager::~Manager()
{
    s_ManagerInstance = nullptr;
}

void Manager::init(int firstId)
{
    if (s_ManagerInstance == nullptr) {
        s_ManagerInstance = new Manager(firstId);
    }
}

Manager* Manager::instance()
{
    return s_ManagerInstance;
}

void Manager::deleteInstance()
{
    delete s_ManagerInstance;
    s_ManagerInstance = nullptr;
}

int Manager::getUniquePopoverID()
{
    return ++m_nextId;
}

// --- Registry --------------------------------------------------------------------------------------------------

QPointer<Controller> Manager::reusedController(int id, bool reuse, bool& reused, const QString& objectName) const
{
    reused = reuse && id != sDefaultControllerID && m_controllers.contains(id);
    const QPointer<Controller> controller = reused ? getController(id) : nullptr;
    if (controller != nullptr) {
        controller->setObjectName(objectName);
    }
    return controller;
}

QPointer<Controller> Manager::createController(int id, bool reuse, bool isSubController, QWidget* inWidget,
    QWidget* forWidget, const QString& title, const QString& objectName,
    QFlags<Balloon::EArrowDirection> directions, const QSizeF& size, QFlags<Balloon::ESizeConstraint> constraints)
{
    bool reused = false;
    QPointer<Controller> controller = reusedController(id, reuse, reused, objectName);
    if (!reused) {
        controller
            = new Controller(inWidget, forWidget, isSubController, objectName, directions, size, constraints);
        controller->setTitle(title);
        addController(id, controller);
    } else if (controller != nullptr) {
        if (forWidget != nullptr) {
            controller->setForWidget(*forWidget, QPointF(-1, 0));
        }
        controller->setInWidget(inWidget);
        controller->setTitle(title);
    }
    return controller;
}

QPointer<Controller> Manager::createController(int id, bool reuse, bool isSubController, QWidget* inWidget,
    const QString& title, const QString& objectName, const QSizeF& size,
    QFlags<Balloon::ESizeConstraint> constraints)
{
    bool reused = false;
    QPointer<Controller> controller = reusedController(id, reuse, reused, objectName);
    if (!reused) {
        controller = new Controller(inWidget, isSubController, objectName, size, constraints);
        controller->setTitle(title);
        addController(id, controller);
    } else if (controller != nullptr) {
        controller->setInWidget(inWidget);
        controller->setTitle(title);
    }
    return controller;
}

void Manager::addController(int id, const QPointer<Controller>& controller)
{
    vx::connect(controller, "2controllerDestroyed( vx::PopoverWidget::Controller* )", this,
        "1onControllerDestroyed( vx::PopoverWidget::Controller* )", Qt::UniqueConnection);
    vx::connect(controller, "2popoverWillAppear()", this, "1onPopoverWillOpen()", Qt::UniqueConnection);
    vx::connect(controller, "2popoverDidAppear()", this, "1onPopoverDidOpen()", Qt::UniqueConnection);
    vx::connect(controller, "2popoverWillDisappear()", this, "1onPopoverWillDisappear()", Qt::UniqueConnection);
    vx::connect(controller, "2popoverDidDisappear()", this, "1onPopoverDidDisappear()", Qt::UniqueConnection);
    vx::connect(controller, "2popoverWillHelp()", this, "1onPopoverWillHelp()", Qt::UniqueConnection);
    m_controllers.insert(id, controller);
}

QPointer<Controller> Manager::getController(int id) const
{
    return m_controllers.value(id);
}

QPointer<Controller> Manager::getController(Controller* controller) const
{
    for (const QPointer<Controller>& entry : m_controllers) {
        if (entry == controller) {
            return entry;
        }
    }
    return nullptr;
}

QList<QPointer<Controller>> Manager::getControllers(int id) const
{
    return m_controllers.values(id);
}

int Manager::getControllerID(Controller* controller) const
{
    return controller != nullptr ? m_controllers.key(controller, sDefaultControllerID) : sDefaultControllerID;
}

int Manager::getControllerID(QPointer<Controller> controller) const
{
    return getControllerID(controller.data());
}

void Manager::setControllerID(QPointer<Controller> controller, int id)
{
    if (controller == nullptr) {
        return;
    }
    const QList<int> ids = m_controllers.keys(controller);
    for (int old : ids) {
        m_controllers.remove(old, controller);
    }
    addController(id, controller);
}

void Manager::onControllerDestroyed(Controller* controller)
{
    const QPointer<Controller> entry = getController(controller);
    if (entry == nullptr) {
        return;
    }
    const QList<int> ids = m_controllers.keys(entry);
    if (ids.size() == 1) {
        const int id = ids.first();
        m_dropTypes.remove(id);
        m_controllers.remove(id, entry);
        ZELKOV_LOG(vx::c_LogTrace, "vx::PopoverWidget::Manager::onControllerDestroyed",
            "controller " << id << " removed!");
    } else if (ids.isEmpty()) {
        ZELKOV_LOG(
            vx::c_LogTrace, "vx::PopoverWidget::Manager::onControllerDestroyed", "object to delete not in list!");
    } else {
        ZELKOV_LOG(
            vx::c_LogTrace, "vx::PopoverWidget::Manager::onControllerDestroyed", "multiple entries in list!");
    }
}

// --- Contents --------------------------------------------------------------------------------------------------

Container* Manager::getContainer(int id) const
{
    const QPointer<Controller> controller = getController(id);
    return controller != nullptr ? controller->getContainer() : nullptr;
}

Item* Manager::getItem(int id, int itemId) const
{
    Container* const container = getContainer(id);
    return container != nullptr ? container->getItems(itemId).value(0) : nullptr;
}

Item* Manager::getSelectedItem(int id, int itemId) const
{
    Container* const container = getContainer(id);
    return container != nullptr ? container->getSelectedItem(itemId) : nullptr;
}

QVariant Manager::getItemValue(int id, int itemId) const
{
    Container* const container = getContainer(id);
    return container != nullptr ? container->getItemValue(itemId) : QVariant();
}

QVariant Manager::getItemUserData(int id, int itemId) const
{
    Container* const container = getContainer(id);
    return container != nullptr ? container->getItemUserData(itemId) : QVariant();
}

// --- What is open ----------------------------------------------------------------------------------------------

bool Manager::isPopoverOpen(int id) const
{
    return isOpen(getController(id));
}

QPointer<Controller> Manager::currentPopover() const
{
    for (const QPointer<Controller>& controller : m_controllers) {
        if (isOpen(controller)) {
            return controller;
        }
    }
    return nullptr;
}

QPointer<Controller> Manager::currentModalPopover() const
{
    for (const QPointer<Controller>& controller : m_controllers) {
        if (isOpen(controller) && controller->isModal()) {
            return controller;
        }
    }
    return nullptr;
}

int Manager::currentPopoverID() const
{
    return getControllerID(currentPopover());
}

bool Manager::anyPopoverOpen(QWidget* window) const
{
    return isOfWindow(currentPopover(), window);
}

bool Manager::anyModalPopoverOpen(QWidget* window) const
{
    return isOfWindow(currentModalPopover(), window);
}

// --- All at once -----------------------------------------------------------------------------------------------

void Manager::dismissThose(const QList<QPointer<Controller>>& controllers, bool animated, bool force)
{
    for (const QPointer<Controller>& controller : controllers) {
        if (controller != nullptr) {
            controller->dismiss(animated, force);
        }
    }
}

QList<QPointer<Controller>> Manager::controllersOf(QWidget* window, bool modalOnly) const
{
    QList<QPointer<Controller>> result;
    for (const QPointer<Controller>& controller : m_controllers) {
        if (isOfWindow(controller, window) && (!modalOnly || controller->isModal())) {
            result << controller;
        }
    }
    return result;
}

void Manager::dismiss(int id, bool animated, bool force)
{
    dismissThose(getControllers(id), animated, force);
}

void Manager::dismissAll(QWidget* window, bool animated, bool force)
{
    dismissThose(controllersOf(window, false), animated, force);
}

void Manager::dismissAllModal(QWidget* window, bool animated, bool force)
{
    dismissThose(controllersOf(window, true), animated, force);
}

void Manager::adjustInsets(int left, int top, int right, int bottom, QWidget* inWidget)
{
    const QList<QPointer<Controller>> controllers = controllersOf(nullptr, false);
    for (const QPointer<Controller>& controller : controllers) {
        if (controller != nullptr && controller->isActive() && controller->inWidget() == inWidget) {
            controller->adjustInsets(left, top, right, bottom);
            if (controller != nullptr) {
                controller->updateLayout(false);
            }
        }
    }
}

// --- Drops -----------------------------------------------------------------------------------------------------

void Manager::registerAcceptedDropMimeType(int id, const QString& type)
{
    m_dropTypes.insert(id, type);
}

QList<QPointer<Controller>> Manager::controllersForMimeType(const QString& type) const
{
    QList<QPointer<Controller>> result;
    const QList<int> ids = m_dropTypes.keys(type);
    for (int id : ids) {
        const QPointer<Controller> controller = getController(id);
        if (controller != nullptr && controller->balloon() != nullptr) {
            result << controller;
        }
    }
    return result;
}

void Manager::raiseControllersForMimeType(const QString& type)
{
    const QList<QPointer<Controller>> controllers = controllersForMimeType(type);
    for (const QPointer<Controller>& controller : controllers) {
        Balloon* const balloon = controller->balloon();
        balloon->setParent(controller->window());
        balloon->show();
        balloon->raise();
    }
}

void Manager::restoreControllersForMimeType(const QString& type)
{
    const QList<QPointer<Controller>> controllers = controllersForMimeType(type);
    for (const QPointer<Controller>& controller : controllers) {
        Balloon* const balloon = controller->balloon();
        balloon->setParent(controller);
        balloon->show();
    }
}

// --- Signals ---------------------------------------------------------------------------------------------------

QPointer<Controller> Manager::senderController() const
{
    return getController(qobject_cast<Controller*>(sender()));
}

void Manager::onPopoverWillOpen()
{
    const QPointer<Controller> controller = senderController();
    const QPointer<Manager> self(this);
    Q_EMIT popoverWillOpen(controller);
    if (self != nullptr && controller != nullptr && controller->isModal()) {
        Q_EMIT modalPopoverWillOpen(controller);
    }
}

void Manager::onPopoverDidOpen()
{
    const QPointer<Controller> controller = senderController();
    const QPointer<Manager> self(this);
    Q_EMIT popoverDidOpen(controller);
    if (self != nullptr && controller != nullptr && controller->isModal()) {
        Q_EMIT modalPopoverDidOpen(controller);
    }
}

void Manager::onPopoverWillDisappear()
{
    const QPointer<Manager> self(this);
    Q_EMIT popoverWillClose(senderController());
    if (self != nullptr && !anyPopoverOpen(nullptr)) {
        Q_EMIT lastPopoverWillClose();
    }
    if (self != nullptr && !anyModalPopoverOpen(nullptr)) {
        Q_EMIT lastModalPopoverWillClose();
    }
}

void Manager::onPopoverDidDisappear()
{
    const QPointer<Manager> self(this);
    Q_EMIT popoverDidClose(senderController());
    if (self != nullptr && !anyPopoverOpen(nullptr)) {
        Q_EMIT lastPopoverDidClose();
    }
    if (self != nullptr && !anyModalPopoverOpen(nullptr)) {
        Q_EMIT lastModalPopoverDidClose();
    }
}

void Manager::onPopoverWillHelp()
{
    Q_EMIT popoverWillHelp(senderController());
}
}
}
