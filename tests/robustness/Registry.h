// SPDX-License-Identifier: MIT
// The one list of all public classes, with what the robustness suites need to know of each.
#pragma once

#include <functional>
#include <type_traits>
#include <utility>
#include <vector>

#include <QtCore/QByteArray>
#include <QtCore/QList>
#include <QtCore/QMetaEnum>
#include <QtCore/QObject>
#include <QtCore/QPointer>
#include <QtCore/QVariant>
#include <QtWidgets/QWidget>

namespace zelkovtest
{
enum class Kind : int
{
    Widget, ///< A QWidget: all suites.
    Object, ///< A QObject that works on a widget: all suites.
    Value,  ///< Anything else (values, static helpers, interfaces): listed so that it is not forgotten.
};

/// One living instance. For a widget class both pointers name the same thing; for other objects @c widget is the
/// widget that they work on and that receives the events.
struct Subject
{
    QPointer<QObject> object;
    QPointer<QWidget> widget;

    bool alive() const { return !object.isNull() && !widget.isNull(); }
};

/// One thing that a user or a client does. The runner asks Subject::alive() before each step; within a step nothing
/// may be touched after a call that can emit.
using Step = std::function<void(const Subject&)>;

/// A short use of the class by real events, calls and short timers, and the signals that must have fired at its end.
struct Script
{
    QByteArray name;
    QList<QByteArray> fires;
    std::vector<Step> steps;
};

/// A public operation that takes arguments, to be called with extreme values.
struct Setter
{
    QByteArray name;
    std::vector<int> types;
    std::function<void(QObject*, const QVariantList&)> call;
};

struct Entry
{
    QByteArray name;
    QByteArray header;
    Kind kind = Kind::Value;
    /// Makes an instance in the given host window, ready to be shown; what it makes dies with the host.
    std::function<Subject(QWidget* host)> create;
    std::vector<Script> exercise;
    std::vector<Setter> setters;
    /// Signals of the destructor: nobody deletes the sender, or what it stands in, a second time then.
    QList<QByteArray> farewells;

    /// Names of all signals that the scripts promise, each once.
    QList<QByteArray> expectedSignals() const;
};

/// All entries, in the order of the rooms.
const std::vector<Entry>& registry();

// One function a room; a new room adds its own file and a line in Registry.cpp.
std::vector<Entry> platformEntries();
std::vector<Entry> foundationEntries();
std::vector<Entry> indicatorsEntries();
std::vector<Entry> labelEntries();
std::vector<Entry> inputEntries();
std::vector<Entry> clickEntries();
std::vector<Entry> balloonEntries();
std::vector<Entry> slidersEntries();
std::vector<Entry> nubsieEntries();
std::vector<Entry> timeLineEntries();
std::vector<Entry> popoverItemEntries();
std::vector<Entry> modelsEntries();
std::vector<Entry> viewsEntries();
std::vector<Entry> editsEntries();
std::vector<Entry> overlayEntries();
std::vector<Entry> controlsEntries();
std::vector<Entry> switchEntries();
std::vector<Entry> controllerEntries();
std::vector<Entry> rowEntries();

// --- Words for entries -----------------------------------------------------------------------------------------

Entry valueClass(const char* name, const char* header);

/// Entry of a widget class with the constructor (QWidget* parent).
template<class Class>
Entry widgetClass(const char* name, const char* header)
{
    Entry entry;
    entry.name = name;
    entry.header = header;
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        Class* const widget = new Class(host);
        return Subject{widget, widget};
    };
    return entry;
}

namespace detail
{
template<class T, class = void>
struct IsFlags : std::false_type
{
};
template<class T>
struct IsFlags<T, std::void_t<typename T::enum_type>> : std::true_type
{
};

// Enumerations without a fixed type, as Qt's own, may not hold any number.
template<class T, class = void>
struct HoldsAnyNumber : std::false_type
{
};
template<class T>
struct HoldsAnyNumber<T, std::void_t<decltype(T{std::underlying_type_t<T>{}})>> : std::true_type
{
};

template<class T>
int argumentType()
{
    if constexpr (std::is_enum_v<T> || IsFlags<T>::value) {
        return QMetaType::Int;
    } else {
        return qMetaTypeId<T>();
    }
}

template<class T>
T argument(const QVariant& value)
{
    if constexpr (std::is_enum_v<T>) {
        if constexpr (HoldsAnyNumber<T>::value) {
            return static_cast<T>(value.toInt());
        } else {
            const QMetaEnum meta = QMetaEnum::fromType<T>();
            return static_cast<T>(meta.value(static_cast<int>(value.toUInt() % static_cast<unsigned>(meta.keyCount()))));
        }
    } else if constexpr (IsFlags<T>::value) {
        return T(QFlag(value.toInt()));
    } else {
        return qvariant_cast<T>(value);
    }
}

template<class Class, class Result, class... Arguments, std::size_t... Index>
void invoke(Class* object, Result (Class::*function)(Arguments...), const QVariantList& values,
    std::index_sequence<Index...>)
{
    (object->*function)(argument<std::decay_t<Arguments>>(values.at(static_cast<int>(Index)))...);
}
}

/// Setter of the member function @p function; overloads are picked by a cast.
template<class Class, class Result, class... Arguments>
Setter setter(const char* name, Result (Class::*function)(Arguments...))
{
    return {name, {detail::argumentType<std::decay_t<Arguments>>()...},
        [function](QObject* object, const QVariantList& values) {
            detail::invoke(static_cast<Class*>(object), function, values, std::index_sequence_for<Arguments...>());
        }};
}

// --- Words for scripts -----------------------------------------------------------------------------------------

/// A mouse event to the widget, @p milliseconds on the clock of the events. Positions are the widget's own.
Step mousePress(const QPoint& position, int milliseconds, Qt::MouseButton button = Qt::LeftButton);
Step mouseMove(const QPoint& position, int milliseconds, Qt::MouseButtons buttons = Qt::LeftButton);
Step mouseRelease(const QPoint& position, int milliseconds, Qt::MouseButton button = Qt::LeftButton);
Step mouseDoubleClick(const QPoint& position, int milliseconds, Qt::MouseButton button = Qt::LeftButton);
Step enter(const QPoint& position);
Step leave();
/// Calls a member function of the object under test.
template<class Class, class... Parameters, class... Arguments>
Step call(void (Class::*function)(Parameters...), Arguments... arguments)
{
    return [=](const Subject& subject) {
        (static_cast<Class*>(subject.object.data())->*function)(arguments...);
    };
}
/// Spins the event loop until the signal of that name fires, the subject dies or patience ends.
Step waitFor(const char* signal);

/// How long waitFor() waits at most, in milliseconds.
void setPatience(int milliseconds);
int patience();
}
