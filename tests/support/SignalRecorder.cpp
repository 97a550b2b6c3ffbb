// SPDX-License-Identifier: MIT
// Records every signal of an object, in order.
#include "SignalRecorder.h"

#include <QtCore/QMetaMethod>

namespace zelkovtest
{
SignalRecorder::SignalRecorder(QObject* object)
{
    if (object != nullptr) {
        add(object);
    }
}

void SignalRecorder::add(QObject* object)
{
    const QMetaObject* meta = object->metaObject();
    // Signals of Qt's own classes (destroyed, windowTitleChanged) are of no interest: stop at the first of them.
    int first = meta->methodCount();
    for (const QMetaObject* m = meta; m != nullptr; m = m->superClass()) {
        const QByteArray name(m->className());
        if (name.startsWith('Q') && name.size() > 1 && name.at(1) >= 'A' && name.at(1) <= 'Z') {
            break;
        }
        first = m->methodOffset();
    }
    for (int i = first; i < meta->methodCount(); ++i) {
        const QMetaMethod method = meta->method(i);
        if (method.methodType() != QMetaMethod::Signal) {
            continue;
        }
        const int slot = QObject::staticMetaObject.methodCount() + m_sources.size();
        m_sources.append({object, method});
        QMetaObject::connect(object, i, this, slot, Qt::DirectConnection, nullptr);
    }
}

QStringList SignalRecorder::names() const
{
    QStringList result;
    for (const Entry& entry : m_entries) {
        result << entry.name;
    }
    return result;
}

int SignalRecorder::count(const QString& name) const
{
    return names().count(name);
}

int SignalRecorder::qt_metacall(QMetaObject::Call call, int id, void** arguments)
{
    id = QObject::qt_metacall(call, id, arguments);
    if (id < 0 || call != QMetaObject::InvokeMetaMethod) {
        return id;
    }
    if (id < m_sources.size()) {
        const Source& source = m_sources.at(id);
        Entry entry{source.sender, QString::fromLatin1(source.method.name()), {}};
        for (int i = 0; i < source.method.parameterCount(); ++i) {
            const int type = source.method.parameterType(i);
            entry.arguments << (type == QMetaType::UnknownType ? QVariant() : QVariant(type, arguments[i + 1]));
        }
        m_entries.append(entry);
    }
    return id - m_sources.size();
}
}
