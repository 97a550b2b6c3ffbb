// SPDX-License-Identifier: MIT
// Page "Zoom area": ZoomScrollArea over a large picture.
#pragma once

#include <QtGui/QPixmap>

#include "../Page.h"

class QLabel;
class ZoomScrollArea;

namespace gallery
{
class ZoomAreaPage : public Page
{
    Q_OBJECT

public:
    explicit ZoomAreaPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

private:
    void zoomBy(double factor);
    void setScale(double scale);

    ZoomScrollArea* m_area;
    QLabel* m_picture;
    QLabel* m_percent;
    QPixmap m_ground;
    double m_scale = 1.0;
};
}
