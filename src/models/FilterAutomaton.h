// SPDX-License-Identifier: MIT
// A small automaton that tells whether a whole text matches a common kind of QRegExp.
#pragma once

#include <array>
#include <memory>

#include <QtCore/QRegExp>
#include <QtCore/QString>
#include <QtCore/QVector>

namespace vx
{
/// Whole matches of expressions with characters, '.', groups, alternatives, '*', '+', '?', the classes \\d, \\s, \\w
/// with their opposites, escaped punctuation and simple character sets, and of wildcards without sets.
///
/// Whether a whole text matches does not depend on which of several ways an engine tries first, so that the places
/// of the pattern at which a match can stand are followed all at once, as bits of a number. Patterns beyond that
/// (more than 64 places, counted repetition, anchors within, look-ahead, back references, ...) have no automaton.
class FilterAutomaton
{
public:
    /// The automaton for @p regExp, nullptr if it has none.
    static std::shared_ptr<const FilterAutomaton> create(const QRegExp& regExp);

    /// As QRegExp::exactMatch().
    bool matchesWhole(const QString& text) const;

private:
    class Parser;

    /// What one place of the pattern takes.
    struct Place
    {
        enum Kind : int { Character, Any, Digit, Space, Word, Set };

        bool takes(ushort unit) const;

        Kind kind = Character;
        bool negated = false;
        ushort unit = 0;
        QVector<QPair<ushort, ushort>> ranges;
    };

    FilterAutomaton() = default;

    quint64 takers(ushort unit) const;

    QVector<Place> m_places;
    std::array<quint64, 128> m_takers {}; ///< by ASCII character: the places that take it
    std::array<quint64, 64> m_follow {};  ///< by place: the places that can come next
    quint64 m_first = 0;
    quint64 m_last = 0;
    bool m_nullable = false;
    bool m_ignoresCase = false;
};
}
