// SPDX-License-Identifier: MIT
// The pulse frame by frame: alpha, direction, tint, its cache, the search for the shape, overlay and badge.
#include "TestCase.h"
#include "TestMain.h"
#include "foundation/FadingWidget.h"
#include "support/LogCapture.h"

#include <QtCore/QTemporaryDir>
#include <QtGui/QPainter>
#include <QtTest/QtTest>
#include <QtWidgets/QAbstractButton>
#include <QtWidgets/QPushButton>

#include <cmath>
#include <limits>

namespace
{
/// Paints nothing of its own, so that a picture of it shows the mix-in's work alone.
template <typename T>
class Bare : public T, public vx::FadingWidget
{
public:
    explicit Bare(QWidget* parent = nullptr, int step = 16, int minAlpha = 0, int maxAlpha = 128,
        const QColor& color = QColor(200, 100, 50, 255), int interval = 100)
        : T(parent)
        , vx::FadingWidget(this, interval, step, color, minAlpha, maxAlpha)
    {
        this->resize(60, 40);
    }

    using vx::FadingWidget::m_color;
    using vx::FadingWidget::m_image;
    using vx::FadingWidget::m_interval;
    using vx::FadingWidget::m_once;
    using vx::FadingWidget::m_overlayRect;
    using vx::FadingWidget::m_rect;
    using vx::FadingWidget::m_step;
    using vx::FadingWidget::m_timer;
    using vx::FadingWidget::m_tinted;
    int paints = 0;
    int alpha() const { return m_color.alpha(); }
    bool runs() const { return m_timer.isActive(); }

    /// One painted frame.
    QImage frame()
    {
        QImage image(this->size(), QImage::Format_ARGB32_Premultiplied);
        image.fill(Qt::transparent);
        this->render(&image, QPoint(), QRegion(), QWidget::RenderFlags());
        return image;
    }
    QVector<int> alphas(int frames)
    {
        QVector<int> result;
        for (int i = 0; i < frames; ++i) {
            frame();
            result << alpha();
        }
        return result;
    }

protected:
    void paintEvent(QPaintEvent* event) override
    {
        ++paints;
        vx::FadingWidget::paintEvent(event);
    }
};
using Button = Bare<QPushButton>;
using Area = Bare<QWidget>;

QImage shape(const QSize& size = QSize(16, 16), QImage::Format format = QImage::Format_ARGB32)
{
    QImage image(size, format);
    image.fill(Qt::transparent);
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width() / 2; ++x) {
            image.setPixelColor(x, y, QColor(0, 0, 255, x == 0 ? 20 : 255));
        }
    }
    return image;
}

QIcon iconOf(const QImage& image)
{
    return QIcon(QPixmap::fromImage(image));
}

bool near(const QColor& a, const QColor& b, int tolerance = 3)
{
    return std::abs(a.red() - b.red()) <= tolerance && std::abs(a.green() - b.green()) <= tolerance
        && std::abs(a.blue() - b.blue()) <= tolerance && std::abs(a.alpha() - b.alpha()) <= 1;
}

QRect opaquePart(const QImage& image)
{
    QRect part;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (qAlpha(image.pixel(x, y)) != 0) {
                part |= QRect(x, y, 1, 1);
            }
        }
    }
    return part;
}
}

class TestFadingWidget : public zelkovtest::TestCase
{
    Q_OBJECT

    QTemporaryDir m_dir;

    QString saved(const QString& name, const QImage& image)
    {
        const QString file = m_dir.filePath(name);
        return image.save(file) ? file : QString();
    }

private Q_SLOTS:
    void itStartsIdleWithAnAlphaOfFifty()
    {
        Button low(nullptr, 16, 0, 128);
        QCOMPARE(low.alpha(), 50);
        QVERIFY(!low.runs());
        QVERIFY(!low.m_once);
        QVERIFY(!low.hasOverlay());
        QVERIFY(!low.badge().hasBadge());
        QVERIFY(!low.paintSelf(nullptr));
        Button high(nullptr, 16, 100, 200);
        QCOMPARE(high.alpha(), 50);
        QCOMPARE(high.m_color.rgb(), QColor(200, 100, 50).rgb());
        QCOMPARE(high.badge().parent(), &high);
    }

    void anIdleWidgetOpensNoPainter()
    {
        Button button;
        button.FadingWidget::paintEvent(nullptr); // a painter outside of a paint event would warn
        QCOMPARE(button.alpha(), 50);
        QCOMPARE(opaquePart(button.frame()), QRect());
        QVERIFY(button.m_rect.isNull());
    }

    void theAlphaMovesOneStepInEachPaintedFrameAndTurnsAtTheLimits()
    {
        Button button(nullptr, 16, 0, 48);
        button.startFading();
        QCOMPARE(button.alpha(), 0);
        QCOMPARE(button.m_timer.interval(), 100);
        QVERIFY(!button.m_timer.isSingleShot());
        QCOMPARE(button.alphas(9), QVector<int>({16, 32, 48, 32, 16, 0, 16, 32, 48}));
        QVERIFY(button.runs());
    }

    void aStepThatDoesNotDivideTheDistancePassesTheLimitByLessThanAStep()
    {
        Button button(nullptr, 16, 10, 50);
        button.setIcon(iconOf(shape()));
        button.startFading();
        QCOMPARE(button.alphas(7), QVector<int>({26, 42, 58, 42, 26, 10, 26}));
        QCOMPARE(button.m_tinted.size(), 4);
        Button below(nullptr, 16, 10, 50);
        below.setIcon(iconOf(shape()));
        below.fadeOnce();
        QCOMPARE(below.alphas(2), QVector<int>({34, 18}));
        below.frame(); // to 2, which is under the limit: the end
        QVERIFY(!below.runs());
        QCOMPARE(below.alpha(), 10);
    }

    void limitsAtTheEndsOfTheScaleAreMet()
    {
        Button button(nullptr, 100, 0, 255);
        button.setIcon(iconOf(shape()));
        button.startFading();
        QCOMPARE(button.alphas(7), QVector<int>({100, 200, 255, 155, 55, 0, 100}));
    }

    void startingARunningPulseDoesNothing()
    {
        Button button;
        button.startFading();
        button.alphas(3);
        button.startFading();
        button.fadeOnce();
        QCOMPARE(button.alpha(), 48);
        QVERIFY(!button.m_once);
        QCOMPARE(button.m_step, 16);
    }

    void stoppingTakesTheTintAwayAndRepaints()
    {
        Button button(nullptr, 16, 8, 40);
        button.setIcon(iconOf(shape()));
        button.show();
        QVERIFY(QTest::qWaitForWindowExposed(&button));
        button.startFading();
        while (button.m_step > 0) {
            button.frame();
        }
        QCoreApplication::processEvents();
        const int before = button.paints;
        button.stopFading();
        QVERIFY(!button.runs());
        QCOMPARE(button.alpha(), 8);
        QCOMPARE(button.m_step, 16);
        QTRY_VERIFY(button.paints > before);
        QCOMPARE(opaquePart(button.frame()), QRect());
    }

    void stoppingAnIdlePulseDoesNothing()
    {
        Button button;
        button.setAlpha(77);
        button.stopFading();
        QCOMPARE(button.alpha(), 77);
    }

    void fadeOnceFallsFromTheUpperLimitAndStopsAtTheLower()
    {
        Button button(nullptr, 16, 0, 48);
        button.fadeOnce();
        QCOMPARE(button.alpha(), 48);
        QCOMPARE(button.m_step, -16);
        QCOMPARE(button.alphas(2), QVector<int>({32, 16}));
        QVERIFY(button.runs());
        button.frame();
        QVERIFY(!button.runs());
        QCOMPARE(button.alpha(), 0);
        QCOMPARE(button.m_step, 16);
        button.fadeOnce();
        QCOMPARE(button.alphas(2), QVector<int>({32, 16}));
    }

    void afterOneFallEveryPulseIsASingleRise()
    {
        Button button(nullptr, 16, 0, 48);
        button.fadeOnce();
        button.alphas(3);
        button.startFading();
        QCOMPARE(button.alphas(2), QVector<int>({16, 32}));
        QVERIFY(button.runs());
        button.frame();
        QVERIFY(!button.runs());
        QCOMPARE(button.alpha(), 0);
        QVERIFY(button.m_once);
        button.stopFading();
        QVERIFY(button.m_once);
    }

    void theSignOfTheStepIsKeptWhenTheTimerWasStoppedFromOutside()
    {
        Button button(nullptr, 16, 0, 48);
        button.startFading();
        button.alphas(4);
        QCOMPARE(button.m_step, -16);
        button.m_timer.stop();
        button.fadeOnce();
        QCOMPARE(button.m_step, 16);
        button.frame();
        QVERIFY(!button.runs());

        Button falling(nullptr, 16, 0, 48);
        falling.startFading();
        falling.alphas(4);
        falling.m_timer.stop();
        falling.startFading();
        QCOMPARE(falling.alphas(3), QVector<int>({0, 16, 32}));
    }

    void theTimerOnlyAsksForRepaints()
    {
        Button button(nullptr, 16, 0, 128, Qt::red, 10);
        button.startFading();
        QSignalSpy ticks(&button.m_timer, &QTimer::timeout);
        QVERIFY(ticks.wait());
        QVERIFY(ticks.wait());
        QCOMPARE(button.alpha(), 0); // hidden, so nothing was painted
        button.show();
        QTRY_VERIFY(button.alpha() > 0);
    }

    void aStepOfZeroAndOtherNonsenseDoNoHarm_data()
    {
        QTest::addColumn<int>("step");
        QTest::addColumn<int>("minAlpha");
        QTest::addColumn<int>("maxAlpha");
        const int least = std::numeric_limits<int>::min();
        const int most = std::numeric_limits<int>::max();
        QTest::newRow("step 0") << 0 << 0 << 128;
        QTest::newRow("step 1 far from 0") << 1 << -100000 << 128;
        QTest::newRow("least") << least << least << least;
        QTest::newRow("most") << most << most << most;
        QTest::newRow("everything") << 1 << least << most;
        QTest::newRow("turned round") << 16 << 128 << 0;
        QTest::newRow("negative step") << -16 << 0 << 128;
    }
    void aStepOfZeroAndOtherNonsenseDoNoHarm()
    {
        QFETCH(int, step);
        QFETCH(int, minAlpha);
        QFETCH(int, maxAlpha);
        Button button(nullptr, step, minAlpha, maxAlpha, Qt::red, -5);
        button.setIcon(iconOf(shape()));
        button.startFading();
        button.alphas(40);
        button.setAlpha(-1);
        button.frame();
        button.setAlpha(1000);
        button.frame();
        button.stopFading();
        button.fadeOnce();
        button.alphas(40);
    }

    // The tint.

    void theTintHasTheShapeOfTheIconAndTheColourWithTheSmallerAlpha()
    {
        for (const QImage::Format format : {QImage::Format_ARGB32, QImage::Format_ARGB32_Premultiplied}) {
            Button button(nullptr, 16, 0, 128);
            button.setIconSize(QSize(16, 16));
            button.setIcon(iconOf(shape(QSize(16, 16), format)));
            button.startFading();
            QCOMPARE(opaquePart(button.frame()), QRect()); // level 0
            button.alphas(3);
            QCOMPARE(button.alpha(), 64);
            const QImage image = button.frame();
            QCOMPARE(button.m_rect, QRect(22, 12, 16, 16));
            QCOMPARE(opaquePart(image), QRect(22, 12, 8, 16));
            QVERIFY(near(image.pixelColor(25, 20), QColor(200, 100, 50, 64)));
            QVERIFY(near(image.pixelColor(22, 20), QColor(200, 100, 50, 20), 10));
        }
    }

    void aPictureWithoutAlphaIsTintedAsARectangle()
    {
        QImage opaque(16, 16, QImage::Format_RGB32);
        opaque.fill(Qt::green);
        Button button;
        button.setIconSize(QSize(16, 16));
        button.setIcon(iconOf(opaque));
        button.startFading();
        button.alphas(4);
        const QImage image = button.frame();
        QCOMPARE(opaquePart(image), QRect(22, 12, 16, 16));
        QVERIFY(near(image.pixelColor(30, 20), QColor(200, 100, 50, 64)));
    }

    void anOddPictureIsCentredToTheHalfPixel_data()
    {
        QTest::addColumn<QSize>("size");
        QTest::addColumn<QPoint>("topLeft");
        // In a widget of 60 x 40.
        QTest::newRow("even") << QSize(16, 12) << QPoint(22, 14);
        QTest::newRow("odd width") << QSize(15, 12) << QPoint(23, 14);
        QTest::newRow("odd height") << QSize(16, 11) << QPoint(22, 15);
        QTest::newRow("both odd") << QSize(15, 11) << QPoint(23, 15);
    }
    void anOddPictureIsCentredToTheHalfPixel()
    {
        QFETCH(QSize, size);
        QFETCH(QPoint, topLeft);
        QImage opaque(size, QImage::Format_ARGB32);
        opaque.fill(Qt::green);
        Button button;
        button.setIconSize(QSize(30, 30));
        button.setIcon(iconOf(opaque));
        button.startFading();
        button.alphas(4);
        QCOMPARE(opaquePart(button.frame()), QRect(topLeft, size));
    }

    void theShapeIsTakenNormalAndOff()
    {
        QImage other(16, 16, QImage::Format_ARGB32);
        other.fill(Qt::black);
        QIcon icon = iconOf(shape());
        icon.addPixmap(QPixmap::fromImage(other), QIcon::Normal, QIcon::On);
        icon.addPixmap(QPixmap::fromImage(other), QIcon::Disabled, QIcon::Off);
        Button button;
        button.setIconSize(QSize(16, 16));
        button.setIcon(icon);
        button.setCheckable(true);
        button.setChecked(true);
        button.setEnabled(false);
        button.startFading();
        button.alphas(4);
        QCOMPARE(opaquePart(button.frame()).width(), 8);
    }

    void eachLevelIsTintedOnceAndKept()
    {
        Button button;
        button.setIcon(iconOf(shape()));
        button.startFading();
        QCOMPARE(button.m_tinted.size(), 0);
        button.alphas(16);
        QCOMPARE(button.m_tinted.size(), 9);
        QVector<qint64> keys;
        for (const QImage& image : qAsConst(button.m_tinted)) {
            QVERIFY(!image.isNull());
            keys << image.cacheKey();
        }
        button.alphas(40);
        QVector<qint64> later;
        for (const QImage& image : qAsConst(button.m_tinted)) {
            later << image.cacheKey();
        }
        QCOMPARE(later, keys);
    }

    void theFirstShapeStays()
    {
        Button button;
        button.setIconSize(QSize(16, 16));
        button.setIcon(iconOf(shape()));
        button.startFading();
        button.alphas(3);
        QImage other(16, 16, QImage::Format_ARGB32);
        other.fill(Qt::black);
        button.setIcon(iconOf(other));
        button.stopFading();
        button.resize(100, 100);
        button.startFading();
        button.alphas(4);
        QCOMPARE(opaquePart(button.frame()), QRect(22, 12, 8, 16));
    }

    void withoutAShapeThePulseRunsUnseenAndDoesNotSearchAgain()
    {
        Button button;
        button.startFading();
        button.alphas(4);
        QVERIFY(button.m_image.isNull());
        QVERIFY(!button.m_rect.isNull());
        button.setIcon(iconOf(shape()));
        QCOMPARE(opaquePart(button.frame()), QRect());
        QCOMPARE(button.alpha(), 80);
    }

    void aWidgetThatIsNoButtonPulsesUnseenOverItsWholeArea()
    {
        Area area;
        area.startFading();
        QCOMPARE(area.alphas(3), QVector<int>({16, 32, 48}));
        QCOMPARE(area.m_rect, QRect(0, 0, 60, 40));
        QCOMPARE(opaquePart(area.frame()), QRect());
    }

    // The search in the style sheets.

    void thePictureOfTheStyleSheetIsFound_data()
    {
        QTest::addColumn<QString>("sheet"); // FILE stands for the picture
        QTest::addColumn<int>("state");     // 0 plain, 1 disabled, 2 checked, 3 checkable, 4 checked and disabled
        QTest::addColumn<bool>("found");
        const QString plain = QStringLiteral("QPushButton#bell { image: url(FILE); }");
        const QString disabled = QStringLiteral("#bell:disabled { image: url(FILE); }");
        const QString checked = QStringLiteral("#bell:checked { image: url(FILE); }");
        QTest::newRow("plain") << plain << 0 << true;
        QTest::newRow("plain, disabled button") << plain << 1 << false;
        QTest::newRow("plain, checked button") << plain << 2 << false;
        QTest::newRow("plain, checkable button") << plain << 3 << true;
        QTest::newRow("disabled") << disabled << 1 << true;
        QTest::newRow("disabled, plain button") << disabled << 0 << true;
        QTest::newRow("checked") << checked << 2 << true;
        QTest::newRow("checked, disabled button") << checked << 4 << false;
        QTest::newRow("disabled, checked and disabled") << disabled << 4 << true;
        QTest::newRow("name of another") << QStringLiteral("#horn { image: url(FILE); }") << 0 << false;
        QTest::newRow("case matters") << QStringLiteral("#BELL { image: url(FILE); }") << 0 << false;
        QTest::newRow("state before the name")
            << QStringLiteral("QPushButton:disabled #bell { image: url(FILE); }") << 1 << false;
        QTest::newRow("blanks") << QStringLiteral("#bell{\n image: \t url(FILE) ;\n}\n") << 0 << true;
        QTest::newRow("no semicolon") << QStringLiteral("#bell { image: url(FILE) }") << 0 << false;
        QTest::newRow("after others") << QStringLiteral("#horn { color: red; } #bell { color: red; image: url(FILE); }")
                                      << 0 << true;
        QTest::newRow("border image") << QStringLiteral("#bell { border-image: url(FILE); }") << 0 << true;
        QTest::newRow("picture of a later rule")
            << QStringLiteral("#bell { color: red; } #horn { image: url(FILE); }") << 0 << true;
        QTest::newRow("first of two pictures")
            << QStringLiteral("#bell { image: url(FILE); } #horn { image: url(none.png); }") << 0 << true;
        QTest::newRow("name after the picture")
            << QStringLiteral("#horn { image: url(FILE); } #bell { color: red; }") << 0 << false;
        QTest::newRow("quoted") << QStringLiteral("#bell { image: url(\"FILE\"); }") << 0 << false;
    }
    void thePictureOfTheStyleSheetIsFound()
    {
        QFETCH(QString, sheet);
        QFETCH(int, state);
        QFETCH(bool, found);
        const QString file = saved(QStringLiteral("bell.png"), shape());
        Button button;
        button.setObjectName(QStringLiteral("bell"));
        button.setStyleSheet(sheet.replace(QStringLiteral("FILE"), file));
        button.setCheckable(state >= 2);
        button.setChecked(state == 2 || state == 4);
        button.setEnabled(state != 1 && state != 4);
        button.startFading();
        button.alphas(4);
        QCOMPARE(!button.m_image.isNull(), found);
        QCOMPARE(opaquePart(button.frame()), found ? QRect(22, 12, 8, 16) : QRect());
    }

    void theFirstSheetUpwardsIsTheOnlyOneAsked()
    {
        const QString file = saved(QStringLiteral("bell.png"), shape());
        const QString sheet = QStringLiteral("#bell { image: url(%1); }").arg(file);
        QWidget top;
        top.setStyleSheet(sheet);
        auto* middle = new QWidget(&top);
        auto* first = new Button(middle);
        first->setObjectName(QStringLiteral("bell"));
        first->startFading();
        first->frame();
        QVERIFY(!first->m_image.isNull());

        auto* second = new Button(middle);
        second->setObjectName(QStringLiteral("bell"));
        second->setStyleSheet(QStringLiteral("color: red;"));
        second->startFading();
        second->frame();
        QVERIFY(second->m_image.isNull());

        middle->setStyleSheet(QStringLiteral("QLabel { color: red; }"));
        auto* third = new Button(middle);
        third->setObjectName(QStringLiteral("bell"));
        third->startFading();
        third->frame();
        QVERIFY(third->m_image.isNull());
    }

    void theSheetOfTheApplicationIsNotAsked()
    {
        const QString file = saved(QStringLiteral("bell.png"), shape());
        qApp->setStyleSheet(QStringLiteral("#bell { image: url(%1); }").arg(file));
        Button button;
        button.setObjectName(QStringLiteral("bell"));
        button.startFading();
        button.frame();
        QVERIFY(button.m_image.isNull());
        qApp->setStyleSheet(QString());
    }

    void anIconIsPreferredToTheStyleSheet()
    {
        const QString file = saved(QStringLiteral("wide.png"), shape(QSize(30, 4)));
        Button button;
        button.setObjectName(QStringLiteral("bell"));
        button.setStyleSheet(QStringLiteral("#bell { image: url(%1); }").arg(file));
        button.setIconSize(QSize(16, 16));
        button.setIcon(iconOf(shape()));
        button.startFading();
        button.frame();
        QCOMPARE(button.m_image.size(), QSize(16, 16));
    }

    void theFoundFileIsLogged()
    {
        const QString file = saved(QStringLiteral("bell.png"), shape());
        zelkovtest::LogCapture log(1);
        Button button;
        button.setObjectName(QStringLiteral("bell"));
        button.setStyleSheet(QStringLiteral("#bell { image: url(%1); }").arg(file));
        button.startFading();
        button.alphas(20);
        QCOMPARE(log.messages(),
            QStringList(QStringLiteral("[vx::FadingWidget::preparePaint] FadingWidget::styleSheet url: \"%1\"").arg(file)));
    }

    void aFileThatCannotBeLoadedLeavesNoShape()
    {
        Button button;
        button.setObjectName(QStringLiteral("bell"));
        button.setIconSize(QSize(0, 0));
        zelkovtest::LogCapture log(1);
        button.setStyleSheet(QStringLiteral("#bell { image: url(%1); }").arg(m_dir.filePath(QStringLiteral("none.png"))));
        button.startFading();
        button.alphas(4);
        QVERIFY(button.m_image.isNull());
        QCOMPARE(log.lines().size(), 1);
    }

    void aNameThatIsNoPatternFindsNothing()
    {
        const QString file = saved(QStringLiteral("bell.png"), shape());
        Button button;
        button.setObjectName(QStringLiteral("bell[("));
        button.setStyleSheet(QStringLiteral("QPushButton { image: url(%1); }").arg(file));
        button.startFading();
        button.frame();
        QVERIFY(button.m_image.isNull());
    }

    // Overlay and badge.

    void theOverlayStandsWhereItIsAligned_data()
    {
        QTest::addColumn<Qt::Alignment>("alignment");
        QTest::addColumn<QPoint>("offset");
        QTest::addColumn<QPoint>("topLeft");
        using Alignment = Qt::Alignment;
        // 10 x 6 in 60 x 40.
        QTest::newRow("top left") << Alignment(Qt::AlignTop | Qt::AlignLeft) << QPoint() << QPoint(0, 0);
        QTest::newRow("bottom right") << Alignment(Qt::AlignBottom | Qt::AlignRight) << QPoint() << QPoint(50, 34);
        QTest::newRow("centre") << Alignment(Qt::AlignCenter) << QPoint() << QPoint(25, 17);
        QTest::newRow("moved") << Alignment(Qt::AlignBottom | Qt::AlignRight) << QPoint(-3, -4) << QPoint(47, 30);
        QTest::newRow("absolute") << Alignment(Qt::AlignAbsolute) << QPoint(7, 9) << QPoint(7, 9);
        QTest::newRow("absolute wins") << Alignment(Qt::AlignAbsolute | Qt::AlignRight) << QPoint(7, 9) << QPoint(7, 9);
    }
    void theOverlayStandsWhereItIsAligned()
    {
        QFETCH(Qt::Alignment, alignment);
        QFETCH(QPoint, offset);
        QFETCH(QPoint, topLeft);
        QImage overlay(10, 6, QImage::Format_ARGB32);
        overlay.fill(Qt::blue);
        Button button;
        button.setLayoutDirection(Qt::RightToLeft);
        button.setOverlay(saved(QStringLiteral("overlay.png"), overlay), alignment, offset);
        QVERIFY(button.hasOverlay());
        const QImage image = button.frame();
        QCOMPARE(opaquePart(image), QRect(topLeft, QSize(10, 6)));
        QCOMPARE(image.pixelColor(topLeft), QColor(Qt::blue));
        QCOMPARE(button.alpha(), 50);
        button.resize(100, 100);
        QCOMPARE(opaquePart(button.frame()), QRect(topLeft, QSize(10, 6)));
    }

    void anAbsolutePlaceKeepsTheSizeOfTheRectangle()
    {
        QImage overlay(10, 6, QImage::Format_ARGB32);
        overlay.fill(Qt::blue);
        const QString file = saved(QStringLiteral("overlay.png"), overlay);
        Button button;
        button.setOverlay(file, Qt::AlignCenter, QPoint());
        button.setOverlay(file, Qt::AlignAbsolute, QPoint(1, 2));
        QCOMPARE(button.m_overlayRect, QRect(1, 2, 10, 6));
    }

    void anEmptyFileTakesTheOverlayAway()
    {
        QImage overlay(10, 6, QImage::Format_ARGB32);
        overlay.fill(Qt::blue);
        Button button;
        button.setOverlay(saved(QStringLiteral("overlay.png"), overlay), Qt::AlignCenter, QPoint());
        button.setOverlay(QString(), Qt::AlignCenter, QPoint());
        QVERIFY(!button.hasOverlay());
        QCOMPARE(opaquePart(button.frame()), QRect());
        button.setOverlay(m_dir.filePath(QStringLiteral("none.png")), Qt::AlignCenter, QPoint());
        QVERIFY(!button.hasOverlay());
    }

    void settingTheOverlayRepaints()
    {
        Button button;
        button.show();
        QVERIFY(QTest::qWaitForWindowExposed(&button));
        QCoreApplication::processEvents();
        const int before = button.paints;
        button.setOverlay(QString(), Qt::AlignCenter, QPoint());
        QTRY_VERIFY(button.paints > before);
    }

    void theBadgeStandsTopRightAboveTheOverlay()
    {
        QImage overlay(60, 40, QImage::Format_ARGB32);
        overlay.fill(Qt::blue);
        Button button;
        button.badge().setBadgeBackground(Qt::green);
        button.badge().setBadgeLabel(QString(), false);
        QCOMPARE(opaquePart(button.frame()), QRect(40, 0, 20, 20));
        button.setOverlay(saved(QStringLiteral("full.png"), overlay), Qt::AlignCenter, QPoint());
        const QImage image = button.frame();
        QCOMPARE(image.pixelColor(50, 10), QColor(Qt::green));
        QCOMPARE(image.pixelColor(5, 35), QColor(Qt::blue));
    }

    void theOverlayStandsAboveTheTint()
    {
        QImage overlay(60, 40, QImage::Format_ARGB32);
        overlay.fill(Qt::blue);
        Button button;
        button.setIcon(iconOf(shape()));
        button.setOverlay(saved(QStringLiteral("full.png"), overlay), Qt::AlignCenter, QPoint());
        button.startFading();
        button.alphas(5);
        QCOMPARE(button.frame().pixelColor(25, 20), QColor(Qt::blue));
    }

    // Life.

    void aWidgetMayGoWhileItPulses()
    {
        auto* button = new Button(nullptr, 16, 0, 128, Qt::red, 1);
        button->badge().setBadgeBusy(true);
        button->show();
        button->startFading();
        QVERIFY(QTest::qWaitForWindowExposed(button));
        delete button;
        QCoreApplication::processEvents();
    }

    void withoutAWidgetItDoesNothing()
    {
        vx::FadingWidget nobody(nullptr, 100, 16, Qt::red, 0, 128);
        nobody.startFading();
        nobody.paintEvent(nullptr);
        nobody.setOverlay(QString(), Qt::AlignCenter, QPoint());
        nobody.badge().setBadgeLabel(QStringLiteral("1"), false);
        nobody.paintEvent(nullptr);
        nobody.stopFading();
    }
};

ZELKOV_TEST_MAIN(TestFadingWidget)
#include "tst_fadingwidget.moc"
