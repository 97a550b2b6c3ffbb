// SPDX-License-Identifier: MIT
// A split tool button whose arrow is a click of its own.
#include "input/CustomContextClickToolButton.h"

#include <QMouseEvent>
#include <QStyle>
#include <QStyleOptionToolButton>

namespace vx
{
CustomContextClickToolButton::CustomContextClickToolButton(QWidget* parent, int longClickSpan, bool shadow)
    : TCustomClickWidget<QToolButton>(parent, longClickSpan, shadow)
{
}

CustomContextClickToolButton::~CustomContextClickToolButton() = default;

bool CustomContextClickToolButton::insideArrow(const QPoint& point) const
{
    QStyleOptionToolButton option;
    initStyleOption(&option);
    const QRect arrow = style()->subControlRect(QStyle::CC_ToolButton, &option, QStyle::SC_ToolButtonMenu, this);
    return arrow.isValid() && arrow.contains(point);
}

void CustomContextClickToolButton::mousePressEvent(QMouseEvent* event)
{
    m_clickType = ectNormal;
    if (event->button() == Qt::LeftButton && popupMode() == QToolButton::MenuButtonPopup
        && insideArrow(event->pos())) {
        m_clickType = ectArrow;
        // Past the tool button, which would open its menu.
        QWidget::mousePressEvent(event);
        return;
    }
    TCustomClickWidget<QToolButton>::mousePressEvent(event);
}

void CustomContextClickToolButton::mouseReleaseEvent(QMouseEvent* event)
{
    if (m_clickType != ectArrow || !insideArrow(event->pos())) {
        TCustomClickWidget<QToolButton>::mouseReleaseEvent(event);
        return;
    }
    const QPointer<QWidget> guard = this;
    Q_EMIT clicked(false);
    if (!guard.isNull()) {
        QWidget::mouseReleaseEvent(event);
    }
}
}
