// SPDX-License-Identifier: MIT
// The bubble of a popover.
#include "popover/Balloon.h"

#include "CoreQt/Connect.h"
#include "popover/BalloonGeometry.h"
#include "popover/BalloonTarget.h"
#include "popover/Container.h"
#include "sliders/NicerScrollBar.h"

#include <QtGui/QLinearGradient>
#include <QtGui/QMouseEvent>
#include <QtGui/QPainter>
#include <QtGui/QPainterPath>
#include <QtGui/QPen>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>
#include <QtWidgets/QVBoxLayout>

#include <cmath>

namespace vx
{
namespace PopoverWidget
{
namespace
{
constexpr int c_ButtonSpacing = 4;
constexpr int c_LargestKeptBody = 1000 * 1000; // pixels

static_assert(int(Balloon::eadTop) == BalloonGeometry::sTop && int(Balloon::eadBottom) == BalloonGeometry::sBottom
        && int(Balloon::eadLeft) == BalloonGeometry::sLeft && int(Balloon::eadRight) == BalloonGeometry::sRight,
    "the plain functions speak of the same sides");

void setUpBalloonLayout(QBoxLayout* layout)
{
    layout->setAlignment(Qt::AlignCenter);
    layout->setSpacing(0);
    layout->setContentsMargins(0, 0, 0, 0);
}

void paintBody(QPainter& painter, const BalloonLook& look, const QPainterPath& path)
{
    painter.setPen(Qt::NoPen);
    if (look.lower == look.upper) {
        painter.setBrush(look.upper); // the same pixels, in less time
    } else {
        QLinearGradient gradient;
        gradient.setCoordinateMode(QGradient::ObjectBoundingMode);
        gradient.setColorAt(1.0, look.lower);
        gradient.setColorAt(0.5, look.upper);
        painter.setBrush(gradient);
    }
    painter.setRenderHint(QPainter::Antialiasing);
    if (look.border.isValid()) {
        painter.setPen(QPen(look.border, 1.0, Qt::SolidLine, Qt::SquareCap, Qt::BevelJoin));
    }
    painter.drawPath(path);
}

QPushButton* makeTitleButton(const QString& objectName, QWidget* parent)
{
    auto* const button = new QPushButton(parent);
    button->setFlat(true);
    button->setObjectName(objectName);
    return button;
}
}

Balloon::Balloon(QWidget* parent, QWidget* forWidget, Container* container, QFlags<EBalloonFeature> features,
    QFlags<EArrowDirection> directions, const QSizeF& size, QFlags<ESizeConstraint> constraints)
    : QWidget(parent)
    , m_forWidget(forWidget)
    , m_fixedSize(size)
    , m_sizeConstraints(constraints)
    , m_container(container)
    , m_allowedDirections(directions)
{
    buildTree(container);
    m_arrowDirection = getPreferredArrowDirection();
    // Queued, so that a burst of changes does not lay out anything in its middle.
    vx::connect(container, "2layoutChanged()", this, "1setupLayout()", Qt::QueuedConnection);
    if (m_forWidget != nullptr) {
        vx::connect(m_forWidget, "2destroyed()", this, "1forWidgetDestroyed()");
    }
    setFeatures(features);
}

Balloon::~Balloon() = default;

void Balloon::buildTree(Container* container)
{
    m_mainLayout = new QVBoxLayout(this);
    setUpBalloonLayout(m_mainLayout);

    m_titleBar = new QWidget(this);
    auto* const titleBlock = new QVBoxLayout(m_titleBar);
    setUpBalloonLayout(titleBlock);
    auto* const titleRow = new QHBoxLayout;
    setUpBalloonLayout(titleRow);
    m_titleLabel = new QLabel(m_titleBar);
    m_titleLabel->setObjectName(QStringLiteral("popoverTitle"));
    m_helpButton = makeTitleButton(QStringLiteral("popoverHelpButton"), m_titleBar);
    m_closeButton = makeTitleButton(QStringLiteral("popoverCloseButton"), m_titleBar);
    titleRow->addWidget(m_titleLabel);
    titleRow->addStretch(0);
    titleRow->addSpacing(c_ButtonSpacing);
    titleRow->addWidget(m_helpButton);
    titleRow->addSpacing(c_ButtonSpacing);
    titleRow->addWidget(m_closeButton);
    auto* const separator = new QWidget(m_titleBar);
    separator->setObjectName(QStringLiteral("popoverSeparator"));
    titleBlock->addLayout(titleRow);
    titleBlock->addWidget(separator);
    vx::connect(m_closeButton, "2clicked()", this, "2dismiss()");
    vx::connect(m_helpButton, "2clicked()", this, "2help()");

    m_scrollArea = new QScrollArea(this);
    m_mainLayout->addWidget(m_titleBar);
    updateHeaderLayout();

    new NicerScrollBar(m_scrollArea, Qt::Horizontal, static_cast<NicerScrollBar::EPositions>(5), m_scrollArea);
    new NicerScrollBar(m_scrollArea, Qt::Vertical, static_cast<NicerScrollBar::EPositions>(5), m_scrollArea);
    vx::connect(m_scrollArea->verticalScrollBar(), "2valueChanged(int)", this, "2contentScrolled()");
    vx::connect(m_scrollArea->horizontalScrollBar(), "2valueChanged(int)", this, "2contentScrolled()");

    m_scrollArea->setWidgetResizable(true);
    m_scrollArea->setFrameShape(QFrame::NoFrame);
    if (container != nullptr) {
        m_scrollArea->setWidget(container);
        container->setAutoFillBackground(false);
    }
    m_scrollArea->viewport()->setAutoFillBackground(false);
    m_scrollArea->setAutoFillBackground(false);
    setAutoFillBackground(false);
}

void Balloon::updateHeaderLayout()
{
    if (m_header) {
        m_mainLayout->removeWidget(m_header);
    }
    if (m_footer) {
        m_mainLayout->removeWidget(m_footer);
    }
    m_mainLayout->removeWidget(m_scrollArea);

    m_header = m_container ? m_container->header() : nullptr;
    m_footer = m_container ? m_container->footer() : nullptr;
    if (m_header) {
        m_mainLayout->addWidget(m_header);
    }
    m_mainLayout->addWidget(m_scrollArea);
    if (m_footer) {
        m_mainLayout->addWidget(m_footer);
    }
}

int Balloon::spacing() const
{
    return m_mainLayout->spacing();
}

void Balloon::setSpacing(int spacing)
{
    m_mainLayout->setSpacing(spacing);
}

int Balloon::innerMargin() const
{
    return m_innerMargin;
}

void Balloon::setInnerMargin(int margin)
{
    m_innerMargin = margin;
}

int Balloon::topBorderMargin() const
{
    return m_topBorderMargin;
}

void Balloon::setTopBorderMargin(int margin)
{
    m_topBorderMargin = margin;
    setupLayout(false);
}

int Balloon::bottomBorderMargin() const
{
    return m_bottomBorderMargin;
}

void Balloon::setBottomBorderMargin(int margin)
{
    m_bottomBorderMargin = margin;
    setupLayout(false);
}

int Balloon::leftBorderMargin() const
{
    return m_leftBorderMargin;
}

void Balloon::setLeftBorderMargin(int margin)
{
    m_leftBorderMargin = margin;
    setupLayout(false);
}

int Balloon::rightBorderMargin() const
{
    return m_rightBorderMargin;
}

void Balloon::setRightBorderMargin(int margin)
{
    m_rightBorderMargin = margin;
    setupLayout(false);
}

int Balloon::arrowLength() const
{
    return m_arrowLength;
}

void Balloon::setArrowLength(int length)
{
    m_arrowLength = length;
}

int Balloon::arrowWidth() const
{
    return m_arrowWidth;
}

void Balloon::setArrowWidth(int width)
{
    m_arrowWidth = width;
}

QColor Balloon::backgroundColor() const
{
    return m_backgroundColor;
}

void Balloon::setBackgroundColor(const QColor& color)
{
    m_backgroundColor = color;
}

QColor Balloon::backgroundColor2() const
{
    return m_backgroundColor2;
}

void Balloon::setBackgroundColor2(const QColor& color)
{
    m_backgroundColor2 = color;
}

QColor Balloon::borderColor() const
{
    return m_borderColor;
}

void Balloon::setBorderColor(const QColor& color)
{
    m_borderColor = color;
}

int Balloon::borderRadius() const
{
    return m_borderRadius;
}

void Balloon::setBorderRadius(int radius)
{
    m_borderRadius = radius;
}

void Balloon::setForWidget(const QWidget* widget, const QPointF& relative)
{
    if (m_forWidget != nullptr) {
        vx::disconnect(m_forWidget, "2destroyed()", this, "1forWidgetDestroyed()");
    }
    m_forWidget = widget;
    m_relativePoint = relative;
    if (m_forWidget != nullptr) {
        vx::connect(m_forWidget, "2destroyed()", this, "1forWidgetDestroyed()");
    }
    setupLayout(false);
}

void Balloon::setForRect(const QRect& rect)
{
    m_forRect = rect;
    setupLayout(false);
}

void Balloon::forWidgetDestroyed()
{
    m_forWidget = nullptr;
}

const QWidget* Balloon::forWidget() const
{
    return m_forWidget;
}

QScrollArea* Balloon::content() const
{
    return m_scrollArea;
}

Container* Balloon::contentWidget() const
{
    return m_container;
}

void Balloon::setPreferredArrowDirections(QFlags<EArrowDirection> directions)
{
    m_allowedDirections = directions;
}

void Balloon::setFeatures(QFlags<EBalloonFeature> features)
{
    m_features = features;
    m_titleBar->setVisible(!features.testFlag(ebfNoHeader));
    m_closeButton->setVisible(features.testFlag(ebfClose));
    m_helpButton->setVisible(features.testFlag(ebfHelp));
    m_titleLabel->setVisible(features.testFlag(ebfTitle));
    setupLayout(false);
}

QFlags<Balloon::EBalloonFeature> Balloon::getFeatures() const
{
    return m_features;
}

void Balloon::setTitle(const QString& title)
{
    m_titleLabel->setText(title);
}

void Balloon::setMargins(int left, int top, int right, int bottom)
{
    m_leftBorderMargin = left;
    m_topBorderMargin = top;
    m_rightBorderMargin = right;
    m_bottomBorderMargin = bottom;
    setupLayout(false);
}

void Balloon::margins(int& left, int& top, int& right, int& bottom) const
{
    left = m_leftBorderMargin;
    top = m_topBorderMargin;
    right = m_rightBorderMargin;
    bottom = m_bottomBorderMargin;
}

void Balloon::raiseBalloon(QWidget* over)
{
    raise();
    if (m_container) {
        m_container->stackNubsiesOver(over);
    }
}

QFlags<Balloon::EArrowDirection> Balloon::getPreferredArrowDirection() const
{
    int side = BalloonGeometry::sNone;
    if (m_forRect.isValid() || m_forWidget != nullptr) {
        side = BalloonGeometry::preferredSide(parentWidget() != nullptr ? parentWidget()->rect() : QRect(),
            getForRect(), getPosition(), int(m_allowedDirections));
    }
    return QFlags<EArrowDirection>(QFlag(side));
}

QRect Balloon::getForRect() const
{
    return BalloonTarget::extent(parentWidget(), m_forWidget, m_forRect);
}

QPointF Balloon::getPosition() const
{
    return BalloonTarget::position(parentWidget(), m_forWidget, m_forRect);
}

QPointF Balloon::createAnchorPointFromRect(const QRect& rect, const QPointF& relative, int side) const
{
    return BalloonGeometry::anchorPoint(rect, relative, side, getPosition());
}

QSize Balloon::getBalloonSizeFromContent() const
{
    using BalloonGeometry::Strip;
    QSize content;
    Strip header;
    Strip footer;
    if (m_container) {
        // adjustSize() in two steps, the second only after a change: the scroll area takes the adjusted size back,
        // and a balloon that follows its target must not lay out its rows twice with every pass.
        m_container->ensurePolished();
        if (QLayout* const rows = m_container->layout()) {
            rows->activate();
        }
        if (m_container->sizeHint() != m_contentHint) {
            m_container->adjustSize();
            m_contentHint = m_container->sizeHint();
        }
        content
            = BalloonGeometry::contentSize(m_contentHint, m_container->minimumSize(), m_container->maximumSize());
        if (const Container* const widget = m_container->header()) {
            header = Strip {widget->isVisible(), widget->sizeHint()};
        }
        if (const Container* const widget = m_container->footer()) {
            footer = Strip {widget->isVisible(), widget->sizeHint()};
        }
    } else {
        content = QSize(0, 0);
    }
    return BalloonGeometry::sizeFromContent(content, int(m_arrowDirection), m_innerMargin, m_arrowLength,
        spacing(), {Strip {m_titleBar->isVisible(), m_titleBar->sizeHint()}, header, footer});
}

QRectF Balloon::frameRect(
    const QRectF& parentRect, const QSizeF& size, const QPointF& anchor, int side, int /*arrowLength*/) const
{
    const QMargins borders(m_leftBorderMargin, m_topBorderMargin, m_rightBorderMargin, m_bottomBorderMargin);
    return BalloonGeometry::frame(BalloonGeometry::limits(parentRect, borders), size, anchor, side, m_innerMargin);
}

QRectF Balloon::innerRect() const
{
    return BalloonGeometry::innerRect(rect(), int(m_arrowDirection), m_arrowLength);
}

QSize Balloon::sizeHint() const
{
    return getBalloonSizeFromContent();
}

void Balloon::setupLayout(bool ignoreVisibility)
{
    if (!ignoreVisibility && !isVisible()) {
        return;
    }
    const QPointer<Balloon> alive(this);
    if (m_container) {
        m_scrollArea->setMaximumHeight(qMax(0, m_container->sizeHint().height()));
    }
    // With the side of the last pass: a balloon that turns has the right size one pass later.
    const QSizeF size
        = BalloonGeometry::constrainedSize(getBalloonSizeFromContent(), m_fixedSize, int(m_sizeConstraints));

    m_arrowDirection = getPreferredArrowDirection();
    const int side = int(m_arrowDirection);
    m_anchorPoint = createAnchorPointFromRect(getForRect(), m_relativePoint, side);
    const QRectF area = parentWidget() != nullptr ? QRectF(parentWidget()->rect()) : QRectF();
    const QRect frame = BalloonGeometry::toRect(frameRect(area, size, m_anchorPoint, side, m_arrowLength));

    const QMargins margins = BalloonGeometry::contentsMargins(innerRect(), rect(), m_innerMargin);
    if (margins != m_mainLayout->contentsMargins()) {
        m_mainLayout->setContentsMargins(margins);
    }
    setGeometry(frame);
    if (alive) {
        update();
    }
    if (alive && m_container) {
        m_container->updateItems();
    }
}

void Balloon::setVisible(bool visible)
{
    const QPointer<Balloon> alive(this);
    // The size so far is that without the title bar, which was not visible when it was worked out. A balloon that
    // is shown again does not lay out its rows for it, only to lay them out again in a moment.
    const bool again = visible && m_wasShown && isHidden() && m_mainLayout->isEnabled();
    if (again) {
        m_mainLayout->setEnabled(false);
    }
    QWidget::setVisible(visible);
    if (!alive) {
        return;
    }
    if (again) {
        m_mainLayout->setEnabled(true);
        m_mainLayout->invalidate();
    }
    if (visible && !size().isEmpty()) {
        m_wasShown = true;
        setupLayout(true);
    }
    if (alive && again) {
        m_mainLayout->activate();
    }
}

bool Balloon::drawArrow() const
{
    return BalloonGeometry::arrowDrawn(int(m_allowedDirections), innerRect(), m_anchorPoint - pos());
}

QPainterPath Balloon::getPainterPathForDownArrow(
    int arrowWidth, int /*arrowLength*/, int side, const QPointF& anchor) const
{
    return BalloonGeometry::outline(innerRect(), m_borderRadius, drawArrow(), arrowWidth, side, anchor);
}

void Balloon::paintEvent(QPaintEvent* /*event*/)
{
    const BalloonLook look
        = BalloonLook::resolved(m_backgroundColor, m_backgroundColor2, m_borderColor, palette());
    const QPainterPath path
        = getPainterPathForDownArrow(m_arrowWidth, m_arrowLength, int(m_arrowDirection), m_anchorPoint - pos());
    QPainter painter(this);
    // A body wanted for the second time is kept: to draw it takes longer than all rows of a small popover. Not
    // where it would have to be scaled.
    const bool sameAgain = m_body.look == look && m_body.path == path;
    const QTransform& transform = painter.combinedTransform();
    if (!sameAgain || transform.type() > QTransform::TxTranslate || transform.dx() != std::floor(transform.dx())
        || transform.dy() != std::floor(transform.dy()) || qint64(width()) * height() > c_LargestKeptBody) {
        m_body = {look, path, QPixmap()};
        paintBody(painter, look, path);
        return;
    }
    if (m_body.picture.size() != size()) {
        m_body.picture = QPixmap(size());
        m_body.picture.fill(Qt::transparent);
        QPainter bodyPainter(&m_body.picture);
        paintBody(bodyPainter, look, path);
    }
    painter.drawPixmap(0, 0, m_body.picture);
}

void Balloon::mouseReleaseEvent(QMouseEvent* event)
{
    if (rect().contains(event->pos()) && !innerRect().contains(event->pos())) {
        Q_EMIT dismiss();
    }
}
}
}
