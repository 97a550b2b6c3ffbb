// SPDX-License-Identifier: MIT
// A line between rows.
#pragma once

#include "foundation/Export.h"

#include <QtWidgets/QWidget>

namespace vx
{
namespace PopoverWidget
{

/// A widget between the rows of a popover that style sheets draw, by its object name "popoverSeparator"; without a
/// sheet it has neither look nor height. Add it with Container::addWidgetItem().
class ZELKOV_WIDGETS_EXPORT Separator : public QWidget
{
    Q_OBJECT

public:
    explicit Separator(QWidget* parent);
    ~Separator() override;

protected:
    void paintEvent(QPaintEvent* event) override;
};

} // namespace PopoverWidget
} // namespace vx
