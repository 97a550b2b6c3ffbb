// SPDX-License-Identifier: MIT
#include "MarkingTool.h"

#include "views/RubberBandWidget.h"

#include <QtCore/QEvent>
#include <QtGui/QMouseEvent>

namespace client
{
namespace
{
const QRectF s_camera(0, 0, 1920, 1080);
const QRectF s_middle(640, 360, 640, 360);
const QColor s_color(255, 193, 77); // over a picture: the same in every theme
constexpr int s_smallest = 6;
}

MarkingTool::MarkingTool(QObject* parent)
    : QObject(parent)
    , m_picture(s_camera, nullptr)
{
}

MarkingTool::~MarkingTool()
{
    dropBand();
}

void MarkingTool::workIn(QWidget* view)
{
    if (view == m_view) {
        return;
    }
    dropBand();
    if (m_view) {
        m_view->removeEventFilter(this);
        m_view->unsetCursor();
    }
    m_view = view;
    m_picture.setWidget(view);
    if (view) {
        view->installEventFilter(this);
        view->setCursor(Qt::CrossCursor);
        makeBand(s_middle);
    }
}

void MarkingTool::retranslate()
{
    if (m_band) {
        m_band->setLabel(tr("Region"));
    }
}

void MarkingTool::makeBand(const QRectF& region)
{
    auto* const band = new vx::RubberBandWidget(&m_picture, m_view);
    m_band = band;
    band->setObjectName(QStringLiteral("markedRegion"));
    band->setColors(s_color, 0.2F);
    band->setFrameWidth(2);
    band->setApplicationGeometry(region);
    retranslate();
    connect(band, &vx::RubberBandWidget::endDrag, this, &MarkingTool::finishDrag);
    connect(band, &vx::RubberBandWidget::closeClicked, this, &MarkingTool::dropBand);
    band->show();
}

void MarkingTool::dropBand()
{
    if (m_band) {
        m_band->disconnect(this);
        if (m_draws) {
            m_band->releaseMouse();
        }
        m_band->hide();
        m_band->setCoordinateSystem(nullptr);
        m_band->deleteLater(); // it may be in its own signal
        m_band = nullptr;
    }
    m_draws = false;
}

void MarkingTool::finishDrag()
{
    const bool isNew = m_draws;
    m_draws = false;
    if (isNew) {
        m_band->releaseMouse();
        const QSize size = m_band->contentsRect().size();
        if (size.width() < s_smallest || size.height() < s_smallest) {
            dropBand(); // merely a click
            return;
        }
    }
    const QRectF region = m_band->applicationGeometry().normalized().intersected(s_camera);
    m_band->setApplicationGeometry(region);
    Q_EMIT marked(region);
}

bool MarkingTool::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() == QEvent::Resize && m_band) {
        m_band->setApplicationGeometry(m_band->applicationGeometry());
    } else if (event->type() == QEvent::MouseButtonPress) {
        const auto* const press = static_cast<QMouseEvent*>(event);
        if (press->button() == Qt::LeftButton && m_view && m_view->width() > 0 && m_view->height() > 0) {
            dropBand();
            const QPointF pixel(s_camera.width() / m_view->width(), s_camera.height() / m_view->height());
            makeBand(QRectF(press->x() * pixel.x(), press->y() * pixel.y(), pixel.x(), pixel.y()));
            m_draws = true;
            m_band->grabMouse();
            m_band->startDragging(press->globalPos(), vx::RubberBandWidget::gBottomRight);
            return true;
        }
    }
    return QObject::eventFilter(watched, event);
}
}
