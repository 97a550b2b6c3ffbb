// SPDX-License-Identifier: MIT
// docs/styling.md as a test reads it: every table of the page, by the word at the head of its first column.
#pragma once

#include <QtCore/QHash>
#include <QtCore/QString>
#include <QtCore/QStringList>
#include <QtCore/QVector>

namespace styling
{
struct Line
{
    QString key; ///< what stands between the first back-ticks; in tables of properties with the section's selector
    QStringList cells; ///< as written
    int number; ///< in the file
};

/// The lines of all tables whose first column is headed @p word: "Selector", "Property", "Picture" ...
QVector<Line> linesOfPage(const QString& word);
QStringList keysOfPage(const QString& word);

/// All files below src with this suffix, and their texts.
QHash<QString, QString> sources(const QString& suffix);
}
