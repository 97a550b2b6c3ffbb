// SPDX-License-Identifier: MIT
// The bars report what was dropped; inserting and removing is the page's business.
#include "ToolBarPage.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QDataStream>
#include <QtCore/QMimeData>
#include <QtGui/QDragMoveEvent>
#include <QtGui/QPainter>
#include <QtGui/QPainterPath>
#include <QtWidgets/QAction>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QVBoxLayout>

#include "../cameras/Scene.h"
#include "../Hand.h"
#include "views/CustomToolBar.h"

namespace gallery
{
namespace
{
const int s_icon = 24;

// Each sign in a square of 24.
QPainterPath signOf(const QString& id)
{
    QPainterPath path;
    path.setFillRule(Qt::WindingFill);
    if (id == QLatin1String("play")) {
        path.addPolygon(QPolygonF({{7, 4}, {20, 12}, {7, 20}, {7, 4}}));
    } else if (id == QLatin1String("pause")) {
        path.addRoundedRect(6, 4, 4.5, 16, 1, 1);
        path.addRoundedRect(13.5, 4, 4.5, 16, 1, 1);
    } else if (id == QLatin1String("record")) {
        path.addEllipse(QPointF(12, 12), 7, 7);
    } else if (id == QLatin1String("back")) {
        path.addPolygon(QPolygonF({{12, 5}, {12, 19}, {3, 12}, {12, 5}}));
        path.addPolygon(QPolygonF({{21, 5}, {21, 19}, {12, 12}, {21, 5}}));
    } else if (id == QLatin1String("forward")) {
        path.addPolygon(QPolygonF({{12, 5}, {12, 19}, {21, 12}, {12, 5}}));
        path.addPolygon(QPolygonF({{3, 5}, {3, 19}, {12, 12}, {3, 5}}));
    } else if (id == QLatin1String("snapshot")) {
        path.addRoundedRect(3, 7, 18, 12, 2, 2);
        path.addRoundedRect(8, 4, 8, 5, 1, 1);
        QPainterPath lens;
        lens.addEllipse(QPointF(12, 13), 3.6, 3.6);
        path = path.subtracted(lens);
    } else if (id == QLatin1String("wall")) {
        for (const QPointF& corner : {QPointF(3, 4), QPointF(13, 4), QPointF(3, 13), QPointF(13, 13)}) {
            path.addRoundedRect(QRectF(corner, QSizeF(8, 7)), 1, 1);
        }
    } else {
        path.addPolygon(QPolygonF({{5, 3}, {7, 3}, {7, 21}, {5, 21}, {5, 3}}));
        path.addPolygon(QPolygonF({{7, 4}, {19, 4}, {16, 8.5}, {19, 13}, {7, 13}, {7, 4}}));
    }
    return path;
}
}

ActionList::ActionList(QWidget* parent)
    : QListWidget(parent)
{
    setDragEnabled(true);
    setDragDropMode(QAbstractItemView::DragOnly);
    setIconSize(QSize(18, 18));
    setSpacing(2);
}

QStringList ActionList::mimeTypes() const
{
    return {QStringLiteral("application/action-id")};
}

QMimeData* ActionList::mimeData(const QList<QListWidgetItem*> items) const
{
    if (items.isEmpty()) {
        return nullptr;
    }
    QByteArray id;
    QDataStream stream(&id, QIODevice::WriteOnly);
    stream << items.first()->data(Qt::UserRole).toString();
    auto* result = new QMimeData;
    result->setData(QStringLiteral("application/action-id"), id);
    return result;
}

const QVector<ToolBarPage::Tool>& ToolBarPage::tools()
{
    static const QVector<Tool> list = {
        {"back", QT_TR_NOOP("Back")},
        {"play", QT_TR_NOOP("Play")},
        {"pause", QT_TR_NOOP("Pause")},
        {"forward", QT_TR_NOOP("Forward")},
        {"record", QT_TR_NOOP("Record")},
        {"snapshot", QT_TR_NOOP("Snapshot")},
        {"wall", QT_TR_NOOP("Camera wall")},
        {"flag", QT_TR_NOOP("Flag")},
    };
    return list;
}

ToolBarPage::ToolBarPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
    , m_window(new ToolBarWindow)
{
    m_across = makeBar(QStringLiteral("across"), Qt::Horizontal,
        {QStringLiteral("back"), QStringLiteral("play"), QStringLiteral("forward")});
    m_down = makeBar(QStringLiteral("down"), Qt::Vertical, {QStringLiteral("wall"), QStringLiteral("snapshot")});
    connect(m_window, &ToolBarWindow::customizeAsked, this, [this] {
        m_list->setFocus();
        say(tr("Drag an action from the list onto a bar."));
    });

    auto* picture = new QLabel;
    picture->setPixmap(Scene(1).ground(QSize(760, 520), devicePixelRatioF()));
    picture->setAlignment(Qt::AlignCenter);
    picture->setMinimumSize(120, 120);
    picture->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Ignored);
    auto* body = new QHBoxLayout;
    body->setSpacing(0);
    body->addWidget(m_down);
    body->addWidget(picture, 1);
    auto* window = new QVBoxLayout(m_window);
    window->setContentsMargins(0, 0, 0, 0);
    window->setSpacing(0);
    window->addWidget(m_across);
    window->addLayout(body, 1);

    QWidget* frame = panel();
    auto* inside = new QVBoxLayout(frame);
    inside->setContentsMargins(2, 2, 2, 2);
    inside->addWidget(m_window);
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(16);
    layout->addWidget(frame, 1);
    layout->addWidget(makeList());
}

QIcon ToolBarPage::icon(const QString& id) const
{
    const qreal ratio = devicePixelRatioF();
    QPixmap pixmap(QSize(s_icon, s_icon) * ratio);
    pixmap.setDevicePixelRatio(ratio);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.fillPath(
        signOf(id), id == QLatin1String("record") ? QColor(222, 72, 72) : palette().color(QPalette::WindowText));
    return QIcon(pixmap);
}

QAction* ToolBarPage::makeAction(const QString& id)
{
    for (const Tool& tool : tools()) {
        if (id == QLatin1String(tool.id)) {
            auto* action = new QAction(icon(id), tr(tool.text), this);
            action->setObjectName(id);
            return action;
        }
    }
    return nullptr;
}

vx::CustomToolBar* ToolBarPage::makeBar(const QString& id, Qt::Orientation orientation, const QStringList& ids)
{
    auto* bar = new vx::CustomToolBar(id, m_window, true, id);
    bar->setObjectName(id);
    bar->setOrientation(orientation);
    bar->setIconSize(QSize(s_icon, s_icon));
    for (const QString& action : ids) {
        bar->addAction(makeAction(action));
    }
    watch(bar, id);
    announcePlace(bar, id);
    connect(bar, &vx::CustomToolBar::actionDropped, this,
        [this](QToolBar* target, const QString& actionId, QAction* before) {
            if (QAction* action = makeAction(actionId)) {
                target->insertAction(before, action);
                say(before ? tr("%1 before %2").arg(action->text(), before->text())
                           : tr("%1 at the end").arg(action->text()));
            }
        });
    connect(bar, &vx::CustomToolBar::actionRemoved, this, [this](QToolBar* source, QAction* action) {
        source->removeAction(action);
        say(tr("%1 removed").arg(action->text()));
        action->deleteLater();
    });
    connect(bar, &vx::CustomToolBar::toolBarDropped, this,
        [this](const QString& barId) { say(tr("Bar dropped: %1").arg(barId)); });
    return bar;
}

QWidget* ToolBarPage::makeList()
{
    m_list = new ActionList;
    for (const Tool& tool : tools()) {
        const QString id = QString::fromLatin1(tool.id);
        auto* item = new QListWidgetItem(icon(id), tr(tool.text), m_list);
        item->setData(Qt::UserRole, id);
    }
    announcePlace(m_list->viewport(), QStringLiteral("actions"));
    m_said = label(QString(), "hint");
    m_said->setWordWrap(true);
    m_said->setMinimumHeight(36);
    m_said->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    auto* hint = label(tr("Drag an action onto a bar; right click an action there to remove it. The bars can be "
                          "dragged by their empty part."),
        "hint");
    hint->setWordWrap(true);

    QWidget* box = panel();
    box->setFixedWidth(230);
    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(16, 14, 16, 12);
    layout->setSpacing(10);
    layout->addWidget(label(tr("Actions"), "heading"));
    layout->addWidget(m_list, 1);
    layout->addWidget(hint);
    layout->addWidget(m_said);
    return box;
}

void ToolBarPage::say(const QString& text)
{
    m_said->setText(text);
}

void ToolBarPage::rehearse(Hand& hand)
{
    // A drag has a loop of its own, in which a script cannot play: the drop is all that shows.
    hand.call(m_across, [this] {
        QMimeData dragged;
        QByteArray id;
        QDataStream stream(&id, QIODevice::WriteOnly);
        stream << QStringLiteral("record");
        dragged.setData(QStringLiteral("application/action-id"), id);
        const QPoint place = m_across->widgetForAction(m_across->actions().at(1))->geometry().topLeft();
        QDragEnterEvent enter(place, Qt::MoveAction, &dragged, Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(m_across, &enter);
        QDragMoveEvent move(place, Qt::MoveAction, &dragged, Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(m_across, &move);
        QDropEvent drop(place, Qt::MoveAction, &dragged, Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(m_across, &drop);
    });
    hand.wait(100);
}
}
