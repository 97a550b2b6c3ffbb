// SPDX-License-Identifier: MIT
// A row with a slider.
#pragma once

#include "foundation/Export.h"
#include "foundation/NubsieID.h"
#include "popover/Item.h"
#include "popover/items/ControlHolder.h"
#include "sliders/MultiNubsieSlider.h"

#include <QtCore/QMap>

namespace vx
{
namespace PopoverWidget
{

/// A row with a time line slider at its right end, which takes all the room that is left. The user's change of a handle
/// performs it, with a list of the handle's id and the value as value and the flag eipControl. A user without the
/// right sees the handle go back to the last value that was accepted.
///
/// Handles are added by the client through slider(), once the row is in its popover: they are children of the window
/// that the slider stands in.
class ZELKOV_WIDGETS_EXPORT SliderItem : public Item
{
    Q_OBJECT

public:
    /// The slider starts without a handle.
    SliderItem(const QString& text, const QString& objectName, int id, QFlags<EItemFlag> flags, QWidget* parent);
    ~SliderItem() override;

    /// Takes a list of two, the handle's id and the value, and nothing else. Performs nothing.
    void setValue(const QVariant& value) override;
    /// A null variant: there may be several handles.
    QVariant value() override;
    /// Brings the handles to their places.
    void cancelAnimations() override;
    void onItemScrolled() override;

    /// The slider; null when it has been deleted by someone else.
    MultiNubsieSlider* slider() const;

protected:
    void moveEvent(QMoveEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private Q_SLOTS:
    void valueChanged(vx::NubsieID nubsieId, int value);
    void rememberValue(vx::NubsieID nubsieId);

private:
    ControlHolder<MultiNubsieSlider> m_slider;
    QMap<vx::NubsieID, int> m_values; // the last that were accepted
};

} // namespace PopoverWidget
} // namespace vx
