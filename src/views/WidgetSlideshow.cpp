// SPDX-License-Identifier: MIT
// A stack of pages that moves on by itself.
#include "views/WidgetSlideshow.h"

#include "CoreQt/Connect.h"

#include <QtCore/QTimer>

namespace vx
{
namespace
{
constexpr int c_SlideDuration = 750; // ms
constexpr int c_SlideshowInterval = 5000; // ms
}

WidgetSlideshow::WidgetSlideshow(const QList<QWidget*>& widgets, QWidget* parent)
    : NavigationViewController(c_SlideDuration, QEasingCurve::InOutQuad, parent)
    , m_timer(new QTimer(this))
{
    for (QWidget* const widget : widgets) {
        addWidget(widget);
    }
    m_timer->setInterval(c_SlideshowInterval);
    vx::connect(m_timer, "2timeout()", this, "1showNextItem()", Qt::AutoConnection);
    m_timer->start();
}

WidgetSlideshow::~WidgetSlideshow() = default;

void WidgetSlideshow::showNextItem()
{
    if (count() > 0) {
        setCurrentIndexWithAnimation((currentIndex() + 1) % count());
    }
}

void WidgetSlideshow::showPreviousItem()
{
}
}
