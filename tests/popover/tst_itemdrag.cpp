// SPDX-License-Identifier: MIT
// A row is dragged: when, with what, and where to. The drags are real.
#include "DragTools.h"
#include "ItemTools.h"

#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QMimeData>
#include <QtGui/QDrag>
#include <QtGui/QDropEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>

#include <functional>

using itemtest::Row;
using vx::PopoverWidget::Item;
namespace pw = vx::PopoverWidget;

namespace
{
QString text(const char* words)
{
    return QString::fromLatin1(words);
}

/// Takes drops and keeps what they brought.
class Target : public QWidget
{
public:
    explicit Target(QWidget* parent)
        : QWidget(parent)
    {
        setAcceptDrops(true);
    }

    QStringList m_formats;
    QMap<QString, QByteArray> m_data;
    QPointer<QObject> m_source;
    Qt::DropAction m_action = Qt::IgnoreAction;
    int m_entered = 0;
    int m_drops = 0;
    std::function<void()> m_onMove;
    std::function<void()> m_onDrop;

protected:
    void dragEnterEvent(QDragEnterEvent* event) override
    {
        ++m_entered;
        event->acceptProposedAction();
    }
    void dragMoveEvent(QDragMoveEvent* event) override
    {
        event->acceptProposedAction();
        if (m_onMove) {
            m_onMove();
        }
    }
    void dropEvent(QDropEvent* event) override
    {
        ++m_drops;
        m_formats = event->mimeData()->formats();
        for (const QString& format : qAsConst(m_formats)) {
            m_data[format] = event->mimeData()->data(format);
        }
        m_source = event->source();
        m_action = event->proposedAction();
        event->acceptProposedAction();
        if (m_onDrop) {
            m_onDrop();
        }
    }
};

/// A row 80 x 20 at (10, 10) and a target below it, on the small screen of the minimal platform.
struct Scene
{
    Scene()
        : host(new QWidget)
        , row(new Row(pw::eifText, 42, QStringLiteral("row"), QString(), host))
        , target(new Target(host))
    {
        host->setGeometry(0, 0, 200, 200);
        row->setGeometry(10, 10, 80, 20);
        row->setDragEnabled(true);
        target->setGeometry(10, 100, 100, 60);
        host->show();
        static_cast<void>(QTest::qWaitForWindowExposed(host));
    }
    ~Scene() { delete host.data(); }

    QPointer<QWidget> host;
    QPointer<Row> row;
    QPointer<Target> target;

    void drag(const std::function<void()>& during = {})
    {
        itemtest::drag(host, QPoint(20, 20), QPoint(60, 130), during);
    }
};
}

class TestItemDrag : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aDraggedRowBringsIdUserDataAndHotSpot()
    {
        Scene scene;
        scene.row->setUserData(text("camera 3"));
        QSignalSpy started(scene.row.data(), &Item::itemDragStarted);
        scene.drag();
        QCOMPARE(started.count(), 1);
        QCOMPARE(scene.target->m_drops, 1);
        QCOMPARE(scene.target->m_formats,
            QStringList({text("PopoverWidgetItem"), text("text/plain"), text("qreal/hotspot/x"),
                text("qreal/hotspot/y")}));
        QCOMPARE(scene.target->m_data.value(text("PopoverWidgetItem")), QByteArray("42"));
        QCOMPARE(scene.target->m_data.value(text("text/plain")), QByteArray("camera 3"));
        QCOMPARE(scene.target->m_data.value(text("qreal/hotspot/x")), QByteArray("0.5"));
        QCOMPARE(scene.target->m_data.value(text("qreal/hotspot/y")), QByteArray("0.5"));
        QCOMPARE(scene.target->m_source.data(), static_cast<QObject*>(scene.row.data()));
        QCOMPARE(scene.target->m_action, Qt::MoveAction);
    }

    void furtherFormatsWin()
    {
        Scene scene;
        scene.row->setUserData(7);
        scene.row->setDragMimeType(text("application/action-id"));
        scene.row->setDragMimeData({{text("x-camera/name"), "Gate"}, {text("qreal/hotspot/y"), "0.25"},
            {text("PopoverWidgetItem"), "other"}});
        scene.drag();
        QCOMPARE(scene.target->m_drops, 1);
        QCOMPARE(scene.target->m_data.value(text("application/action-id")), QByteArray("7"));
        QCOMPARE(scene.target->m_data.value(text("x-camera/name")), QByteArray("Gate"));
        QCOMPARE(scene.target->m_data.value(text("PopoverWidgetItem")), QByteArray("other"));
        QCOMPARE(scene.target->m_data.value(text("qreal/hotspot/x")), QByteArray("0.5"));
        QCOMPARE(scene.target->m_data.value(text("qreal/hotspot/y")), QByteArray("0.25"));
        QVERIFY(!scene.target->m_formats.contains(text("text/plain")));
    }

    void thePictureIsTheRowHeldInItsMiddle()
    {
        Scene scene;
        scene.row->resize(81, 21);
        QSize picture;
        QPoint hotSpot;
        QPointer<QObject> owner;
        scene.drag([&] {
            if (const auto* drag = scene.host->findChild<QDrag*>()) {
                picture = drag->pixmap().size();
                hotSpot = drag->hotSpot();
                owner = drag->parent();
            }
        });
        QCOMPARE(picture, QSize(81, 21));
        QCOMPARE(hotSpot, QPoint(40, 10));
        QCOMPARE(owner.data(), static_cast<QObject*>(scene.host.data()));
        // Nothing is left of the drag.
        QTRY_VERIFY(!scene.host->findChild<QDrag*>());
    }

    void aShortMoveIsLeftToTheBaseClass()
    {
        Scene scene;
        QSignalSpy started(scene.row.data(), &Item::itemDragStarted);
        const QPoint start(5, 5);
        itemtest::sendMouse(scene.row, QEvent::MouseButtonPress, start);
        const int distance = QApplication::startDragDistance();
        QVERIFY(!itemtest::sendMouse(
            scene.row, QEvent::MouseMove, start + QPoint(distance - 1, 0), Qt::NoButton, Qt::LeftButton));
        QCOMPARE(started.count(), 0);
    }

    void aDragNeedsTheFlagAndTheLeftButton()
    {
        Scene scene;
        QSignalSpy started(scene.row.data(), &Item::itemDragStarted);
        itemtest::sendMouse(scene.row, QEvent::MouseButtonPress, QPoint(5, 5));
        QVERIFY(!itemtest::sendMouse(scene.row, QEvent::MouseMove, QPoint(60, 5), Qt::NoButton, Qt::RightButton));
        scene.row->setDragEnabled(false);
        QVERIFY(!itemtest::sendMouse(scene.row, QEvent::MouseMove, QPoint(60, 5), Qt::NoButton, Qt::LeftButton));
        QCOMPARE(started.count(), 0);
    }

    void onlyTheLeftButtonMovesTheStart()
    {
        Scene scene;
        QSignalSpy started(scene.row.data(), &Item::itemDragStarted);
        itemtest::sendMouse(scene.row, QEvent::MouseButtonPress, QPoint(5, 5));
        itemtest::sendMouse(scene.row, QEvent::MouseButtonPress, QPoint(60, 5), Qt::RightButton, Qt::RightButton);
        QVERIFY(!itemtest::sendMouse(scene.row, QEvent::MouseMove, QPoint(8, 5), Qt::NoButton, Qt::LeftButton));
        QCOMPARE(started.count(), 0);
    }

    void theRowMayDieWhenItsDragBegins()
    {
        Scene scene;
        connect(scene.row.data(), &Item::itemDragStarted, this, [&scene] { delete scene.row.data(); });
        scene.drag();
        QVERIFY(!scene.row);
        QCOMPARE(scene.target->m_drops, 0);
        QVERIFY(!scene.host->findChild<QDrag*>());
    }

    void theWindowMayDieWhenTheDragBegins()
    {
        Scene scene;
        connect(scene.row.data(), &Item::itemDragStarted, this, [&scene] { delete scene.host.data(); });
        scene.drag();
        QVERIFY(!scene.host);
    }

    void theRowMayDieInTheMiddleOfItsDrag()
    {
        Scene scene;
        scene.drag([&scene] { delete scene.row.data(); });
        QVERIFY(!scene.row);
        // What no longer exists is not dropped.
        QCOMPARE(scene.target->m_drops, 0);
        QTRY_VERIFY(!scene.host->findChild<QDrag*>());
    }

    void theRowMayDieOverTheTarget()
    {
        Scene scene;
        scene.target->m_onMove = [&scene] { delete scene.row.data(); };
        scene.drag();
        QVERIFY(!scene.row);
        QCOMPARE(scene.target->m_drops, 0);
    }

    void theRowMayDieInTheDrop()
    {
        Scene scene;
        scene.target->m_onDrop = [&scene] { delete scene.row.data(); };
        scene.drag();
        QVERIFY(!scene.row);
        QCOMPARE(scene.target->m_drops, 1);
    }

    void theRowCanBeDraggedTwice()
    {
        Scene scene;
        scene.drag();
        scene.drag();
        QCOMPARE(scene.target->m_drops, 2);
    }
};

ZELKOV_TEST_MAIN(TestItemDrag)
#include "tst_itemdrag.moc"
