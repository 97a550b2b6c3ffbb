// SPDX-License-Identifier: MIT
// A label that shortens its text to the room it has.
#pragma once

#include "foundation/Export.h"

#include <QFont>
#include <QLabel>

class QPaintEvent;

namespace vx
{
/// A QLabel for plain text that is shortened to the label's width when it is painted; text() stays whole. With
/// word wrap the text wraps, and only words wider than the label are shortened, each for itself.
///
/// Its size hints are those of the whole text: in a layout that is to shrink it, give it the size policy
/// QSizePolicy::Ignored or a minimum width. Rich text, pictures and mnemonics are not shown as such, and the
/// margin of QLabel does not count; the indent does where one is set.
class ZELKOV_WIDGETS_EXPORT ElidedLabel : public QLabel
{
    Q_OBJECT

public:
    // As the constructors of QLabel.
    explicit ElidedLabel(QWidget* parent = nullptr, Qt::WindowFlags flags = Qt::WindowFlags());
    explicit ElidedLabel(
        const QString& text, QWidget* parent = nullptr, Qt::WindowFlags flags = Qt::WindowFlags());
    ~ElidedLabel() override;

    /// Where the text is cut; Qt::ElideRight by default. Does not repaint.
    void setElideMode(Qt::TextElideMode mode);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void shorten(int width);

    Qt::TextElideMode m_elideMode = Qt::ElideRight;

    // What is shown, and what it was made from.
    QString m_shownText;
    bool m_shownWrapped = false;
    QString m_fromText;
    QFont m_fromFont;
    Qt::TextElideMode m_fromMode = Qt::ElideRight;
    int m_fromWidth = -1;
    bool m_fromWordWrap = false;
};
}
