// SPDX-License-Identifier: MIT
// The settings, as rows of a popover.
#pragma once

#include "popover/Container.h"

#include <QtCore/QObject>
#include <QtCore/QPointer>

class QButtonGroup;

namespace vx
{
namespace PopoverWidget
{
class SliderItem;
class Submenu;
}
}

namespace client
{
class Fleet;
class LiveWall;
class PopoverPlace;
class Session;
class Settings;

/// Fills the popover of the settings. What is chosen there takes effect at once: in the settings, in the wall, or by
/// one of the signals.
class SettingsPopover : public QObject
{
    Q_OBJECT

public:
    SettingsPopover(Fleet& fleet, Session& session, Settings& settings, LiveWall& wall, PopoverPlace& place,
        QWidget* owner);

    void open(QWidget* target);

    /// "light" or "dark", by the palette of the program.
    static QString presentTheme();
    /// "en", "de" or "fr", by the default locale.
    static QString presentLanguage();

Q_SIGNALS:
    void themeWanted(const QString& name);
    void languageWanted(const QString& language);
    void viewCountWanted(int count);
    void cameraWanted(int id);
    void timeWanted(quint64 microseconds);
    void liveWanted();
    void customizingWanted();
    void newPasswordWanted();
    void logOutWanted();

private:
    using Container = vx::PopoverWidget::Container;
    using Item = vx::PopoverWidget::Item;

    Item* add(Container* container, Item* row);
    Item* add(Container* container, Item* row, vx::PopoverWidget::EContainerFlags flags);
    Container* addSubmenu(Container* container, const QString& text, const QString& value, const QString& objectName);
    void addLine(Container* container);
    void addWall(Container* container);
    void addLabels(Container* container);
    void addLanguages(Container* container);
    void addThemes(Container* container);
    void addRecordings(Container* container);
    void addCameras(Container* container);
    void addAccount(Container* container);
    void addHandle();
    void showTristate();
    QPixmap pictureOfCurrent() const;

    Fleet& m_fleet;
    Session& m_session;
    Settings& m_settings;
    LiveWall& m_wall;
    PopoverPlace& m_place;
    QWidget* m_owner;
    QPointer<vx::PopoverWidget::SliderItem> m_slider;
    QPointer<Container> m_labels;
};
}
