// SPDX-License-Identifier: MIT
// Fades a whole widget in and out, and hides it at the end of a fade-out.
#include "foundation/OpacityAnimation.h"

#include "CoreQt/Connect.h"
#include "foundation/LogStatement.h"

#include <QGraphicsOpacityEffect>

const int OpacityAnimation::s_FadeInTime = 1000;
const int OpacityAnimation::s_FadeOutTime = 350;

namespace
{
QGraphicsOpacityEffect* opacityEffect(const QWidget* widget)
{
    return widget != nullptr ? qobject_cast<QGraphicsOpacityEffect*>(widget->graphicsEffect()) : nullptr;
}
}

OpacityAnimation::OpacityAnimation(QWidget* widget)
    : QPropertyAnimation(widget)
    , m_widget(widget)
{
    initialise();
}

OpacityAnimation::OpacityAnimation(QObject* target, const QByteArray& property, QWidget* widget)
    : QPropertyAnimation(target, property, widget)
    , m_widget(widget)
{
    initialise();
}

OpacityAnimation::~OpacityAnimation() = default;

void OpacityAnimation::initialise()
{
    m_fadeInTime = s_FadeInTime;
    m_fadeOutTime = s_FadeOutTime;
    m_fadeChildren = false;
    m_autoHide = true;
    m_opacity = 0.0;
    if (m_widget != nullptr) {
        m_widget->setGraphicsEffect(nullptr);
    }
    // Without a target in between, Qt warns of a target that lacks the property, whichever is set first.
    setTargetObject(nullptr);
    setPropertyName("opacity");
    setTargetObject(this);
    vx::connect(this, "2valueChanged(const QVariant&)", m_widget, "1update()", Qt::UniqueConnection);
}

void OpacityAnimation::fadeIn()
{
    if (!interrupt()) {
        return;
    }
    QObject::disconnect(this, &QAbstractAnimation::finished, this, &OpacityAnimation::fadedOut);
    if (m_widget != nullptr && !m_widget->isVisible()) {
        m_opacity = 0.0;
        if (m_fadeChildren) {
            if (QGraphicsOpacityEffect* effect = opacityEffect(m_widget)) {
                effect->setOpacity(m_opacity);
            }
        }
        const QPointer<OpacityAnimation> self(this);
        m_widget->show();
        // A show event may ask for a fade of its own, which is the later wish.
        if (self == nullptr || state() != Stopped) {
            return;
        }
    }
    // A pointer to a virtual member: the subclass's override is what is called.
    QObject::connect(this, &QAbstractAnimation::finished, this, &OpacityAnimation::fadedIn, Qt::UniqueConnection);
    startFade(m_fadeInTime, 1.0F);
}

void OpacityAnimation::fadeOut()
{
    if (!interrupt()) {
        return;
    }
    QObject::disconnect(this, &QAbstractAnimation::finished, this, &OpacityAnimation::fadedIn);
    QObject::connect(this, &QAbstractAnimation::finished, this, &OpacityAnimation::fadedOut, Qt::UniqueConnection);
    startFade(m_fadeOutTime, 0.0F);
}

bool OpacityAnimation::interrupt()
{
    // A fade stopped in its last step counts as ended: its slots may start another fade, or delete this.
    const QPointer<OpacityAnimation> self(this);
    stop();
    if (self == nullptr) {
        return false;
    }
    stop();
    return self != nullptr;
}

void OpacityAnimation::startFade(int duration, float end)
{
    if (targetObject() == nullptr) {
        // The effect went in mid-fade and took the fade with it.
        QGraphicsOpacityEffect* effect = m_fadeChildren ? opacityEffect(m_widget) : nullptr;
        setTargetObject(effect != nullptr ? static_cast<QObject*>(effect) : this);
    }
    setDuration(qMax(0, duration));
    setEndValue(QVariant(end));
    start(QAbstractAnimation::KeepWhenStopped);
}

void OpacityAnimation::fadedOut()
{
    QObject::disconnect(this, &QAbstractAnimation::finished, this, &OpacityAnimation::fadedOut);
    const QPointer<OpacityAnimation> self(this);
    if (m_autoHide && m_widget != nullptr) {
        m_widget->hide();
    }
    if (self != nullptr) {
        Q_EMIT didFadeOut();
    }
}

void OpacityAnimation::fadedIn()
{
    QObject::disconnect(this, &QAbstractAnimation::finished, this, &OpacityAnimation::fadedIn);
    Q_EMIT didFadeIn();
}

void OpacityAnimation::onValueChanged(const QVariant& value)
{
    ZELKOV_LOG(vx::c_LogTrace, "OpacityAnimation::onValueChanged", value.toFloat());
}

void OpacityAnimation::setFadingTimes(int in, int out)
{
    m_fadeInTime = in;
    m_fadeOutTime = out;
}

double OpacityAnimation::getOpacity() const
{
    return m_opacity;
}

void OpacityAnimation::setOpacity(double opacity)
{
    m_opacity = opacity;
    if (m_fadeChildren) {
        if (QGraphicsOpacityEffect* effect = opacityEffect(m_widget)) {
            effect->setOpacity(m_opacity);
        }
    }
}

bool OpacityAnimation::autoHide() const
{
    return m_autoHide;
}

void OpacityAnimation::setAutoHide(bool on)
{
    m_autoHide = on;
}

bool OpacityAnimation::fadeChildren() const
{
    return m_fadeChildren;
}

void OpacityAnimation::setFadeChildren(bool on)
{
    m_fadeChildren = on;
    if (m_widget == nullptr) {
        return;
    }
    if (on) {
        auto* effect = new QGraphicsOpacityEffect(this);
        effect->setOpacity(m_opacity);
        m_widget->setGraphicsEffect(effect);
        if (state() != Running) {
            setTargetObject(effect);
        }
    } else {
        m_widget->setGraphicsEffect(nullptr);
        if (state() != Running) {
            setTargetObject(this);
        }
    }
}
