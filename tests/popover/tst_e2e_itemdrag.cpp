// SPDX-License-Identifier: MIT
// A real pointer drags rows.
#include "ItemTools.h"

#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QMimeData>
#include <QtCore/QProcess>
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
class Sink : public QWidget
{
public:
    explicit Sink(QWidget* parent)
        : QWidget(parent)
    {
        setAcceptDrops(true);
    }

    QList<QByteArray> m_taken;
    QPointer<QObject> m_source;
    int m_entered = 0;
    std::function<void()> m_onEnter;

protected:
    void dragEnterEvent(QDragEnterEvent* event) override
    {
        ++m_entered;
        event->acceptProposedAction();
        if (m_onEnter) {
            m_onEnter();
        }
    }
    void dropEvent(QDropEvent* event) override
    {
        m_taken << event->mimeData()->data(Item::sPopoverWidgetItem);
        m_source = event->source();
        event->acceptProposedAction();
    }
};

struct Scene
{
    Scene()
        : sink(new Sink(&window))
        , first(createRow(1))
        , second(createRow(2))
    {
        window.setGeometry(200, 150, 400, 300);
        sink->setGeometry(100, 150, 200, 100);
    }

    Row* createRow(int id)
    {
        auto* const row = new Row(pw::eifText, id, QStringLiteral("row %1").arg(id), QString(), &window);
        row->setGeometry(20, 20 + 40 * (id - 1), 120, 24);
        row->setDragEnabled(true);
        return row;
    }

    QWidget window;
    QPointer<Sink> sink;
    QPointer<Row> first;
    QPointer<Row> second;
};
}

class TestE2eItemDrag : public zelkovtest::TestCase
{
    Q_OBJECT

    static void show(Scene& scene)
    {
        scene.window.show();
        QVERIFY(QTest::qWaitForWindowActive(&scene.window));
        // The window manager moves the window once more after it is shown.
        QPoint last;
        QTRY_VERIFY([&] {
            const QPoint now = scene.window.mapToGlobal(QPoint());
            const bool still = now == last;
            last = now;
            return still;
        }());
    }

    static void drag(const QWidget* from, const QWidget* onto)
    {
        const QPoint start = from->mapToGlobal(from->rect().center());
        const QPoint end = onto->mapToGlobal(onto->rect().center());
        QStringList steps {QStringLiteral("mousemove"), QString::number(start.x()), QString::number(start.y()),
            QStringLiteral("sleep"), QStringLiteral("0.1"), QStringLiteral("mousedown"), QStringLiteral("1")};
        for (int i = 1; i <= 12; ++i) {
            const QPoint point = start + (end - start) * i / 12;
            steps << QStringLiteral("sleep") << QStringLiteral("0.04") << QStringLiteral("mousemove")
                  << QString::number(point.x()) << QString::number(point.y());
        }
        steps << QStringLiteral("sleep") << QStringLiteral("0.2") << QStringLiteral("mouseup")
              << QStringLiteral("1");
        QProcess tool;
        tool.start(QStringLiteral("xdotool"), steps);
        QTRY_VERIFY_WITH_TIMEOUT(tool.state() == QProcess::NotRunning, 20000);
        QCOMPARE(tool.exitCode(), 0);
        QTRY_COMPARE(QGuiApplication::mouseButtons(), Qt::MouseButtons(Qt::NoButton));
    }

private Q_SLOTS:
    void aRowIsDragged()
    {
        Scene scene;
        show(scene);
        QSignalSpy started(scene.second.data(), &Item::itemDragStarted);
        drag(scene.second, scene.sink);
        QTRY_COMPARE(scene.sink->m_taken, QList<QByteArray>({"2"}));
        QCOMPARE(scene.sink->m_source.data(), static_cast<QObject*>(scene.second.data()));
        QCOMPARE(started.count(), 1);
    }

    void aRowThatDiesOnItsWayIsNotDropped()
    {
        Scene scene;
        show(scene);
        scene.sink->m_onEnter = [&scene] { delete scene.first.data(); };
        drag(scene.first, scene.sink);
        QVERIFY(!scene.first);
        QVERIFY(scene.sink->m_entered > 0);
        QCOMPARE(scene.sink->m_taken, QList<QByteArray>());
        QTRY_VERIFY(!QApplication::overrideCursor());
        // The next drag is none the worse for it.
        scene.sink->m_onEnter = {};
        drag(scene.second, scene.sink);
        QTRY_COMPARE(scene.sink->m_taken, QList<QByteArray>({"2"}));
    }
};

ZELKOV_TEST_MAIN(TestE2eItemDrag)
#include "tst_e2e_itemdrag.moc"
