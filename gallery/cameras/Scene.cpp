// SPDX-License-Identifier: MIT
// Paints a street, a hall or a yard.
#include "Scene.h"

#include <cmath>
#include <random>

#include <QtGui/QLinearGradient>
#include <QtGui/QPainter>
#include <QtGui/QRadialGradient>

namespace gallery
{
namespace
{
using Random = std::mt19937;

int between(Random& random, int low, int high)
{
    return low + int(random() % unsigned(high - low + 1));
}

void fillDown(QPainter& p, const QRectF& rect, const QColor& top, const QColor& bottom)
{
    QLinearGradient gradient(rect.topLeft(), rect.bottomLeft());
    gradient.setColorAt(0, top);
    gradient.setColorAt(1, bottom);
    p.fillRect(rect, gradient);
}

void paintRoad(QPainter& p, double w, double h, Random& random)
{
    const double horizon = h * 0.56;
    fillDown(p, QRectF(0, 0, w, horizon), QColor(28, 42, 66), QColor(205, 150, 112));
    for (double x = -8; x < w;) {
        const double width = h * between(random, 12, 26) / 100;
        const double height = h * between(random, 14, 38) / 100;
        const QRectF house(x, horizon - height, width, height);
        p.fillRect(house, QColor(34 + between(random, 0, 12), 42, 58));
        const double cell = h / 26;
        for (double wy = house.top() + cell; wy < house.bottom() - cell; wy += cell * 1.7) {
            for (double wx = house.left() + cell; wx < house.right() - cell; wx += cell * 1.6) {
                const bool lit = random() % 10 < 4;
                p.fillRect(QRectF(wx, wy, cell * 0.8, cell * 0.8), lit ? QColor(247, 208, 128) : QColor(48, 58, 76));
            }
        }
        x += width + h * between(random, 0, 5) / 100;
    }
    fillDown(p, QRectF(0, horizon, w, h - horizon), QColor(70, 76, 86), QColor(40, 44, 51));
    p.fillRect(QRectF(0, horizon, w, h * 0.025), QColor(112, 118, 126));
    for (double x = 0; x < w; x += h * 0.2) {
        p.fillRect(QRectF(x, h * 0.775, h * 0.1, h * 0.014), QColor(214, 214, 204));
    }
}

void paintHall(QPainter& p, double w, double h, Random& random)
{
    const double horizon = h * 0.5;
    const QPointF vanish(w / 2, h * 0.36);
    fillDown(p, QRectF(0, 0, w, horizon), QColor(150, 162, 174), QColor(196, 204, 210));
    fillDown(p, QRectF(0, horizon, w, h - horizon), QColor(118, 130, 138), QColor(84, 94, 102));
    p.setPen(QPen(QColor(255, 255, 255, 34), h / 150));
    for (int i = -14; i <= 14; ++i) {
        const double x = w / 2 + i * w / 9;
        const QPointF far(vanish + (QPointF(x, h) - vanish) * ((horizon - vanish.y()) / (h - vanish.y())));
        p.drawLine(far, QPointF(x, h));
    }
    for (double step = 0.06; step < 1; step *= 1.7) {
        p.drawLine(QPointF(0, horizon + (h - horizon) * step), QPointF(w, horizon + (h - horizon) * step));
    }
    p.setPen(Qt::NoPen);
    const QColor doors[] = {QColor(94, 112, 132), QColor(126, 98, 80), QColor(88, 124, 118)};
    for (double x = h * between(random, 6, 26) / 100; x < w; x += h * 0.46) {
        const QRectF door(x, horizon - h * 0.3, h * 0.19, h * 0.3);
        p.fillRect(door.adjusted(-h * 0.012, -h * 0.012, h * 0.012, 0), QColor(228, 232, 234));
        p.fillRect(door, doors[between(random, 0, 2)]);
        p.fillRect(QRectF(door.right() - h * 0.04, door.center().y(), h * 0.022, h * 0.012), QColor(236, 238, 240));
    }
    for (double x = h * 0.1; x < w; x += h * 0.55) {
        p.fillRect(QRectF(x, h * 0.05, h * 0.32, h * 0.03), QColor(250, 252, 252));
    }
}

void paintYard(QPainter& p, double w, double h, Random& random)
{
    const double horizon = h * 0.58;
    fillDown(p, QRectF(0, 0, w, horizon), QColor(112, 142, 170), QColor(208, 217, 222));
    fillDown(p, QRectF(0, horizon, w, h - horizon), QColor(120, 122, 122), QColor(88, 90, 92));
    const QColor colors[] = {QColor(192, 98, 52), QColor(44, 116, 122), QColor(52, 86, 142), QColor(166, 60, 58),
                             QColor(120, 128, 134)};
    const double boxHeight = h * 0.15;
    for (double x = -h * 0.05; x < w;) {
        const double boxWidth = h * between(random, 34, 44) / 100;
        const int levels = between(random, 1, 3);
        for (int level = 0; level < levels; ++level) {
            const QRectF box(x, horizon - (level + 1) * boxHeight, boxWidth, boxHeight - h * 0.006);
            const QColor color = colors[between(random, 0, 4)];
            fillDown(p, box, color.lighter(112), color.darker(118));
            p.setPen(QPen(color.darker(138), h / 260));
            for (double rib = box.left() + h * 0.025; rib < box.right(); rib += h * 0.025) {
                p.drawLine(QPointF(rib, box.top() + h * 0.012), QPointF(rib, box.bottom() - h * 0.012));
            }
            p.setPen(Qt::NoPen);
        }
        x += boxWidth + h * 0.02;
    }
    p.fillRect(QRectF(0, h * 0.67, w, h * 0.012), QColor(226, 188, 74));
    p.fillRect(QRectF(0, h * 0.94, w, h * 0.012), QColor(226, 188, 74));
}
}

Scene::Scene(int seed)
    : m_seed(seed), m_kind(Kind(seed % kCount))
{
}

QPixmap Scene::ground(const QSize& picture, double ratio) const
{
    const QSize size(qMax(1, int(picture.width() * s_width)), qMax(1, picture.height()));
    QPixmap pixmap(size * ratio);
    pixmap.setDevicePixelRatio(ratio);
    pixmap.fill(Qt::black);
    QPainter p(&pixmap);
    p.setRenderHint(QPainter::Antialiasing);
    p.setPen(Qt::NoPen);
    Random random(unsigned(m_seed * 977 + 5));
    switch (m_kind) {
    case kRoad:
        paintRoad(p, size.width(), size.height(), random);
        break;
    case kHall:
        paintHall(p, size.width(), size.height(), random);
        break;
    default:
        paintYard(p, size.width(), size.height(), random);
        break;
    }
    return pixmap;
}

void Scene::drawMovers(QPainter& painter, const QSize& ground, qint64 millis) const
{
    const double w = ground.width();
    const double h = ground.height();
    for (int i = 0; i < 3; ++i) {
        const bool toTheRight = (m_seed + i) % 2 == 0;
        const bool isPerson = m_kind == kHall;
        const double height = h * (isPerson ? 0.26 + 0.06 * i : 0.11 + 0.025 * i);
        const double width = height * (isPerson ? 0.36 : 2.1);
        const double span = w + 2 * width;
        const double speed = h * (isPerson ? 0.09 : 0.26) * (1 + 0.23 * ((m_seed * 3 + i * 5) % 4));
        const double way = std::fmod(double(millis) / 1000 * speed + span * (0.31 * i + 0.17 * m_seed), span);
        const double x = toTheRight ? way - width : w - way;
        const double foot = h * (isPerson ? 0.66 + 0.11 * i : 0.72 + 0.1 * i);
        drawMover(painter, QRectF(x, foot - height, width, height), toTheRight, i);
    }
}

void Scene::drawMover(QPainter& p, const QRectF& box, bool toTheRight, int number) const
{
    static const QColor colors[] = {QColor(222, 226, 230), QColor(196, 66, 58), QColor(60, 112, 186),
                                    QColor(236, 176, 52), QColor(70, 74, 82)};
    const QColor color = colors[(m_seed + number * 2) % 5];
    p.setPen(Qt::NoPen);
    p.setBrush(QColor(0, 0, 0, 70));
    p.drawEllipse(QRectF(box.left(), box.bottom() - box.height() * 0.06, box.width(), box.height() * 0.12));
    p.setBrush(color);
    if (m_kind == kHall) {
        const double head = box.width() * 0.52;
        p.drawRoundedRect(box.adjusted(0, head * 1.05, 0, 0), box.width() * 0.36, box.width() * 0.36);
        p.setBrush(QColor(226, 186, 156));
        p.drawEllipse(QRectF(box.center().x() - head / 2, box.top(), head, head));
        return;
    }
    const double wheel = box.height() * 0.34;
    p.drawRoundedRect(box.adjusted(0, box.height() * 0.34, 0, -wheel * 0.4), box.height() * 0.16, box.height() * 0.16);
    p.drawRoundedRect(QRectF(box.left() + box.width() * 0.2, box.top(), box.width() * 0.56, box.height() * 0.6),
                      box.height() * 0.2, box.height() * 0.2);
    p.setBrush(QColor(40, 52, 66));
    p.drawRoundedRect(QRectF(box.left() + box.width() * 0.25, box.top() + box.height() * 0.1, box.width() * 0.46,
                             box.height() * 0.26),
                      box.height() * 0.1, box.height() * 0.1);
    p.setBrush(QColor(24, 26, 30));
    p.drawEllipse(QRectF(box.left() + box.width() * 0.12, box.bottom() - wheel, wheel, wheel));
    p.drawEllipse(QRectF(box.right() - box.width() * 0.12 - wheel, box.bottom() - wheel, wheel, wheel));
    p.setBrush(QColor(255, 240, 190));
    const double lamp = box.height() * 0.14;
    p.drawEllipse(QRectF(toTheRight ? box.right() - lamp : box.left(), box.center().y(), lamp, lamp));
}
}
