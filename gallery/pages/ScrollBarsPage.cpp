// SPDX-License-Identifier: MIT
// Three areas over the same kind of picture, the middle one with bars to try.
#include "ScrollBarsPage.h"

#include <QtWidgets/QCheckBox>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>
#include <QtWidgets/QSlider>
#include <QtWidgets/QVBoxLayout>

#include "../cameras/Scene.h"
#include "../Hand.h"
#include "sliders/HSlider.h"
#include "sliders/JumpSlider.h"
#include "sliders/NicerScrollBar.h"

namespace gallery
{
namespace
{
const QStringList s_floodsOfBars
    = {QStringLiteral("nicerValueChanged"), QStringLiteral("valueChanged"), QStringLiteral("sliderMoved")};
}

ScrollBarsPage::ScrollBarsPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
{
    QScrollArea* plain = makeArea();
    QScrollArea* nicer = makeArea();
    m_across = new NicerScrollBar(nicer, Qt::Horizontal, NicerScrollBar::epAutomatic, nicer);
    m_down = new NicerScrollBar(nicer, Qt::Vertical, NicerScrollBar::epAutomatic, nicer);
    watch(m_across, QStringLiteral("across"), s_floodsOfBars);
    watch(m_down, QStringLiteral("down"), s_floodsOfBars);
    announcePlace(m_down, QStringLiteral("down"));
    QScrollArea* mirrored = makeArea();
    new NicerScrollBar(mirrored, Qt::Horizontal, NicerScrollBar::epTop, mirrored);
    new NicerScrollBar(mirrored, Qt::Vertical, NicerScrollBar::epLeft, mirrored);

    auto* areas = new QHBoxLayout;
    areas->setSpacing(12);
    areas->addWidget(makeColumn(tr("Plain bars"), tr("They take room from the content."), plain), 1);
    areas->addWidget(makeColumn(tr("Overlay bars"), tr("They float over it, and fade."), nicer), 1);
    areas->addWidget(makeColumn(tr("Top and left"), tr("The same on the other edges."), mirrored), 1);

    auto* below = new QHBoxLayout;
    below->setSpacing(12);
    below->addWidget(makeSliders(), 2);
    below->addWidget(makeSettings(), 1);

    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(12);
    layout->addLayout(areas, 1);
    layout->addLayout(below);
}

QScrollArea* ScrollBarsPage::makeArea()
{
    auto* picture = new QLabel;
    picture->setPixmap(Scene(0).ground(QSize(900, 620), devicePixelRatioF()));
    auto* area = new QScrollArea;
    area->setFrameShape(QFrame::NoFrame);
    area->setWidget(picture);
    area->setMinimumSize(150, 150);
    area->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Ignored);
    area->horizontalScrollBar()->setValue(200);
    area->verticalScrollBar()->setValue(160);
    return area;
}

QWidget* ScrollBarsPage::makeColumn(const QString& heading, const QString& hint, QScrollArea* area)
{
    QWidget* box = panel();
    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(16, 12, 16, 14);
    layout->setSpacing(8);
    layout->addWidget(label(heading, "heading"));
    layout->addWidget(label(hint, "hint"));
    layout->addWidget(area, 1);
    return box;
}

QWidget* ScrollBarsPage::makeSliders()
{
    QWidget* box = panel();
    auto* grid = new QGridLayout(box);
    grid->setContentsMargins(16, 12, 16, 14);
    grid->setHorizontalSpacing(16);
    grid->setVerticalSpacing(10);
    grid->addWidget(label(tr("A click on the groove"), "heading"), 0, 0, 1, 3);
    auto* paging = new vx::HSlider;
    auto* jumping = new vx::JumpSlider(Qt::Horizontal);
    QSlider* const sliders[] = {paging, jumping};
    const QString names[] = {tr("pages"), tr("jumps")};
    for (int i = 0; i < 2; ++i) {
        QSlider* slider = sliders[i];
        slider->setRange(0, 100);
        slider->setValue(35);
        auto* number = label(QStringLiteral("35"));
        number->setMinimumWidth(30);
        number->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
        connect(slider, &QSlider::valueChanged, number, [number](int value) { number->setNum(value); });
        grid->addWidget(label(names[i], "hint"), i + 1, 0);
        grid->addWidget(slider, i + 1, 1);
        grid->addWidget(number, i + 1, 2);
    }
    grid->setColumnStretch(1, 1);
    return box;
}

QWidget* ScrollBarsPage::makeSettings()
{
    QWidget* box = panel();
    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(16, 12, 16, 14);
    layout->setSpacing(10);
    layout->addWidget(label(tr("Overlay bars"), "heading"));
    auto* policy = new QComboBox;
    policy->addItem(tr("Shown as needed"), static_cast<int>(Qt::ScrollBarAsNeeded));
    policy->addItem(tr("Always shown"), static_cast<int>(Qt::ScrollBarAlwaysOn));
    policy->addItem(tr("Never shown"), static_cast<int>(Qt::ScrollBarAlwaysOff));
    auto* fading = new QCheckBox(tr("Fade after a while"));
    fading->setChecked(true);
    connect(
        policy, static_cast<void (QComboBox::*)(int)>(&QComboBox::currentIndexChanged), m_down, [this, policy] {
            const auto chosen = static_cast<Qt::ScrollBarPolicy>(policy->currentData().toInt());
            m_across->setScrollBarPolicy(chosen);
            m_down->setScrollBarPolicy(chosen);
        });
    connect(fading, &QCheckBox::toggled, m_down, [this](bool on) {
        m_across->setFadingEnabled(on);
        m_down->setFadingEnabled(on);
    });
    layout->addWidget(policy);
    layout->addWidget(fading);
    layout->addStretch(1);
    return box;
}

void ScrollBarsPage::rehearse(Hand& hand)
{
    const int x = m_down->width() / 2;
    const int y = m_down->height() * 2 / 5;
    hand.moveTo(m_down, QPoint(x, y)).press().glideTo(m_down, QPoint(x, y + 30), 300).release().wait(100);
}
}
