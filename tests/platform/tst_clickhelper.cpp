// SPDX-License-Identifier: MIT
// Clicks and double clicks out of real mouse events.
#include "Pointer.h"
#include "SignalRecorder.h"
#include "TestCase.h"
#include "TestMain.h"
#include "ZelkovUtils/ClickHelper.h"

#include <QtTest/QtTest>
#include <QtWidgets/QApplication>

#include <memory>

using vx::ClickHelper;
using zelkovtest::Pointer;
using zelkovtest::SignalRecorder;

namespace
{
const QPoint c_Place(60, 50);

// A window with a watched child; the child stands away from the window's corner.
struct Stage
{
    explicit Stage(int features = ClickHelper::efClick | ClickHelper::efDoubleClick)
        : receiver(new QWidget(&window))
        , helper(new ClickHelper(receiver, features))
        , recorder(helper)
    {
        window.resize(300, 200);
        receiver->setGeometry(20, 10, 200, 150);
        helper->setReceiver(receiver);
        helper->setActive(true);
        window.show();
    }

    QWidget window;
    QWidget* receiver;
    ClickHelper* helper;
    SignalRecorder recorder;
};

QStringList names(const char* text)
{
    return QString::fromLatin1(text).split(QLatin1Char(' '), Qt::SkipEmptyParts);
}
}

class TestClickHelper : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void itStartsInactiveAndWithoutReceiver()
    {
        QWidget parent;
        const ClickHelper helper(&parent, 3);
        QCOMPARE(helper.features(), 3);
        QVERIFY(!helper.isActive());
        QVERIFY(helper.receiver() == nullptr);
        QCOMPARE(helper.parent(), static_cast<QObject*>(&parent));
    }

    void aClickIsReportedAtTheReleaseWithItsPosition()
    {
        Stage stage;
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        Pointer pointer(stage.receiver);
        pointer.move(c_Place);
        pointer.press();
        QCOMPARE(stage.recorder.names(), QStringList());
        pointer.release();
        QCOMPARE(stage.recorder.names(), names("clicked"));
        QCOMPARE(stage.recorder.entries().at(0).arguments.at(0).toPointF(), QPointF(c_Place));
    }

    void theDragDistanceIsTheLimit_data()
    {
        QTest::addColumn<QPoint>("way");
        QTest::addColumn<bool>("click");
        const int limit = QApplication::startDragDistance();
        QTest::newRow("just under") << QPoint(limit - 1, 0) << true;
        QTest::newRow("just there") << QPoint(limit, 0) << false;
        QTest::newRow("sum just under") << QPoint(-(limit - 2), 1) << true;
        QTest::newRow("sum just there") << QPoint(1, -(limit - 1)) << false;
    }
    void theDragDistanceIsTheLimit()
    {
        QFETCH(QPoint, way);
        QFETCH(bool, click);
        Stage stage;
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        Pointer pointer(stage.receiver);
        pointer.move(c_Place);
        pointer.press();
        pointer.move(c_Place + way);
        pointer.release();
        QCOMPARE(stage.recorder.names(), click ? names("clicked") : QStringList());
    }

    void aWidgetThatIsDraggedAlongIsNotClicked()
    {
        Stage stage;
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        Pointer pointer(&stage.window);
        pointer.move(QPoint(80, 60));
        pointer.press();
        pointer.move(QPoint(110, 60));
        stage.receiver->move(stage.receiver->pos() + QPoint(30, 0));
        pointer.release();
        QCOMPARE(stage.recorder.names(), QStringList());
    }

    void aDoubleClickFollowsOneClickAndAddsNoSecondOne()
    {
        Stage stage;
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        Pointer pointer(stage.receiver);
        pointer.click(c_Place);
        pointer.press();
        QCOMPARE(stage.recorder.names(), names("clicked doubleClicked"));
        pointer.release();
        QCOMPARE(stage.recorder.names(), names("clicked doubleClicked"));
        QCOMPARE(stage.recorder.entries().at(1).arguments.at(0).toPointF(), QPointF(c_Place));
    }

    void slowClicksAreTwoClicks()
    {
        Stage stage;
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        Pointer pointer(stage.receiver);
        pointer.click(c_Place);
        pointer.wait(QApplication::doubleClickInterval() + 50);
        pointer.click(c_Place);
        QCOMPARE(stage.recorder.names(), names("clicked clicked"));
    }

    void theFeaturesChooseWhatIsReported_data()
    {
        QTest::addColumn<int>("features");
        QTest::addColumn<QStringList>("expected");
        QTest::newRow("none") << 0 << QStringList();
        QTest::newRow("click") << 1 << names("clicked clicked");
        QTest::newRow("double click") << 2 << names("doubleClicked");
        QTest::newRow("both") << 3 << names("clicked doubleClicked");
    }
    void theFeaturesChooseWhatIsReported()
    {
        QFETCH(int, features);
        QFETCH(QStringList, expected);
        Stage stage(features);
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        Pointer pointer(stage.receiver);
        pointer.click(c_Place);
        pointer.click(c_Place);
        QCOMPARE(stage.recorder.names(), expected);
    }

    void otherButtonsAreNotReported()
    {
        Stage stage;
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        Pointer pointer(stage.receiver);
        pointer.click(c_Place, Qt::RightButton);
        pointer.click(c_Place, Qt::MiddleButton);
        QCOMPARE(stage.recorder.names(), QStringList());
    }

    void whileInactiveNothingIsReported()
    {
        Stage stage;
        stage.helper->setActive(false);
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        Pointer pointer(stage.receiver);
        pointer.click(c_Place);
        QCOMPARE(stage.recorder.names(), QStringList());
        stage.helper->setActive(true);
        pointer.wait(1000);
        pointer.click(c_Place);
        QCOMPARE(stage.recorder.names(), names("clicked"));
    }

    void switchingOffForgetsThePress()
    {
        Stage stage;
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        Pointer pointer(stage.receiver);
        pointer.move(c_Place);
        pointer.press();
        stage.helper->setActive(false);
        stage.helper->setActive(true);
        pointer.release();
        QCOMPARE(stage.recorder.names(), QStringList());
    }

    void hidingForgetsThePress()
    {
        Stage stage;
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        Pointer pointer(stage.receiver);
        pointer.move(c_Place);
        pointer.press();
        stage.receiver->hide();
        stage.receiver->show();
        pointer.release();
        QCOMPARE(stage.recorder.names(), QStringList());
    }

    void onlyTheLastReceiverIsWatched()
    {
        Stage stage;
        auto* const other = new QWidget(&stage.window);
        other->setGeometry(230, 10, 60, 60);
        other->show();
        stage.helper->setReceiver(other);
        QCOMPARE(stage.helper->receiver(), other);
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        Pointer pointer(stage.receiver);
        pointer.click(c_Place);
        QCOMPARE(stage.recorder.names(), QStringList());
        pointer.click(other->pos() - stage.receiver->pos() + QPoint(5, 6));
        QCOMPARE(stage.recorder.names(), names("clicked"));
        QCOMPARE(stage.recorder.entries().at(0).arguments.at(0).toPointF(), QPointF(5, 6));
        stage.helper->setReceiver(nullptr);
        pointer.wait(1000);
        pointer.click(c_Place);
        QCOMPARE(stage.recorder.names(), names("clicked"));
    }

    void theReceiverGetsItsEvents()
    {
        class Counter : public QWidget
        {
        public:
            using QWidget::QWidget;
            int events = 0;

        protected:
            void mousePressEvent(QMouseEvent*) override { ++events; }
            void mouseReleaseEvent(QMouseEvent*) override { ++events; }
            void mouseDoubleClickEvent(QMouseEvent*) override { ++events; }
        };
        Stage stage;
        auto* const counter = new Counter(stage.receiver);
        counter->setGeometry(0, 0, 100, 100);
        counter->show();
        stage.helper->setReceiver(counter);
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        Pointer pointer(counter);
        pointer.click(QPoint(9, 9));
        pointer.click(QPoint(9, 9));
        QCOMPARE(counter->events, 4);
        QCOMPARE(stage.recorder.names(), names("clicked doubleClicked"));
    }

    void aDeadReceiverIsForgotten()
    {
        QWidget parent;
        ClickHelper helper(&parent, 3);
        auto receiver = std::make_unique<QWidget>();
        helper.setReceiver(receiver.get());
        receiver.reset();
        QVERIFY(helper.receiver() == nullptr);
        helper.setReceiver(nullptr);
        helper.setActive(true);
    }

    void aSlotMayDeleteTheReceiver_data()
    {
        QTest::addColumn<bool>("byDoubleClick");
        QTest::newRow("click") << false;
        QTest::newRow("double click") << true;
    }
    void aSlotMayDeleteTheReceiver()
    {
        QFETCH(bool, byDoubleClick);
        Stage stage(byDoubleClick ? ClickHelper::efDoubleClick : ClickHelper::efClick);
        QVERIFY(QTest::qWaitForWindowExposed(&stage.window));
        QPointer<QWidget> receiver = stage.receiver;
        const auto destroy = [receiver] { delete receiver.data(); };
        connect(stage.helper, &ClickHelper::clicked, this, destroy);
        connect(stage.helper, &ClickHelper::doubleClicked, this, destroy);
        Pointer pointer(&stage.window);
        pointer.click(QPoint(80, 60));
        QCOMPARE(receiver.isNull(), !byDoubleClick);
        if (byDoubleClick) {
            pointer.click(QPoint(80, 60));
            QVERIFY(receiver.isNull());
        }
    }
};

ZELKOV_TEST_MAIN(TestClickHelper)
#include "tst_clickhelper.moc"
