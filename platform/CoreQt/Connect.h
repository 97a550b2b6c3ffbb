// SPDX-License-Identifier: MIT
// Signal-slot connections by signature text, without a word to the message log.
#pragma once

#include "CoreQt/Export.h"

#include <QtCore/QObject>

namespace vx
{
/// As QObject::connect with the same texts: "2" before a signal, "1" before a slot, as in "2timeout()" and
/// "1update()". Blanks and references are normalised, so "2moved( const QPoint & )" will do. Where Qt would print a
/// warning (null objects, an unknown signal or slot, arguments that do not fit or cannot be queued), this prints
/// nothing and returns false. \a member may be a signal of the receiver.
ZELKOV_COREQT_EXPORT bool connect(const QObject* sender, const char* signal, const QObject* receiver,
    const char* member, Qt::ConnectionType type = Qt::AutoConnection);

/// As QObject::disconnect: a null \a signal, \a receiver or \a member means any. Returns whether anything was
/// disconnected; prints nothing.
ZELKOV_COREQT_EXPORT bool disconnect(const QObject* sender, const char* signal, const QObject* receiver,
    const char* member);
}
