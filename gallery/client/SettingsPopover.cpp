// SPDX-License-Identifier: MIT
// The settings, as rows of a popover: the main one, and what leads further.
#include "SettingsPopover.h"

#include "Fleet.h"
#include "LiveWall.h"
#include "PopoverPlace.h"
#include "Session.h"
#include "Settings.h"
#include "popover/Manager.h"
#include "popover/items/ComboBoxItem.h"
#include "popover/items/MultiStateItem.h"
#include "popover/items/PushItem.h"
#include "popover/items/SearchItem.h"
#include "popover/items/Separator.h"
#include "popover/items/SliderItem.h"
#include "popover/items/Submenu.h"

#include <QtCore/QLocale>
#include <QtGui/QPainter>
#include <QtWidgets/QApplication>
#include <QtWidgets/QComboBox>

#include <cmath>

namespace client
{
namespace
{
namespace rows = vx::PopoverWidget;

const rows::EItemFlags c_usual = rows::eifText | rows::eifControl;
constexpr int c_width = 300;
constexpr int c_handle = 1;

enum RowId
{
    IdSearch = 1,
    IdViews,
    IdSide,
    IdStripes,
    IdCustomize,
    IdLogOut,
    IdSubmenu
};
}

SettingsPopover::SettingsPopover(
    Fleet& fleet, Session& session, Settings& settings, LiveWall& wall, PopoverPlace& place, QWidget* owner)
    : QObject(owner)
    , m_fleet(fleet)
    , m_session(session)
    , m_settings(settings)
    , m_wall(wall)
    , m_place(place)
    , m_owner(owner)
{
}

QString SettingsPopover::presentTheme()
{
    return QApplication::palette().color(QPalette::Window).lightness() < 128 ? QStringLiteral("dark")
                                                                             : QStringLiteral("light");
}

QString SettingsPopover::presentLanguage()
{
    return QLocale().name().left(2);
}

void SettingsPopover::open(QWidget* target)
{
    if (!m_place.begin(target, tr("Settings"), QStringLiteral("settingsPopover"))) {
        return;
    }
    Container* const main = PopoverPlace::column(QStringLiteral("settingsRows"));
    auto* search = new rows::SearchItem(
        QString(), tr("Go to a camera"), QStringLiteral("cameraSearchRow"), IdSearch, c_usual, nullptr);
    connect(search, &rows::SearchItem::searchChanged, this, [this](const QString& text) {
        for (const Camera& camera : m_fleet.cameras()) {
            if (!text.isEmpty() && camera.name.contains(text, Qt::CaseInsensitive)) {
                Q_EMIT cameraWanted(camera.id);
                return;
            }
        }
    });
    add(main, search);
    addWall(main);
    addLine(main);
    addLabels(main);
    addRecordings(main);
    addCameras(main);
    addAccount(main);
    addLanguages(main);
    addThemes(main);
    addLine(main);
    Item* const customize = add(main,
        new rows::PushItem(tr("Customise the tool bar..."), QString(), QStringLiteral("customizeRow"), IdCustomize,
            rows::eifText, nullptr),
        rows::ecfDismiss);
    connect(customize, &Item::itemPerformed, this, &SettingsPopover::customizingWanted);
    Item* const logOut = add(main,
        new rows::PushItem(
            tr("Log out"), m_session.user(), QStringLiteral("logOutRow"), IdLogOut, rows::eifText | rows::eifAdditionalText,
            nullptr),
        rows::ecfDismiss);
    connect(logOut, &Item::itemPerformed, this, &SettingsPopover::logOutWanted, Qt::QueuedConnection);
    m_place.show(main);
    addHandle();
}

rows::Item* SettingsPopover::add(Container* container, Item* row)
{
    return add(container, row, rows::EContainerFlags());
}

rows::Item* SettingsPopover::add(Container* container, Item* row, rows::EContainerFlags flags)
{
    row->setFixedWidth(c_width);
    return container->addItem(row, flags);
}

void SettingsPopover::addLine(Container* container)
{
    container->addWidgetItem(new rows::Separator(nullptr), QStringLiteral("line"), 0);
}

rows::Container* SettingsPopover::addSubmenu(
    Container* container, const QString& text, const QString& value, const QString& objectName)
{
    Container* const content = PopoverPlace::column(objectName + QStringLiteral("Rows"));
    auto* row = new rows::Submenu(rows::Manager::instance()->getUniquePopoverID(), text, text, value, objectName, m_owner,
        content, m_place.controller(), IdSubmenu, c_usual | rows::eifAdditionalText, nullptr);
    row->controller()->setObjectName(objectName + QStringLiteral("Popover"));
    add(container, row);
    return content;
}

void SettingsPopover::addWall(Container* container)
{
    m_slider = new rows::SliderItem(tr("Views"), QStringLiteral("viewsRow"), IdViews, c_usual, nullptr);
    m_slider->slider()->setMinimumSize(170, 34);
    add(container, m_slider);
    connect(m_slider.data(), &Item::itemPerformed, this, [this](int, const QVariant& value) {
        const int edge = value.toList().value(1).toInt();
        Q_EMIT viewCountWanted(edge * edge);
    });

    auto* side = new rows::ComboBoxItem(tr("Device list"), QStringLiteral("deviceSideRow"), IdSide,
        {tr("left"), tr("right"), tr("hidden")}, c_usual, nullptr);
    side->setValue(m_settings.values().deviceSide);
    add(container, side);
    connect(side, &Item::itemPerformed, this,
        [this](int, const QVariant& value) { m_settings.set(&Settings::Values::deviceSide, value.toInt()); });

    auto* stripes = new rows::MultiStateItem(
        tr("Time line"), QStringLiteral("stripesRow"), {1, 0}, IdStripes, c_usual, nullptr);
    vx::MultiStateCustomToolButton* const button = stripes->multiStateItem();
    const auto show = [button] { button->setText(button->state() == 1 ? tr("shown") : tr("hidden")); };
    button->setToolButtonStyle(Qt::ToolButtonTextOnly);
    stripes->setValue(m_settings.values().stripes ? 1 : 0);
    show();
    add(container, stripes);
    // The button takes its step itself; beside it the row does it.
    connect(button, &QToolButton::clicked, this, [this, button, show] {
        show();
        m_settings.set(&Settings::Values::stripes, button->state() == 1);
    });
    connect(stripes, &Item::itemPerformed, button, [this, button, show] {
        button->setNextState(true);
        show();
        m_settings.set(&Settings::Values::stripes, button->state() == 1);
    });
}

// A handle becomes a child of the window that the slider stands in by now.
void SettingsPopover::addHandle()
{
    vx::MultiNubsieSlider* const slider = m_slider->slider();
    const int edge = qBound(2, int(std::lround(std::sqrt(double(m_wall.viewCount())))), 8);
    slider->addNubsie(tr("Views"), edge, 2, 8, c_handle);
    slider->setFeatures(c_handle, vx::Nubsie::enfDraggable | vx::Nubsie::enfMoveable | vx::Nubsie::enfLiveDrag);
    QPixmap knob(64, 64);
    knob.fill(Qt::transparent);
    QPainter painter(&knob);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(QColor(0, 0, 0, 70), 3));
    painter.setBrush(QApplication::palette().highlight());
    painter.drawEllipse(QRectF(3, 3, 58, 58));
    painter.end();
    slider->setStandardSize(c_handle, QSize(18, 18));
    slider->setDraggedSize(c_handle, QSize(22, 22));
    slider->setIcon(c_handle, knob);
    slider->setDrawTrack(true);
    // It would stay in the window after the popover.
    if (vx::Nubsie* const handle = slider->getNubsies().value(0)) {
        connect(slider, &QObject::destroyed, handle, &QObject::deleteLater);
    }
}
}
