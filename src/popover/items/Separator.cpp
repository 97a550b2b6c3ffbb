// SPDX-License-Identifier: MIT
// A line between rows.
#include "popover/items/Separator.h"

#include <QtGui/QPainter>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOption>

namespace vx
{
namespace PopoverWidget
{

Separator::Separator(QWidget* parent)
    : QWidget(parent)
{
    setObjectName(QStringLiteral("popoverSeparator"));
}

Separator::~Separator() = default;

void Separator::paintEvent(QPaintEvent* /*event*/)
{
    QStyleOption option;
    option.initFrom(this);
    QPainter painter(this);
    style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
}

} // namespace PopoverWidget
} // namespace vx
