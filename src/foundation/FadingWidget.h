// SPDX-License-Identifier: MIT
// What makes a button pulse, and draws an overlay picture and a badge on it.
#pragma once

#include "foundation/Export.h"
#include "indicators/BadgeDrawer.h"

#include <QColor>
#include <QImage>
#include <QPointer>
#include <QRect>
#include <QString>
#include <QTimer>
#include <QVector>
#include <QWidget>

class QPaintEvent;
class QPoint;

namespace vx
{
/// A mix-in beside a widget class: it lays a tint over the widget's icon that rises and falls to catch the eye, and
/// draws a picture and a badge on top. TFadingWidget puts it together with Qt's buttons; other widgets derive from
/// both and call paintEvent() at the end of their own.
///
/// The tint has the shape of the button's icon or, where the button has none, of the picture that the style sheet
/// gives to it. The shape is looked up once, at the first painted frame of a pulse: a button whose icon changes
/// keeps pulsing with the first shape. Without a shape, the pulse runs unseen.
///
/// The timer only asks for repaints; the alpha moves by one step in each painted frame, so that repaints for other
/// reasons quicken the pulse.
///
/// The widget must not die before this object; as a base class beside it, it does not.
class ZELKOV_WIDGETS_EXPORT FadingWidget
{
public:
    /// \a interval is the milliseconds between two frames, \a step the change of the alpha in each frame, which must
    /// not be 0. The alpha goes from \a minAlpha to \a maxAlpha and back, within 0 to 255; that of \a color itself
    /// is not used.
    FadingWidget(QWidget* widget, int interval, int step, QColor color, int minAlpha, int maxAlpha);
    virtual ~FadingWidget();
    FadingWidget(const FadingWidget&) = delete;
    FadingWidget& operator=(const FadingWidget&) = delete;

    /// Starts the pulse at the lower limit; nothing if it runs. It goes on until stopFading(), but after one
    /// fadeOnce() it is a single rise that stops at the top.
    void startFading();

    /// Ends the pulse, takes the tint away and repaints; nothing if no pulse runs.
    void stopFading();

    /// One fall from the upper limit to the lower; nothing if a pulse runs.
    void fadeOnce();

    /// The alpha of the tint, 0 to 255; values outside are taken to the nearer end. Does not repaint. Starting a
    /// pulse sets it anew.
    void setAlpha(int alpha);

    /// Loads a picture that is drawn over the widget; an empty \a file takes it away. It stands as \a alignment says
    /// in the widget's present rectangle, moved by \a offset, or with its top left at \a offset if \a alignment
    /// holds Qt::AlignAbsolute. It does not move when the widget is resized. Repaints.
    void setOverlay(const QString& file, Qt::Alignment alignment, const QPoint& offset);
    bool hasOverlay() const;

    /// The badge in the top right corner.
    BadgeDrawer& badge();

    /// Draws tint, overlay and badge, and takes the pulse one step on. Does nothing, not even open a painter, if
    /// there is none of them. For the widget's own paintEvent(), after its own painting.
    void paintEvent(QPaintEvent* event);

    /// Whether the widget's own painting is to be left out; always false.
    bool paintSelf(QPaintEvent* event);

protected:
    /// Looks up shape and place of the tint, once in the life of the widget.
    void preparePaint(QPaintEvent* event);

    QPointer<QWidget> m_widget; ///< the button itself
    BadgeDrawer m_badge; ///< see badge()
    int m_interval; ///< of the timer, in milliseconds
    int m_step;              ///< its sign is the present direction
    QColor m_color;          ///< its alpha is the running value
    int m_minAlpha; ///< where the pulse turns, 0 to 255
    int m_maxAlpha; ///< where the pulse turns, 0 to 255
    bool m_once;             ///< stop at the next limit; never cleared
    QTimer m_timer; ///< runs during a pulse
    QRect m_rect;            ///< where the shape stands, in the widget's coordinates
    QImage m_image;          ///< the shape, ARGB32 in either form
    QVector<QImage> m_tinted; ///< by alpha level: steps above the lower limit
    QImage m_overlay; ///< see setOverlay(); null without one
    QRect m_overlayRect; ///< in the widget's coordinates

private:
    QImage loadFromStyleSheet() const;
    void drawTint(QPainter& painter);
    QImage tintedImage() const;

    bool m_prepared = false;
};
}
