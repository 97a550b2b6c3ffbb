// SPDX-License-Identifier: MIT
// The overlay of a lost connection, and the arithmetic of both overlays.
#include "indicators/BadgeWidget.h"
#include "indicators/BusyOverlayView.h"
#include "indicators/OverlayGeometry.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QElapsedTimer>
#include <QtTest/QtTest>
#include <QtWidgets/QLabel>

namespace
{
struct Busy
{
    QWidget window;
    vx::BusyOverlayView* overlay;

    explicit Busy(int width = 600)
    {
        window.resize(width, 200);
        overlay = new vx::BusyOverlayView(&window);
        window.show();
    }

    QLabel* label() const { return overlay->findChild<QLabel*>(QStringLiteral("busyText")); }
    vx::BadgeWidget* icon() const { return overlay->findChild<vx::BadgeWidget*>(QStringLiteral("busyIcon")); }
};
}

class TestBusyOverlay : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theTextIsFittedToTheParent_data()
    {
        QTest::addColumn<int>("parentWidth");
        QTest::addColumn<int>("textWidth");
        QTest::addColumn<double>("base");
        QTest::addColumn<int>("fit");
        QTest::addColumn<double>("size");
        const int fits = vx::BusyTextFit::Fits;
        const int shrink = vx::BusyTextFit::Shrink;
        const int tooLong = vx::BusyTextFit::TooLong;
        QTest::newRow("wider than text and 50") << 250 << 200 << 10.0 << fits << 10.0;
        QTest::newRow("much wider: no growth") << 2000 << 200 << 10.0 << fits << 10.0;
        QTest::newRow("ratio 0.995") << 249 << 200 << 10.0 << fits << 10.0;
        QTest::newRow("ratio 0.99 is not above it") << 248 << 200 << 10.0 << shrink << 9.9;
        QTest::newRow("above 8") << 231 << 200 << 9.0 << shrink << 8.145;
        QTest::newRow("8 points are too few") << 210 << 200 << 10.0 << tooLong << 8.0;
        QTest::newRow("narrower than 50") << 20 << 200 << 10.0 << tooLong << -1.5;
        QTest::newRow("no width") << 20 << 0 << 10.0 << fits << 10.0;
    }
    void theTextIsFittedToTheParent()
    {
        QFETCH(int, parentWidth);
        QFETCH(int, textWidth);
        QFETCH(double, base);
        QFETCH(double, size);
        const vx::BusyTextFit fit = vx::fitBusyText(parentWidth, textWidth, base);
        QTEST(int(fit.fit), "fit");
        QVERIFY(qAbs(fit.pointSize - size) < 1e-9);
    }

    void thePartsArePlaced()
    {
        vx::BusyLayout layout = vx::busyLayout(QSize(20, 30), true, 101, 16);
        QCOMPARE(layout.icon, QPoint(40, 0));
        QCOMPARE(layout.label, QRect(0, 36, 109, 18));
        QCOMPARE(layout.size, QSize(109, 54));
        layout = vx::busyLayout(QSize(20, 30), true, 7, 16); // narrower than the spinner
        QCOMPARE(layout.icon, QPoint(-6, 0));
        QCOMPARE(layout.size, QSize(20, 54));
        layout = vx::busyLayout(QSize(20, 30), false, 0, 16);
        QCOMPARE(layout.icon, QPoint(0, 0));
        QCOMPARE(layout.label, QRect(0, 30, 0, 18));
        QCOMPARE(layout.size, QSize(20, 54)); // the gap counts without a text too
    }

    void theRectanglesOfAGrowingSignAreOdd()
    {
        QCOMPARE(vx::signFullRect(QRect(0, 0, 100, 100)), QRectF(-1, -1, 101, 101));
        QCOMPARE(vx::signCenterRect(QRect(0, 0, 100, 100)), QRectF(49, 49, 1, 1));
        QCOMPARE(vx::signFullRect(QRect(0, 0, 101, 100)), QRectF(0, -1, 101, 101));
        QCOMPARE(vx::signFullRect(QRect(0, 0, 101, 99)), QRectF(0, 0, 101, 99));
    }

    void itIsSetUpForStyleSheets()
    {
        Busy busy;
        QCOMPARE(busy.overlay->objectName(), QStringLiteral("BusyOverlayWidget"));
        QVERIFY(busy.overlay->isHidden());
        QVERIFY(busy.label());
        QCOMPARE(busy.label()->alignment() & Qt::AlignHorizontal_Mask, Qt::AlignHCenter);
        QVERIFY(busy.icon());
        QCOMPARE(busy.icon()->alignment(), Qt::AlignCenter);
        QCOMPARE(busy.icon()->badgeSize(), QSize(20, 20));
    }

    void aShortLossShowsNothing()
    {
        Busy busy;
        busy.overlay->showBusyOverlay(false);
        QVERIFY(busy.overlay->isHidden());
        busy.overlay->hideBusyOverlay();
        zelkovtest::SignalRecorder recorder(busy.overlay);
        QTest::qWait(1200);
        QVERIFY(busy.overlay->isHidden());
        QVERIFY(recorder.names().isEmpty());
    }

    void theSpinnerComesAfterASecondAndTheTextASecondLater()
    {
        Busy busy;
        QElapsedTimer clock;
        clock.start();
        busy.overlay->showBusyOverlay(true);
        QTRY_VERIFY_WITH_TIMEOUT(busy.overlay->isVisible(), 5000);
        QVERIFY(clock.elapsed() >= 940);
        QVERIFY(busy.icon()->hasBadge());
        QVERIFY(busy.label()->text().isEmpty());
        QTRY_VERIFY_WITH_TIMEOUT(!busy.label()->text().isEmpty(), 5000);
        QVERIFY(clock.elapsed() >= 1890);
        QCOMPARE(busy.label()->text(), QStringLiteral("Connection lost since 1 s"));
        QTRY_COMPARE_WITH_TIMEOUT(busy.label()->text(), QStringLiteral("Connection lost since 2 s"), 5000);
        busy.overlay->hideBusyOverlay();
        QVERIFY(busy.overlay->isHidden());
        QVERIFY(!busy.icon()->hasBadge());
        busy.overlay->setBusySeconds(0); // the next number is what was counted on from 1
        busy.overlay->hideBusyOverlay();
    }

    void withoutATextThereIsNoLabel()
    {
        Busy busy;
        busy.overlay->showBusyOverlay(false);
        QTRY_VERIFY_WITH_TIMEOUT(busy.overlay->isVisible(), 5000);
        QVERIFY(busy.label()->isHidden());
    }

    void aNumberOfSecondsIsShownAtOnce()
    {
        Busy busy;
        busy.overlay->show();
        busy.overlay->setBusySeconds(65);
        QCOMPARE(busy.label()->text(), QStringLiteral("Connection lost since 1 min 5 s"));
        busy.overlay->setBusySeconds(7);
        QCOMPARE(busy.label()->text(), QStringLiteral("Connection lost since 7 s"));
    }

    void noSecondsWaitForTheNextTick()
    {
        Busy busy;
        busy.overlay->showBusyOverlay(true);
        QTRY_VERIFY_WITH_TIMEOUT(busy.overlay->isVisible(), 5000);
        busy.overlay->setBusySeconds(0);
        QVERIFY(busy.label()->text().isEmpty());
        QTRY_COMPARE_WITH_TIMEOUT(busy.label()->text(), QStringLiteral("Connection lost since 0 s"), 5000);
        QTRY_COMPARE_WITH_TIMEOUT(busy.label()->text(), QStringLiteral("Connection lost since 1 s"), 5000);
        busy.overlay->hideBusyOverlay();
    }

    void aRoundCountsFromOneAgain()
    {
        Busy busy;
        busy.overlay->show();
        busy.overlay->setBusySeconds(40);
        busy.overlay->hideBusyOverlay();
        busy.overlay->showBusyOverlay(true);
        QTRY_COMPARE_WITH_TIMEOUT(busy.label()->text(), QStringLiteral("Connection lost since 1 s"), 5000);
    }

    void aTextOfTheClientIsUsed()
    {
        Busy busy;
        busy.overlay->show();
        QVERIFY(busy.overlay->busyText().isEmpty());
        busy.overlay->setBusyText(QStringLiteral("Waiting %1 for gate"));
        QCOMPARE(busy.overlay->busyText(), QStringLiteral("Waiting %1 for gate"));
        QVERIFY(busy.label()->text().isEmpty()); // no immediate effect
        busy.overlay->setBusySeconds(3);
        QCOMPARE(busy.label()->text(), QStringLiteral("Waiting 3 s for gate"));
        busy.overlay->setBusyText(QStringLiteral("Please wait"));
        busy.overlay->setBusySeconds(4);
        QCOMPARE(busy.label()->text(), QStringLiteral("Please wait"));
        busy.overlay->clearBusyText();
        QVERIFY(busy.overlay->busyText().isEmpty());
        busy.overlay->setBusySeconds(4);
        QCOMPARE(busy.label()->text(), QStringLiteral("Connection lost since 4 s"));
    }

    void eachArrangementIsReported()
    {
        Busy busy;
        busy.overlay->show();
        zelkovtest::SignalRecorder recorder(busy.overlay);
        busy.overlay->showBusyText();
        QCOMPARE(recorder.names(), QStringList{QStringLiteral("updatedLayout")});
        QCOMPARE(recorder.entries().first().arguments, QVariantList{false});
        busy.overlay->hideBusyText();
        QCOMPARE(recorder.names().size(), 1);
        recorder.clear();
        busy.overlay->setBusySeconds(5); // before the text and after it
        QCOMPARE(recorder.names().size(), 2);
    }

    void aWideParentKeepsTheBaseSizeAndANarrowOneShrinksTheText()
    {
        Busy busy(1000);
        busy.overlay->show();
        QFont font = busy.label()->font();
        font.setPointSize(12);
        busy.window.setFont(font);
        auto* const overlay = new vx::BusyOverlayView(&busy.window);
        auto* const label = overlay->findChild<QLabel*>();
        overlay->show();
        overlay->setBusySeconds(5);
        QCOMPARE(label->font().pointSize(), 12);
        const int width = QFontMetrics(label->font()).horizontalAdvance(label->text());
        QCOMPARE(overlay->width(), width + 8);
        busy.window.resize(width * 8 / 10 + 50, 200);
        overlay->setBusySeconds(5);
        QVERIFY(label->isVisible());
        QVERIFY(label->font().pointSizeF() < 12.0);
        QVERIFY(label->font().pointSizeF() > 8.0);
        busy.window.resize(1000, 200);
        overlay->setBusySeconds(5);
        QCOMPARE(label->font().pointSize(), 12);
        busy.window.resize(60, 200);
        overlay->setBusySeconds(5);
        QVERIFY(label->isHidden());
        const auto* const icon = overlay->findChild<vx::BadgeWidget*>();
        QCOMPARE(overlay->height(), icon->height() + QFontMetrics(label->font()).height() + 2 + 6);
        QCOMPARE(overlay->width(), icon->width());
    }

    void askedAgainItWaitsAnew()
    {
        Busy busy;
        busy.overlay->showBusyOverlay(false);
        QTest::qWait(600);
        QElapsedTimer clock;
        clock.start();
        busy.overlay->showBusyOverlay(false);
        QTRY_VERIFY_WITH_TIMEOUT(busy.overlay->isVisible(), 5000);
        QVERIFY(clock.elapsed() >= 940);
    }
};

ZELKOV_TEST_MAIN(TestBusyOverlay)
#include "tst_busyoverlay.moc"
