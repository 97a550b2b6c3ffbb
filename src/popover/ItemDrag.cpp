// SPDX-License-Identifier: MIT
// The drag of a popover's row.
#include "popover/Item.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QEvent>
#include <QtCore/QMimeData>
#include <QtGui/QDrag>

namespace vx
{
namespace PopoverWidget
{
namespace
{
/// Relative to the size of what is dragged.
constexpr double c_HotSpot = 0.5;

/// Ends a drag whose item has died. The end has to wait for the event loop, since the item may well die in an
/// answer to the drag; until then nobody is offered an item that no longer exists.
class DragEnd : public QObject
{
public:
    explicit DragEnd(QDrag* drag)
        : QObject(drag)
    {
        QCoreApplication::instance()->installEventFilter(this);
        QMetaObject::invokeMethod(
            drag, [] { QDrag::cancel(); }, Qt::QueuedConnection);
    }

    bool eventFilter(QObject* /*watched*/, QEvent* event) override
    {
        return event->type() == QEvent::DragEnter || event->type() == QEvent::DragMove
            || event->type() == QEvent::Drop;
    }
};
}

void Item::startDrag()
{
    // isWindow(): a row on its own is its own window.
    QWidget* const owner = window();
    if (!owner) {
        return;
    }
    auto* const mimeData = new QMimeData;
    mimeData->setData(sPopoverWidgetItem, QVariant(m_id).toByteArray());
    mimeData->setData(m_dragMimeType, m_userData.toByteArray());
    for (auto entry = m_dragMimeData.cbegin(); entry != m_dragMimeData.cend(); ++entry) {
        mimeData->setData(entry.key(), entry.value());
    }
    for (const QString& format : {QStringLiteral("qreal/hotspot/x"), QStringLiteral("qreal/hotspot/y")}) {
        if (!m_dragMimeData.contains(format)) {
            mimeData->setData(format, QByteArray::number(c_HotSpot, 'g', 6));
        }
    }

    // The window owns the drag, so that it outlives the item; its source is the item, which the drop looks for.
    const QPointer<QDrag> drag(new QDrag(this));
    drag->setParent(owner);
    drag->setMimeData(mimeData);
    drag->setPixmap(grab(QRect(QPoint(0, 0), QSize(-1, -1))));
    drag->setHotSpot(QPoint(width() / 2, height() / 2));

    const QPointer<Item> self(this);
    Q_EMIT itemDragStarted();
    if (!self || !drag) {
        delete drag.data();
        return;
    }
    connect(this, &QObject::destroyed, drag.data(), [drag] { new DragEnd(drag); });
    drag->exec(Qt::MoveAction);
}

} // namespace PopoverWidget
} // namespace vx
