// SPDX-License-Identifier: MIT
// A walk through a list of integer states.
#include "controls/MultiStateItem.h"

namespace vx
{
MultiStateItem::MultiStateItem() = default;
MultiStateItem::MultiStateItem(const MultiStateItem& other) = default;
MultiStateItem& MultiStateItem::operator=(const MultiStateItem& other) = default;
MultiStateItem::~MultiStateItem() = default;

void MultiStateItem::setState(int state)
{
    m_state = state;
}

int MultiStateItem::state() const
{
    return m_state;
}

QList<int> MultiStateItem::stateList()
{
    return m_stateList;
}

void MultiStateItem::setStateList(const QList<int>& states)
{
    m_stateList = states;
    setState(m_state);
}

void MultiStateItem::setStateChangeEnabled(bool enabled)
{
    m_stateChangeEnabled = enabled;
}

int MultiStateItem::getNextState() const
{
    if (m_stateList.isEmpty()) {
        return m_state;
    }
    return m_stateList.at((m_stateList.indexOf(m_state) + 1) % m_stateList.size());
}

int MultiStateItem::goToNextState(bool force)
{
    if (force || m_stateChangeEnabled) {
        setState(getNextState());
    }
    return m_state;
}
}
