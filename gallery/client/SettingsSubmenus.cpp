// SPDX-License-Identifier: MIT
// What the rows of the settings lead to.
#include "SettingsPopover.h"

#include "../cameras/Scene.h"
#include "Fleet.h"
#include "LiveWall.h"
#include "PopoverPlace.h"
#include "Session.h"
#include "Settings.h"
#include "popover/items/CheckItem.h"
#include "popover/items/ClearEditItem.h"
#include "popover/items/DateTimeItem.h"
#include "popover/items/EditItem.h"
#include "popover/items/ImageItem.h"
#include "popover/items/LabelItem.h"
#include "popover/items/MultipleValuesEditItem.h"
#include "popover/items/PushItem.h"
#include "popover/items/RadioItem.h"
#include "popover/items/SpinItem.h"
#include "popover/items/TristateCheckItem.h"
#include "popover/items/UnitValueItem.h"
#include "popover/items/iOSCheckItem.h"

#include <QtCore/QDateTime>
#include <QtWidgets/QButtonGroup>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QDateTimeEdit>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QSpinBox>

namespace client
{
namespace
{
namespace rows = vx::PopoverWidget;

const rows::EItemFlags c_controls = rows::eifText | rows::eifControl;
constexpr int c_pictureHeight = 110;

enum SubmenuRowId
{
    IdAllLabels = 20,
    IdNames,
    IdTimes,
    IdBadges,
    IdLanguage,
    IdTheme,
    IdPicture,
    IdMoment,
    IdLive,
    IdRename,
    IdSite,
    IdOutage,
    IdWho,
    IdShownName,
    IdIdle,
    IdIdleTime,
    IdPassword
};
}

void SettingsPopover::addLabels(Container* container)
{
    m_labels = addSubmenu(container, tr("Labels in the views"), QString(), QStringLiteral("labelsRow"));
    const Settings::Values& values = m_settings.values();
    auto* all = new rows::TristateCheckItem(
        tr("All labels"), QStringLiteral("allLabelsRow"), IdAllLabels, false, 0, c_controls, nullptr);
    add(m_labels, all);
    auto* names = new rows::CheckItem(tr("Names"), QStringLiteral("namesRow"), IdNames, values.names, c_controls, nullptr);
    add(m_labels, names);
    auto* times = new rows::CheckItem(tr("Times"), QStringLiteral("timesRow"), IdTimes, values.times, c_controls, nullptr);
    add(m_labels, times);
    auto* badges
        = new rows::iOSCheckItem(tr("Badges"), QStringLiteral("badgesRow"), IdBadges, values.badges, c_controls, nullptr);
    add(m_labels, badges);
    showTristate();

    // The row goes through three states; here it is a matter of all or nothing.
    connect(all, &Item::itemPerformed, this, [this, names, times, badges] {
        const Settings::Values& now = m_settings.values();
        const bool on = !(now.names && now.times && now.badges);
        m_settings.set(&Settings::Values::names, on);
        m_settings.set(&Settings::Values::times, on);
        m_settings.set(&Settings::Values::badges, on);
        names->setValue(on);
        times->setValue(on);
        badges->setValue(on);
        showTristate();
    });
    const auto follow = [this](Item* row, bool Settings::Values::*field) {
        connect(row, &Item::itemPerformed, this, [this, field](int, const QVariant& value) {
            m_settings.set(field, value.toBool());
            showTristate();
        });
    };
    follow(names, &Settings::Values::names);
    follow(times, &Settings::Values::times);
    follow(badges, &Settings::Values::badges);
}

void SettingsPopover::showTristate()
{
    const Settings::Values& values = m_settings.values();
    const int count = int(values.names) + int(values.times) + int(values.badges);
    auto* all = m_labels ? qobject_cast<rows::TristateCheckItem*>(m_labels->getItem(IdAllLabels)) : nullptr;
    if (all) {
        all->setTristate(count == 1 || count == 2);
        all->setCheckState(count == 0 ? Qt::Unchecked : count == 3 ? Qt::Checked : Qt::PartiallyChecked);
    }
}

void SettingsPopover::addLanguages(Container* container)
{
    const QString names[] = {QStringLiteral("English"), QStringLiteral("Deutsch"), QStringLiteral("Français")};
    const QString languages[] = {QStringLiteral("en"), QStringLiteral("de"), QStringLiteral("fr")};
    const QString present = presentLanguage();
    QString presentName;
    for (int i = 0; i < 3; ++i) {
        if (languages[i] == present) {
            presentName = names[i];
        }
    }
    Container* const content = addSubmenu(container, tr("Language"), presentName, QStringLiteral("languageRow"));
    auto* group = new QButtonGroup(content);
    for (int i = 0; i < 3; ++i) {
        const QString language = languages[i];
        Item* const row = add(content,
            new rows::RadioItem(names[i], QStringLiteral("languageRow_") + language, IdLanguage, language == present,
                group, c_controls, nullptr),
            rows::ecfDismissAll);
        // All widgets may be made anew on it.
        connect(row, &Item::itemPerformed, this, [this, language] { Q_EMIT languageWanted(language); },
            Qt::QueuedConnection);
    }
}

void SettingsPopover::addThemes(Container* container)
{
    const QString present = presentTheme();
    const bool isDark = present == QLatin1String("dark");
    Container* const content
        = addSubmenu(container, tr("Appearance"), isDark ? tr("Dark") : tr("Light"), QStringLiteral("themeRow"));
    auto* group = new QButtonGroup(content);
    for (const QString& theme : {QStringLiteral("light"), QStringLiteral("dark")}) {
        Item* const row = add(content,
            new rows::RadioItem(theme == QLatin1String("dark") ? tr("Dark") : tr("Light"),
                QStringLiteral("themeRow_") + theme, IdTheme, theme == present, group, c_controls, nullptr),
            rows::ecfDismissAll);
        connect(row, &Item::itemPerformed, this, [this, theme] { Q_EMIT themeWanted(theme); }, Qt::QueuedConnection);
    }
}

QPixmap SettingsPopover::pictureOfCurrent() const
{
    const int id = qMax(0, m_wall.currentCamera());
    return gallery::Scene(id).ground(QSize(c_pictureHeight * 16 / 9, c_pictureHeight), m_owner->devicePixelRatioF());
}

void SettingsPopover::addRecordings(Container* container)
{
    Container* const content = addSubmenu(container, tr("Recordings"), m_wall.isLive() ? tr("live") : tr("recorded"),
        QStringLiteral("recordingsRow"));
    auto* picture = new rows::ImageItem(QStringLiteral("pictureRow"), IdPicture, pictureOfCurrent(), nullptr);
    picture->setFixedHeight(c_pictureHeight + 6);
    add(content, picture, rows::ecfDismissAll);
    // The picture leads to its camera.
    connect(picture, &Item::itemPerformed, this, [this] { Q_EMIT cameraWanted(qMax(0, m_wall.currentCamera())); });
    add(content,
        new rows::LabelItem(tr("All views show this moment of their recordings, within the last 24 hours."), QString(),
            QStringLiteral("recordingsNote"), 0, rows::eifText, nullptr));
    const QDateTime now = QDateTime::currentDateTime();
    auto* moment = new rows::DateTimeItem(tr("Moment"), now.addSecs(-600), Qt::LocalTime,
        QStringLiteral("dd.MM.yyyy  hh:mm"), QStringLiteral("momentRow"), IdMoment, c_controls, nullptr);
    moment->dateTimeEdit()->setDateTimeRange(now.addDays(-1), now);
    add(content, moment);
    connect(moment, &Item::itemPerformed, this, [this](int, const QVariant& value) {
        Q_EMIT timeWanted(quint64(value.toDateTime().toMSecsSinceEpoch()) * 1000);
    });
    Item* const live = add(content,
        new rows::PushItem(tr("Back to live"), QString(), QStringLiteral("backToLiveRow"), IdLive, rows::eifText, nullptr),
        rows::ecfDismissAll);
    connect(live, &Item::itemPerformed, this, &SettingsPopover::liveWanted);
}

void SettingsPopover::addCameras(Container* container)
{
    Container* const content = addSubmenu(container, tr("Cameras and site"), QString(), QStringLiteral("camerasRow"));
    auto* names = new rows::MultipleValuesEditItem(tr("Name of the shown"), tr("New name"), QStringLiteral("renameRow"),
        QString(), tr("several values"), IdRename, c_controls, nullptr);
    names->setMultipleValues(true);
    names->setSecurityCheck(QStringLiteral("edit-devices"));
    names->lineEdit()->setEnabled(!m_session.isRightRefused(QStringLiteral("edit-devices"), true, false, false));
    add(content, names);
    connect(names, &Item::itemPerformed, this, [this](int, const QVariant& value) {
        const QString name = value.toString().trimmed();
        if (name.isEmpty()) {
            return;
        }
        const QVector<Camera> cameras = m_fleet.cameras();
        for (int i = 0; i < qMin(m_wall.viewCount(), cameras.size()); ++i) {
            m_fleet.rename(cameras.at(i).id, QStringLiteral("%1 %2").arg(name).arg(i + 1));
        }
    });
    const QString main = tr("Main building");
    auto* site = new rows::ClearEditItem(tr("Site"), main, QStringLiteral("siteRow"), main, IdSite, c_controls, nullptr);
    site->setValue(m_settings.values().site.isEmpty() ? main : m_settings.values().site);
    add(content, site);
    connect(site->lineEdit(), &QLineEdit::textChanged, this, [this, main](const QString& text) {
        m_settings.set(&Settings::Values::site, text == main ? QString() : text);
    });
    auto* outage = new rows::SpinItem(tr("Outage of a cut line"), QStringLiteral("outageRow"), IdOutage, nullptr,
        m_settings.values().outageSeconds, c_controls, nullptr);
    outage->spinBox()->setRange(2, 60);
    outage->spinBox()->setSuffix(tr(" s"));
    add(content, outage);
    connect(outage->spinBox(), QOverload<int>::of(&QSpinBox::valueChanged), this,
        [this](int seconds) { m_settings.set(&Settings::Values::outageSeconds, seconds); });
}

void SettingsPopover::addAccount(Container* container)
{
    Container* const content = addSubmenu(container, tr("Account"), m_session.user(), QStringLiteral("accountRow"));
    const bool isAdministrator = m_session.role() == Session::Role::Administrator;
    auto* who = new rows::LabelItem((isAdministrator ? tr("Logged in as %1, an administrator.") : tr("Logged in as %1."))
                                        .arg(m_session.user()),
        QString(), QStringLiteral("whoRow"), IdWho, rows::eifText, nullptr);
    add(content, who);
    auto* name = new rows::EditItem(
        tr("Shown name"), m_session.user(), QStringLiteral("shownNameRow"), IdShownName, c_controls, nullptr);
    name->setValue(m_settings.values().shownName);
    add(content, name);
    connect(name, &Item::itemPerformed, this, [this](int, const QVariant& value) {
        m_settings.set(&Settings::Values::shownName, value.toString().trimmed());
    });

    addLine(content);
    const int seconds = m_settings.values().idleSeconds;
    auto* idle = new rows::iOSCheckItem(
        tr("Log out when idle"), QStringLiteral("idleSwitchRow"), IdIdle, seconds > 0, c_controls, nullptr);
    add(content, idle);
    auto* after = new rows::UnitValueItem(
        tr("After"), {tr("s"), tr("min")}, QStringLiteral("idleRow"), nullptr, IdIdleTime, c_controls, nullptr);
    after->valueItem()->setRange(1, 99);
    after->valueItem()->setValue(seconds == 0 ? 10 : seconds >= 60 ? seconds / 60 : seconds);
    after->unitItem()->setCurrentIndex(seconds == 0 || seconds >= 60 ? 1 : 0);
    add(content, after);
    const auto take = [this, idle, after] {
        const int number = after->valueItem()->value();
        const int time = after->unitItem()->currentIndex() == 1 ? number * 60 : number;
        m_settings.set(&Settings::Values::idleSeconds, idle->value().toBool() ? time : 0);
        after->setChecked(idle->value().toBool()); // any change checks it
    };
    after->setChecked(seconds > 0);
    connect(idle, &Item::itemPerformed, after, take);
    connect(after->valueItem(), QOverload<int>::of(&QSpinBox::valueChanged), this, take);
    connect(after->unitItem(), QOverload<int>::of(&QComboBox::currentIndexChanged), this, take);

    addLine(content);
    Item* const password = add(content,
        new rows::PushItem(tr("New password..."), QString(), QStringLiteral("newPasswordRow"), IdPassword, rows::eifText,
            nullptr),
        rows::ecfDismissAll);
    connect(password, &Item::itemPerformed, this, &SettingsPopover::newPasswordWanted, Qt::QueuedConnection);
}
}
