// SPDX-License-Identifier: MIT
// Fades a whole widget in and out, and hides it at the end of a fade-out.
#pragma once

#include "foundation/Export.h"

#include <QByteArray>
#include <QPointer>
#include <QPropertyAnimation>
#include <QVariant>
#include <QWidget>

/// Animates an opacity for one widget: fadeIn() shows the widget and raises the opacity to 1, fadeOut() lowers it to
/// 0 and hides the widget.
///
/// The opacity reaches the screen in one of two ways. By default the animation only keeps the number and repaints
/// the widget, which paints itself with getOpacity(): FadableThing does. With setFadeChildren(true) a
/// QGraphicsOpacityEffect is installed, which fades the child widgets as well and needs no help from the widget, but
/// costs an off-screen picture of it.
///
/// A fade starts at the present opacity and always takes its full time, so that one fade can take over from the other
/// at any moment without a jump. The one that was interrupted emits nothing; the one that ends emits once. stop()
/// leaves the opacity where it is and emits nothing, unless the end had been reached.
///
/// The object belongs to the widget. Making one takes away any graphics effect that the widget had. The fade is
/// linear; use setEasingCurve() for another.
class ZELKOV_WIDGETS_EXPORT OpacityAnimation : public QPropertyAnimation
{
    Q_OBJECT
    /// 0 (transparent) to 1; not clamped. Default 0.
    Q_PROPERTY(double opacity READ getOpacity WRITE setOpacity)

public:
    static const int s_FadeInTime;  ///< 1000 ms
    static const int s_FadeOutTime; ///< 350 ms

    /// Fades \a widget, which owns the animation; its graphics effect is taken away.
    explicit OpacityAnimation(QWidget* widget);

    /// The same as with the widget alone: \a target and \a property are replaced by the opacity.
    OpacityAnimation(QObject* target, const QByteArray& property, QWidget* widget);

    ~OpacityAnimation() override;

    /// Raises the opacity to 1. A widget that is not visible is shown, and begins at 0; a visible one goes on from
    /// its present opacity. didFadeIn() follows.
    void fadeIn();

    /// Lowers the opacity to 0 from its present value; didFadeOut() follows.
    void fadeOut();

    /// Milliseconds of the fades to come; a running fade keeps its time.
    void setFadingTimes(int in, int out);

    double getOpacity() const;

    /// Sets the opacity at once, also that of the effect if there is one. Does not repaint and does not emit; a
    /// running fade overwrites it.
    void setOpacity(double opacity);

    /// Whether the end of a fade-out hides the widget; default true.
    bool autoHide() const;
    void setAutoHide(bool on);

    /// Whether a QGraphicsOpacityEffect does the fading; default false.
    bool fadeChildren() const;

    /// Installs an opacity effect with the present opacity, or takes away the widget's effect, whatever it is. To be
    /// called between fades: a fade that is running through the effect ends with it, and emits nothing.
    ///
    /// While the effect does the fading, getOpacity() keeps the value it had: ask the effect.
    void setFadeChildren(bool on);

Q_SIGNALS:
    /// The opacity has arrived at 1.
    void didFadeIn();
    /// The opacity has arrived at 0. The widget is hidden by now, if autoHide() is on.
    void didFadeOut();

public Q_SLOTS:
    /// Called at the end of a fade-out. Overrides call the base, which hides the widget and emits.
    virtual void fadedOut();
    /// Called at the end of a fade-in. Overrides call the base, which emits.
    virtual void fadedIn();
    /// Writes \a value to the log, for tracing: connect valueChanged() to it. Not connected by default.
    void onValueChanged(const QVariant& value);

private:
    void initialise();
    bool interrupt();
    void startFade(int duration, float end);

    int m_fadeInTime;
    int m_fadeOutTime;
    bool m_fadeChildren;
    bool m_autoHide;
    double m_opacity;
    QPointer<QWidget> m_widget;
};
