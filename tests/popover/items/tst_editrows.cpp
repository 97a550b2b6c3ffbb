// SPDX-License-Identifier: MIT
// Rows with a line edit.
#include "RowTools.h"
#include "TestCase.h"
#include "TestMain.h"
#include "popover/items/ClearEditItem.h"
#include "popover/items/MultipleValuesEditItem.h"
#include "popover/items/SearchItem.h"

#include <QtTest/QtTest>
#include <QtWidgets/QAction>
#include <QtWidgets/QApplication>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>

using namespace vx::PopoverWidget;

namespace
{
ClearEditItem* clearRow(const QString& text, EItemFlags flags = eifText)
{
    return new ClearEditItem(
        text, QStringLiteral("type"), QStringLiteral("name"), QStringLiteral("All"), 4, flags, nullptr);
}

MultipleValuesEditItem* multipleRow(const QString& text)
{
    return new MultipleValuesEditItem(text, QStringLiteral("type"), QStringLiteral("name"), QStringLiteral("All"),
        QStringLiteral("Several"), 4, eifText, nullptr);
}

QAction* mark(const EditItem* row)
{
    return row->lineEdit()->actions().value(0);
}
}

class TestEditRows : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void anEditRowMakesItsLineEdit()
    {
        EditItem row(QStringLiteral("Name"), QStringLiteral("type"), QStringLiteral("row"), 2, eifText, nullptr,
            nullptr);
        QCOMPARE(row.textElement()->text(), QStringLiteral("Name"));
        QCOMPARE(row.lineEdit()->objectName(), QStringLiteral("edit"));
        QCOMPARE(row.lineEdit()->text(), QString());
        QCOMPARE(row.lineEdit()->placeholderText(), QStringLiteral("type"));
        QVERIFY(row.lineEdit()->hasMouseTracking());
        QVERIFY(!row.lineEdit()->testAttribute(Qt::WA_MacShowFocusRect));
        QCOMPARE(row.getFocusItem(), row.lineEdit());
        QCOMPARE(row.lineEdit()->parentWidget(), &row);
        QVERIFY(row.lineEdit()->isEnabled());
        QVERIFY(!row.placeholderColor().isValid());
        QVERIFY(!row.textColor().isValid());
        row.setProperty("placeholderColor", QColor(Qt::red));
        row.setProperty("textColor", QColor(Qt::blue));
        QCOMPARE(row.placeholderColor(), QColor(Qt::red));
        QCOMPARE(row.textColor(), QColor(Qt::blue));
        EditItem off(QString(), QString(), QString(), 2, eifDisabled, nullptr, nullptr);
        QVERIFY(!off.lineEdit()->isEnabled());
        EditItem bare(QString(), QString(), QString(), 2, {}, nullptr, nullptr);
        QCOMPARE(bare.lineEdit()->parentWidget(), &bare);
    }

    void anEditRowTakesALineEdit()
    {
        QPointer<QLineEdit> given = new QLineEdit(QStringLiteral("mine"));
        auto* const row = new EditItem(QString(), QString(), QString(), 2, eifText, nullptr, given);
        QCOMPARE(row->lineEdit(), given.data());
        QCOMPARE(row->value().toString(), QStringLiteral("mine"));
        delete given.data();
        QVERIFY(row->lineEdit() == nullptr);
        QVERIFY(row->value().isNull());
        row->setValue(QStringLiteral("x"));
        delete row;
    }

    void itIsPerformedOnceForEachEndOfTheEditing()
    {
        rowtest::Host<EditItem> host(
            new EditItem(QStringLiteral("Name"), QString(), QString(), 2, eifText, nullptr, nullptr));
        host.row->setUserData(9);
        zelkovtest::SignalRecorder recorder(host.row);
        host.row->setKeyboardFocus();
        QTRY_VERIFY(host.row->lineEdit()->hasFocus());
        QTest::keyClicks(host.row->lineEdit(), QStringLiteral("abc"));
        QVERIFY(recorder.entries().isEmpty());
        QTest::keyClick(host.row->lineEdit(), Qt::Key_Return);
        QCOMPARE(rowtest::told(recorder), QStringList{QStringLiteral("itemPerformed 2 abc 8")});
        QCOMPARE(rowtest::userDataOf(recorder).toInt(), 9);
        recorder.clear();
        host.row->lineEdit()->clearFocus();
        QCOMPARE(rowtest::told(recorder), QStringList{QStringLiteral("itemPerformed 2 abc 8")});
    }

    void valuesFromCodeAreStringsAndPerformNothing()
    {
        EditItem row(QString(), QString(), QString(), 2, eifText, nullptr, nullptr);
        zelkovtest::SignalRecorder recorder(&row);
        row.setValue(QStringLiteral("a & b"));
        QCOMPARE(row.value().toString(), QStringLiteral("a & b"));
        row.setValue(5);
        row.setValue(QVariant());
        QCOMPARE(row.value().toString(), QStringLiteral("a & b"));
        QCOMPARE(rowtest::told(recorder), QStringList{QStringLiteral("layoutChanged")});
    }

    void aRowMayDieWhenItIsPerformed_data()
    {
        QTest::addColumn<bool>("byKey");
        QTest::newRow("return") << true;
        QTest::newRow("focus") << false;
    }
    void aRowMayDieWhenItIsPerformed()
    {
        QFETCH(bool, byKey);
        rowtest::Host<EditItem> host(
            new EditItem(QStringLiteral("Name"), QString(), QString(), 2, eifText, nullptr, nullptr));
        QPointer<EditItem> row(host.row);
        QPointer<QLineEdit> edit(host.row->lineEdit());
        edit->setFocus();
        QTRY_VERIFY(edit->hasFocus());
        connect(host.row, &Item::itemPerformed, this, [row] { delete row.data(); });
        if (byKey) {
            QTest::keyClick(edit.data(), Qt::Key_Return);
        } else {
            QTest::keyClick(edit.data(), Qt::Key_A);
            edit->clearFocus();
        }
        QVERIFY(row.isNull());
        QVERIFY(!edit.isNull());
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QTRY_VERIFY(edit.isNull());
    }

    void theClearMarkIsThereWhileTheTextIsAnother()
    {
        std::unique_ptr<ClearEditItem> row(clearRow(QStringLiteral("Name")));
        QVERIFY(!row->isCleared());
        QVERIFY(!mark(row.get())->isVisible());
        QVERIFY(!mark(row.get())->icon().isNull());
        QCOMPARE(row->lineEdit()->text(), QString());
        row->lineEdit()->setText(QStringLiteral("x"));
        QVERIFY(mark(row.get())->isVisible());
        zelkovtest::SignalRecorder recorder(row.get());
        zelkovtest::SignalRecorder ofEdit;
        QSignalSpy changed(row->lineEdit(), &QLineEdit::textChanged);
        mark(row.get())->trigger();
        QCOMPARE(row->lineEdit()->text(), QStringLiteral("All"));
        QVERIFY(row->isCleared());
        QVERIFY(!mark(row.get())->isVisible());
        QVERIFY(recorder.entries().isEmpty());
        QCOMPARE(changed.count(), 0);
        row->setValue(QStringLiteral("y"));
        QVERIFY(!row->isCleared());
        // The cleared text typed by hand hides nothing and clears nothing.
        row->setValue(QStringLiteral("All"));
        QVERIFY(mark(row.get())->isVisible());
        QVERIFY(!row->isCleared());
        row->setClearedText(QStringLiteral("None"));
        row->clear();
        QCOMPARE(row->lineEdit()->text(), QStringLiteral("None"));
    }

    void aRowWhoseTextIsTheClearedOneStartsCleared()
    {
        std::unique_ptr<ClearEditItem> row(clearRow(QStringLiteral("All")));
        QVERIFY(row->isCleared());
        QCOMPARE(row->lineEdit()->text(), QStringLiteral("All"));
        QCOMPARE(row->textElement()->text(), QStringLiteral("All"));
    }

    void clearingTakesTheFocusWithoutPerforming()
    {
        rowtest::Host<ClearEditItem> host(clearRow(QStringLiteral("Name")));
        host.row->lineEdit()->setFocus();
        QTRY_VERIFY(host.row->lineEdit()->hasFocus());
        QTest::keyClicks(host.row->lineEdit(), QStringLiteral("abc"));
        zelkovtest::SignalRecorder recorder(host.row);
        host.row->clear();
        QVERIFY(!host.row->lineEdit()->hasFocus());
        QVERIFY(recorder.entries().isEmpty());
    }

    void severalValuesShowAsPlaceholder()
    {
        std::unique_ptr<MultipleValuesEditItem> row(multipleRow(QStringLiteral("Name")));
        QVERIFY(!row->hasMultipleValues());
        row->setValue(QStringLiteral("x"));
        QVERIFY(mark(row.get())->isVisible());
        zelkovtest::SignalRecorder recorder(row.get());
        row->setMultipleValues(true);
        QVERIFY(row->hasMultipleValues());
        QVERIFY(row->isCleared());
        QCOMPARE(row->lineEdit()->text(), QString());
        QCOMPARE(row->lineEdit()->placeholderText(), QStringLiteral("Several"));
        QVERIFY(!mark(row.get())->isVisible());
        QVERIFY(recorder.entries().isEmpty());
        // The first change brings mark and placeholder back, even one to the cleared text.
        row->lineEdit()->setText(QStringLiteral("All"));
        QVERIFY(mark(row.get())->isVisible());
        QCOMPARE(row->lineEdit()->placeholderText(), QStringLiteral("type"));
        QVERIFY(row->hasMultipleValues());
        QVERIFY(!row->isCleared());
        mark(row.get())->trigger();
        QCOMPARE(row->lineEdit()->placeholderText(), QStringLiteral("Several"));
        row->setMultipleValues(false);
        QCOMPARE(row->lineEdit()->placeholderText(), QStringLiteral("type"));
        QCOMPARE(row->lineEdit()->text(), QString());
        row->clear();
        QCOMPARE(row->lineEdit()->text(), QStringLiteral("All"));
        row->lineEdit()->setText(QStringLiteral("z"));
        QVERIFY(mark(row.get())->isVisible());
        std::unique_ptr<MultipleValuesEditItem> cleared(multipleRow(QStringLiteral("All")));
        QVERIFY(cleared->isCleared());
        QCOMPARE(cleared->lineEdit()->text(), QStringLiteral("All"));
    }

    void typingShowsTheClearButtonOfASearch()
    {
        rowtest::Host<SearchItem> host(
            new SearchItem(QString(), QStringLiteral("find"), QString(), 6, eifText, nullptr));
        auto* const button = host.row->lineEdit()->findChild<QPushButton*>();
        auto* const loop = host.row->lineEdit()->findChild<QLabel*>();
        QVERIFY(button->isHidden());
        QVERIFY(button->isFlat());
        QVERIFY(button->hasMouseTracking() && loop->hasMouseTracking());
        QVERIFY(loop->hasScaledContents());
        QCOMPARE(host.row->lineEdit()->textMargins(), QMargins(20, 0, 20, 0));
        zelkovtest::SignalRecorder recorder(host.row);
        host.row->lineEdit()->setFocus();
        QTest::keyClicks(host.row->lineEdit(), QStringLiteral("ab"));
        QVERIFY(button->isVisible());
        QCOMPARE(loop->size(), QSize(20, 20));
        QCOMPARE(button->size(), QSize(20, 20));
        QCOMPARE(loop->x(), 4);
        QCOMPARE(button->geometry().right(), host.row->lineEdit()->width() - 5);
        QCOMPARE(loop->y(), button->y());
        QVERIFY(qAbs(loop->geometry().center().y() - host.row->lineEdit()->rect().center().y()) <= 1);
        button->click();
        QVERIFY(button->isHidden());
        QCOMPARE(rowtest::told(recorder),
            (QStringList{QStringLiteral("searchChanged a"), QStringLiteral("searchChanged ab"),
                QStringLiteral("searchChanged ")}));
        // The marks stay at the ends of a row that grows.
        host.row->resize(380, 50);
        QCOMPARE(button->geometry().right(), host.row->lineEdit()->width() - 5);
    }

    void theSlotOfASearchMayDeleteTheRow()
    {
        rowtest::Host<SearchItem> host(
            new SearchItem(QString(), QStringLiteral("find"), QString(), 6, eifText, nullptr));
        QPointer<SearchItem> row(host.row);
        connect(host.row, &SearchItem::searchChanged, this, [row] { delete row.data(); });
        QTest::keyClicks(host.row->lineEdit(), QStringLiteral("a"));
        QVERIFY(row.isNull());
    }
};

ZELKOV_TEST_MAIN(TestEditRows)
#include "tst_editrows.moc"
