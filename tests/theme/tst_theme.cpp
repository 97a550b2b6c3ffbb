// SPDX-License-Identifier: MIT
// The two sheets that come with the library: they are complete, in step, read by Qt without complaint, and all their
// pictures are there.
#include "SheetRules.h"
#include "StylingPage.h"

#include "popover/items/PushItem.h"
#include "sliders/Nubsie.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "theme/Theme.h"

#include <QtCore/QFile>
#include <QtCore/QRegularExpression>
#include <QtGui/QImage>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>

using styling::SheetRule;
using zelkov::theme::Name;

namespace
{
QString joined(const QStringList& lines)
{
    return lines.join(QLatin1Char('\n'));
}

QStringList urlsOf(const QString& sheet)
{
    static const QRegularExpression url(QStringLiteral("url\\(([^)]+)\\)"));
    QStringList result;
    QRegularExpressionMatchIterator all = url.globalMatch(sheet);
    while (all.hasNext()) {
        result << all.next().captured(1);
    }
    return result;
}

QString sourceOf(const char* path)
{
    QFile file(QStringLiteral(ZELKOV_ROOT "/") + QLatin1String(path));
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

/// The rules without colours and pictures, a line for each.
QStringList frameOf(const QString& sheet)
{
    QStringList result;
    for (const SheetRule& rule : styling::rulesOf(sheet)) {
        QString line = rule.selectors.join(QLatin1String(", "));
        for (const QString& declaration : rule.declarations) {
            line += QLatin1String(" | ") + declaration.section(QLatin1Char(':'), 0, 0);
        }
        result << line;
    }
    return result;
}
}

class TestTheme : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup();
    void aSelectorCoversWhatItSpeaksOf_data();
    void aSelectorCoversWhatItSpeaksOf();
    void everySelectorOfThePageIsInTheSheet_data() { looks(); }
    void everySelectorOfThePageIsInTheSheet();
    void everyPropertyOfThePageIsInTheSheet_data() { looks(); }
    void everyPropertyOfThePageIsInTheSheet();
    void qtReadsTheSheet_data() { looks(); }
    void qtReadsTheSheet();
    void everyPictureOfTheSheetLoads_data() { looks(); }
    void everyPictureOfTheSheetLoads();
    void theSheetsDifferInColoursAndPicturesAlone();
    void everyWordOfTheSourceHasTwoColours();
    void theSheetIsSeen_data() { looks(); }
    void theSheetIsSeen();
    void noneIsNoSheet();

private:
    static void looks()
    {
        QTest::addColumn<int>("look");
        QTest::addRow("light") << int(Name::Light);
        QTest::addRow("dark") << int(Name::Dark);
    }
    static QString sheet()
    {
        QFETCH(int, look);
        return zelkov::theme::styleSheet(Name(look));
    }
};

void TestTheme::cleanup()
{
    qApp->setStyleSheet(QString());
    TestCase::cleanup();
}

void TestTheme::aSelectorCoversWhatItSpeaksOf_data()
{
    QTest::addColumn<QString>("selector");
    QTest::addColumn<QString>("wanted");
    QTest::addColumn<bool>("covered");
    const auto row = [](const char* selector, const char* wanted, bool covered) {
        QTest::addRow("%s: %s", selector, wanted) << QString::fromLatin1(selector) << QString::fromLatin1(wanted) << covered;
    };
    row("#text", "#text", true);
    row("vx--A #text", "#text", true);
    row("#textual", "#text", false);
    row("vx--A[role=\"x\"]", "vx--A", true);
    row("vx--AB", "vx--A", false);
    row("vx--A::handle", "vx--A", true);
    row("vx--A[state=\"2\"]", "vx--A[state=\"1\"]", true);
    row("vx--A", "vx--A[state=\"1\"]", false);
    row("vx--A:disabled #b", "vx--A:disabled", true);
    row("vx--A #b:disabled", "vx--A:disabled", false);
    row("#c #d #b", "#c #b", true);
    row("#b #c", "#c #b", false);
    row("vx--A > QLabel", "vx--A > QLabel", true);
}

void TestTheme::aSelectorCoversWhatItSpeaksOf()
{
    QFETCH(const QString, selector);
    QFETCH(const QString, wanted);
    QFETCH(const bool, covered);
    QCOMPARE(styling::covers(selector, wanted), covered);
}

void TestTheme::everySelectorOfThePageIsInTheSheet()
{
    QStringList all;
    const QVector<SheetRule> rules = styling::rulesOf(sheet());
    for (const SheetRule& rule : rules) {
        QVERIFY2(!rule.declarations.isEmpty(), qPrintable(rule.selectors.join(QLatin1Char(','))));
        all += rule.selectors;
    }
    const QStringList wanted = styling::keysOfPage(QStringLiteral("Selector"));
    QVERIFY(wanted.size() > 100);
    QStringList lacking;
    for (const QString& one : wanted) {
        // The program's names, and the same selector with a declaration behind it.
        if (one.startsWith(QLatin1String("#your")) || one.contains(QLatin1Char('{'))) {
            continue;
        }
        bool found = false;
        for (const QString& selector : qAsConst(all)) {
            found = found || styling::covers(selector, one);
        }
        if (!found) {
            lacking << one;
        }
    }
    QCOMPARE(joined(lacking), QString());
}

void TestTheme::everyPropertyOfThePageIsInTheSheet()
{
    const QVector<SheetRule> rules = styling::rulesOf(sheet());
    const QStringList wanted = styling::keysOfPage(QStringLiteral("Property"));
    QVERIFY(wanted.size() > 50);
    QStringList lacking;
    for (const QString& one : wanted) {
        const QString selector = one.section(QStringLiteral(" { "), 0, 0);
        const QString property = one.section(QStringLiteral(" { "), 1).remove(QStringLiteral(" }")) + QLatin1Char(':');
        bool found = false;
        for (const SheetRule& rule : rules) {
            for (const QString& declaration : rule.declarations) {
                if (declaration.startsWith(property)) {
                    for (const QString& head : rule.selectors) {
                        found = found || styling::covers(head, selector);
                    }
                }
            }
        }
        if (!found) {
            lacking << one;
        }
    }
    QCOMPARE(joined(lacking), QString());
}

void TestTheme::qtReadsTheSheet()
{
    // A rule that cannot be parsed prints a warning, which fails the test. So do a property that a widget lacks and
    // a value that it does not take, when the widget is polished.
    QWidget window;
    new vx::PopoverWidget::PushItem(QStringLiteral("Row"), QStringLiteral("more"), QStringLiteral("row"), 1,
        vx::PopoverWidget::eifText | vx::PopoverWidget::eifIcon | vx::PopoverWidget::eifAdditionalText, &window);
    qApp->setStyleSheet(sheet());
    window.show();
    QVERIFY(QTest::qWaitForWindowExposed(&window));
    QVERIFY(!window.grab().isNull());
    QVERIFY(sheet().size() > 20000);
    QVERIFY(!sheet().contains(QLatin1Char('@')));
}

void TestTheme::everyPictureOfTheSheetLoads()
{
    const QStringList urls = urlsOf(sheet());
    QVERIFY(urls.size() > 10);
    for (const QString& url : urls) {
        QVERIFY2(url.startsWith(QLatin1String(":/")), qPrintable(url));
        QVERIFY2(!QImage(url).isNull(), qPrintable(url));
    }
}

void TestTheme::theSheetsDifferInColoursAndPicturesAlone()
{
    const QString light = zelkov::theme::styleSheet(Name::Light);
    const QString dark = zelkov::theme::styleSheet(Name::Dark);
    QVERIFY(light != dark);
    QCOMPARE(joined(frameOf(light)), joined(frameOf(dark)));
    QStringList lightPictures = urlsOf(light);
    lightPictures.replaceInStrings(QStringLiteral("/light/"), QStringLiteral("/dark/"));
    QCOMPARE(lightPictures, urlsOf(dark));
}

void TestTheme::everyWordOfTheSourceHasTwoColours()
{
    QStringList words;
    for (const QString& line : sourceOf("theme/colors.txt").split(QLatin1Char('\n'))) {
        const QStringList parts = line.simplified().split(QLatin1Char(' '));
        if (line.startsWith(QLatin1Char('#')) || line.isEmpty()) {
            continue;
        }
        QCOMPARE(parts.size(), 3);
        QVERIFY2(QColor::isValidColor(parts.at(1)) && QColor::isValidColor(parts.at(2)), qPrintable(line));
        words << parts.at(0);
    }
    QVERIFY(words.size() > 20);
    words << QStringLiteral("pictures") << QStringLiteral("look");
    static const QRegularExpression word(QStringLiteral("@(\\w*)@"));
    QStringList used;
    QRegularExpressionMatchIterator all = word.globalMatch(sourceOf("theme/theme.qss"));
    while (all.hasNext()) {
        used << all.next().captured(1);
        QVERIFY2(words.contains(used.last()), qPrintable(used.last()));
    }
    QVERIFY(used.size() > 100);
}

void TestTheme::theSheetIsSeen()
{
    QFETCH(const int, look);
    qApp->setStyleSheet(sheet());
    QWidget window;
    window.resize(100, 100);
    auto* const handle = new vx::Nubsie(QStringLiteral("handle"), 1, 0, 2, 0, &window, 1);
    handle->setProperty("role", QStringLiteral("playhead"));
    handle->setPosition(QPointF(50, 50));
    window.show();
    QVERIFY(QTest::qWaitForWindowExposed(&window));
    QCOMPARE(handle->getSize(), QSize(24, 24));
    const QColor accent(Name(look) == Name::Dark ? QStringLiteral("#5b9bff") : QStringLiteral("#1f66d6"));
    QCOMPARE(window.grab().toImage().pixelColor(handle->geometry().center()), accent);
    QCOMPARE(zelkov::theme::palette(Name(look)).color(QPalette::Highlight), accent);
}

void TestTheme::noneIsNoSheet()
{
    QCOMPARE(zelkov::theme::styleSheet(Name::None), QString());
}

ZELKOV_TEST_MAIN(TestTheme)
#include "tst_theme.moc"
