// SPDX-License-Identifier: MIT
// Qt's buttons with a list of states in place of the two of a check.
#include "controls/TMultiStateWidget.h"

#include <QtCore/QPointer>
#include <QtWidgets/QStyle>

namespace vx
{
template <typename T>
TMultiStateWidget<T>::TMultiStateWidget(const QList<int>& states, const QString& objectName, QWidget* parent)
    : TFadingWidget<T>(parent, 100, 16, QColor(191, 191, 191, 255), 0, 128, false)
    , MultiStateWidget(states, objectName, this)
{
}

template <typename T>
TMultiStateWidget<T>::~TMultiStateWidget() = default;

template <typename T>
void TMultiStateWidget<T>::setState(int state)
{
    if (state == m_state) {
        return;
    }
    m_state = state;
    this->style()->unpolish(this);
    this->style()->polish(this);
    // Has the selectors on the property evaluated once more.
    this->setStyleSheet(this->styleSheet());
}

template <typename T>
int TMultiStateWidget<T>::setNextState(bool force)
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
void TMultiStateWidget<T>::nextCheckState()
{
    goToNextState(m_forceNextState);
    if (m_stateChangeEnabled) {
        T::nextCheckState();
    }
}

template class TMultiStateWidget<QToolButton>;
template class TMultiStateWidget<QPushButton>;
template class TMultiStateWidget<QCheckBox>;
}
