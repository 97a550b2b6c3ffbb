// SPDX-License-Identifier: MIT
// One camera of the live wall.
#pragma once

#include "cameras/Scene.h"
#include "indicators/BadgeDrawer.h"

#include <QtCore/QElapsedTimer>
#include <QtGui/QPixmap>
#include <QtWidgets/QWidget>

class QPushButton;

namespace vx
{
class BusyOverlayView;
class MouseAdapter;
class NameTimeLabel;
class TimeLabel;
}

namespace client
{
struct Camera;

/// The picture of a camera with its name, the time of the frame and the count of its events; while the camera is
/// offline its last picture, dimmed, with the time since when.
///
/// It has no clock of its own: whoever owns it shows each frame. A frame is painted once, and only the view is: the
/// labels are opaque and are painted when their text changes.
class LiveView : public QWidget
{
    Q_OBJECT

public:
    explicit LiveView(QWidget* parent = nullptr);
    ~LiveView() override;

    /// Another camera: it looks straight ahead and has no events yet.
    void setCamera(const Camera& camera);
    int camera() const { return m_camera; }
    void setName(const QString& name);
    void setOnline(bool online);
    bool isOnline() const { return m_online; }
    /// For how long the camera has been offline when its view comes to light.
    void setSecondsOffline(int seconds);

    /// The picture of that moment: microseconds since 1970-01-01 UTC. Nothing while a live camera is offline.
    void showFrame(quint64 microseconds, bool live);
    quint64 frameTime() const { return m_frame; }
    /// How many frames have been painted since the last call.
    int takePaintedFrames();

    /// The chosen one is framed, and its events have been seen.
    void setCurrent(bool current);
    bool isCurrent() const { return m_current; }
    void setShowName(bool on);
    void setShowTime(bool on);
    void setShowBadge(bool on);
    int eventCount() const { return m_events; }

    /// Looks around: by parts of the picture, to the right and downwards, as far as the scene goes.
    void lookBy(const QPointF& parts);
    /// 1 to 4 times as large.
    void zoomBy(double factor);
    double zoom() const { return m_zoom; }
    /// Where it looks in its scene, which is 1 wide and 1 high.
    QPointF lookingAt() const { return m_centre; }

    /// Paints again what was only scaled while the size kept changing.
    void settle();
    /// While a tool works in the view it has no gestures but the double click.
    void setGestures(bool on);
    /// A sign for a moment: its picture comes from the style sheet by the name, with "Small" after it in a small view.
    void showSign(const QString& name, const QString& text = QString());

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    void chosen(client::LiveView* view);
    void enlargeWanted(client::LiveView* view);
    void snapshotWanted(client::LiveView* view);
    void reconnectWanted(client::LiveView* view);

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void changeEvent(QEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;

private:
    void makeGestures();
    void retranslate();
    void place();
    void writeDates();
    void placeBusy();
    void showConnection();
    void showBusy();
    void hideBusy();
    void countEvents();
    void showEventCount();
    void paintPicture(QPainter& painter);

    gallery::Scene m_scene;
    QPixmap m_ground;
    QSize m_groundFor; // the view's size that it was painted for
    QElapsedTimer m_resized;
    QPointF m_centre;
    double m_zoom = 1;
    int m_camera = -1;
    int m_events = 0;
    int m_secondsOffline = 0;
    quint64 m_frame = 0;
    quint64 m_paintedFrame = 0;
    quint64 m_nextEvent = 0;
    int m_paintedFrames = 0;
    bool m_live = true;
    bool m_online = true;
    bool m_current = false;
    bool m_showBadge = true;
    bool m_showTime = true;
    bool m_showName = true;
    bool m_hasGestures = true;
    bool m_hasDate = true;
    QString m_name;
    vx::BadgeDrawer m_count;
    vx::NameTimeLabel* m_caption;
    vx::TimeLabel* m_time;
    vx::BusyOverlayView* m_busy;
    QPushButton* m_reconnect;
    vx::MouseAdapter* m_gestures;
};
}
