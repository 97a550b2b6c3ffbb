// SPDX-License-Identifier: MIT
// What a balloon looks like, pixel by pixel where it matters.
#include "popover/Balloon.h"

#include "BalloonScene.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtGui/QImage>
#include <QtGui/QPainter>
#include <QtTest/QtTest>

using vx::PopoverWidget::Balloon;
using zelkovtest::BalloonScene;
using zelkovtest::EventCount;

namespace
{
// The balloon alone, over nothing.
QImage picture(Balloon* balloon)
{
    QImage image(balloon->size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    balloon->render(&painter, QPoint(), QRegion(), QWidget::RenderFlags());
    return image;
}

bool near(const QColor& a, const QColor& b, int tolerance = 6)
{
    return qAbs(a.red() - b.red()) <= tolerance && qAbs(a.green() - b.green()) <= tolerance
        && qAbs(a.blue() - b.blue()) <= tolerance && qAbs(a.alpha() - b.alpha()) <= tolerance;
}

QByteArray text(const QColor& color)
{
    return color.name(QColor::HexArgb).toLatin1();
}
}

#define COMPARE_COLOR(actual, expected) QVERIFY2(near((actual), (expected)), text(actual).constData())

class TestBalloonPainting : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theBodyRunsFromOneColourToTheOther();
    void theBorderIsDrawnIfItHasAColour();
    void cornersAreRound();
    void aRadiusOfZeroFillsTheCorners();
    void theArrowReachesItsTarget_data();
    void theArrowReachesItsTarget();
    void nearACornerTheArrowIsStraightTowardsIt_data();
    void nearACornerTheArrowIsStraightTowardsIt();
    void anAnchorOnTheCentreLineCountsAsTheRightHalf();
    void aBalloonPushedOverItsTargetHasNoArrow();
    void withoutAllowedSidesThereIsNoArrow();
    void coloursCountFromTheNextRepaintOn();
    void theDefaultLookFollowsThePalette_data();
    void theDefaultLookFollowsThePalette();
    void thePlaceBesideTheArrowStaysClear();
    void movingPaintsTheArrowAgain();
};

void TestBalloonPainting::theBodyRunsFromOneColourToTheOther()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 100));
    Balloon* const balloon = scene.make(8, 1);
    balloon->setBackgroundColor(Qt::blue);
    balloon->setBackgroundColor2(Qt::red);
    scene.show();
    const QImage image = picture(balloon);
    const int w = image.width();
    const int h = image.height();
    // The gradient runs across the diagonal; its first half is plain.
    COMPARE_COLOR(image.pixelColor(10, 25), QColor(Qt::red));
    COMPARE_COLOR(image.pixelColor(w / 2 - 4, h / 2 - 4), QColor(Qt::red));
    QVERIFY(near(image.pixelColor(w - 3, h - 3), QColor(Qt::blue), 40));
    const QColor between = image.pixelColor(w * 3 / 4, h * 3 / 4);
    QVERIFY2(near(between, QColor(127, 0, 127), 20), text(between).constData());
}

void TestBalloonPainting::theBorderIsDrawnIfItHasAColour()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 100));
    Balloon* const balloon = scene.make(8, 1);
    balloon->setBackgroundColor(Qt::white);
    scene.show();
    QImage image = picture(balloon);
    COMPARE_COLOR(image.pixelColor(0, 60), QColor(Qt::white));
    balloon->setBorderColor(Qt::black);
    image = picture(balloon);
    // One pixel wide on the very edge: half of it lies within.
    QVERIFY2(near(image.pixelColor(0, 60), QColor(127, 127, 127), 12), text(image.pixelColor(0, 60)).constData());
    COMPARE_COLOR(image.pixelColor(1, 60), QColor(Qt::white));
    QVERIFY(near(image.pixelColor(image.width() - 1, 60), QColor(127, 127, 127), 12));
    QVERIFY(near(image.pixelColor(50, image.height() - 1), QColor(127, 127, 127), 12));
    COMPARE_COLOR(image.pixelColor(50, image.height() - 2), QColor(Qt::white));
}

void TestBalloonPainting::cornersAreRound()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 100));
    Balloon* const balloon = scene.make(8, 1);
    balloon->setBackgroundColor(Qt::white);
    scene.show();
    const QImage image = picture(balloon);
    const int w = image.width();
    const int h = image.height();
    for (const QPoint& corner : {QPoint(0, 15), QPoint(w - 1, 15), QPoint(0, h - 1), QPoint(w - 1, h - 1)}) {
        QVERIFY(image.pixelColor(corner).alpha() < 30);
    }
    COMPARE_COLOR(image.pixelColor(6, 15), QColor(Qt::white));
    COMPARE_COLOR(image.pixelColor(0, 21), QColor(Qt::white));
    COMPARE_COLOR(image.pixelColor(2, 17), QColor(Qt::white));
}

void TestBalloonPainting::aRadiusOfZeroFillsTheCorners()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 100));
    Balloon* const balloon = scene.make(8, 1);
    balloon->setBackgroundColor(Qt::white);
    balloon->setBorderRadius(0);
    scene.show();
    const QImage image = picture(balloon);
    COMPARE_COLOR(image.pixelColor(0, 15), QColor(Qt::white));
    COMPARE_COLOR(image.pixelColor(image.width() - 1, image.height() - 1), QColor(Qt::white));
}

void TestBalloonPainting::theArrowReachesItsTarget_data()
{
    QTest::addColumn<int>("sides");
    QTest::addColumn<QPoint>("tip"); // a pixel inside the tip, from the target's edge
    QTest::addColumn<QPoint>("beside");

    // The target covers (180, 130) to (219, 149).
    QTest::newRow("top") << 1 << QPoint(199, 152) << QPoint(206, 152);
    QTest::newRow("bottom") << 2 << QPoint(199, 127) << QPoint(206, 127);
    QTest::newRow("left") << 4 << QPoint(222, 139) << QPoint(222, 146);
    QTest::newRow("right") << 8 << QPoint(177, 139) << QPoint(177, 146);
}

void TestBalloonPainting::theArrowReachesItsTarget()
{
    QFETCH(int, sides);
    QFETCH(QPoint, tip);
    QFETCH(QPoint, beside);
    BalloonScene scene;
    scene.addRow(QSize(100, 100));
    Balloon* const balloon = scene.make(8, sides);
    balloon->setBackgroundColor(Qt::white);
    scene.show();
    const QImage image = picture(balloon);
    COMPARE_COLOR(image.pixelColor(balloon->mapFromParent(tip)), QColor(Qt::white));
    QCOMPARE(image.pixelColor(balloon->mapFromParent(beside)).alpha(), 0);
}

void TestBalloonPainting::nearACornerTheArrowIsStraightTowardsIt_data()
{
    QTest::addColumn<int>("x"); // of the target's middle
    QTest::addColumn<bool>("left");
    QTest::addColumn<bool>("right");

    // The balloon is pushed to 4 to 112, or to 288 to 396; the base is 15 to each side, the strip 15 high. Beside
    // the tip, at three quarters of the way, a slope of its own is 11 pixels wide.
    QTest::newRow("more than twice the width off the left") << 4 + 31 << true << true;
    QTest::newRow("twice the width off the left") << 4 + 30 << false << true;
    QTest::newRow("nearer to the left") << 4 + 15 << false << true;
    QTest::newRow("more than twice the width off the right") << 396 - 31 << true << true;
    QTest::newRow("twice the width off the right") << 396 - 30 << true << false;
    QTest::newRow("nearer to the right") << 396 - 15 << true << false;
}

void TestBalloonPainting::nearACornerTheArrowIsStraightTowardsIt()
{
    QFETCH(int, x);
    QFETCH(bool, left);
    QFETCH(bool, right);
    BalloonScene scene;
    scene.addRow(QSize(100, 100));
    scene.target->setGeometry(x - 1, 20, 3, 3);
    Balloon* const balloon = scene.make(8, 1);
    balloon->setBackgroundColor(Qt::white);
    scene.show();
    const QImage image = picture(balloon);
    const QPoint tip = balloon->mapFromParent(QPoint(x, balloon->y()));
    QCOMPARE(image.pixelColor(tip + QPoint(-5, 11)).alpha() > 200, left);
    QCOMPARE(image.pixelColor(tip + QPoint(5, 11)).alpha() > 200, right);
}

void TestBalloonPainting::anAnchorOnTheCentreLineCountsAsTheRightHalf()
{
    // So narrow that every arrow is near a corner: 48 wide, and twice the width is 30.
    BalloonScene scene;
    scene.addRow(QSize(40, 60));
    scene.target->setGeometry(180, 20, 41, 10);
    Balloon* const balloon = scene.make(8, 1);
    balloon->setBackgroundColor(Qt::white);
    scene.show();
    QCOMPARE(balloon->geometry().x(), 200 - 24);
    const QImage image = picture(balloon);
    QVERIFY(image.pixelColor(24 - 5, 11).alpha() > 200);
    QCOMPARE(image.pixelColor(24 + 5, 11).alpha(), 0);
}

void TestBalloonPainting::aBalloonPushedOverItsTargetHasNoArrow()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 240));
    scene.target->setGeometry(180, 100, 40, 20);
    Balloon* const balloon = scene.make(8, 1);
    balloon->setBackgroundColor(Qt::white);
    scene.show();
    QCOMPARE(balloon->geometry().bottom(), 295);
    const QImage image = picture(balloon);
    for (int y = 0; y < 14; ++y) {
        for (int x = 0; x < image.width(); ++x) {
            QCOMPARE(image.pixelColor(x, y).alpha(), 0);
        }
    }
}

void TestBalloonPainting::withoutAllowedSidesThereIsNoArrow()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 60));
    Balloon* const balloon = scene.make(8, 1);
    balloon->setBackgroundColor(Qt::white);
    scene.show();
    QVERIFY(picture(balloon).pixelColor(54, 4).alpha() > 200);
    // Stored at once, so that the next repaint knows it; the place follows with the next pass.
    balloon->setPreferredArrowDirections(BalloonScene::sides(0));
    QCOMPARE(picture(balloon).pixelColor(54, 4).alpha(), 0);
}

void TestBalloonPainting::coloursCountFromTheNextRepaintOn()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 60));
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    EventCount paints({QEvent::Paint, QEvent::UpdateRequest});
    paints.watch(balloon);
    balloon->setBackgroundColor(Qt::green);
    balloon->setBackgroundColor2(Qt::green);
    balloon->setBorderColor(Qt::green);
    balloon->setBorderRadius(3);
    balloon->setArrowWidth(3);
    BalloonScene::settle();
    QCOMPARE(paints.count(), 0);
    COMPARE_COLOR(picture(balloon).pixelColor(50, 40), QColor(Qt::green));
}

void TestBalloonPainting::theDefaultLookFollowsThePalette_data()
{
    QTest::addColumn<QColor>("window");
    QTest::addColumn<QColor>("words");

    QTest::newRow("light") << QColor(239, 239, 239) << QColor(0, 0, 0);
    QTest::newRow("dark") << QColor(38, 41, 46) << QColor(225, 228, 232);
}

void TestBalloonPainting::theDefaultLookFollowsThePalette()
{
    QFETCH(QColor, window);
    QFETCH(QColor, words);
    BalloonScene scene;
    QPalette palette = scene.window.palette();
    palette.setColor(QPalette::Window, window);
    palette.setColor(QPalette::WindowText, words);
    scene.window.setPalette(palette);
    scene.addRow(QSize(100, 60));
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    const QImage image = picture(balloon);
    const QColor body = image.pixelColor(30, 45);
    QCOMPARE(body.alpha(), 255);
    QVERIFY(qAbs(body.lightness() - words.lightness()) > 120);
    // It has a border that is neither of the body nor of the window.
    const QColor border = image.pixelColor(0, 45);
    QVERIFY2(qAbs(border.lightness() - body.lightness()) > 15, text(border).constData());
}

void TestBalloonPainting::thePlaceBesideTheArrowStaysClear()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 60));
    Balloon* const balloon = scene.make(8, 2);
    balloon->setBackgroundColor(Qt::white);
    scene.show();
    const QImage image = picture(balloon);
    for (int y = image.height() - 15; y < image.height(); ++y) {
        QCOMPARE(image.pixelColor(2, y).alpha(), 0);
        QCOMPARE(image.pixelColor(image.width() - 3, y).alpha(), 0);
    }
}

void TestBalloonPainting::movingPaintsTheArrowAgain()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 100));
    scene.target->setGeometry(3, 20, 21, 10);
    Balloon* const balloon = scene.make(8, 1);
    balloon->setBackgroundColor(Qt::white);
    scene.show();
    const QRect before = balloon->geometry();
    EventCount paints({QEvent::Paint});
    paints.watch(balloon);
    // The frame stays at its limit, only the arrow moves.
    scene.target->move(23, 20);
    balloon->setupLayout();
    BalloonScene::settle();
    QCOMPARE(balloon->geometry(), before);
    QVERIFY(paints.count() >= 1);
    QVERIFY(picture(balloon).pixelColor(33 - 4, 8).alpha() > 200);
}

ZELKOV_TEST_MAIN(TestBalloonPainting)
#include "tst_balloonpainting.moc"
