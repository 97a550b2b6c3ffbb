// SPDX-License-Identifier: MIT
// The line with name, date and time.
#include "indicators/NameTimeLabel.h"
#include "indicators/NameTimeText.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>

namespace
{
const QString blank(QLatin1Char(' '));

vx::NameTimeText parts()
{
    vx::NameTimeText text;
    text.name = QStringLiteral("Gate"); // 4
    text.date = QStringLiteral("17.05.24"); // 8
    text.time = QStringLiteral("12:30"); // 5
    return text;
}

// One unit a character.
QString shown(vx::NameTimeText& text, int room)
{
    return vx::dropUntilFits(
        text, [room](const QString& candidate) { return candidate.size() <= room; },
        [room](const QString& candidate) { return QStringLiteral("~") + candidate.left(room - 1); });
}

struct Line
{
    vx::NameTimeLabel label;

    explicit Line(int width = 600)
    {
        label.resize(width, 30);
        label.setText(QStringLiteral("Gate"), QStringLiteral("12:30:15"), QStringLiteral("17.05.2024"));
        label.show();
    }
    int widthOf(const QString& text) const { return label.fontMetrics().horizontalAdvance(text); }
    bool timeShown() const { return label.text().contains(QLatin1String("12:30:15")); }
    bool dateShown() const { return label.text().contains(QLatin1String("17.05.2024")); }
};
}

class TestNameTimeLabel : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void whatHasNoRoomIsDropped_data()
    {
        QTest::addColumn<int>("room");
        QTest::addColumn<QString>("text");
        QTest::addColumn<bool>("timeDropped");
        QTest::newRow("all") << 19 << "Gate 17.05.24 12:30" << false;
        QTest::newRow("no date") << 18 << "Gate 12:30" << false;
        QTest::newRow("name and time just fit") << 10 << "Gate 12:30" << false;
        QTest::newRow("narrow: the name") << 9 << "Gate" << false;
        QTest::newRow("the name just fits") << 4 << "Gate" << false;
        QTest::newRow("not even the name") << 3 << "~Ga" << true;
    }
    void whatHasNoRoomIsDropped()
    {
        QFETCH(int, room);
        vx::NameTimeText text = parts();
        QTEST(shown(text, room), "text");
        QTEST(text.timeDropped, "timeDropped");
    }

    void theOtherNarrowModeShowsTimeAndDate()
    {
        vx::NameTimeText text = parts();
        text.name = QStringLiteral("Gate by the river");
        text.nameInNarrowMode = false;
        QCOMPARE(shown(text, 14), QStringLiteral("12:30 17.05.24"));
        QCOMPARE(shown(text, 13), QString()); // date, then time dropped: nothing is left, and that fits
        QVERIFY(!text.timeDropped); // lowered again by what fits
        QVERIFY(!text.showTime);
        QVERIFY(!text.showDate);
    }

    void withoutTheTimeABlankTrails()
    {
        vx::NameTimeText text = parts();
        text.showTime = false;
        text.showDate = false;
        QCOMPARE(shown(text, 40), QStringLiteral("Gate "));
    }

    void withoutTheNameNothingIsDroppedButShortened()
    {
        vx::NameTimeText text = parts();
        text.showName = false;
        QCOMPARE(shown(text, 12), QStringLiteral("~17.05.24 12"));
        QVERIFY(text.showDate);
    }

    void aWideLabelShowsAll()
    {
        Line line;
        QCOMPARE(line.label.text(), QStringLiteral("Gate 17.05.2024 12:30:15"));
        QCOMPARE(line.label.getDeviceName(), QStringLiteral("Gate"));
        line.label.setDeviceName(QStringLiteral("Door"));
        line.label.setDate(QStringLiteral("18.05.2024"));
        line.label.setTime(QStringLiteral("01:02:03"));
        QCOMPARE(line.label.text(), QStringLiteral("Door 18.05.2024 01:02:03"));
    }

    void aNarrowLabelShowsTheNameAndAfterAClickTimeAndDate()
    {
        Line line;
        line.label.setDeviceName(QStringLiteral("Gate by the river, north side"));
        const int narrow = line.widthOf(QStringLiteral("12:30:15 17.05.2024 ")) + 1;
        line.label.resize(qMax(narrow, line.widthOf(QStringLiteral("Gate by the river, north side")) + 1), 30);
        QCOMPARE(line.label.text(), QStringLiteral("Gate by the river, north side"));
        QSignalSpy clicked(&line.label, &vx::NameTimeLabel::clicked);
        QTest::mouseClick(&line.label, Qt::LeftButton);
        QCOMPARE(clicked.count(), 1);
        QCOMPARE(line.label.text(), QStringLiteral("Gate by the river, north side")); // not before the next time
        line.label.setTime(QStringLiteral("12:30:16"));
        QCOMPARE(line.label.text(), QStringLiteral("12:30:16 17.05.2024"));
        QTest::mouseClick(&line.label, Qt::LeftButton);
        line.label.setTime(QStringLiteral("12:30:17"));
        QCOMPARE(line.label.text(), QStringLiteral("Gate by the river, north side"));
    }

    void aClickOnAWideLabelChangesNothing()
    {
        Line line;
        QTest::mouseClick(&line.label, Qt::LeftButton);
        line.label.setTime(QStringLiteral("12:30:15"));
        QCOMPARE(line.label.text(), QStringLiteral("Gate 17.05.2024 12:30:15"));
    }

    void aTooLongNameIsElidedInTheMiddle()
    {
        Line line;
        line.label.setDeviceName(QStringLiteral("A very long name of a camera"));
        line.label.resize(80, 30);
        QVERIFY(line.label.text().contains(QChar(0x2026)));
        QVERIFY(line.label.text().startsWith(QLatin1Char('A')));
        QVERIFY(line.label.text().endsWith(QLatin1Char('a')));
    }

    void aResizeBringsThePartsBack()
    {
        Line line;
        line.label.resize(line.widthOf(QStringLiteral("Gate 12:30:15 ")) + 2, 30);
        QCOMPARE(line.label.text(), QStringLiteral("Gate 12:30:15"));
        line.label.resize(600, 30);
        QCOMPARE(line.label.text(), QStringLiteral("Gate 17.05.2024 12:30:15"));
    }

    void aDateTimeIsWrittenInTheFormatsGiven()
    {
        Line line;
        const QDateTime time(QDate(2024, 5, 17), QTime(3, 4, 5));
        line.label.setDateTime(time, Qt::ISODate, Qt::TextDate);
        QCOMPARE(line.label.text(),
            QStringLiteral("Gate 2024-05-17 ") + time.time().toString(Qt::TextDate));
    }

    void aClockAheadBlinksAndTheNextCheckStopsIt()
    {
        Line line;
        line.label.setCheckTimeSync(true);
        line.label.setDateTime(QDateTime::currentDateTime().addSecs(100), Qt::ISODate, Qt::ISODate);
        const QString full = line.label.text();
        QTRY_COMPARE_WITH_TIMEOUT(line.label.text(), QStringLiteral("Gate "), 5000);
        QTRY_COMPARE_WITH_TIMEOUT(line.label.text(), full, 5000);
        QTRY_COMPARE_WITH_TIMEOUT(line.label.text(), QStringLiteral("Gate "), 5000);
        line.label.resize(601, 30); // brings them back at once
        QCOMPARE(line.label.text(), full);
        QTRY_COMPARE_WITH_TIMEOUT(line.label.text(), QStringLiteral("Gate "), 5000);
        line.label.setTime(QStringLiteral("00:00:01")); // the next check: stopped, the parts are due again
        line.label.setDeviceName(QStringLiteral("Gate"));
        QVERIFY(line.label.text().endsWith(QLatin1String("00:00:01")));
        QTest::qWait(1000);
        QVERIFY(line.label.text().endsWith(QLatin1String("00:00:01")));
        line.label.setTime(QStringLiteral("00:00:02")); // and the one after starts again
        QTRY_COMPARE_WITH_TIMEOUT(line.label.text(), QStringLiteral("Gate "), 5000);
    }

    void aClockBehindHasATolerance_data()
    {
        QTest::addColumn<int>("behind");
        QTest::addColumn<bool>("blinks");
        QTest::newRow("equal") << 0 << false;
        QTest::newRow("within") << 50 << false;
        QTest::newRow("beyond") << 70 << true;
        QTest::newRow("ahead: none") << -2 << true;
    }
    void aClockBehindHasATolerance()
    {
        QFETCH(int, behind);
        QFETCH(bool, blinks);
        Line line;
        line.label.setCheckTimeSync(true);
        line.label.setDateTime(QDateTime::currentDateTime().addSecs(-behind), Qt::ISODate, Qt::ISODate);
        QTest::qWait(900);
        QCOMPARE(line.label.text() == QLatin1String("Gate "), blinks);
    }

    void withoutTheCheckNothingBlinks()
    {
        Line line;
        line.label.setDateTime(QDateTime::currentDateTime().addSecs(3000), Qt::ISODate, Qt::ISODate);
        const QString full = line.label.text();
        QTest::qWait(900);
        QCOMPARE(line.label.text(), full);
        line.label.setCheckTimeSync(true);
        line.label.setTime(QStringLiteral("1")); // starts
        line.label.setCheckTimeSync(false);
        QTest::qWait(900);
        QVERIFY(line.label.text().endsWith(QLatin1String(" 1")));
    }

    void dateNameAndTextDoNotCheck()
    {
        Line line;
        line.label.setCheckTimeSync(true);
        line.label.setDate(QStringLiteral("1"));
        line.label.setDeviceName(QStringLiteral("2"));
        line.label.setText(QStringLiteral("Gate"), QStringLiteral("12:30:15"), QStringLiteral("17.05.2024"));
        QTest::qWait(900);
        QVERIFY(line.timeShown());
        QVERIFY(line.dateShown());
    }
};

ZELKOV_TEST_MAIN(TestNameTimeLabel)
#include "tst_nametimelabel.moc"
