// SPDX-License-Identifier: MIT
// vx::NavigationViewController: a stack of pages that slide sideways when they change.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QEasingCurve>
#include <QtWidgets/QStackedWidget>

namespace vx
{
/// A QStackedWidget whose pages slide in from the side where they stand in the order, and that tells of each
/// page's coming and going.
///
/// setCurrentIndexWithAnimation() emits viewWillDisappear(old) and viewWillAppear(next), slides, and when the
/// slide has ended changes the current index and emits viewDidDisappear(old) and viewDidAppear(next), all with
/// `animated` true. setCurrentIndex() does the same at once with `animated` false. The current index is the old
/// page's until the slide ends; animatedIndex() is where it is going.
///
/// A slide started during another one takes over, and the former never reports its end. Only where the two have no
/// page in common, after a setCurrentIndex() in between, do both go on: the first to end changes to the later
/// target, and the end of the other tells once more of the current page's disappearing, though it stays.
class ZELKOV_WIDGETS_EXPORT NavigationViewController : public QStackedWidget
{
    Q_OBJECT

public:
    /// Slides take 200 ms, linear.
    explicit NavigationViewController(QWidget* parent = nullptr);
    /// \a duration in ms; the curve is that of both pages.
    NavigationViewController(int duration, QEasingCurve easing, QWidget* parent = nullptr);
    ~NavigationViewController() override;

    // These two hide the functions of QStackedWidget, which are not virtual: called through a QStackedWidget* they
    // tell nothing.

    /// The first page also appears: viewWillAppear and viewDidAppear. Null is ignored.
    void addWidget(QWidget* widget);
    /// Changes at once. An index out of range changes nothing, but the pages are told.
    void setCurrentIndex(int index);

    /// Target of the slide that runs, else -1. Also the last index asked for if there was nothing to slide.
    int animatedIndex() const;
    /// The page at animatedIndex(), or the current one.
    QWidget* animatedWidget() const;

Q_SIGNALS:
    // Of the page that comes, before and after the change; null for an index out of range.
    void viewWillAppear(QWidget* widget, bool animated);
    void viewDidAppear(QWidget* widget, bool animated);
    // Of the page that goes, likewise.
    void viewWillDisappear(QWidget* widget, bool animated);
    void viewDidDisappear(QWidget* widget, bool animated);

public Q_SLOTS:
    /// Slides to the page: from the right if it stands behind the current one, else from the left. For the current
    /// page, or an index out of range (then with a null page), only viewWillAppear and viewDidAppear are emitted,
    /// with `animated` false.
    void setCurrentIndexWithAnimation(int index);

protected Q_SLOTS:
    /// The end of a slide.
    void animationDone();

private:
    int m_duration = 200; // ms
    QEasingCurve m_easing;
    int m_animatedIndex = -1;
};
}
