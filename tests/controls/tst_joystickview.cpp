// SPDX-License-Identifier: MIT
// The display of a joystick and the law of its point.
#include "controls/JoystickGeometry.h"
#include "controls/JoystickViewWidget.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QRandomGenerator>
#include <QtGui/QImage>
#include <QtGui/QPainter>
#include <QtTest/QtTest>

#include <cmath>
#include <limits>

namespace
{
QPixmap filled(const QSize& size, const QColor& color)
{
    QPixmap pixmap(size);
    pixmap.fill(color);
    return pixmap;
}

QImage painted(QWidget& widget)
{
    QImage image(widget.size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::white);
    widget.render(&image, QPoint(), QRegion(), QWidget::RenderFlags());
    return image;
}

// The middle of what is painted in that colour.
QPoint middleOf(const QImage& image, const QColor& color)
{
    QRect box;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (image.pixelColor(x, y) == color) {
                box |= QRect(x, y, 1, 1);
            }
        }
    }
    return box.center();
}
}

class TestJoystickView : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void thePointFollowsTheStick_data()
    {
        QTest::addColumn<double>("x");
        QTest::addColumn<double>("y");
        QTest::addColumn<QSize>("size");
        QTest::addColumn<double>("inset");
        QTest::addColumn<QPoint>("point");
        const QSize square(100, 100);
        QTest::newRow("middle") << 0.0 << 0.0 << square << 20.0 << QPoint(50, 50);
        QTest::newRow("upper right, on the circle") << 1.0 << 1.0 << square << 20.0 << QPoint(71, 29);
        QTest::newRow("lower left, on the circle") << -1.0 << -1.0 << square << 20.0 << QPoint(29, 71);
        QTest::newRow("lower right") << 1.0 << -1.0 << square << 20.0 << QPoint(71, 71);
        QTest::newRow("inside") << 0.1 << 0.1 << square << 20.0 << QPoint(55, 45);
        QTest::newRow("right") << 1.0 << 0.0 << square << 20.0 << QPoint(80, 50);
        QTest::newRow("left") << -1.0 << 0.0 << square << 20.0 << QPoint(20, 50);
        QTest::newRow("top of the circle") << 0.0 << 1.0 << square << 20.0 << QPoint(50, 20);
        QTest::newRow("bottom of the circle") << 0.0 << -1.0 << square << 20.0 << QPoint(50, 80);
        QTest::newRow("half down: shifted on the axis") << 0.0 << -0.5 << square << 20.0 << QPoint(50, 55);
        QTest::newRow("half down beside the axis: not shifted") << 0.001 << -0.5 << square << 20.0 << QPoint(50, 75);
        QTest::newRow("half up: at its place") << 0.0 << 0.5 << square << 20.0 << QPoint(50, 25);
        QTest::newRow("the height does not enter") << 1.0 << 0.0 << QSize(100, 400) << 20.0 << QPoint(80, 200);
        QTest::newRow("but on the axis") << 0.0 << 1.0 << QSize(100, 400) << 20.0 << QPoint(50, 20);
        QTest::newRow("no size") << 1.0 << 0.0 << QSize(0, 100) << 20.0 << QPoint(0, 0);
        QTest::newRow("no measure") << 1.0 << 1.0 << square << std::numeric_limits<double>::quiet_NaN()
                                    << QPoint(50, 50);
    }
    void thePointFollowsTheStick()
    {
        QFETCH(double, x);
        QFETCH(double, y);
        QFETCH(QSize, size);
        QFETCH(double, inset);
        QTEST(vx::joystickPoint(static_cast<float>(x), static_cast<float>(y), size, static_cast<float>(inset)), "point");
    }

    void beyondTheAxesIsTheEndOfTheAxis_data()
    {
        QTest::addColumn<float>("value");
        QTest::addColumn<float>("axis");
        QTest::newRow("above") << 1.01F << 1.0F;
        QTest::newRow("below") << -7.0F << -1.0F;
        QTest::newRow("end") << 1.0F << 1.0F;
        QTest::newRow("inside") << 0.25F << 0.25F;
        QTest::newRow("no number") << std::numeric_limits<float>::quiet_NaN() << 0.0F;
    }
    void beyondTheAxesIsTheEndOfTheAxis()
    {
        QFETCH(float, value);
        QTEST(vx::joystickAxis(value), "axis");
    }

    void anyStickStaysWithinTheCircleBesideTheAxis()
    {
        QRandomGenerator random(20250901);
        for (int i = 0; i < 5000; ++i) {
            float x = static_cast<float>(random.generateDouble() * 2.0 - 1.0);
            const float y = static_cast<float>(random.generateDouble() * 2.0 - 1.0);
            if (qFuzzyIsNull(x)) {
                x = 0.5F;
            }
            const QPointF at = vx::joystickPoint(x, y, QSize(400, 400), 40.0F);
            const double distance = std::hypot(at.x() - 200.0, at.y() - 200.0);
            QVERIFY2(distance <= 160.0 + 1.0, qPrintable(QStringLiteral("%1 %2").arg(double(x)).arg(double(y))));
        }
    }

    void itStartsInTheMiddleWithItsName()
    {
        JoystickViewWidget view;
        QCOMPARE(view.objectName(), QStringLiteral("ptzJoystickView"));
        QVERIFY(qFuzzyCompare(view.circleInset(), 20.0F));
        QCOMPARE(view.rotationAngle(), 0);
        view.resize(100, 100);
        view.setPtzPointImage(filled(QSize(5, 5), Qt::red));
        QCOMPARE(middleOf(painted(view), Qt::red), QPoint(49, 49)); // 20 pixels about 50
    }

    void aResizeKeepsThePosition()
    {
        JoystickViewWidget view;
        view.resize(100, 100);
        view.setPtzPointImage(filled(QSize(5, 5), Qt::red));
        view.setPointPosition(3.0F, 0.0F); // clamped
        QCOMPARE(middleOf(painted(view), Qt::red), QPoint(79, 49));
        view.resize(200, 200);
        QCOMPARE(middleOf(painted(view), Qt::red), QPoint(179, 99));
    }

    void theInsetMovesThePointAtOnce()
    {
        JoystickViewWidget view;
        view.resize(100, 100);
        view.setPtzPointImage(filled(QSize(5, 5), Qt::red));
        view.setPointPosition(1.0F, 0.0F);
        view.setCircleInset(40.0F);
        QCOMPARE(middleOf(painted(view), Qt::red), QPoint(59, 49));
    }

    void thePointIsAFifthOfTheWidget()
    {
        JoystickViewWidget view;
        view.resize(104, 59); // 20 by 11, cut off
        view.setPtzPointImage(filled(QSize(5, 5), Qt::red));
        const QImage image = painted(view);
        int width = 0;
        for (int x = 0; x < image.width(); ++x) {
            width += image.pixelColor(x, 29) == QColor(Qt::red) ? 1 : 0;
        }
        int height = 0;
        for (int y = 0; y < image.height(); ++y) {
            height += image.pixelColor(52, y) == QColor(Qt::red) ? 1 : 0;
        }
        QCOMPARE(QSize(width, height), QSize(20, 11));
    }

    void withoutPicturesNothingIsDrawn()
    {
        JoystickViewWidget view;
        view.resize(60, 60);
        QImage plain(view.size(), QImage::Format_ARGB32_Premultiplied);
        plain.fill(Qt::white);
        QCOMPARE(painted(view), plain);
    }

    void theStyleSheetsBackgroundShows()
    {
        JoystickViewWidget view;
        view.resize(60, 60);
        view.setStyleSheet(QStringLiteral("#ptzJoystickView { background: #00ff00; }"));
        QCOMPARE(painted(view).pixelColor(30, 30), QColor(Qt::green));
    }

    void theCrosshairTurnsAndKeepsItsScale()
    {
        JoystickViewWidget view;
        view.resize(100, 100);
        QPixmap cross(100, 100);
        cross.fill(Qt::white);
        {
            QPainter painter(&cross);
            painter.fillRect(0, 40, 50, 20, Qt::blue); // from the left edge to the middle
        }
        view.setPtzCrosshairImage(cross);
        QCOMPARE(painted(view).pixelColor(20, 50), QColor(Qt::blue));
        view.setRotationAngle(90); // clockwise: from the top edge to the middle
        QCOMPARE(view.rotationAngle(), 90);
        const QImage turned = painted(view);
        QCOMPARE(turned.pixelColor(50, 20), QColor(Qt::blue));
        QCOMPARE(turned.pixelColor(20, 50), QColor(Qt::white));
        view.setRotationAngle(45); // the corners are cut, the scale stays
        QVERIFY(painted(view).pixelColor(25, 25) == QColor(Qt::blue));
        view.setPtzCrosshairImage(filled(QSize(10, 10), Qt::yellow));
        QCOMPARE(painted(view).pixelColor(50, 50), QColor(Qt::yellow));
    }

    void theCrosshairFillsTheWidget()
    {
        JoystickViewWidget view;
        view.resize(80, 50);
        view.setPtzCrosshairImage(filled(QSize(10, 10), Qt::blue));
        const QImage image = painted(view);
        QCOMPARE(image.pixelColor(0, 0), QColor(Qt::blue));
        QCOMPARE(image.pixelColor(79, 49), QColor(Qt::blue));
    }

    void thePicturesAreProperties()
    {
        JoystickViewWidget view;
        QVERIFY(view.setProperty("ptzCrosshairImage", filled(QSize(3, 3), Qt::red)));
        QVERIFY(view.setProperty("ptzPointImage", filled(QSize(4, 4), Qt::red)));
        QCOMPARE(view.ptzCrosshairImage().width(), 3);
        QCOMPARE(view.property("ptzPointImage").value<QPixmap>().width(), 4);
    }
};

ZELKOV_TEST_MAIN(TestJoystickView)
#include "tst_joystickview.moc"
