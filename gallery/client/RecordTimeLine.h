// SPDX-License-Identifier: MIT
// The contents of the lower stripe: the time line and what it says in words.
#pragma once

#include <QtCore/QPointer>
#include <QtCore/QStringList>
#include <QtCore/QTimer>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QWidget>

namespace vx
{
class ElidedLabel;
namespace PopoverWidget
{
class Controller;
}
}

namespace client
{
class Fleet;
class TimeTrack;

/// The last 24 hours of records. All times are milliseconds since 1970-01-01 UTC. The scale goes on with the clock
/// while it is visible; a handle that the user holds keeps it where it is.
class RecordTimeLine : public QWidget
{
    Q_OBJECT

public:
    static const int s_height = 106;

    RecordTimeLine(Fleet& fleet, QWidget* parent = nullptr);
    ~RecordTimeLine() override;

    TimeTrack* track() const { return m_track; }
    bool isLive() const { return m_live; }
    /// These emit nothing.
    void setLive();
    void setMoment(qint64 moment);
    void setExportAllowed(bool allowed);

    /// Asks for a date and time in a popover at the handle.
    void askForMoment();

Q_SIGNALS:
    void momentChosen(qint64 moment);
    void rangeChosen(qint64 from, qint64 to);
    void liveWanted();
    void exportWanted(QWidget* target);

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void tick();
    void readRecords();
    void choose(qint64 moment);
    void retranslate();
    void showWords();
    void fitWords();

    Fleet& m_fleet;
    QWidget* m_words;
    vx::ElidedLabel* m_moment;
    vx::ElidedLabel* m_range;
    QPushButton* m_export;
    QPushButton* m_liveButton;
    TimeTrack* m_track;
    QPointer<vx::PopoverWidget::Controller> m_popover;
    QStringList m_rangeTexts; // from long to short
    QTimer m_timer;
    bool m_live = true;
    bool m_exportAllowed = true;
};
}
