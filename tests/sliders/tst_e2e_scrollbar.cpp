// SPDX-License-Identifier: MIT
// A real pointer on the overlay bar: drag, wheel, hover.
#include "ScrollScene.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QProcess>
#include <QtTest/QtTest>

#include <memory>

class TestE2eScrollBar : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aWheelOverTheBarScrollsTheArea_data();
    void aWheelOverTheBarScrollsTheArea();
    void aWheelAtTheEndScrollsTheAreaAround();
    void aSlowDragScrollsTheAreaAllTheWay();
    void aQuickDragArrivesWhole();
    void passingOverAFadedBarShowsIt();

private:
    static void show(QWidget* window);
    static QStringList to(const QWidget* widget, const QPoint& position);
    static void pointer(const QStringList& arguments);
};

static QStringList words(const char* text)
{
    return QString::fromLatin1(text).split(QLatin1Char(' '));
}

void TestE2eScrollBar::show(QWidget* window)
{
    window->move(200, 150);
    window->show();
    QVERIFY(QTest::qWaitForWindowActive(window));
    // The window manager moves the window once more after it is shown.
    QPoint last;
    QTRY_VERIFY([&] {
        const QPoint now = window->mapToGlobal(QPoint());
        const bool still = now == last;
        last = now;
        return still;
    }());
}

QStringList TestE2eScrollBar::to(const QWidget* widget, const QPoint& position)
{
    const QPoint global = widget->mapToGlobal(position);
    return {QStringLiteral("mousemove"), QString::number(global.x()), QString::number(global.y()),
        QStringLiteral("sleep"), QStringLiteral("0.03")};
}

void TestE2eScrollBar::pointer(const QStringList& arguments)
{
    QProcess xdotool;
    xdotool.start(QStringLiteral("xdotool"), arguments);
    QVERIFY(QTest::qWaitFor([&] { return xdotool.state() == QProcess::NotRunning; }, 10000));
    QCOMPARE(xdotool.exitCode(), 0);
    QTest::qWait(50);
}

void TestE2eScrollBar::aWheelOverTheBarScrollsTheArea_data()
{
    QTest::addColumn<bool>("horizontal");
    QTest::addColumn<bool>("faded");
    QTest::newRow("vertical bar") << false << false;
    QTest::newRow("horizontal bar") << true << false;
    QTest::newRow("faded vertical bar") << false << true;
}

void TestE2eScrollBar::aWheelOverTheBarScrollsTheArea()
{
    QFETCH(bool, horizontal);
    QFETCH(bool, faded);
    ScrollScene scene(horizontal ? Qt::Horizontal : Qt::Vertical);
    show(&scene.area);
    if (faded) {
        scene.fade();
    }
    const QPoint middle = scene.bar->rect().center();
    pointer(to(scene.bar, middle) + words("click 5 sleep 0.05"));
    QScrollBar* const vertical = scene.area.verticalScrollBar();
    QTRY_VERIFY(vertical->value() > 0);
    const int notch = vertical->value();
    pointer(to(scene.area.viewport(), QPoint(100, 100)) + words("click 5 sleep 0.05"));
    QTRY_COMPARE(vertical->value(), 2 * notch);
    pointer(to(scene.bar, middle) + words("click 4 sleep 0.05"));
    QTRY_COMPARE(vertical->value(), notch);
    QTRY_COMPARE(scene.bar->value(), scene.real->value());
}

void TestE2eScrollBar::aWheelAtTheEndScrollsTheAreaAround()
{
    QScrollArea around;
    around.resize(400, 300);
    auto* content = new QWidget;
    content->resize(380, 2000);
    auto* inner = new QScrollArea(content);
    inner->setGeometry(20, 20, 300, 200);
    auto* innerContent = new QWidget;
    innerContent->resize(100, 1000);
    inner->setWidget(innerContent);
    around.setWidget(content);
    const auto* bar = new NicerScrollBar(inner, Qt::Vertical, NicerScrollBar::epAutomatic, inner);
    show(&around);

    pointer(to(bar, QPoint(7, 100)) + words("click 5 sleep 0.05"));
    QTRY_VERIFY(inner->verticalScrollBar()->value() > 0);
    QCOMPARE(around.verticalScrollBar()->value(), 0);
    inner->verticalScrollBar()->setValue(inner->verticalScrollBar()->maximum());
    pointer(to(bar, QPoint(7, 100)) + words("sleep 0.6 click 5 sleep 0.05"));
    QTRY_VERIFY(around.verticalScrollBar()->value() > 0);
}

void TestE2eScrollBar::aSlowDragScrollsTheAreaAllTheWay()
{
    ScrollScene scene;
    show(&scene.area);
    QSignalSpy dragged(scene.bar, &NicerScrollBar::nicerValueChanged);
    // 24 is on the handle in every state of the bar: under the arrow, if there is one.
    pointer(to(scene.bar, QPoint(7, 24)) + words("mousedown 1 sleep 0.05") + to(scene.bar, QPoint(7, 60))
        + to(scene.bar, QPoint(7, 120)) + to(scene.bar, QPoint(7, 199)) + words("mouseup 1 sleep 0.05"));
    QTRY_COMPARE(scene.real->value(), scene.real->maximum());
    QCOMPARE(scene.bar->value(), scene.bar->maximum());
    QVERIFY(dragged.count() >= 3);
    QVERIFY(!scene.bar->isSliderDown());
}

void TestE2eScrollBar::aQuickDragArrivesWhole()
{
    ScrollScene scene;
    show(&scene.area);
    const QPoint start = scene.bar->mapToGlobal(QPoint(7, 24));
    const QPoint end = scene.bar->mapToGlobal(QPoint(7, 110));
    pointer(to(scene.bar, QPoint(7, 24))
        + words(qPrintable(QStringLiteral("mousedown 1 mousemove %1 %2 mousemove %3 %4 mouseup 1 sleep 0.05")
                               .arg(start.x())
                               .arg(start.y() + 30)
                               .arg(end.x())
                               .arg(end.y()))));
    QTRY_VERIFY(scene.bar->value() > 0);
    QTRY_COMPARE(scene.real->value(), scene.bar->value());
}

void TestE2eScrollBar::passingOverAFadedBarShowsIt()
{
    ScrollScene scene;
    show(&scene.area);
    pointer(to(scene.area.viewport(), QPoint(20, 20)));
    scene.fade();
    pointer(to(scene.bar, QPoint(7, 150)) + to(scene.bar, QPoint(7, 155)));
    QTRY_VERIFY(!scene.faded());
}

ZELKOV_TEST_MAIN(TestE2eScrollBar)
#include "tst_e2e_scrollbar.moc"
