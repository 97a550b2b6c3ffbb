// SPDX-License-Identifier: MIT
// Page "Rubber band": regions of a live picture.
#pragma once

#include <QtCore/QPointer>
#include <QtCore/QTimer>
#include <QtCore/QVector>

#include "../Page.h"
#include "ZelkovUtils/LinearCoordinateSystem.h"

class QCheckBox;
class QLabel;

namespace vx
{
class RubberBandWidget;
}

namespace gallery
{
class CameraTile;

class RubberBandPage : public Page
{
    Q_OBJECT

public:
    explicit RubberBandPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;
    bool eventFilter(QObject* object, QEvent* event) override;

protected:
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    QWidget* makeSettings();
    vx::RubberBandWidget* addBand(const QRectF& region);
    void select(vx::RubberBandWidget* band);
    void showState();

    CameraTile* m_camera;
    vx::LinearCoordinateSystem m_picture; // 1920 by 1080 pixels of the camera
    QVector<QPointer<vx::RubberBandWidget>> m_bands;
    QPointer<vx::RubberBandWidget> m_selected;
    QLabel* m_numbers[4] = {};
    QCheckBox* m_wide = nullptr;
    int m_count = 0;
    QTimer m_frames;
};
}
