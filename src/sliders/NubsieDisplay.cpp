// SPDX-License-Identifier: MIT
// The handle of a slider with several handles: picture, size and place, balloon, painting.
#include "indicators/BadgeDrawer.h"
#include "popover/Controller.h"
#include "sliders/MultiNubsieSlider.h"
#include "sliders/Nubsie.h"
#include "sliders/NubsieMath.h"
#include "ZelkovUtils/TimeUtils.h"

#include <QtGui/QPainter>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOption>

#include <limits>

namespace vx
{
namespace
{
// The size of a widget that may have been put where a bottom or a right no longer fit into an int.
QSize nubsieExtent(const QRect& place)
{
    const auto extent = [](int first, int last) {
        return static_cast<int>(qBound<qint64>(0, qint64(last) - first + 1, std::numeric_limits<int>::max()));
    };
    return QSize(extent(place.left(), place.right()), extent(place.top(), place.bottom()));
}

constexpr int c_NubsieGrowTime = 100;
constexpr int c_NubsieShrinkTime = 250;
constexpr int c_NubsieMoveTime = 500;

void nubsieAnimate(QPropertyAnimation& animator, int duration, const QVariant& end)
{
    animator.setEasingCurve(QEasingCurve::OutCirc);
    animator.setDuration(duration);
    animator.setEndValue(end);
    animator.start();
}

// Keeps what is already there in the right size.
void nubsieScale(const QPixmap& source, QPixmap& scaled, const QSize& target)
{
    const QSize size = NubsieMath::scaledSize(source.size(), target);
    if (!size.isValid()) {
        scaled = QPixmap();
    } else if (scaled.size() != size) {
        scaled = source.scaled(size, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    }
}
}

// Picture --------------------------------------------------------------------------------------------------

QPixmap Nubsie::icon() const
{
    return m_icon;
}

void Nubsie::setIcon(const QPixmap& pix)
{
    if (pix.cacheKey() == m_icon.cacheKey()) {
        return;
    }
    m_icon = pix;
    m_iconCacheKey = pix.cacheKey();
    clearScaledIconCache();
    updateNubsie(false);
}

QPixmap Nubsie::iconRed() const
{
    return m_iconRed;
}

void Nubsie::setIconRed(const QPixmap& pix)
{
    if (pix.cacheKey() == m_iconRed.cacheKey()) {
        return;
    }
    m_iconRed = pix;
    m_iconRedCacheKey = pix.cacheKey();
    clearScaledIconCache();
    updateNubsie(false);
}

void Nubsie::setIconMap(const QMap<ValueRange, QPixmap>& map)
{
    m_iconMap = map;
    clearScaledIconCache();
    updateNubsie(false);
}

QString Nubsie::text() const
{
    return m_text;
}

void Nubsie::setText(const QString& text)
{
    m_text = text;
    updateNubsie(false);
}

void Nubsie::setTextMap(const QMap<ValueRange, QString>& map)
{
    m_textMap = map;
    updateNubsie(false);
}

void Nubsie::setTextColor(const QColor& color)
{
    m_textColor = color;
    updateNubsie(false);
}

void Nubsie::setBackColor(const QColor& color)
{
    m_backColor = color;
    updateNubsie(false);
}

QString Nubsie::getTextFromValue(int value) const
{
    const QString* const found = NubsieMath::entryFor(m_textMap, value);
    return found != nullptr ? *found : m_text;
}

QPixmap Nubsie::badge(const QString& text, bool stroke, const QColor& foreground, const QColor& background)
{
    if (m_badge.picture.isNull() || m_badge.text != text || m_badge.stroke != stroke
        || m_badge.foreground != foreground || m_badge.background != background) {
        m_badge = {text, stroke, foreground, background,
            BadgeDrawer::renderBadgePixmapFromText(text, stroke, false, foreground, background)};
    }
    return m_badge.picture;
}

void Nubsie::updateNubsie(bool balloon)
{
    if (balloon && (m_features & (QFlags<ENubsieFeatures>(enfBalloon) | enfDateMode))) {
        const QPointer<Nubsie> guard(this);
        updateBalloon();
        if (guard.isNull()) {
            return;
        }
    } else if (m_features.testFlag(enfValueBadge)) {
        const int shown = turnedRound(trueValue());
        const QPixmap* const mapped = NubsieMath::entryFor(m_iconMap, shown);
        m_icon = mapped != nullptr ? *mapped : badge(QString::number(shown, 10), true, m_textColor, m_backColor);
        fitSizesToIcon();
    } else if (!m_textMap.isEmpty()) {
        m_icon = badge(getTextFromValue(trueValue()), false, QColor(255, 255, 255, 255), QColor(246, 67, 70, 220));
    } else if (const QPixmap* const mapped = NubsieMath::entryFor(m_iconMap, trueValue())) {
        m_icon = *mapped;
    }
    if (m_icon.cacheKey() != m_iconCacheKey) {
        clearScaledIconCache();
    }
    m_iconCacheKey = m_icon.cacheKey();
    updateScaledIcons(nubsieExtent(geometry()));
    update();
}

// A number of several digits makes a pill of the handle, and one of a single digit a disc again.
void Nubsie::fitSizesToIcon()
{
    const QSize icon = m_icon.size();
    if (NubsieMath::needsPill(icon, m_size, m_draggedSize)) {
        m_draggedSize = NubsieMath::widened(m_draggedSize, icon);
        m_size = NubsieMath::widened(m_size, icon);
        m_currentSize = NubsieMath::widened(m_currentSize, icon);
        resize(m_currentSize);
    } else if (NubsieMath::needsSquare(icon, m_size, m_draggedSize)) {
        m_draggedSize = NubsieMath::squared(m_draggedSize);
        m_size = NubsieMath::squared(m_size);
        m_currentSize = NubsieMath::squared(m_currentSize);
        resize(m_currentSize);
    }
}

void Nubsie::updateScaledIcons(const QSize& target)
{
    nubsieScale(m_icon, m_scaledIcon, target);
    nubsieScale(m_iconRed, m_scaledIconRed, target);
    nubsieScale(m_glow, m_scaledGlow, target);
}

void Nubsie::clearScaledIconCache()
{
    m_scaledIcon = QPixmap();
    m_scaledIconRed = QPixmap();
    m_scaledGlow = QPixmap();
}

// Size and place -------------------------------------------------------------------------------------------

QSize Nubsie::getSize() const
{
    return m_size;
}

void Nubsie::setSize(const QSize& size)
{
    m_size = size;
    setCurrentSize(size);
}

QSize Nubsie::getDraggedSize() const
{
    return m_draggedSize;
}

void Nubsie::setDraggedSize(const QSize& size)
{
    m_draggedSize = size;
    updateNubsie(true);
}

QSize Nubsie::getCurrentSize() const
{
    return m_currentSize;
}

void Nubsie::setCurrentSize(QSize size)
{
    m_currentSize = size;
    m_maximized = size == m_draggedSize;
    resize(size);
    updateNubsie(false);
    setPosition(m_position);
    update();
}

bool Nubsie::isMaximized() const
{
    return m_maximized;
}

QPointF Nubsie::getPosition() const
{
    return m_position;
}

void Nubsie::setPosition(QPointF pos)
{
    m_position = pos;
    // Far beyond any window, but where a rectangle still has a right and a bottom that an int can hold.
    constexpr int farAway = 1 << 28;
    const QPoint place = NubsieMath::topLeft(pos, nubsieExtent(geometry()));
    move(qBound(-farAway, place.x(), farAway), qBound(-farAway, place.y(), farAway));
    update();
}

void Nubsie::setCurrent()
{
    m_sizeAnimator.stop();
    m_positionAnimator.stop();
    nubsieAnimate(m_sizeAnimator, c_NubsieGrowTime, m_draggedSize);
}

void Nubsie::resetSize()
{
    m_sizeAnimator.stop();
    nubsieAnimate(m_sizeAnimator, c_NubsieShrinkTime, m_size);
}

void Nubsie::moveTo(const QPointF& point)
{
    m_positionAnimator.stop();
    nubsieAnimate(m_positionAnimator, c_NubsieMoveTime, point);
}

void Nubsie::cancelAnimations()
{
    m_sizeAnimator.stop();
    setCurrentSize(m_size);
    m_positionAnimator.stop();
    setPosition(m_position);
    update();
}

QPropertyAnimation* Nubsie::sizeAnimator()
{
    return &m_sizeAnimator;
}

QPropertyAnimation* Nubsie::positionAnimator()
{
    return &m_positionAnimator;
}

// Glow -----------------------------------------------------------------------------------------------------

double Nubsie::getGlowOpacity() const
{
    return m_glowOpacity;
}

void Nubsie::setGlowOpacity(double opacity)
{
    m_glowOpacity = opacity;
}

void Nubsie::startBlinking(int duration)
{
    if (duration > 0) {
        m_glowAnimator.setDuration(duration);
    }
    m_glowAnimator.start();
}

void Nubsie::stopBlinking()
{
    m_glowAnimator.stop();
    // No repaint: the last glow stays until the next one, clients rely on it.
    m_glowOpacity = 0.0;
    m_glowAnimator.setDuration(static_cast<int>(s_DefaultBlinkDuration));
}

bool Nubsie::isBlinking() const
{
    return m_glowAnimator.state() == QAbstractAnimation::Running;
}

// Balloon --------------------------------------------------------------------------------------------------

void Nubsie::dismissBalloon()
{
    if (!hasController()) {
        return;
    }
    const QPointer<PopoverWidget::Controller> controller = getController();
    if (!controller.isNull()) {
        controller->dismiss(true, false);
    }
}

void Nubsie::updateBalloon()
{
    if (!isVisible()) {
        dismissBalloon();
    } else if (m_features & (QFlags<ENubsieFeatures>(enfBalloon) | enfRequestedBalloon)) {
        PopoverBalloonWidget::updateBalloon(trueValue(), 0, 0);
    } else if (m_features.testFlag(enfDateMode) && m_startDate.isValid() && m_endDate.isValid()) {
        if (!m_deltaTimeMode) {
            setBalloonText(TimeUtils::formatDateTimeRelative(getDate(), true, true, true, false, false));
        } else if (m_dateDiffer) {
            setBalloonText(TimeUtils::formatTimeInterval(m_anchorTimeDiff / 1000, true));
        }
    }
}

void Nubsie::hideBalloon()
{
    dismissBalloon();
}

// Being seen -----------------------------------------------------------------------------------------------

bool Nubsie::externallyVisible() const
{
    return m_externallyVisible;
}

void Nubsie::setExternallyVisible(bool visible)
{
    m_externallyVisible = visible;
    if (visible && !m_nubsieSlider.isNull() && m_nubsieSlider->isVisible()) {
        setVisible(true);
    }
}

void Nubsie::setNubsieSlider(MultiNubsieSlider* slider)
{
    m_nubsieSlider = slider;
}

void Nubsie::setClipWidget(QWidget* widget)
{
    m_clipWidget = widget;
}

void Nubsie::setVisible(bool visible)
{
    if (!visible || m_externallyVisible) {
        QWidget::setVisible(visible);
    }
}

void Nubsie::showEvent(QShowEvent* event)
{
    if (m_externallyVisible) {
        QWidget::showEvent(event);
    }
}

void Nubsie::hideEvent(QHideEvent* event)
{
    QWidget::hideEvent(event);
}

// Painting -------------------------------------------------------------------------------------------------

QPoint Nubsie::getPainterPointForIcon(const QPixmap& pixmap) const
{
    return NubsieMath::iconPoint(rect().size(), pixmap.size());
}

void Nubsie::draw(QPainter& painter) const
{
    const QPixmap& icon = m_dateDiffer && m_features.testFlag(enfDateMode) ? m_scaledIconRed : m_scaledIcon;
    painter.drawPixmap(getPainterPointForIcon(icon), icon);
    if (m_glowOpacity < 0.0 || m_glowOpacity > 0.0) {
        const double opacity = painter.opacity();
        painter.setOpacity(m_glowOpacity);
        painter.drawPixmap(getPainterPointForIcon(m_scaledGlow), m_scaledGlow);
        painter.setOpacity(opacity);
    }
}

// The part of the clip widget that is seen, in the handle's coordinates.
QRect Nubsie::clipRect() const
{
    const QRect seen = m_clipWidget->visibleRegion().boundingRect();
    return QRect(mapFromGlobal(m_clipWidget->mapToGlobal(seen.topLeft())),
        mapFromGlobal(m_clipWidget->mapToGlobal(seen.bottomRight())));
}

void Nubsie::paintEvent(QPaintEvent* event)
{
    Q_UNUSED(event)
    if (!m_externallyVisible
        || (!m_nubsieSlider.isNull()
            && (!m_nubsieSlider->isVisible() || m_nubsieSlider->visibleRegion().isEmpty()))) {
        return;
    }
    QStyleOption option(1, 0);
    option.initFrom(this);
    QPainter painter(this);
    painter.save();
    if (!m_clipWidget.isNull() && !m_maximized && !m_state) {
        painter.setClipRect(clipRect(), Qt::ReplaceClip);
    }
    if (!isEnabled()) {
        painter.setOpacity(0.5);
    }
    draw(painter);
    style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
    painter.restore();
}
}
