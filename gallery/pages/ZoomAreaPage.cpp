// SPDX-License-Identifier: MIT
// The area says how to zoom; the page scales the picture and keeps its centre.
#include "ZoomAreaPage.h"

#include <QtGui/QWheelEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollBar>
#include <QtWidgets/QVBoxLayout>

#include "../cameras/Scene.h"
#include "../Hand.h"
#include "views/ZoomScrollArea.h"

namespace gallery
{
namespace
{
const double s_step = 0.035;
const double s_smallest = 0.5;
const double s_largest = 4.0;
const QSize s_ground(1100, 720);
}

ZoomAreaPage::ZoomAreaPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
    , m_area(new ZoomScrollArea)
    , m_picture(new QLabel)
    , m_percent(label(QString()))
{
    m_ground = Scene(2).ground(s_ground, 1.0);
    m_picture->setScaledContents(true);
    m_picture->setPixmap(m_ground);
    m_area->setFrameShape(QFrame::NoFrame);
    m_area->setAlignment(Qt::AlignCenter);
    m_area->setWidget(m_picture);
    watch(
        m_area, QStringLiteral("area"), {QStringLiteral("updateZoomFactor"), QStringLiteral("scrollAreaChanged")});
    announcePlace(m_area, QStringLiteral("area"));
    connect(m_area, &ZoomScrollArea::updateZoomFactor, this, &ZoomAreaPage::zoomBy);

    auto* whole = new QPushButton(tr("Original size"));
    connect(whole, &QPushButton::clicked, this, [this] { setScale(1.0); });
    auto* bars = new QCheckBox(tr("Scroll bars"));
    bars->setChecked(true);
    connect(bars, &QCheckBox::toggled, m_area, &ZoomScrollArea::enableScrollbars);

    auto* row = new QHBoxLayout;
    row->setSpacing(8);
    row->addWidget(whole);
    row->addWidget(bars);
    row->addSpacing(8);
    row->addWidget(m_percent);
    row->addStretch(1);
    row->addWidget(label(tr("Turn the wheel over the picture; scroll with the bars."), "hint"));
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    layout->addWidget(m_area, 1);
    layout->addLayout(row);
    setScale(1.0);
}

void ZoomAreaPage::zoomBy(double factor)
{
    setScale(qBound(s_smallest, m_scale * (1.0 + s_step * factor), s_largest));
}

void ZoomAreaPage::setScale(double scale)
{
    const auto middleOf = [](const QScrollBar* bar) { return bar->value() + bar->pageStep() / 2.0; };
    const double change = scale / m_scale;
    const QPointF middle(
        middleOf(m_area->horizontalScrollBar()) * change, middleOf(m_area->verticalScrollBar()) * change);
    m_scale = scale;
    m_picture->resize(m_ground.size() * scale);
    m_area->horizontalScrollBar()->setValue(qRound(middle.x() - m_area->horizontalScrollBar()->pageStep() / 2.0));
    m_area->verticalScrollBar()->setValue(qRound(middle.y() - m_area->verticalScrollBar()->pageStep() / 2.0));
    m_percent->setText(tr("%1 %").arg(qRound(scale * 100)));
}

void ZoomAreaPage::rehearse(Hand& hand)
{
    m_area->horizontalScrollBar()->setValue(240);
    m_area->verticalScrollBar()->setValue(120);
    hand.moveTo(m_area->viewport(), m_area->viewport()->rect().center());
    hand.call(m_area, [this] {
        QWidget* viewport = m_area->viewport();
        const QPoint centre = viewport->rect().center();
        QWheelEvent wheel(centre, viewport->mapToGlobal(centre), QPoint(), QPoint(0, 120), Qt::NoButton,
            Qt::NoModifier, Qt::NoScrollPhase, false);
        QApplication::sendEvent(viewport, &wheel);
    });
    hand.wait(900);
}
}
