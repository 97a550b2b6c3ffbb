// SPDX-License-Identifier: MIT
// vx::GeometryUtils: angles, clamping, directions and table look-ups.
#include "input/GeometryUtils.h"

#include <QtGui/QStandardItemModel>
#include <QtTest/QtTest>
#include <QtWidgets/QHeaderView>
#include <QtWidgets/QSlider>
#include <QtWidgets/QTableView>
#include <QtWidgets/QVBoxLayout>

#include "InputTools.h"
#include "TestCase.h"
#include "TestMain.h"

using vx::GeometryUtils;

Q_DECLARE_METATYPE(vx::Direction)

class TestGeometryUtils : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theDirectionIsTheNearestOne_data()
    {
        QTest::addColumn<QPoint>("vector");
        QTest::addColumn<vx::Direction>("expected");
        QTest::newRow("null vector") << QPoint(0, 0) << vx::dLeft;
        QTest::newRow("right") << QPoint(5, 0) << vx::dRight;
        QTest::newRow("left") << QPoint(-5, 0) << vx::dLeft;
        QTest::newRow("up") << QPoint(0, -5) << vx::dUp;
        QTest::newRow("down") << QPoint(0, 5) << vx::dDown;
        QTest::newRow("diagonal up right") << QPoint(1, -1) << vx::dUp;
        QTest::newRow("diagonal down right") << QPoint(1, 1) << vx::dDown;
        QTest::newRow("diagonal down left") << QPoint(-1, 1) << vx::dLeft;
        QTest::newRow("diagonal up left") << QPoint(-1, -1) << vx::dLeft;
        QTest::newRow("right of the up diagonal") << QPoint(3, -2) << vx::dRight;
        QTest::newRow("right of the down diagonal") << QPoint(3, 2) << vx::dRight;
        QTest::newRow("below the left diagonal") << QPoint(-2, 3) << vx::dDown;
        QTest::newRow("above the left diagonal") << QPoint(-2, -3) << vx::dUp;
        QTest::newRow("extreme") << QPoint(5, std::numeric_limits<int>::min()) << vx::dUp;
    }
    void theDirectionIsTheNearestOne()
    {
        QFETCH(QPoint, vector);
        QTEST(GeometryUtils::direction(vector), "expected");
    }

    void theDirectionBetweenEventsUsesGlobalPositions()
    {
        // Local positions say left, global ones down.
        const QMouseEvent from(QEvent::MouseMove, QPointF(50, 50), QPointF(50, 50), QPointF(10, 10), Qt::NoButton,
            Qt::NoButton, Qt::NoModifier);
        const QMouseEvent to(QEvent::MouseMove, QPointF(0, 50), QPointF(0, 50), QPointF(10, 90), Qt::NoButton,
            Qt::NoButton, Qt::NoModifier);
        QCOMPARE(GeometryUtils::direction(from, to), vx::dDown);
        QCOMPARE(GeometryUtils::direction(to, from), vx::dUp);
    }

    void directionsAreBits()
    {
        QCOMPARE(int(vx::dLeft), 1);
        QCOMPARE(int(vx::dRight), 2);
        QCOMPARE(int(vx::dUp), 4);
        QCOMPARE(int(vx::dDown), 8);
        QCOMPARE(int(vx::dAny), 255);
        QCOMPARE(int(vx::dLeft | vx::dRight), 3);
        QCOMPARE(int(vx::dAny & vx::dDown), 8);
    }

    void theAngleIsInDegreesClockwiseOnTheScreen()
    {
        QCOMPARE(GeometryUtils::angle(QPoint(1, 0)), 0.0);
        QCOMPARE(GeometryUtils::angle(QPoint(0, 1)), 90.0);
        QCOMPARE(GeometryUtils::angle(QPoint(-1, 0)), 180.0);
        QCOMPARE(GeometryUtils::angle(QPoint(0, -1)), -90.0);
        QCOMPARE(GeometryUtils::angle(QPoint(1, 1)), 45.0);
        QCOMPARE(GeometryUtils::angle(QPoint(0, 0)), 0.0);
    }

    void betweenLooksAtTheLowerBoundFirst()
    {
        QCOMPARE(GeometryUtils::between(4, 5, 10), 5);
        QCOMPARE(GeometryUtils::between(5, 5, 10), 5);
        QCOMPARE(GeometryUtils::between(10, 5, 10), 10);
        QCOMPARE(GeometryUtils::between(11, 5, 10), 10);
        QCOMPARE(GeometryUtils::between(7, 10, 5), 10);
        QCOMPARE(GeometryUtils::between(12, 10, 5), 5);
    }

    void betweenTakesTheRangeOfASlider()
    {
        QSlider slider;
        slider.setRange(-3, 12);
        QCOMPARE(GeometryUtils::between(-4, &slider), -3);
        QCOMPARE(GeometryUtils::between(13, &slider), 12);
        QCOMPARE(GeometryUtils::between(0, &slider), 0);
        QCOMPARE(GeometryUtils::between(99, nullptr), 99);
    }

    void everyLookUpMapsIntoTheViewWithItsHeaders()
    {
        QWidget window;
        window.setGeometry(30, 40, 400, 300);
        auto* layout = new QVBoxLayout(&window);
        layout->setContentsMargins(17, 23, 0, 0);
        QStandardItemModel model(10, 3);
        auto* view = new QTableView(&window);
        view->setModel(&model);
        view->horizontalHeader()->setFixedHeight(30);
        view->verticalHeader()->setFixedWidth(40);
        for (int row = 0; row < 10; ++row) {
            view->setRowHeight(row, 20);
        }
        layout->addWidget(view);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));

        // Coordinates of the view go into a look-up that expects the viewport's: the header shifts the row.
        const QPoint inView(50, 45);
        const QModelIndex expected = view->indexAt(inView);
        QVERIFY(expected.isValid());
        QCOMPARE(expected.row(), 2);
        const QPoint global = view->mapToGlobal(inView);
        QMouseEvent event = inputtest::press(global, 1);
        QEvent other(QEvent::User);

        QCOMPARE(GeometryUtils::indexAtPoint(view, inView), expected);
        QCOMPARE(GeometryUtils::indexAtGlobalPos(view, global), expected);
        QCOMPARE(GeometryUtils::indexAtWindowPos(view, view->mapTo(&window, inView)), expected);
        QCOMPARE(GeometryUtils::indexAtScreenPos(view, global), expected);
        QCOMPARE(GeometryUtils::indexAt(view, &event), expected);
        QCOMPARE(GeometryUtils::indexAt(view, static_cast<QEvent*>(&event)), expected);
        QVERIFY(!GeometryUtils::indexAt(view, &other).isValid());
        QVERIFY(!GeometryUtils::indexAtPoint(view, QPoint(50, 4000)).isValid());
    }

    void aViewThatIsAWindowIsLookedUpOnItsScreen()
    {
        QStandardItemModel model(10, 3);
        QTableView view;
        view.setModel(&model);
        view.setGeometry(60, 70, 300, 300);
        view.show();
        QVERIFY(QTest::qWaitForWindowExposed(&view));
        QVERIFY(GeometryUtils::indexAtScreenPos(&view, view.mapToGlobal(QPoint(5, 5))).isValid());
        QCOMPARE(
            GeometryUtils::indexAtScreenPos(&view, view.mapToGlobal(QPoint(5, 5))), view.indexAt(QPoint(5, 5)));
    }

    void nullViewsAndEventsGiveAnInvalidIndex()
    {
        QTableView neverShown;
        QMouseEvent event = inputtest::press(QPoint(1, 1), 1);
        QVERIFY(!GeometryUtils::indexAt(nullptr, &event).isValid());
        QVERIFY(!GeometryUtils::indexAt(&neverShown, static_cast<QEvent*>(nullptr)).isValid());
        QVERIFY(!GeometryUtils::indexAt(&neverShown, static_cast<QMouseEvent*>(nullptr)).isValid());
        QVERIFY(!GeometryUtils::indexAtGlobalPos(nullptr, QPoint()).isValid());
        QVERIFY(!GeometryUtils::indexAtPoint(nullptr, QPoint()).isValid());
        QVERIFY(!GeometryUtils::indexAtScreenPos(nullptr, QPointF()).isValid());
        QVERIFY(!GeometryUtils::indexAtScreenPos(&neverShown, QPointF()).isValid());
        QVERIFY(!GeometryUtils::indexAtWindowPos(nullptr, QPointF()).isValid());
    }
};

ZELKOV_TEST_MAIN(TestGeometryUtils)
#include "tst_geometryutils.moc"
