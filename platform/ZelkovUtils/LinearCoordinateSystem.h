// SPDX-License-Identifier: MIT
// An application rectangle stretched over a widget.
#pragma once

#include "ZelkovUtils/CoordinateSystem.h"
#include "ZelkovUtils/Export.h"

#include <QtCore/QPointer>
#include <QtCore/QRectF>
#include <QtWidgets/QWidget>

namespace vx
{
/// Maps an application rectangle linearly, each axis for itself, to the whole of a widget in its present size.
/// Screen coordinates are the widget's own. The widget is not owned. While it is gone or empty, or the application
/// rectangle has no size, mapToScreen() gives a null rectangle and the other operations change nothing.
class ZELKOV_UTILS_EXPORT LinearCoordinateSystem : public CoordinateSystem
{
public:
    /// Normalises \a applicationRect. The widget may be null.
    LinearCoordinateSystem(const QRectF& applicationRect, QWidget* widget);
    ~LinearCoordinateSystem() override;

    QRectF applicationRect() const;
    /// Normalised when stored.
    void setApplicationRect(const QRectF& rect);
    /// Null without one, and once it is gone.
    QWidget* widget() const;
    /// Not owned; null for none.
    void setWidget(QWidget* widget);

    QRect mapToScreen(const QRectF& rect) const override;
    void setLeft(QRectF& rect, int screenX) const override;
    void setTop(QRectF& rect, int screenY) const override;
    void setRight(QRectF& rect, int screenX) const override;
    void setBottom(QRectF& rect, int screenY) const override;
    void move(QRectF& rect, const QPoint& screenOffset, Qt::Alignment alignment) const override;
    void adjustToAspectRatio(QRectF& rect, double ratio, Qt::Alignment alignment,
        const QRectF& original = QRectF()) const override;

private:
    bool isUsable() const;
    qreal toApplicationX(int screenX) const;
    qreal toApplicationY(int screenY) const;

    QRectF m_applicationRect;
    QPointer<QWidget> m_widget;
};
}
