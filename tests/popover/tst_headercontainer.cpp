// SPDX-License-Identifier: MIT
// The container of headers and footers: where it differs.
#include "ItemTools.h"

#include "popover/HeaderContainer.h"
#include "popover/WidgetItem.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>
#include <QtWidgets/QBoxLayout>
#include <QtWidgets/QLineEdit>

using itemtest::Row;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::HeaderContainer;
using vx::PopoverWidget::Item;
using vx::PopoverWidget::WidgetItem;
namespace pw = vx::PopoverWidget;
using zelkovtest::SignalRecorder;

namespace
{
const QString c_Layout = QStringLiteral("layoutChanged");

class Header : public HeaderContainer
{
public:
    explicit Header(QWidget* parent = nullptr)
        : HeaderContainer(parent, QStringLiteral("header"), Qt::Horizontal, Qt::AlignLeft)
    {
    }
};
}

class TestHeaderContainer : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void itTakesTheWidthThatThereIs()
    {
        Header header;
        QCOMPARE(header.sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred));
        QCOMPARE(header.objectName(), QStringLiteral("header"));
        QVERIFY(qobject_cast<QHBoxLayout*>(header.layout()));
        QCOMPARE(header.spacing(), 0);
        QVERIFY(header.hasMouseTracking());
        QCOMPARE(header.layout()->alignment(), Qt::Alignment(Qt::AlignLeft));
    }

    void stretchesAreNotAnnounced()
    {
        Header header;
        header.show();
        SignalRecorder recorder(&header);
        header.addStretch(3);
        QCOMPARE(static_cast<QBoxLayout*>(header.layout())->stretch(0), 3);
        QCOMPARE(recorder.names(), QStringList());
        header.addSpacing(3);
        QCOMPARE(recorder.names(), QStringList({c_Layout}));
    }

    void theTwoFormsOfInsertingDiffer()
    {
        Header header;
        header.show();
        SignalRecorder recorder(&header);
        auto* const own = new Row(pw::eifText, 1);
        own->m_defaultFlags = pw::ecfDismiss;
        QCOMPARE(header.addItem(own), static_cast<Item*>(own));
        QCOMPARE(own->sizePolicy(), QSizePolicy(QSizePolicy::Preferred, QSizePolicy::Preferred));
        QCOMPARE(recorder.names(), QStringList({c_Layout}));
        recorder.clear();
        auto* const given = new Row(pw::eifText, 2);
        QCOMPARE(header.insertItem(given, pw::ecfDismissAll, 0), static_cast<Item*>(given));
        QCOMPARE(given->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred));
        QCOMPARE(recorder.names(), QStringList());
        QCOMPARE(header.itemIndex(2), 0);
        own->perform();
        given->perform();
        QCOMPARE(recorder.names(),
            QStringList({QStringLiteral("dismissPopover"), QStringLiteral("itemPerformed"),
                QStringLiteral("dismissAllPopover"), QStringLiteral("itemPerformed")}));
        QVERIFY(!header.insertItem(nullptr, 0));
        QVERIFY(!header.insertItem(nullptr, pw::ecfDismiss, 0));
    }

    void aWidgetIsLaidOutItselfAndItsItemIsNeverShown()
    {
        QPointer<QPushButton> edit(new QPushButton);
        const QSizePolicy policy = edit->sizePolicy();
        QPointer<Item> item;
        {
            Header header;
            header.show();
            SignalRecorder recorder(&header);
            header.addWidgetItem(edit, QStringLiteral("holder"), 6);
            QCOMPARE(recorder.names(), QStringList({c_Layout}));
            item = header.getItem(6);
            QVERIFY(qobject_cast<WidgetItem*>(item));
            QCOMPARE(item->getFocusItem(), static_cast<QWidget*>(edit.data()));
            QCOMPARE(edit->parentWidget(), static_cast<QWidget*>(&header));
            QCOMPARE(header.itemIndex(edit), 0);
            QCOMPARE(header.itemIndex(6), -1);
            QVERIFY(!item->isVisible());
            QCOMPARE(edit->sizePolicy(), policy);
            QVERIFY(!edit->hasMouseTracking());
            QTRY_VERIFY(edit->isVisible());
        }
        QVERIFY(!edit);
        QVERIFY(!item);
    }

    void resettingDeletesEverySecondItem_data()
    {
        QTest::addColumn<int>("count");
        QTest::addColumn<QList<int>>("left");
        QTest::newRow("none") << 0 << QList<int>();
        QTest::newRow("one") << 1 << QList<int>({0});
        QTest::newRow("two") << 2 << QList<int>({0});
        QTest::newRow("three") << 3 << QList<int>({0, 2});
        QTest::newRow("four") << 4 << QList<int>({0, 2});
        QTest::newRow("seven") << 7 << QList<int>({0, 2, 4, 6});
    }

    void resettingDeletesEverySecondItem()
    {
        QFETCH(int, count);
        QFETCH(QList<int>, left);
        Header header;
        QList<QPointer<Row>> rows;
        for (int i = 0; i < count; ++i) {
            rows << new Row(pw::eifText, i);
            header.addItem(rows.last());
        }
        header.addStretch(1);
        header.show();
        SignalRecorder recorder(&header);
        header.resetLayout(true, false);
        QCOMPARE(recorder.names(), QStringList({c_Layout}));
        QCOMPARE(header.layout()->count(), 0);
        QVERIFY(header.getItems().isEmpty());
        for (int i = 0; i < count; ++i) {
            QCOMPARE(!rows.at(i).isNull(), left.contains(i));
            if (rows.at(i)) {
                QCOMPARE(rows.at(i)->parentWidget(), static_cast<QWidget*>(&header));
                QVERIFY(rows.at(i)->isHidden());
            }
        }
    }

    void withoutDeletionAllItemsLiveOn()
    {
        Header header;
        QPointer<Row> a(new Row);
        QPointer<Row> b(new Row);
        header.addItem(a);
        header.addItem(b);
        header.resetLayout(false, false);
        QVERIFY(a && b);
        QVERIFY(!a->isHidden());
        QVERIFY(header.getItems().isEmpty());
        QCOMPARE(header.layout()->count(), 0);
    }

    void theItemsOfWidgetsGoWithTheHeaderThatDroppedThem()
    {
        Container box(nullptr, QString(), Qt::Vertical, Qt::AlignTop);
        auto* const header = new Header;
        header->addWidgetItem(new QLineEdit, QString(), 1);
        QPointer<Item> item = header->getItem(1);
        box.addHeader(header);
        header->resetLayout(false, false);
        QVERIFY(item && item->isHidden());
        box.resetLayout(false, true);
        QVERIFY(!item);
    }

    void theItemsOfWidgetsAreNotLost()
    {
        QPointer<Item> first;
        QPointer<Item> second;
        {
            Header header;
            header.addWidgetItem(new QLineEdit, QString(), 1);
            header.addWidgetItem(new QLineEdit, QString(), 2);
            first = header.getItem(1);
            second = header.getItem(2);
            header.resetLayout(true, false);
            QVERIFY(first);
            QCOMPARE(first->parentWidget(), static_cast<QWidget*>(&header));
            QVERIFY(first->isHidden());
            QVERIFY(!second);
        }
        QVERIFY(!first);
    }

    void clearingTheOwnerDeletesTheHeaderWithAllItsItems()
    {
        Container box(nullptr, QString(), Qt::Vertical, Qt::AlignTop);
        QPointer<Header> header(new Header);
        QPointer<Row> a(new Row);
        QPointer<Row> b(new Row);
        header->addItem(a);
        header->addItem(b);
        box.addHeader(header);
        box.clear();
        QVERIFY(!header && !a && !b);
    }

    void deletionInItsSignalsIsSurvived_data()
    {
        QTest::addColumn<int>("operation");
        for (int i = 0; i < 3; ++i) {
            QTest::newRow(qPrintable(QString::number(i))) << i;
        }
    }

    void deletionInItsSignalsIsSurvived()
    {
        QFETCH(int, operation);
        QPointer<Header> header(new Header);
        header->addItem(new Row);
        header->show();
        connect(header.data(), &Container::layoutChanged, this, [header] { delete header.data(); });
        switch (operation) {
        case 0:
            QVERIFY(!header->addItem(new Row));
            break;
        case 1:
            header->addWidgetItem(new QLineEdit, QString(), 3);
            break;
        default:
            header->resetLayout(true, true);
            break;
        }
        QVERIFY(!header);
    }
};

ZELKOV_TEST_MAIN(TestHeaderContainer)
#include "tst_headercontainer.moc"
