// SPDX-License-Identifier: MIT
// The rows of the list of devices.
#include "DeviceList.h"

#include "DeviceRow.h"

#include <QtCore/QTimerEvent>
#include <QtGui/QDragMoveEvent>
#include <QtGui/QKeyEvent>
#include <QtGui/QResizeEvent>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>

namespace client
{
namespace
{
constexpr int c_edge = 40; // pixels at the edge of the area in which a drag scrolls
constexpr int c_step = 12;
constexpr int c_interval = 30; // milliseconds
}

DeviceList::DeviceList(QScrollArea& area)
    : iOSListWidget(nullptr, QStringLiteral("deviceList"))
    , m_area(&area)
{
    setFrameShape(QFrame::NoFrame);
    setBoldSelectionIndication(false);
    setEditTriggers(NoEditTriggers);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setAutoScroll(false); // it lies whole in the area
    connect(this, &QListWidget::currentRowChanged, this, &DeviceList::showCurrent);
}

DeviceRow* DeviceList::deviceAt(int row) const
{
    return dynamic_cast<DeviceRow*>(item(row));
}

DeviceRow* DeviceList::device(int id) const
{
    for (int row = 0; row < count(); ++row) {
        DeviceRow* const device = deviceAt(row);
        if (device && device->id() == id) {
            return device;
        }
    }
    return nullptr;
}

void DeviceList::fitHeight()
{
    setFixedHeight(sizeHint().height());
}

void DeviceList::showCurrent()
{
    const QRect rect = currentItem() ? visualItemRect(currentItem()) : QRect();
    if (m_area && m_area->widget() && rect.isValid()) {
        const QPoint middle = viewport()->mapTo(m_area->widget(), rect.center());
        m_area->ensureVisible(0, middle.y(), 0, rect.height());
    }
}

void DeviceList::startDrag(Qt::DropActions supportedActions)
{
    const QPointer<DeviceList> alive(this);
    m_dragging = true;
    m_pointer = -1;
    m_scrolling.start(c_interval, this);
    iOSListWidget::startDrag(supportedActions);
    if (alive) {
        m_dragging = false;
        m_scrolling.stop();
        Q_EMIT dragFinished();
    }
}

void DeviceList::dragMoveEvent(QDragMoveEvent* event)
{
    iOSListWidget::dragMoveEvent(event);
    if (m_area) {
        m_pointer = m_area->viewport()->mapFromGlobal(viewport()->mapToGlobal(event->pos())).y();
    }
}

void DeviceList::resizeEvent(QResizeEvent* event)
{
    iOSListWidget::resizeEvent(event);
    if (event->size().width() < event->oldSize().width()) {
        scheduleDelayedItemsLayout(); // or the rows stay as wide as they were
    }
}

void DeviceList::keyPressEvent(QKeyEvent* event)
{
    if (hasFocus() && (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter)) {
        Q_EMIT rowEntered(currentRow());
    } else {
        iOSListWidget::keyPressEvent(event);
    }
}

void DeviceList::timerEvent(QTimerEvent* event)
{
    if (event->timerId() != m_scrolling.timerId()) {
        iOSListWidget::timerEvent(event);
        return;
    }
    if (!m_area || m_pointer < 0) {
        return;
    }
    QScrollBar* const bar = m_area->verticalScrollBar();
    if (m_pointer < c_edge) {
        bar->setValue(bar->value() - c_step);
    } else if (m_pointer > m_area->viewport()->height() - c_edge) {
        bar->setValue(bar->value() + c_step);
    }
}
}
