// SPDX-License-Identifier: MIT
// Where a program files its panels.
#include "views/FadeStripeViewController.h"

FadeStripeViewController* FadeStripeViewController::getInstance()
{
    static FadeStripeViewController instance;
    return &instance;
}

void FadeStripeViewController::setFadeStripe(FadeStripeView* stripe, QWidget* widget, EFadeStripePosition position)
{
    m_stripes[widget][position] = stripe;
}

FadeStripeView* FadeStripeViewController::getFadeStripe(QWidget* widget, EFadeStripePosition position) const
{
    return m_stripes.value(widget).value(position, nullptr);
}

void FadeStripeViewController::setTopFadeStripe(FadeStripeView* stripe, QWidget* widget)
{
    setFadeStripe(stripe, widget, efspTop);
}

void FadeStripeViewController::setBottomFadeStripe(FadeStripeView* stripe, QWidget* widget)
{
    setFadeStripe(stripe, widget, efspBottom);
}

void FadeStripeViewController::setWesternFadeStripe(FadeStripeView* stripe, QWidget* widget)
{
    setFadeStripe(stripe, widget, efspWestern);
}

FadeStripeView* FadeStripeViewController::getTopFadeStripe(QWidget* widget) const
{
    return getFadeStripe(widget, efspTop);
}

FadeStripeView* FadeStripeViewController::getBottomFadeStripe(QWidget* widget) const
{
    return getFadeStripe(widget, efspBottom);
}

FadeStripeView* FadeStripeViewController::getWesternFadeStripe(QWidget* widget) const
{
    return getFadeStripe(widget, efspWestern);
}
