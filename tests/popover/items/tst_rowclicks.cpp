// SPDX-License-Identifier: MIT
// Every row against every click: where, with which button, with which flags, with or without the right.
#include "RowTools.h"
#include "TestCase.h"
#include "TestMain.h"
#include "controls/iOSCheckBox.h"
#include "popover/Container.h"
#include "popover/items/CheckItem.h"
#include "popover/items/ComboBoxItem.h"
#include "popover/items/EditItem.h"
#include "popover/items/ImageItem.h"
#include "popover/items/LabelItem.h"
#include "popover/items/MultiStateItem.h"
#include "popover/items/PushItem.h"
#include "popover/items/RadioItem.h"
#include "popover/items/TristateCheckItem.h"
#include "popover/items/iOSCheckItem.h"

#include <QtTest/QtTest>
#include <QtWidgets/QLabel>

using namespace vx::PopoverWidget;

namespace
{
enum Kind
{
    Label,
    Image,
    Edit,
    Push,
    Combo,
    Check,
    Tristate,
    Switch,
    Radio,
    MultiState,
    Kinds
};
const char* const c_kinds[] = {
    "label", "image", "edit", "push", "combo", "check", "tristate", "switch", "radio", "multi state"};

enum Place
{
    Icon,
    Text,
    Additional,
    Nothing,   ///< between the elements
    Corner,    ///< at the origin, where a control is taken to be
    Outside,   ///< the press within, the release without
    Places
};
const char* const c_places[] = {"icon", "text", "additional", "nothing", "corner", "outside"};

Item* makeRow(Kind kind, EItemFlags flags)
{
    const QString text = QStringLiteral("text");
    const QString name = QStringLiteral("name");
    switch (kind) {
    case Label:
        return new LabelItem(text, QStringLiteral("more"), name, 7, flags, nullptr);
    case Image:
        return new ImageItem(name, 7, QPixmap(20, 20), nullptr);
    case Edit:
        return new EditItem(text, QString(), name, 7, flags, nullptr, nullptr);
    case Push:
        return new PushItem(text, QStringLiteral("more"), name, 7, flags, nullptr);
    case Combo:
        return new ComboBoxItem(text, name, 7, {QStringLiteral("a"), QStringLiteral("b")}, flags, nullptr);
    case Check:
        return new CheckItem(text, name, 7, false, flags, nullptr);
    case Tristate:
        return new TristateCheckItem(text, name, 7, true, 0, flags, nullptr);
    case Switch:
        return new iOSCheckItem(text, name, 7, false, flags, nullptr);
    case Radio:
        return new RadioItem(text, name, 7, false, nullptr, flags, nullptr);
    case MultiState:
        return new MultiStateItem(text, name, {3, 4}, 7, flags, nullptr);
    case Kinds:
        break;
    }
    return nullptr;
}

bool hasAdditional(Kind kind)
{
    return kind == Label || kind == Push;
}

/// What the rules say, written down a second time.
QStringList expected(Kind kind, Place place, Qt::MouseButton button, bool rightClick, bool refused)
{
    const bool allowed = button == Qt::LeftButton
        || (button == Qt::RightButton && rightClick && kind != Image);
    if (!allowed || refused || place == Outside || kind == Edit || kind == Combo) {
        return {};
    }
    const int buttonBit = button == Qt::LeftButton ? 16 : 32;
    int part = 0;
    if (place == Icon && kind != Image) {
        part = 1;
    } else if (place == Text && kind != Label && kind != Image) {
        part = 2;
    } else if (place == Additional && hasAdditional(kind)) {
        part = 4;
    }
    const bool hasControl
        = kind == Check || kind == Tristate || kind == Switch || kind == Radio || kind == MultiState;
    if (place == Corner && hasControl) {
        part = 8;
    }
    const QString flags = QString::number(part + buttonBit);
    switch (kind) {
    case Label:
        return {QStringLiteral("itemPerformed 7 text ") + flags};
    case Image:
        return {QStringLiteral("itemPerformed 7 null ") + flags};
    case Push:
        return {QStringLiteral("itemPerformed 7 true ") + flags};
    case Check:
    case Switch:
        // That corner is left to the box.
        return place == Corner ? QStringList()
                               : QStringList{QStringLiteral("toggled true name"),
                                   QStringLiteral("itemPerformed 7 true ") + flags};
    case Tristate:
        return place == Corner ? QStringList()
                               : QStringList{QStringLiteral("stateChanged 1 name"),
                                   QStringLiteral("itemPerformed 7 1 ") + flags};
    case Radio:
        return {QStringLiteral("itemPerformed 7 true ") + flags};
    case MultiState:
        return {QStringLiteral("itemPerformed 7 false ") + flags};
    default:
        return {};
    }
}
}

class TestRowClicks : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void everyClickOnEveryRow_data()
    {
        QTest::addColumn<int>("kind");
        QTest::addColumn<int>("place");
        QTest::addColumn<int>("button");
        QTest::addColumn<bool>("rightClick");
        QTest::addColumn<bool>("refused");
        for (int kind = 0; kind < Kinds; ++kind) {
            for (int place = 0; place < Places; ++place) {
                for (int button : {int(Qt::LeftButton), int(Qt::RightButton), int(Qt::MiddleButton)}) {
                    for (int bits = 0; bits < 4; ++bits) {
                        QTest::addRow("%s, %s, button %d%s%s", c_kinds[kind], c_places[place], button,
                            bits & 1 ? ", right click" : "", bits & 2 ? ", refused" : "")
                            << kind << place << button << bool(bits & 1) << bool(bits & 2);
                    }
                }
            }
        }
    }
    void everyClickOnEveryRow()
    {
        QFETCH(int, kind);
        QFETCH(int, place);
        QFETCH(int, button);
        QFETCH(bool, rightClick);
        QFETCH(bool, refused);
        const rowtest::SharedRights rights;
        EItemFlags flags = eifControl | eifText | eifIcon;
        if (hasAdditional(Kind(kind))) {
            flags |= eifAdditionalText;
        }
        if (rightClick) {
            flags |= eifRightClick;
        }
        rowtest::Host<Item> host(makeRow(Kind(kind), flags));
        if (host.row->iconElement()) {
            host.row->setIconText(QStringLiteral("icon"));
        }
        QCoreApplication::processEvents();
        host.row->setSecurityCheck(refused ? QStringLiteral("no") : QString());
        QPoint position;
        switch (place) {
        case Icon:
            position = host.row->iconElement() ? host.middle(host.row->iconElement()) : QPoint(160, 20);
            break;
        case Text:
            position = host.row->textElement() ? host.middle(host.row->textElement())
                : kind == Label                ? host.middle(static_cast<LabelItem*>(host.row)->label())
                                               : QPoint(200, 20);
            break;
        case Additional:
            position = host.row->additionalTextElement() ? host.middle(host.row->additionalTextElement())
                                                         : QPoint(140, 20);
            break;
        case Nothing:
            position = QPoint(140, 35);
            break;
        case Corner:
            position = QPoint(1, 1);
            break;
        default:
            position = QPoint(401, 20);
            break;
        }
        zelkovtest::SignalRecorder recorder(host.row);
        itemtest::click(host.row, position, Qt::MouseButton(button));
        QCOMPARE(rowtest::events(recorder),
            expected(Kind(kind), Place(place), Qt::MouseButton(button), rightClick, refused));
    }

    void onlyPushRowsDismissByThemselves()
    {
        for (int kind = 0; kind < Kinds; ++kind) {
            Container container(nullptr, QString(), Qt::Vertical, Qt::AlignTop);
            Item* const row = container.addItem(makeRow(Kind(kind), eifText | eifControl));
            container.resize(300, 60);
            container.show();
            QCoreApplication::processEvents();
            QSignalSpy dismissed(&container, &Container::dismissPopover);
            QSignalSpy performed(&container, &Container::itemPerformed);
            itemtest::click(row, QPoint(row->width() / 2, row->height() - 1));
            QCOMPARE(dismissed.count(), kind == Push ? 1 : 0);
            QCOMPARE(performed.count(), kind == Edit || kind == Combo ? 0 : 1);
        }
    }

    void theControlIsTakenToBeAtTheOriginWithItsSize()
    {
        struct Case
        {
            Item* row;
            QWidget* control;
        };
        auto* const check = new CheckItem(QStringLiteral("t"), QString(), 1, false, eifText | eifControl, nullptr);
        auto* const radio
            = new RadioItem(QStringLiteral("t"), QString(), 1, false, nullptr, eifText | eifControl, nullptr);
        auto* const multi = new MultiStateItem(QStringLiteral("t"), QString(), {1}, 1, eifText | eifControl, nullptr);
        auto* const three
            = new TristateCheckItem(QStringLiteral("t"), QString(), 1, true, 0, eifText | eifControl, nullptr);
        auto* const slide = new iOSCheckItem(QStringLiteral("t"), QString(), 1, false, eifText | eifControl, nullptr);
        for (const Case& one : {Case{check, check->checkBox()}, Case{radio, radio->radioButton()},
                 Case{multi, multi->multiStateItem()}, Case{three, three->checkBox()},
                 Case{slide, slide->checkBox()}}) {
            rowtest::Host<Item> host(one.row);
            QCoreApplication::processEvents();
            QVERIFY(one.control->x() > 150);
            const QPoint last = one.control->rect().bottomRight();
            QCOMPARE(int(one.row->getItemPerformedFlag(last, Qt::LeftButton)), 24);
            QCOMPARE(int(one.row->getItemPerformedFlag(last, Qt::RightButton)), 40);
            QCOMPARE(int(one.row->getItemPerformedFlag(last, Qt::MiddleButton)), 8);
            QCOMPARE(int(one.row->getItemPerformedFlag(last + QPoint(1, 0), Qt::LeftButton)), 16);
            QCOMPARE(int(one.row->getItemPerformedFlag(last + QPoint(0, 1), Qt::LeftButton)), 16);
            QCOMPARE(int(one.row->getItemPerformedFlag(host.middle(one.control), Qt::LeftButton)), 16);
            QCOMPARE(
                int(one.row->getItemPerformedFlag(host.middle(one.row->textElement()), Qt::RightButton)), 34);
        }
    }

    void everyRowMayBeDeletedByItsOwnPerforming_data()
    {
        QTest::addColumn<int>("kind");
        QTest::addColumn<QByteArray>("signal");
        for (int kind = 0; kind < Kinds; ++kind) {
            if (kind == Edit || kind == Combo) {
                continue;
            }
            QTest::addRow("%s", c_kinds[kind]) << kind << QByteArray();
        }
    }
    void everyRowMayBeDeletedByItsOwnPerforming()
    {
        QFETCH(int, kind);
        QWidget window;
        window.resize(300, 60);
        QPointer<Item> row = makeRow(Kind(kind), eifText | eifControl);
        row->setParent(&window);
        row->resize(300, 40);
        window.show();
        connect(row.data(), &Item::itemPerformed, this, [row] { delete row.data(); });
        itemtest::sendMouse(row, QEvent::MouseButtonPress, QPoint(150, 35));
        itemtest::sendMouse(row, QEvent::MouseButtonRelease, QPoint(150, 35), Qt::LeftButton, Qt::NoButton);
        QVERIFY(row.isNull());
    }
};

ZELKOV_TEST_MAIN(TestRowClicks)
#include "tst_rowclicks.moc"
