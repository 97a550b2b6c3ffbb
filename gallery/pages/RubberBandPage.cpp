// SPDX-License-Identifier: MIT
// Bands over a camera. The coordinate system maps the camera's own pixels to those of the view.
#include "RubberBandPage.h"

#include <QtCore/QDateTime>
#include <QtCore/QEvent>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QFormLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QVBoxLayout>

#include "../cameras/CameraTile.h"
#include "../Hand.h"
#include "views/RubberBandWidget.h"

namespace gallery
{
namespace
{
const int s_frameMillis = 40;
const QRectF s_camera(0, 0, 1920, 1080);
const QRgb s_colors[] = {0xff4fb3ff, 0xffffc14d, 0xff6ddc8b, 0xffff7d7d};
}

RubberBandPage::RubberBandPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
    , m_camera(new CameraTile(tr("Container yard"), 2, nullptr))
    , m_picture(s_camera, m_camera)
{
    m_camera->setMinimumHeight(300);
    m_camera->installEventFilter(this);

    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(16);
    layout->addWidget(m_camera, 1);
    layout->addWidget(makeSettings());

    vx::RubberBandWidget* gate = addBand(QRectF(300, 330, 520, 420));
    gate->setLabel(tr("Gate"));
    announcePlace(gate, QStringLiteral("band"));
    addBand(QRectF(1080, 200, 480, 300))->setLabel(tr("Crane"));
    select(gate);

    m_frames.setInterval(s_frameMillis);
    connect(
        &m_frames, &QTimer::timeout, m_camera, [this] { m_camera->advance(QDateTime::currentMSecsSinceEpoch()); });
}

QWidget* RubberBandPage::makeSettings()
{
    QWidget* box = panel();
    box->setFixedWidth(250);
    auto* form = new QFormLayout;
    form->setHorizontalSpacing(12);
    form->setVerticalSpacing(6);
    const QString names[] = {tr("Left"), tr("Top"), tr("Width"), tr("Height")};
    for (int i = 0; i < 4; ++i) {
        m_numbers[i] = label(QString());
        m_numbers[i]->setAlignment(Qt::AlignRight);
        m_numbers[i]->setMinimumWidth(60);
        form->addRow(names[i], m_numbers[i]);
    }
    m_wide = new QCheckBox(tr("Keep 16 : 9"));
    connect(m_wide, &QCheckBox::toggled, this, [this](bool on) {
        for (const auto& band : m_bands) {
            if (band) {
                band->setAspectRatio(on ? 16.0 / 9.0 : vx::CoordinateSystem::IGNORE_ASPECT_RATIO);
            }
        }
    });
    auto* add = new QPushButton(tr("New region"));
    connect(add, &QPushButton::clicked, this, [this] { select(addBand(QRectF(760, 420, 400, 240))); });
    auto* hint = label(tr("Drag edges, corners or the inside. Shift keeps the proportions."), "hint");
    hint->setWordWrap(true);

    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(16, 14, 16, 16);
    layout->setSpacing(12);
    layout->addWidget(label(tr("Pixels of the camera"), "heading"));
    layout->addLayout(form);
    layout->addWidget(m_wide);
    layout->addWidget(add);
    layout->addWidget(hint);
    layout->addStretch(1);
    return box;
}

vx::RubberBandWidget* RubberBandPage::addBand(const QRectF& region)
{
    auto* band = new vx::RubberBandWidget(&m_picture, m_camera);
    const QColor color(s_colors[m_count % 4]);
    ++m_count;
    band->setObjectName(QStringLiteral("region%1").arg(m_count));
    band->setLabel(tr("Region %1").arg(m_count));
    band->setColors(color, 0.2F);
    band->setFrameWidth(2);
    if (m_wide->isChecked()) {
        band->setAspectRatio(16.0 / 9.0);
    }
    band->setApplicationGeometry(region);
    m_bands.append(band);
    watch(band, band->objectName(), {QStringLiteral("dragging")});
    connect(band, &vx::RubberBandWidget::startDrag, this, &RubberBandPage::select);
    connect(band, &vx::RubberBandWidget::dragging, this, &RubberBandPage::showState);
    connect(band, &vx::RubberBandWidget::closeClicked, band, &QObject::deleteLater);
    connect(band, &QObject::destroyed, this, &RubberBandPage::showState);
    band->show();
    return band;
}

void RubberBandPage::select(vx::RubberBandWidget* chosen)
{
    m_selected = chosen;
    for (const auto& band : m_bands) {
        if (band) {
            band->select(band == chosen);
        }
    }
    showState();
}

void RubberBandPage::showState()
{
    const QRect region = m_selected ? m_selected->applicationGeometry().toRect() : QRect();
    const int numbers[] = {region.x(), region.y(), region.width(), region.height()};
    for (int i = 0; i < 4; ++i) {
        m_numbers[i]->setText(m_selected ? QString::number(numbers[i]) : QStringLiteral("–"));
    }
}

bool RubberBandPage::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() == QEvent::Resize) {
        // After the camera has taken its size.
        QTimer::singleShot(0, this, [this] {
            m_camera->advance(QDateTime::currentMSecsSinceEpoch());
            for (const auto& band : m_bands) {
                if (band) {
                    band->setApplicationGeometry(band->applicationGeometry());
                }
            }
        });
    }
    return Page::eventFilter(object, event);
}

void RubberBandPage::showEvent(QShowEvent* event)
{
    m_frames.start();
    Page::showEvent(event);
}

void RubberBandPage::hideEvent(QHideEvent* event)
{
    m_frames.stop();
    Page::hideEvent(event);
}

void RubberBandPage::rehearse(Hand& hand)
{
    vx::RubberBandWidget* band = m_bands.first();
    const QPoint corner = band->contentsRect().bottomRight();
    hand.moveTo(band, corner).press();
    hand.glideTo(m_camera, band->geometry().topLeft() + corner + QPoint(40, 30), 300).wait(40).release().wait(60);
}
}
