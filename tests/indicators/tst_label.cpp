// SPDX-License-Identifier: MIT
// The label whose scaled picture keeps its proportions, compared pixel by pixel.
#include "indicators/Label.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtGui/QPainter>
#include <QtTest/QtTest>
#include <QtWidgets/QProxyStyle>
#include <QtWidgets/QStyleOption>

namespace
{
// Columns of four colours, each a quarter of the width; the lower half of the two in the middle is darker.
QPixmap stripes(int width, int height)
{
    QImage image(width, height, QImage::Format_ARGB32_Premultiplied);
    const QColor colours[] = {Qt::red, Qt::green, Qt::blue, Qt::yellow};
    for (int y = 0; y < height; ++y) {
        for (int x = 0; x < width; ++x) {
            const int column = x * 4 / width;
            const bool dark = y >= height / 2 && (column == 1 || column == 2);
            image.setPixelColor(x, y, dark ? colours[column].darker() : colours[column]);
        }
    }
    return QPixmap::fromImage(image);
}

QImage frame(QWidget& widget)
{
    return widget.grab().toImage().convertToFormat(QImage::Format_RGB32);
}

template <class LabelClass> void furnish(LabelClass& label, const QPixmap& picture, const QSize& size)
{
    label.resize(size);
    label.setScaledContents(true);
    label.setPixmap(picture);
}

/// Counts what is drawn through the style, and draws a mark for PE_Widget.
class Spy : public QProxyStyle
{
public:
    Spy()
        : QProxyStyle(QStringLiteral("fusion"))
    {
    }
    mutable QStringList calls;
    mutable QVector<qint64> pictures;

    void drawItemPixmap(QPainter* painter, const QRect& rect, int alignment, const QPixmap& pixmap) const override
    {
        calls << QStringLiteral("pixmap %1x%2 at %3").arg(pixmap.width()).arg(pixmap.height()).arg(alignment);
        pictures << pixmap.cacheKey();
        QProxyStyle::drawItemPixmap(painter, rect, alignment, pixmap);
    }
    void drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
        const QWidget* widget) const override
    {
        if (element == PE_Widget) {
            calls << QStringLiteral("widget");
            painter->fillRect(QRect(0, 0, 3, 3), option->state.testFlag(State_Enabled) ? Qt::black : Qt::white);
            return;
        }
        QProxyStyle::drawPrimitive(element, option, painter, widget);
    }
};
}

class TestLabel : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void itStartsWithItsDefaults()
    {
        QWidget parent;
        vx::Label label(&parent, Qt::WindowFlags());
        QVERIFY(label.keepAspectRatio());
        QCOMPARE(label.parentWidget(), &parent);
        vx::Label text(QStringLiteral("Text"), &parent, Qt::WindowFlags());
        QCOMPARE(text.text(), QStringLiteral("Text"));
        QVERIFY(text.keepAspectRatio());
        vx::Label window(QString(), nullptr, Qt::Tool);
        QVERIFY(window.windowFlags().testFlag(Qt::Tool));
    }

    void withoutScaledContentsItIsAQLabel()
    {
        vx::Label label;
        QLabel plain;
        for (QLabel* each : {static_cast<QLabel*>(&label), &plain}) {
            each->resize(100, 100);
            each->setFrameShape(QFrame::Box);
        }
        label.setPixmap(stripes(40, 20));
        plain.setPixmap(stripes(40, 20));
        QVERIFY(label.keepAspectRatio());
        QCOMPARE(frame(label), frame(plain));
    }

    void withoutKeptProportionsItStretchesAsQLabelDoes()
    {
        vx::Label label;
        QLabel plain;
        furnish(label, stripes(40, 20), QSize(100, 100));
        furnish(plain, stripes(40, 20), QSize(100, 100));
        label.setKeepAspectRatio(false);
        QVERIFY(!label.keepAspectRatio());
        QCOMPARE(frame(label), frame(plain));
        label.setKeepAspectRatio(true);
        QVERIFY(frame(label) != frame(plain));
    }

    void textAndEmptyPicturesAreThoseOfQLabel()
    {
        vx::Label label(QStringLiteral("Text"));
        QLabel plain(QStringLiteral("Text"));
        for (QLabel* each : {static_cast<QLabel*>(&label), &plain}) {
            each->resize(100, 30);
            each->setScaledContents(true);
        }
        QCOMPARE(frame(label), frame(plain));
        label.setPixmap(QPixmap());
        plain.setPixmap(QPixmap());
        QCOMPARE(frame(label), frame(plain));
    }

    void aWidePictureIsCentredAndCutAtTheSides()
    {
        vx::Label label;
        furnish(label, stripes(200, 100), QSize(100, 100));
        const QImage image = frame(label);
        QCOMPARE(image, stripes(200, 100).copy(50, 0, 100, 100).toImage().convertToFormat(QImage::Format_RGB32));
        QCOMPARE(image.pixelColor(0, 10), QColor(Qt::green));
        QCOMPARE(image.pixelColor(99, 10), QColor(Qt::blue));
    }

    void aHighPictureIsCutAboveAndBelow()
    {
        vx::Label label;
        const QPixmap picture = stripes(200, 100).transformed(QTransform().rotate(90));
        QCOMPARE(picture.size(), QSize(100, 200));
        furnish(label, picture, QSize(100, 100));
        QCOMPARE(frame(label), picture.copy(0, 50, 100, 100).toImage().convertToFormat(QImage::Format_RGB32));
    }

    void aPictureIsScaledSmoothlyUntilItCovers_data()
    {
        QTest::addColumn<QSize>("picture");
        QTest::addColumn<QSize>("label");
        QTest::newRow("up") << QSize(40, 20) << QSize(100, 100);
        QTest::newRow("down") << QSize(400, 300) << QSize(90, 30);
        QTest::newRow("same proportions") << QSize(40, 20) << QSize(100, 50);
        QTest::newRow("odd") << QSize(37, 23) << QSize(101, 55);
    }

    void aPictureIsScaledSmoothlyUntilItCovers()
    {
        QFETCH(QSize, picture);
        QFETCH(QSize, label);
        vx::Label widget;
        furnish(widget, stripes(picture.width(), picture.height()), label);
        const QPixmap scaled = stripes(picture.width(), picture.height())
                                   .scaled(label, Qt::KeepAspectRatioByExpanding, Qt::SmoothTransformation);
        QPixmap expected(label);
        QPainter painter(&expected);
        QApplication::style()->drawItemPixmap(&painter, QRect(QPoint(), label), Qt::AlignCenter, scaled);
        painter.end();
        QCOMPARE(frame(widget), expected.toImage().convertToFormat(QImage::Format_RGB32));
    }

    void theStyleDrawsThePictureAndThenTheWidgetOnTop()
    {
        Spy style;
        vx::Label label;
        label.setStyle(&style);
        furnish(label, stripes(200, 100), QSize(100, 100));
        const QImage image = frame(label);
        QCOMPARE(style.calls,
            QStringList(
                {QStringLiteral("pixmap 200x100 at %1").arg(int(Qt::AlignCenter)), QStringLiteral("widget")}));
        QCOMPARE(image.pixelColor(1, 1), QColor(Qt::black));
        label.setEnabled(false);
        QCOMPARE(frame(label).pixelColor(1, 1), QColor(Qt::white));
    }

    void aStyleSheetLaysAFrameOverThePicture()
    {
        vx::Label label;
        furnish(label, stripes(200, 100), QSize(100, 100));
        label.setStyleSheet(QStringLiteral("border: 4px solid #102030;"));
        const QImage image = frame(label);
        QCOMPARE(image.pixelColor(1, 50), QColor(0x10, 0x20, 0x30));
        QCOMPARE(image.pixelColor(97, 50), QColor(0x10, 0x20, 0x30));
        QCOMPARE(image.pixelColor(10, 10), QColor(Qt::green));
    }

    void nothingIsScaledAgainUntilPictureOrSizeChange()
    {
        Spy style;
        vx::Label label;
        label.setStyle(&style);
        furnish(label, stripes(40, 20), QSize(100, 50));
        frame(label);
        frame(label);
        QCOMPARE(style.pictures.at(1), style.pictures.at(0));
        label.resize(80, 40);
        frame(label);
        QVERIFY(style.pictures.at(2) != style.pictures.at(1));
        QVERIFY(style.calls.at(4).startsWith(QLatin1String("pixmap 80x40")));
        label.setPixmap(stripes(20, 10));
        frame(label);
        QVERIFY(style.pictures.at(3) != style.pictures.at(2));
        // The same picture anew.
        const QPixmap same = stripes(20, 10);
        label.setPixmap(same);
        frame(label);
        label.setPixmap(same);
        frame(label);
        QVERIFY(style.pictures.at(5) != style.pictures.at(4));
        // Other proportions than the label's are kept just as well.
        label.resize(50, 50);
        frame(label);
        frame(label);
        QCOMPARE(style.pictures.at(7), style.pictures.at(6));
    }

    void aPictureSetThroughTheBaseClassIsShownToo()
    {
        vx::Label label;
        furnish(label, stripes(100, 50), QSize(100, 50));
        frame(label);
        QPixmap black(100, 50);
        black.fill(Qt::black);
        static_cast<QLabel&>(label).setPixmap(black);
        QCOMPARE(frame(label).pixelColor(50, 25), QColor(Qt::black));
    }

    void aPictureForADenseScreenCoversTheLabelToo()
    {
        QPixmap dense = stripes(400, 200);
        dense.setDevicePixelRatio(2.0);
        vx::Label label;
        furnish(label, dense, QSize(100, 100));
        const QImage image = frame(label);
        QCOMPARE(image.pixelColor(2, 10), QColor(Qt::green));
        QCOMPARE(image.pixelColor(97, 10), QColor(Qt::blue));
    }

    void settingTheProportionsAlwaysRepaints()
    {
        class Counting : public vx::Label
        {
        public:
            int paints = 0;

        protected:
            void paintEvent(QPaintEvent* event) override
            {
                ++paints;
                vx::Label::paintEvent(event);
            }
        };
        Counting label;
        furnish(label, stripes(40, 20), QSize(100, 100));
        label.show();
        QVERIFY(QTest::qWaitForWindowExposed(&label));
        QCoreApplication::processEvents();
        const int before = label.paints;
        label.setKeepAspectRatio(true);
        QTRY_VERIFY(label.paints > before);
    }
};

ZELKOV_TEST_MAIN(TestLabel)
#include "tst_label.moc"
