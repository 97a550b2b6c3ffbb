// SPDX-License-Identifier: MIT
// Recognises literal patterns and compares them without QRegExp.
#include "models/FilterPattern.h"

#include "models/FilterAutomaton.h"

namespace vx
{
namespace
{
/// Whether @p character stands for itself outside of a fixed string.
bool isPlain(QChar character, QRegExp::PatternSyntax syntax)
{
    switch (character.unicode()) {
    case '*':
    case '?':
    case '[':
    case ']':
    case '\\':
        return false;
    case '.':
    case '+':
    case '(':
    case ')':
    case '{':
    case '}':
    case '|':
    case '^':
    case '$':
        return syntax == QRegExp::Wildcard || syntax == QRegExp::WildcardUnix;
    default:
        return true;
    }
}
}

FilterPattern::FilterPattern(const QRegExp& regExp)
    : m_regExp(regExp)
    , m_literal(isLiteral(regExp))
{
    if (!m_literal) {
        m_automaton = FilterAutomaton::create(regExp);
        return;
    }
    m_text = regExp.pattern();
    if (regExp.caseSensitivity() == Qt::CaseSensitive) {
        m_matcher = QStringMatcher(m_text);
        return;
    }
    // QRegExp is of two minds about case: it searches for the lower-cased pattern by case folding, but a whole
    // match lower-cases one character at a time. A long s is found by "s", and is no whole match of it.
    m_matcher = QStringMatcher(m_text.toLower(), Qt::CaseInsensitive);
    for (QChar& character : m_text) {
        character = character.toLower();
    }
}

bool FilterPattern::isLiteral(const QRegExp& regExp)
{
    const QString pattern = regExp.pattern();
    const QRegExp::PatternSyntax syntax = regExp.patternSyntax();
    if (pattern.isEmpty() || syntax == QRegExp::W3CXmlSchema11) {
        return false;
    }
    for (const QChar character : pattern) {
        // QRegExp takes a surrogate pair for one character there, a string matcher takes it apart.
        if (character.isSurrogate() && regExp.caseSensitivity() == Qt::CaseInsensitive) {
            return false;
        }
        if (syntax != QRegExp::FixedString && !isPlain(character, syntax)) {
            return false;
        }
    }
    return true;
}

bool FilterPattern::matchesWhole(const QString& text) const
{
    if (m_automaton != nullptr) {
        return m_automaton->matchesWhole(text);
    }
    if (!m_literal) {
        return m_regExp.exactMatch(text);
    }
    if (text.size() != m_text.size()) {
        return false;
    }
    if (m_matcher.caseSensitivity() == Qt::CaseSensitive) {
        return text == m_text;
    }
    const QChar* const wanted = m_text.constData();
    const QChar* const given = text.constData();
    for (int i = 0; i < m_text.size(); ++i) {
        if (given[i] != wanted[i] && given[i].toLower() != wanted[i]) {
            return false;
        }
    }
    return true;
}

bool FilterPattern::isFoundIn(const QString& text) const
{
    return m_literal ? m_matcher.indexIn(text) >= 0 : m_regExp.indexIn(text, 0, QRegExp::CaretAtZero) >= 0;
}
}
