// SPDX-License-Identifier: MIT
// The prepared pattern gives the results of QRegExp, for every pattern.
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

ZELKOV_TEST_MAIN(TestFilterPattern)
#include "tst_filterpattern.moc"
