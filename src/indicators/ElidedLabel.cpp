// SPDX-License-Identifier: MIT
// A label that shortens its text to the room it has.
#include "indicators/ElidedLabel.h"

#include "indicators/LabelGeometry.h"

#include <QFontMetrics>
#include <QPainter>
#include <QStringList>

namespace vx
{
ElidedLabel::ElidedLabel(QWidget* parent, Qt::WindowFlags flags)
    : QLabel(parent, flags)
{
}

ElidedLabel::ElidedLabel(const QString& text, QWidget* parent, Qt::WindowFlags flags)
    : QLabel(text, parent, flags)
{
}

ElidedLabel::~ElidedLabel() = default;

void ElidedLabel::setElideMode(Qt::TextElideMode mode)
{
    m_elideMode = mode;
}

void ElidedLabel::paintEvent(QPaintEvent* /*event*/)
{
    QPainter painter(this);
    drawFrame(&painter);
    const QRect room = LabelGeometry::indented(contentsRect(), alignment(), indent());
    shorten(room.width());
    painter.drawText(room, int(alignment()) | (m_shownWrapped ? Qt::TextWordWrap : 0), m_shownText);
}

void ElidedLabel::shorten(int width)
{
    const QString whole = text();
    if (m_fromWidth == width && m_fromMode == m_elideMode && m_fromWordWrap == wordWrap() && m_fromText == whole
        && m_fromFont == font()) {
        return;
    }
    m_fromWidth = width;
    m_fromMode = m_elideMode;
    m_fromWordWrap = wordWrap();
    m_fromText = whole;
    m_fromFont = font();

    const QFontMetrics metrics = fontMetrics();
    m_shownWrapped = wordWrap() && metrics.size(0, whole).width() > width;
    if (!m_shownWrapped) {
        m_shownText = metrics.elidedText(whole, m_elideMode, width);
    } else if (metrics.size(Qt::TextWordWrap, whole).width() > width) {
        QStringList words = whole.split(QLatin1Char(' '));
        for (QString& word : words) {
            word = metrics.elidedText(word, m_elideMode, width);
        }
        m_shownText = words.join(QLatin1Char(' '));
    } else {
        m_shownText = whole;
    }
}
}
