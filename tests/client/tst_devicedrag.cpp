// SPDX-License-Identifier: MIT
// Real drags of devices to other places.
#include "client/DeviceList.h"
#include "client/DevicePanel.h"
#include "client/DeviceRow.h"
#include "client/Fleet.h"
#include "client/Session.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QTimer>
#include <QtTest/QtTest>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>

#include <functional>

namespace
{
using client::Camera;
using client::DeviceList;
using client::DevicePanel;
using client::Fleet;
using client::Session;

// A screen of 240 x 320 pixels has room for four rows.
struct Hands
{
    Session session;
    Fleet fleet;
    QWidget window;
    DevicePanel* panel;
    DeviceList* list;

    Hands()
    {
        session.logIn(QStringLiteral("admin"), QStringLiteral("camera2!"));
        while (fleet.cameras().size() > 12) {
            fleet.remove(fleet.cameras().last().id);
        }
        window.resize(240, 310);
        panel = new DevicePanel(fleet, session, &window);
        panel->setGeometry(window.rect());
        list = panel->findChild<DeviceList*>(QStringLiteral("deviceList"));
        window.show();
        panel->findChild<QPushButton*>(QStringLiteral("deviceEditButton"))->click();
        QCoreApplication::processEvents();
        QTest::qWait(50);
    }

    QPoint at(int row, double part) const
    {
        const QRect rect = list->visualItemRect(list->item(row));
        const QPoint inView(200, rect.top() + static_cast<int>(part * (rect.height() - 1)));
        return list->viewport()->mapTo(&window, inView);
    }

    QVector<int> order() const
    {
        QVector<int> ids;
        for (int i = 0; i < list->count(); ++i) {
            ids << (list->deviceAt(i) && list->itemWidget(list->item(i)) ? list->deviceAt(i)->id() : -1);
        }
        return ids;
    }

    QVector<int> fleetOrder() const
    {
        QVector<int> ids;
        for (const Camera& camera : fleet.cameras()) {
            ids << camera.id;
        }
        return ids;
    }

    using Steps = QVector<std::function<void()>>;

    void send(const QPoint& p, Qt::MouseButtons buttons, Qt::MouseButton button, QEvent::Type type)
    {
        m_time += 20;
        qt_handleMouseEvent(
            window.windowHandle(), p, window.mapToGlobal(p), buttons, button, type, Qt::NoModifier, m_time);
    }

    void drag(const QPoint& from, const QPoint& to, const std::function<void()>& above = {}, int hold = 0,
        const std::function<void()>& later = {})
    {
        Steps steps;
        steps << [=] { send(from + QPoint(0, 12), Qt::LeftButton, Qt::NoButton, QEvent::MouseMove); };
        steps << [=] { send((from + to) / 2, Qt::LeftButton, Qt::NoButton, QEvent::MouseMove); };
        steps << [=] { send(to, Qt::LeftButton, Qt::NoButton, QEvent::MouseMove); };
        if (above) {
            steps << above;
            steps << later;
        }
        steps << [=] { send(to - QPoint(1, 0), Qt::LeftButton, Qt::NoButton, QEvent::MouseMove); };
        steps << [=] { send(to - QPoint(1, 0), Qt::NoButton, Qt::LeftButton, QEvent::MouseButtonRelease); };
        // The drag runs a loop of its own: each step is planned before the one before it is taken.
        bool done = false;
        int next = 0;
        std::function<void()> step = [&] {
            if (next == steps.size()) {
                done = true;
                return;
            }
            QTimer::singleShot(next == 2 ? hold : next == 3 ? 30 : 0, &window, [&step] { step(); });
            const int now = next++;
            if (steps.at(now)) {
                steps.at(now)();
            }
            QCoreApplication::processEvents();
        };
        send(from, Qt::NoButton, Qt::NoButton, QEvent::MouseMove);
        send(from, Qt::LeftButton, Qt::LeftButton, QEvent::MouseButtonPress);
        QTimer::singleShot(0, &window, [&step] { step(); });
        QTRY_VERIFY_WITH_TIMEOUT(done, 5000);
        QTest::qWait(20);
    }

private:
    int m_time = 100000;
};
}

class TestDeviceDrag : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aDragReordersTheFleet_data()
    {
        QTest::addColumn<int>("from");
        QTest::addColumn<int>("to");
        QTest::addColumn<double>("part");
        QTest::addColumn<QVector<int>>("order");
        QTest::newRow("down") << 0 << 2 << 0.95 << QVector<int>{1, 2, 0, 3};
        QTest::newRow("up") << 3 << 1 << 0.05 << QVector<int>{0, 3, 1, 2};
        QTest::newRow("to the top") << 2 << 0 << 0.05 << QVector<int>{2, 0, 1, 3};
    }
    void aDragReordersTheFleet()
    {
        QFETCH(int, from);
        QFETCH(int, to);
        QFETCH(double, part);
        QFETCH(QVector<int>, order);
        Hands hands;
        QSignalSpy changed(&hands.fleet, &Fleet::orderChanged);
        hands.drag(hands.at(from, 0.5), hands.at(to, part));
        QCOMPARE(changed.count(), 1);
        QCOMPARE(hands.fleetOrder().mid(0, 4), order);
        QCOMPARE(hands.order(), hands.fleetOrder());
        QVERIFY(!hands.list->isDragging());
    }

    void withASearchNothingMoves()
    {
        Hands hands;
        hands.panel->findChild<QLineEdit*>(QStringLiteral("deviceSearch"))->setText(QStringLiteral("192"));
        QSignalSpy changed(&hands.fleet, &Fleet::orderChanged);
        hands.drag(hands.at(0, 0.5), hands.at(2, 0.95));
        QCOMPARE(changed.count(), 0);
        QCOMPARE(hands.order(), hands.fleetOrder());
    }

    void outsideTheEditModeNothingMoves()
    {
        Hands hands;
        hands.panel->findChild<QPushButton*>(QStringLiteral("deviceEditButton"))->click();
        QSignalSpy changed(&hands.fleet, &Fleet::orderChanged);
        hands.drag(hands.at(0, 0.5), hands.at(2, 0.95));
        QCOMPARE(changed.count(), 0);
        QCOMPARE(hands.order(), hands.fleetOrder());
    }

    void theFleetChangesDuringADrag()
    {
        Hands hands;
        const QVector<int> before = hands.order();
        QVector<int> during;
        hands.drag(hands.at(0, 0.5), hands.at(2, 0.95), [&] {
            hands.fleet.remove(1);
            hands.fleet.move(5, 1);
            hands.fleet.rename(3, QStringLiteral("Harbour"));
        }, 0, [&] { during = hands.order(); });
        QCOMPARE(during, before); // a row under the pointer does not go
        QTRY_COMPARE(hands.order(), hands.fleetOrder());
        QCOMPARE(hands.order().size(), 11);
    }

    void theDraggedDeviceGoesDuringItsDrag()
    {
        Hands hands;
        hands.drag(hands.at(0, 0.5), hands.at(2, 0.95), [&] { hands.fleet.remove(0); });
        QTRY_COMPARE(hands.order(), hands.fleetOrder());
        QCOMPARE(hands.order().size(), 11);
    }

    void theRightGoesDuringADrag()
    {
        Hands hands;
        const QVector<int> before = hands.fleetOrder();
        hands.drag(
            hands.at(0, 0.5), hands.at(2, 0.95), [&] { hands.session.setRole(Session::Role::User); });
        QCOMPARE(hands.fleetOrder(), before);
        QTRY_COMPARE(hands.order(), before);
    }

    void aDragAtTheEdgeScrolls()
    {
        Hands hands;
        auto* const area = hands.panel->findChild<QScrollArea*>(QStringLiteral("deviceArea"));
        const QPoint edge = area->mapTo(&hands.window, QPoint(180, area->height() - 12));
        int scrolled = 0;
        hands.drag(hands.at(0, 0.5), edge, [&] { scrolled = area->verticalScrollBar()->value(); }, 400);
        QVERIFY(scrolled > 0);
        QTRY_COMPARE(hands.order(), hands.fleetOrder());
        QVERIFY(hands.order().indexOf(0) > 3);
    }
};

ZELKOV_TEST_MAIN(TestDeviceDrag)
#include "tst_devicedrag.moc"
