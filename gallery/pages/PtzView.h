// SPDX-License-Identifier: MIT
// What a camera sees that turns and zooms.
#pragma once

#include <QtCore/QPointF>
#include <QtGui/QPixmap>
#include <QtWidgets/QWidget>

namespace gallery
{
class PtzView : public QWidget
{
    Q_OBJECT

public:
    explicit PtzView(QWidget* parent = nullptr);

    /// Each from -1 to 1; right and up.
    void setSpeed(double pan, double tilt);
    /// 1 shows most.
    void setZoom(double factor);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QRectF window() const;
    void move();

    QPixmap m_ground;
    QPointF m_centre;
    QPointF m_speed;
    double m_zoom = 1;
};
}
