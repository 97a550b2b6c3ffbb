// SPDX-License-Identifier: MIT
// A custom click button with a list of states in place of the two of a check.
#include "controls/TMultiStateCustomWidget.h"

#include <QtCore/QPointer>
#include <QtWidgets/QStyle>

namespace vx
{
template <typename T>
TMultiStateCustomWidget<T>::TMultiStateCustomWidget(const QList<int>& states, const QString& objectName, QWidget* parent)
    : TCustomClickWidget<T>(parent, 750, false)
    , MultiStateWidget(states, objectName, this)
{
}

template <typename T>
TMultiStateCustomWidget<T>::~TMultiStateCustomWidget() = default;

template <typename T>
void TMultiStateCustomWidget<T>::setState(int state)
{
    m_state = state;
    this->style()->unpolish(this);
    this->style()->polish(this);
    // Has the selectors on the property evaluated once more.
    this->setStyleSheet(this->styleSheet());
}

template <typename T>
int TMultiStateCustomWidget<T>::setNextState(bool force)
{
    const QPointer<T> guard(this);
    const bool before = m_forceNextState;
    const int oldState = m_state;
    m_forceNextState = force;
    nextCheckState();
    if (guard.isNull()) {
        return oldState;
    }
    m_forceNextState = before;
    return m_state;
}

template <typename T>
void TMultiStateCustomWidget<T>::nextCheckState()
{
    goToNextState(m_forceNextState);
    // Past the custom click's own, which would hold the check back after a long click.
    T::nextCheckState();
}

template class TMultiStateCustomWidget<QToolButton>;
}
