// SPDX-License-Identifier: MIT
// vx::PopoverWidget::Manager: the registry of all popovers of the process.
#pragma once

#include "foundation/Export.h"
#include "popover/Balloon.h"
#include "popover/Controller.h"

#include <QFlags>
#include <QList>
#include <QMap>
#include <QMultiMap>
#include <QObject>
#include <QPointer>
#include <QSizeF>
#include <QString>
#include <QVariant>

class QWidget;

namespace vx
{
namespace PopoverWidget
{
class Container;
class Item;

/// Creates the controllers of popovers, finds them by an id that the client chooses, closes them singly or
/// together and tells when popovers open and close. There is one in a process: call init() at the start of the
/// application and deleteInstance() at its end.
///
/// The registry holds guarded pointers and owns no controller. An entry goes when its controller is destroyed.
/// Several controllers may share an id; "the first" of them is the one entered last, as in any QMultiMap.
class ZELKOV_WIDGETS_EXPORT Manager : public QObject
{
    Q_OBJECT

public:
    /// The id of popovers that nobody looks up: createController() never reuses one.
    static constexpr int sDefaultControllerID = 0;

    /// Makes the instance, unless there is one. getUniquePopoverID() counts on from \a firstId.
    static void init(int firstId);
    /// Null before init() and after deleteInstance().
    static Manager* instance();
    /// Deletes the instance; controllers live on.
    static void deleteInstance();

    ~Manager() override;

    /// The first call gives the argument of init() plus 1.
    int getUniquePopoverID();

    /// Makes a controller, hidden, over the window (or controller) that holds \a inWidget, and enters it under
    /// \a id. With \a reuse and an id other than 0 that is in use, the first controller of this id gets the new
    /// names, target (if it has its content already) and place instead, and is returned.
    ///
    /// \a size counts as far as \a constraints say. The result can be null only when reusing.
    QPointer<Controller> createController(int id, bool reuse, bool isSubController, QWidget* inWidget,
        QWidget* forWidget, const QString& title, const QString& objectName,
        QFlags<Balloon::EArrowDirection> directions, const QSizeF& size,
        QFlags<Balloon::ESizeConstraint> constraints);
    /// The same without a target and an arrow.
    QPointer<Controller> createController(int id, bool reuse, bool isSubController, QWidget* inWidget,
        const QString& title, const QString& objectName, const QSizeF& size,
        QFlags<Balloon::ESizeConstraint> constraints);

    /// Enters a controller under an id, in addition to what is there. createController() does this; entering a
    /// controller twice keeps its entries from being removed at its end.
    void addController(int id, const QPointer<Controller>& controller);

    /// The first of this id, or null.
    QPointer<Controller> getController(int id) const;
    /// The entry of this very object, or null.
    QPointer<Controller> getController(Controller* controller) const;
    /// All that are entered under the id.
    QList<QPointer<Controller>> getControllers(int id) const;
    /// 0 for a controller that is not entered.
    int getControllerID(Controller* controller) const;
    int getControllerID(QPointer<Controller> controller) const;
    /// Removes all entries of the controller and enters it under \a id.
    void setControllerID(QPointer<Controller> controller, int id);

    // Of the first controller of the id and its content; null, or a null variant, if something is missing.
    Container* getContainer(int id) const;
    Item* getItem(int id, int itemId) const;
    /// The first item whose value is true.
    Item* getSelectedItem(int id, int itemId) const;
    // Of the first item with that id in the popover; a null variant without one.
    QVariant getItemValue(int id, int itemId) const;
    QVariant getItemUserData(int id, int itemId) const;

    // Open means visible or active: a popover that fades out is still open.

    /// Asks the first controller of the id alone.
    bool isPopoverOpen(int id) const;
    /// Among the open popovers the one with the lowest id, or null.
    QPointer<Controller> currentPopover() const;
    /// Among those that are also marked as modal.
    QPointer<Controller> currentModalPopover() const;
    /// 0 if none is open.
    int currentPopoverID() const;
    /// Whether a popover is open and, unless \a window is null, the current one belongs to that window. Popovers
    /// other than the current one do not count.
    bool anyPopoverOpen(QWidget* window) const;
    /// The same for modal popovers.
    bool anyModalPopoverOpen(QWidget* window) const;

    /// Dismisses all controllers of the id.
    void dismiss(int id, bool animated, bool force);
    /// Dismisses all controllers, or those of a window. They need not be open.
    void dismissAll(QWidget* window, bool animated, bool force);
    /// The same for modal popovers.
    void dismissAllModal(QWidget* window, bool animated, bool force);

    /// Adds to the insets of all active controllers over \a inWidget.
    void adjustInsets(int left, int top, int right, int bottom, QWidget* inWidget);

    /// One format an id: a second call replaces the first.
    void registerAcceptedDropMimeType(int id, const QString& type);
    /// Lifts the balloons of the ids registered for the format out of their overlays and above everything in the
    /// window, open or not, so that they can receive a drop.
    void raiseControllersForMimeType(const QString& type);
    /// Puts them back.
    void restoreControllersForMimeType(const QString& type);

Q_SIGNALS:
    // Controller by controller, as each of them emits popoverWillAppear(), popoverDidAppear(),
    // popoverWillDisappear() and popoverDidDisappear().
    void popoverWillOpen(vx::TPopoverControllerPointer controller);
    void popoverDidOpen(vx::TPopoverControllerPointer controller);
    void popoverWillClose(vx::TPopoverControllerPointer controller);
    void popoverDidClose(vx::TPopoverControllerPointer controller);
    /// Right after popoverWillOpen(), if the controller is marked as modal.
    void modalPopoverWillOpen(vx::TPopoverControllerPointer controller);
    /// Right after popoverDidOpen(), if the controller is marked as modal.
    void modalPopoverDidOpen(vx::TPopoverControllerPointer controller);
    /// No popover is open any more. Comes after popoverDidClose(), whichever popover that was for.
    void lastPopoverDidClose();
    /// No modal popover is open any more; after lastPopoverDidClose().
    void lastModalPopoverDidClose();
    /// After popoverWillClose() if nothing is open. A visible popover that begins to close still counts as open,
    /// so that this does not come for an ordinary closing; clients rely on it.
    void lastPopoverWillClose();
    /// The same for modal popovers.
    void lastModalPopoverWillClose();
    /// The help button of a popover was clicked.
    void popoverWillHelp(vx::TPopoverControllerPointer controller);

private Q_SLOTS:
    void onControllerDestroyed(vx::PopoverWidget::Controller* controller);
    void onPopoverWillDisappear();
    void onPopoverDidDisappear();
    void onPopoverWillOpen();
    void onPopoverDidOpen();
    void onPopoverWillHelp();

private:
    explicit Manager(int firstId);

    QPointer<Controller> senderController() const;
    QPointer<Controller> reusedController(int id, bool reuse, bool& reused, const QString& objectName) const;
    void dismissThose(const QList<QPointer<Controller>>& controllers, bool animated, bool force);
    QList<QPointer<Controller>> controllersOf(QWidget* window, bool modalOnly) const;
    QList<QPointer<Controller>> controllersForMimeType(const QString& type) const;

    static Manager* s_ManagerInstance;

    QMultiMap<int, QPointer<Controller>> m_controllers;
    QMap<int, QString> m_dropTypes;
    int m_nextId;
};
}
}
