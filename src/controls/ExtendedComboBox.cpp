// SPDX-License-Identifier: MIT
#include "controls/ExtendedComboBox.h"

#include <QtGui/QWheelEvent>

namespace vx
{
ExtendedComboBox::ExtendedComboBox(QWidget* parent)
    : QComboBox(parent)
{
}

ExtendedComboBox::~ExtendedComboBox() = default;

bool ExtendedComboBox::ignoreWheelEvents() const
{
    return m_ignoreWheelEvents;
}

void ExtendedComboBox::setIgnoreWheelEvents(bool ignore)
{
    m_ignoreWheelEvents = ignore;
}

void ExtendedComboBox::wheelEvent(QWheelEvent* event)
{
    // Accepted it is swallowed: in neither case does the wheel choose another item.
    event->setAccepted(!m_ignoreWheelEvents);
}
}
