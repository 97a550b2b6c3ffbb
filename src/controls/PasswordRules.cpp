// SPDX-License-Identifier: MIT
#include "controls/PasswordRules.h"

#include <QtCore/QRegExp>

namespace vx
{
bool hasUpperAndLowerCase(const QString& password)
{
    static const QRegExp pattern(
        QStringLiteral("^(?=.*[a-z])(?=.*[A-Z]).+$"), Qt::CaseSensitive, QRegExp::RegExp);
    return pattern.exactMatch(password);
}

bool hasDigitAndLetter(const QString& password)
{
    static const QRegExp pattern(
        QStringLiteral("^(?=.*\\d)(?=.*[a-zA-Z]).+$"), Qt::CaseSensitive, QRegExp::RegExp);
    return pattern.exactMatch(password);
}

bool hasSpecialCharacter(const QString& password)
{
    static const QRegExp pattern(QStringLiteral("^(?=.*[_\\W]).+$"), Qt::CaseSensitive, QRegExp::RegExp);
    return pattern.exactMatch(password);
}

bool hasAllowedCharactersOnly(const QString& password, const QString& pattern)
{
    return QRegExp(pattern, Qt::CaseSensitive, QRegExp::RegExp).exactMatch(password);
}
}
