// SPDX-License-Identifier: MIT
// Rows with a check box, a box of three states or a sliding switch.
#include "Pointer.h"
#include "RowTools.h"
#include "TestCase.h"
#include "TestMain.h"
#include "popover/items/CheckItem.h"
#include "popover/items/TristateCheckItem.h"
#include "popover/items/iOSCheckItem.h"

#include <QtCore/QPropertyAnimation>
#include <QtTest/QtTest>

using namespace vx::PopoverWidget;

namespace
{
const EItemFlags c_usual = eifText | eifIcon | eifControl;

CheckItem* checkRow(bool checked = false, EItemFlags flags = c_usual)
{
    return new CheckItem(QStringLiteral("text"), QStringLiteral("name"), 3, checked, flags, nullptr);
}
TristateCheckItem* threeRow(bool tristate = true, int state = 0, EItemFlags flags = c_usual)
{
    return new TristateCheckItem(QStringLiteral("text"), QStringLiteral("name"), 3, tristate, state, flags, nullptr);
}
iOSCheckItem* switchRow(bool checked = false, EItemFlags flags = c_usual)
{
    return new iOSCheckItem(QStringLiteral("text"), QStringLiteral("name"), 3, checked, flags, nullptr);
}
QStringList list(std::initializer_list<const char*> texts)
{
    QStringList result;
    for (const char* text : texts) {
        result << QString::fromLatin1(text);
    }
    return result;
}
}

class TestCheckRows : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theyStartAsTold()
    {
        std::unique_ptr<CheckItem> row(checkRow(true));
        QVERIFY(row->checkBox()->isChecked());
        QVERIFY(row->isChecked());
        QVERIFY(row->textElement()->isChecked());
        QCOMPARE(row->value(), QVariant(true));
        QCOMPARE(row->checkBox()->parentWidget(), row.get());
        std::unique_ptr<TristateCheckItem> three(threeRow(true, 1));
        QCOMPARE(three->checkBox()->objectName(), QStringLiteral("tristate"));
        QCOMPARE(three->value(), QVariant(1));
        QVERIFY(three->checkBox()->isTristate());
        QVERIFY(!three->isChecked());
        std::unique_ptr<iOSCheckItem> slide(switchRow(true));
        QCOMPARE(slide->value(), QVariant(true));
        QVERIFY(!slide->checkBox()->getAnimationModeOn());
        std::unique_ptr<CheckItem> off(checkRow(false, c_usual | eifDisabled));
        QVERIFY(!off->checkBox()->isEnabled());
        std::unique_ptr<TristateCheckItem> threeOff(threeRow(true, 0, c_usual | eifDisabled));
        QVERIFY(!threeOff->checkBox()->isEnabled());
        std::unique_ptr<iOSCheckItem> slideOff(switchRow(false, c_usual | eifDisabled));
        QVERIFY(!slideOff->checkBox()->isEnabled());
        QVERIFY(slideOff->checkBox()->getAnimationModeOn());
    }

    void withoutTheControlFlagTheBoxStaysHiddenAndWorks()
    {
        rowtest::Host<CheckItem> host(checkRow(false, eifText));
        QVERIFY(!host.row->checkBox()->isVisible());
        zelkovtest::SignalRecorder recorder(host.row);
        itemtest::click(host.row, QPoint(390, 20));
        QCOMPARE(host.row->value(), QVariant(true));
        QCOMPARE(recorder.count(QStringLiteral("itemPerformed")), 1);
        QPointer<QCheckBox> box(host.row->checkBox());
        delete host.row;
        QVERIFY(box.isNull());
    }

    void aClickOnTheBoxItselfCarriesEight()
    {
        rowtest::Host<CheckItem> host(checkRow());
        QCoreApplication::processEvents();
        zelkovtest::SignalRecorder recorder(host.row);
        zelkovtest::Pointer pointer(&host.window);
        pointer.click(host.inWindow(host.row->checkBox()));
        QCOMPARE(rowtest::events(recorder), list({"toggled true name", "itemPerformed 3 true 8"}));
        recorder.clear();
        // After a click on the row the flags are back.
        itemtest::click(host.row, host.middle(host.row->textElement()));
        QCOMPARE(rowtest::events(recorder), list({"toggled false name", "itemPerformed 3 false 18"}));
        recorder.clear();
        pointer.click(host.inWindow(host.row->checkBox()) + QPoint(1, 0));
        QCOMPARE(rowtest::events(recorder), list({"toggled true name", "itemPerformed 3 true 8"}));
        QVERIFY(host.row->textElement()->isChecked() && host.row->iconElement()->isChecked());
    }

    void theSwitchKeepsTheFlagsOfTheLastClickOnTheRow()
    {
        rowtest::Host<iOSCheckItem> host(switchRow());
        QCoreApplication::processEvents();
        zelkovtest::SignalRecorder recorder(host.row);
        zelkovtest::Pointer pointer(&host.window);
        pointer.click(host.inWindow(host.row->checkBox()));
        QCOMPARE(rowtest::events(recorder), list({"toggled true name", "itemPerformed 3 true 8"}));
        recorder.clear();
        itemtest::click(host.row, host.middle(host.row->textElement()));
        pointer.click(host.inWindow(host.row->checkBox()) + QPoint(1, 0));
        QCOMPARE(rowtest::events(recorder), list({"toggled false name", "itemPerformed 3 false 18",
            "toggled true name", "itemPerformed 3 true 18"}));
    }

    void aClickOnTheRowSlidesTheSwitch()
    {
        rowtest::Host<iOSCheckItem> host(switchRow());
        QCoreApplication::processEvents();
        host.row->checkBox()->setAnimationMode(false);
        itemtest::click(host.row, host.middle(host.row->textElement()));
        QCOMPARE(host.row->checkBox()->findChild<QPropertyAnimation*>()->state(), QAbstractAnimation::Running);
        QVERIFY(!host.row->checkBox()->getAnimationModeOn());
        QVERIFY(host.row->textElement()->isChecked());
    }

    void refusedChangesAreUndoneAndNobodyHears_data()
    {
        QTest::addColumn<bool>("onBox");
        QTest::newRow("click on the row") << false;
        QTest::newRow("click on the box") << true;
    }
    void refusedChangesAreUndoneAndNobodyHears()
    {
        QFETCH(bool, onBox);
        const rowtest::SharedRights rights;
        rowtest::Host<CheckItem> check(checkRow());
        rowtest::Host<iOSCheckItem> slide(switchRow(true));
        rowtest::Host<TristateCheckItem> three(threeRow(true, 1));
        QCoreApplication::processEvents();
        for (Item* row : {static_cast<Item*>(check.row), static_cast<Item*>(slide.row), static_cast<Item*>(three.row)}) {
            row->setSecurityCheck(QStringLiteral("no"));
            const QVariant before = row->value();
            zelkovtest::SignalRecorder recorder(row);
            if (onBox) {
                QCheckBox* const box = row->findChild<QCheckBox*>();
                box->toggle();
            } else {
                itemtest::click(row, row->textElement()->mapTo(row, row->textElement()->rect().center()));
            }
            QVERIFY(recorder.entries().isEmpty());
            if (row == static_cast<Item*>(three.row) && onBox) {
                // QCheckBox's own step from 1 goes to 0; the ring then leads back from there to 2.
                continue;
            }
            QCOMPARE(row->value(), before);
        }
        // With the right back, the next click counts.
        check.row->setSecurityCheck(QStringLiteral("yes"));
        zelkovtest::SignalRecorder recorder(check.row);
        itemtest::click(check.row, check.middle(check.row->textElement()));
        QCOMPARE(rowtest::events(recorder), list({"toggled true name", "itemPerformed 3 true 18"}));
    }

    void theRightIsAskedForTheChangesThatTakeIt()
    {
        const rowtest::SharedRights rights;
        rowtest::Host<CheckItem> host(checkRow());
        host.row->setSecurityCheck(QStringLiteral("no"));
        const QPoint text = host.middle(host.row->textElement());
        host.row->setSecurityCheckStates(false, true);
        zelkovtest::SignalRecorder recorder(host.row);
        itemtest::click(host.row, text);
        // Nobody was asked yet, so it is not performed: the change stands and is told.
        QCOMPARE(rowtest::events(recorder), list({"toggled true name"}));
        QVERIFY(rights.rights->m_asked.isEmpty());
        recorder.clear();
        itemtest::click(host.row, text);
        QCOMPARE(rights.rights->m_asked.size(), 1);
        QCOMPARE(host.row->value(), QVariant(true));
        QVERIFY(recorder.entries().isEmpty());
        host.row->setSecurityCheckStates(false, false);
        itemtest::click(host.row, text);
        itemtest::click(host.row, text);
        QCOMPARE(rowtest::events(recorder), list({"toggled false name", "toggled true name"}));
        QCOMPARE(rights.rights->m_asked.size(), 1);
    }

    void changesFromCodePerformNothing()
    {
        std::unique_ptr<CheckItem> check(checkRow());
        std::unique_ptr<iOSCheckItem> slide(switchRow());
        std::unique_ptr<TristateCheckItem> three(threeRow());
        zelkovtest::SignalRecorder recorder(check.get());
        recorder.add(slide.get());
        recorder.add(three.get());
        check->setValue(true);
        slide->setValue(true);
        three->setValue(1);
        three->setValue(true);
        QCOMPARE(three->value(), QVariant(2));
        three->setValue(false);
        three->setCheckState(2);
        QVERIFY(three->isChecked() && three->textElement()->isChecked());
        check->setChecked(false);
        slide->setChecked(false);
        three->setChecked(false);
        QCOMPARE(recorder.names().size(), 9);
        QCOMPARE(recorder.count(QStringLiteral("layoutChanged")), 9);
        QCOMPARE(check->value(), QVariant(false));
        QVERIFY(!check->textElement()->isChecked());
        recorder.clear();
        // Other types are ignored.
        check->setValue(1);
        check->setValue(QStringLiteral("true"));
        slide->setValue(1);
        three->setValue(QStringLiteral("2"));
        three->setValue(7);
        three->setCheckState(-1);
        QVERIFY(recorder.entries().isEmpty());
        QCOMPARE(check->value(), QVariant(false));
        QCOMPARE(three->value(), QVariant(0));
        // The switch jumps, and slides from then on.
        QVERIFY(slide->checkBox()->getAnimationModeOn());
    }

    void aClickOnTheRowGoesRoundTheRing_data()
    {
        QTest::addColumn<bool>("tristate");
        QTest::newRow("tristate") << true;
        QTest::newRow("not tristate") << false;
    }
    void aClickOnTheRowGoesRoundTheRing()
    {
        QFETCH(bool, tristate);
        rowtest::Host<TristateCheckItem> host(threeRow(tristate));
        const QPoint text = host.middle(host.row->textElement());
        zelkovtest::SignalRecorder recorder(host.row);
        for (int i = 0; i < 3; ++i) {
            itemtest::click(host.row, text);
        }
        QCOMPARE(rowtest::events(recorder),
            list({"stateChanged 1 name", "itemPerformed 3 1 18", "stateChanged 2 name", "itemPerformed 3 2 18",
                "stateChanged 0 name", "itemPerformed 3 0 18"}));
        QVERIFY(!host.row->textElement()->isChecked());
    }

    void tristateOffMovesThePartialStateAway()
    {
        std::unique_ptr<TristateCheckItem> row(threeRow(true, 1));
        row->setTristate(false);
        QCOMPARE(row->checkState(), 0);
        QVERIFY(!row->checkBox()->isTristate());
        QVERIFY(!row->isTristate());
        row->setCheckState(2);
        row->setTristate(true);
        QCOMPARE(row->checkState(), 2);
        row->setTristate(false);
        QCOMPARE(row->checkState(), 2);
    }

    void checkedTextIsBold()
    {
        rowtest::Host<CheckItem> host(checkRow(true, c_usual | eifBoldSelection));
        QVERIFY(host.row->textElement()->font().bold());
        itemtest::click(host.row, host.middle(host.row->textElement()));
        QVERIFY(!host.row->textElement()->font().bold());
    }

    void theSlotMayDeleteTheRowInAnySignal_data()
    {
        QTest::addColumn<int>("which");
        QTest::addColumn<bool>("onBox");
        for (int which = 0; which < 6; ++which) {
            QTest::addRow("%d, row", which) << which << false;
            QTest::addRow("%d, box", which) << which << true;
        }
    }
    void theSlotMayDeleteTheRowInAnySignal()
    {
        QFETCH(int, which);
        QFETCH(bool, onBox);
        QWidget window;
        window.resize(420, 60);
        QPointer<Item> row;
        const auto end = [&row] { delete row.data(); };
        if (which < 2) {
            auto* const check = checkRow();
            row = check;
            if (which == 0) {
                connect(check, &CheckItem::toggled, &window, end);
            }
        } else if (which < 4) {
            auto* const slide = switchRow();
            row = slide;
            if (which == 2) {
                connect(slide, &iOSCheckItem::toggled, &window, end);
            }
        } else {
            auto* const three = threeRow();
            row = three;
            if (which == 4) {
                connect(three, &TristateCheckItem::stateChanged, &window, end);
            }
        }
        if (which % 2 == 1) {
            connect(row.data(), &Item::itemPerformed, &window, end);
        }
        row->setParent(&window);
        row->setGeometry(0, 0, 400, 40);
        window.show();
        if (onBox) {
            zelkovtest::Pointer pointer(&window);
            QCheckBox* const box = row->findChild<QCheckBox*>();
            pointer.click(box->mapTo(&window, box->rect().center()));
        } else {
            itemtest::click(row, QPoint(200, 35));
        }
        QVERIFY(row.isNull());
    }
};

ZELKOV_TEST_MAIN(TestCheckRows)
#include "tst_checkrows.moc"
