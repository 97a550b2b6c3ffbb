// SPDX-License-Identifier: MIT
// The badge as a widget: properties and painting, everything else is the drawer's.
#include "indicators/BadgeWidget.h"

#include "foundation/WidgetPrimitive.h"

#include <QPainter>
#include <QStyle>
#include <QStyleOption>

namespace vx
{

BadgeWidget::BadgeWidget(QWidget* parent)
    : QWidget(parent)
    , m_badge(this, this)
    , m_alignment(Qt::AlignRight | Qt::AlignTop)
{
}

BadgeWidget::~BadgeWidget() = default;

BadgeDrawer& BadgeWidget::badge()
{
    return m_badge;
}

Qt::Alignment BadgeWidget::alignment() const
{
    return m_alignment;
}

void BadgeWidget::setAlignment(Qt::Alignment alignment)
{
    if (m_alignment == alignment) {
        return;
    }
    m_alignment = alignment;
    update();
}

int BadgeWidget::busyBadgeType() const
{
    return m_badge.busyBadgeType();
}

void BadgeWidget::setBusyBadgeType(int type)
{
    m_badge.setBusyBadgeType(static_cast<BadgeDrawer::EBusyBadgeType>(type));
}

QSize BadgeWidget::badgeSize() const
{
    return m_badge.badgeSize();
}

void BadgeWidget::setBadgeSize(const QSize& size)
{
    m_badge.setBadgeSize(size);
}

bool BadgeWidget::badgeStroke() const
{
    return m_badge.badgeStroke();
}

void BadgeWidget::setBadgeStroke(bool stroke)
{
    m_badge.setBadgeStroke(stroke);
}

QColor BadgeWidget::badgeColor() const
{
    return m_badge.badgeColor();
}

void BadgeWidget::setBadgeColor(const QColor& color)
{
    m_badge.setBadgeColor(color);
}

QColor BadgeWidget::busyColor1() const
{
    return m_badge.busyColor1();
}

void BadgeWidget::setBusyColor1(const QColor& color)
{
    m_badge.setBusyColor1(color);
}

QColor BadgeWidget::busyColor2() const
{
    return m_badge.busyColor2();
}

void BadgeWidget::setBusyColor2(const QColor& color)
{
    m_badge.setBusyColor2(color);
}

QColor BadgeWidget::badgeBackground() const
{
    return m_badge.badgeBackground();
}

void BadgeWidget::setBadgeBackground(const QColor& color)
{
    m_badge.setBadgeBackground(color);
}

void BadgeWidget::setBadgeBusy(bool on)
{
    m_badge.setBadgeBusy(on);
}

void BadgeWidget::setBadgeLabel(const QString& text)
{
    m_badge.setBadgeLabel(text, false);
}

QString BadgeWidget::badgeLabel() const
{
    return m_badge.badgeLabel();
}

bool BadgeWidget::hasBadge() const
{
    return m_badge.hasBadge();
}

QSize BadgeWidget::sizeHint() const
{
    return m_badge.sizeHint();
}

void BadgeWidget::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    QStyle* const currentStyle = style();
    if (WidgetPrimitive::isPaintedBy(*currentStyle)) {
        QStyleOption option;
        option.initFrom(this);
        currentStyle->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
    }
    m_badge.drawBadge(painter, m_alignment);
}

} // namespace vx
