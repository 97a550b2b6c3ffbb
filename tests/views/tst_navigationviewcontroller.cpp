// SPDX-License-Identifier: MIT
// Pages that slide: the order of their signals, where they stand, and slides over slides.
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "views/NavigationViewController.h"
#include "views/WidgetSlideshow.h"

#include <QtCore/QElapsedTimer>
#include <QtCore/QPointer>
#include <QtCore/QRandomGenerator>
#include <QtCore/QTimer>
#include <QtTest/QtTest>

#include <memory>

using vx::NavigationViewController;
using vx::WidgetSlideshow;
using zelkovtest::SignalRecorder;

namespace
{
QString word(const char* text)
{
    return QString::fromLatin1(text);
}

/// "viewWillAppear(b,animated)" for each recorded signal; pages are known by their object names.
QStringList told(const SignalRecorder& recorder)
{
    QStringList result;
    for (const auto& entry : recorder.entries()) {
        const QWidget* const page = entry.arguments.at(0).value<QWidget*>();
        result << QStringLiteral("%1(%2%3)")
                      .arg(entry.name, page ? page->objectName() : word("null"),
                          entry.arguments.at(1).toBool() ? word(",animated") : QString());
    }
    return result;
}

QStringList list(const char* text)
{
    return QString::fromLatin1(text).split(QLatin1Char(' '));
}

QWidget* newPage(const char* name)
{
    auto* const page = new QWidget;
    page->setObjectName(word(name));
    return page;
}

struct Stack
{
    explicit Stack(int duration = 60)
        : pages(duration, QEasingCurve::Linear)
    {
        pages.resize(300, 200);
        for (const char* name : {"a", "b", "c"}) {
            pages.addWidget(newPage(name));
        }
        pages.show();
        if (!QTest::qWaitForWindowExposed(&pages)) {
            qFatal("no window");
        }
        recorder.add(&pages);
    }

    void waitForEnds(int count)
    {
        QTRY_COMPARE(recorder.count(word("viewDidDisappear")), count);
        QCoreApplication::processEvents();
    }

    QStringList visible() const
    {
        QStringList result;
        for (int i = 0; i < pages.count(); ++i) {
            if (pages.widget(i)->isVisible()) {
                result << pages.widget(i)->objectName();
            }
        }
        return result;
    }

    NavigationViewController pages;
    SignalRecorder recorder;
};
}

class TestNavigationViewController : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { qRegisterMetaType<QWidget*>(); }

    void theFirstPageAppearsAndTheSecondSaysNothing();
    void nullIsNoPage();
    void aStillChangeTellsBothPages();
    void aStillChangeToTheCurrentPageSaysNothing();
    void anIndexOutOfRangeChangesNothing();
    void aSlideTellsBothPagesTwice();
    void aSlideRunsFromTheSideOfThePage_data();
    void aSlideRunsFromTheSideOfThePage();
    void theIndexChangesAtTheEndOnly();
    void aSlideToTheCurrentPageOnlyAppears();
    void aSlideOutOfRangeAppearsNowhere();
    void theDefaultIsALinearFifthOfASecond();
    void theCurveIsThatOfBothPages();
    void withoutTimeASlideEndsAtOnce();
    void aPageThatSlidAwayComesBackInPlace();
    void theStackMayBeResizedInMidSlide();
    void aSlideOverASlideTakesOver();
    void slidesWithoutACommonPageBothEnd();
    void backAndForthLeavesOnePageInPlace();
    void manySlidesAtOnceEndOnOnePage();
    void thePagesMayDieInMidSlide_data();
    void thePagesMayDieInMidSlide();
    void theStackMayDieInMidSlide();
    void aPageMayBeRemovedInMidSlide();
    void slotsMayDeleteAnything_data();
    void slotsMayDeleteAnything();

    void aSlideshowMovesOnByItself();
    void aSlideshowStartsOverAfterTheLastPage();
    void aSlideshowOfOnePageStaysOnIt();
    void aSlideshowOfNoPageDoesNothing();
    void theSlideshowsTimerIsAChildOfFiveSeconds();
    void showPreviousItemDoesNothing();
};

void TestNavigationViewController::theFirstPageAppearsAndTheSecondSaysNothing()
{
    NavigationViewController pages;
    SignalRecorder recorder(&pages);
    QVector<int> counts;
    connect(&pages, &NavigationViewController::viewWillAppear, this, [&] { counts << pages.count(); });
    connect(&pages, &NavigationViewController::viewDidAppear, this, [&] { counts << pages.count(); });
    pages.addWidget(newPage("a"));
    QCOMPARE(told(recorder), list("viewWillAppear(a) viewDidAppear(a)"));
    QCOMPARE(counts, (QVector<int> {0, 1}));
    pages.addWidget(newPage("b"));
    QCOMPARE(recorder.entries().size(), 2);
    QCOMPARE(pages.currentIndex(), 0);
    QCOMPARE(pages.animatedIndex(), -1);
    QCOMPARE(pages.animatedWidget(), pages.widget(0));
}

void TestNavigationViewController::nullIsNoPage()
{
    NavigationViewController pages;
    SignalRecorder recorder(&pages);
    pages.addWidget(nullptr);
    QCOMPARE(pages.count(), 0);
    QCOMPARE(recorder.entries().size(), 0);
    QVERIFY(!pages.animatedWidget());
}

void TestNavigationViewController::aStillChangeTellsBothPages()
{
    Stack stack;
    QVector<int> indexes;
    connect(&stack.pages, &NavigationViewController::viewWillAppear, this,
        [&] { indexes << stack.pages.currentIndex(); });
    connect(&stack.pages, &NavigationViewController::viewDidDisappear, this,
        [&] { indexes << stack.pages.currentIndex(); });
    stack.pages.setCurrentIndex(2);
    QCOMPARE(
        told(stack.recorder), list("viewWillDisappear(a) viewWillAppear(c) viewDidDisappear(a) viewDidAppear(c)"));
    QCOMPARE(indexes, (QVector<int> {0, 2}));
    QCOMPARE(stack.visible(), list("c"));
    QCOMPARE(stack.pages.animatedIndex(), -1);
}

void TestNavigationViewController::aStillChangeToTheCurrentPageSaysNothing()
{
    Stack stack;
    stack.pages.setCurrentIndex(0);
    QCOMPARE(stack.recorder.entries().size(), 0);
}

void TestNavigationViewController::anIndexOutOfRangeChangesNothing()
{
    Stack stack;
    for (const int index : {3, -1, 99}) {
        stack.recorder.clear();
        stack.pages.setCurrentIndex(index);
        QCOMPARE(told(stack.recorder),
            list("viewWillDisappear(a) viewWillAppear(null) viewDidDisappear(a) viewDidAppear(null)"));
        QCOMPARE(stack.pages.currentIndex(), 0);
        QCOMPARE(stack.visible(), list("a"));
    }
}

void TestNavigationViewController::aSlideTellsBothPagesTwice()
{
    Stack stack;
    stack.pages.setCurrentIndexWithAnimation(1);
    QCOMPARE(told(stack.recorder), list("viewWillDisappear(a,animated) viewWillAppear(b,animated)"));
    stack.recorder.clear();
    stack.waitForEnds(1);
    QCOMPARE(told(stack.recorder), list("viewDidDisappear(a,animated) viewDidAppear(b,animated)"));
    QCOMPARE(stack.visible(), list("b"));
}

void TestNavigationViewController::aSlideRunsFromTheSideOfThePage_data()
{
    QTest::addColumn<int>("from");
    QTest::addColumn<int>("to");
    QTest::addColumn<int>("side");
    QTest::newRow("forward") << 0 << 1 << 1;
    QTest::newRow("forward over one") << 0 << 2 << 1;
    QTest::newRow("back") << 2 << 1 << -1;
    QTest::newRow("back over one") << 2 << 0 << -1;
}

void TestNavigationViewController::aSlideRunsFromTheSideOfThePage()
{
    QFETCH(int, from);
    QFETCH(int, to);
    QFETCH(int, side);
    Stack stack(200);
    stack.pages.setCurrentIndex(from);
    QCoreApplication::processEvents();
    QWidget* const old = stack.pages.widget(from);
    QWidget* const next = stack.pages.widget(to);
    stack.recorder.clear();
    stack.pages.setCurrentIndexWithAnimation(to);
    QVERIFY(old->isVisible());
    QVERIFY(next->isVisible());
    QCOMPARE(next->size(), old->size());
    QCOMPARE(old->x(), 0);
    QCOMPARE(next->x(), side * 300);
    QVERIFY(stack.pages.children().last() == next);
    // Side by side all the way.
    int steps = 0;
    while (stack.recorder.count(word("viewDidAppear")) == 0) {
        QTest::qWait(5);
        if (stack.recorder.count(word("viewDidAppear")) == 0) {
            QVERIFY2(
                qAbs(next->x() - old->x() - side * 300) <= 1, qPrintable(QString::number(next->x() - old->x())));
            QVERIFY(qAbs(next->x()) <= 300 && qAbs(old->x()) <= 300);
            ++steps;
        }
    }
    QVERIFY(steps > 1);
    QCoreApplication::processEvents();
    QCOMPARE(next->geometry(), stack.pages.rect());
    QVERIFY(old->isHidden());
}

void TestNavigationViewController::theIndexChangesAtTheEndOnly()
{
    Stack stack;
    stack.pages.setCurrentIndexWithAnimation(2);
    QCOMPARE(stack.pages.currentIndex(), 0);
    QCOMPARE(stack.pages.animatedIndex(), 2);
    QCOMPARE(stack.pages.animatedWidget(), stack.pages.widget(2));
    QVector<int> seen;
    connect(&stack.pages, &NavigationViewController::viewDidDisappear, this,
        [&] { seen << stack.pages.currentIndex() << stack.pages.animatedIndex(); });
    stack.waitForEnds(1);
    QCOMPARE(seen, (QVector<int> {2, -1}));
    QCOMPARE(stack.pages.animatedWidget(), stack.pages.widget(2));
}

void TestNavigationViewController::aSlideToTheCurrentPageOnlyAppears()
{
    Stack stack;
    stack.pages.setCurrentIndexWithAnimation(0);
    QCOMPARE(told(stack.recorder), list("viewWillAppear(a) viewDidAppear(a)"));
    // The index stays as it was asked for.
    QCOMPARE(stack.pages.animatedIndex(), 0);
}

void TestNavigationViewController::aSlideOutOfRangeAppearsNowhere()
{
    Stack stack;
    for (const int index : {3, -1}) {
        stack.recorder.clear();
        stack.pages.setCurrentIndexWithAnimation(index);
        QCOMPARE(told(stack.recorder), list("viewWillAppear(null) viewDidAppear(null)"));
        QCOMPARE(stack.pages.animatedIndex(), index);
        QCOMPARE(stack.pages.animatedWidget(), stack.pages.widget(0));
    }
    NavigationViewController empty;
    empty.setCurrentIndexWithAnimation(0);
    QCOMPARE(empty.currentIndex(), -1);
}

void TestNavigationViewController::theDefaultIsALinearFifthOfASecond()
{
    NavigationViewController pages;
    pages.resize(300, 200);
    pages.addWidget(newPage("a"));
    pages.addWidget(newPage("b"));
    pages.show();
    SignalRecorder recorder(&pages);
    QElapsedTimer clock;
    clock.start();
    pages.setCurrentIndexWithAnimation(1);
    QTRY_COMPARE(recorder.count(word("viewDidAppear")), 1);
    QVERIFY2(clock.elapsed() >= 195, qPrintable(QString::number(clock.elapsed())));
}

void TestNavigationViewController::theCurveIsThatOfBothPages()
{
    // A curve that is at its end from the start on.
    QEasingCurve jump;
    jump.setCustomType([](qreal) { return 1.0; });
    NavigationViewController pages(100, jump);
    pages.resize(300, 200);
    pages.addWidget(newPage("a"));
    pages.addWidget(newPage("b"));
    pages.show();
    SignalRecorder recorder(&pages);
    pages.setCurrentIndexWithAnimation(1);
    QCOMPARE(pages.widget(1)->x(), 0);
    QCOMPARE(pages.widget(0)->x(), -300);
    QTRY_COMPARE(recorder.count(word("viewDidAppear")), 1);
}

void TestNavigationViewController::withoutTimeASlideEndsAtOnce()
{
    for (const int duration : {0, -5}) {
        Stack stack(duration);
        stack.pages.setCurrentIndexWithAnimation(1);
        QCOMPARE(told(stack.recorder),
            list("viewWillDisappear(a,animated) viewWillAppear(b,animated) viewDidDisappear(a,animated) "
                 "viewDidAppear(b,animated)"));
        QCOMPARE(stack.pages.currentIndex(), 1);
    }
}

void TestNavigationViewController::aPageThatSlidAwayComesBackInPlace()
{
    Stack stack;
    stack.pages.setCurrentIndexWithAnimation(1);
    stack.waitForEnds(1);
    QVERIFY(stack.pages.widget(0)->x() != 0);
    stack.pages.setCurrentIndex(0);
    QCoreApplication::processEvents();
    QCOMPARE(stack.visible(), list("a"));
    QCOMPARE(stack.pages.widget(0)->geometry(), stack.pages.rect());
}

void TestNavigationViewController::theStackMayBeResizedInMidSlide()
{
    Stack stack(200);
    stack.pages.setCurrentIndexWithAnimation(1);
    QTest::qWait(60);
    stack.pages.resize(420, 260);
    stack.waitForEnds(1);
    QTRY_COMPARE(stack.pages.widget(1)->geometry(), QRect(0, 0, 420, 260));
    QCOMPARE(stack.visible(), list("b"));
}

void TestNavigationViewController::aSlideOverASlideTakesOver()
{
    Stack stack(150);
    stack.pages.setCurrentIndexWithAnimation(1);
    QTest::qWait(60);
    stack.pages.setCurrentIndexWithAnimation(2);
    QCOMPARE(stack.pages.animatedIndex(), 2);
    stack.recorder.clear();
    stack.waitForEnds(1);
    QTest::qWait(200);
    QCOMPARE(told(stack.recorder), list("viewDidDisappear(a,animated) viewDidAppear(c,animated)"));
    QCOMPARE(stack.pages.currentIndex(), 2);
    QCOMPARE(stack.pages.animatedIndex(), -1);
    QCOMPARE(stack.visible(), list("c"));
    QCOMPARE(stack.pages.widget(2)->geometry(), stack.pages.rect());
}

void TestNavigationViewController::slidesWithoutACommonPageBothEnd()
{
    Stack stack(300);
    stack.pages.addWidget(newPage("d"));
    stack.pages.setCurrentIndexWithAnimation(1);
    QTest::qWait(150);
    stack.pages.setCurrentIndex(2);
    stack.pages.setCurrentIndexWithAnimation(3);
    stack.recorder.clear();
    // The end of the first slide changes to the target of the second.
    QVERIFY(QSignalSpy(&stack.pages, &NavigationViewController::viewDidAppear).wait());
    QCOMPARE(stack.recorder.count(word("viewDidDisappear")), 1);
    QCOMPARE(stack.pages.currentIndex(), 3);
    QCOMPARE(stack.pages.animatedIndex(), -1);
    QCOMPARE(stack.visible(), list("d"));
    stack.waitForEnds(2);
    QCOMPARE(told(stack.recorder),
        list("viewDidDisappear(c,animated) viewDidAppear(d,animated) viewDidDisappear(d,animated)"));
    QCOMPARE(stack.pages.currentIndex(), 3);
    QCOMPARE(stack.visible(), list("d"));
    QCOMPARE(stack.pages.widget(3)->geometry(), stack.pages.rect());
}

void TestNavigationViewController::backAndForthLeavesOnePageInPlace()
{
    Stack stack(120);
    stack.pages.setCurrentIndexWithAnimation(1);
    QTest::qWait(50);
    // Back to where the slide started: nothing slides, and the running slide ends there.
    stack.pages.setCurrentIndexWithAnimation(0);
    stack.waitForEnds(1);
    QCOMPARE(stack.pages.currentIndex(), 0);
    QCOMPARE(stack.visible(), list("a"));
    QTRY_COMPARE(stack.pages.widget(0)->geometry(), stack.pages.rect());
}

void TestNavigationViewController::manySlidesAtOnceEndOnOnePage()
{
    Stack stack(80);
    QRandomGenerator random(54);
    for (int i = 0; i < 60; ++i) {
        const int target = random.bounded(-1, 4);
        if (random.bounded(3) == 0) {
            stack.pages.setCurrentIndex(target);
        } else {
            stack.pages.setCurrentIndexWithAnimation(target);
        }
        QTest::qWait(random.bounded(25));
    }
    QTest::qWait(200);
    QCOMPARE(stack.visible().size(), 1);
    QVERIFY(stack.pages.currentWidget()->isVisible());
    QCOMPARE(stack.pages.currentWidget()->size(), stack.pages.size());
}

void TestNavigationViewController::thePagesMayDieInMidSlide_data()
{
    QTest::addColumn<int>("victim");
    QTest::newRow("the old one") << 0;
    QTest::newRow("the next one") << 1;
    QTest::newRow("another one") << 2;
}

void TestNavigationViewController::thePagesMayDieInMidSlide()
{
    QFETCH(int, victim);
    Stack stack(100);
    stack.pages.setCurrentIndexWithAnimation(1);
    QTest::qWait(30);
    delete stack.pages.widget(victim);
    QTest::qWait(200);
    QCOMPARE(stack.pages.count(), 2);
    QVERIFY(stack.pages.currentWidget()->isVisible());
    QCOMPARE(stack.visible().size(), 1);
}

void TestNavigationViewController::theStackMayDieInMidSlide()
{
    auto stack = std::make_unique<Stack>(100);
    stack->pages.setCurrentIndexWithAnimation(1);
    QTest::qWait(30);
    stack.reset();
    QTest::qWait(120);
}

void TestNavigationViewController::aPageMayBeRemovedInMidSlide()
{
    Stack stack(100);
    stack.pages.setCurrentIndexWithAnimation(2);
    const std::unique_ptr<QWidget> page(stack.pages.widget(2));
    stack.pages.removeWidget(page.get());
    QTest::qWait(200);
    QCOMPARE(stack.pages.currentIndex(), 0);
    QCOMPARE(stack.visible(), list("a"));
    page->setParent(nullptr);
}

void TestNavigationViewController::slotsMayDeleteAnything_data()
{
    QTest::addColumn<int>("nth");
    QTest::addColumn<int>("victim");
    QTest::addColumn<bool>("animated");
    for (const bool animated : {true, false}) {
        for (int nth = 1; nth <= 4; ++nth) {
            for (int victim = 0; victim < 3; ++victim) {
                QTest::addRow("%d %d %d", nth, victim, animated) << nth << victim << animated;
            }
        }
    }
}

void TestNavigationViewController::slotsMayDeleteAnything()
{
    QFETCH(int, nth);
    QFETCH(int, victim);
    QFETCH(bool, animated);
    auto* const pages = new NavigationViewController(20, QEasingCurve::Linear);
    pages->resize(100, 100);
    pages->addWidget(newPage("a"));
    pages->addWidget(newPage("b"));
    pages->show();
    const QPointer<NavigationViewController> alive(pages);
    const QPointer<QWidget> doomed(victim == 0 ? pages : pages->widget(victim - 1));
    int left = nth;
    const auto die = [&] {
        if (--left == 0) {
            delete doomed;
        }
    };
    connect(pages, &NavigationViewController::viewWillAppear, this, die);
    connect(pages, &NavigationViewController::viewDidAppear, this, die);
    connect(pages, &NavigationViewController::viewWillDisappear, this, die);
    connect(pages, &NavigationViewController::viewDidDisappear, this, die);
    if (animated) {
        pages->setCurrentIndexWithAnimation(1);
    } else {
        pages->setCurrentIndex(1);
    }
    QTest::qWait(60);
    delete alive;
}

void TestNavigationViewController::aSlideshowMovesOnByItself()
{
    WidgetSlideshow show({newPage("a"), newPage("b")});
    show.resize(200, 100);
    show.show();
    SignalRecorder recorder(&show);
    QElapsedTimer clock;
    clock.start();
    auto* const timer = show.findChild<QTimer*>(QString(), Qt::FindDirectChildrenOnly);
    // Once, and sooner.
    timer->setSingleShot(true);
    timer->start(50);
    QTRY_COMPARE(show.currentIndex(), 1);
    QVERIFY2(clock.elapsed() >= 790, qPrintable(QString::number(clock.elapsed())));
    QCOMPARE(told(recorder),
        list("viewWillDisappear(a,animated) viewWillAppear(b,animated) viewDidDisappear(a,animated) "
             "viewDidAppear(b,animated)"));
}

void TestNavigationViewController::aSlideshowStartsOverAfterTheLastPage()
{
    WidgetSlideshow show({newPage("a"), newPage("b"), newPage("c")});
    show.setCurrentIndex(2);
    SignalRecorder recorder(&show);
    QVERIFY(QMetaObject::invokeMethod(&show, "showNextItem", Qt::DirectConnection));
    QCOMPARE(show.animatedIndex(), 0);
    QCOMPARE(told(recorder), list("viewWillDisappear(c,animated) viewWillAppear(a,animated)"));
}

void TestNavigationViewController::aSlideshowOfOnePageStaysOnIt()
{
    WidgetSlideshow show({newPage("a")});
    SignalRecorder recorder(&show);
    QVERIFY(QMetaObject::invokeMethod(&show, "showNextItem", Qt::DirectConnection));
    QCOMPARE(told(recorder), list("viewWillAppear(a) viewDidAppear(a)"));
    QCOMPARE(show.currentIndex(), 0);
}

void TestNavigationViewController::aSlideshowOfNoPageDoesNothing()
{
    WidgetSlideshow show({});
    SignalRecorder recorder(&show);
    QVERIFY(QMetaObject::invokeMethod(&show, "showNextItem", Qt::DirectConnection));
    QCOMPARE(told(recorder), QStringList());
    QCOMPARE(show.count(), 0);
}

void TestNavigationViewController::theSlideshowsTimerIsAChildOfFiveSeconds()
{
    WidgetSlideshow show({newPage("a"), newPage("b")});
    const auto* const timer = show.findChild<QTimer*>(QString(), Qt::FindDirectChildrenOnly);
    QVERIFY(timer);
    QCOMPARE(timer->interval(), 5000);
    QVERIFY(timer->isActive());
    QVERIFY(!timer->isSingleShot());
}

void TestNavigationViewController::showPreviousItemDoesNothing()
{
    WidgetSlideshow show({newPage("a"), newPage("b")});
    SignalRecorder recorder(&show);
    QVERIFY(QMetaObject::invokeMethod(&show, "showPreviousItem", Qt::DirectConnection));
    QCOMPARE(told(recorder), QStringList());
    QCOMPARE(show.currentIndex(), 0);
}

ZELKOV_TEST_MAIN(TestNavigationViewController)
#include "tst_navigationviewcontroller.moc"
