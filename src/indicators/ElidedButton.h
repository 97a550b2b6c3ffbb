// SPDX-License-Identifier: MIT
// A push button that shortens its text to the room it has.
#pragma once

#include "foundation/Export.h"

#include <QFont>
#include <QPushButton>
#include <QRect>
#include <QString>

class QPaintEvent;
class QStyleOptionButton;

/// A QPushButton that can shorten its text to its width when it is painted; text() stays whole. As it comes it
/// shows the whole text: call setElideMode(). Its size hint is that of the whole text.
///
/// The room for the text ends before the place of a menu indicator, whether there is a menu or not; an icon is not
/// taken into account.
class ZELKOV_WIDGETS_EXPORT ElidedButton : public QPushButton
{
    Q_OBJECT

public:
    explicit ElidedButton(QWidget* parent = nullptr);
    /// Starts with that text, not elided.
    explicit ElidedButton(const QString& text, QWidget* parent = nullptr);
    ~ElidedButton() override;

    /// Where the text is cut; Qt::ElideNone by default. Repaints at once if it changes. Until the next change of
    /// size, text or font the ampersand of a mnemonic counts as a letter then.
    Qt::TextElideMode getElideMode() const;
    void setElideMode(Qt::TextElideMode mode);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QRect textRect(const QStyleOptionButton& option) const;

    Qt::TextElideMode m_elideMode = Qt::ElideNone;
    QString m_elidedText;
    QString m_originalText; ///< what the elided text was made from, with the next two
    QRect m_lastRect;
    QFont m_lastFont;
};
