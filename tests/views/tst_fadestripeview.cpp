// SPDX-License-Identifier: MIT
// The panel with handle, slider and rows: its tree, its heights, drops, styles.
#include "StripeScene.h"
#include "support/TestMain.h"

using stripescene::c_Bottom;
using stripescene::c_Top;
using stripescene::list;
using stripescene::OpenStripe;
using stripescene::Scene;
using stripescene::word;

class TestFadeStripeView : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { qRegisterMetaType<QPointer<QObject>>(); }
    void signalsStandInTheirOrder();
    void theTreeIsAsTold_data();
    void theTreeIsAsTold();
    void theHandleLiesUnderTheSlider();
    void theMaximumIsThatOfTheEdge();
    void rowsAreHeightsWithBothBars();
    void sizesSnapAtTwoThirds();
    void aSizeHintIsClampedAndTold_data();
    void aSizeHintIsClampedAndTold();
    void duringFullHeightTheContentsAreNotTold();
    void distributingTellsTheHeightOfTheContents();
    void openingAndClosingTellsTheHeight_data();
    void openingAndClosingTellsTheHeight();
    void contentsComeAndGoWithThePanel();
    void typesTurnDropsOnAndOff();
    void dropsAreReported();
    void ignoredSourcesAreRefused();
    void stylesNameTheWidgets_data();
    void stylesNameTheWidgets();
    void theControllerFilesStripes();
};

void TestFadeStripeView::signalsStandInTheirOrder()
{
    const QMetaObject& meta = FadeStripeView::staticMetaObject;
    QStringList names;
    for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
        if (meta.method(i).methodType() == QMetaMethod::Signal) {
            names << QString::fromLatin1(meta.method(i).name());
        }
    }
    QCOMPARE(names,
        list("headerPressed footerPressed headerReleased footerReleased headerReleasedFadedOut "
             "footerReleasedFadedOut heightChanged sizeChanged inactiveClicked dragAccepted"));
}

void TestFadeStripeView::theTreeIsAsTold_data()
{
    QTest::addColumn<FadeView::EPositions>("edge");
    QTest::newRow("top") << c_Top;
    QTest::newRow("bottom") << c_Bottom;
}

void TestFadeStripeView::theTreeIsAsTold()
{
    QFETCH(FadeView::EPositions, edge);
    QWidget view;
    view.resize(400, 600);
    auto* const contents = new QWidget;
    OpenStripe stripe(edge, contents, &view);
    QCOMPARE(stripe.height(), 15);
    QCOMPARE(stripe.minimumHeight(), 15);
    QCOMPARE(stripe.maximumHeight(), 15);
    QCOMPARE(stripe.m_stripeMinimumHeight, 15);
    QCOMPARE(stripe.getRows(), 0);
    const auto* const layout = qobject_cast<QVBoxLayout*>(stripe.layout());
    QVERIFY(layout);
    QCOMPARE(layout->spacing(), 0);
    QCOMPARE(layout->contentsMargins(), QMargins());
    QCOMPARE(layout->itemAt(1)->widget(), contents);
    QCOMPARE(contents->objectName(), word("contentView"));
    QCOMPARE(contents->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Ignored));
    QCOMPARE(stripe.slider()->objectName(), word("fadeStripeNubsieSlider"));
    QWidget* const moving = layout->itemAt(edge == c_Top ? 2 : 0)->widget();
    QWidget* const other = layout->itemAt(edge == c_Top ? 0 : 2)->widget();
    QCOMPARE(moving->minimumHeight(), 15);
    QCOMPARE(moving->maximumHeight(), 15);
    QCOMPARE(other->minimumHeight(), 0);
    QCOMPARE(other->maximumHeight(), 15);
    QCOMPARE(other->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::MinimumExpanding));
    QVERIFY(moving->isAncestorOf(stripe.slider()));
    QVERIFY(moving->objectName().isEmpty());
    const QTimer* const timer = stripe.findChild<QTimer*>(QString(), Qt::FindDirectChildrenOnly);
    QVERIFY(timer && timer->isSingleShot());
    QCOMPARE(timer->interval(), QApplication::doubleClickInterval());
}

void TestFadeStripeView::theHandleLiesUnderTheSlider()
{
    Scene scene;
    const auto* const stack = qobject_cast<QStackedLayout*>(scene.movingBar()->layout());
    QVERIFY(stack);
    QCOMPARE(stack->stackingMode(), QStackedLayout::StackAll);
    QCOMPARE(stack->currentWidget(), scene.stripe->slider());
    QCOMPARE(stack->widget(1), scene.stripe->slider());
    const QObjectList children = scene.movingBar()->children();
    QVERIFY(children.indexOf(stack->widget(0)) < children.indexOf(stack->widget(1)));
    const QWidget* const handle = stack->widget(0)->layout()->itemAt(0)->widget();
    QCOMPARE(handle->maximumWidth(), 35);
    QCOMPARE(handle->width(), 35);
    QVERIFY(qAbs(handle->mapTo(scene.stripe, QPoint()).x() + 17 - 200) <= 1);
}

void TestFadeStripeView::theMaximumIsThatOfTheEdge()
{
    QWidget view;
    view.resize(400, 601);
    OpenStripe top(c_Top, new QWidget, &view);
    OpenStripe bottom(c_Bottom, new QWidget, &view);
    QCOMPARE(top.m_maximumHeight, 601);
    QCOMPARE(bottom.m_maximumHeight, 300);
    bottom.setMaximumHeight(77);
    QCOMPARE(bottom.m_maximumHeight, 77);
    // Not that of the widget.
    QCOMPARE(bottom.maximumHeight(), 15);
}

void TestFadeStripeView::rowsAreHeightsWithBothBars()
{
    Scene scene;
    QCOMPARE(scene.stripe->m_minimumSize, 130);
    scene.stripe->setRows(2);
    QCOMPARE(scene.stripe->height(), 230);
    scene.stripe->setRows(1);
    QCOMPARE(scene.stripe->height(), 130);
    scene.stripe->setRows(0);
    QCOMPARE(scene.stripe->height(), 15);
    QVERIFY(!scene.stripe->isFadedIn());
    // No such row.
    scene.stripe->setRows(9);
    QCOMPARE(scene.stripe->height(), 15);
    scene.stripe->setRows(-1);
    QCOMPARE(scene.stripe->height(), 15);
}

void TestFadeStripeView::sizesSnapAtTwoThirds()
{
    Scene scene;
    QCOMPARE(scene.stripe->snapToSize(66), 15);
    QCOMPARE(scene.stripe->snapToSize(67), 130);
    QCOMPARE(scene.stripe->snapToSize(129), 130);
    QCOMPARE(scene.stripe->snapToSize(130), 130);
    QCOMPARE(scene.stripe->snapToSize(177), 177);
}

void TestFadeStripeView::aSizeHintIsClampedAndTold_data()
{
    QTest::addColumn<int>("size");
    QTest::addColumn<int>("height");
    QTest::addColumn<bool>("open");
    QTest::addColumn<QStringList>("told");
    QTest::newRow("in between") << 150 << 150 << true << list("sizeChanged heightChanged geometryChanged");
    QTest::newRow("just open") << 16 << 16 << true << list("sizeChanged heightChanged geometryChanged");
    QTest::newRow("closed") << 15 << 15 << false
                            << list("sizeChanged heightChanged fadingOutFinished geometryChanged");
    QTest::newRow("below") << -3 << 15 << false
                           << list("sizeChanged heightChanged fadingOutFinished geometryChanged");
    QTest::newRow("above") << 2000 << 600 << true << list("sizeChanged heightChanged geometryChanged");
}

void TestFadeStripeView::aSizeHintIsClampedAndTold()
{
    QFETCH(int, size);
    QFETCH(int, height);
    Scene scene;
    scene.recorder.clear();
    scene.stripe->setSizeHint(size, true);
    QTEST(scene.recorder.names(), "told");
    QCOMPARE(scene.recorder.entries().at(0).arguments.first().toInt(), height - 30);
    QCOMPARE(scene.recorder.entries().at(1).arguments.at(0).toInt(), height);
    QCOMPARE(scene.recorder.entries().at(1).arguments.at(1).toInt(), 0);
    QCOMPARE(scene.stripe->height(), height);
    QTEST(scene.stripe->isFadedIn(), "open");
    QCOMPARE(scene.stripe->slider()->isVisible(), scene.stripe->isFadedIn());
    QCOMPARE(scene.stripe->getSizeHint(), height);
}

void TestFadeStripeView::duringFullHeightTheContentsAreNotTold()
{
    Scene scene;
    scene.stripe->goFullscreen(true);
    scene.recorder.clear();
    scene.stripe->setSizeHint(200, false);
    QCOMPARE(scene.recorder.count(word("sizeChanged")), 0);
    QCOMPARE(scene.recorder.count(word("heightChanged")), 1);
    scene.wait("fullscreenAppeared");
    scene.recorder.clear();
    scene.stripe->setSizeHint(200, false);
    scene.stripe->distributeHeight();
    QCOMPARE(scene.recorder.count(word("sizeChanged")), 0);
}

void TestFadeStripeView::distributingTellsTheHeightOfTheContents()
{
    Scene scene;
    scene.recorder.clear();
    scene.stripe->distributeHeight();
    QCOMPARE(scene.recorder.names(), list("sizeChanged"));
    QCOMPARE(scene.recorder.entries().first().arguments.first().toInt(), 100);
    scene.stripe->setRows(0);
    scene.recorder.clear();
    scene.stripe->distributeHeight();
    QCOMPARE(scene.recorder.names(), QStringList());
}

void TestFadeStripeView::openingAndClosingTellsTheHeight_data()
{
    theTreeIsAsTold_data();
}

void TestFadeStripeView::openingAndClosingTellsTheHeight()
{
    QFETCH(FadeView::EPositions, edge);
    Scene scene(edge, false);
    scene.recorder.clear();
    scene.stripe->fadein(true, false, 200);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.without(list("geometryChanged")), list("fadingIn heightChanged fadingInFinished"));
    QCOMPARE(scene.stripe->height(), 200);
    QVERIFY(scene.stripe->slider()->isVisible());
    scene.recorder.clear();
    scene.stripe->fadeout(true);
    scene.wait("fadingOutFinished");
    QCOMPARE(scene.without(list("geometryChanged")), list("fadingOut heightChanged fadingOutFinished"));
    for (const auto& entry : scene.recorder.entries()) {
        if (entry.name == word("heightChanged")) {
            QCOMPARE(entry.arguments.at(0).toInt(), 15);
            QCOMPARE(entry.arguments.at(1).toInt(), int(edge));
        }
    }
    QVERIFY(scene.stripe->slider()->isHidden());
}

void TestFadeStripeView::contentsComeAndGoWithThePanel()
{
    Scene scene;
    scene.stripe->fadeout(true);
    QVERIFY(!scene.contents->isHidden());
    scene.wait("fadingOutFinished");
    QVERIFY(scene.contents->isHidden());
    scene.stripe->fadein(true);
    QVERIFY(!scene.contents->isHidden());
    scene.wait("fadingInFinished");
}

void TestFadeStripeView::typesTurnDropsOnAndOff()
{
    Scene scene;
    QVERIFY(!scene.stripe->acceptDrops());
    scene.stripe->addAcceptedMimeType(word("text/plain"));
    QVERIFY(scene.stripe->acceptDrops());
    scene.stripe->addAcceptedMimeType(word("text/html"));
    QCOMPARE(scene.stripe->acceptedMimeTypes(), list("text/plain text/html"));
    scene.stripe->removeAcceptedMimeType(word("text/plain"));
    QVERIFY(scene.stripe->acceptDrops());
    scene.stripe->removeAcceptedMimeType(word("text/html"));
    QVERIFY(!scene.stripe->acceptDrops());
    scene.stripe->setAcceptedMimeTypes(list("a/b"));
    QVERIFY(scene.stripe->acceptDrops());
    scene.stripe->setAcceptedMimeTypes({});
    QVERIFY(!scene.stripe->acceptDrops());
}

void TestFadeStripeView::dropsAreReported()
{
    Scene scene;
    scene.stripe->setAcceptedMimeTypes(list("text/plain"));
    QString text;
    int pos = 0;
    connect(scene.stripe, &FadeStripeView::dragAccepted, this,
        [&](const QPointer<QObject>& source, const QMimeData& data, int at) {
            QVERIFY(!source);
            text = data.text();
            pos = at;
        });
    QMimeData data;
    data.setText(word("camera 7"));
    QMimeData other;
    other.setData(word("a/b"), "x");
    for (QMimeData* const dragged : {&data, &other}) {
        const bool wanted = dragged == &data;
        QDragEnterEvent enter(QPoint(5, 5), Qt::CopyAction, dragged, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(scene.stripe, &enter);
        QCOMPARE(enter.isAccepted(), wanted);
        QDragMoveEvent move(QPoint(5, 5), Qt::CopyAction, dragged, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(scene.stripe, &move);
        QCOMPARE(move.isAccepted() && wanted, wanted);
        text.clear();
        QDropEvent drop(QPoint(5, 5), Qt::CopyAction, dragged, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(scene.stripe, &drop);
        QCOMPARE(text, wanted ? word("camera 7") : QString());
    }
    QCOMPARE(pos, -1);
}

void TestFadeStripeView::ignoredSourcesAreRefused()
{
    Scene scene;
    QObject one;
    QObject two;
    scene.stripe->setIgnoredSources({&one, &one, nullptr, &two});
    QCOMPARE(scene.stripe->ignoredSources(), (QList<QObject*> {&one, &two}));
    scene.stripe->removeIgnoredSource(&one);
    QCOMPARE(scene.stripe->ignoredSources(), QList<QObject*> {&two});
    scene.stripe->addIgnoredSource(&two);
    scene.stripe->addIgnoredSource(&one);
    QCOMPARE(scene.stripe->ignoredSources(), (QList<QObject*> {&two, &one}));
    // A drag from another program has no source: never ignored.
    scene.stripe->setAcceptedMimeTypes(list("text/plain"));
    QMimeData data;
    data.setText(word("x"));
    QDropEvent drop(QPoint(5, 5), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QVERIFY(scene.stripe->isMimeTypeAccepted(&drop));
}

void TestFadeStripeView::stylesNameTheWidgets_data()
{
    QTest::addColumn<int>("style");
    QTest::addColumn<QStringList>("names");
    QTest::newRow("default") << 0 << list("header footer grab");
    QTest::newRow("red") << 1 << list("header-red footer-red grab-red");
    QTest::newRow("green") << 2 << list("header-green footer-green grab-green");
    QTest::newRow("grey") << 3 << list("header-solid-grey footer-solid-grey grab");
    QTest::newRow("blue") << 4 << list("header-solid-blue footer-solid-blue grab");
}

void TestFadeStripeView::stylesNameTheWidgets()
{
    QFETCH(int, style);
    Scene scene;
    using Setter = void (FadeStripeView::*)();
    static const Setter setters[] = {&FadeStripeView::setStyleDefault, &FadeStripeView::setStyleRed,
        &FadeStripeView::setStyleGreen, &FadeStripeView::setStyleSolidGrey, &FadeStripeView::setStyleSolidBlue};
    const Setter set = setters[qBound(0, style, 4)];
    (scene.stripe->*set)();
    QWidget* const handle = scene.movingBar()->layout()->itemAt(0)->widget()->layout()->itemAt(0)->widget();
    const auto names = [&] {
        return QStringList {scene.bar(true)->objectName(), scene.bar(false)->objectName(), handle->objectName()};
    };
    QTEST(names(), "names");
    // Nothing if the header has its name, whatever became of the others.
    handle->setObjectName(word("other"));
    (scene.stripe->*set)();
    QCOMPARE(handle->objectName(), word("other"));
    FadeStripeView::updateStyle(nullptr, word("x"));
}

void TestFadeStripeView::theControllerFilesStripes()
{
    Scene scene;
    FadeStripeViewController* const files = FadeStripeViewController::getInstance();
    QCOMPARE(files, FadeStripeViewController::getInstance());
    QCOMPARE(int(FadeStripeViewController::efspTop), 0);
    QCOMPARE(int(FadeStripeViewController::efspBottom), 2);
    QCOMPARE(int(FadeStripeViewController::efspWestern), 3);
    QVERIFY(!files->getTopFadeStripe(&scene.view));
    files->setTopFadeStripe(scene.stripe, &scene.view);
    QCOMPARE(files->getFadeStripe(&scene.view, FadeStripeViewController::efspTop), scene.stripe);
    QVERIFY(!files->getBottomFadeStripe(&scene.view));
    QVERIFY(!files->getWesternFadeStripe(&scene.view));
    files->setFadeStripe(scene.stripe, &scene.view, FadeStripeViewController::efspWestern);
    QCOMPARE(files->getWesternFadeStripe(&scene.view), scene.stripe);
    files->setBottomFadeStripe(scene.stripe, &scene.view);
    QCOMPARE(files->getBottomFadeStripe(&scene.view), scene.stripe);
    files->setTopFadeStripe(nullptr, &scene.view);
    files->setBottomFadeStripe(nullptr, &scene.view);
    files->setWesternFadeStripe(nullptr, &scene.view);
    QVERIFY(!files->getTopFadeStripe(&scene.view));
}

ZELKOV_TEST_MAIN(TestFadeStripeView)
#include "tst_fadestripeview.moc"
