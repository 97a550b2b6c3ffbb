// SPDX-License-Identifier: MIT
// A tool button that tells short, long and context clicks apart and asks for the right to click.
#pragma once

#include "foundation/Export.h"
#include "foundation/TFadingWidget.h"
#include "input/CustomClickAdapter.h"

#include <QPointer>
#include <QToolButton>

class QContextMenuEvent;
class QEvent;
class QMouseEvent;

namespace vx
{
/// A pulsing button with more than one kind of click. Connect to clicked() and ask getClickType() in the slot.
///
/// Held for the long click span it clicks by itself while the mouse is still down (unless setAutoClick(false),
/// when the release brings the click); the type is then ectLong. A right click is a click of the type ectContext,
/// and opens no menu. A long click on a checkable button emits toggled() with the present state and changes
/// nothing. A user whom the security manager refuses gets no reaction at all.
///
/// click() called by the program counts as long while automatic clicks are on and nothing has been pressed since
/// the last click: no hold timer runs then. Takes no focus. Instantiated for QToolButton alone.
template <typename T> class TCustomClickWidget : public TFadingWidget<T>, public CustomClickAdapter
{
public:
    /// \a longClickSpan is in milliseconds (s_DefaultLongClickSpan), \a shadow as in
    /// TFadingWidget::enableShadow().
    TCustomClickWidget(QWidget* parent, int longClickSpan, bool shadow);
    ~TCustomClickWidget() override;

    /// Who sees the mouse events of the button, in two slots that are called directly: mousePress(QMouseEvent*,
    /// T*) before the press has an effect, and mouseRelease(QMouseEvent*, T*) after the release had its own. The
    /// second argument is the button, and its type has to be spelled just so: let T be an alias of QToolButton in
    /// the listener. Qt warns about a listener that lacks a slot. Presses of a refused user are not told. Null
    /// (the default) for none; not owned.
    void setListener(QObject* listener);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void enterEvent(QEvent* event) override;
    void leaveEvent(QEvent* event) override;
    void changeEvent(QEvent* event) override;
    void checkStateSet() override;
    void nextCheckState() override;

    QPointer<QObject> m_listener; ///< see setListener()
};

extern template class ZELKOV_WIDGETS_EXPORT TCustomClickWidget<QToolButton>;
}
