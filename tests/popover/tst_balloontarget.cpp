// SPDX-License-Identifier: MIT
// Targets in windows that are embedded in a graphics scene.
#include "popover/Balloon.h"
#include "popover/BalloonTarget.h"

#include "BalloonScene.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>
#include <QtWidgets/QGraphicsProxyWidget>
#include <QtWidgets/QGraphicsScene>
#include <QtWidgets/QGraphicsView>
#include <QtWidgets/QScrollBar>

using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;
using zelkovtest::BalloonScene;
namespace BalloonTarget = vx::PopoverWidget::BalloonTarget;

namespace
{
// A window in a graphics scene with a nested target, and one view of it.
struct ProxiedScene
{
    ProxiedScene()
    {
        auto* const embedded = new QWidget;
        embedded->resize(200, 100);
        auto* const panel = new QWidget(embedded);
        panel->setGeometry(20, 10, 150, 80);
        target = new QWidget(panel);
        target->setGeometry(30, 5, 40, 20);
        proxy = scene.addWidget(embedded);
        proxy->setPos(50, 60);
        window.resize(500, 400);
        view = new QGraphicsView(&scene, &window);
        view->setGeometry(10, 20, 480, 370);
        view->setSceneRect(0, 0, 900, 900);
        parent = new QWidget(&window);
        parent->setGeometry(5, 7, 480, 380);
        window.show();
        BalloonScene::settle();
    }
    ~ProxiedScene() { delete second; }

    QPoint viewportOrigin() const { return view->viewport()->mapToGlobal(QPoint(0, 0)); }

    QGraphicsScene scene;
    QWidget window;
    QGraphicsProxyWidget* proxy = nullptr;
    QGraphicsView* view = nullptr;
    QGraphicsView* second = nullptr;
    QWidget* parent = nullptr;
    QWidget* target = nullptr;
};
}

class TestBalloonTarget : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aTargetInASceneIsFoundThroughItsView();
    void aMovedAndScaledSceneIsFollowed();
    void severalViewsGiveNoPlaceForTheExtent();
    void aSceneWithoutViewGivesTheScreensOrigin();
    void aProxyWithoutSceneIsAPlainWidget();
    void theBalloonPointsIntoAScene();
};

void TestBalloonTarget::aTargetInASceneIsFoundThroughItsView()
{
    ProxiedScene scene;
    QVERIFY(BalloonTarget::isProxied(scene.target));
    QVERIFY(!BalloonTarget::isProxied(scene.parent));
    // Panel and target stand at (20, 10) and (30, 5) in a window at (50, 60) of the scene.
    const QPoint atScene = QPoint(50, 60) + QPoint(20, 10) + QPoint(30, 5);
    const QPoint expected = scene.parent->mapFromGlobal(
        scene.view->mapToGlobal(atScene - QPoint(scene.view->horizontalScrollBar()->value(), 0)
            - QPoint(0, scene.view->verticalScrollBar()->value())));
    QCOMPARE(BalloonTarget::position(scene.parent, scene.target, QRect()), QPointF(expected));

    // A point of the widget goes through the viewport.
    QCOMPARE(
        BalloonTarget::mapToGlobal(scene.target, QPoint(3, 4)), scene.viewportOrigin() + atScene + QPoint(3, 4));
    // The corners of its geometry are taken for points of the widget itself.
    const QPoint topLeft = scene.parent->mapFromGlobal(scene.viewportOrigin() + atScene + QPoint(30, 5));
    QCOMPARE(BalloonTarget::extent(scene.parent, scene.target, QRect()), QRect(topLeft, QSize(40, 20)));
    QCOMPARE(BalloonTarget::extent(scene.parent, scene.target, QRect(1, 2, 3, 4)), QRect(1, 2, 3, 4));
}

void TestBalloonTarget::aMovedAndScaledSceneIsFollowed()
{
    ProxiedScene scene;
    scene.view->scale(2, 2);
    BalloonScene::settle();
    const QPoint scroll(scene.view->horizontalScrollBar()->value(), scene.view->verticalScrollBar()->value());
    const QPoint atView = 2 * QPoint(100, 75) - scroll;
    QCOMPARE(BalloonTarget::position(scene.parent, scene.target, QRect()),
        QPointF(scene.parent->mapFromGlobal(scene.view->mapToGlobal(atView))));
    QCOMPARE(
        BalloonTarget::mapToGlobal(scene.target, QPoint(3, 4)), scene.viewportOrigin() + atView + QPoint(6, 8));
    // The extent grows with the picture: from pixel to pixel, each twice as far.
    QCOMPARE(BalloonTarget::extent(scene.parent, scene.target, QRect()).size(), QSize(39 * 2 + 1, 19 * 2 + 1));
}

void TestBalloonTarget::severalViewsGiveNoPlaceForTheExtent()
{
    ProxiedScene scene;
    scene.second = new QGraphicsView(&scene.scene);
    QCOMPARE(BalloonTarget::mapToGlobal(scene.target, QPoint(3, 4)), QPoint());
    const QPoint origin = scene.parent->mapFromGlobal(QPoint());
    QCOMPARE(BalloonTarget::extent(scene.parent, scene.target, QRect()), QRect(origin, origin));
    // The position still goes through the first view.
    QVERIFY(BalloonTarget::position(scene.parent, scene.target, QRect()) != QPointF(origin));
}

void TestBalloonTarget::aSceneWithoutViewGivesTheScreensOrigin()
{
    ProxiedScene scene;
    scene.view->setScene(nullptr);
    QCOMPARE(BalloonTarget::mapToGlobal(scene.target, QPoint(3, 4)), QPoint());
    QCOMPARE(BalloonTarget::position(scene.parent, scene.target, QRect()),
        QPointF(scene.parent->mapFromGlobal(QPoint())));
}

void TestBalloonTarget::aProxyWithoutSceneIsAPlainWidget()
{
    ProxiedScene scene;
    scene.scene.removeItem(scene.proxy);
    const std::unique_ptr<QGraphicsProxyWidget> owned(scene.proxy);
    QWidget* const window = scene.target->window();
    QCOMPARE(BalloonTarget::position(scene.parent, scene.target, QRect()),
        QPointF(scene.parent->mapFromGlobal(window->mapToGlobal(scene.target->pos()))));
    QCOMPARE(BalloonTarget::mapToGlobal(scene.target, QPoint(3, 4)), scene.target->mapToGlobal(QPoint(3, 4)));
}

void TestBalloonTarget::theBalloonPointsIntoAScene()
{
    ProxiedScene scene;
    Container* const container = BalloonScene::makeContainer(QStringLiteral("content"));
    BalloonScene::addRow(container, QSize(100, 40));
    auto* const balloon = new Balloon(scene.parent, scene.target, container, Balloon::ebfNoHeader, Balloon::eadTop,
        QSizeF(), Balloon::ESizeConstraints());
    balloon->show();
    BalloonScene::settle();
    const QPoint tip = BalloonTarget::position(scene.parent, scene.target, QRect()).toPoint() + QPoint(19, 19);
    QCOMPARE(balloon->geometry(), QRect(tip - QPoint(54, 0), QSize(108, 63)));
}

ZELKOV_TEST_MAIN(TestBalloonTarget)
#include "tst_balloontarget.moc"
