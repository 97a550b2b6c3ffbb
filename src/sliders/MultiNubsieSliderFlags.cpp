// SPDX-License-Identifier: MIT
// A slider with any number of handles: the two flags. The client places them, the slider gives them their
// pictures.
#include "sliders/MultiNubsieSlider.h"
#include "sliders/SliderDecoration.h"

#include <array>

namespace vx
{
namespace
{
using FlagPictures = std::array<QPixmap, 3>;

// In the order of the colours.
FlagPictures flagPictures(int flag)
{
    const QString path = QStringLiteral(":/views/btn_flag_%1%2.png");
    return {QPixmap(path.arg(QStringLiteral("red")).arg(flag)),
        QPixmap(path.arg(QStringLiteral("green")).arg(flag)), QPixmap(path.arg(QStringLiteral("gray")).arg(flag))};
}

void takeFlagPicture(QPixmap& picture, const FlagPictures& pictures, int color)
{
    if (color >= 0 && color < static_cast<int>(pictures.size())) {
        picture = pictures[static_cast<std::size_t>(color)];
    }
}

void fitFlagPicture(QPixmap& picture, QLabel* label, int thickness)
{
    const QSize size = SliderDecoration::flagSize(picture.size(), thickness);
    if (size != picture.size()) {
        picture = picture.scaled(size, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    }
    if (label != nullptr) {
        label->setPixmap(picture);
    }
}
}

void MultiNubsieSlider::showFlags(bool show)
{
    if (m_firstFlag.isNull() || m_secondFlag.isNull()) {
        return;
    }
    m_firstFlag->setVisible(show);
    m_secondFlag->setVisible(show);
    updateFlagPositions();
}

void MultiNubsieSlider::updateFlagPositions()
{
    // What was scaled is scaled again, and not the picture it came from: clients rely on the look.
    const int thickness = m_orientation == Qt::Horizontal ? height() : width();
    fitFlagPicture(m_firstFlagPixmap, m_firstFlag, thickness);
    fitFlagPicture(m_secondFlagPixmap, m_secondFlag, thickness);
}

void MultiNubsieSlider::setFirstFlagColor(EMultiNubsieSliderFlagColor color)
{
    if (m_firstFlag.isNull()) {
        return;
    }
    static const FlagPictures pictures = flagPictures(1);
    takeFlagPicture(m_firstFlagPixmap, pictures, color);
    m_firstFlag->setPixmap(m_firstFlagPixmap);
    m_firstFlagColor = color;
    m_firstFlag->update();
    updateFlagPositions();
}

void MultiNubsieSlider::setSecondFlagColor(EMultiNubsieSliderFlagColor color)
{
    if (m_secondFlag.isNull()) {
        return;
    }
    static const FlagPictures pictures = flagPictures(2);
    takeFlagPicture(m_secondFlagPixmap, pictures, color);
    m_secondFlag->setPixmap(m_secondFlagPixmap);
    m_secondFlagColor = color;
    m_secondFlag->update();
    updateFlagPositions();
}

MultiNubsieSlider::EMultiNubsieSliderFlagColor MultiNubsieSlider::getFirstFlagColor() const
{
    return m_firstFlagColor;
}

MultiNubsieSlider::EMultiNubsieSliderFlagColor MultiNubsieSlider::getSecondFlagColor() const
{
    return m_secondFlagColor;
}

QWidget* MultiNubsieSlider::getFirstFlag() const
{
    return m_firstFlag;
}

QWidget* MultiNubsieSlider::getSecondFlag() const
{
    return m_secondFlag;
}
}
