// SPDX-License-Identifier: MIT
// A password and its repetition, with a live check of strength rules.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QFlags>
#include <QtCore/QString>
#include <QtCore/QVector>
#include <QtWidgets/QWidget>

class QBoxLayout;
class QLineEdit;

namespace vx
{
/// A form of two password fields, a password and its repetition, that checks a set of strength rules with every edit.
/// It draws no verdict itself: a style sheet colours the fields (object names "firstInput" and "secondInput") by the
/// properties secureStateDisplay and passwordsMatchDisplay.
///
/// Only edits of the user count, not QLineEdit::setText(). Both states stay at "none" until the first edit and after
/// reset().
class ZELKOV_WIDGETS_EXPORT PasswordCheckWidget : public QWidget
{
    Q_OBJECT
    Q_PROPERTY(ESecureState secureState READ secureState WRITE setSecureState)
    Q_PROPERTY(EPasswordsMatchState passwordsMatch READ passwordsMatch WRITE setPasswordsMatch)
    Q_PROPERTY(ESecureState secureStateDisplay READ secureStateDisplay)
    Q_PROPERTY(EPasswordsMatchState passwordsMatchDisplay READ passwordsMatchDisplay)

public:
    /// The verdict on the password.
    enum ESecureState : int
    {
        essNone = 0,
        essUnsecure = 1,
        essSecure = 2
    };
    Q_ENUM(ESecureState)

    /// The verdict on the repetition.
    enum EPasswordsMatchState : int
    {
        epmNone = 0,
        epmDiffer = 1,
        epmMatch = 2
    };
    Q_ENUM(EPasswordsMatchState)

    /// What is asked of the password; all but esrPasswordsMatch is about the first field.
    enum ESecurityRequirement : int
    {
        esrMinimumLength = 1,     ///< minimumPasswordLength() characters or more
        esrUpperAndLowerCase = 2, ///< a lower-case and an upper-case letter from a to z
        esrDigitAndLetter = 4,    ///< a digit and a letter from a to z
        esrSpecialCharacter = 8,  ///< an underscore or anything that is no letter, digit or mark
        esrNotInHistory = 16,     ///< passwordInHistory() says no
        esrPasswordsMatch = 32,   ///< both fields hold the same text
        esrAllowedCharacters = 64 ///< the pattern of setAllowedCharacters() matches the whole text
    };
    Q_ENUM(ESecurityRequirement)

    /// Where the labels stand. Any other value lays out neither label nor field.
    enum Orientation : int
    {
        Horizontal = 0, ///< beside the field
        Vertical = 1    ///< above the field
    };
    Q_ENUM(Orientation)

    static const int s_DefaultMinimumLength; ///< 8

    /// Takes both labels over. With \a oldPasswordSet both fields show "****" until they are edited or reset.
    PasswordCheckWidget(QWidget* firstLabel, QWidget* secondLabel, Orientation orientation, bool oldPasswordSet,
        QFlags<ESecurityRequirement> requirements, QWidget* parent = nullptr);
    /// With the labels "Password" and "Confirm Password" beside the fields.
    PasswordCheckWidget(bool oldPasswordSet, QFlags<ESecurityRequirement> requirements, QWidget* parent = nullptr);
    ~PasswordCheckWidget() override;

    /// What is asked of the password from now on.
    virtual void setSecurityRequirements(QFlags<ESecurityRequirement> requirements);

    /// The requirements that are asked for and met.
    QFlags<ESecurityRequirement> evaluateSecurityRequirements() const;
    /// Whether all that are asked for are met.
    bool allRequirementsMet() const;
    QFlags<ESecurityRequirement> securityRequirements() const;
    /// Pattern (QRegExp, case sensitive) for esrAllowedCharacters. Empty by default, which only an empty field meets;
    /// an invalid pattern is met by nothing.
    void setAllowedCharacters(const QString& pattern);
    /// Text of the first field.
    QString password() const;
    /// Clears both fields and states. The "****" of an old password does not come back.
    void reset();
    /// Whether the user has edited a field since the start or the last reset().
    bool isDirty() const;
    /// True when both fields hold text: the reverse of its name. Clients rely on it.
    bool isEmpty() const;
    /// As given to the constructor.
    bool oldPasswordSet() const;
    int minimumPasswordLength() const; //!< always s_DefaultMinimumLength
    // The fields, with the object names "firstInput" and "secondInput".
    QLineEdit* firstLineEdit() const;
    QLineEdit* secondLineEdit() const;

Q_SIGNALS:
    /// The user edited a field. \a password is the text of that field, so for the second one the repetition: read
    /// password() for the password. \a requirementsMet is the verdict on all requirements.
    void passwordChanged(QString password, bool requirementsMet);

protected:
    /// Whether the password has been used before: for subclasses. False here.
    virtual bool passwordInHistory(const QString& password) const;

    /// Builds the form; called by the constructors.
    void init(QWidget* firstLabel, QWidget* secondLabel, Orientation orientation, bool oldPasswordSet,
        QFlags<ESecurityRequirement> requirements);
    /// Dresses a field and lays it out beside or below its label.
    void initializeLineEdit(QBoxLayout* layout, QLineEdit* edit, QWidget* label, Orientation orientation,
        const QString& placeholder, const QString& objectName, bool oldPasswordSet);
    /// Sets both states anew; "none" unless isDirty().
    void updateSecurityState();
    /// Lets the style polish both fields anew, so that the rules for the states take hold.
    void resetStyleSheet();
    // Whether the user has edited the first field, and the second.
    void setDirtyFirst(bool dirty);
    void setDirtySecond(bool dirty);

    /// The password is only secure or not by all requirements but esrPasswordsMatch.
    ESecureState secureState() const;
    void setSecureState(ESecureState state);
    /// epmMatch only for a secure password whose repetition is asked for and equal.
    EPasswordsMatchState passwordsMatch() const;
    void setPasswordsMatch(EPasswordsMatchState state);
    /// secureState(), but essNone while the first field is empty.
    ESecureState secureStateDisplay() const;
    /// passwordsMatch(), but epmNone while the second field is empty or still shows the "****" of an old password.
    EPasswordsMatchState passwordsMatchDisplay() const;

    void paintEvent(QPaintEvent* event) override;

private Q_SLOTS:
    void onTextChangedFirst(QString text);
    void onTextChangedSecond(QString text);

private:
    void reportEdit(const QString& text);

    QFlags<ESecurityRequirement> m_securityRequirements;
    int m_minimumLength;
    ESecureState m_secureState = essNone;
    EPasswordsMatchState m_passwordsMatch = epmNone;
    bool m_dirtyFirst = false;
    bool m_dirtySecond = false;
    bool m_oldPasswordSet;
    QLineEdit* m_firstLineEdit = nullptr;
    QLineEdit* m_secondLineEdit = nullptr;
    QString m_allowedCharacters;
    QVector<QLineEdit*>* m_rescued = nullptr; // where the destructor leaves fields that are in their own signal
};
}

Q_DECLARE_METATYPE(QFlags<vx::PasswordCheckWidget::ESecurityRequirement>)
Q_DECLARE_OPERATORS_FOR_FLAGS(QFlags<vx::PasswordCheckWidget::ESecurityRequirement>)
