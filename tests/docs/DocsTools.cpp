// SPDX-License-Identifier: MIT
// Reads the pages of docs/, the headers and the pieces of code as plain text.
#include "DocsTools.h"

#include <QtCore/QFile>
#include <QtCore/QRegularExpression>

namespace docs
{
namespace
{
bool isFence(const QString& line)
{
    return line.trimmed().startsWith(QLatin1String("```"));
}

QStringList linesOutsideOfCode(const QString& page)
{
    QStringList result;
    bool inCode = false;
    const QStringList lines = page.split(QLatin1Char('\n'));
    for (const QString& line : lines) {
        if (isFence(line)) {
            inCode = !inCode;
        } else if (!inCode && !line.startsWith(QLatin1String("    "))) {
            result << line;
        }
    }
    return result;
}

QString withoutCodeLetters(QString line)
{
    static const QRegularExpression code(QStringLiteral("`[^`]*`"));
    return line.remove(code);
}

QStringList moved(const QStringList& lines)
{
    int indent = 1000;
    for (const QString& line : lines) {
        if (!line.trimmed().isEmpty()) {
            int blanks = 0;
            while (line.at(blanks) == QLatin1Char(' ')) {
                ++blanks;
            }
            indent = qMin(indent, blanks);
        }
    }
    QStringList result;
    for (const QString& line : lines) {
        result << line.mid(indent);
    }
    while (!result.isEmpty() && result.constFirst().trimmed().isEmpty()) {
        result.removeFirst();
    }
    while (!result.isEmpty() && result.constLast().trimmed().isEmpty()) {
        result.removeLast();
    }
    return result;
}
}

QString readFile(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

QStringList linksOf(const QString& page)
{
    static const QRegularExpression link(QStringLiteral("\\]\\(([^)\\s]+)[^)]*\\)"));
    QStringList result;
    // A link may stand with its text on one line and its target on the next.
    const QString text = withoutCodeLetters(linesOutsideOfCode(page).join(QLatin1Char('\n')));
    QRegularExpressionMatchIterator matches = link.globalMatch(text);
    while (matches.hasNext()) {
        result << matches.next().captured(1);
    }
    return result;
}

QSet<QString> anchorsOf(const QString& page)
{
    static const QRegularExpression heading(QStringLiteral("^#+\\s+(.*)$"));
    static const QRegularExpression dropped(QStringLiteral("[^\\w\\- ]"), QRegularExpression::UseUnicodePropertiesOption);
    QSet<QString> result;
    const QStringList lines = linesOutsideOfCode(page);
    for (const QString& line : lines) {
        const QRegularExpressionMatch match = heading.match(line);
        if (match.hasMatch()) {
            result << match.captured(1).trimmed().toLower().remove(dropped).replace(QLatin1Char(' '), QLatin1Char('-'));
        }
    }
    return result;
}

QVector<Block> codeBlocksOf(const QString& page)
{
    static const QRegularExpression mark(QStringLiteral("^<!-- code: (.*) -->$"));
    QVector<Block> result;
    QString before;
    QStringList text;
    bool inCode = false;
    bool inCpp = false;
    const QStringList lines = page.split(QLatin1Char('\n'));
    for (int i = 0; i < lines.size(); ++i) {
        const QString& line = lines.at(i);
        if (!isFence(line)) {
            (inCode ? text : text = QStringList()) << line;
            before = inCode ? before : line;
            continue;
        }
        if (!inCode) {
            inCpp = line.trimmed().startsWith(QLatin1String("```cpp"));
            text.clear();
            if (inCpp) {
                result.append({mark.match(before).captured(1), QString(), i + 1});
            }
        } else if (inCpp) {
            result.last().text = text.join(QLatin1Char('\n'));
        }
        inCode = !inCode;
        before.clear();
    }
    return result;
}

QMap<QString, QString> piecesOf(const QString& source)
{
    static const QRegularExpression mark(QStringLiteral("^\\s*//! \\[(\\w+)\\]$"));
    QMap<QString, QString> result;
    QString name;
    QStringList text;
    const QStringList lines = source.split(QLatin1Char('\n'));
    for (const QString& line : lines) {
        const QRegularExpressionMatch match = mark.match(line);
        if (!match.hasMatch()) {
            text << line;
            continue;
        }
        if (name.isEmpty()) {
            name = match.captured(1);
        } else {
            const QString piece = moved(text).join(QLatin1Char('\n'));
            QString& all = result[name];
            all += all.isEmpty() ? piece : QStringLiteral("\n\n") + piece;
            name.clear();
        }
        text.clear();
    }
    return result;
}

QSet<QString> tableNamesOf(const QString& page)
{
    static const QRegularExpression code(QStringLiteral("`([^`]+)`"));
    static const QRegularExpression arguments(QStringLiteral("<.*>|\\.h$"));
    static const QRegularExpression folders(QStringLiteral("^.*(?:::|/)"));
    QSet<QString> result;
    const QStringList lines = linesOutsideOfCode(page);
    for (const QString& line : lines) {
        if (!line.startsWith(QLatin1Char('|'))) {
            continue;
        }
        QRegularExpressionMatchIterator matches = code.globalMatch(line.section(QLatin1Char('|'), 1, 1));
        while (matches.hasNext()) {
            result << matches.next().captured(1).remove(arguments).remove(folders);
        }
    }
    return result;
}

QStringList signalsOf(const QString& header)
{
    static const QRegularExpression begin(QStringLiteral("^\\s*(?:Q_SIGNALS|signals)\\s*:"));
    static const QRegularExpression end(QStringLiteral("^\\s*(?:public|protected|private)\\b|^\\s*\\};"));
    static const QRegularExpression signal(QStringLiteral("^\\s*void\\s+(\\w+)\\s*\\("));
    QStringList result;
    bool inSignals = false;
    const QStringList lines = header.split(QLatin1Char('\n'));
    for (const QString& line : lines) {
        if (begin.match(line).hasMatch()) {
            inSignals = true;
        } else if (end.match(line).hasMatch()) {
            inSignals = false;
        } else if (inSignals && signal.match(line).hasMatch()) {
            result << signal.match(line).captured(1);
        }
    }
    return result;
}
}
