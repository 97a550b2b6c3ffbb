// SPDX-License-Identifier: MIT
// A switch whose picture has a frame for each of three states.
#include "controls/AnimatedCheckBox.h"

#include <QtGui/QPainter>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOptionButton>

#include <utility>

namespace
{
constexpr int c_CrossingTime = 10; // ms
constexpr int c_Frames = 3;
}

AnimatedCheckBox::AnimatedCheckBox(QWidget* parent, bool checked, QString path)
    : iOSCheckBox(parent, checked, std::move(path))
{
    *controlIconPosition() = QPointF(-(controlMacCheckBox()->width() * 2) / c_Frames, 0);
    *controlIconAnimationDuration() = c_CrossingTime;
}

AnimatedCheckBox::~AnimatedCheckBox() = default;

QSize AnimatedCheckBox::sizeHint() const
{
    return {controlMacCheckBox()->width() / c_Frames, controlMacCheckBox()->height()};
}

void AnimatedCheckBox::setVisible(bool visible)
{
    iOSCheckBox::setVisible(visible);
    if (checkState() == Qt::PartiallyChecked) {
        *controlIconPosition() = QPointF(-(getControlRect().width() * 2) / c_Frames, 0);
        update();
    }
}

void AnimatedCheckBox::checkStateSet()
{
    switch (checkState()) {
    case Qt::Unchecked:
        placeStrip(maximumLeftPosition());
        break;
    case Qt::Checked:
        placeStrip(maximumRightPosition());
        break;
    case Qt::PartiallyChecked:
        break;
    }
    QCheckBox::checkStateSet();
}

// The frames do not depend on the size of the widget.
void AnimatedCheckBox::resizeEvent(QResizeEvent* event)
{
    QCheckBox::resizeEvent(event);
}

QRect AnimatedCheckBox::getControlRect()
{
    return {QPoint(0, 0), controlMacCheckBox()->size()};
}

QPoint AnimatedCheckBox::maximumRightPosition()
{
    return {0, 0};
}

void AnimatedCheckBox::draw(QPaintEvent*, QPainter& painter)
{
    ensurePolished();
    QStyleOptionButton option;
    option.initFrom(this);
    option.rect.setSize(sizeHint());
    painter.setClipRect(option.rect, Qt::ReplaceClip);
    const QPixmap& strip = scaledStrip({option.rect.width() * c_Frames, option.rect.height()});
    if (!strip.isNull()) {
        painter.drawPixmap(*controlIconPosition(), strip);
    }
    if (style() != nullptr) {
        style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
    }
}
