// SPDX-License-Identifier: MIT
// Widgets that paint themselves with the opacity of their fader.
#include "TestCase.h"
#include "TestMain.h"
#include "foundation/FadableThing.h"

#include <QtGui/QPainter>
#include <QtTest/QtTest>
#include <QtWidgets/QGraphicsOpacityEffect>

#include <cmath>

namespace
{
class Panel : public FadableThing<QWidget>
{
    Q_OBJECT

public:
    using FadableThing::FadableThing;
    int draws = 0;
    double opacity = -1.0;

protected:
    void draw(QPaintEvent* event, QPainter& painter) override
    {
        ++draws;
        FadableThing::draw(event, painter);
        opacity = painter.opacity();
    }
};

/// What the widget paints, over nothing.
QImage picture(QWidget& widget, QWidget::RenderFlags flags = {})
{
    QImage image(widget.size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    widget.render(&image, QPoint(), QRegion(), flags);
    return image;
}
}

class TestFadableThing : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theFaderBelongsToTheWidgetAndIsLinear()
    {
        QWidget parent;
        auto* panel = new Panel(&parent);
        QCOMPARE(panel->parentWidget(), &parent);
        QVERIFY(panel->fader() != nullptr);
        QCOMPARE(panel->fader()->parent(), panel);
        QCOMPARE(panel->fader()->easingCurve().type(), QEasingCurve::Linear);
        QCOMPARE(panel->fader()->getOpacity(), 0.0);
    }

    void theStyleSheetIsPaintedWithTheOpacity_data()
    {
        QTest::addColumn<double>("opacity");
        for (const double opacity : {0.0, 0.25, 0.5, 1.0}) {
            QTest::newRow(qPrintable(QString::number(opacity))) << opacity;
        }
    }
    void theStyleSheetIsPaintedWithTheOpacity()
    {
        QFETCH(double, opacity);
        Panel panel(nullptr);
        panel.resize(20, 20);
        panel.setStyleSheet(QStringLiteral("Panel { background: rgb(200, 40, 20); }"));
        panel.fader()->setOpacity(opacity);
        const QColor pixel = picture(panel).pixelColor(10, 10);
        QCOMPARE(panel.draws, 1);
        QVERIFY(std::abs(pixel.alpha() - qRound(opacity * 255)) <= 1);
        QVERIFY(std::abs(panel.opacity - opacity) < 0.01);
        if (opacity > 0.0) {
            QVERIFY(std::abs(pixel.red() - 200) <= 3);
        }
    }

    void aFadeChangesWhatIsPainted()
    {
        Panel panel(nullptr);
        panel.resize(20, 20);
        panel.setStyleSheet(QStringLiteral("Panel { background: red; }"));
        panel.fader()->fadeIn();
        panel.fader()->setCurrentTime(500);
        QVERIFY(std::abs(picture(panel).pixelColor(10, 10).alpha() - 128) <= 2);
        panel.fader()->setCurrentTime(1000);
        QCOMPARE(picture(panel).pixelColor(10, 10).alpha(), 255);
    }

    void childrenFadeOnlyThroughTheEffect()
    {
        QWidget host;
        host.resize(20, 20);
        Panel panel(&host);
        panel.resize(20, 20);
        QWidget child(&panel);
        child.setGeometry(0, 0, 10, 20);
        child.setAutoFillBackground(true);
        QCOMPARE(picture(host, QWidget::DrawChildren).pixelColor(5, 5).alpha(), 255);
        panel.fader()->setFadeChildren(true);
        panel.fader()->setOpacity(0.5);
        QVERIFY(std::abs(picture(host, QWidget::DrawChildren).pixelColor(5, 5).alpha() - 128) <= 2);
    }

    void whileTheEffectFadesNothingIsDrawnByHand()
    {
        Panel panel(nullptr);
        panel.resize(20, 20);
        panel.fader()->setFadeChildren(true);
        picture(panel);
        QCOMPARE(panel.draws, 0);
        panel.fader()->setFadeChildren(false);
        picture(panel);
        QCOMPARE(panel.draws, 1);
    }

    void deletingItInMidFadeIsFine()
    {
        for (const bool children : {false, true}) {
            auto* panel = new Panel(nullptr);
            panel->fader()->setFadeChildren(children);
            panel->fader()->fadeIn();
            QVERIFY(QTest::qWaitForWindowExposed(panel));
            delete panel;
            QCoreApplication::processEvents();
        }
    }

    void deletingItInTheSlotOfItsFaderIsFine()
    {
        QPointer<Panel> panel = new Panel(nullptr);
        panel->fader()->setFadingTimes(20, 20);
        connect(panel->fader(), &OpacityAnimation::didFadeOut, this, [&] { delete panel.data(); });
        panel->show();
        panel->fader()->fadeOut();
        QTRY_VERIFY(panel == nullptr);
    }
};

ZELKOV_TEST_MAIN(TestFadableThing)
#include "tst_fadablething.moc"
