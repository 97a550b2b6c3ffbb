// SPDX-License-Identifier: MIT
#include "controls/DialButton.h"

#include "CoreQt/Connect.h"
#include "controls/DialLaw.h"
#include "foundation/LogStatement.h"

#include <QtGui/QMouseEvent>
#include <QtGui/QPainter>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOptionSlider>

#include <cmath>

namespace vx
{
const QPalette::ColorRole DialButton::BackgroundNormal = QPalette::Button;
const QPalette::ColorRole DialButton::BackgroundChecked = QPalette::Mid;

namespace
{
constexpr int dialFallbackDefault = 8;

// Style sheets may name any number; sums of two must stay within it.
int dialPixels(int pixels)
{
    return qBound(-100000, pixels, 100000);
}

DialRange dialRangeOf(const QDial& dial)
{
    return {dial.minimum(), dial.maximum(), dial.wrapping(), dial.invertedAppearance()};
}
}

DialButton::DialButton(int defaultValue, QWidget* parent)
    : QDial(parent)
    , PopoverBalloonWidget(this, QStringLiteral("dialButtonBalloon"), 0, QString())
    , m_defaultValue(defaultValue)
{
    init();
}

DialButton::DialButton(QWidget* parent)
    : DialButton(dialFallbackDefault, parent)
{
}

DialButton::~DialButton() = default;

void DialButton::init()
{
    setFocusPolicy(Qt::NoFocus);
    m_checkable = true;
    m_checked = false;
    m_active = false;
    m_horizontalTracking = true;
    m_horizontalNow = false;
    m_reboundEnabled = false;
    m_moved = false;
    m_clickTimer.setSingleShot(true);
    vx::connect(&m_clickTimer, "2timeout()", this, "1onTimeout()", Qt::AutoConnection);
    m_clickTimer.setInterval(200);
    QPalette colors = palette();
    colors.setColor(BackgroundNormal, QColor(Qt::darkBlue).darker(400));
    colors.setColor(BackgroundChecked, QColor(Qt::darkBlue).lighter(400));
    setPalette(colors);
    vx::connect(this, "2valueChanged(int)", this, "1updateBalloon(int)", Qt::AutoConnection);
}

bool DialButton::isChecked() const
{
    return m_checkable && m_checked;
}

bool DialButton::isDown() const
{
    return !m_downPos.isNull();
}

bool DialButton::isActive() const
{
    return m_active;
}

bool DialButton::isCheckable() const
{
    return m_checkable;
}

void DialButton::setCheckable(bool checkable)
{
    m_checkable = checkable;
    update();
}

int DialButton::defaultValue() const
{
    return m_defaultValue;
}

void DialButton::setDefaultValue(int value)
{
    m_defaultValue = value;
}

bool DialButton::reboundEnabled() const
{
    return m_reboundEnabled;
}

void DialButton::setReboundEnabled(bool enabled)
{
    m_reboundEnabled = enabled;
}

void DialButton::reset()
{
    setValue(m_defaultValue);
}

void DialButton::setMouseClickSensitivity(int milliseconds)
{
    m_clickTimer.setInterval(milliseconds);
}

int DialButton::mouseClickSensitivity() const
{
    return m_clickTimer.interval();
}

void DialButton::setHorizontalMouseTracking(bool horizontal)
{
    m_horizontalTracking = horizontal;
    if (horizontal) {
        setWrapping(false); // the two exclude each other in this direction only
    }
}

bool DialButton::horizontalMouseTracking() const
{
    return m_horizontalTracking;
}

QPixmap DialButton::image() const
{
    return m_image;
}

void DialButton::setImage(const QPixmap& image)
{
    m_image = image;
    update();
}

QPixmap DialButton::button() const
{
    return m_button;
}

void DialButton::setButton(const QPixmap& button)
{
    m_button = button;
    update();
}

QPixmap DialButton::handle() const
{
    return m_handle;
}

void DialButton::setHandle(const QPixmap& handle)
{
    m_handle = handle;
    update();
}

#define ZELKOV_DIAL_INSET(getter, setter, member) \
    int DialButton::getter() const                \
    {                                             \
        return member;                            \
    }                                             \
    void DialButton::setter(int pixels)           \
    {                                             \
        member = pixels;                          \
        updateGeometry();                         \
        update();                                 \
    }
ZELKOV_DIAL_INSET(rightMargin, setRightMargin, m_rightMargin)
ZELKOV_DIAL_INSET(leftMargin, setLeftMargin, m_leftMargin)
ZELKOV_DIAL_INSET(topMargin, setTopMargin, m_topMargin)
ZELKOV_DIAL_INSET(bottomMargin, setBottomMargin, m_bottomMargin)
ZELKOV_DIAL_INSET(rightPadding, setRightPadding, m_rightPadding)
ZELKOV_DIAL_INSET(leftPadding, setLeftPadding, m_leftPadding)
ZELKOV_DIAL_INSET(topPadding, setTopPadding, m_topPadding)
ZELKOV_DIAL_INSET(bottomPadding, setBottomPadding, m_bottomPadding)
#undef ZELKOV_DIAL_INSET

double DialButton::angleFromValue(int value) const
{
    return dialAngle(value, dialRangeOf(*this));
}

QPointF DialButton::pointFromAngle(double angle, double radius)
{
    return dialPoint(rect().center(), angle, radius);
}

QPointF DialButton::pointFromValue(int value)
{
    return pointFromAngle(angleFromValue(value), qMin(width(), height()));
}

QRadialGradient DialButton::gradient(const QColor& inner, const QColor& outer)
{
    QRadialGradient made(QPointF(0.5, 0.5), 0.6, QPointF(0.5, 0.5));
    made.setCoordinateMode(QGradient::ObjectBoundingMode);
    made.setColorAt(0.0, inner);
    made.setColorAt(1.0, outer);
    return made;
}

QSize DialButton::sizeHint() const
{
    return QDial::sizeHint()
        + QSize(dialPixels(m_rightMargin) + dialPixels(m_leftMargin),
            dialPixels(m_bottomMargin) + dialPixels(m_topMargin));
}

void DialButton::setDown(bool down)
{
    if (!down) {
        m_downPos = QPoint();
    }
    m_clickTimer.stop();
    m_checked = down; // one flag for both: clients rely on it
    const QPointer<DialButton> alive(this);
    Q_EMIT toggled(down);
    if (alive) {
        rePolish();
        repaint();
    }
}

void DialButton::setChecked(bool checked)
{
    m_checked = checked;
    const QPointer<DialButton> alive(this);
    Q_EMIT toggled(checked);
    if (alive) {
        rePolish();
    }
}

void DialButton::setActive(bool active)
{
    m_active = active;
    rePolish();
}

void DialButton::toggle()
{
    setChecked(!m_checked);
}

void DialButton::rePolish()
{
    style()->unpolish(this);
    style()->polish(this);
}

void DialButton::updateBalloon(int value)
{
    ZELKOV_LOG(vx::c_LogTrace, "vx::DialButton::updateBalloon", "DialButton::updateBalloon() -> " << value);
    PopoverBalloonWidget::updateBalloon(value, 0, 0);
}

// The spot on the dial where QDial finds the wanted value; the event itself where it is to be followed around.
QMouseEvent* DialButton::createMouseEvent(QMouseEvent* event, const QPoint& reference, int value)
{
    if (!m_horizontalNow && m_moved) {
        return event;
    }
    const int wanted = m_horizontalNow
        ? dialValueAfterDrag(value, event->x() - reference.x(), width(), dialRangeOf(*this))
        : 0; // the literal 0, whatever the value: clients rely on it
    // QDial measures from the exact middle, which lies beside rect().center(): that alone is worth a step.
    const QPointF spot = pointFromValue(wanted) - rect().center() + QPointF(width() / 2.0, height() / 2.0);
    auto* const made
        = new QMouseEvent(event->type(), spot, event->button(), event->buttons(), event->modifiers());
    made->setAccepted(event->isAccepted());
    return made;
}

void DialButton::freeMouseEvent(QMouseEvent* event, QMouseEvent* made)
{
    if (event != made) {
        event->setAccepted(made->isAccepted());
        delete made;
    }
}

void DialButton::mousePressEvent(QMouseEvent* event)
{
    m_moved = false;
    if (event->button() == Qt::LeftButton && event->modifiers() == Qt::NoModifier) {
        m_downPos = event->pos();
        m_pressPos = event->pos();
        m_valueAtPress = value();
        m_horizontalNow = m_horizontalTracking;
        const QPointer<DialButton> alive(this);
        setDown(true);
        if (!alive) {
            return;
        }
        repaint();
        Q_EMIT pressed();
        return;
    }
    QMouseEvent* const made = createMouseEvent(event, m_downPos, m_valueAtPress);
    QDial::mousePressEvent(made);
    freeMouseEvent(event, made);
}

void DialButton::mouseMoveEvent(QMouseEvent* event)
{
    m_lastMousePos = event->pos();
    if (m_clickTimer.isActive()) {
        return;
    }
    m_moved = true;
    QMouseEvent* const made = createMouseEvent(event, m_downPos, m_valueAtPress);
    QDial::mouseMoveEvent(made);
    freeMouseEvent(event, made);
}

void DialButton::mouseReleaseEvent(QMouseEvent* event)
{
    QMouseEvent* const made = createMouseEvent(event, m_pressPos, m_valueAtPress);
    const int distance = (event->pos() - m_pressPos).manhattanLength();
    const bool timerActive = m_clickTimer.isActive();
    const QPointer<DialButton> alive(this);
    setDown(false);
    if (alive) {
        Q_EMIT released();
    }
    // A click does nothing more, and neither does a release on the spot.
    const bool click = alive && !m_reboundEnabled && timerActive && distance < 10;
    if (alive && !click && distance > 0) {
        QDial::mouseReleaseEvent(made);
        if (alive && m_reboundEnabled) {
            const int target = m_defaultValue;
            setValue(target);
            if (alive) {
                Q_EMIT reboundPerformed(target);
            }
        }
    }
    if (event != made) {
        event->setAccepted(made->isAccepted());
        delete made;
    }
    if (alive) {
        m_lastMousePos = QPoint();
    }
}

void DialButton::onTimeout()
{
    if (m_lastMousePos.isNull()) {
        return;
    }
    const QPoint target = m_reboundEnabled ? pointFromValue(m_defaultValue).toPoint() : m_lastMousePos;
    QMouseEvent press(QEvent::MouseButtonPress, target, Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
    QMouseEvent* const made = createMouseEvent(&press, target, m_valueAtPress);
    QDial::mousePressEvent(made);
    freeMouseEvent(&press, made);
}

// Left and right are crossed: clients rely on it.
QRect DialButton::insetRect(bool withPadding) const
{
    const auto inset = [withPadding](int margin, int padding) {
        return dialPixels(margin) + (withPadding ? dialPixels(padding) : 0);
    };
    return rect().adjusted(inset(m_rightMargin, m_rightPadding), inset(m_topMargin, m_topPadding),
        -inset(m_leftMargin, m_leftPadding), -inset(m_bottomMargin, m_bottomPadding));
}

void DialButton::paintOrbitingHandle(QPainter& painter, const QRect& inner)
{
    const QRect knob = QStyle::alignedRect(Qt::LeftToRight, Qt::AlignCenter, m_button.size(), inner);
    const double angle = angleFromValue(value());
    const int size = qMin(m_button.width(), m_button.height());
    QRect orbiting = m_handle.rect();
    orbiting.moveCenter(knob.center()
        + QPoint(static_cast<int>(std::cos(angle) * size * 0.25), static_cast<int>(std::sin(angle) * size * 0.25)));
    painter.drawPixmap(inner, m_button, m_button.rect());
    painter.drawPixmap(orbiting, m_handle, m_handle.rect());
}

void DialButton::paintTurnedButton(QPainter& painter, const QRect& inner)
{
    constexpr double quarter = 1.5707963267948966; // upright pictures point at the value
    const double x = inner.width() * 0.5 + dialPixels(m_leftMargin) + dialPixels(m_leftPadding);
    const double y = inner.height() * 0.5 + dialPixels(m_topMargin) + dialPixels(m_topPadding);
    QTransform transform = painter.worldTransform();
    transform.translate(x, y);
    transform.rotateRadians(angleFromValue(value()) + quarter, Qt::ZAxis);
    transform.translate(-x, -y);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    painter.setTransform(transform, false);
    painter.drawPixmap(inner, m_button, m_button.rect());
}

void DialButton::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    QStyleOptionSlider option;
    initStyleOption(&option);
    style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
    const QRect inner = insetRect(true);
    if (!m_image.isNull()) {
        painter.drawPixmap(insetRect(false), m_image, m_image.rect());
    }
    if (!m_button.isNull() && !m_handle.isNull()) {
        paintOrbitingHandle(painter, inner);
    } else if (!m_button.isNull()) {
        paintTurnedButton(painter, inner);
    } else {
        const QBrush knob = palette().brush(isChecked() ? BackgroundChecked : BackgroundNormal);
        const QBrush window = option.palette.brush(QPalette::Window);
        option.palette.setBrush(QPalette::Window, knob);
        option.palette.setBrush(QPalette::Button, knob);
        style()->drawComplexControl(QStyle::CC_Dial, &option, &painter, this);
        option.palette.setBrush(QPalette::Window, window);
    }
}
}
