// SPDX-License-Identifier: MIT
// Fades of a widget: values, ends, interruptions in every combination, with and without an effect.
#include "TestCase.h"
#include "TestMain.h"
#include "foundation/OpacityAnimation.h"
#include "support/LogCapture.h"
#include "support/SignalRecorder.h"

#include <QtCore/QMetaMethod>
#include <QtTest/QtTest>
#include <QtWidgets/QGraphicsBlurEffect>
#include <QtWidgets/QGraphicsOpacityEffect>

#include <cmath>
#include <functional>
#include <memory>

using zelkovtest::SignalRecorder;

namespace
{
/// Counts its paints and does what it is told when it is shown or hidden.
class Canvas : public QWidget
{
public:
    using QWidget::QWidget;
    int paints = 0;
    std::function<void()> onShow;
    std::function<void()> onHide;

protected:
    void paintEvent(QPaintEvent* /*event*/) override { ++paints; }
    void showEvent(QShowEvent* /*event*/) override
    {
        if (onShow) {
            onShow();
        }
    }
    void hideEvent(QHideEvent* /*event*/) override
    {
        if (onHide) {
            onHide();
        }
    }
};

class Overriding : public OpacityAnimation
{
public:
    using OpacityAnimation::OpacityAnimation;
    QStringList calls;
    void fadedOut() override
    {
        calls << QStringLiteral("out");
        OpacityAnimation::fadedOut();
    }
    void fadedIn() override
    {
        calls << QStringLiteral("in");
        OpacityAnimation::fadedIn();
    }
};

const QStringList s_in{QStringLiteral("didFadeIn")};
const QStringList s_out{QStringLiteral("didFadeOut")};

bool near(double a, double b)
{
    return std::abs(a - b) < 1e-6;
}

QGraphicsOpacityEffect* effectOf(const QWidget& widget)
{
    return qobject_cast<QGraphicsOpacityEffect*>(widget.graphicsEffect());
}

/// Jumps to the end of the running fade, as the animation timer would.
void finish(OpacityAnimation& fader)
{
    fader.setCurrentTime(fader.duration());
}
}

class TestOpacityAnimation : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aNewAnimationHasTheDefaults()
    {
        QWidget widget;
        auto* fader = new OpacityAnimation(&widget);
        QCOMPARE(fader->parent(), &widget);
        QCOMPARE(fader->targetObject(), fader);
        QCOMPARE(fader->propertyName(), QByteArray("opacity"));
        QCOMPARE(fader->getOpacity(), 0.0);
        QVERIFY(fader->autoHide());
        QVERIFY(!fader->fadeChildren());
        QVERIFY(!fader->startValue().isValid());
        QCOMPARE(fader->easingCurve().type(), QEasingCurve::Linear);
        QCOMPARE(int(OpacityAnimation::s_FadeInTime), 1000);
        QCOMPARE(int(OpacityAnimation::s_FadeOutTime), 350);
        QVERIFY(!widget.isVisible());
    }

    void targetAndPropertyGivenToTheConstructorAreReplaced()
    {
        QWidget widget;
        widget.setGeometry(1, 2, 30, 40);
        auto* fader = new OpacityAnimation(&widget, "geometry", &widget);
        QCOMPARE(fader->targetObject(), fader);
        QCOMPARE(fader->propertyName(), QByteArray("opacity"));
        fader->fadeIn();
        finish(*fader);
        QCOMPARE(fader->getOpacity(), 1.0);
        QCOMPARE(widget.size(), QSize(30, 40));
    }

    void theConstructorTakesAwayTheEffectOfTheWidget()
    {
        QWidget widget;
        QPointer<QGraphicsBlurEffect> blur = new QGraphicsBlurEffect;
        widget.setGraphicsEffect(blur);
        new OpacityAnimation(&widget);
        QVERIFY(blur == nullptr);
        QVERIFY(widget.graphicsEffect() == nullptr);
    }

    void signalsAndSlotsKeepTheirOrder()
    {
        const QMetaObject& meta = OpacityAnimation::staticMetaObject;
        QList<QByteArray> found;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
            found << meta.method(i).methodSignature();
        }
        const QList<QByteArray> expected{
            "didFadeIn()", "didFadeOut()", "fadedOut()", "fadedIn()", "onValueChanged(QVariant)"};
        QCOMPARE(found, expected);
        const QMetaProperty property = meta.property(meta.indexOfProperty("opacity"));
        QCOMPARE(property.typeName(), "double");
        QVERIFY(property.isWritable());
    }

    void fadeInShowsAHiddenWidgetAtOpacityZero()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        fader.setOpacity(0.8);
        fader.fadeIn();
        QVERIFY(widget.isVisible());
        QCOMPARE(fader.getOpacity(), 0.0);
        QCOMPARE(fader.state(), QAbstractAnimation::Running);
        QCOMPARE(fader.duration(), 1000);
        fader.setCurrentTime(250);
        QVERIFY(near(fader.getOpacity(), 0.25));
    }

    void fadeInOfAVisibleWidgetRisesFromItsOpacityOverTheFullTime()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        SignalRecorder recorder(&fader);
        widget.show();
        fader.setOpacity(0.4);
        fader.fadeIn();
        QVERIFY(near(fader.getOpacity(), 0.4));
        QCOMPARE(fader.duration(), 1000);
        fader.setCurrentTime(500);
        QVERIFY(near(fader.getOpacity(), 0.7));
        fader.setCurrentTime(999);
        QVERIFY(fader.getOpacity() < 1.0);
        QCOMPARE(recorder.names(), QStringList());
        fader.setCurrentTime(1000);
        QCOMPARE(fader.getOpacity(), 1.0);
        QCOMPARE(recorder.names(), s_in);
    }

    void fadeOutFallsFromThePresentOpacityOverTheFullTime()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        SignalRecorder recorder(&fader);
        widget.show();
        fader.setOpacity(0.5);
        fader.fadeOut();
        QCOMPARE(fader.duration(), 350);
        fader.setCurrentTime(175);
        QVERIFY(near(fader.getOpacity(), 0.25));
        fader.setCurrentTime(349);
        QVERIFY(widget.isVisible());
        QCOMPARE(recorder.names(), QStringList());
        fader.setCurrentTime(350);
        QCOMPARE(fader.getOpacity(), 0.0);
        QVERIFY(!widget.isVisible());
        QCOMPARE(recorder.names(), s_out);
    }

    void slotsOfDidFadeOutSeeAHiddenWidget()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        widget.show();
        int calls = 0;
        connect(&fader, &OpacityAnimation::didFadeOut, &widget, [&] {
            ++calls;
            QVERIFY(widget.isHidden());
        });
        fader.fadeOut();
        finish(fader);
        QCOMPARE(calls, 1);
    }

    void withoutAutoHideTheWidgetStaysVisibleAtOpacityZero()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        SignalRecorder recorder(&fader);
        fader.setAutoHide(false);
        QVERIFY(!fader.autoHide());
        widget.show();
        fader.setOpacity(1.0);
        fader.fadeOut();
        finish(fader);
        QVERIFY(widget.isVisible());
        QCOMPARE(fader.getOpacity(), 0.0);
        QCOMPARE(recorder.names(), s_out);
    }

    void fadesRunInRealTime()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        fader.setFadingTimes(80, 60);
        SignalRecorder recorder(&fader);
        QElapsedTimer clock;
        clock.start();
        fader.fadeIn();
        QTRY_COMPARE(recorder.names(), s_in);
        QVERIFY(clock.elapsed() >= 70);
        fader.fadeOut();
        QTRY_COMPARE(recorder.names(), s_in + s_out);
        QVERIFY(widget.isHidden());
    }

    void everyInterruptionEndsWithOneSignal_data()
    {
        QTest::addColumn<QString>("steps");
        QTest::addColumn<QStringList>("expected");
        const QStringList none;
        // i and o start a fade, a digit goes on to so many tenths of it, e to its end, s stops it, h hides.
        QTest::newRow("in") << "ie" << s_in;
        QTest::newRow("out") << "oe" << s_out;
        QTest::newRow("in, in at once") << "iie" << s_in;
        QTest::newRow("in, in halfway") << "i5ie" << s_in;
        QTest::newRow("out, out at once") << "ooe" << s_out;
        QTest::newRow("out, out halfway") << "o5oe" << s_out;
        QTest::newRow("out during in") << "i5oe" << s_out;
        QTest::newRow("out during in at once") << "ioe" << s_out;
        QTest::newRow("in during out") << "o5ie" << s_in;
        QTest::newRow("in during out at once") << "oie" << s_in;
        QTest::newRow("to and fro") << "i3o3i3o3i9o9ie" << s_in;
        QTest::newRow("fro and to") << "o3i3o3i3o9i9oe" << s_out;
        QTest::newRow("in, then out") << "ieoe" << s_in + s_out;
        QTest::newRow("out, then in") << "oeie" << s_out + s_in;
        QTest::newRow("in again when in") << "ieie" << s_in + s_in;
        QTest::newRow("out again when out") << "oeoe" << s_out + s_out;
        QTest::newRow("stopped in") << "i5s" << none;
        QTest::newRow("stopped out") << "o5s" << none;
        QTest::newRow("stopped, in again") << "i5sie" << s_in;
        QTest::newRow("stopped, then out") << "i5soe" << s_out;
        QTest::newRow("stopped out, then in") << "o5sie" << s_in;
        QTest::newRow("stopped after the end") << "ies" << s_in;
        QTest::newRow("hidden during in") << "i5he" << s_in;
        QTest::newRow("hidden during in, in again") << "i5hie" << s_in;
        QTest::newRow("hidden during out") << "o5he" << s_out;
        QTest::newRow("hidden during out, in") << "o5hie" << s_in;
    }
    void everyInterruptionEndsWithOneSignal()
    {
        QFETCH(QString, steps);
        QFETCH(QStringList, expected);
        for (const bool children : {false, true}) {
            QWidget widget;
            OpacityAnimation fader(&widget);
            fader.setFadeChildren(children);
            SignalRecorder recorder(&fader);
            widget.show();
            fader.setOpacity(0.5);
            for (const QChar step : steps) {
                const auto opacity = [&] { return children ? effectOf(widget)->opacity() : fader.getOpacity(); };
                const double before = opacity();
                const bool wasVisible = widget.isVisible();
                switch (step.toLatin1()) {
                case 'i':
                    fader.fadeIn();
                    QVERIFY(near(opacity(), wasVisible ? before : 0.0));
                    QCOMPARE(fader.duration(), 1000);
                    break;
                case 'o':
                    fader.fadeOut();
                    QVERIFY(near(opacity(), before));
                    QCOMPARE(fader.duration(), 350);
                    break;
                case 'e':
                    finish(fader);
                    break;
                case 's':
                    fader.stop();
                    QVERIFY(near(opacity(), before));
                    break;
                case 'h':
                    widget.hide();
                    break;
                default:
                    fader.setCurrentTime(fader.duration() * step.digitValue() / 10);
                }
            }
            QCOMPARE(recorder.names(), expected);
            QCOMPARE(fader.state(), QAbstractAnimation::Stopped);
        }
    }

    void anInterruptedFadeDoesNotReportLater()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        fader.setFadingTimes(40, 40);
        SignalRecorder recorder(&fader);
        fader.fadeIn();
        fader.fadeOut();
        QTRY_COMPARE(recorder.names(), s_out);
        QSignalSpy later(&fader, &OpacityAnimation::didFadeIn);
        QVERIFY(!later.wait(120));
        QCOMPARE(recorder.names(), s_out);
    }

    void newTimesDoNotAlterARunningFade()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        fader.fadeIn();
        fader.setFadingTimes(70, 30);
        QCOMPARE(fader.duration(), 1000);
        fader.fadeOut();
        QCOMPARE(fader.duration(), 30);
        fader.fadeIn();
        QCOMPARE(fader.duration(), 70);
    }

    void fadesWithoutTimeEndAtOnce_data()
    {
        QTest::addColumn<int>("time");
        QTest::newRow("zero") << 0;
        QTest::newRow("negative") << -5;
    }
    void fadesWithoutTimeEndAtOnce()
    {
        QFETCH(int, time);
        QWidget widget;
        OpacityAnimation fader(&widget);
        SignalRecorder recorder(&fader);
        fader.setFadingTimes(time, time);
        fader.fadeIn();
        QCOMPARE(fader.getOpacity(), 1.0);
        QCOMPARE(recorder.names(), s_in);
        fader.fadeOut();
        QCOMPARE(fader.getOpacity(), 0.0);
        QVERIFY(widget.isHidden());
        QCOMPARE(recorder.names(), s_in + s_out);
    }

    void overridesOfTheEndsAreCalled()
    {
        QWidget widget;
        Overriding fader(&widget);
        SignalRecorder recorder(&fader);
        fader.fadeIn();
        fader.fadeIn();
        finish(fader);
        fader.fadeOut();
        finish(fader);
        QCOMPARE(fader.calls, QStringList({QStringLiteral("in"), QStringLiteral("out")}));
        QCOMPARE(recorder.names(), s_in + s_out);
    }

    void eachValueRepaintsTheWidget()
    {
        Canvas widget;
        OpacityAnimation fader(&widget);
        widget.show();
        QVERIFY(QTest::qWaitForWindowExposed(&widget));
        fader.fadeIn();
        for (int time : {100, 200, 300}) {
            QCoreApplication::processEvents();
            const int before = widget.paints;
            fader.pause();
            fader.setCurrentTime(time);
            QTRY_VERIFY(widget.paints > before);
            fader.resume();
        }
        fader.stop();
        QCoreApplication::processEvents();
        const int before = widget.paints;
        fader.setOpacity(0.1);
        QCoreApplication::processEvents();
        QCOMPARE(widget.paints, before);
    }

    void theTracingSlotWritesTheValue()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        zelkovtest::LogCapture log(1);
        fader.fadeIn();
        fader.setCurrentTime(100);
        QCOMPARE(log.lines(), QStringList());
        connect(&fader, &QVariantAnimation::valueChanged, &fader, &OpacityAnimation::onValueChanged);
        fader.setCurrentTime(500);
        QCOMPARE(log.messages(), QStringList(QStringLiteral("[OpacityAnimation::onValueChanged] 0.5")));
    }

    // Through an effect.

    void theEffectTakesThePresentOpacityAndBecomesTheTarget()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        fader.setOpacity(0.3);
        fader.setFadeChildren(true);
        QVERIFY(fader.fadeChildren());
        QVERIFY(effectOf(widget) != nullptr);
        QVERIFY(near(effectOf(widget)->opacity(), 0.3));
        QCOMPARE(effectOf(widget)->parent(), &fader);
        QCOMPARE(fader.targetObject(), effectOf(widget));
        fader.setFadeChildren(false);
        QVERIFY(!fader.fadeChildren());
        QVERIFY(widget.graphicsEffect() == nullptr);
        QCOMPARE(fader.targetObject(), &fader);
    }

    void theEffectFadesWhileTheNumberStays()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        SignalRecorder recorder(&fader);
        fader.setFadeChildren(true);
        widget.show();
        fader.setOpacity(0.4);
        QVERIFY(near(effectOf(widget)->opacity(), 0.4));
        fader.fadeIn();
        fader.setCurrentTime(500);
        QVERIFY(near(effectOf(widget)->opacity(), 0.7));
        QVERIFY(near(fader.getOpacity(), 0.4));
        finish(fader);
        QCOMPARE(effectOf(widget)->opacity(), 1.0);
        fader.fadeOut();
        fader.setCurrentTime(175);
        QVERIFY(near(effectOf(widget)->opacity(), 0.5));
        finish(fader);
        QVERIFY(widget.isHidden());
        QVERIFY(near(fader.getOpacity(), 0.4));
        effectOf(widget)->setOpacity(0.9);
        fader.fadeIn();
        QCOMPARE(effectOf(widget)->opacity(), 0.0);
        QCOMPARE(fader.getOpacity(), 0.0);
        QCOMPARE(recorder.names(), s_in + s_out);
    }

    void anEffectInstalledMidFadeIsDrivenThroughTheNumber()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        SignalRecorder recorder(&fader);
        fader.fadeIn();
        fader.setCurrentTime(200);
        fader.setFadeChildren(true);
        QCOMPARE(fader.targetObject(), &fader);
        QVERIFY(near(effectOf(widget)->opacity(), 0.2));
        fader.setCurrentTime(600);
        QVERIFY(near(fader.getOpacity(), 0.6));
        QVERIFY(near(effectOf(widget)->opacity(), 0.6));
        finish(fader);
        QCOMPARE(recorder.names(), s_in);
    }

    void anEffectTakenAwayMidFadeEndsTheFadeAndTheNextOneRuns_data()
    {
        QTest::addColumn<int>("how");
        QTest::newRow("switched off") << 0;
        QTest::newRow("replaced by another") << 1;
        QTest::newRow("replaced by itself") << 2;
    }
    void anEffectTakenAwayMidFadeEndsTheFadeAndTheNextOneRuns()
    {
        QFETCH(int, how);
        QWidget widget;
        OpacityAnimation fader(&widget);
        SignalRecorder recorder(&fader);
        fader.setFadeChildren(true);
        fader.setFadingTimes(50, 50);
        fader.fadeIn();
        fader.setCurrentTime(20);
        if (how == 0) {
            fader.setFadeChildren(false);
        } else if (how == 1) {
            widget.setGraphicsEffect(new QGraphicsBlurEffect);
        } else {
            fader.setFadeChildren(true);
        }
        QTRY_COMPARE(fader.state(), QAbstractAnimation::Stopped);
        QCOMPARE(recorder.names(), QStringList());
        fader.fadeOut();
        finish(fader);
        QCOMPARE(recorder.names(), s_out);
        fader.fadeIn();
        finish(fader);
        QCOMPARE(recorder.names(), s_out + s_in);
        if (how == 2) {
            QCOMPARE(effectOf(widget)->opacity(), 1.0);
        } else {
            QCOMPARE(fader.getOpacity(), 1.0);
        }
    }

    void settingTheOpacityLeavesAForeignEffectAlone()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        auto* own = new QGraphicsOpacityEffect;
        own->setOpacity(0.6);
        widget.setGraphicsEffect(own);
        fader.setOpacity(0.2);
        QVERIFY(near(own->opacity(), 0.6));
        fader.fadeIn();
        QVERIFY(near(own->opacity(), 0.6));
    }

    // Slots that call back, and deaths.

    void aFadeStartedAtTheEndOfTheOtherRuns()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        fader.setFadingTimes(30, 30);
        SignalRecorder recorder(&fader);
        connect(&fader, &OpacityAnimation::didFadeIn, &fader, &OpacityAnimation::fadeOut);
        fader.fadeIn();
        QTRY_COMPARE(recorder.names(), s_in + s_out);
        QVERIFY(widget.isHidden());
    }

    void anInterruptionInTheLastStepLetsTheFirstFadeCount()
    {
        QWidget widget;
        OpacityAnimation fader(&widget);
        SignalRecorder recorder(&fader);
        bool done = false;
        connect(&fader, &QVariantAnimation::valueChanged, &widget, [&](const QVariant& value) {
            if (!done && value.toDouble() >= 1.0) {
                done = true;
                fader.fadeOut();
            }
        });
        fader.fadeIn();
        finish(fader);
        QCOMPARE(recorder.names(), s_in);
        QCOMPARE(fader.state(), QAbstractAnimation::Running);
        finish(fader);
        QCOMPARE(recorder.names(), s_in + s_out);
    }

    void aFadeOutAskedForWhileShowingWins()
    {
        Canvas widget;
        OpacityAnimation fader(&widget);
        SignalRecorder recorder(&fader);
        widget.onShow = [&] { fader.fadeOut(); };
        fader.fadeIn();
        QCOMPARE(fader.duration(), 350);
        finish(fader);
        QCOMPARE(recorder.names(), s_out);
        QVERIFY(widget.isHidden());
    }

    void aFadeInAskedForWhileHidingStartsBeforeTheSignal()
    {
        Canvas widget;
        OpacityAnimation fader(&widget);
        SignalRecorder recorder(&fader);
        widget.show();
        bool done = false;
        widget.onHide = [&] {
            if (!done) {
                done = true;
                fader.fadeIn();
            }
        };
        fader.fadeOut();
        finish(fader);
        QCOMPARE(recorder.names(), s_out);
        QVERIFY(widget.isVisible());
        finish(fader);
        QCOMPARE(recorder.names(), s_out + s_in);
    }

    void theWidgetMayGoInMidFade()
    {
        for (const bool children : {false, true}) {
            auto* widget = new QWidget;
            QPointer<OpacityAnimation> fader = new OpacityAnimation(widget);
            fader->setFadeChildren(children);
            fader->fadeIn();
            fader->setCurrentTime(100);
            delete widget;
            QVERIFY(fader == nullptr);
            QCoreApplication::processEvents();
        }
    }

    void theAnimationMayGoInMidFade()
    {
        for (const bool children : {false, true}) {
            QWidget widget;
            auto* fader = new OpacityAnimation(&widget);
            fader->setFadeChildren(children);
            fader->fadeIn();
            fader->setCurrentTime(100);
            delete fader;
            QVERIFY(widget.graphicsEffect() == nullptr);
            QCoreApplication::processEvents();
        }
    }

    void aSlotMayDeleteTheWidget_data()
    {
        QTest::addColumn<bool>("in");
        QTest::newRow("in") << true;
        QTest::newRow("out") << false;
    }
    void aSlotMayDeleteTheWidget()
    {
        QFETCH(bool, in);
        QPointer<QWidget> widget = new QWidget;
        auto* fader = new OpacityAnimation(widget);
        fader->setFadingTimes(20, 20);
        const auto signal = in ? &OpacityAnimation::didFadeIn : &OpacityAnimation::didFadeOut;
        connect(fader, signal, this, [&] { delete widget.data(); });
        if (in) {
            fader->fadeIn();
        } else {
            widget->show();
            fader->fadeOut();
        }
        QTRY_VERIFY(widget == nullptr);
    }

    void aHideEventMayDeleteTheAnimation()
    {
        Canvas widget;
        QPointer<OpacityAnimation> fader = new OpacityAnimation(&widget);
        fader->setFadingTimes(20, 20);
        widget.show();
        widget.onHide = [&] { delete fader.data(); };
        fader->fadeOut();
        QTRY_VERIFY(fader == nullptr);
        widget.onHide = nullptr;
    }

    void withoutAWidgetItStillCounts()
    {
        OpacityAnimation fader(nullptr);
        SignalRecorder recorder(&fader);
        fader.setFadeChildren(true);
        fader.fadeIn();
        finish(fader);
        fader.fadeOut();
        finish(fader);
        QCOMPARE(recorder.names(), s_in + s_out);
    }
};

ZELKOV_TEST_MAIN(TestOpacityAnimation)
#include "tst_opacityanimation.moc"
