// SPDX-License-Identifier: MIT
// A counting line over a picture.
#pragma once

#include <QtCore/QPoint>
#include <QtCore/QString>
#include <QtWidgets/QWidget>

namespace client
{
/// Draws a line over its parent and lets the user drag its ends, or the whole of it by its middle. Covers the parent;
/// what is not near the line goes on to it. Points are pixels of the camera (1920 x 1080).
class CountingLine : public QWidget
{
    Q_OBJECT

public:
    explicit CountingLine(QWidget* view);

    void setLine(const QPoint& start, const QPoint& end);
    void setNames(const QString& line, const QString& left, const QString& right);
    QPoint start() const { return m_start; }
    QPoint end() const { return m_end; }
    /// A point of the camera in this widget.
    QPointF toView(const QPoint& point) const;

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    /// The user drags.
    void lineDragged(const QPoint& start, const QPoint& end);

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    enum class Part : int
    {
        None,
        Start,
        End,
        Middle
    };

    Part partAt(const QPointF& position) const;
    QPoint toCamera(const QPointF& position) const;
    void drawCaption(QPainter& painter, const QPointF& centre, const QString& text) const;

    QPoint m_start;
    QPoint m_end;
    QPoint m_grabbed; // in the pixels of the camera, from the start
    QString m_name;
    QString m_left;
    QString m_right;
    Part m_held = Part::None;
};
}
