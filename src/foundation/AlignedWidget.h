// SPDX-License-Identifier: MIT
// Puts a widget in the centre of itself.
#pragma once

#include "foundation/Export.h"

#include <QtWidgets/QWidget>

namespace vx
{
/// Shows one child in its preferred size in the middle, with no margins, however large it is itself.
class ZELKOV_WIDGETS_EXPORT AlignedWidget : public QWidget
{
    Q_OBJECT

public:
    /// Takes the child as its own. Without one (null) the widget stays empty.
    AlignedWidget(QWidget* child, QWidget* parent);
    ~AlignedWidget() override;

    /// The child; null once it is gone.
    virtual QWidget* qchild() const;
};
}
