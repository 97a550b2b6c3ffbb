// SPDX-License-Identifier: MIT
// The frame-time overlay.
#include "controls/DateTimeEdit.h"
#include "indicators/TimeDifference.h"
#include "indicators/TimeLabel.h"
#include "support/Pointer.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>

#include <limits>

namespace
{
constexpr quint64 second = 1000000;
constexpr quint64 noTime = vx::c_NoFrameTime;
const quint64 noon = 1715947200ULL * second; // 17 May 2024, 12:00 UTC

struct Overlay
{
    QWidget window;
    vx::TimeLabel* label;

    explicit Overlay(bool recording = true)
    {
        window.resize(640, 300);
        label = new vx::TimeLabel(recording, &window);
        window.show();
    }
    void show(quint64 time = noon, bool forceShow = false, bool readOnly = true)
    {
        label->showFrametime(true, time, 30, 5, readOnly, Qt::AlignLeft | Qt::AlignTop, forceShow);
    }
    QLabel* difference() const { return label->findChild<QLabel*>(QStringLiteral("FrameTimeLabel")); }
    QLabel* symbol() const
    {
        for (QLabel* const child : label->findChildren<QLabel*>()) {
            if (child != difference()) {
                return child;
            }
        }
        return nullptr;
    }
    vx::DateTimeEdit* edit() const { return label->getDateTimeEit(); }
};
}

class TestTimeLabel : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theDifferenceIsTakenWithoutSign_data()
    {
        QTest::addColumn<quint64>("frame");
        QTest::addColumn<quint64>("anchor");
        QTest::addColumn<QString>("text");
        QTest::newRow("equal") << noon << noon << "";
        QTest::newRow("no anchor") << noon << noTime << "";
        QTest::newRow("no frame") << noTime << noon << "";
        QTest::newRow("less than a second before") << noon - 999999 << noon << "";
        QTest::newRow("a second before") << noon - second << noon << " -00:00:01";
        QTest::newRow("1.5 seconds before") << noon - 1500000 << noon << " -00:00:01";
        QTest::newRow("less than a second after") << noon + 1 << noon << " +00:00:00";
        QTest::newRow("a second after") << noon + second << noon << " +00:00:01";
        QTest::newRow("an hour after") << noon + 3661 * second << noon << " +01:01:01";
    }
    void theDifferenceIsTakenWithoutSign()
    {
        QFETCH(quint64, frame);
        QFETCH(quint64, anchor);
        QTEST(vx::frameTimeDifference(frame, anchor), "text");
        Overlay overlay;
        overlay.label->setAnchortime(anchor);
        overlay.show(frame, true);
        if (frame != noTime) {
            QTEST(overlay.difference()->text(), "text");
        }
    }

    void secondsAreCountedIn32Bits()
    {
        QCOMPARE(vx::secondsOfTime(QDateTime()), std::numeric_limits<quint32>::max());
        QCOMPARE(vx::secondsOfTime(QDateTime(QDate(1960, 1, 1), QTime(0, 0))), std::numeric_limits<quint32>::max());
        QCOMPARE(vx::secondsOfTime(QDateTime(QDate(2200, 1, 1), QTime(0, 0))), std::numeric_limits<quint32>::max());
        QCOMPARE(vx::secondsOfTime(vx::frameDateTime(noon)), quint32(noon / second));
        QCOMPARE(vx::frameDateTime((quint64(1) << 32) * second), QDateTime::fromSecsSinceEpoch(0));
    }

    void itIsSetUp()
    {
        Overlay overlay;
        QCOMPARE(overlay.label->objectName(), QStringLiteral("FrameTimeWidget"));
        QVERIFY(overlay.label->isHidden());
        QVERIFY(overlay.symbol()->hasScaledContents());
        QCOMPARE(overlay.edit()->objectName(), QStringLiteral("DateEdit"));
        QCOMPARE(overlay.edit()->buttonSymbols(), QAbstractSpinBox::NoButtons);
        QVERIFY(!overlay.edit()->hasFrame());
        QVERIFY(!overlay.edit()->keyboardTracking());
        QVERIFY(overlay.edit()->m_returnLeavesField);
        QVERIFY(overlay.edit()->isHidden());
        QCOMPARE(overlay.edit()->alignment() & Qt::AlignHorizontal_Mask, Qt::AlignHCenter);
    }

    void theSymbolsNameIsItsState()
    {
        QCOMPARE(Overlay(true).symbol()->objectName(), QStringLiteral("FrameTimeGrabberCamera"));
        Overlay overlay(false);
        QCOMPARE(overlay.symbol()->objectName(), QStringLiteral("FrameTimeGrabberFileserver"));
        overlay.label->changeRecordingSymbol(true);
        QCOMPARE(overlay.symbol()->objectName(), QStringLiteral("FrameTimeGrabberCamera"));
        overlay.label->showErrorSymbol(true);
        QCOMPARE(overlay.symbol()->objectName(), QStringLiteral("FrameTimeGrabberError"));
        overlay.label->changeRecordingSymbol(false); // outranked
        QCOMPARE(overlay.symbol()->objectName(), QStringLiteral("FrameTimeGrabberError"));
        overlay.label->showErrorSymbol(false);
        QCOMPARE(overlay.symbol()->objectName(), QStringLiteral("FrameTimeGrabberFileserver"));
    }

    void theStyleSheetFollowsTheState()
    {
        Overlay overlay;
        overlay.window.setStyleSheet(QStringLiteral("#FrameTimeGrabberError { background: #ff0000; }"));
        overlay.show();
        overlay.label->showErrorSymbol(true);
        QCOMPARE(overlay.symbol()->grab().toImage().pixelColor(2, 2), QColor(Qt::red));
        overlay.label->showErrorSymbol(false);
        QVERIFY(overlay.symbol()->grab().toImage().pixelColor(2, 2) != QColor(Qt::red));
    }

    void aFrameIsShownWithItsTime()
    {
        Overlay overlay;
        zelkovtest::SignalRecorder recorder(overlay.label);
        overlay.show();
        QVERIFY(overlay.label->isVisible());
        QVERIFY(overlay.edit()->isVisible());
        QCOMPARE(overlay.edit()->dateTime(), QDateTime::fromSecsSinceEpoch(qint64(noon / second)));
        QVERIFY(overlay.edit()->isReadOnly());
        QCOMPARE(overlay.label->property("overlaypos").toInt(), int(Qt::AlignLeft | Qt::AlignTop));
        QCOMPARE(overlay.label->property("overlaymargin").toInt(), 5);
        QVERIFY(overlay.label->height() >= 12);
        QVERIFY(!recorder.names().isEmpty());
        QCOMPARE(recorder.names().count(QStringLiteral("reposTimeLabel")), recorder.names().size());
        QCOMPARE(recorder.entries().last().arguments, QVariantList{false});
    }

    void hiddenItIsLeftAlone()
    {
        Overlay overlay;
        zelkovtest::SignalRecorder recorder(overlay.label);
        overlay.label->showFrametime(false, noon, 30, 5, true, Qt::AlignLeft, false);
        QVERIFY(overlay.label->isHidden());
        QVERIFY(!overlay.label->property("overlaypos").isValid());
        overlay.label->setFrametime(noon);
        QVERIFY(recorder.names().isEmpty());
    }

    void theSameFrameIsNoNews()
    {
        Overlay overlay;
        overlay.show();
        zelkovtest::SignalRecorder recorder(overlay.label);
        overlay.label->setFrametime(noon);
        overlay.label->setAnchortime(noTime);
        QVERIFY(recorder.names().isEmpty());
        overlay.label->setFrametime(noon + second);
        QCOMPARE(recorder.names().size(), 1);
        overlay.label->setAnchortime(noon);
        QCOMPARE(recorder.names().size(), 2);
    }

    void withoutATimeItCollapses()
    {
        Overlay overlay;
        overlay.show();
        QVERIFY(overlay.label->height() > 0);
        overlay.label->setFrametime(noTime);
        QCOMPARE(overlay.label->height(), 0);
        QVERIFY(overlay.edit()->isHidden());
    }

    void forcedToShowItShowsDashes()
    {
        Overlay overlay;
        overlay.show(noTime, true);
        QCOMPARE(overlay.difference()->text(), QStringLiteral("--- --.--.-- --:--:--"));
        QVERIFY(overlay.edit()->isHidden());
        QVERIFY(overlay.label->height() > 0);
        overlay.label->setForceShow(false);
        overlay.label->setFrametime(noTime); // no time twice is looked at again
        QCOMPARE(overlay.label->height(), 0);
    }

    void anErrorStandsUntilThereIsATime()
    {
        Overlay overlay;
        overlay.show(noTime);
        QCOMPARE(overlay.label->height(), 0);
        overlay.label->setErrorText(QStringLiteral("No access"));
        QCOMPARE(overlay.difference()->text(), QStringLiteral("No access"));
        QVERIFY(overlay.label->height() > 0);
        overlay.label->setFrametime(noon);
        QVERIFY(overlay.difference()->text().isEmpty());
    }

    void thePartsStandSideBySide()
    {
        Overlay overlay;
        overlay.label->setAnchortime(noon - 100 * second);
        overlay.show();
        const int height = overlay.label->height();
        QCOMPARE(overlay.symbol()->geometry(), QRect(0, 0, height * 94 / 108, height));
        const QFontMetrics metrics(overlay.edit()->getFont());
        QCOMPARE(overlay.edit()->x(), overlay.symbol()->width());
        QCOMPARE(overlay.edit()->width(), metrics.horizontalAdvance(overlay.edit()->text()) + 5);
        QCOMPARE(overlay.difference()->x(), overlay.edit()->geometry().right() + 1);
        QCOMPARE(overlay.difference()->width(), metrics.horizontalAdvance(overlay.difference()->text()) + 5);
        QCOMPARE(overlay.label->width(), overlay.difference()->geometry().right() + 1);
        QCOMPARE(overlay.label->minimumSize(), overlay.label->maximumSize());
        overlay.label->setAnchortime(noTime);
        QCOMPARE(overlay.difference()->width(), 0);
    }

    void theFontIsTheLargestThatFits()
    {
        Overlay overlay;
        overlay.show();
        const int size = overlay.difference()->font().pointSize();
        QCOMPARE(overlay.edit()->getFont().pointSize(), size);
        QFont font = overlay.difference()->font();
        auto fits = [&](int points) {
            font.setPointSize(points);
            const QFontMetrics metrics(font);
            const int symbol = metrics.height() * 94 / 108;
            return metrics.horizontalAdvance(overlay.edit()->text()) + symbol + 10 <= 640 && metrics.height() <= 30;
        };
        QVERIFY(fits(size));
        QVERIFY(!fits(size + 1));
        font.setPointSize(size + 1); // the height of the size that failed
        QCOMPARE(overlay.label->height(), QFontMetrics(font).height());
        overlay.window.resize(250, 300);
        overlay.label->resizeContent(false);
        QVERIFY(overlay.difference()->font().pointSize() < size);
    }

    void aFrameOfTheSameSecondKeepsTheSizesAndAnotherParentChangesThem()
    {
        Overlay overlay;
        overlay.show();
        const int size = overlay.difference()->font().pointSize();
        const QSize extent = overlay.label->size();
        overlay.label->setFrametime(noon + 40000);
        QCOMPARE(overlay.difference()->font().pointSize(), size);
        QCOMPARE(overlay.label->size(), extent);
        overlay.window.resize(250, 300);
        overlay.label->setFrametime(noon + 80000);
        QVERIFY(overlay.difference()->font().pointSize() < size);
        overlay.window.resize(640, 300);
        QFont other = overlay.difference()->font();
        other.setPointSize(4);
        overlay.difference()->setFont(other); // a client's or a style sheet's
        overlay.label->setFrametime(noon + 120000);
        QCOMPARE(overlay.difference()->font().pointSize(), size);
        overlay.label->showFrametime(true, noon + 160000, 20, 5, true, Qt::AlignLeft, false);
        QVERIFY(overlay.difference()->font().pointSize() < size);
    }

    void aFrameOfTheSameSecondPaintsNothing()
    {
        struct Paints : QObject
        {
            int count = 0;
            bool eventFilter(QObject*, QEvent* event) override
            {
                count += event->type() == QEvent::Paint ? 1 : 0;
                return false;
            }
        } paints;
        Overlay overlay;
        overlay.show();
        overlay.label->resizeContent(false);
        overlay.edit()->installEventFilter(&paints);
        overlay.difference()->installEventFilter(&paints);
        overlay.label->installEventFilter(&paints);
        QVERIFY(QTest::qWaitForWindowExposed(&overlay.window));
        overlay.window.repaint();
        QCoreApplication::processEvents();
        paints.count = 0;
        zelkovtest::SignalRecorder recorder(overlay.label);
        for (quint64 frame = 1; frame < 25; ++frame) {
            overlay.label->setFrametime(noon + frame * 40000);
            QCoreApplication::processEvents();
        }
        QCOMPARE(paints.count, 0);
        QCOMPARE(recorder.count(QStringLiteral("reposTimeLabel")), 24);
        overlay.label->setFrametime(noon + second);
        QTRY_VERIFY(paints.count > 0);
        QCOMPARE(overlay.edit()->dateTime().toSecsSinceEpoch(), qint64(noon / second) + 1);
    }

    void aFrameOfTheSameSecondReplacesWhatTheUserTypes()
    {
        Overlay overlay;
        overlay.show(noon, false, false);
        overlay.label->setFrametime(noon + 40000);
        const QString shown = overlay.edit()->text();
        overlay.edit()->lineEdit()->setCursorPosition(shown.size());
        QTest::keyClick(overlay.edit(), Qt::Key_Backspace);
        QVERIFY(overlay.edit()->text() != shown);
        overlay.label->setFrametime(noon + 80000);
        QCOMPARE(overlay.edit()->text(), shown);
        QSignalSpy changed(overlay.edit(), &QDateTimeEdit::dateTimeChanged);
        overlay.edit()->setDateTime(QDateTime::fromSecsSinceEpoch(qint64(noon / second) + 5));
        overlay.label->setFrametime(noon + 120000);
        QCOMPARE(overlay.edit()->text(), shown);
        QCOMPARE(changed.count(), 2);
        overlay.edit()->clear();
        overlay.label->setFrametime(noon + 160000);
        QCOMPARE(overlay.edit()->text(), shown);
        overlay.edit()->setDisplayFormat(QStringLiteral("hh:mm:ss"));
        overlay.label->setFrametime(noon + 200000);
        QCOMPARE(overlay.edit()->text(), QStringLiteral("12:00:00"));
        QVERIFY(overlay.edit()->width() < QFontMetrics(overlay.edit()->getFont()).horizontalAdvance(shown));
    }

    void aTimeThatTheEditRefusesIsTriedAnew()
    {
        Overlay overlay;
        overlay.show();
        overlay.edit()->setMaximumDateTime(QDateTime::fromSecsSinceEpoch(qint64(noon / second) + 10));
        overlay.label->setFrametime(noon + 60 * second);
        QCOMPARE(overlay.edit()->dateTime().toSecsSinceEpoch(), qint64(noon / second) + 10);
        overlay.edit()->clearMaximumDateTime();
        overlay.label->setFrametime(noon + 60 * second + 1);
        QCOMPARE(overlay.edit()->dateTime().toSecsSinceEpoch(), qint64(noon / second) + 60);
    }

    void anUnreadableLineIsGone()
    {
        Overlay overlay;
        overlay.window.resize(40, 300);
        overlay.show();
        QCOMPARE(overlay.label->height(), 0);
    }

    void aHeightUnderFourLeavesTheSizes()
    {
        Overlay overlay;
        overlay.label->showFrametime(true, noon, 3, 0, true, Qt::AlignLeft, false);
        QCOMPARE(overlay.label->height(), 0);
    }

    void onlyARepositioningResizeIsReported()
    {
        Overlay overlay;
        overlay.show();
        zelkovtest::SignalRecorder recorder(overlay.label);
        overlay.label->resizeContent(false);
        QVERIFY(recorder.names().isEmpty());
        overlay.label->resizeContent(true);
        QCOMPARE(recorder.names(), QStringList{QStringLiteral("reposTimeLabel")});
        QCOMPARE(recorder.entries().first().arguments, QVariantList{false});
    }

    void aClickIsOnTheSymbolUnlessItFollowedADrag()
    {
        Overlay overlay;
        overlay.show();
        zelkovtest::SignalRecorder recorder(overlay.label);
        zelkovtest::Pointer pointer(&overlay.window);
        pointer.click(QPoint(4, 4));
        QCOMPARE(recorder.names(),
            (QStringList{QStringLiteral("labelGrabbed"), QStringLiteral("symbolClicked"), QStringLiteral("labelGrabbed")}));
        QCOMPARE(recorder.entries().first().arguments, QVariantList{true});
        QCOMPARE(recorder.entries().last().arguments, QVariantList{false});
        recorder.clear();
        pointer.wait(2000);
        pointer.move(QPoint(4, 4));
        pointer.press();
        pointer.move(QPoint(6, 5));
        QCOMPARE(overlay.label->cursor().shape(), Qt::ClosedHandCursor);
        pointer.move(QPoint(4, 4));
        pointer.release();
        QCOMPARE(recorder.names(), (QStringList{QStringLiteral("labelGrabbed"), QStringLiteral("labelGrabbed")}));
    }

    void movesAreLeftToTheClient()
    {
        class Open : public vx::TimeLabel
        {
        public:
            using vx::TimeLabel::TimeLabel;
            using vx::TimeLabel::mouseMoveEvent;
        };
        Open label(true);
        QMouseEvent move(QEvent::MouseMove, QPointF(3, 3), Qt::NoButton, Qt::NoButton, Qt::NoModifier);
        move.accept();
        label.mouseMoveEvent(&move);
        QVERIFY(!move.isAccepted());
        QCOMPARE(label.cursor().shape(), Qt::OpenHandCursor);
    }

    void aDoubleClickPutsItBack()
    {
        Overlay overlay;
        overlay.show();
        overlay.label->setProperty("overlaypos", int(Qt::AlignRight));
        zelkovtest::SignalRecorder recorder(overlay.label);
        zelkovtest::Pointer pointer(&overlay.window);
        pointer.click(QPoint(4, 4));
        pointer.click(QPoint(4, 4));
        QCOMPARE(recorder.count(QStringLiteral("reposTimeLabel")), 1);
        for (const zelkovtest::SignalRecorder::Entry& entry : recorder.entries()) {
            if (entry.name == QLatin1String("reposTimeLabel")) {
                QCOMPARE(entry.arguments, QVariantList{true});
            }
        }
        QCOMPARE(overlay.label->property("overlaypos").toInt(), int(Qt::AlignLeft | Qt::AlignTop));
    }

    void anEditedTimeIsReported()
    {
        Overlay overlay;
        overlay.show(noon, false, false);
        zelkovtest::SignalRecorder recorder(overlay.label);
        overlay.edit()->m_returnLeavesField = false;
        overlay.edit()->setDateTime(QDateTime::fromSecsSinceEpoch(qint64(noon / second) + 60));
        QTest::keyClick(overlay.edit(), Qt::Key_Return);
        QCOMPARE(recorder.names(), QStringList{QStringLiteral("frametimeUpdate")});
        QCOMPARE(recorder.entries().first().arguments.first().toDateTime().toSecsSinceEpoch(),
            qint64(noon / second) + 60);
        recorder.clear();
        overlay.label->setFrametime(noon + 60 * second); // known by now
        QVERIFY(recorder.names().isEmpty());
        overlay.label->setReadOnly(true);
        QVERIFY(overlay.edit()->isReadOnly());
        QTest::keyClick(overlay.edit(), Qt::Key_Return);
        QVERIFY(recorder.names().isEmpty());
    }

    void eventsAreHandedToTheEditUnlessItIsReadOnly()
    {
        Overlay overlay;
        overlay.show(noon, false, false);
        QSignalSpy pressed(overlay.edit(), &vx::DateTimeEdit::anchorTimeClicked);
        QMouseEvent press(QEvent::MouseButtonPress, QPointF(2, 2), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
        overlay.label->handleEvents(&press);
        QCOMPARE(pressed.count(), 1);
        QVERIFY(!overlay.edit()->m_returnLeavesField);
        overlay.label->setReadOnly(true);
        press.accept();
        overlay.label->handleEvents(&press);
        QCOMPARE(pressed.count(), 1);
        QVERIFY(!press.isAccepted());
    }

    void shownAgainItFitsItself()
    {
        Overlay overlay;
        overlay.show();
        overlay.window.hide();
        zelkovtest::SignalRecorder recorder(overlay.label);
        overlay.window.show();
        QCOMPARE(recorder.names(), QStringList{QStringLiteral("reposTimeLabel")});
    }
};

ZELKOV_TEST_MAIN(TestTimeLabel)
#include "tst_timelabel.moc"
