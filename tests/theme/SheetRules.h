// SPDX-License-Identifier: MIT
// A style sheet as a list of rules.
#pragma once

#include <QtCore/QString>
#include <QtCore/QStringList>
#include <QtCore/QVector>

namespace styling
{
struct SheetRule
{
    QStringList selectors;
    QStringList declarations; ///< "name: value"
};

QVector<SheetRule> rulesOf(const QString& sheet);
/// Whether a selector of the sheet speaks of all that @p wanted does, part by part and in the same order. The value of
/// an attribute does not count: states have the numbers of the program.
bool covers(const QString& selector, const QString& wanted);
}
