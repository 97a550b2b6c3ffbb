// SPDX-License-Identifier: MIT
// A slim scroll bar that floats over the content of a scroll area.
#include "sliders/NicerScrollBar.h"

#include "CoreQt/Connect.h"
#include "sliders/SliderGeometry.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QTimer>
#include <QtGui/QMouseEvent>
#include <QtGui/QPalette>
#include <QtGui/QWheelEvent>
#include <QtWidgets/QAbstractScrollArea>

namespace
{
// From this maximum of the real bar on there is something worth scrolling.
constexpr int c_LowestScrollableMaximum = 2;

QString handleSheet(Qt::Orientation orientation, bool faded)
{
    if (orientation == Qt::Horizontal) {
        return faded ? QStringLiteral("QScrollBar::handle:horizontal { background: transparent; }")
                     : QStringLiteral("QScrollBar::handle:horizontal { background: rgb(140,140,140,170); }");
    }
    return faded ? QStringLiteral("QScrollBar::handle:vertical { background: transparent; }")
                 : QStringLiteral("QScrollBar::handle:vertical { background: rgb(140,140,140,170); }");
}

QWheelEvent wheelEventFor(const QWidget* target, const QWheelEvent& event)
{
#if QT_VERSION >= QT_VERSION_CHECK(5, 14, 0)
    const QPointF global = event.globalPosition();
#else
    const QPointF global = event.globalPosF();
#endif
    QWheelEvent result(target->mapFromGlobal(global.toPoint()), global, event.pixelDelta(), event.angleDelta(),
        event.buttons(), event.modifiers(), event.phase(), event.inverted(), event.source());
    result.setTimestamp(event.timestamp());
    return result;
}
}

const QString NicerScrollBar::s_HorizontalNicerScrollBar = QStringLiteral("HorizontalNicerScrollBar");
const QString NicerScrollBar::s_HorizontalNicerScrollBarInvisible
    = QStringLiteral("HorizontalNicerScrollBarInvisible");
const QString NicerScrollBar::s_VerticalNicerScrollBar = QStringLiteral("VerticalNicerScrollBar");
const QString NicerScrollBar::s_VerticalNicerScrollBarInvisible
    = QStringLiteral("VerticalNicerScrollBarInvisible");

NicerScrollBar::NicerScrollBar(QWidget* parent)
    : QScrollBar(parent)
{
}

NicerScrollBar::NicerScrollBar(
    QAbstractScrollArea* scrollArea, Qt::Orientation orientation, EPositions position, QWidget* parent)
    : QScrollBar(parent)
    , m_position(position)
    , m_scrollArea(scrollArea)
    , m_orientation(orientation)
{
    if (m_position == epAutomatic) {
        m_position = orientation == Qt::Horizontal ? epBottom : epRight;
    }
    init();
}

NicerScrollBar::~NicerScrollBar() = default;

void NicerScrollBar::init()
{
    const bool horizontal = m_orientation == Qt::Horizontal;
    setOrientation(m_orientation);
    setObjectName(horizontal ? s_HorizontalNicerScrollBar : s_VerticalNicerScrollBar);
    if (!m_scrollArea) {
        return;
    }

    if (horizontal) {
        m_realBar = m_scrollArea->horizontalScrollBar();
        m_scrollArea->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    } else {
        m_realBar = m_scrollArea->verticalScrollBar();
        m_scrollArea->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    }
    setRange(m_realBar->minimum(), m_realBar->maximum());
    setPageStep(m_realBar->pageStep());
    setValue(m_realBar->value());

    // Queued, so that the two bars never re-enter each other within one event.
    vx::connect(m_realBar, "2valueChanged(int)", this, "1setNicerValue(int)", Qt::QueuedConnection);
    vx::connect(m_realBar, "2rangeChanged(int,int)", this, "1setNicerRange(int,int)", Qt::QueuedConnection);
    vx::connect(this, "2valueChanged(int)", this, "1nicerValueChange(int)", Qt::QueuedConnection);
    vx::connect(this, "2nicerValueChanged(int)", m_realBar, "1setValue(int)", Qt::QueuedConnection);

    QPalette seeThrough;
    seeThrough.setColor(QPalette::Light, QColor(0, 0, 0, 0));
    setPalette(seeThrough);

    m_fadeTimer = new QTimer(this);
    m_fadeTimer->setSingleShot(true);
    m_fadeTimer->setInterval(m_fadeDelay);
    vx::connect(m_fadeTimer, "2timeout()", this, "1fadeBar()", Qt::QueuedConnection);

    if (parentWidget() != nullptr) {
        parentWidget()->installEventFilter(this);
    }
    raise();
    resizeBar();

    m_scrollBarPolicy = Qt::ScrollBarAsNeeded;
    showScrollbar();
    setContextMenuPolicy(Qt::NoContextMenu);
    // A pointer that merely passes over a faded bar shows it.
    setMouseTracking(true);
}

void NicerScrollBar::resizeBar()
{
    if (m_scrollArea) {
        const bool leading = m_position == (m_orientation == Qt::Horizontal ? epTop : epLeft);
        setGeometry(vx::SliderGeometry::overlayBarRect(m_orientation, leading, m_scrollArea->size(), m_thickness));
    }
}

void NicerScrollBar::showBar()
{
    if (m_faded) {
        setStyleSheet(handleSheet(m_orientation, false));
        m_faded = false;
    }
    if (m_fadingEnabled && m_fadeTimer != nullptr) {
        m_fadeTimer->start();
    }
    raise();
}

void NicerScrollBar::fadeBar()
{
    if (!m_fadingEnabled) {
        return;
    }
    if (!m_faded) {
        setStyleSheet(handleSheet(m_orientation, true));
    }
    m_faded = true;
}

void NicerScrollBar::setFadingEnabled(bool enabled)
{
    m_fadingEnabled = enabled;
    if (m_fadeTimer == nullptr) {
        return;
    }
    if (enabled) {
        m_fadeTimer->stop();
        showScrollbar();
        showBar();
    } else {
        // Not the other way round: the timer runs out into nothing, and a faded bar stays faded until the next
        // showBar(). Clients rely on it.
        m_fadeTimer->start();
    }
}

void NicerScrollBar::setScrollBarPolicy(Qt::ScrollBarPolicy policy)
{
    m_scrollBarPolicy = policy;
    showScrollbar();
}

void NicerScrollBar::showScrollbar()
{
    if (m_fadeTimer == nullptr) {
        return;
    }
    if (m_fadingEnabled) {
        m_fadeTimer->start();
    }
    switch (m_scrollBarPolicy) {
    case Qt::ScrollBarAlwaysOn:
        show();
        break;
    case Qt::ScrollBarAlwaysOff:
        hide();
        break;
    case Qt::ScrollBarAsNeeded:
        setVisible(m_realBar && m_realBar->maximum() >= c_LowestScrollableMaximum);
        break;
    }
    raise();
}

void NicerScrollBar::setNicerRange(int min, int max)
{
    const QPointer<NicerScrollBar> alive(this);
    resizeBar();
    setRange(min, max);
    if (alive && m_realBar) {
        setPageStep(m_realBar->pageStep());
    }
    if (alive) {
        showScrollbar();
    }
    if (alive) {
        showBar();
    }
}

void NicerScrollBar::setNicerValue(int value)
{
    if (isSliderDown()) {
        return;
    }
    const QPointer<NicerScrollBar> alive(this);
    setValue(value);
    if (alive) {
        showBar();
    }
}

void NicerScrollBar::nicerValueChange(int value)
{
    if (isSliderDown()) {
        Q_EMIT nicerValueChanged(value);
    }
}

bool NicerScrollBar::eventFilter(QObject* object, QEvent* event)
{
    if (object == parentWidget() && event->type() == QEvent::Resize) {
        resizeBar();
        return false;
    }
    return QScrollBar::eventFilter(object, event);
}

void NicerScrollBar::mousePressEvent(QMouseEvent* event)
{
    const QPointer<NicerScrollBar> alive(this);
    Q_EMIT sliderPressed();
    if (alive) {
        QScrollBar::mousePressEvent(event);
    }
}

void NicerScrollBar::mouseReleaseEvent(QMouseEvent* event)
{
    const QPointer<NicerScrollBar> alive(this);
    if (isSliderDown()) {
        // The last move of a quick drag and the release may come in one go: what is queued was still dragged.
        QCoreApplication::sendPostedEvents(this, QEvent::MetaCall);
    }
    if (alive) {
        Q_EMIT sliderReleased();
    }
    if (alive) {
        QScrollBar::mouseReleaseEvent(event);
    }
}

void NicerScrollBar::mouseMoveEvent(QMouseEvent* event)
{
    showBar();
    QScrollBar::mouseMoveEvent(event);
}

void NicerScrollBar::wheelEvent(QWheelEvent* event)
{
    event->ignore();
    QWidget* const viewport = m_scrollArea ? m_scrollArea->viewport() : nullptr;
    if (viewport == nullptr || viewport->isAncestorOf(this)) {
        return;
    }
    // Scroll areas turn away wheel events that come up from children other than the viewport. What the area does
    // not want, at the end of its range for instance, goes on to what is around it as ever.
    QWheelEvent copy = wheelEventFor(viewport, *event);
    copy.ignore();
    QCoreApplication::sendEvent(viewport, &copy);
    event->setAccepted(copy.isAccepted());
}

void NicerScrollBar::hideEvent(QHideEvent* event)
{
    const QPointer<NicerScrollBar> alive(this);
    QScrollBar::hideEvent(event);
    // A bar that is hidden in the middle of a drag gets no release and would ignore the real bar from then on.
    if (alive) {
        setSliderDown(false);
    }
}
