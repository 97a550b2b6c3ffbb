// SPDX-License-Identifier: MIT
// vx::PopoverWidget::Controller: the life of one popover, from its opening to its result.
#pragma once

#include "foundation/Export.h"
#include "foundation/FadableThing.h"
#include "popover/Balloon.h"
#include "popover/Item.h"

#include <QDialogButtonBox>
#include <QFlags>
#include <QList>
#include <QMargins>
#include <QMetaType>
#include <QPointer>
#include <QPointF>
#include <QRect>
#include <QSizeF>
#include <QString>
#include <QVariant>

class QDropEvent;
class QPropertyAnimation;

namespace vx
{
namespace PopoverWidget
{
class Container;
class Manager;

/// One popover: an overlay that covers a window (or another popover) and holds the balloon with the content. It
/// opens and closes the balloon, with fades and a grow animation if wanted, runs modally on request and reports
/// the result. A click that begins and ends outside the balloon closes the popover.
///
/// Controllers are made by Manager::createController(). Then: setContainer() with the content, setForWidget() or
/// setForRect() to point at something, setActive() or exec(). The covered window owns the controller; the
/// controller owns the balloon, and the balloon's scroll area the container. After closing, the controller deletes
/// itself and all of these, unless it is persistent.
///
/// Signals of an opening with the default flags: popoverWillAppear, popoverDidAppear, balloonOpened (layoutUpdated
/// comes in between, with each layout pass). Of a closing: balloonClosed, popoverWillDisappear, and at the end of
/// the fade popoverDidDisappear, then controllerDestroyed.
///
/// The overlay paints what style sheets say of it, with the fader's opacity; the balloon does not fade.
class ZELKOV_WIDGETS_EXPORT Controller : public FadableThing<QWidget>
{
    Q_OBJECT

public:
    /// How a popover opens and closes. The flags of the opening also count for the closing by dismiss().
    enum EPopoverShowFlag : int
    {
        epsBalloon = 1, ///< The balloon is shown and hidden at once.
        /// The balloon grows from the centre and shrinks to it, each in 400 ms; ignored with epsBalloon. Without
        /// either flag the balloon is neither shown nor hidden, and closing hides nothing at all.
        epsGrow = 2,
        epsNoFade = 4, ///< The overlay is shown at once, even if animated.
        epsMouseTransparent = 8 ///< The mouse goes through the overlay; a press outside does not close.
    };
    Q_DECLARE_FLAGS(EPopoverShowFlags, EPopoverShowFlag)
    Q_FLAG(EPopoverShowFlags)

    /// Emits controllerDestroyed() first of all.
    ~Controller() override;

    /// Takes the content, once: a second call is ignored. Makes the balloon, hidden; without a covered widget the
    /// content is put into the controller itself, in a scroll area, and there is no balloon.
    ///
    /// Header and footer of the container must be there by now.
    void setContainer(Container* container, QFlags<Balloon::EBalloonFeature> features);

    /// Points the balloon at \a widget, whose moves and resizes it follows from now on. A coordinate of \a
    /// relative, a point inside the widget, counts if it is greater than 0. Needs the balloon.
    void setForWidget(QWidget& widget, const QPointF& relative);

    /// Covers the first ancestor of \a widget, itself included, that is a window or a controller, and becomes its
    /// child. Hides the overlay. Nothing happens for the widget that is covered already.
    void setInWidget(QWidget* widget);

    /// Adds a row of buttons (object name "buttonBox") to the content, opens the popover and waits until it begins
    /// to close. Returns resultCode(): 1 after an accepting button, 0 after a rejecting one. The controller still
    /// exists then and is about to fade. If it was deleted while it waited, the result is 0.
    int exec(QFlags<QDialogButtonBox::StandardButton> buttons);

    /// Shows and hides the parts of the title bar; needs the balloon.
    void setBalloonFeatures(QFlags<Balloon::EBalloonFeature> features);
    /// The title of the balloon.
    void setTitle(const QString& title);
    QString title() const;

    /// Insets are added to the rectangle of a covered window as they stand: right and bottom ones shrink it only
    /// if they are negative. They have no effect over another controller. Default 0.
    void setInsets(int left, int top, int right, int bottom);
    /// Adds to the present insets.
    void adjustInsets(int left, int top, int right, int bottom);
    void getInsets(int& left, int& top, int& right, int& bottom) const;
    /// See setMargins().
    void getMargins(int& left, int& top, int& right, int& bottom) const;

    /// Only a mark, for the modal questions and signals of the Manager; exec() does not look at it. Default true.
    void setModal(bool modal);
    bool isModal() const;
    /// A persistent controller is not deleted after closing and can be opened again. Default false.
    void setPersistence(bool persistent);
    bool hasPersistence() const;
    /// Refuses every dismissal that is not forced, and clicks outside. Default false.
    void setStayVisible(bool stay);

    /// True from the opening until the closing begins.
    bool isActive() const;
    /// As the creator said; nothing in here depends on it.
    bool isSubController() const;
    /// See exec(); 0 at first.
    int resultCode() const;
    /// Null before setContainer().
    Balloon* balloon() const;
    Container* getContainer() const;
    /// The covered window or controller; null if there is none.
    QWidget* inWidget() const;

    /// Hiding an overlay of which nothing was seen repaints nothing.
    void setVisible(bool visible) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    /// The opening is complete, except for a fade or a growth that still runs.
    void balloonOpened();
    /// Closing has begun; exec() returns now.
    void balloonClosed();
    /// The opening begins.
    void popoverWillAppear();
    /// The fade-in is over, which without a fade is before the balloon is shown. With epsGrow it comes a second
    /// time when the balloon has its size.
    void popoverDidAppear();
    /// After balloonClosed(); the fade begins.
    void popoverWillDisappear();
    /// The overlay is hidden. With epsGrow and a fade it comes twice if the controller lives on.
    void popoverDidDisappear();
    /// The help button was clicked, or help() called.
    void popoverWillHelp();
    /// Return or Enter was released.
    void shouldAccept();
    /// Escape was released in a popover that stays visible.
    void shouldReject();
    /// An item of the content was performed.
    void itemPerformed(
        int itemId, const QVariant& value, const QVariant& userData, vx::PopoverWidget::EItemPerformedFlags flag);
    /// The margins were set; a layout pass follows.
    void marginsChanged(int left, int top, int right, int bottom);
    /// A layout pass has run. A resize of the window runs more than one.
    void layoutUpdated();
    /// Emitted by the destructor, while the controller is still whole.
    void controllerDestroyed(vx::PopoverWidget::Controller* controller);
    /// Something in the format Item::sPopoverWidgetItem was dropped on the overlay, or on a part of the balloon
    /// that takes no drops itself. \a item is the item that was dragged, null if something else made the drag; the
    /// position is global, and the event is valid during the emission only.
    void itemDropped(vx::PopoverWidget::Item* item, QDropEvent* dropEvent, const QPoint& globalPos);

public Q_SLOTS:
    /// Opens or closes. Closing this way asks and tells the container nothing.
    void setActive(bool active = true,
        EPopoverShowFlags showFlags = EPopoverShowFlags(QFlag(epsBalloon | epsNoFade)), bool animated = true);
    /// Points the balloon at a rectangle in the controller's coordinates.
    void setForRect(const QRect& rect);
    /// Covers the covered widget again and lays out the balloon; only while visible, unless \a force.
    void updateLayout(bool force = false);
    /// Closes, unless the popover stays visible or Container::canBeClosed() says no. \a force asks nobody.
    virtual void dismiss(bool animated = true, bool force = false);
    /// Emits popoverWillHelp().
    void help();
    /// dismiss(false, false).
    void close();
    /// What exec() returns.
    void setResultCode(int code);
    void setAccepted(); ///< Result 1; does not close.
    void setRejected(); ///< Result 0; does not close.
    /// Margins, in pixels inwards, of the covered area. Default 0.
    void setMargins(int left, int top, int right, int bottom);
    /// Adds to the present margins.
    void adjustMargins(int left, int top, int right, int bottom);

private Q_SLOTS:
    void fadedOut();
    void appeared();
    void disappeared();

protected:
    friend class Manager;

    /// Controllers are made by the Manager.
    Controller(QWidget* inWidget, QWidget* forWidget, bool isSubController, const QString& objectName,
        QFlags<Balloon::EArrowDirection> directions, const QSizeF& size,
        QFlags<Balloon::ESizeConstraint> constraints);
    /// The same without a target.
    Controller(QWidget* inWidget, bool isSubController, const QString& objectName, const QSizeF& size,
        QFlags<Balloon::ESizeConstraint> constraints);

    /// What the overlay is to cover, in coordinates of its parent.
    QRect controllerRect() const;

    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void keyReleaseEvent(QKeyEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dragMoveEvent(QDragMoveEvent* event) override;
    void dragLeaveEvent(QDragLeaveEvent* event) override;
    void dropEvent(QDropEvent* event) override;
    void showEvent(QShowEvent* event) override;

private:
    void open(bool animated);
    void closeDown(bool animated);
    bool appear(bool animated);
    void growToShow();
    void shrinkAway();
    void leaveInterruptedMotion();
    void setContentVisible(bool visible);
    void emitOwedLayoutUpdated();
    bool isUnseen() const;
    QList<QPointer<Controller>> nestedControllers() const;
    static QList<Controller*>& all();
    void buildBalloon(QFlags<Balloon::EBalloonFeature> features);
    void buildEmbedded();

    bool m_active = false;
    QPointer<QWidget> m_forWidget;
    QPointer<QWidget> m_inWidget;
    bool m_isSubController;
    QPointer<Container> m_container;
    QPointer<Balloon> m_balloon;
    QFlags<Balloon::EArrowDirection> m_arrowDirections;
    QSizeF m_size;
    QFlags<Balloon::ESizeConstraint> m_sizeConstraints;
    bool m_stayVisible = false;
    bool m_persistence = false;
    bool m_opened = false;
    bool m_pressedOutside = false;
    bool m_closing = false;
    QPointer<QPropertyAnimation> m_geometryAnimation;
    QRect m_balloonRect;
    QRect m_shrunkRect;
    EPopoverShowFlags m_showFlags = epsBalloon;
    int m_resultCode = 0;
    QMargins m_margins;
    QMargins m_insets;
    bool m_modal = true;
    QString m_title;

    // While Qt shows or resizes the overlay on our behalf, layoutUpdated() waits until it is done, so that a slot
    // may delete the controller.
    int m_insideQt = 0;
    int m_owedLayoutUpdated = 0;
};

Q_DECLARE_OPERATORS_FOR_FLAGS(Controller::EPopoverShowFlags)
}

/// How controllers are handed around; null once one is gone.
using TPopoverControllerPointer = QPointer<PopoverWidget::Controller>;
}

Q_DECLARE_METATYPE(vx::TPopoverControllerPointer)
