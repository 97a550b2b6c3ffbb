// SPDX-License-Identifier: MIT
// Each button opens a popover with rows of one family; a click beside it closes it.
#include "PopoverRowsPage.h"

#include <QtCore/QDateTime>
#include <QtGui/QPainter>
#include <QtWidgets/QButtonGroup>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QVBoxLayout>

#include "../cameras/Scene.h"
#include "../Hand.h"
#include "popover/Container.h"
#include "popover/Manager.h"
#include "popover/items/CheckItem.h"
#include "popover/items/ClearEditItem.h"
#include "popover/items/ComboBoxItem.h"
#include "popover/items/DateTimeItem.h"
#include "popover/items/ImageItem.h"
#include "popover/items/LabelItem.h"
#include "popover/items/MultiStateItem.h"
#include "popover/items/MultipleValuesEditItem.h"
#include "popover/items/PushItem.h"
#include "popover/items/RadioItem.h"
#include "popover/items/SearchItem.h"
#include "popover/items/Separator.h"
#include "popover/items/SliderItem.h"
#include "popover/items/SpinItem.h"
#include "popover/items/Submenu.h"
#include "popover/items/TristateCheckItem.h"
#include "popover/items/UnitValueItem.h"
#include "popover/items/iOSCheckItem.h"
#include "ZelkovUtils/ISecurityManager.h"

namespace gallery
{
namespace
{
namespace rows = vx::PopoverWidget;
using rows::Balloon;
using rows::Manager;

const rows::EItemFlags s_usual = rows::eifText | rows::eifControl;
constexpr int s_width = 222;

QString name(const char* text)
{
    return QString::fromLatin1(text);
}
}

/// Whoever sits at the gallery is an administrator or is not.
class PopoverRowsPage::Rights : public vx::ISecurityManager
{
public:
    bool isRightRefused(const QString&, bool, bool, bool) override { return !m_administrator; }
    bool isAdministrator(bool, bool) override { return m_administrator; }

    bool m_administrator = true;
};

PopoverRowsPage::PopoverRowsPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
    , m_rights(std::make_shared<Rights>())
{
    Manager::init(1000);
    Item::setSecurityManager(m_rights);

    auto* bar = new QHBoxLayout;
    bar->setSpacing(12);
    bar->addWidget(addButton(tr("Texts"), &PopoverRowsPage::texts));
    bar->addWidget(addButton(tr("Choices"), &PopoverRowsPage::choices));
    bar->addWidget(addButton(tr("Values"), &PopoverRowsPage::values));
    bar->addWidget(addButton(tr("Settings"), &PopoverRowsPage::settings));

    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(12);
    layout->addLayout(bar);
    layout->addStretch(1);
    layout->addWidget(makeSettings());
}

PopoverRowsPage::~PopoverRowsPage()
{
    for (const QPointer<Controller>& controller : qAsConst(m_open)) {
        delete controller.data();
    }
    // The page that follows may have come first.
    if (Item::securityManager() == m_rights) {
        Item::setSecurityManager(nullptr);
    }
}

QPushButton* PopoverRowsPage::addButton(const QString& text, Container* (PopoverRowsPage::*fill)())
{
    auto* button = new QPushButton(text);
    connect(button, &QPushButton::clicked, this, [this, button, fill] { open(button, fill); });
    m_buttons << button;
    return button;
}

QWidget* PopoverRowsPage::makeSettings()
{
    QWidget* box = panel();
    auto* administrator = new QCheckBox(tr("I am an administrator"));
    administrator->setChecked(true);
    connect(administrator, &QCheckBox::toggled, this, [this](bool on) { m_rights->m_administrator = on; });
    m_busy = new QCheckBox(tr("Rows are busy"));
    connect(m_busy, &QCheckBox::toggled, this, &PopoverRowsPage::setBusy);
    auto* layout = new QHBoxLayout(box);
    layout->setContentsMargins(16, 10, 16, 10);
    layout->setSpacing(24);
    layout->addWidget(administrator);
    layout->addWidget(m_busy);
    layout->addWidget(label(tr("A right click on a row with a value offers to set it back."), "hint"));
    layout->addStretch(1);
    return box;
}

void PopoverRowsPage::setBusy(bool busy)
{
    for (const QPointer<Item>& row : qAsConst(m_rows)) {
        if (row) {
            row->setBusy(busy, true);
        }
    }
}

void PopoverRowsPage::open(QPushButton* button, Container* (PopoverRowsPage::*fill)())
{
    const int index = m_buttons.indexOf(button);
    m_open.resize(m_buttons.size());
    QPointer<Controller>& controller = m_open[index];
    if (controller && controller->isActive()) {
        controller->dismiss(false, true);
        return;
    }
    controller = Manager::instance()->createController(Manager::instance()->getUniquePopoverID(), false, false, this,
        button, button->text(), QString(), Balloon::EArrowDirections(Balloon::eadTop), QSizeF(),
        Balloon::ESizeConstraints());
    controller->setContainer((this->*fill)(), Balloon::ebfTitle | Balloon::ebfClose);
    controller->setActive(true, Controller::epsBalloon | Controller::epsNoFade, false);
    if (m_busy->isChecked()) {
        setBusy(true);
    }
    if (m_slider && fill == &PopoverRowsPage::values) {
        addHandle();
    }
}

// A handle becomes a child of the window that the slider stands in by now.
void PopoverRowsPage::addHandle()
{
    vx::MultiNubsieSlider* const slider = m_slider->slider();
    if (slider->getNubsies().isEmpty()) {
        slider->addNubsie(tr("Brightness"), 60, 0, 100, 1);
        slider->setFeatures(1, vx::Nubsie::enfDraggable | vx::Nubsie::enfMoveable | vx::Nubsie::enfLiveDrag);
        QPixmap knob(64, 64);
        knob.fill(Qt::transparent);
        QPainter painter(&knob);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setPen(QPen(QColor(0, 0, 0, 70), 3));
        painter.setBrush(palette().highlight());
        painter.drawEllipse(QRectF(3, 3, 58, 58));
        painter.end();
        slider->setStandardSize(1, QSize(18, 18));
        slider->setDraggedSize(1, QSize(22, 22));
        slider->setIcon(1, knob);
        slider->setDrawTrack(true);
    }
}

PopoverRowsPage::Container* PopoverRowsPage::column()
{
    auto* container = new Container(nullptr, name("rows"), Qt::Vertical, Qt::AlignTop);
    container->setLeftMargin(0);
    container->setTopMargin(4);
    container->setRightMargin(0);
    container->setBottomMargin(0);
    return container;
}

PopoverRowsPage::Item* PopoverRowsPage::add(Container* container, Item* row, const QString& rowName)
{
    row->setAdminOnly(true);
    row->setFixedWidth(s_width);
    container->addItem(row, rows::EContainerFlags());
    watch(row, rowName, {name("layoutChanged")});
    if (row->layout() && row->itemFlags().testFlag(rows::eifControl)) {
        m_rows << row;
    }
    return row;
}

void PopoverRowsPage::addReset(Item* row, const std::function<void()>& action)
{
    row->setResetPopover(tr("Set back"));
    connect(row, &Item::resetContextMenuPerformed, this, action);
}

PopoverRowsPage::Container* PopoverRowsPage::texts()
{
    Container* box = column();
    add(box, new rows::SearchItem(QString(), tr("Search cameras"), name("search"), 1, s_usual, nullptr), name("search"));
    add(box, new rows::LabelItem(tr("Text over as many lines as it takes, with <a href=\"https://www.qt.io\">links</a>."),
                 QString(), name("label"), 2, rows::eifText, nullptr), name("label"));
    auto* image = new rows::ImageItem(name("image"), 3,
        Scene(2).ground(QSize(s_width, 70), devicePixelRatioF()), nullptr);
    image->setFixedHeight(76);
    add(box, image, name("image"));
    add(box, new rows::EditItem(tr("Name"), tr("Gate"), name("edit"), 4, s_usual, nullptr, nullptr), name("edit"));
    auto* clear = new rows::ClearEditItem(tr("Group"), tr("Group"), name("clear"), tr("All groups"), 5, s_usual, nullptr);
    clear->setValue(tr("Car park"));
    add(box, clear, name("clear"));
    auto* several = new rows::MultipleValuesEditItem(tr("Place"), tr("Place"), name("several"), QString(),
        tr("several values"), 6, s_usual, nullptr);
    several->setMultipleValues(true);
    add(box, several, name("several"));
    box->addWidgetItem(new rows::Separator(nullptr), name("line"), 0);
    add(box, new rows::PushItem(tr("Take a picture"), tr("Ctrl+P"), name("push"), 7,
                 rows::eifText | rows::eifAdditionalText, nullptr), name("push"));
    add(box, new rows::PushItem(tr("Click or double click"), QString(), name("double"), 8,
                 rows::eifText | rows::eifDoubleClick, nullptr), name("push twice"));
    return box;
}

PopoverRowsPage::Container* PopoverRowsPage::choices()
{
    Container* box = column();
    add(box, new rows::iOSCheckItem(tr("Recording"), name("switch"), 11, true, s_usual, nullptr), name("switch"));
    add(box, new rows::CheckItem(tr("Audio"), name("check"), 12, true, s_usual | rows::eifBoldSelection, nullptr),
        name("check"));
    add(box, new rows::TristateCheckItem(tr("Events of all inputs"), name("tristate"), 13, true, 1, s_usual, nullptr),
        name("three states"));
    auto* combo = new rows::ComboBoxItem(tr("Stream"), name("combo"), 14,
        {tr("High"), tr("Medium"), tr("Low")}, s_usual, nullptr);
    combo->enableItem(2, false);
    add(box, combo, name("combo"));
    auto* states = new rows::MultiStateItem(tr("Lamp"), name("states"), {0, 1, 2}, 15, s_usual, nullptr);
    states->multiStateItem()->setText(name("0 / 1 / 2"));
    connect(states->multiStateItem(), &QToolButton::clicked, states,
        [states] { states->multiStateItem()->setText(tr("level %1").arg(states->value().toInt())); });
    states->multiStateItem()->setText(tr("level %1").arg(0));
    add(box, states, name("states"));
    box->addWidgetItem(new rows::Separator(nullptr), name("line"), 0);
    auto* group = new QButtonGroup(box);
    const QString modes[] = {tr("Always"), tr("On motion"), tr("Never")};
    for (int i = 0; i < 3; ++i) {
        add(box, new rows::RadioItem(modes[i], name("radio"), 16, i == 1, group, s_usual, nullptr), name("radio"));
    }
    return box;
}

PopoverRowsPage::Container* PopoverRowsPage::values()
{
    Container* box = column();
    m_slider = new rows::SliderItem(tr("Brightness"), name("slider"), 21, s_usual, nullptr);
    m_slider->slider()->setMinimumSize(130, 34);
    add(box, m_slider, name("slider"));
    rows::SliderItem* const slider = m_slider;
    addReset(slider, [slider] { slider->setValue(QVariantList{1, 60}); });
    auto* spin = new rows::SpinItem(tr("Frames a second"), name("spin"), 22, nullptr, 25, s_usual, nullptr);
    addReset(add(box, spin, name("spin")), [spin] { spin->setValue(25); });
    const QDateTime start(QDate(2024, 5, 6), QTime(10, 0));
    auto* date = new rows::DateTimeItem(tr("From"), start, Qt::LocalTime, name("dd.MM.yyyy  hh:mm"), name("date"), 23,
        s_usual, nullptr);
    addReset(add(box, date, name("date")), [date, start] { date->setValue(start); });
    box->addWidgetItem(new rows::Separator(nullptr), name("line"), 0);
    auto* group = new QButtonGroup(box);
    auto* seconds = new rows::UnitValueItem(tr("Every"), {tr("s"), tr("min")}, name("every"), group, 24, s_usual, nullptr);
    seconds->valueItem()->setValue(10);
    add(box, seconds, name("every"));
    auto* count = new rows::UnitValueItem(tr("At most"), {tr("MB"), tr("GB")}, name("most"), group, 25, s_usual,
        nullptr);
    count->valueItem()->setValue(50);
    add(box, count, name("most"));
    return box;
}

PopoverRowsPage::Container* PopoverRowsPage::settings()
{
    Container* box = column();
    Container* quality = column();
    auto* menu = new rows::Submenu(Manager::instance()->getUniquePopoverID(), tr("Quality"), tr("Quality"), tr("Medium"),
        name("quality"), this, quality, nullptr, 31, s_usual | rows::eifAdditionalText, nullptr);
    add(box, menu, name("submenu"));
    box->setSubmenuRadioList(31, 32, {tr("High"), tr("Medium"), tr("Low")}, 1, name("quality"));
    connect(menu, &Item::itemPerformed, menu, [menu](int id, const QVariant&, const QVariant& text) {
        if (id == 32) {
            menu->setAdditionalText(text.toString());
        }
    });
    Container* storage = column();
    auto* only = new rows::Submenu(Manager::instance()->getUniquePopoverID(), tr("Storage"), tr("Storage"), QString(),
        name("storage"), this, storage, nullptr, 33, s_usual | rows::eifDisclosureOnly, nullptr);
    add(storage, new rows::iOSCheckItem(tr("Overwrite old recordings"), name("overwrite"), 34, true, s_usual, nullptr),
        name("overwrite"));
    add(storage, new rows::SpinItem(tr("Days to keep"), name("days"), 35, nullptr, 30, s_usual, nullptr), name("days"));
    add(box, only, name("submenu at its mark"));
    add(box, new rows::CheckItem(tr("Show the time"), name("time"), 36, true, s_usual, nullptr), name("time"));
    return box;
}

void PopoverRowsPage::rehearse(Hand& hand)
{
    open(m_buttons.at(0), &PopoverRowsPage::texts);
    open(m_buttons.at(2), &PopoverRowsPage::values);
    // The last one opened is the one that takes the mouse.
    open(m_buttons.at(1), &PopoverRowsPage::choices);
    const Container* const chosen = m_open.at(1)->getContainer();
    hand.wait(200);
    for (int id : {12, 13}) {
        Item* const row = chosen->getItem(id);
        hand.click(row, QPoint(60, row->sizeHint().height() / 2)).wait(80);
    }
    hand.wait(200);
}
}
