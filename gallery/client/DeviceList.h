// SPDX-License-Identifier: MIT
// The rows of the list of devices.
#pragma once

#include "controls/iOSListWidget.h"

#include <QtCore/QBasicTimer>
#include <QtCore/QPointer>

class QScrollArea;

namespace client
{
class DeviceRow;

/// A phone-style list that lies whole in a scroll area, which follows its current row and a row that is dragged to its
/// edge.
class DeviceList : public vx::iOSListWidget
{
    Q_OBJECT

public:
    explicit DeviceList(QScrollArea& area);

    /// Null for no row.
    DeviceRow* deviceAt(int row) const;
    DeviceRow* device(int id) const;
    bool isDragging() const { return m_dragging; }
    /// As high as the rows that are shown.
    void fitHeight();

Q_SIGNALS:
    void dragFinished();
    /// Return, while no row is being renamed.
    void rowEntered(int row);

protected:
    void startDrag(Qt::DropActions supportedActions) override;
    void dragMoveEvent(QDragMoveEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void timerEvent(QTimerEvent* event) override;

private:
    void showCurrent();

    QPointer<QScrollArea> m_area;
    QBasicTimer m_scrolling;
    int m_pointer = 0; // where the pointer is in the area, from its top
    bool m_dragging = false;
};
}
