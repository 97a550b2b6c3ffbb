// SPDX-License-Identifier: MIT
// A rectangle over a view that the user moves and resizes.
#include "views/RubberBandWidget.h"

#include "CoreQt/Connect.h"
#include "input/GestureVerdicts.h"
#include "views/RubberBandGeometry.h"

#include <QtCore/QMetaType>
#include <QtCore/QPointer>
#include <QtGui/QMouseEvent>
#include <QtGui/QPainter>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>

namespace vx
{
namespace
{
constexpr QPoint c_NoDrag(-1, -1);
constexpr int c_CloseButtonSize = 16;
constexpr int c_BackgroundAlpha = 25;
constexpr int c_WidestPen = (1 << 15) - 1; // of Qt

// At load, so that a queued connection may name the type before any band exists.
[[maybe_unused]] const int s_rubberBandMetaType
    = qRegisterMetaType<vx::RubberBandWidget*>("vx::RubberBandWidget*");

static_assert(RubberBandWidget::gLeft == RubberBandGeometry::c_Left
        && RubberBandWidget::gRight == RubberBandGeometry::c_Right
        && RubberBandWidget::gTop == RubberBandGeometry::c_Top
        && RubberBandWidget::gBottom == RubberBandGeometry::c_Bottom
        && RubberBandWidget::gInside == RubberBandGeometry::c_Inside,
    "the plain functions speak of the same grips");
}

RubberBandWidget::RubberBandWidget(CoordinateSystem* coordinateSystem, QWidget* parent)
    : QWidget(parent)
    , m_coordinateSystem(coordinateSystem)
    , m_backgroundColor(0, 0, 0, c_BackgroundAlpha)
    , m_framePen(Qt::SolidLine)
    , m_label(new QLabel(this))
    , m_closeButton(new QPushButton(QStringLiteral("x"), this))
{
    m_framePen.setColor(Qt::black);
    setMouseTracking(true);
    setFocusPolicy(Qt::StrongFocus);
    setCursor(Qt::OpenHandCursor);
    setMinimumSize(1, 1);

    m_label->hide();
    m_closeButton->setFlat(true);
    m_closeButton->setMaximumSize(c_CloseButtonSize, c_CloseButtonSize);
    m_closeButton->setCursor(Qt::ArrowCursor);
    m_closeButton->setFocusPolicy(Qt::NoFocus);
    vx::connect(m_closeButton, "2clicked()", this, "1onClose()", Qt::AutoConnection);

    auto* const layout = new QGridLayout(this);
    layout->addWidget(m_label, 0, 0, Qt::AlignLeft | Qt::AlignTop);
    layout->addWidget(m_closeButton, 0, 1, Qt::AlignRight | Qt::AlignTop);
}

RubberBandWidget::~RubberBandWidget() = default;

void RubberBandWidget::setApplicationGeometry(const QRectF& rect, double ratio)
{
    m_applicationGeometry = rect;
    if (ratio != CoordinateSystem::IGNORE_ASPECT_RATIO) {
        m_aspectRatio = ratio;
    }
    showGeometry();
}

void RubberBandWidget::showGeometry()
{
    if (m_coordinateSystem != nullptr) {
        setContentsGeometry(m_coordinateSystem->mapToScreen(m_applicationGeometry));
    }
}

void RubberBandWidget::setAspectRatio(double ratio)
{
    m_aspectRatio = ratio;
}

void RubberBandWidget::setContentsGeometry(const QRect& rect)
{
    setGeometry(RubberBandGeometry::grown(rect, RubberBandGeometry::c_Margin));
}

void RubberBandWidget::setLabel(const QString& text)
{
    m_label->setText(text);
    m_label->setVisible(!text.isEmpty());
    m_label->setAutoFillBackground(false);
    m_label->setMouseTracking(false);
}

void RubberBandWidget::setFramePen(const QPen& pen)
{
    m_framePen = pen;
    update();
}

void RubberBandWidget::setFrameColor(const QColor& color)
{
    m_framePen.setColor(color);
    update();
}

void RubberBandWidget::setFrameStyle(Qt::PenStyle style)
{
    m_framePen.setStyle(style);
    update();
}

void RubberBandWidget::setFrameWidth(int width)
{
    m_framePen.setWidth(qBound(0, width, c_WidestPen));
    update();
}

void RubberBandWidget::setBackgroundColor(const QColor& color)
{
    m_backgroundColor = color;
    update();
}

void RubberBandWidget::setBackgroundTransparency(float transparency)
{
    // Written so that "not a number" counts as 0.
    const double alpha = static_cast<double>(transparency) * 255.0;
    m_backgroundColor.setAlpha(alpha >= 255.0 ? 255 : alpha > 0.0 ? static_cast<int>(alpha) : 0);
    update();
}

void RubberBandWidget::setColors(const QColor& color, float transparency)
{
    setFrameColor(color);
    setBackgroundColor(color);
    setBackgroundTransparency(transparency);
}

void RubberBandWidget::select(bool on)
{
    if (m_selected == on) {
        return;
    }
    m_selected = on;
    const QPointer<RubberBandWidget> alive(this);
    repaint();
    if (!alive) {
        return;
    }
    if (on) {
        Q_EMIT selected(this);
    } else {
        Q_EMIT selectionLost(this);
    }
}

void RubberBandWidget::setCoordinateSystem(CoordinateSystem* coordinateSystem)
{
    m_coordinateSystem = coordinateSystem;
    if (!m_applicationGeometry.isNull()) {
        showGeometry();
    }
}

void RubberBandWidget::drawFrame(QPainter* painter)
{
    QPen pen = m_framePen;
    if (m_selected) {
        pen.setWidthF(qMin<qreal>(pen.widthF() * 2.0, c_WidestPen));
    }
    const qreal half = pen.widthF() / 2.0;
    painter->setPen(pen);
    painter->setBrush(Qt::NoBrush);
    painter->drawRect(QRectF(frameRect()).adjusted(half, half, -half, -half));
}

void RubberBandWidget::drawContents(QPainter* painter)
{
    painter->fillRect(contentsRect(), m_backgroundColor);
}

void RubberBandWidget::startDragging(QPoint position, Grip grip)
{
    m_dragStart = position;
    m_grip = grip;
    m_dragStartGeometry = contentsGeometry();
    m_dragStartApplicationGeometry = m_applicationGeometry;
    raise();
    setCursor(getCursor(grip, true));
    Q_EMIT startDrag(this);
}

void RubberBandWidget::calcDrag(QRect& rect, QRectF& geometry, double ratio, const QPoint& position)
{
    if (m_coordinateSystem != nullptr) {
        RubberBandGeometry::drag(*m_coordinateSystem, m_grip, rect, geometry, ratio,
            GestureVerdicts::offset(m_dragStart, position), m_dragStartApplicationGeometry);
    }
}

void RubberBandWidget::onClose()
{
    Q_EMIT closeClicked(this);
}

QRectF RubberBandWidget::applicationGeometry() const
{
    return m_applicationGeometry;
}

bool RubberBandWidget::isSelected() const
{
    return m_selected;
}

bool RubberBandWidget::isResizeDragging() const
{
    return (m_grip & (gLeft | gRight | gTop | gBottom)) != 0;
}

QString RubberBandWidget::label() const
{
    return m_label->text();
}

QPen RubberBandWidget::framePen() const
{
    return m_framePen;
}

QRect RubberBandWidget::contentsRect() const
{
    return RubberBandGeometry::grown(rect(), -RubberBandGeometry::c_Margin);
}

QRect RubberBandWidget::frameRect() const
{
    return contentsRect();
}

QRect RubberBandWidget::contentsGeometry() const
{
    return RubberBandGeometry::grown(geometry(), -RubberBandGeometry::c_Margin);
}

RubberBandWidget::Grip RubberBandWidget::findGrip(const QPoint& point) const
{
    return findGrip(rect(), point, m_framePen.width() + RubberBandGeometry::c_Margin,
        RubberBandGeometry::c_EdgesMode | RubberBandGeometry::c_InsideMode);
}

RubberBandWidget::Grip RubberBandWidget::findGrip(const QRect& rect, const QPoint& point, int margin, int modes)
{
    return static_cast<Grip>(RubberBandGeometry::gripAt(rect, point, margin, modes));
}

RubberBandWidget::Grip RubberBandWidget::findGrip(const QPolygon& polygon, const QPoint& point)
{
    return static_cast<Grip>(RubberBandGeometry::gripAt(polygon, point));
}

QCursor RubberBandWidget::getCursor(Grip grip, bool dragging)
{
    return RubberBandGeometry::cursorFor(grip, dragging);
}

bool RubberBandWidget::event(QEvent* event)
{
    if (event->type() == QEvent::FocusIn) {
        // QWidget touches itself after the handler, when a slot may have deleted it.
        focusInEvent(static_cast<QFocusEvent*>(event));
        return true;
    }
    return QWidget::event(event);
}

void RubberBandWidget::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    drawContents(&painter);
    drawFrame(&painter);
}

void RubberBandWidget::mousePressEvent(QMouseEvent* event)
{
    startDragging(event->globalPos(), findGrip(event->pos()));
}

void RubberBandWidget::mouseMoveEvent(QMouseEvent* event)
{
    if (m_dragStart.x() < 0) {
        m_grip = findGrip(event->pos());
        setCursor(getCursor(m_grip, false));
        return;
    }
    // Measured from the press each time, so that rounding does not add up.
    QRect rect = m_dragStartGeometry;
    m_applicationGeometry = m_dragStartApplicationGeometry;
    double ratio = m_aspectRatio;
    if (ratio == CoordinateSystem::IGNORE_ASPECT_RATIO && event->modifiers().testFlag(Qt::ShiftModifier)) {
        ratio = CoordinateSystem::CALC_ASPECT_RATIO;
    }
    calcDrag(rect, m_applicationGeometry, ratio, event->globalPos());
    setContentsGeometry(rect);
    Q_EMIT dragging(this);
}

void RubberBandWidget::mouseReleaseEvent(QMouseEvent*)
{
    m_dragStart = c_NoDrag;
    m_grip = gNone;
    setCursor(Qt::OpenHandCursor);
    Q_EMIT endDrag(this);
}

void RubberBandWidget::enterEvent(QEvent*)
{
    Q_EMIT mouseEntered(this);
}

void RubberBandWidget::leaveEvent(QEvent*)
{
    m_grip = gNone;
    setCursor(Qt::OpenHandCursor);
    Q_EMIT mouseLeft(this);
}

void RubberBandWidget::focusInEvent(QFocusEvent*)
{
    raise();
    Q_EMIT focused(this);
}

void RubberBandWidget::focusOutEvent(QFocusEvent*)
{
    const QPointer<RubberBandWidget> alive(this);
    repaint();
    if (alive) {
        Q_EMIT focusLost(this);
    }
}
}
