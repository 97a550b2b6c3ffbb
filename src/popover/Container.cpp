// SPDX-License-Identifier: MIT
// The content of a popover: building it, its hooks and its looks.
#include "popover/Container.h"

#include "CoreQt/Connect.h"
#include "foundation/WidgetPrimitive.h"
#include "popover/WidgetItem.h"

#include <QtCore/QMetaMethod>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QVBoxLayout>

namespace vx
{
namespace PopoverWidget
{
namespace
{
constexpr char c_ItemPerformed[]
    = "2itemPerformed( int, const QVariant &,const QVariant&, vx::PopoverWidget::EItemPerformedFlags )";

/// An item that is added again is not connected twice.
void connectOnce(const QObject* sender, const char* signal, const QObject* receiver, const char* member)
{
    vx::connect(sender, signal, receiver, member, Qt::UniqueConnection);
}

/// The signals of rows and of their container, looked up once: by text that takes longer than making the row. The
/// connections are the same as by text, so vx::disconnect() finds them.
struct RowSignals
{
    const int performed = QMetaMethod::fromSignal(&Item::itemPerformed).methodIndex();
    const int layoutChanged = QMetaMethod::fromSignal(&Item::layoutChanged).methodIndex();
    const int ownPerformed = QMetaMethod::fromSignal(&Container::itemPerformed).methodIndex();
    const int ownLayoutChanged = QMetaMethod::fromSignal(&Container::layoutChanged).methodIndex();
    const int dismiss = QMetaMethod::fromSignal(&Container::dismissPopover).methodIndex();
    const int dismissAll = QMetaMethod::fromSignal(&Container::dismissAllPopover).methodIndex();
};

const RowSignals& rowSignals()
{
    static const RowSignals all;
    return all;
}

void connectOnce(const Item* sender, int signal, const Container* receiver, int member,
    Qt::ConnectionType type = Qt::AutoConnection)
{
    QMetaObject::connect(sender, signal, receiver, member, type | Qt::UniqueConnection);
}
}

Container::Container(
    QWidget* parent, const QString& objectName, Qt::Orientation orientation, QFlags<Qt::AlignmentFlag> alignment)
    : QWidget(parent)
    , m_orientation(orientation)
{
    setObjectName(objectName);
    setSizePolicy(QSizePolicy::Minimum, QSizePolicy::Minimum);
    if (orientation == Qt::Vertical) {
        m_layout = new QVBoxLayout(this);
    } else {
        m_layout = new QHBoxLayout(this);
    }
    m_layout->setSpacing(0);
    m_layout->setAlignment(alignment);
    setMouseTracking(true);
}

Container::~Container()
{
    // What is about to die is forgotten first: it still looks alive to those who hear of its destruction.
    for (QPointer<Container>* member : {&m_header, &m_footer}) {
        QPointer<Container> part;
        part.swap(*member);
        if (part && !part->parent()) {
            delete part.data();
        }
    }
    // A header container has items outside its layout.
    QList<QPointer<Item>> items;
    items.swap(m_items);
    for (const QPointer<Item>& item : qAsConst(items)) {
        if (item && !item->parent()) {
            delete item.data();
        }
    }
}

void Container::setSpacing(int spacing)
{
    // Beyond the size of a widget Qt's layouts count pixel by pixel for minutes.
    m_layout->setSpacing(qMin(spacing, QWIDGETSIZE_MAX));
}

int Container::spacing() const
{
    return m_layout->spacing();
}

void Container::addStretch(int stretch)
{
    m_layout->addStretch(stretch);
    emitLayoutChanged();
}

void Container::addSpacing(int size)
{
    m_layout->addSpacing(size);
    emitLayoutChanged();
}

void Container::addSpacer(QSizePolicy::Policy policy, int width, int height)
{
    m_layout->addItem(new QSpacerItem(width, height, policy, policy));
    emitLayoutChanged();
}

Item* Container::addItem(Item* item, QFlags<EContainerFlag> flags)
{
    return insertItem(item, flags, m_layout->count());
}

Item* Container::addItem(Item* item)
{
    return insertItem(item, m_layout->count());
}

Item* Container::insertItem(Item* item, QFlags<EContainerFlag> flags, int index)
{
    if (!item) {
        return nullptr;
    }
    const QPointer<Item> added(item);
    item->updateGeometry();
    m_layout->insertWidget(index, item);
    append(item);
    applyFlags(item, flags);
    applyDefaultConnects(item);
    emitLayoutChanged();
    return added;
}

Item* Container::insertItem(Item* item, int index)
{
    if (!item) {
        return nullptr;
    }
    const QPointer<Item> added(item);
    item->updateGeometry();
    m_layout->insertWidget(index, item);
    append(item);
    applyFlags(item, item->defaultItemFlags());
    applyDefaultConnects(item);
    emitLayoutChanged();
    return added;
}

void Container::addWidgetItem(QWidget* widget, const QString& objectName, int id)
{
    insertWidgetItem(widget, m_layout->count(), objectName, id);
}

void Container::insertWidgetItem(QWidget* widget, int index, const QString& objectName, int id)
{
    auto* const item = new WidgetItem(widget, objectName, id, nullptr);
    item->setAttribute(Qt::WA_MacShowFocusRect, false);
    item->setMouseTracking(true);
    setMouseTracking(true);
    item->setSizePolicy(QSizePolicy::Minimum, QSizePolicy::MinimumExpanding);
    if (widget) {
        widget->setAttribute(Qt::WA_MacShowFocusRect, false);
        widget->setMouseTracking(true);
        widget->setSizePolicy(QSizePolicy::Minimum, QSizePolicy::Maximum);
    }
    m_layout->insertWidget(index, item);
    append(item);
    emitLayoutChanged();
}

void Container::resetLayout(bool deleteItems, bool withHeaderAndFooter)
{
    const QPointer<Container> self(this);
    if (withHeaderAndFooter && (!dropPart(m_header, deleteItems) || !dropPart(m_footer, deleteItems))) {
        return;
    }
    dropItems(deleteItems);
    if (self) {
        emitLayoutChanged();
    }
}

/// Whether this container survived.
bool Container::dropPart(QPointer<Container>& part, bool deleteItems)
{
    const QPointer<Container> self(this);
    if (part) {
        part->resetLayout(deleteItems, false);
    }
    if (self) {
        // Forgotten first: it still looks alive to those who hear of its destruction.
        QPointer<Container> dropped;
        dropped.swap(part);
        delete dropped.data();
    }
    return !self.isNull();
}

void Container::dropItems(bool deleteItems)
{
    m_items.removeAll(QPointer<Item>());
    // The list shrinks under the walk, so what comes after an item outside the layout is skipped. A header
    // container is emptied by halves in this way; clients rely on it.
    for (int i = 0; i < m_items.size(); ++i) {
        if (m_layout->indexOf(m_items.at(i)) >= 0) {
            m_layout->removeWidget(m_items.at(i));
        } else {
            m_items.removeAt(i);
        }
    }
    QList<QPointer<Item>> dropped;
    dropped.swap(m_items);
    if (deleteItems) {
        for (const QPointer<Item>& item : dropped) {
            delete item.data();
        }
    }
}

bool Container::canBeClosed()
{
    return true;
}

void Container::popoverClosing()
{
    Q_EMIT popoverAboutToClose();
}

void Container::popoverOpening()
{
    Q_EMIT popoverAboutToOpen();
}

void Container::popoverClosed()
{
}

void Container::popoverOpened()
{
    updateTabOrder();
}

void Container::applyFlags(Item* item, QFlags<EContainerFlag> flags)
{
    if (!item) {
        return;
    }
    if (flags.testFlag(ecfDismiss)) {
        connectOnce(item, rowSignals().performed, this, rowSignals().dismiss);
    }
    if (flags.testFlag(ecfDismissAll)) {
        connectOnce(item, rowSignals().performed, this, rowSignals().dismissAll);
    }
}

void Container::applyDefaultConnects(Item* item)
{
    if (!item) {
        return;
    }
    if (!item->itemFlags().testFlag(eifNoForward)) {
        connectOnce(item, rowSignals().performed, this, rowSignals().ownPerformed);
    }
    connectOnce(item, rowSignals().layoutChanged, this, rowSignals().ownLayoutChanged, Qt::QueuedConnection);
}

int Container::leftMargin() const
{
    return m_layout->contentsMargins().left();
}

void Container::setLeftMargin(int margin)
{
    QMargins margins = m_layout->contentsMargins();
    margins.setLeft(margin);
    m_layout->setContentsMargins(margins);
}

int Container::topMargin() const
{
    return m_layout->contentsMargins().top();
}

void Container::setTopMargin(int margin)
{
    QMargins margins = m_layout->contentsMargins();
    margins.setTop(margin);
    m_layout->setContentsMargins(margins);
}

int Container::rightMargin() const
{
    return m_layout->contentsMargins().right();
}

void Container::setRightMargin(int margin)
{
    QMargins margins = m_layout->contentsMargins();
    margins.setRight(margin);
    m_layout->setContentsMargins(margins);
}

int Container::bottomMargin() const
{
    return m_layout->contentsMargins().bottom();
}

void Container::setBottomMargin(int margin)
{
    QMargins margins = m_layout->contentsMargins();
    margins.setBottom(margin);
    m_layout->setContentsMargins(margins);
}

int Container::layoutOrientation() const
{
    return m_orientation;
}

void Container::addContainer(Container* container)
{
    if (!container || container == this) {
        return;
    }
    m_layout->addWidget(container);
    m_containers.removeAll(QPointer<Container>());
    m_containers.append(container);
    connectOnce(container, c_ItemPerformed, this, c_ItemPerformed);
    emitLayoutChanged();
}

void Container::addHeader(Container* header)
{
    if (m_header || !header || header == this) {
        return;
    }
    m_header = header;
    connectOnce(header, c_ItemPerformed, this, c_ItemPerformed);
    emitLayoutChanged();
}

void Container::addFooter(Container* footer)
{
    if (m_footer || !footer || footer == this) {
        return;
    }
    m_footer = footer;
    connectOnce(footer, c_ItemPerformed, this, c_ItemPerformed);
    emitLayoutChanged();
}

Container* Container::header() const
{
    return m_header;
}

Container* Container::footer() const
{
    return m_footer;
}

void Container::clear()
{
    resetLayout(true, true);
}

void Container::removeItem(int id)
{
    if (Item* const item = getItem(id)) {
        m_layout->removeWidget(item);
        m_items.removeAll(QPointer<Item>(item));
        item->deleteLater();
    }
}

void Container::append(Item* item)
{
    // Items that clients deleted are swept out now and then.
    if ((m_items.size() & (m_items.size() - 1)) == 0) {
        m_items.removeAll(QPointer<Item>());
    }
    m_items.append(item);
}

void Container::emitLayoutChanged()
{
    if (isVisible()) {
        Q_EMIT layoutChanged();
    }
}

void Container::paintEvent(QPaintEvent* /*event*/)
{
    WidgetPrimitive::paint(this);
}

} // namespace PopoverWidget
} // namespace vx
