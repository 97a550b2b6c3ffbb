// SPDX-License-Identifier: MIT
// Runs a function when a signal, known by its index only, fires.
#pragma once

#include <functional>

#include <QtCore/QByteArray>
#include <QtCore/QList>
#include <QtCore/QObject>

namespace zelkovtest
{
class Saboteur : public QObject
{
    // No Q_OBJECT: qt_metacall is answered by hand, so that one class serves signals of any signature.
public:
    /// @p signal is a method index of the sender's meta-object. The deed is done each time the signal fires.
    Saboteur(QObject* sender, int signal, std::function<void()> deed);

    int qt_metacall(QMetaObject::Call call, int id, void** arguments) override;

private:
    std::function<void()> m_deed;
};

/// Qt's own class, by its name.
bool isQtClass(const QMetaObject* meta);

/// Names of the signals that the library's own classes declare, Qt's base classes left out.
QList<QByteArray> declaredSignals(const QObject* object);

/// Method index of the signal of that name, or -1.
int signalIndex(const QObject* object, const QByteArray& name);
}
