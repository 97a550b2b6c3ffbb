// SPDX-License-Identifier: MIT
// vx::PopoverWidget::Controller: content, place and interfaces. What the user does is in ControllerEvents.cpp.
#include "popover/Controller.h"

#include "CoreQt/Connect.h"
#include "foundation/LogStatement.h"
#include "popover/Container.h"
#include "popover/ControllerVerdicts.h"

#include <QEasingCurve>
#include <QEventLoop>
#include <QPropertyAnimation>
#include <QScrollArea>
#include <QScrollBar>
#include <QVBoxLayout>

namespace vx
{
namespace PopoverWidget
{
namespace
{
constexpr int c_GrowTime = 400; // ms
constexpr int c_ControllerButtonSpacing = 8;
constexpr int c_InternalItemID = -1;

void logNoBalloon(const char* function)
{
    ZELKOV_LOG(vx::c_LogFault, function, "no PopoverWidget set!");
}
}

Controller::Controller(QWidget* inWidget, QWidget* forWidget, bool isSubController, const QString& objectName,
    QFlags<Balloon::EArrowDirection> directions, const QSizeF& size, QFlags<Balloon::ESizeConstraint> constraints)
    : FadableThing<QWidget>(inWidget)
    , m_forWidget(forWidget)
    , m_isSubController(isSubController)
    , m_arrowDirections(directions)
    , m_size(size)
    , m_sizeConstraints(constraints)
{
    all() << this;
    setObjectName(objectName);
    setInWidget(inWidget);
}

Controller::Controller(QWidget* inWidget, bool isSubController, const QString& objectName, const QSizeF& size,
    QFlags<Balloon::ESizeConstraint> constraints)
    : Controller(
        inWidget, nullptr, isSubController, objectName, QFlags<Balloon::EArrowDirection>(), size, constraints)
{
}

Controller::~Controller()
{
    Q_EMIT controllerDestroyed(this);
    // While it is raised for a drop, the balloon is a child of the window.
    if (m_balloon != nullptr && m_balloon->parentWidget() != this) {
        delete m_balloon.data();
    }
    all().removeOne(this);
}

QList<Controller*>& Controller::all()
{
    static auto* const controllers = new QList<Controller*>; // outlives windows that go at the very end
    return *controllers;
}

void Controller::setContainer(Container* container, QFlags<Balloon::EBalloonFeature> features)
{
    if (m_balloon != nullptr || layout() != nullptr || container == nullptr) {
        return;
    }
    m_container = container;
    vx::connect(container,
        "2itemPerformed( int, const QVariant& ,const QVariant&, vx::PopoverWidget::EItemPerformedFlags )", this,
        "2itemPerformed( int, const QVariant& ,const QVariant&, vx::PopoverWidget::EItemPerformedFlags )",
        Qt::AutoConnection);
    vx::connect(container, "2dismissPopover()", this, "1dismiss()", Qt::AutoConnection);
    if (m_inWidget != nullptr) {
        buildBalloon(features);
    } else {
        buildEmbedded();
    }
}

void Controller::buildBalloon(QFlags<Balloon::EBalloonFeature> features)
{
    m_balloon
        = new Balloon(this, m_forWidget, m_container, features, m_arrowDirections, m_size, m_sizeConstraints);
    vx::connect(m_balloon, "2dismiss()", this, "1dismiss()", Qt::AutoConnection);
    vx::connect(m_balloon, "2help()", this, "1help()", Qt::AutoConnection);
    vx::connect(m_container, "2layoutChanged()", this, "1updateLayout()", Qt::AutoConnection);
    vx::connect(m_balloon, "2contentScrolled()", m_container, "1onScrolled()", Qt::AutoConnection);
    m_geometryAnimation = new QPropertyAnimation(m_balloon, "geometry", m_balloon);
    m_geometryAnimation->setDuration(c_GrowTime);
    m_balloonRect = m_balloon->geometry();
    m_balloon->setTitle(m_title);
    m_balloon->hide();
}

void Controller::buildEmbedded()
{
    auto* const box = new QVBoxLayout(this);
    box->setContentsMargins(0, 0, 0, 0);
    if (m_container->header() != nullptr) {
        box->addWidget(m_container->header());
    }
    auto* const area = new QScrollArea;
    area->setWidget(m_container);
    area->setWidgetResizable(true);
    area->setFrameShape(QFrame::NoFrame);
    box->addWidget(area);
    if (m_container->footer() != nullptr) {
        box->addWidget(m_container->footer());
    }
}

void Controller::setForWidget(QWidget& widget, const QPointF& relative)
{
    if (m_balloon == nullptr) {
        logNoBalloon("vx::PopoverWidget::Controller::setForWidget");
        return;
    }
    m_balloon->setForWidget(&widget, relative);
    m_forWidget = &widget;
    widget.installEventFilter(this);
}

void Controller::setInWidget(QWidget* widget)
{
    if (widget == m_inWidget) {
        return;
    }
    fader()->setOpacity(0.0);
    setAcceptDrops(true);
    hide();
    if (widget == nullptr) {
        return;
    }
    while (
        !widget->isWindow() && qobject_cast<Controller*>(widget) == nullptr && widget->parentWidget() != nullptr) {
        widget = widget->parentWidget();
    }
    setParent(widget);
    m_inWidget = widget;
    vx::connect(fader(), "2didFadeIn()", this, "2popoverDidAppear()", Qt::UniqueConnection);
    vx::connect(fader(), "2didFadeOut()", this, "1fadedOut()", Qt::UniqueConnection);
    widget->installEventFilter(this);
    if (m_forWidget != nullptr) {
        m_forWidget->installEventFilter(this);
    }
}

QRect Controller::controllerRect() const
{
    if (m_inWidget == nullptr) {
        return coveredArea(rect(), QMargins(), m_margins);
    }
    if (!m_inWidget->isWindow()) {
        return coveredArea(m_inWidget->geometry(), QMargins(), m_margins);
    }
    return coveredArea(m_inWidget->rect(), m_insets, m_margins);
}

void Controller::updateLayout(bool force)
{
    if ((!isVisible() && !force) || m_inWidget == nullptr) {
        return;
    }
    const QPointer<Controller> self(this);
    ++m_insideQt;
    setGeometry(controllerRect());
    if (self == nullptr) {
        return;
    }
    if (m_balloon != nullptr) {
        m_balloon->setupLayout(true);
        m_balloonRect = m_balloon->geometry();
    }
    m_shrunkRect = QRect(controllerRect().center(), QSize());
    if (m_inWidget != nullptr) {
        m_inWidget->update();
    }
    --m_insideQt;
    ++m_owedLayoutUpdated;
    emitOwedLayoutUpdated();
}

void Controller::emitOwedLayoutUpdated()
{
    const QPointer<Controller> self(this);
    while (self != nullptr && m_insideQt == 0 && m_owedLayoutUpdated > 0) {
        --m_owedLayoutUpdated;
        Q_EMIT layoutUpdated();
    }
}

void Controller::setActive(bool active, EPopoverShowFlags showFlags, bool animated)
{
    m_showFlags = showFlags;
    if (active) {
        open(animated);
    } else {
        closeDown(animated);
    }
}

void Controller::open(bool animated)
{
    const QPointer<Controller> self(this);
    Q_EMIT popoverWillAppear();
    if (self == nullptr) {
        return;
    }
    setAttribute(Qt::WA_TransparentForMouseEvents, m_showFlags.testFlag(epsMouseTransparent));
    if (m_container != nullptr) {
        m_container->popoverOpening();
    }
    if (self == nullptr) {
        return;
    }
    m_active = true;
    setAttribute(Qt::WA_DontShowOnScreen, false);
    leaveInterruptedMotion();
    updateLayout(false);
    // A slot may close the popover while it opens, and that is the later wish.
    if (self == nullptr || !m_active || !appear(animated) || !m_active) {
        return;
    }
    raise();
    switch (balloonMotion(m_showFlags.testFlag(epsBalloon), m_showFlags.testFlag(epsGrow))) {
    case EBalloonMotion::AtOnce:
        if (m_balloon != nullptr) {
            m_balloon->show();
            m_balloon->raiseBalloon(nullptr);
        }
        if (m_container != nullptr) {
            m_container->popoverOpened();
        }
        if (self != nullptr) {
            setFocus();
        }
        break;
    case EBalloonMotion::Animated:
        growToShow();
        break;
    case EBalloonMotion::None:
        break;
    }
    if (self == nullptr || !m_active) {
        return;
    }
    m_opened = true;
    m_closing = false;
    Q_EMIT balloonOpened();
    if (self != nullptr && m_container != nullptr) {
        m_container->setAutoFocus();
    }
}

bool Controller::appear(bool animated)
{
    const QPointer<Controller> self(this);
    const EOverlayEntry entry = overlayEntry(m_showFlags.testFlag(epsNoFade), animated);
    if (entry == EOverlayEntry::Opaque) {
        fader()->setOpacity(1.0);
    }
    ++m_insideQt;
    if (entry == EOverlayEntry::Fade) {
        fader()->fadeIn();
    } else {
        show();
    }
    if (self == nullptr) {
        return false;
    }
    --m_insideQt;
    emitOwedLayoutUpdated();
    if (self == nullptr || entry == EOverlayEntry::Fade) {
        return self != nullptr;
    }
    if (entry == EOverlayEntry::Opaque) {
        setWindowState(windowState() & ~Qt::WindowFullScreen);
    }
    fader()->fadedIn();
    if (self != nullptr) {
        setFocus();
    }
    return self != nullptr;
}

// A popover that is opened again before it has gone, or closed before it has come, must not be caught up by the
// end of the motion that it left.
void Controller::leaveInterruptedMotion()
{
    const QPointer<Controller> self(this);
    if (m_closing) {
        fader()->stop();
    }
    if (self == nullptr || m_geometryAnimation == nullptr
        || (m_geometryAnimation->state() == QAbstractAnimation::Stopped && !m_balloon->content()->isHidden())) {
        return;
    }
    m_geometryAnimation->stop();
    if (m_balloon->layout() != nullptr) {
        m_balloon->layout()->setEnabled(true);
    }
    setContentVisible(true);
}

void Controller::setContentVisible(bool visible)
{
    QScrollArea* const area = m_balloon->content();
    area->horizontalScrollBar()->setVisible(visible);
    area->verticalScrollBar()->setVisible(visible);
    area->setVisible(visible);
}

void Controller::growToShow()
{
    if (m_balloon == nullptr || m_geometryAnimation == nullptr) {
        logNoBalloon("vx::PopoverWidget::Controller::appear");
        return;
    }
    const QPointer<Controller> self(this);
    updateLayout(false);
    if (self == nullptr || m_balloon == nullptr) {
        return;
    }
    m_balloon->content()->hide();
    m_geometryAnimation->stop();
    m_geometryAnimation->setStartValue(m_shrunkRect);
    m_geometryAnimation->setEndValue(m_balloonRect);
    m_geometryAnimation->setEasingCurve(QEasingCurve::OutBack);
    vx::disconnect(m_geometryAnimation, "2finished()", this, "1disappeared()");
    vx::connect(m_geometryAnimation, "2finished()", this, "1appeared()", Qt::UniqueConnection);
    m_balloon->setGeometry(m_shrunkRect);
    m_geometryAnimation->start();
    m_balloon->show();
    m_balloon->raiseBalloon(this);
}

void Controller::appeared()
{
    if (m_balloon == nullptr) {
        logNoBalloon("vx::PopoverWidget::Controller::appeared");
        return;
    }
    const QPointer<Controller> self(this);
    setContentVisible(true);
    updateLayout(false);
    if (self != nullptr && m_container != nullptr) {
        m_container->popoverOpened();
    }
    if (self == nullptr) {
        return;
    }
    if (m_balloon != nullptr) {
        m_balloon->setFocus();
    }
    Q_EMIT popoverDidAppear();
}

void Controller::dismiss(bool animated, bool force)
{
    const QPointer<Controller> self(this);
    const void* const address = this;
    const bool prohibited = !force && (m_stayVisible || m_container == nullptr || !m_container->canBeClosed());
    if (self == nullptr) {
        return;
    }
    if (prohibited) {
        ZELKOV_LOG(vx::c_LogTrace, "vx::PopoverWidget::Controller::dismiss",
            "closing of controller prohibited by Container!");
    } else {
        if (m_container != nullptr) {
            m_container->popoverClosing();
        }
        if (self != nullptr) {
            closeDown(animated);
        }
    }
    ZELKOV_LOG(vx::c_LogTrace, "vx::PopoverWidget::Controller::dismiss", address);
}

void Controller::closeDown(bool animated)
{
    const QPointer<Controller> self(this);
    m_active = false;
    m_opened = false;
    m_closing = true;
    Q_EMIT balloonClosed();
    if (self == nullptr) {
        return;
    }
    Q_EMIT popoverWillDisappear();
    if (self == nullptr) {
        return;
    }
    switch (balloonMotion(m_showFlags.testFlag(epsBalloon), m_showFlags.testFlag(epsGrow))) {
    case EBalloonMotion::AtOnce:
        leaveInterruptedMotion();
        if (self != nullptr && m_balloon != nullptr) {
            m_balloon->hide();
        }
        break;
    case EBalloonMotion::Animated:
        shrinkAway();
        break;
    case EBalloonMotion::None:
        return;
    }
    if (self == nullptr) {
        return;
    }
    if (animated) {
        fader()->fadeOut();
        return;
    }
    fader()->stop();
    if (self != nullptr) {
        hide();
    }
    if (self != nullptr) {
        fadedOut();
    }
}

void Controller::shrinkAway()
{
    if (m_balloon == nullptr || m_geometryAnimation == nullptr) {
        logNoBalloon("vx::PopoverWidget::Controller::disappear");
        return;
    }
    if (m_balloon->layout() != nullptr) {
        m_balloon->layout()->setEnabled(false);
    }
    setContentVisible(false);
    vx::disconnect(m_geometryAnimation, "2finished()", this, "1appeared()");
    vx::connect(m_geometryAnimation, "2finished()", this, "1disappeared()", Qt::UniqueConnection);
    m_geometryAnimation->stop();
    m_geometryAnimation->setStartValue(m_balloon->geometry());
    m_geometryAnimation->setEndValue(m_shrunkRect);
    m_geometryAnimation->setEasingCurve(QEasingCurve::Linear);
    m_geometryAnimation->start();
}

void Controller::disappeared()
{
    if (m_balloon == nullptr) {
        logNoBalloon("vx::PopoverWidget::Controller::disappeared");
        return;
    }
    if (m_balloon->layout() != nullptr) {
        m_balloon->layout()->setEnabled(true);
    }
    const QPointer<Controller> self(this);
    hide();
    if (self == nullptr) {
        return;
    }
    m_closing = false;
    Q_EMIT popoverDidDisappear();
}

void Controller::fadedOut()
{
    ZELKOV_LOG(vx::c_LogTrace, "vx::PopoverWidget::Controller::fadedOut", static_cast<const void*>(this));
    setAttribute(Qt::WA_DontShowOnScreen);
    const QPointer<Controller> self(this);
    Q_EMIT popoverDidDisappear();
    if (self != nullptr && !m_persistence) {
        deleteLater();
    }
}

int Controller::exec(QFlags<QDialogButtonBox::StandardButton> buttons)
{
    if (m_container == nullptr) {
        return m_resultCode;
    }
    const QPointer<Controller> self(this);
    auto* const box = new QDialogButtonBox(buttons);
    box->setCenterButtons(true);
    vx::connect(box, "2accepted()", this, "1setAccepted()", Qt::AutoConnection);
    vx::connect(box, "2rejected()", this, "1setRejected()", Qt::AutoConnection);
    vx::connect(box, "2accepted()", this, "1dismiss()", Qt::AutoConnection);
    vx::connect(box, "2rejected()", this, "1dismiss()", Qt::AutoConnection);
    m_container->addSpacing(c_ControllerButtonSpacing);
    m_container->addWidgetItem(box, QStringLiteral("buttonBox"), c_InternalItemID);
    setActive(true, EPopoverShowFlags(QFlag(epsBalloon | epsNoFade)), true);
    // A slot may have closed or deleted it already, and nothing would end the loop.
    if (self == nullptr || !m_active) {
        return self != nullptr ? m_resultCode : 0;
    }
    QEventLoop loop;
    vx::connect(this, "2balloonClosed()", &loop, "1quit()", Qt::DirectConnection);
    vx::connect(this, "2destroyed()", &loop, "1quit()", Qt::DirectConnection);
    loop.exec(QEventLoop::DialogExec);
    return self != nullptr ? m_resultCode : 0;
}

void Controller::setBalloonFeatures(QFlags<Balloon::EBalloonFeature> features)
{
    if (m_balloon != nullptr) {
        m_balloon->setFeatures(features);
    }
}

void Controller::setTitle(const QString& title)
{
    m_title = title;
    if (m_balloon != nullptr) {
        m_balloon->setTitle(title);
    }
}

QString Controller::title() const
{
    return m_title;
}

void Controller::setForRect(const QRect& rect)
{
    if (m_balloon != nullptr) {
        m_balloon->setForRect(rect);
    }
}

void Controller::setInsets(int left, int top, int right, int bottom)
{
    m_insets = QMargins(left, top, right, bottom);
    updateLayout(false);
}

void Controller::adjustInsets(int left, int top, int right, int bottom)
{
    m_insets = saturatedSum(m_insets, QMargins(left, top, right, bottom));
    updateLayout(false);
}

void Controller::getInsets(int& left, int& top, int& right, int& bottom) const
{
    left = m_insets.left();
    top = m_insets.top();
    right = m_insets.right();
    bottom = m_insets.bottom();
}

void Controller::setMargins(int left, int top, int right, int bottom)
{
    m_margins = QMargins(left, top, right, bottom);
    const QPointer<Controller> self(this);
    Q_EMIT marginsChanged(left, top, right, bottom);
    if (self != nullptr) {
        updateLayout(false);
    }
}

void Controller::adjustMargins(int left, int top, int right, int bottom)
{
    const QMargins sum = saturatedSum(m_margins, QMargins(left, top, right, bottom));
    setMargins(sum.left(), sum.top(), sum.right(), sum.bottom());
}

void Controller::getMargins(int& left, int& top, int& right, int& bottom) const
{
    left = m_margins.left();
    top = m_margins.top();
    right = m_margins.right();
    bottom = m_margins.bottom();
}

void Controller::help()
{
    Q_EMIT popoverWillHelp();
}

void Controller::close()
{
    dismiss(false, false);
}

void Controller::setResultCode(int code)
{
    m_resultCode = code;
}

void Controller::setAccepted()
{
    m_resultCode = 1;
}

void Controller::setRejected()
{
    m_resultCode = 0;
}

void Controller::setModal(bool modal)
{
    m_modal = modal;
}

bool Controller::isModal() const
{
    return m_modal;
}

void Controller::setPersistence(bool persistent)
{
    m_persistence = persistent;
}

bool Controller::hasPersistence() const
{
    return m_persistence;
}

void Controller::setStayVisible(bool stay)
{
    m_stayVisible = stay;
}

bool Controller::isActive() const
{
    return m_active;
}

bool Controller::isSubController() const
{
    return m_isSubController;
}

int Controller::resultCode() const
{
    return m_resultCode;
}

Balloon* Controller::balloon() const
{
    return m_balloon;
}

Container* Controller::getContainer() const
{
    return m_container;
}

QWidget* Controller::inWidget() const
{
    return m_inWidget;
}
}
}
