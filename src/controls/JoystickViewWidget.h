// SPDX-License-Identifier: MIT
// A display of where a joystick stands.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPoint>
#include <QtGui/QPixmap>
#include <QtWidgets/QWidget>

/// Shows the position of a joystick that steers a pan, tilt and zoom camera: a crosshair picture, which can be
/// rotated, and a point that moves over it inside a circle. A display only: it takes no mouse, the client feeds it.
///
/// Both pictures are properties and come from the application, as a rule from its style sheet
/// (qproperty-ptzCrosshairImage: url(...)); without them only the style sheet's background shows. The object name is
/// "ptzJoystickView".
class ZELKOV_WIDGETS_EXPORT JoystickViewWidget : public QWidget
{
    Q_OBJECT
    Q_PROPERTY(QPixmap ptzCrosshairImage READ ptzCrosshairImage WRITE setPtzCrosshairImage)
    Q_PROPERTY(QPixmap ptzPointImage READ ptzPointImage WRITE setPtzPointImage)

public:
    explicit JoystickViewWidget(QWidget* parent = nullptr);
    ~JoystickViewWidget() override;

    QPixmap ptzCrosshairImage() const;
    /// The background, scaled to the whole widget.
    void setPtzCrosshairImage(const QPixmap& image);
    QPixmap ptzPointImage() const;
    /// The moving point, scaled to a fifth of the widget in each direction.
    void setPtzPointImage(const QPixmap& image);

    float circleInset();
    /// Distance of the circle from the left and right edge, in pixels. Default 20. Moves the point at once.
    void setCircleInset(float inset);

    /// Where the stick stands: \a x to the right, \a y upwards, each from -1 to 1; what lies outside is clamped.
    /// Outside the circle the point is pulled onto it, see joystickPoint(). A resize keeps the position.
    virtual void setPointPosition(float x, float y);
    /// Rotation of the crosshair in degrees, clockwise. Default 0. The point does not turn with it.
    virtual void setRotationAngle(int angle);
    virtual int rotationAngle();

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    QPixmap rotatedCrosshair();

    QPixmap m_ptzCrosshairImage;
    QPixmap m_ptzPointImage;
    float m_circleInset = 20.0F;
    QPoint m_pointPosition; // own coordinates
    float m_x = 0.0F;
    float m_y = 0.0F;
    int m_rotationAngle = 0;

    // The crosshair turned by m_rotatedAngle: null when it has to be made again.
    QPixmap m_rotated;
    int m_rotatedAngle = 0;
};
