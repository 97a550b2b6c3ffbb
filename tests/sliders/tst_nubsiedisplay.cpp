// SPDX-License-Identifier: MIT
// How a handle looks, grows, moves and glows.
#include "indicators/BadgeDrawer.h"
#include "NubsieScene.h"
#include "sliders/Nubsie.h"
#include "sliders/NubsieMath.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QElapsedTimer>
#include <QtTest/QtTest>

using nubsietest::isColor;
using nubsietest::Painted;
using nubsietest::painted;
using nubsietest::picture;
using vx::BadgeDrawer;
using vx::Nubsie;

namespace
{
using Features = QFlags<Nubsie::ENubsieFeatures>;

struct Handle : Painted
{
    explicit Handle(QWidget* parent = nullptr, int value = 3, int maximum = 100)
        : Painted(QStringLiteral("handle"), value, 0, maximum, 5, parent, 1)
    {
    }

    void give(ENubsieFeatures feature) { setFeatures(features() | feature); }
};

QPixmap valueBadge(const QString& text, const QColor& fore = Qt::white, const QColor& back = QColor(236, 33, 33))
{
    return BadgeDrawer::renderBadgePixmapFromText(text, true, false, fore, back);
}

QPixmap textBadge(const QString& text)
{
    return BadgeDrawer::renderBadgePixmapFromText(text, false, false, Qt::white, QColor(246, 67, 70, 220));
}

bool same(const QPixmap& a, const QPixmap& b)
{
    return a.toImage() == b.toImage();
}

// A window that is shown; the handle in its middle, 40 pixels large.
struct Scene
{
    Scene()
        : handle(new Handle(&window))
    {
        window.resize(200, 100);
        handle->setSize(QSize(40, 40));
        handle->setPosition(QPointF(99, 49));
        window.show();
        (void)QTest::qWaitForWindowExposed(&window);
        settle();
    }

    void settle()
    {
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents();
        handle->paints = 0;
    }

    QWidget window;
    Handle* handle;
};
}

class TestNubsieDisplay : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theIconIsScaledIntoTheHandleAndCentred();
    void theSameIconAgainRepaintsNothing();
    void anotherIconRepaints();
    void theRedIconShowsWhileTheDateDiffers();
    void theValueBadgeShowsTheValue();
    void theValueBadgeOfAnInvertedHandleIsTurnedRound();
    void aValueBadgeIsNotDrawnAgainForTheSameValue();
    void anIconForTheShownValueStandsInForTheBadge();
    void aTextBadgeTakesTheTextOfTheValue();
    void aTextWithoutAMapIsNotSeen();
    void anIconMapGivesTheIconOfTheTrueValue();
    void ofSeveralSourcesTheFirstOneWins();
    void withABalloonTheImageIsKept();
    void manyDigitsMakeAPillAndOneDigitASquareAgain();
    void withoutADraggedSizeNothingIsFitted();
    void aSizeResizesAboutThePoint();
    void theSizeAtRestIsTakenAtOnce();
    void aHandleIsMaximizedAtItsDraggedSize();
    void growingTakesTheDraggedSize();
    void shrinkingTakesTheSizeAtRest();
    void growingStopsTheSliding();
    void movingSlidesToThePoint();
    void cancellingStopsWhereItIs();
    void settingAValueEndsAllAnimations();
    void theGlowPulses();
    void aPulseHasItsDefaultDurationAgainAfterTheEnd();
    void noDurationKeepsThePresentOne();
    void stoppingTheGlowRepaintsNothing();
    void theGlowIsDrawnOverTheIcon();
    void aDisabledHandleIsHalfTransparent();
    void aStyleSheetDressesTheHandle();
    void aHandleThatShouldNotShowIsNotPainted();
    void aHandleThatShouldNotShowCannotBeShown();
    void hidingAlwaysWorks();
    void aHandleAtRestIsClipped();
    void aHandleWithAStateOrMaximizedIsNotClipped();
    void aDeadClipWidgetClipsNothing();
};

void TestNubsieDisplay::theIconIsScaledIntoTheHandleAndCentred()
{
    Handle handle;
    handle.setSize(QSize(40, 30));
    handle.setIcon(picture(Qt::blue, QSize(100, 50)));
    const QImage image = painted(handle);
    // 40 x 20, with five pixels above and below.
    QVERIFY(isColor(image, QPoint(0, 5), Qt::blue));
    QVERIFY(isColor(image, QPoint(39, 24), Qt::blue));
    QVERIFY(isColor(image, QPoint(20, 4), Qt::white));
    QVERIFY(isColor(image, QPoint(20, 25), Qt::white));
    QVERIFY(!handle.icon().isNull());
    QCOMPARE(handle.icon().size(), QSize(100, 50));
}

void TestNubsieDisplay::theSameIconAgainRepaintsNothing()
{
    Scene scene;
    const QPixmap icon = picture(Qt::blue);
    scene.handle->setIcon(icon);
    scene.handle->setIconRed(icon);
    scene.settle();
    scene.handle->setIcon(icon);
    scene.handle->setIconRed(icon);
    QCoreApplication::processEvents();
    QCOMPARE(scene.handle->paints, 0);
}

void TestNubsieDisplay::anotherIconRepaints()
{
    Scene scene;
    scene.handle->setIcon(picture(Qt::blue));
    scene.settle();
    scene.handle->setIcon(picture(Qt::green));
    QTRY_VERIFY(scene.handle->paints > 0);
    QVERIFY(isColor(painted(*scene.handle), QPoint(20, 20), Qt::green));
}

void TestNubsieDisplay::theRedIconShowsWhileTheDateDiffers()
{
    Handle handle;
    handle.setSize(QSize(40, 40));
    handle.setIcon(picture(Qt::blue));
    handle.setIconRed(picture(Qt::red));
    handle.setDateDiffer(true);
    QVERIFY(isColor(painted(handle), QPoint(20, 20), Qt::blue));
    handle.give(Nubsie::enfDateMode);
    QVERIFY(isColor(painted(handle), QPoint(20, 20), Qt::red));
    handle.setDateDiffer(false);
    QVERIFY(isColor(painted(handle), QPoint(20, 20), Qt::blue));
}

void TestNubsieDisplay::theValueBadgeShowsTheValue()
{
    Handle handle;
    QVERIFY(handle.icon().isNull());
    handle.give(Nubsie::enfValueBadge);
    QVERIFY(same(handle.icon(), valueBadge(QStringLiteral("3"))));
    handle.setValue(8);
    QVERIFY(same(handle.icon(), valueBadge(QStringLiteral("8"))));
    handle.setTextColor(Qt::black);
    handle.setBackColor(Qt::yellow);
    QVERIFY(same(handle.icon(), valueBadge(QStringLiteral("8"), Qt::black, Qt::yellow)));
}

void TestNubsieDisplay::theValueBadgeOfAnInvertedHandleIsTurnedRound()
{
    Handle handle(nullptr, 3, 10);
    handle.setFeatures(Features(Nubsie::enfValueBadge) | Nubsie::enfInverted);
    QVERIFY(same(handle.icon(), valueBadge(QStringLiteral("7"))));
}

void TestNubsieDisplay::aValueBadgeIsNotDrawnAgainForTheSameValue()
{
    Handle handle;
    handle.give(Nubsie::enfValueBadge);
    const qint64 key = handle.icon().cacheKey();
    handle.setCurrentSize(QSize(30, 30));
    handle.updateNubsie(false);
    QCOMPARE(handle.icon().cacheKey(), key);
    handle.setValue(4);
    QVERIFY(handle.icon().cacheKey() != key);
}

void TestNubsieDisplay::anIconForTheShownValueStandsInForTheBadge()
{
    Handle handle(nullptr, 3, 10);
    handle.setFeatures(Features(Nubsie::enfValueBadge) | Nubsie::enfInverted);
    const QPixmap seven = picture(Qt::blue);
    handle.setIconMap({{{3}, picture(Qt::red)}, {{7}, seven}});
    QCOMPARE(handle.icon().cacheKey(), seven.cacheKey());
    handle.setValue(2);
    QVERIFY(same(handle.icon(), valueBadge(QStringLiteral("8"))));
}

void TestNubsieDisplay::aTextBadgeTakesTheTextOfTheValue()
{
    Handle handle;
    handle.setText(QStringLiteral("else"));
    handle.setTextMap({{{3, 5}, QStringLiteral("some")}, {{4}, QStringLiteral("four")}});
    QVERIFY(same(handle.icon(), textBadge(QStringLiteral("some"))));
    handle.setValue(4);
    QVERIFY(same(handle.icon(), textBadge(QStringLiteral("some"))));
    handle.setValue(6);
    QVERIFY(same(handle.icon(), textBadge(QStringLiteral("else"))));
    handle.setText(QStringLiteral("other"));
    QVERIFY(same(handle.icon(), textBadge(QStringLiteral("other"))));
    QCOMPARE(handle.text(), QStringLiteral("other"));
}

void TestNubsieDisplay::aTextWithoutAMapIsNotSeen()
{
    Handle handle;
    handle.setText(QStringLiteral("text"));
    QVERIFY(handle.icon().isNull());
}

void TestNubsieDisplay::anIconMapGivesTheIconOfTheTrueValue()
{
    Handle handle;
    const QPixmap low = picture(Qt::blue);
    const QPixmap high = picture(Qt::red);
    handle.give(Nubsie::enfInverted);
    handle.setIconMap({{{0, 10}, low}, {{5, 20}, high}});
    QCOMPARE(handle.icon().cacheKey(), low.cacheKey());
    handle.setSize(QSize(20, 20));
    QVERIFY(isColor(painted(handle), QPoint(10, 10), Qt::blue));
    handle.setValue(11);
    QCOMPARE(handle.icon().cacheKey(), high.cacheKey());
    QVERIFY(isColor(painted(handle), QPoint(10, 10), Qt::red));
    handle.setValue(21);
    QCOMPARE(handle.icon().cacheKey(), high.cacheKey());
    handle.setIconMap({});
    QCOMPARE(handle.icon().cacheKey(), high.cacheKey());
}

void TestNubsieDisplay::ofSeveralSourcesTheFirstOneWins()
{
    Handle handle;
    const QPixmap icon = picture(Qt::blue);
    handle.setIconMap({{{0, 100}, icon}});
    handle.setTextMap({{{0, 100}, QStringLiteral("text")}});
    QVERIFY(same(handle.icon(), textBadge(QStringLiteral("text"))));
    handle.setTextMap({});
    QCOMPARE(handle.icon().cacheKey(), icon.cacheKey());
    handle.setTextMap({{{0, 100}, QStringLiteral("text")}});
    handle.setIconMap({});
    handle.give(Nubsie::enfValueBadge);
    QVERIFY(same(handle.icon(), valueBadge(QStringLiteral("3"))));
}

void TestNubsieDisplay::withABalloonTheImageIsKept()
{
    for (const auto feature : {Nubsie::enfBalloon, Nubsie::enfDateMode}) {
        Handle handle;
        handle.setFeatures(Features(Nubsie::enfValueBadge) | feature);
        handle.setNormalizedValue(0.5);
        handle.updateNubsie(true);
        QVERIFY(same(handle.icon(), valueBadge(QStringLiteral("3"))));
        handle.updateNubsie(false);
        QVERIFY(same(handle.icon(), valueBadge(QStringLiteral("50"))));
    }
    Handle handle;
    handle.setFeatures(Features(Nubsie::enfValueBadge) | Nubsie::enfRequestedBalloon);
    handle.setNormalizedValue(0.5);
    handle.updateNubsie(true);
    QVERIFY(same(handle.icon(), valueBadge(QStringLiteral("50"))));
}

void TestNubsieDisplay::manyDigitsMakeAPillAndOneDigitASquareAgain()
{
    Handle handle(nullptr, 9, 100000);
    handle.setSize(QSize(20, 20));
    handle.setDraggedSize(QSize(40, 40));
    handle.give(Nubsie::enfValueBadge);
    QCOMPARE(handle.getSize(), QSize(20, 20));
    const QSize badge = valueBadge(QStringLiteral("1000")).size();
    QVERIFY(badge.width() > badge.height());
    handle.setValue(1000);
    QCOMPARE(handle.getSize(), vx::NubsieMath::widened(QSize(20, 20), badge));
    QCOMPARE(handle.getDraggedSize(), vx::NubsieMath::widened(QSize(40, 40), badge));
    QCOMPARE(handle.getCurrentSize(), handle.getSize());
    QCOMPARE(handle.QWidget::size(), handle.getSize());
    QVERIFY(handle.getSize().width() > 20);
    // A longer number keeps the first pill.
    const QSize pill = handle.getSize();
    handle.setValue(10000);
    QCOMPARE(handle.getSize(), pill);
    handle.setValue(9);
    QCOMPARE(handle.getSize(), QSize(20, 20));
    QCOMPARE(handle.getDraggedSize(), QSize(40, 40));
    QCOMPARE(handle.getCurrentSize(), QSize(20, 20));
    QCOMPARE(handle.QWidget::size(), QSize(20, 20));
}

void TestNubsieDisplay::withoutADraggedSizeNothingIsFitted()
{
    Handle handle(nullptr, 1000, 1000);
    handle.setSize(QSize(20, 20));
    handle.give(Nubsie::enfValueBadge);
    QCOMPARE(handle.getSize(), QSize(20, 20));
    handle.setDraggedSize(QSize(40, 40));
    QVERIFY(handle.getSize().width() > 20);
    // Nor a text badge, however wide.
    Handle text;
    text.setSize(QSize(20, 20));
    text.setDraggedSize(QSize(40, 40));
    text.setTextMap({{{0, 100}, QStringLiteral("a long text")}});
    QCOMPARE(text.getSize(), QSize(20, 20));
}

void TestNubsieDisplay::aSizeResizesAboutThePoint()
{
    QWidget parent;
    auto* const handle = new Handle(&parent);
    handle->setPosition(QPointF(100, 50));
    QCOMPARE(handle->getPosition(), QPointF(100, 50));
    handle->setCurrentSize(QSize(20, 10));
    QCOMPARE(handle->geometry(), QRect(91, 46, 20, 10));
    handle->setCurrentSize(QSize(40, 40));
    QCOMPARE(handle->geometry(), QRect(81, 31, 40, 40));
    QCOMPARE(handle->getPosition(), QPointF(100, 50));
    handle->setPosition(QPointF(10.6, 20));
    QCOMPARE(handle->pos(), QPoint(-8, 1));
}

void TestNubsieDisplay::theSizeAtRestIsTakenAtOnce()
{
    Handle handle;
    handle.setSize(QSize(24, 26));
    QCOMPARE(handle.getSize(), QSize(24, 26));
    QCOMPARE(handle.getCurrentSize(), QSize(24, 26));
    QCOMPARE(handle.QWidget::size(), QSize(24, 26));
    handle.setDraggedSize(QSize(48, 50));
    QCOMPARE(handle.getDraggedSize(), QSize(48, 50));
    QCOMPARE(handle.getCurrentSize(), QSize(24, 26));
}

void TestNubsieDisplay::aHandleIsMaximizedAtItsDraggedSize()
{
    Handle handle;
    handle.setSize(QSize(24, 24));
    handle.setDraggedSize(QSize(48, 48));
    QVERIFY(!handle.isMaximized());
    handle.setCurrentSize(QSize(47, 48));
    QVERIFY(!handle.isMaximized());
    handle.setCurrentSize(QSize(48, 48));
    QVERIFY(handle.isMaximized());
    // Judged when the size is set, not when the other one changes.
    handle.setDraggedSize(QSize(60, 60));
    QVERIFY(handle.isMaximized());
}

void TestNubsieDisplay::growingTakesTheDraggedSize()
{
    Handle handle;
    handle.setSize(QSize(20, 20));
    handle.setDraggedSize(QSize(40, 44));
    handle.setCurrent();
    QPropertyAnimation* const animator = handle.sizeAnimator();
    QCOMPARE(animator->state(), QAbstractAnimation::Running);
    QCOMPARE(animator->duration(), 100);
    QCOMPARE(animator->easingCurve().type(), QEasingCurve::OutCirc);
    QCOMPARE(animator->endValue().toSize(), QSize(40, 44));
    QVERIFY(!animator->startValue().isValid());
    QTRY_COMPARE(handle.QWidget::size(), QSize(40, 44));
    QTRY_COMPARE(animator->state(), QAbstractAnimation::Stopped);
    QVERIFY(handle.isMaximized());
}

void TestNubsieDisplay::shrinkingTakesTheSizeAtRest()
{
    Handle handle;
    handle.setSize(QSize(20, 20));
    handle.setDraggedSize(QSize(40, 44));
    handle.setCurrentSize(QSize(40, 44));
    handle.resetSize();
    QPropertyAnimation* const animator = handle.sizeAnimator();
    QCOMPARE(animator->duration(), 250);
    QCOMPARE(animator->easingCurve().type(), QEasingCurve::OutCirc);
    QCOMPARE(animator->endValue().toSize(), QSize(20, 20));
    QTRY_COMPARE(animator->state(), QAbstractAnimation::Stopped);
    QCOMPARE(handle.QWidget::size(), QSize(20, 20));
    QVERIFY(!handle.isMaximized());
}

void TestNubsieDisplay::growingStopsTheSliding()
{
    Handle handle;
    handle.setSize(QSize(20, 20));
    handle.setDraggedSize(QSize(40, 40));
    handle.moveTo(QPointF(100, 0));
    handle.resetSize();
    QCOMPARE(handle.positionAnimator()->state(), QAbstractAnimation::Running);
    handle.setCurrent();
    QCOMPARE(handle.positionAnimator()->state(), QAbstractAnimation::Stopped);
}

void TestNubsieDisplay::movingSlidesToThePoint()
{
    Handle handle;
    handle.setSize(QSize(20, 20));
    handle.setPosition(QPointF(10, 10));
    handle.moveTo(QPointF(90, 30));
    QPropertyAnimation* const animator = handle.positionAnimator();
    QCOMPARE(animator->duration(), 500);
    QCOMPARE(animator->easingCurve().type(), QEasingCurve::OutCirc);
    QCOMPARE(animator->endValue().toPointF(), QPointF(90, 30));
    QCOMPARE(handle.getPosition(), QPointF(10, 10));
    QTRY_COMPARE(animator->state(), QAbstractAnimation::Stopped);
    QCOMPARE(handle.getPosition(), QPointF(90, 30));
    QCOMPARE(handle.pos(), QPoint(81, 21));
}

void TestNubsieDisplay::cancellingStopsWhereItIs()
{
    Handle handle;
    handle.setSize(QSize(20, 20));
    handle.setDraggedSize(QSize(40, 40));
    handle.setPosition(QPointF(10, 10));
    handle.setCurrent();
    handle.moveTo(QPointF(90, 30));
    QTRY_VERIFY(handle.getPosition() != QPointF(10, 10));
    handle.cancelAnimations();
    const QPointF position = handle.getPosition();
    QCOMPARE(handle.sizeAnimator()->state(), QAbstractAnimation::Stopped);
    QCOMPARE(handle.positionAnimator()->state(), QAbstractAnimation::Stopped);
    QCOMPARE(handle.QWidget::size(), QSize(20, 20));
    QVERIFY(position != QPointF(90, 30));
    QCOMPARE(handle.pos(), vx::NubsieMath::topLeft(position, QSize(20, 20)));
}

void TestNubsieDisplay::settingAValueEndsAllAnimations()
{
    Handle handle;
    handle.setSize(QSize(20, 20));
    handle.setDraggedSize(QSize(40, 40));
    handle.setCurrentSize(QSize(40, 40));
    handle.moveTo(QPointF(90, 30));
    handle.resetSize();
    handle.setValue(5);
    QCOMPARE(handle.sizeAnimator()->state(), QAbstractAnimation::Stopped);
    QCOMPARE(handle.positionAnimator()->state(), QAbstractAnimation::Stopped);
    QCOMPARE(handle.QWidget::size(), QSize(20, 20));
}

void TestNubsieDisplay::theGlowPulses()
{
    Handle handle;
    handle.startBlinking(100);
    QVERIFY(handle.isBlinking());
    // Up, down and up again: it goes on after the first pulse.
    QTRY_VERIFY(handle.getGlowOpacity() > 0.6);
    QTRY_VERIFY(handle.getGlowOpacity() < 0.4);
    QTRY_VERIFY(handle.getGlowOpacity() > 0.6);
    handle.stopBlinking();
    QVERIFY(!handle.isBlinking());
    QCOMPARE(handle.getGlowOpacity(), 0.0);
}

void TestNubsieDisplay::aPulseHasItsDefaultDurationAgainAfterTheEnd()
{
    Handle handle;
    handle.startBlinking(400);
    handle.stopBlinking();
    QElapsedTimer time;
    time.start();
    handle.startBlinking();
    QTRY_VERIFY(handle.getGlowOpacity() > 0.98);
    // The peak is at half of 1500 ms; of 400 ms it would have come long before.
    QVERIFY2(time.elapsed() >= 600, qPrintable(QString::number(time.elapsed())));
}

void TestNubsieDisplay::noDurationKeepsThePresentOne()
{
    Handle handle;
    QElapsedTimer time;
    time.start();
    handle.startBlinking(-400);
    QTRY_VERIFY(handle.getGlowOpacity() > 0.98);
    QVERIFY2(time.elapsed() >= 600, qPrintable(QString::number(time.elapsed())));
}

void TestNubsieDisplay::stoppingTheGlowRepaintsNothing()
{
    Scene scene;
    scene.handle->startBlinking(100);
    QTRY_VERIFY(scene.handle->paints > 2);
    scene.handle->stopBlinking();
    // What was asked for before the end is still to come.
    scene.settle();
    scene.handle->stopBlinking();
    scene.handle->setGlowOpacity(0.7);
    QCoreApplication::processEvents();
    QCOMPARE(scene.handle->paints, 0);
}

void TestNubsieDisplay::theGlowIsDrawnOverTheIcon()
{
    Handle handle;
    handle.setSize(QSize(50, 50));
    handle.setIcon(picture(Qt::black));
    QVERIFY(isColor(painted(handle, Qt::black), QPoint(25, 12), Qt::black));
    handle.setGlowOpacity(1.0);
    const int full = painted(handle, Qt::black).pixelColor(25, 12).value();
    QVERIFY(full > 60);
    handle.setGlowOpacity(0.5);
    const int half = painted(handle, Qt::black).pixelColor(25, 12).value();
    QVERIFY2(qAbs(half - full / 2) <= 6, qPrintable(QStringLiteral("%1 of %2").arg(half).arg(full)));
    // Its own opacity counts alone, and the painter gets its own back.
    QImage image(50, 50, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::black);
    QPainter painter(&image);
    painter.setOpacity(0.25);
    handle.draw(painter);
    QCOMPARE(painter.opacity(), 0.25);
    painter.end();
    QVERIFY(qAbs(image.pixelColor(25, 12).value() - half) <= 2);
}

void TestNubsieDisplay::aDisabledHandleIsHalfTransparent()
{
    Handle handle;
    handle.setSize(QSize(40, 40));
    handle.setIcon(picture(Qt::black));
    QVERIFY(isColor(painted(handle), QPoint(20, 20), Qt::black));
    handle.setEnabled(false);
    QVERIFY(isColor(painted(handle), QPoint(20, 20), QColor(127, 127, 127)));
}

void TestNubsieDisplay::aStyleSheetDressesTheHandle()
{
    Handle handle;
    handle.setSize(QSize(40, 40));
    handle.setIcon(picture(Qt::blue));
    handle.setStyleSheet(QStringLiteral("#handle { border: 4px solid rgb(0, 255, 0); background: transparent; }"));
    const QImage image = painted(handle);
    QVERIFY(isColor(image, QPoint(1, 20), Qt::green));
    QVERIFY(isColor(image, QPoint(20, 20), Qt::blue));
}

void TestNubsieDisplay::aHandleThatShouldNotShowIsNotPainted()
{
    Scene scene;
    scene.handle->setIcon(picture(Qt::blue));
    scene.handle->setExternallyVisible(false);
    QVERIFY(!scene.handle->externallyVisible());
    QVERIFY(scene.handle->isVisible());
    QVERIFY(isColor(painted(*scene.handle), QPoint(20, 20), Qt::white));
    scene.handle->setExternallyVisible(true);
    QVERIFY(isColor(painted(*scene.handle), QPoint(20, 20), Qt::blue));
}

void TestNubsieDisplay::aHandleThatShouldNotShowCannotBeShown()
{
    Scene scene;
    scene.handle->hide();
    scene.handle->setExternallyVisible(false);
    scene.handle->show();
    QVERIFY(!scene.handle->isVisible());
    scene.handle->setVisible(true);
    QVERIFY(!scene.handle->isVisible());
    // Without a slider the wish alone shows nothing.
    scene.handle->setExternallyVisible(true);
    QVERIFY(!scene.handle->isVisible());
    scene.handle->show();
    QVERIFY(scene.handle->isVisible());
}

void TestNubsieDisplay::hidingAlwaysWorks()
{
    Scene scene;
    scene.handle->setExternallyVisible(false);
    scene.handle->setVisible(false);
    QVERIFY(!scene.handle->isVisible());
}

void TestNubsieDisplay::aHandleAtRestIsClipped()
{
    Scene scene;
    QWidget clip(&scene.window);
    clip.setGeometry(0, 0, 100, 50);
    clip.show();
    scene.handle->raise();
    scene.handle->setIcon(picture(Qt::blue));
    scene.handle->setClipWidget(&clip);
    // The handle lies at 80, 30: its right half and its lower half are outside.
    const QImage image = scene.window.grab().toImage();
    QVERIFY(isColor(image, QPoint(85, 35), Qt::blue));
    QVERIFY(isColor(image, QPoint(99, 49), Qt::blue));
    QVERIFY(!isColor(image, QPoint(101, 40), Qt::blue));
    QVERIFY(!isColor(image, QPoint(90, 51), Qt::blue));
}

void TestNubsieDisplay::aHandleWithAStateOrMaximizedIsNotClipped()
{
    Scene scene;
    QWidget clip(&scene.window);
    clip.setGeometry(0, 0, 100, 50);
    clip.show();
    scene.handle->raise();
    scene.handle->setIcon(picture(Qt::blue));
    scene.handle->setClipWidget(&clip);
    QVERIFY(!isColor(scene.window.grab().toImage(), QPoint(110, 60), Qt::blue));
    scene.handle->setState(QFlags<Nubsie::ENubsieState>(QFlag(2)));
    QVERIFY(isColor(scene.window.grab().toImage(), QPoint(110, 60), Qt::blue));
    scene.handle->setState(Nubsie::ensNone);
    QVERIFY(!isColor(scene.window.grab().toImage(), QPoint(110, 60), Qt::blue));
    scene.handle->setDraggedSize(QSize(40, 40));
    scene.handle->setCurrentSize(QSize(40, 40));
    QVERIFY(scene.handle->isMaximized());
    QVERIFY(isColor(scene.window.grab().toImage(), QPoint(110, 60), Qt::blue));
}

void TestNubsieDisplay::aDeadClipWidgetClipsNothing()
{
    Scene scene;
    scene.handle->setIcon(picture(Qt::blue));
    auto* const clip = new QWidget(&scene.window);
    scene.handle->setClipWidget(clip);
    delete clip;
    QVERIFY(isColor(scene.window.grab().toImage(), QPoint(110, 60), Qt::blue));
}

ZELKOV_TEST_MAIN(TestNubsieDisplay)
#include "tst_nubsiedisplay.moc"
