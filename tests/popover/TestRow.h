// SPDX-License-Identifier: MIT
// A plain row for tests of what stands around rows.
#pragma once

#include "popover/Item.h"

#include <QtCore/QPointer>
#include <QtCore/QVariant>
#include <QtGui/QMouseEvent>

namespace zelkovtest
{
/// Performed by a release of the left button inside; its value is whatever it was given.
class TestRow : public vx::PopoverWidget::Item
{
public:
    explicit TestRow(int id, const QString& text = QStringLiteral("row"),
        QFlags<vx::PopoverWidget::EItemFlag> flags = vx::PopoverWidget::eifText)
        : Item(nullptr, flags, id, QStringLiteral("testRow"), text, QString())
    {
        setMinimumSize(60, 20);
    }

    QVariant value() override { return m_value; }
    void setValue(const QVariant& value) override { m_value = value; }
    QWidget* getFocusItem() override { return m_focus; }
    void setFocusItem(QWidget* widget) { m_focus = widget; }

protected:
    void mouseReleaseEvent(QMouseEvent* event) override
    {
        if (isProtected() || !rect().contains(event->pos()) || event->button() != Qt::LeftButton) {
            QWidget::mouseReleaseEvent(event);
            return;
        }
        const QPointer<TestRow> self(this);
        const QFlags<vx::PopoverWidget::EItemPerformedFlag> hit
            = getItemPerformedFlag(event->pos(), event->button());
        Q_EMIT itemPerformed(id(), value(), userData(), hit);
        if (self != nullptr) {
            QWidget::mouseReleaseEvent(event);
        }
    }

private:
    QVariant m_value;
    QPointer<QWidget> m_focus;
};
}
