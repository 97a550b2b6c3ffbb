// SPDX-License-Identifier: MIT
// A picture with a counting line whose ends can be dragged.
#pragma once

#include <QtGui/QPixmap>
#include <QtWidgets/QWidget>

namespace gallery
{
/// Points are pixels of the camera's picture, whatever the size of the widget.
class LinePicture : public QWidget
{
    Q_OBJECT

public:
    explicit LinePicture(const QSize& picture, QWidget* parent = nullptr);

    void setLine(const QPoint& start, const QPoint& end);
    void setNames(const QString& line, const QString& left, const QString& right);
    QPoint fromPicture(const QPoint& point) const;

Q_SIGNALS:
    void startDragged(const QPoint& point);
    void endDragged(const QPoint& point);

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;

private:
    void caption(QPainter& painter, const QPointF& centre, const QString& text) const;

    QSize m_size;
    QPixmap m_ground;
    QPoint m_start;
    QPoint m_end;
    QString m_name;
    QString m_left;
    QString m_right;
    bool m_dragsEnd = false;
};
}
