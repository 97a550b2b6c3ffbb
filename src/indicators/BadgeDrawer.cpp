// SPDX-License-Identifier: MIT
// Rendering of pills and busy marks, and the state of one badge.
#include "indicators/BadgeDrawer.h"

#include <QConicalGradient>
#include <QEvent>
#include <QFont>
#include <QFontMetrics>
#include <QPainter>
#include <QPen>
#include <QPixmapCache>
#include <QSet>
#include <QStyle>

namespace vx
{

namespace
{

constexpr double OutlineWidth = 5.0;
constexpr double CrossWidth = 10.0;
constexpr double ArcWidth = 15.0;
constexpr double SpokeWidth = 12.0;

void drawRounded(QPainter& painter, const QRect& rect)
{
    const double radius = rect.height() / 2.0;
    painter.drawRoundedRect(rect, radius, radius, Qt::AbsoluteSize);
}

QConicalGradient turningGradient(const QRect& rect, int angle, const QColor& color1, const QColor& color2)
{
    QConicalGradient gradient(rect.center(), angle);
    gradient.setColorAt(0.0, color1);
    gradient.setColorAt(1.0, color2);
    return gradient;
}

// QPixmap::scaled() prints a warning for a null source and for a result without room; this one is silent.
QPixmap covering(const QPixmap& canvas, const QSize& wanted)
{
    if (canvas.isNull() || BadgeGeometry::coveringSize(canvas.size(), wanted).isEmpty()) {
        return QPixmap();
    }
    return canvas.scaled(wanted, Qt::KeepAspectRatioByExpanding, Qt::SmoothTransformation);
}

// One copy of each key for all drawers of a look: a wall of spinners then stays within the processor's cache.
QString sharedKey(const QString& key)
{
    constexpr int mostKeys = 512;
    static QSet<QString> keys;
    if (keys.size() >= mostKeys) {
        keys.clear();
    }
    return *keys.insert(key);
}

} // namespace

BadgeDrawer::BadgeDrawer(QObject* parent, QWidget* widget)
    : QObject(parent)
    , m_widget(widget)
    , m_busyBadgeType(ebbtSpokes)
    , m_busy(false)
    , m_badgeSize(20, 20)
    , m_badgeStroke(false)
    , m_badgeColor(255, 255, 255, 255)
    , m_busyColor1(255, 255, 255, 255)
    , m_busyColor2(192, 192, 192, 255)
    , m_badgeBackground(246, 67, 70, 220)
    , m_busyAngle(BadgeGeometry::FirstAngle)
    , m_busySpan(BadgeGeometry::ArcSpan)
    , m_busyFrame(0)
    , m_busyTimer(this)
{
    m_busyTimer.setInterval(BadgeGeometry::TickInterval);
    connect(&m_busyTimer, &QTimer::timeout, this, &BadgeDrawer::updateBusyBadge);
}

BadgeDrawer::~BadgeDrawer() = default;

void BadgeDrawer::setBadgeWidget(QWidget* widget)
{
    m_widget = widget;
}

void BadgeDrawer::setBadgeLabel(const QString& text, const QSize& size, bool stroke, bool crossed)
{
    m_busyTimer.stop();
    m_label = text;
    m_pixmap = covering(renderBadgePixmapFromText(text, stroke, crossed, m_badgeColor, m_badgeBackground), size);
    refreshHost();
}

void BadgeDrawer::setBadgeLabel(const QString& text, bool crossed)
{
    setBadgeLabel(text, m_badgeSize, m_badgeStroke, crossed);
}

void BadgeDrawer::unsetBadgeLabel()
{
    m_busyTimer.stop();
    m_label.clear();
    m_pixmap = QPixmap();
    refreshHost();
}

QString BadgeDrawer::badgeLabel() const
{
    return m_label;
}

void BadgeDrawer::setBadgeBusy(bool on)
{
    if (m_busy == on) {
        return;
    }
    m_busy = on;
    if (on) {
        m_label.clear();
        m_busyAngle = BadgeGeometry::FirstAngle;
        m_busyFrame = 0;
        showFrame();
        if (!m_widget) {
            m_busyTimer.start();
        } else {
            if (m_widget->isVisible()) {
                m_busyTimer.start();
            }
            m_widget->installEventFilter(this);
        }
    } else if (m_label.isEmpty()) {
        m_busyTimer.stop();
        m_pixmap = QPixmap();
        if (m_widget) {
            m_widget->removeEventFilter(this);
        }
    }
    // With a label nothing else ends: clients rely on a label set while busy to survive the end of busy.
    refreshHost();
}

bool BadgeDrawer::badgeBusy() const
{
    return m_busy;
}

void BadgeDrawer::drawBadge(QPainter& painter, Qt::Alignment alignment)
{
    if (!m_widget || m_pixmap.isNull() || !painter.isActive()) {
        return;
    }
    const QRect room = m_widget->rect();
    const QSize size = m_pixmap.size();
    // A host of the badge's own size, as layouts make it, has only one place for it.
    const QPoint place = room.size() == size
        ? room.topLeft()
        : QStyle::alignedRect(Qt::LeftToRight, alignment, size, room).topLeft();
    painter.drawPixmap(place, m_pixmap);
}

bool BadgeDrawer::hasBadge() const
{
    return !m_pixmap.isNull();
}

QPixmap BadgeDrawer::currentPixmap() const
{
    return m_pixmap;
}

QSize BadgeDrawer::sizeHint() const
{
    return m_pixmap.isNull() ? m_badgeSize : m_pixmap.size();
}

QPixmap BadgeDrawer::busyPixmap()
{
    constexpr int angle = BadgeGeometry::FirstAngle;
    constexpr int span = BadgeGeometry::ArcSpan;
    QPixmap frame;
    fetchFrame(
        cacheKey(m_busyBadgeType, m_badgeSize, angle, span, m_busyColor1, m_busyColor2), angle, span, frame);
    return frame;
}

QSize BadgeDrawer::badgeSize() const
{
    return m_badgeSize;
}

void BadgeDrawer::setBadgeSize(const QSize& size)
{
    m_badgeSize = size;
    forgetKeys();
}

bool BadgeDrawer::badgeStroke() const
{
    return m_badgeStroke;
}

void BadgeDrawer::setBadgeStroke(bool stroke)
{
    m_badgeStroke = stroke;
}

QColor BadgeDrawer::badgeColor() const
{
    return m_badgeColor;
}

void BadgeDrawer::setBadgeColor(const QColor& color)
{
    m_badgeColor = color;
}

QColor BadgeDrawer::badgeBackground() const
{
    return m_badgeBackground;
}

void BadgeDrawer::setBadgeBackground(const QColor& color)
{
    m_badgeBackground = color;
}

QColor BadgeDrawer::busyColor1() const
{
    return m_busyColor1;
}

void BadgeDrawer::setBusyColor1(const QColor& color)
{
    m_busyColor1 = color;
    forgetKeys();
}

QColor BadgeDrawer::busyColor2() const
{
    return m_busyColor2;
}

void BadgeDrawer::setBusyColor2(const QColor& color)
{
    m_busyColor2 = color;
    forgetKeys();
}

BadgeDrawer::EBusyBadgeType BadgeDrawer::busyBadgeType() const
{
    return m_busyBadgeType;
}

void BadgeDrawer::setBusyBadgeType(EBusyBadgeType type)
{
    m_busyBadgeType = type;
    forgetKeys();
}

QPixmap BadgeDrawer::renderBadgePixmapFromText(
    const QString& text, bool stroke, bool crossed, const QColor& foreground, const QColor& background)
{
    QFont font;
    font.setPixelSize(BadgeGeometry::CanvasExtent);
    QRect pill(0, 0, BadgeGeometry::CanvasExtent, BadgeGeometry::CanvasExtent);
    if (!text.isEmpty()) {
        const int room = BadgeGeometry::textRoomHeight(stroke);
        QRect measured = QFontMetrics(font).boundingRect(text);
        while (measured.height() > room && font.pixelSize() > 1) {
            font.setPixelSize(font.pixelSize() - 1);
            measured = QFontMetrics(font).boundingRect(text);
        }
        pill = BadgeGeometry::pillRect(measured.width(), stroke);
    }

    QPixmap pixmap(pill.size());
    pixmap.fill(Qt::transparent);
    if (pixmap.isNull()) {
        return pixmap;
    }

    QPainter painter(&pixmap);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::TextAntialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(background);
    drawRounded(painter, pill);

    const QRect outline = BadgeGeometry::outlineRect(pill, stroke);
    if (stroke) {
        painter.setBrush(Qt::NoBrush);
        painter.setPen(QPen(foreground, OutlineWidth, Qt::SolidLine, Qt::SquareCap, Qt::BevelJoin));
        drawRounded(painter, outline);
    }
    if (crossed) {
        painter.setPen(QPen(foreground, CrossWidth, Qt::SolidLine, Qt::SquareCap, Qt::BevelJoin));
        painter.drawLine(BadgeGeometry::crossLine(outline));
    }
    if (!text.isEmpty()) {
        painter.setFont(font);
        painter.setPen(QPen(foreground));
        painter.drawText(BadgeGeometry::textRect(outline), Qt::AlignHCenter | Qt::AlignVCenter, text);
    }
    return pixmap;
}

QPixmap BadgeDrawer::renderBusyBadgePixmap(
    EBusyBadgeType type, int startAngle, int spanAngle, const QColor& color1, const QColor& color2)
{
    QPixmap pixmap(BadgeGeometry::CanvasExtent, BadgeGeometry::CanvasExtent);
    pixmap.fill(Qt::transparent);
    if (pixmap.isNull()) {
        return pixmap;
    }

    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    switch (type) {
    case ebbtArc:
        painter.setPen(QPen(color1, ArcWidth, Qt::SolidLine, Qt::RoundCap, Qt::BevelJoin));
        painter.drawArc(BadgeGeometry::ringRect(), startAngle, spanAngle);
        break;
    case ebbtRing: {
        const QRect rect = BadgeGeometry::ringRect();
        const int angle = BadgeGeometry::gradientAngle(startAngle);
        const QBrush brush(turningGradient(rect, angle, color1, color2));
        painter.setPen(QPen(brush, ArcWidth, Qt::SolidLine, Qt::RoundCap));
        painter.drawEllipse(rect);
        break;
    }
    case ebbtDots: {
        const int angle = BadgeGeometry::gradientAngle(startAngle);
        painter.setPen(Qt::NoPen);
        painter.setBrush(turningGradient(BadgeGeometry::dotsRect(), angle, color1, color2));
        for (const QRect& dot : BadgeGeometry::dotRects()) {
            drawRounded(painter, dot);
        }
        break;
    }
    case ebbtSpokes: {
        const int angle = BadgeGeometry::spokesGradientAngle(startAngle);
        const QBrush brush(turningGradient(BadgeGeometry::spokesRect(), angle, color1, color2));
        painter.setPen(QPen(brush, SpokeWidth, Qt::SolidLine, Qt::RoundCap));
        for (const QLine& spoke : BadgeGeometry::spokeLines()) {
            painter.drawLine(spoke);
        }
        break;
    }
    }
    return pixmap;
}

bool BadgeDrawer::eventFilter(QObject* watched, QEvent* event)
{
    if (m_busy && watched == m_widget) {
        if (event->type() == QEvent::Show) {
            m_busyTimer.start();
        } else if (event->type() == QEvent::Hide) {
            m_busyTimer.stop();
        }
    }
    return false;
}

void BadgeDrawer::updateBusyBadge()
{
    m_busyAngle = BadgeGeometry::nextAngle(m_busyAngle);
    showFrame();
    if (m_widget) {
        m_widget->update();
    }
    Q_EMIT pixmapChanged();
}

QString BadgeDrawer::cacheKey(EBusyBadgeType type, const QSize& size, int startAngle, int spanAngle,
    const QColor& color1, const QColor& color2) const
{
    return BadgeGeometry::cacheKey(type, size, startAngle, spanAngle, color1, color2);
}

void BadgeDrawer::fetchFrame(const QString& key, int startAngle, int spanAngle, QPixmap& frame) const
{
    if (QPixmapCache::find(key, &frame)) {
        return;
    }
    frame = covering(
        renderBusyBadgePixmap(m_busyBadgeType, startAngle, spanAngle, m_busyColor1, m_busyColor2), m_badgeSize);
    if (!frame.isNull()) {
        QPixmapCache::insert(key, frame);
    }
}

void BadgeDrawer::showFrame()
{
    // Spelling the key takes longer than the look-up, and this happens for every spinner on every tick.
    QString& key = m_frameKeys[size_t(BadgeGeometry::angleIndex(m_busyAngle))];
    if (key.isEmpty()) {
        key = sharedKey(
            cacheKey(m_busyBadgeType, m_badgeSize, m_busyAngle, m_busySpan, m_busyColor1, m_busyColor2));
    }
    fetchFrame(key, m_busyAngle, m_busySpan, m_pixmap);
}

void BadgeDrawer::forgetKeys()
{
    m_frameKeys.fill(QString());
}

void BadgeDrawer::refreshHost()
{
    if (m_widget) {
        m_widget->update();
        m_widget->updateGeometry();
    }
}

} // namespace vx
