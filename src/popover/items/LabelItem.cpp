// SPDX-License-Identifier: MIT
// A row that shows text.
#include "popover/items/LabelItem.h"

#include "popover/items/ControlRules.h"

#include <QtGui/QMouseEvent>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>

namespace vx
{
namespace PopoverWidget
{

LabelItem::LabelItem(const QString& text, const QString& additionalText, const QString& objectName, int id,
    QFlags<EItemFlag> flags, QWidget* parent)
    : Item(parent, flags, id, objectName, QString(), additionalText)
    , m_label(new QLabel(text, this))
{
    m_label->setObjectName(QStringLiteral("label"));
    m_label->setWordWrap(true);
    m_label->setOpenExternalLinks(true);
    m_label->setFocusPolicy(Qt::NoFocus);
    if (flags.testFlag(eifCentered)) {
        m_label->setAlignment(Qt::AlignCenter);
    }
    (m_leftLayout ? m_leftLayout : m_mainLayout)->addWidget(m_label);
    if (m_leftLayout && !flags.testFlag(eifCentered)) {
        // Aligned, the layout would keep to its size hint, and the text could not wrap to the width of the row.
        m_mainLayout->setAlignment(m_leftLayout, Qt::Alignment());
    }
    m_lastElement = m_label;
}

LabelItem::~LabelItem() = default;

void LabelItem::setText(const QString& text)
{
    if (m_label) {
        m_label->setText(text);
    }
    Q_EMIT layoutChanged();
}

QString LabelItem::text()
{
    return m_label ? m_label->text() : QString();
}

void LabelItem::setValue(const QVariant& value)
{
    setText(value.toString());
}

void LabelItem::setBold(bool /*bold*/)
{
    if (m_label) {
        QFont font = m_label->font();
        font.setBold(true);
        m_label->setFont(font);
    }
}

QLabel* LabelItem::label() const
{
    return m_label;
}

void LabelItem::mouseReleaseEvent(QMouseEvent* event)
{
    if (isProtected()) {
        return;
    }
    const QPointer<LabelItem> self(this);
    if (ControlRules::isClick(rect(), event->pos(), event->button(), m_flags)) {
        Q_EMIT itemPerformed(m_id, text(), userData(), getItemPerformedFlag(event->pos(), event->button()));
    }
    if (self) {
        Item::mouseReleaseEvent(event);
    }
}

} // namespace PopoverWidget
} // namespace vx
