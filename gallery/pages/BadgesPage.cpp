// SPDX-License-Identifier: MIT
// Panels of badges, and one badge to try.
#include "BadgesPage.h"

#include <QtWidgets/QFrame>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>

#include "../Hand.h"
#include "indicators/BadgeWidget.h"

namespace gallery
{
namespace
{
const QColor s_green(38, 150, 92);
const QColor s_amber(214, 140, 20);
const QColor s_blue(44, 110, 222);
const QColor s_grey(110, 122, 140);

vx::BadgeWidget* spinner(int look, int size, const QColor& first, const QColor& second)
{
    auto* badge = new vx::BadgeWidget(nullptr);
    badge->setAlignment(Qt::AlignCenter);
    badge->setFixedSize(size, size);
    badge->setBusyBadgeType(look);
    badge->setBadgeSize(QSize(size, size));
    badge->setBusyColor1(first);
    badge->setBusyColor2(second);
    badge->setBadgeBusy(true);
    return badge;
}

vx::BadgeWidget* pill(const QString& text, int size, const QColor& background = QColor(), bool stroke = false,
                      bool crossed = false)
{
    auto* badge = new vx::BadgeWidget(nullptr);
    badge->setAlignment(Qt::AlignCenter);
    badge->setBadgeSize(QSize(size, size));
    badge->setBadgeStroke(stroke);
    if (background.isValid()) {
        badge->setBadgeBackground(background);
    }
    badge->badge().setBadgeLabel(text, crossed);
    badge->setFixedSize(badge->sizeHint());
    return badge;
}

QVBoxLayout* column(QWidget* panel, QLabel* heading)
{
    auto* layout = new QVBoxLayout(panel);
    layout->setContentsMargins(16, 12, 16, 14);
    layout->setSpacing(10);
    layout->addWidget(heading);
    return layout;
}
}

BadgesPage::BadgesPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
{
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setSpacing(12);
    grid->addWidget(makeLooks(), 0, 0, 1, 2);
    grid->addWidget(makePills(), 1, 0, 1, 2);
    grid->addWidget(makeRows(), 0, 2);
    grid->addWidget(makeAlignments(), 1, 2);
    grid->addWidget(makeTry(), 2, 0, 1, 3);
    grid->setColumnStretch(0, 1);
    grid->setColumnStretch(1, 1);
    grid->setColumnStretch(2, 1);
    grid->setRowStretch(3, 1);
}

QWidget* BadgesPage::makeLooks()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Busy marks"), "heading"));
    auto* grid = new QGridLayout;
    grid->setHorizontalSpacing(18);
    grid->setVerticalSpacing(4);
    const QString names[] = {tr("Arc"), tr("Ring"), tr("Dots"), tr("Spokes")};
    const int sizes[] = {16, 24, 32, 40};
    for (int i = 0; i < 4; ++i) {
        grid->addWidget(label(tr("%1 px").arg(sizes[i]), "hint"), 0, i + 1, Qt::AlignCenter);
    }
    grid->addWidget(label(tr("Colours"), "hint"), 0, 5, Qt::AlignCenter);
    const QColor text = palette().color(QPalette::WindowText);
    QColor clear = text;
    clear.setAlpha(20);
    for (int look = 0; look < 4; ++look) {
        grid->addWidget(label(names[look]), look + 1, 0);
        int place = 1;
        for (const int size : sizes) {
            grid->addWidget(spinner(look, size, text, clear), look + 1, place++, Qt::AlignCenter);
        }
        // Frames are cached by the brightness of the colours, so no two of these share it.
        const QColor colors[] = {s_blue, s_green, s_amber, s_grey};
        QColor end = colors[look];
        end.setAlpha(20);
        grid->addWidget(spinner(look, 32, colors[look], end), look + 1, place, Qt::AlignCenter);
        grid->setRowMinimumHeight(look + 1, 42);
    }
    for (int i = 0; i < 6; ++i) {
        grid->setColumnStretch(i, 1);
    }
    layout->addLayout(grid);
    return box;
}

QWidget* BadgesPage::makePills()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Pills"), "heading"));
    // Pills are made to lie on a picture, so they get a dark ground in every theme.
    auto* ground = new QFrame;
    ground->setObjectName(QStringLiteral("pillGround"));
    ground->setStyleSheet(QStringLiteral("#pillGround { background: #2b3646; border-radius: 6px; border: none; }"
                                         "#pillGround QLabel { color: #d5dce6; }"));
    auto* grid = new QGridLayout(ground);
    grid->setContentsMargins(14, 10, 14, 10);
    grid->setHorizontalSpacing(12);
    grid->setVerticalSpacing(8);
    struct Line
    {
        QString name;
        bool stroke;
        bool crossed;
    };
    const Line lines[] = {
        {tr("Plain"), false, false}, {tr("Stroke"), true, false}, {tr("Crossed"), false, true},
    };
    for (int row = 0; row < 3; ++row) {
        const Line& line = lines[row];
        grid->addWidget(label(line.name), row, 0);
        grid->addWidget(pill(QString(), 26, QColor(), line.stroke, line.crossed), row, 1, Qt::AlignCenter);
        grid->addWidget(pill(QStringLiteral("3"), 26, QColor(), line.stroke, line.crossed), row, 2, Qt::AlignCenter);
        grid->addWidget(pill(QStringLiteral("42"), 26, s_blue, line.stroke, line.crossed), row, 3, Qt::AlignCenter);
        grid->addWidget(pill(QStringLiteral("128"), 26, s_green, line.stroke, line.crossed), row, 4, Qt::AlignCenter);
        grid->addWidget(pill(tr("new"), 26, s_amber, line.stroke, line.crossed), row, 5, Qt::AlignCenter);
    }
    for (int i = 0; i < 6; ++i) {
        grid->setColumnStretch(i, 1);
    }
    layout->addWidget(ground, 1);
    return box;
}

QWidget* BadgesPage::makeRows()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("In rows"), "heading"));
    layout->setSpacing(15);
    const QColor text = palette().color(QPalette::WindowText);
    QColor clear = text;
    clear.setAlpha(20);
    vx::BadgeWidget* const badges[] = {spinner(vx::BadgeDrawer::ebbtSpokes, 18, text, clear),
                                       pill(QStringLiteral("12"), 20), pill(tr("live"), 20, s_green),
                                       pill(tr("off"), 20, s_grey), spinner(vx::BadgeDrawer::ebbtDots, 18, text, clear)};
    const QString names[] = {tr("Searching for cameras"), tr("Unread alarms"), tr("Main street"), tr("Car park"),
                             tr("Export is running")};
    for (int i = 0; i < 5; ++i) {
        auto* row = new QHBoxLayout;
        row->addWidget(label(names[i]));
        row->addStretch(1);
        row->addWidget(badges[i]);
        layout->addLayout(row);
    }
    layout->addStretch(1);
    return box;
}

QWidget* BadgesPage::makeAlignments()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Alignment"), "heading"));
    auto* grid = new QGridLayout;
    grid->setSpacing(6);
    const Qt::Alignment across[] = {Qt::AlignLeft, Qt::AlignHCenter, Qt::AlignRight};
    const Qt::Alignment down[] = {Qt::AlignTop, Qt::AlignVCenter, Qt::AlignBottom};
    for (int i = 0; i < 9; ++i) {
        auto* frame = new QFrame;
        frame->setFrameShape(QFrame::StyledPanel);
        frame->setProperty("role", QStringLiteral("panel"));
        auto* inside = new QHBoxLayout(frame);
        inside->setContentsMargins(4, 4, 4, 4);
        auto* badge = new vx::BadgeWidget(nullptr);
        badge->setAlignment(across[i % 3] | down[i / 3]);
        badge->setBadgeSize(QSize(16, 16));
        badge->setBadgeLabel(QString::number(i + 1));
        badge->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
        inside->addWidget(badge);
        frame->setMinimumHeight(38);
        grid->addWidget(frame, i / 3, i % 3);
    }
    layout->addLayout(grid, 1);
    return box;
}

QWidget* BadgesPage::makeTry()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Try it"), "heading"));
    m_badge = new vx::BadgeWidget(nullptr);
    m_badge->setAlignment(Qt::AlignCenter);
    m_badge->setBadgeSize(QSize(36, 36));
    m_badge->setFixedSize(100, 40);
    const QColor text = palette().color(QPalette::WindowText);
    QColor clear = text;
    clear.setAlpha(20);
    m_badge->setBusyColor1(text);
    m_badge->setBusyColor2(clear);
    m_badge->setBadgeLabel(QStringLiteral("7"));
    watch(&m_badge->badge(), QStringLiteral("badge"), {QStringLiteral("pixmapChanged")});

    auto* field = new QLineEdit(QStringLiteral("7"));
    field->setMaxLength(8);
    field->setFixedWidth(110);
    auto* set = new QPushButton(tr("Set the label"));
    auto* cross = new QPushButton(tr("Set it crossed"));
    auto* busy = new QPushButton(tr("Busy"));
    auto* idle = new QPushButton(tr("Not busy"));
    auto* none = new QPushButton(tr("No badge"));
    busy->setProperty("role", QStringLiteral("primary"));
    m_busyButton = busy;
    connect(set, &QPushButton::clicked, m_badge, [this, field] { m_badge->setBadgeLabel(field->text()); });
    connect(cross, &QPushButton::clicked, m_badge, [this, field] { m_badge->badge().setBadgeLabel(field->text(), true); });
    connect(busy, &QPushButton::clicked, m_badge, [this] { m_badge->setBadgeBusy(true); });
    connect(idle, &QPushButton::clicked, m_badge, [this] { m_badge->setBadgeBusy(false); });
    connect(none, &QPushButton::clicked, m_badge, [this] { m_badge->badge().unsetBadgeLabel(); });

    auto* row = new QHBoxLayout;
    row->setSpacing(8);
    row->addWidget(m_badge);
    row->addSpacing(8);
    row->addWidget(field);
    row->addWidget(set);
    row->addWidget(cross);
    row->addStretch(1);
    row->addWidget(busy);
    row->addWidget(idle);
    row->addWidget(none);
    layout->addLayout(row);
    return box;
}

void BadgesPage::rehearse(Hand& hand)
{
    hand.click(m_busyButton, m_busyButton->rect().center()).wait(400);
}
}
