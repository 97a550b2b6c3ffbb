// SPDX-License-Identifier: MIT
// The gallery from outside: its options, its pictures; and the style sheets it wears.
#include <QtCore/QFile>
#include <QtCore/QProcess>
#include <QtCore/QRegularExpression>
#include <QtCore/QTemporaryDir>
#include <QtGui/QImage>
#include <QtTest/QtTest>

#include "support/TestCase.h"
#include "support/TestMain.h"
#include "theme/Theme.h"

namespace
{
struct Outcome
{
    int code = -1;
    QString out;
    QString err;
};

Outcome run(const QStringList& arguments)
{
    QProcess process;
    process.start(QStringLiteral(GALLERY_PROGRAM), arguments);
    Outcome outcome;
    if (process.waitForFinished(240000) && process.exitStatus() == QProcess::NormalExit) {
        outcome.code = process.exitCode();
    }
    outcome.out = QString::fromUtf8(process.readAllStandardOutput());
    outcome.err = QString::fromUtf8(process.readAllStandardError());
    return outcome;
}

QStringList pageNames()
{
    QStringList names;
    for (const QString& line : run({QStringLiteral("--list")}).out.split(QLatin1Char('\n'), Qt::SkipEmptyParts)) {
        names.append(line.section(QLatin1Char(' '), 0, 0));
    }
    return names;
}

int colorCount(const QImage& image)
{
    QSet<QRgb> colors;
    for (int y = 0; y < image.height(); y += 3) {
        for (int x = 0; x < image.width(); x += 3) {
            colors.insert(image.pixel(x, y));
        }
    }
    return colors.size();
}

const char* const s_themes[] = {"light", "dark", "none"};
}

class TestGalleryCli : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void listNamesEveryPageWithFamilyAndTitle();
    void shotsWriteAPictureOfEachPageInEachTheme();
    void shotsOfOnePageAndThemeWriteOnePicture();
    void shotsIntoAnImpossibleFolderFail();
    void rehearsalLogsTheSignalsOfRealEvents();
    void textsFollowTheLanguage();
    void cataloguesAreComplete_data();
    void cataloguesAreComplete();
    void badOptionsFailWithAMessage_data();
    void badOptionsFailWithAMessage();
    void sheetsHaveNoWordLeftUnfilled_data();
    void sheetsHaveNoWordLeftUnfilled();
    void noThemeIsAnEmptySheet();
    void picturesNamedInASheetExist_data();
    void picturesNamedInASheetExist();
    void textStandsOutFromItsGround_data();
    void textStandsOutFromItsGround();
};

void TestGalleryCli::listNamesEveryPageWithFamilyAndTitle()
{
    const Outcome outcome = run({QStringLiteral("--list")});
    QCOMPARE(outcome.code, 0);
    QVERIFY2(outcome.err.isEmpty(), qPrintable(outcome.err));
    const QStringList names = pageNames();
    QCOMPARE(names.value(0), QStringLiteral("client"));
    QCOMPARE(names.value(1), QStringLiteral("camera-wall"));
    QVERIFY(names.contains(QStringLiteral("mouse-gestures")));
    QVERIFY(names.contains(QStringLiteral("badges")));
    QVERIFY(outcome.out.contains(QRegularExpression(QStringLiteral("client +Cameras: Camera client\n"))));
    QCOMPARE(QSet<QString>(names.begin(), names.end()).size(), names.size());
}

void TestGalleryCli::shotsWriteAPictureOfEachPageInEachTheme()
{
    QTemporaryDir folder;
    const Outcome outcome = run({QStringLiteral("--shots"), folder.filePath(QStringLiteral("shots"))});
    QVERIFY2(outcome.code == 0, qPrintable(outcome.err));
    const QStringList names = pageNames();
    for (const QString& name : names) {
        QVector<QImage> pictures;
        for (const char* theme : s_themes) {
            const QString file
                = folder.filePath(QStringLiteral("shots/%1-%2.png").arg(name, QString::fromLatin1(theme)));
            QVERIFY2(QFile::exists(file), qPrintable(file));
            const QImage picture(file);
            QVERIFY(picture.width() >= 800 && picture.height() >= 500);
            QVERIFY2(colorCount(picture) > 20, qPrintable(file + QStringLiteral(" is nearly blank")));
            pictures.append(picture);
        }
        QVERIFY2(qGray(pictures.at(0).pixel(5, 5)) > 160, qPrintable(name + QStringLiteral(" is not light")));
        QVERIFY2(qGray(pictures.at(1).pixel(5, 5)) < 90, qPrintable(name + QStringLiteral(" is not dark")));
    }
}

void TestGalleryCli::shotsOfOnePageAndThemeWriteOnePicture()
{
    QTemporaryDir folder;
    const Outcome outcome = run({QStringLiteral("--shots"), folder.path(), QStringLiteral("--page"),
                                 QStringLiteral("badges"), QStringLiteral("--theme"), QStringLiteral("dark")});
    QCOMPARE(outcome.code, 0);
    QCOMPARE(QDir(folder.path()).entryList(QDir::Files), QStringList{QStringLiteral("badges-dark.png")});
}

void TestGalleryCli::shotsIntoAnImpossibleFolderFail()
{
    const Outcome outcome = run({QStringLiteral("--shots"), QStringLiteral("/dev/null/shots"), QStringLiteral("--page"),
                                 QStringLiteral("badges"), QStringLiteral("--theme"), QStringLiteral("none")});
    QCOMPARE(outcome.code, 1);
    QVERIFY(outcome.out.contains(QStringLiteral("cannot be written")));
}

void TestGalleryCli::rehearsalLogsTheSignalsOfRealEvents()
{
    QTemporaryDir folder;
    const QString file = folder.filePath(QStringLiteral("log.txt"));
    const Outcome outcome
        = run({QStringLiteral("--shots"), folder.path(), QStringLiteral("--page"), QStringLiteral("mouse-gestures"),
               QStringLiteral("--theme"), QStringLiteral("light"), QStringLiteral("--log"), file});
    QCOMPARE(outcome.code, 0);
    QFile log(file);
    QVERIFY(log.open(QIODevice::ReadOnly));
    QStringList pad;
    const QStringList lines = QString::fromUtf8(log.readAll()).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    const QRegularExpression form(QStringLiteral("^\\d\\d:\\d\\d:\\d\\d\\.\\d{3} pad\\.(\\w+\\(.*\\))$"));
    for (const QString& line : lines) {
        const QRegularExpressionMatch match = form.match(line);
        if (match.hasMatch() && match.captured(1) != pad.value(pad.size() - 1)) {
            pad.append(match.captured(1));
        }
    }
    const QStringList expected{QStringLiteral("pressed(gesturePad)"), QStringLiteral("panning(gesturePad)"),
                               QStringLiteral("released(gesturePad)"), QStringLiteral("swiped(gesturePad)"),
                               QStringLiteral("finished(gesturePad)")};
    QCOMPARE(pad, expected);
    QVERIFY(!lines.filter(QRegularExpression(QStringLiteral("^# pad -?\\d+ -?\\d+ \\d+ \\d+$"))).isEmpty());
}

void TestGalleryCli::textsFollowTheLanguage()
{
    QTemporaryDir folder;
    QVector<QImage> pictures;
    for (const char* language : {"en", "de", "fr"}) {
        const QString target = folder.filePath(QString::fromLatin1(language));
        QCOMPARE(run({QStringLiteral("--shots"), target, QStringLiteral("--page"), QStringLiteral("badges"),
                      QStringLiteral("--theme"), QStringLiteral("light"), QStringLiteral("--lang"),
                      QString::fromLatin1(language)})
                     .code,
                 0);
        // The list of pages, whose texts change and nothing else.
        pictures.append(QImage(target + QStringLiteral("/badges-light.png")).copy(0, 60, 195, 300));
    }
    QVERIFY(!pictures.at(0).isNull());
    QVERIFY(pictures.at(0) != pictures.at(1));
    QVERIFY(pictures.at(0) != pictures.at(2));
    QVERIFY(pictures.at(1) != pictures.at(2));
}

void TestGalleryCli::cataloguesAreComplete_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QStringList>("folders");
    // The client has catalogues of its own.
    const QStringList folders{QStringLiteral("."), QStringLiteral("pages"), QStringLiteral("cameras")};
    QTest::newRow("de") << QStringLiteral("gallery_de.ts") << folders;
    QTest::newRow("fr") << QStringLiteral("gallery_fr.ts") << folders;
    QTest::newRow("client, de") << QStringLiteral("client/client_de.ts") << QStringList{QStringLiteral("client")};
    QTest::newRow("client, fr") << QStringLiteral("client/client_fr.ts") << QStringList{QStringLiteral("client")};
}

void TestGalleryCli::cataloguesAreComplete()
{
    QFETCH(QString, name);
    QFETCH(QStringList, folders);
    QTemporaryDir folder;
    const QString copy = folder.filePath(QFileInfo(name).fileName());
    QVERIFY(QFile::copy(QStringLiteral(GALLERY_FOLDER "/") + name, copy));
    QProcess lupdate;
    lupdate.setWorkingDirectory(QStringLiteral(GALLERY_FOLDER));
    lupdate.start(QStringLiteral(LUPDATE_PROGRAM),
                  QStringList{QStringLiteral("-silent"), QStringLiteral("-locations"), QStringLiteral("none"),
                              QStringLiteral("-no-recursive")}
                      + folders + QStringList{QStringLiteral("-ts"), copy});
    QVERIFY(lupdate.waitForFinished(30000));
    QCOMPARE(lupdate.exitCode(), 0);
    QFile file(copy);
    QVERIFY(file.open(QIODevice::ReadOnly));
    const QByteArray text = file.readAll();
    QVERIFY(text.count("<source>") > 50);
    QCOMPARE(text.count("type=\"unfinished\""), 0);
    QCOMPARE(text.count("type=\"vanished\""), 0);
    QCOMPARE(text.count("<translation></translation>"), 0);
}

void TestGalleryCli::badOptionsFailWithAMessage_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::addColumn<QString>("message");
    QTest::newRow("page") << QStringList{QStringLiteral("--page"), QStringLiteral("nowhere")}
                          << QStringLiteral("there is no page 'nowhere'");
    QTest::newRow("theme") << QStringList{QStringLiteral("--theme"), QStringLiteral("pink")}
                           << QStringLiteral("there is no theme 'pink'");
    QTest::newRow("language") << QStringList{QStringLiteral("--lang"), QStringLiteral("xx")}
                              << QStringLiteral("there is no language 'xx'");
    QTest::newRow("log") << QStringList{QStringLiteral("--log"), QStringLiteral("/dev/null/log")}
                         << QStringLiteral("cannot write '/dev/null/log'");
    QTest::newRow("argument") << QStringList{QStringLiteral("camera-wall")}
                              << QStringLiteral("unexpected argument 'camera-wall'");
}

void TestGalleryCli::badOptionsFailWithAMessage()
{
    QFETCH(QStringList, arguments);
    QFETCH(QString, message);
    const Outcome outcome = run(arguments);
    QCOMPARE(outcome.code, 2);
    QVERIFY2(outcome.err.contains(message), qPrintable(outcome.err));
}

static void themeRows()
{
    QTest::addColumn<int>("name");
    QTest::newRow("light") << int(zelkov::theme::Name::Light);
    QTest::newRow("dark") << int(zelkov::theme::Name::Dark);
}

void TestGalleryCli::sheetsHaveNoWordLeftUnfilled_data()
{
    themeRows();
}

void TestGalleryCli::sheetsHaveNoWordLeftUnfilled()
{
    QFETCH(int, name);
    QString sheet = zelkov::theme::styleSheet(zelkov::theme::Name(name));
    sheet.remove(QRegularExpression(QStringLiteral("/\\*.*?\\*/"), QRegularExpression::DotMatchesEverythingOption));
    QVERIFY(sheet.size() > 1000);
    QVERIFY(!sheet.contains(QLatin1Char('@')));
    QCOMPARE(sheet.count(QLatin1Char('{')), sheet.count(QLatin1Char('}')));
}

void TestGalleryCli::noThemeIsAnEmptySheet()
{
    QVERIFY(zelkov::theme::styleSheet(zelkov::theme::Name::None).isEmpty());
}

void TestGalleryCli::picturesNamedInASheetExist_data()
{
    themeRows();
}

void TestGalleryCli::picturesNamedInASheetExist()
{
    QFETCH(int, name);
    const QString sheet = zelkov::theme::styleSheet(zelkov::theme::Name(name));
    QRegularExpressionMatchIterator it = QRegularExpression(QStringLiteral("url\\(([^)]*)\\)")).globalMatch(sheet);
    int count = 0;
    while (it.hasNext()) {
        const QString file = it.next().captured(1);
        QVERIFY2(!QImage(file).isNull(), qPrintable(file));
        if (file.contains(QLatin1String("/overlays/"))) {
            continue; // drawn large, and always made smaller
        }
        QString twice = file;
        twice.replace(QLatin1String(".png"), QLatin1String("@2x.png"));
        QCOMPARE(QImage(twice).size(), QImage(file).size() * 2);
        ++count;
    }
    QVERIFY(count >= 4);
}

void TestGalleryCli::textStandsOutFromItsGround_data()
{
    themeRows();
}

void TestGalleryCli::textStandsOutFromItsGround()
{
    QFETCH(int, name);
    const QPalette palette = zelkov::theme::palette(zelkov::theme::Name(name));
    const QPair<QPalette::ColorRole, QPalette::ColorRole> pairs[] = {
        {QPalette::Text, QPalette::Base},
        {QPalette::WindowText, QPalette::Window},
        {QPalette::ButtonText, QPalette::Button},
        {QPalette::HighlightedText, QPalette::Highlight},
        {QPalette::ToolTipText, QPalette::ToolTipBase},
        {QPalette::PlaceholderText, QPalette::Base},
    };
    auto luminance = [](const QColor& color) {
        auto linear = [](double c) { return c <= 0.04045 ? c / 12.92 : std::pow((c + 0.055) / 1.055, 2.4); };
        return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
    };
    for (const auto& pair : pairs) {
        const double one = luminance(palette.color(pair.first));
        const double other = luminance(palette.color(pair.second));
        const double contrast = (qMax(one, other) + 0.05) / (qMin(one, other) + 0.05);
        QVERIFY2(contrast >= 4.5, qPrintable(QStringLiteral("role %1: %2").arg(int(pair.first)).arg(contrast)));
    }
}

ZELKOV_TEST_MAIN(TestGalleryCli)
#include "tst_gallery_cli.moc"
