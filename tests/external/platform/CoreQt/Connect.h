// SPDX-License-Identifier: MIT
// Second platform set: connections by signature text, which are counted.
#pragma once

#include <QtCore/QObject>

namespace vx
{
bool connect(const QObject* sender, const char* signal, const QObject* receiver, const char* member,
    Qt::ConnectionType type = Qt::AutoConnection);
bool disconnect(const QObject* sender, const char* signal, const QObject* receiver, const char* member);

/// Only this set has it.
int connectionCount();
}
