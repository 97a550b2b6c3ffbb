// SPDX-License-Identifier: MIT
// What tells short from long clicks on a button and asks whether the user may click at all.
#include "input/CustomClickAdapter.h"

#include "input/ClickVerdict.h"
#include "ZelkovUtils/ISecurityManager.h"

#include <QPointer>
#include <QWidget>

namespace vx
{
namespace
{
std::shared_ptr<ISecurityManager>& sharedSecurityManager()
{
    static std::shared_ptr<ISecurityManager> manager;
    return manager;
}
}

const int CustomClickAdapter::s_DefaultLongClickTimeout = 750;
const int CustomClickAdapter::s_DefaultLongClickSpan = 750;

CustomClickAdapter::CustomClickAdapter(QWidget* owner, int longClickSpan)
    : m_owner(owner)
    , m_longClickSpan(longClickSpan)
{
    m_longClickTimer.setSingleShot(true);
    m_longClickTimer.setInterval(qMax(0, m_longClickSpan));
}

CustomClickAdapter::~CustomClickAdapter() = default;

CustomClickAdapter::EClickType CustomClickAdapter::getClickType() const
{
    return m_clickType;
}

bool CustomClickAdapter::autoClick() const
{
    return m_autoClick;
}

void CustomClickAdapter::setAutoClick(bool on)
{
    m_autoClick = on;
}

int CustomClickAdapter::getLongClickSpan() const
{
    return m_longClickSpan;
}

void CustomClickAdapter::setLongClickSpan(int span)
{
    m_longClickSpan = span;
    m_longClickTimer.setInterval(qMax(0, span));
}

QTimer& CustomClickAdapter::longClickTimer()
{
    return m_longClickTimer;
}

void CustomClickAdapter::setAdminOnly(bool on)
{
    m_adminOnly = on;
}

void CustomClickAdapter::setSecurityCheck(const QString& right)
{
    m_securityCheck = right;
}

std::shared_ptr<ISecurityManager> CustomClickAdapter::securityManager()
{
    return sharedSecurityManager();
}

void CustomClickAdapter::setSecurityManager(const std::shared_ptr<ISecurityManager>& manager)
{
    sharedSecurityManager() = manager;
}

bool CustomClickAdapter::isProtected()
{
    // The answer may come from a dialog: the button or the manager may be gone afterwards.
    const std::shared_ptr<ISecurityManager> manager = sharedSecurityManager();
    const bool hasOwner = m_owner != nullptr;
    const QPointer<QWidget> owner = m_owner;
    bool refused = false;
    if (manager != nullptr) {
        // The two queries answer in opposite senses.
        if (m_adminOnly) {
            refused = !manager->isAdministrator(true, false);
        } else if (!m_securityCheck.isEmpty()) {
            refused = manager->isRightRefused(m_securityCheck, true, false, false);
        }
    }
    if (hasOwner && owner.isNull()) {
        return true;
    }
    m_protected = refused;
    return refused;
}

void CustomClickAdapter::startClickTimer()
{
    m_clickType = ectNormal;
    m_evaluated = false;
    if (m_autoClick) {
        m_longClickTimer.start();
    }
    m_pressTime.start();
}

void CustomClickAdapter::stopClickTimer()
{
    evaluateClickTimespan();
    m_longClickTimer.stop();
}

void CustomClickAdapter::evaluateClickTimespan()
{
    if (m_evaluated || m_protected) {
        return;
    }
    m_evaluated = true;
    const qint64 heldFor = m_pressTime.isValid() ? m_pressTime.elapsed() : 0;
    if (isLongHold(m_autoClick, m_longClickTimer.isActive(), heldFor, m_longClickSpan)) {
        m_clickType = ectLong;
    }
}
}
