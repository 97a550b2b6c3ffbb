// SPDX-License-Identifier: MIT
// A row that shows a picture.
#include "popover/items/ImageItem.h"

#include "indicators/Label.h"
#include "popover/items/ControlRules.h"

#include <QtGui/QMouseEvent>
#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{

ImageItem::ImageItem(const QString& objectName, int id, const QPixmap& pixmap, QWidget* parent)
    : Item(parent, {}, id, objectName, QString(), QString())
    , m_label(new vx::Label(this))
    , m_pixmap(pixmap)
{
    m_label->setObjectName(QStringLiteral("image"));
    m_label->setScaledContents(true);
    m_label->setFocusPolicy(Qt::NoFocus);
    m_label->setPixmap(pixmap);
    m_mainLayout->insertWidget(0, m_label);
    m_lastElement = m_label;
}

ImageItem::~ImageItem() = default;

void ImageItem::setValue(const QVariant& value)
{
    if (value.type() != QVariant::Pixmap) {
        return;
    }
    m_pixmap = value.value<QPixmap>();
    if (m_label) {
        m_label->setPixmap(m_pixmap);
    }
    Q_EMIT layoutChanged();
}

QVariant ImageItem::value()
{
    return m_pixmap.isNull() ? QVariant() : QVariant(m_pixmap);
}

vx::Label* ImageItem::label() const
{
    return m_label;
}

void ImageItem::mouseReleaseEvent(QMouseEvent* event)
{
    if (isProtected()) {
        return;
    }
    const QPointer<ImageItem> self(this);
    if (ControlRules::isClick(rect(), event->pos(), event->button(), m_flags)) {
        Q_EMIT itemPerformed(
            m_id, QVariant(), userData(), getItemPerformedFlag(event->pos(), event->button()));
    }
    if (self) {
        Item::mouseReleaseEvent(event);
    }
}

} // namespace PopoverWidget
} // namespace vx
