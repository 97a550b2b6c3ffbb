// SPDX-License-Identifier: MIT
// Geometry of thumbnails, the fitting of captions, and the pictures that the delegate paints.
#include <random>

#include <QtCore/QStringListModel>
#include <QtGui/QFontDatabase>
#include <QtGui/QPainter>
#include <QtGui/QStandardItemModel>
#include <QtTest/QtTest>

#include "models/TableViewDelegate.h"
#include "models/ThumbnailGeometry.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

namespace
{
class Delegate : public vx::TableViewDelegate
{
public:
    Delegate()
        : TableViewDelegate(nullptr)
    {
    }
    using TableViewDelegate::fitPixmapIntoFrame;
    using TableViewDelegate::paintCaption;
    using TableViewDelegate::pixmapFromIndex;
};

/// Records what paint() asks for.
class Recording : public Delegate
{
public:
    struct Caption
    {
        QRect background;
        bool sameRect;
        QColor color;
        int role;
    };

    mutable QVector<Caption> captions;
    mutable int fitted = 0;

protected:
    void fitPixmapIntoFrame(QImage&, QRect&, const QSize&, QPainter*, const QModelIndex&) const override
    {
        ++fitted;
    }
    void paintCaption(QRect& background, QRect& text, const QModelIndex&, QPainter*, const QStyleOptionViewItem&,
        const QColor& color, Qt::ItemDataRole role) const override
    {
        captions << Caption {background, &background == &text, color, int(role)};
    }
};

/// A colourful picture without symmetry.
QImage picture(const QSize& size, QImage::Format format = QImage::Format_RGB32)
{
    QImage image(size, QImage::Format_ARGB32);
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width(); ++x) {
            const int alpha = format == QImage::Format_RGB32 ? 255 : 55 + x % 200;
            image.setPixel(x, y, qRgba(x * 7 % 256, y * 11 % 256, (x + y) * 3 % 256, alpha));
        }
    }
    return image.convertToFormat(format);
}

QStandardItem* cell(const QString& text, const QVariant& decoration, int alignment)
{
    auto* item = new QStandardItem(text);
    item->setData(decoration, Qt::DecorationRole);
    item->setData(alignment, Qt::TextAlignmentRole);
    return item;
}

QStyleOptionViewItem optionFor(const QRect& rect, bool selected = false)
{
    QStyleOptionViewItem option;
    option.rect = rect;
    option.state = QStyle::State_Enabled;
    option.state.setFlag(QStyle::State_Selected, selected);
    return option;
}

QImage canvas(const QSize& size = QSize(240, 180))
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(QColor(30, 60, 90));
    return image;
}

QImage painted(const vx::TableViewDelegate& delegate, const QModelIndex& index, const QRect& rect,
    bool selected = false, const QPoint& shift = QPoint(), bool smooth = false)
{
    QImage image = canvas();
    QPainter painter(&image);
    painter.translate(shift);
    painter.setRenderHint(QPainter::SmoothPixmapTransform, smooth);
    delegate.paint(&painter, optionFor(rect, selected), index);
    return image;
}

int largestDifference(const QImage& left, const QImage& right)
{
    if (left.size() != right.size()) {
        return 1000;
    }
    int result = 0;
    for (int y = 0; y < left.height(); ++y) {
        for (int x = 0; x < left.width(); ++x) {
            const QRgb a = left.pixel(x, y);
            const QRgb b = right.pixel(x, y);
            result = qMax(result, qMax(qAbs(qRed(a) - qRed(b)),
                                      qMax(qAbs(qGreen(a) - qGreen(b)), qAbs(qBlue(a) - qBlue(b)))));
        }
    }
    return result;
}

int widthAt(const QString& text, int pixels)
{
    QFont font = QFontDatabase::systemFont(QFontDatabase::FixedFont);
    font.setPixelSize(pixels);
    return QFontMetrics(font).horizontalAdvance(text);
}

/// The picture of a bar with its caption, drawn by the plain calls.
QImage plainCaption(const QRect& bar, const QString& text, int startSize, const QColor& color)
{
    QImage image = canvas();
    QPainter painter(&image);
    painter.fillRect(bar, color);
    const QRect inner = bar.adjusted(4, 0, -4, 0);
    int size = startSize;
    while (size >= 8 && widthAt(text, size) > inner.width()) {
        --size;
    }
    QFont font = QFontDatabase::systemFont(QFontDatabase::FixedFont);
    font.setPixelSize(size);
    painter.setFont(font);
    painter.setPen(Qt::white);
    painter.drawText(inner, Qt::AlignLeft | Qt::AlignVCenter,
        QFontMetrics(font).elidedText(text, Qt::ElideLeft, inner.width()));
    return image;
}

const int c_keepAspect = Qt::AlignAbsolute;
const int c_cover = Qt::AlignAbsolute | Qt::AlignJustify;
const QColor c_plainBar(109, 110, 113, 185);
const QColor c_selectedBar(236, 208, 30, 185);
}

class TestTableViewDelegate : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void fitting_data();
    void fitting();
    void fittedRectanglesFitAndCoveringOnesCover();
    void alignment_data();
    void alignment();
    void alignmentBitsMoveOneEdgeEach();
    void titleSizes_data();
    void titleSizes();
    void fontShrinksOnlyWhileTooWide_data();
    void fontShrinksOnlyWhileTooWide();

    void picturesComeFromTheDecoration();
    void fitPixmapIntoFrameDoesNothing();
    void paintAsksForOneCaptionBar();
    void paintRestoresThePainter();
    void selectionColoursTheBar();
    void pictureLeavesAMarginAtTheUpperLeft_data();
    void pictureLeavesAMarginAtTheUpperLeft();
    void withoutAlignmentThePictureStandsAtTheOrigin();
    void keptPicturesLookLikeFreshOnes_data();
    void keptPicturesLookLikeFreshOnes();
    void keptPicturesLookLikeFreshOnesUnderTransforms_data();
    void keptPicturesLookLikeFreshOnesUnderTransforms();
    void keptPicturesAreSharpOnDenseScreens();
    void aChangedPictureIsPaintedAnew();
    void aCellWithoutTextHasNoBar();
    void aCellWithoutPictureHasItsBarInTheCell();
    void captionsLookLikePlainText_data();
    void captionsLookLikePlainText();
    void keptCaptionsFollowColourAndSize();
    void oneBarInTwoFontSizesIsTwoCaptions();
    void captionsLookLikePlainCalls_data();
    void captionsLookLikePlainCalls();
    void captionShrinksTheTextRectangle();
    void captionSetsPenAndBrush();
    void longCaptionsAreElidedAtTheLeft();
    void emptyCellsPaintNothing();
    void aLimitOfZeroKeepsNoPicture();
};

void TestTableViewDelegate::fitting_data()
{
    QTest::addColumn<QRect>("rect");
    QTest::addColumn<QSize>("size");
    QTest::addColumn<bool>("expand");
    QTest::addColumn<QRect>("expected");

    const QRect wide(10, 20, 200, 100);
    const QRect high(10, 20, 100, 200);
    QTest::newRow("narrower picture fits") << wide << QSize(100, 100) << false << QRect(60, 20, 100, 100);
    QTest::newRow("narrower picture covers") << wide << QSize(100, 100) << true << QRect(10, -30, 200, 200);
    QTest::newRow("wider picture fits") << wide << QSize(400, 100) << false << QRect(10, 45, 200, 50);
    QTest::newRow("wider picture covers") << wide << QSize(400, 100) << true << QRect(-90, 20, 400, 100);
    QTest::newRow("same ratio fits") << wide << QSize(20, 10) << false << wide;
    QTest::newRow("same ratio covers") << wide << QSize(20, 10) << true << wide;
    QTest::newRow("high fits") << high << QSize(100, 100) << false << QRect(10, 70, 100, 100);
    QTest::newRow("high covers") << high << QSize(100, 100) << true << QRect(-40, 20, 200, 200);
    QTest::newRow("division truncates") << QRect(0, 0, 100, 10) << QSize(3, 7) << false << QRect(48, 0, 4, 10);
    QTest::newRow("no size") << wide << QSize(0, 10) << false << wide;
    QTest::newRow("invalid size") << wide << QSize() << true << wide;
    QTest::newRow("products beyond int") << QRect(0, 0, 100000, 50000) << QSize(100000, 100000) << false
                                         << QRect(25000, 0, 50000, 50000);
}

void TestTableViewDelegate::fitting()
{
    QFETCH(QRect, rect);
    QFETCH(QSize, size);
    QFETCH(bool, expand);
    QFETCH(QRect, expected);
    QCOMPARE(vx::thumbnail::fitWithAspectRatio(rect, size, expand), expected);
    QCOMPARE(vx::TableViewDelegate::fitIntoRectWithAspectRatio(rect, size, expand), expected);
}

void TestTableViewDelegate::fittedRectanglesFitAndCoveringOnesCover()
{
    const uint seed = 3;
    std::mt19937 random(seed);
    const auto number = [&random] { return int(random() % 500) + 1; };
    for (int i = 0; i < 5000; ++i) {
        const QRect rect(number() - 250, number() - 250, number(), number());
        const QSize size(number(), number());
        const QRect inside = vx::thumbnail::fitWithAspectRatio(rect, size, false);
        const QRect around = vx::thumbnail::fitWithAspectRatio(rect, size, true);
        const QByteArray where = QByteArray::number(i) + " of seed " + QByteArray::number(seed);
        QVERIFY2(inside.width() <= rect.width() && inside.height() <= rect.height(), where);
        QVERIFY2(inside.width() == rect.width() || inside.height() == rect.height(), where);
        QVERIFY2(inside.isEmpty() || rect.contains(inside), where);
        // A width cut off by up to a pixel decides on the side, and that is more in the height of a high picture.
        QVERIFY2(around.width() >= rect.width(), where);
        QVERIFY2(around.height() >= rect.height() - 1 - size.height() / size.width(), where);
        QVERIFY2(around.width() == rect.width() || around.height() == rect.height(), where);
    }
}

void TestTableViewDelegate::alignment_data()
{
    QTest::addColumn<int>("bits");
    QTest::addColumn<QRect>("expected");

    // A picture twice as wide as high in a cell of 100 x 80 at (300, 200).
    const int left = Qt::AlignLeft;
    const int right = Qt::AlignRight;
    const int hCenter = Qt::AlignHCenter;
    const int top = Qt::AlignTop;
    const int bottom = Qt::AlignBottom;
    const int vCenter = Qt::AlignVCenter;
    QTest::newRow("none stands at the origin") << 0 << QRect(0, 0, 100, 80);
    QTest::newRow("justify alone does nothing") << int(Qt::AlignJustify) << QRect(0, 0, 100, 80);
    QTest::newRow("left") << left << QRect(300, 0, 100, 80);
    QTest::newRow("right") << right << QRect(300, 0, 100, 80);
    QTest::newRow("top") << top << QRect(0, 200, 100, 80);
    QTest::newRow("bottom") << bottom << QRect(0, 200, 100, 80);
    QTest::newRow("hcenter") << hCenter << QRect(300, 0, 100, 80);
    QTest::newRow("vcenter") << vCenter << QRect(0, 200, 100, 80);
    QTest::newRow("center") << int(Qt::AlignCenter) << QRect(300, 200, 100, 80);
    QTest::newRow("left top") << (left | top) << QRect(300, 200, 100, 80);
    QTest::newRow("baseline is not looked at") << int(Qt::AlignBaseline) << QRect(0, 0, 100, 80);

    QTest::newRow("aspect") << c_keepAspect << QRect(300, 215, 100, 50);
    QTest::newRow("aspect left") << (c_keepAspect | left) << QRect(300, 215, 100, 50);
    QTest::newRow("aspect right") << (c_keepAspect | right) << QRect(300, 215, 100, 50);
    QTest::newRow("aspect top") << (c_keepAspect | top) << QRect(300, 200, 100, 50);
    QTest::newRow("aspect bottom") << (c_keepAspect | bottom) << QRect(300, 230, 100, 50);
    QTest::newRow("aspect hcenter") << (c_keepAspect | hCenter) << QRect(300, 215, 100, 50);
    QTest::newRow("aspect vcenter") << (c_keepAspect | vCenter) << QRect(300, 215, 100, 50);
    QTest::newRow("aspect bottom right") << (c_keepAspect | bottom | right) << QRect(300, 230, 100, 50);

    QTest::newRow("cover") << c_cover << QRect(270, 200, 160, 80);
    QTest::newRow("cover left") << (c_cover | left) << QRect(300, 200, 160, 80);
    QTest::newRow("cover right") << (c_cover | right) << QRect(240, 200, 160, 80);
    QTest::newRow("cover hcenter") << (c_cover | hCenter) << QRect(270, 200, 160, 80);
    QTest::newRow("cover top") << (c_cover | top) << QRect(270, 200, 160, 80);
    QTest::newRow("cover bottom") << (c_cover | bottom) << QRect(270, 200, 160, 80);
    QTest::newRow("cover left and right: right is later") << (c_cover | left | right) << QRect(240, 200, 160, 80);
    QTest::newRow("cover left and centre: centre is later") << (c_cover | left | hCenter) << QRect(270, 200, 160, 80);
    QTest::newRow("aspect top and bottom: bottom is later") << (c_keepAspect | top | bottom)
                                                            << QRect(300, 230, 100, 50);
    QTest::newRow("aspect bottom and centre: centre is later") << (c_keepAspect | bottom | vCenter)
                                                               << QRect(300, 215, 100, 50);
}

void TestTableViewDelegate::alignment()
{
    QFETCH(int, bits);
    QFETCH(QRect, expected);
    const QRect rect(300, 200, 100, 80);
    QCOMPARE(vx::thumbnail::align(QSize(64, 32), rect, bits), expected);
    QCOMPARE(vx::TableViewDelegate::adjustAlignment(QSize(64, 32), rect, bits), expected);
}

void TestTableViewDelegate::alignmentBitsMoveOneEdgeEach()
{
    const QRect rect(31, 47, 101, 83);
    for (int bits = 0; bits < 256; ++bits) {
        const QRect result = vx::thumbnail::align(QSize(60, 45), rect, bits);
        const QByteArray where = QByteArray::number(bits);
        if ((bits & Qt::AlignHCenter) != 0) {
            QVERIFY2(result.center().x() == rect.center().x(), where);
        } else if ((bits & Qt::AlignRight) != 0) {
            QVERIFY2(result.right() == rect.right(), where);
        } else if ((bits & Qt::AlignLeft) != 0) {
            QVERIFY2(result.left() == rect.left(), where);
        }
        if ((bits & Qt::AlignVCenter) != 0) {
            QVERIFY2(result.center().y() == rect.center().y(), where);
        } else if ((bits & Qt::AlignBottom) != 0) {
            QVERIFY2(result.bottom() == rect.bottom(), where);
        } else if ((bits & Qt::AlignTop) != 0) {
            QVERIFY2(result.top() == rect.top(), where);
        }
        if ((bits & Qt::AlignAbsolute) == 0) {
            QVERIFY2(result.size() == rect.size(), where);
        }
    }
}

void TestTableViewDelegate::titleSizes_data()
{
    QTest::addColumn<bool>("scaled");
    QTest::addColumn<int>("height");
    QTest::addColumn<int>("font");
    QTest::addColumn<int>("title");
    QTest::addColumn<int>("barHeight");

    QTest::newRow("fixed, high") << false << 400 << 12 << 20 << 21;
    QTest::newRow("fixed, low") << false << 10 << 12 << 20 << 21;
    QTest::newRow("scaled 400") << true << 400 << 240 << 101 << 101;
    QTest::newRow("scaled 100") << true << 100 << 60 << 26 << 26;
    QTest::newRow("scaled 21") << true << 21 << 12 << 6 << 6;
    QTest::newRow("scaled 22: 13 and a bit") << true << 22 << 13 << 6 << 6;
    QTest::newRow("scaled 10") << true << 10 << 12 << 3 << 3;
    QTest::newRow("scaled 5, in single precision") << true << 35 << 21 << 9 << 9;
}

void TestTableViewDelegate::titleSizes()
{
    QFETCH(bool, scaled);
    QFETCH(int, height);
    QFETCH(int, font);
    QFETCH(int, title);
    QFETCH(int, barHeight);
    Delegate delegate;
    QCOMPARE(delegate.getFontSize(400), 12); // not scaled at first
    delegate.setScaleFont(scaled);
    QCOMPARE(delegate.getFontSize(height), font);
    QCOMPARE(delegate.getTitleHeight(height), title);
    const QRect rect(30, 40, 120, height);
    const QRect bar = delegate.getTitleRect(rect);
    QCOMPARE(bar, QRect(30, 40 + height - barHeight, 120, barHeight));
    QCOMPARE(bar.bottom(), rect.bottom());
}

void TestTableViewDelegate::fontShrinksOnlyWhileTooWide_data()
{
    QTest::addColumn<int>("size");
    QTest::addColumn<int>("width");
    QTest::addColumn<int>("expected");
    // A text of ten times the size.
    QTest::newRow("fits") << 12 << 120 << 12;
    QTest::newRow("a pixel too wide") << 12 << 119 << 11;
    QTest::newRow("fits at 8") << 12 << 80 << 8;
    QTest::newRow("fits at 7") << 12 << 79 << 7;
    QTest::newRow("never fits") << 12 << 5 << 7;
    QTest::newRow("negative room") << 12 << -5 << 7;
    QTest::newRow("starts at 7") << 7 << 5 << 7;
    QTest::newRow("starts at 3") << 3 << 5 << 3;
}

void TestTableViewDelegate::fontShrinksOnlyWhileTooWide()
{
    QFETCH(int, size);
    QFETCH(int, width);
    QFETCH(int, expected);
    QCOMPARE(vx::thumbnail::fittingSize(size, width, [](int pixels) { return pixels * 10; }), expected);
}

void TestTableViewDelegate::picturesComeFromTheDecoration()
{
    QStandardItemModel model;
    const QImage image = picture(QSize(8, 6));
    auto* item = cell(QString(), image, 0);
    item->setData(QSize(11, 12), Qt::SizeHintRole);
    model.appendRow(item);
    model.appendRow(cell(QString(), QPixmap::fromImage(image), 0));
    model.appendRow(cell(QString(), QStringLiteral("no picture"), 0));

    Delegate delegate;
    QImage read;
    QSize size;
    delegate.pixmapFromIndex(model.index(0, 0), read, &size);
    QCOMPARE(read, image);
    QCOMPARE(size, QSize(11, 12));
    delegate.pixmapFromIndex(model.index(1, 0), read, nullptr);
    QCOMPARE(read.convertToFormat(QImage::Format_RGB32), image);
    delegate.pixmapFromIndex(model.index(2, 0), read, &size);
    QVERIFY(read.isNull());
    QVERIFY(!size.isValid());
}

void TestTableViewDelegate::fitPixmapIntoFrameDoesNothing()
{
    Delegate delegate;
    QImage image = picture(QSize(8, 6));
    const QImage before = image;
    QRect rect(1, 2, 3, 4);
    delegate.fitPixmapIntoFrame(image, rect, QSize(9, 9), nullptr, QModelIndex());
    QCOMPARE(image, before);
    QCOMPARE(rect, QRect(1, 2, 3, 4));
}

void TestTableViewDelegate::paintAsksForOneCaptionBar()
{
    QStandardItemModel model;
    model.appendRow(cell(QStringLiteral("name"), picture(QSize(64, 32)), c_keepAspect));
    Recording delegate;
    painted(delegate, model.index(0, 0), QRect(20, 10, 100, 80));
    QCOMPARE(delegate.captions.size(), 1);
    // The bar lies over the picture's rectangle, (20, 25, 100, 50), not over the cell's.
    QCOMPARE(delegate.captions.at(0).background, QRect(20, 54, 100, 21));
    QVERIFY(delegate.captions.at(0).sameRect);
    QCOMPARE(delegate.captions.at(0).color, c_plainBar);
    QCOMPARE(delegate.captions.at(0).role, int(Qt::DisplayRole));
    QCOMPARE(delegate.fitted, 0);
    painted(delegate, model.index(0, 0), QRect(20, 10, 100, 80), true);
    QCOMPARE(delegate.captions.at(1).color, c_selectedBar);
}

void TestTableViewDelegate::paintRestoresThePainter()
{
    QStandardItemModel model;
    model.appendRow(cell(QStringLiteral("name"), picture(QSize(64, 32)), c_keepAspect));
    Delegate delegate;
    QImage image = canvas();
    QPainter painter(&image);
    painter.setPen(Qt::green);
    painter.setBrush(Qt::blue);
    const QFont font = painter.font();
    delegate.paint(&painter, optionFor(QRect(0, 0, 100, 80)), model.index(0, 0));
    QCOMPARE(painter.pen().color(), QColor(Qt::green));
    QCOMPARE(painter.brush().color(), QColor(Qt::blue));
    QCOMPARE(painter.font(), font);
}

void TestTableViewDelegate::selectionColoursTheBar()
{
    QStandardItemModel model;
    model.appendRow(new QStandardItem(QStringLiteral("x")));
    Delegate delegate;
    const QRect rect(20, 10, 100, 80);
    for (const bool selected : {false, true}) {
        QImage expected = canvas();
        QPainter painter(&expected);
        painter.fillRect(QRect(20, 69, 100, 21), selected ? c_selectedBar : c_plainBar);
        painter.end();
        const QImage result = painted(delegate, model.index(0, 0), rect, selected);
        for (const QPoint& point : {QPoint(119, 69), QPoint(119, 89), QPoint(20, 69), QPoint(119, 68),
                 QPoint(120, 75), QPoint(119, 90)}) {
            QCOMPARE(result.pixelColor(point), expected.pixelColor(point));
        }
    }
}

void TestTableViewDelegate::pictureLeavesAMarginAtTheUpperLeft_data()
{
    QTest::addColumn<int>("bits");
    QTest::addColumn<QRect>("target");
    QTest::newRow("filling") << int(Qt::AlignCenter) << QRect(30, 20, 89, 69);
    QTest::newRow("aspect") << c_keepAspect << QRect(30, 35, 89, 39);
    QTest::newRow("aspect, top") << (c_keepAspect | int(Qt::AlignTop)) << QRect(30, 20, 89, 39);
    QTest::newRow("cover") << c_cover << QRect(0, 20, 149, 69);
}

void TestTableViewDelegate::pictureLeavesAMarginAtTheUpperLeft()
{
    QFETCH(int, bits);
    QFETCH(QRect, target);
    const QImage image = picture(QSize(64, 32));
    QStandardItemModel model;
    model.appendRow(cell(QString(), image, bits));
    QImage expected = canvas();
    QPainter painter(&expected);
    painter.drawImage(target, image);
    painter.end();
    Delegate delegate;
    QVERIFY(largestDifference(painted(delegate, model.index(0, 0), QRect(20, 10, 100, 80)), expected) <= 1);
}

void TestTableViewDelegate::withoutAlignmentThePictureStandsAtTheOrigin()
{
    const QImage image = picture(QSize(64, 32));
    QStandardItemModel model;
    model.appendRow(cell(QString(), image, 0));
    QImage expected = canvas();
    QPainter painter(&expected);
    painter.drawImage(QRect(10, 10, 89, 69), image);
    painter.end();
    Delegate delegate;
    QVERIFY(largestDifference(painted(delegate, model.index(0, 0), QRect(120, 90, 100, 80)), expected) <= 1);
}

void TestTableViewDelegate::keptPicturesLookLikeFreshOnes_data()
{
    QTest::addColumn<QImage>("image");
    QTest::addColumn<bool>("smooth");
    QTest::addColumn<QPoint>("shift");
    const struct
    {
        const char* name;
        QSize size;
        QImage::Format format;
    } pictures[] = {
        {"opaque", QSize(320, 180), QImage::Format_RGB32},
        {"small", QSize(7, 5), QImage::Format_RGB32},
        {"at size", QSize(89, 69), QImage::Format_RGB32},
        {"translucent", QSize(200, 100), QImage::Format_ARGB32},
        {"premultiplied", QSize(200, 100), QImage::Format_ARGB32_Premultiplied},
        {"grey", QSize(120, 90), QImage::Format_Grayscale8},
    };
    for (const auto& entry : pictures) {
        const QImage image = picture(entry.size, entry.format);
        QTest::addRow("%s", entry.name) << image << false << QPoint();
        QTest::addRow("%s, smooth", entry.name) << image << true << QPoint();
        QTest::addRow("%s, shifted", entry.name) << image << false << QPoint(13, -6);
    }
}

void TestTableViewDelegate::keptPicturesLookLikeFreshOnes()
{
    QFETCH(QImage, image);
    QFETCH(bool, smooth);
    QFETCH(QPoint, shift);
    QStandardItemModel model;
    model.appendRow(cell(QString(), image, Qt::AlignCenter));
    QImage expected = canvas();
    QPainter painter(&expected);
    painter.translate(shift);
    painter.setRenderHint(QPainter::SmoothPixmapTransform, smooth);
    painter.drawImage(QRect(30, 20, 89, 69), image);
    painter.end();
    Delegate delegate;
    for (int round = 0; round < 3; ++round) {
        const QImage result = painted(delegate, model.index(0, 0), QRect(20, 10, 100, 80), false, shift, smooth);
        QVERIFY(largestDifference(result, expected) <= 2);
    }
}

void TestTableViewDelegate::keptPicturesLookLikeFreshOnesUnderTransforms_data()
{
    QTest::addColumn<QTransform>("transform");
    QTest::newRow("scaled") << QTransform::fromScale(1.5, 1.25);
    QTest::newRow("rotated") << QTransform().translate(60, 0).rotate(20);
    QTest::newRow("half a pixel") << QTransform::fromTranslate(0.5, 0.25);
    QTest::newRow("mirrored") << QTransform(-1, 0, 0, 1, 150, 0);
}

void TestTableViewDelegate::keptPicturesLookLikeFreshOnesUnderTransforms()
{
    QFETCH(QTransform, transform);
    const QImage image = picture(QSize(64, 32));
    QStandardItemModel model;
    model.appendRow(cell(QString(), image, Qt::AlignCenter));
    QImage expected = canvas();
    QPainter plain(&expected);
    plain.setTransform(transform);
    plain.drawImage(QRect(30, 20, 89, 69), image);
    plain.end();
    Delegate delegate;
    for (int round = 0; round < 2; ++round) {
        QImage result = canvas();
        QPainter painter(&result);
        painter.setTransform(transform);
        delegate.paint(&painter, optionFor(QRect(20, 10, 100, 80)), model.index(0, 0));
        painter.end();
        QCOMPARE(largestDifference(result, expected), 0);
    }
}

void TestTableViewDelegate::keptPicturesAreSharpOnDenseScreens()
{
    const QImage image = picture(QSize(320, 180));
    QStandardItemModel model;
    model.appendRow(cell(QString(), image, Qt::AlignCenter));
    Delegate delegate;
    for (const qreal ratio : {1.0, 2.0, 1.5, 1.0}) {
        QImage expected = canvas(QSize(360, 270));
        expected.setDevicePixelRatio(ratio);
        QImage result = expected;
        QPainter plain(&expected);
        plain.drawImage(QRect(30, 20, 89, 69), image);
        plain.end();
        QPainter painter(&result);
        delegate.paint(&painter, optionFor(QRect(20, 10, 100, 80)), model.index(0, 0));
        painter.end();
        QVERIFY2(largestDifference(result, expected) <= 2, QByteArray::number(ratio));
    }
}

void TestTableViewDelegate::aChangedPictureIsPaintedAnew()
{
    QStandardItemModel model;
    QImage image(40, 40, QImage::Format_RGB32);
    image.fill(Qt::red);
    model.appendRow(cell(QString(), image, Qt::AlignCenter));
    Delegate delegate;
    QCOMPARE(painted(delegate, model.index(0, 0), QRect(0, 0, 100, 80)).pixelColor(50, 40), QColor(Qt::red));
    image.fill(Qt::blue);
    model.item(0)->setData(image, Qt::DecorationRole);
    QCOMPARE(painted(delegate, model.index(0, 0), QRect(0, 0, 100, 80)).pixelColor(50, 40), QColor(Qt::blue));
}

void TestTableViewDelegate::aCellWithoutTextHasNoBar()
{
    QStandardItemModel model;
    model.appendRow(new QStandardItem);
    Delegate delegate;
    QCOMPARE(painted(delegate, model.index(0, 0), QRect(20, 10, 100, 80)), canvas());
}

void TestTableViewDelegate::aCellWithoutPictureHasItsBarInTheCell()
{
    QStandardItemModel model;
    // The alignment does not matter without a picture.
    model.appendRow(cell(QStringLiteral("name"), QVariant(), 0));
    Recording delegate;
    painted(delegate, model.index(0, 0), QRect(20, 10, 100, 80));
    QCOMPARE(delegate.captions.at(0).background, QRect(20, 69, 100, 21));
}

void TestTableViewDelegate::captionsLookLikePlainText_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("scaled");
    QTest::addColumn<int>("startSize");
    const int fixed = 12;
    QTest::newRow("short") << QStringLiteral("Gate") << false << fixed;
    QTest::newRow("fits at ten") << QStringLiteral("Camera 17 at north") << false << fixed;
    QTest::newRow("elided") << QStringLiteral("Building 4, second floor, corridor, camera 17") << false << fixed;
    QTest::newRow("umlauts") << QString::fromUtf8("K\xC3\xBC" "che gr\xC3\xB6\xC3\x9F" "er") << false << fixed;
    QTest::newRow("markup") << QStringLiteral("<b>bold</b> &amp;") << false << fixed;
    QTest::newRow("ampersand") << QStringLiteral("In && &Out") << false << fixed;
    QTest::newRow("two lines") << QStringLiteral("one\ntwo") << false << fixed;
    QTest::newRow("tab") << QStringLiteral("one\ttwo") << false << fixed;
    QTest::newRow("blanks") << QStringLiteral("   ") << false << fixed;
    QTest::newRow("hebrew") << QString::fromUtf8("\xD7\xA9\xD7\xA2\xD7\xA8") << false << fixed;
    QTest::newRow("scaled") << QStringLiteral("Gate") << true << 24;
    QTest::newRow("scaled, long") << QStringLiteral("Building 4, camera 17") << true << 24;
}

void TestTableViewDelegate::captionsLookLikePlainText()
{
    QFETCH(QString, text);
    QFETCH(bool, scaled);
    QFETCH(int, startSize);
    QStandardItemModel model;
    model.appendRow(new QStandardItem(text));
    Delegate delegate;
    delegate.setScaleFont(scaled);
    for (int width = 40; width < 210; width += 7) {
        const QRect rect(20, 10, width, 160);
        const QImage expected = plainCaption(delegate.getTitleRect(rect), text, startSize, c_plainBar);
        for (int round = 0; round < 2; ++round) {
            const QImage result = painted(delegate, model.index(0, 0), rect);
            const int difference = largestDifference(result, expected);
            // Blending a kept text rounds twice.
            QVERIFY2(difference <= 4, QByteArray::number(width) + " wide: " + QByteArray::number(difference));
        }
    }
}

void TestTableViewDelegate::keptCaptionsFollowColourAndSize()
{
    QStringListModel model({QStringLiteral("Gate")});
    Delegate delegate;
    for (int round = 0; round < 12; ++round) {
        const bool selected = round % 2 != 0;
        const bool scaled = round / 2 % 2 != 0;
        const QRect rect(20, 10, 160, round < 8 ? 160 : 120);
        delegate.setScaleFont(scaled);
        const QRect bar = delegate.getTitleRect(rect);
        const QImage expected = plainCaption(bar, QStringLiteral("Gate"), delegate.getFontSize(bar.height()),
            selected ? c_selectedBar : c_plainBar);
        const int difference = largestDifference(painted(delegate, model.index(0, 0), rect, selected), expected);
        QVERIFY2(difference <= 4, QByteArray::number(round) + ": " + QByteArray::number(difference));
    }
}

void TestTableViewDelegate::oneBarInTwoFontSizesIsTwoCaptions()
{
    QStringListModel model({QStringLiteral("Gate")});
    Delegate delegate;
    for (const bool scaled : {false, true, false}) {
        delegate.setScaleFont(scaled);
        QImage result = canvas();
        QPainter painter(&result);
        QRect bar(20, 30, 160, 40);
        delegate.paintCaption(bar, bar, model.index(0, 0), &painter, optionFor(QRect()), c_plainBar, Qt::DisplayRole);
        painter.end();
        const QImage expected
            = plainCaption(QRect(20, 30, 160, 40), QStringLiteral("Gate"), scaled ? 24 : 12, c_plainBar);
        QVERIFY(largestDifference(result, expected) <= 4);
    }
}

void TestTableViewDelegate::captionsLookLikePlainCalls_data()
{
    QTest::addColumn<QRect>("background");
    QTest::addColumn<QRect>("text");
    QTest::addColumn<double>("opacity");
    QTest::addColumn<int>("mode");
    const int over = QPainter::CompositionMode_SourceOver;
    const QRect bar(20, 30, 160, 24);
    QTest::newRow("same") << bar << bar << 1.0 << over;
    QTest::newRow("text within") << bar << QRect(50, 32, 90, 20) << 1.0 << over;
    QTest::newRow("text within, moved") << bar << QRect(60, 34, 90, 20) << 1.0 << over;
    QTest::newRow("text sticks out") << bar << QRect(100, 40, 120, 30) << 1.0 << over;
    QTest::newRow("text beside") << bar << QRect(20, 80, 160, 24) << 1.0 << over;
    QTest::newRow("fading") << bar << bar << 0.5 << over;
    QTest::newRow("multiplied") << bar << bar << 1.0 << int(QPainter::CompositionMode_Multiply);
    QTest::newRow("added") << bar << bar << 1.0 << int(QPainter::CompositionMode_Plus);
    QTest::newRow("copied") << bar << bar << 1.0 << int(QPainter::CompositionMode_Source);
}

void TestTableViewDelegate::captionsLookLikePlainCalls()
{
    QFETCH(QRect, background);
    QFETCH(QRect, text);
    QFETCH(double, opacity);
    QFETCH(int, mode);
    QStringListModel model({QStringLiteral("Gate")});
    Delegate delegate;
    // With the captions of the other cases already kept, and twice with its own.
    const auto paintOn = [&](QImage& image, double strength, int how, QRect bar, QRect words) {
        QPainter painter(&image);
        painter.setOpacity(strength);
        painter.setCompositionMode(QPainter::CompositionMode(how));
        if (bar == words) {
            delegate.paintCaption(bar, bar, model.index(0, 0), &painter, optionFor(QRect()), c_plainBar,
                Qt::DisplayRole);
        } else {
            delegate.paintCaption(bar, words, model.index(0, 0), &painter, optionFor(QRect()), c_plainBar,
                Qt::DisplayRole);
        }
    };
    QImage other = canvas();
    paintOn(other, 1, QPainter::CompositionMode_SourceOver, QRect(20, 30, 160, 24), QRect(20, 30, 160, 24));
    paintOn(other, 1, QPainter::CompositionMode_SourceOver, QRect(20, 30, 160, 24), QRect(50, 32, 90, 20));
    for (int round = 0; round < 2; ++round) {
        QImage expected = canvas();
        QPainter painter(&expected);
        painter.setOpacity(opacity);
        painter.setCompositionMode(QPainter::CompositionMode(mode));
        painter.fillRect(background, c_plainBar);
        QFont font = QFontDatabase::systemFont(QFontDatabase::FixedFont);
        font.setPixelSize(12);
        painter.setFont(font);
        painter.setPen(Qt::white);
        painter.drawText(text.adjusted(4, 0, -4, 0), Qt::AlignLeft | Qt::AlignVCenter, QStringLiteral("Gate"));
        painter.end();
        QImage result = canvas();
        paintOn(result, opacity, mode, background, text);
        const int difference = largestDifference(result, expected);
        QVERIFY2(difference <= 4, QByteArray::number(difference));
    }
}

void TestTableViewDelegate::captionShrinksTheTextRectangle()
{
    QStringListModel model({QStringLiteral("name")});
    Delegate delegate;
    QImage image = canvas();
    QPainter painter(&image);
    QRect background(10, 20, 100, 20);
    QRect text(30, 20, 60, 20);
    delegate.paintCaption(background, text, model.index(0, 0), &painter, optionFor(QRect()), c_plainBar,
        Qt::DisplayRole);
    QCOMPARE(background, QRect(10, 20, 100, 20));
    QCOMPARE(text, QRect(34, 20, 52, 20));
}

void TestTableViewDelegate::captionSetsPenAndBrush()
{
    QStringListModel model({QStringLiteral("name")});
    Delegate delegate;
    for (const bool selected : {false, true}) {
        QImage image = canvas();
        QPainter painter(&image);
        QStyleOptionViewItem option = optionFor(QRect(), selected);
        option.palette.setColor(QPalette::Active, QPalette::HighlightedText, Qt::magenta);
        option.palette.setColor(QPalette::Active, QPalette::ButtonText, Qt::cyan);
        QRect rect(10, 20, 100, 20);
        delegate.paintCaption(rect, rect, model.index(0, 0), &painter, option, c_plainBar, Qt::DisplayRole);
        QCOMPARE(painter.pen().color(), QColor(Qt::white));
        QCOMPARE(painter.brush().color(), QColor(selected ? Qt::magenta : Qt::cyan));
        QCOMPARE(painter.font().pixelSize(), 12);
        QCOMPARE(rect, QRect(14, 20, 92, 20));
    }
}

void TestTableViewDelegate::longCaptionsAreElidedAtTheLeft()
{
    // The ends differ, the beginnings do not.
    QStandardItemModel model;
    const QString stem = QStringLiteral("a device with a name that is by far too long for its bar, number ");
    model.appendRow(new QStandardItem(stem + QStringLiteral("1")));
    model.appendRow(new QStandardItem(stem + QStringLiteral("2")));
    model.appendRow(new QStandardItem(QStringLiteral("another one than ") + stem + QStringLiteral("1")));
    Delegate delegate;
    const QRect rect(0, 0, 120, 60);
    QVERIFY(widthAt(stem, 7) > 120);
    const QImage first = painted(delegate, model.index(0, 0), rect);
    QVERIFY(first != painted(delegate, model.index(1, 0), rect));
    QCOMPARE(first, painted(delegate, model.index(2, 0), rect));
}

void TestTableViewDelegate::emptyCellsPaintNothing()
{
    QStandardItemModel model;
    model.appendRow(cell(QStringLiteral("name"), picture(QSize(64, 32)), c_keepAspect));
    Delegate delegate;
    for (const QRect& rect : {QRect(), QRect(10, 10, 0, 0), QRect(10, 10, 3, 3), QRect(10, 10, 11, 11),
             QRect(10, 10, 1, 100)}) {
        painted(delegate, model.index(0, 0), rect);
        painted(delegate, QModelIndex(), rect);
    }
    QCOMPARE(painted(delegate, QModelIndex(), QRect(10, 10, 100, 100)), canvas());
}

void TestTableViewDelegate::aLimitOfZeroKeepsNoPicture()
{
    const QImage image = picture(QSize(64, 32));
    QStandardItemModel model;
    model.appendRow(cell(QString(), image, Qt::AlignCenter));
    Delegate delegate;
    const QImage kept = painted(delegate, model.index(0, 0), QRect(20, 10, 100, 80));
    delegate.setPictureCacheLimit(0);
    QVERIFY(largestDifference(painted(delegate, model.index(0, 0), QRect(20, 10, 100, 80)), kept) <= 1);
    delegate.setPictureCacheLimit(-1);
    QVERIFY(largestDifference(painted(delegate, model.index(0, 0), QRect(20, 10, 100, 80)), kept) <= 1);
}

ZELKOV_TEST_MAIN(TestTableViewDelegate)
#include "tst_tableviewdelegate.moc"
