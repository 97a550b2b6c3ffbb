// SPDX-License-Identifier: MIT
// Random events, the same for the same seed.
#include <memory>

#include <QtCore/QMetaProperty>
#include <QtCore/QRandomGenerator>
#include <QtCore/QTimer>
#include <QtGui/QHelpEvent>
#include <QtGui/QKeyEvent>
#include <QtGui/QMouseEvent>
#include <QtGui/QWheelEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>

#include "Suites.h"

namespace zelkovtest
{
namespace
{
class Monkey
{
public:
    Monkey(const Entry& entry, quint32 seed)
        : m_entry(entry)
        , m_random(seed)
        , m_properties(writableProperties(entry))
    {
        fresh();
    }

    void act()
    {
        // A subject that a class deletes on its own is replaced, as a client would.
        if (!m_subject.alive() || !m_host) {
            fresh();
        }
        switch (below(24)) {
        case 0:
        case 1:
        case 2:
        case 3:
            mouse(QEvent::MouseButtonPress);
            break;
        case 4:
        case 5:
        case 6:
        case 7:
            mouse(QEvent::MouseButtonRelease);
            break;
        case 8:
        case 9:
        case 10:
            mouse(QEvent::MouseMove);
            break;
        case 11:
            mouse(QEvent::MouseButtonDblClick);
            break;
        case 12:
            wheel();
            break;
        case 13:
        case 14:
            key();
            break;
        case 15:
            touch();
            break;
        case 16:
            resize();
            break;
        case 17:
            m_subject.widget->setVisible(below(4) != 0);
            break;
        case 18:
            m_subject.widget->setEnabled(below(4) != 0);
            break;
        case 19:
            property();
            break;
        case 20:
            setter();
            break;
        case 21:
            plainEvent();
            break;
        case 22:
            surroundings();
            break;
        default:
            settle();
            break;
        }
    }

    void fresh()
    {
        delete m_host.data();
        QCoreApplication::processEvents();
        m_host = new QWidget;
        m_host->resize(200, 150);
        m_subject = m_entry.create(m_host);
        m_host->show();
        m_buttons = Qt::NoButton;
    }

    void end()
    {
        delete m_host.data();
        QCoreApplication::processEvents();
    }

private:
    int below(int bound) { return m_random.bounded(bound); }

    template<class T, std::size_t Size>
    const T& pick(const T (&values)[Size])
    {
        return values[below(static_cast<int>(Size))];
    }

    QPoint position()
    {
        // Mostly inside, now and then far outside.
        if (below(16) == 0) {
            return {below(4000) - 2000, below(4000) - 2000};
        }
        // A geometry that was written may reach beyond the range of int: QRect cannot tell its size then.
        const QRect place = m_subject.widget->geometry();
        const auto extent = [](int first, int last) {
            return static_cast<int>(qBound<qint64>(1, qint64(last) - first + 1, 100000));
        };
        return {below(extent(place.left(), place.right()) + 10) - 5, below(extent(place.top(), place.bottom()) + 10) - 5};
    }

    void send(QEvent& event)
    {
        QApplication::sendEvent(m_subject.widget, &event);
    }

    void mouse(QEvent::Type type)
    {
        static const Qt::MouseButton buttons[] = {Qt::LeftButton, Qt::LeftButton, Qt::RightButton, Qt::MiddleButton};
        Qt::MouseButton button = pick(buttons);
        if (type == QEvent::MouseButtonRelease) {
            m_buttons &= ~Qt::MouseButtons(button);
        } else if (type == QEvent::MouseMove) {
            button = Qt::NoButton;
        } else {
            m_buttons |= button;
        }
        const QPoint at = position();
        QMouseEvent event(type, at, m_subject.widget->mapTo(m_subject.widget->window(), at),
            m_subject.widget->mapToGlobal(at), button, m_buttons, modifiers());
        m_time += static_cast<ulong>(below(300));
        event.setTimestamp(m_time);
        send(event);
    }

    Qt::KeyboardModifiers modifiers()
    {
        static const Qt::KeyboardModifiers all[]
            = {Qt::NoModifier, Qt::NoModifier, Qt::ShiftModifier, Qt::ControlModifier, Qt::AltModifier};
        return pick(all);
    }

    void wheel()
    {
        static const int steps[] = {120, -120, 15, -15, 0, 100000};
        const QPoint at = position();
        QWheelEvent event(at, m_subject.widget->mapToGlobal(at), QPoint(), QPoint(below(3) == 0 ? 120 : 0, pick(steps)),
            m_buttons, modifiers(), Qt::NoScrollPhase, below(2) == 0);
        send(event);
    }

    void key()
    {
        static const int keys[] = {Qt::Key_Tab, Qt::Key_Backtab, Qt::Key_Return, Qt::Key_Escape, Qt::Key_Space,
            Qt::Key_Left, Qt::Key_Right, Qt::Key_Up, Qt::Key_Down, Qt::Key_Home, Qt::Key_End, Qt::Key_PageUp,
            Qt::Key_PageDown, Qt::Key_Delete, Qt::Key_Backspace, Qt::Key_A, Qt::Key_9, Qt::Key_Menu, Qt::Key_F2};
        const int code = pick(keys);
        const QString text = code < 128 ? QString(QChar(code)) : QString();
        QKeyEvent press(QEvent::KeyPress, code, modifiers(), text, below(4) == 0);
        send(press);
        if (m_subject.alive()) {
            QKeyEvent release(QEvent::KeyRelease, code, Qt::NoModifier, text);
            send(release);
        }
    }

    void touch()
    {
        static QTouchDevice* const device = QTest::createTouchDevice();
        if (m_host->windowHandle() == nullptr || !m_host->isVisible()) {
            return;
        }
        const QPoint at = position();
        QTest::touchEvent(m_subject.widget, device).press(0, at, m_subject.widget);
        if (m_subject.alive() && below(2) == 0) {
            QTest::touchEvent(m_subject.widget, device).move(0, position(), m_subject.widget);
        }
        // The host lives on whatever the subject does, and a finger must not stay down.
        QWidget* const last = m_subject.alive() ? m_subject.widget.data() : m_host.data();
        QTest::touchEvent(last, device).release(0, at, last);
    }

    void resize()
    {
        static const QSize sizes[] = {QSize(0, 0), QSize(1, 1), QSize(20, 20), QSize(200, 150), QSize(7, 300)};
        if (below(4) == 0) {
            m_host->resize(pick(sizes));
        } else {
            m_subject.widget->setGeometry(QRect(QPoint(below(60) - 30, below(60) - 30), pick(sizes)));
        }
    }

    static QPoint near(const QPoint& place)
    {
        return {qBound(-100000, place.x(), 100000), qBound(-100000, place.y(), 100000)};
    }

    QVariant randomValue(int type)
    {
        const QVariantList values = extremeValues(type);
        const QVariant value = values.at(below(values.size()));
        // Huge pictures are the business of the extremes; here they would only be slow.
        if (type == QMetaType::QString) {
            return value.toString().left(20);
        }
        if (type == QMetaType::QSize) {
            return value.toSize().boundedTo(QSize(100, 100));
        }
        // Nor numbers that, as a margin or a place, take a rectangle to where Qt itself cannot count to its far corner.
        if (type == QMetaType::Int) {
            return qBound(-100000, value.toInt(), 100000);
        }
        if (type == QMetaType::QPoint) {
            return near(value.toPoint());
        }
        if (type == QMetaType::QRect) {
            return QRect(near(value.toRect().topLeft()), value.toRect().size().boundedTo(QSize(100, 100)));
        }
        return value;
    }

    void property()
    {
        if (m_properties.isEmpty()) {
            return;
        }
        const QByteArray& name = m_properties.at(below(m_properties.size()));
        const QMetaObject* const meta = m_subject.object->metaObject();
        const QMetaProperty property = meta->property(meta->indexOfProperty(name));
        if (property.isEnumType()) {
            const QMetaEnum values = property.enumerator();
            property.write(m_subject.object, values.value(below(values.keyCount())));
        } else {
            property.write(m_subject.object, randomValue(property.userType()));
        }
    }

    void setter()
    {
        if (m_entry.setters.empty()) {
            return;
        }
        const Setter& setter = m_entry.setters.at(static_cast<std::size_t>(below(static_cast<int>(m_entry.setters.size()))));
        QVariantList arguments;
        for (const int type : setter.types) {
            // Extremes have a suite of their own; here an ordinary value comes half of the time.
            arguments << (below(2) == 0 ? extremeValues(type).first() : randomValue(type));
        }
        setter.call(m_subject.object, arguments);
    }

    void plainEvent()
    {
        static const QEvent::Type types[] = {QEvent::Leave, QEvent::LanguageChange, QEvent::StyleChange,
            QEvent::FontChange, QEvent::PaletteChange, QEvent::WindowActivate, QEvent::WindowDeactivate,
            QEvent::HoverLeave, QEvent::UngrabMouse, QEvent::ApplicationFontChange, QEvent::LocaleChange};
        switch (below(4)) {
        case 0: {
            const QPoint at = position();
            QEnterEvent event(at, m_subject.widget->mapTo(m_subject.widget->window(), at),
                m_subject.widget->mapToGlobal(at));
            send(event);
            break;
        }
        case 1: {
            const QPoint at = position();
            QHelpEvent event(QEvent::ToolTip, at, m_subject.widget->mapToGlobal(at));
            send(event);
            break;
        }
        case 2: {
            QFocusEvent event(below(2) == 0 ? QEvent::FocusIn : QEvent::FocusOut, Qt::OtherFocusReason);
            send(event);
            break;
        }
        default: {
            QEvent event(pick(types));
            send(event);
            break;
        }
        }
    }

    void surroundings()
    {
        static const char* const sheets[] = {"", "* { background: #204060; border: 3px solid white; }",
            "QWidget { color: red; font-size: 30px; }", "*:hover { padding: 12px; }"};
        switch (below(5)) {
        case 0:
            m_subject.widget->setStyleSheet(QLatin1String(pick(sheets)));
            break;
        case 1:
            m_subject.widget->setLayoutDirection(below(2) == 0 ? Qt::LeftToRight : Qt::RightToLeft);
            break;
        case 2:
            m_host->setVisible(below(3) != 0);
            break;
        case 3:
            m_subject.widget->setFocus();
            break;
        default:
            m_subject.widget->setMouseTracking(below(2) == 0);
            break;
        }
    }

    void settle()
    {
        paint(m_subject.widget);
        QCoreApplication::processEvents();
    }

    const Entry& m_entry;
    QRandomGenerator m_random;
    const QList<QByteArray> m_properties;
    QPointer<QWidget> m_host;
    Subject m_subject;
    Qt::MouseButtons m_buttons;
    ulong m_time = 1000;
};
}

QString runMonkey(const Entry& entry, quint32 seed, int events)
{
    // Ends popups and modal windows that a class opens, also within their own event loops.
    QTimer guard;
    QObject::connect(&guard, &QTimer::timeout, &guard, [] {
        if (QWidget* const popup = QApplication::activePopupWidget()) {
            popup->close();
        }
        if (QWidget* const modal = QApplication::activeModalWidget()) {
            modal->close();
        }
    });
    guard.start(20);

    Monkey monkey(entry, seed);
    for (int i = 0; i < events; ++i) {
        if (i % 500 == 499) {
            monkey.fresh();
        }
        monkey.act();
    }
    monkey.end();
    return {};
}
}
