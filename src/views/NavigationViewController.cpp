// SPDX-License-Identifier: MIT
// A stack of pages that slide sideways when they change.
#include "views/NavigationViewController.h"

#include "CoreQt/Connect.h"

#include <QtCore/QParallelAnimationGroup>
#include <QtCore/QPointer>
#include <QtCore/QPropertyAnimation>

namespace vx
{
namespace
{
/// The movement of one page. A group starts what has stopped in it again with each tick, and Qt would complain
/// each time when the page has died.
class PageSlide : public QPropertyAnimation
{
public:
    explicit PageSlide(QWidget* page)
        : QPropertyAnimation(page, QByteArrayLiteral("pos"))
    {
    }

protected:
    void updateState(QAbstractAnimation::State newState, QAbstractAnimation::State oldState) override
    {
        if (targetObject() != nullptr || oldState != Stopped) {
            QPropertyAnimation::updateState(newState, oldState);
        }
    }
};

PageSlide* newSlideOf(QWidget* page, int duration, const QEasingCurve& easing, int fromX, int toX)
{
    auto* const slide = new PageSlide(page);
    slide->setDuration(qMax(0, duration));
    slide->setEasingCurve(easing);
    slide->setStartValue(QPoint(fromX, page->y()));
    slide->setEndValue(QPoint(toX, page->y()));
    return slide;
}
}

NavigationViewController::NavigationViewController(QWidget* parent)
    : QStackedWidget(parent)
{
}

NavigationViewController::NavigationViewController(int duration, QEasingCurve easing, QWidget* parent)
    : QStackedWidget(parent)
    , m_duration(duration)
    , m_easing(std::move(easing))
{
}

NavigationViewController::~NavigationViewController() = default;

void NavigationViewController::addWidget(QWidget* widget)
{
    const QPointer<NavigationViewController> alive(this);
    const QPointer<QWidget> page(widget);
    if (count() == 0 && page) {
        Q_EMIT viewWillAppear(widget, false);
    }
    if (!alive || !page) {
        return;
    }
    QStackedWidget::addWidget(page);
    if (count() == 1) {
        Q_EMIT viewDidAppear(page, false);
    }
}

void NavigationViewController::setCurrentIndex(int index)
{
    if (index == currentIndex()) {
        return;
    }
    const QPointer<NavigationViewController> alive(this);
    const QPointer<QWidget> old(currentWidget());
    const QPointer<QWidget> next(widget(index));
    Q_EMIT viewWillDisappear(old, false);
    if (alive) {
        Q_EMIT viewWillAppear(next, false);
    }
    if (alive) {
        QStackedWidget::setCurrentIndex(index);
    }
    if (alive) {
        Q_EMIT viewDidDisappear(old, false);
    }
    if (alive) {
        Q_EMIT viewDidAppear(next, false);
    }
}

int NavigationViewController::animatedIndex() const
{
    return m_animatedIndex;
}

QWidget* NavigationViewController::animatedWidget() const
{
    return m_animatedIndex >= 0 && m_animatedIndex < count() ? widget(m_animatedIndex) : currentWidget();
}

void NavigationViewController::setCurrentIndexWithAnimation(int index)
{
    m_animatedIndex = index;
    const QPointer<NavigationViewController> alive(this);
    const QPointer<QWidget> old(widget(currentIndex()));
    const QPointer<QWidget> next(widget(index));
    if (!next || next == old) {
        Q_EMIT viewWillAppear(next, false);
        if (alive) {
            Q_EMIT viewDidAppear(next, false);
        }
        return;
    }

    // There is a page, so there is a current one too.
    const int away = currentIndex() < index ? old->width() : -old->width();
    const QPointer<QParallelAnimationGroup> group(new QParallelAnimationGroup);
    group->addAnimation(newSlideOf(next, m_duration, m_easing, away, 0));
    group->addAnimation(newSlideOf(old, m_duration, m_easing, 0, -away));
    vx::connect(group, "2finished()", this, "1animationDone()", Qt::AutoConnection);
    // Without a parent it would live on.
    connect(this, &QObject::destroyed, group.data(), &QAbstractAnimation::stop);

    next->resize(old->size());
    next->show();
    next->raise();
    Q_EMIT viewWillDisappear(old, true);
    if (alive) {
        Q_EMIT viewWillAppear(next, true);
    }
    if (!alive) {
        delete group;
        return;
    }
    group->start(QAbstractAnimation::DeleteWhenStopped);
}

void NavigationViewController::animationDone()
{
    const QPointer<NavigationViewController> alive(this);
    const QPointer<QWidget> old(currentWidget());
    const QPointer<QWidget> next(widget(m_animatedIndex));
    QStackedWidget::setCurrentIndex(m_animatedIndex);
    if (!alive) {
        return;
    }
    m_animatedIndex = -1;
    // A slide that was overtaken has shown a page that did not become the current one.
    for (int i = 0; i < count(); ++i) {
        if (i != currentIndex()) {
            widget(i)->hide();
        }
    }
    if (old) {
        Q_EMIT viewDidDisappear(old, true);
    }
    if (alive && next) {
        Q_EMIT viewDidAppear(next, true);
    }
}
}
