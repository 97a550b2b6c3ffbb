// SPDX-License-Identifier: MIT
// Rows with a number, a number and its unit, a date.
#include "Pointer.h"
#include "RowTools.h"
#include "TestCase.h"
#include "TestMain.h"
#include "popover/items/DateTimeItem.h"
#include "popover/items/SpinItem.h"
#include "popover/items/UnitValueItem.h"

#include <QtTest/QtTest>

using namespace vx::PopoverWidget;

namespace
{
const QDateTime c_date(QDate(2024, 5, 6), QTime(7, 8), Qt::UTC);

UnitValueItem* unitRow(QButtonGroup* group, EItemFlags flags = eifText | eifControl)
{
    return new UnitValueItem(QStringLiteral("text"), {QStringLiteral("s"), QStringLiteral("min")},
        QStringLiteral("name"), group, 8, flags, nullptr);
}
}

class TestValueRows : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aSpinRowTakesOrMakesASpinBox()
    {
        QPointer<QSpinBox> given = new QSpinBox;
        given->setRange(0, 500);
        {
            SpinItem row(QStringLiteral("t"), QStringLiteral("name"), 8, given, 250, eifText | eifDisabled, nullptr);
            QCOMPARE(given->value(), 250);
            QVERIFY(!given->isEnabled());
            QCOMPARE(row.spinBox(), given.data());
            QCOMPARE(given->parentWidget(), &row);
        }
        QVERIFY(given.isNull());
        SpinItem row(QStringLiteral("t"), QStringLiteral("name"), 8, nullptr, 5, eifText, nullptr);
        QCOMPARE(row.value(), QVariant(5));
        zelkovtest::SignalRecorder recorder(&row);
        row.setValue(QStringLiteral("7"));
        QCOMPARE(row.value(), QVariant(7));
        row.setValue(QVariant());
        QCOMPARE(row.value(), QVariant(0));
        row.setValue(1000);
        QCOMPARE(row.value(), QVariant(99));
        QCOMPARE(recorder.count(QStringLiteral("itemPerformed")), 0);
    }

    void aClickPerformsASpinRow_data()
    {
        QTest::addColumn<int>("button");
        QTest::addColumn<QPoint>("position");
        QTest::addColumn<bool>("refused");
        QTest::addColumn<QString>("told");
        const QPoint far(140, 35);
        QTest::newRow("left") << int(Qt::LeftButton) << far << false << QStringLiteral("itemPerformed 8 true 16");
        QTest::newRow("right, in spite of the flag") << int(Qt::RightButton) << far << false << QString();
        QTest::newRow("middle") << int(Qt::MiddleButton) << far << false << QString();
        QTest::newRow("outside") << int(Qt::LeftButton) << QPoint(400, 20) << false << QString();
        QTest::newRow("last pixel") << int(Qt::LeftButton) << QPoint(399, 39) << false
                                    << QStringLiteral("itemPerformed 8 true 16");
        QTest::newRow("refused") << int(Qt::LeftButton) << far << true << QString();
    }
    void aClickPerformsASpinRow()
    {
        QFETCH(int, button);
        QFETCH(QPoint, position);
        QFETCH(bool, refused);
        QFETCH(QString, told);
        const rowtest::SharedRights rights;
        rowtest::Host<SpinItem> host(new SpinItem(QStringLiteral("t"), QStringLiteral("name"), 8, nullptr, 5,
            eifText | eifIcon | eifRightClick, nullptr));
        host.row->setSecurityCheck(refused ? QStringLiteral("no") : QString());
        zelkovtest::SignalRecorder recorder(host.row);
        itemtest::click(host.row, position, Qt::MouseButton(button));
        QCOMPARE(rowtest::told(recorder), told.isEmpty() ? QStringList() : QStringList{told});
        QCOMPARE(host.row->iconElement()->isChecked(), !told.isEmpty());
        if (!told.isEmpty()) {
            itemtest::click(host.row, host.middle(host.row->textElement()));
            QCOMPARE(rowtest::told(recorder).last(), QStringLiteral("itemPerformed 8 false 18"));
        }
        recorder.clear();
        host.row->spinBox()->stepUp();
        QVERIFY(recorder.entries().isEmpty());
    }

    void aDateRowIsPerformedWithoutFlags()
    {
        rowtest::Host<DateTimeItem> host(new DateTimeItem(QStringLiteral("t"), c_date, Qt::UTC,
            QStringLiteral("dd.MM.yyyy hh:mm"), QStringLiteral("name"), 8, eifText, nullptr));
        QDateTimeEdit* const edit = host.row->dateTimeEdit();
        QCOMPARE(edit->objectName(), QStringLiteral("dateTimeEdit"));
        QCOMPARE(edit->timeSpec(), Qt::UTC);
        QCOMPARE(edit->displayFormat(), QStringLiteral("dd.MM.yyyy hh:mm"));
        QCOMPARE(host.row->value().toDateTime(), c_date);
        zelkovtest::SignalRecorder recorder(host.row);
        itemtest::click(host.row, QPoint(140, 35));
        host.row->setValue(c_date.addDays(2));
        QCOMPARE(edit->dateTime(), c_date.addDays(2));
        QVERIFY(recorder.entries().isEmpty());
        edit->setFocus();
        QTest::keyClick(edit, Qt::Key_Up);
        QCOMPARE(recorder.names(), QStringList{QStringLiteral("itemPerformed")});
        QCOMPARE(int(recorder.entries().first().arguments.at(3).value<EItemPerformedFlags>()), 0);
        const QVariant value = recorder.entries().first().arguments.at(1);
        QCOMPARE((value.userType() == QMetaType::QVariant ? value.value<QVariant>() : value).toDateTime(),
            edit->dateTime());
        QCOMPARE(edit->dateTime(), c_date.addDays(3));
    }

    void aDateRowMayDieWhenItIsPerformed()
    {
        rowtest::Host<DateTimeItem> host(new DateTimeItem(QStringLiteral("t"), c_date, Qt::UTC,
            QStringLiteral("dd.MM.yyyy hh:mm"), QStringLiteral("name"), 8, eifText, nullptr));
        QPointer<DateTimeItem> row(host.row);
        connect(host.row, &Item::itemPerformed, this, [row] { delete row.data(); });
        QTest::keyClick(host.row->dateTimeEdit(), Qt::Key_Up);
        QVERIFY(row.isNull());
    }

    void aUnitRowIsCheckedByChangesAndPerformedByClicks()
    {
        QButtonGroup group;
        QRadioButton other;
        group.addButton(&other);
        rowtest::Host<UnitValueItem> host(unitRow(&group));
        QCOMPARE(host.row->valueItem()->objectName(), QStringLiteral("edit"));
        QCOMPARE(host.row->unitItem()->objectName(), QStringLiteral("edit"));
        QCOMPARE(host.row->unitItem()->count(), 2);
        QCOMPARE(group.buttons().size(), 2);
        zelkovtest::SignalRecorder recorder(host.row);
        host.row->valueItem()->setValue(5);
        QVERIFY(host.row->radioButton()->isChecked());
        QVERIFY(host.row->isChecked());
        QCOMPARE(rowtest::events(recorder), QStringList());
        other.setChecked(true);
        QVERIFY(!host.row->isChecked());
        host.row->unitItem()->setCurrentIndex(1);
        QVERIFY(host.row->radioButton()->isChecked() && host.row->isChecked());
        other.setChecked(true);
        recorder.clear();
        itemtest::click(host.row, host.middle(host.row->textElement()));
        QCOMPARE(rowtest::events(recorder), QStringList{QStringLiteral("itemPerformed 8 null 18")});
        QVERIFY(host.row->radioButton()->isChecked());
        recorder.clear();
        itemtest::click(host.row, QPoint(140, 35), Qt::RightButton);
        itemtest::click(host.row, QPoint(400, 35));
        QCOMPARE(rowtest::events(recorder), QStringList());
        // The radio button is the row's: a click on it counts.
        zelkovtest::Pointer pointer(&host.window);
        pointer.click(host.inWindow(host.row->radioButton()));
        QCOMPARE(rowtest::events(recorder), QStringList{QStringLiteral("itemPerformed 8 null 16")});
    }

    void aUnitRowWithoutAGroupHasNoRadioButton()
    {
        const rowtest::SharedRights rights;
        rowtest::Host<UnitValueItem> host(unitRow(nullptr, eifText | eifDisabled | eifRightClick));
        QVERIFY(host.row->radioButton() == nullptr);
        QVERIFY(!host.row->valueItem()->isEnabled() && !host.row->unitItem()->isEnabled());
        host.row->setBusy(true, true);
        QVERIFY(host.row->valueItem()->isHidden() && !host.row->unitItem()->isHidden());
        zelkovtest::SignalRecorder recorder(host.row);
        itemtest::click(host.row, QPoint(140, 35), Qt::RightButton);
        QCOMPARE(rowtest::events(recorder), QStringList{QStringLiteral("itemPerformed 8 null 32")});
        recorder.clear();
        host.row->setSecurityCheck(QStringLiteral("no"));
        itemtest::click(host.row, QPoint(140, 35));
        QVERIFY(recorder.entries().isEmpty());
    }
};

ZELKOV_TEST_MAIN(TestValueRows)
#include "tst_valuerows.moc"
