// SPDX-License-Identifier: MIT
// The linear coordinate system: tables of cases, and properties over many random ones.
#include "TestCase.h"
#include "TestMain.h"
#include "ZelkovUtils/LinearCoordinateSystem.h"

#include <QtTest/QtTest>

#include <limits>
#include <memory>
#include <random>

using vx::CoordinateSystem;
using vx::LinearCoordinateSystem;

namespace
{
constexpr Qt::Alignment c_LeftTop = Qt::AlignLeft | Qt::AlignTop;

bool near(const QRectF& a, const QRectF& b, qreal tolerance = 1e-6)
{
    return qAbs(a.x() - b.x()) < tolerance && qAbs(a.y() - b.y()) < tolerance
        && qAbs(a.width() - b.width()) < tolerance && qAbs(a.height() - b.height()) < tolerance;
}

#define COMPARE_RECTS(actual, expected)                                                                              \
    QVERIFY2(near(actual, expected),                                                                                 \
        qPrintable(QStringLiteral("%1,%2 %3x%4").arg((actual).x()).arg((actual).y()).arg((actual).width())           \
                       .arg((actual).height())))
}

class TestCoordinateSystem : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theConstantsDifferAndAreNoRatios()
    {
        QVERIFY(CoordinateSystem::IGNORE_ASPECT_RATIO <= 0.0);
        QVERIFY(CoordinateSystem::CALC_ASPECT_RATIO <= 0.0);
        QVERIFY(qAbs(CoordinateSystem::IGNORE_ASPECT_RATIO - CoordinateSystem::CALC_ASPECT_RATIO) > 0.5);
    }

    void rectanglesMapToTheWidget_data()
    {
        QTest::addColumn<QRectF>("application");
        QTest::addColumn<QRectF>("rect");
        QTest::addColumn<QRect>("screen");
        const QRectF unit(0, 0, 1, 1);
        QTest::newRow("all") << unit << unit << QRect(0, 0, 200, 100);
        QTest::newRow("quarter") << unit << QRectF(0.5, 0.5, 0.5, 0.5) << QRect(100, 50, 100, 50);
        QTest::newRow("outside") << unit << QRectF(-0.5, 1.0, 0.5, 1.0) << QRect(-100, 100, 100, 100);
        QTest::newRow("offset area") << QRectF(-10, 10, 20, 20) << QRectF(0, 15, 5, 5) << QRect(100, 25, 50, 25);
        QTest::newRow("empty rectangle") << unit << QRectF(0.25, 0.25, 0, 0) << QRect(50, 25, 0, 0);
        QTest::newRow("negative size") << unit << QRectF(0.5, 0.5, -0.25, -0.25) << QRect(100, 50, -50, -25);
        QTest::newRow("edges are rounded") << unit << QRectF(0.0026, 0.0, 0.0051, 0.01) << QRect(1, 0, 1, 1);
        QTest::newRow("area given the wrong way round") << QRectF(1, 1, -1, -1) << QRectF(0, 0, 0.5, 1)
                                                        << QRect(0, 0, 100, 100);
    }
    void rectanglesMapToTheWidget()
    {
        QFETCH(QRectF, application);
        QFETCH(QRectF, rect);
        QFETCH(QRect, screen);
        QWidget widget;
        widget.resize(200, 100);
        const LinearCoordinateSystem system(application, &widget);
        QCOMPARE(system.mapToScreen(rect), screen);
    }

    void itFollowsTheWidgetsSize()
    {
        QWidget widget;
        widget.resize(200, 100);
        LinearCoordinateSystem system(QRectF(0, 0, 10, 10), &widget);
        widget.resize(50, 400);
        QCOMPARE(system.mapToScreen(QRectF(0, 0, 5, 5)), QRect(0, 0, 25, 200));
        system.setApplicationRect(QRectF(0, 0, 5, 5));
        QCOMPARE(system.mapToScreen(QRectF(0, 0, 5, 5)), QRect(0, 0, 50, 400));
    }

    void edgesGoToTheGivenPixel()
    {
        QWidget widget;
        widget.resize(200, 100);
        const LinearCoordinateSystem system(QRectF(0, 0, 20, 20), &widget);
        QRectF rect(2, 2, 10, 10);
        system.setLeft(rect, 50);
        COMPARE_RECTS(rect, QRectF(5, 2, 7, 10));
        system.setTop(rect, 5);
        COMPARE_RECTS(rect, QRectF(5, 1, 7, 11));
        system.setRight(rect, 99);
        COMPARE_RECTS(rect, QRectF(5, 1, 5, 11));
        system.setBottom(rect, 49);
        COMPARE_RECTS(rect, QRectF(5, 1, 5, 9));
        QCOMPARE(system.mapToScreen(rect), QRect(QPoint(50, 5), QPoint(99, 49)));
    }

    void anEdgeMayPassTheOppositeOne()
    {
        QWidget widget;
        widget.resize(200, 100);
        const LinearCoordinateSystem system(QRectF(0, 0, 20, 20), &widget);
        QRectF rect(2, 2, 10, 10);
        system.setLeft(rect, 150);
        COMPARE_RECTS(rect, QRectF(15, 2, -3, 10));
    }

    void movingKeepsTheSize()
    {
        QWidget widget;
        widget.resize(200, 100);
        const LinearCoordinateSystem system(QRectF(0, 0, 20, 20), &widget);
        QRectF rect(2, 2, 10, 10);
        system.move(rect, QPoint(-10, 5), c_LeftTop);
        COMPARE_RECTS(rect, QRectF(1, 3, 10, 10));
    }

    void theAspectRatioIsSet_data()
    {
        QTest::addColumn<QRectF>("rect");
        QTest::addColumn<double>("ratio");
        QTest::addColumn<int>("alignment");
        QTest::addColumn<QRectF>("original");
        QTest::addColumn<QRectF>("expected");
        const int leftTop = Qt::AlignLeft | Qt::AlignTop;
        const int rightBottom = Qt::AlignRight | Qt::AlignBottom;
        const double calc = CoordinateSystem::CALC_ASPECT_RATIO;
        const QRectF none;
        const QRectF square(0, 0, 10, 10);
        QTest::newRow("width leads by itself") << QRectF(1, 2, 8, 5) << 2.0 << leftTop << none << QRectF(1, 2, 8, 4);
        QTest::newRow("height changed") << QRectF(0, 0, 10, 20) << 2.0 << leftTop << square << QRectF(0, 0, 40, 20);
        QTest::newRow("width changed") << QRectF(0, 0, 20, 10) << 2.0 << leftTop << square << QRectF(0, 0, 20, 10);
        QTest::newRow("height shrank more") << QRectF(0, 0, 9, 2) << 1.0 << leftTop << square << QRectF(0, 0, 2, 2);
        QTest::newRow("right and bottom stay")
            << QRectF(0, 0, 10, 10) << 2.0 << rightBottom << none << QRectF(0, 5, 10, 5);
        QTest::newRow("centre stays")
            << QRectF(0, 0, 10, 10) << 2.0 << int(Qt::AlignCenter) << none << QRectF(0, 2.5, 10, 5);
        QTest::newRow("negative sizes stay negative")
            << QRectF(0, 0, -8, -5) << 2.0 << leftTop << none << QRectF(0, 0, -8, -4);
        QTest::newRow("kept proportions") << QRectF(0, 0, 12, 5) << calc << leftTop << QRectF(0, 0, 8, 5)
                                          << QRectF(0, 0, 12, 7.5);
        QTest::newRow("no original") << QRectF(0, 0, 12, 5) << calc << leftTop << none << QRectF(0, 0, 12, 5);
        QTest::newRow("flat original") << QRectF(0, 0, 12, 5) << calc << leftTop << QRectF(0, 0, 8, 0)
                                       << QRectF(0, 0, 12, 5);
        const QRectF any(1, 2, 3, 4);
        QTest::newRow("ignored") << any << CoordinateSystem::IGNORE_ASPECT_RATIO << leftTop << square << any;
        QTest::newRow("negative") << any << -2.0 << leftTop << square << any;
        QTest::newRow("not a number") << any << qQNaN() << leftTop << square << any;
        QTest::newRow("infinite") << any << qInf() << leftTop << square << any;
    }
    void theAspectRatioIsSet()
    {
        QFETCH(QRectF, rect);
        QFETCH(double, ratio);
        QFETCH(int, alignment);
        QFETCH(QRectF, original);
        QFETCH(QRectF, expected);
        QWidget widget;
        widget.resize(200, 100);
        const LinearCoordinateSystem system(QRectF(0, 0, 1, 1), &widget);
        system.adjustToAspectRatio(rect, ratio, Qt::Alignment(alignment), original);
        COMPARE_RECTS(rect, expected);
    }

    void withoutAnExtentNothingHappens_data()
    {
        QTest::addColumn<QRectF>("application");
        QTest::addColumn<QSize>("size");
        QTest::newRow("no widget") << QRectF(0, 0, 1, 1) << QSize();
        QTest::newRow("empty widget") << QRectF(0, 0, 1, 1) << QSize(0, 50);
        QTest::newRow("flat widget") << QRectF(0, 0, 1, 1) << QSize(50, 0);
        QTest::newRow("null area") << QRectF() << QSize(50, 50);
        QTest::newRow("flat area") << QRectF(0, 0, 1, 0) << QSize(50, 50);
        QTest::newRow("infinite area") << QRectF(0, 0, qInf(), 1) << QSize(50, 50);
    }
    void withoutAnExtentNothingHappens()
    {
        QFETCH(QRectF, application);
        QFETCH(QSize, size);
        auto widget = std::make_unique<QWidget>();
        LinearCoordinateSystem system(application, widget.get());
        if (size.isValid()) {
            widget->resize(size);
        } else {
            widget.reset();
            QVERIFY(system.widget() == nullptr);
        }
        const QRectF before(1, 2, 3, 4);
        QRectF rect = before;
        system.setLeft(rect, 7);
        system.setTop(rect, 7);
        system.setRight(rect, 7);
        system.setBottom(rect, 7);
        system.move(rect, QPoint(7, 7), c_LeftTop);
        system.adjustToAspectRatio(rect, 2.0, c_LeftTop);
        QCOMPARE(rect, before);
        QVERIFY(system.mapToScreen(rect).isNull());
    }

    void hugeAndInfiniteRectanglesAreSafe()
    {
        QWidget widget;
        widget.resize(200, 100);
        const LinearCoordinateSystem system(QRectF(0, 0, 1, 1), &widget);
        const qreal huge = std::numeric_limits<qreal>::max() / 4;
        const QRect screen = system.mapToScreen(QRectF(-huge, -huge, 2 * huge, 2 * huge));
        QVERIFY(screen.isValid());
        QVERIFY(system.mapToScreen(QRectF(qInf(), 0, 1, 1)).isNull());
        QVERIFY(system.mapToScreen(QRectF(0, qQNaN(), 1, 1)).isNull());
    }

    void settingAnEdgeAndMappingBackGivesTheSamePixel()
    {
        const unsigned seed = 20260310;
        std::mt19937 random(seed);
        const auto number = [&random](double low, double high) {
            return std::uniform_real_distribution<double>(low, high)(random);
        };
        const auto pixel = [&random] { return std::uniform_int_distribution<int>(-3000, 3000)(random); };
        QWidget widget;
        for (int i = 0; i < 5000; ++i) {
            widget.resize(1 + qAbs(pixel()), 1 + qAbs(pixel()));
            const QRectF application(number(-1e6, 1e6), number(-1e6, 1e6), number(0.01, 1e6), number(0.01, 1e6));
            const LinearCoordinateSystem system(application, &widget);
            const QRect wanted(QPoint(pixel(), pixel()), QPoint(pixel(), pixel()));
            QRectF rect(number(-1e6, 1e6), number(-1e6, 1e6), 1, 1);
            system.setLeft(rect, wanted.left());
            system.setTop(rect, wanted.top());
            system.setRight(rect, wanted.right());
            system.setBottom(rect, wanted.bottom());
            QVERIFY2(system.mapToScreen(rect) == wanted, qPrintable(QStringLiteral("seed %1, case %2").arg(seed).arg(i)));

            const QPoint offset(pixel(), pixel());
            system.move(rect, offset, c_LeftTop);
            QVERIFY2(system.mapToScreen(rect) == wanted.translated(offset),
                qPrintable(QStringLiteral("seed %1, case %2").arg(seed).arg(i)));
        }
    }
};

ZELKOV_TEST_MAIN(TestCoordinateSystem)
#include "tst_coordinatesystem.moc"
