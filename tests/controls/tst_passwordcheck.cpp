// SPDX-License-Identifier: MIT
// The form of a password and its repetition.
#include "controls/PasswordCheckWidget.h"
#include "controls/PasswordRules.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>

namespace
{
using Form = vx::PasswordCheckWidget;
using Requirements = QFlags<Form::ESecurityRequirement>;

Requirements requirements(int bits)
{
    return Requirements(QFlag(bits));
}

int state(const Form& form, const char* property)
{
    return form.property(property).toInt();
}

void typeInto(QLineEdit* edit, const QString& text)
{
    edit->selectAll();
    QTest::keyClick(edit, Qt::Key_Backspace);
    QTest::keyClicks(edit, text);
}

class WithHistory : public Form
{
public:
    using Form::Form;
    mutable int m_asked = 0;

protected:
    bool passwordInHistory(const QString& password) const override
    {
        ++m_asked;
        return password == QLatin1String("old");
    }
};
}

class TestPasswordCheck : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theNumbersStand()
    {
        QCOMPARE(int(Form::essNone), 0);
        QCOMPARE(int(Form::essUnsecure), 1);
        QCOMPARE(int(Form::essSecure), 2);
        QCOMPARE(int(Form::epmNone), 0);
        QCOMPARE(int(Form::epmDiffer), 1);
        QCOMPARE(int(Form::epmMatch), 2);
        QCOMPARE(int(Form::esrMinimumLength), 1);
        QCOMPARE(int(Form::esrUpperAndLowerCase), 2);
        QCOMPARE(int(Form::esrDigitAndLetter), 4);
        QCOMPARE(int(Form::esrSpecialCharacter), 8);
        QCOMPARE(int(Form::esrNotInHistory), 16);
        QCOMPARE(int(Form::esrPasswordsMatch), 32);
        QCOMPARE(int(Form::esrAllowedCharacters), 64);
        QCOMPARE(int(Form::Horizontal), 0);
        QCOMPARE(int(Form::Vertical), 1);
        QCOMPARE(int(Form::s_DefaultMinimumLength), 8);
        QCOMPARE(Form(false, requirements(0)).minimumPasswordLength(), 8);
    }

    void theRulesJudgeTheWholeText_data()
    {
        QTest::addColumn<QString>("text");
        QTest::addColumn<bool>("cases");
        QTest::addColumn<bool>("digits");
        QTest::addColumn<bool>("special");
        QTest::newRow("empty") << "" << false << false << false;
        QTest::newRow("lower case") << "abc" << false << false << false;
        QTest::newRow("upper case") << "ABC" << false << false << false;
        QTest::newRow("both") << "aB" << true << false << false;
        QTest::newRow("digits alone") << "1234" << false << false << false;
        QTest::newRow("digit and letter") << "1a" << false << true << false;
        QTest::newRow("digit and upper letter") << "A1" << false << true << false;
        QTest::newRow("one of each") << "aB1" << true << true << false;
        QTest::newRow("underscore") << "_" << false << false << true;
        QTest::newRow("blank") << "a b" << false << false << true;
        QTest::newRow("exclamation") << "aB1!" << true << true << true;
        QTest::newRow("umlauts are letters, not from a to z") << QStringLiteral("\u00e4\u00c4") << false << false << false;
    }
    void theRulesJudgeTheWholeText()
    {
        QFETCH(QString, text);
        QTEST(vx::hasUpperAndLowerCase(text), "cases");
        QTEST(vx::hasDigitAndLetter(text), "digits");
        QTEST(vx::hasSpecialCharacter(text), "special");
    }

    void theAllowedCharactersMatchTheWholeText_data()
    {
        QTest::addColumn<QString>("text");
        QTest::addColumn<QString>("pattern");
        QTest::addColumn<bool>("allowed");
        QTest::newRow("whole") << "abc" << "[a-c]+" << true;
        QTest::newRow("a part is not enough") << "abcd" << "[a-c]+" << false;
        QTest::newRow("case counts") << "ABC" << "[a-c]+" << false;
        QTest::newRow("empty pattern, empty text") << "" << "" << true;
        QTest::newRow("empty pattern, some text") << "a" << "" << false;
        QTest::newRow("invalid pattern") << "a" << "[a" << false;
    }
    void theAllowedCharactersMatchTheWholeText()
    {
        QFETCH(QString, text);
        QFETCH(QString, pattern);
        QTEST(vx::hasAllowedCharactersOnly(text, pattern), "allowed");
        Form form(false, requirements(64));
        form.setAllowedCharacters(pattern);
        form.firstLineEdit()->setText(text);
        QTEST(form.allRequirementsMet(), "allowed");
    }

    void theStatesFollowTheEdits_data()
    {
        QTest::addColumn<int>("bits");
        QTest::addColumn<QString>("first");
        QTest::addColumn<QString>("second");
        QTest::addColumn<int>("secure");
        QTest::addColumn<int>("match");
        QTest::addColumn<int>("matchShown");
        QTest::addColumn<bool>("met");
        QTest::newRow("length only") << 1 << "abcdefgh" << "" << 2 << 1 << 0 << true;
        QTest::newRow("one too few") << 1 << "abcdefg" << "" << 1 << 1 << 0 << false;
        QTest::newRow("length and match") << 33 << "abcdefgh" << "abcdefgh" << 2 << 2 << 2 << true;
        QTest::newRow("equal but too short") << 33 << "abc" << "abc" << 1 << 1 << 1 << false;
        QTest::newRow("no repetition yet") << 33 << "abcdefgh" << "" << 2 << 1 << 0 << false;
        QTest::newRow("another repetition") << 33 << "abcdefgh" << "abcdefgx" << 2 << 1 << 1 << false;
        QTest::newRow("equal, but not asked for") << 1 << "abcdefgh" << "abcdefgh" << 2 << 1 << 1 << true;
        QTest::newRow("nothing asked") << 0 << "a" << "b" << 2 << 1 << 1 << true;
    }
    void theStatesFollowTheEdits()
    {
        QFETCH(int, bits);
        QFETCH(QString, first);
        QFETCH(QString, second);
        QFETCH(bool, met);
        Form form(false, requirements(bits));
        QSignalSpy changed(&form, &Form::passwordChanged);
        typeInto(form.firstLineEdit(), first);
        typeInto(form.secondLineEdit(), second);
        QTEST(state(form, "secureState"), "secure");
        QTEST(state(form, "secureStateDisplay"), "secure");
        QTEST(state(form, "passwordsMatch"), "match");
        QTEST(state(form, "passwordsMatchDisplay"), "matchShown");
        QCOMPARE(form.allRequirementsMet(), met);
        QCOMPARE(changed.last().at(1).toBool(), met);
        QCOMPARE(changed.last().at(0).toString(), second.isEmpty() ? first : second); // that field's text
        QCOMPARE(form.password(), first);
    }

    void onlyWhatIsAskedForAndMetIsReported()
    {
        Form form(false, requirements(1 | 2 | 8));
        form.firstLineEdit()->setText(QStringLiteral("aB1"));
        QCOMPARE(int(form.evaluateSecurityRequirements()), 2);
        QCOMPARE(int(form.securityRequirements()), 11);
        form.setSecurityRequirements(requirements(2 | 4));
        QCOMPARE(int(form.evaluateSecurityRequirements()), 6);
        QVERIFY(form.allRequirementsMet());
    }

    void theHistoryIsTheSubclasses()
    {
        WithHistory form(false, requirements(16));
        form.firstLineEdit()->setText(QStringLiteral("old"));
        QVERIFY(!form.allRequirementsMet());
        form.firstLineEdit()->setText(QStringLiteral("new"));
        QVERIFY(form.allRequirementsMet());
        form.setSecurityRequirements(requirements(1));
        const int asked = form.m_asked;
        QVERIFY(!form.allRequirementsMet());
        QCOMPARE(form.m_asked, asked); // not asked for
        Form plain(false, requirements(16));
        plain.firstLineEdit()->setText(QStringLiteral("old"));
        QVERIFY(plain.allRequirementsMet());
    }

    void anUntouchedFormHasNoState()
    {
        Form form(false, requirements(33));
        QVERIFY(!form.isDirty());
        QVERIFY(!form.isEmpty()); // the reverse of its name
        QVERIFY(!form.oldPasswordSet());
        for (const char* property :
            {"secureState", "secureStateDisplay", "passwordsMatch", "passwordsMatchDisplay"}) {
            QCOMPARE(state(form, property), 0);
        }
        form.firstLineEdit()->setText(QStringLiteral("abcdefgh")); // no edit of the user
        form.setSecurityRequirements(requirements(1));
        QVERIFY(!form.isDirty());
        QCOMPARE(state(form, "secureState"), 0);
        form.secondLineEdit()->setText(QStringLiteral("x"));
        QVERIFY(form.isEmpty());
        form.firstLineEdit()->clear();
        QVERIFY(!form.isEmpty());
    }

    void anOldPasswordStaysNeutralUntilItIsEdited()
    {
        Form form(true, requirements(33));
        QVERIFY(form.oldPasswordSet());
        QCOMPARE(form.firstLineEdit()->text(), QStringLiteral("****"));
        QCOMPARE(form.secondLineEdit()->text(), QStringLiteral("****"));
        QCOMPARE(state(form, "secureStateDisplay"), 0);
        typeInto(form.firstLineEdit(), QStringLiteral("abcdefgh"));
        QCOMPARE(state(form, "secureStateDisplay"), 2);
        QCOMPARE(state(form, "passwordsMatch"), 1);
        QCOMPARE(state(form, "passwordsMatchDisplay"), 0); // the second one is untouched
        typeInto(form.secondLineEdit(), QStringLiteral("abc"));
        QCOMPARE(state(form, "passwordsMatchDisplay"), 1);
    }

    void resetClearsAllButTheOldPassword()
    {
        Form form(true, requirements(33));
        typeInto(form.firstLineEdit(), QStringLiteral("abcdefgh"));
        QSignalSpy changed(&form, &Form::passwordChanged);
        form.reset();
        QCOMPARE(changed.count(), 0);
        QVERIFY(!form.isDirty());
        QVERIFY(form.oldPasswordSet());
        QVERIFY(form.firstLineEdit()->text().isEmpty());
        QVERIFY(form.secondLineEdit()->text().isEmpty());
        QCOMPARE(state(form, "secureState"), 0);
        QCOMPARE(state(form, "passwordsMatch"), 0);
    }

    void theFieldsAreSetUp()
    {
        Form form(false, requirements(0));
        QCOMPARE(form.firstLineEdit()->objectName(), QStringLiteral("firstInput"));
        QCOMPARE(form.secondLineEdit()->objectName(), QStringLiteral("secondInput"));
        QCOMPARE(form.firstLineEdit()->placeholderText(), QStringLiteral("Type Password"));
        QCOMPARE(form.secondLineEdit()->placeholderText(), QStringLiteral("Retype Password"));
        QCOMPARE(form.firstLineEdit()->echoMode(), QLineEdit::Password);
        QCOMPARE(form.secondLineEdit()->echoMode(), QLineEdit::Password);
        QCOMPARE(form.layout()->contentsMargins(), QMargins());
        QCOMPARE(form.layout()->spacing(), 8);
        const QList<QLabel*> labels = form.findChildren<QLabel*>();
        QCOMPARE(labels.size(), 2);
        QCOMPARE(labels[0]->text(), QStringLiteral("Password"));
        QCOMPARE(labels[1]->text(), QStringLiteral("Confirm Password"));
        QCOMPARE(labels[0]->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding));
    }

    void theLabelsStandBesideOrAboveTheFields()
    {
        auto* const first = new QLabel(QStringLiteral("1"));
        auto* const second = new QLabel(QStringLiteral("2"));
        Form beside(first, second, Form::Horizontal, false, requirements(0));
        auto* const row = qobject_cast<QHBoxLayout*>(beside.layout()->itemAt(0)->layout());
        QVERIFY(row);
        QCOMPARE(row->spacing(), 8);
        QCOMPARE(row->itemAt(0)->widget(), first);
        QCOMPARE(row->itemAt(1)->widget(), beside.firstLineEdit());
        QCOMPARE(beside.layout()->itemAt(1)->layout()->itemAt(0)->widget(), second);
        Form above(new QLabel, new QLabel, Form::Vertical, false, requirements(0));
        auto* const column = qobject_cast<QVBoxLayout*>(above.layout()->itemAt(0)->layout());
        QVERIFY(column);
        QCOMPARE(column->spacing(), 0);
        QCOMPARE(column->contentsMargins(), QMargins());
        Form neither(new QLabel, new QLabel, static_cast<Form::Orientation>(7), false, requirements(0));
        QCOMPARE(neither.layout()->count(), 0);
    }

    void theStyleSheetColoursByState()
    {
        Form form(false, requirements(33));
        form.setStyleSheet(QStringLiteral(
            "vx--PasswordCheckWidget { background: #0000ff; }"
            "vx--PasswordCheckWidget[secureStateDisplay=\"2\"] QLineEdit#firstInput { background: #00ff00; }"));
        form.resize(300, 80);
        form.show();
        const auto colour = [&] {
            return form.firstLineEdit()->grab().toImage().pixelColor(form.firstLineEdit()->width() - 8,
                form.firstLineEdit()->height() / 2);
        };
        QVERIFY(colour() != QColor(Qt::green));
        typeInto(form.firstLineEdit(), QStringLiteral("abcdefgh"));
        QCOMPARE(colour(), QColor(Qt::green));
        QTest::keyClick(form.firstLineEdit(), Qt::Key_Backspace);
        QVERIFY(colour() != QColor(Qt::green));
    }

    void theBackgroundOfTheFormShows()
    {
        Form form(new QLabel, new QLabel, static_cast<Form::Orientation>(7), false, requirements(0));
        form.setStyleSheet(QStringLiteral("vx--PasswordCheckWidget { background: #0000ff; }"));
        form.resize(300, 200);
        QCOMPARE(form.grab().toImage().pixelColor(290, 190), QColor(Qt::blue));
    }

    void theApplicationsStyleSheetIsCopied()
    {
        qApp->setStyleSheet(QStringLiteral("QLabel { color: #112233; }"));
        {
            Form form(false, requirements(0));
            QCOMPARE(form.styleSheet(), QStringLiteral("QLabel { color: #112233; }"));
        }
        qApp->setStyleSheet(QString());
        Form plain(false, requirements(0));
        QVERIFY(plain.styleSheet().isEmpty());
    }
};

ZELKOV_TEST_MAIN(TestPasswordCheck)
#include "tst_passwordcheck.moc"
