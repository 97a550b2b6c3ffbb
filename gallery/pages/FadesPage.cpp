// SPDX-License-Identifier: MIT
// A card that fades in and out, and buttons that pulse and carry overlays and badges.
#include "FadesPage.h"

#include <QtCore/QTemporaryDir>
#include <QtGui/QPainter>
#include <QtGui/QPainterPath>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QFrame>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>

#include <array>
#include <memory>

#include "../Hand.h"
#include "foundation/FadableThing.h"
#include "foundation/TFadingWidget.h"

namespace gallery
{
namespace
{
constexpr int c_iconExtent = 40;

/// What fades. It has Q_OBJECT, as every subclass of FadableThing should: the style sheet finds it by its own name,
/// and Qt does not paint a background of its own below it.
class FadeCard : public FadableThing<QWidget>
{
    Q_OBJECT

public:
    explicit FadeCard(QWidget* parent)
        : FadableThing(parent)
    {
        setStyleSheet(QStringLiteral("gallery--FadeCard, FadeCard { background: #2c6ede; border-radius: 10px; }"
                                     "QLabel { color: white; background: transparent; border: none; }"));
    }

    /// While an effect does the fading, the card does not paint its look, so Qt has to.
    void setFadeChildren(bool on)
    {
        setAttribute(Qt::WA_StyledBackground, on);
        fader()->setFadeChildren(on);
    }
};

using Draw = void (*)(QPainter& painter);

void drawBell(QPainter& painter)
{
    QPainterPath bell(QPointF(50, 8));
    bell.cubicTo(76, 12, 74, 40, 76, 54);
    bell.cubicTo(78, 64, 86, 68, 88, 76);
    bell.lineTo(12, 76);
    bell.cubicTo(14, 68, 22, 64, 24, 54);
    bell.cubicTo(26, 40, 24, 12, 50, 8);
    painter.drawPath(bell);
    painter.drawPie(QRectF(38, 70, 24, 24), 180 * 16, 180 * 16);
}

void drawCamera(QPainter& painter)
{
    painter.drawRoundedRect(QRectF(6, 26, 60, 48), 10, 10);
    painter.drawPolygon(QPolygonF({{70, 46}, {94, 28}, {94, 72}, {70, 54}}));
}

void drawRecord(QPainter& painter)
{
    QPainterPath ring;
    ring.addEllipse(QPointF(50, 50), 44, 44);
    ring.addEllipse(QPointF(50, 50), 34, 34);
    painter.drawPath(ring);
    painter.drawEllipse(QPointF(50, 50), 22, 22);
}

void drawWarning(QPainter& painter)
{
    QPainterPath sign;
    sign.addPolygon(QPolygonF({{50, 8}, {96, 90}, {4, 90}, {50, 8}}));
    sign.addRoundedRect(QRectF(45, 36, 10, 28), 4, 4);
    sign.addEllipse(QPointF(50, 75), 6, 6);
    painter.drawPath(sign);
}

QPixmap picture(Draw draw, const QColor& color, int extent = c_iconExtent)
{
    QPixmap pixmap(extent, extent);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.scale(extent / 100.0, extent / 100.0);
    painter.setPen(Qt::NoPen);
    painter.setBrush(color);
    draw(painter);
    return pixmap;
}

vx::TFadingWidget<QToolButton>* toolButton(const QPixmap& icon, const QColor& tint, bool shadow = false)
{
    auto* button = new vx::TFadingWidget<QToolButton>(nullptr, 50, 16, tint, 0, 240, shadow);
    button->setIcon(icon);
    button->setIconSize(QSize(c_iconExtent, c_iconExtent));
    button->setFixedSize(66, 60);
    return button;
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

FadesPage::FadesPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
{
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setSpacing(12);
    grid->addWidget(makeFades(), 0, 0, 1, 2);
    grid->addWidget(makePulses(), 1, 0);
    grid->addWidget(makeExtras(), 1, 1);
    grid->setColumnStretch(0, 1);
    grid->setColumnStretch(1, 1);
    grid->setRowStretch(2, 1);
}

QWidget* FadesPage::makeFades()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Fade a whole widget"), "heading"));

    auto* stage = new QFrame;
    stage->setFixedHeight(130);
    auto* inside = new QHBoxLayout(stage);
    inside->setContentsMargins(0, 0, 0, 0);
    auto* card = new FadeCard(stage);
    card->setFixedSize(340, 112);
    auto* cardLayout = new QVBoxLayout(card);
    auto* text = new QLabel(tr("Recording resumes in a moment"));
    text->setAlignment(Qt::AlignCenter);
    cardLayout->addWidget(text);
    inside->addWidget(card, 0, Qt::AlignCenter);
    layout->addWidget(stage);

    m_fader = card->fader();
    card->setFadeChildren(true);
    m_fader->setOpacity(1.0);
    watch(m_fader, QStringLiteral("fader"), {QStringLiteral("valueChanged")});

    const auto opacity = std::make_shared<double>(1.0); // as last seen, whoever has it
    auto* gauge = label(tr("Opacity %1 %").arg(100), "hint");
    connect(m_fader, &QVariantAnimation::valueChanged, gauge, [gauge, opacity](const QVariant& value) {
        *opacity = value.toDouble();
        gauge->setText(tr("Opacity %1 %").arg(qRound(*opacity * 100)));
    });

    m_fadeIn = new QPushButton(tr("Fade in"));
    m_fadeIn->setProperty("role", QStringLiteral("primary"));
    auto* fadeOut = new QPushButton(tr("Fade out"));
    auto* children = new QCheckBox(tr("Fade what is inside as well"));
    children->setChecked(true);
    auto* hide = new QCheckBox(tr("Hide at the end"));
    hide->setChecked(true);
    auto* times = new QComboBox;
    times->addItem(tr("1 s, 0.35 s"));
    times->addItem(tr("0.2 s, 0.2 s"));
    times->addItem(tr("4 s, 4 s"));
    OpacityAnimation* const fader = m_fader;
    connect(m_fadeIn, &QPushButton::clicked, fader, [fader] { fader->fadeIn(); });
    connect(fadeOut, &QPushButton::clicked, fader, [fader] { fader->fadeOut(); });
    connect(hide, &QCheckBox::toggled, fader, [fader](bool on) { fader->setAutoHide(on); });
    connect(children, &QCheckBox::toggled, card, [fader, card, opacity](bool on) {
        // Between two fades only, and with the opacity that was last seen.
        fader->stop();
        card->setFadeChildren(on);
        fader->setOpacity(*opacity);
        card->update();
    });
    connect(times, QOverload<int>::of(&QComboBox::currentIndexChanged), fader, [fader](int index) {
        const std::array<std::pair<int, int>, 3> choices = {
            {{OpacityAnimation::s_FadeInTime, OpacityAnimation::s_FadeOutTime}, {200, 200}, {4000, 4000}}};
        if (index >= 0 && index < int(choices.size())) {
            fader->setFadingTimes(choices[std::size_t(index)].first, choices[std::size_t(index)].second);
        }
    });

    auto* row = new QHBoxLayout;
    row->setSpacing(8);
    row->addWidget(m_fadeIn);
    row->addWidget(fadeOut);
    row->addWidget(times);
    row->addSpacing(8);
    row->addWidget(children);
    row->addWidget(hide);
    row->addStretch(1);
    row->addWidget(gauge);
    layout->addLayout(row);
    return box;
}

QWidget* FadesPage::makePulses()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Pulse"), "heading"));
    layout->addWidget(label(tr("A press on a button ends its pulse."), "hint"));
    const QColor ink = palette().color(QPalette::WindowText);
    auto* buttons = new QHBoxLayout;
    buttons->setSpacing(10);
    const Draw draws[] = {drawBell, drawCamera, drawRecord, drawWarning};
    const QColor tints[] = {QColor(214, 140, 20), QColor(44, 110, 222), QColor(228, 52, 52), QColor(38, 170, 92)};
    for (int i = 0; i < 4; ++i) {
        auto* button = toolButton(picture(draws[i], ink), tints[i]);
        m_pulses << button;
        buttons->addWidget(button);
    }
    buttons->addStretch(1);
    layout->addLayout(buttons);

    auto* push = new vx::TFadingWidget<QPushButton>(nullptr, 50, 16, QColor(228, 52, 52), 0, 240, false);
    push->setIcon(picture(drawWarning, ink, 20));
    push->setIconSize(QSize(20, 20));
    push->setFixedSize(66, 36);
    m_pulses << push;

    m_start = new QPushButton(tr("Pulse"));
    m_start->setProperty("role", QStringLiteral("primary"));
    auto* once = new QPushButton(tr("Fall once"));
    auto* stop = new QPushButton(tr("Stop"));
    connect(m_start, &QPushButton::clicked, this, [this] {
        for (vx::FadingWidget* pulse : qAsConst(m_pulses)) {
            pulse->startFading();
        }
    });
    connect(once, &QPushButton::clicked, this, [this] {
        for (vx::FadingWidget* pulse : qAsConst(m_pulses)) {
            pulse->fadeOnce();
        }
    });
    connect(stop, &QPushButton::clicked, this, [this] {
        for (vx::FadingWidget* pulse : qAsConst(m_pulses)) {
            pulse->stopFading();
        }
    });
    auto* row = new QHBoxLayout;
    row->setSpacing(8);
    row->addWidget(push);
    row->addStretch(1);
    row->addWidget(m_start);
    row->addWidget(once);
    row->addWidget(stop);
    layout->addLayout(row);
    layout->addStretch(1);
    return box;
}

QWidget* FadesPage::makeExtras()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Overlay, badge, shadow"), "heading"));
    layout->addWidget(label(tr("Drawn on top of the button, with or without a pulse."), "hint"));
    const QColor ink = palette().color(QPalette::WindowText);

    auto* overlaid = toolButton(picture(drawCamera, ink), Qt::white);
    // Overlays come from files; an application has them among its pictures.
    const QTemporaryDir folder;
    const QString file = folder.filePath(QStringLiteral("warning.png"));
    if (picture(drawWarning, QColor(228, 52, 52), 22).save(file)) {
        overlaid->setOverlay(file, Qt::AlignAbsolute, QPoint(38, 34));
    }
    auto* counted = toolButton(picture(drawBell, ink), Qt::white);
    counted->badge().setBadgeSize(QSize(22, 22));
    counted->badge().setBadgeLabel(QStringLiteral("3"), false);
    auto* busy = toolButton(picture(drawRecord, ink), Qt::white);
    busy->badge().setBadgeSize(QSize(22, 22));
    busy->badge().setBusyColor1(QColor(44, 110, 222));
    busy->badge().setBusyColor2(QColor(44, 110, 222, 30));
    busy->badge().setBadgeBusy(true);
    auto* shaded = toolButton(picture(drawWarning, QColor(214, 140, 20)), Qt::white, true);

    auto* grid = new QGridLayout;
    grid->setHorizontalSpacing(10);
    grid->setVerticalSpacing(6);
    const std::array<std::pair<QWidget*, QString>, 4> cells = {{{overlaid, tr("overlay")},
                                                                {counted, tr("badge")},
                                                                {busy, tr("busy")},
                                                                {shaded, tr("shadow")}}};
    for (int i = 0; i < 4; ++i) {
        grid->addWidget(cells[std::size_t(i)].first, 0, i, Qt::AlignCenter);
        grid->addWidget(label(cells[std::size_t(i)].second, "hint"), 1, i, Qt::AlignCenter);
        grid->setColumnStretch(i, 1);
    }
    layout->addLayout(grid);
    layout->addStretch(1);
    return box;
}

void FadesPage::rehearse(Hand& hand)
{
    hand.click(m_start, m_start->rect().center()).wait(300);
    hand.call(this, [this] { m_fader->fadeOut(); }).wait(200);
    hand.click(m_fadeIn, m_fadeIn->rect().center()).wait(500);
}
}

#include "FadesPage.moc"
