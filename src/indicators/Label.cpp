// SPDX-License-Identifier: MIT
// A label whose scaled picture keeps its proportions.
#include "indicators/Label.h"

#include "indicators/LabelGeometry.h"

#include <QPainter>
#include <QStyle>
#include <QStyleOption>

namespace vx
{
namespace
{
QPixmap labelPixmap(const QLabel& label)
{
#if QT_VERSION >= QT_VERSION_CHECK(5, 15, 0)
    return label.pixmap(Qt::ReturnByValue);
#else
    return label.pixmap() != nullptr ? *label.pixmap() : QPixmap();
#endif
}
}

Label::Label(QWidget* parent, Qt::WindowFlags flags)
    : QLabel(parent, flags)
{
}

Label::Label(const QString& text, QWidget* parent, Qt::WindowFlags flags)
    : QLabel(text, parent, flags)
{
}

Label::~Label() = default;

bool Label::keepAspectRatio() const
{
    return m_keepAspectRatio;
}

void Label::setKeepAspectRatio(bool on)
{
    m_keepAspectRatio = on;
    update();
}

void Label::setPixmap(const QPixmap& pixmap)
{
    m_scaledPixmap = QPixmap();
    QLabel::setPixmap(pixmap);
}

void Label::paintEvent(QPaintEvent* event)
{
    const QPixmap picture = m_keepAspectRatio && hasScaledContents() ? labelPixmap(*this) : QPixmap();
    if (picture.isNull()) {
        QLabel::paintEvent(event);
        return;
    }
    QPainter painter(this);
    const QSize wanted = size() * picture.devicePixelRatio();
    if (m_scaledPixmap.isNull() || m_scaledFor != wanted || m_scaledFrom != picture.cacheKey()) {
        m_scaledPixmap = picture.scaled(wanted, Qt::KeepAspectRatioByExpanding, Qt::SmoothTransformation);
        if (picture.devicePixelRatio() != 1.0) {
            // QStyle cuts what overhangs in the wrong place then.
            m_scaledPixmap = m_scaledPixmap.copy(QStyle::alignedRect(
                Qt::LeftToRight, Qt::AlignCenter, wanted, QRect(QPoint(), m_scaledPixmap.size())));
        }
        m_scaledFor = wanted;
        m_scaledFrom = picture.cacheKey();
    }
    const QStyle* const look = style();
    if (look == nullptr) {
        const QSize extent = m_scaledPixmap.size() / m_scaledPixmap.devicePixelRatio();
        painter.drawPixmap(LabelGeometry::coverOrigin(rect(), extent), m_scaledPixmap);
        return;
    }
    look->drawItemPixmap(&painter, rect(), Qt::AlignCenter, m_scaledPixmap);
    // On top, so that a style sheet can lay a frame over the picture.
    QStyleOption option;
    option.initFrom(this);
    look->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
}
}
