// SPDX-License-Identifier: MIT
// The bubble of a popover: a rounded body with a title bar and scrollable rows, and an arrow at its target.
#pragma once

#include "foundation/Export.h"
#include "popover/BalloonLook.h"

#include <QtCore/QPointer>
#include <QtCore/QPointF>
#include <QtCore/QRect>
#include <QtCore/QSizeF>
#include <QtGui/QColor>
#include <QtGui/QPainterPath>
#include <QtGui/QPixmap>
#include <QtWidgets/QWidget>

class QLabel;
class QPushButton;
class QScrollArea;
class QVBoxLayout;

namespace vx
{
namespace PopoverWidget
{
class Container;

/// The visible bubble of a popover. It shows a Container in a scroll area below a title bar, and a triangular arrow
/// whose tip touches a target, a widget or a rectangle. It chooses the edge that carries the arrow, places itself
/// beside the target, keeps inside its parent and paints its own background.
///
/// A balloon is the child of a Controller, which covers the area that the balloon may use, makes it in
/// setContainer() and shows and hides it; applications rarely make one themselves. All coordinates are those of the
/// parent, in logical pixels, unless said otherwise. The balloon owns its content through the scroll area and
/// never its target.
///
/// All properties can be set with `qproperty-` in style sheets. Parts have the object names "popoverTitle",
/// "popoverHelpButton", "popoverCloseButton" and "popoverSeparator". The two buttons have neither text nor picture
/// of their own.
class ZELKOV_WIDGETS_EXPORT Balloon : public QWidget
{
    Q_OBJECT
    /// Between title bar, header, rows and footer; the spacing of the main layout. Default 0.
    Q_PROPERTY(int spacing READ spacing WRITE setSpacing)
    /// Between the painted body and the content. Default 4; heeded by the next layout pass.
    Q_PROPERTY(int innerMargin READ innerMargin WRITE setInnerMargin)
    /// Least distances from the edges of the parent. Default 4; in force at once while the balloon is visible.
    Q_PROPERTY(int topBorderMargin READ topBorderMargin WRITE setTopBorderMargin)
    Q_PROPERTY(int bottomBorderMargin READ bottomBorderMargin WRITE setBottomBorderMargin)
    Q_PROPERTY(int leftBorderMargin READ leftBorderMargin WRITE setLeftBorderMargin)
    Q_PROPERTY(int rightBorderMargin READ rightBorderMargin WRITE setRightBorderMargin)
    /// From the body to the tip of the arrow. Default 15; heeded by the next layout pass.
    Q_PROPERTY(int arrowLength READ arrowLength WRITE setArrowLength)
    /// Half the width of the arrow's base. Default 15; heeded by the next repaint.
    Q_PROPERTY(int arrowWidth READ arrowWidth WRITE setArrowWidth)
    /// Colour of the lower right of the body. With only one of the two body colours set, the body has that colour;
    /// with none, the palette gives them. Default invalid, heeded by the next repaint, as the next three are.
    Q_PROPERTY(QColor backgroundColor READ backgroundColor WRITE setBackgroundColor)
    /// Colour of the upper left half of the body.
    Q_PROPERTY(QColor backgroundColor2 READ backgroundColor2 WRITE setBackgroundColor2)
    /// Colour of the outline. Invalid: none, or a line from the palette if the body colours are invalid too.
    Q_PROPERTY(QColor borderColor READ borderColor WRITE setBorderColor)
    /// Radius of the corners. Default 6; 0 gives a plain rectangle.
    Q_PROPERTY(int borderRadius READ borderRadius WRITE setBorderRadius)

public:
    /// An edge of the balloon that carries the arrow.
    enum EArrowDirection : int
    {
        eadTop = 1, ///< the balloon lies below its target
        eadBottom = 2, ///< the balloon lies above its target
        eadLeft = 4, ///< the balloon lies to the right of its target
        eadRight = 8 ///< the balloon lies to the left of its target
    };
    Q_DECLARE_FLAGS(EArrowDirections, EArrowDirection)

    /// The parts of the title bar.
    enum EBalloonFeature : int
    {
        ebfClose = 1, ///< close button visible
        ebfHelp = 2, ///< help button visible
        ebfTitle = 4, ///< title visible
        ebfNoHeader = 8 ///< the whole title bar hidden
    };
    Q_DECLARE_FLAGS(EBalloonFeatures, EBalloonFeature)

    /// The sides of the configured size that count.
    enum ESizeConstraint : int
    {
        escWidth = 1, ///< the configured width replaces the width of the content
        escHeight = 2 ///< the configured height replaces the height of the content
    };
    Q_DECLARE_FLAGS(ESizeConstraints, ESizeConstraint)

    /// Builds the bubble, hidden within @p parent. @p forWidget is the target, or null. Takes the container, with
    /// the header and the footer that it has by now. @p size counts if it is neither null nor invalid, and only the
    /// sides named in @p constraints.
    Balloon(QWidget* parent, QWidget* forWidget, Container* container, QFlags<EBalloonFeature> features,
        QFlags<EArrowDirection> directions, const QSizeF& size, QFlags<ESizeConstraint> constraints);
    ~Balloon() override;

    // See the properties of the same names.
    int spacing() const;
    void setSpacing(int spacing);
    int innerMargin() const;
    void setInnerMargin(int margin);
    // Least distances from the edges of the parent. Default 4; in force at once while the balloon is visible.
    int topBorderMargin() const;
    void setTopBorderMargin(int margin);
    int bottomBorderMargin() const;
    void setBottomBorderMargin(int margin);
    int leftBorderMargin() const;
    void setLeftBorderMargin(int margin);
    int rightBorderMargin() const;
    void setRightBorderMargin(int margin);
    int arrowLength() const;
    void setArrowLength(int length);
    int arrowWidth() const;
    void setArrowWidth(int width);
    QColor backgroundColor() const;
    void setBackgroundColor(const QColor& color);
    QColor backgroundColor2() const;
    void setBackgroundColor2(const QColor& color);
    QColor borderColor() const;
    void setBorderColor(const QColor& color);
    int borderRadius() const;
    void setBorderRadius(int radius);

    /// Points the balloon at another widget, or at none (null). @p relative is a point within the target that the
    /// arrow touches; each of its coordinates counts only if it is greater than 0, so (-1, 0) is no point.
    void setForWidget(const QWidget* widget, const QPointF& relative);
    /// The target; null without one, and once it is destroyed.
    const QWidget* forWidget() const;
    /// The scroll area that shows the rows.
    QScrollArea* content() const;
    /// The container that was given to the constructor; null once it is destroyed.
    Container* contentWidget() const;

    /// The sides that the next layout pass may choose from. Of top and bottom, where both are allowed, the one with
    /// more room wins; left and right are looked at only where that pair is not complete. 0: no arrow.
    void setPreferredArrowDirections(QFlags<EArrowDirection> directions);
    /// Shows and hides the parts of the title bar.
    void setFeatures(QFlags<EBalloonFeature> features);
    QFlags<EBalloonFeature> getFeatures() const;
    /// The text of the title; shown with ebfTitle.
    void setTitle(const QString& title);
    /// The four border margins.
    void margins(int& left, int& top, int& right, int& bottom) const;

    /// The size that the content asks for, with the title bar, the margins and the strip of the arrow as they are
    /// now; the configured size does not count here.
    QSize sizeHint() const override;

    /// Raises the balloon and then the handles of its sliders, which stand over @p over.
    void raiseBalloon(QWidget* over);

Q_SIGNALS:
    /// The close button was clicked, or the strip beside the arrow.
    void dismiss();
    /// The help button was clicked.
    void help();
    /// Not emitted by the balloon itself; for subclasses.
    void layoutUpdated();
    /// The rows were scrolled, by the user or by a layout.
    void contentScrolled();

public Q_SLOTS:
    /// Points the balloon at a rectangle. While it is valid it gives the extent of the target even if a target
    /// widget is set; the place is then still counted from that widget.
    void setForRect(const QRect& rect);
    /// Sets the four border margins with one layout pass.
    void setMargins(int left, int top, int right, int bottom);
    /// The layout pass: chooses the side of the arrow and sets the geometry and the margins. Does nothing while the
    /// balloon is not visible, unless @p ignoreVisibility is set. Changes of the rows come here by themselves, one
    /// turn of the event loop later.
    void setupLayout(bool ignoreVisibility = false);
    /// Showing runs a layout pass.
    void setVisible(bool visible) override;

private Q_SLOTS:
    void forWidgetDestroyed();

protected:
    /// A release on the strip beside the arrow emits dismiss().
    void mouseReleaseEvent(QMouseEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    void buildTree(Container* container);
    void updateHeaderLayout();
    QFlags<EArrowDirection> getPreferredArrowDirection() const;
    QRect getForRect() const;
    QPointF getPosition() const;
    QPointF createAnchorPointFromRect(const QRect& rect, const QPointF& relative, int side) const;
    QSize getBalloonSizeFromContent() const;
    QRectF frameRect(
        const QRectF& parentRect, const QSizeF& size, const QPointF& anchor, int side, int arrowLength) const;
    QRectF innerRect() const;
    bool drawArrow() const;
    QPainterPath getPainterPathForDownArrow(int arrowWidth, int arrowLength, int side, const QPointF& anchor) const;

    QPointF m_anchorPoint; // tip of the arrow
    const QWidget* m_forWidget;
    QPointF m_relativePoint; // within the target; coordinates above 0 count
    QRect m_forRect;
    QSizeF m_fixedSize;
    QFlags<ESizeConstraint> m_sizeConstraints;
    QWidget* m_titleBar = nullptr;
    QLabel* m_titleLabel = nullptr;
    QPushButton* m_closeButton = nullptr;
    QPushButton* m_helpButton = nullptr;
    QPointer<Container> m_container;
    QScrollArea* m_scrollArea = nullptr;
    QPointer<Container> m_header; // as last put into the layout
    QPointer<Container> m_footer;
    QFlags<EArrowDirection> m_allowedDirections;
    QFlags<EArrowDirection> m_arrowDirection; // one side, 0 or 15
    int m_innerMargin = 4;
    int m_topBorderMargin = 4;
    int m_bottomBorderMargin = 4;
    int m_leftBorderMargin = 4;
    int m_rightBorderMargin = 4;
    int m_arrowLength = 15;
    int m_arrowWidth = 15;
    int m_borderRadius = 6;
    QColor m_backgroundColor;
    QColor m_backgroundColor2;
    QColor m_borderColor;
    QFlags<EBalloonFeature> m_features;

    QVBoxLayout* m_mainLayout = nullptr;
    mutable QSize m_contentHint; // of the container when it was last adjusted

    struct Body
    {
        BalloonLook look;
        QPainterPath path;
        QPixmap picture; // null until it is painted again
    };
    Body m_body; // as last painted
    bool m_wasShown = false;
};

Q_DECLARE_OPERATORS_FOR_FLAGS(Balloon::EArrowDirections)
Q_DECLARE_OPERATORS_FOR_FLAGS(Balloon::EBalloonFeatures)
Q_DECLARE_OPERATORS_FOR_FLAGS(Balloon::ESizeConstraints)
}
}
