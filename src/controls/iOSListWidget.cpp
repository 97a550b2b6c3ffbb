// SPDX-License-Identifier: MIT
#include "controls/iOSListWidget.h"

#include "CoreQt/Connect.h"
#include "controls/ListDropRow.h"
#include "controls/iOSListWidgetItem.h"
#include "sliders/NicerScrollBar.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QEvent>
#include <QtCore/QMimeData>
#include <QtCore/QPointer>
#include <QtGui/QDrag>
#include <QtGui/QDropEvent>
#include <QtGui/QWheelEvent>
#include <QtWidgets/QLabel>
#include <QtWidgets/QScrollBar>

namespace vx
{
iOSListWidget::iOSListWidget(QWidget* parent, const QString& objectName)
    : QListWidget(parent)
{
    setObjectName(objectName);
    setMinimumHeight(0);
    setMaximumHeight(0);
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
    setContentsMargins(0, 0, 0, 0);
    setSpacing(0);
    setDragDropMode(QAbstractItemView::DragOnly);
    setDefaultDropAction(Qt::MoveAction);
    setAcceptDrops(true);
    viewport()->setAcceptDrops(true);
    setDragEnabled(true);
    setSelectionMode(QAbstractItemView::SingleSelection);
    setSelectionRectVisible(false);
    setDropIndicatorShown(true);
    setResizeMode(QListView::Adjust);
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    new NicerScrollBar(this, Qt::Horizontal, NicerScrollBar::epAutomatic, this);
    new NicerScrollBar(this, Qt::Vertical, NicerScrollBar::epAutomatic, this);
    setEditMode(m_editMode);
    setAttribute(Qt::WA_MacShowFocusRect, false);
    qRegisterMetaType<TListWidgetItemPointer>("vx::iOSListWidget::TListWidgetItemPointer");
    vx::connect(this, "2itemSelectionChanged()", this, "1itemSelectionChanged()", Qt::AutoConnection);
    vx::connect(this, "2itemAdded()", this, "1layoutUpdated()", Qt::AutoConnection);
    vx::connect(this, "2itemRemoved( vx::iOSListWidget::TListWidgetItemPointer)", this, "1layoutUpdated()",
        Qt::AutoConnection);
    setAutoScrollMargin(52);
    setAutoScroll(true);
}

iOSListWidget::~iOSListWidget() = default;

iOSListWidgetItem* iOSListWidget::getIOSItem(int row) const
{
    return dynamic_cast<iOSListWidgetItem*>(item(row));
}

void iOSListWidget::setEditMode(bool on)
{
    m_editMode = on;
    for (int row = 0; row < count(); ++row) {
        if (iOSListWidgetItem* const item = getIOSItem(row)) {
            item->setEditMode(on);
        }
    }
}

void iOSListWidget::toggleEditMode()
{
    setEditMode(!m_editMode);
}

bool iOSListWidget::editMode() const
{
    return m_editMode;
}

void iOSListWidget::setDeleteMode(iOSListWidgetItem* item)
{
    if (!item) {
        return;
    }
    item->setDeleteMode(!item->isInDeleteMode(), true);
    for (int row = 0; row < count(); ++row) {
        iOSListWidgetItem* const other = getIOSItem(row);
        if (other && other != item) {
            other->setDeleteMode(false, true);
        }
    }
    if (isVisible()) {
        Q_EMIT layoutChanged();
    }
}

void iOSListWidget::setKeepLastItem(bool keep)
{
    m_keepLastItem = keep;
}

void iOSListWidget::setBoldSelectionIndication(bool bold)
{
    m_boldSelection = bold;
}

void iOSListWidget::itemHasBeenAdded()
{
    setMaximumHeight(sizeHint().height());
    Q_EMIT itemAdded();
}

QSize iOSListWidget::sizeHint() const
{
    int height = 0;
    for (int row = 0; row < count(); ++row) {
        if (!isRowHidden(row)) {
            height += qMax(0, sizeHintForRow(row));
        }
    }
    return QSize(sizeHintForColumn(0), height);
}

void iOSListWidget::clear()
{
    QListWidget::clear();
    setMaximumHeight(0);
}

void iOSListWidget::deleteItem(QListWidgetItem* item)
{
    if (!item || (m_keepLastItem && count() < 2)) {
        return;
    }
    // The call comes late: the row may be gone by now, so it is looked for and not asked.
    int at = 0;
    while (at < count() && this->item(at) != item) {
        ++at;
    }
    if (at == count()) {
        return;
    }
    removeItemWidget(item);
    const QPointer<iOSListWidget> alive(this);
    if (QListWidgetItem* const taken = takeItem(at)) {
        Q_EMIT itemRemoved(TListWidgetItemPointer(taken));
    }
    if (alive) {
        setMaximumHeight(sizeHint().height());
    }
}

void iOSListWidget::itemSelectionChanged()
{
    if (!m_boldSelection) {
        return;
    }
    for (int row = 0; row < count(); ++row) {
        const iOSListWidgetItem* const item = getIOSItem(row);
        auto* const label = item ? qobject_cast<QLabel*>(item->itemWidget()) : nullptr;
        if (label) {
            QFont font = label->font();
            font.setBold(item->isSelected());
            label->setFont(font);
        }
    }
}

void iOSListWidget::layoutUpdated()
{
    updateGeometry();
    if (isVisible()) {
        Q_EMIT layoutChanged();
    }
}

void iOSListWidget::setBackgroundColor(const QColor& color)
{
    setAutoFillBackground(true);
    QPalette colors = palette();
    colors.setColor(QPalette::Window, color);
    setPalette(colors);
}

void iOSListWidget::selectionChanged(const QItemSelection& selected, const QItemSelection& deselected)
{
    QListWidget::selectionChanged(selected, deselected);
    for (const QModelIndex& index : deselected.indexes()) {
        if (iOSListWidgetItem* const item = getIOSItem(index.row())) {
            item->setSelected(false);
        }
    }
    for (const QModelIndex& index : selected.indexes()) {
        if (iOSListWidgetItem* const item = getIOSItem(index.row())) {
            item->setSelected(true);
        }
    }
}

void iOSListWidget::startDrag(Qt::DropActions supportedActions)
{
    iOSListWidgetItem* const item = getIOSItem(currentRow());
    if (!item || !item->movable()) {
        return;
    }
    m_dragSourceRow = currentRow();
    if (m_dragSourceRow != -1) {
        m_dragSourceData = item->data(Qt::UserRole);
    }
    if (m_editMode) {
        QListWidget::startDrag(supportedActions);
    } else {
        dragPayload(item, supportedActions);
    }
}

void iOSListWidget::dragPayload(iOSListWidgetItem* item, Qt::DropActions supportedActions)
{
    auto* const drag = new QDrag(this);
    auto* const payload = new QMimeData;
    const QStringList types = item->mimeTypes();
    for (const QString& type : types) {
        payload->setData(type, item->mimeData(type));
    }
    drag->setMimeData(payload);
    if (QWidget* const content = item->itemWidget()) {
        const QPixmap picture = content->grab(QRect(QPoint(0, 0), QSize(-1, -1)));
        drag->setPixmap(picture);
        drag->setHotSpot(QPoint(picture.width() / 2, picture.height() / 2));
    }
    vx::connect(drag, "2destroyed(QObject*)", item, "1dragEnded(QObject*)", Qt::QueuedConnection);
    drag->exec(supportedActions);
}

void iOSListWidget::wheelEvent(QWheelEvent* event)
{
    constexpr int step = 8; // pixels
    horizontalScrollBar()->setSingleStep(step);
    verticalScrollBar()->setSingleStep(step);
    QListWidget::wheelEvent(event);
}

void iOSListWidget::dropEvent(QDropEvent* event)
{
    if (event->source() != this || (event->dropAction() != Qt::MoveAction && dragDropMode() != InternalMove)) {
        QListWidget::dropEvent(event);
        return;
    }
    event->accept();
    const ListDropSide side = dropIndicatorPosition() == AboveItem ? ListDropSide::Above
        : dropIndicatorPosition() == BelowItem                     ? ListDropSide::Below
                                                                   : ListDropSide::Other;
    const int target = listDropRow(m_dragSourceRow, indexAt(event->pos()).row(), side, count());
    const QPointer<iOSListWidget> alive(this);
    Q_EMIT itemMoved(m_dragSourceRow, target);
    if (!alive) {
        return;
    }
    const QListWidgetItem* const there = item(target);
    Q_EMIT dataMoved(m_dragSourceData, there ? there->data(Qt::UserRole) : QVariant());
    if (alive) {
        dropKeepingTheRows(event);
    }
}

// The view moves a row by taking it out and putting it in again, and deletes its widget on the way.
void iOSListWidget::dropKeepingTheRows(QDropEvent* event)
{
    QVector<QPointer<QWidget>> containers;
    for (int row = 0; row < count(); ++row) {
        const iOSListWidgetItem* const item = getIOSItem(row);
        containers.append(item ? item->m_container : nullptr);
    }
    event->ignore(); // the view moves rows for events that nobody has accepted; others it copies
    QListWidget::dropEvent(event);
    event->accept();
    for (const QPointer<QWidget>& container : containers) {
        if (container) {
            QCoreApplication::removePostedEvents(container, QEvent::DeferredDelete);
        }
    }
    for (int row = 0; row < count(); ++row) {
        iOSListWidgetItem* const item = getIOSItem(row);
        if (item && item->m_container && QListWidget::itemWidget(item) != item->m_container) {
            setItemWidget(item, item->m_container);
            item->m_container->show();
        }
    }
}
}
