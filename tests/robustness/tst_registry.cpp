// SPDX-License-Identifier: MIT
// The registry is complete: no exported class of src/ and platform/ is missing from it, and it says what kind each is.
#include <QtCore/QDirIterator>
#include <QtCore/QRegularExpression>
#include <QtCore/QTemporaryDir>
#include <QtTest/QtTest>

#include "Registry.h"
#include "TestCase.h"
#include "TestMain.h"

using zelkovtest::Entry;
using zelkovtest::Kind;

namespace
{
struct Found
{
    QString name;
    QString header;
    bool hasMetaObject;
};

QString read(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

// Exported classes and class templates that are defined (not just announced) in the headers below root.
QVector<Found> exportedClasses(const QString& root)
{
    static const QRegularExpression definition(QStringLiteral(
        "^(?:template\\s*<[^;{]*>\\s*(?:class|struct)\\s+(\\w+)|(?:class|struct)\\s+ZELKOV_\\w+_EXPORT\\s+(\\w+))"
        "\\s*(?:final\\s*)?(?::[^;{]*)?\\{"),
        QRegularExpression::MultilineOption);
    QVector<Found> result;
    QDirIterator files(root, {QStringLiteral("*.h")}, QDir::Files, QDirIterator::Subdirectories);
    while (files.hasNext()) {
        const QString path = files.next();
        const QString text = read(path);
        QVector<int> starts;
        const int first = result.size();
        QRegularExpressionMatchIterator matches = definition.globalMatch(text);
        while (matches.hasNext()) {
            const QRegularExpressionMatch match = matches.next();
            starts << match.capturedStart();
            const QString name = match.captured(1).isEmpty() ? match.captured(2) : match.captured(1);
            result.append({name, QDir(root).relativeFilePath(path), false});
        }
        starts << text.size();
        for (int i = first; i < result.size(); ++i) {
            const int from = starts.at(i - first);
            const QString body = text.mid(from, starts.at(i - first + 1) - from);
            result[i].hasMetaObject = body.contains(QLatin1String("Q_OBJECT"));
        }
    }
    return result;
}

QStringList missing(const std::vector<Entry>& entries, const QVector<Found>& classes)
{
    QStringList result;
    for (const Found& found : classes) {
        bool listed = false;
        for (const Entry& entry : entries) {
            listed |= QString::fromLatin1(entry.name) == found.name
                && QString::fromLatin1(entry.header) == found.header;
        }
        if (!listed) {
            result << found.name + QLatin1String(" of ") + found.header;
        }
    }
    return result;
}

void write(const QString& path, const char* text)
{
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(text);
}
}

class TestRegistry : public zelkovtest::TestCase
{
    Q_OBJECT

    const QString m_root = QStringLiteral(ZELKOV_SOURCE_ROOT);
    const QString m_platform = QStringLiteral(ZELKOV_PLATFORM_ROOT);

private Q_SLOTS:
    void everyExportedClassIsListed()
    {
        const QVector<Found> classes = exportedClasses(m_root) + exportedClasses(m_platform);
        QVERIFY2(classes.size() >= 3, "the headers were not found");
        const QStringList forgotten = missing(zelkovtest::registry(), classes);
        QVERIFY2(forgotten.isEmpty(), qPrintable(forgotten.join(QLatin1String(", "))));
    }

    void objectsAreNotListedAsValues()
    {
        const QVector<Found> classes = exportedClasses(m_root) + exportedClasses(m_platform);
        for (const Found& found : classes) {
            for (const Entry& entry : zelkovtest::registry()) {
                if (QString::fromLatin1(entry.name) == found.name
                    && QString::fromLatin1(entry.header) == found.header && found.hasMetaObject) {
                    QVERIFY2(entry.kind != Kind::Value, entry.name.constData());
                }
            }
        }
    }

    void everyHeaderNamedExists()
    {
        for (const Entry& entry : zelkovtest::registry()) {
            const QString header = QString::fromLatin1(entry.header);
            QVERIFY2(QFile::exists(m_root + QLatin1Char('/') + header)
                    || QFile::exists(m_platform + QLatin1Char('/') + header),
                entry.header.constData());
        }
    }

    void everyEntryIsComplete()
    {
        QStringList seen;
        for (const Entry& entry : zelkovtest::registry()) {
            // Rooms may have classes of one name.
            const QString key = QString::fromLatin1(entry.name + " of " + entry.header);
            QVERIFY2(!seen.contains(key), entry.name.constData());
            seen << key;
            if (entry.kind == Kind::Value) {
                continue;
            }
            QVERIFY2(entry.create, entry.name.constData());
            QVERIFY2(!entry.exercise.empty(), entry.name.constData());
            QWidget host;
            const zelkovtest::Subject subject = entry.create(&host);
            QVERIFY2(subject.alive(), entry.name.constData());
            QCOMPARE(subject.object->isWidgetType(), entry.kind == Kind::Widget);
            QByteArray className(subject.object->metaObject()->className());
            className.remove(0, className.lastIndexOf(':') + 1);
            // A class without a meta-object of its own answers with its base class.
            QVERIFY2(className == entry.name || subject.object->metaObject()->superClass() != nullptr,
                entry.name.constData());
        }
    }

    void aNewClassThatIsNotListedIsFound()
    {
        QTemporaryDir folder;
        QVERIFY(QDir(folder.path()).mkpath(QStringLiteral("views/deep")));
        write(folder.filePath(QStringLiteral("views/Listed.h")),
            "class Announced;\nclass ZELKOV_WIDGETS_EXPORT Listed : public QWidget\n{\n    Q_OBJECT\n};\n");
        write(folder.filePath(QStringLiteral("views/deep/Forgotten.h")),
            "class ZELKOV_WIDGETS_EXPORT Later;\nclass ZELKOV_WIDGETS_EXPORT Forgotten final\n{\n};\n");
        write(folder.filePath(QStringLiteral("views/Shape.h")),
            "template<class Base>\nclass TShape : public Base\n{\n};\ntemplate<class T> class TNamed;\n");
        const QVector<Found> classes = exportedClasses(folder.path());
        QCOMPARE(classes.size(), 3);
        const QStringList forgotten = missing({zelkovtest::valueClass("Listed", "views/Listed.h")}, classes);
        QCOMPARE(forgotten.size(), 2);
        QVERIFY(forgotten.contains(QStringLiteral("Forgotten of views/deep/Forgotten.h")));
        QVERIFY(forgotten.contains(QStringLiteral("TShape of views/Shape.h")));
        for (const Found& found : classes) {
            QCOMPARE(found.hasMetaObject, found.name == QLatin1String("Listed"));
        }
    }
};

ZELKOV_TEST_MAIN(TestRegistry)
#include "tst_registry.moc"
