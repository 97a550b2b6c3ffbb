// SPDX-License-Identifier: MIT
// A slider with any number of handles: what it paints itself. Handles are widgets and paint themselves.
#include "sliders/MultiNubsieSlider.h"
#include "sliders/SliderDecoration.h"

#include <QtGui/QFontMetricsF>
#include <QtGui/QPainter>
#include <QtGui/QPalette>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOption>

namespace vx
{
namespace
{
// Of the application's font, whatever the slider's own.
QSizeF sliderNumberSize(const QString& number)
{
    return QFontMetricsF(QFont()).boundingRect(number).size();
}
}

QPointF MultiNubsieSlider::currentValuePos(const Nubsie* nubsie) const
{
    const QString number = QString::number(nubsie->valueFromNormalizedValue(nubsie->normalizedValue()), 10);
    // In the window's coordinates, while the painter works in the slider's: the number stands off by the slider's
    // place in its window. Clients rely on it.
    return SliderDecoration::valuePosition(
        m_orientation, nubsiePos(nubsie), nubsieRect(nubsie).size(), sliderNumberSize(number), s_NubsieTextMargin);
}

QPointF MultiNubsieSlider::minimumValuePos(const Nubsie* nubsie) const
{
    return SliderDecoration::minimumPosition(m_orientation, sliderBarRect(),
        sliderNumberSize(QString::number(nubsie->minimum(), 10)), s_NubsieTextMargin);
}

QPointF MultiNubsieSlider::maximumValuePos(const Nubsie* nubsie) const
{
    return SliderDecoration::maximumPosition(m_orientation, sliderBarRect(),
        sliderNumberSize(QString::number(nubsie->maximum(), 10)), s_NubsieTextMargin);
}

void MultiNubsieSlider::paintEvent(QPaintEvent* event)
{
    Q_UNUSED(event)
    if (!isVisible()) {
        return;
    }
    QPainter painter(this);
    painter.setOpacity(m_opacityFactor);
    QStyleOption option(1, 0);
    option.initFrom(this);
    style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);

    QPalette palette = property("palette").value<QPalette>();
    if (!isEnabled()) {
        // Only the handles of a disabled slider look it.
        palette.setCurrentColorGroup(isActiveWindow() ? QPalette::Active : QPalette::Inactive);
        painter.setPen(palette.color(foregroundRole()));
    }
    painter.fillRect(
        QRect(0, 0, option.rect.width() - 1, option.rect.height() - 1), palette.color(QPalette::Window));
    if (m_drawTrack) {
        const QRectF bar = sliderBarRect();
        painter.fillRect(bar, palette.color(QPalette::WindowText));
        if (m_drawProgress) {
            painter.fillRect(SliderDecoration::progressRect(bar, m_progress), m_progressColor);
        }
    }
    if (const Nubsie* const current = m_currentNubsie.data()) {
        if (m_features.testFlag(emfShowValueLabel)) {
            painter.drawText(currentValuePos(current),
                QString::number(current->valueFromNormalizedValue(current->normalizedValue()), 10));
        }
        if (m_features.testFlag(emfShowRangeLabels)) {
            painter.drawText(minimumValuePos(current), QString::number(current->minimum(), 10));
            painter.drawText(maximumValuePos(current), QString::number(current->maximum(), 10));
        }
    }
    painter.end();
}
}
