// SPDX-License-Identifier: MIT
// The icon that fills any rectangle as a frame of nine parts.
#include "indicators/BorderIcon.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtGui/QImage>
#include <QtGui/QPainter>
#include <QtGui/QPixmap>
#include <QtTest/QtTest>

#include <memory>

namespace
{
// Each of the nine parts has a colour of its own, and the edges and the centre have a pattern.
QImage frame()
{
    QImage image(10, 10, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::gray);
    for (int y = 0; y < 10; ++y) {
        for (int x = 0; x < 10; ++x) {
            const int column = x < 2 ? 0 : x > 7 ? 2 : 1;
            const int row = y < 2 ? 0 : y > 7 ? 2 : 1;
            image.setPixelColor(x, y, QColor(60 + column * 60, 60 + row * 60, ((x * 7 + y * 13) % 5) * 50));
        }
    }
    return image;
}

QImage painted(const QIcon& icon, const QSize& size, QIcon::Mode mode = QIcon::Normal, QIcon::State state = QIcon::Off)
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::white);
    QPainter painter(&image);
    icon.paint(&painter, QRect(QPoint(), size), Qt::AlignCenter, mode, state);
    return image;
}

// The told arithmetic, written out once more for a rectangle at the origin.
QImage reference(const QImage& picture, int margin, BorderIcon::Stretch stretch, const QSize& size)
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::white);
    QPainter painter(&image);
    const QPixmap pixmap = QPixmap::fromImage(picture);
    const bool growing = stretch == BorderIcon::StretchBorder || stretch == BorderIcon::TileBorder;
    auto lines = [&](int target, int source) {
        int low = margin;
        int high = margin;
        if (growing) {
            const int k = ((target - 1) - (source - 1)) / (2 * margin) + 1;
            low = k * margin;
            high = (target - 1) - k * margin - (source - 1) + 2 * margin;
        }
        return QVector<int>{0, low, target - 1 - high, target - 1, 0, margin, source - 1 - margin, source - 1};
    };
    const QVector<int> c = lines(size.width(), picture.width());
    const QVector<int> r = lines(size.height(), picture.height());
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column) {
            const QRect to(QPoint(c[column], r[row]), QPoint(c[column + 1], r[row + 1]));
            const QRect from(QPoint(c[4 + column], r[4 + row]), QPoint(c[5 + column], r[5 + row]));
            if (to.isEmpty() || from.isEmpty()) {
                continue;
            }
            painter.setClipRect(to, Qt::ReplaceClip);
            const bool centre = row == 1 && column == 1;
            const bool scaled = centre ? stretch == BorderIcon::StretchCenter : stretch == BorderIcon::StretchBorder;
            const bool tiled = centre ? stretch == BorderIcon::TileCenter : stretch == BorderIcon::TileBorder;
            if (scaled) {
                painter.drawPixmap(to, pixmap, from);
            } else if (tiled) {
                for (int y = to.top(); y < to.bottom(); y += from.height()) {
                    for (int x = to.left(); x < to.right(); x += from.width()) {
                        painter.drawPixmap(QPoint(x, y), pixmap, from);
                    }
                }
            } else {
                painter.drawPixmap(to.topLeft(), pixmap, from);
            }
        }
    }
    return image;
}
}

class TestBorderIcon : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theModesHaveTheirNumbers()
    {
        QCOMPARE(int(BorderIcon::StretchCenter), 0);
        QCOMPARE(int(BorderIcon::StretchBorder), 1);
        QCOMPARE(int(BorderIcon::TileCenter), 2);
        QCOMPARE(int(BorderIcon::TileBorder), 3);
        QCOMPARE(BorderIcon::defaultMargins, QMargins(2, 2, 2, 2));
    }

    void eachModeMatchesTheReference_data()
    {
        QTest::addColumn<int>("stretch");
        QTest::addColumn<QSize>("size");
        for (int stretch = 0; stretch < 4; ++stretch) {
            for (const QSize& size : {QSize(100, 100), QSize(37, 61), QSize(10, 10), QSize(11, 9), QSize(6, 30)}) {
                QTest::addRow("%d at %dx%d", stretch, size.width(), size.height()) << stretch << size;
            }
        }
    }
    void eachModeMatchesTheReference()
    {
        QFETCH(int, stretch);
        QFETCH(QSize, size);
        const auto mode = static_cast<BorderIcon::Stretch>(stretch);
        const BorderIcon icon(QPixmap::fromImage(frame()), QMargins(2, 2, 2, 2), mode, 1.0);
        const QImage expected = reference(frame(), 2, mode, size);
        QCOMPARE(painted(icon, size), expected);
        QCOMPARE(painted(icon, size), expected); // kept
    }

    void theEdgesOfAStretchedCentreShowTheirNaturalPixelsOnly()
    {
        const BorderIcon icon(QPixmap::fromImage(frame()), QMargins(2, 2, 2, 2), BorderIcon::StretchCenter, 1.0);
        const QImage image = painted(icon, QSize(100, 100));
        QCOMPARE(image.pixelColor(0, 0), frame().pixelColor(0, 0));
        QCOMPARE(image.pixelColor(4, 0), frame().pixelColor(4, 0));
        QCOMPARE(image.pixelColor(50, 0), QColor(Qt::white)); // the rest of the edge stays empty
        QVERIFY(image.pixelColor(50, 50) != QColor(Qt::white));
        QCOMPARE(image.pixelColor(99, 99), frame().pixelColor(9, 9));
    }

    void aCentreTileWiderThanItsPartIsCut()
    {
        const BorderIcon icon(QPixmap::fromImage(frame()), QMargins(2, 2, 2, 2), BorderIcon::TileCenter, 1.0);
        const QImage image = painted(icon, QSize(8, 8)); // centre of 4, tile of 6
        QCOMPARE(image.pixelColor(3, 3), frame().pixelColor(3, 3));
        QCOMPARE(image.pixelColor(7, 7), frame().pixelColor(9, 9));
    }

    void anotherPlaceShowsTheSame()
    {
        const BorderIcon icon(QPixmap::fromImage(frame()), QMargins(2, 2, 2, 2), BorderIcon::StretchBorder, 1.0);
        QImage image(80, 80, QImage::Format_ARGB32_Premultiplied);
        image.fill(Qt::white);
        QPainter painter(&image);
        icon.paint(&painter, QRect(13, 17, 40, 40));
        painter.end();
        QCOMPARE(image.copy(13, 17, 40, 40), painted(icon, QSize(40, 40)));
        QCOMPARE(image.pixelColor(12, 17), QColor(Qt::white));
    }

    void aScaledPainterIsServedToo()
    {
        const BorderIcon icon(QPixmap::fromImage(frame()), QMargins(2, 2, 2, 2), BorderIcon::StretchCenter, 1.0);
        QImage image(80, 80, QImage::Format_ARGB32_Premultiplied);
        image.fill(Qt::white);
        QPainter painter(&image);
        painter.scale(2, 2);
        icon.paint(&painter, QRect(0, 0, 40, 40));
        painter.end();
        QCOMPARE(image.pixelColor(1, 1), frame().pixelColor(0, 0));
        QCOMPARE(image.pixelColor(79, 79), frame().pixelColor(9, 9));
    }

    void anotherModeAndStateFallBack()
    {
        const BorderIcon icon(QPixmap::fromImage(frame()), QMargins(2, 2, 2, 2), BorderIcon::StretchCenter, 1.0);
        const QImage normal = painted(icon, QSize(30, 30));
        QCOMPARE(painted(icon, QSize(30, 30), QIcon::Disabled, QIcon::On), normal);
        QCOMPARE(painted(icon, QSize(30, 30), QIcon::Normal, QIcon::On), normal);
    }

    void aModeOfItsOwnIsUsed()
    {
        QPixmap red(10, 10);
        red.fill(Qt::red);
        QPixmap blue(10, 10);
        blue.fill(Qt::blue);
        BorderIcon icon(QPixmap::fromImage(frame()));
        icon.addPixmap(red, QIcon::Disabled, QIcon::On);
        icon.addPixmap(blue, QIcon::Normal, QIcon::On);
        QCOMPARE(painted(icon, QSize(30, 30), QIcon::Disabled, QIcon::On).pixelColor(15, 15), QColor(Qt::red));
        // First the mode falls back, then the state.
        QCOMPARE(painted(icon, QSize(30, 30), QIcon::Active, QIcon::On).pixelColor(15, 15), QColor(Qt::blue));
        QCOMPARE(painted(icon, QSize(30, 30), QIcon::Disabled, QIcon::Off), painted(icon, QSize(30, 30)));
    }

    void withoutAPictureNothingIsPainted()
    {
        QImage white(30, 30, QImage::Format_ARGB32_Premultiplied);
        white.fill(Qt::white);
        QCOMPARE(painted(BorderIcon(), QSize(30, 30)), white);
        QCOMPARE(painted(BorderIcon(QStringLiteral(":/no/such.png")), QSize(30, 30)), white);
    }

    void aFileServesToo()
    {
        QTemporaryDir directory;
        const QString path = directory.path() + QLatin1String("/frame.png");
        QVERIFY(frame().save(path));
        const BorderIcon icon(path, QMargins(2, 2, 2, 2), BorderIcon::StretchCenter, 1.0);
        QCOMPARE(painted(icon, QSize(50, 50)), reference(frame(), 2, BorderIcon::StretchCenter, QSize(50, 50)));
    }

    void itHasNoSizeOfItsOwn()
    {
        const BorderIcon icon(QPixmap::fromImage(frame()));
        QCOMPARE(icon.actualSize(QSize(321, 7)), QSize(321, 7));
        QCOMPARE(icon.pixmap(QSize(40, 30)).size(), QSize(40, 30));
    }

    void theOpacityReplacesThePainters()
    {
        QPixmap black(10, 10);
        black.fill(Qt::black);
        BorderIcon icon(black, QMargins(2, 2, 2, 2), BorderIcon::TileCenter, 1.0);
        QVERIFY(qFuzzyCompare(icon.getOpacity(), 1.0));
        icon.setOpacity(0.5);
        const QImage image = painted(icon, QSize(30, 30));
        const int value = image.pixelColor(5, 5).red();
        QVERIFY2(qAbs(value - 128) <= 2, qPrintable(QString::number(value)));
    }

    void aCopySharesTheEngine()
    {
        BorderIcon icon(QPixmap::fromImage(frame()));
        BorderIcon copy(icon);
        copy.setOpacity(0.5);
        QVERIFY(qFuzzyCompare(icon.getOpacity(), 0.5));
        BorderIcon assigned;
        assigned = icon;
        assigned.setOpacity(0.25);
        QVERIFY(qFuzzyCompare(icon.getOpacity(), 0.25));
        QCOMPARE(painted(copy, QSize(40, 40)), painted(icon, QSize(40, 40)));
    }

    void aCopyThatPartedFromItsEngineDoesNotTouchADeadOne()
    {
        std::unique_ptr<BorderIcon> icon(new BorderIcon(QPixmap::fromImage(frame())));
        BorderIcon copy(*icon);
        copy.addPixmap(QPixmap(4, 4), QIcon::Active, QIcon::On); // parts
        icon.reset();
        copy.setOpacity(0.5);
        QVERIFY(qFuzzyCompare(copy.getOpacity(), 1.0));
    }
};

ZELKOV_TEST_MAIN(TestBorderIcon)
#include "tst_bordericon.moc"
