// SPDX-License-Identifier: MIT
// The date and time field with a way back to a default.
#include "controls/DateTimeDefaultEdit.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>
#include <QtWidgets/QPushButton>

namespace
{
const QDateTime noon(QDate(2024, 5, 17), QTime(12, 0));
const QDateTime night(QDate(2024, 5, 17), QTime(23, 0));

QPushButton* buttonOf(QWidget& edit)
{
    return edit.findChild<QPushButton*>();
}
}

class TestDateTimeDefaultEdit : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theSidesHaveTheirNumbers()
    {
        QCOMPARE(int(vx::DateTimeDefaultEdit::Left), 0);
        QCOMPARE(int(vx::DateTimeDefaultEdit::Right), 1);
    }

    void returnLeavesTheField()
    {
        vx::DateTimeDefaultEdit edit(nullptr, vx::DateTimeDefaultEdit::Right);
        QVERIFY(edit.m_returnLeavesField);
    }

    void withoutADefaultTheButtonNeverShows()
    {
        vx::DateTimeDefaultEdit edit(nullptr, vx::DateTimeDefaultEdit::Right);
        QVERIFY(edit.defaultDateTime().isNull());
        edit.show();
        edit.setDateTime(noon);
        QVERIFY(buttonOf(edit)->isHidden());
        edit.setDefaultDateTime(night);
        edit.setDateTime(noon);
        QVERIFY(!buttonOf(edit)->isHidden());
        edit.setDefaultDateTime(QDateTime());
        QVERIFY(buttonOf(edit)->isHidden());
    }

    void theDefaultIsShownAndStored()
    {
        vx::DateTimeDefaultEdit edit(nullptr, vx::DateTimeDefaultEdit::Right);
        edit.setDefaultDateTime(night);
        QCOMPARE(edit.defaultDateTime(), night);
        QCOMPARE(edit.dateTime(), night);
        QVERIFY(buttonOf(edit)->isHidden());
    }

    void theButtonShowsWhileTheValueDiffers()
    {
        vx::DateTimeDefaultEdit edit(nullptr, vx::DateTimeDefaultEdit::Left);
        edit.setDefaultDateTime(night);
        edit.setDateTime(noon);
        QVERIFY(!buttonOf(edit)->isHidden());
        edit.setDateTime(night);
        QVERIFY(buttonOf(edit)->isHidden());
    }

    void theButtonIsJudgedAnewWhereTheDefaultBecomesTheValue()
    {
        vx::DateTimeDefaultEdit edit(nullptr, vx::DateTimeDefaultEdit::Right);
        edit.setDefaultDateTime(night);
        edit.setDateTime(noon);
        QVERIFY(!buttonOf(edit)->isHidden());
        edit.setDefaultDateTime(noon); // no change of the value
        QVERIFY(buttonOf(edit)->isHidden());
    }

    void theButtonBringsTheDefaultBackAndLeavesTheField()
    {
        QWidget window;
        window.setFocusPolicy(Qt::StrongFocus);
        auto* const edit = new vx::DateTimeDefaultEdit(&window, vx::DateTimeDefaultEdit::Right);
        window.resize(300, 60);
        edit->resize(220, 30);
        window.show();
        QVERIFY(QTest::qWaitForWindowActive(&window));
        edit->setDefaultDateTime(night);
        edit->setDateTime(noon);
        edit->setFocus();
        QSignalSpy changed(edit, &QDateTimeEdit::dateTimeChanged);
        QSignalSpy finished(edit, &QAbstractSpinBox::editingFinished);
        QSignalSpy reset(edit, &vx::DateTimeDefaultEdit::resettedToDefault);
        QTest::mouseClick(buttonOf(*edit), Qt::LeftButton);
        QCOMPARE(edit->dateTime(), night);
        QCOMPARE(changed.count(), 1);
        QVERIFY(finished.count() >= 1);
        QCOMPARE(reset.count(), 0); // declared for clients, not emitted here
        QVERIFY(buttonOf(*edit)->isHidden());
        QVERIFY(!edit->hasFocus());
    }

    void theButtonKeepsItsSideInEveryDirection_data()
    {
        QTest::addColumn<int>("position");
        QTest::addColumn<int>("x");
        QTest::newRow("left") << int(vx::DateTimeDefaultEdit::Left) << 0;
        QTest::newRow("right") << int(vx::DateTimeDefaultEdit::Right) << 180;
    }
    void theButtonKeepsItsSideInEveryDirection()
    {
        QFETCH(int, position);
        QFETCH(int, x);
        for (const Qt::LayoutDirection direction : {Qt::LeftToRight, Qt::RightToLeft}) {
            vx::DateTimeDefaultEdit edit(nullptr, static_cast<vx::DateTimeDefaultEdit::EPosition>(position));
            edit.setLayoutDirection(direction);
            edit.resize(200, 30);
            edit.show();
            QCOMPARE(buttonOf(edit)->geometry(), QRect(x, 5, 20, 20));
        }
    }

    void theButtonLooksLikeOne()
    {
        vx::DateTimeDefaultEdit edit(nullptr, vx::DateTimeDefaultEdit::Right);
        QVERIFY(buttonOf(edit)->isFlat());
        QCOMPARE(buttonOf(edit)->toolTip(), QStringLiteral("Reset time"));
        QVERIFY(buttonOf(edit)->isHidden());
    }

    void theFieldMayBeDeletedByWhoHearsOfTheReset()
    {
        QWidget window;
        auto* const edit = new vx::DateTimeDefaultEdit(&window, vx::DateTimeDefaultEdit::Right);
        edit->setDefaultDateTime(night);
        edit->setDateTime(noon);
        QPointer<QWidget> gone(edit);
        connect(edit, &QDateTimeEdit::dateTimeChanged, &window, [edit] { edit->deleteLater(); });
        buttonOf(*edit)->click();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QVERIFY(!gone);
    }
};

ZELKOV_TEST_MAIN(TestDateTimeDefaultEdit)
#include "tst_datetimedefaultedit.moc"
