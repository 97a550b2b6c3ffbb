// SPDX-License-Identifier: MIT
// Rows of popovers on a real server, with a real pointer.
#include <QtCore/QElapsedTimer>
#include <QtCore/QProcess>
#include <QtTest/QtTest>
#include <QtWidgets/QAbstractItemView>
#include <QtWidgets/QApplication>
#include <QtWidgets/QPushButton>

#include "controls/iOSCheckBox.h"
#include "popover/Container.h"
#include "popover/Controller.h"
#include "popover/Manager.h"
#include "popover/items/ComboBoxItem.h"
#include "popover/items/LabelItem.h"
#include "popover/items/PushItem.h"
#include "popover/items/RadioItem.h"
#include "popover/items/SliderItem.h"
#include "popover/items/Submenu.h"
#include "popover/items/iOSCheckItem.h"
#include "SignalRecorder.h"
#include "TestCase.h"
#include "TestMain.h"

using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::Item;
using vx::PopoverWidget::Manager;
using zelkovtest::SignalRecorder;

namespace
{
const auto usual = vx::PopoverWidget::eifText | vx::PopoverWidget::eifControl;

Container* column()
{
    return new Container(nullptr, QStringLiteral("rows"), Qt::Vertical, Qt::AlignTop);
}

/// A window with one button and a popover of rows below it.
struct Desk
{
    Desk()
    {
        window->setGeometry(QRect(QPoint(80, 80), QSize(560, 440)));
        target->setGeometry(250, 16, 60, 24);
        window->show();
    }
    ~Desk() { delete window.data(); }

    Controller* open(Container* rows)
    {
        controller = Manager::instance()->createController(Manager::instance()->getUniquePopoverID(), false, false,
            window, target, QStringLiteral("rows"), QString(), Balloon::EArrowDirections(Balloon::eadTop),
            QSizeF(), Balloon::ESizeConstraints());
        controller->setContainer(rows, Balloon::ebfNoHeader);
        controller->setActive(true, Controller::epsBalloon | Controller::epsNoFade, false);
        return controller;
    }

    QPointer<QWidget> window {new QWidget};
    QPushButton* target {new QPushButton(window.data())};
    QPointer<Controller> controller;
};
}

class TestE2eRows : public zelkovtest::TestCase
{
    Q_OBJECT

    static void pointer(const QStringList& arguments)
    {
        QProcess tool;
        tool.start(QStringLiteral("xdotool"), arguments);
        QTRY_VERIFY_WITH_TIMEOUT(tool.state() == QProcess::NotRunning, 20000);
        QCOMPARE(tool.exitCode(), 0);
    }
    static QStringList words(const char* text) { return QString::fromLatin1(text).split(QLatin1Char(' ')); }
    static QStringList to(const QWidget* widget, const QPoint& position)
    {
        const QPoint global = widget->mapToGlobal(position);
        return {QStringLiteral("mousemove"), QString::number(global.x()), QString::number(global.y()),
            QStringLiteral("sleep"), QStringLiteral("0.1")};
    }
    static void click(const QWidget* widget, int button = 1)
    {
        pointer(to(widget, widget->rect().center())
            + QStringList {QStringLiteral("click"), QString::number(button), QStringLiteral("sleep"),
                QStringLiteral("0.1")});
    }
    static void drag(const QWidget* widget, const QPoint& from, const QPoint& onto)
    {
        QStringList steps = to(widget, from) + words("mousedown 1 sleep 0.1");
        for (int i = 1; i <= 10; ++i) {
            steps += to(widget, from + (onto - from) * i / 10);
        }
        pointer(steps + words("mouseup 1 sleep 0.2"));
    }
    // The window manager moves the window once more after it is shown.
    static void waitUntilSettled(const QWidget* window)
    {
        QVERIFY(QTest::qWaitForWindowExposed(const_cast<QWidget*>(window)));
        QPoint last;
        QElapsedTimer unchanged;
        unchanged.start();
        QVERIFY(QTest::qWaitFor(
            [&] {
                const QPoint now = window->mapToGlobal(QPoint());
                if (now != last) {
                    last = now;
                    unchanged.restart();
                }
                return unchanged.elapsed() > 300;
            },
            10000));
    }
    static int performed(const SignalRecorder& recorder)
    {
        return recorder.count(QStringLiteral("itemPerformed"));
    }

private Q_SLOTS:
    void init()
    {
        TestCase::init();
        Manager::init(100);
    }
    void cleanup()
    {
        Manager::deleteInstance();
        TestCase::cleanup();
    }

    void aSwitchIsToggledByAClickAndByADrag()
    {
        Desk desk;
        waitUntilSettled(desk.window);
        auto* const row = new vx::PopoverWidget::iOSCheckItem(
            QStringLiteral("Recording"), QStringLiteral("switch"), 11, false, usual, nullptr);
        Container* const rows = column();
        rows->addItem(row);
        desk.open(rows);
        SignalRecorder recorder(rows);
        QWidget* const box = row->checkBox();
        QVERIFY(box->isVisible());
        click(box);
        QTRY_VERIFY(row->isChecked());
        QCOMPARE(performed(recorder), 1);
        const int y = box->height() / 2;
        drag(box, QPoint(box->width() * 3 / 4, y), QPoint(box->width() / 6, y));
        QTRY_VERIFY(!row->isChecked());
        QCOMPARE(performed(recorder), 2);
        for (const SignalRecorder::Entry& entry : recorder.entries()) {
            if (entry.name == QLatin1String("itemPerformed")) {
                QCOMPARE(entry.arguments.first().toInt(), 11);
            }
        }
    }

    void anEntryIsPickedFromAComboBox()
    {
        Desk desk;
        waitUntilSettled(desk.window);
        auto* const row = new vx::PopoverWidget::ComboBoxItem(QStringLiteral("Stream"), QStringLiteral("combo"), 14,
            {QStringLiteral("High"), QStringLiteral("Medium"), QStringLiteral("Low")}, usual, nullptr);
        Container* const rows = column();
        rows->addItem(row);
        desk.open(rows);
        SignalRecorder recorder(rows);
        click(row->comboBox());
        QAbstractItemView* const list = row->comboBox()->view();
        QTRY_VERIFY(list->isVisible());
        QTest::qWait(QApplication::doubleClickInterval() + 200); // the list takes no release right after it opened
        const QRect third = list->visualRect(list->model()->index(2, 0));
        pointer(to(list->viewport(), QPoint(20, third.center().y())) + words("click 1 sleep 0.1"));
        QTRY_COMPARE(row->currentText(), QStringLiteral("Low"));
        QCOMPARE(performed(recorder), 1);
        QVERIFY(desk.controller && desk.controller->isActive());
    }

    void aRadioRowIsChosenInASubmenu()
    {
        Desk desk;
        waitUntilSettled(desk.window);
        Container* const rows = column();
        auto* const menu = new vx::PopoverWidget::Submenu(-1, QStringLiteral("Mode"), QStringLiteral("Mode"), QString(),
            QStringLiteral("mode"), desk.window, column(), nullptr, 20, vx::PopoverWidget::eifText);
        rows->addItem(menu);
        rows->setSubmenuRadioList(20, 21,
            {QStringLiteral("Always"), QStringLiteral("On motion"), QStringLiteral("Never")}, 0, QStringLiteral("modes"));
        desk.open(rows);
        QVERIFY(menu->isVisible());
        click(menu);
        QTRY_VERIFY(menu->controller() && menu->controller()->isActive());
        const QList<vx::PopoverWidget::RadioItem*> choices
            = menu->container()->findChildren<vx::PopoverWidget::RadioItem*>();
        QCOMPARE(choices.size(), 3);
        QTRY_VERIFY(choices[2]->isVisible());
        QVERIFY(choices[0]->radioButton()->isChecked());
        SignalRecorder recorder(menu->container());
        click(choices[2]->radioButton());
        QTRY_VERIFY(choices[2]->radioButton()->isChecked());
        QVERIFY(!choices[0]->radioButton()->isChecked());
        QVERIFY(performed(recorder) >= 1);
    }

    void aSliderRowIsScrubbed()
    {
        Desk desk;
        waitUntilSettled(desk.window);
        auto* const row = new vx::PopoverWidget::SliderItem(
            QStringLiteral("Brightness"), QStringLiteral("slider"), 31, usual, nullptr);
        row->setFixedWidth(360);
        Container* const rows = column();
        rows->addItem(row);
        desk.open(rows);
        vx::MultiNubsieSlider* const slider = row->slider();
        QTRY_VERIFY(slider->isVisible() && slider->width() > 100);
        slider->addNubsie(QStringLiteral("Brightness"), 50, 0, 100, 1);
        slider->setFeatures(1, vx::Nubsie::enfDraggable | vx::Nubsie::enfMoveable | vx::Nubsie::enfLiveDrag);
        slider->setStandardSize(1, QSize(18, 18));
        slider->setDraggedSize(1, QSize(22, 22));
        slider->setValue(1, 50, false, false);
        QTest::qWait(50);
        SignalRecorder recorder(rows);
        const QPoint middle = slider->rect().center();
        drag(slider, middle, middle + QPoint(60, 0));
        QTRY_VERIFY(performed(recorder) >= 1);
        QVERIFY2(slider->value(1) > 60, qPrintable(QString::number(slider->value(1))));
    }

    void aRowIsSetBackByItsContextMenu()
    {
        Desk desk;
        waitUntilSettled(desk.window);
        auto* const row = new vx::PopoverWidget::PushItem(QStringLiteral("Contrast"), QString(),
            QStringLiteral("contrast"), 41, vx::PopoverWidget::eifText, nullptr);
        row->setResetPopover(QStringLiteral("Set back"));
        Container* const rows = column();
        rows->addItem(row);
        desk.open(rows);
        QTRY_VERIFY(row->isVisible());
        SignalRecorder recorder(row);
        click(row, 3);
        QTRY_COMPARE(recorder.count(QStringLiteral("contextMenuRequested")), 1);
        vx::PopoverWidget::LabelItem* entry = nullptr;
        QTRY_VERIFY((entry = desk.window->findChild<vx::PopoverWidget::LabelItem*>()) && entry->isVisible());
        click(entry);
        QTRY_COMPARE(recorder.count(QStringLiteral("resetContextMenuPerformed")), 1);
    }
};

ZELKOV_TEST_MAIN(TestE2eRows)
#include "tst_e2e_rows.moc"
