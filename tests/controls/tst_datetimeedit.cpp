// SPDX-License-Identifier: MIT
// The date and time field of frame labels.
#include "controls/DateTimeEdit.h"
#include "support/Pointer.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QVBoxLayout>

#include <memory>

namespace
{
const QDateTime noon(QDate(2024, 5, 17), QTime(12, 30, 15));

struct Host
{
    QWidget window;
    vx::DateTimeEdit* edit = new vx::DateTimeEdit(&window);

    Host()
    {
        window.setFocusPolicy(Qt::StrongFocus);
        window.resize(300, 80);
        edit->setGeometry(10, 10, 200, 28);
        edit->setDateTime(noon);
        window.show();
        QVERIFY2(QTest::qWaitForWindowActive(&window), "window never active");
    }
};
}

class TestDateTimeEdit : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aPressOnAReadOnlyFieldReportsTheShownTime()
    {
        Host host;
        host.edit->setReadOnly(true);
        QSignalSpy pressed(host.edit, &vx::DateTimeEdit::anchorTimeClicked);
        zelkovtest::Pointer pointer(&host.window);
        pointer.click(QPoint(60, 24)); // on the text: the line edit lets it through
        QCOMPARE(pressed.count(), 1);
        QCOMPARE(pressed.first().first().toDateTime(), noon);
    }

    void aPressOnAnEditableFieldReportsToo()
    {
        Host host;
        QSignalSpy pressed(host.edit, &vx::DateTimeEdit::anchorTimeClicked);
        for (const QEvent::Type type : {QEvent::MouseButtonPress, QEvent::MouseButtonRelease}) {
            QMouseEvent event(type, QPointF(2, 2), Qt::MiddleButton, Qt::MiddleButton, Qt::NoModifier);
            QCoreApplication::sendEvent(host.edit, &event);
            QCOMPARE(pressed.count(), 1);
        }
    }

    void theTextOfAnEditableFieldTakesTheMouseItself()
    {
        Host host;
        host.edit->setReadOnly(true);
        host.edit->setReadOnly(false);
        QVERIFY(!host.edit->lineEdit()->testAttribute(Qt::WA_TransparentForMouseEvents));
    }

    void aReadOnlyFieldShowsNoSelection()
    {
        Host host;
        host.edit->lineEdit()->selectAll();
        QVERIFY(host.edit->lineEdit()->hasSelectedText());
        host.edit->setReadOnly(true);
        host.edit->lineEdit()->selectAll();
        QEvent any(QEvent::User);
        QCoreApplication::sendEvent(host.edit, &any);
        QVERIFY(!host.edit->lineEdit()->hasSelectedText());
    }

    void anEditableFieldKeepsItsSelection()
    {
        Host host;
        host.edit->lineEdit()->selectAll();
        QEvent any(QEvent::User);
        QCoreApplication::sendEvent(host.edit, &any);
        QVERIFY(host.edit->lineEdit()->hasSelectedText());
    }

    void returnLeavesTheFieldOnlyIfAsked_data()
    {
        QTest::addColumn<bool>("leaves");
        QTest::addColumn<int>("key");
        QTest::addColumn<bool>("parentFocused");
        QTest::newRow("asked, Return") << true << int(Qt::Key_Return) << true;
        QTest::newRow("asked, Enter") << true << int(Qt::Key_Enter) << true;
        QTest::newRow("asked, another key") << true << int(Qt::Key_5) << false;
        QTest::newRow("not asked") << false << int(Qt::Key_Return) << false;
    }
    void returnLeavesTheFieldOnlyIfAsked()
    {
        QFETCH(bool, leaves);
        QFETCH(int, key);
        Host host;
        host.edit->m_returnLeavesField = leaves;
        host.edit->setFocus();
        QVERIFY(host.edit->hasFocus());
        QTest::keyClick(host.edit, static_cast<Qt::Key>(key));
        QTEST(host.window.hasFocus(), "parentFocused");
    }

    void returnDoesNotLeaveTheFieldAtFirst()
    {
        vx::DateTimeEdit edit;
        QVERIFY(!edit.m_returnLeavesField);
        edit.m_returnLeavesField = true;
        QTest::keyClick(&edit, Qt::Key_Return); // no parent to leave to
    }

    void theFontIsTheLineEdits()
    {
        vx::DateTimeEdit edit;
        QFont font = edit.getFont();
        font.setPixelSize(31);
        edit.changeFont(font);
        QCOMPARE(edit.lineEdit()->font().pixelSize(), 31);
        QCOMPARE(edit.getFont().pixelSize(), 31);
        QVERIFY(edit.font().pixelSize() != 31);
    }

    void anotherLineEditIsTakenOver()
    {
        vx::DateTimeEdit edit;
        edit.setReadOnly(true);
        auto* const other = new QLineEdit;
        edit.setLineEdit(other);
        QCOMPARE(edit.lineEdit(), other);
        QVERIFY(other->testAttribute(Qt::WA_TransparentForMouseEvents));
        edit.setLineEdit(nullptr);
        QCOMPARE(edit.lineEdit(), other);
    }

    void theFieldMayBeDeletedByWhoHearsOfThePress()
    {
        QWidget window;
        auto* const edit = new vx::DateTimeEdit(&window);
        QPointer<vx::DateTimeEdit> gone(edit);
        connect(edit, &vx::DateTimeEdit::anchorTimeClicked, &window, [edit] { delete edit; });
        QMouseEvent press(QEvent::MouseButtonPress, QPointF(2, 2), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(edit, &press);
        QVERIFY(!gone);
    }
};

ZELKOV_TEST_MAIN(TestDateTimeEdit)
#include "tst_datetimeedit.moc"
