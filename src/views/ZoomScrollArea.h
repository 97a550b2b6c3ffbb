// SPDX-License-Identifier: MIT
// ZoomScrollArea: a scroll area whose wheel zooms.
#pragma once

#include "foundation/Export.h"

#include <QtWidgets/QScrollArea>

class NicerScrollBar;
class QScrollBar;
class QTimer;

/// A QScrollArea that turns the mouse wheel into a stream of zoom factors instead of scrolling, and knows whether
/// the user is working by touch. It does no zooming itself: connect to updateZoomFactor() and scale the content.
/// Scrolling is done by the two overlay bars, at the top and at the right, or by the program.
///
/// Touches are noted and go no further, so the area has no scrolling by touch of its own.
class ZELKOV_WIDGETS_EXPORT ZoomScrollArea : public QScrollArea
{
    Q_OBJECT

public:
    explicit ZoomScrollArea(QWidget* parent = nullptr);
    ~ZoomScrollArea() override;

    // The overlay bars, at the top and at the right.
    QScrollBar* horizontalNicerScrollBar() const;
    QScrollBar* verticalNicerScrollBar() const;
    /// Default on: the bars are shown as needed.
    void enableScrollbars(bool enable);
    /// Says that the user works by touch, as a touch does. It is forgotten 2000 ms after the last call or touch,
    /// so false merely starts that time.
    void setTouchActive(bool active);

Q_SIGNALS:
    /// Once every 75 ms for about 750 ms after each notch of the wheel: 1.0 to zoom in, -1.0 to zoom out. 0.0 when
    /// the stream stops, 825 ms after the last notch, and from then on for what still ticks.
    void updateZoomFactor(double factor);
    /// The content was scrolled.
    void scrollAreaChanged();

protected:
    /// Whether the user works by touch.
    bool isTouchActive() const;

    void wheelEvent(QWheelEvent* event) override;
    bool viewportEvent(QEvent* event) override;
    void scrollContentsBy(int dx, int dy) override;

private Q_SLOTS:
    void wheelTimeout();
    void scalingTime(double value);
    void animFinished();
    void stopAllZooming();

private:
    double zoomFactor() const;
    void reportScrolling();

    bool m_touchActive = false;
    NicerScrollBar* m_horizontalBar;
    NicerScrollBar* m_verticalBar;
    QTimer* m_wheelTimer;
    QTimer* m_zoomTimer;
    int m_scheduledScalings = 0;
    bool m_zooming = false;
    QObject* m_watchedBars[2]; // only compared
    bool m_scrolled = false;
};
