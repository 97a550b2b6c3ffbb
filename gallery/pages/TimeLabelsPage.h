// SPDX-License-Identifier: MIT
// Page "Time labels": the time of a picture that can be moved and edited, and a line that drops what has no room.
#pragma once

#include "../Page.h"

#include <QtCore/QDateTime>
#include <QtCore/QElapsedTimer>
#include <QtCore/QPoint>

namespace vx
{
class Label;
class TimeLabel;
}

namespace gallery
{
class TimeLabelsPage : public Page
{
    Q_OBJECT

public:
    explicit TimeLabelsPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;
    bool eventFilter(QObject* object, QEvent* event) override;

protected:
    void showEvent(QShowEvent* event) override;

private:
    QWidget* makeSettings();
    QWidget* makeNames();
    quint64 now() const;
    void nextFrame();
    void place(bool home);

    QDateTime m_start;
    QElapsedTimer m_clock;
    vx::Label* m_picture;
    vx::TimeLabel* m_time;
    QWidget* m_anchor = nullptr;
    QPoint m_grabbed;
    bool m_isGrabbed = false;
    bool m_isMoved = false;
};
}
