// SPDX-License-Identifier: MIT
// Each target opens a popover with what is chosen in the middle. Rows here are a small class of their own, as a
// client writes one.
#include "PopoversPage.h"

#include <functional>

#include <QtCore/QMimeData>
#include <QtGui/QDropEvent>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QVBoxLayout>

#include "../Hand.h"
#include "popover/Container.h"
#include "popover/Item.h"
#include "popover/Manager.h"

namespace gallery
{
namespace
{
using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::Item;
using vx::PopoverWidget::Manager;

const QString s_cameraFormat = QStringLiteral("application/x-gallery-camera");

class TextRow : public Item
{
public:
    TextRow(int id, const QString& text, const QString& note)
        : Item(nullptr,
            note.isEmpty() ? vx::PopoverWidget::eifText
                           : vx::PopoverWidget::eifText | vx::PopoverWidget::eifAdditionalText,
            id, QStringLiteral("popoverRow"), text, note)
    {
    }

protected:
    void mouseReleaseEvent(QMouseEvent* event) override
    {
        if (rect().contains(event->pos()) && event->button() == Qt::LeftButton) {
            Q_EMIT itemPerformed(id(), value(), userData(), getItemPerformedFlag(event->pos(), event->button()));
        }
    }
};

// A row that can be dragged and tells when the drag is over.
class DragRow : public TextRow
{
public:
    DragRow(int id, const QString& text, const std::function<void(bool)>& dragging)
        : TextRow(id, text, QString())
        , m_dragging(dragging)
    {
        setDragEnabled(true);
        setDragMimeType(s_cameraFormat);
        setUserData(text);
        setCursor(Qt::OpenHandCursor);
        connect(this, &Item::itemDragStarted, this, [this] {
            m_dragged = true;
            m_dragging(true);
        });
    }

protected:
    void mouseMoveEvent(QMouseEvent* event) override
    {
        const QPointer<DragRow> alive(this);
        TextRow::mouseMoveEvent(event); // a drag runs in here
        if (alive && m_dragged) {
            m_dragged = false;
            m_dragging(false);
        }
    }

private:
    std::function<void(bool)> m_dragging;
    bool m_dragged = false;
};

class DropLabel : public QLabel
{
public:
    DropLabel(const QString& text, const std::function<void(const QString&)>& dropped)
        : QLabel(text)
        , m_dropped(dropped)
    {
        setAcceptDrops(true);
        setMinimumSize(170, 64);
        setAlignment(Qt::AlignCenter);
        setProperty("role", QStringLiteral("hint"));
    }

protected:
    void dragEnterEvent(QDragEnterEvent* event) override
    {
        if (event->mimeData()->hasFormat(s_cameraFormat)) {
            event->acceptProposedAction();
        }
    }
    void dropEvent(QDropEvent* event) override
    {
        event->acceptProposedAction();
        m_dropped(QString::fromUtf8(event->mimeData()->data(s_cameraFormat)));
    }

private:
    std::function<void(const QString&)> m_dropped;
};

Container* makeRows(int count)
{
    auto* rows = new Container(nullptr, QStringLiteral("rows"), Qt::Vertical, Qt::AlignTop);
    rows->setLeftMargin(0);
    rows->setTopMargin(4);
    rows->setRightMargin(0);
    rows->setBottomMargin(0);
    for (int i = 0; i < count; ++i) {
        auto* row = new TextRow(i, PopoversPage::tr("Camera %1").arg(i + 1),
            i % 3 == 2 ? PopoversPage::tr("offline") : PopoversPage::tr("live"));
        rows->addItem(row, vx::PopoverWidget::ecfDismiss);
    }
    return rows;
}

// Where the targets stand, in thirds of the page's width and height.
constexpr int s_columns[] = {0, 1, 2, 3, 0, 3, 0, 3, 0, 1, 2, 3};
constexpr int s_lines[] = {0, 0, 0, 0, 1, 1, 2, 2, 3, 3, 3, 3};
}

PopoversPage::PopoversPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
{
    Manager::init(1000);

    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setSpacing(12);
    for (int i = 0; i < 12; ++i) {
        auto* target = new QPushButton(QString::number(i + 1));
        target->setFixedSize(26, 26); // so small that arrows in the corners are right-angled
        target->setStyleSheet(QStringLiteral("padding: 0; min-width: 24px; min-height: 24px;"));
        target->setObjectName(QStringLiteral("target%1").arg(i + 1));
        connect(target, &QPushButton::clicked, this,
            [this, target] { open(target, bitsOf(m_sides), bitsOf(m_features)); });
        const Qt::Alignment across = s_columns[i] == 0 ? Qt::AlignLeft
            : s_columns[i] == 3                        ? Qt::AlignRight
                                                       : Qt::AlignHCenter;
        const Qt::Alignment down = s_lines[i] == 0 ? Qt::AlignTop
            : s_lines[i] == 3                      ? Qt::AlignBottom
                                                   : Qt::AlignVCenter;
        grid->addWidget(target, s_lines[i], s_columns[i], across | down);
        m_targets << target;
    }
    auto* middle = new QHBoxLayout;
    middle->setSpacing(12);
    auto* right = new QVBoxLayout;
    right->setSpacing(12);
    right->addWidget(makeModal());
    right->addWidget(makeDragHelp(), 1);
    middle->addWidget(makeSettings(), 1);
    middle->addLayout(right, 1);
    grid->addLayout(middle, 1, 1, 2, 2);
    grid->setColumnStretch(1, 1);
    grid->setColumnStretch(2, 1);
    grid->setRowStretch(1, 1);
    grid->setRowStretch(2, 1);
}

PopoversPage::~PopoversPage()
{
    for (const QPointer<Controller>& controller : qAsConst(m_open)) {
        delete controller.data();
    }
}

QCheckBox* PopoversPage::makeBox(const QString& text, int bit, bool checked)
{
    auto* box = new QCheckBox(text);
    box->setProperty("bit", bit);
    box->setChecked(checked);
    return box;
}

int PopoversPage::bitsOf(const QVector<QCheckBox*>& boxes)
{
    int bits = 0;
    for (const QCheckBox* box : boxes) {
        bits |= box->isChecked() ? box->property("bit").toInt() : 0;
    }
    return bits;
}

QWidget* PopoversPage::makeSettings()
{
    QWidget* box = panel();
    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(16, 12, 16, 14);
    layout->setSpacing(6);
    layout->addWidget(label(tr("Sides of the arrow"), "heading"));
    m_sides = {makeBox(tr("Top: below the target"), Balloon::eadTop, true),
        makeBox(tr("Bottom: above the target"), Balloon::eadBottom, true),
        makeBox(tr("Left: right of the target"), Balloon::eadLeft, true),
        makeBox(tr("Right: left of the target"), Balloon::eadRight, true)};
    for (QCheckBox* side : qAsConst(m_sides)) {
        layout->addWidget(side);
    }
    layout->addSpacing(8);
    layout->addWidget(label(tr("Features"), "heading"));
    m_features = {makeBox(tr("Title"), Balloon::ebfTitle, true),
        makeBox(tr("Close button"), Balloon::ebfClose, true), makeBox(tr("Help button"), Balloon::ebfHelp, false),
        makeBox(tr("No title bar"), Balloon::ebfNoHeader, false)};
    for (QCheckBox* feature : qAsConst(m_features)) {
        layout->addWidget(feature);
    }
    layout->addSpacing(8);
    m_rows = new QComboBox;
    for (const int count : {3, 8, 60}) {
        m_rows->addItem(tr("%1 rows").arg(count), count);
    }
    layout->addWidget(m_rows);
    m_grow = new QCheckBox(tr("Grow from the middle"));
    layout->addWidget(m_grow);
    layout->addStretch(1);
    return box;
}

QWidget* PopoversPage::makeModal()
{
    QWidget* box = panel();
    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(16, 12, 16, 14);
    layout->setSpacing(8);
    layout->addWidget(label(tr("Modal"), "heading"));
    m_ask = new QPushButton(tr("Ask"));
    m_answer = label(tr("No answer yet"), "hint");
    connect(m_ask, &QPushButton::clicked, this, &PopoversPage::askModally);
    auto* line = new QHBoxLayout;
    line->setSpacing(10);
    line->addWidget(m_ask);
    line->addWidget(m_answer, 1);
    layout->addLayout(line);
    return box;
}

QWidget* PopoversPage::makeDragHelp()
{
    QWidget* box = panel();
    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(16, 12, 16, 14);
    layout->setSpacing(8);
    layout->addWidget(label(tr("Drag help"), "heading"));
    auto* hint = label(tr("Drag a camera: the popover that takes it comes up."), "hint");
    hint->setWordWrap(true);
    layout->addWidget(hint);
    for (int i = 0; i < 2; ++i) {
        layout->addWidget(new DragRow(i, tr("Camera %1").arg(i + 1), [this](bool dragging) {
            fillTray();
            if (dragging) {
                Manager::instance()->raiseControllersForMimeType(s_cameraFormat);
            } else {
                Manager::instance()->restoreControllersForMimeType(s_cameraFormat);
            }
        }));
    }
    m_dropped = label(tr("Nothing dropped yet"), "hint");
    layout->addWidget(m_dropped);
    layout->addStretch(1);
    return box;
}

QPointer<PopoversPage::Controller> PopoversPage::makePopover(QWidget* target, const QString& title, int sides)
{
    Manager* const manager = Manager::instance();
    QPointer<Controller> controller = manager->createController(manager->getUniquePopoverID(), false, false, this,
        target, title, QString(), Balloon::EArrowDirections(QFlag(sides)), QSizeF(), Balloon::ESizeConstraints());
    watch(controller, QStringLiteral("popover"), {QStringLiteral("layoutUpdated")});
    m_open << controller;
    return controller;
}

void PopoversPage::open(QWidget* target, int sides, int features)
{
    const QPointer<Controller> controller = makePopover(target, tr("Cameras"), sides);
    controller->setContainer(makeRows(m_rows->currentData().toInt()), Balloon::EBalloonFeatures(QFlag(features)));
    controller->setActive(true, m_grow->isChecked() ? Controller::epsGrow : Controller::epsBalloon, true);
}

void PopoversPage::askModally()
{
    const QPointer<PopoversPage> alive(this);
    const QPointer<Controller> controller = makePopover(m_ask, tr("Delete the recording?"), 15);
    auto* content = new Container(nullptr, QStringLiteral("question"), Qt::Vertical, Qt::AlignTop);
    auto* words = new QLabel(tr("Camera 3, today from 10:00 to 10:45"));
    words->setMargin(6);
    content->addWidgetItem(words, QStringLiteral("words"), 0);
    controller->setContainer(content, Balloon::ebfTitle);
    const int result = controller->exec(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    if (alive) {
        m_answer->setText(result == 1 ? tr("Accepted: 1") : tr("Rejected: 0"));
    }
}

void PopoversPage::fillTray()
{
    if (m_tray) {
        return;
    }
    m_tray = makePopover(m_dropped, tr("Favourites"), Balloon::eadTop | Balloon::eadBottom);
    m_tray->setPersistence(true);
    auto* content = new Container(nullptr, QStringLiteral("tray"), Qt::Vertical, Qt::AlignTop);
    content->addWidgetItem(
        new DropLabel(tr("Drop it here"),
            [this](const QString& camera) { m_dropped->setText(tr("Dropped: %1").arg(camera)); }),
        QStringLiteral("drop"), 0);
    m_tray->setContainer(content, Balloon::ebfTitle);
    Manager::instance()->registerAcceptedDropMimeType(
        Manager::instance()->getControllerID(m_tray), s_cameraFormat);
}

void PopoversPage::rehearse(Hand& hand)
{
    // One click like a user's, then more of them at once than a user could open.
    hand.click(m_targets.at(3), m_targets.at(3)->rect().center()).wait(150);
    hand.call(this, [this] {
        open(m_targets.at(2), Balloon::eadTop, Balloon::ebfNoHeader);
        open(m_targets.at(4), Balloon::eadLeft, Balloon::ebfTitle | Balloon::ebfClose | Balloon::ebfHelp);
        open(m_targets.at(7), Balloon::eadRight, Balloon::ebfTitle | Balloon::ebfClose);
        open(m_targets.at(9), Balloon::eadBottom, Balloon::ebfTitle | Balloon::ebfClose);
    });
    hand.wait(500);
}
}
