// SPDX-License-Identifier: MIT
// A row that is a button.
#include "popover/items/PushItem.h"

#include "indicators/ElidedButton.h"
#include "popover/items/ControlRules.h"

#include <QtGui/QMouseEvent>

namespace vx
{
namespace PopoverWidget
{

PushItem::PushItem(const QString& text, const QString& additionalText, const QString& objectName, int id,
    QFlags<EItemFlag> flags, QWidget* parent)
    : Item(parent, flags, id, objectName, text, additionalText)
{
}

PushItem::~PushItem() = default;

EContainerFlag PushItem::defaultItemFlags()
{
    return ecfDismiss;
}

void PushItem::performSingleClick(QFlags<EItemPerformedFlag> flags)
{
    const QPointer<PushItem> self(this);
    if (m_iconElement) {
        m_iconElement->toggle();
    }
    if (self && m_textElement) {
        m_textElement->toggle();
    }
    if (self) {
        updateSelectionDrawing();
        Q_EMIT itemPerformed(m_id, isChecked(), userData(), flags);
    }
}

ElidedButton* PushItem::pushItem() const
{
    return m_textElement ? m_textElement : m_iconElement;
}

void PushItem::mouseReleaseEvent(QMouseEvent* event)
{
    if (isProtected()) {
        return;
    }
    const QPointer<PushItem> self(this);
    if (ControlRules::isClick(rect(), event->pos(), event->button(), m_flags)) {
        const QFlags<EItemPerformedFlag> flags = getItemPerformedFlag(event->pos(), event->button());
        if (m_flags.testFlag(eifDoubleClick)) {
            startDoubleClickTimer(flags);
        } else {
            performSingleClick(flags);
        }
    }
    if (self) {
        Item::mouseReleaseEvent(event);
    }
}

} // namespace PopoverWidget
} // namespace vx
