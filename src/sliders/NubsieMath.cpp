// SPDX-License-Identifier: MIT
// The arithmetic of a slider's handle: values, dates, sizes and places, no widgets.
#include "sliders/NubsieMath.h"

#include <cmath>
#include <limits>

namespace vx
{
namespace NubsieMath
{
namespace
{
constexpr int c_LongestSide = 32767;
constexpr qint64 c_MostPixels = 16 * 1000 * 1000;
constexpr double c_LargestWidget = 16777215.0; // QWIDGETSIZE_MAX, without QtWidgets

// As qRound, but in doubles, so that nothing overflows: halves go up, below zero as well.
double rounded(double value)
{
    if (value >= 0.0) {
        return std::trunc(value + 0.5);
    }
    const double below = std::trunc(value - 1.0);
    return std::trunc(value - below + 0.5) + below;
}

// The upper bound first: where the bounds are crossed the lower one wins. What is no number becomes the lower one.
template <typename Number> Number heldIn(double value, Number lowest, Number highest)
{
    if (value > static_cast<double>(lowest) && !(value < static_cast<double>(highest))) {
        return highest > lowest ? highest : lowest;
    }
    return value > static_cast<double>(lowest) ? static_cast<Number>(value) : lowest;
}

int toInt(double value)
{
    return heldIn(value, std::numeric_limits<int>::min(), std::numeric_limits<int>::max());
}

int toInt(qint64 value)
{
    return static_cast<int>(
        qBound<qint64>(std::numeric_limits<int>::min(), value, std::numeric_limits<int>::max()));
}

int toCoordinate(double value)
{
    return std::isnan(value) ? 0 : static_cast<int>(qBound(-c_LargestWidget, rounded(value), c_LargestWidget));
}
}

double normalized(int value, int minimum, int maximum)
{
    if (maximum == minimum) {
        return 1.0;
    }
    const int held = qMax(minimum, qMin(maximum, value));
    return (static_cast<double>(held) - minimum) / (static_cast<double>(maximum) - minimum);
}

int denormalized(double place, int minimum, int maximum)
{
    const double value = rounded((static_cast<double>(maximum) - minimum) * place + minimum);
    return heldIn(value, minimum, maximum);
}

int turnedRound(int value, int minimum, int maximum)
{
    return toInt(static_cast<qint64>(minimum) + maximum - value);
}

int steppedUp(int value, int maximum)
{
    const qint64 next = static_cast<qint64>(value) + 1;
    const qint64 count = static_cast<qint64>(maximum) + 1;
    return count == 0 ? 0 : toInt(next % count);
}

int steppedDown(int value, int minimum, int maximum)
{
    const qint64 next = static_cast<qint64>(value) - 1;
    return next < minimum ? maximum : static_cast<int>(next);
}

int valueOfDate(qint64 date, qint64 start, qint64 end, int minimum, int maximum)
{
    const double elapsed = static_cast<double>(date) - static_cast<double>(start);
    const double span = static_cast<double>(end) - static_cast<double>(start);
    if (!(span > 0.0 || span < 0.0)) {
        return elapsed > 0.0 ? std::numeric_limits<int>::max()
            : elapsed < 0.0  ? std::numeric_limits<int>::min()
                             : minimum;
    }
    const double range = static_cast<double>(maximum) - minimum;
    return toInt(std::trunc(range * (elapsed / span)) + minimum);
}

qint64 dateOfPlace(qint64 start, qint64 end, double place)
{
    const double span = static_cast<double>(end) - static_cast<double>(start);
    const qint64 elapsed
        = heldIn(std::trunc(span * place), std::numeric_limits<qint64>::min(), std::numeric_limits<qint64>::max());
    if (elapsed > 0 && start > std::numeric_limits<qint64>::max() - elapsed) {
        return std::numeric_limits<qint64>::max();
    }
    if (elapsed < 0 && start < std::numeric_limits<qint64>::min() - elapsed) {
        return std::numeric_limits<qint64>::min();
    }
    return start + elapsed;
}

QPoint topLeft(const QPointF& middle, const QSize& size)
{
    return QPoint(
        toCoordinate(middle.x() - size.width() * 0.5 + 1.0), toCoordinate(middle.y() - size.height() * 0.5 + 1.0));
}

QPoint iconPoint(const QSize& area, const QSize& icon)
{
    return QPoint(qMax(0, (area.width() - icon.width()) / 2), qMax(0, (area.height() - icon.height()) / 2));
}

QSize scaledSize(const QSize& picture, const QSize& target)
{
    if (picture.isEmpty() || target.isEmpty()) {
        return QSize();
    }
    const QSize size = picture.scaled(target, Qt::KeepAspectRatio).expandedTo(QSize(1, 1));
    if (size.width() > c_LongestSide || size.height() > c_LongestSide
        || static_cast<qint64>(size.width()) * size.height() > c_MostPixels) {
        return QSize();
    }
    return size;
}

bool needsPill(const QSize& picture, const QSize& size, const QSize& draggedSize)
{
    return picture.width() > picture.height() && size.isValid() && draggedSize.isValid()
        && size.width() == size.height();
}

bool needsSquare(const QSize& picture, const QSize& size, const QSize& draggedSize)
{
    return picture.width() == picture.height() && size.isValid() && draggedSize.isValid()
        && size.width() != size.height();
}

QSize widened(const QSize& size, const QSize& picture)
{
    if (picture.height() <= 0) {
        return size;
    }
    const double ratio = static_cast<double>(picture.width()) / picture.height();
    return QSize(toInt(std::trunc(size.width() * ratio)), size.height());
}

QSize squared(const QSize& size)
{
    return QSize(size.height(), size.height());
}
}
}
