// SPDX-License-Identifier: MIT
// A panel at the edge of its parent that slides open from a thin strip.
#include "views/FadeView.h"

#include "CoreQt/Connect.h"
#include "views/PanelGeometry.h"

#include <QtCore/QMetaObject>
#include <QtCore/QPointer>
#include <QtCore/QPropertyAnimation>

static_assert(c_Bordersize == vx::PanelGeometry::c_Strip, "one strip");

/// One movement of a panel. All are animations of "geometry", so that Qt lets a later one take over from a former
/// one, but in a layout the geometry is not this class's to write: there the steps are only reported.
class FadeView::Movement : public QPropertyAnimation
{
public:
    Movement(FadeView* view, bool moves)
        : QPropertyAnimation(view, QByteArrayLiteral("geometry"))
        , m_moves(moves)
    {
        setDuration(c_Duration);
        // Without a parent it would live on.
        QObject::connect(view, &QObject::destroyed, this, &QAbstractAnimation::stop);
    }

protected:
    void updateCurrentValue(const QVariant& value) override
    {
        if (m_moves) {
            QPropertyAnimation::updateCurrentValue(value);
        }
    }

private:
    bool m_moves;
};

FadeView::FadeView(EPositions position, QWidget* widget, QWidget* parent)
    : QWidget(parent)
    , m_position(position)
    , m_parentHeight(parent != nullptr ? parent->height() : 0)
    , m_parentWidth(parent != nullptr ? parent->width() : 0)
{
    setAutoFillBackground(true);
    init(position, widget);
}

FadeView::~FadeView() = default;

void FadeView::init(EPositions, QWidget*)
{
}

vx::PanelGeometry::Surroundings FadeView::surroundings() const
{
    return {m_position, m_parentWidth, m_parentHeight, m_neighbourOffset, m_verticalOffset};
}

void FadeView::liftHeightLock()
{
    setFixedSize(QWIDGETSIZE_MAX, QWIDGETSIZE_MAX);
}

void FadeView::setOpenedSizeHint(int size)
{
    m_sizeHint = size;
    m_fadedIn = vx::PanelGeometry::isOpen(size);
}

bool FadeView::isActive() const
{
    return m_active;
}

void FadeView::setActive(bool active)
{
    m_active = active;
}

bool FadeView::isFadedIn() const
{
    return m_fadedIn;
}

bool FadeView::isFullscreen() const
{
    return m_fullscreen;
}

int FadeView::getSizeHint() const
{
    return m_sizeHint;
}

void FadeView::setSizeHint(int size, bool resizeNow)
{
    setOpenedSizeHint(size);
    if (resizeNow) {
        resize(-1, -1);
    }
}

void FadeView::setFadeStripeAsPartOfLayout(bool partOfLayout)
{
    m_partOfLayout = partOfLayout;
    updateNeighbourOffset();
}

void FadeView::setNeighbourSize(int size)
{
    m_neighbourSize = size;
    updateNeighbourOffset();
}

void FadeView::updateNeighbourOffset()
{
    m_neighbourOffset = vx::PanelGeometry::neighbourOffset(m_position, m_partOfLayout, m_neighbourSize);
    const QPointer<FadeView> alive(this);
    if (m_partOfLayout) {
        show();
    }
    if (alive) {
        resize(-1, -1);
    }
}

QRect FadeView::geometryOffsetFree() const
{
    return geometry();
}

void FadeView::resize(int width, int height)
{
    const QWidget* const parent = parentWidget();
    m_parentWidth = qMax(parent != nullptr ? parent->width() : 0, width);
    m_parentHeight = qMax(parent != nullptr ? parent->height() : 0, height);
    if (m_partOfLayout) {
        setFixedHeight(vx::PanelGeometry::widgetHeight(qMin(m_sizeHint, m_maximumHeight)));
    } else if (m_position == ePositionBottom) {
        setGeometry(vx::PanelGeometry::panelRect(surroundings(), m_sizeHint));
    } else if (m_position == ePositionTop) {
        if (m_fullscreen && !m_fullscreenTransition) {
            setOpenedSizeHint(m_parentHeight);
        }
        setGeometry(vx::PanelGeometry::panelRect(surroundings(), m_sizeHint));
        setFixedHeight(vx::PanelGeometry::widgetHeight(m_sizeHint));
    }
    Q_EMIT geometryChanged(geometry());
}

void FadeView::emitGeometryChange()
{
    Q_EMIT geometryChanged(geometry());
}

void FadeView::changeSize(const QVariant& value)
{
    const QRect rect = value.toRect();
    if (rect.isValid()) {
        setFixedHeight(vx::PanelGeometry::widgetHeight(rect.height()));
        Q_EMIT geometryChanged(geometry());
    }
}

void FadeView::fadein(bool animated, bool force, int size)
{
    if (!m_active) {
        return;
    }
    if (size > 0) {
        m_fadeInSize = size;
    }
    if (m_partOfLayout) {
        fadeinLayout(animated, force);
    } else {
        fadeinIndependent(animated, force);
    }
}

void FadeView::fadeinIndependent(bool animated, bool force)
{
    if (m_partOfLayout) {
        return;
    }
    setOpenedSizeHint(qMax(m_minimumSize, m_fadeInSize));
    liftHeightLock();
    if (!animated) {
        // A strip, and not a word of it: odd on purpose.
        setGeometry(vx::PanelGeometry::stillStripRect(surroundings()));
        return;
    }
    const QPointer<FadeView> alive(this);
    auto* const movement = new Movement(this, true);
    vx::connect(movement, "2valueChanged(const QVariant&)", this, "1emitGeometryChange()", Qt::AutoConnection);
    vx::connect(movement, "2finished()", this, "1fadedIn()", Qt::AutoConnection);
    movement->setStartValue(force ? vx::PanelGeometry::panelRect(surroundings(), c_Bordersize) : geometry());
    // This reports the start value already.
    movement->setEndValue(vx::PanelGeometry::panelRect(surroundings(), m_sizeHint));
    if (alive) {
        Q_EMIT fadingIn(this);
    }
    if (!alive) {
        delete movement;
        return;
    }
    movement->start(QAbstractAnimation::DeleteWhenStopped);
}

void FadeView::fadeinLayout(bool animated, bool)
{
    setOpenedSizeHint(qMax(m_minimumSize, m_fadeInSize));
    const QRect start = vx::PanelGeometry::panelRect(surroundings(), c_Bordersize);
    const QRect end = vx::PanelGeometry::panelRect(surroundings(), m_sizeHint);
    const QPointer<FadeView> alive(this);
    if (!animated) {
        Q_EMIT fadingIn(this);
        if (alive) {
            changeSize(end);
        }
        if (alive) {
            // By name, which finds the slot of a subclass first.
            QMetaObject::invokeMethod(this, "fadedIn", Qt::DirectConnection);
        }
        return;
    }
    auto* const movement = new Movement(this, false);
    vx::connect(
        movement, "2valueChanged(const QVariant&)", this, "1changeSize(const QVariant&)", Qt::AutoConnection);
    vx::connect(movement, "2finished()", this, "1fadedIn()", Qt::AutoConnection);
    movement->setStartValue(start);
    movement->setEndValue(end);
    if (alive) {
        Q_EMIT fadingIn(this);
    }
    if (!alive) {
        delete movement;
        return;
    }
    movement->start(QAbstractAnimation::DeleteWhenStopped);
}

void FadeView::fadedIn()
{
    const QPointer<FadeView> alive(this);
    Q_EMIT fadingInFinished(this);
    if (!alive) {
        return;
    }
    setOpenedSizeHint(height());
    resize(-1, -1);
    if (alive) {
        show();
    }
}

void FadeView::fadeout(bool animated, bool force)
{
    if (!m_active) {
        return;
    }
    if (m_partOfLayout) {
        fadeoutLayout(animated, force);
    } else {
        fadeoutIndependent(animated, force);
    }
}

void FadeView::fadeoutIndependent(bool animated, bool force)
{
    m_fadedIn = false;
    m_fadeInSize = m_sizeHint;
    if (m_partOfLayout) {
        m_sizeHint = c_Bordersize;
        resize(-1, -1);
        return;
    }
    liftHeightLock();
    if (!animated) {
        setGeometry(vx::PanelGeometry::stillStripRect(surroundings()));
        return;
    }
    const QPointer<FadeView> alive(this);
    auto* const movement = new Movement(this, true);
    vx::connect(movement, "2valueChanged(const QVariant&)", this, "1emitGeometryChange()", Qt::AutoConnection);
    vx::connect(movement, "2finished()", this, "1fadedOut()", Qt::AutoConnection);
    movement->setStartValue(force ? vx::PanelGeometry::panelRect(surroundings(), m_sizeHint) : geometry());
    movement->setEndValue(vx::PanelGeometry::panelRect(surroundings(), c_Bordersize));
    if (alive) {
        Q_EMIT fadingOut(this);
    }
    if (!alive) {
        delete movement;
        return;
    }
    movement->start(QAbstractAnimation::DeleteWhenStopped);
}

void FadeView::fadeoutLayout(bool animated, bool)
{
    m_fadedIn = false;
    const QRect start = vx::PanelGeometry::panelRect(surroundings(), m_sizeHint);
    const QRect end = vx::PanelGeometry::panelRect(surroundings(), c_Bordersize);
    const QPointer<FadeView> alive(this);
    if (!animated) {
        Q_EMIT fadingOut(this);
        if (alive) {
            changeSize(end);
        }
        if (alive) {
            Q_EMIT fadingOutFinished(this);
        }
        if (alive) {
            m_sizeHint = c_Bordersize;
            m_fadedIn = false;
            resize(-1, -1);
        }
        return;
    }
    auto* const movement = new Movement(this, false);
    vx::connect(
        movement, "2valueChanged(const QVariant&)", this, "1changeSize(const QVariant&)", Qt::AutoConnection);
    vx::connect(movement, "2finished()", this, "1fadedOut()", Qt::AutoConnection);
    movement->setStartValue(start);
    movement->setEndValue(end);
    if (alive) {
        Q_EMIT fadingOut(this);
    }
    if (!alive) {
        delete movement;
        return;
    }
    movement->start(QAbstractAnimation::DeleteWhenStopped);
}

void FadeView::fadedOut()
{
    const QPointer<FadeView> alive(this);
    Q_EMIT fadingOutFinished(this);
    if (!alive) {
        return;
    }
    m_sizeHint = c_Bordersize;
    m_fadedIn = false;
    resize(-1, -1);
}

void FadeView::goFullscreen(bool animated)
{
    m_preFullscreenSize = m_sizeHint;
    setOpenedSizeHint(parentWidget() != nullptr ? parentWidget()->height() : m_parentHeight);
    if (m_partOfLayout) {
        return;
    }
    m_fullscreenTransition = true;
    liftHeightLock();
    const QRect end = vx::PanelGeometry::fullRect(surroundings(), m_parentHeight);
    const QPointer<FadeView> alive(this);
    if (!animated) {
        // Does not enter the state proper: odd on purpose.
        setGeometry(end);
        Q_EMIT fullscreenAppeared();
        return;
    }
    // At the bottom edge there is nothing but the time it takes.
    const bool moves = m_position == ePositionTop;
    auto* const movement = new Movement(this, moves);
    if (moves) {
        vx::connect(movement, "2valueChanged(const QVariant&)", this, "1emitGeometryChange()", Qt::AutoConnection);
    }
    vx::connect(movement, "2finished()", this, "1fullscreenEntered()", Qt::AutoConnection);
    movement->setStartValue(geometry());
    movement->setEndValue(moves ? end : geometry());
    if (!alive) {
        delete movement;
        return;
    }
    movement->start(QAbstractAnimation::DeleteWhenStopped);
    if (alive) {
        Q_EMIT appearingFullscreen();
    }
    if (alive) {
        Q_EMIT changeViewOrientation(Qt::Vertical);
    }
}

void FadeView::fullscreenEntered()
{
    m_fullscreen = true;
    m_fullscreenTransition = false;
    Q_EMIT fullscreenAppeared();
}

void FadeView::exitFullscreen(bool animated)
{
    if (!m_fullscreen) {
        return;
    }
    if (m_partOfLayout) {
        m_sizeHint = c_Bordersize;
        m_fadedIn = false;
        resize(-1, -1);
        return;
    }
    setOpenedSizeHint(qMax(m_minimumSize, m_preFullscreenSize));
    m_fullscreenTransition = true;
    liftHeightLock();
    if (!animated) {
        setGeometry(vx::PanelGeometry::fullRect(surroundings(), c_Bordersize));
        if (m_position == ePositionTop) {
            m_fullscreen = false;
        }
        Q_EMIT fullscreenLeft();
        return;
    }
    const bool moves = m_position == ePositionTop;
    const QPointer<FadeView> alive(this);
    auto* const movement = new Movement(this, moves);
    if (moves) {
        vx::connect(movement, "2valueChanged(const QVariant&)", this, "1emitGeometryChange()", Qt::AutoConnection);
    }
    vx::connect(movement, "2finished()", this, "1fullscreenExited()", Qt::AutoConnection);
    movement->setStartValue(geometry());
    movement->setEndValue(moves ? vx::PanelGeometry::fullRect(surroundings(), m_preFullscreenSize) : geometry());
    if (!alive) {
        delete movement;
        return;
    }
    movement->start(QAbstractAnimation::DeleteWhenStopped);
    if (alive) {
        Q_EMIT leavingFullscreen();
    }
}

void FadeView::fullscreenExited()
{
    const QPointer<FadeView> alive(this);
    Q_EMIT changeViewOrientation(Qt::Horizontal);
    if (!alive) {
        return;
    }
    m_fullscreen = false;
    m_fullscreenTransition = false;
    Q_EMIT fullscreenLeft();
}

void FadeView::setVerticalOffset(int offset)
{
    if (m_partOfLayout) {
        m_layoutVerticalOffset = offset;
    } else {
        m_verticalOffset = offset;
    }
}

void FadeView::showEvent(QShowEvent*)
{
    Q_EMIT geometryChanged(geometry());
}
