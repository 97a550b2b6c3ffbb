// SPDX-License-Identifier: MIT
#include "controls/JoystickViewWidget.h"

#include "controls/JoystickGeometry.h"

#include <QtGui/QPainter>
#include <QtGui/QTransform>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOption>

JoystickViewWidget::JoystickViewWidget(QWidget* parent)
    : QWidget(parent)
{
    setObjectName(QStringLiteral("ptzJoystickView"));
    JoystickViewWidget::setPointPosition(0.0F, 0.0F);
}

JoystickViewWidget::~JoystickViewWidget() = default;

QPixmap JoystickViewWidget::ptzCrosshairImage() const
{
    return m_ptzCrosshairImage;
}

void JoystickViewWidget::setPtzCrosshairImage(const QPixmap& image)
{
    m_ptzCrosshairImage = image;
    m_rotated = QPixmap();
    update();
}

QPixmap JoystickViewWidget::ptzPointImage() const
{
    return m_ptzPointImage;
}

void JoystickViewWidget::setPtzPointImage(const QPixmap& image)
{
    m_ptzPointImage = image;
    update();
}

float JoystickViewWidget::circleInset()
{
    return m_circleInset;
}

void JoystickViewWidget::setCircleInset(float inset)
{
    m_circleInset = inset;
    setPointPosition(m_x, m_y);
}

void JoystickViewWidget::setPointPosition(float x, float y)
{
    m_x = vx::joystickAxis(x);
    m_y = vx::joystickAxis(y);
    m_pointPosition = vx::joystickPoint(m_x, m_y, size(), m_circleInset);
    update();
}

void JoystickViewWidget::setRotationAngle(int angle)
{
    m_rotationAngle = angle;
    update();
}

int JoystickViewWidget::rotationAngle()
{
    return m_rotationAngle;
}

QPixmap JoystickViewWidget::rotatedCrosshair()
{
    if (m_rotated.isNull() || m_rotatedAngle != m_rotationAngle) {
        QTransform transform;
        transform.rotate(m_rotationAngle, Qt::ZAxis);
        const QPixmap turned = m_ptzCrosshairImage.transformed(transform, Qt::FastTransformation);
        // The bounding box grows with the turn; cut back to the picture's size about the centre, the scale stays.
        const int width = m_ptzCrosshairImage.width();
        const int height = m_ptzCrosshairImage.height();
        m_rotated = turned.copy((turned.width() - width) / 2, (turned.height() - height) / 2, width, height);
        m_rotatedAngle = m_rotationAngle;
    }
    return m_rotated;
}

void JoystickViewWidget::paintEvent(QPaintEvent*)
{
    const QSize point(width() / 5, height() / 5);
    QStyleOption option;
    option.initFrom(this);
    QPainter painter(this);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
    if (!m_ptzCrosshairImage.isNull()) {
        painter.drawPixmap(QRect(0, 0, width(), height()), rotatedCrosshair());
    }
    if (!m_ptzPointImage.isNull()) {
        painter.drawPixmap(QRect(m_pointPosition.x() - point.width() / 2, m_pointPosition.y() - point.height() / 2,
                               point.width(), point.height()),
            m_ptzPointImage);
    }
}

void JoystickViewWidget::resizeEvent(QResizeEvent* event)
{
    QWidget::resizeEvent(event);
    setPointPosition(m_x, m_y);
    update();
}
