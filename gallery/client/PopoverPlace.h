// SPDX-License-Identifier: MIT
// One popover at a time, below the button that asked for it.
#pragma once

#include "popover/Controller.h"

#include <QtCore/QObject>
#include <QtCore/QPointer>

namespace client
{
/// Opens popovers for the menus of the desk. A second click on the button closes what the first has opened.
class PopoverPlace : public QObject
{
    Q_OBJECT

public:
    /// Popovers cover the window of \a owner.
    explicit PopoverPlace(QWidget* owner);
    ~PopoverPlace() override;

    /// Closes what is open. Null if that was the popover of this very target, else a new controller without content.
    vx::PopoverWidget::Controller* begin(QWidget* target, const QString& title, const QString& objectName);
    /// Gives it the content and opens it.
    void show(vx::PopoverWidget::Container* content);
    void close();

    vx::PopoverWidget::Controller* controller() const { return m_controller; }

    /// A column without margins.
    static vx::PopoverWidget::Container* column(const QString& objectName);

private:
    QWidget* m_owner;
    QPointer<QWidget> m_target;
    QPointer<QWidget> m_focus; // before the popover
    QPointer<vx::PopoverWidget::Controller> m_controller;
};
}
