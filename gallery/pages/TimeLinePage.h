// SPDX-License-Identifier: MIT
// Page "Time line": a day of recordings to scrub, with a range to export, and handles of all kinds.
#pragma once

#include "../Page.h"

#include <QtCore/QVector>

class QCheckBox;
class QGridLayout;
class QLabel;

namespace vx
{
class MultiNubsieSlider;
}

namespace gallery
{
class RecordingView;

class TimeLinePage : public Page
{
    Q_OBJECT

public:
    explicit TimeLinePage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

protected:
    void showEvent(QShowEvent* event) override;
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    QWidget* makeDay();
    QWidget* makeCluster();
    QWidget* makeKinds();
    QWidget* makeUpright();
    vx::MultiNubsieSlider* makeSlider(const QString& name, Qt::Orientation orientation = Qt::Horizontal);
    void addKind(QGridLayout* grid, const QString& text, vx::MultiNubsieSlider* slider);
    void addHandles();
    void showMoment();
    void showRange();
    void placeFlags();
    void applySwitches();

    QVector<vx::MultiNubsieSlider*> m_sliders;
    QVector<vx::MultiNubsieSlider*> m_kinds; // those that the switches work on
    QVector<QLabel*> m_values; // of the first of them
    RecordingView* m_recording = nullptr;
    QWidget* m_ruler = nullptr;
    QLabel* m_moment = nullptr;
    QLabel* m_range = nullptr;
    vx::MultiNubsieSlider* m_day = nullptr;
    vx::MultiNubsieSlider* m_cluster = nullptr;
    vx::MultiNubsieSlider* m_discrete = nullptr;
    vx::MultiNubsieSlider* m_spring = nullptr;
    vx::MultiNubsieSlider* m_inverted = nullptr;
    vx::MultiNubsieSlider* m_left = nullptr;
    vx::MultiNubsieSlider* m_right = nullptr;
    QCheckBox* m_numbers = nullptr;
    QCheckBox* m_fading = nullptr;
    QCheckBox* m_jumping = nullptr;
};
}
