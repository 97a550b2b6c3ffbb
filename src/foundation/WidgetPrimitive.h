// SPDX-License-Identifier: MIT
// The look that a style sheet gives a widget. For the library's own use; not installed.
#pragma once

#include <QPainter>
#include <QStyle>
#include <QStyleOption>
#include <QWidget>

#include <cstring>

namespace vx
{
/// What all widgets with a look from a style sheet do in their paint event.
namespace WidgetPrimitive
{
/// Whether the style may paint anything for QStyle::PE_Widget. Style sheets and styles of applications do. Fusion,
/// the usual style, does not, but takes longer to find that out than a label takes to draw.
inline bool isPaintedBy(const QStyle& style)
{
    static const QMetaObject* fusion = nullptr;
    const QMetaObject* const meta = style.metaObject();
    if (meta == fusion) {
        return false;
    }
    if (std::strcmp(meta->className(), "QFusionStyle") != 0) {
        return true;
    }
    fusion = meta;
    return false;
}

/// Paints QStyle::PE_Widget, in a paint event of \a widget.
inline void paint(QWidget* widget)
{
    const QStyle* const style = widget->style();
    if (!isPaintedBy(*style)) {
        return;
    }
    QStyleOption option;
    option.initFrom(widget);
    QPainter painter(widget);
    style->drawPrimitive(QStyle::PE_Widget, &option, &painter, widget);
}
}
}
