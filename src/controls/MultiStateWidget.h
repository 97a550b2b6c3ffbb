// SPDX-License-Identifier: MIT
// The states of a button.
#pragma once

#include "controls/MultiStateItem.h"
#include "foundation/Export.h"

#include <QtCore/QString>

class QWidget;

namespace vx
{
/// The walk through states, bound to a widget. A mix-in beside a button class; TMultiStateWidget and
/// TMultiStateCustomWidget put it together with Qt's buttons.
class ZELKOV_WIDGETS_EXPORT MultiStateWidget : public MultiStateItem
{
public:
    /// Names \a widget, which is the button itself and not owned. The first state is the first of \a states, or 0.
    /// setState() is not called: nothing is styled anew.
    MultiStateWidget(const QList<int>& states, const QString& objectName, QWidget* widget);
    MultiStateWidget(const MultiStateWidget& other);
    MultiStateWidget& operator=(const MultiStateWidget& other);
    ~MultiStateWidget() override;

protected:
    bool m_reserved = false; // keeps the place of what follows
    bool m_forceNextState = false; ///< while setNextState() takes a forced step
    QWidget* m_widget; ///< the button itself
};
}
