// SPDX-License-Identifier: MIT
// What the tests of the slider with several handles share: a window with a slider of 220 pixels, whose handles of
// 20 pixels have a way of 200, and a journal of its signals and of the slots that handles call.
#pragma once

#include "CoreQt/QtSlot.h"
#include "sliders/MultiNubsieSlider.h"
#include "support/Pointer.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QTimer>
#include <QtCore/QTimerEvent>
#include <QtGui/QPixmap>
#include <QtTest/QtTest>

#include <functional>

namespace timelinetest
{
/// Writes down every signal of a slider and every slot that one of its handles calls, in order.
class Journal : public QObject
{
    Q_OBJECT

public:
    QStringList lines;
    /// Called with each line, after it is written.
    std::function<void(const QString&)> action;

    void follow(vx::MultiNubsieSlider* slider)
    {
        using Slider = vx::MultiNubsieSlider;
        connect(slider, static_cast<void (Slider::*)(vx::NubsieID, int)>(&Slider::nubsieValueChanged), this,
            [this](int id, int value) { note(QStringLiteral("value %1 %2").arg(id).arg(value)); });
        connect(slider, &Slider::nubsieValueChangedByUser, this,
            [this](int id, int value) { note(QStringLiteral("changed %1 %2").arg(id).arg(value)); });
        connect(slider, &Slider::nubsieDragStarted, this,
            [this](int id) { note(QStringLiteral("started %1").arg(id)); });
        connect(
            slider, &Slider::nubsieDragEnded, this, [this](int id) { note(QStringLiteral("ended %1").arg(id)); });
        connect(slider, &Slider::triggerNubsieRepaintQueued, this, [this](bool animate) {
            note(animate ? QStringLiteral("queued animated") : QStringLiteral("queued"));
        });
        connect(slider, &Slider::firstFlagClicked, this, [this] { note(QStringLiteral("first clicked")); });
        connect(slider, &Slider::secondFlagClicked, this, [this] { note(QStringLiteral("second clicked")); });
        connect(slider, &Slider::firstFlagLongClicked, this, [this] { note(QStringLiteral("first long")); });
        connect(slider, &Slider::secondFlagLongClicked, this, [this] { note(QStringLiteral("second long")); });
        connect(slider, &Slider::firstFlagRightClicked, this, [this] { note(QStringLiteral("first right")); });
        connect(slider, &Slider::secondFlagRightClicked, this, [this] { note(QStringLiteral("second right")); });
        connect(slider, &Slider::firstFlagDoubleClicked, this, [this] { note(QStringLiteral("first double")); });
        connect(slider, &Slider::secondFlagDoubleClicked, this, [this] { note(QStringLiteral("second double")); });
    }

    /// Every slot of the handle.
    void listen(vx::MultiNubsieSlider* slider, int id)
    {
        slider->setPressSlot(id, slot("press"));
        slider->setDragSlot(id, slot("drag"));
        slider->setReleaseSlot(id, slot("release"));
        slider->setClickSlot(id, slot("click"));
        slider->setDoubleClickSlot(id, slot("doubleClick"));
        slider->setLongPressSlot(id, slot("longClick"));
    }

    vx::QtSlot slot(const char* name) const { return vx::QtSlot(this, name, Qt::DirectConnection); }

public Q_SLOTS:
    void press(int value) { note(QStringLiteral("press %1").arg(value)); }
    void drag(int value) { note(QStringLiteral("drag %1").arg(value)); }
    void release(int value, QPoint at)
    {
        note(QStringLiteral("release %1 at %2,%3").arg(value).arg(at.x()).arg(at.y()));
    }
    void click(int value) { note(QStringLiteral("click %1").arg(value)); }
    void doubleClick(int value) { note(QStringLiteral("doubleClick %1").arg(value)); }
    void longClick(int value) { note(QStringLiteral("longClick %1").arg(value)); }

private:
    void note(const QString& line)
    {
        lines << line;
        if (action) {
            action(line);
        }
    }
};

inline QStringList list(std::initializer_list<const char*> words)
{
    QStringList result;
    for (const char* word : words) {
        result << QString::fromLatin1(word);
    }
    return result;
}

inline QPixmap disc(const QColor& color = Qt::red)
{
    QPixmap result(40, 40);
    result.fill(color);
    return result;
}

/// The slider stands at (100, 230) in a window of 600 by 500: the pointer can go 270 pixels sideways. Horizontal,
/// it is 220 by 40; a handle with display value d has its middle at (9 + 200 d, 17.5) for hits, one pixel to the
/// upper left of where it is seen.
class Scene
{
public:
    explicit Scene(Qt::Orientation orientation = Qt::Horizontal, QWidget* handleWindow = nullptr)
        : slider(new vx::MultiNubsieSlider(&host, handleWindow != nullptr ? handleWindow : &host))
    {
        host.resize(600, 500);
        slider->setOrientation(orientation);
        slider->setGeometry(
            100, 230, orientation == Qt::Horizontal ? 220 : 40, orientation == Qt::Horizontal ? 40 : 220);
        journal.follow(slider);
    }

    vx::Nubsie* add(int id, int value, int minimum = 0, int maximum = 200)
    {
        slider->addNubsie(QStringLiteral("handle%1").arg(id), value, minimum, maximum, id);
        vx::Nubsie* const nubsie = slider->nubsie(id);
        nubsie->setSize(QSize(20, 20));
        nubsie->setDraggedSize(QSize(30, 30));
        nubsie->setIcon(disc());
        return nubsie;
    }

    void show()
    {
        host.show();
        QVERIFY(QTest::qWaitForWindowExposed(&host));
        QCoreApplication::processEvents();
        journal.lines.clear();
    }

    QTimer* timer(int interval) const
    {
        const QList<QTimer*> timers = slider->findChildren<QTimer*>();
        for (QTimer* timer : timers) {
            if (timer->interval() == interval) {
                return timer;
            }
        }
        return nullptr;
    }
    QTimer* longClickTimer() const { return timer(1500); }
    QTimer* flagTimer() const { return timer(1000); }

    /// Lets the timer run out now.
    static void fire(QTimer* timer)
    {
        QVERIFY(timer != nullptr && timer->isActive());
        QTimerEvent event(timer->timerId());
        QCoreApplication::sendEvent(timer, &event);
    }

    double drawn(int id) const { return slider->nubsie(id)->getDisplayValue(); }

    QWidget host;
    vx::MultiNubsieSlider* slider;
    Journal journal;
};
}
