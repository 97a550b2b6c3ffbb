// SPDX-License-Identifier: MIT
// A row with a slider.
#include "popover/items/SliderItem.h"

#include "CoreQt/Connect.h"

#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{

SliderItem::SliderItem(
    const QString& text, const QString& objectName, int id, QFlags<EItemFlag> flags, QWidget* parent)
    : Item(parent, flags, id, objectName, text, QString())
    , m_slider(new MultiNubsieSlider(this))
{
    m_slider->setObjectName(QStringLiteral("slider"));
    m_slider->setOrientation(Qt::Horizontal);
    m_slider->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
    if (flags.testFlag(eifDisabled)) {
        m_slider->setEnabled(false);
    }
    if (m_rightLayout) {
        m_rightLayout->addWidget(m_slider.get());
        // Aligned, the layout would keep to the slider's size hint and not grow.
        m_mainLayout->setAlignment(m_rightLayout, Qt::Alignment());
    } else {
        m_mainLayout->addWidget(m_slider.get());
    }
    m_lastElement = m_slider.get();
    vx::connect(m_slider.get(), "2nubsieValueChangedByUser(vx::NubsieID,int)", this,
        "1valueChanged(vx::NubsieID,int)", Qt::AutoConnection);
    vx::connect(m_slider.get(), "2nubsieDragStarted(vx::NubsieID)", this, "1rememberValue(vx::NubsieID)",
        Qt::AutoConnection);
}

SliderItem::~SliderItem() = default;

void SliderItem::setValue(const QVariant& value)
{
    if (value.type() != QVariant::List || !m_slider) {
        return;
    }
    const QVariantList list = value.toList();
    if (list.size() == 2) {
        const vx::NubsieID nubsieId = list.first().toInt();
        m_values.insert(nubsieId, list.last().toInt());
        m_slider->setValue(nubsieId, list.last().toInt(), false, false);
    }
}

QVariant SliderItem::value()
{
    return {};
}

void SliderItem::cancelAnimations()
{
    if (m_slider) {
        m_slider->cancelAnimations();
    }
}

void SliderItem::onItemScrolled()
{
    if (m_slider) {
        m_slider->updateNubsiePositions(false);
    }
}

MultiNubsieSlider* SliderItem::slider() const
{
    return m_slider.get();
}

// Neither of the two calls that of the base class, which has nothing to do.
void SliderItem::moveEvent(QMoveEvent* /*event*/)
{
    cancelAnimations();
}

void SliderItem::resizeEvent(QResizeEvent* /*event*/)
{
    cancelAnimations();
}

void SliderItem::valueChanged(vx::NubsieID nubsieId, int value)
{
    const auto reporting = m_slider.report();
    if (isProtected()) {
        m_slider->setValue(nubsieId, m_values.value(nubsieId), false, false);
        return;
    }
    m_values.insert(nubsieId, value);
    Q_EMIT itemPerformed(m_id, QVariantList{nubsieId, value}, userData(), eipControl);
}

// A handle that was never set through the row has the value that it is first taken with.
void SliderItem::rememberValue(vx::NubsieID nubsieId)
{
    if (!m_values.contains(nubsieId)) {
        m_values.insert(nubsieId, m_slider->value(nubsieId));
    }
}

} // namespace PopoverWidget
} // namespace vx
