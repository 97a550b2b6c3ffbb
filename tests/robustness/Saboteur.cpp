// SPDX-License-Identifier: MIT
// Connects to a signal without knowing its signature.
#include "Saboteur.h"

#include <QtCore/QMetaMethod>

namespace zelkovtest
{
bool isQtClass(const QMetaObject* meta)
{
    const QByteArray name(meta->className());
    return name.size() > 1 && name.at(0) == 'Q' && name.at(1) >= 'A' && name.at(1) <= 'Z';
}

Saboteur::Saboteur(QObject* sender, int signal, std::function<void()> deed)
    : m_deed(std::move(deed))
{
    QMetaObject::connect(sender, signal, this, QObject::staticMetaObject.methodCount(), Qt::DirectConnection, nullptr);
}

int Saboteur::qt_metacall(QMetaObject::Call call, int id, void** arguments)
{
    id = QObject::qt_metacall(call, id, arguments);
    if (id < 0 || call != QMetaObject::InvokeMetaMethod) {
        return id;
    }
    if (id == 0) {
        // A copy: the deed may end this object's life.
        const std::function<void()> deed = m_deed;
        deed();
        return -1;
    }
    return id - 1;
}

QList<QByteArray> declaredSignals(const QObject* object)
{
    QList<QByteArray> result;
    for (const QMetaObject* meta = object->metaObject(); meta != nullptr; meta = meta->superClass()) {
        if (isQtClass(meta)) {
            continue;
        }
        for (int i = meta->methodOffset(); i < meta->methodCount(); ++i) {
            const QMetaMethod method = meta->method(i);
            const bool cloned = (method.attributes() & QMetaMethod::Cloned) != 0;
            if (method.methodType() == QMetaMethod::Signal && !cloned && !result.contains(method.name())) {
                result << method.name();
            }
        }
    }
    return result;
}

int signalIndex(const QObject* object, const QByteArray& name)
{
    const QMetaObject* const meta = object->metaObject();
    for (int i = meta->methodCount() - 1; i >= 0; --i) {
        const QMetaMethod method = meta->method(i);
        const bool cloned = (method.attributes() & QMetaMethod::Cloned) != 0;
        if (method.methodType() == QMetaMethod::Signal && !cloned && method.name() == name) {
            return i;
        }
    }
    return -1;
}
}
