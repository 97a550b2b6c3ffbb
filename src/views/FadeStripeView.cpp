// SPDX-License-Identifier: MIT
// A panel at the edge of a view with a grab handle, a time line and rows of contents.
#include "views/FadeStripeView.h"

#include "CoreQt/Connect.h"
#include "sliders/MultiNubsieSlider.h"
#include "views/PanelGeometry.h"
#include "ZelkovUtils/ReloadStyleSheet.h"

#include <QtCore/QTimer>
#include <QtGui/QDropEvent>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QStackedLayout>
#include <QtWidgets/QVBoxLayout>

#include <limits>

namespace
{
constexpr int c_GrabWidth = 35;
constexpr int c_StripeBars = vx::PanelGeometry::c_Bars;
// Stands for the place of a press that moved: no pointer is there.
constexpr int c_Moved = std::numeric_limits<int>::max();

float relativePosition(const QMouseEvent* event, int width)
{
    return width == 0 ? 0.0F : static_cast<float>(event->localPos().x() / width);
}
}

FadeStripeView::FadeStripeView(EPositions position, QWidget* contents, QWidget* parent)
    : FadeView(position, contents, parent)
    , m_slider(new vx::MultiNubsieSlider(this, window()))
    , m_clickTimer(new QTimer(this))
{
    m_slider->setObjectName(QStringLiteral("fadeStripeNubsieSlider"));
    m_clickTimer->setSingleShot(true);
    m_clickTimer->setInterval(QApplication::doubleClickInterval());
    m_stripeMinimumHeight = c_Bordersize;
    init(contents);
}

FadeStripeView::~FadeStripeView() = default;

void FadeStripeView::init(QWidget* contents)
{
    m_header = new QWidget;
    m_footer = new QWidget;
    m_contents = contents != nullptr ? contents : new QWidget;
    m_contents->setObjectName(QStringLiteral("contentView"));
    m_contents->setMinimumHeight(0);
    m_contents->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Ignored);

    QWidget* const moving = m_position == ePositionTop ? m_footer : m_header;
    QWidget* const other = m_position == ePositionTop ? m_header : m_footer;
    moving->setFixedHeight(c_Bordersize);
    other->setMinimumHeight(0);
    other->setMaximumHeight(c_Bordersize);
    other->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::MinimumExpanding);
    addGrab(moving);

    auto* const layout = new QVBoxLayout(this);
    layout->setSpacing(0);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_header);
    layout->addWidget(m_contents);
    layout->addWidget(m_footer);
    setFixedHeight(c_Bordersize);

    vx::connect(m_clickTimer, "2timeout()", this, "1emitSingleClicked()", Qt::AutoConnection);
    vx::connect(this, "2geometryChanged(const QRect& )", m_slider, "1repaintNubsiesQueued()", Qt::AutoConnection);
    m_maximumHeight = m_position == ePositionTop ? m_parentHeight : m_parentHeight / 2;
    vx::connect(this, "2fadingIn(FadeView*)", m_contents, "1show()", Qt::AutoConnection);
    vx::connect(this, "2fadingOutFinished(FadeView*)", m_contents, "1hide()", Qt::AutoConnection);
}

void FadeStripeView::addGrab(QWidget* bar)
{
    auto* const stack = new QStackedLayout(bar);
    stack->setStackingMode(QStackedLayout::StackAll);
    auto* const page = new QWidget;
    auto* const layout = new QHBoxLayout(page);
    layout->setContentsMargins(0, 0, 0, 0);
    m_grab = new QWidget;
    m_grab->setMaximumWidth(c_GrabWidth);
    layout->addWidget(m_grab);
    stack->addWidget(page);
    stack->addWidget(m_slider);
    // The current page is the upper one: the handle shows through the slider.
    stack->setCurrentWidget(m_slider);
}

vx::MultiNubsieSlider* FadeStripeView::slider() const
{
    return m_slider;
}

void FadeStripeView::setContentsHeight(int height)
{
    m_contentsHeight = height;
    m_rowHeights = vx::PanelGeometry::rowHeights(height, m_maxRows);
    m_minimumSize = vx::PanelGeometry::rowHeights(height, 1).at(1);
}

void FadeStripeView::setRows(int rows)
{
    setSizeHint(m_rowHeights.value(rows), true);
}

int FadeStripeView::getRows() const
{
    return m_rows;
}

int FadeStripeView::snapToSize(int size) const
{
    const int row = vx::PanelGeometry::snapOfRequest(size, m_contentsHeight);
    return row < 0 ? size : m_rowHeights.value(row, c_Bordersize);
}

void FadeStripeView::distributeHeight()
{
    if (m_fadedIn && !m_fullscreen && !m_fullscreenTransition) {
        Q_EMIT sizeChanged(height() - c_StripeBars);
    }
}

void FadeStripeView::setMaximumHeight(int height)
{
    m_maximumHeight = height;
}

void FadeStripeView::setAcceptedMimeTypes(const QStringList& types)
{
    m_acceptedMimeTypes = types;
    setAcceptDrops(!m_acceptedMimeTypes.isEmpty());
}

void FadeStripeView::addAcceptedMimeType(const QString& type)
{
    if (!m_acceptedMimeTypes.contains(type)) {
        m_acceptedMimeTypes.append(type);
    }
    setAcceptDrops(!m_acceptedMimeTypes.isEmpty());
}

void FadeStripeView::removeAcceptedMimeType(const QString& type)
{
    m_acceptedMimeTypes.removeAll(type);
    setAcceptDrops(!m_acceptedMimeTypes.isEmpty());
}

QStringList FadeStripeView::acceptedMimeTypes() const
{
    return m_acceptedMimeTypes;
}

void FadeStripeView::setIgnoredSources(const QList<QObject*>& sources)
{
    m_ignoredSources.clear();
    for (QObject* const source : sources) {
        addIgnoredSource(source);
    }
}

void FadeStripeView::addIgnoredSource(QObject* source)
{
    if (source != nullptr && !m_ignoredSources.contains(source)) {
        m_ignoredSources.append(source);
    }
}

void FadeStripeView::removeIgnoredSource(QObject* source)
{
    m_ignoredSources.removeAll(source);
}

QList<QObject*> FadeStripeView::ignoredSources() const
{
    return m_ignoredSources;
}

void FadeStripeView::setStyleDefault()
{
    setStyle("header", "footer", "grab");
}

void FadeStripeView::setStyleRed()
{
    setStyle("header-red", "footer-red", "grab-red");
}

void FadeStripeView::setStyleGreen()
{
    setStyle("header-green", "footer-green", "grab-green");
}

void FadeStripeView::setStyleSolidGrey()
{
    setStyle("header-solid-grey", "footer-solid-grey", "grab");
}

void FadeStripeView::setStyleSolidBlue()
{
    setStyle("header-solid-blue", "footer-solid-blue", "grab");
}

void FadeStripeView::setStyle(const char* header, const char* footer, const char* grab)
{
    if (m_header->objectName() == QLatin1String(header)) {
        return;
    }
    updateStyle(m_header, QLatin1String(header));
    updateStyle(m_footer, QLatin1String(footer));
    updateStyle(m_grab, QLatin1String(grab));
}

void FadeStripeView::updateStyle(QWidget* widget, const QString& name)
{
    if (widget != nullptr && widget->objectName() != name) {
        vx::reloadStyleSheet(widget, name);
    }
}

void FadeStripeView::setSizeHint(int size, bool resizeNow)
{
    const QPointer<FadeStripeView> alive(this);
    const int height = qBound(m_stripeMinimumHeight, size, m_maximumHeight);
    if (resizeNow) {
        setFixedHeight(vx::PanelGeometry::widgetHeight(height));
    }
    if (!m_fullscreen && !m_fullscreenTransition) {
        Q_EMIT sizeChanged(height - c_StripeBars);
    }
    if (alive) {
        Q_EMIT heightChanged(height, m_position);
    }
    if (!alive) {
        return;
    }
    if (height > m_stripeMinimumHeight) {
        m_fadedIn = true;
        m_slider->show();
        m_grab->show();
        m_fadeInSize = height;
    } else {
        m_fadedIn = false;
        m_slider->hide();
        Q_EMIT fadingOutFinished(this);
    }
    if (alive) {
        FadeView::setSizeHint(height, resizeNow);
    }
}

void FadeStripeView::fadedIn()
{
    const QPointer<FadeStripeView> alive(this);
    m_slider->show();
    Q_EMIT heightChanged(m_fadeInSize, m_position);
    if (alive) {
        FadeView::fadedIn();
    }
}

void FadeStripeView::fadedOut()
{
    const QPointer<FadeStripeView> alive(this);
    m_slider->hide();
    Q_EMIT heightChanged(c_Bordersize, m_position);
    if (alive) {
        FadeView::fadedOut();
    }
}

void FadeStripeView::emitSingleClicked()
{
    if (!m_active) {
        Q_EMIT inactiveClicked();
    } else if (m_fullscreen) {
        exitFullscreen(true);
    } else if (m_fadedIn) {
        m_slider->hide();
        fadeout(true, false);
    } else {
        m_slider->show();
        fadein(true, false, -1);
    }
}

bool FadeStripeView::isOnMovingBar(const QPoint& position) const
{
    return (m_position == ePositionTop ? m_footer : m_header)->geometry().contains(position);
}

QRect FadeStripeView::grabRect() const
{
    return {m_grab->mapTo(const_cast<FadeStripeView*>(this), QPoint()), m_grab->size()};
}

void FadeStripeView::mousePressEvent(QMouseEvent* event)
{
    if (m_fullscreenTransition) {
        return;
    }
    m_pressPos = event->pos();
    // On top this is a pixel less than to the edge, so a drag costs a pixel: odd on purpose.
    m_dragOffset = m_position == ePositionTop ? rect().bottom() - event->y() : event->y() - rect().top();
    const QPointer<FadeStripeView> alive(this);
    if (m_header->geometry().contains(event->pos())) {
        Q_EMIT headerPressed(relativePosition(event, width()));
    } else if (m_footer->geometry().contains(event->pos())) {
        Q_EMIT footerPressed(relativePosition(event, width()));
    }
    if (alive && rect().contains(event->pos())) {
        if (isOnMovingBar(event->pos())) {
            m_dragging = true;
            setCursor(Qt::OpenHandCursor);
        }
        m_pressGlobalY = event->globalY();
    }
    event->accept();
}

void FadeStripeView::mouseMoveEvent(QMouseEvent* event)
{
    if (m_fullscreenTransition || !m_active) {
        return;
    }
    const QPointer<FadeStripeView> alive(this);
    if (m_dragging && !m_fullscreen) {
        dragTo(event);
    }
    // Any move, however small, spoils a click.
    if (alive) {
        m_pressPos = QPoint();
        m_pressGlobalY = c_Moved;
    }
    event->accept();
}

int FadeStripeView::draggedHeight(const QMouseEvent* event) const
{
    if (m_position == ePositionTop) {
        return event->y() + m_dragOffset;
    }
    const int parentHeight = parentWidget() != nullptr ? parentWidget()->height() : m_parentHeight;
    const double height
        = m_layoutVerticalOffset + (parentHeight - event->windowPos().y()) + m_dragOffset - m_neighbourOffset;
    return static_cast<int>(qBound(-1e9, height, 1e9));
}

void FadeStripeView::dragTo(const QMouseEvent* event)
{
    m_grab->show();
    const int dragged
        = vx::PanelGeometry::widgetHeight(qBound(m_stripeMinimumHeight, draggedHeight(event), m_maximumHeight));
    if (m_position == ePositionBottom && !m_partOfLayout) {
        const int parentHeight = parentWidget() != nullptr ? parentWidget()->height() : m_parentHeight;
        move(0, parentHeight - dragged - m_neighbourOffset);
    }
    setFixedHeight(dragged);

    const QPointer<FadeStripeView> alive(this);
    // The contents are never told of less than a row during a drag.
    Q_EMIT sizeChanged(qMax(height(), m_rowHeights.value(1)) - c_StripeBars);
    if (!alive) {
        return;
    }
    if (vx::PanelGeometry::isOpen(dragged) && !m_fadedIn) {
        m_fadedIn = true;
        Q_EMIT fadingIn(this);
    } else if (!vx::PanelGeometry::isOpen(dragged) && m_fadedIn) {
        m_fadedIn = false;
        Q_EMIT fadingOut(this);
    }
    if (!alive) {
        return;
    }
    m_slider->show();
    setCursor(Qt::ClosedHandCursor);
    emitGeometryChange();
}

void FadeStripeView::mouseReleaseEvent(QMouseEvent* event)
{
    if (m_fullscreenTransition) {
        return;
    }
    m_dragging = false;
    setCursor(Qt::ArrowCursor);
    const QPointer<FadeStripeView> alive(this);
    const bool samePlace = event->pos() == m_pressPos;
    const bool onGrab = grabRect().contains(event->pos());
    const bool wasDragged = m_pressGlobalY != event->globalY();
    if (onGrab && samePlace) {
        m_clickTimer->start();
    } else if (samePlace && m_header->geometry().contains(event->pos())) {
        if (m_fadedIn) {
            // The handle was ruled out above.
            Q_EMIT headerReleased(relativePosition(event, width()));
        } else if (m_active) {
            Q_EMIT headerReleasedFadedOut();
        } else {
            Q_EMIT inactiveClicked();
        }
    } else if (samePlace && m_footer->geometry().contains(event->pos())) {
        if (m_fadedIn) {
            Q_EMIT footerReleased(relativePosition(event, width()));
        } else if (m_active) {
            Q_EMIT footerReleasedFadedOut();
        } else {
            Q_EMIT inactiveClicked();
        }
    }
    if (alive && wasDragged) {
        snap();
    }
    event->accept();
}

void FadeStripeView::snap()
{
    const QPointer<FadeStripeView> alive(this);
    switch (vx::PanelGeometry::snapOfRelease(height(), m_contentsHeight)) {
    case 0:
        m_fadeInSize = m_rowHeights.value(0, c_Bordersize);
        fadeout(true, false);
        break;
    case 1:
        m_fadeInSize = m_rowHeights.value(1, c_Bordersize);
        fadein(true, false, -1);
        break;
    default:
        setSizeHint(height(), true);
        if (alive) {
            Q_EMIT fadingInFinished(this);
        }
        break;
    }
}

void FadeStripeView::mouseDoubleClickEvent(QMouseEvent* event)
{
    if (m_fullscreenTransition) {
        return;
    }
    m_clickTimer->stop();
    if (!m_fadedIn || isFullScreen() || !grabRect().contains(event->pos())) {
        return;
    }
    if (m_position == ePositionTop) {
        if (m_fullscreen) {
            exitFullscreen(true);
        } else {
            goFullscreen(true);
        }
    } else {
        setSizeHint(m_rowHeights.value(1), true);
    }
}

void FadeStripeView::resizeEvent(QResizeEvent* event)
{
    if (m_fullscreen && !m_fullscreenTransition && parentWidget() != nullptr) {
        setFixedHeight(parentWidget()->height());
    }
    FadeView::resizeEvent(event);
}

bool FadeStripeView::isMimeTypeAccepted(QDropEvent* event)
{
    if (event->source() != nullptr && m_ignoredSources.contains(event->source())) {
        return false;
    }
    const QMimeData* const mimeData = event->mimeData();
    for (const QString& type : qAsConst(m_acceptedMimeTypes)) {
        if (mimeData != nullptr && mimeData->hasFormat(type)) {
            return true;
        }
    }
    return false;
}

void FadeStripeView::dragEnterEvent(QDragEnterEvent* event)
{
    if (isMimeTypeAccepted(event)) {
        event->acceptProposedAction();
    } else {
        event->ignore();
    }
}

void FadeStripeView::dragMoveEvent(QDragMoveEvent* event)
{
    if (isMimeTypeAccepted(event)) {
        event->acceptProposedAction();
    } else {
        event->ignore();
    }
}

void FadeStripeView::dropEvent(QDropEvent* event)
{
    if (isMimeTypeAccepted(event)) {
        Q_EMIT dragAccepted(QPointer<QObject>(event->source()), *event->mimeData(), -1);
        event->acceptProposedAction();
    } else {
        event->ignore();
    }
}
