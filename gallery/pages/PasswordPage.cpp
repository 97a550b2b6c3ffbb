// SPDX-License-Identifier: MIT
// The form colours its fields by the theme; the list of rules works without one, too.
#include "PasswordPage.h"

#include <QtWidgets/QCheckBox>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QVBoxLayout>

#include "../Hand.h"

namespace gallery
{
namespace
{
using Form = vx::PasswordCheckWidget;
using Rules = QFlags<Form::ESecurityRequirement>;

const Rules s_rules = Form::esrMinimumLength | Form::esrUpperAndLowerCase | Form::esrDigitAndLetter
    | Form::esrSpecialCharacter | Form::esrNotInHistory | Form::esrPasswordsMatch;

// The history is the program's.
class NewPasswordForm : public Form
{
public:
    using Form::Form;

protected:
    bool passwordInHistory(const QString& password) const override { return password == QLatin1String("Camera_2025"); }
};

QVBoxLayout* column(QWidget* panel, QLabel* heading)
{
    auto* layout = new QVBoxLayout(panel);
    layout->setContentsMargins(20, 16, 20, 18);
    layout->setSpacing(12);
    layout->addWidget(heading);
    return layout;
}
}

PasswordPage::PasswordPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
    , m_form(new NewPasswordForm(new QLabel(tr("New password")), new QLabel(tr("Once more")), Form::Vertical, false,
          s_rules))
{
    watch(m_form, QStringLiteral("form"));
    announcePlace(m_form->firstLineEdit(), QStringLiteral("first"));
    announcePlace(m_form->secondLineEdit(), QStringLiteral("second"));

    auto* row = new QHBoxLayout;
    row->setSpacing(16);
    row->addWidget(makeForm());
    row->addWidget(makeRules());
    row->addStretch(1);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addLayout(row);
    layout->addStretch(1);

    // The password comes in the clear with each edit of the user.
    connect(m_form, &Form::passwordChanged, this, [this](const QString&, bool allMet) {
        m_save->setEnabled(allMet);
        showRules();
    });
    showRules();
}

QWidget* PasswordPage::makeForm()
{
    QWidget* box = panel();
    box->setFixedWidth(360);
    QVBoxLayout* layout = column(box, label(tr("Password of the camera"), "heading"));
    layout->addWidget(m_form);
    m_save = new QPushButton(tr("Save"));
    m_save->setProperty("role", QStringLiteral("primary"));
    m_save->setEnabled(false);
    auto* again = new QPushButton(tr("Start again"));
    const auto clear = [this] {
        m_form->reset();
        m_save->setEnabled(false);
        showRules();
    };
    connect(m_save, &QPushButton::clicked, m_form, clear);
    connect(again, &QPushButton::clicked, m_form, clear);
    auto* buttons = new QHBoxLayout;
    buttons->setSpacing(8);
    buttons->addStretch(1);
    buttons->addWidget(again);
    buttons->addWidget(m_save);
    layout->addSpacing(4);
    layout->addLayout(buttons);
    layout->addStretch(1);
    return box;
}

QWidget* PasswordPage::makeRules()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("What is asked of it"), "heading"));
    const auto add = [&](Form::ESecurityRequirement rule, const QString& text) {
        auto* state = new QLabel;
        state->setFixedWidth(18);
        auto* row = new QHBoxLayout;
        row->setSpacing(8);
        row->addWidget(state);
        row->addWidget(new QLabel(text));
        row->addStretch(1);
        layout->addLayout(row);
        m_rules.insert(rule, state);
    };
    add(Form::esrMinimumLength, tr("%1 characters or more").arg(m_form->minimumPasswordLength()));
    add(Form::esrUpperAndLowerCase, tr("A small and a capital letter"));
    add(Form::esrDigitAndLetter, tr("A digit and a letter"));
    add(Form::esrSpecialCharacter, tr("A special character"));
    add(Form::esrNotInHistory, tr("Not used before (Camera_2025 was)"));
    add(Form::esrPasswordsMatch, tr("The same both times"));
    layout->addStretch(1);
    return box;
}

void PasswordPage::showRules()
{
    const Rules met = m_form->evaluateSecurityRequirements();
    for (auto it = m_rules.cbegin(); it != m_rules.cend(); ++it) {
        const bool isMet = m_form->isDirty() && met.testFlag(it.key());
        it.value()->setText(isMet ? QStringLiteral("\u2713") : QStringLiteral("\u2013"));
    }
}

void PasswordPage::rehearse(Hand& hand)
{
    // Edits of the user count, setText() does not.
    hand.call(m_form, [this] {
        m_form->firstLineEdit()->insert(QStringLiteral("Camera_2026"));
        m_form->secondLineEdit()->insert(QStringLiteral("Camera_202"));
    });
    hand.wait(100);
}
}
