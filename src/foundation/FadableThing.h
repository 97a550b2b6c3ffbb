// SPDX-License-Identifier: MIT
// Base of widgets that fade in and out as a whole.
#pragma once

#include "foundation/Export.h"
#include "foundation/OpacityAnimation.h"

#include <QWidget>

class QPainter;
class QPaintEvent;

/// A widget with a fader: it paints its style-sheet look with the opacity that the fader animates.
///
/// Derive from FadableThing<QWidget> and call `fader()->fadeIn()` and `fader()->fadeOut()`. Child widgets do not fade
/// along unless `fader()->setFadeChildren(true)` was called. The widget then paints nothing itself and draw() is not
/// called: set Qt::WA_StyledBackground to have Qt paint the style sheet's background.
///
/// A new widget has the opacity 0: it is transparent until it has been faded in, or until
/// `fader()->setOpacity(1)`. A subclass should have Q_OBJECT: without it a style sheet takes the widget for a plain
/// QWidget, and Qt paints the background at full strength below. Instantiated for QWidget only.
template <typename T>
class FadableThing : public T
{
public:
    explicit FadableThing(QWidget* parent);
    ~FadableThing() override;

    /// Owned by the widget, never null.
    OpacityAnimation* fader() const;

protected:
    void paintEvent(QPaintEvent* event) override;

    /// Paints the widget with the present opacity, which it sets on \a painter. The base paints what the style sheet
    /// says. Not called while the children fade along.
    virtual void draw(QPaintEvent* event, QPainter& painter);

private:
    OpacityAnimation* m_fader;
};

extern template class ZELKOV_WIDGETS_EXPORT FadableThing<QWidget>;
