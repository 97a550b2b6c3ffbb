// SPDX-License-Identifier: MIT
// The handle of a slider with several handles.
#pragma once

#include "CoreQt/QtSlot.h"
#include "foundation/Export.h"
#include "foundation/NubsieID.h"
#include "foundation/ValueRange.h"
#include "popover/PopoverBalloonWidget.h"
#include "popover/PopoverFlags.h"

#include <QtCore/QDateTime>
#include <QtCore/QMap>
#include <QtCore/QPointer>
#include <QtCore/QPointF>
#include <QtCore/QPropertyAnimation>
#include <QtCore/QSize>
#include <QtCore/QString>
#include <QtCore/QVariant>
#include <QtGui/QColor>
#include <QtGui/QPixmap>
#include <QtWidgets/QWidget>

#include <type_traits>

class QPainter;

namespace vx
{
class MultiNubsieSlider;

/// A draggable handle of a MultiNubsieSlider: a small widget that paints an icon or a badge and knows its value,
/// its range, the dates at both ends of the range, and what is to be called when it is pressed, clicked, dragged,
/// long-clicked, double-clicked or released.
///
/// It takes no mouse events: the slider finds the handle under the pointer and drives it. Nor is it a child of its
/// slider but of the slider's window, so that it may grow over the slider's edges while it is held.
///
/// A handle has two places on the scale, both from 0 to 1. normalizedValue() is its true value, and value() always
/// comes from it. getDisplayValue() is where it is drawn; the two differ while handles that lie close together are
/// pushed apart. The slider maps the latter to getPosition().
///
/// A handle without a size is not seen: set setSize() and, so that it grows while held, setDraggedSize(). It owns
/// neither its parent nor its slider nor its clip widget. All sizes and positions are logical pixels. GUI thread
/// only.
class ZELKOV_WIDGETS_EXPORT Nubsie : public QWidget, public PopoverBalloonWidget
{
    Q_OBJECT
    Q_PROPERTY(QSize currentSize READ getCurrentSize WRITE setCurrentSize)
    Q_PROPERTY(int value READ value WRITE setValue)
    Q_PROPERTY(int defaultValue READ defaultValue WRITE setDefaultValue)
    Q_PROPERTY(int maximum READ maximum WRITE setMaximum)
    Q_PROPERTY(int minimum READ minimum WRITE setMinimum)
    Q_PROPERTY(QPixmap icon READ icon WRITE setIcon)
    Q_PROPERTY(QPixmap icon_red READ iconRed WRITE setIconRed)
    Q_PROPERTY(QSize size READ getSize WRITE setSize)
    Q_PROPERTY(QSize draggedSize READ getDraggedSize WRITE setDraggedSize)
    Q_PROPERTY(QPointF position READ getPosition WRITE setPosition)
    Q_PROPERTY(double glowOpacity READ getGlowOpacity WRITE setGlowOpacity)

public:
    /// What a handle can do. Some features are read as they were set by setFeatures(), others as they are in force
    /// at the present value, see setFeatureMap().
    enum ENubsieFeatures : int
    {
        enfDraggable = 0x0001, ///< can be hit at all
        enfMoveable = 0x0002, ///< reported by isMoveable(), tested by nobody here
        enfValueBadge = 0x0004, ///< shows its value as a badge
        enfLiveDrag = 0x0008, ///< a drag reports each change of the value, not only the last one
        enfBalloon = 0x0010, ///< shows the text or item for its value in a balloon, kept up to date
        enfRequestedBalloon = 0x0020, ///< the same, but only when updateBalloon() is called
        enfDateMode = 0x0040, ///< stands for a date between the start and the end date
        enfResetOnDoubleClick = 0x0080, ///< a double click goes back to the default value
        enfResetOnRelease = 0x0100, ///< a drag ends at the default value, like a spring
        enfLongClick = 0x0200, ///< can be long-clicked
        enfHoldAfterLongClick = 0x0400, ///< stays held after the long click
        enfStepOnClick = 0x0800, ///< a click that no slot took steps the value up by one, around the end
        enfStepOnFlick = 0x1000, ///< a fast release steps the value once more
        enfDiscreteSteps = 0x2000, ///< drags by the handle's size a step; excludes both steps above
        enfInverted = 0x4000, ///< the user sees minimum + maximum - value
        enfValuePopover = 0x8000, ///< a click opens the item for the value, if there is one
    };
    Q_FLAG(ENubsieFeatures)

    /// A set of bits that a client defines; the handle keeps them. While any is set, the handle is not clipped.
    enum ENubsieState : int
    {
        ensNone = 0,
    };
    Q_FLAG(ENubsieState)

    /// The id of no handle.
    static constexpr int s_InvalidNubsieID = -1;
    /// Milliseconds of one pulse of the glow.
    static constexpr unsigned int s_DefaultBlinkDuration = 1500;
    /// How far, in pixels and along each axis, the pointer may leave the press before a long click is given up.
    /// For all handles of the process; 30 at first.
    static unsigned int s_LongClickMaxMoveThreshold;
    /// The meta-type of NubsieID.
    static const int qMetaTypes;

    /// A negative @p id takes the next free number of a counter shared by all handles that starts at 0. The object
    /// name is @p name. @p value is held in the range.
    Nubsie(
        const QString& name, int value, int minimum, int maximum, int defaultValue, QWidget* parent, int id = -1);
    /// A handle without a name, with the range of int, a default value of -1 and no sensible value: set a range
    /// and a value before use.
    explicit Nubsie(QWidget* parent);
    ~Nubsie() override;

    /// The number that clients know it by.
    int id() const;

    /// Shown by the slider over the handle.
    QString toolTipText() const;
    void setToolTipText(const QString& text);

    // Looks. Of several sources the first one there is wins: the value badge, the text badge, the icon by value,
    // the icon. Whatever wins overwrites icon().

    QPixmap icon() const;
    /// Does nothing for the pixmap that is already set.
    void setIcon(const QPixmap& pix);
    /// Shown instead of the icon by a handle in date mode while dateDiffer().
    QPixmap iconRed() const;
    void setIconRed(const QPixmap& pix);
    /// The icon for the first range that holds the value; under enfValueBadge that of the value as shown, which
    /// then stands in for the badge.
    void setIconMap(const QMap<ValueRange, QPixmap>& map);
    /// The fallback of the text map. Seen only while the text map is not empty.
    QString text() const;
    void setText(const QString& text);
    /// The text of the text badge by value.
    void setTextMap(const QMap<ValueRange, QString>& map);
    /// Foreground of the value badge, white at first.
    void setTextColor(const QColor& color);
    /// Background of the value badge, (236, 33, 33) at first.
    void setBackColor(const QColor& color);

    // Balloon.

    /// The items of the value popover and of the balloon. Empties the present balloon's container first.
    void setItemMap(const QMap<ValueRange, QPointer<PopoverWidget::Item>>& map);
    QMap<ValueRange, QPointer<PopoverWidget::Item>> itemMap() const;
    /// Opens the balloon at the item for the value as shown to the user, with the items that lie in the range.
    /// From then on what the user picks is taken over as the value, see valueChangedbyPopover().
    void showValuePopover();
    /// Only lets values select no items any more; what is open stays open.
    void hideValuePopover();

    // Features.

    /// Initially enfDraggable, enfMoveable and enfLiveDrag.
    void setFeatures(QFlags<ENubsieFeatures> features);
    /// Features for stretches of the scale. The first range that holds the value counts, and setFeatures() where
    /// none does. Takes effect with the next gesture.
    void setFeatureMap(const QMap<ValueRange, ENubsieFeatures>& map);
    /// The same for a map of flags.
    template <typename Features,
        typename = std::enable_if_t<std::is_same<Features, QFlags<ENubsieFeatures>>::value>>
    void setFeatureMap(const QMap<ValueRange, Features>& map);
    /// The features in force at the present value.
    QFlags<ENubsieFeatures> getCurrentFeature() const;
    // Of setFeatures() alone: whether it has enfDraggable, and enfMoveable.
    bool isDraggable() const;
    bool isMoveable() const;

    // A client's own bits; the handle keeps them and is not clipped while one is set.
    void setState(QFlags<ENubsieState> state);
    void addState(QFlags<ENubsieState> state);
    void unsetState(QFlags<ENubsieState> state);
    QFlags<ENubsieState> getState() const;

    // Value. The setters of the range, the default and the two places store and do nothing else.

    /// The value from minimum to maximum; under enfInverted, unless @p raw, the one that the user sees.
    int value(bool raw = false) const;
    /// Holds the value in the range, ends running animations of size and position at once (the handle shrinks),
    /// and repaints. Without @p updateDisplay the handle stays where it is drawn. Emits valueChanged(), also for
    /// the present value, unless @p emitSignal is false.
    void setValue(int value, bool emitSignal = true, bool updateDisplay = true);
    // Only stored.
    int defaultValue() const;
    void setDefaultValue(int value);
    int maximum() const;
    void setMaximum(int maximum);
    int minimum() const;
    void setMinimum(int minimum);
    void setRange(int minimum, int maximum);
    double getDisplayValue() const;
    void setDisplayValue(double value);
    double normalizedValue() const;
    void setNormalizedValue(double value);
    /// Goes to the default value and emits valueChanged().
    void reset();
    /// One up, from the maximum to 0 and not to the minimum. Emits valueChanged().
    Nubsie& operator++();
    /// One down, from the minimum to the maximum. Emits valueChanged().
    Nubsie& operator--();

    // Dates.

    /// Stores the dates at minimum and maximum; value and place stay.
    void setStartEndDate(const QDateTime& start, const QDateTime& end);
    // The dates at minimum and maximum; invalid at first.
    QDateTime getStartDate() const;
    QDateTime getEndDate() const;
    /// Sets the value, cut off to a whole one, that stands for the date.
    void setDate(const QDateTime& date);
    /// The date of the normalised value, in local time.
    QDateTime getDate() const;
    /// Whether the balloon of a date handle shows the interval anchorTimeDiff() instead of a date. Ends with the
    /// next drag.
    bool deltaTimeMode() const;
    void setDeltaTimeMode(bool on);
    /// Whether the date differs from the anchor: the handle shows its red icon. Stored only. Ends with the next
    /// drag.
    bool dateDiffer() const;
    void setDateDiffer(bool differ);
    /// Milliseconds.
    qint64 anchorTimeDiff() const;
    void setAnchorTimeDiff(qint64 difference);

    // Size and place.

    /// The size at rest.
    QSize getSize() const;
    void setSize(const QSize& size);
    /// The size while held.
    QSize getDraggedSize() const;
    void setDraggedSize(const QSize& size);
    /// Whether it has its full size of a held handle.
    bool isMaximized() const;
    /// Grows to the dragged size within 100 ms.
    void setCurrent();
    /// Shrinks to the size at rest within 250 ms.
    void resetSize();
    /// Slides to the point within 500 ms.
    void moveTo(const QPointF& point);
    /// Stops growing, shrinking and sliding; takes the size at rest and stays at getPosition().
    void cancelAnimations();
    // The animations themselves; owned by the handle.
    QPropertyAnimation* sizeAnimator();
    QPropertyAnimation* positionAnimator();

    // How strong the glow shows, 0 to 1; what startBlinking() animates.
    double getGlowOpacity() const;
    void setGlowOpacity(double opacity);

    // What is called. Each slot gets the value as an int; the release slot gets the point as well. The first range
    // of a map that holds the value counts, and the slot without a map where none does. Setting a slot keeps the
    // map.

    void setClickSlot(const QtSlot& slot);
    void setClickSlotMap(const QMap<ValueRange, QtSlot>& map);
    void setDoubleClickSlot(const QtSlot& slot);
    void setDoubleClickSlotMap(const QMap<ValueRange, QtSlot>& map);
    void setDragSlot(const QtSlot& slot);
    void setDragSlotMap(const QMap<ValueRange, QtSlot>& map);
    void setLongPressSlot(const QtSlot& slot);
    void setLongPressSlotMap(const QMap<ValueRange, QtSlot>& map);
    void setPressSlot(const QtSlot& slot);
    void setPressSlotMap(const QMap<ValueRange, QtSlot>& map);
    void setReleaseSlot(const QtSlot& slot);
    void setReleaseSlotMap(const QMap<ValueRange, QtSlot>& map);

    /// Whether a slot took the click; true until the handle has shrunk back.
    bool clickOrLongClickOccured() const;
    void setClickOrLongClickOccured(bool occured);

    // Being seen.

    /// The client's wish that the handle show; true at first. Without it the handle is neither painted nor hit,
    /// and it cannot be shown, but a handle that is visible stays so. With it the handle is shown if its slider
    /// is.
    bool externallyVisible() const;
    void setExternallyVisible(bool visible);
    /// While that slider is hidden or covered, the handle does not paint.
    void setNubsieSlider(MultiNubsieSlider* slider);
    /// At rest and without a state the handle is painted only where that widget is seen.
    void setClipWidget(QWidget* widget);

    /// Paints icon and glow as paintEvent() does, in the handle's coordinates.
    void draw(QPainter& painter) const;
    /// Brings image and size up to date with value and features. With @p balloon a handle with a balloon or in
    /// date mode updates its balloon and keeps its image.
    void updateNubsie(bool balloon);

    /// The features as they were set.
    QFlags<ENubsieFeatures> features() const;
    /// The features in force at that value.
    QFlags<ENubsieFeatures> getFeatureFromValue(int value) const;
    /// The place of a value, held in the range, on the scale from 0 to 1; 1 if minimum and maximum are the same.
    double createNormalizedValue(int value) const;
    /// The nearest value, held in the range.
    int valueFromNormalizedValue(double normalized) const;
    /// The integer value before the last change; 0 at first.
    int previousValue() const;

Q_SIGNALS:
    /// The user has picked a value in the value popover; the true value, also under enfInverted. No valueChanged()
    /// goes with it.
    void valueChangedbyPopover(int value);
    /// The value was set, stepped or dragged (the latter only if the integer has changed and under enfLiveDrag).
    /// The true value, also under enfInverted.
    void valueChanged(int value);
    /// For subclasses: the size while held has changed. Never emitted here; the slider listens to it.
    void dragSizeChanged(Nubsie* nubsie, QSize size);
    /// The balloon is about to go; from the first showValuePopover() on.
    void valuePopoverClosing();

public Q_SLOTS:
    QSize getCurrentSize() const;
    /// Resizes the widget about its point.
    void setCurrentSize(QSize size);
    QPointF getPosition() const;
    /// Moves the widget so that its middle lies one pixel to the lower right of the point, which is in the
    /// parent's coordinates.
    void setPosition(QPointF pos);
    /// Shows the value, the date or the interval in the balloon; a hidden handle takes its balloon away.
    void updateBalloon();
    /// Closes the balloon, if there is one.
    void hideBalloon();
    /// Lets the glow pulse until stopBlinking(), one pulse taking @p duration ms; 0 and less keep the present
    /// duration.
    void startBlinking(int duration = 0);
    /// Back to the default duration. The last glow stays until the next paint: clients rely on it.
    void stopBlinking();
    /// Whether the glow pulses.
    bool isBlinking() const;
    /// The perform functions call the slot for the value and give whether there was one.
    bool performLongClick();
    // Calls the slot for the value. Gives whether there was one.
    bool performClick();
    bool performDrag();
    /// Called by the slider after each step of a drag: false if the integer value is the previous one. Otherwise,
    /// under enfLiveDrag in force, calls the drag slot and emits valueChanged().
    bool performDragAction();
    // Calls the slot for the value. Gives whether there was one.
    bool performDoubleClick();
    bool performPress();
    bool performRelease(QPoint globalPos);
    /// Forgets that the present gesture was a click or a long click.
    void clearClickOrLongClickOccured();
    /// Shows only if externallyVisible().
    void setVisible(bool visible) override;

protected:
    void paintEvent(QPaintEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private Q_SLOTS:
    void handlePopoverAction(
        int itemId, QVariant value, QVariant userData, vx::PopoverWidget::EItemPerformedFlags flags);

private:
    enum EValuePopoverType : int
    {
        evptItems = 1,
    };

    struct Badge
    {
        QString text;
        bool stroke = false;
        QColor foreground;
        QColor background;
        QPixmap picture;
    };

    void initialize();
    EValuePopoverType getValuePopoverType() const;
    int trueValue() const;
    int turnedRound(int value) const;
    QtSlot getSlotFromValue(int value, const QMap<ValueRange, QtSlot>& map, const QtSlot& fallback) const;
    bool invokeSlot(const QtSlot& slot) const;
    bool performSlot(const QMap<ValueRange, QtSlot>& map, const QtSlot& fallback) const;
    QString getTextFromValue(int value) const;
    QPixmap badge(const QString& text, bool stroke, const QColor& foreground, const QColor& background);
    void fitSizesToIcon();
    void updateScaledIcons(const QSize& target);
    void clearScaledIconCache();
    QPoint getPainterPointForIcon(const QPixmap& pixmap) const;
    void dismissBalloon();
    QRect clipRect() const;

    static int s_NubsieID;

    int m_id;
    QString m_toolTipText;
    QPixmap m_icon;
    QPixmap m_iconRed;
    qint64 m_iconCacheKey = 0;
    QPixmap m_scaledIcon;
    QPixmap m_scaledIconRed;
    qint64 m_iconRedCacheKey = 0;
    QMap<ValueRange, QPixmap> m_iconMap;
    QString m_text;
    QMap<ValueRange, QString> m_textMap;
    QSize m_size;
    QSize m_draggedSize;
    QSize m_currentSize;
    QPointF m_position;
    QtSlot m_longPressSlot;
    QMap<ValueRange, QtSlot> m_longPressSlotMap;
    QtSlot m_clickSlot;
    QMap<ValueRange, QtSlot> m_clickSlotMap;
    QtSlot m_dragSlot;
    QMap<ValueRange, QtSlot> m_dragSlotMap;
    QtSlot m_pressSlot;
    QMap<ValueRange, QtSlot> m_pressSlotMap;
    QtSlot m_releaseSlot;
    QMap<ValueRange, QtSlot> m_releaseSlotMap;
    QtSlot m_doubleClickSlot;
    QMap<ValueRange, QtSlot> m_doubleClickSlotMap;
    QMap<ValueRange, ENubsieFeatures> m_featureMap;
    QFlags<ENubsieFeatures> m_features;
    QFlags<ENubsieState> m_state;
    QPropertyAnimation m_sizeAnimator;
    QPropertyAnimation m_positionAnimator;
    QColor m_textColor;
    QColor m_backColor;
    int m_defaultValue;
    int m_maximum;
    int m_minimum;
    double m_displayValue;
    double m_normalizedValue;
    int m_previousValue = 0;
    QDateTime m_startDate;
    QDateTime m_endDate;
    QPixmap m_glow;
    QPixmap m_scaledGlow;
    double m_glowOpacity = 0.0;
    QPropertyAnimation m_glowAnimator;
    bool m_maximized = false;
    bool m_deltaTimeMode = false;
    bool m_dateDiffer = false;
    qint64 m_anchorTimeDiff = 0;
    bool m_clickOrLongClickOccured = false;
    bool m_externallyVisible = true;
    QPointer<MultiNubsieSlider> m_nubsieSlider;
    QPointer<QWidget> m_clipWidget;

    // Badges are asked for at every step of an animation; the last one is kept.
    Badge m_badge;
};

Q_DECLARE_OPERATORS_FOR_FLAGS(QFlags<Nubsie::ENubsieFeatures>)
Q_DECLARE_OPERATORS_FOR_FLAGS(QFlags<Nubsie::ENubsieState>)

template <typename Features, typename> void Nubsie::setFeatureMap(const QMap<ValueRange, Features>& map)
{
    QMap<ValueRange, ENubsieFeatures> plain;
    for (auto it = map.begin(); it != map.end(); ++it) {
        plain.insert(it.key(), static_cast<ENubsieFeatures>(static_cast<int>(it.value())));
    }
    setFeatureMap(plain);
}
}
