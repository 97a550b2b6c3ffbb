// SPDX-License-Identifier: MIT
// Reads the page and the sources.
#include "StylingPage.h"

#include <QtCore/QDirIterator>
#include <QtCore/QFile>
#include <QtCore/QRegularExpression>

namespace styling
{
namespace
{
QString contents(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

QString firstCode(const QString& text)
{
    static const QRegularExpression code(QStringLiteral("`([^`]+)`"));
    return code.match(text).captured(1);
}

QStringList cellsOf(const QString& line)
{
    QStringList result = line.trimmed().mid(1).split(QLatin1Char('|'));
    result.removeLast();
    for (QString& cell : result) {
        cell = cell.trimmed();
    }
    return result;
}
}

QVector<Line> linesOfPage(const QString& word)
{
    QVector<Line> result;
    QString selector;
    QString head; // of the table, empty outside
    const QStringList lines
        = contents(QStringLiteral(ZELKOV_ROOT "/docs/styling.md")).split(QLatin1Char('\n'));
    for (int i = 0; i < lines.size(); ++i) {
        const QString& line = lines.at(i);
        if (line.startsWith(QLatin1Char('#'))) {
            selector = firstCode(line);
        }
        if (!line.startsWith(QLatin1Char('|'))) {
            head.clear();
            continue;
        }
        const QStringList cells = cellsOf(line);
        if (head.isEmpty()) {
            head = cells.value(0);
        } else if (head == word && !line.startsWith(QLatin1String("|---"))) {
            const QString code = firstCode(cells.value(0));
            result << Line {head == QLatin1String("Property") || head == QLatin1String("State property")
                    ? selector + QLatin1String(" { qproperty-") + code + QLatin1String(" }")
                    : code,
                cells, i + 1};
        }
    }
    return result;
}

QStringList keysOfPage(const QString& word)
{
    QStringList result;
    for (const Line& line : linesOfPage(word)) {
        result << line.key;
    }
    return result;
}

QHash<QString, QString> sources(const QString& suffix)
{
    QHash<QString, QString> result;
    QDirIterator files(
        QStringLiteral(ZELKOV_ROOT "/src"), {QLatin1String("*.") + suffix}, QDir::Files, QDirIterator::Subdirectories);
    while (files.hasNext()) {
        const QString path = files.next();
        result.insert(path, contents(path));
    }
    return result;
}
}
