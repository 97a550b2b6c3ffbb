// SPDX-License-Identifier: MIT
// The pages of docs/ against the rest of the repository: links and pictures exist, the code is the code that is
// compiled, and every class and signal is told on the page of its family.
#include <QtCore/QDir>
#include <QtCore/QDirIterator>
#include <QtCore/QFileInfo>
#include <QtCore/QRegularExpression>
#include <QtCore/QTemporaryDir>
#include <QtTest/QtTest>

#include "DocsTools.h"
#include "Snippets.h"
#include "TestCase.h"
#include "TestMain.h"

namespace
{
const QString c_root = QStringLiteral(ZELKOV_ROOT "/");

// Pages that are no family of classes: they tell of the whole.
const QStringList c_others{QStringLiteral("architecture"), QStringLiteral("gallery"), QStringLiteral("styling")};

QStringList pageFiles()
{
    QStringList result{QStringLiteral("README.md"), QStringLiteral("CONTRIBUTING.md"), QStringLiteral("CHANGELOG.md"),
        QStringLiteral("examples/README.md")};
    for (const QString& name : QDir(c_root + QStringLiteral("docs")).entryList({QStringLiteral("*.md")})) {
        result << QStringLiteral("docs/") + name;
    }
    return result;
}

// Page name and text.
QMap<QString, QString> familyPages()
{
    QMap<QString, QString> result;
    for (const QString& file : pageFiles()) {
        const QString name = QFileInfo(file).baseName();
        if (file.startsWith(QLatin1String("docs/")) && !c_others.contains(name)) {
            result.insert(name, docs::readFile(c_root + file));
        }
    }
    return result;
}

// What is wrong with the links of a file, whose path is relative to root.
QStringList brokenLinks(const QString& root, const QString& file)
{
    QStringList result;
    const QString text = docs::readFile(root + file);
    for (const QString& link : docs::linksOf(text)) {
        if (link.contains(QLatin1String("://")) || link.startsWith(QLatin1String("mailto:"))) {
            continue;
        }
        const QString path = link.section(QLatin1Char('#'), 0, 0);
        const QString anchor = link.section(QLatin1Char('#'), 1);
        const QString target
            = path.isEmpty() ? root + file : QFileInfo(root + file).absolutePath() + QLatin1Char('/') + path;
        if (!QFileInfo::exists(target)) {
            result << file + QLatin1String(" -> ") + link;
        } else if (!anchor.isEmpty() && !docs::anchorsOf(docs::readFile(target)).contains(anchor)) {
            result << file + QLatin1String(" -> ") + link + QLatin1String(" (no such heading)");
        }
    }
    return result;
}

// What is wrong with the code of a page whose pieces stand in that source.
QStringList wrongCode(const QString& name, const QString& page, const QString& source)
{
    QStringList result;
    const QMap<QString, QString> pieces = docs::piecesOf(source);
    QSet<QString> unseen = QSet<QString>(pieces.keyBegin(), pieces.keyEnd());
    for (const docs::Block& block : docs::codeBlocksOf(page)) {
        const QString place = QStringLiteral("%1.md:%2: ").arg(name).arg(block.line);
        if (block.mark.startsWith(QLatin1String("none, "))) {
            continue;
        }
        if (block.mark.isEmpty()) {
            result << place + QLatin1String("no comment <!-- code: name --> right above");
        } else if (!pieces.contains(block.mark)) {
            result << place + QStringLiteral("examples/snippets/%1.cpp has no [%2]").arg(name, block.mark);
        } else if (pieces.value(block.mark) != block.text) {
            result << place
                    + QStringLiteral("differs from [%1]. Compiled:\n%2\nOn the page:\n%3")
                          .arg(block.mark, pieces.value(block.mark), block.text);
        }
        unseen.remove(block.mark);
    }
    for (const QString& piece : qAsConst(unseen)) {
        result << QStringLiteral("%1.cpp: [%2] is on no page").arg(name, piece);
    }
    return result;
}

// Installed headers: room and name, as in "popover/items/CheckItem".
QStringList publicHeaders()
{
    QStringList result;
    for (const char* folder : {"src", "platform"}) {
        const QString root = c_root + QLatin1String(folder);
        QDirIterator files(root, {QStringLiteral("*.h")}, QDir::Files, QDirIterator::Subdirectories);
        while (files.hasNext()) {
            const QString path = files.next();
            if (docs::readFile(path).left(300).contains(QLatin1String("; not installed."))) {
                continue; // the library's own
            }
            result << path.left(path.size() - 2);
        }
    }
    return result;
}

// Headers that no page names in a table, or more pages than there are headers of that name.
QStringList misplaced(const QStringList& headers, const QMap<QString, QString>& pages)
{
    QMap<QString, int> wanted;
    for (const QString& header : headers) {
        ++wanted[QFileInfo(header).fileName()];
    }
    QStringList result;
    for (auto header = wanted.cbegin(); header != wanted.cend(); ++header) {
        QStringList found;
        for (auto page = pages.cbegin(); page != pages.cend(); ++page) {
            if (docs::tableNamesOf(page.value()).contains(header.key())) {
                found << page.key();
            }
        }
        if (found.size() != header.value()) {
            result << QStringLiteral("%1: %2").arg(
                header.key(), found.isEmpty() ? QStringLiteral("on no page") : found.join(QLatin1String(" and ")));
        }
    }
    return result;
}

// Signals of the header that its page does not speak of.
QStringList untold(const QString& name, const QString& header, const QMap<QString, QString>& pages)
{
    QStringList result;
    for (const QString& signal : docs::signalsOf(header)) {
        const QRegularExpression word(QStringLiteral("\\b%1\\b").arg(signal));
        bool told = false;
        for (const QString& page : pages) {
            told |= docs::tableNamesOf(page).contains(name) && word.match(page).hasMatch();
        }
        if (!told) {
            result << name + QLatin1String("::") + signal;
        }
    }
    return result;
}

// Picture and the rest of its line, from the table of pictures.
QMap<QString, QString> pictureTable()
{
    QMap<QString, QString> result;
    const QStringList lines = docs::readFile(c_root + QStringLiteral("docs/images/pictures.txt")).split(QLatin1Char('\n'));
    for (const QString& line : lines) {
        if (!line.isEmpty() && !line.startsWith(QLatin1Char('#'))) {
            result.insert(line.simplified().section(QLatin1Char(' '), 0, 0), line.simplified().section(QLatin1Char(' '), 1));
        }
    }
    return result;
}

QByteArray joined(const QStringList& lines)
{
    return lines.join(QLatin1Char('\n')).toUtf8();
}
}

class TestDocs : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void everyLinkLeadsSomewhere()
    {
        QStringList found;
        for (const QString& file : pageFiles()) {
            found << brokenLinks(c_root, file);
        }
        QVERIFY2(found.isEmpty(), joined(found).constData());
    }

    void everyPageIsReachedFromTheReadme()
    {
        QStringList waiting{QStringLiteral("README.md")};
        QSet<QString> reached;
        while (!waiting.isEmpty()) {
            const QString file = waiting.takeFirst();
            if (reached.contains(file)) {
                continue;
            }
            reached << file;
            for (const QString& link : docs::linksOf(docs::readFile(c_root + file))) {
                const QString path = QDir::cleanPath(
                    QFileInfo(file).path() + QLatin1Char('/') + link.section(QLatin1Char('#'), 0, 0));
                if (path.endsWith(QLatin1String(".md"))) {
                    waiting << path;
                }
            }
        }
        for (const QString& file : pageFiles()) {
            if (file.startsWith(QLatin1String("docs/"))) {
                QVERIFY2(reached.contains(file), qPrintable(file));
            }
        }
    }

    void everyPictureHasItsRecipeAndItsPage()
    {
        const QStringList files = QDir(c_root + QStringLiteral("docs/images")).entryList({QStringLiteral("*.png")});
        QVERIFY(!files.isEmpty());
        const QMap<QString, QString> table = pictureTable();
        QSet<QString> shown;
        for (const QString& file : pageFiles()) {
            for (const QString& link : docs::linksOf(docs::readFile(c_root + file))) {
                shown << QFileInfo(link).fileName();
            }
        }
        for (const QString& file : files) {
            QVERIFY2(table.contains(QFileInfo(file).baseName()), qPrintable(file));
            QVERIFY2(shown.contains(file), qPrintable(file));
        }
        for (const QString& picture : table.keys()) {
            QVERIFY2(files.contains(picture + QLatin1String(".png")), qPrintable(picture));
        }
    }

    void everyFamilyPageHasAPictureOrNothingToShow()
    {
        // Classes without a look.
        const QStringList unseen{QStringLiteral("foundation"), QStringLiteral("platform"), QStringLiteral("resources")};
        const QMap<QString, QString> pages = familyPages();
        for (auto page = pages.cbegin(); page != pages.cend(); ++page) {
            QVERIFY2(unseen.contains(page.key()) != page.value().contains(QLatin1String("](images/")), qPrintable(page.key()));
        }
    }

    void theCodeOnThePagesIsTheCodeThatIsCompiled()
    {
        QStringList found;
        for (const QString& file : pageFiles()) {
            const QString name = QFileInfo(file).baseName();
            if (file.startsWith(QLatin1String("docs/"))) {
                found << wrongCode(name, docs::readFile(c_root + file),
                    docs::readFile(c_root + QStringLiteral("examples/snippets/") + name + QLatin1String(".cpp")));
            }
        }
        QVERIFY2(found.isEmpty(), joined(found).constData());
    }

    void everyFamilyPageHasCodeThatRuns()
    {
        QStringList listed;
        for (const snippets::Page& page : snippets::pages()) {
            listed << QLatin1String(page.name);
        }
        QCOMPARE(listed, QStringList(familyPages().keys()));
    }

    void everyHeaderIsOnOnePage()
    {
        const QStringList headers = publicHeaders();
        QVERIFY(headers.size() > 100);
        const QStringList found = misplaced(headers, familyPages());
        QVERIFY2(found.isEmpty(), joined(found).constData());
    }

    void everySignalIsOnThePageOfItsClass()
    {
        const QMap<QString, QString> pages = familyPages();
        QStringList found;
        for (const QString& header : publicHeaders()) {
            found << untold(QFileInfo(header).fileName(), docs::readFile(header + QLatin1String(".h")), pages);
        }
        QVERIFY2(found.isEmpty(), joined(found).constData());
    }

    void brokenLinksAreFound()
    {
        QTemporaryDir folder;
        const QString root = folder.path() + QLatin1Char('/');
        const auto write = [&](const char* name, const char* text) {
            QFile file(root + QLatin1String(name));
            QVERIFY(file.open(QIODevice::WriteOnly));
            file.write(text);
        };
        QVERIFY(QDir(root).mkdir(QStringLiteral("docs")));
        write("docs/a.md",
            "# The `first` heading\n[here](#the-first-heading) [there](b.md) ![picture](images/none.png)\n"
            "```cpp\nauto a = b[i](c);\n```\n`x[1](y.md)` [web](https://example.org/x) [no](#none) [up](../b.md)\n"
            "[two\nlines](c.md)\n");
        write("docs/b.md", "# B\n");
        QCOMPARE(brokenLinks(root, QStringLiteral("docs/a.md")),
            (QStringList{QStringLiteral("docs/a.md -> images/none.png"),
                QStringLiteral("docs/a.md -> #none (no such heading)"), QStringLiteral("docs/a.md -> ../b.md"),
                QStringLiteral("docs/a.md -> c.md")}));
    }

    void codeThatDriftsIsFound()
    {
        const QString source = QStringLiteral(
            "//! [a]\n#include \"x.h\"\n\n//! [a]\nint f()\n{\n    //! [a]\n    if (x) {\n        y();\n    }\n    //! [a]\n}\n");
        const QString good = QStringLiteral("<!-- code: a -->\n```cpp\n#include \"x.h\"\n\nif (x) {\n    y();\n}\n```\n");
        QCOMPARE(wrongCode(QStringLiteral("p"), good, source), QStringList());
        QCOMPARE(wrongCode(QStringLiteral("p"), QString(good).replace(QLatin1String("y()"), QLatin1String("z()")), source).size(), 1);
        QCOMPARE(wrongCode(QStringLiteral("p"), QString(good).remove(QLatin1String("<!-- code: a -->\n")), source),
            (QStringList{QStringLiteral("p.md:1: no comment <!-- code: name --> right above"),
                QStringLiteral("p.cpp: [a] is on no page")}));
        QCOMPARE(wrongCode(QStringLiteral("p"), QString(good).replace(QLatin1String("code: a"), QLatin1String("code: b")), source).size(), 2);
        QCOMPARE(wrongCode(QStringLiteral("p"), QStringLiteral("<!-- code: none, it is a sketch -->\n```cpp\nx\n```\n"), QString()).size(), 0);
        QCOMPARE(wrongCode(QStringLiteral("p"), QStringLiteral("```css\nx\n```\n"), QString()).size(), 0);
        QCOMPARE(wrongCode(QStringLiteral("p"), QString(), source).size(), 1);
    }

    void classesWithoutAPageAreFound()
    {
        const QMap<QString, QString> pages{
            {QStringLiteral("a"), QStringLiteral("| `vx::A`, `vx::T<QWidget>` | `vx::B` |\n| `room/C.h` | x |\n")},
            {QStringLiteral("b"), QStringLiteral("| `C` | x |\n```\n| `D` |\n```\nvx::B emits `done`.\n")}};
        QCOMPARE(misplaced({QStringLiteral("r/A"), QStringLiteral("r/B"), QStringLiteral("r/C"), QStringLiteral("r/D"),
                               QStringLiteral("r/T"), QStringLiteral("r/A")},
                     pages),
            (QStringList{QStringLiteral("A: a"), QStringLiteral("B: on no page"), QStringLiteral("C: a and b"),
                QStringLiteral("D: on no page")}));
        const QString header = QStringLiteral(
            "class C {\npublic:\n    void x();\nQ_SIGNALS:\n    /// Always.\n    void done(int a,\n        int b);\n"
            "    void gone();\n\nprotected:\n    void y();\n};\n");
        QCOMPARE(docs::signalsOf(header), (QStringList{QStringLiteral("done"), QStringLiteral("gone")}));
        QCOMPARE(untold(QStringLiteral("C"), header, pages), QStringList{QStringLiteral("C::gone")});
    }
};

ZELKOV_TEST_MAIN(TestDocs)
#include "tst_docs.moc"
