// SPDX-License-Identifier: MIT
// Finding items in a tree of containers, and changing them by id.
#include "ItemTools.h"

#include "popover/Container.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

using itemtest::Row;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::Item;
namespace pw = vx::PopoverWidget;
using zelkovtest::SignalRecorder;

namespace
{
QString text(const char* words)
{
    return QString::fromLatin1(words);
}

const QString c_Layout = QStringLiteral("layoutChanged");

Container* createBox()
{
    return new Container(nullptr, QStringLiteral("box"), Qt::Vertical, Qt::AlignTop);
}

Row* createRow(int id, const QVariant& value = QVariant(), const QVariant& userData = QVariant())
{
    auto* const row = new Row(pw::eifText | pw::eifAdditionalText, id, QStringLiteral("row %1").arg(id));
    row->m_value = value;
    row->setUserData(userData);
    return row;
}

/// Two direct items and one item in each part; the nested container has a header of its own.
struct Tree
{
    Tree()
        : top(createBox())
        , nested(createBox())
    {
        auto* const header = createBox();
        auto* const footer = createBox();
        auto* const innerHeader = createBox();
        nested->addItem(rows[5]);
        nested->addHeader(innerHeader);
        innerHeader->addItem(rows[6]);
        top->addContainer(nested);
        footer->addItem(rows[4]);
        top->addFooter(footer);
        header->addItem(rows[3]);
        top->addHeader(header);
        top->addItem(rows[1]);
        top->insertItem(rows[2], 0);
    }

    QScopedPointer<Container> top;
    Container* nested;
    // In the order of the walk.
    QVector<Row*> rows {nullptr, createRow(1, 7, 70), createRow(2, 8, 70), createRow(1, 7, 71),
        createRow(4, 7, 70), createRow(1, 7, 70), createRow(6, 7, 72)};
};

QList<Item*> items(const QList<Row*>& rows)
{
    QList<Item*> result;
    for (Row* row : rows) {
        result << row;
    }
    return result;
}
}

class TestContainerItems : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theWalkGoesThroughItemsHeaderFooterAndNestedContainers()
    {
        Tree tree;
        const auto& rows = tree.rows;
        QCOMPARE(tree.top->getItems(), items({rows[1], rows[2], rows[3], rows[4], rows[5], rows[6]}));
        QCOMPARE(tree.top->getItemIDs(), QList<int>({1, 2, 1, 4, 1, 6}));
        QCOMPARE(tree.top->getItems(1), items({rows[1], rows[3], rows[5]}));
        QCOMPARE(tree.top->getItems(9), QList<Item*>());
        QCOMPARE(tree.top->getItemsByUserData(70), items({rows[1], rows[2], rows[4], rows[5]}));
        QCOMPARE(tree.top->getItem(1), static_cast<Item*>(rows[1]));
        QCOMPARE(tree.top->getItem(6), static_cast<Item*>(rows[6]));
        QVERIFY(!tree.top->getItem(9));
        QCOMPARE(tree.top->getItemByUserData(71), static_cast<Item*>(rows[3]));
        QVERIFY(!tree.top->getItemByUserData(text("none")));
        QVERIFY(tree.top->itemExists(6));
        QVERIFY(!tree.top->itemExists(9));
        QVERIFY(tree.top->hasItem(rows[2]));
        QVERIFY(!tree.top->hasItem(rows[3]));
        QVERIFY(!tree.top->hasItem(rows[5]));
        QCOMPARE(tree.top->itemIndex(6), -1);
    }

    void theSearchByValueStaysOutOfNestedContainers()
    {
        Tree tree;
        const auto& rows = tree.rows;
        QCOMPARE(tree.top->getItemsByValue(7), items({rows[1], rows[3], rows[4]}));
        QCOMPARE(tree.nested->getItemsByValue(7), items({rows[5], rows[6]}));
        QCOMPARE(tree.top->getItemByValue(7), static_cast<Item*>(rows[1]));
        QCOMPARE(tree.top->getItemByValue(8), static_cast<Item*>(rows[2]));
        QVERIFY(!tree.top->getItemByValue(99));
    }

    void theSelectedItemIsTheFirstWithATrueValue()
    {
        Tree tree;
        tree.rows[1]->m_value = false;
        tree.rows[3]->m_value = 0;
        tree.rows[5]->m_value = true;
        QCOMPARE(tree.top->getSelectedItem(1), static_cast<Item*>(tree.rows[5]));
        tree.rows[3]->m_value = text("yes");
        QCOMPARE(tree.top->getSelectedItem(1), static_cast<Item*>(tree.rows[3]));
        tree.rows[2]->m_value = false;
        QVERIFY(!tree.top->getSelectedItem(2));
        QVERIFY(!tree.top->getSelectedItem(99));
    }

    void theFirstIsAlwaysTheHeadOfTheList()
    {
        const quint32 seed = QRandomGenerator::system()->generate();
        qInfo("seed %u", seed);
        QRandomGenerator random(seed);
        for (int round = 0; round < 60; ++round) {
            QScopedPointer<Container> top(createBox());
            QList<Container*> all {top.data()};
            for (int i = 0; i < 12; ++i) {
                Container* const box = all.at(random.bounded(all.size()));
                Container* const part = createBox();
                switch (random.bounded(3)) {
                case 0:
                    box->addContainer(part);
                    break;
                case 1:
                    box->addHeader(part);
                    break;
                default:
                    box->addFooter(part);
                    break;
                }
                if (part->parent() || box->header() == part || box->footer() == part) {
                    all << part;
                } else {
                    delete part;
                }
            }
            for (int i = 0; i < 30; ++i) {
                all.at(random.bounded(all.size()))
                    ->addItem(createRow(random.bounded(8), random.bounded(4), random.bounded(4)));
            }
            QCOMPARE(top->getItems().size(), 30);
            QCOMPARE(top->getItemIDs().size(), 30);
            for (int id = 0; id < 8; ++id) {
                const QList<Item*> found = top->getItems(id);
                QCOMPARE(found.size(), top->getItemIDs().count(id));
                QCOMPARE(top->getItem(id), found.value(0));
                QCOMPARE(top->itemExists(id), !found.isEmpty());
                Item* selected = nullptr;
                for (Item* item : found) {
                    if (!selected && item->value().toBool()) {
                        selected = item;
                    }
                }
                QCOMPARE(top->getSelectedItem(id), selected);
            }
            for (int data = 0; data < 4; ++data) {
                QCOMPARE(top->getItemByUserData(data), top->getItemsByUserData(data).value(0));
                QCOMPARE(top->getItemByValue(data), top->getItemsByValue(data).value(0));
            }
        }
    }

    void gettersOfUnknownIdsAreEmpty()
    {
        Tree tree;
        QCOMPARE(tree.top->getItemText(9), QString());
        QCOMPARE(tree.top->getItemCurrentText(9), QString());
        QCOMPARE(tree.top->getItemValue(9), QVariant());
        QCOMPARE(tree.top->getItemUserData(9), QVariant());
        QVERIFY(!tree.top->getItemVisibility(9));
    }

    void gettersTakeTheFirstMatch()
    {
        Tree tree;
        QCOMPARE(tree.top->getItemText(6), text("row 6"));
        QCOMPARE(tree.top->getItemValue(2), QVariant(8));
        QCOMPARE(tree.top->getItemUserData(4), QVariant(70));
        QCOMPARE(tree.top->getItemCurrentText(1), QString());
        QVERIFY(!tree.top->getItemVisibility(1));
        tree.top->show();
        QVERIFY(tree.top->getItemVisibility(1));
        // The footer is not shown by the container.
        QVERIFY(!tree.top->getItemVisibility(4));
    }

    void twoItemsWithOneId()
    {
        Tree tree;
        const auto& rows = tree.rows;
        tree.top->setItemText(1, text("first"), false);
        QCOMPARE(rows[1]->text(), text("first"));
        QCOMPARE(rows[3]->text(), text("row 1"));
        tree.top->setItemsChecked(1, true, false);
        QVERIFY(rows[1]->isChecked() && rows[3]->isChecked() && rows[5]->isChecked());
        QVERIFY(!rows[2]->isChecked());
        tree.top->setItemsEnabled(1, false, false);
        QVERIFY(!rows[1]->isEnabled() && !rows[3]->isEnabled() && !rows[5]->isEnabled());
        tree.top->setItemEnabled(1, true, false);
        QVERIFY(rows[1]->isEnabled() && !rows[3]->isEnabled());
        tree.top->enableItem(1, false, false);
        QVERIFY(!rows[1]->isEnabled());
        tree.top->setItemsVisibility(1, false, false);
        QVERIFY(rows[1]->isHidden() && rows[3]->isHidden() && rows[5]->isHidden());
        tree.top->setItemVisibility(1, true, false);
        QVERIFY(!rows[1]->isHidden() && rows[3]->isHidden());
        tree.top->setItemUserData(1, 5);
        QCOMPARE(rows[1]->userData(), QVariant(5));
        QCOMPARE(rows[3]->userData(), QVariant(71));
        tree.top->setItemValue(4, text("A & B"), false);
        QCOMPARE(rows[4]->additionalText(), text("A && B"));
    }

    void onlyDirectItemsBecomeBusy()
    {
        Tree tree;
        const auto& rows = tree.rows;
        rows[1]->m_value.clear();
        Row* const second = createRow(1);
        tree.top->addItem(second);
        tree.top->setItemBusy(1, true, true, false);
        QVERIFY(rows[1]->additionalTextElement() && rows[1]->m_lastElement->isHidden());
        QVERIFY(second->m_lastElement->isHidden());
        QVERIFY(!rows[3]->m_lastElement->isHidden());
        QVERIFY(!rows[5]->m_lastElement->isHidden());
        tree.top->setItemBusy(1, false, true, false);
        QVERIFY(!second->m_lastElement->isHidden());
    }

    void manyItemsAreShownAndHiddenInTurn()
    {
        Tree tree;
        tree.top->show();
        SignalRecorder recorder(tree.top.data());
        tree.top->setItemVisibility(QList<int>({1, 99, 2}), false, true);
        QVERIFY(tree.rows[1]->isHidden() && tree.rows[2]->isHidden());
        QCOMPARE(recorder.names(), QStringList({c_Layout, c_Layout}));
        recorder.clear();
        tree.top->setItemVisibility(QList<int>({1, 2}), true, false);
        QVERIFY(!tree.rows[1]->isHidden() && !tree.rows[2]->isHidden());
        QCOMPARE(recorder.names(), QStringList());
    }

    void onlyNestedContainersAreShownAndHidden()
    {
        Tree tree;
        tree.top->show();
        SignalRecorder recorder(tree.top.data());
        QVERIFY(tree.top->getContainerVisibility(tree.nested));
        tree.top->setContainerVisibility(tree.nested, false, true);
        QVERIFY(tree.nested->isHidden());
        QVERIFY(!tree.top->getContainerVisibility(tree.nested));
        QCOMPARE(recorder.names(), QStringList({c_Layout}));
        tree.top->setContainerVisibility(tree.nested, true, false);
        QVERIFY(!tree.nested->isHidden());
        Container* const header = tree.top->header();
        header->show();
        tree.top->setContainerVisibility(header, false, true);
        QVERIFY(header->isVisible());
        QVERIFY(!tree.top->getContainerVisibility(header));
        tree.top->setContainerVisibility(nullptr, false, true);
        QCOMPARE(recorder.names(), QStringList({c_Layout}));
    }

    void changesAreAnnouncedOnRequestWhileVisible_data()
    {
        QTest::addColumn<int>("operation");
        const QList<QByteArray> names {"text", "current text", "value", "busy", "visibility", "enabled", "enable",
            "all checked", "all enabled", "all visible"};
        for (int i = 0; i < names.size(); ++i) {
            QTest::newRow(names.at(i).constData()) << i;
        }
    }

    void changesAreAnnouncedOnRequestWhileVisible()
    {
        QFETCH(int, operation);
        QScopedPointer<Container> box(createBox());
        box->addItem(createRow(1));
        box->addItem(createRow(2));
        SignalRecorder recorder(box.data());
        const auto change = [&](int id, bool emitSignal) {
            recorder.clear();
            switch (operation) {
            case 0:
                box->setItemText(id, text("x"), emitSignal);
                break;
            case 1:
                box->setItemCurrentText(id, text("x"), emitSignal);
                break;
            case 2:
                box->setItemValue(id, text("x"), emitSignal);
                break;
            case 3:
                box->setItemBusy(id, true, true, emitSignal);
                break;
            case 4:
                box->setItemVisibility(id, true, emitSignal);
                break;
            case 5:
                box->setItemEnabled(id, false, emitSignal);
                break;
            case 6:
                box->enableItem(id, false, emitSignal);
                break;
            case 7:
                box->setItemsChecked(id, true, emitSignal);
                break;
            case 8:
                box->setItemsEnabled(id, false, emitSignal);
                break;
            default:
                box->setItemsVisibility(id, true, emitSignal);
                break;
            }
            // What the item itself announces comes later and is not of interest here.
            return recorder.names();
        };
        QCOMPARE(change(1, true), QStringList());
        box->show();
        QCOMPARE(change(1, true), QStringList({c_Layout}));
        QCOMPARE(change(1, false), QStringList());
        QCOMPARE(change(99, true), QStringList());
        box->hide();
        QCOMPARE(change(1, true), QStringList());
    }

    void manyDeadItemsLeaveNothingBehind()
    {
        QScopedPointer<Container> box(createBox());
        for (int i = 0; i < 500; ++i) {
            Row* const row = createRow(i);
            box->addItem(row);
            delete row;
        }
        box->addItem(createRow(7));
        QCOMPARE(box->getItemIDs(), QList<int>({7}));
    }
};

ZELKOV_TEST_MAIN(TestContainerItems)
#include "tst_containeritems.moc"
