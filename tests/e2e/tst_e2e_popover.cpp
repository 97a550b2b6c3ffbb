// SPDX-License-Identifier: MIT
// Popovers on a real server, with a window manager, a real pointer and real keys.
#include <QtCore/QElapsedTimer>
#include <QtCore/QMimeData>
#include <QtCore/QProcess>
#include <QtGui/QDragEnterEvent>
#include <QtGui/QDropEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QLineEdit>

#include "../popover/PopoverScene.h"
#include "popover/Manager.h"
#include "TestCase.h"
#include "TestMain.h"

using vx::PopoverWidget::Manager;
using zelkovtest::Balloon;
using zelkovtest::Controller;
using zelkovtest::Item;
using zelkovtest::SignalRecorder;
using zelkovtest::TestContainer;
using zelkovtest::TestController;
using zelkovtest::TestRow;

namespace
{
// A row that takes what is dragged onto it.
class DropRow : public TestRow
{
public:
    explicit DropRow(int id)
        : TestRow(id)
    {
        setAcceptDrops(true);
    }
    QList<QByteArray> taken;

protected:
    void dragEnterEvent(QDragEnterEvent* event) override { event->acceptProposedAction(); }
    void dropEvent(QDropEvent* event) override
    {
        event->acceptProposedAction();
        taken << event->mimeData()->data(Item::sPopoverWidgetItem);
    }
};

struct Window
{
    explicit Window(const QPoint& position)
        : window(new QWidget)
        , target(new QPushButton(window.data()))
    {
        window->setGeometry(QRect(position, QSize(500, 400)));
        target->setGeometry(200, 20, 60, 24);
        window->show();
    }
    ~Window() { delete window.data(); }

    TestController* open(TestRow* row, int id, QWidget* at)
    {
        TestController* const controller = new TestController(window, at, Balloon::eadTop, QSizeF(140, 80));
        controller->fader()->setFadingTimes(40, 40);
        Manager::instance()->addController(id, controller);
        TestContainer* const container = new TestContainer;
        container->addItem(row);
        controller->setContainer(container, QFlags<Balloon::EBalloonFeature>(QFlag(8)));
        controller->setActive();
        return controller;
    }

    QPointer<QWidget> window;
    QPushButton* target;
};
}

class TestE2ePopover : public zelkovtest::TestCase
{
    Q_OBJECT

    // Runs xdotool while the program goes on.
    static void pointer(const QStringList& arguments)
    {
        QProcess tool;
        tool.start(QStringLiteral("xdotool"), arguments);
        QTRY_VERIFY_WITH_TIMEOUT(tool.state() == QProcess::NotRunning, 20000);
        QCOMPARE(tool.exitCode(), 0);
    }

    static QStringList words(const char* text) { return QString::fromLatin1(text).split(QLatin1Char(' ')); }

    static QStringList to(const QWidget* widget, const QPoint& position)
    {
        const QPoint global = widget->mapToGlobal(position);
        return {QStringLiteral("mousemove"), QString::number(global.x()), QString::number(global.y()),
            QStringLiteral("sleep"), QStringLiteral("0.05")};
    }

    // A drag from one point to another, with stops on the way for the other side to answer.
    static void drag(const QPoint& from, const QPoint& onto)
    {
        QStringList steps {QStringLiteral("mousemove"), QString::number(from.x()), QString::number(from.y())};
        steps << words("sleep 0.1 mousedown 1 sleep 0.1");
        for (int i = 1; i <= 12; ++i) {
            const QPoint point = from + (onto - from) * i / 12;
            steps << words("mousemove") << QString::number(point.x()) << QString::number(point.y())
                  << words("sleep 0.04");
        }
        pointer(steps + words("sleep 0.2 mouseup 1 sleep 0.2"));
    }

    static void waitUntilSettled(const Window& window)
    {
        QVERIFY(QTest::qWaitForWindowExposed(window.window));
        // The window manager moves the window once more after it is shown.
        QPoint last;
        QElapsedTimer unchanged;
        unchanged.start();
        QVERIFY(QTest::qWaitFor(
            [&] {
                const QPoint now = window.window->mapToGlobal(QPoint());
                if (now != last) {
                    last = now;
                    unchanged.restart();
                }
                return unchanged.elapsed() > 300;
            },
            10000));
    }

private Q_SLOTS:
    void init()
    {
        TestCase::init();
        Manager::init(100);
    }
    void cleanup()
    {
        Manager::deleteInstance();
        TestCase::cleanup();
    }

    void aClickBesideTheBalloonCloses()
    {
        Window scene(QPoint(100, 100));
        waitUntilSettled(scene);
        const QPointer<TestController> controller = scene.open(new TestRow(1), 1, scene.target);
        SignalRecorder recorder(controller);
        pointer(to(controller, controller->balloon()->geometry().center()) + words("click 1 sleep 0.05"));
        QVERIFY(controller->isActive());
        QCOMPARE(recorder.count(QStringLiteral("balloonClosed")), 0);
        // Pressed inside and released outside is no click outside.
        pointer(to(controller, controller->balloon()->geometry().center()) + words("mousedown 1 sleep 0.05")
            + to(controller, QPoint(20, 380)) + words("mouseup 1 sleep 0.05"));
        QVERIFY(controller->isActive());
        pointer(to(controller, QPoint(20, 380)) + words("click 1"));
        QTRY_VERIFY(controller == nullptr);
    }

    void escapeCloses()
    {
        Window scene(QPoint(100, 100));
        waitUntilSettled(scene);
        scene.window->activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(scene.window));
        const QPointer<TestController> controller = scene.open(new TestRow(1), 1, scene.target);
        pointer(words("key Escape"));
        QTRY_VERIFY(controller == nullptr);
    }

    void returnAccepts()
    {
        Window scene(QPoint(100, 100));
        waitUntilSettled(scene);
        scene.window->activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(scene.window));
        TestController* const controller = scene.open(new TestRow(1), 1, scene.target);
        SignalRecorder recorder(controller);
        pointer(words("key Return"));
        QTRY_COMPARE(recorder.count(QStringLiteral("shouldAccept")), 1);
        QVERIFY(controller->isActive());
    }

    void aPopoverInAnotherWindowDoesNotTakeTheKeys()
    {
        Window behind(QPoint(60, 60));
        waitUntilSettled(behind);
        Window scene(QPoint(600, 300));
        QLineEdit* const edit = new QLineEdit(scene.window);
        edit->setGeometry(20, 60, 200, 30);
        edit->show();
        waitUntilSettled(scene);
        scene.window->activateWindow();
        edit->setFocus();
        QVERIFY(QTest::qWaitForWindowActive(scene.window));
        for (const int flags : {5, 1, 6}) {
            TestController* const controller = behind.open(new TestRow(1), 1, behind.target);
            controller->setActive(false, zelkovtest::showFlags(0), false);
            controller->setActive(true, zelkovtest::showFlags(flags));
            QTRY_VERIFY(controller->isVisible());
        }
        edit->clear();
        pointer(words("type --delay 30 abc"));
        QTRY_COMPARE(edit->text(), QStringLiteral("abc"));
        QCOMPARE(QApplication::activeWindow(), scene.window.data());
        QVERIFY(edit->hasFocus());
    }

    void anItemIsDroppedOnItsPopover()
    {
        Window scene(QPoint(100, 100));
        waitUntilSettled(scene);
        TestRow* const row = new TestRow(7);
        row->setDragEnabled(true);
        row->setUserData(QByteArray("camera"));
        TestController* const controller = scene.open(row, 1, scene.target);
        QTRY_VERIFY(row->isVisible());
        QList<QByteArray> ids;
        QList<QByteArray> texts;
        QPoint where;
        Item* dropped = nullptr;
        int started = 0;
        connect(row, &Item::itemDragStarted, this, [&] { ++started; });
        connect(controller, &Controller::itemDropped, this,
            [&](Item* item, QDropEvent* event, const QPoint& position) {
                dropped = item;
                ids << event->mimeData()->data(Item::sPopoverWidgetItem);
                texts << event->mimeData()->data(QStringLiteral("text/plain"));
                where = position;
            });
        const QPoint onto = controller->mapToGlobal(QPoint(60, 340));
        drag(row->mapToGlobal(row->rect().center()), onto);
        QTRY_COMPARE(ids, QList<QByteArray>({"7"}));
        QCOMPARE(texts, QList<QByteArray>({"camera"}));
        QCOMPARE(started, 1);
        QCOMPARE(dropped, static_cast<Item*>(row));
        QCOMPARE(where, onto);
        QVERIFY2(controller->isActive(), "a drop outside is no click outside");
    }

    void aBalloonThatIsLiftedTakesTheDrop()
    {
        Window scene(QPoint(100, 100));
        waitUntilSettled(scene);
        QPushButton* const second = new QPushButton(scene.window);
        second->setGeometry(380, 200, 60, 24);
        second->show();
        DropRow* const sink = new DropRow(2);
        TestController* const below = scene.open(sink, 2, second);
        TestRow* const row = new TestRow(7);
        row->setDragEnabled(true);
        TestController* const above = scene.open(row, 1, scene.target);
        SignalRecorder recorder(above);
        Manager* const manager = Manager::instance();
        manager->registerAcceptedDropMimeType(2, QStringLiteral("text/plain"));
        connect(row, &Item::itemDragStarted, this,
            [&] { manager->raiseControllersForMimeType(QStringLiteral("text/plain")); });
        const QPoint from = row->mapToGlobal(row->rect().center());
        const QPoint onto = sink->mapToGlobal(sink->rect().center());
        drag(from, onto);
        QTRY_COMPARE(sink->taken, QList<QByteArray>({"7"}));
        QCOMPARE(recorder.count(QStringLiteral("itemDropped")), 0);
        QCOMPARE(below->balloon()->parentWidget(), scene.window.data());
        manager->restoreControllersForMimeType(QStringLiteral("text/plain"));
        QCOMPARE(below->balloon()->parentWidget(), static_cast<QWidget*>(below));
        // Back under the other overlay, which gets the next drop.
        disconnect(row, &Item::itemDragStarted, this, nullptr);
        drag(from, onto);
        QTRY_COMPARE(recorder.count(QStringLiteral("itemDropped")), 1);
        QCOMPARE(sink->taken.size(), 1);
    }
};

ZELKOV_TEST_MAIN(TestE2ePopover)
#include "tst_e2e_popover.moc"
