// SPDX-License-Identifier: MIT
// The three buttons: own painting below the pulse, the end of the pulse on a press, menu and shadow.
#include "TestCase.h"
#include "TestMain.h"
#include "foundation/TFadingWidget.h"
#include "support/Pointer.h"

#include <QtCore/QTimer>
#include <QtGui/QContextMenuEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QGraphicsBlurEffect>
#include <QtWidgets/QGraphicsDropShadowEffect>
#include <QtWidgets/QMenu>

namespace
{
template <typename T>
class Button : public vx::TFadingWidget<T>
{
public:
    explicit Button(QWidget* parent = nullptr, bool shadow = false)
        : vx::TFadingWidget<T>(parent, 100, 16, QColor(255, 0, 0), 0, 128, shadow)
    {
        QImage image(16, 16, QImage::Format_ARGB32);
        image.fill(Qt::black);
        this->setIconSize(QSize(16, 16));
        this->setIcon(QIcon(QPixmap::fromImage(image)));
        this->resize(60, 40);
    }
    int alpha() const { return this->m_color.alpha(); }
    bool runs() const { return this->m_timer.isActive(); }
    QImage frame() { return this->grab().toImage(); }
};

class Parent : public QWidget
{
public:
    int menus = 0;

protected:
    void contextMenuEvent(QContextMenuEvent* event) override
    {
        ++menus;
        event->accept();
    }
};

template <typename T>
void aPressEndsThePulse()
{
    QWidget host;
    host.resize(100, 80);
    auto* button = new Button<T>(&host);
    button->move(10, 10);
    host.show();
    QVERIFY(QTest::qWaitForWindowExposed(&host));
    button->startFading();
    button->frame();
    button->frame();
    QVERIFY(button->runs());
    const int before = button->alpha();
    QVERIFY(before > 0);
    zelkovtest::Pointer pointer(&host);
    pointer.move(button->geometry().topLeft() + QPoint(8, 20));
    QVERIFY(button->runs());
    // Not yet painted again: what the press changes is to be seen before that.
    int atPress = -1;
    QObject::connect(button, &T::pressed, button, [&] { atPress = button->alpha(); });
    pointer.press();
    QTRY_VERIFY(!button->runs());
    QVERIFY(atPress > 0);
    QCOMPARE(button->alpha(), atPress);
    pointer.release();
}

template <typename T>
void theTintLiesOverTheButton()
{
    Button<T> button;
    const QImage plain = button.frame();
    button.startFading();
    QCOMPARE(button.frame(), plain);
    for (int i = 0; i < 4; ++i) {
        button.frame();
    }
    QCOMPARE(button.alpha(), 80);
    const QImage tinted = button.frame();
    const QPoint centre = button.rect().center();
    const QColor under = plain.pixelColor(centre);
    const QColor over = tinted.pixelColor(centre);
    const int red = (under.red() * (255 - 80) + 255 * 80) / 255;
    QVERIFY(qAbs(over.red() - red) <= 2);
    QVERIFY(qAbs(over.green() - under.green() * (255 - 80) / 255) <= 2);
    QCOMPARE(tinted.pixelColor(1, 20), plain.pixelColor(1, 20));
    button.stopFading();
    QVERIFY(!button.runs());
    QCOMPARE(button.alpha(), 0);
    QCOMPARE(button.frame(), plain);
}
}

class TestTFadingWidget : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aPressEndsThePulseAndKeepsTheAlphaOnAToolButton() { aPressEndsThePulse<QToolButton>(); }
    void aPressEndsThePulseAndKeepsTheAlphaOnAPushButton() { aPressEndsThePulse<QPushButton>(); }
    void aPressEndsThePulseAndKeepsTheAlphaOnACheckBox() { aPressEndsThePulse<QCheckBox>(); }

    void theTintLiesOverThePaintedToolButton() { theTintLiesOverTheButton<QToolButton>(); }
    void theTintLiesOverThePaintedPushButton() { theTintLiesOverTheButton<QPushButton>(); }
    void theTintLiesOverThePaintedCheckBox() { theTintLiesOverTheButton<QCheckBox>(); }

    void aPressDoesNotRepaintByItself()
    {
        Button<QPushButton> button;
        button.startFading();
        button.frame();
        button.click();
        QVERIFY(!button.runs());
        QCOMPARE(button.alpha(), 16);
        button.startFading();
        QVERIFY(button.runs());
        QCOMPARE(button.alpha(), 0);
    }

    void theShadowIsThatOfTheConstructor()
    {
        Button<QPushButton> plain;
        QVERIFY(plain.graphicsEffect() == nullptr);
        Button<QPushButton> button(nullptr, true);
        auto* shadow = qobject_cast<QGraphicsDropShadowEffect*>(button.graphicsEffect());
        QVERIFY(shadow != nullptr);
        QCOMPARE(shadow->blurRadius(), 10.0);
        QCOMPARE(shadow->offset(), QPointF(2.5, 2.5));
        QCOMPARE(shadow->parent(), &button);
        button.frame();
        QPointer<QGraphicsEffect> old = shadow;
        button.enableShadow(true);
        QVERIFY(old == nullptr);
        QVERIFY(button.graphicsEffect() != nullptr);
        button.enableShadow(false);
        QVERIFY(button.graphicsEffect() == nullptr);
        button.setGraphicsEffect(new QGraphicsBlurEffect);
        button.enableShadow(false);
        QVERIFY(button.graphicsEffect() == nullptr);
    }

    void aRightClickOnAToolButtonOpensItsMenu()
    {
        Parent host;
        host.resize(100, 80);
        auto* button = new Button<QToolButton>(&host);
        QMenu menu;
        menu.addAction(QStringLiteral("One"));
        button->setMenu(&menu);
        host.show();
        QVERIFY(QTest::qWaitForWindowExposed(&host));
        int shown = 0;
        connect(&menu, &QMenu::aboutToShow, this, [&] {
            ++shown;
            QTimer::singleShot(0, &menu, &QMenu::close);
        });
        QContextMenuEvent event(QContextMenuEvent::Mouse, QPoint(5, 5), button->mapToGlobal(QPoint(5, 5)));
        QCoreApplication::sendEvent(button, &event);
        QCOMPARE(shown, 1);
        QCOMPARE(host.menus, 0);
    }

    void aToolButtonWithoutAMenuDoesNothing()
    {
        Button<QToolButton> button;
        QContextMenuEvent event(QContextMenuEvent::Mouse, QPoint(5, 5));
        QCoreApplication::sendEvent(&button, &event);
    }

    void aRightClickOnTheOthersIsLeftToTheParent()
    {
        Parent host;
        auto* push = new Button<QPushButton>(&host);
        auto* check = new Button<QCheckBox>(&host);
        for (QWidget* button : {static_cast<QWidget*>(push), static_cast<QWidget*>(check)}) {
            QContextMenuEvent event(QContextMenuEvent::Mouse, QPoint(5, 5));
            QCoreApplication::sendEvent(button, &event);
        }
        QCOMPARE(host.menus, 2);
    }

    void aSlotOfPressedMayDeleteThePulsingButton()
    {
        QWidget host;
        host.resize(100, 80);
        host.show();
        QVERIFY(QTest::qWaitForWindowExposed(&host));
        QPointer<Button<QPushButton>> button = new Button<QPushButton>(&host);
        button->show();
        button->startFading();
        connect(button, &QPushButton::pressed, this, [&] { delete button.data(); });
        zelkovtest::Pointer pointer(&host);
        pointer.move(QPoint(20, 20));
        pointer.press();
        QTRY_VERIFY(button == nullptr);
        pointer.release();
    }

    void theInstancesAreFoundByTheirMixIn()
    {
        Button<QToolButton> button;
        QWidget* widget = &button;
        QVERIFY(dynamic_cast<vx::FadingWidget*>(widget) != nullptr);
        QVERIFY((dynamic_cast<vx::TFadingWidget<QToolButton>*>(widget)) != nullptr);
        QVERIFY((dynamic_cast<vx::TFadingWidget<QPushButton>*>(widget)) == nullptr);
    }
};

ZELKOV_TEST_MAIN(TestTFadingWidget)
#include "tst_tfadingwidget.moc"
