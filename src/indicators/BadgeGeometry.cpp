// SPDX-License-Identifier: MIT
// Plain arithmetic of badges. Truncations are deliberate: they decide which pixels a badge covers.
#include "indicators/BadgeGeometry.h"

#include <QChar>
#include <QColor>
#include <QPoint>
#include <QtMath>

#include <cmath>

namespace vx
{
namespace BadgeGeometry
{

namespace
{

constexpr int TextMargin = 10;
constexpr int CrossMargin = 10;
constexpr int StrokeMargin = 5;
constexpr int OutlineInset = 2;
constexpr int DotExtent = 20;
constexpr int LongestSide = 32767;
constexpr qint64 MostPixels = qint64(4096) * 4096;
constexpr double CosineOf45Degrees = 0.7071067811865476;

QRect grown(const QRect& rect, int by)
{
    return rect.adjusted(-by, -by, by, by);
}

QRect shrunk(const QRect& rect, int by)
{
    return grown(rect, -by);
}

// The longest number has 11 characters; there are seven of them and six separators.
constexpr int LongestKey = 7 * 11 + 6;

QChar* appendNumber(QChar* out, int number)
{
    qint64 rest = number;
    if (rest < 0) {
        *out++ = QLatin1Char('-');
        rest = -rest;
    }
    QChar digits[10];
    int count = 0;
    do {
        digits[count++] = QChar(ushort('0' + rest % 10));
        rest /= 10;
    } while (rest != 0);
    while (count > 0) {
        *out++ = digits[--count];
    }
    return out;
}

} // namespace

int nextAngle(int angle)
{
    // The sign of % follows the dividend, and the frames' keys follow that sequence.
    return (angle - AngleStep) % FullTurn;
}

int gradientAngle(int startAngle)
{
    return startAngle / 16;
}

int spokesGradientAngle(int startAngle)
{
    return startAngle / 16 - 15;
}

QRect ringRect()
{
    return QRect(7, 7, 86, 86);
}

QRect dotsRect()
{
    return QRect(10, 10, 80, 80);
}

QRect spokesRect()
{
    return QRect(6, 6, 88, 88);
}

std::array<QRect, DotCount> dotRects()
{
    const QRect rect = dotsRect();
    const QPoint center = rect.center();
    const int radius = int(rect.width() * 0.5);
    std::array<QRect, DotCount> dots;
    for (int i = 0; i < DotCount; ++i) {
        const double angle = i * M_PI / 4 + M_PI / 2;
        QRect dot(0, 0, DotExtent, DotExtent);
        dot.moveCenter(
            QPoint(int(center.x() + radius * std::cos(angle)), int(center.y() - radius * std::sin(angle))));
        dots[size_t(i)] = dot;
    }
    return dots;
}

std::array<QLine, SpokeCount> spokeLines()
{
    const QRect rect = spokesRect();
    const QPoint center = rect.center();
    const int outer = int(rect.width() * 0.5);
    const int inner = int(rect.width() * (1.0 / 3.0));
    std::array<QLine, SpokeCount> spokes;
    for (int i = 0; i < SpokeCount; ++i) {
        const double angle = i * M_PI / 6 + M_PI / 2;
        const double cosine = std::cos(angle);
        const double sine = std::sin(angle);
        spokes[size_t(i)] = QLine(int(center.x() + outer * cosine), int(center.y() + outer * sine),
            int(center.x() + inner * cosine), int(center.y() + inner * sine));
    }
    return spokes;
}

QString cacheKey(
    int type, const QSize& size, int startAngle, int spanAngle, const QColor& color1, const QColor& color2)
{
    // Built on every tick of every spinner: a chain of QString::arg() would cost more than the repaint saves.
    const int numbers[]
        = {type, size.width(), size.height(), startAngle, spanAngle, color1.value(), color2.value()};
    QChar key[LongestKey];
    QChar* end = appendNumber(key, numbers[0]);
    for (int i = 1; i < 7; ++i) {
        *end++ = QLatin1Char(i == 2 ? 'x' : '_');
        end = appendNumber(end, numbers[i]);
    }
    return QString(key, int(end - key));
}

int textRoomHeight(bool stroke)
{
    return CanvasExtent - 2 * TextMargin - (stroke ? 2 * StrokeMargin : 0);
}

QRect pillRect(int textWidth, bool stroke)
{
    QRect rect(0, 0, CanvasExtent, CanvasExtent);
    if (stroke) {
        rect = shrunk(rect, StrokeMargin);
    }
    const int widest = LongestSide - (stroke ? 2 * StrokeMargin : 0);
    rect.setWidth(qBound(rect.height(), qMin(textWidth, widest) + 2 * TextMargin, widest));
    return stroke ? grown(rect, StrokeMargin) : rect;
}

QRect outlineRect(const QRect& pill, bool stroke)
{
    return stroke ? shrunk(pill, OutlineInset) : pill;
}

QLineF crossLine(const QRect& outline)
{
    const QRect rect = shrunk(outline, CrossMargin);
    const QPoint center = rect.center();
    const double dx = rect.width() * CosineOf45Degrees * 0.5;
    const double dy = rect.height() * CosineOf45Degrees * 0.5;
    return QLineF(center.x() - dx + 1, center.y() + dy + 1, center.x() + dx + 1, center.y() - dy + 1);
}

QRect textRect(const QRect& outline)
{
    return shrunk(outline, TextMargin);
}

QSize coveringSize(const QSize& canvas, const QSize& wanted)
{
    if (canvas.isEmpty() || wanted.isEmpty()) {
        return QSize();
    }
    if (wanted.width() > LongestSide || wanted.height() > LongestSide) {
        return QSize();
    }
    const QSize size = canvas.scaled(wanted, Qt::KeepAspectRatioByExpanding).expandedTo(QSize(1, 1));
    if (size.width() > LongestSide || size.height() > LongestSide
        || qint64(size.width()) * size.height() > MostPixels) {
        return QSize();
    }
    return size;
}

} // namespace BadgeGeometry
} // namespace vx
