// SPDX-License-Identifier: MIT
// What tells short from long clicks on a button and asks whether the user may click at all.
#pragma once

#include "foundation/Export.h"

#include <QElapsedTimer>
#include <QString>
#include <QTimer>

#include <memory>

class QWidget;

namespace vx
{
class ISecurityManager;

/// A mix-in beside a button class: it times how long the button is held, keeps the kind of the last click, and
/// asks the application's security manager before a click. It connects nothing and handles no events itself;
/// TCustomClickWidget puts it together with Qt's tool button.
class ZELKOV_WIDGETS_EXPORT CustomClickAdapter
{
public:
    /// Kinds of clicks.
    enum EClickType
    {
        ectNone = 0, ///< nothing was clicked yet
        ectNormal = 1, ///< a press, so far
        ectLong = 2, ///< held for the long click span
        ectContext = 4, ///< a right click or what the desktop has instead
        ectArrow = 6, ///< a press on the arrow of CustomContextClickToolButton
    };

    static const int s_DefaultLongClickTimeout; ///< 750 ms
    static const int s_DefaultLongClickSpan; ///< 750 ms

    /// \a owner is the button, which must not die before this object; \a longClickSpan is in milliseconds.
    CustomClickAdapter(QWidget* owner, int longClickSpan);
    virtual ~CustomClickAdapter();
    CustomClickAdapter(const CustomClickAdapter&) = delete;
    CustomClickAdapter& operator=(const CustomClickAdapter&) = delete;

    /// What the present click is. To be asked in slots of clicked() and toggled(): the release that ends a right
    /// click, for one, is judged by its time again.
    EClickType getClickType() const;

    /// Whether a button that is held for the long click span clicks by itself, the mouse still down; on by
    /// default.
    bool autoClick() const;
    void setAutoClick(bool on);

    /// From how many milliseconds on a press is long. A timer that runs goes on as QTimer::setInterval() has it.
    int getLongClickSpan() const;
    void setLongClickSpan(int span);

    /// The hold timer: single shot, started by a press if autoClick().
    QTimer& longClickTimer();

    /// Whether only an administrator may click; off by default. Goes before the security check.
    void setAdminOnly(bool on);

    /// The right that a user needs in order to click; empty (the default) if none.
    void setSecurityCheck(const QString& right);

    /// Who is asked about rights, for all buttons; null (the default): everybody may click.
    static std::shared_ptr<vx::ISecurityManager> securityManager();
    static void setSecurityManager(const std::shared_ptr<vx::ISecurityManager>& manager);

protected:
    /// Asks the security manager whether the user is refused, and remembers the answer for the rest of the press.
    /// Also true if the owner did not survive the question; then nothing of this object may be touched.
    bool isProtected();

    /// A press: the click is a normal one so far, and time runs.
    void startClickTimer();
    /// Judges the press, if that is still to be done, and stops the hold timer.
    void stopClickTimer();
    /// Judges the press by the time since its beginning, once a press. Does nothing for a user who was refused.
    void evaluateClickTimespan();

    QTimer m_longClickTimer; ///< see longClickTimer()
    QWidget* m_owner; ///< the button
    bool m_autoClick = true; ///< see setAutoClick()
    bool m_evaluated = false; ///< the time of this press has been judged
    QElapsedTimer m_pressTime; ///< runs from the press on
    EClickType m_clickType = ectNone; ///< of the present or last click
    int m_longClickSpan; ///< in milliseconds
    QString m_securityCheck; ///< see setSecurityCheck()
    bool m_protected = false; ///< the last question refused the user
    bool m_adminOnly = false; ///< see setAdminOnly()
};
}
