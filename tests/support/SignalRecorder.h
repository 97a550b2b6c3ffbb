// SPDX-License-Identifier: MIT
// Records every signal of an object, in order, so that a test can compare the order as one list.
#pragma once

#include <QtCore/QList>
#include <QtCore/QMetaMethod>
#include <QtCore/QObject>
#include <QtCore/QStringList>
#include <QtCore/QVariantList>
#include <QtCore/QVector>

namespace zelkovtest
{
class SignalRecorder : public QObject
{
    // No Q_OBJECT: qt_metacall is answered by hand, one virtual slot for each signal.
public:
    struct Entry
    {
        QObject* sender;
        QString name;
        QVariantList arguments;
    };

    /// Records the signals that @p object declares below QObject, QWidget and the other Qt base classes.
    explicit SignalRecorder(QObject* object = nullptr);

    /// Adds the signals of a further object to the same list.
    void add(QObject* object);

    QStringList names() const;
    const QVector<Entry>& entries() const { return m_entries; }
    int count(const QString& name) const;
    void clear() { m_entries.clear(); }

    int qt_metacall(QMetaObject::Call call, int id, void** arguments) override;

private:
    struct Source
    {
        QObject* sender;
        QMetaMethod method;
    };

    QVector<Source> m_sources;
    QVector<Entry> m_entries;
};
}
