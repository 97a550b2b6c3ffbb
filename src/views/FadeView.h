// SPDX-License-Identifier: MIT
// FadeView: a panel at the edge of its parent that slides open from a thin strip.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QRect>
#include <QtCore/QVariant>
#include <QtWidgets/QWidget>

/// Length of every movement in milliseconds.
constexpr int c_Duration = 300;
/// Height of the closed strip in pixels. A panel of this height or less counts as closed.
constexpr int c_Bordersize = 15;

namespace vx
{
namespace PanelGeometry
{
struct Surroundings;
}
}

/// A panel along the top or the bottom edge of its parent that slides from a strip of 15 pixels to its full height
/// and back, and can take the whole height of the parent. "Fading" is a movement here; nothing becomes
/// transparent. The class paints nothing of its own: put a layout on it, or use FadeStripeView.
///
/// It works in one of two ways. As part of a layout (the default) it sets its height only, and the layout places
/// it. Otherwise it places itself over the other children of the parent, in the parent's full width; then call
/// resize() from the parent's resizeEvent(), since a panel does not watch its parent. The parent is required.
///
/// Signals in order, animated: fadein() gives fadingIn, then fadingInFinished and geometryChanged at the end;
/// fadeout() gives fadingOut, then fadingOutFinished and geometryChanged; goFullscreen() outside a layout gives
/// appearingFullscreen and changeViewOrientation(Qt::Vertical), then fullscreenAppeared; exitFullscreen() gives
/// leavingFullscreen, then changeViewOrientation(Qt::Horizontal) and fullscreenLeft. geometryChanged also comes
/// with every step of a movement, the first of them before the movement is announced.
///
/// A call during a movement starts another one, which takes over; the former never reports its end.
class ZELKOV_WIDGETS_EXPORT FadeView : public QWidget
{
    Q_OBJECT

public:
    /// The edge that the panel stands at.
    enum EPositions : int
    {
        ePositionTop = 0,
        ePositionBottom = 1
    };
    Q_ENUM(EPositions)

    static constexpr int c_Duration = ::c_Duration; ///< of a movement, in milliseconds
    static constexpr int c_Bordersize = ::c_Bordersize; ///< height of the strip, in pixels

    /// \a widget is for subclasses; this class makes no use of it. A new panel counts as open, though it has the
    /// height hint of the strip.
    FadeView(EPositions position, QWidget* widget, QWidget* parent);
    ~FadeView() override;

    bool isActive() const;
    /// An inactive panel ignores fadein() and fadeout(). A running movement goes on.
    void setActive(bool active);
    /// Whether the panel is open or about to open.
    bool isFadedIn() const;
    /// Whether the panel has the full height, after an animated goFullscreen().
    bool isFullscreen() const;
    /// The height that the panel has, or is about to have.
    int getSizeHint() const;
    void setSizeHint(int size, bool resizeNow);
    /// Which of the two ways the panel works in; a panel put into a layout is shown.
    void setFadeStripeAsPartOfLayout(bool partOfLayout);
    /// Height of another panel at the same edge. The panel keeps this distance from its edge on top in a layout,
    /// and at the bottom outside one.
    void setNeighbourSize(int size);
    /// The same as geometry(): nothing is taken off.
    QRect geometryOffsetFree() const;

Q_SIGNALS:
    /// The panel is open; followed by geometryChanged(). Not outside a layout without animation.
    void fadingInFinished(FadeView* view);
    /// The panel is a strip; followed by geometryChanged(). Not outside a layout without animation.
    void fadingOutFinished(FadeView* view);
    /// A movement that opens the panel begins; of a FadeStripeView also when a drag passes the height of the
    /// strip.
    void fadingIn(FadeView* view);
    /// The same for closing.
    void fadingOut(FadeView* view);
    // The movement to the full height begins, and that back from it.
    void appearingFullscreen();
    void leavingFullscreen();
    // The panel has the full height, and its former one again.
    void fullscreenAppeared();
    void fullscreenLeft();
    /// Vertical while the panel has the full height, horizontal again from when it has left it.
    void changeViewOrientation(Qt::Orientation orientation);
    /// Also when the panel is shown, and whenever resize() was asked to look again, changed or not.
    void geometryChanged(const QRect& geometry);

public Q_SLOTS:
    /// Takes note of the parent's size, or of a larger one, and puts the panel where it belongs. Hides the
    /// function of QWidget.
    void resize(int width = -1, int height = -1);
    /// Emits geometryChanged().
    void emitGeometryChange();
    /// In a movement of the first way: takes over the height of a rectangle, if that is valid.
    void changeSize(const QVariant& value);
    /// Opens to \a size from now on, or to the former size if that is not above 0. With \a force the movement
    /// starts at the strip and not where the panel is; in a layout it always does. Not animated and outside a
    /// layout the panel becomes a strip all the same and emits nothing: clients rely on it.
    void fadein(bool animated = true, bool force = false, int size = -1);
    /// Closes. Outside a layout the present height is what the next fadein() opens to. With \a force the movement
    /// starts at the full height and not where the panel is; in a layout it always does.
    void fadeout(bool animated = true, bool force = false);
    /// Takes the parent's full height; outside a layout only. Not animated it emits fullscreenAppeared() at once,
    /// but does not count as full height. A second call forgets the height to come back to. At the bottom edge the
    /// panel does not move.
    void goFullscreen(bool animated = true);
    /// Nothing unless isFullscreen(). Not animated the panel becomes a strip.
    void exitFullscreen(bool animated = true);
    /// Distance to the top edge of the parent, for panels there outside a layout. Counts from the next movement.
    void setVerticalOffset(int offset);

protected Q_SLOTS:
    // At the end of the movements. A subclass may declare slots of the same names: they are called in place of
    // these.
    void fadedIn();
    void fadedOut();
    void fullscreenEntered();
    void fullscreenExited();

protected:
    // The two ways of fadein() and fadeout(), outside a layout and in one.
    void fadeinIndependent(bool animated, bool force);
    void fadeinLayout(bool animated, bool force);
    void fadeoutIndependent(bool animated, bool force);
    void fadeoutLayout(bool animated, bool force);
    /// Called by the constructor.
    void init(EPositions position, QWidget* widget);

    void showEvent(QShowEvent* event) override;

    EPositions m_position; ///< the edge
    bool m_partOfLayout = true; ///< see setFadeStripeAsPartOfLayout()
    bool m_fullscreen = false; ///< see isFullscreen()
    bool m_fullscreenTransition = false; // stays on after a still goFullscreen()
    int m_parentHeight = 0; ///< as of the last resize()
    int m_parentWidth = 0; ///< as of the last resize()
    int m_sizeHint = c_Bordersize; ///< see getSizeHint()
    int m_maximumHeight = QWIDGETSIZE_MAX; // in a layout
    int m_stripeMinimumHeight = 0; // of a dragged height
    bool m_fadedIn = true; ///< see isFadedIn()
    int m_fadeInSize = 99; ///< what the next fadein() opens to
    int m_preFullscreenSize = 99; ///< what exitFullscreen() goes back to
    int m_verticalOffset = 0; ///< see setVerticalOffset()
    int m_layoutVerticalOffset = 0; // stored only
    int m_minimumSize = c_Bordersize; // of the opened height
    int m_neighbourOffset = 0; ///< distance from the edge
    int m_neighbourSize = 0; ///< see setNeighbourSize()
    bool m_active = true; ///< see setActive()

private:
    class Movement;

    vx::PanelGeometry::Surroundings surroundings() const;
    void liftHeightLock();
    void setOpenedSizeHint(int size);
    void updateNeighbourOffset();
};
