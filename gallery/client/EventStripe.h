// SPDX-License-Identifier: MIT
// The contents of the upper stripe: small pictures of recorded events.
#pragma once

#include "Recordings.h"

#include <QtCore/QHash>
#include <QtCore/QTimer>
#include <QtGui/QPixmap>
#include <QtWidgets/QWidget>

namespace client
{
class Fleet;

/// The events of the last 24 hours, newest first, in rows from the left to the right. The wheel scrolls.
class EventStripe : public QWidget
{
    Q_OBJECT

public:
    static const int s_rowHeight = 108;

    EventStripe(Fleet& fleet, QWidget* parent = nullptr);

    const QVector<RecordedEvent>& events() const { return m_events; }
    /// Of that place in events(); null for one that is not to be seen.
    QRect rectOf(int index) const;

Q_SIGNALS:
    /// Milliseconds since 1970-01-01 UTC.
    void eventClicked(int camera, qint64 time);

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void leaveEvent(QEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void readEvents();
    int columns() const;
    int indexAt(const QPoint& point) const;
    void hover(int index);
    void scrollTo(int top);
    QPixmap pictureOf(const RecordedEvent& event, bool& mayMake);
    void paintCell(QPainter& painter, int index, const QRect& cell, bool& mayMake);

    Fleet& m_fleet;
    QVector<RecordedEvent> m_events;
    QHash<QPair<qint64, int>, QPixmap> m_pictures;
    QHash<int, QPixmap> m_grounds;
    QTimer m_timer;
    int m_top = 0; // scrolled by
    int m_hovered = -1;
    int m_pressed = -1;
};
}
