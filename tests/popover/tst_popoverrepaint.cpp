// SPDX-License-Identifier: MIT
// What a popover paints and lays out again when it comes and goes, and that nothing is missing from the picture.
#include "popover/Balloon.h"
#include "popover/Container.h"
#include "popover/Controller.h"
#include "popover/Manager.h"

#include "BalloonScene.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "TestRow.h"

#include "CoreQt/Connect.h"
#include "indicators/ElidedButton.h"

#include <QtGui/QImage>
#include <QtGui/QPainter>
#include <QtGui/QScreen>
#include <QtTest/QtTest>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>

using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::Manager;
using zelkovtest::EventCount;
using zelkovtest::TestRow;

namespace
{
void settle()
{
    QCoreApplication::processEvents();
    QCoreApplication::processEvents();
}

// A window with a persistent popover of the Manager's.
struct RepaintScene
{
    explicit RepaintScene(int rows)
        : window(new QWidget)
    {
        Manager::init(1000);
        window->resize(400, 300);
        auto* const target = new QPushButton(QStringLiteral("target"), window);
        target->setGeometry(180, 20, 60, 20);
        window->show();
        controller
            = Manager::instance()->createController(0, false, false, window, target, QStringLiteral("title"),
                QString(), Balloon::eadTop | Balloon::eadBottom, QSizeF(), Balloon::ESizeConstraints());
        container = new Container(nullptr, QStringLiteral("rows"), Qt::Vertical, Qt::AlignTop);
        for (int i = 0; i < rows; ++i) {
            container->addItem(new TestRow(i));
        }
        controller->setContainer(container, Balloon::ebfTitle | Balloon::ebfClose);
        controller->setPersistence(true);
        settle();
    }
    ~RepaintScene()
    {
        delete window.data();
        Manager::deleteInstance();
    }
    void open()
    {
        controller->setActive(true, Controller::epsBalloon | Controller::epsNoFade, true);
        settle();
    }
    void close()
    {
        controller->dismiss(false, true);
        settle();
    }
    // What is on the screen, as opposed to what a fresh paint would give.
    QImage screen() const
    {
        return window->screen()->grabWindow(window->winId()).toImage().convertToFormat(QImage::Format_RGB32);
    }
    QImage fresh() const { return window->grab().toImage().convertToFormat(QImage::Format_RGB32); }

    QPointer<QWidget> window;
    QPointer<Controller> controller;
    QPointer<Container> container;
};

int worstDifference(const QImage& a, const QImage& b)
{
    if (a.size() != b.size()) {
        return 256;
    }
    int worst = 0;
    for (int y = 0; y < a.height(); ++y) {
        for (int x = 0; x < a.width(); ++x) {
            const QRgb p = a.pixel(x, y);
            const QRgb q = b.pixel(x, y);
            const int green = qAbs(qGreen(p) - qGreen(q));
            worst = qMax(worst, qMax(qAbs(qRed(p) - qRed(q)), qMax(green, qAbs(qBlue(p) - qBlue(q)))));
        }
    }
    return worst;
}

QImage bodyOf(Balloon* balloon)
{
    QImage image(balloon->size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::white);
    QPainter painter(&image);
    balloon->render(&painter, QPoint(), QRegion(), QWidget::RenderFlags());
    return image;
}
}

class TestPopoverRepaint : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void closingLeavesNothingOnTheScreen()
    {
        RepaintScene scene(5);
        const QImage before = scene.screen();
        QVERIFY(!before.isNull());
        for (int i = 0; i < 2; ++i) {
            scene.open();
            QVERIFY(worstDifference(scene.screen(), before) > 20);
            QVERIFY(worstDifference(scene.screen(), scene.fresh()) <= 2);
            scene.close();
            QCOMPARE(worstDifference(scene.screen(), before), 0);
        }
    }

    void hidingTheOverlayTakesAnOpenBalloonOffTheScreen()
    {
        RepaintScene scene(5);
        const QImage before = scene.screen();
        scene.open();
        scene.controller->hide();
        settle();
        QCOMPARE(worstDifference(scene.screen(), before), 0);
        QVERIFY(scene.controller->updatesEnabled());
    }

    void closingRepaintsTheBalloonsPlaceOnly()
    {
        RepaintScene scene(5);
        scene.open();
        const QRect balloon = scene.controller->balloon()->geometry();
        auto* const corner = new QWidget(scene.window);
        corner->setGeometry(0, 280, 20, 20);
        corner->lower();
        corner->show();
        QVERIFY(!balloon.intersects(corner->geometry()));
        settle();
        EventCount paints({QEvent::Paint});
        paints.watch(corner);
        scene.close();
        QCOMPARE(paints.count(), 0);
        QVERIFY(scene.controller->updatesEnabled());
    }

    void withAStyleSheetTheWholeOverlayIsRepainted()
    {
        RepaintScene scene(5);
        scene.controller->setStyleSheet(
            QStringLiteral("vx--PopoverWidget--Controller { background: rgba(0, 0, 0, 128); }"));
        const QImage before = scene.screen();
        scene.controller->setActive(true, Controller::epsBalloon, false);
        settle();
        QVERIFY(qAbs(qRed(scene.screen().pixel(2, 290)) - qRed(before.pixel(2, 290))) > 60);
        scene.close();
        QCOMPARE(worstDifference(scene.screen(), before), 0);
    }

    void rowsOutOfSightAreSeenOnceScrolledTo()
    {
        RepaintScene scene(100);
        scene.open();
        auto* const last = static_cast<TestRow*>(scene.container->getItem(99));
        QVERIFY(last->textElement()->visibleRegion().isEmpty());
        EventCount paints({QEvent::Paint});
        paints.watch(last);
        paints.watch(last->textElement());
        QScrollBar* const bar = scene.controller->balloon()->content()->verticalScrollBar();
        bar->setValue(bar->maximum());
        settle();
        QVERIFY(paints.count() >= 1);
        QVERIFY(worstDifference(scene.screen(), scene.fresh()) <= 2);
    }

    void aRowShownInAnOpenPopoverIsPainted()
    {
        RepaintScene scene(3);
        TestRow* const row = static_cast<TestRow*>(scene.container->getItem(1));
        row->hide();
        scene.open();
        scene.container->setItemVisibility(1, true, true);
        settle();
        settle();
        QVERIFY(!row->textElement()->visibleRegion().isEmpty());
        QVERIFY(worstDifference(scene.screen(), scene.fresh()) <= 2);
    }

    void reopeningDoesNotLayOutTheRowsAgain()
    {
        RepaintScene scene(5);
        // Wider than the rows, so that the size without the title bar differs.
        scene.controller->setTitle(QString(40, QLatin1Char('m')));
        scene.open();
        auto* const row = static_cast<TestRow*>(scene.container->getItem(3));
        const QRect balloon = scene.controller->balloon()->geometry();
        const QRect area = scene.controller->balloon()->content()->geometry();
        const QRect place = row->geometry();
        scene.close();
        EventCount resizes({QEvent::Resize, QEvent::Move});
        resizes.watch(row);
        scene.open();
        QCOMPARE(scene.controller->balloon()->geometry(), balloon);
        QCOMPARE(scene.controller->balloon()->content()->geometry(), area);
        QCOMPARE(row->geometry(), place);
        QCOMPARE(resizes.count(), 0);
    }

    void rowsAddedWhileClosedAreLaidOutOnReopening()
    {
        RepaintScene scene(2);
        scene.open();
        const int height = scene.controller->balloon()->height();
        scene.close();
        scene.container->addItem(new TestRow(7));
        scene.open();
        settle();
        QVERIFY(scene.controller->balloon()->height() > height);
        QVERIFY(!scene.container->getItem(7)->textElement()->visibleRegion().isEmpty());
        QVERIFY(worstDifference(scene.screen(), scene.fresh()) <= 2);
    }

    void theBodyLooksTheSameTheSecondTime_data()
    {
        QTest::addColumn<QColor>("upper");
        QTest::addColumn<QColor>("lower");
        QTest::newRow("default") << QColor() << QColor();
        QTest::newRow("gradient") << QColor(Qt::yellow) << QColor(Qt::blue);
        QTest::newRow("translucent") << QColor(10, 20, 30, 120) << QColor(10, 20, 30, 120);
    }

    void theBodyLooksTheSameTheSecondTime()
    {
        QFETCH(QColor, upper);
        QFETCH(QColor, lower);
        RepaintScene scene(3);
        Balloon* const balloon = scene.controller->balloon();
        balloon->setBackgroundColor(lower);
        balloon->setBackgroundColor2(upper);
        balloon->setBorderColor(Qt::darkGreen);
        scene.open();
        balloon->setBorderColor(Qt::darkRed); // forgets what was kept
        const QImage first = bodyOf(balloon);
        const QImage second = bodyOf(balloon);
        const QImage third = bodyOf(balloon);
        QVERIFY2(
            worstDifference(first, second) <= 2, QByteArray::number(worstDifference(first, second)).constData());
        QCOMPARE(worstDifference(second, third), 0);
    }

    void aKeptBodyFollowsColourArrowAndRadius()
    {
        RepaintScene scene(3);
        Balloon* const balloon = scene.controller->balloon();
        scene.open();
        QImage last = bodyOf(balloon);
        last = bodyOf(balloon);
        balloon->setBackgroundColor(Qt::red);
        QVERIFY(worstDifference(bodyOf(balloon), last) > 60);
        last = bodyOf(balloon);
        balloon->setBorderRadius(30);
        QVERIFY(worstDifference(bodyOf(balloon), last) > 60);
        last = bodyOf(balloon);
        balloon->setArrowWidth(3);
        QVERIFY(worstDifference(bodyOf(balloon), last) > 60);
    }

    void aScaledBalloonIsDrawnAndNotBlown()
    {
        RepaintScene scene(3);
        Balloon* const balloon = scene.controller->balloon();
        balloon->setBorderColor(Qt::black);
        scene.open();
        QImage pictures[3];
        for (QImage& picture : pictures) {
            picture = QImage(balloon->size() * 3, QImage::Format_ARGB32_Premultiplied);
            picture.fill(Qt::white);
            QPainter painter(&picture);
            painter.scale(3, 3);
            balloon->render(&painter, QPoint(), QRegion(), QWidget::RenderFlags());
        }
        QCOMPARE(worstDifference(pictures[0], pictures[1]), 0);
        QCOMPARE(worstDifference(pictures[0], pictures[2]), 0);
    }

    void rowsAreDressedInThePopoverOnly()
    {
        TestRow row(1);
        QVERIFY(!row.textElement()->testAttribute(Qt::WA_WState_Polished));
        QVERIFY(!row.textElement()->isHidden());
        QCOMPARE(QByteArray(row.textElement()->metaObject()->className()), QByteArray("ElidedButton"));
    }

    void connectionsOfRowsAreFoundByTheirTexts()
    {
        const char performed[]
            = "2itemPerformed( int, const QVariant &,const QVariant&, vx::PopoverWidget::EItemPerformedFlags )";
        Container container(nullptr, QStringLiteral("rows"), Qt::Vertical, Qt::AlignTop);
        auto* const row = new TestRow(1);
        container.addItem(row, vx::PopoverWidget::ecfDismiss | vx::PopoverWidget::ecfDismissAll);
        container.applyFlags(nullptr, vx::PopoverWidget::ecfDismiss);
        container.applyDefaultConnects(nullptr);
        QVERIFY(!vx::connect(row, performed, &container, performed, Qt::UniqueConnection));
        QVERIFY(vx::disconnect(row, performed, &container, "2dismissPopover()"));
        QVERIFY(vx::disconnect(row, performed, &container, "2dismissAllPopover()"));
        QVERIFY(vx::disconnect(row, performed, &container, performed));
        QVERIFY(vx::disconnect(row, "2layoutChanged()", &container, "2layoutChanged()"));
        QVERIFY(!vx::disconnect(row, "2layoutChanged()", &container, "2layoutChanged()"));
    }
};

ZELKOV_TEST_MAIN(TestPopoverRepaint)
#include "tst_popoverrepaint.moc"
