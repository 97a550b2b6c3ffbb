// SPDX-License-Identifier: MIT
// What a user who is logged in works with.
#include "Desk.h"

#include "DeskBar.h"
#include "DevicePanel.h"
#include "Fleet.h"
#include "LiveWall.h"
#include "PopoverPlace.h"
#include "PtzPanel.h"
#include "Reconnection.h"
#include "RecordStripes.h"
#include "Session.h"
#include "Settings.h"
#include "SettingsPopover.h"
#include "ThumbnailWall.h"
#include "indicators/ElidedLabel.h"
#include "popover/Container.h"
#include "popover/items/LabelItem.h"
#include "popover/items/PushItem.h"
#include "popover/items/RadioItem.h"
#include "popover/items/Separator.h"
#include "views/NavigationViewController.h"

#include <QtCore/QDateTime>
#include <QtCore/QEvent>
#include <QtCore/QRectF>
#include <QtWidgets/QApplication>
#include <QtWidgets/QButtonGroup>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QSplitter>
#include <QtWidgets/QVBoxLayout>

#include <cmath>

namespace client
{
namespace
{
namespace rows = vx::PopoverWidget;

constexpr int c_slideMs = 260;
constexpr int c_menuWidth = 220;
// From live pictures the recordings begin this far back.
constexpr int c_backMs = 60 * 1000;
}

Desk::Desk(Fleet& fleet, Session& session, QWidget* parent)
    : QWidget(parent)
    , m_fleet(fleet)
    , m_session(session)
    , m_settings(new Settings(this))
    , m_bar(new DeskBar(session))
    , m_splitter(new QSplitter(Qt::Horizontal))
    , m_devices(new DevicePanel(fleet, session))
    , m_middle(new vx::NavigationViewController(c_slideMs, QEasingCurve::OutCubic))
    , m_area(new QWidget)
    , m_wall(new LiveWall(fleet))
    , m_stripes(nullptr)
    , m_thumbnails(new ThumbnailWall(fleet))
    , m_ptz(new PtzPanel(*m_wall, session))
    , m_status(new vx::ElidedLabel)
    , m_site(new vx::ElidedLabel)
    , m_rate(new QLabel)
    , m_place(new PopoverPlace(this))
    , m_settingsPopover(new SettingsPopover(fleet, session, *m_settings, *m_wall, *m_place, this))
{
    setObjectName(QStringLiteral("desk"));
    m_splitter->setObjectName(QStringLiteral("deskSplitter"));
    m_middle->setObjectName(QStringLiteral("deskMiddle"));
    m_area->setObjectName(QStringLiteral("wallArea"));
    m_status->setObjectName(QStringLiteral("statusText"));
    m_site->setObjectName(QStringLiteral("siteText"));
    m_rate->setObjectName(QStringLiteral("frameRate"));
    if (m_devices->objectName().isEmpty()) {
        m_devices->setObjectName(QStringLiteral("devicePanel"));
    }
    if (m_ptz->objectName().isEmpty()) {
        m_ptz->setObjectName(QStringLiteral("ptzPanel"));
    }

    auto* area = new QVBoxLayout(m_area);
    area->setContentsMargins(0, 0, 0, 0);
    area->addWidget(m_wall);
    m_stripes = new RecordStripes(fleet, session, m_area);
    m_middle->addWidget(m_area);
    m_middle->addWidget(m_thumbnails);

    m_splitter->addWidget(m_devices);
    m_splitter->addWidget(m_middle);
    m_splitter->addWidget(m_ptz);
    m_splitter->setChildrenCollapsible(false);
    m_splitter->setHandleWidth(6);
    m_splitter->setStretchFactor(0, 0);
    m_splitter->setStretchFactor(1, 1);
    m_splitter->setStretchFactor(2, 0);
    m_splitter->setSizes({210, 10000, 210});
    m_devices->setContentsMargins(10, 8, 4, 0);
    m_thumbnails->setContentsMargins(4, 8, 4, 0);
    m_devices->setMinimumWidth(170);
    m_middle->setMinimumWidth(320);
    m_ptz->setMinimumWidth(180);
    m_ptz->hide();

    auto* line = new QWidget;
    line->setObjectName(QStringLiteral("statusLine"));
    line->setAttribute(Qt::WA_StyledBackground);
    m_status->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
    m_site->setSizePolicy(QSizePolicy::Maximum, QSizePolicy::Preferred);
    m_site->setMaximumWidth(240);
    m_rate->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    for (QLabel* label : {static_cast<QLabel*>(m_status), static_cast<QLabel*>(m_site), m_rate}) {
        label->setProperty("role", QStringLiteral("hint"));
    }
    auto* lineLayout = new QHBoxLayout(line);
    lineLayout->setContentsMargins(12, 4, 12, 4);
    lineLayout->setSpacing(16);
    lineLayout->addWidget(m_status, 1);
    lineLayout->addWidget(m_site);
    lineLayout->addWidget(m_rate);

    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(m_bar);
    layout->addWidget(m_splitter, 1);
    layout->addWidget(line);

    m_idle.setSingleShot(true);
    connect(&m_idle, &QTimer::timeout, this, &Desk::logOutWanted);
    connectBar();
    connectPanels();
    connectSettings();
    applySettings();
    retranslate();
    m_bar->setViewCount(m_wall->viewCount());
    m_bar->setLive(m_wall->isLive());
}

Desk::~Desk()
{
    // Its rows refer to all that is below.
    delete m_place;
}

void Desk::connectBar()
{
    connect(m_bar, &DeskBar::nextViewCountWanted, this, [this] {
        const int edge = int(std::lround(std::sqrt(double(m_wall->viewCount()))));
        const int next = edge >= 8 ? 2 : edge + 1;
        setViewCount(next * next);
    });
    connect(m_bar, &DeskBar::viewCountChoiceWanted, this, &Desk::openViewCounts);
    connect(m_bar, &DeskBar::thumbnailsWanted, this, &Desk::showThumbnails);
    connect(m_bar, &DeskBar::liveWanted, this, [this](bool live) {
        if (live) {
            showLive();
        } else {
            showRecorded(quint64(QDateTime::currentMSecsSinceEpoch() - c_backMs) * 1000);
        }
    });
    // Both draw in the view: one at a time.
    connect(m_bar, &DeskBar::markingWanted, this, [this](bool on) {
        if (on) {
            m_bar->setCounting(false);
            m_wall->setCounting(false);
            showThumbnails(false);
            tell(tr("Drag a rectangle in the chosen view."));
        }
        m_wall->setMarking(on);
    });
    connect(m_bar, &DeskBar::countingWanted, this, [this](bool on) {
        if (on) {
            m_bar->setMarking(false);
            m_wall->setMarking(false);
            showThumbnails(false);
            tell(tr("Drag the ends of the line in the chosen view."));
        }
        m_wall->setCounting(on);
    });
    connect(m_bar, &DeskBar::exportWanted, m_stripes, &RecordStripes::runExport);
    connect(m_bar, &DeskBar::steeringWanted, m_ptz, &QWidget::setVisible);
    connect(m_bar, &DeskBar::dropWanted, this, &Desk::dropOrRestore);
    connect(m_bar, &DeskBar::settingsWanted, m_settingsPopover, &SettingsPopover::open);
    connect(m_bar, &DeskBar::userWanted, this, &Desk::openUserMenu);
}

void Desk::connectPanels()
{
    connect(m_devices, &DevicePanel::cameraChosen, this, &Desk::chooseCamera);
    connect(m_thumbnails, &ThumbnailWall::cameraChosen, this, [this](int id) {
        showThumbnails(false);
        chooseCamera(id);
    });
    connect(m_stripes, &RecordStripes::timeChosen, this, &Desk::showRecorded);
    connect(m_stripes, &RecordStripes::cameraChosen, this, &Desk::chooseCamera);
    connect(m_stripes, &RecordStripes::liveWanted, this, &Desk::showLive);
    connect(m_stripes, &RecordStripes::exportFinished, this, [this](bool complete) {
        tell(complete ? tr("The export is complete.") : tr("The export was stopped."));
    });
    connect(m_wall, &LiveWall::currentChanged, this, &Desk::showCamera);
    connect(m_wall, &LiveWall::frameRateChanged, this, &Desk::showRate);
    connect(m_wall, &LiveWall::marked, this, [this](int id, const QRectF& region) {
        const Camera* camera = m_fleet.camera(id);
        const QRect whole = region.toRect();
        tell(tr("Marked in %1: %2 x %3 pixels at %4, %5")
                 .arg(camera ? camera->name : QString())
                 .arg(whole.width())
                 .arg(whole.height())
                 .arg(whole.x())
                 .arg(whole.y()));
    });
    connect(m_wall, &LiveWall::snapshotTaken, this, [this](int id) {
        const Camera* camera = m_fleet.camera(id);
        tell(tr("A picture of %1 was taken.").arg(camera ? camera->name : QString()));
    });
    connect(&m_fleet, &Fleet::onlineChanged, this, [this](int id, bool online) {
        const Camera* camera = m_fleet.camera(id);
        if (camera) {
            tell((online ? tr("%1 is back.") : tr("%1 has gone.")).arg(camera->name));
        }
        m_bar->setCameraOnline(!m_fleet.camera(m_wall->currentCamera())
            || m_fleet.camera(m_wall->currentCamera())->online);
    });
    connect(&m_session, &Session::roleChanged, this, &Desk::applyRole);
}

void Desk::connectSettings()
{
    connect(m_settings, &Settings::changed, this, &Desk::applySettings);
    connect(m_settingsPopover, &SettingsPopover::themeWanted, this, &Desk::themeWanted);
    connect(m_settingsPopover, &SettingsPopover::languageWanted, this, &Desk::languageWanted);
    connect(m_settingsPopover, &SettingsPopover::viewCountWanted, this, &Desk::setViewCount);
    connect(m_settingsPopover, &SettingsPopover::cameraWanted, this, &Desk::chooseCamera);
    connect(m_settingsPopover, &SettingsPopover::timeWanted, this, &Desk::showRecorded);
    connect(m_settingsPopover, &SettingsPopover::liveWanted, this, &Desk::showLive);
    connect(m_settingsPopover, &SettingsPopover::customizingWanted, m_bar, &DeskBar::customizeToolBar);
    connect(m_settingsPopover, &SettingsPopover::newPasswordWanted, this, &Desk::newPasswordWanted);
    connect(m_settingsPopover, &SettingsPopover::logOutWanted, this, &Desk::logOutWanted);
}

void Desk::setViewCount(int count)
{
    m_wall->setViewCount(count);
    m_bar->setViewCount(m_wall->viewCount());
    showThumbnails(false);
}

void Desk::enter()
{
    m_wall->setFocus();
}

void Desk::leave()
{
    m_place->close();
    m_bar->endCustomizing();
    m_bar->setSteering(false);
    m_ptz->hide();
    m_bar->setMarking(false);
    m_wall->setMarking(false);
    m_bar->setCounting(false);
    m_wall->setCounting(false);
    m_idle.stop();
}

bool Desk::eventFilter(QObject* watched, QEvent* event)
{
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseMove:
    case QEvent::KeyPress:
    case QEvent::Wheel:
        if (m_idle.isActive()) {
            m_idle.start();
        }
        break;
    default:
        break;
    }
    return QWidget::eventFilter(watched, event);
}

void Desk::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        m_place->close(); // its rows were made in the old language
        retranslate();
    }
}

void Desk::retranslate()
{
    showUserText();
    applySettings();
    showRate();
    showCamera();
}

void Desk::applySettings()
{
    const Settings::Values& values = m_settings->values();
    m_wall->setShowNames(values.names);
    m_wall->setShowTimes(values.times);
    m_wall->setShowBadges(values.badges);
    m_wall->reconnection().setDelay(values.outageSeconds * 1000);
    m_stripes->setStripesVisible(values.stripes);
    m_devices->setVisible(values.deviceSide != Settings::Hidden);
    const int place = values.deviceSide == Settings::Right ? m_splitter->count() - 1 : 0;
    if (m_splitter->indexOf(m_devices) != place) {
        m_splitter->insertWidget(place, m_devices);
    }
    m_site->setText(values.site.isEmpty() ? tr("Main building") : values.site);
    showUserText();
    const bool waits = values.idleSeconds > 0 && m_session.role() != Session::Role::None;
    qApp->removeEventFilter(this);
    m_idle.stop();
    if (waits) {
        qApp->installEventFilter(this);
        m_idle.start(values.idleSeconds * 1000);
    }
}

void Desk::applyRole()
{
    if (m_session.isRightRefused(QStringLiteral("ptz"), true, false, false)) {
        m_bar->setSteering(false);
        m_ptz->hide();
    }
    if (m_session.role() == Session::Role::None) {
        m_settings->set(&Settings::Values::shownName, QString()); // the next user has a name of his own
    }
    applySettings();
}

void Desk::showUserText()
{
    const QString& shown = m_settings->values().shownName;
    m_bar->setUserText(shown.isEmpty() ? m_session.user() : shown);
}

void Desk::showThumbnails(bool on)
{
    const int index = on ? 1 : 0;
    if ((m_middle->animatedIndex() >= 0 ? m_middle->animatedIndex() : m_middle->currentIndex()) != index) {
        m_middle->setCurrentIndexWithAnimation(index);
    }
    m_bar->setThumbnails(on);
}

void Desk::chooseCamera(int id)
{
    m_wall->chooseCamera(id);
    showCamera();
}

void Desk::showRecorded(quint64 microseconds)
{
    m_wall->showRecorded(microseconds);
    m_stripes->showTime(microseconds);
    m_bar->setLive(false);
    tell(tr("Recording of %1")
             .arg(QDateTime::fromMSecsSinceEpoch(qint64(microseconds / 1000)).toString(QStringLiteral("dd.MM.yyyy  hh:mm:ss"))));
}

void Desk::showLive()
{
    m_wall->showLive();
    m_stripes->showLive();
    m_bar->setLive(true);
    showCamera();
}

void Desk::dropOrRestore()
{
    const int id = m_wall->currentCamera();
    const Camera* camera = m_fleet.camera(id);
    if (!camera) {
        tell(tr("Choose a camera first."));
        return;
    }
    // The wall brings it back after a while.
    m_fleet.setOnline(id, !camera->online);
}

void Desk::showCamera()
{
    const Camera* camera = m_fleet.camera(m_wall->currentCamera());
    m_stripes->setCurrentCamera(m_wall->currentCamera());
    m_bar->setCameraOnline(!camera || camera->online);
    if (camera) {
        tell(tr("%1, %2, %3").arg(camera->name, camera->address, camera->online ? tr("online") : tr("offline")));
    } else {
        tell(tr("%1 cameras").arg(m_fleet.cameras().size()));
    }
}

void Desk::showRate()
{
    m_rate->setText(tr("%1 frames/s").arg(m_wall->framesPerSecond()));
}

void Desk::tell(const QString& text)
{
    m_status->setText(text);
}

void Desk::openUserMenu(QWidget* button)
{
    if (!m_place->begin(button, m_session.user(), QStringLiteral("userPopover"))) {
        return;
    }
    const rows::EItemFlags usual = rows::eifText | rows::eifControl;
    rows::Container* const content = PopoverPlace::column(QStringLiteral("userRows"));
    const auto add = [content](rows::Item* row) {
        row->setFixedWidth(c_menuWidth);
        content->addItem(row, rows::ecfDismiss);
        return row;
    };
    auto* group = new QButtonGroup(content);
    const auto addRole = [&](const QString& text, const char* name, Session::Role role) {
        rows::Item* const row = add(new rows::RadioItem(
            text, QString::fromLatin1(name), int(role), m_session.role() == role, group, usual, nullptr));
        connect(row, &rows::Item::itemPerformed, this, [this, role] { m_session.setRole(role); });
    };
    addRole(tr("User"), "roleUserRow", Session::Role::User);
    addRole(tr("Administrator"), "roleAdministratorRow", Session::Role::Administrator);
    content->addWidgetItem(new rows::Separator(nullptr), QStringLiteral("line"), 0);
    const auto addPush = [&](const QString& text, const char* name, void (Desk::*wanted)()) {
        rows::Item* const row
            = add(new rows::PushItem(text, QString(), QString::fromLatin1(name), 0, rows::eifText, nullptr));
        connect(row, &rows::Item::itemPerformed, this, wanted, Qt::QueuedConnection);
    };
    addPush(tr("New password..."), "userNewPasswordRow", &Desk::newPasswordWanted);
    addPush(tr("Log out"), "userLogOutRow", &Desk::logOutWanted);
    m_place->show(content);
}

void Desk::openViewCounts(QWidget* button)
{
    if (!m_place->begin(button, tr("Views"), QStringLiteral("viewsPopover"))) {
        return;
    }
    rows::Container* const content = PopoverPlace::column(QStringLiteral("viewCountRows"));
    auto* group = new QButtonGroup(content);
    for (int edge = 2; edge <= 8; ++edge) {
        const int count = edge * edge;
        auto* row = new rows::RadioItem(tr("%1 views").arg(count), QStringLiteral("viewCountRow_%1").arg(count), count,
            m_wall->viewCount() == count, group, rows::eifText | rows::eifControl, nullptr);
        row->setFixedWidth(c_menuWidth * 2 / 3);
        content->addItem(row, rows::ecfDismiss);
        connect(row, &rows::Item::itemPerformed, this, [this, count] { setViewCount(count); });
    }
    m_place->show(content);
}
}
