// SPDX-License-Identifier: MIT
// Who may include whom, and what every source file has to begin with and must not speak of.
#include <QtCore/QDirIterator>
#include <QtCore/QFile>
#include <QtCore/QRegularExpression>
#include <QtCore/QSet>
#include <QtCore/QTemporaryDir>
#include <QtTest/QtTest>

#include "TestCase.h"
#include "TestMain.h"

namespace
{
struct File
{
    QString path; // below the folder that was read
    QString text;
};

QVector<File> readFolder(const QString& folder, const QStringList& patterns)
{
    QVector<File> result;
    QDirIterator files(folder, patterns, QDir::Files, QDirIterator::Subdirectories);
    while (files.hasNext()) {
        const QString path = files.next();
        QFile file(path);
        if (file.open(QIODevice::ReadOnly)) {
            result.append({QDir(folder).relativeFilePath(path), QString::fromUtf8(file.readAll())});
        }
    }
    return result;
}

const QStringList c_sources{QStringLiteral("*.h"), QStringLiteral("*.cpp")};

// A room may include itself and every room of a smaller rank.
int rankOf(const QString& room)
{
    static const QHash<QString, int> ranks{
        {QStringLiteral("foundation"), 0},
        {QStringLiteral("resources"), 0},
        {QStringLiteral("indicators"), 1},
        {QStringLiteral("input"), 2},
        {QStringLiteral("sliders"), 3},
        {QStringLiteral("popover"), 4},
        {QStringLiteral("popover/items"), 5},
        {QStringLiteral("models"), 6},
        {QStringLiteral("views"), 6},
        {QStringLiteral("controls"), 6},
    };
    return ranks.value(room, -1);
}

bool isPlatform(const QString& room)
{
    return room == QLatin1String("Core") || room == QLatin1String("CoreQt") || room == QLatin1String("ZelkovUtils");
}

// "popover/items" of "popover/items/CheckItem.h".
QString roomOf(const QString& path)
{
    const int slash = path.lastIndexOf(QLatin1Char('/'));
    return slash < 0 ? QString() : path.left(slash);
}

QStringList includesOf(const QString& text)
{
    static const QRegularExpression include(
        QStringLiteral("^[ \\t]*#[ \\t]*include[ \\t]*\"([^\"]+)\""), QRegularExpression::MultilineOption);
    QStringList result;
    QRegularExpressionMatchIterator matches = include.globalMatch(text);
    while (matches.hasNext()) {
        result << matches.next().captured(1);
    }
    return result;
}

// Lines "from/File.h -> to/File.h" of the block that begins with ```arrows.
QSet<QString> exceptionsOf(const QString& page)
{
    static const QRegularExpression block(
        QStringLiteral("^```arrows\\s*$(.*?)^```\\s*$"),
        QRegularExpression::MultilineOption | QRegularExpression::DotMatchesEverythingOption);
    QSet<QString> result;
    const QStringList lines = block.match(page).captured(1).split(QLatin1Char('\n'));
    for (const QString& line : lines) {
        if (!line.trimmed().isEmpty()) {
            result << line.simplified();
        }
    }
    return result;
}

// What is wrong with the includes of the files of src/.
QStringList forbiddenArrows(const QVector<File>& files, const QSet<QString>& exceptions)
{
    QStringList result;
    for (const File& file : files) {
        const QString from = roomOf(file.path);
        if (rankOf(from) < 0) {
            result << file.path + QLatin1String(" stands in no known room");
            continue;
        }
        const QStringList includes = includesOf(file.text);
        for (const QString& include : includes) {
            if (include.endsWith(QLatin1String(".moc")) || include.startsWith(QLatin1String("moc_"))) {
                continue;
            }
            const QString arrow = file.path + QLatin1String(" -> ") + include;
            const QString to = roomOf(include);
            if (isPlatform(to) || to == from || exceptions.contains(arrow)) {
                continue;
            }
            if (to.isEmpty()) {
                result << arrow + QLatin1String(" (the include does not name the room)");
            } else if (rankOf(to) < 0) {
                result << arrow + QLatin1String(" (no such room)");
            } else if (rankOf(to) >= rankOf(from)) {
                result << arrow;
            }
        }
    }
    return result;
}

// The platform libraries know nothing of the library.
QStringList upwardArrows(const QVector<File>& platform)
{
    QStringList result;
    for (const File& file : platform) {
        const QStringList includes = includesOf(file.text);
        for (const QString& include : includes) {
            if (!isPlatform(roomOf(include)) && !include.endsWith(QLatin1String(".moc"))) {
                result << file.path + QLatin1String(" -> ") + include;
            }
        }
    }
    return result;
}

// A reader of the sources has nothing but this repository: comments must not lean on papers from outside.
QStringList outsidePapers(const QVector<File>& files)
{
    static const QVector<QRegularExpression> words = [] {
        const char* const patterns[] = {"\\b(?:the|this|our)\\s+spec(?:ification)?\\b", "\\bspec\\.md\\b",
            "\\bas\\s+specified\\b", "\\bPart\\s+\\d+\\.\\d+", "\\bissue\\s+#?\\d+", "\\.\\./shared\\b",
            "\\breadings\\.md\\b"};
        QVector<QRegularExpression> result;
        for (const char* pattern : patterns) {
            result << QRegularExpression(QLatin1String(pattern), QRegularExpression::CaseInsensitiveOption);
        }
        return result;
    }();
    QStringList result;
    for (const File& file : files) {
        for (const QRegularExpression& word : words) {
            const QRegularExpressionMatch match = word.match(file.text);
            if (match.hasMatch()) {
                result << file.path + QLatin1String(": \"") + match.captured() + QLatin1Char('"');
            }
        }
    }
    return result;
}

QStringList withoutLicence(const QVector<File>& files)
{
    QStringList result;
    for (const File& file : files) {
        if (!file.text.startsWith(QLatin1String("// SPDX-License-Identifier: MIT\n"))) {
            result << file.path;
        }
    }
    return result;
}

QByteArray joined(const QStringList& lines)
{
    return lines.join(QLatin1Char('\n')).toLocal8Bit();
}

QString root(const char* folder)
{
    return QStringLiteral(ZELKOV_ROOT "/") + QLatin1String(folder);
}
}

class TestArchitecture : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void roomsIncludeOnlyWhatStandsBeforeThem()
    {
        const QVector<File> files = readFolder(root("src"), c_sources);
        QVERIFY(files.size() > 5);
        QFile page(root("docs/architecture.md"));
        QVERIFY(page.open(QIODevice::ReadOnly));
        const QSet<QString> exceptions = exceptionsOf(QString::fromUtf8(page.readAll()));
        const QStringList found = forbiddenArrows(files, exceptions);
        QVERIFY2(found.isEmpty(), joined(found).constData());
    }

    void everyExceptionIsStillNeeded()
    {
        QFile page(root("docs/architecture.md"));
        QVERIFY(page.open(QIODevice::ReadOnly));
        const QSet<QString> exceptions = exceptionsOf(QString::fromUtf8(page.readAll()));
        const QVector<File> files = readFolder(root("src"), c_sources);
        for (const QString& exception : exceptions) {
            QSet<QString> others = exceptions;
            others.remove(exception);
            QVERIFY2(forbiddenArrows(files, others).contains(exception), qPrintable(exception));
        }
    }

    void platformKnowsNothingOfTheLibrary()
    {
        const QStringList found = upwardArrows(readFolder(root("platform"), c_sources));
        QVERIFY2(found.isEmpty(), joined(found).constData());
    }

    void sourcesStandOnTheirOwn()
    {
        QStringList found;
        for (const char* folder : {"src", "platform", "gallery", "theme", "examples", "benchmarks"}) {
            found << outsidePapers(readFolder(root(folder), c_sources));
        }
        QVERIFY2(found.isEmpty(), joined(found).constData());
    }

    void everySourceBeginsWithItsLicence()
    {
        QStringList found;
        for (const char* folder : {"src", "platform", "gallery", "theme", "examples", "benchmarks", "tests"}) {
            found << withoutLicence(readFolder(root(folder), c_sources));
        }
        QVERIFY2(found.isEmpty(), joined(found).constData());
    }

    void anArrowAgainstTheOrderIsFound_data()
    {
        QTest::addColumn<QString>("path");
        QTest::addColumn<QString>("include");
        QTest::addColumn<bool>("allowed");
        const auto row = [](const char* path, const char* include, bool allowed) {
            QTest::addRow("%s -> %s", path, include) << QString::fromLatin1(path) << QString::fromLatin1(include) << allowed;
        };
        row("input/A.h", "foundation/B.h", true);
        row("input/A.h", "indicators/B.h", true);
        row("input/A.h", "input/B.h", true);
        row("input/A.h", "sliders/B.h", false);
        row("foundation/A.cpp", "indicators/B.h", false);
        row("foundation/A.cpp", "CoreQt/Connect.h", true);
        row("popover/A.h", "popover/items/B.h", false);
        row("popover/items/A.h", "popover/B.h", true);
        row("views/A.h", "controls/B.h", false);
        row("controls/A.cpp", "popover/items/B.h", true);
        row("controls/A.cpp", "gallery/B.h", false);
        row("controls/A.cpp", "B.h", false);
        row("controls/A.cpp", "A.moc", true);
        row("nowhere/A.cpp", "foundation/B.h", false);
    }

    void anArrowAgainstTheOrderIsFound()
    {
        QFETCH(QString, path);
        QFETCH(QString, include);
        QFETCH(bool, allowed);
        const QVector<File> files{{path, QStringLiteral("// x\n#include \"") + include + QStringLiteral("\"\n")}};
        QCOMPARE(forbiddenArrows(files, {}).isEmpty(), allowed);
    }

    void anExceptionOfThePageIsHeeded()
    {
        const QVector<File> files{{QStringLiteral("foundation/A.h"), QStringLiteral("#include \"indicators/B.h\"\n")}};
        const QString page = QStringLiteral("# T\n\n```arrows\nfoundation/A.h -> indicators/B.h\n```\n\n```\nx -> y\n```\n");
        const QSet<QString> exceptions = exceptionsOf(page);
        QCOMPARE(exceptions, QSet<QString>{QStringLiteral("foundation/A.h -> indicators/B.h")});
        QVERIFY(forbiddenArrows(files, exceptions).isEmpty());
        QVERIFY(!forbiddenArrows(files, {}).isEmpty());
        QVERIFY(exceptionsOf(QStringLiteral("```arrows\n```\n")).isEmpty());
    }

    void plantedSinsAreFound()
    {
        QTemporaryDir folder;
        const auto write = [&](const char* name, const char* text) {
            QFile file(folder.filePath(QLatin1String(name)));
            QVERIFY(file.open(QIODevice::WriteOnly));
            file.write(text);
        };
        write("Good.h", "// SPDX-License-Identifier: MIT\n// The part of 1.5 pixels; a special ordering list.\n");
        write("Bad.h", "// No licence, and P" "art 2.1 says so.\n#include \"input/X.h\"\n");
        const QVector<File> files = readFolder(folder.path(), c_sources);
        QCOMPARE(files.size(), 2);
        QCOMPARE(withoutLicence(files), QStringList{QStringLiteral("Bad.h")});
        QCOMPARE(outsidePapers(files), QStringList{QStringLiteral("Bad.h: \"P" "art 2.1\"")});
        QCOMPARE(upwardArrows(files), QStringList{QStringLiteral("Bad.h -> input/X.h")});
    }
};

ZELKOV_TEST_MAIN(TestArchitecture)
#include "tst_architecture.moc"
