// SPDX-License-Identifier: MIT
// vx::WidgetSlideshow: a stack of pages that moves on by itself.
#pragma once

#include "views/NavigationViewController.h"

#include <QtCore/QList>

class QTimer;

namespace vx
{
/// Slides to the next of its pages every five seconds, from the last back to the first, for as long as it lives.
/// The slides take 750 ms; their signals are those of NavigationViewController. With a single page each turn emits
/// viewWillAppear and viewDidAppear with `animated` false.
class ZELKOV_WIDGETS_EXPORT WidgetSlideshow : public NavigationViewController
{
    Q_OBJECT

public:
    /// The pages become children. More can be added later.
    explicit WidgetSlideshow(const QList<QWidget*>& widgets, QWidget* parent = nullptr);
    ~WidgetSlideshow() override;

private Q_SLOTS:
    void showNextItem();
    /// Does nothing.
    void showPreviousItem();

private:
    QTimer* m_timer;
};
}
