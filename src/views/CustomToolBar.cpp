// SPDX-License-Identifier: MIT
// A tool bar that takes part in customising tool bars.
#include "views/CustomToolBar.h"

#include "CoreQt/Connect.h"
#include "foundation/LogStatement.h"
#include "views/DropPosition.h"

#include <QtCore/QDataStream>
#include <QtCore/QIODevice>
#include <QtCore/QMimeData>
#include <QtGui/QContextMenuEvent>
#include <QtGui/QDrag>
#include <QtGui/QDropEvent>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QBoxLayout>
#include <QtWidgets/QMenu>

namespace vx
{
namespace
{
const char c_ActionFormat[] = "application/action-id";
const char c_ToolBarFormat[] = "application/toolbar-id";

bool hasToolBarFormat(const QMimeData* data, const char* format)
{
    return data != nullptr && data->hasFormat(QLatin1String(format));
}
}

CustomToolBar::CustomToolBar(const QString& title, QWidget* parent, bool draggable, const QString& toolBarId)
    : QToolBar(title, parent)
    , m_draggable(draggable)
    , m_toolBarId(toolBarId)
{
    setAcceptDrops(true);
}

CustomToolBar::CustomToolBar(QWidget* parent, bool draggable, const QString& toolBarId)
    : QToolBar(parent)
    , m_draggable(draggable)
    , m_toolBarId(toolBarId)
{
    setAcceptDrops(true);
}

CustomToolBar::~CustomToolBar() = default;

void CustomToolBar::mousePressEvent(QMouseEvent* event)
{
    if (m_draggable && event->buttons() == Qt::LeftButton) {
        m_pressPos = event->pos();
    }
}

void CustomToolBar::mouseMoveEvent(QMouseEvent* event)
{
    if (!m_draggable || !event->buttons().testFlag(Qt::LeftButton)) {
        return;
    }
    if ((event->pos() - m_pressPos).manhattanLength() < QApplication::startDragDistance()) {
        return;
    }
    QByteArray id;
    QDataStream stream(&id, QIODevice::WriteOnly);
    stream << m_toolBarId;
    auto* const mimeData = new QMimeData;
    mimeData->setData(QLatin1String(c_ToolBarFormat), id);

    auto* const drag = new QDrag(this);
    drag->setMimeData(mimeData);
    drag->setPixmap(grab());
    drag->setHotSpot(event->pos());
    drag->exec(Qt::MoveAction);
    // Anything may have happened meanwhile, the end of this bar included.
}

void CustomToolBar::contextMenuEvent(QContextMenuEvent* event)
{
    const QPointer<QAction> action(actionAt(event->pos()));
    if (!action) {
        QToolBar::contextMenuEvent(event);
        return;
    }
    // Not on the stack: a bar that dies while the menu is open takes the menu along.
    const QPointer<QMenu> menu(new QMenu(this));
    // The display style is a fixed picture: clients rely on it.
    QAction* const iconsOnly = menu->addAction(tr("Icons Only"));
    iconsOnly->setCheckable(true);
    iconsOnly->setChecked(true);
    menu->addAction(tr("Icons & Text"));
    menu->addAction(tr("Text Only"));
    menu->addSeparator();
    menu->addAction(tr("Small Icons"));
    menu->addSeparator();
    const QAction* const remove = menu->addAction(tr("Remove Item"));
    menu->addSeparator();
    const QAction* const customize = menu->addAction(tr("Customize Toolbar..."));
    vx::connect(customize, "2triggered()", parentWidget(), "1customizeToolBar()", Qt::AutoConnection);

    const QPointer<CustomToolBar> alive(this);
    const bool removes = menu->exec(mapToGlobal(event->pos())) == remove;
    delete menu;
    if (alive && removes && action) {
        Q_EMIT actionRemoved(this, action);
    }
}

void CustomToolBar::dragEnterEvent(QDragEnterEvent* event)
{
    if (!hasToolBarFormat(event->mimeData(), c_ActionFormat)
        && !hasToolBarFormat(event->mimeData(), c_ToolBarFormat)) {
        event->ignore();
        return;
    }
    ZELKOV_LOG(vx::c_LogTrace, "vx::CustomToolBar::dragEnterEvent",
        "CustomToolBar::dragEnterEvent..." << static_cast<const void*>(this));
    m_dropBefore = nullptr;
    event->accept();
}

void CustomToolBar::dragMoveEvent(QDragMoveEvent* event)
{
    ZELKOV_LOG(vx::c_LogTrace, "vx::CustomToolBar::dragMoveEvent",
        "CustomToolBar::dragMoveEvent..." << static_cast<const void*>(this));
    if (hasToolBarFormat(event->mimeData(), c_ActionFormat)) {
        QVector<QAction*> candidates;
        QVector<QRect> places;
        const QList<QAction*> all = actions();
        for (QAction* const action : all) {
            const QWidget* const widget = widgetForAction(action);
            if (action != m_spacerAction && widget != nullptr) {
                candidates.append(action);
                places.append(widget->geometry());
            }
        }
        const int position = dropPosition(places, event->pos(), orientation());
        m_dropBefore = position < 0 ? nullptr : candidates.at(position);
        event->accept();
    } else if (hasToolBarFormat(event->mimeData(), c_ToolBarFormat)) {
        event->accept();
    } else {
        event->ignore();
    }
}

void CustomToolBar::dragLeaveEvent(QDragLeaveEvent* event)
{
    ZELKOV_LOG(vx::c_LogTrace, "vx::CustomToolBar::dragLeaveEvent",
        "CustomToolBar::dragLeaveEvent..." << static_cast<const void*>(this));
    removeSpacer();
    m_dropBefore = nullptr;
    event->accept();
}

void CustomToolBar::dropEvent(QDropEvent* event)
{
    const bool isAction = hasToolBarFormat(event->mimeData(), c_ActionFormat);
    const QByteArray bytes = event->mimeData() != nullptr
        ? event->mimeData()->data(QLatin1String(isAction ? c_ActionFormat : c_ToolBarFormat))
        : QByteArray();
    QDataStream stream(bytes);
    const QPointer<CustomToolBar> alive(this);
    if (!stream.atEnd()) {
        QString id;
        stream >> id;
        if (isAction) {
            ZELKOV_LOG(vx::c_LogTrace, "vx::CustomToolBar::dropEvent",
                "CustomToolBar::dropped action ID: " << id.toStdWString());
            Q_EMIT actionDropped(this, id, m_dropBefore);
        } else {
            ZELKOV_LOG(vx::c_LogTrace, "vx::CustomToolBar::dropEvent",
                "CustomToolBar::dropped toolbar ID: " << id.toStdWString());
            Q_EMIT toolBarDropped(id);
        }
    }
    if (alive) {
        removeSpacer();
    }
    event->acceptProposedAction();
}

// Nobody calls it yet; it stays for the gap that opens where a drop would land.
void CustomToolBar::addSpacer()
{
    auto* const widget = new QWidget;
    auto* const layout = new QBoxLayout(
        orientation() == Qt::Horizontal ? QBoxLayout::LeftToRight : QBoxLayout::TopToBottom, widget);
    layout->addSpacing(iconSize() == QSize(16, 16) ? 32 : 64);
    m_spacerAction = insertWidget(m_dropBefore, widget);
}

void CustomToolBar::removeSpacer()
{
    if (m_spacerAction) {
        removeAction(m_spacerAction);
        m_spacerAction = nullptr;
    }
}
}
