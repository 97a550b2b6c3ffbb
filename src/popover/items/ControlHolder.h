// SPDX-License-Identifier: MIT
// Ownership of a row's control.
#pragma once

#include <QtCore/QPointer>

#include <memory>

namespace vx
{
namespace PopoverWidget
{

/// Holds the control of a row, for the row that made it or was given it. The control dies with the row, wherever it
/// stands by then.
///
/// With one exception: Qt's widgets do not survive their end within one of their own signals, and a client may well
/// delete the popover when a row is performed. While a Report is held the control outlives its row, hidden and
/// without a parent; it is deleted one turn of the event loop after the last Report is gone.
template<class Control>
class ControlHolder
{
    struct Token
    {
        ~Token()
        {
            if (!orphan.isNull()) {
                orphan->deleteLater();
            }
        }
        QPointer<Control> orphan;
    };

public:
    /// What a slot holds while the control emits.
    using Report = std::shared_ptr<Token>;

    /// Owns \a control from now on; null is allowed.
    explicit ControlHolder(Control* control)
        : m_control(control)
        , m_token(std::make_shared<Token>())
    {
    }
    ~ControlHolder()
    {
        if (m_control.isNull()) {
            return;
        }
        if (m_token.use_count() == 1) {
            delete m_control.data();
            return;
        }
        m_control->hide();
        m_control->setParent(nullptr);
        m_token->orphan = m_control;
    }
    ControlHolder(const ControlHolder&) = delete;
    ControlHolder& operator=(const ControlHolder&) = delete;

    // Null when somebody else has deleted it.
    Control* get() const { return m_control.data(); }
    Control* operator->() const { return m_control.data(); }
    explicit operator bool() const { return !m_control.isNull(); }

    /// To be held by every slot of the row that answers a signal of the control.
    Report report() const { return m_token; }

private:
    QPointer<Control> m_control;
    Report m_token;
};

} // namespace PopoverWidget
} // namespace vx
