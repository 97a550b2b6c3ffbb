// SPDX-License-Identifier: MIT
// Second platform set: deferred slot calls with integers and other shared meta-types.
#pragma once

#include <QtCore/QObject>
#include <QtCore/QPointer>
#include <QtCore/QVariant>

#include <array>
#include <string>

namespace vx
{
class QtSlot
{
public:
    QtSlot() = default;
    QtSlot(const QObject* receiver, const std::string& slot, Qt::ConnectionType type = Qt::AutoConnection)
        : m_receiver(const_cast<QObject*>(receiver))
        , m_slot(slot)
        , m_type(type)
    {
    }

    QObject* receiver() const { return m_receiver; }
    const char* slotName() const { return m_slot.c_str(); }
    Qt::ConnectionType connectionType() const { return m_type; }
    QGenericArgument parameter(int index) const
    {
        const QVariant value = index >= 0 && index < 10 ? m_parameters[std::size_t(index)] : QVariant();
        return value.isValid() ? QGenericArgument(value.typeName(), m_parameters[std::size_t(index)].constData())
                               : QGenericArgument();
    }
    void setParameter(int index, QGenericArgument argument)
    {
        if (index >= 0 && index < 10) {
            m_parameters[std::size_t(index)] = QVariant(QMetaType::type(argument.name()), argument.data());
        }
    }

private:
    QPointer<QObject> m_receiver;
    std::string m_slot;
    Qt::ConnectionType m_type = Qt::AutoConnection;
    std::array<QVariant, 10> m_parameters;
};
}
