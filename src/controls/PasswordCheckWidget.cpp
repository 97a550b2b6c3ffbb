// SPDX-License-Identifier: MIT
#include "controls/PasswordCheckWidget.h"

#include "CoreQt/Connect.h"
#include "controls/PasswordRules.h"

#include <QtCore/QPointer>
#include <QtGui/QPainter>
#include <QtWidgets/QApplication>
#include <QtWidgets/QBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOption>

namespace vx
{
const int PasswordCheckWidget::s_DefaultMinimumLength = 8;

PasswordCheckWidget::PasswordCheckWidget(QWidget* firstLabel, QWidget* secondLabel, Orientation orientation,
    bool oldPasswordSet, QFlags<ESecurityRequirement> requirements, QWidget* parent)
    : QWidget(parent)
    , m_minimumLength(s_DefaultMinimumLength)
    , m_oldPasswordSet(oldPasswordSet)
{
    init(firstLabel, secondLabel, orientation, oldPasswordSet, requirements);
}

PasswordCheckWidget::PasswordCheckWidget(
    bool oldPasswordSet, QFlags<ESecurityRequirement> requirements, QWidget* parent)
    : QWidget(parent)
    , m_minimumLength(s_DefaultMinimumLength)
    , m_oldPasswordSet(oldPasswordSet)
{
    init(new QLabel(tr("Password")), new QLabel(tr("Confirm Password")), Horizontal, oldPasswordSet, requirements);
}

PasswordCheckWidget::~PasswordCheckWidget()
{
    if (m_rescued) {
        for (QLineEdit* const edit : {m_firstLineEdit, m_secondLineEdit}) {
            edit->disconnect(this);
            edit->hide();
            edit->setParent(nullptr);
            m_rescued->append(edit);
        }
    }
}

void PasswordCheckWidget::init(QWidget* firstLabel, QWidget* secondLabel, Orientation orientation,
    bool oldPasswordSet, QFlags<ESecurityRequirement> requirements)
{
    auto* const rows = new QVBoxLayout(this);
    rows->setContentsMargins(0, 0, 0, 0);
    rows->setSpacing(8);
    m_firstLineEdit = new QLineEdit(this);
    m_secondLineEdit = new QLineEdit(this);
    initializeLineEdit(rows, m_firstLineEdit, firstLabel, orientation, tr("Type Password"),
        QStringLiteral("firstInput"), oldPasswordSet);
    initializeLineEdit(rows, m_secondLineEdit, secondLabel, orientation, tr("Retype Password"),
        QStringLiteral("secondInput"), oldPasswordSet);
    vx::connect(m_firstLineEdit, "2textEdited(QString)", this, "1onTextChangedFirst(QString)", Qt::AutoConnection);
    vx::connect(m_secondLineEdit, "2textEdited(QString)", this, "1onTextChangedSecond(QString)", Qt::AutoConnection);
    if (styleSheet().isEmpty() && !qApp->styleSheet().isEmpty()) {
        setStyleSheet(qApp->styleSheet()); // property selectors are to be judged for the fields
    }
    setSecurityRequirements(requirements);
}

void PasswordCheckWidget::initializeLineEdit(QBoxLayout* layout, QLineEdit* edit, QWidget* label,
    Orientation orientation, const QString& placeholder, const QString& objectName, bool oldPasswordSet)
{
    edit->setAttribute(Qt::WA_MacShowFocusRect, false);
    edit->setEchoMode(QLineEdit::Password);
    if (oldPasswordSet) {
        edit->setText(QStringLiteral("****"));
    }
    edit->setPlaceholderText(placeholder);
    edit->setObjectName(objectName);
    if (label) {
        label->setParent(this);
    }
    QBoxLayout* row = nullptr;
    if (orientation == Horizontal) {
        row = new QHBoxLayout;
        row->setSpacing(8);
        if (label) {
            label->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
        }
    } else if (orientation == Vertical) {
        row = new QVBoxLayout;
        row->setSpacing(0);
    } else {
        return;
    }
    row->setContentsMargins(0, 0, 0, 0);
    if (label) {
        row->addWidget(label);
    }
    row->addWidget(edit);
    layout->addLayout(row);
}

void PasswordCheckWidget::setSecurityRequirements(QFlags<ESecurityRequirement> requirements)
{
    m_securityRequirements = requirements;
    updateSecurityState();
}

QFlags<PasswordCheckWidget::ESecurityRequirement> PasswordCheckWidget::evaluateSecurityRequirements() const
{
    const QString text = m_firstLineEdit->text();
    QFlags<ESecurityRequirement> met;
    // Each is tested only if it is asked for: the history may be costly.
    const auto judge = [this, &met](ESecurityRequirement requirement, auto&& test) {
        if (m_securityRequirements.testFlag(requirement) && test()) {
            met |= requirement;
        }
    };
    judge(esrMinimumLength, [&] { return text.length() >= m_minimumLength; });
    judge(esrUpperAndLowerCase, [&] { return hasUpperAndLowerCase(text); });
    judge(esrDigitAndLetter, [&] { return hasDigitAndLetter(text); });
    judge(esrSpecialCharacter, [&] { return hasSpecialCharacter(text); });
    judge(esrNotInHistory, [&] { return !passwordInHistory(text); });
    judge(esrPasswordsMatch, [&] { return text == m_secondLineEdit->text(); });
    judge(esrAllowedCharacters, [&] { return hasAllowedCharactersOnly(text, m_allowedCharacters); });
    return met;
}

bool PasswordCheckWidget::allRequirementsMet() const
{
    return evaluateSecurityRequirements() == m_securityRequirements;
}

QFlags<PasswordCheckWidget::ESecurityRequirement> PasswordCheckWidget::securityRequirements() const
{
    return m_securityRequirements;
}

void PasswordCheckWidget::setAllowedCharacters(const QString& pattern)
{
    m_allowedCharacters = pattern;
}

QString PasswordCheckWidget::password() const
{
    return m_firstLineEdit->text();
}

void PasswordCheckWidget::reset()
{
    m_firstLineEdit->clear();
    m_secondLineEdit->clear();
    m_dirtyFirst = false;
    m_dirtySecond = false;
    m_secureState = essNone;
    m_passwordsMatch = epmNone;
    resetStyleSheet();
}

bool PasswordCheckWidget::isDirty() const
{
    return m_dirtyFirst || m_dirtySecond;
}

bool PasswordCheckWidget::isEmpty() const
{
    return !m_firstLineEdit->text().isEmpty() && !m_secondLineEdit->text().isEmpty();
}

bool PasswordCheckWidget::oldPasswordSet() const
{
    return m_oldPasswordSet;
}

int PasswordCheckWidget::minimumPasswordLength() const
{
    return m_minimumLength;
}

QLineEdit* PasswordCheckWidget::firstLineEdit() const
{
    return m_firstLineEdit;
}

QLineEdit* PasswordCheckWidget::secondLineEdit() const
{
    return m_secondLineEdit;
}

bool PasswordCheckWidget::passwordInHistory(const QString&) const
{
    return false;
}

void PasswordCheckWidget::updateSecurityState()
{
    if (!isDirty()) {
        setSecureState(essNone);
        setPasswordsMatch(epmNone);
        return;
    }
    const QFlags<ESecurityRequirement> met = evaluateSecurityRequirements();
    const QFlags<ESecurityRequirement> rules = ~QFlags<ESecurityRequirement>(esrPasswordsMatch);
    const bool secure = (met & rules) == (m_securityRequirements & rules);
    setSecureState(secure ? essSecure : essUnsecure);
    // Equal passwords that fail a rule count as differing, and so do those whose equality is not asked for.
    setPasswordsMatch(secure && met.testFlag(esrPasswordsMatch) ? epmMatch : epmDiffer);
}

void PasswordCheckWidget::resetStyleSheet()
{
    for (QLineEdit* const edit : {m_firstLineEdit, m_secondLineEdit}) {
        edit->style()->unpolish(edit);
        edit->style()->polish(edit);
    }
    update();
}

void PasswordCheckWidget::setDirtyFirst(bool dirty)
{
    m_dirtyFirst = dirty;
}

void PasswordCheckWidget::setDirtySecond(bool dirty)
{
    m_dirtySecond = dirty;
}

PasswordCheckWidget::ESecureState PasswordCheckWidget::secureState() const
{
    return m_secureState;
}

void PasswordCheckWidget::setSecureState(ESecureState state)
{
    m_secureState = state;
    resetStyleSheet();
}

PasswordCheckWidget::EPasswordsMatchState PasswordCheckWidget::passwordsMatch() const
{
    return m_passwordsMatch;
}

void PasswordCheckWidget::setPasswordsMatch(EPasswordsMatchState state)
{
    m_passwordsMatch = state;
    resetStyleSheet();
}

PasswordCheckWidget::ESecureState PasswordCheckWidget::secureStateDisplay() const
{
    return m_firstLineEdit->text().isEmpty() ? essNone : m_secureState;
}

PasswordCheckWidget::EPasswordsMatchState PasswordCheckWidget::passwordsMatchDisplay() const
{
    if (m_secondLineEdit->text().isEmpty() || (m_oldPasswordSet && !m_dirtySecond)) {
        return epmNone;
    }
    return m_passwordsMatch;
}

// The field is in the middle of a key event and goes on with it after this: it has to outlive a form that is deleted
// by a slot.
void PasswordCheckWidget::reportEdit(const QString& text)
{
    QVector<QLineEdit*> rescued;
    QVector<QLineEdit*>* const outer = m_rescued;
    const QPointer<PasswordCheckWidget> alive(this);
    if (!outer) {
        m_rescued = &rescued;
    }
    Q_EMIT passwordChanged(text, allRequirementsMet());
    if (alive) {
        m_rescued = outer;
    }
    for (QLineEdit* const edit : qAsConst(rescued)) {
        edit->deleteLater();
    }
}

void PasswordCheckWidget::onTextChangedFirst(QString text)
{
    setDirtyFirst(true);
    updateSecurityState();
    reportEdit(text);
}

void PasswordCheckWidget::onTextChangedSecond(QString text)
{
    setDirtySecond(true);
    updateSecurityState();
    reportEdit(text);
}

void PasswordCheckWidget::paintEvent(QPaintEvent* event)
{
    QStyleOption option;
    option.initFrom(this);
    QPainter painter(this);
    style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
    painter.end();
    QWidget::paintEvent(event);
}
}
