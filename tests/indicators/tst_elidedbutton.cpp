// SPDX-License-Identifier: MIT
// The push button that shortens its text, compared with push buttons that have the text it should show.
#include "indicators/ElidedButton.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtTest/QtTest>
#include <QtWidgets/QMenu>
#include <QtWidgets/QProxyStyle>
#include <QtWidgets/QStyleOptionButton>

namespace
{
const QString c_text = QStringLiteral("Connect the camera in the main entrance");

class Button : public ElidedButton
{
public:
    using ElidedButton::ElidedButton;

    QRect room() const
    {
        QStyleOptionButton option;
        initStyleOption(&option);
        QRect rect = style()->subElementRect(QStyle::SE_PushButtonContents, &option, this);
        rect.setRight(rect.right() - style()->pixelMetric(QStyle::PM_MenuButtonIndicator, &option, this));
        return rect;
    }
    QString cut(Qt::TextElideMode mode, int flags = Qt::TextShowMnemonic) const
    {
        return fontMetrics().elidedText(text(), mode, room().width(), flags);
    }
};

/// Notes the texts that buttons are drawn with.
class Spy : public QProxyStyle
{
public:
    Spy()
        : QProxyStyle(QStringLiteral("fusion"))
    {
    }
    mutable QStringList texts;
    int indicator = 12;

    void drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
        const QWidget* widget) const override
    {
        if (element == CE_PushButton) {
            texts << static_cast<const QStyleOptionButton*>(option)->text;
        }
        QProxyStyle::drawControl(element, option, painter, widget);
    }
    int pixelMetric(PixelMetric metric, const QStyleOption* option, const QWidget* widget) const override
    {
        return metric == PM_MenuButtonIndicator ? indicator : QProxyStyle::pixelMetric(metric, option, widget);
    }
};

QImage frame(QWidget& widget)
{
    return widget.grab().toImage();
}

bool looksLike(QPushButton& button, const QString& text)
{
    QPushButton plain(text);
    plain.resize(button.size());
    plain.setFont(button.font());
    plain.setMenu(button.menu());
    plain.setEnabled(button.isEnabled());
    return frame(button) == frame(plain);
}
}

class TestElidedButton : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void itStartsWithItsDefaults()
    {
        QWidget parent;
        ElidedButton button(&parent);
        QCOMPARE(button.getElideMode(), Qt::ElideNone);
        QCOMPARE(button.parentWidget(), &parent);
        ElidedButton text(c_text, &parent);
        QCOMPARE(text.text(), c_text);
        QCOMPARE(text.getElideMode(), Qt::ElideNone);
    }

    void asItComesItShowsTheWholeText()
    {
        Button button(c_text);
        button.resize(100, 30);
        QVERIFY(looksLike(button, c_text));
        button.resize(400, 30);
        QVERIFY(looksLike(button, c_text));
    }

    void allModesArePainted_data()
    {
        QTest::addColumn<int>("mode");
        QTest::newRow("left") << int(Qt::ElideLeft);
        QTest::newRow("right") << int(Qt::ElideRight);
        QTest::newRow("middle") << int(Qt::ElideMiddle);
    }

    void allModesArePainted()
    {
        QFETCH(int, mode);
        Button button(c_text);
        button.resize(120, 30);
        button.setElideMode(Qt::TextElideMode(mode));
        QCOMPARE(int(button.getElideMode()), mode);
        const QString cut = button.cut(Qt::TextElideMode(mode));
        QVERIFY(cut.contains(QChar(0x2026)));
        QVERIFY(looksLike(button, cut));
        QCOMPARE(button.text(), c_text);
        button.resize(600, 30);
        QVERIFY(looksLike(button, c_text));
        button.setElideMode(Qt::ElideNone);
        button.resize(120, 30);
        QVERIFY(looksLike(button, c_text));
    }

    void whatIsShownFollowsSizeTextAndFont()
    {
        Button button(c_text);
        button.setElideMode(Qt::ElideRight);
        button.resize(120, 30);
        QVERIFY(looksLike(button, button.cut(Qt::ElideRight)));
        button.resize(150, 30);
        QVERIFY(looksLike(button, button.cut(Qt::ElideRight)));
        button.setText(QStringLiteral("Disconnect all cameras of this site at once"));
        QVERIFY(looksLike(button, button.cut(Qt::ElideRight)));
        QFont font = button.font();
        font.setPixelSize(9);
        button.setFont(font);
        QVERIFY(looksLike(button, button.cut(Qt::ElideRight)));
        button.setEnabled(false);
        QVERIFY(looksLike(button, button.cut(Qt::ElideRight)));
    }

    void theMenuIndicatorReservesItsWidth()
    {
        Spy style;
        Button button(c_text);
        button.setStyle(&style);
        button.setElideMode(Qt::ElideRight);
        button.resize(160, 30);
        QMenu menu;
        button.setMenu(&menu);
        QStyleOptionButton option;
        option.initFrom(&button);
        const int whole = style.subElementRect(QStyle::SE_PushButtonContents, &option, &button).width();
        for (const int indicator : {0, 12, 40, 90}) {
            style.indicator = indicator;
            frame(button);
            QCOMPARE(style.texts.constLast(),
                button.fontMetrics().elidedText(c_text, Qt::ElideRight, whole - indicator, Qt::TextShowMnemonic));
        }
        QVERIFY(style.texts.constLast().size() < style.texts.constFirst().size());
        // The place is kept free without a menu, too.
        button.setMenu(nullptr);
        frame(button);
        QCOMPARE(style.texts.constLast(), style.texts.at(style.texts.size() - 2));
    }

    void theModeElidesWithoutRegardToMnemonics()
    {
        Spy style;
        Button button(QStringLiteral("&Con&&nect && the camera in the main entrance"));
        button.setStyle(&style);
        int width = 60;
        for (; width < 400; ++width) {
            button.resize(width, 30);
            if (button.cut(Qt::ElideRight, 0) != button.cut(Qt::ElideRight)) {
                break;
            }
        }
        QVERIFY(width < 400);
        frame(button);
        button.setElideMode(Qt::ElideRight);
        frame(button);
        QCOMPARE(style.texts.constLast(), button.cut(Qt::ElideRight, 0));
        // As long as nothing changes.
        frame(button);
        QCOMPARE(style.texts.constLast(), button.cut(Qt::ElideRight, 0));
        button.resize(width, 31);
        frame(button);
        QCOMPARE(style.texts.constLast(), button.cut(Qt::ElideRight));
        // Not painted in between: the rectangle is a new one.
        Button fresh(button.text());
        fresh.setStyle(&style);
        fresh.resize(width, 30);
        fresh.setElideMode(Qt::ElideRight);
        frame(fresh);
        QCOMPARE(style.texts.constLast(), fresh.cut(Qt::ElideRight));
    }

    void aNewModeRepaintsAtOnceAndTheSameOneDoesNot()
    {
        Spy style;
        Button button(c_text);
        button.setStyle(&style);
        button.resize(120, 30);
        button.show();
        QVERIFY(QTest::qWaitForWindowExposed(&button));
        QTRY_VERIFY(!style.texts.isEmpty());
        QCoreApplication::processEvents();
        style.texts.clear();
        button.setElideMode(Qt::ElideMiddle);
        QCOMPARE(style.texts, QStringList(button.cut(Qt::ElideMiddle)));
        button.setElideMode(Qt::ElideMiddle);
        QCoreApplication::processEvents();
        QCOMPARE(style.texts.size(), 1);
    }

    void itClicksLikeAnyButton()
    {
        Button button(c_text);
        button.setElideMode(Qt::ElideRight);
        QSignalSpy clicked(&button, &QPushButton::clicked);
        button.click();
        QCOMPARE(clicked.size(), 1);
        QCOMPARE(button.sizeHint().width(), QPushButton(c_text).sizeHint().width());
    }
};

ZELKOV_TEST_MAIN(TestElidedButton)
#include "tst_elidedbutton.moc"
