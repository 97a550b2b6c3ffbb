// SPDX-License-Identifier: MIT
// The live or recorded pictures of the cameras, side by side.
#pragma once

#include <QtCore/QElapsedTimer>
#include <QtCore/QTimer>
#include <QtCore/QVector>
#include <QtWidgets/QWidget>

namespace client
{
class CountingTools;
class Fleet;
class LiveView;
class MarkingTool;
class Reconnection;

/// The first viewCount() cameras of the fleet, in its order, at 25 frames a second while it is visible. While there
/// are cameras one of them is the chosen one, at first the first.
///
/// A press chooses a view, a double click enlarges it to the whole wall and back, a long press takes a snapshot, and
/// a drag looks around. The arrow keys choose, too, and Return enlarges.
class LiveWall : public QWidget
{
    Q_OBJECT

public:
    explicit LiveWall(Fleet& fleet, QWidget* parent = nullptr);
    ~LiveWall() override;

    Fleet& fleet() const { return m_fleet; }

    /// 4, 9, 16, 25, 36, 49 or 64; other numbers become the next of these. 4 by default.
    void setViewCount(int count);
    int viewCount() const { return m_viewCount; }

    /// Makes the camera the chosen one; a camera beyond the wall comes to its first place.
    void chooseCamera(int id);
    /// -1 if there is none.
    int currentCamera() const { return m_current; }

    /// All views show this moment of their records: microseconds since 1970-01-01 UTC.
    void showRecorded(quint64 microseconds);
    /// All views show what their cameras send. The default.
    void showLive();
    bool isLive() const { return m_live; }

    /// Lets the user mark a region in the current view.
    void setMarking(bool on);
    bool isMarking() const { return m_marks; }
    /// Lets the user draw the counting line in the current view.
    void setCounting(bool on);
    bool isCounting() const { return m_counts; }

    /// Turns and zooms the picture of the current camera: each -1 to 1, what a stick says. Goes on until told
    /// otherwise, or until another camera is chosen. Nothing for a camera without a motor.
    void steer(double pan, double tilt, double zoom);

    /// What the frame-time labels show besides the time.
    void setShowNames(bool on);
    void setShowTimes(bool on);
    void setShowBadges(bool on);

    /// Frames of all views together within the last second.
    int framesPerSecond() const { return m_framesPerSecond; }

    /// The cameras on the wall in reading order, and the view of one; null for a camera that is not on the wall.
    QVector<int> shownCameras() const;
    LiveView* view(int id) const;
    /// The camera that fills the wall, or -1.
    int enlargedCamera() const { return m_enlarged; }
    void setEnlarged(int id);
    bool isRunning() const { return m_frames.isActive(); }
    Reconnection& reconnection() { return *m_reconnection; }

Q_SIGNALS:
    void currentChanged(int id);
    /// A region that was marked, in the pixels of the camera (1920 x 1080).
    void marked(int id, const QRectF& region);
    /// Once a second while visible.
    void frameRateChanged();
    /// The user has taken a picture.
    void snapshotTaken(int id);
    /// The user has changed the counting line, in the pixels of the camera.
    void countingLineChanged(int id, const QPoint& start, const QPoint& end);

protected:
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    LiveView* makeView();
    void fill();
    void arrange();
    void setCurrent(int id);
    void placeTools();
    void setCameraOnline(int id, bool online);
    void tick();
    void turn(double seconds);
    void measure();
    void showMoment();

    Fleet& m_fleet;
    QVector<LiveView*> m_views;
    Reconnection* m_reconnection;
    MarkingTool* m_marking;
    CountingTools* m_counting;
    QTimer m_frames;
    QTimer m_settle;
    QElapsedTimer m_clock;
    qint64 m_tick = 0;
    qint64 m_measured = 0;
    quint64 m_moment = 0; // of the records
    double m_pan = 0;
    double m_tilt = 0;
    double m_zoom = 0;
    int m_viewCount = 4;
    int m_framesPerSecond = 0;
    int m_current = -1;
    int m_front = -1; // a camera from beyond the wall
    int m_enlarged = -1;
    bool m_live = true;
    bool m_marks = false;
    bool m_counts = false;
    bool m_showNames = true;
    bool m_showTimes = true;
    bool m_showBadges = true;
};
}
