// SPDX-License-Identifier: MIT
// The test pictures of the synthetic cameras.
#pragma once

#include <QtCore/QSize>
#include <QtGui/QPixmap>

class QPainter;

namespace gallery
{
/// What one camera looks at: a still ground, painted once for a size, and a few things that move over it.
/// The ground is wider than the picture, so that the camera can look around.
class Scene
{
public:
    explicit Scene(int seed);

    /// How much wider than the picture the ground is.
    static constexpr double s_width = 1.4;

    QPixmap ground(const QSize& picture, double ratio) const;
    /// In the coordinates of the ground; millis is any running time.
    void drawMovers(QPainter& painter, const QSize& ground, qint64 millis) const;

private:
    enum Kind : int
    {
        kRoad,
        kHall,
        kYard,
        kCount
    };

    void drawMover(QPainter& painter, const QRectF& box, bool toTheRight, int number) const;

    int m_seed;
    Kind m_kind;
};
}
