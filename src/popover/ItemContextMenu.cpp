// SPDX-License-Identifier: MIT
// The context menu of a row: a popover with one entry.
#include "popover/Container.h"
#include "popover/Item.h"
#include "popover/Manager.h"
#include "popover/items/LabelItem.h"
#include "CoreQt/Connect.h"

namespace vx
{
namespace PopoverWidget
{

void Item::setResetPopover(const QString& text)
{
    m_resetText = text;
    vx::disconnect(
        this, "2customContextMenuRequested(const QPoint&)", this, "2contextMenuRequested(const QPoint&)");
    vx::disconnect(this, "2contextMenuRequested(const QPoint&)", this, "1openContextMenu(const QPoint&)");
    if (text.isEmpty()) {
        return;
    }
    setContextMenuPolicy(Qt::CustomContextMenu);
    vx::connect(this, "2customContextMenuRequested(const QPoint&)", this, "2contextMenuRequested(const QPoint&)",
        Qt::AutoConnection);
    vx::connect(this, "2contextMenuRequested(const QPoint&)", this, "1openContextMenu(const QPoint&)",
        Qt::AutoConnection);
}

void Item::openContextMenu(const QPoint& /*pos*/)
{
    if (!Manager::instance()) {
        return;
    }
    auto* const container = new Container(nullptr, QString(), Qt::Vertical, Qt::AlignLeft);
    container->addItem(
        new LabelItem(m_resetText, QString(), QString(), -1, eifText, nullptr), QFlags<EContainerFlag>(ecfDismiss));
    const QPointer<Controller> controller = Manager::instance()->createController(0, true, true, this, this,
        QString(), QStringLiteral("contextMenuPopover"), QFlags<Balloon::EArrowDirection>(QFlag(12)), QSizeF(),
        QFlags<Balloon::ESizeConstraint>(QFlag(3)));
    if (!controller) {
        delete container;
        return;
    }
    controller->setContainer(container, QFlags<Balloon::EBalloonFeature>(QFlag(8)));
    vx::connect(container,
        "2itemPerformed(int, const QVariant&,const QVariant&,vx::PopoverWidget::EItemPerformedFlags)", this,
        "2resetContextMenuPerformed()", Qt::AutoConnection);
    controller->setActive(true, Controller::epsBalloon | Controller::epsNoFade, true);
}

} // namespace PopoverWidget
} // namespace vx
