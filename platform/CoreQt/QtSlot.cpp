// SPDX-License-Identifier: MIT
// A slot call that is described now and made later.
#include "CoreQt/QtSlot.h"

#include <QtCore/QMetaMethod>
#include <QtCore/QMetaObject>
#include <QtCore/QMetaType>

namespace vx
{
namespace
{
std::shared_ptr<void> copyOf(int type, const void* data)
{
    if (type == QMetaType::UnknownType) {
        return std::make_shared<void*>(*static_cast<void* const*>(data));
    }
    return std::shared_ptr<void>(
        QMetaType::create(type, data), [type](void* copy) { QMetaType::destroy(type, copy); });
}
}

QtSlot::Parameter::Parameter(const QByteArray& name, int type, const void* data)
    : typeName(name)
    , typeId(type)
    , value(copyOf(type, data))
{
}

QtSlot::Parameter::Parameter(const Parameter& other)
    : typeName(other.typeName)
    , typeId(other.typeId)
    , value(other.value ? copyOf(other.typeId, other.value.get()) : nullptr)
{
}

QtSlot::Parameter& QtSlot::Parameter::operator=(const Parameter& other)
{
    if (this != &other) {
        typeName = other.typeName;
        typeId = other.typeId;
        value = other.value ? copyOf(typeId, other.value.get()) : nullptr;
    }
    return *this;
}

QtSlot::QtSlot()
    : m_connectionType(Qt::AutoConnection)
{
}

QtSlot::QtSlot(const QObject* receiver, const std::string& slot, Qt::ConnectionType connectionType)
    : m_receiver(const_cast<QObject*>(receiver))
    , m_slotName(slot)
    , m_connectionType(connectionType)
{
}

QtSlot::QtSlot(const QtSlot& other) = default;
QtSlot& QtSlot::operator=(const QtSlot& other) = default;
QtSlot::~QtSlot() = default;

QObject* QtSlot::receiver() const
{
    return m_receiver;
}

const char* QtSlot::slotName() const
{
    return m_slotName.c_str();
}

Qt::ConnectionType QtSlot::connectionType() const
{
    return m_connectionType;
}

QGenericArgument QtSlot::parameter(int index) const
{
    if (index < 0 || index >= s_ParameterCount) {
        return {};
    }
    const Parameter& parameter = m_parameters[static_cast<std::size_t>(index)];
    if (parameter.typeName.isEmpty()) {
        return {};
    }
    return QGenericArgument(parameter.typeName.constData(), parameter.value.get());
}

void QtSlot::setParameter(int index, QGenericArgument argument)
{
    if (index < 0 || index >= s_ParameterCount) {
        return;
    }
    Parameter parameter;
    if (argument.name() != nullptr && *argument.name() != '\0' && argument.data() != nullptr) {
        const QByteArray type = QMetaObject::normalizedType(argument.name());
        int id = QMetaType::type(type);
        if (id == QMetaType::UnknownType) {
            id = typeOfSlotParameter(index, type);
        }
        if (id != QMetaType::UnknownType && id != QMetaType::Void) {
            parameter = Parameter(argument.name(), id, argument.data());
        } else if (type.endsWith('*')) {
            parameter = Parameter(argument.name(), 0, argument.data());
        }
    }
    m_parameters[static_cast<std::size_t>(index)] = parameter;
}

int QtSlot::typeOfSlotParameter(int index, const QByteArray& typeName) const
{
    if (m_receiver.isNull()) {
        return QMetaType::UnknownType;
    }
    const QMetaObject* const meta = m_receiver->metaObject();
    for (int i = meta->methodCount() - 1; i >= 0; --i) {
        const QMetaMethod method = meta->method(i);
        if (method.name() == m_slotName.c_str() && index < method.parameterCount()
            && method.parameterTypes().at(index) == typeName) {
            return method.parameterType(index);
        }
    }
    return QMetaType::UnknownType;
}
}
