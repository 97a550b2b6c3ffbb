// SPDX-License-Identifier: MIT
// A container: building it, what it connects, its hooks, emptying it.
#include "ItemTools.h"

#include "popover/Container.h"
#include "popover/WidgetItem.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QMetaMethod>
#include <QtTest/QtTest>
#include <QtWidgets/QBoxLayout>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QScrollArea>

using itemtest::Row;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::EContainerFlag;
using vx::PopoverWidget::Item;
using vx::PopoverWidget::WidgetItem;
namespace pw = vx::PopoverWidget;
using zelkovtest::SignalRecorder;

namespace
{
QString text(const char* words)
{
    return QString::fromLatin1(words);
}

const QString c_Layout = QStringLiteral("layoutChanged");
const QString c_Performed = QStringLiteral("itemPerformed");
const QString c_Dismiss = QStringLiteral("dismissPopover");
const QString c_DismissAll = QStringLiteral("dismissAllPopover");

class Box : public Container
{
public:
    explicit Box(Qt::Orientation orientation = Qt::Vertical, QWidget* parent = nullptr,
        const QString& name = QStringLiteral("box"))
        : Container(parent, name, orientation, Qt::AlignTop)
    {
    }
    using Container::items;
    using Container::m_layout;
    using Container::updateTabOrder;
};

QList<int> ids(const QList<Item*>& items)
{
    QList<int> result;
    for (const Item* item : items) {
        result << item->id();
    }
    return result;
}
}

class TestContainer : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aFreshContainerIsAnEmptyBox()
    {
        Box column;
        QCOMPARE(column.objectName(), text("box"));
        QCOMPARE(column.sizePolicy(), QSizePolicy(QSizePolicy::Minimum, QSizePolicy::Minimum));
        QVERIFY(column.hasMouseTracking());
        QVERIFY(qobject_cast<QVBoxLayout*>(column.layout()));
        QCOMPARE(column.layout()->alignment(), Qt::Alignment(Qt::AlignTop));
        QCOMPARE(column.spacing(), 0);
        QCOMPARE(column.layoutOrientation(), int(Qt::Vertical));
        QVERIFY(!column.header());
        QVERIFY(!column.footer());
        QVERIFY(column.getItems().isEmpty());
        QVERIFY(column.canBeClosed());
        Box row(Qt::Horizontal);
        QVERIFY(qobject_cast<QHBoxLayout*>(row.layout()));
        QCOMPARE(row.property("layoutOrientation").toInt(), int(Qt::Horizontal));
        QVERIFY(!row.metaObject()->property(row.metaObject()->indexOfProperty("layoutOrientation")).isWritable());
    }

    void theSignalsHaveTheirOrder()
    {
        QStringList names;
        const QMetaObject& meta = Container::staticMetaObject;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
            names << QString::fromLatin1(meta.method(i).methodSignature());
        }
        QCOMPARE(names,
            QStringList({text("layoutChanged()"), text("dismissPopover()"), text("dismissAllPopover()"),
                text("itemPerformed(int,QVariant,QVariant,vx::PopoverWidget::EItemPerformedFlags)"),
                text("popoverAboutToClose()"), text("popoverAboutToOpen()"), text("onScrolled()")}));
    }

    void marginsAndSpacingAreTheLayouts()
    {
        Box box;
        const QList<QByteArray> names {"spacing", "leftMargin", "topMargin", "rightMargin", "bottomMargin"};
        for (int i = 0; i < names.size(); ++i) {
            QVERIFY(box.setProperty(names.at(i), 11 + i));
            QCOMPARE(box.property(names.at(i)).toInt(), 11 + i);
        }
        QCOMPARE(box.layout()->spacing(), 11);
        QCOMPARE(box.layout()->contentsMargins(), QMargins(12, 13, 14, 15));
    }

    void itemsGoWhereTheyAreInserted()
    {
        Box box;
        Item* const first = box.addItem(new Row(pw::eifText, 1));
        box.addStretch(2);
        Item* const last = box.addItem(new Row(pw::eifText, 2), QFlags<EContainerFlag>());
        Item* const middle = box.insertItem(new Row(pw::eifText, 3), 1);
        Item* const top = box.insertItem(new Row(pw::eifText, 4), pw::ecfDismiss, 0);
        Item* const end = box.insertItem(new Row(pw::eifText, 5), -1);
        QCOMPARE(box.layout()->count(), 6);
        QCOMPARE(box.itemIndex(top), 0);
        QCOMPARE(box.itemIndex(first), 1);
        QCOMPARE(box.itemIndex(middle), 2);
        QVERIFY(box.layout()->itemAt(3)->spacerItem());
        QCOMPARE(box.itemIndex(last), 4);
        QCOMPARE(box.itemIndex(end), 5);
        QCOMPARE(box.itemIndex(4), 0);
        QCOMPARE(box.itemIndex(99), -1);
        QCOMPARE(box.itemIndex(static_cast<QWidget*>(nullptr)), -1);
        QCOMPARE(first->parentWidget(), static_cast<QWidget*>(&box));
        // In the list what was inserted comes last.
        QCOMPARE(ids(box.getItems()), QList<int>({1, 2, 3, 4, 5}));
        QVERIFY(box.hasItem(middle));
        QVERIFY(!box.addItem(nullptr));
        QVERIFY(!box.addItem(nullptr, pw::ecfDismiss));
        QVERIFY(!box.hasItem(nullptr));
    }

    void spacersHaveTheirPolicies()
    {
        Box box;
        box.addSpacing(7);
        box.addSpacer(QSizePolicy::Expanding, 3, 4);
        box.addStretch(2);
        QCOMPARE(box.layout()->itemAt(0)->spacerItem()->sizeHint(), QSize(0, 7));
        const QSpacerItem* const spacer = box.layout()->itemAt(1)->spacerItem();
        QCOMPARE(spacer->sizeHint(), QSize(3, 4));
        QCOMPARE(spacer->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding));
        QCOMPARE(box.m_layout->stretch(2), 2);
    }

    void buildingIsAnnouncedWhileVisible()
    {
        Box box;
        SignalRecorder recorder(&box);
        const auto build = [&box] {
            box.addStretch(1);
            box.addSpacing(1);
            box.addSpacer(QSizePolicy::Fixed, 1, 1);
            box.addItem(new Row);
            box.addItem(new Row, pw::ecfDismiss);
            box.addWidgetItem(new QPushButton, QString(), 3);
            box.addContainer(new Box);
        };
        build();
        box.addHeader(new Box);
        QCOMPARE(recorder.names(), QStringList());
        box.show();
        build();
        box.addFooter(new Box);
        QCOMPARE(recorder.names().count(c_Layout), 8);
        QCOMPARE(recorder.names().size(), 8);
        recorder.clear();
        box.resetLayout(true, false);
        QCOMPARE(recorder.names(), QStringList({c_Layout}));
    }

    void thePopoverIsDismissedBeforeTheClientHearsOfTheItem_data()
    {
        QTest::addColumn<int>("flags");
        QTest::addColumn<QStringList>("expected");
        QTest::newRow("none") << 0 << QStringList({c_Performed});
        QTest::newRow("dismiss") << 1 << QStringList({c_Dismiss, c_Performed});
        QTest::newRow("dismiss all") << 2 << QStringList({c_DismissAll, c_Performed});
        QTest::newRow("both") << 3 << QStringList({c_Dismiss, c_DismissAll, c_Performed});
    }

    void thePopoverIsDismissedBeforeTheClientHearsOfTheItem()
    {
        QFETCH(int, flags);
        QFETCH(QStringList, expected);
        Box box;
        auto* const given = new Row(pw::eifText, 8);
        given->setUserData(text("data"));
        given->m_value = 42;
        box.addItem(given, QFlags<EContainerFlag>(QFlag(flags)));
        auto* const own = new Row(pw::eifText, 9);
        own->m_defaultFlags = static_cast<EContainerFlag>(flags);
        box.addItem(own);
        SignalRecorder recorder(&box);
        given->perform();
        QCOMPARE(recorder.names(), expected);
        const QVariantList arguments = recorder.entries().last().arguments;
        QCOMPARE(arguments.at(0).toInt(), 8);
        QCOMPARE(arguments.at(1).value<QVariant>(), QVariant(42));
        QCOMPARE(arguments.at(2).value<QVariant>(), QVariant(text("data")));
        QCOMPARE(int(arguments.at(3).value<pw::EItemPerformedFlags>()), int(pw::eipControl));
        recorder.clear();
        own->perform();
        QCOMPARE(recorder.names(), expected);
    }

    void givenFlagsReplaceTheItemsOwn()
    {
        Box box;
        auto* const row = new Row;
        row->m_defaultFlags = pw::ecfDismiss;
        box.addItem(row, QFlags<EContainerFlag>());
        SignalRecorder recorder(&box);
        row->perform();
        QCOMPARE(recorder.names(), QStringList({c_Performed}));
    }

    void anItemThatIsNotForwardedStillDismisses()
    {
        Box box;
        auto* const row = new Row(pw::eifText | pw::eifNoForward);
        box.addItem(row, pw::ecfDismiss);
        SignalRecorder recorder(&box);
        row->perform();
        QCOMPARE(recorder.names(), QStringList({c_Dismiss}));
    }

    void layoutChangesOfItemsComeLater()
    {
        Box box;
        auto* const row = new Row(pw::eifText | pw::eifNoForward);
        box.addItem(row);
        SignalRecorder recorder(&box);
        row->setText(text("a"));
        row->setText(text("b"));
        QCOMPARE(recorder.names(), QStringList());
        // The forwarding does not ask whether the container is visible.
        QTRY_COMPARE(recorder.names(), QStringList({c_Layout, c_Layout}));
    }

    void anItemThatIsAddedAgainIsConnectedOnce()
    {
        Box box;
        auto* const row = new Row;
        box.addItem(row, pw::ecfDismiss);
        box.resetLayout(false, false);
        box.addItem(row, pw::ecfDismiss);
        SignalRecorder recorder(&box);
        row->perform();
        QCOMPARE(recorder.names(), QStringList({c_Dismiss, c_Performed}));
    }

    void nestedContainersAreHeardButDoNotDismiss()
    {
        Box box;
        QList<Box*> parts {new Box, new Box, new Box};
        box.addHeader(parts.at(0));
        box.addFooter(parts.at(1));
        box.addContainer(parts.at(2));
        SignalRecorder recorder(&box);
        for (Box* part : parts) {
            auto* const row = new Row;
            part->addItem(row, pw::ecfDismiss | pw::ecfDismissAll);
            row->perform();
        }
        QCOMPARE(recorder.names(), QStringList({c_Performed, c_Performed, c_Performed}));
        QCOMPARE(parts.at(2)->parentWidget(), static_cast<QWidget*>(&box));
        QCOMPARE(box.itemIndex(parts.at(2)), 0);
        // Header and footer are placed by the balloon.
        QCOMPARE(box.layout()->count(), 1);
        QVERIFY(!parts.at(0)->parentWidget());
    }

    void theFirstHeaderAndFooterStay()
    {
        Box box;
        auto* const header = new Box;
        auto* const footer = new Box;
        Box other;
        box.addHeader(header);
        box.addFooter(footer);
        box.addHeader(&other);
        box.addFooter(&other);
        box.addHeader(nullptr);
        QCOMPARE(box.header(), static_cast<Container*>(header));
        QCOMPARE(box.footer(), static_cast<Container*>(footer));
        SignalRecorder recorder(&box);
        auto* const row = new Row;
        other.addItem(row);
        row->perform();
        QCOMPARE(recorder.names(), QStringList());
    }

    void aContainerIsNoPartOfItself()
    {
        Box box;
        box.addContainer(&box);
        box.addHeader(&box);
        box.addFooter(&box);
        box.addContainer(nullptr);
        QVERIFY(!box.header());
        QVERIFY(!box.footer());
        QCOMPARE(box.layout()->count(), 0);
        QVERIFY(box.getItems().isEmpty());
    }

    void partsWithoutParentGoDownWithTheContainer()
    {
        QPointer<Box> header(new Box);
        QWidget balloon;
        QPointer<Box> footer(new Box(Qt::Vertical, &balloon));
        {
            Box box;
            box.addHeader(header);
            box.addFooter(footer);
        }
        QVERIFY(!header);
        QVERIFY(footer);
    }

    void partsThatDiedAreForgotten()
    {
        Box box;
        auto* const header = new Box;
        auto* const nested = new Box;
        auto* const row = new Row;
        box.addHeader(header);
        box.addContainer(nested);
        box.addItem(row);
        delete header;
        delete nested;
        delete row;
        QVERIFY(!box.header());
        QVERIFY(box.getItems().isEmpty());
        QVERIFY(!box.itemExists(1));
        box.updateItems();
        box.raiseContainer(nullptr);
        box.onScrolled();
        auto* const next = new Box;
        box.addHeader(next);
        QCOMPARE(box.header(), static_cast<Container*>(next));
    }

    void theHooksOfThePopoverEmit()
    {
        Box box;
        SignalRecorder recorder(&box);
        box.popoverOpening();
        box.popoverOpened();
        box.popoverClosing();
        box.popoverClosed();
        QCOMPARE(recorder.names(), QStringList({text("popoverAboutToOpen"), text("popoverAboutToClose")}));
    }

    void aWidgetItemWrapsTheWidget()
    {
        Box box;
        box.addItem(new Row(pw::eifText, 1));
        auto* const edit = new QLineEdit;
        box.insertWidgetItem(edit, 0, text("holder"), 6);
        auto* const item = qobject_cast<WidgetItem*>(box.getItem(6));
        QVERIFY(item);
        QCOMPARE(item->objectName(), text("holder"));
        QCOMPARE(box.itemIndex(6), 0);
        QCOMPARE(edit->parentWidget(), static_cast<QWidget*>(item));
        QVERIFY(!item->testAttribute(Qt::WA_MacShowFocusRect));
        QVERIFY(!edit->testAttribute(Qt::WA_MacShowFocusRect));
        QVERIFY(item->hasMouseTracking());
        QVERIFY(edit->hasMouseTracking());
        QCOMPARE(item->sizePolicy(), QSizePolicy(QSizePolicy::Minimum, QSizePolicy::MinimumExpanding));
        QCOMPARE(edit->sizePolicy(), QSizePolicy(QSizePolicy::Minimum, QSizePolicy::Maximum));
        QCOMPARE(item->getFocusItem(), static_cast<QWidget*>(edit));
        SignalRecorder recorder(&box);
        item->setChecked(true);
        item->performSingleClick({});
        QCoreApplication::processEvents();
        QCOMPARE(recorder.names(), QStringList());
        box.addWidgetItem(nullptr, QString(), 7);
        QVERIFY(!box.getItem(7)->getFocusItem());
    }

    void resettingKeepsSpacersAndNestedContainers()
    {
        Box box;
        QPointer<Row> row(new Row);
        box.addItem(row);
        box.addStretch(1);
        box.addSpacing(3);
        auto* const nested = new Box;
        box.addContainer(nested);
        auto* const inner = new Row(pw::eifText, 5);
        nested->addItem(inner);
        box.addHeader(new Box);
        box.resetLayout(true, false);
        QVERIFY(!row);
        QCOMPARE(box.layout()->count(), 3);
        QCOMPARE(box.getItems(), QList<Item*>({inner}));
        QVERIFY(box.header());
    }

    void resettingWithoutDeletionLeavesTheItemsToTheClient()
    {
        Box box;
        QPointer<Row> row(new Row);
        box.addItem(row);
        box.resetLayout(false, false);
        QVERIFY(row);
        QCOMPARE(row->parentWidget(), static_cast<QWidget*>(&box));
        QCOMPARE(box.itemIndex(row), -1);
        QVERIFY(!box.hasItem(row));
        QVERIFY(!box.itemExists(1));
        delete row.data();
    }

    void clearDeletesHeaderAndFooterToo()
    {
        Box box;
        QPointer<Box> header(new Box);
        QPointer<Box> footer(new Box);
        QPointer<Row> row(new Row);
        QPointer<Row> inner(new Row);
        header->addItem(inner);
        box.addHeader(header);
        box.addFooter(footer);
        box.addItem(row);
        box.clear();
        QVERIFY(!header && !footer && !row && !inner);
        QVERIFY(!box.header());
        QVERIFY(!box.footer());
        box.addHeader(new Box);
        QVERIFY(box.header());
    }

    void resettingPartsWithoutDeletionLosesTheirItems()
    {
        Box box;
        QPointer<Box> header(new Box);
        QPointer<Row> inner(new Row);
        header->addItem(inner);
        box.addHeader(header);
        box.resetLayout(false, true);
        // The items are no longer in the header's list, but still its children.
        QVERIFY(!header && !inner);
    }

    void anItemTakenOutOfTheLayoutIsLeftAlone()
    {
        Box box;
        QPointer<Row> a(new Row(pw::eifText, 1));
        QPointer<Row> b(new Row(pw::eifText, 2));
        QPointer<Row> c(new Row(pw::eifText, 3));
        for (Row* row : {a.data(), b.data(), c.data()}) {
            box.addItem(row);
        }
        box.layout()->removeWidget(b);
        box.resetLayout(true, false);
        QVERIFY(!a && b && !c);
        QCOMPARE(box.getItems(), QList<Item*>());
    }

    void removeItemEmitsNothing()
    {
        Box box;
        QPointer<Row> row(new Row);
        box.addItem(row);
        box.addItem(new Row(pw::eifText, 2));
        box.show();
        SignalRecorder recorder(&box);
        box.removeItem(1);
        QVERIFY(row);
        QCOMPARE(box.itemIndex(row), -1);
        QCOMPARE(ids(box.getItems()), QList<int>({2}));
        box.removeItem(99);
        QTRY_VERIFY(!row);
        QCOMPARE(recorder.names(), QStringList());
    }

    void anItemOfANestedContainerIsRemovedThereWhenItDies()
    {
        Box box;
        auto* const nested = new Box;
        box.addContainer(nested);
        QPointer<Row> row(new Row);
        nested->addItem(row);
        box.removeItem(1);
        QTRY_VERIFY(!row);
        QVERIFY(nested->getItems().isEmpty());
    }

    void theTabOrderFollowsTheItems()
    {
        QWidget host;
        auto* const layout = new QVBoxLayout(&host);
        auto* const box = new Box;
        layout->addWidget(box);
        QList<QLineEdit*> edits;
        for (int i = 0; i < 4; ++i) {
            edits << new QLineEdit;
        }
        for (const int i : {2, 0, 3, 1}) {
            box->addWidgetItem(edits.at(i), QString(), i);
        }
        host.show();
        QVERIFY(QTest::qWaitForWindowActive(&host));
        const auto tabs = [&](int from) {
            QList<int> visited;
            edits.at(from)->setFocus();
            for (int i = 0; i < 3; ++i) {
                QTest::keyClick(&host, Qt::Key_Tab);
                visited << edits.indexOf(qobject_cast<QLineEdit*>(host.focusWidget()));
            }
            return visited;
        };
        box->popoverOpened();
        QCOMPARE(tabs(2), QList<int>({0, 3, 1}));
        box->setItemVisibility(0, false, false);
        QCOMPARE(tabs(2), QList<int>({3, 1, 2}));
    }

    void theTabOrderSkipsWhatIsInAnotherWindow()
    {
        Box box;
        box.addWidgetItem(new QLineEdit, QString(), 1);
        auto* const header = new Box;
        header->addWidgetItem(new QLineEdit, QString(), 2);
        box.addHeader(header);
        box.show();
        header->show();
        box.updateTabOrder();
    }

    void theAutoFocusItemGetsTheFocus()
    {
        Box box;
        auto* const edit = new QLineEdit;
        box.addWidgetItem(new QLineEdit, QString(), 1);
        box.addWidgetItem(edit, QString(), 2);
        box.show();
        QVERIFY(QTest::qWaitForWindowActive(&box));
        box.setAutoFocus();
        QVERIFY(!edit->hasFocus());
        box.setAutoFocusItem(2);
        QVERIFY(!edit->hasFocus());
        box.setAutoFocus();
        QVERIFY(edit->hasFocus());
        box.setAutoFocusItem(77);
        box.setAutoFocus();
        QVERIFY(edit->hasFocus());
    }

    void scrollingReachesTheDirectItems()
    {
        Box box;
        auto* const row = new Row;
        auto* const inner = new Row;
        auto* const nested = new Box;
        box.addItem(row);
        box.addContainer(nested);
        nested->addItem(inner);
        QVERIFY(QMetaObject::invokeMethod(&box, "onScrolled"));
        QCOMPARE(row->m_scrolled, 1);
        QCOMPARE(inner->m_scrolled, 0);
        // The care for sliders is for sliders.
        box.updateItems();
        QCOMPARE(row->m_scrolled, 1);
    }

    void raisingPutsTheContainerOnTop()
    {
        QWidget host;
        auto* const box = new Box(Qt::Vertical, &host);
        auto* const other = new QWidget(&host);
        QCOMPARE(host.children().last(), static_cast<QObject*>(other));
        box->raiseContainer(nullptr);
        QCOMPARE(host.children().last(), static_cast<QObject*>(box));
        box->stackNubsiesOver(other);
        QCOMPARE(host.children().last(), static_cast<QObject*>(box));
    }

    void aStyleSheetGivesTheContainerItsBackground()
    {
        QWidget host;
        auto* const box = new Box(Qt::Vertical, &host);
        box->setGeometry(0, 0, 60, 40);
        box->setStyleSheet(text("#box { background: rgb(200, 10, 30); }"));
        QCOMPARE(box->grab().toImage().pixelColor(30, 20), QColor(200, 10, 30));
    }

    void aWidgetItemsValueReplacesEverything()
    {
        Box box;
        QPointer<QLineEdit> first(new QLineEdit);
        QPointer<Row> row(new Row);
        box.addItem(row);
        box.addWidgetItem(first, text("edit"), 4);
        box.show();
        SignalRecorder recorder(&box);
        box.setItemValue(4, 7, true);
        box.setItemValue(4, text("text"), true);
        QCOMPARE(recorder.names(), QStringList());
        QVERIFY(first);
        auto* const second = new QPushButton;
        box.setItemValue(4, QVariant::fromValue(static_cast<QWidget*>(second)), false);
        QVERIFY(!first && !row);
        QCOMPARE(ids(box.getItems()), QList<int>({-1}));
        QCOMPARE(box.getItem(-1)->getFocusItem(), static_cast<QWidget*>(second));
        QCOMPARE(box.getItem(-1)->objectName(), QString());
        // The widget may be the one that is already there.
        QPointer<QWidget> same(second);
        box.setItemValue(-1, QVariant::fromValue(same.data()), true);
        QVERIFY(same);
        QCOMPARE(box.getItem(-1)->getFocusItem(), same.data());
    }

    void deletionOfTheContainerInItsSignalsIsSurvived_data()
    {
        QTest::addColumn<int>("operation");
        for (int i = 0; i < 18; ++i) {
            QTest::newRow(qPrintable(QString::number(i))) << i;
        }
    }

    void deletionOfTheContainerInItsSignalsIsSurvived()
    {
        QFETCH(int, operation);
        QPointer<Box> box(new Box);
        box->addItem(new Row(pw::eifText | pw::eifAdditionalText, 1), pw::ecfDismiss);
        auto* const nested = new Box;
        box->addContainer(nested);
        box->show();
        const auto gone = [box] { delete box.data(); };
        connect(box.data(), &Container::layoutChanged, this, gone);
        connect(box.data(), &Container::dismissPopover, this, gone);
        connect(box.data(), &Container::popoverAboutToClose, this, gone);
        connect(box.data(), &Container::popoverAboutToOpen, this, gone);
        // Straight from the item, in the middle of the container's work.
        connect(box->getItem(1), &Item::layoutChanged, this, gone);
        const QList<std::function<void()>> operations {
            [&] { box->addItem(new Row); },
            [&] { box->addItem(new Row, pw::ecfDismiss); },
            [&] { box->addStretch(1); },
            [&] { box->addWidgetItem(new QPushButton, QString(), 4); },
            [&] { box->resetLayout(true, true); },
            [&] { box->popoverOpening(); },
            [&] { box->popoverClosing(); },
            [&] { static_cast<Row*>(box->getItem(1))->perform(); },
            [&] { box->setItemText(1, text("x"), true); },
            [&] { box->setItemValue(1, text("x"), true); },
            [&] { box->setItemBusy(1, true, true, true); },
            [&] { box->setItemVisibility(1, false, true); },
            [&] {
                box->setItemVisibility(QList<int>({1, 1}), false, true);
            },
            [&] { box->setItemEnabled(1, false, true); },
            [&] { box->setItemsChecked(1, true, true); },
            [&] { box->setItemsVisibility(1, false, true); },
            [&] { box->setContainerVisibility(nested, false, true); },
            [&] { box->addFooter(new Box); },
        };
        operations.at(operation)();
        QVERIFY(!box);
    }

    void anItemMayEmptyItsContainerWhenPerformed()
    {
        Box box;
        QPointer<Row> row(new Row(pw::eifText | pw::eifDoubleClick));
        box.addItem(row, pw::ecfDismiss);
        connect(&box, &Container::itemPerformed, &box, &Container::clear);
        itemtest::sendMouse(row, QEvent::MouseButtonDblClick, QPoint(3, 3));
        QVERIFY(!row);
    }

    void anItemsDeathMayTakeItsNeighbour()
    {
        Box box;
        QPointer<Row> a(new Row(pw::eifText, 1));
        QPointer<Row> b(new Row(pw::eifText, 2));
        box.addItem(a);
        box.addItem(b);
        connect(a.data(), &QObject::destroyed, this, [b] { delete b.data(); });
        box.clear();
        QVERIFY(!a && !b);
    }

    void theContainerMayDieWithAnItem()
    {
        QPointer<Box> box(new Box);
        auto* const row = new Row;
        auto* const header = new Box;
        box->addItem(row);
        box->addHeader(header);
        connect(header, &QObject::destroyed, this, [box] { delete box.data(); });
        box->clear();
        QVERIFY(!box);
    }
};

ZELKOV_TEST_MAIN(TestContainer)
#include "tst_container.moc"
