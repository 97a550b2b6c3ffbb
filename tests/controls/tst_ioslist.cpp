// SPDX-License-Identifier: MIT
// The phone-style list: rows, edit and delete modes, tool tips.
#include "controls/ListDropRow.h"
#include "controls/iOSListWidget.h"
#include "controls/iOSListWidgetDeleteIcon.h"
#include "controls/iOSListWidgetItem.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QPropertyAnimation>
#include <QtGui/QHelpEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollBar>
#include <QtWidgets/QToolTip>

namespace
{
using List = vx::iOSListWidget;
using Row = vx::iOSListWidgetItem;

struct Phone
{
    QWidget window;
    List* list;

    Phone()
    {
        window.resize(320, 400);
        list = new List(&window, QStringLiteral("devices"));
        auto* const column = new QVBoxLayout(&window);
        column->addWidget(list);
        column->addStretch();
    }
    Row* add(const char* text, QWidget* edit = nullptr, QWidget* selected = nullptr, QWidget* accessory = nullptr)
    {
        return new Row(list, new QLabel(QLatin1String(text)), QStringLiteral("row"), QSize(), edit, selected, accessory);
    }
    void show()
    {
        window.show();
        QCoreApplication::processEvents(); // what the rows asked of the layout
    }

    static QWidget* container(Row* row) { return row->listWidget()->itemWidget(row); }
    static vx::iOSListWidgetDeleteIcon* icon(Row* row)
    {
        return container(row)->findChild<vx::iOSListWidgetDeleteIcon*>();
    }
    static QPushButton* button(Row* row)
    {
        return container(row)->findChild<QPushButton*>(QStringLiteral("deleteButton"));
    }
    static QLabel* riffle(Row* row)
    {
        for (QLabel* const label : container(row)->findChildren<QLabel*>()) {
            if (label->pixmap(Qt::ReturnByValue).size().isValid() && label != row->itemWidget()) {
                return label;
            }
        }
        return nullptr;
    }
};

QStringList names(std::initializer_list<const char*> list)
{
    QStringList result;
    for (const char* const name : list) {
        result << QLatin1String(name);
    }
    return result;
}
}

class TestIosList : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aDroppedRowArrives_data()
    {
        using Side = vx::ListDropSide;
        QTest::addColumn<int>("source");
        QTest::addColumn<int>("at");
        QTest::addColumn<int>("side");
        QTest::addColumn<int>("count");
        QTest::addColumn<int>("target");
        QTest::newRow("0 above 3") << 0 << 3 << int(Side::Above) << 5 << 2;
        QTest::newRow("3 below 0") << 3 << 0 << int(Side::Below) << 5 << 1;
        QTest::newRow("3 above 0") << 3 << 0 << int(Side::Above) << 5 << 0;
        QTest::newRow("0 below 3") << 0 << 3 << int(Side::Below) << 5 << 3;
        QTest::newRow("on its own place") << 2 << 2 << int(Side::Other) << 5 << 2;
        QTest::newRow("above itself") << 2 << 2 << int(Side::Above) << 5 << 2;
        QTest::newRow("on another") << 0 << 3 << int(Side::Other) << 5 << 3;
        QTest::newRow("beside all rows") << 2 << -1 << int(Side::Other) << 5 << 0;
        QTest::newRow("below the last") << 4 << 4 << int(Side::Below) << 5 << 4;
    }
    void aDroppedRowArrives()
    {
        QFETCH(int, source);
        QFETCH(int, at);
        QFETCH(int, side);
        QFETCH(int, count);
        QTEST(vx::listDropRow(source, at, static_cast<vx::ListDropSide>(side), count), "target");
    }

    void theListIsSetUp()
    {
        List list(nullptr, QStringLiteral("devices"));
        QCOMPARE(list.objectName(), QStringLiteral("devices"));
        QCOMPARE(list.minimumHeight(), 0);
        QCOMPARE(list.maximumHeight(), 0);
        QCOMPARE(list.sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred));
        QCOMPARE(list.dragDropMode(), QAbstractItemView::DragDrop); // drags only by the mode, but drops are accepted
        QCOMPARE(list.defaultDropAction(), Qt::MoveAction);
        QVERIFY(list.acceptDrops());
        QVERIFY(list.viewport()->acceptDrops());
        QVERIFY(list.dragEnabled());
        QCOMPARE(list.selectionMode(), QAbstractItemView::SingleSelection);
        QVERIFY(!list.isSelectionRectVisible());
        QVERIFY(list.showDropIndicator());
        QCOMPARE(list.resizeMode(), QListView::Adjust);
        QCOMPARE(list.verticalScrollMode(), QAbstractItemView::ScrollPerPixel);
        QCOMPARE(list.autoScrollMargin(), 52);
        QVERIFY(list.hasAutoScroll());
        QVERIFY(!list.editMode());
        QCOMPARE(QMetaType::type("vx::iOSListWidget::TListWidgetItemPointer"),
            qMetaTypeId<List::TListWidgetItemPointer>());
    }

    void aRowIsSetUp()
    {
        Phone phone;
        Row* const row = phone.add("Gate");
        QCOMPARE(row->type(), 1000);
        QCOMPARE(int(row->flags()), 39);
        QVERIFY(row->deletable());
        QVERIFY(row->movable());
        QCOMPARE(phone.list->getIOSItem(0), row);
        QVERIFY(!phone.list->getIOSItem(1));
        QVERIFY(!phone.list->getIOSItem(-1));
        QWidget* const container = Phone::container(row);
        QCOMPARE(container->objectName(), QStringLiteral("row"));
        QCOMPARE(container->layout()->spacing(), 4);
        QCOMPARE(container->layout()->alignment(), Qt::AlignTop);
        QCOMPARE(container->layout()->contentsMargins(), QMargins());
        QCOMPARE(row->sizeHint(), container->sizeHint());
        QVERIFY(container->hasMouseTracking());
        QVERIFY(row->itemWidget()->hasMouseTracking());
        QVERIFY(phone.list->hasMouseTracking());
        QVERIFY(Phone::icon(row)->isFlat());
        QVERIFY(Phone::button(row)->isFlat());
        QCOMPARE(Phone::button(row)->text(), QStringLiteral("Delete"));
        QVERIFY(!Phone::riffle(row)->pixmap(Qt::ReturnByValue).isNull());
        QCOMPARE(Phone::icon(row)->sizeHint(), QPixmap(QStringLiteral(":/iOSListWidget/iOSDeleteListEntry.png")).size());
    }

    void theWidgetsStandInTheirOrder()
    {
        Phone phone;
        auto* const edit = new QLineEdit;
        auto* const selected = new QLabel(QStringLiteral("s"));
        auto* const accessory = new QLabel(QStringLiteral("a"));
        Row* const row = phone.add("Gate", edit, selected, accessory);
        QLayout* const layout = Phone::container(row)->layout();
        QCOMPARE(layout->itemAt(0)->widget(), Phone::icon(row));
        QCOMPARE(layout->itemAt(1)->widget(), row->itemWidget());
        QCOMPARE(layout->itemAt(2)->widget(), edit);
        QCOMPARE(layout->itemAt(3)->widget(), accessory);
        QVERIFY(layout->itemAt(4)->spacerItem());
        QCOMPARE(layout->itemAt(5)->widget(), selected);
        QCOMPARE(layout->itemAt(6)->widget(), Phone::button(row));
        QCOMPARE(layout->itemAt(7)->widget(), Phone::riffle(row));
        QCOMPARE(row->accessoryWidget(), accessory);
        QCOMPARE(row->editWidget(), edit);
        QVERIFY(edit->isHidden());
        QVERIFY(selected->isHidden());
        QCOMPARE(row->itemWidget()->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred));
    }

    void aValidSizeIsFixed()
    {
        Phone phone;
        auto* const label = new QLabel;
        auto* const edit = new QLineEdit;
        new Row(phone.list, label, QStringLiteral("row"), QSize(120, 40), edit, nullptr, nullptr);
        QCOMPARE(label->minimumSize(), QSize(120, 40));
        QCOMPARE(edit->maximumSize(), QSize(120, 40));
    }

    void theListIsAsHighAsItsRows()
    {
        Phone phone;
        Row* const first = phone.add("1");
        const int one = phone.list->maximumHeight();
        QCOMPARE(one, phone.list->sizeHintForRow(0));
        QVERIFY(one > 0);
        phone.add("2");
        QCOMPARE(phone.list->maximumHeight(), 2 * one);
        QCOMPARE(phone.list->sizeHint(), QSize(phone.list->sizeHintForColumn(0), 2 * one));
        phone.list->setRowHidden(0, true);
        QCOMPARE(phone.list->sizeHint().height(), one);
        phone.list->setRowHidden(0, false);
        phone.list->deleteItem(first);
        QCOMPARE(phone.list->maximumHeight(), one);
        phone.list->clear();
        QCOMPARE(phone.list->count(), 0);
        QCOMPARE(phone.list->maximumHeight(), 0);
    }

    void addingAndRemovingAreReported()
    {
        Phone phone;
        zelkovtest::SignalRecorder recorder(phone.list);
        phone.add("hidden yet");
        QCOMPARE(recorder.names(), names({"itemAdded"}));
        phone.show();
        recorder.clear();
        Row* const row = phone.add("2");
        QVERIFY(recorder.names().contains(QStringLiteral("layoutChanged")));
        QVERIFY(recorder.names().contains(QStringLiteral("itemAdded")));
        recorder.clear();
        List::TListWidgetItemPointer kept;
        connect(phone.list, &List::itemRemoved, phone.list, [&](List::TListWidgetItemPointer item) { kept = item; });
        phone.list->deleteItem(row);
        QVERIFY(recorder.names().contains(QStringLiteral("itemRemoved")));
        QCOMPARE(kept.data(), static_cast<QListWidgetItem*>(row));
        QPointer<Row> gone(row);
        QVERIFY(gone);
        recorder.clear();
        kept.clear(); // the last holder
        QVERIFY(!gone);
    }

    void aRowThatNobodyHoldsDies()
    {
        Phone phone;
        QPointer<Row> row(phone.add("1"));
        phone.list->deleteItem(row);
        QVERIFY(!row);
        phone.list->deleteItem(nullptr);
    }

    void editModeShowsSignAndGrip()
    {
        Phone phone;
        Row* const row = phone.add("1");
        Row* const fixed = phone.add("2");
        fixed->setDeletable(false);
        fixed->setMovable(false);
        phone.show();
        QVERIFY(Phone::icon(row)->isHidden());
        QVERIFY(Phone::riffle(row)->isHidden());
        phone.list->setEditMode(true);
        QVERIFY(phone.list->editMode());
        QCOMPARE(Phone::container(row)->layout()->contentsMargins(), QMargins(4, 0, 4, 0));
        QVERIFY(Phone::icon(row)->isVisible());
        QVERIFY(Phone::riffle(row)->isVisible());
        QVERIFY(Phone::button(row)->isHidden());
        QVERIFY(Phone::icon(fixed)->isHidden());
        QVERIFY(Phone::riffle(fixed)->isHidden());
        phone.list->toggleEditMode();
        QVERIFY(!phone.list->editMode());
        QCOMPARE(Phone::container(row)->layout()->contentsMargins(), QMargins());
        QVERIFY(Phone::icon(row)->isHidden());
        QVERIFY(Phone::riffle(row)->isHidden());
    }

    void editModeSwapsTheContent()
    {
        Phone phone;
        auto* const edit = new QLineEdit;
        Row* const row = phone.add("1", edit);
        Row* const plain = phone.add("2");
        phone.show();
        phone.list->setEditMode(true);
        QVERIFY(row->itemWidget()->isHidden());
        QVERIFY(edit->isVisible());
        QVERIFY(plain->itemWidget()->isVisible());
        phone.list->setEditMode(false);
        QVERIFY(row->itemWidget()->isVisible());
        QVERIFY(edit->isHidden());
        QVERIFY(row->editWidgetEnabled());
        row->setEditWidgetEnabled(false);
        QVERIFY(!edit->isEnabled());
        QVERIFY(!row->editWidgetEnabled());
        QVERIFY(!plain->editWidgetEnabled());
    }

    void theSignBringsOutTheButtonOfOneRowOnly()
    {
        Phone phone;
        Row* const first = phone.add("1");
        Row* const second = phone.add("2");
        phone.list->setEditMode(true);
        phone.show();
        zelkovtest::SignalRecorder recorder(phone.list);
        QTest::mouseClick(Phone::icon(first), Qt::LeftButton);
        QCOMPARE(recorder.names(), names({"layoutChanged"}));
        QVERIFY(Phone::button(first)->isVisible());
        QVERIFY(Phone::riffle(first)->isHidden());
        QVERIFY(Phone::icon(first)->getDeleteMode());
        QTRY_COMPARE(Phone::icon(first)->deleteIconRotation(), -90.0);
        QTest::mouseClick(Phone::icon(second), Qt::LeftButton);
        QVERIFY(!Phone::icon(first)->getDeleteMode());
        QVERIFY(Phone::button(first)->isHidden());
        QVERIFY(Phone::riffle(first)->isVisible());
        QVERIFY(Phone::icon(first)->deleteIconRotation() < 0.0); // on its way back
        QTRY_COMPARE(Phone::icon(first)->deleteIconRotation(), 0.0);
        QTest::mouseClick(Phone::icon(second), Qt::LeftButton);
        QVERIFY(!Phone::icon(second)->getDeleteMode());
        first->toggleDeleteMode();
        QVERIFY(Phone::icon(first)->getDeleteMode());
        QVERIFY(Phone::icon(first)->deleteIconRotation() > -90.0);
    }

    void leavingEditModeEndsDeleteModeAtOnce()
    {
        Phone phone;
        Row* const row = phone.add("1");
        phone.list->setEditMode(true);
        row->setDeleteMode(true, false);
        QCOMPARE(Phone::icon(row)->deleteIconRotation(), -90.0);
        phone.list->setEditMode(false);
        QVERIFY(!Phone::icon(row)->getDeleteMode());
        QCOMPARE(Phone::icon(row)->deleteIconRotation(), 0.0);
        QVERIFY(Phone::button(row)->isHidden());
    }

    void theSignTurnsFromTheEndPointWithinAQuarterSecond()
    {
        vx::iOSListWidgetDeleteIcon icon(nullptr);
        auto* const animation = icon.findChild<QPropertyAnimation*>();
        QVERIFY(animation);
        QCOMPARE(animation->duration(), 250);
        QCOMPARE(animation->loopCount(), 1);
        QCOMPARE(animation->easingCurve().type(), QEasingCurve::Linear);
        icon.setDeleteMode(true, true);
        QCOMPARE(animation->startValue().toInt(), 0);
        QCOMPARE(animation->endValue().toInt(), -90);
        icon.setDeleteMode(true, true); // no change, no new run
        animation->pause();
        animation->setCurrentTime(100);
        QCOMPARE(icon.deleteIconRotation(), -36.0);
        icon.setDeleteMode(false, true);
        QCOMPARE(icon.deleteIconRotation(), -90.0); // not from where it is
        QCOMPARE(animation->state(), QAbstractAnimation::Running);
        icon.setDeleteMode(true, false);
        QCOMPARE(icon.deleteIconRotation(), -90.0);
        QTest::qWait(60);
        QCOMPARE(icon.deleteIconRotation(), -90.0);
    }

    void theSignIsPaintedTurned()
    {
        vx::iOSListWidgetDeleteIcon icon(nullptr);
        icon.resize(icon.sizeHint());
        const QImage upright = icon.grab().toImage();
        QCOMPARE(upright.pixelColor(upright.rect().center()).alpha(), 255);
        icon.setDeleteMode(true, false);
        QVERIFY(icon.grab().toImage() != upright);
    }

    void theDeleteButtonDeletesOnReleaseAndLater()
    {
        Phone phone;
        phone.add("0");
        QPointer<Row> row(phone.add("1"));
        phone.list->setEditMode(true);
        row->setDeleteMode(true, false);
        phone.show();
        QSignalSpy asked(row.data(), &Row::itemToBeDeleted);
        QPushButton* const button = Phone::button(row);
        QTest::mousePress(button, Qt::LeftButton);
        QCOMPARE(asked.count(), 0);
        QTest::mouseRelease(button, Qt::LeftButton);
        QCOMPARE(asked.count(), 1);
        QTRY_VERIFY(!row);
        QCOMPARE(phone.list->count(), 1);
    }

    void aRowThatIsGoneBeforeItsDeletionIsNotTouched()
    {
        Phone phone;
        Row* const row = phone.add("1");
        phone.list->setEditMode(true);
        row->setDeleteMode(true, false);
        phone.show();
        QTest::mouseClick(Phone::button(row), Qt::LeftButton);
        phone.list->clear();
        phone.add("2");
        QCoreApplication::processEvents();
        QCOMPARE(phone.list->count(), 1);
    }

    void theLastRowMayBeKept()
    {
        Phone phone;
        Row* const row = phone.add("1");
        phone.list->setEditMode(true);
        phone.list->setKeepLastItem(true);
        row->setDeleteMode(true, false);
        phone.show();
        QTest::mouseClick(Phone::button(row), Qt::LeftButton);
        QCoreApplication::processEvents();
        QCOMPARE(phone.list->count(), 1);
        QVERIFY(Phone::icon(row)->getDeleteMode());
        QPointer<Row> second(phone.add("2"));
        phone.list->deleteItem(second);
        QVERIFY(!second);
    }

    void theSelectedRowShowsItsWidgetAndABoldLabel()
    {
        Phone phone;
        auto* const mark = new QLabel(QStringLiteral("x"));
        auto* const otherMark = new QLabel(QStringLiteral("x"));
        Row* const row = phone.add("1", nullptr, mark);
        Row* const other = phone.add("2", nullptr, otherMark);
        phone.show();
        phone.list->setCurrentItem(row);
        QVERIFY(mark->isVisible());
        QVERIFY(row->itemWidget()->font().bold());
        QVERIFY(!other->itemWidget()->font().bold());
        phone.list->setCurrentItem(other);
        QVERIFY(mark->isHidden());
        QVERIFY(otherMark->isVisible());
        QVERIFY(!row->itemWidget()->font().bold());
        phone.list->setEditMode(true);
        phone.list->setCurrentItem(row);
        QVERIFY(mark->isHidden()); // left alone in edit mode
        QVERIFY(otherMark->isVisible());
        row->setSelected(true);
        QVERIFY(mark->isHidden());
        phone.list->setEditMode(false);
        row->setSelected(true);
        QVERIFY(mark->isVisible());
        row->setSelected(false);
        QVERIFY(mark->isHidden());
    }

    void theBoldLabelCanBeTurnedOff()
    {
        Phone phone;
        Row* const row = phone.add("1");
        phone.list->setBoldSelectionIndication(false);
        phone.list->setCurrentItem(row);
        QVERIFY(!row->itemWidget()->font().bold());
    }

    void contentAndAccessoryCanBeReplaced()
    {
        Phone phone;
        Row* const row = phone.add("1", nullptr, nullptr, new QLabel(QStringLiteral("a")));
        QPointer<QWidget> content(row->itemWidget());
        QPointer<QWidget> accessory(row->accessoryWidget());
        auto* const newContent = new QLabel(QStringLiteral("2"));
        auto* const newAccessory = new QLabel(QStringLiteral("b"));
        row->setItemWidget(newContent);
        row->setAccessoryWidget(newAccessory);
        QLayout* const layout = Phone::container(row)->layout();
        QCOMPARE(layout->itemAt(1)->widget(), newContent);
        QCOMPARE(layout->itemAt(2)->widget(), newAccessory);
        QCOMPARE(newContent->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred));
        QVERIFY(newContent->hasMouseTracking());
        QTRY_VERIFY(!content && !accessory);
        row->setItemWidget(nullptr);
        QVERIFY(!row->itemWidget());
        row->setAccessoryWidget(nullptr);
        QVERIFY(!row->accessoryWidget());
    }

    void thePayloadOfADragIsKept()
    {
        Phone phone;
        Row* const row = phone.add("1");
        QVERIFY(row->mimeTypes().isEmpty());
        row->setMimeData(QStringLiteral("b/b"), "2");
        row->setMimeData(QStringLiteral("a/a"), "1");
        row->setMimeData(QStringLiteral("b/b"), "3");
        QCOMPARE(row->mimeTypes(), names({"a/a", "b/b"}));
        QCOMPARE(row->mimeData(QStringLiteral("b/b")), QByteArray("3"));
        QCOMPARE(row->mimeData(QStringLiteral("c/c")), QByteArray());
    }

    void theWheelScrollsByEightPixelsAStep()
    {
        Phone phone;
        for (int i = 0; i < 40; ++i) {
            phone.add("row");
        }
        phone.list->setMaximumHeight(100);
        phone.show();
        QWheelEvent event(QPointF(5, 5), QPointF(5, 5), QPoint(), QPoint(0, -120), Qt::NoButton, Qt::NoModifier,
            Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(phone.list->viewport(), &event);
        QCOMPARE(phone.list->verticalScrollBar()->singleStep(), 8);
        QCOMPARE(phone.list->horizontalScrollBar()->singleStep(), 8);
        QVERIFY(phone.list->verticalScrollBar()->value() > 0);
    }

    void theBackgroundCanBeColoured()
    {
        class Open : public List
        {
        public:
            using List::setBackgroundColor;
        };
        Open list;
        list.setBackgroundColor(Qt::green);
        QVERIFY(list.autoFillBackground());
        QCOMPARE(list.palette().color(QPalette::Window), QColor(Qt::green));
    }

    void aSuppressedToolTipIsSwallowed()
    {
        Phone phone;
        Row* const row = phone.add("1");
        row->setToolTipEnabled(false);
        QHelpEvent help(QEvent::ToolTip, QPoint(1, 1), QPoint(1, 1));
        QVERIFY(row->eventFilter(row->itemWidget(), &help));
        row->setToolTipEnabled(true);
        QVERIFY(!row->eventFilter(row->itemWidget(), &help));
        QEvent enter(QEvent::DragEnter);
        QVERIFY(!row->eventFilter(row->itemWidget(), &enter)); // passes, but suppresses
        QVERIFY(row->eventFilter(row->itemWidget(), &help));
        QEvent leave(QEvent::DragLeave);
        QVERIFY(!row->eventFilter(row->itemWidget(), &leave));
        QVERIFY(!row->eventFilter(row->itemWidget(), &help));
    }

    void thePicturesTakeTurns()
    {
        class Open : public Row
        {
        public:
            using Row::mouseEntered;
            using Row::mouseLeft;
            using Row::Row;
        };
        Phone phone;
        auto* const row = new Open(phone.list, new QLabel(QStringLiteral("1")), QStringLiteral("row"), QSize(), nullptr,
            nullptr, nullptr);
        phone.show();
        QVERIFY(QTest::qWaitForWindowExposed(&phone.window));
        QCursor::setPos(row->itemWidget()->mapToGlobal(QPoint(10, 6)));
        row->setTooltipImageFilePaths({QStringLiteral("a.png"), QStringLiteral("b.png")});
        row->mouseEntered();
        QVERIFY(!QToolTip::isVisible()); // not before a second
        QTRY_VERIFY_WITH_TIMEOUT(QToolTip::text().contains(QLatin1String("a.png")), 4000);
        QCOMPARE(QToolTip::text(),
            QStringLiteral("<html>   <body>      <img src=\"a.png\" width=\"320\" />   </body></html>"));
        QCOMPARE(QToolTip::palette().color(QPalette::Inactive, QPalette::ToolTipBase).alpha(), 0);
        QTRY_VERIFY_WITH_TIMEOUT(QToolTip::text().contains(QLatin1String("b.png")), 6000);
        QTRY_VERIFY_WITH_TIMEOUT(QToolTip::text().contains(QLatin1String("a.png")), 6000);
        row->mouseLeft();
        QTRY_VERIFY(!QToolTip::isVisible());
        row->setTooltipImageFilePath(QString());
        row->mouseEntered();
        QTest::qWait(1300);
        QVERIFY(!QToolTip::isVisible());
        row->setToolTipEnabled(true);
        QToolTip::setPalette(QPalette());
    }
};

ZELKOV_TEST_MAIN(TestIosList)
#include "tst_ioslist.moc"
