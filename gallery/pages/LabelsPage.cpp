// SPDX-License-Identifier: MIT
// Texts on the left side of a splitter that is dragged to see them shorten, and pictures in three shapes.
#include "LabelsPage.h"

#include <QtCore/QVariant>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QSplitter>
#include <QtWidgets/QSplitterHandle>
#include <QtWidgets/QVBoxLayout>

#include "../cameras/Scene.h"
#include "../Hand.h"
#include "indicators/ElidedButton.h"
#include "indicators/ElidedLabel.h"
#include "indicators/Label.h"

namespace gallery
{
namespace
{
QVBoxLayout* column(QWidget* panel, QLabel* heading)
{
    auto* layout = new QVBoxLayout(panel);
    layout->setContentsMargins(16, 12, 16, 14);
    layout->setSpacing(10);
    layout->addWidget(heading);
    return layout;
}

vx::ElidedLabel* elided(const QString& text, Qt::TextElideMode mode)
{
    auto* label = new vx::ElidedLabel(text);
    label->setElideMode(mode);
    // Its size hint is that of the whole text.
    label->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
    return label;
}
}

LabelsPage::LabelsPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
{
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(12);
    layout->addWidget(makeTexts());
    layout->addWidget(makePictures(), 1);
}

QWidget* LabelsPage::makeTexts()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Texts"), "heading"));
    layout->addWidget(label(tr("Drag the bar between the two sides."), "hint"));

    const QString text = tr("The camera in the main entrance of building 4 does not answer any more");
    auto* texts = new QWidget;
    auto* grid = new QGridLayout(texts);
    grid->setContentsMargins(0, 0, 12, 0);
    grid->setHorizontalSpacing(14);
    grid->setVerticalSpacing(10);
    grid->setColumnStretch(1, 1);
    int row = 0;
    const auto add = [&](const QString& name, QWidget* widget, Qt::Alignment alignment = Qt::AlignVCenter) {
        grid->addWidget(label(name, "hint"), row, 0, Qt::AlignLeft | alignment);
        grid->addWidget(widget, row++, 1);
    };
    add(tr("Cut at the end"), elided(text, Qt::ElideRight));
    add(tr("In the middle"), elided(text, Qt::ElideMiddle));
    add(tr("At the start"), elided(text, Qt::ElideLeft));
    auto* wrapped = elided(
        tr("Wrapped, with one word too long: site_west_building_4_main_entrance_camera_17_2026_04_01.mkv"),
        Qt::ElideMiddle);
    wrapped->setWordWrap(true);
    wrapped->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    wrapped->setFixedHeight(wrapped->fontMetrics().lineSpacing() * 3);
    add(tr("Word wrap"), wrapped, Qt::AlignTop);
    auto* button = new ElidedButton(tr("Connect the camera in the main entrance of building 4"));
    button->setElideMode(Qt::ElideRight);
    button->setMinimumWidth(60);
    button->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
    watch(button, QStringLiteral("button"));
    add(tr("Button"), button);

    auto* whole = new QWidget;
    auto* beside = new QVBoxLayout(whole);
    beside->setContentsMargins(12, 0, 0, 0);
    auto* note = label(tr("The text itself stays whole, in tool tips and for the program: %1").arg(text), "hint");
    note->setWordWrap(true);
    note->setMinimumWidth(120);
    note->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    beside->addWidget(note);

    m_texts = new QSplitter(Qt::Horizontal);
    m_texts->addWidget(texts);
    m_texts->addWidget(whole);
    m_texts->setChildrenCollapsible(false);
    m_texts->setHandleWidth(7);
    m_texts->setStretchFactor(0, 3);
    m_texts->setStretchFactor(1, 2);
    m_texts->setSizes({420, 280});
    m_texts->setProperty("role", QStringLiteral("grip"));
    layout->addWidget(m_texts);
    return box;
}

QWidget* LabelsPage::makePictures()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Pictures"), "heading"));
    auto* keep = new QCheckBox(tr("Keep the proportions"));
    keep->setChecked(true);
    const QPixmap picture = Scene(2).ground(QSize(640, 360), devicePixelRatioF());
    auto* row = new QHBoxLayout;
    row->setSpacing(14);
    const int stretches[] = {1, 3, 5};
    for (const int stretch : stretches) {
        auto* shown = new vx::Label;
        shown->setScaledContents(true);
        shown->setPixmap(picture);
        shown->setMinimumSize(40, 80);
        shown->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Ignored);
        connect(keep, &QCheckBox::toggled, shown, &vx::Label::setKeepAspectRatio);
        row->addWidget(shown, stretch);
    }
    layout->addLayout(row, 1);
    layout->addWidget(keep);
    return box;
}

void LabelsPage::rehearse(Hand& hand)
{
    QWidget* grip = m_texts->handle(1);
    hand.moveTo(grip, grip->rect().center()).press();
    hand.glideTo(m_texts, QPoint(m_texts->width() * 45 / 100, m_texts->height() / 2), 300).release();
    hand.wait(100);
}
}
