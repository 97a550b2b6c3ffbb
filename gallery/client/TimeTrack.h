// SPDX-License-Identifier: MIT
// The scale of a time line with its three handles.
#pragma once

#include "Recordings.h"

#include <QtCore/QPointer>
#include <QtGui/QColor>
#include <QtWidgets/QWidget>

namespace vx
{
class MultiNubsieSlider;
}

namespace client
{
/// Twenty-four hours of records with the position and the two flags of an export. All times are milliseconds since
/// 1970-01-01 UTC.
///
/// Each handle has a slider of its own, so that none pushes another aside: the flags stand exactly at their moments
/// also where they meet. The track takes the mouse and gives it to the slider whose handle is hit.
class TimeTrack : public QWidget
{
    Q_OBJECT
    Q_PROPERTY(QColor groundColor MEMBER m_groundColor)
    Q_PROPERTY(QColor recordColor MEMBER m_recordColor)
    Q_PROPERTY(QColor eventColor MEMBER m_eventColor)
    Q_PROPERTY(QColor alarmColor MEMBER m_alarmColor)
    Q_PROPERTY(QColor rangeColor MEMBER m_rangeColor)
    Q_PROPERTY(QColor knobColor READ knobColor WRITE setKnobColor)

public:
    static const int s_height = 62;
    static const int s_margin = 30; ///< left and right, room for a flag
    static const qint64 s_length = 24 * 60 * 60 * 1000;
    static const qint64 s_shortestRange = 10 * 1000;

    /// \a clip is the widget that handles must not leave while they rest.
    TimeTrack(QWidget* clip, QWidget* parent);

    /// The scale ends at \a end; the handles stay at their moments as far as it goes.
    void setEnd(qint64 end);
    qint64 begin() const { return m_end - s_length; }
    qint64 end() const { return m_end; }
    void setRecords(const QVector<RecordedSpan>& spans, const QVector<RecordedEvent>& events);

    /// Held in the scale. These emit nothing.
    void setMoment(qint64 moment);
    void setRange(qint64 from, qint64 to);
    qint64 moment() const { return m_moment; }
    qint64 from() const { return m_from; }
    qint64 to() const { return m_to; }
    /// Whether the user holds a handle.
    bool isHeld() const;

    /// Brings the handles to where the track is, after something around it has moved.
    void follow();
    void setHandlesVisible(bool visible);
    vx::MultiNubsieSlider* positionSlider() const { return m_position; }
    vx::MultiNubsieSlider* fromSlider() const { return m_fromFlag; }
    vx::MultiNubsieSlider* toSlider() const { return m_toFlag; }
    /// Where a moment is, in pixels from the left.
    double xOf(qint64 moment) const;

    QColor knobColor() const { return m_knobColor; }
    void setKnobColor(const QColor& color);

    QSize sizeHint() const override { return {600, s_height}; }

Q_SIGNALS:
    /// By the user, by a drag or a press on the track.
    void momentChosen(qint64 moment);
    void rangeChosen(qint64 from, qint64 to);
    void momentDoubleClicked();

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void changeEvent(QEvent* event) override;

private Q_SLOTS:
    void doubleClickMoment(int value);

private:
    vx::MultiNubsieSlider* makeSlider(const char* name);
    void makeHandles();
    void dressPosition();
    void retranslate();
    void placeHandles();
    bool takeMouse(QEvent* event);
    vx::MultiNubsieSlider* sliderAt(const QPoint& point) const;
    qint64 momentAt(double x) const;
    void moveFlag(bool isFrom, int value);
    void paintScale(QPainter& painter) const;
    void paintHours(QPainter& painter) const;

    qint64 m_end = 0;
    qint64 m_moment = 0;
    qint64 m_from = 0;
    qint64 m_to = 0;
    QVector<RecordedSpan> m_spans;
    QVector<RecordedEvent> m_events;
    QPointer<QWidget> m_clip;
    vx::MultiNubsieSlider* m_position;
    vx::MultiNubsieSlider* m_fromFlag;
    vx::MultiNubsieSlider* m_toFlag;
    QPointer<vx::MultiNubsieSlider> m_pressed; // gets the mouse until the release
    bool m_handlesVisible = true;
    QColor m_groundColor;
    QColor m_recordColor;
    QColor m_eventColor;
    QColor m_alarmColor;
    QColor m_rangeColor;
    QColor m_knobColor;
};
}
