// SPDX-License-Identifier: MIT
// Rows of the table: the time line, its handles, the plain sliders and the overlay scroll bar.
#include "StylingTable.h"

#include "sliders/HSlider.h"
#include "sliders/JumpSlider.h"
#include "sliders/MultiNubsieSlider.h"
#include "sliders/NicerScrollBar.h"
#include "sliders/Nubsie.h"
#include "sliders/VSlider.h"
#include "ZelkovUtils/ReloadStyleSheet.h"

#include <QtGui/QPixmap>
#include <QtWidgets/QLabel>
#include <QtWidgets/QScrollArea>

namespace styling
{
namespace
{
QWidget* timeLine(QWidget* window)
{
    auto* const line = placed(new vx::MultiNubsieSlider(window, window), QRect(20, 20, 340, 40));
    line->setDrawTrack(true);
    line->setDrawProgress(true);
    line->setProgress(0.5);
    return line;
}

QWidget* trackless(QWidget* window)
{
    return placed(new vx::MultiNubsieSlider(window, window), QRect(20, 20, 340, 40));
}

QWidget* handle(QWidget* window)
{
    auto* const result = new vx::Nubsie(QStringLiteral("yourHandle"), 3, 0, 10, 5, window, 1);
    QPixmap icon(16, 16);
    icon.fill(Qt::darkGreen);
    result->setIcon(icon);
    result->setSize(QSize(24, 24));
    result->setPosition(QPointF(100, 100));
    result->show();
    return result;
}

QWidget* bareHandle(QWidget* window)
{
    auto* const result = new vx::Nubsie(QStringLiteral("yourHandle"), 3, 0, 10, 5, window, 1);
    result->setSize(QSize(24, 24));
    result->setPosition(QPointF(100, 100));
    result->show();
    return result;
}

QWidget* disabledHandle(QWidget* window)
{
    QWidget* const result = handle(window);
    result->setEnabled(false);
    return result;
}

QWidget* scrolled(QWidget* window, Qt::Orientation orientation)
{
    auto* const area = new QScrollArea(window);
    auto* const content = new QLabel;
    content->setFixedSize(900, 900);
    area->setWidget(content);
    auto* const bar = new NicerScrollBar(area, orientation, NicerScrollBar::epAutomatic, area);
    bar->setFadingEnabled(false);
    placed(area, QRect(10, 10, 300, 200));
    bar->showBar();
    return bar;
}

QWidget* horizontalBar(QWidget* window)
{
    return scrolled(window, Qt::Horizontal);
}

QWidget* verticalBar(QWidget* window)
{
    return scrolled(window, Qt::Vertical);
}

QWidget* invisibleHorizontalBar(QWidget* window)
{
    QWidget* const bar = scrolled(window, Qt::Horizontal);
    vx::reloadStyleSheet(bar, NicerScrollBar::s_HorizontalNicerScrollBarInvisible);
    return bar;
}

QWidget* invisibleVerticalBar(QWidget* window)
{
    QWidget* const bar = scrolled(window, Qt::Vertical);
    vx::reloadStyleSheet(bar, NicerScrollBar::s_VerticalNicerScrollBarInvisible);
    return bar;
}

QWidget* jumpSlider(QWidget* window)
{
    return placed(new vx::JumpSlider(Qt::Horizontal, window));
}
}

Table sliderTable()
{
    const char* const line = "vx--MultiNubsieSlider";
    const char* const knob = "vx--Nubsie";
    static const QByteArray url = "url(" + pictureFile().toLatin1() + ")";
    return {
        box(line, timeLine),
        rule("vx--MultiNubsieSlider { color }", "vx--MultiNubsieSlider { color: #ff00ff; }", timeLine),
        picture(line, "progressColor", "#ff00ff", timeLine),
        picture(line, "sliderBarExtent", "17", timeLine),
        picture(line, "drawTrack", "true", trackless),
        picture(line, "opacityFactor", "0.5", timeLine),
        picture(line, "orientation", "Vertical", timeLine),

        box(knob, handle),
        box("#yourHandle", handle),
        rule("vx--Nubsie:disabled", "vx--Nubsie:disabled { background: #ff00ff; border: 4px solid #ff00ff; }",
            disabledHandle),
        picture(knob, "icon", url.constData(), bareHandle, "picture"),
        value(knob, "icon_red", url.constData(), handle, "picture"),
        picture(knob, "size", "40px 40px", handle, "40 x 40"),
        value(knob, "draggedSize", "50px 50px", handle, "50 x 50"),
        picture(knob, "currentSize", "44px 44px", handle, "44 x 44"),
        value(knob, "glowOpacity", "0.5", handle),
        value(knob, "value", "9", handle),
        value(knob, "defaultValue", "8", handle),
        value(knob, "minimum", "-5", handle),
        value(knob, "maximum", "50", handle),

        box("NicerScrollBar", horizontalBar),
        box("#HorizontalNicerScrollBar", horizontalBar),
        box("#VerticalNicerScrollBar", verticalBar),
        box("#HorizontalNicerScrollBarInvisible", invisibleHorizontalBar),
        box("#VerticalNicerScrollBarInvisible", invisibleVerticalBar),

        box("vx--JumpSlider", jumpSlider),
    };
}
}
