// SPDX-License-Identifier: MIT
// What the user has chosen about the desk.
#pragma once

#include <QtCore/QObject>
#include <QtCore/QString>

namespace client
{
/// The choices of the settings popover. They last as long as the client.
class Settings : public QObject
{
    Q_OBJECT

public:
    enum DeviceSide : int
    {
        Left,
        Right,
        Hidden
    };

    struct Values
    {
        bool names = true;
        bool times = true;
        bool badges = true;
        int deviceSide = Left;
        bool stripes = true;
        QString site; ///< empty: the main building
        QString shownName; ///< empty: the name of the log-in
        int outageSeconds = 8;
        int idleSeconds = 0; ///< until the user is logged out; 0: never
    };

    using QObject::QObject;

    const Values& values() const { return m_values; }

    template <class T>
    void set(T Values::*field, const T& value)
    {
        if (m_values.*field != value) {
            m_values.*field = value;
            Q_EMIT changed();
        }
    }

Q_SIGNALS:
    void changed();

private:
    Values m_values;
};
}
