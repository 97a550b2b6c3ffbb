// SPDX-License-Identifier: MIT
// The widget with the signals of a button: their order, any mouse button, and the hooks for subclasses.
#include "ClickTools.h"
#include "input/CustomClickQWidget.h"
#include "support/Pointer.h"
#include "support/SignalRecorder.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtCore/QMetaMethod>
#include <QtTest/QtTest>

using clicktest::mouse;

namespace
{
class Clickable : public vx::CustomClickQWidget
{
public:
    explicit Clickable(QWidget* parent = nullptr)
        : vx::CustomClickQWidget(parent)
    {
        resize(60, 40);
    }
    using vx::CustomClickQWidget::checkStateSet;
    using vx::CustomClickQWidget::click;
    using vx::CustomClickQWidget::nextCheckState;
};

class Counting : public Clickable
{
public:
    int calls = 0;

protected:
    void clicked() override { ++calls; }
    void checkStateSet() override { ++calls; }
    void nextCheckState() override { ++calls; }
};

QStringList words(std::initializer_list<const char*> list)
{
    QStringList result;
    for (const char* word : list) {
        result << QLatin1String(word);
    }
    return result;
}
}

class TestCustomClickQWidget : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void itHasTheSignalsOfAButtonInTheirOrder()
    {
        const QMetaObject& meta = vx::CustomClickQWidget::staticMetaObject;
        QStringList methods;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
            methods << QLatin1String(meta.method(i).methodSignature());
        }
        QCOMPARE(methods, words({"clicked(bool)", "pressed()", "released()", "toggled(bool)", "click()"}));
        QCOMPARE(meta.method(meta.methodCount() - 1).access(), QMetaMethod::Protected);
        QCOMPARE(meta.method(meta.methodOffset()).parameterNames(), QList<QByteArray> {"checked"});
    }

    void aClickIsPressedThenClickedThenReleased_data()
    {
        QTest::addColumn<int>("button");
        QTest::newRow("left") << int(Qt::LeftButton);
        QTest::newRow("middle") << int(Qt::MiddleButton);
        QTest::newRow("right") << int(Qt::RightButton);
    }

    void aClickIsPressedThenClickedThenReleased()
    {
        QFETCH(int, button);
        const auto mouseButton = Qt::MouseButton(button);
        QWidget host;
        host.resize(100, 80);
        auto* widget = new Clickable(&host);
        host.show();
        QVERIFY(QTest::qWaitForWindowExposed(&host));
        zelkovtest::SignalRecorder recorder(widget);
        zelkovtest::Pointer pointer(&host);
        pointer.move(QPoint(20, 20));
        pointer.press(mouseButton);
        QCoreApplication::processEvents();
        QCOMPARE(recorder.names(), words({"pressed"}));
        pointer.release(mouseButton);
        QCoreApplication::processEvents();
        QCOMPARE(recorder.names(), words({"pressed", "clicked", "released"}));
        QCOMPARE(recorder.entries().at(1).arguments, QVariantList {false});
    }

    void aReleaseOutsideClicksToo()
    {
        Clickable widget;
        zelkovtest::SignalRecorder recorder(&widget);
        mouse(&widget, QEvent::MouseButtonPress, QPoint(5, 5));
        mouse(&widget, QEvent::MouseButtonRelease, QPoint(500, 500));
        QCOMPARE(recorder.names(), words({"pressed", "clicked", "released"}));
    }

    void aReleaseWithoutAPressIsOnlyReleased()
    {
        Clickable widget;
        zelkovtest::SignalRecorder recorder(&widget);
        mouse(&widget, QEvent::MouseButtonRelease, QPoint(5, 5));
        QCOMPARE(recorder.names(), words({"released"}));
        mouse(&widget, QEvent::MouseButtonPress, QPoint(5, 5));
        mouse(&widget, QEvent::MouseButtonRelease, QPoint(5, 5));
        mouse(&widget, QEvent::MouseButtonRelease, QPoint(5, 5));
        QCOMPARE(recorder.names(), words({"released", "pressed", "clicked", "released", "released"}));
    }

    void theEventsEndHere()
    {
        Clickable widget;
        QVERIFY(mouse(&widget, QEvent::MouseButtonPress, QPoint(5, 5)));
        QVERIFY(mouse(&widget, QEvent::MouseButtonRelease, QPoint(5, 5)));
    }

    void slotAndVirtualOperationEmitClicked()
    {
        Clickable widget;
        zelkovtest::SignalRecorder recorder(&widget);
        widget.click();
        widget.clicked();
        QVERIFY(QMetaObject::invokeMethod(&widget, "click"));
        QCOMPARE(recorder.names(), words({"clicked", "clicked", "clicked"}));
        for (const auto& entry : recorder.entries()) {
            QCOMPARE(entry.arguments, QVariantList {false});
        }
    }

    void theHooksDoNothingAndAreNotCalled()
    {
        Clickable widget;
        zelkovtest::SignalRecorder recorder(&widget);
        widget.checkStateSet();
        widget.nextCheckState();
        QCOMPARE(recorder.names(), QStringList());
        Counting counting;
        mouse(&counting, QEvent::MouseButtonPress, QPoint(5, 5));
        mouse(&counting, QEvent::MouseButtonRelease, QPoint(5, 5));
        counting.click();
        QCOMPARE(counting.calls, 0);
    }

    void aSlotMayDeleteTheWidget_data()
    {
        QTest::addColumn<QByteArray>("signal");
        for (const char* name : {"2pressed()", "2clicked(bool)", "2released()"}) {
            QTest::newRow(name) << QByteArray(name);
        }
    }

    void aSlotMayDeleteTheWidget()
    {
        QFETCH(QByteArray, signal);
        m_victim = new Clickable;
        QVERIFY(connect(m_victim, signal.constData(), this, SLOT(kill())));
        mouse(m_victim, QEvent::MouseButtonPress, QPoint(5, 5));
        if (m_victim != nullptr) {
            QMouseEvent release(
                QEvent::MouseButtonRelease, QPoint(5, 5), Qt::LeftButton, Qt::NoButton, Qt::NoModifier);
            QApplication::sendEvent(m_victim, &release);
        }
        QVERIFY(m_victim == nullptr);
    }

private:
    QPointer<Clickable> m_victim;

public Q_SLOTS:
    void kill() { delete m_victim.data(); }
};

ZELKOV_TEST_MAIN(TestCustomClickQWidget)
#include "tst_customclickqwidget.moc"
