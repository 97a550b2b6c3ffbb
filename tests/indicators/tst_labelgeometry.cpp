// SPDX-License-Identifier: MIT
// Where text and pictures of labels go, without a widget.
#include "indicators/LabelGeometry.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

#include <climits>

using namespace vx::LabelGeometry;

class TestLabelGeometry : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theIndentMovesTheEdgeThatHoldsTheText_data()
    {
        QTest::addColumn<int>("alignment");
        QTest::addColumn<int>("indent");
        QTest::addColumn<QRect>("expected");
        const QRect whole(2, 3, 100, 50);
        QTest::newRow("none") << int(Qt::AlignLeft) << -1 << whole;
        QTest::newRow("none anywhere") << int(Qt::AlignRight | Qt::AlignBottom) << -1 << whole;
        QTest::newRow("zero") << int(Qt::AlignLeft) << 0 << whole;
        QTest::newRow("left") << int(Qt::AlignLeft | Qt::AlignVCenter) << 7 << QRect(9, 3, 93, 50);
        QTest::newRow("right") << int(Qt::AlignRight | Qt::AlignVCenter) << 7 << QRect(2, 3, 93, 50);
        QTest::newRow("top") << int(Qt::AlignHCenter | Qt::AlignTop) << 7 << QRect(2, 10, 100, 43);
        QTest::newRow("bottom") << int(Qt::AlignHCenter | Qt::AlignBottom) << 7 << QRect(2, 3, 100, 43);
        QTest::newRow("corner") << int(Qt::AlignLeft | Qt::AlignTop) << 7 << QRect(9, 10, 93, 43);
        QTest::newRow("other corner") << int(Qt::AlignRight | Qt::AlignBottom) << 7 << QRect(2, 3, 93, 43);
        QTest::newRow("centred") << int(Qt::AlignCenter) << 7 << whole;
        QTest::newRow("justified") << int(Qt::AlignJustify) << 7 << whole;
        QTest::newRow("outwards") << int(Qt::AlignLeft) << -2 << QRect(0, 3, 102, 50);
    }

    void theIndentMovesTheEdgeThatHoldsTheText()
    {
        QFETCH(int, alignment);
        QFETCH(int, indent);
        QTEST(indented(QRect(2, 3, 100, 50), Qt::Alignment(QFlag(alignment)), indent), "expected");
    }

    void anIndentBeyondAllMeasureIsHarmless()
    {
        for (const int indent : {INT_MIN, INT_MAX}) {
            for (const Qt::Alignment alignment :
                {Qt::AlignLeft | Qt::AlignTop, Qt::AlignRight | Qt::AlignBottom}) {
                const QRect rect = indented(QRect(0, 0, 100, 50), alignment, indent);
                QCOMPARE(rect.isEmpty(), indent > 0);
            }
        }
    }

    void aPictureThatCoversIsCentred_data()
    {
        QTest::addColumn<QSize>("picture");
        QTest::addColumn<QPoint>("expected");
        QTest::newRow("fits") << QSize(100, 100) << QPoint(5, 6);
        QTest::newRow("wider") << QSize(200, 100) << QPoint(-45, 6);
        QTest::newRow("wider by one") << QSize(101, 100) << QPoint(5, 6);
        QTest::newRow("wider by three") << QSize(103, 100) << QPoint(4, 6);
        QTest::newRow("higher") << QSize(100, 150) << QPoint(5, -19);
        QTest::newRow("wider goes first") << QSize(110, 150) << QPoint(0, 6);
        QTest::newRow("smaller") << QSize(20, 20) << QPoint(5, 6);
    }

    void aPictureThatCoversIsCentred()
    {
        QFETCH(QSize, picture);
        QTEST(coverOrigin(QRect(5, 6, 100, 100), picture), "expected");
    }

    void whatOverhangsIsHalved()
    {
        QRandomGenerator random(7);
        for (int i = 0; i < 20000; ++i) {
            const QRect frame(
                random.bounded(-50, 50), random.bounded(-50, 50), random.bounded(1, 300), random.bounded(1, 300));
            const QSize source(random.bounded(1, 300), random.bounded(1, 300));
            const QSize picture = source.scaled(frame.size(), Qt::KeepAspectRatioByExpanding);
            const QRect placed(coverOrigin(frame, picture), picture);
            const int left = frame.left() - placed.left();
            const int right = placed.right() - frame.right();
            const int above = frame.top() - placed.top();
            const int below = placed.bottom() - frame.bottom();
            QVERIFY2(left >= 0 && right - left >= 0 && right - left <= 1, qPrintable(QString::number(i)));
            QVERIFY2(above >= 0 && below - above >= 0 && below - above <= 1, qPrintable(QString::number(i)));
        }
    }
};

ZELKOV_TEST_MAIN(TestLabelGeometry)
#include "tst_labelgeometry.moc"
