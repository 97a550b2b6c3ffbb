// SPDX-License-Identifier: MIT
// A row that opens a popover of its own.
#pragma once

#include "foundation/Export.h"
#include "popover/Container.h"
#include "popover/Controller.h"
#include "popover/items/PushItem.h"

class QAbstractButton;

namespace vx
{
namespace PopoverWidget
{

/// A row that leads to a nested popover at its left or right. A click performs it, with its user data as value, and
/// opens the popover; the row is checked while that is open. With eifDisclosureOnly only a click on the disclosure icon
/// at the right end (flag eipDisclosure) opens it.
///
/// What is performed in the nested container is also emitted by this row, with the ids of the rows in there. Opening
/// does not close the popover that the row is in. The nested controller stays until the row dies.
///
/// Needs the Manager, see Manager::init(), unless a controller is given.
class ZELKOV_WIDGETS_EXPORT Submenu : public PushItem
{
    Q_OBJECT

public:
    /// \a container becomes the content of the nested popover, which covers the window of \a inWidget. The layout of
    /// the nested popover follows that of \a parentController, which is dismissed, too, when the nested content
    /// dismisses all; it may be null. \a existing is a controller to use, not owned, or null to make one.
    Submenu(int controllerId, const QString& title, const QString& text, const QString& additionalText,
        const QString& objectName, QWidget* inWidget, Container* container, Controller* parentController, int id,
        QFlags<EItemFlag> flags, Controller* existing = nullptr);
    ~Submenu() override;

    /// 0: opening a submenu does not dismiss.
    EContainerFlag defaultItemFlags() override;
    /// On the disclosure icon: eipDisclosure and the button.
    QFlags<EItemPerformedFlag> getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button) override;

    /// The nested content; null when it has been destroyed.
    Container* container() const;
    /// Null when it has been destroyed; the submenu then does not open any more.
    Controller* controller() const;

public Q_SLOTS:
    /// Opens the nested popover, as a click does.
    void open();

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;

private Q_SLOTS:
    void uncheck();
    void controllerDeleted();

private:
    QPointer<Container> m_container;
    QPointer<Controller> m_controller;
    QPointer<QWidget> m_inWidget;
    QPointer<QAbstractButton> m_button; // checked with the row
    ElidedButton* m_disclosureIcon = nullptr;
    bool m_controllerGiven = false;
};

} // namespace PopoverWidget
} // namespace vx
