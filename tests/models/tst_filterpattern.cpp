// SPDX-License-Identifier: MIT
// The prepared pattern gives the results of QRegExp, for every pattern.
#include <functional>
#include <random>

#include <QtTest/QtTest>

#include "models/FilterPattern.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

using vx::FilterPattern;

class TestFilterPattern : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void plainTextIsRecognised_data();
    void plainTextIsRecognised();
    void resultsAreThoseOfQRegExp_data();
    void resultsAreThoseOfQRegExp();
    void everyAsciiLetterAgainstEveryCharacter();
    void everyCharacterAgainstItsCases();
    void randomPatternsAgreeWithQRegExp();
    void anEmptyPatternIsNotLiteral();
    void commonExpressionsAreRecognised_data();
    void commonExpressionsAreRecognised();
    void aMinimalPatternIsLeftToQRegExp();
    void placesEndAtSixtyFour();
    void everyCharacterAgainstTheClasses();
    void randomExpressionsAgreeWithQRegExp();
};

static QString describe(const QRegExp& regExp, const QString& text)
{
    return QStringLiteral("\"%1\" syntax %2 case %3 against \"%4\"")
        .arg(regExp.pattern())
        .arg(int(regExp.patternSyntax()))
        .arg(int(regExp.caseSensitivity()))
        .arg(text);
}

/// The reason why pattern and QRegExp disagree, empty if they agree.
static QString disagreement(const QRegExp& regExp, const FilterPattern& pattern, const QString& text)
{
    if (regExp.exactMatch(text) != pattern.matchesWhole(text)) {
        return QStringLiteral("whole match of ") + describe(regExp, text);
    }
    if ((regExp.indexIn(text, 0, QRegExp::CaretAtZero) >= 0) != pattern.isFoundIn(text)) {
        return QStringLiteral("search of ") + describe(regExp, text);
    }
    return QString();
}

void TestFilterPattern::plainTextIsRecognised_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<int>("syntax");
    QTest::addColumn<bool>("literal");

    QTest::newRow("word") << "north gate" << int(QRegExp::RegExp) << true;
    QTest::newRow("word, RegExp2") << "north gate" << int(QRegExp::RegExp2) << true;
    QTest::newRow("word, wildcard") << "north gate" << int(QRegExp::Wildcard) << true;
    QTest::newRow("umlaut") << QString::fromUtf8("M\xC3\xBCnchen") << int(QRegExp::RegExp) << true;
    QTest::newRow("schema") << "word" << int(QRegExp::W3CXmlSchema11) << false;
    QTest::newRow("half a pair") << QString(QChar(0xDC28)) << int(QRegExp::FixedString) << false;
    for (const char c : {'*', '?', '[', ']', '\\'}) {
        const QByteArray name(1, c);
        const QString text = QStringLiteral("a") + QLatin1Char(c);
        QTest::newRow(name + " regexp") << text << int(QRegExp::RegExp) << false;
        QTest::newRow(name + " wildcard") << text << int(QRegExp::Wildcard) << false;
        QTest::newRow(name + " unix wildcard") << text << int(QRegExp::WildcardUnix) << false;
        QTest::newRow(name + " fixed") << text << int(QRegExp::FixedString) << true;
    }
    for (const char c : {'.', '+', '(', ')', '{', '}', '|', '^', '$'}) {
        const QByteArray name(1, c);
        const QString text = QStringLiteral("a") + QLatin1Char(c);
        QTest::newRow(name + " regexp") << text << int(QRegExp::RegExp) << false;
        QTest::newRow(name + " RegExp2") << text << int(QRegExp::RegExp2) << false;
        QTest::newRow(name + " wildcard") << text << int(QRegExp::Wildcard) << true;
        QTest::newRow(name + " fixed") << text << int(QRegExp::FixedString) << true;
    }
}

void TestFilterPattern::plainTextIsRecognised()
{
    QFETCH(QString, text);
    QFETCH(int, syntax);
    QFETCH(bool, literal);
    const QRegExp regExp(text, Qt::CaseInsensitive, QRegExp::PatternSyntax(syntax));
    QCOMPARE(FilterPattern::isLiteral(regExp), literal);
    QCOMPARE(FilterPattern(regExp).isLiteral(), literal);
}

void TestFilterPattern::resultsAreThoseOfQRegExp_data()
{
    QTest::addColumn<QString>("pattern");
    QTest::addColumn<int>("syntax");
    QTest::newRow("word") << "cam" << int(QRegExp::RegExp);
    QTest::newRow("fixed with specials") << "a.b*c" << int(QRegExp::FixedString);
    QTest::newRow("expression") << "a.b*c" << int(QRegExp::RegExp);
    QTest::newRow("address as wildcard") << "10.0.1" << int(QRegExp::Wildcard);
    QTest::newRow("caret") << "^cam" << int(QRegExp::RegExp);
    QTest::newRow("alternatives") << "cam|gate" << int(QRegExp::RegExp2);
    QTest::newRow("invalid") << "(cam" << int(QRegExp::RegExp);
    QTest::newRow("sharp s") << QString::fromUtf8("stra\xC3\x9F" "e") << int(QRegExp::FixedString);
    QTest::newRow("dotted I") << QString(QChar(0x130)) << int(QRegExp::FixedString);
}

void TestFilterPattern::resultsAreThoseOfQRegExp()
{
    QFETCH(QString, pattern);
    QFETCH(int, syntax);
    const QStringList texts {QString(), QStringLiteral(""), QStringLiteral("cam"), QStringLiteral("CAM"),
        QStringLiteral("my cam 3"), QStringLiteral("camcam"), QStringLiteral("gate"), QStringLiteral("a.b*c"),
        QStringLiteral("A.B*C"), QStringLiteral("axbbc"), QStringLiteral("10.0.1"), QStringLiteral("10x0x1"),
        QStringLiteral("host 10.0.17"), QString::fromUtf8("Stra\xC3\x9F" "e"), QStringLiteral("STRASSE"),
        QString::fromUtf8("STRA\xE1\xBA\x9E" "E"), QStringLiteral("i"), QString(QChar(0x130)),
        QStringLiteral("i") + QChar(0x307), QString(QChar(0x17F)), QString(QChar(0x212A))};
    for (const Qt::CaseSensitivity sensitivity : {Qt::CaseInsensitive, Qt::CaseSensitive}) {
        const QRegExp regExp(pattern, sensitivity, QRegExp::PatternSyntax(syntax));
        const FilterPattern prepared(regExp);
        for (const QString& text : texts) {
            const QString fault = disagreement(regExp, prepared, text);
            QVERIFY2(fault.isEmpty(), qPrintable(fault));
        }
    }
}

void TestFilterPattern::everyAsciiLetterAgainstEveryCharacter()
{
    for (const char letter : {'a', 'i', 'I', 'k', 'K', 's', 'S', 'z', '1', '_'}) {
        const QRegExp regExp(QString(QLatin1Char(letter)), Qt::CaseInsensitive, QRegExp::FixedString);
        const FilterPattern prepared(regExp);
        QVERIFY(prepared.isLiteral());
        for (uint unit = 0; unit < 0x10000; ++unit) {
            const QString fault = disagreement(regExp, prepared, QString(QChar(unit)));
            QVERIFY2(fault.isEmpty(), qPrintable(fault));
        }
    }
}

void TestFilterPattern::everyCharacterAgainstItsCases()
{
    for (uint unit = 1; unit < 0x10000; ++unit) {
        const QRegExp regExp(QString(QChar(unit)), Qt::CaseInsensitive, QRegExp::FixedString);
        const FilterPattern prepared(regExp);
        for (const uint other : {unit, QChar::toLower(unit), QChar::toUpper(unit), QChar::toTitleCase(unit),
                 QChar::toCaseFolded(unit), 0x3C2u, 0x3C3u, 0x3A3u, 0x17Fu, 0x130u}) {
            const QString fault = disagreement(regExp, prepared, QString(QChar(other)));
            QVERIFY2(fault.isEmpty(), qPrintable(fault));
        }
    }
}

void TestFilterPattern::randomPatternsAgreeWithQRegExp()
{
    const uint seed = 20;
    std::mt19937 random(seed);
    const QString alphabet = QString::fromUtf8("aAbBkKsS\xC4\xB1\xC4\xB0\xC5\xBF\xE2\x84\xAA\xC3\x9F.*+?()[]{}|^$\\ -_1"
                                               "\xF0\x90\x90\x80\xF0\x90\x90\xA8")
        + QChar(0) + QLatin1Char('\n') + QChar(0xD801) + QChar(0xDC28);
    const auto below = [&random](int limit) { return int(random() % uint(limit)); };
    const auto word = [&](int limit) {
        QString result;
        for (int i = below(limit); i > 0; --i) {
            result += alphabet.at(below(below(3) == 0 ? alphabet.size() : 8));
        }
        return result;
    };
    int literals = 0;
    for (int i = 0; i < 100000; ++i) {
        const QString pattern = word(5);
        QString text = word(8);
        switch (below(5)) {
        case 0:
            text = word(4) + pattern + word(4);
            break;
        case 1:
            text = pattern.toUpper();
            break;
        case 2:
            text = pattern;
            break;
        default:
            break;
        }
        const QRegExp regExp(
            pattern, below(2) == 0 ? Qt::CaseSensitive : Qt::CaseInsensitive, QRegExp::PatternSyntax(below(6)));
        const FilterPattern prepared(regExp);
        literals += prepared.isLiteral() ? 1 : 0;
        const QString fault = disagreement(regExp, prepared, text);
        QVERIFY2(fault.isEmpty(), qPrintable(fault + QStringLiteral(", seed %1, round %2").arg(seed).arg(i)));
    }
    QVERIFY(literals > 10000);
}

void TestFilterPattern::anEmptyPatternIsNotLiteral()
{
    const QRegExp empty;
    QVERIFY(!FilterPattern::isLiteral(empty));
    QCOMPARE(FilterPattern(empty).isFoundIn(QStringLiteral("x")), empty.indexIn(QStringLiteral("x")) >= 0);
    QCOMPARE(FilterPattern().matchesWhole(QString()), empty.exactMatch(QString()));
}

void TestFilterPattern::commonExpressionsAreRecognised_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<int>("syntax");
    QTest::addColumn<bool>("recognised");
    const int expression = QRegExp::RegExp;
    const int wildcard = QRegExp::Wildcard;
    for (const char* text : {"on(line|hold)", "Camera .*", "a+b?c*", "10\\.0\\.\\d+\\.\\d+", "^on(line)?$", "[a-f0-9]+",
             "[^x]*", "(ab|c(d|e)+)*f", "\\w+\\s\\S+", "a|b|c", "^a\\(b\\)$"}) {
        QTest::newRow(text) << QString::fromLatin1(text) << expression << true;
    }
    for (const char* text : {"a**", "a{2}", "(?=a)b", "(a)\\1", "a|", "()", "(a", "a)", "^a|b$", "[a", "[]", "[.]",
             "\\b", "\\x41", "a^b", "\\", "*", "a\\\\$", "^*", "[b-a]"}) {
        QTest::newRow(text) << QString::fromLatin1(text) << expression << false;
    }
    QTest::newRow("newer") << QStringLiteral("on.*") << int(QRegExp::RegExp2) << true;
    QTest::newRow("wild") << QStringLiteral("cam*(1?)+") << wildcard << true;
    QTest::newRow("wild set") << QStringLiteral("cam[12]*") << wildcard << false;
    QTest::newRow("unix") << QStringLiteral("cam*") << int(QRegExp::WildcardUnix) << false;
    QTest::newRow("schema") << QStringLiteral("cam.*") << int(QRegExp::W3CXmlSchema11) << false;
    QTest::newRow("fixed") << QStringLiteral("cam.*") << int(QRegExp::FixedString) << false;
}

void TestFilterPattern::commonExpressionsAreRecognised()
{
    QFETCH(QString, text);
    QFETCH(int, syntax);
    QFETCH(bool, recognised);
    const QRegExp regExp(text, Qt::CaseSensitive, QRegExp::PatternSyntax(syntax));
    const FilterPattern prepared(regExp);
    QCOMPARE(prepared.usesAutomaton(), recognised);
    for (const char* sample : {"", "a", "aa", "abc", "online", "onhold", "offline", "Camera 7", "10.0.12.7",
             "10x0x1x7", "ff09", "abcdcef", "a b", "b", "ab", "a(b)", "cam(1x)+", "cam", "cam1", "c", "a|", "a\\", "\\", "$", "^a"}) {
        const QString fault = disagreement(regExp, prepared, QString::fromLatin1(sample));
        QVERIFY2(fault.isEmpty(), qPrintable(fault));
    }
}

void TestFilterPattern::aMinimalPatternIsLeftToQRegExp()
{
    QRegExp regExp(QStringLiteral("a.*"));
    regExp.setMinimal(true);
    const FilterPattern prepared(regExp);
    QVERIFY(!prepared.usesAutomaton());
    QCOMPARE(prepared.matchesWhole(QStringLiteral("abc")), regExp.exactMatch(QStringLiteral("abc")));
}

void TestFilterPattern::placesEndAtSixtyFour()
{
    for (const int places : {63, 64, 65}) {
        const QString word(places - 1, QLatin1Char('a'));
        const QRegExp regExp(word + QLatin1Char('.'));
        const FilterPattern prepared(regExp);
        QCOMPARE(prepared.usesAutomaton(), places <= 64);
        for (int length = places - 2; length <= places + 1; ++length) {
            const QString fault = disagreement(regExp, prepared, QString(length, QLatin1Char('a')));
            QVERIFY2(fault.isEmpty(), qPrintable(fault));
        }
    }
}

void TestFilterPattern::everyCharacterAgainstTheClasses()
{
    for (const char* text : {".", "\\d", "\\D", "\\s", "\\S", "\\w", "\\W", "[0-9a-f]", "[^0-9a-f]", "(k)", "(K)",
             "(s|I)", "[^0-9]"}) {
        for (const Qt::CaseSensitivity sensitivity : {Qt::CaseSensitive, Qt::CaseInsensitive}) {
            const QRegExp regExp(QString::fromLatin1(text), sensitivity);
            const FilterPattern prepared(regExp);
            for (uint unit = 0; unit < 0x10000; ++unit) {
                const QString one {QChar(unit)};
                if (regExp.exactMatch(one) != prepared.matchesWhole(one)) {
                    QFAIL(qPrintable(describe(regExp, one) + QStringLiteral(", unit %1").arg(unit)));
                }
            }
        }
    }
}

void TestFilterPattern::randomExpressionsAgreeWithQRegExp()
{
    const uint seed = 31;
    std::mt19937 random(seed);
    const auto below = [&random](int limit) { return int(random() % uint(limit)); };
    const QStringList atoms {QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c"), QStringLiteral("K"),
        QStringLiteral("."), QStringLiteral("\\d"), QStringLiteral("\\W"), QStringLiteral("[ab]"),
        QStringLiteral("[^a-b]"), QStringLiteral("\\."), QStringLiteral("1"), QString::fromUtf8("\xC3\x9F")};
    const QStringList signs {QStringLiteral("*"), QStringLiteral("+"), QStringLiteral("?"), QString(), QString(),
        QString()};
    std::function<QString(int)> expression = [&](int depth) {
        QString result;
        for (int i = 1 + below(3); i > 0; --i) {
            result += depth > 0 && below(3) == 0 ? QLatin1Char('(') + expression(depth - 1) + QLatin1Char(')')
                                                 : atoms.at(below(atoms.size()));
            result += signs.at(below(signs.size()));
        }
        return below(4) == 0 ? result + QLatin1Char('|') + expression(depth > 0 ? depth - 1 : 0) : result;
    };
    const QString alphabet = QString::fromUtf8("aaabbbccckK1.-\xC3\x9F\xE2\x84\xAA\xF0\x90\x90\x80");
    int recognised = 0;
    int matches = 0;
    for (int round = 0; round < 5000; ++round) {
        const QRegExp regExp(expression(2), below(3) == 0 ? Qt::CaseInsensitive : Qt::CaseSensitive,
            below(2) == 0 ? QRegExp::RegExp : QRegExp::RegExp2);
        const FilterPattern prepared(regExp);
        recognised += prepared.usesAutomaton() ? 1 : 0;
        for (int i = 0; i < 12; ++i) {
            QString text;
            for (int length = below(7); length > 0; --length) {
                text += alphabet.at(below(alphabet.size()));
            }
            matches += prepared.usesAutomaton() && prepared.matchesWhole(text) ? 1 : 0;
            const QString fault = disagreement(regExp, prepared, text);
            QVERIFY2(fault.isEmpty(), qPrintable(fault + QStringLiteral(", seed %1, round %2").arg(seed).arg(round)));
        }
    }
    QVERIFY2(recognised > 3000, QByteArray::number(recognised));
    QVERIFY2(matches > 3000, QByteArray::number(matches));
}

ZELKOV_TEST_MAIN(TestFilterPattern)
#include "tst_filterpattern.moc"
