// SPDX-License-Identifier: MIT
// Where a balloon goes on the screen: layout passes with real widgets and targets.
#include "popover/Balloon.h"

#include "BalloonScene.h"
#include "popover/HeaderContainer.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtGui/QPainter>
#include <QtTest/QtTest>
#include <QtWidgets/QScrollBar>

using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::HeaderContainer;
using zelkovtest::BalloonScene;
using zelkovtest::EventCount;
using zelkovtest::PlainRow;

Q_DECLARE_METATYPE(QMargins)

namespace
{
QMargins layoutMargins(const Balloon* balloon)
{
    return balloon->layout()->contentsMargins();
}
}

class TestBalloonLayout : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theBalloonStandsBesideItsTarget_data();
    void theBalloonStandsBesideItsTarget();
    void theContentLiesInTheBody_data();
    void theContentLiesInTheBody();
    void aTieOfAllSidesPutsTheArrowOnTop();
    void aTieOfLeftAndRightPutsTheArrowOnTheRight();
    void aHiddenBalloonIsNotLaidOut();
    void anyPassCanBeForced();
    void showingLaysOut();
    void showingAnEmptyBalloonDoesNot();
    void aBalloonWithoutTargetIsCentred();
    void unknownSidesCentreTheBalloonOnItsAnchor();
    void aRectangleWinsOverTheTarget();
    void anInvalidRectangleGivesTheTargetBack();
    void aRectangleAloneIsATarget();
    void withoutItsTargetABalloonFallsBack();
    void aRelativePointMovesTheAnchor_data();
    void aRelativePointMovesTheAnchor();
    void aNestedTargetIsFoundInTheParent();
    void borderMarginsActAtOnce();
    void storedLengthsWaitForTheNextPass();
    void allowedSidesWaitForTheNextPass();
    void theSideChangesWhileTheBalloonIsOpen();
    void aBalloonThatTurnsHasItsSizeOnePassLater();
    void configuredSizes_data();
    void configuredSizes();
    void rowsBeyondTheParentScroll();
    void theScrollAreaIsNoHigherThanItsRows();
    void limitsOfTheContainerCount();
    void theTitleBarCountsWhileItIsVisible();
    void headerAndFooterAddToTheSize();
    void spacingCountsForEachStrip();
    void theHintNeedsNoPass();
    void featuresLayOutAtOnce();
    void followingATargetLaysOutNoRow();
    void turningOverLaysOutNoRow();
    void aBurstOfChangesEndsInTheRightPlace();
};

void TestBalloonLayout::theBalloonStandsBesideItsTarget_data()
{
    QTest::addColumn<int>("sides");
    QTest::addColumn<QRect>("geometry");

    // A target of 40 x 20 at (180, 130): its middle pixel is (199, 139). Rows of 100 x 40, margins 4, arrow 15.
    QTest::newRow("top") << 1 << QRect(145, 149, 108, 63);
    QTest::newRow("bottom") << 2 << QRect(145, 67, 108, 63);
    QTest::newRow("left") << 4 << QRect(219, 115, 123, 48);
    QTest::newRow("right") << 8 << QRect(57, 115, 123, 48);
    QTest::newRow("none allowed") << 0 << QRect(126, 106, 108, 48);
}

void TestBalloonLayout::theBalloonStandsBesideItsTarget()
{
    QFETCH(int, sides);
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, sides);
    scene.show();
    QTEST(balloon->geometry(), "geometry");
}

void TestBalloonLayout::theContentLiesInTheBody_data()
{
    QTest::addColumn<int>("sides");
    QTest::addColumn<QMargins>("margins");

    QTest::newRow("top") << 1 << QMargins(4, 19, 4, 4);
    QTest::newRow("bottom") << 2 << QMargins(4, 4, 4, 19);
    QTest::newRow("left") << 4 << QMargins(19, 4, 4, 4);
    QTest::newRow("right") << 8 << QMargins(4, 4, 19, 4);
    QTest::newRow("unknown") << 16 << QMargins(4, 4, 4, 4);
}

void TestBalloonLayout::theContentLiesInTheBody()
{
    QFETCH(int, sides);
    BalloonScene scene;
    PlainRow* const row = scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, sides);
    scene.show();
    QTEST(layoutMargins(balloon), "margins");
    if (sides != 16) {
        const QMargins margins = layoutMargins(balloon);
        QCOMPARE(row->mapTo(balloon, QPoint(0, 0)), QPoint(margins.left(), margins.top()));
        QCOMPARE(row->size(), QSize(100, 40));
        QCOMPARE(balloon->content()->geometry(), balloon->rect().marginsRemoved(margins));
    }
}

void TestBalloonLayout::aTieOfAllSidesPutsTheArrowOnTop()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    // The target's own offset counts twice in the measure: 65 and 65 are a tie in 300 for a height of 40.
    scene.target->setGeometry(180, 65, 40, 40);
    Balloon* const balloon = scene.make(8, 15);
    scene.show();
    QCOMPARE(layoutMargins(balloon), QMargins(4, 19, 4, 4));
    scene.target->move(180, 66);
    balloon->setupLayout();
    QCOMPARE(layoutMargins(balloon), QMargins(4, 4, 4, 19));
}

void TestBalloonLayout::aTieOfLeftAndRightPutsTheArrowOnTheRight()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    scene.target->setGeometry(90, 65, 40, 40);
    Balloon* const balloon = scene.make(8, 12);
    scene.show();
    QCOMPARE(layoutMargins(balloon), QMargins(4, 4, 19, 4));
    scene.target->move(89, 65);
    balloon->setupLayout();
    QCOMPARE(layoutMargins(balloon), QMargins(19, 4, 4, 4));
}

void TestBalloonLayout::aHiddenBalloonIsNotLaidOut()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1);
    const QRect before = balloon->geometry();
    balloon->setupLayout();
    balloon->setupLayout(false);
    balloon->setForRect(QRect(10, 10, 20, 20));
    balloon->setForWidget(scene.target, QPointF(1, 1));
    balloon->setMargins(20, 20, 20, 20);
    balloon->setFeatures(BalloonScene::features(15));
    Q_EMIT scene.container->layoutChanged();
    scene.window.show();
    BalloonScene::settle();
    QCOMPARE(balloon->geometry(), before);
}

void TestBalloonLayout::anyPassCanBeForced()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1);
    balloon->setupLayout(true);
    QCOMPARE(balloon->geometry(), QRect(145, 149, 108, 63));
}

void TestBalloonLayout::showingLaysOut()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1);
    scene.window.show();
    balloon->setVisible(true);
    QCOMPARE(balloon->geometry(), QRect(145, 149, 108, 63));
    balloon->hide();
    scene.target->move(100, 100);
    QCOMPARE(balloon->geometry(), QRect(145, 149, 108, 63));
    balloon->show();
    QCOMPARE(balloon->geometry(), QRect(65, 119, 108, 63));
}

void TestBalloonLayout::showingAnEmptyBalloonDoesNot()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1);
    balloon->resize(0, 50);
    scene.window.show();
    balloon->show();
    QCOMPARE(balloon->size(), QSize(0, 50));
    balloon->setupLayout();
    QCOMPARE(balloon->size(), QSize(108, 63));
}

void TestBalloonLayout::aBalloonWithoutTargetIsCentred()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 15, QSizeF(), 3, false);
    scene.show();
    // Centred on the middle pixel (199, 149) and grown by the inner margin.
    QCOMPARE(balloon->geometry(), QRect(145, 125, 108, 48));
    QCOMPARE(layoutMargins(balloon), QMargins(4, 4, 4, 4));
}

void TestBalloonLayout::unknownSidesCentreTheBalloonOnItsAnchor()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 16);
    scene.show();
    // The anchor is the target's upper left corner; no room for margins or an arrow.
    QCOMPARE(balloon->geometry(), QRect(130, 110, 100, 40));
}

void TestBalloonLayout::aRectangleWinsOverTheTarget()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    // Its extent is taken, its place is not: that still starts at the widget.
    balloon->setForRect(QRect(5, 5, 81, 11));
    QCOMPARE(balloon->geometry(), QRect(180 + 40 - 54, 130 + 10, 108, 63));
}

void TestBalloonLayout::anInvalidRectangleGivesTheTargetBack()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    const QRect before = balloon->geometry();
    balloon->setForRect(QRect(5, 5, 81, 11));
    QVERIFY(balloon->geometry() != before);
    balloon->setForRect(QRect());
    QCOMPARE(balloon->geometry(), before);
}

void TestBalloonLayout::aRectangleAloneIsATarget()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 15, QSizeF(), 3, false);
    balloon->setForRect(QRect(180, 130, 40, 20));
    scene.show();
    // More than half way down, counted twice: above it. The first pass still has the size of no side.
    QCOMPARE(balloon->geometry(), QRect(149, 90, 100, 40));
    balloon->setupLayout();
    QCOMPARE(balloon->geometry(), QRect(145, 67, 108, 63));
}

void TestBalloonLayout::withoutItsTargetABalloonFallsBack()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1);
    balloon->setForRect(QRect(10, 20, 41, 11));
    scene.show();
    const QRect atWidget = balloon->geometry();
    delete scene.target;
    QCOMPARE(balloon->geometry(), atWidget);
    balloon->setupLayout();
    QCOMPARE(balloon->geometry(), QRect(4, 30, 108, 63));
    balloon->setForRect(QRect());
    balloon->setupLayout();
    QCOMPARE(balloon->geometry(), QRect(145, 125, 108, 48));
}

void TestBalloonLayout::aRelativePointMovesTheAnchor_data()
{
    QTest::addColumn<QPointF>("relative");
    QTest::addColumn<QPoint>("position");

    QTest::newRow("none") << QPointF(0, 0) << QPoint(145, 149);
    QTest::newRow("(-1, 0)") << QPointF(-1, 0) << QPoint(145, 149);
    QTest::newRow("(10, 0)") << QPointF(10, 0) << QPoint(136, 149);
    QTest::newRow("(0, 5)") << QPointF(0, 5) << QPoint(145, 135);
    QTest::newRow("(10, 5)") << QPointF(10, 5) << QPoint(136, 135);
}

void TestBalloonLayout::aRelativePointMovesTheAnchor()
{
    QFETCH(QPointF, relative);
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    balloon->setForWidget(scene.target, relative);
    QTEST(balloon->pos(), "position");
}

void TestBalloonLayout::aNestedTargetIsFoundInTheParent()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    auto* const panel = new QWidget(&scene.window);
    panel->setGeometry(100, 80, 200, 150);
    auto* const nested = new QWidget(panel);
    nested->setGeometry(30, 10, 40, 20);
    scene.parent->setGeometry(20, 10, 380, 290);
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    balloon->setForWidget(nested, QPointF());
    QCOMPARE(balloon->mapTo(&scene.window, QPoint(0, 0)), QPoint(100 + 30 + 19 - 54, 80 + 10 + 19));
    // A target within the balloon's own parent.
    auto* const inside = new QWidget(scene.parent);
    inside->setGeometry(100, 100, 40, 20);
    balloon->setForWidget(inside, QPointF());
    QCOMPARE(balloon->pos(), QPoint(100 + 19 - 54, 100 + 19));
}

void TestBalloonLayout::borderMarginsActAtOnce()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    scene.target->move(0, 0);
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    QCOMPARE(balloon->pos(), QPoint(4, 19));
    balloon->setLeftBorderMargin(30);
    QCOMPARE(balloon->pos(), QPoint(30, 19));
    balloon->setTopBorderMargin(50);
    QCOMPARE(balloon->pos(), QPoint(30, 50));
    scene.target->move(390, 290);
    balloon->setupLayout();
    QCOMPARE(balloon->geometry().bottomRight(), QPoint(395, 295));
    balloon->setRightBorderMargin(40);
    QCOMPARE(balloon->geometry().bottomRight(), QPoint(359, 295));
    balloon->setBottomBorderMargin(60);
    QCOMPARE(balloon->geometry().bottomRight(), QPoint(359, 239));
    balloon->setMargins(4, 4, 4, 4);
    QCOMPARE(balloon->geometry().bottomRight(), QPoint(395, 295));
}

void TestBalloonLayout::storedLengthsWaitForTheNextPass()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    const QRect before = balloon->geometry();
    balloon->setArrowLength(25);
    balloon->setInnerMargin(10);
    balloon->setBorderRadius(12);
    balloon->setArrowWidth(8);
    BalloonScene::settle();
    QCOMPARE(balloon->geometry(), before);
    QCOMPARE(layoutMargins(balloon), QMargins(4, 19, 4, 4));
    balloon->setupLayout();
    QCOMPARE(balloon->geometry(), QRect(139, 149, 120, 85));
    QCOMPARE(layoutMargins(balloon), QMargins(10, 35, 10, 10));
}

void TestBalloonLayout::allowedSidesWaitForTheNextPass()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    balloon->setPreferredArrowDirections(Balloon::eadBottom);
    BalloonScene::settle();
    QCOMPARE(layoutMargins(balloon), QMargins(4, 19, 4, 4));
    balloon->setupLayout();
    QCOMPARE(layoutMargins(balloon), QMargins(4, 4, 4, 19));
    QCOMPARE(balloon->geometry(), QRect(145, 67, 108, 63));
}

void TestBalloonLayout::theSideChangesWhileTheBalloonIsOpen()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    scene.target->move(180, 20);
    Balloon* const balloon = scene.make(8, 15);
    scene.show();
    QCOMPARE(balloon->geometry(), QRect(145, 39, 108, 63));
    scene.target->move(180, 250);
    balloon->setupLayout();
    QCOMPARE(balloon->geometry(), QRect(145, 187, 108, 63));
}

void TestBalloonLayout::aBalloonThatTurnsHasItsSizeOnePassLater()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    balloon->setPreferredArrowDirections(Balloon::eadLeft);
    balloon->setupLayout();
    QCOMPARE(balloon->size(), QSize(108, 63));
    balloon->setupLayout();
    QCOMPARE(balloon->size(), QSize(123, 48));
}

void TestBalloonLayout::configuredSizes_data()
{
    QTest::addColumn<QSizeF>("size");
    QTest::addColumn<int>("constraints");
    QTest::addColumn<QSize>("expected");

    QTest::newRow("both") << QSizeF(200, 90) << 3 << QSize(200, 90);
    QTest::newRow("width") << QSizeF(200, 90) << 1 << QSize(200, 63);
    QTest::newRow("height") << QSizeF(200, 90) << 2 << QSize(108, 90);
    QTest::newRow("neither") << QSizeF(200, 90) << 0 << QSize(108, 63);
    QTest::newRow("invalid") << QSizeF() << 3 << QSize(108, 63);
    QTest::newRow("null") << QSizeF(0, 0) << 3 << QSize(108, 63);
}

void TestBalloonLayout::configuredSizes()
{
    QFETCH(QSizeF, size);
    QFETCH(int, constraints);
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1, size, constraints);
    scene.show();
    QTEST(balloon->size(), "expected");
    // The hint is that of the content all the same.
    QCOMPARE(balloon->sizeHint(), QSize(108, 63));
}

void TestBalloonLayout::rowsBeyondTheParentScroll()
{
    BalloonScene scene;
    for (int i = 0; i < 20; ++i) {
        scene.addRow(QSize(100, 40));
    }
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    QCOMPARE(balloon->geometry(), QRect(145, 4, 108, 292));
    QCOMPARE(balloon->content()->height(), 292 - 23);
    QCOMPARE(balloon->content()->verticalScrollBar()->maximum(), 800 - (292 - 23));
    QCOMPARE(scene.container->width(), 100);
}

void TestBalloonLayout::theScrollAreaIsNoHigherThanItsRows()
{
    BalloonScene scene;
    PlainRow* const row = scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1, QSizeF(200, 200));
    scene.show();
    QCOMPARE(balloon->content()->maximumHeight(), 40);
    QCOMPARE(balloon->content()->height(), 40);
    row->setHint(QSize(100, 50));
    Q_EMIT scene.container->layoutChanged();
    BalloonScene::settle();
    QCOMPARE(balloon->content()->maximumHeight(), 50);
}

void TestBalloonLayout::limitsOfTheContainerCount()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    scene.container->setMinimumWidth(150);
    scene.container->setMaximumHeight(30);
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    QCOMPARE(balloon->size(), QSize(158, 53));
}

void TestBalloonLayout::theTitleBarCountsWhileItIsVisible()
{
    BalloonScene scene;
    scene.addRow(QSize(300, 40));
    Balloon* const balloon = scene.make(5, 1);
    balloon->setTitle(QStringLiteral("Cameras"));
    scene.window.show();
    // Hidden with the balloon: it does not count yet.
    QCOMPARE(balloon->sizeHint(), QSize(308, 63));
    balloon->show();
    QWidget* const titleBar = balloon->layout()->itemAt(0)->widget();
    const int height = titleBar->sizeHint().height();
    QVERIFY(height > 10);
    QCOMPARE(balloon->size(), QSize(308, 63 + height));
    balloon->setFeatures(BalloonScene::features(8));
    QCOMPARE(balloon->size(), QSize(308, 63));
}

void TestBalloonLayout::headerAndFooterAddToTheSize()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Container* const header = BalloonScene::makeContainer(QStringLiteral("header"));
    Container* const footer = BalloonScene::makeContainer(QStringLiteral("footer"));
    BalloonScene::addRow(header, QSize(120, 10));
    BalloonScene::addRow(footer, QSize(130, 20));
    scene.container->addHeader(header);
    scene.container->addFooter(footer);
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    balloon->setupLayout();
    // Each adds its own excess over the 100 of the rows.
    QCOMPARE(balloon->size(), QSize(108 + 20 + 30, 63 + 10 + 20));
    header->hide();
    balloon->setupLayout();
    QCOMPARE(balloon->size(), QSize(108 + 30, 63 + 20));
}

void TestBalloonLayout::spacingCountsForEachStrip()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Container* const footer = BalloonScene::makeContainer(QStringLiteral("footer"));
    BalloonScene::addRow(footer, QSize(100, 20));
    scene.container->addFooter(footer);
    Balloon* const balloon = scene.make(8, 1);
    balloon->setSpacing(6);
    scene.show();
    balloon->setupLayout();
    QCOMPARE(balloon->size(), QSize(108, 63 + 20 + 6));
}

void TestBalloonLayout::theHintNeedsNoPass()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 4);
    QCOMPARE(balloon->sizeHint(), QSize(123, 48));
    scene.addRow(QSize(80, 30));
    BalloonScene::settle();
    QCOMPARE(balloon->sizeHint(), QSize(123, 78));
    // The container was adjusted on the way.
    QCOMPARE(scene.container->size(), QSize(100, 70));
}

void TestBalloonLayout::featuresLayOutAtOnce()
{
    BalloonScene scene;
    scene.addRow(QSize(300, 40));
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    balloon->setTitle(QStringLiteral("Cameras"));
    balloon->setFeatures(BalloonScene::features(5));
    QCOMPARE(balloon->height(), 63 + balloon->layout()->itemAt(0)->widget()->sizeHint().height());
}

void TestBalloonLayout::followingATargetLaysOutNoRow()
{
    // With a title wider than the rows, and with a size of its own: the rows then are wider than they ask for.
    for (const QSizeF& size : {QSizeF(), QSizeF(250, 200)}) {
        BalloonScene scene(QSize(800, 600));
        for (int i = 0; i < 10; ++i) {
            scene.addRow(QSize(60, 20));
        }
        scene.target->move(300, 20);
        Balloon* const balloon = scene.make(7, 3, size);
        balloon->setTitle(QStringLiteral("A title that is wider than all rows"));
        scene.show();
        balloon->setupLayout();
        BalloonScene::settle();

        EventCount work({QEvent::Resize, QEvent::Move, QEvent::LayoutRequest});
        work.watchTree(balloon->content());
        for (int i = 0; i < 20; ++i) {
            scene.target->move(300 + i, 20);
            const QPoint before = balloon->pos();
            balloon->setupLayout(false);
            QCOMPARE(balloon->pos(), i == 0 ? before : before + QPoint(1, 0));
            BalloonScene::settle();
        }
        QCOMPARE(work.count(), 0);
    }
}

void TestBalloonLayout::turningOverLaysOutNoRow()
{
    BalloonScene scene(QSize(800, 600));
    for (int i = 0; i < 10; ++i) {
        scene.addRow(QSize(60, 20));
    }
    scene.target->move(300, 20);
    Balloon* const balloon = scene.make(8, 3);
    scene.show();
    EventCount work({QEvent::Resize, QEvent::Move, QEvent::LayoutRequest});
    work.watchTree(scene.container);
    scene.target->move(300, 500);
    balloon->setupLayout();
    BalloonScene::settle();
    QCOMPARE(layoutMargins(balloon), QMargins(4, 4, 4, 19));
    QCOMPARE(work.count(), 0);
}

void TestBalloonLayout::aBurstOfChangesEndsInTheRightPlace()
{
    BalloonScene scene;
    QList<PlainRow*> rows;
    for (int i = 0; i < 5; ++i) {
        rows << scene.addRow(QSize(100, 20));
    }
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    EventCount moves({QEvent::Resize});
    moves.watch(balloon);
    for (PlainRow* row : rows) {
        row->setHint(QSize(110, 22));
        Q_EMIT scene.container->layoutChanged();
    }
    BalloonScene::settle();
    QCOMPARE(balloon->size(), QSize(118, 110 + 23));
    QCOMPARE(moves.count(), 1);
}

ZELKOV_TEST_MAIN(TestBalloonLayout)
#include "tst_balloonlayout.moc"
