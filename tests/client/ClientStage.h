// SPDX-License-Identifier: MIT
// The whole client in a window of its own, and the finding of its parts at the moment of use.
#pragma once

#include "client/ClientWindow.h"

#include <QtCore/QObject>
#include <QtCore/QPointer>
#include <QtCore/QStringList>
#include <QtCore/QTranslator>
#include <QtWidgets/QWidget>

#include <functional>

namespace vx
{
class MultiNubsieSlider;
}

namespace client
{
class DeviceList;
class LiveWall;
class RecordStripes;
class TimeTrack;
}

namespace zelkovtest
{
/// Plays the program around a client: applies the theme and the language that it asks for, and takes both back at its
/// end. The client can be deleted at any time.
class ClientStage : public QObject
{
    Q_OBJECT

public:
    explicit ClientStage(const QSize& size);
    ~ClientStage() override;

    QWidget& window() { return m_window; }
    client::ClientWindow* client() const { return m_client; }
    client::LiveWall& wall() const;
    client::RecordStripes& stripes() const;
    client::TimeTrack* track() const;
    client::DeviceList* devices() const;
    QVector<int> shownDevices() const;
    QVector<int> fleetOrder() const;

    /// What has been asked for.
    QStringList themes;
    QStringList languages;

    /// The widget of this name and class that is to be seen now; null if there is none.
    template <typename T = QWidget>
    T* seen(const char* name) const
    {
        for (T* const each : m_window.findChildren<T*>(QLatin1String(name))) {
            if (each->isVisible() && !each->visibleRegion().isEmpty()) {
                return each;
            }
        }
        return nullptr;
    }

    /// Waits until it is to be seen, stands still and is not covered in its middle or where else. Null after five
    /// seconds, with a word on the log.
    template <typename T = QWidget>
    T* settled(const char* name, const std::function<QPoint(const QWidget*)>& where = {})
    {
        return static_cast<T*>(waitFor(name, [this, name]() -> QWidget* { return seen<T>(name); }, where));
    }
    static QPoint middleOf(const QWidget* widget) { return widget->rect().center(); }
    /// Waits until it is not to be seen any more.
    bool gone(const char* name);

    /// Of the only handle of the slider, in the window; waits until it is to be seen.
    QPoint handleOf(vx::MultiNubsieSlider* slider);

    /// Calls \a action as soon as a widget of this name is to be seen and stands still, in whatever event loop runs by
    /// then. Once.
    void whenSeen(const char* name, const std::function<void()>& action);

    void deleteClient() { delete m_client.data(); }

private:
    QWidget* waitFor(const char* name, const std::function<QWidget*()>& find,
        const std::function<QPoint(const QWidget*)>& where);
    void applyTheme(const QString& name);
    void applyLanguage(const QString& language);

    QWidget m_window;
    QPointer<client::ClientWindow> m_client;
    QTranslator m_translator;
};
}
