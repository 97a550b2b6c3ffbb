// SPDX-License-Identifier: MIT
// Rows with a combo box, a radio button or a button with states.
#include "Pointer.h"
#include "RowTools.h"
#include "TestCase.h"
#include "TestMain.h"
#include "popover/items/ComboBoxItem.h"
#include "popover/items/ControlRules.h"
#include "popover/items/MultiStateItem.h"
#include "popover/items/RadioItem.h"

#include <QtCore/QStringListModel>
#include <QtGui/QStandardItemModel>
#include <QtTest/QtTest>

using namespace vx::PopoverWidget;

namespace
{
ComboBoxItem* comboRow(EItemFlags flags = eifText | eifControl)
{
    auto* const row = new ComboBoxItem(QStringLiteral("text"), QStringLiteral("name"), 5,
        {QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")}, flags, nullptr);
    row->comboBox()->setItemData(1, 100);
    row->comboBox()->setItemData(2, 200);
    return row;
}
QStringList lines(std::initializer_list<const char*> texts)
{
    QStringList result;
    for (const char* text : texts) {
        result << QString::fromLatin1(text);
    }
    return result;
}
}

class TestChoiceRows : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aComboRowIsPerformedByTheUsersChoice()
    {
        rowtest::Host<ComboBoxItem> host(comboRow());
        QCOMPARE(host.row->comboBox()->objectName(), QStringLiteral("combo"));
        QCOMPARE(host.row->comboBox()->parentWidget(), host.row);
        zelkovtest::SignalRecorder recorder(host.row);
        host.row->comboBox()->setFocus();
        QTest::keyClick(host.row->comboBox(), Qt::Key_Down);
        QCOMPARE(rowtest::told(recorder), lines({"itemPerformed 5 1 8"}));
        QCOMPARE(rowtest::userDataOf(recorder).toInt(), 100);
        recorder.clear();
        QTest::keyClick(host.row->comboBox(), Qt::Key_Home);
        QCOMPARE(rowtest::told(recorder), lines({"itemPerformed 5 0 8"}));
    }

    void anEditableOneIsPerformedWithTheTextAlone()
    {
        rowtest::Host<ComboBoxItem> host(comboRow());
        host.row->comboBox()->setEditable(true);
        zelkovtest::SignalRecorder recorder(host.row);
        host.row->comboBox()->setCurrentIndex(2);
        QCOMPARE(rowtest::told(recorder), lines({"itemPerformed 5 c 8"}));
        recorder.clear();
        host.row->comboBox()->setEditText(QStringLiteral("other"));
        QCOMPARE(rowtest::told(recorder), lines({"itemPerformed 5 other 8"}));
    }

    void valuesFromCodeAreIndexesOrTexts()
    {
        std::unique_ptr<ComboBoxItem> row(comboRow());
        zelkovtest::SignalRecorder recorder(row.get());
        row->setValue(1);
        QCOMPARE(row->value(), QVariant(1));
        QCOMPARE(row->currentText(), QStringLiteral("b"));
        QCOMPARE(row->userData(), QVariant(100));
        row->setValue(QStringLiteral("c"));
        QCOMPARE(row->value(), QVariant(2));
        QCOMPARE(rowtest::told(recorder), lines({"layoutChanged", "layoutChanged"}));
        recorder.clear();
        row->setValue(QVariant());
        row->setValue(2.0);
        row->setCurrentText(QStringLiteral("a"));
        QCOMPARE(row->value(), QVariant(0));
        QVERIFY(recorder.entries().isEmpty());
        row->setValue(QStringLiteral("unknown"));
        QCOMPARE(row->value(), QVariant(0));
    }

    void userDataFindEntries()
    {
        std::unique_ptr<ComboBoxItem> row(comboRow());
        zelkovtest::SignalRecorder recorder(row.get());
        row->setValueByUserData(200);
        QCOMPARE(row->value(), QVariant(2));
        row->setValueByUserData(300);
        QCOMPARE(row->value(), QVariant(2));
        QCOMPARE(recorder.count(QStringLiteral("itemPerformed")), 0);
        QCOMPARE(row->getUserDataForValue(1), QVariant(100));
        QCOMPARE(row->getUserDataForValue(QStringLiteral("c")), QVariant(200));
        QVERIFY(row->getUserDataForValue(9).isNull());
        QVERIFY(row->getUserDataForValue(QStringLiteral("z")).isNull());
        QCOMPARE(row->getValueForUserData(100).toInt(), 1);
        QCOMPARE(row->getValueForUserData(300).toInt(), -1);
    }

    void entriesCanBeSwitchedOff()
    {
        std::unique_ptr<ComboBoxItem> row(comboRow());
        const auto* const model = qobject_cast<QStandardItemModel*>(row->comboBox()->model());
        row->enableItem(0, false);
        QVERIFY(!model->item(0)->isEnabled());
        row->enableItem(0, true);
        QVERIFY(model->item(0)->isEnabled());
        row->enableItemByUserData(200, false);
        QVERIFY(!model->item(2)->isEnabled());
        row->enableItemByUserData(300, false);
        row->enableItem(9, false);
        row->enableItem(-1, false);
        QVERIFY(model->item(0)->isEnabled() && model->item(1)->isEnabled());
        QStringListModel other(QStringList{QStringLiteral("x")});
        row->comboBox()->setModel(&other);
        row->enableItem(0, false);
    }

    void aProtectedComboRowAcceptsTheRelease()
    {
        const rowtest::SharedRights rights;
        rowtest::Host<ComboBoxItem> host(comboRow());
        QVERIFY(!itemtest::sendMouse(
            host.row, QEvent::MouseButtonRelease, QPoint(2, 2), Qt::LeftButton, Qt::NoButton));
        host.row->setSecurityCheck(QStringLiteral("no"));
        QVERIFY(itemtest::sendMouse(
            host.row, QEvent::MouseButtonRelease, QPoint(2, 2), Qt::LeftButton, Qt::NoButton));
    }

    void aComboRowMayDieWhenItIsPerformed()
    {
        rowtest::Host<ComboBoxItem> host(comboRow());
        QPointer<ComboBoxItem> row(host.row);
        connect(host.row, &Item::itemPerformed, this, [row] { delete row.data(); });
        host.row->comboBox()->setFocus();
        QTest::keyClick(host.row->comboBox(), Qt::Key_Down);
        QVERIFY(row.isNull());
    }

    void radioRowsAreChosenOnce()
    {
        QButtonGroup group;
        QWidget window;
        window.resize(420, 100);
        RadioItem first(QStringLiteral("one"), QStringLiteral("r"), 1, true, &group, eifText | eifControl, &window);
        RadioItem second(QStringLiteral("two"), QStringLiteral("r"), 2, false, &group, eifText | eifControl, &window);
        first.setGeometry(0, 0, 400, 40);
        second.setGeometry(0, 50, 400, 40);
        window.show();
        QCOMPARE(first.userData(), QVariant(QStringLiteral("one")));
        QVERIFY(first.radioButton()->testAttribute(Qt::WA_TransparentForMouseEvents));
        QCOMPARE(first.buttonGroup(), &group);
        QCOMPARE(group.buttons().size(), 2);
        zelkovtest::SignalRecorder recorder(&first);
        recorder.add(&second);
        itemtest::click(&first, QPoint(200, 35));
        QVERIFY(recorder.entries().isEmpty());
        itemtest::click(&second, second.textElement()->geometry().center());
        QCOMPARE(rowtest::events(recorder), lines({"itemPerformed 2 true 18"}));
        QCOMPARE(first.value(), QVariant(false));
        QVERIFY(!first.textElement()->isChecked());
        QVERIFY(second.textElement()->isChecked());
        recorder.clear();
        // Also where the click hits the button, which is transparent.
        zelkovtest::Pointer pointer(&window);
        pointer.click(first.radioButton()->mapTo(&window, first.radioButton()->rect().center()));
        QCOMPARE(rowtest::events(recorder), lines({"itemPerformed 1 true 16"}));
        recorder.clear();
        group.setExclusive(false);
        itemtest::click(&first, QPoint(200, 35));
        QCOMPARE(rowtest::events(recorder), lines({"itemPerformed 1 true 16"}));
        recorder.clear();
        first.setValue(false);
        QCOMPARE(first.value(), QVariant(false));
        first.setValue(1);
        first.setValue(QStringLiteral("true"));
        QCOMPARE(first.value(), QVariant(false));
        QCOMPARE(rowtest::events(recorder), QStringList());
        delete first.radioButton();
        QVERIFY(first.value().isNull());
    }

    void aMultiStateRowIsPerformedAndKeepsItsState()
    {
        rowtest::Host<MultiStateItem> host(new MultiStateItem(
            QStringLiteral("text"), QStringLiteral("name"), {3, 4}, 6, eifText | eifControl, nullptr));
        QCoreApplication::processEvents();
        QCOMPARE(host.row->multiStateItem()->objectName(), QStringLiteral("multiStateWidget"));
        QVERIFY(host.row->multiStateItem()->isVisible());
        zelkovtest::SignalRecorder recorder(host.row);
        QVERIFY(itemtest::sendMouse(host.row, QEvent::MouseButtonRelease,
            host.middle(host.row->textElement()), Qt::LeftButton, Qt::NoButton));
        QCOMPARE(rowtest::told(recorder), lines({"itemPerformed 6 false 18"}));
        QCOMPARE(host.row->value(), QVariant(3));
        recorder.clear();
        zelkovtest::Pointer pointer(&host.window);
        pointer.click(host.inWindow(host.row->multiStateItem()));
        QCOMPARE(host.row->value(), QVariant(4));
        QVERIFY(recorder.entries().isEmpty());
        host.row->setValue(3);
        QCOMPARE(host.row->multiStateItem()->state(), 3);
        host.row->setValue(QStringLiteral("4"));
        host.row->setValue(true);
        QCOMPARE(host.row->value(), QVariant(3));
        QVERIFY(recorder.entries().isEmpty());
    }

    void withoutTheControlFlagTheStatesAreThereUnseen()
    {
        rowtest::Host<MultiStateItem> host(new MultiStateItem(
            QStringLiteral("text"), QStringLiteral("name"), {3, 4}, 6, eifText, nullptr));
        QVERIFY(!host.row->multiStateItem()->isVisible());
        QCOMPARE(host.row->multiStateItem()->parentWidget(), host.row);
        host.row->setBusy(false, false);
        QVERIFY(!host.row->multiStateItem()->isVisible());
        QCOMPARE(host.row->value(), QVariant(3));
    }

    void theBusyMarkReplacesTheControl()
    {
        std::unique_ptr<ComboBoxItem> row(comboRow());
        row->setBusy(true, true);
        QVERIFY(row->comboBox()->isHidden());
        row->setBusy(false, true);
        QVERIFY(!row->comboBox()->isHidden());
        std::unique_ptr<ComboBoxItem> without(comboRow(eifText));
        without->setBusy(false, false);
        QVERIFY(without->comboBox()->isHidden());
        std::unique_ptr<ComboBoxItem> off(comboRow(eifText | eifDisabled));
        QVERIFY(!off->comboBox()->isEnabled());
    }

    void theRingAndTheFlagsOfControls()
    {
        for (int state = 0; state < 3; ++state) {
            QCOMPARE(ControlRules::previousInRing(ControlRules::nextInRing(state)), state);
        }
        QCOMPARE(ControlRules::nextInRing(2), 0);
        QCOMPARE(int(ControlRules::onControl(Qt::LeftButton)), 24);
        QCOMPARE(int(ControlRules::onControl(Qt::RightButton)), 40);
        QCOMPARE(int(ControlRules::onControl(Qt::MiddleButton)), 8);
        QVERIFY(ControlRules::isClick(QRect(0, 0, 10, 10), QPoint(9, 9), Qt::LeftButton, {}));
        QVERIFY(!ControlRules::isClick(QRect(0, 0, 10, 10), QPoint(10, 9), Qt::LeftButton, {}));
        QVERIFY(!ControlRules::isClick(QRect(0, 0, 10, 10), QPoint(9, 9), Qt::RightButton, {}));
        QVERIFY(ControlRules::isClick(QRect(0, 0, 10, 10), QPoint(9, 9), Qt::RightButton, eifRightClick));
    }
};

ZELKOV_TEST_MAIN(TestChoiceRows)
#include "tst_choicerows.moc"
