// SPDX-License-Identifier: MIT
// Base of all pages of the gallery.
#pragma once

#include <QtCore/QStringList>
#include <QtWidgets/QWidget>

class QLabel;

namespace gallery
{
class Hand;
class SignalLog;

/// A page shows one family of widgets. It is built anew whenever the language or the theme changes, so it
/// sets its texts once, in its constructor, and lives only from one switch to the next. A page that keeps itself is
/// the exception.
///
/// A new page needs a class like this one, a line in PageList.cpp and a line in CMakeLists.txt.
class Page : public QWidget
{
    Q_OBJECT

public:
    explicit Page(SignalLog& log, QWidget* parent = nullptr);

    /// Uses the widgets for a second or two, with real events, so that a picture of the page shows an
    /// interesting state. The hand plays the steps after this has returned.
    virtual void rehearse(Hand& hand);

    /// Whether the page is made once, keeps its state and follows language and theme by itself. It then has all the
    /// room below the description, without a scroll area around it.
    virtual bool keepsItself() const { return false; }
    /// How many rows of the signal log are to be seen at least.
    virtual int logRows() const { return 5; }

Q_SIGNALS:
    // For pages that offer the choice themselves, by the names that --theme and --lang take.
    void themeWanted(const QString& name);
    void languageWanted(const QString& language);

protected:
    /// From now on every signal of the object is written to the log under the name. Signals that come in
    /// floods are named in chatty; the log folds their repetitions into one row.
    void watch(QObject* object, const QString& name, const QStringList& chatty = {});

    /// Writes into the log file where on the screen the widget is, now and whenever that changes, as
    /// "# name x y w h" in pixels of the screen. A program that moves the real pointer reads it.
    void announcePlace(QWidget* widget, const QString& name);

    /// A label in the words of the theme: its role, see theme/Theme.h.
    static QLabel* label(const QString& text, const char* role = nullptr);
    /// An empty panel in the look of the theme.
    static QWidget* panel();

private:
    SignalLog& m_log;
};
}
