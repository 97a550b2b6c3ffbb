// SPDX-License-Identifier: MIT
// Asks for a new password.
#include "PasswordPanel.h"

#include "Session.h"
#include "controls/PasswordCheckWidget.h"

#include <QtCore/QEvent>
#include <QtWidgets/QFrame>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QStyle>
#include <QtWidgets/QVBoxLayout>

namespace client
{
namespace
{
using Form = vx::PasswordCheckWidget;

constexpr int c_cardWidth = 420;

const Form::ESecurityRequirement c_rules[] = {Form::esrMinimumLength, Form::esrUpperAndLowerCase,
    Form::esrDigitAndLetter, Form::esrSpecialCharacter, Form::esrNotInHistory, Form::esrPasswordsMatch};

class NewPasswordForm : public Form
{
public:
    NewPasswordForm(const Session& session, QLabel* first, QLabel* second)
        : Form(first, second, Form::Vertical, false,
              Form::esrMinimumLength | Form::esrUpperAndLowerCase | Form::esrDigitAndLetter | Form::esrSpecialCharacter
                  | Form::esrNotInHistory | Form::esrPasswordsMatch)
        , m_session(session)
    {
    }

protected:
    bool passwordInHistory(const QString& password) const override { return m_session.wasUsed(password); }

private:
    const Session& m_session;
};
}

PasswordPanel::PasswordPanel(Session& session, QWidget* parent)
    : QWidget(parent)
    , m_session(session)
    , m_card(new QFrame)
    , m_title(new QLabel)
    , m_hint(new QLabel)
    , m_formPlace(new QVBoxLayout)
    , m_save(new QPushButton)
    , m_cancel(new QPushButton)
{
    setObjectName(QStringLiteral("passwordPanel"));
    m_card->setObjectName(QStringLiteral("passwordCard"));
    m_card->setProperty("role", QStringLiteral("panel"));
    m_card->setFrameShape(QFrame::StyledPanel);
    m_card->setFixedWidth(c_cardWidth);
    m_title->setProperty("role", QStringLiteral("title"));
    m_hint->setProperty("role", QStringLiteral("hint"));
    m_hint->setWordWrap(true);
    m_save->setObjectName(QStringLiteral("savePasswordButton"));
    m_save->setProperty("role", QStringLiteral("primary"));
    m_cancel->setObjectName(QStringLiteral("cancelPasswordButton"));

    auto* rules = new QVBoxLayout;
    rules->setSpacing(2);
    for (int i = 0; i < int(sizeof c_rules / sizeof *c_rules); ++i) {
        auto* rule = new QLabel;
        rule->setObjectName(QStringLiteral("passwordRule%1").arg(i));
        rule->setProperty("role", QStringLiteral("rule"));
        rules->addWidget(rule);
        m_rules << rule;
    }
    auto* buttons = new QHBoxLayout;
    buttons->addStretch(1);
    buttons->addWidget(m_cancel);
    buttons->addWidget(m_save);
    auto* card = new QVBoxLayout(m_card);
    card->setContentsMargins(28, 24, 28, 24);
    card->setSpacing(8);
    card->addWidget(m_title);
    card->addWidget(m_hint);
    card->addSpacing(4);
    card->addLayout(m_formPlace);
    card->addLayout(rules);
    card->addSpacing(8);
    card->addLayout(buttons);
    auto* row = new QHBoxLayout;
    row->addStretch(1);
    row->addWidget(m_card);
    row->addStretch(1);
    auto* layout = new QVBoxLayout(this);
    layout->addStretch(2);
    layout->addLayout(row);
    layout->addStretch(3);

    connect(m_save, &QPushButton::clicked, this, &PasswordPanel::save);
    connect(m_cancel, &QPushButton::clicked, this, &PasswordPanel::cancelled);
    makeForm();
    retranslate();
}

void PasswordPanel::clear()
{
    makeForm();
    retranslate();
    m_form->firstLineEdit()->setFocus();
}

void PasswordPanel::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        retranslate();
    }
}

void PasswordPanel::makeForm()
{
    // It may be the sender.
    if (m_form) {
        m_form->hide();
        m_form->deleteLater();
    }
    m_form = new NewPasswordForm(m_session, new QLabel, new QLabel);
    m_form->setObjectName(QStringLiteral("passwordForm"));
    m_formPlace->addWidget(m_form);
    connect(m_form.data(), &Form::passwordChanged, this, &PasswordPanel::showRules);
    for (const QLineEdit* field : {m_form->firstLineEdit(), m_form->secondLineEdit()}) {
        connect(field, &QLineEdit::returnPressed, this, &PasswordPanel::save);
    }
}

void PasswordPanel::retranslate()
{
    m_title->setText(tr("New password"));
    m_hint->setText(tr("A new password for %1, twice. The rules below turn green as they are met.").arg(m_session.user()));
    m_save->setText(tr("Save"));
    m_cancel->setText(tr("Cancel"));
    const QList<QLabel*> labels = m_form->findChildren<QLabel*>(QString(), Qt::FindDirectChildrenOnly);
    if (labels.size() == 2) {
        labels.at(0)->setText(tr("New password"));
        labels.at(1)->setText(tr("Once more"));
    }
    m_form->firstLineEdit()->setPlaceholderText(QString());
    m_form->secondLineEdit()->setPlaceholderText(QString());
    showRules();
}

void PasswordPanel::showRules()
{
    const QString texts[] = {tr("%1 characters or more").arg(m_form->minimumPasswordLength()),
        tr("a small and a capital letter"), tr("a digit and a letter"), tr("a special character"), tr("not used before"),
        tr("the same both times")};
    const auto met = m_form->evaluateSecurityRequirements();
    for (int i = 0; i < m_rules.size(); ++i) {
        const bool isMet = !m_form->password().isEmpty() && met.testFlag(c_rules[i]);
        QLabel* const rule = m_rules.at(i);
        rule->setText((isMet ? QStringLiteral("\u2713  ") : QStringLiteral("\u2013  ")) + texts[i]);
        if (rule->property("met") != QVariant(isMet)) {
            rule->setProperty("met", isMet);
            rule->style()->unpolish(rule);
            rule->style()->polish(rule);
        }
    }
    m_save->setEnabled(m_form->allRequirementsMet());
}

void PasswordPanel::save()
{
    if (m_form->allRequirementsMet() && m_session.setPassword(m_form->password())) {
        Q_EMIT saved();
    }
}
}
