// SPDX-License-Identifier: MIT
// vx::RubberBandWidget: a rectangle over a view that the user moves and resizes.
#pragma once

#include "foundation/Export.h"
#include "ZelkovUtils/CoordinateSystem.h"

#include <QtCore/QPoint>
#include <QtCore/QRect>
#include <QtCore/QRectF>
#include <QtCore/QString>
#include <QtGui/QColor>
#include <QtGui/QPen>
#include <QtGui/QPolygon>
#include <QtWidgets/QWidget>

class QLabel;
class QPushButton;

namespace vx
{
/// Marks a region of what its parent shows: a frame with a translucent fill, a label and a close button. The user
/// moves it by its inside and resizes it by edges and corners; Shift keeps the proportions.
///
/// What is edited is the rectangle in the application's units, and the widget follows it: a CoordinateSystem,
/// which is not owned and has to outlive its use here, converts between the two. Its screen pixels are those of
/// the parent. A band does not follow changes of the scale by itself: give it its geometry again with
/// setApplicationGeometry() when the parent was resized.
///
/// The widget is 4 pixels larger on each side than the marked area, so that the edges can be gripped from outside.
///
/// A drag emits startDrag() at the press, dragging() with each move and endDrag() at the release, without any
/// movement too. The pointer of every signal is known to the meta-type system as "vx::RubberBandWidget*" from the
/// moment the library is loaded.
class ZELKOV_WIDGETS_EXPORT RubberBandWidget : public QWidget
{
    Q_OBJECT

public:
    /// What the pointer holds. A bit set: corners are the sum of two sides.
    enum Grip : int
    {
        gNone = 0,
        gLeft = 1,
        gRight = 4,
        gTop = 16,
        gTopLeft = 17,
        gTopRight = 20,
        gInside = 34,
        gBottom = 64,
        gBottomLeft = 65,
        gBottomRight = 68
    };
    Q_ENUM(Grip)

    /// Without a geometry; \a coordinateSystem is not owned and may be null.
    explicit RubberBandWidget(vx::CoordinateSystem* coordinateSystem, QWidget* parent = nullptr);
    ~RubberBandWidget() override;

    /// Shows \a rect, in the application's units. A ratio (width / height) other than IGNORE_ASPECT_RATIO is kept
    /// for the drags to come; that one leaves a former ratio in force, see setAspectRatio().
    virtual void setApplicationGeometry(
        const QRectF& rect, double ratio = vx::CoordinateSystem::IGNORE_ASPECT_RATIO);
    /// The proportions that drags enforce: a ratio in the application's units, CALC_ASPECT_RATIO for those at the
    /// press, or IGNORE_ASPECT_RATIO (the default), with which holding Shift does the same as CALC_ASPECT_RATIO.
    /// Counts from the next move on; the present geometry is left alone.
    virtual void setAspectRatio(double ratio);
    /// Where the marked area stands in the parent. The application geometry is left alone.
    virtual void setContentsGeometry(const QRect& rect);
    /// Shown in the top left corner; an empty text hides the label.
    virtual void setLabel(const QString& text);
    // Pen, colour and style of the frame.
    virtual void setFramePen(const QPen& pen);
    virtual void setFrameColor(const QColor& color);
    virtual void setFrameStyle(Qt::PenStyle style);
    /// In pixels; twice as wide while selected. Below 0 counts as 0, which is the thinnest line. The wider the
    /// frame, the wider the grips of the edges.
    virtual void setFrameWidth(int width);
    /// Of the inside, with its alpha.
    virtual void setBackgroundColor(const QColor& color);
    /// From 0 (seen through) to 1 (opaque); sets the alpha of the background colour.
    virtual void setBackgroundTransparency(float transparency);
    /// One colour for frame and background, the background with this transparency.
    virtual void setColors(const QColor& color, float transparency);
    /// Emits selected() or selectionLost() if that is a change. Nothing but the frame depends on it.
    virtual void select(bool on);
    /// Not owned. A band that has a geometry is shown where the new system puts it. Without a system (null) the
    /// band can be dragged, but stays where it is.
    virtual void setCoordinateSystem(vx::CoordinateSystem* coordinateSystem);

protected:
    // What the band paints, in its own coordinates: the contents first, then the frame.
    virtual void drawFrame(QPainter* painter);
    virtual void drawContents(QPainter* painter);

public:
    /// Starts a drag as a press does. For clients that let the user draw a new band: give it a size of one pixel
    /// where the press was, call this with gBottomRight and grab the mouse with it. \a position is global.
    virtual void startDragging(QPoint position, Grip grip);

protected:
    /// What a move of the pointer to \a position (global) does, measured from the press: \a rect and \a geometry
    /// come with the rectangles at the press, in pixels of the parent and in the application's units, and go with
    /// the new ones.
    virtual void calcDrag(QRect& rect, QRectF& geometry, double ratio, const QPoint& position);

protected Q_SLOTS:
    /// The close button was clicked: emits closeClicked() and does nothing else.
    virtual void onClose();

Q_SIGNALS:
    // The pointer came over the band, and left it.
    void mouseEntered(vx::RubberBandWidget* band);
    void mouseLeft(vx::RubberBandWidget* band);
    /// A press on a grip, before anything moves.
    void startDrag(vx::RubberBandWidget* band);
    /// The geometry has been changed by the pointer, or would have been.
    void dragging(vx::RubberBandWidget* band);
    /// The release that ends the drag, moved or not.
    void endDrag(vx::RubberBandWidget* band);
    // The band got the focus and has been raised, and lost it.
    void focused(vx::RubberBandWidget* band);
    void focusLost(vx::RubberBandWidget* band);
    // select() has changed something.
    void selected(vx::RubberBandWidget* band);
    void selectionLost(vx::RubberBandWidget* band);
    /// The close button was clicked; the band stays.
    void closeClicked(vx::RubberBandWidget* band);

public:
    /// The region in the application's units.
    QRectF applicationGeometry() const;
    /// See select().
    bool isSelected() const;
    /// Whether an edge or corner is held, or merely under the pointer.
    bool isResizeDragging() const;
    QString label() const;
    /// As it was set; twice as wide is drawn while selected.
    QPen framePen() const;

    /// The marked area in this widget's coordinates.
    QRect contentsRect() const;
    /// The rectangle on whose inner side the frame runs: contentsRect().
    QRect frameRect() const;
    /// The marked area in the parent's coordinates.
    QRect contentsGeometry() const;

    /// The grip at a point of this widget. Never gNone within it.
    Grip findGrip(const QPoint& point) const;
    /// The grip of any rectangle: its edges reach \a margin pixels to both sides, ends included. Bit 1 of \a modes
    /// asks for edges and corners, bit 2 for the inside. Left goes before right, top before bottom.
    static Grip findGrip(const QRect& rect, const QPoint& point, int margin, int modes);
    /// A polygon can only be gripped as a whole: gInside in it (odd-even rule) or on its outline, gNone elsewhere
    /// and for fewer than three points.
    static Grip findGrip(const QPolygon& polygon, const QPoint& point);
    /// The cursor over a grip, and while it is dragged.
    static QCursor getCursor(Grip grip, bool dragging);

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void enterEvent(QEvent* event) override;
    void leaveEvent(QEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;

private:
    void showGeometry();

    vx::CoordinateSystem* m_coordinateSystem;
    QRectF m_applicationGeometry;
    QColor m_backgroundColor;
    QPen m_framePen;
    bool m_selected = false;
    double m_aspectRatio = vx::CoordinateSystem::IGNORE_ASPECT_RATIO;
    QLabel* m_label;
    QPushButton* m_closeButton;
    Grip m_grip = gNone;
    QPoint m_dragStart {-1, -1}; // global; a negative x means no drag
    QRect m_dragStartGeometry;
    QRectF m_dragStartApplicationGeometry;
};
}
