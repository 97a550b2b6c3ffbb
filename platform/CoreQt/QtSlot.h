// SPDX-License-Identifier: MIT
// A slot call that is described now and made later.
#pragma once

#include "CoreQt/Export.h"

#include <QtCore/QByteArray>
#include <QtCore/QGenericArgument>
#include <QtCore/QObject>
#include <QtCore/QPointer>

#include <array>
#include <memory>
#include <string>

namespace vx
{
/// Names a slot of a receiver together with up to ten arguments, so that a widget can be told what to call when
/// something happens. It does not call by itself:
///
///     QMetaObject::invokeMethod(slot.receiver(), slot.slotName(), slot.connectionType(),
///                               slot.parameter(0), slot.parameter(1), ...);
///
/// A default-constructed object names no slot, and that call returns false.
///
/// The receiver is not owned and reads as null once it is gone. Arguments are owned: setParameter() copies the value,
/// so that the caller's variable may go at once, and copies of a QtSlot have arguments of their own. The value can
/// only be copied if the meta-type system knows its type; a type that is registered nowhere, but that the named slot
/// of the receiver takes at this position, is looked up there. Of pointers the address is copied. Anything else
/// leaves the parameter empty.
class ZELKOV_COREQT_EXPORT QtSlot
{
public:
    /// Parameters have the indexes 0 to 9.
    static constexpr int s_ParameterCount = 10;

    QtSlot();
    /// \a slot is the bare name as QMetaObject::invokeMethod wants it: "onDragged", without signature.
    QtSlot(const QObject* receiver, const std::string& slot, Qt::ConnectionType connectionType = Qt::AutoConnection);
    QtSlot(const QtSlot& other);
    QtSlot& operator=(const QtSlot& other);
    ~QtSlot();

    /// Null without a receiver, and once it is gone.
    QObject* receiver() const;
    /// Never null. Valid as long as this object is neither changed nor destroyed; so is what parameter() gives.
    const char* slotName() const;
    /// As given to the constructor.
    Qt::ConnectionType connectionType() const;

    /// The argument at \a index, empty if none was set and for an index outside 0 to 9.
    QGenericArgument parameter(int index) const;
    /// Stores a copy of the argument; an empty one clears the parameter. Ignored for an index outside 0 to 9.
    void setParameter(int index, QGenericArgument argument);

private:
    struct Parameter
    {
        Parameter() = default;
        Parameter(const QByteArray& name, int type, const void* data);
        Parameter(const Parameter& other);
        Parameter& operator=(const Parameter& other);
        ~Parameter() = default;

        QByteArray typeName;
        int typeId = 0;               // meta-type of the value; 0 for a pointer to a type that is not registered
        std::shared_ptr<void> value;  // never shared between parameters: a slot may write to what it is given
    };

    int typeOfSlotParameter(int index, const QByteArray& typeName) const;

    QPointer<QObject> m_receiver;
    std::string m_slotName;
    Qt::ConnectionType m_connectionType;
    std::array<Parameter, s_ParameterCount> m_parameters;
};
}
