// SPDX-License-Identifier: MIT
// Takes style sheets apart.
#include "SheetRules.h"

#include <QtCore/QRegularExpression>
#include <QtCore/QSet>

namespace styling
{
namespace
{
// What one part of a selector demands: the class, #names, [attributes], :states.
QSet<QString> demandsOf(const QString& part)
{
    static const QRegularExpression piece(
        QStringLiteral("^[\\w-]+|#[\\w-]+|\\[\\w+|(?<!:):(?!:)[\\w-]+|::[\\w-]+"));
    QSet<QString> result;
    QRegularExpressionMatchIterator all = piece.globalMatch(part);
    while (all.hasNext()) {
        result << all.next().captured();
    }
    return result;
}

QStringList partsOf(QString selector)
{
    return selector.replace(QLatin1Char('>'), QLatin1Char(' ')).simplified().split(QLatin1Char(' '));
}
}

QVector<SheetRule> rulesOf(const QString& sheet)
{
    QString text = sheet;
    text.remove(QRegularExpression(QStringLiteral("/\\*.*?\\*/"), QRegularExpression::DotMatchesEverythingOption));
    static const QRegularExpression rule(QStringLiteral("([^{}]+)\\{([^{}]*)\\}"));
    QVector<SheetRule> result;
    QRegularExpressionMatchIterator all = rule.globalMatch(text);
    while (all.hasNext()) {
        const QRegularExpressionMatch match = all.next();
        SheetRule one;
        for (const QString& selector : match.captured(1).split(QLatin1Char(','))) {
            one.selectors << selector.simplified();
        }
        for (const QString& declaration : match.captured(2).split(QLatin1Char(';'))) {
            if (!declaration.simplified().isEmpty()) {
                one.declarations << declaration.simplified();
            }
        }
        result << one;
    }
    return result;
}

bool covers(const QString& selector, const QString& wanted)
{
    const QStringList have = partsOf(selector);
    int at = 0;
    for (const QString& part : partsOf(wanted)) {
        const QSet<QString> demands = demandsOf(part);
        while (at < have.size() && !demandsOf(have.at(at)).contains(demands)) {
            ++at;
        }
        if (at++ == have.size()) {
            return false;
        }
    }
    return true;
}
}
