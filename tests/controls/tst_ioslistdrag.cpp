// SPDX-License-Identifier: MIT
// Real drags of the rows of the phone-style list.
#include "controls/iOSListWidget.h"
#include "controls/iOSListWidgetItem.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QMimeData>
#include <QtCore/QTimer>
#include <QtGui/QDropEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QLabel>

#include <functional>

namespace
{
using List = vx::iOSListWidget;
using Row = vx::iOSListWidgetItem;

class Target : public QWidget
{
public:
    explicit Target(QWidget* parent)
        : QWidget(parent)
    {
        setAcceptDrops(true);
    }
    QByteArray m_received;

protected:
    void dragEnterEvent(QDragEnterEvent* event) override { event->acceptProposedAction(); }
    void dropEvent(QDropEvent* event) override
    {
        m_received = event->mimeData()->data(QStringLiteral("camera/id"));
        event->acceptProposedAction();
    }
};

struct Phone
{
    QWidget window;
    List* list;
    Target* target;
    QVector<Row*> rows;

    Phone()
    {
        window.resize(230, 300);
        list = new List(&window, QStringLiteral("devices"));
        list->setGeometry(0, 0, 160, 250);
        target = new Target(&window);
        target->setGeometry(165, 0, 60, 100);
        for (int i = 0; i < 5; ++i) {
            auto* const row = new Row(list, new QLabel(QString::number(i)), QStringLiteral("row"), QSize(60, 30),
                nullptr, nullptr, nullptr);
            row->setData(Qt::UserRole, 10 + i);
            rows.append(row);
        }
        window.show();
        list->resize(160, 250);
        QCoreApplication::processEvents();
    }

    // In the window's coordinates; part is 0 at the top of the row and 1 at its bottom.
    QPoint at(int row, double part) const
    {
        const QRect rect = list->visualItemRect(list->item(row));
        const QPoint inView(60, rect.top() + static_cast<int>(part * (rect.height() - 1)));
        return list->viewport()->mapTo(&window, inView);
    }

    QStringList order() const
    {
        QStringList texts;
        for (int i = 0; i < list->count(); ++i) {
            const Row* const row = list->getIOSItem(i);
            const auto* const label = row ? qobject_cast<QLabel*>(row->itemWidget()) : nullptr;
            texts << (label && label->isVisible() ? label->text() : QStringLiteral("lost"));
        }
        return texts;
    }

    void drag(const QPoint& from, const QPoint& to)
    {
        QWindow* const handle = window.windowHandle();
        int time = 100000;
        const auto send = [this, handle, &time](const QPoint& p, Qt::MouseButtons buttons, Qt::MouseButton button,
                              QEvent::Type type) {
            time += 20;
            qt_handleMouseEvent(handle, p, window.mapToGlobal(p), buttons, button, type, Qt::NoModifier, time);
        };
        // The drag runs a loop of its own: each step is planned before the one before it is taken.
        QVector<std::function<void()>> steps;
        steps << [=] { send(from + QPoint(0, 12), Qt::LeftButton, Qt::NoButton, QEvent::MouseMove); };
        steps << [=] { send((from + to) / 2, Qt::LeftButton, Qt::NoButton, QEvent::MouseMove); };
        steps << [=] { send(to, Qt::LeftButton, Qt::NoButton, QEvent::MouseMove); };
        steps << [=] { send(to + QPoint(1, 0), Qt::LeftButton, Qt::NoButton, QEvent::MouseMove); };
        steps << [=] { send(to + QPoint(1, 0), Qt::NoButton, Qt::LeftButton, QEvent::MouseButtonRelease); };
        bool done = false;
        int next = 0;
        std::function<void()> step = [&] {
            if (next == steps.size()) {
                done = true;
                return;
            }
            QTimer::singleShot(0, &window, [&step] { step(); });
            const int now = next++;
            steps.at(now)();
            QCoreApplication::processEvents();
        };
        send(from, Qt::NoButton, Qt::NoButton, QEvent::MouseMove);
        send(from, Qt::LeftButton, Qt::LeftButton, QEvent::MouseButtonPress);
        QTimer::singleShot(0, &window, [&step] { step(); });
        QTRY_VERIFY_WITH_TIMEOUT(done, 5000);
        QCoreApplication::processEvents();
    }
};
}

class TestIosListDrag : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void rowsAreReordered_data()
    {
        QTest::addColumn<int>("from");
        QTest::addColumn<int>("to");
        QTest::addColumn<double>("part");
        QTest::addColumn<int>("target");
        QTest::addColumn<int>("targetData");
        QTest::addColumn<QString>("order");
        QTest::newRow("0 above 3") << 0 << 3 << 0.0 << 2 << 12 << "1 2 0 3 4";
        QTest::newRow("3 below 0") << 3 << 0 << 1.0 << 1 << 11 << "0 3 1 2 4";
        QTest::newRow("4 above 0") << 4 << 0 << 0.0 << 0 << 10 << "4 0 1 2 3";
        QTest::newRow("0 below 4") << 0 << 4 << 0.9 << 4 << 14 << "1 2 3 4 0";
    }
    void rowsAreReordered()
    {
        QFETCH(int, from);
        QFETCH(int, to);
        QFETCH(double, part);
        QFETCH(int, target);
        QFETCH(int, targetData);
        Phone phone;
        phone.list->setEditMode(true);
        QCoreApplication::processEvents();
        QSignalSpy moved(phone.list, &List::itemMoved);
        QSignalSpy data(phone.list, &List::dataMoved);
        QStringList orderAtSignal;
        connect(phone.list, &List::itemMoved, phone.list, [&] { orderAtSignal = phone.order(); });
        phone.drag(phone.at(from, 0.5), phone.at(to, part));
        QCOMPARE(moved.count(), 1);
        QCOMPARE(moved.first().at(0).toInt(), from);
        QCOMPARE(moved.first().at(1).toInt(), target);
        QCOMPARE(data.first().at(0).value<QVariant>().toInt(), 10 + from);
        QCOMPARE(data.first().at(1).value<QVariant>().toInt(), targetData);
        QCOMPARE(orderAtSignal.join(QLatin1Char(' ')), QStringLiteral("0 1 2 3 4")); // not moved yet
        QTRY_COMPARE(phone.list->count(), 5);
        QTest::qWait(20); // what is deleted later would be gone
        QTEST(phone.order().join(QLatin1Char(' ')), "order");
        QVERIFY(phone.rows.contains(phone.list->getIOSItem(target)));
    }

    void aRowDroppedOnItselfStays()
    {
        Phone phone;
        phone.list->setEditMode(true);
        QSignalSpy moved(phone.list, &List::itemMoved);
        phone.drag(phone.at(2, 0.2), phone.at(2, 0.5));
        QTest::qWait(20);
        QCOMPARE(phone.order().join(QLatin1Char(' ')), QStringLiteral("0 1 2 3 4"));
        if (moved.count() > 0) {
            QCOMPARE(moved.first().at(0).toInt(), 2);
            QCOMPARE(moved.first().at(1).toInt(), 2);
        }
    }

    void aRowThatIsNotMovableStays()
    {
        Phone phone;
        phone.rows[0]->setMovable(false);
        phone.list->setEditMode(true);
        QSignalSpy moved(phone.list, &List::itemMoved);
        phone.drag(phone.at(0, 0.5), phone.at(3, 0.0));
        QCOMPARE(moved.count(), 0);
        QCOMPARE(phone.order().join(QLatin1Char(' ')), QStringLiteral("0 1 2 3 4"));
    }

    void outsideEditModeARowCarriesItsPayload()
    {
        Phone phone;
        phone.rows[1]->setMimeData(QStringLiteral("camera/id"), "7");
        QSignalSpy moved(phone.list, &List::itemMoved);
        phone.drag(phone.at(1, 0.5), QPoint(190, 50));
        QCOMPARE(phone.target->m_received, QByteArray("7"));
        QCOMPARE(moved.count(), 0);
        QTest::qWait(20);
        QCOMPARE(phone.order().join(QLatin1Char(' ')), QStringLiteral("0 1 2 3 4"));
    }
};

ZELKOV_TEST_MAIN(TestIosListDrag)
#include "tst_ioslistdrag.moc"
