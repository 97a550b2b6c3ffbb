// SPDX-License-Identifier: MIT
// A row that opens a popover of its own.
#include "popover/items/Submenu.h"

#include "CoreQt/Connect.h"
#include "indicators/ElidedButton.h"
#include "popover/Manager.h"
#include "popover/items/ControlRules.h"

#include <QtGui/QMouseEvent>
#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{

Submenu::Submenu(int controllerId, const QString& title, const QString& text, const QString& additionalText,
    const QString& objectName, QWidget* inWidget, Container* container, Controller* parentController, int id,
    QFlags<EItemFlag> flags, Controller* existing)
    : PushItem(text, additionalText, objectName, id, flags, nullptr)
    , m_container(container)
    , m_controller(existing)
    , m_inWidget(inWidget)
    , m_controllerGiven(existing != nullptr)
{
    for (const ElidedButton* const element : {m_textElement, m_iconElement}) {
        if (m_additionalTextElement && element) {
            vx::connect(
                m_additionalTextElement, "2toggled(bool)", element, "1setChecked(bool)", Qt::AutoConnection);
        }
    }
    if (flags.testFlag(eifControl)) {
        m_disclosureIcon = new ElidedButton(this);
        m_disclosureIcon->setObjectName(QStringLiteral("disclosureIcon"));
        m_disclosureIcon->setFlat(true);
        m_disclosureIcon->setFocusPolicy(Qt::NoFocus);
        m_disclosureIcon->setAttribute(Qt::WA_TransparentForMouseEvents);
        m_rightLayout->addWidget(m_disclosureIcon);
        m_lastElement = m_disclosureIcon;
    }
    if (!m_controller && Manager::instance()) {
        m_controller = Manager::instance()->createController(controllerId, false, true, inWidget, this, title,
            objectName, QFlags<Balloon::EArrowDirection>(QFlag(12)), QSizeF(),
            QFlags<Balloon::ESizeConstraint>(QFlag(3)));
        if (m_controller && window() != this) {
            m_controller->setParent(window());
        }
        vx::connect(m_controller, "2controllerDestroyed(vx::PopoverWidget::Controller*)", this,
            "1controllerDeleted()", Qt::AutoConnection);
    }
    if (m_controller && parentController) {
        vx::connect(parentController, "2layoutUpdated()", m_controller, "1updateLayout()", Qt::AutoConnection);
    }
    if (m_container && parentController) {
        vx::connect(m_container, "2dismissAllPopover()", parentController, "1dismiss()", Qt::AutoConnection);
    }
    if (m_controller) {
        m_controller->setContainer(m_container, QFlags<Balloon::EBalloonFeature>(QFlag(5)));
        m_controller->setPersistence(true);
        vx::connect(m_controller, "2balloonClosed()", this, "1uncheck()", Qt::AutoConnection);
    }
    if (m_container) {
        vx::connect(m_container,
            "2itemPerformed(int, const QVariant&, const QVariant&, vx::PopoverWidget::EItemPerformedFlags)", this,
            "2itemPerformed(int, const QVariant&, const QVariant&, vx::PopoverWidget::EItemPerformedFlags)",
            Qt::AutoConnection);
    }
}

Submenu::~Submenu()
{
    if (m_controller && !m_controllerGiven) {
        m_controller->deleteLater();
    }
}

EContainerFlag Submenu::defaultItemFlags()
{
    return static_cast<EContainerFlag>(0);
}

QFlags<EItemPerformedFlag> Submenu::getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button)
{
    if (m_disclosureIcon && m_disclosureIcon->geometry().contains(pos)) {
        return ItemRules::hit({}, QPoint(-1, -1), button) | eipDisclosure;
    }
    return PushItem::getItemPerformedFlag(pos, button);
}

Container* Submenu::container() const
{
    return m_container;
}

Controller* Submenu::controller() const
{
    return m_controller;
}

void Submenu::open()
{
    if (!m_controller) {
        return;
    }
    const QPointer<Submenu> self(this);
    m_controller->setForWidget(*this, QPointF(-1, 0));
    if (self && m_controller) {
        m_controller->setActive(true, Controller::epsBalloon | Controller::epsNoFade, true);
    }
    if (self) {
        setChecked(true);
    }
    if (self && m_button) {
        m_button->setChecked(true);
    }
    if (self) {
        Q_EMIT layoutChanged();
    }
}

void Submenu::uncheck()
{
    const QPointer<Submenu> self(this);
    setChecked(false);
    if (self && m_button) {
        m_button->setChecked(false);
    }
    if (self) {
        Q_EMIT layoutChanged();
    }
}

void Submenu::controllerDeleted()
{
    m_controller = nullptr;
}

void Submenu::mouseReleaseEvent(QMouseEvent* event)
{
    if (isProtected()) {
        return;
    }
    if (!rect().contains(event->pos())) {
        Item::mouseReleaseEvent(event);
        return;
    }
    const QPointer<Submenu> self(this);
    const QFlags<EItemPerformedFlag> flags = getItemPerformedFlag(event->pos(), event->button());
    const bool allowed = ItemRules::performs(m_flags, event->button());
    if (m_flags.testFlag(eifDisclosureOnly)) {
        if (allowed && flags.testFlag(eipDisclosure)) {
            open();
        }
        // With any button, and open or not.
        if (self) {
            Q_EMIT itemPerformed(m_id, userData(), userData(), flags);
        }
    } else if (allowed) {
        Q_EMIT itemPerformed(m_id, userData(), userData(), flags);
        if (self) {
            open();
        }
    }
    if (self) {
        Item::mouseReleaseEvent(event);
    }
    event->accept();
}

} // namespace PopoverWidget
} // namespace vx
