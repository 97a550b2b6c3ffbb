// SPDX-License-Identifier: MIT
// A slider with any number of handles on one scale: the time line.
#pragma once

#include "CoreQt/QtSlot.h"
#include "foundation/Export.h"
#include "foundation/NubsieID.h"
#include "foundation/ValueRange.h"
#include "popover/Balloon.h"
#include "sliders/Nubsie.h"

#include <QColor>
#include <QDateTime>
#include <QLabel>
#include <QList>
#include <QMap>
#include <QPixmap>
#include <QPointer>
#include <QPropertyAnimation>
#include <QTimer>
#include <QWidget>

class QMouseEvent;

namespace vx
{
namespace PopoverWidget
{
class Item;
}

/// A slider with any number of handles on one scale, each with its own range, value and features: a time line with
/// a date handle and the ends of an export range, or a plain value slider with one handle.
///
/// Handles at rest do not overlap. Where true values lie closer together than a handle is wide, the drawn places
/// are pushed apart into a row, which is centred on the true values; Nubsie has the two numbers. A handle that is
/// held is taken out of its row, its neighbours drift home, and at the release it is put back.
///
/// A drag follows the pointer one to one near the bar. Farther than 24 pixels off its centre line the handle moves
/// the slower the farther the pointer is, which lets a user scrub a day to the second.
///
/// Handles are widgets, children of the slider's window, so that they can grow over the slider's edges: put the
/// slider into its window before adding handles. They follow the slider as it moves and resizes, is shown, hidden
/// and disabled; repaintNubsiesQueued() brings them after where something else moved, such as a parent of the
/// slider. Nothing is laid out while the slider is not visible.
///
/// Two small flags, hidden at first, can mark the ends of a range. They are labels in the slider, whose places the
/// client sets: see getFirstFlag().
///
/// Signals of a drag of a handle with enfLiveDrag: nubsieDragStarted and the press slot; for each change of the
/// integer value the drag slot and nubsieValueChangedByUser; the release slot and nubsieDragEnded. Without
/// enfLiveDrag nubsieValueChangedByUser comes once, before the release slot. With enfResetOnRelease the release
/// slot is followed by nubsieValueChangedByUser and nubsieDragEnded, both twice: clients rely on it. A plain click
/// emits nubsieDragStarted and no nubsieDragEnded.
///
/// An id that no handle has is ignored, or answered with 0, false or an invalid date.
class ZELKOV_WIDGETS_EXPORT MultiNubsieSlider : public QWidget
{
    Q_OBJECT
    Q_PROPERTY(double opacityFactor READ getOpacity WRITE setOpacity)
    Q_PROPERTY(Qt::Orientation orientation READ orientation WRITE setOrientation)
    Q_PROPERTY(double sliderBarExtent READ sliderBarExtent WRITE setSliderBarExtent)
    Q_PROPERTY(bool drawTrack READ getDrawTrack WRITE setDrawTrack)
    Q_PROPERTY(QColor progressColor READ getProgressColor WRITE setProgressColor)

public:
    static constexpr int s_SliderBarPadding = 0; ///< adds nothing
    static constexpr int s_NubsieTextMargin = 4; ///< distance of the number labels from the bar, in pixels
    static constexpr int s_NubsieMargin = 0; ///< adds nothing
    static constexpr int s_SlidingAccuracyShearing = 50; ///< not used
    /// From here on off the centre line a drag is fine, in pixels.
    static constexpr int s_SlidingAccuracyBorder = 25;
    static constexpr unsigned int s_FlagLongPressThreshold = 1000; ///< ms
    static constexpr double s_OpacityFadeValue = 0.25; ///< opacity of an inactive slider

    /// Bits of what the slider does besides.
    enum EMultiNubsieSliderFeatures : int
    {
        emfShowRangeLabels = 0x01, ///< numbers of minimum and maximum while a handle is in use
        emfShowValueLabel = 0x02, ///< number of the value beside the handle in use
        emfDirectMapping = 0x04, ///< stored, without effect
        emfReserved8 = 0x08, ///< stored, without effect
        emfFadeWhenInactive = 0x10, ///< fades to s_OpacityFadeValue when the pointer leaves; handles do not
        emfJumpOnTrackClick = 0x20 ///< with exactly one handle: a left click beside it moves it there
    };
    Q_DECLARE_FLAGS(MultiNubsieSliderFeatures, EMultiNubsieSliderFeatures)

    /// Pictures of a flag.
    enum EMultiNubsieSliderFlagColor : int
    {
        efcRed = 0,
        efcGreen = 1,
        efcGray = 2
    };
    Q_ENUM(EMultiNubsieSliderFlagColor)

    /// With a @p window other than null and this slider, the slider deletes its handles with itself. Otherwise
    /// they stay behind and live as long as the window that they were put into.
    explicit MultiNubsieSlider(QWidget* parent = nullptr, QWidget* window = nullptr);
    ~MultiNubsieSlider() override;

    // --- Handles -----------------------------------------------------------------------------------------------

    /// Adds a handle whose default value is the middle of the range, and returns its id; -1 if the id is taken or
    /// negative.
    int addNubsie(const QString& name, int value, int minimum, int maximum, int id);
    /// The same: @p defaultValue is ignored, and clients rely on it. setDefaultValues() sets it.
    int addNubsie(const QString& name, int value, int minimum, int maximum, int defaultValue, int id);
    /// Adopts a handle, which should be a child of the slider's window. Ids are not compared.
    void addNubsie(Nubsie* nubsie);
    /// Deletes the handle.
    void removeNubsie(const int& id);
    /// Deletes all handles.
    void removeAllNubsies();
    /// In the order in which they are searched under the pointer; a press moves the handle to the end.
    QList<QPointer<Nubsie>> getNubsies() const;

    /// The handle with that id, or null.
    Nubsie* nubsie(const int& id) const;
    /// Whether a handle has that id.
    bool nubsieExists(const int& id) const;
    /// Whether the handle is held by the mouse button.
    bool nubsieGrabbed(const int& id) const;
    /// Whether the handle has its dragged size.
    bool nubsieMaximized(const int& id) const;
    /// What the client wished by setNubsieVisible().
    bool nubsieVisible(int id) const;
    void setNubsieVisible(int id, bool visible);
    /// Shows or hides all handles.
    void setNubsiesVisible(bool visible);

    // --- Values ------------------------------------------------------------------------------------------------

    /// The true value, also of an inverted handle.
    int value(const int& id) const;
    // The handle's own range.
    int minimum(const int& id) const;
    int maximum(const int& id) const;
    /// Nothing if the handle has that value. A held handle takes the value and stays drawn where it is until it is
    /// released. @p emitSignal: whether nubsieValueChangedByUser is emitted.
    void setValue(const int& id, int value, bool animated, bool emitSignal);
    /// Emits nubsieValueChangedByUser.
    void setValues(const int& id, int value, int minimum, int maximum, int defaultValue);
    /// Clamps the value and emits nubsieValueChangedByUser if the range differs from the present one. Moves a held
    /// handle, too, until its next drag step.
    void setRange(const int& id, int minimum, int maximum);
    /// What resets go back to; at first the middle of the range.
    void setDefaultValues(const int& id, int value);

    // Of handles in date mode, see Nubsie::setStartEndDate().
    QDateTime getDate(const int& id) const;
    QDateTime startDate(const int& id) const;
    QDateTime endDate(const int& id) const;
    /// Emits nubsieValueChangedByUser.
    void setDate(const int& id, const QDateTime& date, bool animated);
    /// The dates at minimum and maximum; leaves the value as it is.
    void setStartEndDates(const int& id, const QDateTime& start, const QDateTime& end);
    /// Lets a date handle show its distance from an anchor, in ms, and its red icon. 0 is ignored.
    void setDateDiff(const int& id, qint64 milliseconds);
    /// Ends that.
    void clearDateDiff(const int& id);

    // --- Features and looks of a handle: see Nubsie ------------------------------------------------------------

    /// The features in force at the present value.
    QFlags<Nubsie::ENubsieFeatures> getFeatures(const int& id) const;
    /// The handle's own features, see Nubsie::setFeatures().
    void setFeatures(const int& id, QFlags<Nubsie::ENubsieFeatures> features);
    /// Makes the features in force and the given ones the handle's own.
    void addFeatures(const int& id, QFlags<Nubsie::ENubsieFeatures> features);
    // As the functions of Nubsie; the standard size is that of Nubsie::setSize().
    void setStandardSize(const int& id, QSize size);
    void setDraggedSize(const int& id, QSize size);
    void setIcon(const int& id, const QPixmap& icon);
    void setIconRed(const int& id, const QPixmap& icon);
    void setIconMap(const int& id, const QMap<vx::ValueRange, QPixmap>& map);
    void setItemMap(const int& id, const QMap<vx::ValueRange, QPointer<vx::PopoverWidget::Item>>& map);
    void setText(const int& id, const QString& text);
    void setTextMap(const int& id, const QMap<vx::ValueRange, QString>& map);
    void setToolTipText(const int& id, const QString& text);
    void setTextColor(const int& id, const QColor& color);
    void setBackColor(const int& id, const QColor& color);
    void setBalloonTextMap(const int& id, const QMap<vx::ValueRange, QString>& map);
    void setPopoverFeatures(const int& id, QFlags<vx::PopoverWidget::Balloon::EBalloonFeature> features);
    void setPopoverID(const int& id, int controllerId, const QString& title);
    /// @p duration of one pulse in ms; 0 leaves it as it is.
    void startBlinkingNubsie(const int& id, int duration = 0);
    // As the functions of Nubsie.
    void stopBlinkingNubsie(const int& id);
    bool isBlinkingNubsie(const int& id) const;

    // What is called when; a map goes by the value of the moment.
    void setClickSlot(const int& id, const vx::QtSlot& slot);
    void setClickSlotMap(const int& id, const QMap<vx::ValueRange, vx::QtSlot>& map);
    void setDoubleClickSlot(const int& id, const vx::QtSlot& slot);
    void setDoubleClickSlotMap(const int& id, const QMap<vx::ValueRange, vx::QtSlot>& map);
    void setDragSlot(const int& id, const vx::QtSlot& slot);
    void setDragSlotMap(const int& id, const QMap<vx::ValueRange, vx::QtSlot>& map);
    void setLongPressSlot(const int& id, const vx::QtSlot& slot);
    void setLongPressSlotMap(const int& id, const QMap<vx::ValueRange, vx::QtSlot>& map);
    void setPressSlot(const int& id, const vx::QtSlot& slot);
    void setPressSlotMap(const int& id, const QMap<vx::ValueRange, vx::QtSlot>& map);
    void setReleaseSlot(const int& id, const vx::QtSlot& slot);
    void setReleaseSlotMap(const int& id, const QMap<vx::ValueRange, vx::QtSlot>& map);

    // --- The slider as a whole ---------------------------------------------------------------------------------

    /// 0x0C by default.
    QFlags<EMultiNubsieSliderFeatures> getFeatures() const;
    /// Bits of EMultiNubsieSliderFeatures. Gives the slider the opacity that it has without the pointer.
    void setFeatures(QFlags<EMultiNubsieSliderFeatures> features);
    // Qt::Horizontal by default.
    Qt::Orientation orientation() const;
    void setOrientation(Qt::Orientation orientation);
    /// The bar is half as thick as this, and at least one pixel; 5 by default.
    double sliderBarExtent() const;
    void setSliderBarExtent(double extent);
    /// Whether the bar is painted; false by default. Does not repaint.
    bool getDrawTrack() const;
    void setDrawTrack(bool draw);
    /// Whether the progress stripe is painted, on a bar that is; false by default.
    void setDrawProgress(bool draw);
    /// Yellow by default. Does not repaint.
    QColor getProgressColor() const;
    void setProgressColor(const QColor& color);
    /// 0 to 1; values outside are taken to the nearer end.
    void setProgress(double progress);
    double getProgress() const;
    /// Of what the slider paints, 0 to 1. Does not repaint.
    double getOpacity() const;
    void setOpacity(double opacity);
    /// A slider whose handles lie among those of this one; the relation is mutual. No effect on values and layout.
    void addRival(MultiNubsieSlider* other);
    /// Ends growing, shrinking and moving: all handles stand at once where they were going from.
    void cancelAnimations();
    /// Hands an event to event(); whether it was accepted.
    bool handleEvent(QEvent* event);
    /// Drives this slider with the mouse events of another widget. Their coordinates are taken as they stand, and
    /// the widget gets them, too.
    bool eventFilter(QObject* object, QEvent* event) override;

    // --- Flags -------------------------------------------------------------------------------------------------

    /// Shows or hides both flags. At first they are hidden.
    void showFlags(bool show);
    /// Also gives the flag its picture at half the slider's thickness.
    void setFirstFlagColor(EMultiNubsieSliderFlagColor color);
    /// Likewise.
    void setSecondFlagColor(EMultiNubsieSliderFlagColor color);
    EMultiNubsieSliderFlagColor getFirstFlagColor() const;
    /// Likewise.
    EMultiNubsieSliderFlagColor getSecondFlagColor() const;
    /// The labels, for the client to place in the slider's coordinates; the slider itself never does.
    QWidget* getFirstFlag() const;
    /// Likewise.
    QWidget* getSecondFlag() const;

    // --- Geometry ----------------------------------------------------------------------------------------------

    /// The bar in the slider's coordinates. It lies a quarter of the extent off the centre line, on purpose.
    QRectF sliderBarRect() const;
    /// The length that display values 0 to 1 of this handle run through: the bar less the handle's standard size.
    double extent(const Nubsie* nubsie) const;
    /// The slider's origin in the window's coordinates; null when the slider is not visible.
    QPoint sliderOrigin() const;
    /// Where the handle at rest belongs, in the window's coordinates; not where it is during an animation.
    QPointF nubsiePos(const Nubsie* nubsie) const;
    /// The standard size around nubsiePos().
    QRectF nubsieRect(const Nubsie* nubsie) const;
    /// Signed, along the bar; @p point in the window's coordinates.
    double distanceToNubsieCenter(const Nubsie* nubsie, const QPointF& point) const;
    /// The handle that a press at @p point (slider's coordinates) would find by its rectangle, or null.
    Nubsie* getNubsieForPos(const QPointF& point) const;
    /// Whether @p point (slider's coordinates) lies in the disc across @p rect (window's coordinates).
    bool nubsieImageClicked(const QRectF& rect, const QPointF& point) const;

Q_SIGNALS:
    /// Never emitted by the slider itself.
    void nubsieValueChanged(vx::NubsieID nubsieID, int value);
    /// Every change of a value, also those from setValue() with its signal switched on.
    void nubsieValueChangedByUser(vx::NubsieID nubsieID, int value);
    /// A handle was pressed, whether a drag follows or a click.
    void nubsieDragStarted(vx::NubsieID nubsieID);
    /// The handle was let go after a drag, was double-clicked or reset. Not after a click.
    void nubsieDragEnded(vx::NubsieID nubsieID);
    /// Emitting it lays all handles out one turn of the event loop later.
    void triggerNubsieRepaintQueued(bool animate);
    /// Pressed and released on the flag within s_FlagLongPressThreshold.
    void firstFlagClicked();
    /// Likewise.
    void secondFlagClicked();
    /// Held for s_FlagLongPressThreshold; no click follows.
    void firstFlagLongClicked();
    /// Likewise.
    void secondFlagLongClicked();
    /// At the press of the right button.
    void firstFlagRightClicked();
    /// Likewise.
    void secondFlagRightClicked();
    // At the second press; the first click has been reported as one.
    void firstFlagDoubleClicked();
    void secondFlagDoubleClicked();

public Q_SLOTS:
    /// Closes the value balloons of all handles.
    void hideNubsieBalloons();
    /// Lays all handles out one turn of the event loop later, when geometries are settled.
    void repaintNubsiesQueued();
    // Stacking among the children of the window.
    void raiseNubsies();
    void raiseNubsieOnSlider(Nubsie* kingNubsie);
    void stackNubsiesUnder(QWidget* widget);
    void stackNubsiesOver(QWidget* widget);
    void raiseNubsieOverRivals();
    /// Lays all handles out now.
    void repaintNubsiesImmediately();
    /// Lays all visible handles out.
    void updateNubsiePositions(bool animated = true);

private Q_SLOTS:
    void nubsieValueChanged(int value);
    void dragSizeChanged(Nubsie* nubsie, QSize size);
    void setActiveOpacity();
    void setInActiveOpacity();
    void handleResize();
    void longClickEvent();
    void flagLongClickEvent();
    void startLongClickTimer();
    void stopLongClickTimer();
    void startFlagLongClickTimer();
    void stopFlagLongClickTimer();
    void nubsiePopoverClosing();
    void singleClickPerformed();

protected:
    bool event(QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void enterEvent(QEvent* event) override;
    void leaveEvent(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void moveEvent(QMoveEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    /// Does nothing, so that no context menu comes up.
    void contextMenuEvent(QContextMenuEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void changeEvent(QEvent* event) override;

    /// Puts a handle at rest among its neighbours; nothing while the slider is not visible.
    void enqueueNubsie(Nubsie* nubsie, bool animated);
    /// Lets the neighbours that the handle pushed aside drift home.
    void dequeueNubsie(Nubsie* nubsie);
    /// Places a handle in motion at once; nothing while the slider is not visible.
    void updateNubsieLayer(Nubsie* nubsie);

private:
    // What the place of a handle at rest depends on, looked up once for all of them.
    struct Frame
    {
        QRectF bar; // slider's coordinates
        QPoint origin;
        Qt::Orientation orientation;

        QPointF position(const Nubsie* nubsie) const;
    };

    // MultiNubsieSlider.cpp
    Frame frame() const;
    void updateNubsiePositionsQueued(bool animated);
    void layOutNowAndLater();
    void stopNubsieAnimations();
    static void placeNubsie(Nubsie* nubsie, const Frame& place, bool animated);
    Nubsie* firstLiveNubsie() const;

    // MultiNubsieSliderInteraction.cpp
    void setCurrentNubsie(Nubsie* nubsie);
    void resetNubsie(Nubsie* nubsie);
    Nubsie* nubsieUnder(const QPoint& position) const;
    void pressNubsie(Nubsie* nubsie, QMouseEvent* event);
    void dragNubsie(QMouseEvent* event);
    void dragNubsieInSteps(const QPointF& pointer, double target);
    double fineSpeed(const QPointF& pointer) const;
    QRect rectOnSlider(const Nubsie* nubsie) const;
    void updateAfterStep(const QRect& before);
    void settleDrag(const QPoint& position);
    bool settleClick();
    void closeGesture();
    void putBackCurrentNubsie();
    bool jumpOnTrack(const QPointF& position);
    static bool flagHit(const QLabel* flag, const QPoint& position);
    bool releaseFlag(const QLabel* flag, bool& pressed, const QPoint& position, bool& clicked);

    // MultiNubsieSliderPainting.cpp: where the number labels of the handle in use stand
    QPointF currentValuePos(const Nubsie* nubsie) const;
    QPointF minimumValuePos(const Nubsie* nubsie) const;
    QPointF maximumValuePos(const Nubsie* nubsie) const;

    // MultiNubsieSliderFlags.cpp
    void updateFlagPositions();

    bool m_moved = false; // the pointer has left the press point
    QPoint m_pressPos; // slider's coordinates
    QPointF m_anchorPos; // press point in the window's coordinates
    double m_anchorNormalized = 0.0;
    double m_lastNormalized = 0.0;
    qint64 m_lastMoveTime = 0; // of the press or the previous move, ms since the epoch
    double m_velocity = 0.0; // normalised units per second, positive toward the low end
    qint64 m_lastMoveStamp = 0; // ms since the epoch
    QPointer<Nubsie> m_currentNubsie; // from the press until the gesture is settled
    QPointer<Nubsie> m_grabbedNubsie; // from the press to the release
    QList<QPointer<Nubsie>> m_nubsies;
    QFlags<EMultiNubsieSliderFeatures> m_features;
    Qt::Orientation m_orientation = Qt::Horizontal;
    double m_sliderBarExtent = 5.0;
    double m_opacityFactor = 1.0;
    QPropertyAnimation m_opacityAnimator;
    QTimer m_longClickTimer;
    QTimer m_flagLongClickTimer;
    QTimer m_singleClickTimer;
    bool m_doubleClicked = false;
    QPointF m_lastDragPos;
    bool m_anchorMapped = false; // the drag still maps between start value and the ends
    double m_anchorDisplay = 0.0;
    bool m_drawTrack = false;
    bool m_drawProgress = false;
    QColor m_progressColor = Qt::yellow;
    double m_progress = 0.0;
    QWidget* m_handleWindow; // only compared, never followed
    double m_grabOffset = 0.0; // of the pointer from the handle's centre at the press
    QPointer<QLabel> m_firstFlag;
    QPointer<QLabel> m_secondFlag;
    QList<QPointer<MultiNubsieSlider>> m_rivals;
    QPixmap m_firstFlagPixmap;
    QPixmap m_secondFlagPixmap;
    EMultiNubsieSliderFlagColor m_firstFlagColor = efcGray;
    EMultiNubsieSliderFlagColor m_secondFlagColor = efcGray;
    QDateTime m_flagPressTime;
    bool m_firstFlagPressed = false;
    bool m_secondFlagPressed = false;
    bool m_nubsiesShown = false;
};

}

Q_DECLARE_OPERATORS_FOR_FLAGS(vx::MultiNubsieSlider::MultiNubsieSliderFeatures)
