// SPDX-License-Identifier: MIT
// The live or recorded pictures of the cameras, side by side.
#pragma once

#include <QtWidgets/QWidget>

namespace client
{
class Fleet;

/// The first viewCount() cameras of the fleet, in its order, at 25 frames a second while it is visible.
class LiveWall : public QWidget
{
    Q_OBJECT

public:
    explicit LiveWall(Fleet& fleet, QWidget* parent = nullptr);

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
    /// Lets the user draw the counting line in the current view.
    void setCounting(bool on);

    /// Turns and zooms the picture of the current camera: each -1 to 1, what a stick says.
    void steer(double pan, double tilt, double zoom);

    /// What the frame-time labels show besides the time.
    void setShowNames(bool on);
    void setShowTimes(bool on);
    void setShowBadges(bool on);

    /// Frames of all views together within the last second.
    int framesPerSecond() const;

Q_SIGNALS:
    void currentChanged(int id);
    /// A region that was marked, in the pixels of the camera (1920 x 1080).
    void marked(int id, const QRectF& region);
    /// Once a second while visible.
    void frameRateChanged();

private:
    Fleet& m_fleet;
    int m_viewCount = 4;
    int m_current = -1;
    bool m_live = true;
};
}
