// SPDX-License-Identifier: MIT
// The states of a button.
#include "controls/MultiStateWidget.h"

#include <QtWidgets/QWidget>

namespace vx
{
MultiStateWidget::MultiStateWidget(const QList<int>& states, const QString& objectName, QWidget* widget)
    : m_widget(widget)
{
    if (m_widget != nullptr) {
        m_widget->setObjectName(objectName);
    }
    m_stateList = states;
    m_state = states.isEmpty() ? 0 : states.first();
}

MultiStateWidget::MultiStateWidget(const MultiStateWidget& other) = default;
MultiStateWidget& MultiStateWidget::operator=(const MultiStateWidget& other) = default;
MultiStateWidget::~MultiStateWidget() = default;
}
