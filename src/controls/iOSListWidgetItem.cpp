// SPDX-License-Identifier: MIT
#include "controls/iOSListWidgetItem.h"

#include "CoreQt/Connect.h"
#include "controls/iOSListWidget.h"
#include "controls/iOSListWidgetDeleteIcon.h"
#include "input/MouseAdapter.h"

#include <QtCore/QEvent>
#include <QtGui/QCursor>
#include <QtGui/QPalette>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QToolTip>

namespace vx
{
iOSListWidgetItem::iOSListWidgetItem(iOSListWidget* list, QWidget* itemWidget, const QString& objectName,
    const QSize& size, QWidget* editWidget, QWidget* selectedWidget, QWidget* accessoryWidget)
    : QListWidgetItem(nullptr, Type)
    , m_list(list)
    , m_itemWidget(itemWidget)
    , m_editWidget(editWidget)
    , m_selectedWidget(selectedWidget)
    , m_accessoryWidget(accessoryWidget)
{
    m_container = new QWidget;
    m_layout = new QHBoxLayout;
    m_deleteIcon = new iOSListWidgetDeleteIcon(m_container);
    m_deleteButton = new QPushButton(tr("Delete"), m_container);
    m_riffleLabel = new QLabel(m_container);
    m_riffleLabel->setPixmap(QPixmap(QStringLiteral(":/iOSListWidget/iOSRiffleArea.png")));
    m_container->setObjectName(objectName);
    m_deleteIcon->setFlat(true);
    m_deleteButton->setFlat(true);
    m_deleteButton->setObjectName(QStringLiteral("deleteButton"));

    m_layout->setAlignment(Qt::AlignTop);
    m_layout->setSpacing(4);
    m_layout->setContentsMargins(0, 0, 0, 0);
    m_layout->addWidget(m_deleteIcon);
    for (QWidget* const content : {itemWidget, editWidget}) {
        if (!content) {
            continue;
        }
        if (size.isValid()) {
            content->setFixedSize(size);
        }
        content->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
        content->setParent(m_container);
        m_layout->addWidget(content);
    }
    if (editWidget) {
        editWidget->hide();
    }
    if (accessoryWidget) {
        m_layout->addWidget(accessoryWidget);
    }
    if (selectedWidget) {
        m_layout->addStretch();
        m_layout->addWidget(selectedWidget);
    }
    m_layout->addWidget(m_deleteButton);
    m_layout->addWidget(m_riffleLabel);
    iOSListWidgetItem::setEditMode(false);
    m_container->setLayout(m_layout);
    m_container->adjustSize();
    m_container->updateGeometry();
    setSizeHint(m_container->sizeHint());
    setFlags(Qt::ItemIsSelectable | Qt::ItemIsEditable | Qt::ItemIsDragEnabled | Qt::ItemIsEnabled);

    // Queued, so that the row is not deleted inside the signal of its own button.
    qRegisterMetaType<QListWidgetItem*>("QListWidgetItem*");
    if (list) {
        vx::connect(this, "2itemToBeDeleted(QListWidgetItem*)", list, "1deleteItem(QListWidgetItem*)",
            Qt::QueuedConnection);
    }
    vx::connect(m_deleteIcon, "2clicked(bool)", this, "1enableDeleteMode()", Qt::AutoConnection);
    vx::connect(m_deleteButton, "2released()", this, "1deleteItem()", Qt::AutoConnection);

    m_container->setMouseTracking(true);
    if (list) {
        list->addItem(this);
        list->setItemWidget(this, m_container);
        list->setMouseTracking(true);
        // A slot may delete the list, and with it this row that is only being made.
        const QPointer<QObject> alive(this);
        list->itemHasBeenAdded();
        if (!alive) {
            return;
        }
    }
    if (m_selectedWidget && !m_inEditMode) {
        m_selectedWidget->hide();
    }
    m_tooltipDelayTimer.setSingleShot(true);
    m_tooltipDelayTimer.setInterval(1000);
    m_tooltipCycleTimer.setSingleShot(false);
    m_tooltipCycleTimer.setInterval(2500);
    vx::connect(&m_tooltipDelayTimer, "2timeout()", this, "1showTooltip()", Qt::AutoConnection);
    vx::connect(&m_tooltipCycleTimer, "2timeout()", this, "1toggleTooltip()", Qt::AutoConnection);
    watchContent();
    if (m_itemWidget) {
        m_itemWidget->installEventFilter(this);
    }
}

iOSListWidgetItem::~iOSListWidgetItem()
{
    if (!listWidget() && m_container && !m_container->parentWidget()) {
        delete m_container; // never came into a list
    }
}

void iOSListWidgetItem::watchContent()
{
    if (!m_itemWidget) {
        return;
    }
    auto* const adapter = new MouseAdapter(m_itemWidget, false);
    adapter->setMouseTracking(true);
    m_itemWidget->setMouseTracking(true);
    vx::connect(adapter, "2moved(vx::MouseEvent)", this, "1mouseMoved()", Qt::AutoConnection);
    vx::connect(adapter, "2left(vx::MouseEvent)", this, "1mouseLeft()", Qt::AutoConnection);
    vx::connect(adapter, "2entered(vx::MouseEvent)", this, "1mouseEntered()", Qt::AutoConnection);
}

void iOSListWidgetItem::setEditMode(bool on)
{
    m_inEditMode = on;
    if (!m_container || !m_layout) {
        return;
    }
    m_layout->setContentsMargins(on ? 4 : 0, 0, on ? 4 : 0, 0);
    m_deleteIcon->setVisible(on && m_deletable);
    m_deleteButton->hide();
    m_riffleLabel->setVisible(on && m_movable);
    m_deleteIcon->setDeleteMode(false, false);
    if (m_editWidget) {
        if (m_itemWidget) {
            m_itemWidget->setVisible(!on);
        }
        m_editWidget->setVisible(on);
    }
}

void iOSListWidgetItem::setDeleteMode(bool on, bool animated)
{
    if (!m_deleteIcon) {
        return;
    }
    m_deleteButton->setVisible(on);
    m_riffleLabel->setVisible(!on && m_movable);
    m_deleteIcon->setDeleteMode(on, animated);
}

bool iOSListWidgetItem::deletable() const
{
    return m_deletable;
}

void iOSListWidgetItem::setDeletable(bool deletable)
{
    m_deletable = deletable;
}

bool iOSListWidgetItem::movable() const
{
    return m_movable;
}

void iOSListWidgetItem::setMovable(bool movable)
{
    m_movable = movable;
}

QWidget* iOSListWidgetItem::accessoryWidget() const
{
    return m_accessoryWidget;
}

QWidget* iOSListWidgetItem::editWidget() const
{
    return m_editWidget;
}

QWidget* iOSListWidgetItem::itemWidget() const
{
    return m_itemWidget;
}

void iOSListWidgetItem::setAccessoryWidget(QWidget* widget)
{
    if (m_accessoryWidget) {
        if (m_layout) {
            m_layout->removeWidget(m_accessoryWidget);
        }
        m_accessoryWidget->deleteLater();
    }
    m_accessoryWidget = widget;
    if (widget && m_layout) {
        m_layout->insertWidget(2, widget);
    }
}

void iOSListWidgetItem::setItemWidget(QWidget* widget)
{
    if (m_itemWidget) {
        if (m_layout) {
            m_layout->removeWidget(m_itemWidget);
        }
        m_itemWidget->deleteLater();
    }
    m_itemWidget = widget;
    if (!widget || !m_layout) {
        return;
    }
    m_layout->insertWidget(1, widget);
    widget->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
    watchContent();
    widget->installEventFilter(this);
}

void iOSListWidgetItem::setEditWidgetEnabled(bool enabled)
{
    if (m_editWidget) {
        m_editWidget->setEnabled(enabled);
    }
}

bool iOSListWidgetItem::editWidgetEnabled() const
{
    return m_editWidget && m_editWidget->isEnabled();
}

void iOSListWidgetItem::setMimeData(const QString& type, const QByteArray& data)
{
    m_mimeData.insert(type, data);
}

QByteArray iOSListWidgetItem::mimeData(const QString& type) const
{
    return m_mimeData.value(type);
}

QStringList iOSListWidgetItem::mimeTypes() const
{
    return m_mimeData.keys();
}

void iOSListWidgetItem::setSelected(bool selected)
{
    if (m_selectedWidget && !m_inEditMode) {
        m_selectedWidget->setVisible(selected);
    }
}

void iOSListWidgetItem::toggleDeleteMode()
{
    setDeleteMode(!isInDeleteMode(), true);
}

bool iOSListWidgetItem::isInDeleteMode() const
{
    return m_deleteIcon && m_deleteIcon->getDeleteMode();
}

void iOSListWidgetItem::deleteItem()
{
    Q_EMIT itemToBeDeleted(this);
}

void iOSListWidgetItem::enableDeleteMode()
{
    if (m_list) {
        m_list->setDeleteMode(this);
    }
}

void iOSListWidgetItem::dragEnded(QObject*)
{
    m_tooltipSuppressed = false;
}

void iOSListWidgetItem::hideTooltip()
{
    m_tooltipCycleTimer.stop();
    QToolTip::hideText();
}

void iOSListWidgetItem::setToolTipEnabled(bool enabled)
{
    m_tooltipSuppressed = !enabled;
    m_tooltipDelayTimer.stop();
    hideTooltip();
}

void iOSListWidgetItem::setTooltipImageFilePath(const QString& path)
{
    m_tooltipPaths.clear();
    if (!path.isEmpty()) {
        m_tooltipPaths.append(path);
    }
}

void iOSListWidgetItem::setTooltipImageFilePaths(const QStringList& paths)
{
    m_tooltipPaths = paths;
}

void iOSListWidgetItem::mouseEntered()
{
    if (m_tooltipSuppressed) {
        m_tooltipDelayTimer.stop();
    } else {
        m_tooltipDelayTimer.start();
    }
    hideTooltip();
}

void iOSListWidgetItem::mouseMoved()
{
    if (m_tooltipSuppressed || QToolTip::isVisible()) {
        return;
    }
    m_tooltipDelayTimer.start();
    hideTooltip();
}

void iOSListWidgetItem::mouseLeft()
{
    m_tooltipDelayTimer.stop();
    hideTooltip();
}

void iOSListWidgetItem::showTooltip()
{
    if (m_tooltipSuppressed || m_tooltipPaths.isEmpty()) {
        return;
    }
    m_tooltipIndex = 0;
    showTooltipForFilePath(m_tooltipPaths.first());
    if (m_tooltipPaths.size() >= 2) {
        m_tooltipCycleTimer.start();
    }
}

void iOSListWidgetItem::toggleTooltip()
{
    if (m_tooltipPaths.isEmpty()) {
        return;
    }
    m_tooltipIndex = (m_tooltipIndex + 1) % m_tooltipPaths.size();
    showTooltipForFilePath(m_tooltipPaths.at(m_tooltipIndex));
}

void iOSListWidgetItem::showTooltipForFilePath(const QString& path) const
{
    if (m_tooltipSuppressed || path.isEmpty() || !m_itemWidget) {
        return;
    }
    QPalette palette;
    palette.setColor(QPalette::Inactive, QPalette::ToolTipBase, Qt::transparent);
    palette.setColor(QPalette::Inactive, QPalette::ToolTipText, Qt::transparent);
    QToolTip::setPalette(palette);
    const QString text = QLatin1String("<html>   <body>      <img src=\"") + path
        + QLatin1String("\" width=\"320\" />   </body></html>");
    QToolTip::showText(QCursor::pos(), text, m_itemWidget, m_itemWidget->rect().adjusted(2, 2, -2, -2));
}

bool iOSListWidgetItem::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == m_itemWidget) {
        switch (event->type()) {
        case QEvent::ToolTip:
            if (m_tooltipSuppressed) {
                event->accept();
                return true;
            }
            break;
        case QEvent::DragEnter:
        case QEvent::DragMove: m_tooltipSuppressed = true; break;
        case QEvent::DragLeave:
        case QEvent::Drop: m_tooltipSuppressed = false; break;
        default: break;
        }
    }
    return QObject::eventFilter(watched, event);
}
}
