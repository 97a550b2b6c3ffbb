// SPDX-License-Identifier: MIT
// A slider with any number of handles: stacking, what concerns the slider as a whole, and the events that are not
// of the mouse.
#include "sliders/MultiNubsieSlider.h"

#include <QtCore/QEvent>
#include <QtGui/QHelpEvent>
#include <QtGui/QMouseEvent>
#include <QtGui/QMoveEvent>
#include <QtGui/QResizeEvent>
#include <QtWidgets/QToolTip>

namespace vx
{
namespace
{
constexpr int c_FadeInTime = 500; // ms
constexpr int c_FadeOutTime = 2000; // ms
}

// Stacking ---------------------------------------------------------------------------------------------------

void MultiNubsieSlider::raiseNubsies()
{
    const QList<QPointer<Nubsie>> nubsies = m_nubsies;
    for (const QPointer<Nubsie>& nubsie : nubsies) {
        if (nubsie) {
            nubsie->raise();
        }
    }
}

void MultiNubsieSlider::raiseNubsieOnSlider(Nubsie* kingNubsie)
{
    const QPointer<MultiNubsieSlider> self(this);
    const QList<QPointer<Nubsie>> nubsies = m_nubsies;
    const QPointer<Nubsie> king(kingNubsie);
    for (const QPointer<Nubsie>& nubsie : nubsies) {
        if (nubsie && king && nubsie != king) {
            nubsie->stackUnder(king);
        }
    }
    if (self) {
        raiseNubsieOverRivals();
    }
}

void MultiNubsieSlider::raiseNubsieOverRivals()
{
    // A rival's own handles stay where they are; it is only a reason to put ours under the one in use.
    const QList<QPointer<Nubsie>> nubsies = m_nubsies;
    const QPointer<Nubsie> current = m_currentNubsie;
    const auto rivals = m_rivals;
    for (const QPointer<MultiNubsieSlider>& rival : rivals) {
        if (!rival) {
            continue;
        }
        for (const QPointer<Nubsie>& nubsie : nubsies) {
            if (nubsie && current) {
                nubsie->stackUnder(current);
            }
        }
    }
}

void MultiNubsieSlider::stackNubsiesUnder(QWidget* widget)
{
    const QPointer<QWidget> over(widget);
    const QList<QPointer<Nubsie>> nubsies = m_nubsies;
    for (const QPointer<Nubsie>& nubsie : nubsies) {
        if (nubsie && over) {
            nubsie->stackUnder(over);
        }
    }
}

void MultiNubsieSlider::stackNubsiesOver(QWidget* widget)
{
    QList<QPointer<Nubsie>> nubsies = m_nubsies;
    nubsies.removeAll(QPointer<Nubsie>());
    if (nubsies.isEmpty() || widget == nullptr) {
        return;
    }
    const QPointer<QWidget> under(widget);
    const QPointer<Nubsie> first = nubsies.constFirst();
    const QPointer<Nubsie> last = nubsies.constLast();
    if (first != last) {
        last->stackUnder(first);
        for (int i = 1; i < nubsies.size() - 1; ++i) {
            if (nubsies.at(i) && first) {
                nubsies.at(i)->stackUnder(first);
            }
        }
    }
    if (under && last) {
        under->stackUnder(last);
    }
}

void MultiNubsieSlider::addRival(MultiNubsieSlider* other)
{
    if (other == nullptr || m_rivals.contains(other)) {
        return;
    }
    m_rivals.append(other);
    other->m_rivals.append(this);
}

// The slider as a whole --------------------------------------------------------------------------------------

QFlags<MultiNubsieSlider::EMultiNubsieSliderFeatures> MultiNubsieSlider::getFeatures() const
{
    return m_features;
}

void MultiNubsieSlider::setFeatures(QFlags<EMultiNubsieSliderFeatures> features)
{
    m_features = features;
    setInActiveOpacity();
}

Qt::Orientation MultiNubsieSlider::orientation() const
{
    return m_orientation;
}

void MultiNubsieSlider::setOrientation(Qt::Orientation orientation)
{
    m_orientation = orientation;
    updateNubsiePositions(false);
}

double MultiNubsieSlider::sliderBarExtent() const
{
    return m_sliderBarExtent;
}

void MultiNubsieSlider::setSliderBarExtent(double extent)
{
    m_sliderBarExtent = extent;
    update();
}

bool MultiNubsieSlider::getDrawTrack() const
{
    return m_drawTrack;
}

void MultiNubsieSlider::setDrawTrack(bool draw)
{
    m_drawTrack = draw;
}

void MultiNubsieSlider::setDrawProgress(bool draw)
{
    m_drawProgress = draw;
    update();
}

QColor MultiNubsieSlider::getProgressColor() const
{
    return m_progressColor;
}

void MultiNubsieSlider::setProgressColor(const QColor& color)
{
    m_progressColor = color;
}

void MultiNubsieSlider::setProgress(double progress)
{
    m_progress = qBound(0.0, progress, 1.0);
    update();
}

double MultiNubsieSlider::getProgress() const
{
    return m_progress;
}

double MultiNubsieSlider::getOpacity() const
{
    return m_opacityFactor;
}

void MultiNubsieSlider::setOpacity(double opacity)
{
    m_opacityFactor = opacity;
}

void MultiNubsieSlider::setActiveOpacity()
{
    m_opacityAnimator.stop();
    if (m_features.testFlag(emfFadeWhenInactive)) {
        m_opacityAnimator.setEasingCurve(QEasingCurve::OutExpo);
        m_opacityAnimator.setDuration(c_FadeInTime);
        m_opacityAnimator.setEndValue(1.0);
        m_opacityAnimator.start();
    }
}

void MultiNubsieSlider::setInActiveOpacity()
{
    m_opacityAnimator.stop();
    if (m_features.testFlag(emfFadeWhenInactive)) {
        m_opacityFactor = 1.0;
        m_opacityAnimator.setEasingCurve(QEasingCurve::InExpo);
        m_opacityAnimator.setDuration(c_FadeOutTime);
        m_opacityAnimator.setEndValue(s_OpacityFadeValue);
        m_opacityAnimator.start();
    }
}

void MultiNubsieSlider::hideNubsieBalloons()
{
    const QList<QPointer<Nubsie>> nubsies = m_nubsies;
    for (const QPointer<Nubsie>& nubsie : nubsies) {
        if (nubsie) {
            nubsie->hideBalloon();
        }
    }
}

void MultiNubsieSlider::nubsieValueChanged(int value)
{
    if (const auto* const nubsie = qobject_cast<Nubsie*>(sender())) {
        Q_EMIT nubsieValueChangedByUser(nubsie->id(), value);
    }
}

void MultiNubsieSlider::dragSizeChanged(Nubsie* nubsie, QSize size)
{
    Q_UNUSED(size)
    if (nubsie != nullptr && nubsie == m_currentNubsie) {
        updateNubsieLayer(nubsie);
    }
}

// Events -----------------------------------------------------------------------------------------------------

void MultiNubsieSlider::showEvent(QShowEvent* event)
{
    m_nubsiesShown = true;
    const QPointer<MultiNubsieSlider> self(this);
    const QList<QPointer<Nubsie>> nubsies = m_nubsies;
    for (const QPointer<Nubsie>& nubsie : nubsies) {
        if (nubsie) {
            nubsie->show();
        }
    }
    if (!self) {
        return;
    }
    updateNubsiePositions(false);
    if (self) {
        QWidget::showEvent(event);
    }
}

void MultiNubsieSlider::hideEvent(QHideEvent* event)
{
    m_nubsiesShown = false;
    const QPointer<MultiNubsieSlider> self(this);
    const QList<QPointer<Nubsie>> nubsies = m_nubsies;
    for (const QPointer<Nubsie>& nubsie : nubsies) {
        if (nubsie) {
            nubsie->hide();
        }
    }
    if (self) {
        QWidget::hideEvent(event);
    }
}

void MultiNubsieSlider::moveEvent(QMoveEvent* event)
{
    QWidget::moveEvent(event);
    layOutNowAndLater();
}

void MultiNubsieSlider::resizeEvent(QResizeEvent* event)
{
    QWidget::resizeEvent(event);
    layOutNowAndLater();
}

// At once, and again when the geometry of the whole window is final.
void MultiNubsieSlider::layOutNowAndLater()
{
    const QPointer<MultiNubsieSlider> self(this);
    stopNubsieAnimations();
    if (self) {
        updateNubsiePositions(false);
    }
    if (self) {
        Q_EMIT triggerNubsieRepaintQueued(false);
    }
}

void MultiNubsieSlider::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::EnabledChange) {
        const QPointer<MultiNubsieSlider> self(this);
        const QList<QPointer<Nubsie>> nubsies = m_nubsies;
        for (const QPointer<Nubsie>& nubsie : nubsies) {
            // Those in the window do not inherit the state.
            if (self && nubsie && nubsie->parentWidget() != this) {
                nubsie->setEnabled(isEnabled());
            }
        }
        if (!self) {
            return;
        }
    }
    QWidget::changeEvent(event);
}

void MultiNubsieSlider::contextMenuEvent(QContextMenuEvent* event)
{
    Q_UNUSED(event)
}

// The base class is left out of both, on purpose.
void MultiNubsieSlider::enterEvent(QEvent* event)
{
    Q_UNUSED(event)
    setActiveOpacity();
}

void MultiNubsieSlider::leaveEvent(QEvent* event)
{
    Q_UNUSED(event)
    setInActiveOpacity();
}

bool MultiNubsieSlider::event(QEvent* event)
{
    if (event->type() == QEvent::ToolTip) {
        const auto* const help = static_cast<QHelpEvent*>(event);
        Nubsie* const nubsie = getNubsieForPos(help->pos());
        if (nubsie != nullptr && !nubsie->toolTipText().isEmpty()) {
            QToolTip::showText(mapToGlobal(help->pos()), nubsie->toolTipText(), nubsie, QRect());
            return true;
        }
        if (flagHit(m_firstFlag, help->pos()) || flagHit(m_secondFlag, help->pos())) {
            QToolTip::showText(mapToGlobal(help->pos()), tr("Time range to export"), nubsie, QRect());
            return true;
        }
    }
    return QWidget::event(event);
}

bool MultiNubsieSlider::handleEvent(QEvent* event)
{
    this->event(event);
    return event->isAccepted();
}

bool MultiNubsieSlider::eventFilter(QObject* object, QEvent* event)
{
    const QPointer<QObject> watched(object);
    const QPointer<MultiNubsieSlider> self(this);
    switch (event->type()) {
    case QEvent::MouseButtonPress:
        mousePressEvent(static_cast<QMouseEvent*>(event));
        break;
    case QEvent::MouseButtonRelease:
        mouseReleaseEvent(static_cast<QMouseEvent*>(event));
        break;
    case QEvent::MouseMove:
        mouseMoveEvent(static_cast<QMouseEvent*>(event));
        break;
    case QEvent::MouseButtonDblClick:
        mouseDoubleClickEvent(static_cast<QMouseEvent*>(event));
        break;
    default:
        break;
    }
    // An object that a slot has deleted must not get the event any more.
    if (!watched) {
        return true;
    }
    return self ? QObject::eventFilter(object, event) : false;
}
}
