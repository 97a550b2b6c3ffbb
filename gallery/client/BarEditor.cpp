// SPDX-License-Identifier: MIT
// The tools that are not in the tool bar.
#include "BarEditor.h"

#include "Signs.h"

#include <QtCore/QDataStream>
#include <QtCore/QMimeData>
#include <QtGui/QDrag>
#include <QtGui/QDropEvent>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>

namespace client
{
namespace
{
QString toolFormat()
{
    return QStringLiteral("application/action-id");
}
}

ToolList::ToolList(QWidget* parent)
    : QListWidget(parent)
{
    setObjectName(QStringLiteral("toolList"));
    setFlow(QListView::LeftToRight);
    setWrapping(false);
    setDragEnabled(true);
    setAcceptDrops(true);
    setDropIndicatorShown(false);
    setDragDropMode(QAbstractItemView::DragDrop);
    setIconSize(QSize(c_signExtent, c_signExtent));
    setSpacing(3);
    setFixedHeight(44);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
}

QMimeData* ToolList::dataOf(const QString& id)
{
    QByteArray bytes;
    QDataStream stream(&bytes, QIODevice::WriteOnly);
    stream << id;
    auto* data = new QMimeData;
    data->setData(toolFormat(), bytes);
    return data;
}

QString ToolList::idOf(const QMimeData* data)
{
    QString id;
    if (data && data->hasFormat(toolFormat())) {
        QDataStream stream(data->data(toolFormat()));
        stream >> id;
    }
    return id;
}

QStringList ToolList::mimeTypes() const
{
    return {toolFormat()};
}

QMimeData* ToolList::mimeData(const QList<QListWidgetItem*> items) const
{
    return items.isEmpty() ? nullptr : dataOf(items.first()->data(Qt::UserRole).toString());
}

void ToolList::dragEnterEvent(QDragEnterEvent* event)
{
    event->setAccepted(event->mimeData()->hasFormat(toolFormat()));
}

void ToolList::dragMoveEvent(QDragMoveEvent* event)
{
    event->setAccepted(event->mimeData()->hasFormat(toolFormat()));
}

void ToolList::dropEvent(QDropEvent* event)
{
    const QString id = idOf(event->mimeData());
    // Nothing for the view to move: the list is made anew by whoever listens.
    event->setDropAction(Qt::CopyAction);
    event->accept();
    if (!id.isEmpty()) {
        Q_EMIT toolDropped(id);
    }
}

BarEditor::BarEditor(QWidget* parent)
    : QFrame(parent)
    , m_list(new ToolList)
    , m_hint(new QLabel)
    , m_reset(new QPushButton)
    , m_done(new QPushButton)
{
    setObjectName(QStringLiteral("barEditor"));
    m_hint->setProperty("role", QStringLiteral("hint"));
    m_hint->setWordWrap(true);
    m_reset->setObjectName(QStringLiteral("resetToolsButton"));
    m_done->setObjectName(QStringLiteral("toolsDoneButton"));
    m_done->setProperty("role", QStringLiteral("primary"));
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(12, 6, 12, 6);
    layout->setSpacing(10);
    layout->addWidget(m_list, 3);
    layout->addWidget(m_hint, 2);
    layout->addWidget(m_reset);
    layout->addWidget(m_done);
    connect(m_reset, &QPushButton::clicked, this, &BarEditor::resetWanted);
    connect(m_done, &QPushButton::clicked, this, &BarEditor::done);
    retranslate();
}

void BarEditor::addButton(QWidget* button, const QString& id)
{
    m_ids.insert(button, id);
    button->installEventFilter(this);
}

bool BarEditor::eventFilter(QObject* watched, QEvent* event)
{
    if (isVisible() && m_ids.contains(watched)) {
        return filterButton(static_cast<QWidget*>(watched), event);
    }
    return QFrame::eventFilter(watched, event);
}

bool BarEditor::filterButton(QWidget* button, QEvent* event)
{
    switch (event->type()) {
    case QEvent::MouseButtonPress: {
        const auto* mouse = static_cast<QMouseEvent*>(event);
        m_pressed = mouse->button() == Qt::LeftButton ? button : nullptr;
        m_pressedAt = mouse->pos();
        return true;
    }
    case QEvent::MouseMove: {
        const auto* mouse = static_cast<QMouseEvent*>(event);
        if (m_pressed == button && mouse->buttons().testFlag(Qt::LeftButton)
            && (mouse->pos() - m_pressedAt).manhattanLength() >= QApplication::startDragDistance()) {
            m_pressed = nullptr;
            auto* drag = new QDrag(this);
            drag->setMimeData(ToolList::dataOf(m_ids.value(button)));
            drag->setPixmap(button->grab());
            drag->setHotSpot(m_pressedAt);
            drag->exec(Qt::MoveAction);
        }
        return true;
    }
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
        m_pressed = nullptr;
        return true;
    default:
        return false;
    }
}

void BarEditor::changeEvent(QEvent* event)
{
    QFrame::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        retranslate();
    }
}

void BarEditor::retranslate()
{
    m_hint->setText(tr("Drag tools into the bar, out of it, or to another place."));
    m_reset->setText(tr("Reset"));
    m_done->setText(tr("Done"));
}
}
