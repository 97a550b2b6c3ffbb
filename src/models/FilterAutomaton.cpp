// SPDX-License-Identifier: MIT
// Reads a pattern into places and what may follow each of them, and runs texts through them.
#include "models/FilterAutomaton.h"

#include <QtCore/QtAlgorithms>

namespace vx
{
namespace
{
constexpr int c_mostPlaces = 64;

bool isAsciiPunctuation(ushort unit)
{
    return unit > 0x20 && unit < 0x7f && !QChar(unit).isLetterOrNumber();
}
}

bool FilterAutomaton::Place::takes(ushort other) const
{
    const QChar character(other);
    bool result = false;
    switch (kind) {
    case Character:
        return other == unit;
    case Any:
        return true;
    case Digit:
        result = character.isDigit();
        break;
    case Space:
        result = character.isSpace();
        break;
    case Word:
        result = character.isLetterOrNumber() || character.isMark() || other == '_';
        break;
    case Set:
        for (const QPair<ushort, ushort>& range : ranges) {
            result = result || (range.first <= other && other <= range.second);
        }
        break;
    }
    return result != negated;
}

/// Reads by recursive descent. Every part of the pattern knows at which places it can begin and end.
class FilterAutomaton::Parser
{
public:
    Parser(FilterAutomaton& automaton, const QString& pattern, bool wildcard)
        : m_automaton(automaton)
        , m_pattern(pattern)
        , m_wildcard(wildcard)
    {
    }

    bool parse()
    {
        if (!m_wildcard) {
            stripAnchors();
        }
        const Part whole = alternatives();
        m_automaton.m_first = whole.first;
        m_automaton.m_last = whole.last;
        m_automaton.m_nullable = whole.nullable;
        return !m_failed && m_at == m_pattern.size();
    }

private:
    struct Part
    {
        quint64 first = 0;
        quint64 last = 0;
        bool nullable = true;
    };

    ushort peek() const { return m_at < m_pattern.size() ? m_pattern.at(m_at).unicode() : ushort(0); }
    bool atEnd() const { return m_failed || m_at >= m_pattern.size(); }

    /// Around the whole pattern they say what a whole match says anyway.
    void stripAnchors()
    {
        if (m_pattern.contains(QLatin1Char('|'))) {
            return;
        }
        if (m_pattern.startsWith(QLatin1Char('^'))) {
            m_pattern.remove(0, 1);
        }
        if (m_pattern.endsWith(QLatin1Char('$')) && !m_pattern.endsWith(QLatin1String("\\$"))) {
            m_pattern.chop(1);
        }
    }

    Part alternatives()
    {
        Part result = sequence();
        while (!atEnd() && !m_wildcard && peek() == '|') {
            ++m_at;
            const Part other = sequence();
            result.first |= other.first;
            result.last |= other.last;
            result.nullable = result.nullable || other.nullable;
        }
        return result;
    }

    /// An empty one is left to QRegExp.
    Part sequence()
    {
        Part result;
        bool empty = true;
        while (!atEnd() && (m_wildcard || (peek() != '|' && peek() != ')'))) {
            const Part next = repeated();
            connect(result.last, next.first);
            result.first |= result.nullable ? next.first : 0;
            result.last = next.last | (next.nullable ? result.last : 0);
            result.nullable = result.nullable && next.nullable;
            empty = false;
        }
        m_failed = m_failed || empty;
        return result;
    }

    Part repeated()
    {
        Part result = atom();
        if (m_wildcard || atEnd()) {
            return result;
        }
        const ushort sign = peek();
        if (sign != '*' && sign != '+' && sign != '?') {
            return result;
        }
        ++m_at;
        if (sign != '?') {
            connect(result.last, result.first);
        }
        result.nullable = result.nullable || sign != '+';
        const ushort next = peek();
        m_failed = m_failed || next == '*' || next == '+' || next == '?';
        return result;
    }

    Part atom()
    {
        Place place;
        place.unit = peek();
        ++m_at;
        if (m_wildcard) {
            if (place.unit == '[' || place.unit == ']' || place.unit == '\\') {
                m_failed = true;
            }
            place.kind = place.unit == '*' || place.unit == '?' ? Place::Any : Place::Character;
            Part result = add(place);
            if (place.unit == '*') {
                connect(result.last, result.first);
                result.nullable = true;
            }
            return result;
        }
        switch (place.unit) {
        case '(':
            return group();
        case '[':
            return set();
        case '\\':
            return escape();
        case '.':
            place.kind = Place::Any;
            break;
        case '*':
        case '+':
        case '?':
        case '{':
        case '}':
        case ']':
        case '^':
        case '$':
            m_failed = true;
            break;
        default:
            break;
        }
        return add(place);
    }

    Part group()
    {
        if (peek() == '?') {
            m_failed = true; // look-ahead and the like
            return Part();
        }
        const Part result = alternatives();
        m_failed = m_failed || atEnd() || peek() != ')';
        ++m_at;
        return result;
    }

    Part escape()
    {
        Place place;
        place.unit = peek();
        m_failed = m_failed || atEnd();
        ++m_at;
        switch (place.unit) {
        case 'd':
        case 'D':
            place.kind = Place::Digit;
            place.negated = place.unit == 'D';
            break;
        case 's':
        case 'S':
            place.kind = Place::Space;
            place.negated = place.unit == 'S';
            break;
        case 'w':
        case 'W':
            place.kind = Place::Word;
            place.negated = place.unit == 'W';
            break;
        default:
            m_failed = m_failed || !isAsciiPunctuation(place.unit);
            break;
        }
        return add(place);
    }

    /// Letters, digits and ranges of them; letters only where case counts.
    Part set()
    {
        Place place;
        place.kind = Place::Set;
        place.negated = peek() == '^';
        m_at += place.negated ? 1 : 0;
        while (!atEnd() && peek() != ']') {
            const ushort from = peek();
            ushort to = from;
            ++m_at;
            if (peek() == '-') {
                ++m_at;
                to = peek();
                ++m_at;
            }
            place.ranges.append(qMakePair(from, to));
            m_failed = m_failed || !isPlain(from) || !isPlain(to) || from > to;
        }
        m_failed = m_failed || atEnd() || place.ranges.isEmpty();
        ++m_at;
        return add(place);
    }

    bool isPlain(ushort unit) const
    {
        const bool letter = (unit >= 'a' && unit <= 'z') || (unit >= 'A' && unit <= 'Z');
        return (unit >= '0' && unit <= '9') || (letter && !m_automaton.m_ignoresCase);
    }

    Part add(Place place)
    {
        Part result;
        if (m_automaton.m_places.size() >= c_mostPlaces) {
            m_failed = true;
            return result;
        }
        if (m_automaton.m_ignoresCase) {
            // Lower-casing beyond ASCII has surprises that only QRegExp knows.
            m_failed = m_failed || place.unit >= 128;
            place.unit = QChar(place.unit).toLower().unicode();
        }
        result.first = quint64(1) << m_automaton.m_places.size();
        result.last = result.first;
        result.nullable = false;
        m_automaton.m_places.append(place);
        return result;
    }

    void connect(quint64 from, quint64 to)
    {
        for (; from != 0; from &= from - 1) {
            m_automaton.m_follow[qCountTrailingZeroBits(from)] |= to;
        }
    }

    FilterAutomaton& m_automaton;
    QString m_pattern;
    const bool m_wildcard;
    int m_at = 0;
    bool m_failed = false;
};

std::shared_ptr<const FilterAutomaton> FilterAutomaton::create(const QRegExp& regExp)
{
    const QRegExp::PatternSyntax syntax = regExp.patternSyntax();
    const bool wildcard = syntax == QRegExp::Wildcard;
    if (regExp.isMinimal() || (!wildcard && syntax != QRegExp::RegExp && syntax != QRegExp::RegExp2)) {
        return nullptr; // a minimal match may end before the text does
    }
    std::shared_ptr<FilterAutomaton> result(new FilterAutomaton);
    result->m_ignoresCase = regExp.caseSensitivity() == Qt::CaseInsensitive;
    if (!Parser(*result, regExp.pattern(), wildcard).parse()) {
        return nullptr;
    }
    for (ushort unit = 0; unit < result->m_takers.size(); ++unit) {
        const ushort wanted = result->m_ignoresCase ? QChar(unit).toLower().unicode() : unit;
        for (int i = 0; i < result->m_places.size(); ++i) {
            result->m_takers[unit] |= quint64(result->m_places.at(i).takes(wanted) ? 1 : 0) << i;
        }
    }
    return result;
}

bool FilterAutomaton::matchesWhole(const QString& text) const
{
    if (text.isEmpty()) {
        return m_nullable;
    }
    const QChar* const units = text.constData();
    quint64 reached = m_first & takers(units[0].unicode());
    for (int i = 1; i < text.size() && reached != 0; ++i) {
        quint64 next = 0;
        for (; reached != 0; reached &= reached - 1) {
            next |= m_follow[qCountTrailingZeroBits(reached)];
        }
        reached = next & takers(units[i].unicode());
    }
    return (reached & m_last) != 0;
}

quint64 FilterAutomaton::takers(ushort unit) const
{
    if (unit < m_takers.size()) {
        return m_takers[unit];
    }
    const ushort wanted = m_ignoresCase ? QChar(unit).toLower().unicode() : unit;
    quint64 result = 0;
    for (int i = 0; i < m_places.size(); ++i) {
        result |= quint64(m_places.at(i).takes(wanted) ? 1 : 0) << i;
    }
    return result;
}
}
