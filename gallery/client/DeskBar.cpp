// SPDX-License-Identifier: MIT
// The tool bar of the desk.
#include "DeskBar.h"

#include "BarEditor.h"
#include "Session.h"
#include "controls/MultiStateCustomToolButton.h"
#include "controls/MultiStateToolButton.h"
#include "indicators/ElidedButton.h"
#include "input/CustomContextClickToolButton.h"
#include "views/CustomToolBar.h"

#include <QtCore/QEvent>
#include <QtCore/QCoreApplication>
#include <QtGui/QContextMenuEvent>
#include <QtWidgets/QAction>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QVBoxLayout>
#include <QtWidgets/QWidgetAction>

namespace client
{
namespace
{
using Click = vx::CustomClickAdapter;
using ClickButton = vx::TCustomClickWidget<QToolButton>;

constexpr int c_userWidth = 190;
constexpr int c_userRoom = 56;

ClickButton* clickButton()
{
    return new ClickButton(nullptr, Click::s_DefaultLongClickSpan, false);
}
}

DeskBar::DeskBar(Session& session, QWidget* parent)
    : QWidget(parent)
    , m_session(session)
    , m_bar(new vx::CustomToolBar(QString(), this, false, QStringLiteral("deskTools")))
    , m_editor(new BarEditor)
{
    setObjectName(QStringLiteral("deskBar"));
    setAttribute(Qt::WA_StyledBackground);
    setProperty("role", QStringLiteral("bar"));
    m_bar->setObjectName(QStringLiteral("toolBar"));
    m_bar->setMovable(false);
    m_bar->setIconSize(QSize(c_signExtent, c_signExtent));
    m_editor->hide();
    makeTools();

    m_settings = clickButton();
    m_settings->setObjectName(QStringLiteral("settingsButton"));
    m_settings->setIconSize(QSize(c_signExtent, c_signExtent));
    m_user = new ElidedButton;
    m_user->setObjectName(QStringLiteral("userButton"));
    m_user->setElideMode(Qt::ElideRight);
    m_user->setMaximumWidth(c_userWidth);
    m_user->setFocusPolicy(Qt::TabFocus);
    connect(m_settings, &QToolButton::clicked, this, [this] { Q_EMIT settingsWanted(m_settings); });
    connect(m_user, &QPushButton::clicked, this, [this] { Q_EMIT userWanted(m_user); });

    auto* row = new QHBoxLayout;
    row->setContentsMargins(8, 4, 12, 4);
    row->setSpacing(6);
    row->addWidget(m_bar, 1);
    row->addWidget(m_settings);
    row->addWidget(m_user);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addLayout(row);
    layout->addWidget(m_editor);

    connectBar();
    connect(&session, &Session::roleChanged, this, &DeskBar::redraw);
    placeTools();
    retranslate();
    drawSigns();
}

QToolButton* DeskBar::addTool(const QString& id, QToolButton* button, Sign sign, const QString& right)
{
    button->setObjectName(id + QStringLiteral("Button"));
    button->setIconSize(QSize(c_signExtent, c_signExtent));
    button->setFocusPolicy(Qt::NoFocus);
    if (auto* asking = dynamic_cast<Click*>(button)) {
        asking->setSecurityCheck(right);
    }
    auto* action = new QWidgetAction(this);
    action->setObjectName(id);
    action->setDefaultWidget(button);
    m_editor->addButton(button, id);
    button->installEventFilter(this);
    m_tools.append({id, right, button, action, sign});
    return button;
}

void DeskBar::makeTools()
{
    auto* views = new vx::CustomContextClickToolButton(nullptr, Click::s_DefaultLongClickSpan, false);
    views->setPopupMode(QToolButton::MenuButtonPopup);
    views->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
    m_views = addTool(QStringLiteral("views"), views, Sign::Views);
    connect(views, &QToolButton::clicked, this, [this, views] {
        if (views->getClickType() == Click::ectNormal) {
            Q_EMIT nextViewCountWanted();
        } else {
            Q_EMIT viewCountChoiceWanted(views);
        }
    });

    m_thumbnails = new vx::MultiStateCustomToolButton({0, 1}, QStringLiteral("thumbnails"), nullptr);
    addTool(QStringLiteral("thumbnails"), m_thumbnails, Sign::Thumbnails);
    connect(m_thumbnails, &QToolButton::clicked, this, [this] {
        drawSigns();
        Q_EMIT thumbnailsWanted(m_thumbnails->state() == 1);
    });

    m_live = new vx::MultiStateToolButton({0, 1}, QStringLiteral("live"), nullptr);
    m_live->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
    addTool(QStringLiteral("live"), m_live, Sign::Live);
    connect(m_live, &QToolButton::clicked, this, [this] { Q_EMIT liveWanted(m_live->state() == 0); });

    m_mark = addTool(QStringLiteral("mark"), clickButton(), Sign::Mark);
    m_mark->setCheckable(true);
    connect(m_mark, &QToolButton::toggled, this, &DeskBar::markingWanted);
    m_line = addTool(QStringLiteral("line"), clickButton(), Sign::Line);
    m_line->setCheckable(true);
    connect(m_line, &QToolButton::toggled, this, &DeskBar::countingWanted);

    QToolButton* exporting = addTool(QStringLiteral("export"), clickButton(), Sign::Export, QStringLiteral("export"));
    connect(exporting, &QToolButton::clicked, this, [this, exporting] { Q_EMIT exportWanted(exporting); });
    m_ptz = addTool(QStringLiteral("ptz"), clickButton(), Sign::Ptz, QStringLiteral("ptz"));
    m_ptz->setCheckable(true);
    connect(m_ptz, &QToolButton::toggled, this, &DeskBar::steeringWanted);
    m_drop = addTool(QStringLiteral("drop"), clickButton(), Sign::Drop);
    connect(m_drop, &QToolButton::clicked, this, &DeskBar::dropWanted);
}

void DeskBar::connectBar()
{
    connect(m_bar, &vx::CustomToolBar::actionDropped, this,
        [this](QToolBar*, const QString& id, QAction* before) { moveTool(id, before); });
    connect(m_bar, &vx::CustomToolBar::actionRemoved, this, [this](QToolBar* bar, QAction* action) {
        bar->removeAction(action);
        fillList();
    });
    connect(&m_editor->list(), &ToolList::toolDropped, this, [this](const QString& id) {
        for (const Tool& tool : qAsConst(m_tools)) {
            if (tool.id == id) {
                m_bar->removeAction(tool.action);
            }
        }
        fillList();
    });
    // The list may be in the middle of its drag.
    connect(m_editor, &BarEditor::resetWanted, this, [this] {
        placeTools();
        fillList();
    });
    connect(m_editor, &BarEditor::done, this, &DeskBar::endCustomizing);
}

void DeskBar::placeTools()
{
    for (const Tool& tool : qAsConst(m_tools)) {
        m_bar->removeAction(tool.action);
        m_bar->addAction(tool.action);
    }
}

void DeskBar::moveTool(const QString& id, QAction* before)
{
    for (const Tool& tool : qAsConst(m_tools)) {
        if (tool.id == id && tool.action != before) {
            m_bar->removeAction(tool.action);
            m_bar->insertAction(before, tool.action);
            tool.button->show();
        }
    }
    fillList();
}

void DeskBar::fillList()
{
    ToolList& list = m_editor->list();
    list.clear();
    for (const Tool& tool : qAsConst(m_tools)) {
        if (!m_bar->actions().contains(tool.action)) {
            auto* item = new QListWidgetItem(tool.button->icon(), textOf(tool.id), &list);
            item->setData(Qt::UserRole, tool.id);
        }
    }
}

QStringList DeskBar::tools() const
{
    QStringList result;
    for (const QAction* action : m_bar->actions()) {
        result << action->objectName();
    }
    return result;
}

void DeskBar::customizeToolBar()
{
    fillList();
    m_editor->show();
}

void DeskBar::endCustomizing()
{
    m_editor->hide();
}

void DeskBar::setViewCount(int count)
{
    m_viewCount = count;
    m_views->setText(QString::number(count));
}

void DeskBar::setThumbnails(bool on)
{
    m_thumbnails->setState(on ? 1 : 0);
    drawSigns();
}

void DeskBar::setLive(bool live)
{
    m_live->setState(live ? 0 : 1);
    retranslate();
    drawSigns();
}

void DeskBar::setSteering(bool on)
{
    const QSignalBlocker quiet(m_ptz);
    m_ptz->setChecked(on);
}

void DeskBar::setMarking(bool on)
{
    const QSignalBlocker quiet(m_mark);
    m_mark->setChecked(on);
}

void DeskBar::setCounting(bool on)
{
    const QSignalBlocker quiet(m_line);
    m_line->setChecked(on);
}

void DeskBar::setCameraOnline(bool online)
{
    if (m_cameraOnline != online) {
        m_cameraOnline = online;
        redraw();
    }
}

void DeskBar::setUserText(const QString& text)
{
    m_user->setText(text);
    // The button keeps room for a menu mark beside its text.
    const int wanted = m_user->fontMetrics().boundingRect(text).width() + c_userRoom;
    m_user->setMinimumWidth(qBound(c_userRoom, wanted, c_userWidth));
}

void DeskBar::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    switch (event->type()) {
    case QEvent::LanguageChange:
        retranslate();
        break;
    case QEvent::PaletteChange:
    case QEvent::StyleChange:
        drawSigns();
        break;
    default:
        break;
    }
}

bool DeskBar::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() == QEvent::ContextMenu && (watched != m_views || m_editor->isVisible())) {
        // The menu is that of the bar, where the button would take the click for itself.
        auto* button = static_cast<QWidget*>(watched);
        const auto* menu = static_cast<QContextMenuEvent*>(event);
        QContextMenuEvent there(menu->reason(), m_bar->mapFromGlobal(button->mapToGlobal(menu->pos())),
            menu->globalPos(), menu->modifiers());
        QCoreApplication::sendEvent(m_bar, &there);
        return true;
    }
    return QWidget::eventFilter(watched, event);
}

QString DeskBar::textOf(const QString& id) const
{
    if (id == QLatin1String("views")) {
        return tr("Number of views");
    }
    if (id == QLatin1String("thumbnails")) {
        return m_thumbnails->state() == 1 ? tr("Back to the pictures") : tr("All cameras as thumbnails");
    }
    if (id == QLatin1String("live")) {
        return m_live->state() == 0 ? tr("Live pictures; click for the recordings") : tr("Recordings; click for live");
    }
    if (id == QLatin1String("mark")) {
        return tr("Mark a region");
    }
    if (id == QLatin1String("line")) {
        return tr("Counting line");
    }
    if (id == QLatin1String("export")) {
        return tr("Export a recording");
    }
    if (id == QLatin1String("ptz")) {
        return tr("Steer the camera");
    }
    return m_cameraOnline ? tr("Cut the line of the camera") : tr("Restore the line of the camera");
}

void DeskBar::retranslate()
{
    m_bar->setWindowTitle(tr("Tools"));
    m_live->setText(m_live->state() == 0 ? tr("LIVE") : tr("RECORDED"));
    for (const Tool& tool : qAsConst(m_tools)) {
        const QString text = textOf(tool.id);
        const bool locked = !tool.right.isEmpty() && m_session.isRightRefused(tool.right, true, false, false);
        const QString tip = locked ? tr("%1 (administrators only)").arg(text) : text;
        tool.action->setText(text);
        tool.button->setToolTip(tip);
        tool.button->setAccessibleName(tip);
    }
    m_settings->setToolTip(tr("Settings"));
    m_settings->setAccessibleName(tr("Settings"));
    if (m_editor->isVisible()) {
        fillList();
    }
}

void DeskBar::drawSigns()
{
    if (m_redrawing || !m_settings) {
        return;
    }
    // An icon that is set may bring a change of its own.
    m_redrawing = true;
    const qreal ratio = devicePixelRatioF();
    for (const Tool& tool : qAsConst(m_tools)) {
        Sign sign = tool.sign;
        if (tool.button == m_thumbnails && m_thumbnails->state() == 1) {
            sign = Sign::Views;
        } else if (tool.button == m_live && m_live->state() == 1) {
            sign = Sign::Recorded;
        } else if (tool.button == m_drop && !m_cameraOnline) {
            sign = Sign::Restore;
        }
        const bool locked = !tool.right.isEmpty() && m_session.isRightRefused(tool.right, true, false, false);
        tool.button->setIcon(signIcon(sign, palette(), ratio, locked));
        tool.button->setProperty("refused", locked);
    }
    m_settings->setIcon(signIcon(Sign::Settings, palette(), ratio));
    m_redrawing = false;
}

void DeskBar::redraw()
{
    retranslate();
    drawSigns();
}
}
