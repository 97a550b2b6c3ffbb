// SPDX-License-Identifier: MIT
// Rows for tests: one that opens what is protected, one that clicks as rows do, and a manager of rights.
#pragma once

#include "popover/Item.h"
#include "popover/ItemRules.h"
#include "ZelkovUtils/ISecurityManager.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QStringList>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QPushButton>

namespace itemtest
{
using namespace vx::PopoverWidget;

const QFlags<EItemFlag> c_NoFlags;

/// An item with everything protected made public.
class Row : public Item
{
public:
    explicit Row(QFlags<EItemFlag> flags = eifText, int id = 1, const QString& text = QStringLiteral("row"),
        const QString& additionalText = QString(), QWidget* parent = nullptr)
        : Item(parent, flags, id, QStringLiteral("row"), text, additionalText)
    {
    }

    using Item::isProtected;
    using Item::m_doubleClickTimer;
    using Item::m_lastElement;
    using Item::m_leftLayout;
    using Item::m_mainLayout;
    using Item::m_protected;
    using Item::m_rightLayout;
    using Item::performDoubleClick;
    using Item::startDoubleClickTimer;
    using Item::stopDoubleClickTimer;
    using Item::updateSelectionDrawing;

    void perform() { Q_EMIT itemPerformed(id(), value(), userData(), eipControl); }

    QVariant m_value;
    QWidget* m_focusItem = nullptr;
    EContainerFlag m_defaultFlags = static_cast<EContainerFlag>(0);
    int m_scrolled = 0;

    EContainerFlag defaultItemFlags() override { return m_defaultFlags; }
    QVariant value() override { return m_value.isValid() ? m_value : Item::value(); }
    QWidget* getFocusItem() override { return m_focusItem; }
    void onItemScrolled() override { ++m_scrolled; }
};

/// A row that is performed by a click, and waits for a second one if its flags say so.
class ClickRow : public Row
{
public:
    using Row::Row;

    void performSingleClick(QFlags<EItemPerformedFlag> flags) override
    {
        Q_EMIT itemPerformed(id(), QVariant(true), userData(), flags);
    }

protected:
    void mouseReleaseEvent(QMouseEvent* event) override
    {
        if (isProtected()) {
            return;
        }
        if (rect().contains(event->pos()) && ItemRules::performs(itemFlags(), event->button())) {
            const QFlags<EItemPerformedFlag> flags = getItemPerformedFlag(event->pos(), event->button());
            if (itemFlags().testFlag(eifDoubleClick)) {
                startDoubleClickTimer(flags);
            } else {
                performSingleClick(flags);
            }
        }
    }
};

/// Says what it was asked; refuses the right "no" and everybody's being an administrator, unless told otherwise.
class Rights : public vx::ISecurityManager
{
public:
    bool isRightRefused(const QString& right, bool first, bool second, bool third) override
    {
        m_asked << QStringLiteral("%1 %2 %3 %4").arg(right).arg(first).arg(second).arg(third);
        return right == QLatin1String("no");
    }
    bool isAdministrator(bool first, bool second) override
    {
        m_asked << QStringLiteral("admin %1 %2").arg(first).arg(second);
        return m_administrator;
    }

    bool m_administrator = false;
    QStringList m_asked;
};

/// Sends a mouse event straight to the widget; whether it was accepted.
inline bool sendMouse(QWidget* widget, QEvent::Type type, const QPoint& position,
    Qt::MouseButton button = Qt::LeftButton, Qt::MouseButtons buttons = Qt::LeftButton)
{
    QMouseEvent event(type, position, widget->mapToGlobal(position), button, buttons, Qt::NoModifier);
    QCoreApplication::sendEvent(widget, &event);
    return event.isAccepted();
}

inline void click(QWidget* widget, const QPoint& position, Qt::MouseButton button = Qt::LeftButton)
{
    sendMouse(widget, QEvent::MouseButtonPress, position, button, button);
    sendMouse(widget, QEvent::MouseButtonRelease, position, button, Qt::NoButton);
}

/// Press, release, double click, release, as the window system sends them.
inline void doubleClick(QWidget* widget, const QPoint& position, Qt::MouseButton button = Qt::LeftButton)
{
    click(widget, position, button);
    sendMouse(widget, QEvent::MouseButtonDblClick, position, button, button);
    sendMouse(widget, QEvent::MouseButtonRelease, position, button, Qt::NoButton);
}
}
