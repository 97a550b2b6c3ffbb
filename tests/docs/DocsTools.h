// SPDX-License-Identifier: MIT
// Reads the pages of docs/, the headers and the pieces of code as plain text.
#pragma once

#include <QtCore/QMap>
#include <QtCore/QSet>
#include <QtCore/QString>
#include <QtCore/QStringList>
#include <QtCore/QVector>

namespace docs
{
QString readFile(const QString& path);

/// A link or picture of a page: what stands in the round brackets. Code is left out.
QStringList linksOf(const QString& page);
/// The anchors of the page's headings, as the usual hosts spell them.
QSet<QString> anchorsOf(const QString& page);

/// A block of C++ on a page, and what the comment right above says of it.
struct Block
{
    QString mark; ///< of "<!-- code: mark -->"; empty without such a comment
    QString text;
    int line = 0; ///< of the page, from 1
};
QVector<Block> codeBlocksOf(const QString& page);
/// The pieces of a source: what stands between two lines "//! [name]", moved to the left edge. Pieces of one name
/// are joined with a blank line between them.
QMap<QString, QString> piecesOf(const QString& source);

/// The names in code letters in the first cells of the page's tables, without namespaces, template arguments and
/// folders: "Item" of "`vx::PopoverWidget::Item`", "NubsieLayout" of "`sliders/NubsieLayout.h`".
QSet<QString> tableNamesOf(const QString& page);
/// The signals that the classes of a header declare.
QStringList signalsOf(const QString& header);
}
