// SPDX-License-Identifier: MIT
// An application rectangle stretched over a widget.
#include "ZelkovUtils/LinearCoordinateSystem.h"

#include <QtCore/QtMath>

#include <cmath>

namespace vx
{
namespace
{
// Far beyond any widget, near enough that widths and sums still fit an int.
constexpr qreal c_ScreenLimit = 100000000.0;

int toPixel(qreal value)
{
    return qRound(qBound(-c_ScreenLimit, value, c_ScreenLimit));
}

bool isFinite(const QRectF& rect)
{
    return std::isfinite(rect.x()) && std::isfinite(rect.y()) && std::isfinite(rect.width())
        && std::isfinite(rect.height());
}

// By how much a side was stretched or shrunk, as a factor of at least 1.
qreal change(qreal now, qreal before)
{
    const qreal from = std::abs(before);
    const qreal to = std::abs(now);
    if (qFuzzyIsNull(from) || qFuzzyIsNull(to)) {
        return qFuzzyCompare(1.0 + from, 1.0 + to) ? 1.0 : qInf();
    }
    return from > to ? from / to : to / from;
}

// Where a side of the new length starts so that the named edge or the centre stays.
qreal startOf(qreal start, qreal length, qreal newLength, bool keepEnd, bool keepCentre)
{
    if (keepEnd) {
        return start + length - newLength;
    }
    return keepCentre ? start + (length - newLength) / 2.0 : start;
}
}

LinearCoordinateSystem::LinearCoordinateSystem(const QRectF& applicationRect, QWidget* widget)
    : m_applicationRect(applicationRect.normalized())
    , m_widget(widget)
{
}

LinearCoordinateSystem::~LinearCoordinateSystem() = default;

QRectF LinearCoordinateSystem::applicationRect() const
{
    return m_applicationRect;
}

void LinearCoordinateSystem::setApplicationRect(const QRectF& rect)
{
    m_applicationRect = rect.normalized();
}

QWidget* LinearCoordinateSystem::widget() const
{
    return m_widget;
}

void LinearCoordinateSystem::setWidget(QWidget* widget)
{
    m_widget = widget;
}

bool LinearCoordinateSystem::isUsable() const
{
    return m_widget && m_widget->width() > 0 && m_widget->height() > 0 && isFinite(m_applicationRect)
        && m_applicationRect.width() > 0.0 && m_applicationRect.height() > 0.0;
}

QRect LinearCoordinateSystem::mapToScreen(const QRectF& rect) const
{
    if (!isUsable() || !isFinite(rect)) {
        return {};
    }
    const qreal scaleX = m_widget->width() / m_applicationRect.width();
    const qreal scaleY = m_widget->height() / m_applicationRect.height();
    // Edges are rounded, not sizes, so that rectangles side by side neither overlap nor gape.
    const int left = toPixel((rect.left() - m_applicationRect.left()) * scaleX);
    const int top = toPixel((rect.top() - m_applicationRect.top()) * scaleY);
    const int right = toPixel((rect.right() - m_applicationRect.left()) * scaleX);
    const int bottom = toPixel((rect.bottom() - m_applicationRect.top()) * scaleY);
    return {left, top, right - left, bottom - top};
}

qreal LinearCoordinateSystem::toApplicationX(int screenX) const
{
    return m_applicationRect.left() + screenX * (m_applicationRect.width() / m_widget->width());
}

qreal LinearCoordinateSystem::toApplicationY(int screenY) const
{
    return m_applicationRect.top() + screenY * (m_applicationRect.height() / m_widget->height());
}

void LinearCoordinateSystem::setLeft(QRectF& rect, int screenX) const
{
    if (isUsable()) {
        rect.setLeft(toApplicationX(screenX));
    }
}

void LinearCoordinateSystem::setTop(QRectF& rect, int screenY) const
{
    if (isUsable()) {
        rect.setTop(toApplicationY(screenY));
    }
}

void LinearCoordinateSystem::setRight(QRectF& rect, int screenX) const
{
    if (isUsable()) {
        rect.setRight(toApplicationX(screenX) + m_applicationRect.width() / m_widget->width());
    }
}

void LinearCoordinateSystem::setBottom(QRectF& rect, int screenY) const
{
    if (isUsable()) {
        rect.setBottom(toApplicationY(screenY) + m_applicationRect.height() / m_widget->height());
    }
}

void LinearCoordinateSystem::move(QRectF& rect, const QPoint& screenOffset, Qt::Alignment) const
{
    if (isUsable()) {
        rect.translate(screenOffset.x() * (m_applicationRect.width() / m_widget->width()),
            screenOffset.y() * (m_applicationRect.height() / m_widget->height()));
    }
}

void LinearCoordinateSystem::adjustToAspectRatio(QRectF& rect, double ratio, Qt::Alignment alignment,
    const QRectF& original) const
{
    if (!isUsable() || !isFinite(rect) || !isFinite(original)) {
        return;
    }
    if (qFuzzyCompare(ratio, CALC_ASPECT_RATIO) && !qFuzzyIsNull(original.height())) {
        ratio = std::abs(original.width() / original.height());
    }
    if (!std::isfinite(ratio) || ratio <= 0.0) {
        return;
    }
    const bool heightLeads = !original.isNull()
        && change(rect.height(), original.height()) > change(rect.width(), original.width());
    QSizeF size = rect.size();
    if (heightLeads) {
        size.setWidth(std::copysign(std::abs(size.height()) * ratio, size.width()));
    } else {
        size.setHeight(std::copysign(std::abs(size.width()) / ratio, size.height()));
    }
    const QPointF corner(
        startOf(rect.x(), rect.width(), size.width(), alignment.testFlag(Qt::AlignRight),
            alignment.testFlag(Qt::AlignHCenter)),
        startOf(rect.y(), rect.height(), size.height(), alignment.testFlag(Qt::AlignBottom),
            alignment.testFlag(Qt::AlignVCenter)));
    rect = QRectF(corner, size);
}
}
