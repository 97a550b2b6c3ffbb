// SPDX-License-Identifier: MIT
// A check box that looks and works like a sliding switch.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPointF>
#include <QtCore/QPropertyAnimation>
#include <QtCore/QRect>
#include <QtCore/QString>
#include <QtGui/QPixmap>
#include <QtWidgets/QCheckBox>

class QMouseEvent;
class QPainter;
class QPaintEvent;
class QResizeEvent;

/// A sliding switch. A strip picture, on half at its left and off half at its right, slides behind a window; the user
/// clicks it or drags the strip, which snaps to the nearer side.
///
/// It is a QCheckBox, with its signals: toggled() and stateChanged(), but from the mouse neither pressed(), released()
/// nor clicked(). Its text is not shown. A click animates, a change from code or the end of a drag jumps, unless
/// setAnimationMode(true). Any mouse button works it. A style sheet lays a frame or mask over the strip.
class ZELKOV_WIDGETS_EXPORT iOSCheckBox : public QCheckBox
{
    Q_OBJECT
    /// Where the top left corner of the strip stands, in the switch's coordinates; what is animated.
    Q_PROPERTY(QPointF iconPosition READ getIconPosition WRITE setIconPosition)

public:
    /// A strip that cannot be loaded draws nothing; the switch works all the same.
    explicit iOSCheckBox(QWidget* parent = nullptr, bool checked = false,
        QString path = QStringLiteral(":/iOSCheckBox/iOSCheckBox.png"));
    ~iOSCheckBox() override;

    /// 72 x 18.
    QSize sizeHint() const override;

    /// Slides the strip to the side of \a on without changing the state. The time is proportional to the way that is
    /// left towards the side of the present state, so it jumps when the strip stands there or beyond.
    void animateTo(bool on);

    /// Whether changes of the state slide the strip. Off by default; a click leaves it off.
    bool getAnimationModeOn() const;
    /// See getAnimationModeOn().
    void setAnimationMode(bool on);

public Q_SLOTS:
    /// Also puts the strip on the side of the present state.
    void setVisible(bool visible) override;

protected:
    // The members themselves, for subclasses.
    const QPixmap* controlMacCheckBox() const;
    /// Milliseconds for a whole crossing; 300 at first.
    int* controlIconAnimationDuration();
    /// Where the strip stands.
    QPointF* controlIconPosition();

    /// The strip in that size, kept until another size is asked for. Null without a picture.
    const QPixmap& scaledStrip(const QSize& size);

    void checkStateSet() override;
    void nextCheckState() override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

    /// Brings the strip to \a target as a change of the state does: slides in animation mode, else jumps.
    void placeStrip(const QPointF& target);

private:
    friend class AnimatedCheckBox;

    virtual QRect getControlRect();
    virtual QPoint maximumRightPosition();
    virtual QPoint maximumLeftPosition();
    virtual void draw(QPaintEvent* event, QPainter& painter);
    virtual int getIconOffset() const;

    QPointF getIconPosition() const;
    void setIconPosition(const QPointF& position);
    void animateTo(const QPointF& target);
    int getDurationForPosition(bool right) const;

    QPixmap m_pixmap;
    QPointF m_iconPosition;
    QPropertyAnimation* m_animation;
    bool m_pressed = false;
    bool m_dragged = false;
    QPointF m_lastPos; // of the drag, own coordinates
    bool m_animationMode = false;
    int m_iconAnimationDuration = 300;
    QPointF m_restPosition; // where the strip was last put to stay
    QPixmap m_scaled;
};
