// SPDX-License-Identifier: MIT
// Connections by signature text.
#include "CoreQt/Connect.h"

#include <QtCore/QByteArray>
#include <QtCore/QMetaMethod>
#include <QtCore/QMetaObject>

namespace vx
{
namespace
{
constexpr char c_SlotCode = '1';
constexpr char c_SignalCode = '2';

// A signature text taken apart: the method of the object that it names, if any, and the text in Qt's own form.
struct Member
{
    Member(const QObject* object, const char* text)
    {
        if (object == nullptr || text == nullptr || (*text != c_SlotCode && *text != c_SignalCode)) {
            return;
        }
        code = *text;
        const QByteArray signature = QMetaObject::normalizedSignature(text + 1);
        const QMetaObject* const meta = object->metaObject();
        const int index = code == c_SignalCode ? meta->indexOfSignal(signature) : meta->indexOfSlot(signature);
        if (index >= 0) {
            method = meta->method(index);
            normalized = code + signature;
        }
    }

    bool isValid() const { return method.isValid(); }
    bool isSignal() const { return isValid() && code == c_SignalCode; }

    QMetaMethod method;
    QByteArray normalized;
    char code = '\0';
};

bool canBeQueued(const QMetaMethod& signal)
{
    for (int i = 0; i < signal.parameterCount(); ++i) {
        const bool pointer = signal.parameterTypes().at(i).endsWith('*');
        if (!pointer && signal.parameterType(i) == QMetaType::UnknownType) {
            return false;
        }
    }
    return true;
}
}

bool connect(const QObject* sender, const char* signal, const QObject* receiver, const char* member,
    Qt::ConnectionType type)
{
    const Member from(sender, signal);
    const Member to(receiver, member);
    if (!from.isSignal() || !to.isValid()
        || !QMetaObject::checkConnectArgs(from.normalized.constData() + 1, to.normalized.constData() + 1)) {
        return false;
    }
    if ((type & ~Qt::UniqueConnection) == Qt::QueuedConnection && !canBeQueued(from.method)) {
        return false;
    }
    return static_cast<bool>(
        QObject::connect(sender, from.normalized.constData(), receiver, to.normalized.constData(), type));
}

bool disconnect(const QObject* sender, const char* signal, const QObject* receiver, const char* member)
{
    if (sender == nullptr || (receiver == nullptr && member != nullptr)) {
        return false;
    }
    const Member from(sender, signal);
    const Member to(receiver, member);
    if ((signal != nullptr && !from.isSignal()) || (member != nullptr && !to.isValid())) {
        return false;
    }
    return QObject::disconnect(sender, signal != nullptr ? from.normalized.constData() : nullptr, receiver,
        member != nullptr ? to.normalized.constData() : nullptr);
}
}
