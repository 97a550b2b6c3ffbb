// SPDX-License-Identifier: MIT
// FadeStripeViewController: where a program files its panels.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QMap>

class FadeStripeView;
class QWidget;

/// A process-wide directory of panels by widget and position. It holds what it was given and nothing else: panels
/// are not owned, and entries are never removed, so overwrite an entry by null before its panel or widget dies.
class ZELKOV_WIDGETS_EXPORT FadeStripeViewController
{
public:
    /// Where a panel stands at its widget.
    enum EFadeStripePosition : int
    {
        efspTop = 0,
        efspBottom = 2,
        efspWestern = 3
    };

    /// The one directory of the process.
    static FadeStripeViewController* getInstance();

    void setFadeStripe(FadeStripeView* stripe, QWidget* widget, EFadeStripePosition position);
    /// Null if there is none.
    FadeStripeView* getFadeStripe(QWidget* widget, EFadeStripePosition position) const;

    // The same with the position in the name.
    void setTopFadeStripe(FadeStripeView* stripe, QWidget* widget);
    void setBottomFadeStripe(FadeStripeView* stripe, QWidget* widget);
    void setWesternFadeStripe(FadeStripeView* stripe, QWidget* widget);
    FadeStripeView* getTopFadeStripe(QWidget* widget) const;
    FadeStripeView* getBottomFadeStripe(QWidget* widget) const;
    FadeStripeView* getWesternFadeStripe(QWidget* widget) const;

private:
    FadeStripeViewController() = default;
    ~FadeStripeViewController() = default;
    Q_DISABLE_COPY(FadeStripeViewController)

    QMap<QWidget*, QMap<EFadeStripePosition, FadeStripeView*>> m_stripes;
};
