// SPDX-License-Identifier: MIT
// What makes a button pulse, and draws an overlay picture and a badge on it.
#include "foundation/FadingWidget.h"

#include "CoreQt/Connect.h"
#include "foundation/LogStatement.h"

#include <QAbstractButton>
#include <QIcon>
#include <QPainter>
#include <QRegExp>
#include <QStyle>

#include <limits>

namespace vx
{
namespace
{
constexpr int c_InitialAlpha = 50;
// More levels than alphas only come from a lower limit far below 0; those are not worth a cache.
constexpr qint64 c_MaxCachedLevel = 4095;

QImage withAlphaChannel(const QImage& image)
{
    switch (image.format()) {
    case QImage::Format_Invalid:
    case QImage::Format_ARGB32:
    case QImage::Format_ARGB32_Premultiplied:
        return image;
    default:
        return image.convertToFormat(QImage::Format_ARGB32);
    }
}
}

FadingWidget::FadingWidget(QWidget* widget, int interval, int step, QColor color, int minAlpha, int maxAlpha)
    : m_widget(widget)
    , m_badge(widget, widget)
    , m_interval(interval)
    , m_step(qMax(step, -std::numeric_limits<int>::max()))
    , m_color(color)
    , m_minAlpha(minAlpha)
    , m_maxAlpha(maxAlpha)
    , m_once(false)
{
    setAlpha(m_minAlpha);
    vx::connect(&m_timer, "2timeout()", m_widget, "1update()", Qt::AutoConnection);
    setAlpha(c_InitialAlpha);
}

FadingWidget::~FadingWidget()
{
    m_widget = nullptr;
    stopFading();
}

void FadingWidget::startFading()
{
    if (m_timer.isActive()) {
        return;
    }
    setAlpha(m_minAlpha);
    m_timer.start(qMax(0, m_interval));
}

void FadingWidget::fadeOnce()
{
    if (m_timer.isActive()) {
        return;
    }
    m_once = true;
    setAlpha(m_maxAlpha);
    // Negated whatever the sign: after a pulse that was cut short on its way down this rises, and ends at once.
    m_step = -m_step;
    m_timer.start(qMax(0, m_interval));
}

void FadingWidget::stopFading()
{
    if (!m_timer.isActive()) {
        return;
    }
    m_timer.stop();
    setAlpha(m_minAlpha);
    m_step = qAbs(m_step);
    if (m_widget != nullptr) {
        m_widget->update();
    }
}

void FadingWidget::setAlpha(int alpha)
{
    m_color.setAlpha(qBound(0, alpha, 255));
}

void FadingWidget::setOverlay(const QString& file, Qt::Alignment alignment, const QPoint& offset)
{
    m_overlay = file.isEmpty() ? QImage() : QImage(file);
    if (!m_overlay.isNull()) {
        if (alignment.testFlag(Qt::AlignAbsolute)) {
            m_overlayRect.moveTopLeft(offset);
        } else {
            const QRect frame = m_widget != nullptr ? m_widget->rect() : QRect();
            m_overlayRect = QStyle::alignedRect(Qt::LeftToRight, alignment, m_overlay.size(), frame)
                                .translated(offset);
        }
    }
    if (m_widget != nullptr) {
        m_widget->update();
    }
}

bool FadingWidget::hasOverlay() const
{
    return !m_overlay.isNull();
}

BadgeDrawer& FadingWidget::badge()
{
    return m_badge;
}

bool FadingWidget::paintSelf(QPaintEvent* /*event*/)
{
    return false;
}

void FadingWidget::paintEvent(QPaintEvent* event)
{
    if (!m_timer.isActive() && m_overlay.isNull() && !m_badge.hasBadge()) {
        return;
    }
    QPainter painter;
    if (m_widget != nullptr) {
        painter.begin(m_widget);
    }
    if (m_timer.isActive()) {
        preparePaint(event);
        if (!m_image.isNull()) {
            drawTint(painter);
        }
        // Bounded, since a colour knows no other alphas; a limit of 255 is met by what passes it.
        setAlpha(qBound(-256, m_step, 256) + m_color.alpha());
        const int alpha = m_color.alpha();
        if (alpha >= m_maxAlpha || alpha <= m_minAlpha) {
            if (m_once) {
                stopFading();
            } else {
                m_step = -m_step;
            }
        }
    }
    if (!painter.isActive()) {
        return;
    }
    if (!m_overlay.isNull()) {
        painter.drawImage(m_overlayRect.topLeft(), m_overlay);
    }
    m_badge.drawBadge(painter, Qt::AlignTop | Qt::AlignRight);
}

void FadingWidget::drawTint(QPainter& painter)
{
    if (!painter.isActive()) {
        return;
    }
    const qint64 distance = static_cast<qint64>(m_color.alpha()) - m_minAlpha;
    const qint64 level = m_step != 0 ? distance / qAbs(static_cast<qint64>(m_step)) : 0;
    if (level < 0 || level > c_MaxCachedLevel) {
        painter.drawImage(m_rect.topLeft(), tintedImage());
        return;
    }
    const int index = static_cast<int>(level);
    if (m_tinted.size() <= index) {
        m_tinted.resize(index + 1);
    }
    if (m_tinted.at(index).isNull()) {
        m_tinted[index] = tintedImage();
    }
    painter.drawImage(m_rect.topLeft(), m_tinted.at(index));
}

QImage FadingWidget::tintedImage() const
{
    QImage tinted(m_image.size(), m_image.format());
    if (tinted.isNull()) {
        return tinted;
    }
    tinted.setDevicePixelRatio(m_image.devicePixelRatio());
    const bool premultiplied = m_image.format() == QImage::Format_ARGB32_Premultiplied;
    const QRgb color = m_color.rgb();
    const int limit = m_color.alpha();
    for (int y = 0; y < m_image.height(); ++y) {
        const auto* source = reinterpret_cast<const QRgb*>(m_image.constScanLine(y));
        auto* target = reinterpret_cast<QRgb*>(tinted.scanLine(y));
        for (int x = 0; x < m_image.width(); ++x) {
            const QRgb pixel = qRgba(qRed(color), qGreen(color), qBlue(color), qMin(qAlpha(source[x]), limit));
            target[x] = premultiplied ? qPremultiply(pixel) : pixel;
        }
    }
    return tinted;
}

void FadingWidget::preparePaint(QPaintEvent* /*event*/)
{
    if (m_prepared || m_widget == nullptr) {
        return;
    }
    m_prepared = true;
    const QRect frame = m_widget->rect();
    m_rect = frame;
    const auto* button = qobject_cast<const QAbstractButton*>(m_widget.data());
    if (button == nullptr) {
        return;
    }
    m_rect = QRect(QPoint(), button->iconSize());
    m_rect.moveCenter(frame.center());
    m_image = withAlphaChannel(button->icon().pixmap(m_rect.size(), QIcon::Normal, QIcon::Off).toImage());
    if (m_image.isNull()) {
        m_image = withAlphaChannel(loadFromStyleSheet());
    }
    if (!m_image.isNull()) {
        m_rect = QRect(QPoint(), (QSizeF(m_image.size()) / m_image.devicePixelRatio()).toSize());
        m_rect.moveCenter(frame.center());
        // The centre of a rectangle is rounded down: an odd size would stand one pixel off.
        if (m_rect.width() % 2 != 0) {
            m_rect.setLeft(m_rect.left() + 1);
        }
        if (m_rect.height() % 2 != 0) {
            m_rect.setTop(m_rect.top() + 1);
        }
    }
}

QImage FadingWidget::loadFromStyleSheet() const
{
    const auto* button = qobject_cast<const QAbstractButton*>(m_widget.data());
    if (button == nullptr) {
        return QImage();
    }
    QString sheet;
    for (const QWidget* widget = button; widget != nullptr && sheet.isEmpty(); widget = widget->parentWidget()) {
        sheet = widget->styleSheet();
    }
    if (sheet.isEmpty()) {
        return QImage();
    }
    QString pattern = QLatin1String(".*") + button->objectName();
    if (!button->isEnabled()) {
        pattern += QLatin1String(".*:disabled");
    } else if (button->isCheckable() && button->isChecked()) {
        pattern += QLatin1String(".*:checked");
    }
    pattern += QLatin1String(".*\\{.*image:\\s*url\\((.+)\\)\\s*;.*\\}");
    // Not the newer class: minimal matching over the whole sheet means another thing there.
    QRegExp expression(pattern, Qt::CaseSensitive, QRegExp::RegExp);
    expression.setMinimal(true);
    if (expression.indexIn(sheet) < 0 || expression.captureCount() < 1) {
        return QImage();
    }
    const QString file = expression.cap(1);
    ZELKOV_LOG(c_LogTrace, "vx::FadingWidget::preparePaint",
        "FadingWidget::styleSheet url: \"" << file.toStdWString() << "\"");
    return QImage(file);
}
}
