// SPDX-License-Identifier: MIT
// A QRegExp prepared for testing many texts: patterns without special characters are searched as plain text, whole
// matches of common expressions go through a small automaton.
#pragma once

#include <memory>

#include <QtCore/QRegExp>
#include <QtCore/QString>
#include <QtCore/QStringMatcher>

#include "foundation/Export.h"

namespace vx
{
class FilterAutomaton;

/// A pattern that is tested against many texts.
///
/// Most of what a user types into a search box is plain text, for which the machinery of QRegExp is slow. A pattern
/// that can only match itself is recognised once, in the constructor, and then compared as a string; every other one
/// is left to QRegExp, but for whole matches of common expressions. The results are those of QRegExp for every pattern
/// and every text.
class ZELKOV_WIDGETS_EXPORT FilterPattern
{
public:
    FilterPattern() = default;
    /// Looks once at how \a regExp is best tested.
    explicit FilterPattern(const QRegExp& regExp);

    /// Whether the pattern is compared as plain text.
    bool isLiteral() const { return m_literal; }

    /// Whether whole matches do without QRegExp although the pattern is not plain text.
    bool usesAutomaton() const { return m_automaton != nullptr; }

    /// As QRegExp::exactMatch(): the whole @p text matches.
    bool matchesWhole(const QString& text) const;

    /// Whether QRegExp::indexIn() with QRegExp::CaretAtZero finds the pattern anywhere in @p text.
    bool isFoundIn(const QString& text) const;

    /// Whether @p regExp can match nothing but its own pattern, up to case.
    static bool isLiteral(const QRegExp& regExp);

private:
    QRegExp m_regExp;
    QString m_text; ///< lower-cased, one character at a time, for a pattern that ignores case
    QStringMatcher m_matcher;
    std::shared_ptr<const FilterAutomaton> m_automaton;
    bool m_literal = false;
};
}
