// SPDX-License-Identifier: MIT
// A slim scroll bar that floats over the content of a scroll area and fades when it is left alone.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPointer>
#include <QtCore/QString>
#include <QtWidgets/QScrollBar>

class QAbstractScrollArea;
class QTimer;

/// A slim scroll bar over the content of a QAbstractScrollArea, in place of the area's own bar, which it switches
/// off.
///
/// The area's own bar (the real one) stays the owner of range and value; this one shadows it. It copies range,
/// page step and value, and sends back what the user drags: while the handle is held, values of the real bar are
/// not taken over, and only then this bar's values are handed on. Everything goes through queued connections, one
/// turn of the event loop later. A press on the groove moves this bar by a page and nothing else, since nothing is
/// dragged.
///
/// 1500 ms after the last activity (a value or range of the real bar, a move of the pointer over this bar) the
/// handle turns transparent. A faded bar is not hidden: it still takes the mouse. Wheel events over the bar scroll
/// the area.
///
/// The bar is named "HorizontalNicerScrollBar" or "VerticalNicerScrollBar" for style sheets and sets the colour of
/// its handle through a style sheet of its own, from the first fade on. Qt heeds colours of a handle only if a
/// style sheet also says something of the bar itself, so an application has a rule such as "QScrollBar {
/// background: transparent; border: none; }"; without one the bar looks like any other and its fades are not seen.
///
/// It follows the size of its parent, which is usually the area. One bar serves one area for all its life; a
/// second one serves the other orientation.
class ZELKOV_WIDGETS_EXPORT NicerScrollBar : public QScrollBar
{
    Q_OBJECT

public:
    /// Where the bar lies. Only epTop and epLeft make a difference, and each for its own orientation only: a
    /// horizontal bar at epLeft lies at the bottom, a vertical one at epTop at the right.
    enum EPositions : int
    {
        epAutomatic = 1, ///< bottom or right; becomes epBottom or epRight in the constructor
        epBottom = 2,
        epTop = 3,
        epRight = 4,
        epLeft = 5
    };

    // Object names of the bars, and two more that style sheets may use; this class does not apply those.
    static const QString s_HorizontalNicerScrollBar;
    static const QString s_HorizontalNicerScrollBarInvisible;
    static const QString s_VerticalNicerScrollBar;
    static const QString s_VerticalNicerScrollBarInvisible;

    /// A plain scroll bar that shadows nothing and never fades.
    explicit NicerScrollBar(QWidget* parent = nullptr);

    /// Takes over the bar of @p scrollArea with this orientation, with what range and value it has. @p parent is
    /// the widget that the bar lies on, usually the area itself; the bar's place is computed from the size of the
    /// area.
    NicerScrollBar(
        QAbstractScrollArea* scrollArea, Qt::Orientation orientation, EPositions position, QWidget* parent);
    ~NicerScrollBar() override;

    /// Puts the bar on its edge. Called by itself whenever the parent is resized or the range changes.
    void resizeBar();

    /// Makes the handle visible if it is faded, starts the time to the next fade and raises the bar.
    void showBar();

    /// Default true. Switching it off leaves a faded bar faded until the next showBar().
    void setFadingEnabled(bool enabled);

    /// Default Qt::ScrollBarAsNeeded: the bar is shown if the real bar's maximum is above 1.
    void setScrollBarPolicy(Qt::ScrollBarPolicy policy);

Q_SIGNALS:
    /// The user has dragged the handle to this value. Emitted while the handle is held, one turn of the event loop
    /// after valueChanged().
    void nicerValueChanged(int value);

public Q_SLOTS:
    /// Takes over a range, and the page step of the real bar; shows or hides the bar by its policy.
    void setNicerRange(int min, int max);
    /// Takes over a value and shows the handle, unless the user holds the handle.
    void setNicerValue(int value);

private Q_SLOTS:
    void nicerValueChange(int value);
    void fadeBar();

public:
    bool eventFilter(QObject* object, QEvent* event) override;

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    void init();
    void showScrollbar();

    EPositions m_position = epAutomatic;
    int m_thickness = 15; // logical pixels
    int m_fadeDelay = 1500; // ms
    QTimer* m_fadeTimer = nullptr; // null in a bar that shadows nothing
    bool m_faded = false;
    bool m_fadingEnabled = true;
    QPointer<QAbstractScrollArea> m_scrollArea;
    QPointer<QScrollBar> m_realBar; // an area deletes its bar when it is given another
    Qt::Orientation m_orientation = Qt::Vertical;
    Qt::ScrollBarPolicy m_scrollBarPolicy = Qt::ScrollBarAsNeeded;
};
