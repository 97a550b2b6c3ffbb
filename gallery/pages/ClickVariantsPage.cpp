// SPDX-License-Identifier: MIT
// A row of buttons and a card that says what the last click was; two buttons that ask for rights.
#include "ClickVariantsPage.h"

#include <QtGui/QPainter>
#include <QtGui/QPainterPath>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>

#include <memory>

#include "../Hand.h"
#include "input/CustomClickQWidget.h"
#include "input/CustomContextClickToolButton.h"
#include "ZelkovUtils/ISecurityManager.h"

namespace gallery
{
namespace
{
constexpr int c_iconExtent = 40;
using Adapter = vx::CustomClickAdapter;

/// What an application has: it knows the present user. Mind that the two queries answer in opposite senses.
class Rights : public vx::ISecurityManager
{
public:
    bool mayExport = false;
    bool isAdmin = false;

    bool isRightRefused(const QString&, bool, bool, bool) override { return !mayExport; }
    bool isAdministrator(bool, bool) override { return isAdmin; }
};

/// A widget that is clicked without being a button.
class Tile : public vx::CustomClickQWidget
{
public:
    explicit Tile(const QString& text)
        : vx::CustomClickQWidget(nullptr)
        , m_text(text)
    {
        setFixedHeight(56);
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QPainter painter(this);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setPen(Qt::NoPen);
        painter.setBrush(QColor(44, 110, 222));
        painter.drawRoundedRect(rect(), 8, 8);
        painter.setPen(Qt::white);
        painter.drawText(rect(), Qt::AlignCenter, m_text);
    }

private:
    QString m_text;
};

using Draw = void (*)(QPainter& painter);

void drawCamera(QPainter& painter)
{
    painter.drawRoundedRect(QRectF(6, 26, 60, 48), 10, 10);
    painter.drawPolygon(QPolygonF({{70, 46}, {94, 28}, {94, 72}, {70, 54}}));
}

void drawLamp(QPainter& painter)
{
    QPainterPath lamp;
    lamp.addEllipse(QPointF(50, 40), 32, 32);
    lamp.addRoundedRect(QRectF(36, 68, 28, 22), 6, 6);
    painter.drawPath(lamp.simplified());
}

void drawRecord(QPainter& painter)
{
    QPainterPath ring;
    ring.addEllipse(QPointF(50, 50), 44, 44);
    ring.addEllipse(QPointF(50, 50), 34, 34);
    painter.drawPath(ring);
    painter.drawEllipse(QPointF(50, 50), 22, 22);
}

void drawExport(QPainter& painter)
{
    painter.drawPolygon(QPolygonF({{50, 6}, {78, 36}, {60, 36}, {60, 64}, {40, 64}, {40, 36}, {22, 36}}));
    painter.drawPolygon(
        QPolygonF({{10, 58}, {22, 58}, {22, 82}, {78, 82}, {78, 58}, {90, 58}, {90, 94}, {10, 94}}));
}

void drawLock(QPainter& painter)
{
    QPainterPath bow;
    bow.moveTo(32, 50);
    bow.lineTo(32, 30);
    bow.arcTo(QRectF(32, 12, 36, 36), 180, -180);
    bow.lineTo(68, 50);
    QPainterPathStroker stroker;
    stroker.setWidth(9);
    painter.drawPath(stroker.createStroke(bow));
    painter.drawRoundedRect(QRectF(20, 44, 60, 46), 8, 8);
}

QPixmap picture(Draw draw, const QColor& color)
{
    QPixmap pixmap(c_iconExtent, c_iconExtent);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.scale(c_iconExtent / 100.0, c_iconExtent / 100.0);
    painter.setPen(Qt::NoPen);
    painter.setBrush(color);
    draw(painter);
    return pixmap;
}

QVBoxLayout* column(QWidget* panel, QLabel* heading)
{
    auto* layout = new QVBoxLayout(panel);
    layout->setContentsMargins(16, 12, 16, 14);
    layout->setSpacing(10);
    layout->addWidget(heading);
    return layout;
}

template <class Button> Button* furnish(Button* button, const QPixmap& icon)
{
    button->setIcon(icon);
    button->setIconSize(QSize(c_iconExtent, c_iconExtent));
    button->setFixedSize(66, 60);
    return button;
}
}

ClickVariantsPage::ClickVariantsPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
{
    QWidget* card = panel();
    QVBoxLayout* inCard = column(card, label(tr("The last click"), "hint"));
    inCard->setSpacing(4);
    m_kind = label(tr("None yet"), "title");
    m_kind->setObjectName(QStringLiteral("kind"));
    m_hint = label(tr("Click, hold or right click one of the buttons."), "hint");
    inCard->addWidget(m_kind);
    inCard->addWidget(m_hint);

    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setSpacing(12);
    grid->addWidget(card, 0, 0, 1, 2);
    grid->addWidget(makeKinds(), 1, 0, 1, 2);
    grid->addWidget(makeRights(), 2, 0);
    grid->addWidget(makePlain(), 2, 1);
    grid->setColumnStretch(0, 1);
    grid->setColumnStretch(1, 1);
    grid->setRowStretch(3, 1);
}

ClickVariantsPage::~ClickVariantsPage()
{
    Adapter::setSecurityManager(nullptr);
}

void ClickVariantsPage::show(Button* button)
{
    switch (button->getClickType()) {
    case Adapter::ectLong:
        m_kind->setText(tr("Long click"));
        m_hint->setText(button->autoClick() ? tr("The button clicked by itself, the mouse still down.")
                                            : tr("The button clicked on the release."));
        break;
    case Adapter::ectContext:
        m_kind->setText(tr("Context click"));
        m_hint->setText(tr("A right click is a click of its own kind and opens no menu."));
        break;
    case Adapter::ectArrow:
        m_kind->setText(tr("Click on the arrow"));
        m_hint->setText(tr("The slot opens what it wants."));
        break;
    default:
        m_kind->setText(tr("Normal click"));
        m_hint->setText(tr("Hold the button longer, or use the other mouse button."));
    }
}

QWidget* ClickVariantsPage::cell(Button* button, const QString& text, const QString& hint)
{
    connect(button, &QToolButton::clicked, this, [this, button] { show(button); });
    auto* result = new QWidget;
    auto* layout = new QVBoxLayout(result);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(4);
    layout->addWidget(button, 0, Qt::AlignHCenter);
    auto* name = label(text);
    name->setAlignment(Qt::AlignHCenter);
    layout->addWidget(name);
    auto* explained = label(hint, "hint");
    explained->setAlignment(Qt::AlignHCenter | Qt::AlignTop);
    explained->setWordWrap(true);
    layout->addWidget(explained, 1);
    return result;
}

QWidget* ClickVariantsPage::makeKinds()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Kinds of clicks"), "heading"));
    const QColor ink = palette().color(QPalette::WindowText);
    const int span = Adapter::s_DefaultLongClickSpan;

    m_hold = furnish(new Button(nullptr, span, false), picture(drawCamera, ink));
    watch(m_hold, QStringLiteral("hold"));
    announcePlace(m_hold, QStringLiteral("hold"));
    auto* manual = furnish(new Button(nullptr, span, false), picture(drawRecord, QColor(228, 52, 52)));
    manual->setAutoClick(false);
    watch(manual, QStringLiteral("manual"));
    auto* light = furnish(new Button(nullptr, span, false), picture(drawLamp, QColor(214, 140, 20)));
    light->setCheckable(true);
    watch(light, QStringLiteral("light"));
    auto* split = furnish(new vx::CustomContextClickToolButton(nullptr, span, false), picture(drawExport, ink));
    split->setPopupMode(QToolButton::MenuButtonPopup);
    split->setFixedSize(88, 60);
    watch(split, QStringLiteral("split"));
    announcePlace(split, QStringLiteral("split"));

    auto* row = new QHBoxLayout;
    row->setSpacing(16);
    row->addWidget(cell(m_hold, tr("Hold"), tr("Clicks by itself after 750 ms.")), 1);
    row->addWidget(cell(manual, tr("Hold and release"), tr("Without automatic clicks.")), 1);
    row->addWidget(cell(light, tr("Checkable"), tr("Held, it reports its state and keeps it.")), 1);
    row->addWidget(cell(split, tr("Split"), tr("The arrow is a click of its own.")), 1);
    layout->addLayout(row);
    return box;
}

QWidget* ClickVariantsPage::makeRights()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Rights"), "heading"));
    const QColor ink = palette().color(QPalette::WindowText);
    const auto rights = std::make_shared<Rights>();
    Adapter::setSecurityManager(rights);

    m_guarded = furnish(new Button(nullptr, Adapter::s_DefaultLongClickSpan, false), picture(drawExport, ink));
    m_guarded->setSecurityCheck(QStringLiteral("export"));
    watch(m_guarded, QStringLiteral("export"));
    auto* admin = furnish(new Button(nullptr, Adapter::s_DefaultLongClickSpan, false), picture(drawLock, ink));
    admin->setAdminOnly(true);
    watch(admin, QStringLiteral("admin"));
    auto* row = new QHBoxLayout;
    row->setSpacing(16);
    row->addWidget(cell(m_guarded, tr("Export"), tr("Needs the right to export.")), 1);
    row->addWidget(cell(admin, tr("Settings"), tr("For administrators.")), 1);
    layout->addLayout(row);

    m_allowed = new QCheckBox(tr("The user may export"));
    auto* isAdmin = new QCheckBox(tr("The user is an administrator"));
    connect(m_allowed, &QCheckBox::toggled, this, [rights](bool on) { rights->mayExport = on; });
    connect(isAdmin, &QCheckBox::toggled, this, [rights](bool on) { rights->isAdmin = on; });
    layout->addWidget(m_allowed);
    layout->addWidget(isAdmin);
    layout->addStretch(1);
    return box;
}

QWidget* ClickVariantsPage::makePlain()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("A widget to click"), "heading"));
    auto* tile = new Tile(tr("Click me with any button"));
    watch(tile, QStringLiteral("tile"));
    connect(tile, QOverload<bool>::of(&vx::CustomClickQWidget::clicked), this, [this] {
        m_kind->setText(tr("Click on a widget"));
        m_hint->setText(tr("It has the signals of a button and is none."));
    });
    layout->addWidget(tile);
    auto* hint = label(tr("pressed, clicked and released, with every mouse button."), "hint");
    hint->setWordWrap(true);
    layout->addWidget(hint);
    layout->addStretch(1);
    return box;
}

void ClickVariantsPage::rehearse(Hand& hand)
{
    // Refused at first, so the card keeps what it says.
    hand.click(m_guarded, m_guarded->rect().center()).wait(100);
    hand.click(m_allowed, QPoint(8, m_allowed->height() / 2)).wait(100);
    hand.click(m_guarded, m_guarded->rect().center()).wait(100);
    hand.moveTo(m_hold, m_hold->rect().center()).press().wait(900).release();
}
}
