// SPDX-License-Identifier: MIT
// The transient sign over a widget.
#include "indicators/IconOverlayView.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QElapsedTimer>
#include <QtGui/QMouseEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QLabel>
#include <QtWidgets/QVBoxLayout>

namespace
{
using View = vx::IconOverlayView;

class Ground : public QWidget
{
public:
    int m_presses = 0;

protected:
    void mousePressEvent(QMouseEvent*) override { ++m_presses; }
};

QLabel* textLabel(const QSize& size, QWidget* parent)
{
    auto* const label = new QLabel(QStringLiteral("!"), parent);
    label->setFixedSize(size);
    return label;
}
}

class TestIconOverlay : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theNumbersStand()
    {
        QCOMPARE(int(View::eatGeometry), 0);
        QCOMPARE(int(View::eatOpacity), 1);
        QCOMPARE(int(View::sDefaultIconShowTime), 1000);
        QCOMPARE(int(View::sDefaultTextShowTime), 2000);
    }

    void itCoversItsParentAndTakesTheContent()
    {
        QWidget window;
        window.resize(300, 200);
        window.show();
        auto* const label = textLabel(QSize(30, 30), &window);
        auto* const view = new View(label, &window);
        QCOMPARE(view->geometry(), window.rect());
        QCOMPARE(label->parentWidget(), view);
        QVERIFY(view->isVisible()); // it fits
        window.resize(400, 250);
        QTRY_COMPARE(view->geometry(), window.rect());
    }

    void aSignThatDoesNotFitStaysAwayUntilThereIsRoom()
    {
        QWidget window;
        window.resize(100, 100);
        window.show();
        auto* const view = new View(textLabel(QSize(101, 20), &window), &window);
        QVERIFY(view->isHidden());
        view->showIcon();
        QVERIFY(view->isHidden());
        window.resize(101, 100);
        QTRY_VERIFY(view->isVisible());
        window.resize(100, 100);
        QTRY_VERIFY(view->isHidden());
    }

    void aShownIconStays()
    {
        QWidget window;
        window.resize(100, 100);
        window.show();
        auto* const view = new View(textLabel(QSize(20, 20), &window), &window);
        view->hide();
        view->showIcon();
        QVERIFY(view->isVisible());
        QTest::qWait(50);
        QVERIFY(view->isVisible());
        QVERIFY(!view->testAttribute(Qt::WA_DontShowOnScreen));
    }

    void hiddenNowItGoesAndIsNotOnTheScreen()
    {
        QWidget window;
        window.resize(100, 100);
        window.show();
        auto* const label = textLabel(QSize(20, 20), &window);
        QPointer<View> view(new View(label, &window));
        view->showIcon();
        view->hideIconNow();
        QVERIFY(view->testAttribute(Qt::WA_DontShowOnScreen));
        QTRY_VERIFY(view->isHidden());
        QVERIFY(label->isHidden());
        QVERIFY(view); // its owner's
    }

    void theStayIsTwiceHalfTheTime()
    {
        QWidget window;
        window.resize(100, 100);
        window.show();
        auto* const view = new View(textLabel(QSize(20, 20), &window), &window);
        QElapsedTimer clock;
        clock.start();
        view->showIconFor(401); // 200 there, 200 back
        QTRY_VERIFY_WITH_TIMEOUT(view->isHidden(), 5000);
        QVERIFY2(clock.elapsed() >= 395, qPrintable(QString::number(clock.elapsed())));
        QVERIFY(view->testAttribute(Qt::WA_DontShowOnScreen));
        view->showIconFor(20);
        QVERIFY(!view->testAttribute(Qt::WA_DontShowOnScreen));
        QTRY_VERIFY(view->isHidden());
    }

    void theContentGrowsFromTheCentrePixel()
    {
        QWidget window;
        window.resize(100, 100);
        window.show();
        auto* const label = new QLabel(QStringLiteral("!"), &window);
        auto* const view = new View(label, &window);
        view->showIconFor(2000);
        QCOMPARE(label->geometry(), QRect(49, 49, 1, 1));
        QTRY_VERIFY(label->width() > 50);
        view->hideIconNow();
        QCOMPARE(label->geometry(), QRect(-1, -1, 101, 101));
    }

    void aNamedIconIsANewLabel()
    {
        QWidget window;
        window.resize(100, 100);
        window.show();
        auto* const label = textLabel(QSize(20, 20), &window);
        auto* const view = new View(label, &window);
        view->showIcon(QStringLiteral("snapshotTaken"));
        auto* const added = view->findChild<QLabel*>(QStringLiteral("snapshotTaken"));
        QVERIFY(added);
        QCOMPARE(added->parentWidget(), view);
        QCOMPARE(view->layout()->indexOf(added), -1); // not in the layout
        QVERIFY(added->isVisible());
        QCOMPARE(label->parentWidget(), view); // the old one stays
        QTRY_VERIFY_WITH_TIMEOUT(view->isHidden(), 5000);
        QVERIFY(added->isHidden());
        QVERIFY(!label->isHidden());
    }

    void theStaticFunctionsMakeRunAndDelete_data()
    {
        QTest::addColumn<int>("which");
        QTest::addColumn<int>("atLeast");
        QTest::newRow("icon") << 0 << 980;
        QTest::newRow("text") << 1 << 1980;
        QTest::newRow("text and icon") << 2 << 1980;
    }
    void theStaticFunctionsMakeRunAndDelete()
    {
        QFETCH(int, which);
        QFETCH(int, atLeast);
        QWidget window;
        window.resize(200, 200);
        window.show();
        const QString name = QStringLiteral("sign");
        QElapsedTimer clock;
        clock.start();
        QPointer<View> view;
        switch (which) {
        case 0: view = View::showIcon(&window, name, true); break;
        case 1: view = View::showText(&window, QStringLiteral("Saved"), name, true); break;
        default: view = View::showTextAndIcon(&window, QStringLiteral("Saved"), name, true); break;
        }
        QVERIFY(view);
        QVERIFY(view->isVisible());
        QVERIFY(view->findChild<QLabel*>(name));
        QTRY_VERIFY_WITH_TIMEOUT(!view, 8000);
        QVERIFY2(clock.elapsed() >= atLeast, qPrintable(QString::number(clock.elapsed())));
    }

    void withoutTheWishThereIsNoPointer()
    {
        QWidget window;
        window.resize(200, 200);
        window.show();
        QVERIFY(!View::showIcon(&window, QStringLiteral("a"), false));
        QVERIFY(!View::showText(&window, QStringLiteral("t"), QStringLiteral("b"), false));
        QVERIFY(!View::showTextAndIcon(&window, QString(), QStringLiteral("c"), false));
        QCOMPARE(window.findChildren<View*>().size(), 3);
    }

    void textAndIconStandInAContainer()
    {
        QWidget window;
        window.resize(200, 200);
        window.show();
        View* const view = View::showTextAndIcon(&window, QStringLiteral("Saved"), QStringLiteral("tick"), true);
        auto* const container = view->findChild<QWidget*>(QStringLiteral("container"));
        QVERIFY(container);
        QCOMPARE(container->parentWidget(), view);
        auto* const icon = container->findChild<QWidget*>(QStringLiteral("icon"));
        QVERIFY(icon);
        QVERIFY(icon->findChild<QLabel*>(QStringLiteral("tick")));
        auto* const text = container->findChild<QLabel*>(QStringLiteral("text"));
        QVERIFY(text);
        QCOMPARE(text->text(), QStringLiteral("Saved"));
        QCOMPARE(text->alignment(), Qt::AlignCenter);
        QVERIFY(container->layout()->indexOf(icon) < container->layout()->indexOf(text));
        View* const bare = View::showTextAndIcon(&window, QString(), QStringLiteral("tick"), true);
        QVERIFY(!bare->findChild<QLabel*>(QStringLiteral("text")));
    }

    void aTextTooLargeForItsParentStaysHiddenAndGoes()
    {
        QWidget window;
        window.resize(20, 10);
        window.show();
        QPointer<View> view(
            View::showText(&window, QStringLiteral("A text that needs more room"), QStringLiteral("t"), true));
        QVERIFY(view->isHidden());
        QTRY_VERIFY_WITH_TIMEOUT(!view, 8000);
    }

    void aTypeSetWhileTheSignGrowsCountsForItsWayOut()
    {
        QWidget window;
        window.resize(200, 200);
        window.show();
        auto* const label = textLabel(QSize(30, 30), &window);
        auto* const view = new View(label, &window);
        view->showIconFor(80);
        view->setAnimationType(View::eatOpacity); // no warning of Qt either
        QTRY_VERIFY(label->windowOpacity() < 1.0 || view->isHidden());
        QTRY_VERIFY(view->isHidden());
        QCOMPARE(label->windowOpacity(), 1.0); // no window: the property stays, and is not animated
    }

    void anUnknownTypeLeavesTheAnimationAsItWas()
    {
        QWidget window;
        window.resize(200, 200);
        window.show();
        auto* const label = new QLabel(QStringLiteral("!"), &window);
        auto* const view = new View(label, &window);
        view->showIconFor(20);
        QTRY_VERIFY(view->isHidden());
        view->setAnimationType(static_cast<View::EAnimationType>(7));
        view->showIconFor(60);
        QTRY_VERIFY(view->isHidden());
        QCOMPARE(label->size(), QSize(1, 1)); // still the geometry, with the values of the way out
    }

    void aPressFallsThrough()
    {
        Ground window;
        window.resize(100, 100);
        window.show();
        View* const view = View::showText(&window, QStringLiteral("Saved"), QStringLiteral("t"), true);
        QVERIFY(view->isVisible());
        QTest::mouseClick(&window, Qt::LeftButton, Qt::NoModifier, QPoint(50, 50)); // on the sign
        QCOMPARE(window.m_presses, 1);
    }

    void theStyleSheetPaintsTheSign()
    {
        QWidget window;
        window.resize(100, 100);
        window.setStyleSheet(QStringLiteral("vx--IconOverlayView { background: #00ff00; }"));
        window.show();
        new View(new QLabel(&window), &window);
        QCOMPARE(window.grab().toImage().pixelColor(5, 5), QColor(Qt::green));
    }

    void itGoesWithItsContent()
    {
        QWidget window;
        window.resize(100, 100);
        window.show();
        QPointer<View> view(View::showText(&window, QStringLiteral("x"), QStringLiteral("t"), true));
        delete view->findChild<QLabel*>();
        QTRY_VERIFY(!view);
        auto* const own = new View(new QLabel(&window), &window);
        delete own->findChild<QLabel*>();
        own->showIconFor(20);
        own->hideIconNow();
        QVERIFY(own->isHidden());
    }
};

ZELKOV_TEST_MAIN(TestIconOverlay)
#include "tst_iconoverlay.moc"
