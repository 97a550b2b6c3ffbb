// SPDX-License-Identifier: MIT
// A walk through a list of integer states.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QList>

namespace vx
{
/// A list of integer states and the step through it. Plain logic without a widget; the multi-state buttons derive
/// from it.
///
/// The state need not be in the list: the step from such a state leads to the first entry. From a state that is in
/// the list twice the step goes on from its first place, so entries behind the second may never be reached.
class ZELKOV_WIDGETS_EXPORT MultiStateItem
{
public:
    MultiStateItem();
    MultiStateItem(const MultiStateItem& other);
    MultiStateItem& operator=(const MultiStateItem& other);
    virtual ~MultiStateItem();

    /// Only stores the state; buttons style themselves anew.
    virtual void setState(int state);
    int state() const;

    QList<int> stateList();
    /// Takes the list and calls setState() with the present state, which is not checked against the list.
    void setStateList(const QList<int>& states);

    /// Whether clicks may advance the state; true by default.
    void setStateChangeEnabled(bool enabled);

protected:
    /// The state after the present one, from the last back to the first; the present one if the list is empty.
    int getNextState() const;
    /// Takes the step, if changes are enabled or \a force is true. Returns the state that then holds.
    int goToNextState(bool force);

    QList<int> m_stateList; ///< in the order of the steps
    int m_state = 0; ///< need not be in the list
    bool m_stateChangeEnabled = true; ///< whether clicks take the step
};
}
