// SPDX-License-Identifier: MIT
// What a controller decides, by tables and by random cases.
#include "popover/ControllerVerdicts.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

#include <climits>

#include "TestCase.h"
#include "TestMain.h"

using namespace vx::PopoverWidget; // NOLINT: a test of this namespace alone

Q_DECLARE_METATYPE(vx::PopoverWidget::EKeyVerdict)

class TestControllerVerdicts : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void balloonComesAtOnceRatherThanGrowing()
    {
        QCOMPARE(balloonMotion(false, false), EBalloonMotion::None);
        QCOMPARE(balloonMotion(false, true), EBalloonMotion::Animated);
        QCOMPARE(balloonMotion(true, false), EBalloonMotion::AtOnce);
        QCOMPARE(balloonMotion(true, true), EBalloonMotion::AtOnce);
    }

    void noFadeIsStrongerThanAnimated()
    {
        QCOMPARE(overlayEntry(true, true), EOverlayEntry::AtOnce);
        QCOMPARE(overlayEntry(true, false), EOverlayEntry::AtOnce);
        QCOMPARE(overlayEntry(false, true), EOverlayEntry::Fade);
        QCOMPARE(overlayEntry(false, false), EOverlayEntry::Opaque);
    }

    void aClickOutsideNeedsPressAndReleaseOutsideAndAnOpenPopover()
    {
        for (int bits = 0; bits < 16; ++bits) {
            const bool pressed = (bits & 1) != 0;
            const bool inside = (bits & 2) != 0;
            const bool closing = (bits & 4) != 0;
            const bool stays = (bits & 8) != 0;
            QCOMPARE(isPressOutside(inside, closing, stays), (bits & 14) == 0);
            QCOMPARE(isClickOutside(pressed, inside, closing, stays), bits == 1);
        }
    }

    void keys_data()
    {
        QTest::addColumn<int>("key");
        QTest::addColumn<bool>("visible");
        QTest::addColumn<bool>("stays");
        QTest::addColumn<bool>("closing");
        QTest::addColumn<EKeyVerdict>("verdict");
        for (int bits = 0; bits < 8; ++bits) {
            const bool visible = (bits & 1) != 0;
            const bool stays = (bits & 2) != 0;
            const bool closing = (bits & 4) != 0;
            const EKeyVerdict escape = !visible || stays ? EKeyVerdict::Reject
                : closing                                ? EKeyVerdict::Ignore
                                                         : EKeyVerdict::Dismiss;
            const QByteArray name = QByteArray::number(bits, 2);
            QTest::newRow("escape " + name) << int(Qt::Key_Escape) << visible << stays << closing << escape;
            QTest::newRow("return " + name)
                << int(Qt::Key_Return) << visible << stays << closing << EKeyVerdict::Accept;
            QTest::newRow("enter " + name)
                << int(Qt::Key_Enter) << visible << stays << closing << EKeyVerdict::Accept;
            QTest::newRow("space " + name)
                << int(Qt::Key_Space) << visible << stays << closing << EKeyVerdict::NotOurs;
        }
    }

    void keys()
    {
        QFETCH(int, key);
        QFETCH(bool, visible);
        QFETCH(bool, stays);
        QFETCH(bool, closing);
        QFETCH(EKeyVerdict, verdict);
        QCOMPARE(keyVerdict(key, visible, stays, closing), verdict);
    }

    void insetsAreAddedAsTheyStandAndMarginsGoInwards()
    {
        const QRect covered(0, 0, 400, 300);
        QCOMPARE(coveredArea(covered, QMargins(), QMargins()), covered);
        QCOMPARE(coveredArea(covered, QMargins(10, 20, -30, -40), QMargins()), QRect(10, 20, 360, 240));
        QCOMPARE(coveredArea(covered, QMargins(10, 20, 30, 40), QMargins()), QRect(10, 20, 420, 320));
        QCOMPARE(coveredArea(covered, QMargins(), QMargins(1, 2, 3, 4)), QRect(1, 2, 396, 294));
        QCOMPARE(coveredArea(covered, QMargins(10, 20, -30, -40), QMargins(1, 2, 3, 4)), QRect(11, 22, 356, 234));
    }

    void coveredAreaIsQtsArithmetic()
    {
        const quint32 seed = 20260;
        QRandomGenerator random(seed);
        for (int i = 0; i < 20000; ++i) {
            const auto number = [&random](int bound) { return random.bounded(2 * bound) - bound; };
            const QRect covered(number(50), number(50), random.bounded(3000), random.bounded(2000));
            const QMargins insets(number(500), number(500), number(500), number(500));
            const QMargins margins(number(500), number(500), number(500), number(500));
            QRect expected = covered;
            expected.adjust(insets.left(), insets.top(), insets.right(), insets.bottom());
            expected.adjust(margins.left(), margins.top(), -margins.right(), -margins.bottom());
            QCOMPARE(coveredArea(covered, insets, margins), expected);
        }
    }

    void extremeInsetsAndMarginsEndWhereNoWidgetCanBe()
    {
        const QMargins most(INT_MAX, INT_MAX, INT_MAX, INT_MAX);
        const QMargins least(INT_MIN, INT_MIN, INT_MIN, INT_MIN);
        const QRect covered(0, 0, 400, 300);
        QCOMPARE(coveredArea(covered, most, QMargins()).topLeft(), QPoint(1 << 24, 1 << 24));
        QCOMPARE(coveredArea(covered, QMargins(), most).bottomRight(), QPoint(-(1 << 24), -(1 << 24)));
        QCOMPARE(coveredArea(covered, least, least).topLeft(), QPoint(-(1 << 24), -(1 << 24)));
        QCOMPARE(saturatedSum(most, most), most);
        QCOMPARE(saturatedSum(least, least), least);
        QCOMPARE(saturatedSum(most, least), QMargins(-1, -1, -1, -1));
    }
};

ZELKOV_TEST_MAIN(TestControllerVerdicts)
#include "tst_controllerverdicts.moc"
