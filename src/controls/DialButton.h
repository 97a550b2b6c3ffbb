// SPDX-License-Identifier: MIT
// A rotary control with a knob of pictures, a rebound and a value balloon.
#pragma once

#include "foundation/Export.h"
#include "popover/PopoverBalloonWidget.h"

#include <QtCore/QPoint>
#include <QtCore/QTimer>
#include <QtGui/QBrush>
#include <QtGui/QPalette>
#include <QtGui/QPixmap>
#include <QtWidgets/QDial>

namespace vx
{
/// A QDial that looks like a knob of pictures, is dragged along the horizontal axis in place of around the knob, can
/// spring back to a default value when it is let go, and shows its value in a balloon while it turns. It can be
/// toggled too.
///
/// A left press without modifiers does not turn the dial; the moves that follow do. Pressing and releasing sets and
/// clears the checked state: clients rely on it. Its order of signals is toggled(true), pressed(); while it is turned
/// valueChanged(); toggled(false), released(), valueChanged(), reboundPerformed().
///
/// Margins and paddings are mirrored: the left edge is inset by the right ones and the right edge by the left ones.
/// Clients rely on it.
class ZELKOV_WIDGETS_EXPORT DialButton : public QDial, public PopoverBalloonWidget
{
    Q_OBJECT
    Q_PROPERTY(QPixmap image READ image WRITE setImage)
    Q_PROPERTY(QPixmap button READ button WRITE setButton)
    Q_PROPERTY(QPixmap handle READ handle WRITE setHandle)
    Q_PROPERTY(bool checked READ isChecked WRITE setChecked)
    Q_PROPERTY(bool active READ isActive WRITE setActive)
    Q_PROPERTY(int rightmargin READ rightMargin WRITE setRightMargin)
    Q_PROPERTY(int leftmargin READ leftMargin WRITE setLeftMargin)
    Q_PROPERTY(int topmargin READ topMargin WRITE setTopMargin)
    Q_PROPERTY(int bottommargin READ bottomMargin WRITE setBottomMargin)
    Q_PROPERTY(int rightpadding READ rightPadding WRITE setRightPadding)
    Q_PROPERTY(int leftpadding READ leftPadding WRITE setLeftPadding)
    Q_PROPERTY(int toppadding READ topPadding WRITE setTopPadding)
    Q_PROPERTY(int bottompadding READ bottomPadding WRITE setBottomPadding)

public:
    /// Palette roles of the knob that is drawn where there is no picture.
    static const QPalette::ColorRole BackgroundNormal;  ///< QPalette::Button
    static const QPalette::ColorRole BackgroundChecked; ///< QPalette::Mid

    /// The value stays where QDial has it; only reset() and the rebound go to the default.
    explicit DialButton(int defaultValue, QWidget* parent = nullptr);
    explicit DialButton(QWidget* parent = nullptr); //!< default value 8
    ~DialButton() override;

    bool isChecked() const; //!< checkable and checked
    bool isDown() const;    //!< pressed by the mouse; not at the very top left pixel
    bool isActive() const;  //!< for style sheets
    bool isCheckable() const; //!< default true
    void setCheckable(bool checkable);

    /// What reset() and the rebound go to. Setting it moves nothing.
    int defaultValue() const;
    void setDefaultValue(int value);
    bool reboundEnabled() const; //!< default false
    /// Whether the value returns to the default when the dial is let go after a move.
    void setReboundEnabled(bool enabled);
    /// Sets the default value.
    void reset();

    /// Interval in milliseconds of the timer that tells a click from a turn. Default 200. Nothing starts it.
    void setMouseClickSensitivity(int milliseconds);
    int mouseClickSensitivity() const;
    /// Whether the dial is dragged horizontally (the default) or around. Turning it on turns wrapping off; turning it
    /// off leaves wrapping as it is. Holds from the next press.
    void setHorizontalMouseTracking(bool horizontal);
    bool horizontalMouseTracking() const;

    QPixmap image() const;
    void setImage(const QPixmap& image); //!< background plate, scaled to the widget less the margins
    QPixmap button() const;
    void setButton(const QPixmap& button); //!< the knob; without a handle it turns itself
    QPixmap handle() const;
    void setHandle(const QPixmap& handle); //!< orbits the knob at a quarter of its size; nothing without a knob

    // Pixels between the edges and the background plate; 0 at first. Mirrored: the left edge is inset by the
    // right margin.
    int rightMargin() const;
    void setRightMargin(int pixels);
    int leftMargin() const;
    void setLeftMargin(int pixels);
    int topMargin() const;
    void setTopMargin(int pixels);
    int bottomMargin() const;
    void setBottomMargin(int pixels);
    // Pixels between the plate and the knob; 0 at first. Mirrored as the margins are.
    int rightPadding() const;
    void setRightPadding(int pixels);
    int leftPadding() const;
    void setLeftPadding(int pixels);
    int topPadding() const;
    void setTopPadding(int pixels);
    int bottomPadding() const;
    void setBottomPadding(int pixels);

    /// See dialAngle(). Radians.
    double angleFromValue(int value) const;
    /// Own coordinates.
    QPointF pointFromAngle(double angle, double radius);
    /// A point in the direction of the value, outside of the widget: only its direction counts for QDial.
    QPointF pointFromValue(int value);

    /// A round gradient over the bounding box of what is painted, for surfaces that match.
    static QRadialGradient gradient(const QColor& inner, const QColor& outer);

    QSize sizeHint() const override;

public Q_SLOTS:
    /// Sets the checked state too and emits toggled(), changed or not.
    void setDown(bool down = true);
    /// Emits toggled(), changed or not.
    void setChecked(bool checked);
    /// A state for style sheets. No signal.
    void setActive(bool active);
    /// Flips the state, also of a dial that is not checkable.
    void toggle();

Q_SIGNALS:
    /// For clients; this class does not emit it.
    void clicked(bool checked = false);
    /// The user pressed the dial; comes after toggled(true).
    void pressed();
    /// The user let the dial go; comes after toggled(false).
    void released();
    /// The checked state was set, changed or not.
    void toggled(bool checked);
    /// The dial has returned to its default value, after released(). Not without a move.
    void reboundPerformed(int value);

protected Q_SLOTS:
    /// End of the timer of setMouseClickSensitivity(), which nothing starts.
    void onTimeout();
    /// Shows the value in the balloon.
    void updateBalloon(int value);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    QMouseEvent* createMouseEvent(QMouseEvent* event, const QPoint& reference, int value);
    void freeMouseEvent(QMouseEvent* event, QMouseEvent* made);
    void init();
    void rePolish();
    QRect insetRect(bool withPadding) const;
    void paintTurnedButton(QPainter& painter, const QRect& inner);
    void paintOrbitingHandle(QPainter& painter, const QRect& inner);

    bool m_checkable;
    bool m_checked;
    bool m_active;
    QPoint m_pressPos;
    QPoint m_downPos;
    QTimer m_clickTimer;
    int m_valueAtPress = 0;
    bool m_horizontalTracking;
    bool m_horizontalNow;
    QPoint m_lastMousePos;
    QPixmap m_image;
    QPixmap m_button;
    QPixmap m_handle;
    int m_defaultValue;
    bool m_reboundEnabled;
    int m_rightMargin = 0;
    int m_leftMargin = 0;
    int m_topMargin = 0;
    int m_bottomMargin = 0;
    int m_rightPadding = 0;
    int m_leftPadding = 0;
    int m_topPadding = 0;
    int m_bottomPadding = 0;
    bool m_moved;
};
}
