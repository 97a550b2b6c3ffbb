// SPDX-License-Identifier: MIT
// One popover at a time.
#include "PopoverPlace.h"

#include "popover/Container.h"
#include "popover/Manager.h"

#include <QtWidgets/QApplication>

namespace client
{
using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::Manager;

PopoverPlace::PopoverPlace(QWidget* owner)
    : QObject(owner)
    , m_owner(owner)
{
    // Stays for the other popovers of the program.
    Manager::init(1000);
}

PopoverPlace::~PopoverPlace()
{
    if (m_controller) {
        disconnect(m_controller, nullptr, this, nullptr);
        delete m_controller;
    }
}

Controller* PopoverPlace::begin(QWidget* target, const QString& title, const QString& objectName)
{
    const bool again = m_controller && m_controller->isActive() && m_target == target;
    close();
    if (again) {
        return nullptr;
    }
    m_target = target;
    m_focus = QApplication::focusWidget();
    m_controller = Manager::instance()->createController(Manager::instance()->getUniquePopoverID(), false, false,
        m_owner, target, title, objectName, Balloon::EArrowDirections(Balloon::eadTop), QSizeF(),
        Balloon::ESizeConstraints());
    // Qt would give the keyboard to whatever comes next to the popover.
    connect(m_controller.data(), &Controller::balloonClosed, this, [this] {
        if (m_focus && m_owner->isAncestorOf(m_focus) && m_focus->isVisible()) {
            m_focus->setFocus();
        }
    });
    return m_controller;
}

void PopoverPlace::show(Container* content)
{
    m_controller->setContainer(content, Balloon::ebfTitle | Balloon::ebfClose);
    m_controller->setActive(true, Controller::epsBalloon | Controller::epsNoFade, false);
}

void PopoverPlace::close()
{
    if (m_controller) {
        m_controller->dismiss(false, true);
    }
    m_controller = nullptr;
}

Container* PopoverPlace::column(const QString& objectName)
{
    auto* container = new Container(nullptr, objectName, Qt::Vertical, Qt::AlignTop);
    container->setLeftMargin(0);
    container->setTopMargin(4);
    container->setRightMargin(0);
    container->setBottomMargin(0);
    return container;
}
}
