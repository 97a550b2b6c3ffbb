// SPDX-License-Identifier: MIT
// The row with a slider, and what containers do for its handles.
#include "Pointer.h"
#include "RowTools.h"
#include "TestCase.h"
#include "TestMain.h"
#include "popover/Container.h"
#include "popover/items/SliderItem.h"

#include <QtTest/QtTest>

using namespace vx::PopoverWidget;

namespace
{
QPixmap disc()
{
    QPixmap picture(40, 40);
    picture.fill(Qt::red);
    return picture;
}

class SliderHost : public rowtest::Host<SliderItem>
{
public:
    SliderHost()
        : Host(new SliderItem(QStringLiteral("text"), QStringLiteral("name"), 3, eifText | eifControl, nullptr))
    {
        QCoreApplication::processEvents();
        row->slider()->addNubsie(QStringLiteral("handle"), 5, 0, 10, 1);
        row->slider()->setFeatures(1, vx::Nubsie::enfDraggable | vx::Nubsie::enfMoveable | vx::Nubsie::enfLiveDrag);
        row->slider()->setStandardSize(1, QSize(16, 16));
        row->slider()->setDraggedSize(1, QSize(20, 20));
        row->slider()->setIcon(1, disc());
        QCoreApplication::processEvents();
        row->slider()->updateNubsiePositions(false);
    }
    int handleValue() const { return row->slider()->value(1); }
    /// Drags the handle to the right end.
    void dragToTheEnd()
    {
        vx::Nubsie* const handle = row->slider()->nubsie(1);
        zelkovtest::Pointer pointer(&window);
        pointer.move(handle->geometry().center());
        pointer.press();
        const QPoint end = row->slider()->mapTo(&window, row->slider()->rect().center())
            + QPoint(row->slider()->width(), 0);
        pointer.move(handle->geometry().center() + QPoint(15, 0));
        pointer.move(end);
        pointer.release();
    }
};
}

class TestSliderItem : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theSliderTakesTheRoomThatIsLeft()
    {
        SliderHost host;
        QCOMPARE(host.row->slider()->objectName(), QStringLiteral("slider"));
        QCOMPARE(host.row->slider()->orientation(), Qt::Horizontal);
        QCOMPARE(host.row->slider()->sizePolicy().horizontalPolicy(), QSizePolicy::Expanding);
        QVERIFY(host.row->slider()->width() > 120);
        QVERIFY(host.row->value().isNull());
        const SliderItem off(QString(), QString(), 3, eifText | eifDisabled, nullptr);
        QVERIFY(!off.slider()->isEnabled());
    }

    void valuesAreListsOfTwo()
    {
        SliderHost host;
        zelkovtest::SignalRecorder recorder(host.row);
        host.row->setValue(QVariantList{1, 8});
        QCOMPARE(host.handleValue(), 8);
        host.row->setValue(QVariantList{1, 2, 3});
        host.row->setValue(QVariantList{1});
        host.row->setValue(QVariantList());
        host.row->setValue(4);
        host.row->setValue(QStringList{QStringLiteral("1"), QStringLiteral("2")});
        host.row->setValue(QVariantList{99, 2});
        QCOMPARE(host.handleValue(), 8);
        QCOMPARE(rowtest::events(recorder), QStringList());
    }

    void aDragPerforms()
    {
        SliderHost host;
        host.row->setUserData(QStringLiteral("data"));
        QList<QVariantList> values;
        QList<int> flags;
        connect(host.row, &Item::itemPerformed, this,
            [&](int id, const QVariant& value, const QVariant& userData, EItemPerformedFlags given) {
                QCOMPARE(id, 3);
                QCOMPARE(userData.toString(), QStringLiteral("data"));
                values << value.toList();
                flags << int(given);
            });
        host.dragToTheEnd();
        QVERIFY(!values.isEmpty());
        QCOMPARE(values.last(), (QVariantList{1, 10}));
        QCOMPARE(flags.last(), 8);
        QCOMPARE(host.handleValue(), 10);
    }

    void aRefusedUserSeesTheLastAcceptedValue_data()
    {
        QTest::addColumn<bool>("set");
        QTest::newRow("set through the row") << true;
        QTest::newRow("set at the handle") << false;
    }
    void aRefusedUserSeesTheLastAcceptedValue()
    {
        QFETCH(bool, set);
        const rowtest::SharedRights rights;
        SliderHost host;
        if (set) {
            host.row->setValue(QVariantList{1, 3});
        }
        host.row->setSecurityCheck(QStringLiteral("no"));
        zelkovtest::SignalRecorder recorder(host.row);
        host.dragToTheEnd();
        QCOMPARE(host.handleValue(), set ? 3 : 5);
        QCOMPARE(rowtest::events(recorder), QStringList());
    }

    void theContainerCaresForTheHandles()
    {
        QWidget window;
        window.resize(400, 120);
        Container container(&window, QString(), Qt::Vertical, Qt::AlignTop);
        container.setGeometry(0, 20, 400, 60);
        auto* const row
            = new SliderItem(QStringLiteral("text"), QStringLiteral("name"), 3, eifText | eifControl, nullptr);
        row->slider()->setMinimumHeight(30);
        container.addItem(row);
        window.show();
        QCoreApplication::processEvents();
        row->slider()->addNubsie(QStringLiteral("handle"), 5, 0, 10, 1);
        QCoreApplication::processEvents();
        row->slider()->setStandardSize(1, QSize(16, 16));
        row->slider()->setIcon(1, disc());
        row->slider()->cancelAnimations();
        row->slider()->updateNubsiePositions(false);
        vx::Nubsie* const handle = row->slider()->nubsie(1);
        const QPoint there = handle->pos();
        handle->move(0, 0);
        container.updateItems();
        QCOMPARE(handle->pos(), there);
        handle->move(0, 0);
        container.onScrolled();
        QCOMPARE(handle->pos(), there);
        container.raiseContainer(nullptr);
        QVERIFY(window.children().indexOf(handle) > window.children().indexOf(&container));
        container.setItemValue(3, QVariantList{1, 9}, false);
        QCOMPARE(row->slider()->value(1), 9);
        QSignalSpy layout(&container, &Container::layoutChanged);
        container.setItemValue(3, 4, true);
        QCOMPARE(row->slider()->value(1), 9);
        QCOMPARE(layout.count(), 0);
        container.setItemValue(3, QVariantList{1, 2}, true);
        QCOMPARE(layout.count(), 1);
    }
};

ZELKOV_TEST_MAIN(TestSliderItem)
#include "tst_slideritem.moc"
