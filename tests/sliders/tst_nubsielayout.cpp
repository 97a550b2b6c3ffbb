// SPDX-License-Identifier: MIT
// Tables and random cases for the rule by which handles share a scale.
#include "sliders/NubsieLayout.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

#include <algorithm>
#include <numeric>
#include <vector>

using namespace vx::NubsieLayout;

namespace
{
using Doubles = QVector<double>;

// The rule sentence by sentence, sorting anew for each handle: what enqueueAll() has to match to the last bit.
class LiteralRule
{
public:
    explicit LiteralRule(std::vector<Place> handles)
        : m_handles(std::move(handles))
    {
    }

    const std::vector<Place>& handles() const { return m_handles; }

    void enqueue(int handle, double w)
    {
        m_sorted = sorted();
        const int n = static_cast<int>(m_sorted.size());
        const int i = static_cast<int>(std::find(m_sorted.begin(), m_sorted.end(), handle) - m_sorted.begin());
        int lo = i;
        int hi = i;

        double limit = d(i) + w;
        for (int k = i + 1; k < n; ++k) {
            if (d(k) >= limit) {
                break;
            }
            d(k) = limit;
            hi = k;
            limit += w;
        }
        const double overTop = limit - w > 1.0 ? limit - w - 1.0 : 0.0;

        limit = d(i) - w;
        for (int k = i - 1; k >= 0; --k) {
            if (d(k) <= limit) {
                break;
            }
            d(k) = limit;
            lo = k;
            limit -= w;
        }
        const double overBottom = limit + w < 0.0 ? -(limit + w) : 0.0;

        if (overTop > 0.0) {
            for (int k = hi; k >= lo; --k) {
                d(k) -= overTop;
            }
            limit = d(lo) - w;
            for (int k = lo - 1; k >= 0; --k) {
                if (d(k) <= limit) {
                    break;
                }
                d(k) = limit;
                lo = k;
                limit -= w;
            }
        } else if (overBottom > 0.0) {
            for (int k = lo; k <= hi; ++k) {
                d(k) += overBottom;
            }
            limit = d(hi) + w;
            for (int k = hi + 1; k < n; ++k) {
                if (d(k) >= limit) {
                    break;
                }
                d(k) = limit;
                hi = k;
                limit += w;
            }
        }

        double sum = 0.0;
        double minD = d(lo);
        double maxD = d(lo);
        for (int k = lo; k <= hi; ++k) {
            sum += d(k) - t(k);
            minD = std::min(minD, d(k));
            maxD = std::max(maxD, d(k));
        }
        const double shift = sum / (hi - lo + 1);
        double delta = 0.0;
        if (shift > 0.0) {
            double room = minD;
            if (lo > 0) {
                room = minD - d(lo - 1) - w;
            }
            delta = -std::min(room, shift);
        } else {
            double room = 1.0 - maxD;
            if (hi != n - 1) {
                room = d(hi + 1) - maxD - w;
            }
            delta = std::min(-shift, room);
        }
        for (int k = lo; k <= hi; ++k) {
            d(k) += delta;
        }
        // Alone it returns exactly.
        if (lo == hi && delta == -shift) {
            d(lo) = t(lo);
        }
    }

private:
    std::vector<int> sorted() const
    {
        std::vector<int> result(m_handles.size());
        std::iota(result.begin(), result.end(), 0);
        std::stable_sort(result.begin(), result.end(), [this](int a, int b) {
            return m_handles[static_cast<std::size_t>(a)].display < m_handles[static_cast<std::size_t>(b)].display;
        });
        return result;
    }
    double& d(int k) { return m_handles[static_cast<std::size_t>(m_sorted[static_cast<std::size_t>(k)])].display; }
    double t(int k) { return m_handles[static_cast<std::size_t>(m_sorted[static_cast<std::size_t>(k)])].value; }

    std::vector<Place> m_handles;
    std::vector<int> m_sorted;
};

std::vector<Place> places(const Doubles& displays, const Doubles& values)
{
    std::vector<Place> result;
    for (int i = 0; i < displays.size(); ++i) {
        result.push_back({displays.at(i), values.at(i)});
    }
    return result;
}

Doubles displays(const std::vector<Place>& row)
{
    Doubles result;
    for (const Place& place : row) {
        result << place.display;
    }
    return result;
}

QByteArray text(const Doubles& numbers)
{
    QByteArray result;
    for (const double number : numbers) {
        result += QByteArray::number(number, 'g', 17) + ' ';
    }
    return result;
}

bool near(const Doubles& a, const Doubles& b)
{
    return std::equal(
        a.begin(), a.end(), b.begin(), b.end(), [](double x, double y) { return qAbs(x - y) < 1e-12; });
}

#define COMPARE_NEAR(actual, expected)                                                                            \
    do {                                                                                                          \
        const Doubles isThis = (actual);                                                                          \
        const Doubles wanted = (expected);                                                                        \
        QVERIFY2(near(isThis, wanted), text(isThis) + "instead of " + text(wanted));                              \
    } while (false)

int size(const std::vector<Place>& row)
{
    return static_cast<int>(row.size());
}

// A row as use leaves it: drawn places in the scale, mostly at the true ones, here and there in clusters.
std::vector<Place> randomRow(QRandomGenerator& random, int count)
{
    std::vector<Place> row;
    const double centre = random.generateDouble();
    for (int i = 0; i < count; ++i) {
        double value = random.generateDouble();
        if (random.bounded(3) == 0) {
            value = qBound(0.0, centre + random.generateDouble() * 0.05, 1.0);
        }
        if (random.bounded(10) == 0) {
            value = random.bounded(2);
        }
        const double display = random.bounded(2) == 0 ? value : random.generateDouble();
        row.push_back({display, value});
    }
    return row;
}

void sortRow(std::vector<Place>& row)
{
    std::stable_sort(row.begin(), row.end(), [](const Place& a, const Place& b) { return a.display < b.display; });
}

bool isSorted(const std::vector<Place>& row)
{
    return std::is_sorted(
        row.begin(), row.end(), [](const Place& a, const Place& b) { return a.display < b.display; });
}
}

class TestNubsieLayout : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aLengthIsTheShareOfTheScale();
    void handlesAreSortedAndEqualOnesKeepTheirOrder();
    void aHandleIsPutAmongItsNeighbours_data();
    void aHandleIsPutAmongItsNeighbours();
    void handlesExactlyOneLengthApartStayApart();
    void handlesThatAreNearerByTheLastBitFormABlock();
    void blocksKeepOrderAndDistanceAndStayInside();
    void aHandleTakenOutLetsItsNeighboursGo_data();
    void aHandleTakenOutLetsItsNeighboursGo();
    void pullingInStopsAtTheFirstThatIsHome();
    void takingOutKeepsTheOrderAndOvershootsNothing();
    void allHandlesInTurn_data();
    void allHandlesInTurn();
    void allAtOnceIsTheSameAsOneByOne_data();
    void allAtOnceIsTheSameAsOneByOne();
};

void TestNubsieLayout::aLengthIsTheShareOfTheScale()
{
    QCOMPARE(handleLength(20, 200), 0.1);
    QCOMPARE(handleLength(0, 200), 0.0);
    QCOMPARE(handleLength(20, -40), -0.5);
    QVERIFY(handleLength(20, 0) < 0);
    QVERIFY(handleLength(0, 0) < 0);
}

void TestNubsieLayout::handlesAreSortedAndEqualOnesKeepTheirOrder()
{
    const std::vector<int> order = sortedByDisplay(places({0.5, 0.1, 0.5, 0.9, 0.1}, {0, 0, 0, 0, 0}));
    QCOMPARE(order, (std::vector<int> {1, 4, 0, 2, 3}));
    QVERIFY(sortedByDisplay({}).empty());
    QCOMPARE(sortedByDisplay(places({qQNaN(), 0.5, qInf(), 0.1}, {0, 0, 0, 0})), (std::vector<int> {3, 1, 0, 2}));
}

void TestNubsieLayout::aHandleIsPutAmongItsNeighbours_data()
{
    QTest::addColumn<QVector<double>>("drawn");
    QTest::addColumn<QVector<double>>("values");
    QTest::addColumn<int>("seed");
    QTest::addColumn<QVector<double>>("expected");
    QTest::addColumn<int>("first");
    QTest::addColumn<int>("last");

    // All with a length of 0.1.
    QTest::newRow("alone at home") << Doubles {0.4} << Doubles {0.4} << 0 << Doubles {0.4} << 0 << 0;
    QTest::newRow("alone away") << Doubles {0.4} << Doubles {0.7} << 0 << Doubles {0.7} << 0 << 0;
    QTest::newRow("two are centred on their mean, from below")
        << Doubles {0.5, 0.52} << Doubles {0.5, 0.52} << 0 << Doubles {0.46, 0.56} << 0 << 1;
    QTest::newRow("two are centred on their mean, from above")
        << Doubles {0.5, 0.52} << Doubles {0.5, 0.52} << 1 << Doubles {0.46, 0.56} << 0 << 1;
    QTest::newRow("three at the top") << Doubles {0.99, 0.99, 0.99} << Doubles {0.99, 0.99, 0.99} << 1
                                      << Doubles {0.8, 0.9, 1.0} << 0 << 2;
    QTest::newRow("two at the bottom") << Doubles {0, 0.01} << Doubles {0, 0.01} << 0 << Doubles {0, 0.1} << 0
                                       << 1;
    QTest::newRow("two at the bottom, from above")
        << Doubles {0, 0.01} << Doubles {0, 0.01} << 1 << Doubles {0, 0.1} << 0 << 1;
    QTest::newRow("neighbours out of reach stay")
        << Doubles {0.2, 0.5, 0.8} << Doubles {0.1, 0.5, 0.9} << 1 << Doubles {0.2, 0.5, 0.8} << 1 << 1;
    QTest::newRow("a push goes on") << Doubles {0.5, 0.55, 0.62, 0.9} << Doubles {0.5, 0.5, 0.5, 0.9} << 0
                                    << Doubles {0.4, 0.5, 0.6, 0.9} << 0 << 2;
    QTest::newRow("and goes on downward") << Doubles {0.1, 0.38, 0.45, 0.5} << Doubles {0.1, 0.5, 0.5, 0.5} << 3
                                          << Doubles {0.1, 0.4, 0.5, 0.6} << 1 << 3;
    QTest::newRow("the way home ends at the neighbour below")
        << Doubles {0.3, 0.6} << Doubles {0.3, 0.2} << 1 << Doubles {0.3, 0.4} << 1 << 1;
    QTest::newRow("the way home ends at the neighbour above")
        << Doubles {0.3, 0.6} << Doubles {0.9, 0.6} << 0 << Doubles {0.5, 0.6} << 0 << 0;
    QTest::newRow("pushed down from the top into others")
        << Doubles {0.75, 0.95, 0.98} << Doubles {0.75, 0.99, 0.99} << 1 << Doubles {0.75, 0.9, 1.0} << 1 << 2;
    QTest::newRow("pushed down from the top and on")
        << Doubles {0.85, 0.95, 0.98} << Doubles {0.95, 0.99, 0.99} << 1 << Doubles {0.8, 0.9, 1.0} << 0 << 2;
    QTest::newRow("pushed up from the bottom and on")
        << Doubles {0.02, 0.05, 0.15} << Doubles {0, 0, 0.1} << 1 << Doubles {0, 0.1, 0.2} << 0 << 2;

    Doubles crowd;
    Doubles flush;
    for (int i = 0; i < 13; ++i) {
        crowd << 0.9;
        flush << 1.0 - 0.1 * (12 - i);
    }
    QTest::newRow("more than the scale holds, at the top") << crowd << crowd << 6 << flush << 0 << 12;

    // The top comes first; but where the true values want down, the block may move by its room to 0, which is
    // negative here.
    Doubles low;
    Doubles flushBelow;
    for (int i = 0; i < 13; ++i) {
        low << 0.1;
        flushBelow << 0.1 * i;
    }
    QTest::newRow("more than the scale holds, at the bottom") << low << low << 12 << flushBelow << 0 << 12;
}

void TestNubsieLayout::aHandleIsPutAmongItsNeighbours()
{
    QFETCH(QVector<double>, drawn);
    QFETCH(QVector<double>, values);
    QFETCH(int, seed);
    QFETCH(QVector<double>, expected);
    QFETCH(int, first);
    QFETCH(int, last);
    std::vector<Place> row = places(drawn, values);
    const Block block = enqueue(row.data(), size(row), seed, 0.1);
    COMPARE_NEAR(displays(row), expected);
    QCOMPARE(block.first, first);
    QCOMPARE(block.last, last);
}

void TestNubsieLayout::handlesExactlyOneLengthApartStayApart()
{
    // 0.25 is exact, so the two are not nearer than a length, and each goes its own way.
    std::vector<Place> row = places({0.25, 0.5}, {0.0, 0.75});
    QCOMPARE(enqueue(row.data(), 2, 0, 0.25).last, 0);
    QCOMPARE(row[0].display, 0.0);
    QCOMPARE(enqueue(row.data(), 2, 1, 0.25).first, 1);
    QCOMPARE(row[1].display, 0.75);
}

void TestNubsieLayout::handlesThatAreNearerByTheLastBitFormABlock()
{
    std::vector<Place> row = places({0.25, std::nextafter(0.5, 0.0)}, {0.25, 0.75});
    QCOMPARE(enqueue(row.data(), 2, 0, 0.25).last, 1);
    // Centred: the upper one takes the lower one along.
    COMPARE_NEAR(displays(row), (Doubles {0.375, 0.625}));
}

void TestNubsieLayout::blocksKeepOrderAndDistanceAndStayInside()
{
    QRandomGenerator random(42);
    for (int round = 0; round < 8000; ++round) {
        const int count = random.bounded(1, 12);
        const double length = random.generateDouble() * (round % 2 == 0 ? 1.0 / count : 0.5) + 1e-4;
        std::vector<Place> row = randomRow(random, count);
        sortRow(row);
        const std::vector<Place> before = row;
        const int seed = random.bounded(count);
        const Block block = enqueue(row.data(), count, seed, length);
        const QByteArray what = "round " + QByteArray::number(round) + ": " + text(displays(before)) + "-> "
            + text(displays(row)) + "length " + QByteArray::number(length);

        QVERIFY2(block.first <= seed && seed <= block.last, what);
        const bool fits = (block.last - block.first) * length <= 1.0;
        if (fits) {
            QVERIFY2(isSorted(row), what);
        }
        for (int k = 0; k < count; ++k) {
            const std::size_t at = static_cast<std::size_t>(k);
            QVERIFY2(row[at].value == before[at].value, what);
            if (k < block.first || k > block.last) {
                QVERIFY2(row[at].display == before[at].display, what);
                continue;
            }
            if (k > block.first) {
                QVERIFY2(row[at].display - row[at - 1].display > length - 1e-9, what);
            }
            if (fits) {
                QVERIFY2(row[at].display > -1e-9 && row[at].display < 1.0 + 1e-9, what);
            }
        }
        if (fits && block.first > 0) {
            const std::size_t first = static_cast<std::size_t>(block.first);
            QVERIFY2(row[first].display - row[first - 1].display > length - 1e-9, what);
        }
        if (count == 1) {
            QVERIFY2(row[0].display == row[0].value, what);
        }
    }
}

void TestNubsieLayout::aHandleTakenOutLetsItsNeighboursGo_data()
{
    QTest::addColumn<QVector<double>>("drawn");
    QTest::addColumn<QVector<double>>("values");
    QTest::addColumn<int>("index");
    QTest::addColumn<QVector<double>>("expected");

    // All with a length of 0.1.
    QTest::newRow("alone") << Doubles {0.4} << Doubles {0.7} << 0 << Doubles {0.4};
    QTest::newRow("below it comes home")
        << Doubles {0.46, 0.56} << Doubles {0.5, 0.52} << 1 << Doubles {0.5, 0.56};
    QTest::newRow("above it comes home")
        << Doubles {0.46, 0.56} << Doubles {0.5, 0.52} << 0 << Doubles {0.46, 0.52};
    QTest::newRow("who is not pushed stays")
        << Doubles {0.3, 0.5, 0.7} << Doubles {0.2, 0.5, 0.8} << 1 << Doubles {0.3, 0.5, 0.7};
    QTest::newRow("both sides, room for both")
        << Doubles {0.4, 0.5, 0.6} << Doubles {0.43, 0.5, 0.57} << 1 << Doubles {0.43, 0.5, 0.57};
    // Between the two there is room for 0.1, and they want 0.09 each.
    QTest::newRow("the upper was pushed further and goes first")
        << Doubles {0.4, 0.5, 0.6} << Doubles {0.48, 0.5, 0.51} << 1 << Doubles {0.41, 0.5, 0.51};
    QTest::newRow("the lower was pushed further and goes first")
        << Doubles {0.4, 0.5, 0.6} << Doubles {0.49, 0.5, 0.52} << 1 << Doubles {0.49, 0.5, 0.59};
    QTest::newRow("equally far: the lower goes first")
        << Doubles {0.25, 0.375, 0.5} << Doubles {0.375, 0.375, 0.375} << 1 << Doubles {0.375, 0.375, 0.475};
    QTest::newRow("no further than the room")
        << Doubles {0.4, 0.5, 0.6} << Doubles {0.3, 0.5, 0.3} << 1 << Doubles {0.4, 0.5, 0.5};
    QTest::newRow("the row behind follows, each by no more than the one before") << Doubles {
        0.2, 0.4, 0.5, 0.6, 0.7} << Doubles {0.2, 0.4, 0.4, 0.55, 0.6} << 2 << Doubles {0.2, 0.4, 0.5, 0.55, 0.65};
    QTest::newRow("the row below follows")
        << Doubles {0.3, 0.4, 0.5, 0.6} << Doubles {0.4, 0.45, 0.6, 0.6} << 2 << Doubles {0.35, 0.45, 0.5, 0.6};
    QTest::newRow("one that is home holds those behind it")
        << Doubles {0.4, 0.5, 0.6, 0.7} << Doubles {0.4, 0.5, 0.6, 0.65} << 1 << Doubles {0.4, 0.5, 0.6, 0.7};
    QTest::newRow("at the bottom the room is what is above 0")
        << Doubles {0.0, 0.1} << Doubles {0.0, -1.0} << 0 << Doubles {0.0, 0.0};
    QTest::newRow("at the top the room is what is below 1")
        << Doubles {0.9, 1.0} << Doubles {2.0, 1.0} << 1 << Doubles {1.0, 1.0};
}

void TestNubsieLayout::aHandleTakenOutLetsItsNeighboursGo()
{
    QFETCH(QVector<double>, drawn);
    QFETCH(QVector<double>, values);
    QFETCH(int, index);
    QFETCH(QVector<double>, expected);
    std::vector<Place> row = places(drawn, values);
    const Drift drift = dequeue(row.data(), size(row), index, 0.1);
    COMPARE_NEAR(displays(row), expected);
    for (int k = 0; k < drawn.size(); ++k) {
        const bool told = (drift.below.first <= k && k <= drift.below.last)
            || (drift.above.first <= k && k <= drift.above.last);
        QVERIFY(told || row[static_cast<std::size_t>(k)].display == drawn.at(k));
    }
}

void TestNubsieLayout::pullingInStopsAtTheFirstThatIsHome()
{
    std::vector<Place> row = places({0.1, 0.3, 0.5, 0.7, 0.9}, {0.1, 0.2, 0.4, 0.7, 0.8});
    Block block = pullInThoseAbove(row.data(), 5, 0, 0.05);
    QCOMPARE(block.first, 1);
    QCOMPARE(block.last, 2);
    COMPARE_NEAR(displays(row), (Doubles {0.1, 0.25, 0.45, 0.7, 0.9}));

    row = places({0.1, 0.3, 0.5, 0.7, 0.9}, {0.2, 0.3, 0.52, 0.8, 0.9});
    block = pullInThoseBelow(row.data(), 4, 1.0);
    QCOMPARE(block.first, 2);
    QCOMPARE(block.last, 3);
    COMPARE_NEAR(displays(row), (Doubles {0.1, 0.3, 0.52, 0.8, 0.9}));

    block = pullInThoseAbove(row.data(), 5, 4, 1.0);
    QVERIFY(block.last < block.first);
    block = pullInThoseBelow(row.data(), 0, 1.0);
    QVERIFY(block.last < block.first);
}

void TestNubsieLayout::takingOutKeepsTheOrderAndOvershootsNothing()
{
    QRandomGenerator random(4711);
    for (int round = 0; round < 8000; ++round) {
        const int count = random.bounded(1, 12);
        const double length = random.generateDouble() / count * 0.95;
        std::vector<Place> row = randomRow(random, count);
        enqueueAll(row, std::vector<double>(row.size(), length));
        sortRow(row);
        const std::vector<Place> before = row;
        const int index = random.bounded(count);
        const Drift drift = dequeue(row.data(), count, index, length);
        const QByteArray what
            = "round " + QByteArray::number(round) + ": " + text(displays(before)) + "-> " + text(displays(row));

        for (int k = 0; k < count; ++k) {
            const Place& now = row[static_cast<std::size_t>(k)];
            const Place& old = before[static_cast<std::size_t>(k)];
            const bool below = drift.below.first <= k && k <= drift.below.last;
            const bool above = drift.above.first <= k && k <= drift.above.last;
            QVERIFY2(!(below && above), what);
            QVERIFY2(below || above || now.display == old.display, what);
            if (below) {
                QVERIFY2(k < index && now.display > old.display - 1e-9 && now.display < now.value + 1e-9, what);
            }
            if (above) {
                QVERIFY2(k > index && now.display < old.display + 1e-9 && now.display > now.value - 1e-9, what);
            }
            // The one that was taken out is no neighbour any more.
            const int neighbour = k - 1 == index ? k - 2 : k - 1;
            if (k != index && neighbour >= 0) {
                const double gap = now.display - row[static_cast<std::size_t>(neighbour)].display;
                const double gapBefore = old.display - before[static_cast<std::size_t>(neighbour)].display;
                QVERIFY2(gap > qMin(length, gapBefore) - 1e-9, what);
            }
        }
    }
}

void TestNubsieLayout::allHandlesInTurn_data()
{
    QTest::addColumn<QVector<double>>("values");
    QTest::addColumn<QVector<double>>("expected");

    // Handles of 20 pixels on a bar of 220; drawn at their true values before.
    QTest::newRow("none") << Doubles {} << Doubles {};
    QTest::newRow("two in the middle") << Doubles {0.5, 0.52} << Doubles {0.46, 0.56};
    QTest::newRow("in the other order") << Doubles {0.52, 0.5} << Doubles {0.56, 0.46};
    QTest::newRow("three at the top") << Doubles {0.99, 0.99, 0.99} << Doubles {0.8, 0.9, 1.0};
    QTest::newRow("two at the bottom") << Doubles {0.0, 0.01} << Doubles {0.0, 0.1};
    QTest::newRow("far apart") << Doubles {0.9, 0.1, 0.5} << Doubles {0.9, 0.1, 0.5};
    QTest::newRow("two pairs") << Doubles {0.2, 0.7, 0.22, 0.72} << Doubles {0.16, 0.66, 0.26, 0.76};
    QTest::newRow("twelve at the top") << Doubles(12, 0.95)
                                       << Doubles {-0.1, 0.0, 0.1, 0.2, 0.3, 0.4, 0.5, 0.6, 0.7, 0.8, 0.9, 1.0};
}

void TestNubsieLayout::allHandlesInTurn()
{
    QFETCH(QVector<double>, values);
    QFETCH(QVector<double>, expected);
    std::vector<Place> row = places(values, values);
    enqueueAll(row, std::vector<double>(row.size(), handleLength(20, 200)));
    Doubles drawn = displays(row);
    if (std::all_of(values.begin(), values.end(), [&](double value) { return value == values.constFirst(); })) {
        // Which of equal ones comes first is free.
        std::sort(drawn.begin(), drawn.end());
    }
    COMPARE_NEAR(drawn, expected);
}

void TestNubsieLayout::allAtOnceIsTheSameAsOneByOne_data()
{
    QTest::addColumn<int>("most");
    QTest::addColumn<int>("lengths");
    QTest::addColumn<int>("rounds");

    QTest::newRow("few, all fit") << 8 << 0 << 6000;
    QTest::newRow("few, of different lengths") << 8 << 1 << 6000;
    QTest::newRow("few, overfull") << 12 << 2 << 4000;
    QTest::newRow("few, scale shorter than some handles") << 8 << 3 << 6000;
    QTest::newRow("many, all fit") << 150 << 0 << 60;
    QTest::newRow("many, of different lengths") << 150 << 1 << 60;
    QTest::newRow("many, overfull") << 150 << 2 << 30;
}

void TestNubsieLayout::allAtOnceIsTheSameAsOneByOne()
{
    QFETCH(int, most);
    QFETCH(int, lengths);
    QFETCH(int, rounds);
    QRandomGenerator random(2026);
    int moved = 0;
    for (int round = 0; round < rounds; ++round) {
        const int count = random.bounded(1, most + 1);
        std::vector<Place> row = randomRow(random, count);
        const double length = random.generateDouble() / count + (lengths == 2 ? 1.5 / count : 0.0);
        std::vector<double> each(row.size(), length);
        for (double& one : each) {
            if (lengths == 1) {
                one *= random.generateDouble() * 2.0;
            } else if (lengths == 3 && random.bounded(3) == 0) {
                one = -random.generateDouble();
            }
        }

        // Twice, since a row at rest is the usual case.
        for (int turn = 0; turn < 2; ++turn) {
            LiteralRule rule(row);
            for (int i = 0; i < count; ++i) {
                rule.enqueue(i, each[static_cast<std::size_t>(i)]);
            }
            const std::vector<Place> before = row;
            enqueueAll(row, each);
            for (std::size_t i = 0; i < row.size(); ++i) {
                moved += before[i].display != row[i].display ? 1 : 0;
                if (row[i].display != rule.handles()[i].display) {
                    QFAIL("round " + QByteArray::number(round) + ": " + text(displays(row)) + "instead of "
                        + text(displays(rule.handles())) + "from " + text(displays(before)));
                }
            }
        }
    }
    QVERIFY(moved > rounds);
}

ZELKOV_TEST_MAIN(TestNubsieLayout)
#include "tst_nubsielayout.moc"
