// SPDX-License-Identifier: MIT
// Rows of the table: panels, areas and tool bars.
#include "StylingTable.h"

#include "foundation/AlignedWidget.h"
#include "sliders/MultiNubsieSlider.h"
#include "views/CustomToolBar.h"
#include "views/FadeStripeView.h"
#include "views/FadeView.h"
#include "views/NavigationViewController.h"
#include "views/RubberBandWidget.h"
#include "views/WidgetSlideshow.h"
#include "views/ZoomScrollArea.h"

#include <QtWidgets/QAction>
#include <QtWidgets/QLabel>

namespace styling
{
namespace
{
QWidget* panel(QWidget* window)
{
    return placed(new FadeView(FadeView::ePositionTop, new QLabel(QStringLiteral("panel"), window), window));
}

Build stripe(void (FadeStripeView::*dress)(), FadeView::EPositions position = FadeView::ePositionTop)
{
    return [dress, position](QWidget* window) -> QWidget* {
        auto* const view = new FadeStripeView(position, new QLabel(QStringLiteral("contents"), window), window);
        view->setContentsHeight(80);
        if (dress != nullptr) {
            (view->*dress)();
        }
        view->setRows(1);
        view->resize(window->width(), view->height());
        view->show();
        return view;
    };
}

QWidget* stripeSlider(QWidget* window)
{
    QWidget* const view = stripe(nullptr)(window);
    static_cast<FadeStripeView*>(view)->slider()->show();
    return view;
}

QWidget* pages(QWidget* window)
{
    auto* const result = new vx::NavigationViewController(window);
    result->addWidget(new QLabel(QStringLiteral("page")));
    return placed(result);
}

QWidget* slideshow(QWidget* window)
{
    return placed(new vx::WidgetSlideshow({new QLabel(QStringLiteral("page"))}, window));
}

QWidget* zoomArea(QWidget* window)
{
    return placed(new ZoomScrollArea(window));
}

QWidget* rubberBand(QWidget* window)
{
    auto* const band = placed(new vx::RubberBandWidget(nullptr, window), QRect(20, 20, 200, 150));
    band->setLabel(QStringLiteral("label"));
    return band;
}

QWidget* toolBar(QWidget* window)
{
    auto* const bar = new vx::CustomToolBar(window, true, QStringLiteral("tools"));
    bar->addAction(QStringLiteral("act"));
    return placed(bar);
}

QWidget* aligned(QWidget* window)
{
    return placed(new vx::AlignedWidget(new QLabel(QStringLiteral("child")), window));
}
}

Table viewTable()
{
    using Stripe = FadeStripeView;
    constexpr FadeView::EPositions bottom = FadeView::ePositionBottom;
    return {
        noBox("FadeView", panel),
        noBox("FadeStripeView", stripe(nullptr)),
        box("#contentView", stripe(nullptr)),
        box("#fadeStripeNubsieSlider", stripeSlider),
        box("#header", stripe(&Stripe::setStyleDefault, bottom)),
        box("#footer", stripe(&Stripe::setStyleDefault)),
        box("#grab", stripe(&Stripe::setStyleDefault)),
        box("#header-red", stripe(&Stripe::setStyleRed, bottom)),
        box("#footer-red", stripe(&Stripe::setStyleRed)),
        box("#grab-red", stripe(&Stripe::setStyleRed)),
        box("#header-green", stripe(&Stripe::setStyleGreen, bottom)),
        box("#footer-green", stripe(&Stripe::setStyleGreen)),
        box("#grab-green", stripe(&Stripe::setStyleGreen)),
        box("#header-solid-grey", stripe(&Stripe::setStyleSolidGrey, bottom)),
        box("#footer-solid-grey", stripe(&Stripe::setStyleSolidGrey)),
        box("#header-solid-blue", stripe(&Stripe::setStyleSolidBlue, bottom)),
        box("#footer-solid-blue", stripe(&Stripe::setStyleSolidBlue)),
        box("vx--NavigationViewController", pages),
        box("vx--WidgetSlideshow", slideshow),
        box("ZoomScrollArea", zoomArea),
        noBox("vx--RubberBandWidget", rubberBand),
        box("vx--RubberBandWidget > QLabel", rubberBand),
        box("vx--RubberBandWidget > QPushButton", rubberBand),
        box("vx--CustomToolBar", toolBar),
        noBox("vx--AlignedWidget", aligned),
    };
}
}
