// SPDX-License-Identifier: MIT
// Puts a widget in the centre of itself.
#include "foundation/AlignedWidget.h"

#include <QtWidgets/QHBoxLayout>

namespace vx
{
AlignedWidget::AlignedWidget(QWidget* child, QWidget* parent)
    : QWidget(parent)
{
    auto* const layout = new QHBoxLayout;
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setAlignment(Qt::AlignCenter);
    // An ancestor cannot become a child.
    if (child != nullptr && child != this && !child->isAncestorOf(this)) {
        layout->addWidget(child);
    }
    setLayout(layout);
}

AlignedWidget::~AlignedWidget() = default;

QWidget* AlignedWidget::qchild() const
{
    QLayoutItem* const item = layout() != nullptr ? layout()->itemAt(0) : nullptr;
    return item != nullptr ? item->widget() : nullptr;
}
}
