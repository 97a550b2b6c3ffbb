// SPDX-License-Identifier: MIT
// What the tests of the handle share: pictures, and an object that writes down what it is called with.
#pragma once

#include "sliders/Nubsie.h"

#include <QtCore/QPoint>
#include <QtCore/QStringList>
#include <QtGui/QImage>
#include <QtGui/QPainter>
#include <QtWidgets/QWidget>

#include <functional>

namespace nubsietest
{
inline QPixmap picture(const QColor& color, const QSize& size = QSize(40, 40))
{
    QPixmap result(size);
    result.fill(color);
    return result;
}

// The widget alone, as it paints itself now.
inline QImage painted(QWidget& widget, const QColor& ground = Qt::white)
{
    QImage image(widget.size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(ground);
    widget.render(&image, QPoint(), QRegion(), QWidget::RenderFlags());
    return image;
}

// Where within the tolerance the pixel has the colour.
inline bool isColor(const QImage& image, const QPoint& point, const QColor& color, int tolerance = 6)
{
    const QColor found = image.pixelColor(point);
    return qAbs(found.red() - color.red()) <= tolerance && qAbs(found.green() - color.green()) <= tolerance
        && qAbs(found.blue() - color.blue()) <= tolerance;
}

/// Counts the repaints that a handle was asked for: update() posts one, however often it is called.
class Painted : public vx::Nubsie
{
public:
    using vx::Nubsie::Nubsie;

    int paints = 0;

protected:
    void paintEvent(QPaintEvent* event) override
    {
        ++paints;
        vx::Nubsie::paintEvent(event);
    }
};

class Receiver : public QObject
{
    Q_OBJECT

public:
    QStringList calls;
    std::function<void()> action;
    vx::QtSlot slot(const char* name, Qt::ConnectionType type = Qt::DirectConnection) const
    {
        return vx::QtSlot(this, name, type);
    }

public Q_SLOTS:
    void pressed(int value) { calls << QStringLiteral("pressed %1").arg(value); }
    void clicked(int value) { calls << QStringLiteral("clicked %1").arg(value); }
    void dragged(int value) { calls << QStringLiteral("dragged %1").arg(value); }
    void longPressed(int value) { calls << QStringLiteral("longPressed %1").arg(value); }
    void doubleClicked(int value) { calls << QStringLiteral("doubleClicked %1").arg(value); }
    void released(int value, QPoint point)
    {
        calls << QStringLiteral("released %1 at %2,%3").arg(value).arg(point.x()).arg(point.y());
    }
    void low(int value) { calls << QStringLiteral("low %1").arg(value); }
    void high(int value) { calls << QStringLiteral("high %1").arg(value); }
    void act(int) { action(); }
    void labelled(int value, const QString& text) { calls << QStringLiteral("%1 %2").arg(text).arg(value); }
};
}
