// SPDX-License-Identifier: MIT
// The tool bar that takes part in customising: real drags, drops and its log.
#include "support/TestMain.h"
#include "ToolBarScene.h"

using toolbarscene::addSpacer;
using toolbarscene::c_Action;
using toolbarscene::c_OnSource;
using toolbarscene::c_ToolBar;
using toolbarscene::Dragged;
using toolbarscene::Host;
using toolbarscene::packed;
using toolbarscene::Scene;
using toolbarscene::word;

using vx::CustomToolBar;
using zelkovtest::LogCapture;
using zelkovtest::SignalRecorder;

class TestCustomToolBar : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void bothConstructorsTakeDrops();
    void aRealDragOfAnActionLandsBeforeTheNextCentre_data();
    void aRealDragOfAnActionLandsBeforeTheNextCentre();
    void aRealDragThatGoesAwayDropsNothing();
    void aRealDragOfAnotherKindIsRefused();
    void aBarDraggedOntoItselfReportsItsOwnId();
    void aBarDraggedOntoAnotherReportsThere();
    void aBarThatIsNotDraggableStays();
    void aDragStartsAtTheDistanceOfTheDesktop();
    void onlyTheLeftButtonDrags();
    void theBaseClassSeesNoPressesAndMoves();
    void theBarMayDieWhileItIsDragged();
    void theBarMayDieOfADrop_data();
    void theBarMayDieOfADrop();
    void entersWantOneOfTheTwoFormats();
    void movesWantOneOfTheTwoFormats();
    void theActionFormatGoesFirst();
    void anEnterAndALeaveForgetThePlace();
    void theDropKeepsThePlace();
    void anEmptyStreamIsAcceptedInSilence();
    void theSpacerIsSkippedAndRemoved();
    void theSpacerIsWideOrWider_data();
    void theSpacerIsWideOrWider();
    void anActionThatDiedIsNoPlace();
    void everyStepIsLogged();
};

void TestCustomToolBar::bothConstructorsTakeDrops()
{
    CustomToolBar titled(word("Tools"), nullptr, false, word("id"));
    CustomToolBar bare(nullptr, false, word("id"));
    QCOMPARE(titled.windowTitle(), word("Tools"));
    QVERIFY(bare.windowTitle().isEmpty());
    QVERIFY(titled.acceptDrops());
    QVERIFY(bare.acceptDrops());
}

void TestCustomToolBar::aRealDragOfAnActionLandsBeforeTheNextCentre_data()
{
    QTest::addColumn<Qt::Orientation>("orientation");
    QTest::addColumn<int>("index");
    QTest::addColumn<int>("offset");
    QTest::addColumn<int>("before");
    for (const auto orientation : {Qt::Horizontal, Qt::Vertical}) {
        const char* const name = orientation == Qt::Horizontal ? "horizontal" : "vertical";
        QTest::addRow("%s, in the first half of the first", name) << orientation << 0 << -1 << 0;
        QTest::addRow("%s, on the centre of the first", name) << orientation << 0 << 0 << 1;
        QTest::addRow("%s, in the first half of the second", name) << orientation << 1 << -1 << 1;
        QTest::addRow("%s, in the second half of the second", name) << orientation << 1 << 1 << 2;
        QTest::addRow("%s, past the last", name) << orientation << 2 << 1 << -1;
    }
}

void TestCustomToolBar::aRealDragOfAnActionLandsBeforeTheNextCentre()
{
    QFETCH(Qt::Orientation, orientation);
    QFETCH(int, index);
    QFETCH(int, offset);
    QFETCH(int, before);
    Scene scene(orientation);
    const QPoint centre = scene.place(index).center();
    const QPoint at = centre + (orientation == Qt::Horizontal ? QPoint(offset, 5) : QPoint(5, offset));
    scene.drag(c_OnSource, {QPoint(50, 100), at + QPoint(1, 1), at});
    QCOMPARE(scene.recorder.names(), QStringList {word("actionDropped")});
    const QVariantList arguments = scene.recorder.entries().first().arguments;
    QCOMPARE(arguments.at(0).value<QToolBar*>(), scene.bar);
    QCOMPARE(arguments.at(1).toString(), word("zoom-in"));
    QCOMPARE(arguments.at(2).value<QAction*>(), before < 0 ? nullptr : scene.actions.at(before));
    QCOMPARE(scene.source->result, Qt::MoveAction);
    // The bar changes nothing by itself.
    QCOMPARE(scene.bar->actions(), scene.actions);
}

void TestCustomToolBar::aRealDragThatGoesAwayDropsNothing()
{
    Scene scene;
    scene.drag(c_OnSource, {scene.place(1).center(), QPoint(50, 150)});
    QCOMPARE(scene.recorder.names(), QStringList());
    QCOMPARE(scene.source->result, Qt::IgnoreAction);
}

void TestCustomToolBar::aRealDragOfAnotherKindIsRefused()
{
    Scene scene;
    scene.source->format = "text/plain";
    scene.drag(c_OnSource, {QPoint(50, 100), scene.place(1).center()});
    QCOMPARE(scene.recorder.names(), QStringList());
    QCOMPARE(scene.source->result, Qt::IgnoreAction);
}

void TestCustomToolBar::aBarDraggedOntoItselfReportsItsOwnId()
{
    Scene scene;
    // By its body, right of the actions.
    scene.drag(QPoint(180, 10), {QPoint(190, 100), QPoint(170, 20), QPoint(160, 20)});
    QCOMPARE(scene.recorder.names(), QStringList {word("toolBarDropped")});
    QCOMPARE(scene.recorder.entries().first().arguments.first().toString(), word("tools"));
}

void TestCustomToolBar::aBarDraggedOntoAnotherReportsThere()
{
    Scene scene;
    CustomToolBar other(&scene.host, false, word("other"));
    other.setGeometry(0, 60, 220, 40);
    other.show();
    SignalRecorder recorder(&other);
    scene.drag(QPoint(180, 10), {QPoint(100, 70), QPoint(90, 75)});
    QCOMPARE(scene.recorder.names(), QStringList());
    QCOMPARE(recorder.names(), QStringList {word("toolBarDropped")});
    QCOMPARE(recorder.entries().first().arguments.first().toString(), word("tools"));
}

void TestCustomToolBar::aBarThatIsNotDraggableStays()
{
    Scene scene(Qt::Horizontal, false);
    bool dragged = false;
    scene.send(QEvent::MouseButtonPress, QPoint(180, 10));
    QTimer::singleShot(0, &scene.host, [&] { dragged = scene.bar->findChild<QDrag*>() != nullptr; });
    scene.send(QEvent::MouseMove, QPoint(120, 30));
    scene.send(QEvent::MouseButtonRelease, QPoint(120, 30));
    QCoreApplication::processEvents();
    QVERIFY(!dragged);
    QCOMPARE(scene.recorder.names(), QStringList());
}

void TestCustomToolBar::aDragStartsAtTheDistanceOfTheDesktop()
{
    const int distance = QApplication::startDragDistance();
    for (const int length : {distance - 1, distance}) {
        Scene scene;
        bool dragged = false;
        QTimer::singleShot(50, &scene.host, [&] { QDrag::cancel(); });
        connect(&scene.host, &QObject::destroyed, this, [] {});
        QTimer watch;
        connect(&watch, &QTimer::timeout, &scene.host,
            [&] { dragged = dragged || scene.bar->findChild<QDrag*>() != nullptr; });
        watch.start(1);
        scene.send(QEvent::MouseButtonPress, QPoint(180, 10));
        scene.send(QEvent::MouseMove, QPoint(180 - (length - 3), 13));
        QTest::qWait(60);
        scene.send(QEvent::MouseButtonRelease, QPoint(180, 13));
        QCOMPARE(dragged, length == distance);
    }
}

void TestCustomToolBar::onlyTheLeftButtonDrags()
{
    Scene scene;
    scene.send(QEvent::MouseButtonPress, QPoint(180, 10), Qt::RightButton);
    scene.send(QEvent::MouseMove, QPoint(100, 10), Qt::RightButton);
    scene.send(QEvent::MouseButtonRelease, QPoint(100, 10), Qt::RightButton);
    QCOMPARE(scene.recorder.names(), QStringList());
    // With a second button down the press is not noted, so the drag is measured from the former one.
    QMouseEvent both(QEvent::MouseButtonPress, QPoint(180, 10), Qt::LeftButton, Qt::LeftButton | Qt::RightButton,
        Qt::NoModifier);
    QApplication::sendEvent(scene.bar, &both);
    QVERIFY(both.isAccepted());
}

void TestCustomToolBar::theBaseClassSeesNoPressesAndMoves()
{
    // The base class would ignore them, and the parent would get them.
    for (const bool draggable : {true, false}) {
        Scene scene(Qt::Horizontal, draggable);
        QMouseEvent press(
            QEvent::MouseButtonPress, QPoint(180, 10), Qt::RightButton, Qt::RightButton, Qt::NoModifier);
        QApplication::sendEvent(scene.bar, &press);
        QVERIFY(press.isAccepted());
        QMouseEvent move(QEvent::MouseMove, QPoint(181, 10), Qt::NoButton, Qt::RightButton, Qt::NoModifier);
        QApplication::sendEvent(scene.bar, &move);
        QVERIFY(move.isAccepted());
    }
}

void TestCustomToolBar::theBarMayDieWhileItIsDragged()
{
    Scene scene;
    scene.recorder.clear();
    const QPointer<CustomToolBar> bar(scene.bar);
    scene.drag(QPoint(180, 10), {QPoint(180, 100)}, [&] { delete bar; });
    QVERIFY(!bar);
}

void TestCustomToolBar::theBarMayDieOfADrop_data()
{
    QTest::addColumn<QString>("format");
    QTest::newRow("an action") << word(c_Action);
    QTest::newRow("a bar") << word(c_ToolBar);
}

void TestCustomToolBar::theBarMayDieOfADrop()
{
    QFETCH(QString, format);
    Scene scene;
    const QPointer<CustomToolBar> bar(scene.bar);
    connect(bar, &CustomToolBar::actionDropped, this, [&] { delete bar; });
    connect(bar, &CustomToolBar::toolBarDropped, this, [&] { delete bar; });
    scene.source->format = format.toLatin1();
    scene.drag(c_OnSource, {QPoint(50, 100), QPoint(60, 20), QPoint(61, 20)});
    QVERIFY(!bar);
}

void TestCustomToolBar::entersWantOneOfTheTwoFormats()
{
    Scene scene;
    QVERIFY(Dragged(scene.bar, word(c_Action), packed(word("x"))).enter());
    QVERIFY(Dragged(scene.bar, word(c_ToolBar), packed(word("x"))).enter());
    QVERIFY(!Dragged(scene.bar, word("text/plain"), "x").enter());
    QVERIFY(!Dragged(scene.bar, QString(), QByteArray()).enter());
}

void TestCustomToolBar::movesWantOneOfTheTwoFormats()
{
    Scene scene;
    Dragged action(scene.bar, word(c_Action), packed(word("x")));
    Dragged bar(scene.bar, word(c_ToolBar), packed(word("x")));
    Dragged other(scene.bar, word("text/plain"), "x");
    QVERIFY(action.move(QPoint(5, 5)));
    QVERIFY(bar.move(QPoint(5, 5)));
    QVERIFY(!other.move(QPoint(5, 5)));
}

void TestCustomToolBar::theActionFormatGoesFirst()
{
    Scene scene;
    Dragged both(scene.bar, word(c_Action), packed(word("an action")));
    both.data.setData(word(c_ToolBar), packed(word("a bar")));
    both.enter();
    QVERIFY(both.drop(QPoint(5, 5)));
    QCOMPARE(scene.recorder.names(), QStringList {word("actionDropped")});
    QCOMPARE(scene.recorder.entries().first().arguments.at(1).toString(), word("an action"));
}

void TestCustomToolBar::anEnterAndALeaveForgetThePlace()
{
    Scene scene;
    Dragged action(scene.bar, word(c_Action), packed(word("x")));
    const auto beforeOfLast = [&] { return scene.recorder.entries().last().arguments.at(2).value<QAction*>(); };
    action.enter();
    action.move(scene.place(0).topLeft());
    QVERIFY(action.drop(QPoint(5, 5)));
    QCOMPARE(beforeOfLast(), scene.actions.at(0));
    action.enter();
    QVERIFY(action.drop(QPoint(5, 5)));
    QCOMPARE(beforeOfLast(), nullptr);
    action.enter();
    action.move(scene.place(0).topLeft());
    QVERIFY(action.leave());
    QVERIFY(action.drop(QPoint(5, 5)));
    QCOMPARE(beforeOfLast(), nullptr);
}

void TestCustomToolBar::theDropKeepsThePlace()
{
    Scene scene;
    Dragged action(scene.bar, word(c_Action), packed(word("x")));
    action.enter();
    action.move(scene.place(1).topLeft());
    QVERIFY(action.drop(QPoint(5, 5)));
    QVERIFY(action.drop(QPoint(5, 5)));
    QCOMPARE(scene.recorder.entries().last().arguments.at(2).value<QAction*>(), scene.actions.at(1));
}

void TestCustomToolBar::anEmptyStreamIsAcceptedInSilence()
{
    for (const char* format : {c_Action, c_ToolBar}) {
        Scene scene;
        Dragged empty(scene.bar, word(format), QByteArray());
        QVERIFY(empty.enter());
        QVERIFY(empty.drop(QPoint(5, 5)));
        QCOMPARE(scene.recorder.names(), QStringList());
    }
    Scene scene;
    Dragged other(scene.bar, word("text/plain"), "x");
    Dragged(scene.bar, word(c_Action), QByteArray()).enter();
    QVERIFY(other.drop(QPoint(5, 5)));
    QCOMPARE(scene.recorder.names(), QStringList());
}

void TestCustomToolBar::theSpacerIsSkippedAndRemoved()
{
    Scene scene;
    for (const bool byLeave : {true, false}) {
        Dragged action(scene.bar, word(c_Action), packed(word("x")));
        action.enter();
        action.move(scene.place(1).topLeft());
        addSpacer(*scene.bar);
        QCOMPARE(scene.bar->actions().size(), 4);
        // Where the drop would land.
        QAction* const spacer = scene.bar->actions().at(1);
        QCOMPARE(scene.bar->actions().at(2), scene.actions.at(1));
        QCoreApplication::processEvents();
        // Over the gap itself the action behind it is meant, not the gap.
        action.move(scene.bar->widgetForAction(spacer)->geometry().topLeft());
        if (byLeave) {
            QVERIFY(action.leave());
        } else {
            QVERIFY(action.drop(QPoint(5, 5)));
            QCOMPARE(scene.recorder.entries().last().arguments.at(2).value<QAction*>(), scene.actions.at(1));
        }
        QCOMPARE(scene.bar->actions(), scene.actions);
    }
}

void TestCustomToolBar::theSpacerIsWideOrWider_data()
{
    QTest::addColumn<QSize>("icons");
    QTest::addColumn<int>("length");
    QTest::newRow("small icons") << QSize(16, 16) << 32;
    QTest::newRow("others") << QSize(24, 24) << 64;
    QTest::newRow("not square") << QSize(16, 17) << 64;
}

void TestCustomToolBar::theSpacerIsWideOrWider()
{
    QFETCH(QSize, icons);
    QFETCH(int, length);
    for (const auto orientation : {Qt::Horizontal, Qt::Vertical}) {
        Scene scene(orientation);
        scene.bar->setIconSize(icons);
        addSpacer(*scene.bar);
        // No place is known, so at the end.
        const QWidget* const spacer = scene.bar->widgetForAction(scene.bar->actions().last());
        const auto* const layout = qobject_cast<QBoxLayout*>(spacer->layout());
        QVERIFY(layout);
        QCOMPARE(layout->direction(),
            orientation == Qt::Horizontal ? QBoxLayout::LeftToRight : QBoxLayout::TopToBottom);
        const QSize size = layout->itemAt(0)->sizeHint();
        QCOMPARE(orientation == Qt::Horizontal ? size.width() : size.height(), length);
    }
}

void TestCustomToolBar::anActionThatDiedIsNoPlace()
{
    Scene scene;
    Dragged action(scene.bar, word(c_Action), packed(word("x")));
    action.enter();
    action.move(scene.place(0).topLeft());
    delete scene.actions.at(0);
    QVERIFY(action.drop(QPoint(5, 5)));
    QCOMPARE(scene.recorder.entries().last().arguments.at(2).value<QAction*>(), nullptr);
}

void TestCustomToolBar::everyStepIsLogged()
{
    Scene scene;
    LogCapture log(1);
    Dragged action(scene.bar, word(c_Action), packed(word("zoom")));
    action.enter();
    action.move(QPoint(5, 5));
    action.leave();
    action.drop(QPoint(5, 5));
    Dragged(scene.bar, word(c_ToolBar), packed(word("bar"))).drop(QPoint(5, 5));
    Dragged(scene.bar, word("text/plain"), "x").enter();
    const QStringList lines = log.lines();
    QCOMPARE(lines.size(), 5);
    const auto ends = [&](int i, const char* function, const QString& message) {
        return lines.at(i).endsWith(QStringLiteral("[vx::CustomToolBar::%1] %2").arg(word(function), message));
    };
    const QString address = QStringLiteral("0x%1").arg(quintptr(scene.bar), 0, 16);
    QVERIFY2(
        ends(0, "dragEnterEvent", word("CustomToolBar::dragEnterEvent...") + address), qPrintable(lines.at(0)));
    QVERIFY(ends(1, "dragMoveEvent", word("CustomToolBar::dragMoveEvent...") + address));
    QVERIFY(ends(2, "dragLeaveEvent", word("CustomToolBar::dragLeaveEvent...") + address));
    QVERIFY(ends(3, "dropEvent", word("CustomToolBar::dropped action ID: zoom")));
    QVERIFY(ends(4, "dropEvent", word("CustomToolBar::dropped toolbar ID: bar")));
}

ZELKOV_TEST_MAIN(TestCustomToolBar)
#include "tst_customtoolbar.moc"
