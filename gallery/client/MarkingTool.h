// SPDX-License-Identifier: MIT
// Marks a region in a view.
#pragma once

#include "ZelkovUtils/LinearCoordinateSystem.h"

#include <QtCore/QObject>
#include <QtCore/QPointer>

namespace vx
{
class RubberBandWidget;
}

namespace client
{
/// One rubber band over a view, in the pixels of the camera (1920 x 1080). A press beside it begins a new one.
class MarkingTool : public QObject
{
    Q_OBJECT

public:
    explicit MarkingTool(QObject* parent = nullptr);
    ~MarkingTool() override;

    /// Moves to the view, with a region in its middle. Null puts the tool away.
    void workIn(QWidget* view);
    void retranslate();

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    /// At the end of each drag.
    void marked(const QRectF& region);

private:
    void makeBand(const QRectF& region);
    void dropBand();
    void finishDrag();

    QPointer<QWidget> m_view;
    QPointer<vx::RubberBandWidget> m_band;
    vx::LinearCoordinateSystem m_picture;
    bool m_draws = false; // a new one, with the mouse grabbed
};
}
