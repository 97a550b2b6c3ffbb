// SPDX-License-Identifier: MIT
// What a user who is logged in works with.
#pragma once

#include <QtCore/QTimer>
#include <QtWidgets/QWidget>

class QLabel;
class QSplitter;

namespace vx
{
class ElidedLabel;
class NavigationViewController;
}

namespace client
{
class DeskBar;
class DevicePanel;
class Fleet;
class LiveWall;
class PopoverPlace;
class PtzPanel;
class RecordStripes;
class Session;
class Settings;
class SettingsPopover;
class ThumbnailWall;

/// Tool bar, devices, pictures with their panels, the stick, and a line that tells what has happened.
class Desk : public QWidget
{
    Q_OBJECT

public:
    Desk(Fleet& fleet, Session& session, QWidget* parent = nullptr);
    ~Desk() override;

    LiveWall& wall() { return *m_wall; }
    RecordStripes& stripes() { return *m_stripes; }

    void setViewCount(int count);
    /// Gives the pictures the keyboard.
    void enter();
    /// Ends what should not wait for the next user: popovers, the stick, marking.
    void leave();

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    void themeWanted(const QString& name);
    void languageWanted(const QString& language);
    void newPasswordWanted();
    void logOutWanted();

protected:
    void changeEvent(QEvent* event) override;

private:
    void connectBar();
    void connectPanels();
    void connectSettings();
    void retranslate();
    void applySettings();
    void applyRole();
    void showUserText();
    void showThumbnails(bool on);
    void chooseCamera(int id);
    void showRecorded(quint64 microseconds);
    void showLive();
    void dropOrRestore();
    void showCamera();
    void showRate();
    void tell(const QString& text);
    void openUserMenu(QWidget* button);
    void openViewCounts(QWidget* button);

    Fleet& m_fleet;
    Session& m_session;
    Settings* m_settings;
    DeskBar* m_bar;
    QSplitter* m_splitter;
    DevicePanel* m_devices;
    vx::NavigationViewController* m_middle;
    QWidget* m_area;
    LiveWall* m_wall;
    RecordStripes* m_stripes;
    ThumbnailWall* m_thumbnails;
    PtzPanel* m_ptz;
    vx::ElidedLabel* m_status;
    vx::ElidedLabel* m_site;
    QLabel* m_rate;
    PopoverPlace* m_place;
    SettingsPopover* m_settingsPopover;
    QTimer m_idle;
};
}
