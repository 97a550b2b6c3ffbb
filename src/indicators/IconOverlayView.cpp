// SPDX-License-Identifier: MIT
#include "indicators/IconOverlayView.h"

#include "CoreQt/Connect.h"
#include "indicators/OverlayGeometry.h"

#include <QtCore/QEvent>
#include <QtGui/QMouseEvent>
#include <QtGui/QPainter>
#include <QtWidgets/QLabel>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOption>
#include <QtWidgets/QVBoxLayout>

namespace vx
{
const int IconOverlayView::sDefaultIconShowTime = 1000;
const int IconOverlayView::sDefaultTextShowTime = 2000;

IconOverlayView::IconOverlayView(QWidget* content, QWidget* parent)
    : QWidget(parent)
    , m_content(content)
    , m_animation(content, "geometry")
{
    auto* const rows = new QVBoxLayout(this);
    rows->setAlignment(Qt::AlignHCenter);
    rows->setContentsMargins(0, 0, 0, 0);
    rows->addStretch();
    if (content) {
        content->setParent(this);
        rows->addWidget(content);
        // An animation without its target never ends: the view has to go with its content.
        QObject::connect(content, &QObject::destroyed, this, [this] {
            if (m_deleteWhenHidden) {
                deleteLater();
            }
        });
    }
    rows->addStretch();
    hide();
    if (parent) {
        init(*parent);
    }
    m_hideTimer.setSingleShot(true);
    vx::connect(&m_hideTimer, "2timeout()", this, "1hideIconNow()", Qt::AutoConnection);
    m_centerRect = signCenterRect(geometry());
    m_animation.setLoopCount(1);
    vx::connect(&m_animation, "2valueChanged( const QVariant & )", this, "1update()", Qt::AutoConnection);
}

IconOverlayView::~IconOverlayView()
{
    if (QObject* const target = m_animation.targetObject()) {
        QObject::disconnect(target, &QObject::destroyed, this, nullptr);
    }
}

void IconOverlayView::init(QWidget& watched)
{
    hide();
    m_watched = &watched;
    m_watched->installEventFilter(this);
    updateLayout();
}

void IconOverlayView::setAnimationType(EAnimationType type)
{
    m_animationType = type;
    adoptProperty();
}

// Qt refuses another property while the animation runs: the next start takes it then.
void IconOverlayView::adoptProperty()
{
    if (m_animation.state() != QAbstractAnimation::Stopped) {
        return;
    }
    if (m_animationType == eatGeometry) {
        m_animation.setPropertyName("geometry");
    } else if (m_animationType == eatOpacity) {
        m_animation.setPropertyName("windowOpacity");
    }
}

bool IconOverlayView::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == m_watched && event->type() == QEvent::Resize) {
        updateLayout();
    }
    return false;
}

void IconOverlayView::updateLayout()
{
    if (!m_watched) {
        return;
    }
    setGeometry(m_watched->rect());
    updateGeometry();
    const QSize wanted = sizeHint();
    m_fits = wanted.width() <= m_watched->width() && wanted.height() <= m_watched->height();
    setVisible(m_fits);
    if (m_animationType != eatGeometry) {
        return;
    }
    m_fullRect = signFullRect(geometry());
    m_centerRect = signCenterRect(geometry());
    if (QWidget* const around = parentWidget()) {
        around->update();
    }
}

// A sign that does not fit its parent stays away, whoever asks for it.
void IconOverlayView::reveal()
{
    setAttribute(Qt::WA_DontShowOnScreen, false);
    if (m_fits) {
        show();
    }
    if (m_content) {
        m_content->show();
    }
    raise();
}

void IconOverlayView::showIcon()
{
    updateLayout();
    reveal();
}

void IconOverlayView::showIcon(const QString& objectName)
{
    auto* const label = new QLabel(this);
    label->setObjectName(objectName);
    m_content = label;
    m_animation.setDuration(sDefaultIconShowTime / 2);
    reveal();
    appear();
}

void IconOverlayView::showIconFor(int milliseconds)
{
    updateLayout();
    m_animation.setDuration(qMax(0, milliseconds / 2));
    reveal();
    appear();
}

IconOverlayView* IconOverlayView::run(IconOverlayView* view, int duration, bool returnView)
{
    view->updateLayout();
    view->m_animation.setDuration(duration);
    view->reveal();
    view->appear();
    view->m_deleteWhenHidden = true;
    return returnView ? view : nullptr;
}

IconOverlayView* IconOverlayView::showIcon(QWidget* parent, const QString& objectName, bool returnView)
{
    auto* const label = new QLabel(parent);
    label->setObjectName(objectName);
    label->setScaledContents(false);
    return run(new IconOverlayView(label, parent), sDefaultIconShowTime / 2, returnView);
}

IconOverlayView* IconOverlayView::showText(
    QWidget* parent, const QString& text, const QString& objectName, bool returnView)
{
    auto* const label = new QLabel(parent);
    label->setObjectName(objectName);
    label->setText(text);
    label->setAlignment(Qt::AlignCenter);
    auto* const view = new IconOverlayView(label, parent);
    view->setAnimationType(eatOpacity);
    return run(view, sDefaultTextShowTime / 2, returnView);
}

IconOverlayView* IconOverlayView::showTextAndIcon(
    QWidget* parent, const QString& text, const QString& objectName, bool returnView)
{
    auto* const label = new QLabel(parent);
    label->setObjectName(objectName);
    label->setAlignment(Qt::AlignCenter);
    auto* const icon = new QWidget(parent);
    icon->setObjectName(QStringLiteral("icon"));
    auto* const iconRows = new QVBoxLayout(icon);
    iconRows->setContentsMargins(0, 0, 0, 0);
    iconRows->addWidget(label);
    QLabel* textLabel = nullptr;
    if (!text.isEmpty()) {
        textLabel = new QLabel(parent);
        textLabel->setAlignment(Qt::AlignCenter);
        textLabel->setText(text);
        textLabel->setObjectName(QStringLiteral("text"));
    }
    auto* const container = new QWidget;
    container->setObjectName(QStringLiteral("container"));
    auto* const rows = new QVBoxLayout(container);
    rows->setContentsMargins(0, 0, 0, 0);
    rows->addWidget(icon);
    if (textLabel) {
        rows->addWidget(textLabel);
    }
    auto* const view = new IconOverlayView(container, parent);
    view->setAnimationType(eatOpacity);
    return run(view, sDefaultTextShowTime / 2, returnView);
}

void IconOverlayView::appear()
{
    m_animation.stop();
    adoptProperty();
    if (!m_animation.targetObject()) {
        return;
    }
    if (m_animationType == eatGeometry) {
        m_animation.setStartValue(m_centerRect.toRect());
        m_animation.setEndValue(m_fullRect.toRect());
        m_animation.setEasingCurve(QEasingCurve::OutBack);
    } else if (m_animationType == eatOpacity) {
        m_animation.setStartValue(0);
        m_animation.setEndValue(1);
        m_animation.setEasingCurve(QEasingCurve::Linear);
    }
    vx::connect(&m_animation, "2finished()", this, "1appeared()",
        static_cast<Qt::ConnectionType>(Qt::AutoConnection | Qt::UniqueConnection));
    vx::disconnect(&m_animation, "2finished()", this, "1disappeared()");
    m_animation.start(QAbstractAnimation::KeepWhenStopped);
}

void IconOverlayView::appeared()
{
    disappear();
}

void IconOverlayView::disappear()
{
    vx::disconnect(&m_animation, "2finished()", this, "1appeared()");
    vx::connect(&m_animation, "2finished()", this, "1disappeared()",
        static_cast<Qt::ConnectionType>(Qt::AutoConnection | Qt::UniqueConnection));
    m_animation.stop();
    adoptProperty();
    if (!m_animation.targetObject()) {
        disappeared();
        return;
    }
    if (m_animationType == eatGeometry) {
        m_animation.setStartValue(m_fullRect.toRect());
        m_animation.setEndValue(m_centerRect.toRect());
        m_animation.setEasingCurve(QEasingCurve::Linear);
    } else if (m_animationType == eatOpacity) {
        m_animation.setStartValue(1);
        m_animation.setEndValue(0);
        m_animation.setEasingCurve(QEasingCurve::Linear);
    }
    m_animation.start(QAbstractAnimation::KeepWhenStopped);
}

void IconOverlayView::hideIconNow()
{
    m_hideTimer.stop();
    setAttribute(Qt::WA_DontShowOnScreen);
    disappear();
}

void IconOverlayView::disappeared()
{
    setAttribute(Qt::WA_DontShowOnScreen);
    if (m_content) {
        m_content->hide();
    }
    hide();
    if (m_deleteWhenHidden) {
        deleteLater();
    }
}

void IconOverlayView::mousePressEvent(QMouseEvent* event)
{
    event->ignore();
    QWidget::mousePressEvent(event);
}

void IconOverlayView::paintEvent(QPaintEvent* event)
{
    QStyleOption option;
    option.initFrom(this);
    QPainter painter(this);
    style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
    painter.end();
    QWidget::paintEvent(event);
}
}
