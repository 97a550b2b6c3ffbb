// SPDX-License-Identifier: MIT
// Hit test, buttons, start of a drag and escaping as plain functions.
#include "popover/ItemRules.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

namespace pw = vx::PopoverWidget;
namespace rules = vx::PopoverWidget::ItemRules;

class TestItemRules : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theFirstElementUnderThePointCounts_data()
    {
        QTest::addColumn<QPoint>("position");
        QTest::addColumn<int>("button");
        QTest::addColumn<int>("flags");
        // Icon 10..29, text 25..64, additional text 60..99, all in rows 5..14.
        QTest::newRow("icon, left") << QPoint(10, 5) << int(Qt::LeftButton) << 17;
        QTest::newRow("icon, right") << QPoint(10, 5) << int(Qt::RightButton) << 33;
        QTest::newRow("icon, middle") << QPoint(10, 5) << int(Qt::MiddleButton) << 1;
        QTest::newRow("icon before text") << QPoint(29, 5) << int(Qt::LeftButton) << 17;
        QTest::newRow("text") << QPoint(30, 5) << int(Qt::LeftButton) << 18;
        QTest::newRow("text before additional text") << QPoint(64, 14) << int(Qt::LeftButton) << 18;
        QTest::newRow("additional text") << QPoint(65, 14) << int(Qt::RightButton) << 36;
        QTest::newRow("last pixel") << QPoint(99, 14) << int(Qt::LeftButton) << 20;
        QTest::newRow("beyond") << QPoint(100, 14) << int(Qt::LeftButton) << 16;
        QTest::newRow("above") << QPoint(30, 4) << int(Qt::LeftButton) << 16;
        QTest::newRow("below") << QPoint(30, 15) << int(Qt::RightButton) << 32;
        QTest::newRow("nothing, no button") << QPoint(0, 0) << int(Qt::NoButton) << 0;
    }

    void theFirstElementUnderThePointCounts()
    {
        QFETCH(QPoint, position);
        QFETCH(int, button);
        QFETCH(int, flags);
        const rules::Elements elements {QRect(10, 5, 20, 10), QRect(25, 5, 40, 10), QRect(60, 5, 40, 10)};
        QCOMPARE(int(rules::hit(elements, position, static_cast<Qt::MouseButton>(button))), flags);
    }

    void elementsThatAreMissingAreNeverHit()
    {
        QCOMPARE(int(rules::hit({}, QPoint(0, 0), Qt::LeftButton)), 16);
        QCOMPARE(int(rules::hit({{}, QRect(0, 0, 5, 5), {}}, QPoint(0, 0), Qt::LeftButton)), 18);
        QCOMPARE(int(rules::hit({{}, {}, QRect(0, 0, 5, 5)}, QPoint(4, 4), Qt::LeftButton)), 20);
    }

    void atMostOneElementAndOneButtonAreReported()
    {
        const quint32 seed = QRandomGenerator::system()->generate();
        qInfo("seed %u", seed);
        QRandomGenerator random(seed);
        const auto rectangle = [&random] {
            return QRect(random.bounded(-20, 20), random.bounded(-20, 20), random.bounded(30), random.bounded(30));
        };
        for (int i = 0; i < 5000; ++i) {
            const rules::Elements elements {rectangle(), rectangle(), rectangle()};
            const QPoint position(random.bounded(-30, 40), random.bounded(-30, 40));
            const auto flags = rules::hit(elements, position, Qt::LeftButton);
            const int part = int(flags) & 15;
            QVERIFY(part == 0 || part == 1 || part == 2 || part == 4);
            QCOMPARE(int(flags) & ~15, 16);
            const bool any = elements.icon.contains(position) || elements.text.contains(position)
                || elements.additionalText.contains(position);
            QCOMPARE(part != 0, any);
        }
    }

    void theRightButtonPerformsOnlyWithItsFlag()
    {
        QVERIFY(rules::performs({}, Qt::LeftButton));
        QVERIFY(rules::performs(pw::eifRightClick, Qt::LeftButton));
        QVERIFY(rules::performs(pw::eifRightClick | pw::eifText, Qt::RightButton));
        QVERIFY(!rules::performs(pw::eifText, Qt::RightButton));
        QVERIFY(!rules::performs(pw::eifRightClick, Qt::MiddleButton));
        QVERIFY(!rules::performs(pw::eifRightClick, Qt::NoButton));
    }

    void aDragStartsAtTheDistance_data()
    {
        QTest::addColumn<QPoint>("position");
        QTest::addColumn<int>("buttons");
        QTest::addColumn<bool>("starts");
        QTest::newRow("9 away") << QPoint(109, 50) << int(Qt::LeftButton) << false;
        QTest::newRow("10 away") << QPoint(110, 50) << int(Qt::LeftButton) << true;
        QTest::newRow("10 up and left") << QPoint(94, 46) << int(Qt::LeftButton) << true;
        QTest::newRow("9 up and left") << QPoint(95, 46) << int(Qt::LeftButton) << false;
        QTest::newRow("with a second button") << QPoint(150, 50) << int(Qt::LeftButton | Qt::RightButton) << true;
        QTest::newRow("right button") << QPoint(150, 50) << int(Qt::RightButton) << false;
        QTest::newRow("no button") << QPoint(150, 50) << 0 << false;
        QTest::newRow("at the end of the world")
            << QPoint(-2147483647, -2147483647) << int(Qt::LeftButton) << true;
    }

    void aDragStartsAtTheDistance()
    {
        QFETCH(QPoint, position);
        QFETCH(int, buttons);
        QFETCH(bool, starts);
        QCOMPARE(rules::startsDrag(Qt::MouseButtons(buttons), QPoint(100, 50), position, 10), starts);
    }

    void onlyAnAmpersandBetweenBlanksIsDoubled_data()
    {
        QTest::addColumn<QString>("text");
        QTest::addColumn<QString>("escaped");
        const auto row = [](const char* text, const char* escaped) {
            QTest::newRow(text) << QString::fromLatin1(text) << QString::fromLatin1(escaped);
        };
        row("Pan & tilt", "Pan && tilt");
        row("A & B & C", "A && B && C");
        row("R&D", "R&D");
        row("&File", "&File");
        row("Save &as", "Save &as");
        row("Save& as", "Save& as");
        row("& tilt", "& tilt");
        row("Pan &", "Pan &");
        row("Pan && tilt", "Pan && tilt");
        row(" & ", " && ");
        row(" & & ", " && & ");
        row("", "");
    }

    void onlyAnAmpersandBetweenBlanksIsDoubled()
    {
        QFETCH(QString, text);
        QFETCH(QString, escaped);
        QCOMPARE(rules::escaped(text), escaped);
    }

    void anEscapedTextStaysAsItIs()
    {
        QRandomGenerator random(4711);
        const QString letters = QStringLiteral("a &");
        for (int i = 0; i < 2000; ++i) {
            QString text;
            for (int n = random.bounded(12); n > 0; --n) {
                text += letters.at(random.bounded(letters.size()));
            }
            const QString once = rules::escaped(text);
            QCOMPARE(once.count(QLatin1Char(' ')), text.count(QLatin1Char(' ')));
            QVERIFY(once.count(QLatin1Char('&')) >= text.count(QLatin1Char('&')));
            if (!text.contains(QLatin1String(" & "))) {
                QCOMPARE(once, text);
            }
        }
    }
};

ZELKOV_TEST_MAIN(TestItemRules)
#include "tst_itemrules.moc"
