// SPDX-License-Identifier: MIT
// A row: what it is built of, its setters, busy states, looks and rights.
#include "ItemTools.h"

#include "indicators/BadgeWidget.h"
#include "indicators/ElidedButton.h"
#include "popover/WidgetItem.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QMetaEnum>
#include <QtTest/QtTest>
#include <QtWidgets/QGraphicsDropShadowEffect>

#include <limits>

using itemtest::Rights;
using itemtest::Row;
using vx::PopoverWidget::EItemFlag;
using vx::PopoverWidget::Item;
using vx::PopoverWidget::WidgetItem;
namespace pw = vx::PopoverWidget;
using zelkovtest::SignalRecorder;

namespace
{
const QString c_Layout = QStringLiteral("layoutChanged");

QString text(const char* words)
{
    return QString::fromLatin1(words);
}
}

class TestItem : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theFlagsAreAMetaTypeFromTheFirstItemOn()
    {
        const Row row;
        QVERIFY(QMetaType::type("vx::PopoverWidget::EItemPerformedFlags") != QMetaType::UnknownType);
        QCOMPARE(Item::sPopoverWidgetItem, text("PopoverWidgetItem"));
    }

    void theEnumeratorsHaveTheirNumbers()
    {
        QCOMPARE(QList<int>({pw::eifControl, pw::eifDisabled, pw::eifText, pw::eifIcon, pw::eifAdditionalText,
                     pw::eifCentered, pw::eifBoldSelection, pw::eifDisclosureOnly, pw::eifRightClick,
                     pw::eifDoubleClick, pw::eifNoForward}),
            QList<int>({1, 2, 4, 8, 16, 32, 64, 128, 256, 512, 1024}));
        QCOMPARE(QList<int>({pw::eipIcon, pw::eipText, pw::eipAdditionalText, pw::eipControl, pw::eipLeftButton,
                     pw::eipRightButton, pw::eipDoubleClick, pw::eipDisclosure}),
            QList<int>({1, 2, 4, 8, 16, 32, 64, 128}));
        QCOMPARE(QList<int>({pw::ecfDismiss, pw::ecfDismissAll}), QList<int>({1, 2}));
    }

    void theSignalsHaveTheirOrder()
    {
        QStringList names;
        const QMetaObject& meta = Item::staticMetaObject;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
            if (meta.method(i).methodType() == QMetaMethod::Signal) {
                names << QString::fromLatin1(meta.method(i).methodSignature());
            }
        }
        QCOMPARE(names.mid(0, 3),
            QStringList({text("layoutChanged()"),
                text("itemPerformed(int,QVariant,QVariant,vx::PopoverWidget::EItemPerformedFlags)"),
                text("itemDragStarted()")}));
    }

    void flagsOfZeroGiveABareRow()
    {
        const Row row(itemtest::c_NoFlags, 7, text("text"), text("more"));
        QVERIFY(!row.iconElement());
        QVERIFY(!row.textElement());
        QVERIFY(!row.additionalTextElement());
        QVERIFY(!row.m_leftLayout);
        QVERIFY(!row.m_rightLayout);
        QVERIFY(!row.m_lastElement);
        QCOMPARE(row.layout(), static_cast<QLayout*>(row.m_mainLayout));
        QCOMPARE(row.m_mainLayout->count(), 1);
        QCOMPARE(row.m_mainLayout->itemAt(0)->widget(), static_cast<QWidget*>(row.busyWidget()));
        QCOMPARE(row.m_mainLayout->contentsMargins(), QMargins());
        QCOMPARE(row.m_mainLayout->spacing(), 5);
        QVERIFY(row.findChildren<ElidedButton*>().isEmpty());
    }

    void aFullRowHasItsElementsInOrder()
    {
        const Row row(pw::eifIcon | pw::eifText | pw::eifAdditionalText, 7, text("A & B"), text("C & D"));
        QCOMPARE(row.id(), 7);
        QCOMPARE(int(row.itemFlags()), 28);
        QCOMPARE(row.objectName(), text("row"));
        QCOMPARE(row.sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred));
        QCOMPARE(row.focusPolicy(), Qt::NoFocus);
        QVERIFY(!row.testAttribute(Qt::WA_MacShowFocusRect));

        QCOMPARE(row.m_mainLayout->count(), 2);
        QCOMPARE(row.m_mainLayout->itemAt(0)->layout(), static_cast<QLayout*>(row.m_leftLayout));
        QCOMPARE(row.m_mainLayout->itemAt(1)->layout(), static_cast<QLayout*>(row.m_rightLayout));
        for (const QHBoxLayout* layout : {row.m_leftLayout, row.m_rightLayout}) {
            QCOMPARE(layout->contentsMargins(), QMargins());
            QCOMPARE(layout->spacing(), 5);
        }
        QCOMPARE(row.m_leftLayout->alignment(), Qt::Alignment(Qt::AlignLeft));
        QCOMPARE(row.m_rightLayout->alignment(), Qt::Alignment(Qt::AlignRight));
        QCOMPARE(row.m_leftLayout->sizeConstraint(), QLayout::SetMinAndMaxSize);
        QCOMPARE(row.m_leftLayout->count(), 2);
        QCOMPARE(row.m_leftLayout->itemAt(0)->widget(), static_cast<QWidget*>(row.iconElement()));
        QCOMPARE(row.m_leftLayout->itemAt(1)->widget(), static_cast<QWidget*>(row.textElement()));
        QCOMPARE(row.m_rightLayout->count(), 2);
        QCOMPARE(row.m_rightLayout->itemAt(0)->widget(), static_cast<QWidget*>(row.additionalTextElement()));
        QCOMPARE(row.m_rightLayout->itemAt(1)->widget(), static_cast<QWidget*>(row.busyWidget()));

        QCOMPARE(row.iconElement()->objectName(), text("icon"));
        QCOMPARE(row.textElement()->objectName(), text("text"));
        QCOMPARE(row.additionalTextElement()->objectName(), text("additionalText"));
        QCOMPARE(row.busyWidget()->objectName(), text("popoverBusy"));
        QCOMPARE(row.iconElement()->text(), QString());
        QCOMPARE(row.textElement()->text(), text("A && B"));
        QCOMPARE(row.additionalTextElement()->text(), text("C && D"));
        QCOMPARE(row.iconElement()->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding));
        for (const ElidedButton* element : {row.iconElement(), row.textElement(), row.additionalTextElement()}) {
            QVERIFY(element->isFlat());
            QVERIFY(element->isCheckable());
            QVERIFY(element->testAttribute(Qt::WA_TransparentForMouseEvents));
            QCOMPARE(element->focusPolicy(), Qt::NoFocus);
            QCOMPARE(element->autoFillBackground(), element != row.additionalTextElement());
        }
        QCOMPARE(row.m_lastElement.data(), static_cast<QWidget*>(row.additionalTextElement()));
        QVERIFY(row.busyWidget()->isHidden());
        QVERIFY(!row.additionalTextElement()->isHidden());
    }

    void aCentredRowStandsBetweenSpacers()
    {
        const Row row(pw::eifText | pw::eifCentered);
        QCOMPARE(row.m_mainLayout->count(), 4);
        for (const int i : {0, 3}) {
            QSpacerItem* const spacer = row.m_mainLayout->itemAt(i)->spacerItem();
            QVERIFY(spacer);
            QCOMPARE(spacer->sizeHint(), QSize(0, 0));
            QCOMPARE(spacer->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding));
        }
        QCOMPARE(row.m_mainLayout->itemAt(1)->layout(), static_cast<QLayout*>(row.m_leftLayout));
        QCOMPARE(row.m_mainLayout->itemAt(2)->layout(), static_cast<QLayout*>(row.m_rightLayout));
    }

    void anEmptyTextGivesNoTextElement()
    {
        Row row(pw::eifText, 1, QString());
        QVERIFY(!row.textElement());
        QVERIFY(row.m_leftLayout);
        SignalRecorder recorder(&row);
        row.setText(text("late"));
        QCOMPARE(row.text(), QString());
        QCOMPARE(recorder.names(), QStringList());
    }

    void anEmptyAdditionalTextGivesAnElementAllTheSame()
    {
        const Row row(pw::eifAdditionalText, 1, text("text"));
        QVERIFY(row.additionalTextElement());
        QVERIFY(!row.textElement());
    }

    void theTextGoesToTheIconIfThereIsNothingElse()
    {
        const Row alone(pw::eifIcon, 1, text("A & B"));
        QCOMPARE(alone.iconElement()->text(), text("A && B"));
        const Row controlled(pw::eifIcon | pw::eifControl, 1, text("A & B"));
        QCOMPARE(controlled.iconElement()->text(), QString());
        QCOMPARE(controlled.m_lastElement.data(), static_cast<QWidget*>(controlled.iconElement()));
    }

    void textsAreEscapedButForTheAdditionalOne()
    {
        Row row(pw::eifIcon | pw::eifText | pw::eifAdditionalText);
        SignalRecorder recorder(&row);
        row.setText(text("a & b"));
        QCOMPARE(row.text(), text("a && b"));
        row.setIconText(text("c & d"));
        QCOMPARE(row.iconElement()->text(), text("c && d"));
        row.setAdditionalText(text("e & f"));
        QCOMPARE(row.additionalText(), text("e & f"));
        QCOMPARE(row.value(), QVariant(text("e & f")));
        row.setValue(text("g & h"));
        QCOMPARE(row.additionalText(), text("g && h"));
        QCOMPARE(recorder.names(), QStringList({c_Layout, c_Layout, c_Layout, c_Layout}));
    }

    void settersOfMissingElementsDoNothing()
    {
        Row row(itemtest::c_NoFlags);
        SignalRecorder recorder(&row);
        row.setText(text("x"));
        row.setIconText(text("x"));
        row.setAdditionalText(text("x"));
        row.setValue(text("x"));
        row.setCurrentText(text("x"));
        row.setElideMode(Qt::ElideLeft);
        row.cancelAnimations();
        QCOMPARE(recorder.names(), QStringList());
        QCOMPARE(row.text(), QString());
        QCOMPARE(row.additionalText(), QString());
        QCOMPARE(row.currentText(), QString());
        QCOMPARE(row.value(), QVariant());
        QVERIFY(!row.isChecked());
    }

    void valuesOfOtherTypesAreIgnored()
    {
        Row row(pw::eifAdditionalText, 1, QString(), text("old"));
        SignalRecorder recorder(&row);
        row.setValue(5);
        row.setValue(QVariant());
        row.setValue(QByteArray("bytes"));
        QCOMPARE(row.additionalText(), text("old"));
        QCOMPARE(recorder.names(), QStringList());
    }

    void userDataAreKept()
    {
        Row row;
        QCOMPARE(row.userData(), QVariant());
        row.setUserData(text("camera 3"));
        QCOMPARE(row.userData(), QVariant(text("camera 3")));
    }

    void checkingReachesIconAndText()
    {
        Row row(pw::eifIcon | pw::eifText | pw::eifAdditionalText);
        SignalRecorder recorder(&row);
        row.setChecked(true);
        QVERIFY(row.iconElement()->isChecked());
        QVERIFY(row.textElement()->isChecked());
        QVERIFY(!row.additionalTextElement()->isChecked());
        QVERIFY(row.isChecked());
        row.iconElement()->setChecked(false);
        QVERIFY(row.isChecked());
        row.textElement()->setChecked(false);
        QVERIFY(!row.isChecked());
        row.additionalTextElement()->setChecked(true);
        QVERIFY(!row.isChecked());
        row.setChecked(false);
        QCOMPARE(recorder.names(), QStringList({c_Layout, c_Layout}));
    }

    void aBareRowStillReportsThatItWasChecked()
    {
        Row row(itemtest::c_NoFlags);
        SignalRecorder recorder(&row);
        row.setChecked(true);
        QCOMPARE(recorder.names(), QStringList({c_Layout}));
        QVERIFY(!row.isChecked());
    }

    void theElideModeReachesAllElements()
    {
        Row row(pw::eifIcon | pw::eifText | pw::eifAdditionalText);
        row.setElideMode(Qt::ElideMiddle);
        for (const ElidedButton* element : {row.iconElement(), row.textElement(), row.additionalTextElement()}) {
            QCOMPARE(element->getElideMode(), Qt::ElideMiddle);
        }
    }

    void theBusyMarkTakesThePlaceOfTheLastElement_data()
    {
        QTest::addColumn<bool>("hideLast");
        QTest::newRow("beside") << false;
        QTest::newRow("in its place") << true;
    }

    void theBusyMarkTakesThePlaceOfTheLastElement()
    {
        QFETCH(bool, hideLast);
        Row row(pw::eifText | pw::eifAdditionalText);
        SignalRecorder recorder(&row);
        row.setBusy(true, hideLast);
        QVERIFY(!row.busyWidget()->isHidden());
        QVERIFY(row.busyWidget()->badge().badgeBusy());
        QCOMPARE(row.additionalTextElement()->isHidden(), hideLast);
        QVERIFY(!row.textElement()->isHidden());
        row.setBusy(false, hideLast);
        QVERIFY(row.busyWidget()->isHidden());
        QVERIFY(!row.busyWidget()->badge().badgeBusy());
        QVERIFY(!row.additionalTextElement()->isHidden());
        QCOMPARE(recorder.names(), QStringList({c_Layout, c_Layout}));
    }

    void theEndOfBusyShowsTheLastElementInAnyCase()
    {
        Row row;
        row.textElement()->hide();
        row.setBusy(false, true);
        QVERIFY(!row.textElement()->isHidden());
    }

    void aBareRowCanBeBusyToo()
    {
        Row row(itemtest::c_NoFlags);
        row.setBusy(true, true);
        QVERIFY(!row.busyWidget()->isHidden());
        row.setBusy(false, true);
        QVERIFY(row.busyWidget()->isHidden());
    }

    void aBusyTextShowsTheBadge()
    {
        Row row;
        SignalRecorder recorder(&row);
        row.setBusyText(text("12"), false);
        QVERIFY(!row.busyWidget()->isHidden());
        QVERIFY(!row.textElement()->isHidden());
        QCOMPARE(row.busyWidget()->badgeLabel(), text("12"));
        row.setBusyText(text("3"), true);
        QVERIFY(row.textElement()->isHidden());
        row.setBusyText(QString(), false);
        QVERIFY(row.busyWidget()->isHidden());
        QVERIFY(!row.textElement()->isHidden());
        QCOMPARE(recorder.names(), QStringList({c_Layout, c_Layout, c_Layout}));
    }

    void aBusyTextNeedsALastElement()
    {
        Row row(itemtest::c_NoFlags);
        SignalRecorder recorder(&row);
        row.setBusyText(text("12"), true);
        QVERIFY(row.busyWidget()->isHidden());
        QCOMPARE(row.busyWidget()->badgeLabel(), QString());
        QCOMPARE(recorder.names(), QStringList({c_Layout}));
    }

    void busySurvivesTheDeathOfTheLastElement()
    {
        Row row;
        auto* const control = new QPushButton(&row);
        row.m_lastElement = control;
        row.setBusy(true, true);
        QVERIFY(control->isHidden());
        delete control;
        row.setBusy(false, true);
        row.setBusyText(text("1"), true);
        QVERIFY(row.busyWidget()->isHidden());
    }

    void spacingAndMarginsAreProperties()
    {
        Row row;
        QCOMPARE(row.spacing(), 5);
        QVERIFY(row.setProperty("spacing", 9));
        QCOMPARE(row.property("spacing").toInt(), 9);
        for (const QHBoxLayout* layout : {row.m_mainLayout, row.m_leftLayout, row.m_rightLayout}) {
            QCOMPARE(layout->spacing(), 9);
        }
        QVERIFY(row.setProperty("leftMargin", 3));
        QVERIFY(row.setProperty("rightMargin", 4));
        QCOMPARE(row.m_mainLayout->contentsMargins(), QMargins(3, 0, 4, 0));
        QCOMPARE(row.leftMargin(), 3);
        QCOMPARE(row.rightMargin(), 4);
        row.setSpacing(std::numeric_limits<int>::max());
        QCOMPARE(row.spacing(), std::numeric_limits<int>::max());
        Row bare(itemtest::c_NoFlags);
        bare.setSpacing(2);
        QCOMPARE(bare.m_mainLayout->spacing(), 2);
    }

    void theShadowIsTheIconsAndNotReported()
    {
        Row row(pw::eifIcon);
        SignalRecorder recorder(&row);
        QVERIFY(!row.shadowEnabled());
        QVERIFY(row.setProperty("shadow", true));
        auto* const shadow = qobject_cast<QGraphicsDropShadowEffect*>(row.iconElement()->graphicsEffect());
        QVERIFY(shadow);
        QCOMPARE(shadow->color(), QColor(31, 31, 31, 47));
        QCOMPARE(shadow->blurRadius(), 2.0);
        QCOMPARE(shadow->offset(), QPointF(2.0, 2.0));
        QVERIFY(!row.property("shadow").toBool());
        row.setEnableShadow(false);
        QVERIFY(!row.iconElement()->graphicsEffect());
        QCOMPARE(recorder.names(), QStringList({c_Layout, c_Layout}));
        row.setGraphicsEffect(new QGraphicsDropShadowEffect);
        QVERIFY(row.shadowEnabled());
    }

    void withoutAnIconTheShadowIsOnlyAnnounced()
    {
        Row row;
        SignalRecorder recorder(&row);
        row.setEnableShadow(true);
        QCOMPARE(recorder.names(), QStringList({c_Layout}));
        QVERIFY(!row.shadowEnabled());
    }

    void boldSelectionFollowsTheCheckedState()
    {
        Row row(pw::eifText | pw::eifIcon | pw::eifBoldSelection);
        row.setChecked(true);
        QFont font = row.textElement()->font();
        QVERIFY(font.bold());
        QVERIFY(font.fixedPitch());
        QCOMPARE(font.letterSpacingType(), QFont::AbsoluteSpacing);
        // Fonts keep it in 1/64 pixel.
        QVERIFY(qAbs(font.letterSpacing() + 0.9) < 1.0 / 64);
        row.setChecked(false);
        font = row.textElement()->font();
        QVERIFY(!font.bold());
        QCOMPARE(font.letterSpacing(), 0.0);
        // What was checked behind the row's back is seen when it is shown.
        row.iconElement()->setChecked(true);
        QVERIFY(!row.textElement()->font().bold());
        row.show();
        QVERIFY(row.textElement()->font().bold());
    }

    void withoutTheFlagTheFontStays()
    {
        Row row;
        const QFont font = row.textElement()->font();
        row.setChecked(true);
        QCOMPARE(row.textElement()->font(), font);
        Row empty(pw::eifText | pw::eifBoldSelection);
        empty.setText(QString());
        empty.setChecked(true);
        QVERIFY(!empty.textElement()->font().bold());
    }

    void theFocusGoesToTheFocusItem()
    {
        QWidget host;
        Row row(pw::eifText, 1, text("row"), QString(), &host);
        QPushButton button(&host);
        host.show();
        QVERIFY(QTest::qWaitForWindowActive(&host));
        button.clearFocus();
        row.setKeyboardFocus();
        QVERIFY(!button.hasFocus());
        row.m_focusItem = &button;
        row.setKeyboardFocus();
        QVERIFY(button.hasFocus());
    }

    void withoutConditionsARowIsNotProtected()
    {
        Row row;
        QVERIFY(row.m_protected);
        QVERIFY(!row.isProtected());
        QVERIFY(!row.m_protected);
        // A right that nobody can be asked for protects nothing.
        row.setSecurityCheck(text("no"));
        QVERIFY(!row.isProtected());
    }

    void theManagerOfRightsDecides()
    {
        const auto rights = std::make_shared<Rights>();
        Item::setSecurityManager(rights);
        QCOMPARE(Item::securityManager().get(), static_cast<vx::ISecurityManager*>(rights.get()));
        Row row;
        QVERIFY(!row.isProtected());
        QCOMPARE(rights->m_asked, QStringList());
        row.setSecurityCheck(text("no"));
        QVERIFY(row.isProtected());
        QVERIFY(row.m_protected);
        row.setSecurityCheck(text("yes"));
        QVERIFY(!row.isProtected());
        row.setAdminOnly(true);
        QVERIFY(row.isProtected());
        rights->m_administrator = true;
        QVERIFY(!row.isProtected());
        QCOMPARE(rights->m_asked,
            QStringList({text("no 1 0 0"), text("yes 1 0 0"), text("admin 1 0"), text("admin 1 0")}));
        Item::setSecurityManager(nullptr);
        QVERIFY(row.isProtected());
    }

    void theFilterSwallowsPressesWhileProtected()
    {
        const auto rights = std::make_shared<Rights>();
        Item::setSecurityManager(rights);
        Row row;
        QPushButton control;
        control.resize(40, 20);
        control.installEventFilter(&row);
        QSignalSpy clicked(&control, &QPushButton::clicked);
        itemtest::click(&control, QPoint(5, 5));
        QCOMPARE(clicked.count(), 1);
        row.setSecurityCheck(text("no"));
        itemtest::click(&control, QPoint(5, 5));
        QCOMPARE(clicked.count(), 1);
        QVERIFY(!control.isDown());
        // Other events pass, and nobody is asked about them.
        rights->m_asked.clear();
        QMouseEvent move(QEvent::MouseMove, QPoint(5, 5), Qt::NoButton, Qt::NoButton, Qt::NoModifier);
        QVERIFY(!row.eventFilter(&control, &move));
        QMouseEvent twice(
            QEvent::MouseButtonDblClick, QPoint(5, 5), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
        QVERIFY(!row.eventFilter(&control, &twice));
        QCOMPARE(rights->m_asked, QStringList());
        Item::setSecurityManager(nullptr);
    }

    void aStyleSheetGivesTheRowItsBackground()
    {
        QWidget host;
        host.resize(120, 40);
        auto* const row = new Row(itemtest::c_NoFlags, 1, QString(), QString(), &host);
        row->setGeometry(10, 10, 100, 20);
        row->setStyleSheet(text("vx--PopoverWidget--Item { background: rgb(10, 200, 30); }"));
        const QImage picture = row->grab().toImage();
        QCOMPARE(picture.pixelColor(50, 10), QColor(10, 200, 30));
    }

    void aWidgetItemHoldsAForeignWidget()
    {
        QPointer<QPushButton> button(new QPushButton);
        {
            WidgetItem item(button, text("holder"), 4, nullptr);
            QCOMPARE(button->parentWidget(), static_cast<QWidget*>(&item));
            QCOMPARE(item.getFocusItem(), static_cast<QWidget*>(button.data()));
            QCOMPARE(item.value(), QVariant());
            QCOMPARE(item.id(), 4);
            QCOMPARE(item.objectName(), text("holder"));
            QCOMPARE(int(item.itemFlags()), 0);
        }
        QVERIFY(!button);
        WidgetItem empty(nullptr, QString(), 5, nullptr);
        QVERIFY(!empty.getFocusItem());
        empty.setKeyboardFocus();
    }

    void deletionInAnySignalIsSurvived_data()
    {
        QTest::addColumn<int>("operation");
        for (int i = 0; i < 8; ++i) {
            QTest::newRow(qPrintable(QString::number(i))) << i;
        }
    }

    void deletionInAnySignalIsSurvived()
    {
        QFETCH(int, operation);
        QPointer<Row> row(new Row(pw::eifIcon | pw::eifText | pw::eifAdditionalText));
        connect(row.data(), &Item::layoutChanged, this, [row] { delete row.data(); });
        switch (operation) {
        case 0:
            row->setText(text("x"));
            break;
        case 1:
            row->setIconText(text("x"));
            break;
        case 2:
            row->setAdditionalText(text("x"));
            break;
        case 3:
            row->setValue(text("x"));
            break;
        case 4:
            row->setChecked(true);
            break;
        case 5:
            row->setBusy(true, true);
            break;
        case 6:
            row->setBusyText(text("x"), true);
            break;
        default:
            row->setEnableShadow(true);
            break;
        }
        QVERIFY(!row);
    }

    void deletionByAnElementsOwnSignalIsSurvived()
    {
        QPointer<Row> row(new Row(pw::eifIcon | pw::eifText));
        connect(row->iconElement(), &QPushButton::toggled, this, [row] { row->deleteLater(); });
        row->setChecked(true);
        QTRY_VERIFY(!row);
    }
};

ZELKOV_TEST_MAIN(TestItem)
#include "tst_item.moc"
