// SPDX-License-Identifier: MIT
// The rules of a popover's row that need no widget.
#include "popover/ItemRules.h"

namespace vx
{
namespace PopoverWidget
{
namespace ItemRules
{

EItemPerformedFlags hit(const Elements& elements, const QPoint& position, Qt::MouseButton button)
{
    EItemPerformedFlags result;
    if (elements.icon.contains(position)) {
        result |= eipIcon;
    } else if (elements.text.contains(position)) {
        result |= eipText;
    } else if (elements.additionalText.contains(position)) {
        result |= eipAdditionalText;
    }
    if (button == Qt::LeftButton) {
        result |= eipLeftButton;
    } else if (button == Qt::RightButton) {
        result |= eipRightButton;
    }
    return result;
}

bool performs(EItemFlags flags, Qt::MouseButton button)
{
    return button == Qt::LeftButton || (button == Qt::RightButton && flags.testFlag(eifRightClick));
}

bool startsDrag(Qt::MouseButtons buttons, const QPoint& from, const QPoint& position, int startDistance)
{
    // In 64 bits, so that no pair of points overflows.
    const qint64 distance = qAbs(qint64(position.x()) - from.x()) + qAbs(qint64(position.y()) - from.y());
    return (buttons & Qt::LeftButton) && distance >= startDistance;
}

QString escaped(const QString& text)
{
    return QString(text).replace(QLatin1String(" & "), QLatin1String(" && "));
}

} // namespace ItemRules
} // namespace PopoverWidget
} // namespace vx
