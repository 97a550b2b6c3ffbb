// SPDX-License-Identifier: MIT
// Rows that show text or a picture, the button row and the separator.
#include "RowTools.h"
#include "TestCase.h"
#include "TestMain.h"
#include "indicators/Label.h"
#include "popover/items/ImageItem.h"
#include "popover/items/LabelItem.h"
#include "popover/items/PushItem.h"
#include "popover/items/Separator.h"

#include <QtTest/QtTest>
#include <QtWidgets/QApplication>

using namespace vx::PopoverWidget;

class TestTextRows : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aLabelRowHasOneLabelAndNoTextElement()
    {
        LabelItem row(QStringLiteral("a & b"), QStringLiteral("more"), QStringLiteral("name"), 3,
            eifText | eifIcon | eifAdditionalText, nullptr);
        QCOMPARE(row.objectName(), QStringLiteral("name"));
        QCOMPARE(row.label()->objectName(), QStringLiteral("label"));
        QVERIFY(row.textElement() == nullptr);
        QVERIFY(row.label()->wordWrap());
        QVERIFY(row.label()->openExternalLinks());
        QCOMPARE(row.label()->focusPolicy(), Qt::NoFocus);
        QCOMPARE(row.label()->text(), QStringLiteral("a & b"));
        QCOMPARE(row.value().toString(), QStringLiteral("more"));
        QVERIFY(row.iconElement()->geometry().left() <= row.label()->geometry().left());
        QVERIFY(!(row.label()->alignment() & Qt::AlignHCenter));
        LabelItem centred(QStringLiteral("x"), QString(), QString(), 3, eifText | eifCentered, nullptr);
        QCOMPARE(centred.label()->alignment(), Qt::Alignment(Qt::AlignCenter));
        LabelItem bare(QStringLiteral("x"), QString(), QString(), 3, {}, nullptr);
        QCOMPARE(bare.text(), QStringLiteral("x"));
        QVERIFY(bare.value().isNull());
    }

    void theTextWrapsToTheWidthOfTheRow()
    {
        rowtest::Host<LabelItem> host(new LabelItem(
            QStringLiteral("a text of so many words that one line does not hold them, nor do two of them, by far"),
            QString(), QString(), 3, eifText, nullptr));
        QCoreApplication::processEvents();
        QCOMPARE(host.row->label()->width(), 250);
        QVERIFY(host.row->heightForWidth(250) > host.row->heightForWidth(400));
    }

    void theTextOfALabelRow()
    {
        LabelItem row(QStringLiteral("a"), QString(), QString(), 3, eifText, nullptr);
        zelkovtest::SignalRecorder recorder(&row);
        row.setText(QStringLiteral("b & c"));
        QCOMPARE(row.label()->text(), QStringLiteral("b & c"));
        row.setValue(17);
        QCOMPARE(row.text(), QStringLiteral("17"));
        QCOMPARE(rowtest::told(recorder), (QStringList{QStringLiteral("layoutChanged"), QStringLiteral("layoutChanged")}));
        row.setBold(false);
        QVERIFY(row.label()->font().bold());
    }

    void theLabelIsWhatTheBusyMarkReplaces()
    {
        LabelItem row(QStringLiteral("a"), QStringLiteral("b"), QString(), 3, eifText | eifAdditionalText, nullptr);
        row.setBusy(true, true);
        QVERIFY(row.label()->isHidden());
        QVERIFY(!row.additionalTextElement()->isHidden());
        row.setBusy(false, true);
        QVERIFY(!row.label()->isHidden());
    }

    void anImageRowTakesPicturesOnly()
    {
        QPixmap picture(30, 20);
        picture.fill(Qt::red);
        ImageItem row(QStringLiteral("name"), 4, picture, nullptr);
        QCOMPARE(row.label()->objectName(), QStringLiteral("image"));
        QVERIFY(row.label()->hasScaledContents());
        QCOMPARE(row.label()->focusPolicy(), Qt::NoFocus);
        QCOMPARE(row.value().value<QPixmap>().size(), QSize(30, 20));
        row.setValue(QStringLiteral("no picture"));
        row.setValue(QImage(4, 4, QImage::Format_RGB32));
        QCOMPARE(row.value().value<QPixmap>().size(), QSize(30, 20));
        row.setValue(QPixmap(5, 6));
        QCOMPARE(row.value().value<QPixmap>().size(), QSize(5, 6));
        row.setValue(QPixmap());
        QVERIFY(row.value().isNull());
    }

    void aPushRowDismissesAndTogglesItsElements()
    {
        PushItem row(QStringLiteral("a & b"), QString(), QStringLiteral("name"), 5, eifText | eifIcon, nullptr);
        QCOMPARE(row.defaultItemFlags(), ecfDismiss);
        QCOMPARE(row.pushItem(), row.textElement());
        QCOMPARE(row.text(), QStringLiteral("a && b"));
        row.setUserData(QStringLiteral("data"));
        zelkovtest::SignalRecorder recorder(&row);
        row.performSingleClick(eipText | eipRightButton);
        QVERIFY(row.isChecked());
        QVERIFY(row.iconElement()->isChecked());
        row.performSingleClick(eipIcon);
        QVERIFY(!row.isChecked());
        QCOMPARE(rowtest::told(recorder),
            (QStringList{QStringLiteral("itemPerformed 5 true 34"), QStringLiteral("itemPerformed 5 false 1")}));
        QCOMPARE(rowtest::userDataOf(recorder).toString(), QStringLiteral("data"));
        PushItem icon(QStringLiteral("a"), QString(), QString(), 5, eifIcon, nullptr);
        QCOMPARE(icon.pushItem(), icon.iconElement());
        PushItem bare(QStringLiteral("a"), QString(), QString(), 5, {}, nullptr);
        QVERIFY(bare.pushItem() == nullptr);
        zelkovtest::SignalRecorder ofBare(&bare);
        bare.performSingleClick({});
        QCOMPARE(rowtest::told(ofBare), QStringList{QStringLiteral("itemPerformed 5 false 0")});
    }

    void anElementThatDiffersIsToggledToo()
    {
        PushItem row(QStringLiteral("a"), QString(), QString(), 5, eifText | eifIcon, nullptr);
        row.iconElement()->setChecked(true);
        row.performSingleClick({});
        QVERIFY(!row.iconElement()->isChecked());
        QVERIFY(row.textElement()->isChecked());
    }

    void oneClickOfTwoPossibleWaits()
    {
        rowtest::Host<PushItem> host(
            new PushItem(QStringLiteral("a"), QString(), QString(), 5, eifText | eifDoubleClick, nullptr));
        zelkovtest::SignalRecorder recorder(host.row);
        QSignalSpy performed(host.row, &Item::itemPerformed);
        itemtest::click(host.row, host.middle(host.row->textElement()));
        QCOMPARE(performed.count(), 0);
        QVERIFY(performed.wait(3000));
        QCOMPARE(rowtest::told(recorder), QStringList{QStringLiteral("itemPerformed 5 true 18")});
    }

    void aDoubleClickPerformsOnceAtOnceAndTogglesOnce()
    {
        rowtest::Host<PushItem> host(
            new PushItem(QStringLiteral("a"), QString(), QString(), 5, eifText | eifDoubleClick, nullptr));
        zelkovtest::SignalRecorder recorder(host.row);
        itemtest::doubleClick(host.row, host.middle(host.row->textElement()));
        QCOMPARE(rowtest::told(recorder), QStringList{QStringLiteral("itemPerformed 5 true 82")});
        QVERIFY(host.row->isChecked());
        QSignalSpy performed(host.row, &Item::itemPerformed);
        QVERIFY(!performed.wait(QApplication::doubleClickInterval() + 200));
    }

    void aSeparatorIsDrawnByItsName()
    {
        QWidget window;
        window.resize(60, 20);
        window.setStyleSheet(QStringLiteral("#popoverSeparator { background: red; min-height: 3px }"));
        Separator line(&window);
        line.setGeometry(0, 0, 60, 4);
        window.show();
        QCOMPARE(line.objectName(), QStringLiteral("popoverSeparator"));
        QCOMPARE(line.grab().toImage().pixelColor(30, 1), QColor(Qt::red));
        QCOMPARE(line.minimumHeight(), 3);
    }
};

ZELKOV_TEST_MAIN(TestTextRows)
#include "tst_textrows.moc"
