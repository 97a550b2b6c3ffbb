// SPDX-License-Identifier: MIT
// What a balloon is made of, its properties and its signals.
#include "popover/Balloon.h"

#include "BalloonScene.h"
#include "popover/HeaderContainer.h"
#include "sliders/NicerScrollBar.h"
#include "support/Pointer.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QMetaProperty>
#include <QtTest/QtTest>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollBar>

using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::HeaderContainer;
using zelkovtest::BalloonScene;
using zelkovtest::EventCount;
using zelkovtest::SignalRecorder;

class TestBalloon : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void numbersOfTheEnumerations();
    void theMainLayoutHoldsTitleHeaderRowsAndFooter();
    void aBalloonWithoutHeaderAndFooterHoldsTitleAndRows();
    void theTitleBarHoldsARowAndASeparator();
    void theRowsLieInAScrollAreaWithOverlayBars();
    void propertiesHaveTheirDefaults_data();
    void propertiesHaveTheirDefaults();
    void allPropertiesCanBeSetByStyleSheets();
    void storedPropertiesReadBack();
    void spacingGoesToTheMainLayout();
    void accessorsGiveWhatWasGiven();
    void marginsAreSetAndReadInOneStep();
    void featuresShowTheirParts_data();
    void featuresShowTheirParts();
    void theTitleIsShown();
    void signalsKeepTheirOrder();
    void theButtonsEmitDismissAndHelp();
    void scrollingEmitsContentScrolled();
    void aReleaseOnTheArrowStripDismisses_data();
    void aReleaseOnTheArrowStripDismisses();
    void aRealClickOnTheStripDismissesOnceAndStaysThere();
    void aBalloonWithoutSideHasNoStrip();
    void layoutUpdatedIsLeftToOthers();
    void aDestroyedTargetIsForgotten();
    void anOldTargetIsNoLongerWatched();
    void sayingTheSameTargetTwiceIsHarmless();
    void layoutChangedIsHandledOneTurnLater();
    void raisingStacksTheBalloonOnTop();
    void aHeaderThatComesLaterIsShownNowhere();
    void aContainerMayDieFirst();
    void dismissMayDeleteTheBalloon();
};

void TestBalloon::numbersOfTheEnumerations()
{
    QCOMPARE(int(Balloon::eadTop), 1);
    QCOMPARE(int(Balloon::eadBottom), 2);
    QCOMPARE(int(Balloon::eadLeft), 4);
    QCOMPARE(int(Balloon::eadRight), 8);
    QCOMPARE(int(Balloon::ebfClose), 1);
    QCOMPARE(int(Balloon::ebfHelp), 2);
    QCOMPARE(int(Balloon::ebfTitle), 4);
    QCOMPARE(int(Balloon::ebfNoHeader), 8);
    QCOMPARE(int(Balloon::escWidth), 1);
    QCOMPARE(int(Balloon::escHeight), 2);
    QCOMPARE(int(Balloon::ebfTitle | Balloon::ebfClose), 5);
}

void TestBalloon::theMainLayoutHoldsTitleHeaderRowsAndFooter()
{
    BalloonScene scene;
    auto* const header = new HeaderContainer(nullptr, QStringLiteral("header"), Qt::Horizontal, Qt::AlignLeft);
    auto* const footer = new HeaderContainer(nullptr, QStringLiteral("footer"), Qt::Horizontal, Qt::AlignLeft);
    scene.container->addHeader(header);
    scene.container->addFooter(footer);
    Balloon* const balloon = scene.make(5);

    auto* const layout = qobject_cast<QVBoxLayout*>(balloon->layout());
    QVERIFY(layout != nullptr);
    QCOMPARE(int(layout->alignment()), 0x84);
    QCOMPARE(layout->spacing(), 0);
    QCOMPARE(layout->contentsMargins(), QMargins(0, 0, 0, 0));
    QCOMPARE(layout->count(), 4);
    QCOMPARE(layout->itemAt(0)->widget()->layout()->count(), 2); // the title bar
    QCOMPARE(layout->itemAt(1)->widget(), header);
    QCOMPARE(layout->itemAt(2)->widget(), balloon->content());
    QCOMPARE(layout->itemAt(3)->widget(), footer);
    QCOMPARE(header->parentWidget(), balloon);
    QCOMPARE(footer->parentWidget(), balloon);
}

void TestBalloon::aBalloonWithoutHeaderAndFooterHoldsTitleAndRows()
{
    BalloonScene scene;
    Balloon* const balloon = scene.make(5);
    QCOMPARE(balloon->layout()->count(), 2);
    QCOMPARE(balloon->layout()->itemAt(1)->widget(), balloon->content());
}

void TestBalloon::theTitleBarHoldsARowAndASeparator()
{
    BalloonScene scene;
    Balloon* const balloon = scene.make(5);
    QWidget* const titleBar = balloon->layout()->itemAt(0)->widget();
    auto* const block = qobject_cast<QVBoxLayout*>(titleBar->layout());
    QVERIFY(block != nullptr);
    QCOMPARE(block->count(), 2);
    auto* const row = qobject_cast<QHBoxLayout*>(block->itemAt(0)->layout());
    QVERIFY(row != nullptr);
    for (const QBoxLayout* layout : {static_cast<QBoxLayout*>(block), static_cast<QBoxLayout*>(row)}) {
        QCOMPARE(int(layout->alignment()), 0x84);
        QCOMPARE(layout->spacing(), 0);
        QCOMPARE(layout->contentsMargins(), QMargins(0, 0, 0, 0));
    }
    QCOMPARE(block->itemAt(1)->widget()->objectName(), QStringLiteral("popoverSeparator"));
    QCOMPARE(block->itemAt(1)->widget()->metaObject(), &QWidget::staticMetaObject);

    QCOMPARE(row->count(), 6);
    auto* const label = qobject_cast<QLabel*>(row->itemAt(0)->widget());
    auto* const help = qobject_cast<QPushButton*>(row->itemAt(3)->widget());
    auto* const close = qobject_cast<QPushButton*>(row->itemAt(5)->widget());
    QVERIFY(label != nullptr && help != nullptr && close != nullptr);
    QCOMPARE(label->objectName(), QStringLiteral("popoverTitle"));
    QCOMPARE(help->objectName(), QStringLiteral("popoverHelpButton"));
    QCOMPARE(close->objectName(), QStringLiteral("popoverCloseButton"));
    QVERIFY(help->isFlat() && close->isFlat());
    QVERIFY(row->itemAt(1)->spacerItem()->expandingDirections().testFlag(Qt::Horizontal));
    QCOMPARE(row->stretch(1), 0);
    QCOMPARE(row->itemAt(2)->sizeHint().width(), 4);
    QCOMPARE(row->itemAt(4)->sizeHint().width(), 4);
}

void TestBalloon::theRowsLieInAScrollAreaWithOverlayBars()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make();
    QScrollArea* const area = balloon->content();
    QCOMPARE(area->widget(), scene.container);
    QVERIFY(area->widgetResizable());
    QCOMPARE(area->frameShape(), QFrame::NoFrame);
    QVERIFY(!area->autoFillBackground());
    QVERIFY(!area->viewport()->autoFillBackground());
    QVERIFY(!scene.container->autoFillBackground());
    QVERIFY(!balloon->autoFillBackground());

    const auto bars = area->findChildren<NicerScrollBar*>(QString(), Qt::FindDirectChildrenOnly);
    QCOMPARE(bars.size(), 2);
    QCOMPARE(bars.at(0)->orientation(), Qt::Horizontal);
    QCOMPARE(bars.at(1)->orientation(), Qt::Vertical);
    QCOMPARE(area->horizontalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);
    QCOMPARE(area->verticalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);
}

void TestBalloon::propertiesHaveTheirDefaults_data()
{
    QTest::addColumn<QVariant>("value");

    for (const char* name :
        {"innerMargin", "topBorderMargin", "bottomBorderMargin", "leftBorderMargin", "rightBorderMargin"}) {
        QTest::newRow(name) << QVariant(4);
    }
    QTest::newRow("spacing") << QVariant(0);
    QTest::newRow("arrowLength") << QVariant(15);
    QTest::newRow("arrowWidth") << QVariant(15);
    QTest::newRow("borderRadius") << QVariant(6);
    for (const char* name : {"backgroundColor", "backgroundColor2", "borderColor"}) {
        QTest::newRow(name) << QVariant(QColor());
    }
}

void TestBalloon::propertiesHaveTheirDefaults()
{
    BalloonScene scene;
    const Balloon* const balloon = scene.make();
    const QMetaObject* const meta = balloon->metaObject();
    const QMetaProperty property = meta->property(meta->indexOfProperty(QTest::currentDataTag()));
    QVERIFY(property.isReadable() && property.isWritable() && property.isStored());
    QTEST(property.read(balloon), "value");
}

void TestBalloon::allPropertiesCanBeSetByStyleSheets()
{
    BalloonScene scene;
    Balloon* const balloon = scene.make();
    scene.window.setStyleSheet(QStringLiteral(
        "vx--PopoverWidget--Balloon { qproperty-spacing: 1; qproperty-innerMargin: 2; qproperty-topBorderMargin: "
        "3;"
        "qproperty-bottomBorderMargin: 5; qproperty-leftBorderMargin: 6; qproperty-rightBorderMargin: 7;"
        "qproperty-arrowLength: 8; qproperty-arrowWidth: 9; qproperty-backgroundColor: #102030;"
        "qproperty-backgroundColor2: #405060; qproperty-borderColor: #708090; qproperty-borderRadius: 10; }"));
    scene.show();
    QCOMPARE(balloon->spacing(), 1);
    QCOMPARE(balloon->innerMargin(), 2);
    QCOMPARE(balloon->topBorderMargin(), 3);
    QCOMPARE(balloon->bottomBorderMargin(), 5);
    QCOMPARE(balloon->leftBorderMargin(), 6);
    QCOMPARE(balloon->rightBorderMargin(), 7);
    QCOMPARE(balloon->arrowLength(), 8);
    QCOMPARE(balloon->arrowWidth(), 9);
    QCOMPARE(balloon->backgroundColor(), QColor(0x10, 0x20, 0x30));
    QCOMPARE(balloon->backgroundColor2(), QColor(0x40, 0x50, 0x60));
    QCOMPARE(balloon->borderColor(), QColor(0x70, 0x80, 0x90));
    QCOMPARE(balloon->borderRadius(), 10);
}

void TestBalloon::storedPropertiesReadBack()
{
    BalloonScene scene;
    Balloon* const balloon = scene.make();
    int number = 20;
    for (const char* name : {"spacing", "innerMargin", "topBorderMargin", "bottomBorderMargin", "leftBorderMargin",
             "rightBorderMargin", "arrowLength", "arrowWidth", "borderRadius"}) {
        QVERIFY(balloon->setProperty(name, ++number));
        QCOMPARE(balloon->property(name).toInt(), number);
    }
    QCOMPARE(balloon->rightBorderMargin(), 26);
    for (const char* name : {"backgroundColor", "backgroundColor2", "borderColor"}) {
        QVERIFY(balloon->setProperty(name, QColor(++number, 0, 0)));
        QCOMPARE(balloon->property(name).value<QColor>(), QColor(number, 0, 0));
    }
}

void TestBalloon::spacingGoesToTheMainLayout()
{
    BalloonScene scene;
    Balloon* const balloon = scene.make();
    balloon->setSpacing(7);
    QCOMPARE(balloon->layout()->spacing(), 7);
    balloon->layout()->setSpacing(3);
    QCOMPARE(balloon->spacing(), 3);
}

void TestBalloon::accessorsGiveWhatWasGiven()
{
    BalloonScene scene;
    Balloon* const balloon = scene.make(6);
    QCOMPARE(balloon->parentWidget(), scene.parent);
    QCOMPARE(balloon->forWidget(), static_cast<const QWidget*>(scene.target));
    QCOMPARE(balloon->contentWidget(), scene.container);
    QCOMPARE(int(balloon->getFeatures()), 6);
    balloon->setForWidget(nullptr, QPointF());
    QVERIFY(balloon->forWidget() == nullptr);
}

void TestBalloon::marginsAreSetAndReadInOneStep()
{
    BalloonScene scene;
    Balloon* const balloon = scene.make();
    QVERIFY(QMetaObject::invokeMethod(
        balloon, "setMargins", Q_ARG(int, 1), Q_ARG(int, 2), Q_ARG(int, 3), Q_ARG(int, 5)));
    int left = 0;
    int top = 0;
    int right = 0;
    int bottom = 0;
    balloon->margins(left, top, right, bottom);
    QCOMPARE(QMargins(left, top, right, bottom), QMargins(1, 2, 3, 5));
    QCOMPARE(balloon->leftBorderMargin(), 1);
    QCOMPARE(balloon->topBorderMargin(), 2);
    QCOMPARE(balloon->rightBorderMargin(), 3);
    QCOMPARE(balloon->bottomBorderMargin(), 5);
}

void TestBalloon::featuresShowTheirParts_data()
{
    QTest::addColumn<int>("features");
    for (int features = 0; features < 16; ++features) {
        QTest::newRow(QByteArray::number(features).constData()) << features;
    }
}

void TestBalloon::featuresShowTheirParts()
{
    QFETCH(int, features);
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(~features & 15);
    balloon->setFeatures(BalloonScene::features(features));
    QCOMPARE(int(balloon->getFeatures()), features);
    QWidget* const titleBar = balloon->layout()->itemAt(0)->widget();
    QCOMPARE(titleBar->isHidden(), (features & 8) != 0);
    QCOMPARE(balloon->findChild<QWidget*>(QStringLiteral("popoverCloseButton"))->isHidden(), (features & 1) == 0);
    QCOMPARE(balloon->findChild<QWidget*>(QStringLiteral("popoverHelpButton"))->isHidden(), (features & 2) == 0);
    QCOMPARE(balloon->findChild<QWidget*>(QStringLiteral("popoverTitle"))->isHidden(), (features & 4) == 0);
    scene.show();
    QCOMPARE(titleBar->isVisible(), (features & 8) == 0);
}

void TestBalloon::theTitleIsShown()
{
    BalloonScene scene;
    Balloon* const balloon = scene.make(5);
    balloon->setTitle(QStringLiteral("Cameras"));
    QCOMPARE(balloon->findChild<QLabel*>(QStringLiteral("popoverTitle"))->text(), QStringLiteral("Cameras"));
}

void TestBalloon::signalsKeepTheirOrder()
{
    const QMetaObject& meta = Balloon::staticMetaObject;
    QList<QByteArray> methods;
    for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
        methods << meta.method(i).methodSignature();
    }
    const QList<QByteArray> expected {"dismiss()", "help()", "layoutUpdated()", "contentScrolled()",
        "setForRect(QRect)", "setMargins(int,int,int,int)", "setupLayout(bool)", "setupLayout()",
        "setVisible(bool)", "forWidgetDestroyed()"};
    QCOMPARE(methods, expected);
}

void TestBalloon::theButtonsEmitDismissAndHelp()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(7);
    balloon->setTitle(QStringLiteral("Cameras"));
    scene.show();
    SignalRecorder recorder(balloon);
    zelkovtest::Pointer pointer(&scene.window);
    const auto click = [&](const char* name) {
        QWidget* const button = balloon->findChild<QWidget*>(QLatin1String(name));
        pointer.click(button->mapTo(&scene.window, button->rect().center()));
    };
    click("popoverCloseButton");
    QCOMPARE(recorder.names(), QStringList {QStringLiteral("dismiss")});
    recorder.clear();
    click("popoverHelpButton");
    QCOMPARE(recorder.names(), QStringList {QStringLiteral("help")});
}

void TestBalloon::scrollingEmitsContentScrolled()
{
    BalloonScene scene;
    scene.addRow(QSize(600, 500));
    Balloon* const balloon = scene.make();
    scene.show();
    SignalRecorder recorder(balloon);
    QScrollBar* const vertical = balloon->content()->verticalScrollBar();
    QVERIFY(vertical->maximum() > 10);
    vertical->setValue(10);
    QCOMPARE(recorder.names(), QStringList {QStringLiteral("contentScrolled")});
    vertical->setValue(10);
    QCOMPARE(recorder.names().size(), 1);
    QScrollBar* const horizontal = balloon->content()->horizontalScrollBar();
    QVERIFY(horizontal->maximum() > 10);
    horizontal->setValue(5);
    QCOMPARE(
        recorder.names(), QStringList({QStringLiteral("contentScrolled"), QStringLiteral("contentScrolled")}));
}

void TestBalloon::aReleaseOnTheArrowStripDismisses_data()
{
    QTest::addColumn<int>("sides");
    QTest::addColumn<QPoint>("position"); // negative: from the other edge
    QTest::addColumn<bool>("dismisses");

    QTest::newRow("top, last of the strip") << 1 << QPoint(50, 14) << true;
    QTest::newRow("top, first of the body") << 1 << QPoint(50, 15) << false;
    QTest::newRow("top, first of all") << 1 << QPoint(0, 0) << true;
    QTest::newRow("top, above") << 1 << QPoint(50, -1000) << false;
    QTest::newRow("top, in the middle") << 1 << QPoint(50, 40) << false;
    // The edges belong to the body, so the first row of a strip at the end is one further.
    QTest::newRow("bottom, on the edge of the body") << 2 << QPoint(50, -15) << false;
    QTest::newRow("bottom, first of the strip") << 2 << QPoint(50, -14) << true;
    QTest::newRow("bottom, last of all") << 2 << QPoint(50, -1) << true;
    QTest::newRow("left, last of the strip") << 4 << QPoint(14, 20) << true;
    QTest::newRow("left, first of the body") << 4 << QPoint(15, 20) << false;
    QTest::newRow("right, on the edge of the body") << 8 << QPoint(-15, 20) << false;
    QTest::newRow("right, first of the strip") << 8 << QPoint(-14, 20) << true;
}

void TestBalloon::aReleaseOnTheArrowStripDismisses()
{
    QFETCH(int, sides);
    QFETCH(QPoint, position);
    QFETCH(bool, dismisses);
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, sides);
    scene.show();
    const auto fromEnd = [](int value, int length) { return value < 0 && value > -100 ? length + value : value; };
    position = QPoint(fromEnd(position.x(), balloon->width()), fromEnd(position.y(), balloon->height()));
    SignalRecorder recorder(balloon);
    QMouseEvent release(QEvent::MouseButtonRelease, position, Qt::LeftButton, Qt::NoButton, Qt::NoModifier);
    QCoreApplication::sendEvent(balloon, &release);
    QCOMPARE(recorder.names(), dismisses ? QStringList {QStringLiteral("dismiss")} : QStringList());
}

void TestBalloon::aRealClickOnTheStripDismissesOnceAndStaysThere()
{
    BalloonScene scene;
    scene.addRow(QSize(200, 40));
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    SignalRecorder recorder(balloon);
    EventCount releases({QEvent::MouseButtonRelease});
    releases.watch(scene.parent);
    zelkovtest::Pointer pointer(&scene.window);
    pointer.click(balloon->mapTo(&scene.window, QPoint(5, 5)));
    QCOMPARE(recorder.names(), QStringList {QStringLiteral("dismiss")});
    pointer.click(balloon->mapTo(&scene.window, QPoint(1, 30)));
    QCOMPARE(recorder.names().size(), 1);
    QCOMPARE(releases.count(), 0);
}

void TestBalloon::aBalloonWithoutSideHasNoStrip()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 15, QSizeF(), 3, false);
    scene.show();
    SignalRecorder recorder(balloon);
    for (const QPoint& position : {QPoint(0, 0), balloon->rect().bottomRight(), balloon->rect().center()}) {
        QMouseEvent release(QEvent::MouseButtonRelease, position, Qt::LeftButton, Qt::NoButton, Qt::NoModifier);
        QCoreApplication::sendEvent(balloon, &release);
    }
    QCOMPARE(recorder.names(), QStringList());
}

void TestBalloon::layoutUpdatedIsLeftToOthers()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make();
    SignalRecorder recorder(balloon);
    scene.show();
    balloon->setupLayout();
    balloon->setForRect(QRect(10, 10, 20, 20));
    balloon->setMargins(9, 9, 9, 9);
    balloon->hide();
    QCOMPARE(recorder.count(QStringLiteral("layoutUpdated")), 0);
}

void TestBalloon::aDestroyedTargetIsForgotten()
{
    BalloonScene scene;
    Balloon* const balloon = scene.make();
    delete scene.target;
    QVERIFY(balloon->forWidget() == nullptr);
}

void TestBalloon::anOldTargetIsNoLongerWatched()
{
    BalloonScene scene;
    Balloon* const balloon = scene.make();
    auto* const other = new QWidget(&scene.window);
    balloon->setForWidget(other, QPointF(-1, 0));
    QCOMPARE(balloon->forWidget(), static_cast<const QWidget*>(other));
    delete scene.target;
    QCOMPARE(balloon->forWidget(), static_cast<const QWidget*>(other));
    delete other;
    QVERIFY(balloon->forWidget() == nullptr);
}

void TestBalloon::sayingTheSameTargetTwiceIsHarmless()
{
    BalloonScene scene;
    Balloon* const balloon = scene.make();
    balloon->setForWidget(scene.target, QPointF());
    balloon->setForWidget(scene.target, QPointF());
    balloon->setForWidget(nullptr, QPointF());
    delete scene.target;
    QVERIFY(balloon->forWidget() == nullptr);
}

void TestBalloon::layoutChangedIsHandledOneTurnLater()
{
    BalloonScene scene;
    zelkovtest::PlainRow* const row = scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(8, 1);
    scene.show();
    const QRect before = balloon->geometry();
    row->setHint(QSize(100, 60));
    Q_EMIT scene.container->layoutChanged();
    QCOMPARE(balloon->geometry(), before);
    BalloonScene::settle();
    QCOMPARE(balloon->geometry(), before.adjusted(0, 0, 0, 20));
}

void TestBalloon::raisingStacksTheBalloonOnTop()
{
    BalloonScene scene;
    Balloon* const balloon = scene.make();
    auto* const above = new QWidget(scene.parent);
    QCOMPARE(scene.parent->children().last(), above);
    balloon->raiseBalloon(nullptr);
    QCOMPARE(scene.parent->children().last(), balloon);
    balloon->raiseBalloon(above);
    QCOMPARE(scene.parent->children().last(), balloon);
}

void TestBalloon::aHeaderThatComesLaterIsShownNowhere()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make();
    scene.show();
    const QSize before = balloon->size();
    auto* const header = new HeaderContainer(nullptr, QStringLiteral("header"), Qt::Horizontal, Qt::AlignLeft);
    BalloonScene::addRow(header, QSize(300, 50));
    scene.container->addHeader(header);
    BalloonScene::settle();
    QCOMPARE(balloon->layout()->count(), 2);
    QVERIFY(!header->isVisible());
    QCOMPARE(balloon->size(), before);
}

void TestBalloon::aContainerMayDieFirst()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    Balloon* const balloon = scene.make(5, 1);
    scene.show();
    delete scene.container;
    QVERIFY(balloon->contentWidget() == nullptr);
    balloon->setupLayout(true);
    balloon->raiseBalloon(nullptr);
    balloon->hide();
    balloon->show();
    QVERIFY(balloon->sizeHint().height() > 20);
}

void TestBalloon::dismissMayDeleteTheBalloon()
{
    BalloonScene scene;
    scene.addRow(QSize(100, 40));
    QPointer<Balloon> balloon = scene.make(8, 1);
    scene.show();
    connect(balloon, &Balloon::dismiss, balloon, [&balloon] { delete balloon.data(); });
    QMouseEvent release(QEvent::MouseButtonRelease, QPointF(3, 3), Qt::LeftButton, Qt::NoButton, Qt::NoModifier);
    QCoreApplication::sendEvent(balloon, &release);
    QVERIFY(balloon.isNull());
}

ZELKOV_TEST_MAIN(TestBalloon)
#include "tst_balloon.moc"
