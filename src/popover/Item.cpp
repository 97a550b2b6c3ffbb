// SPDX-License-Identifier: MIT
// One row of a popover: elements, clicks, busy mark, protection.
#include "popover/Item.h"

#include "foundation/WidgetPrimitive.h"
#include "indicators/BadgeWidget.h"
#include "indicators/ElidedButton.h"
#include "popover/ItemRules.h"
#include "ZelkovUtils/ISecurityManager.h"

#include <QtCore/QTimer>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QGraphicsDropShadowEffect>
#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{
namespace
{
constexpr int c_DoubleClickGrace = 50; // ms, beyond the system's double click interval

QHBoxLayout* createItemLayout(Qt::Alignment alignment, int spacing)
{
    auto* const layout = new QHBoxLayout;
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(spacing);
    layout->setAlignment(alignment);
    return layout;
}

QSpacerItem* createItemStretch()
{
    return new QSpacerItem(0, 0, QSizePolicy::Expanding, QSizePolicy::Expanding);
}

QRect elementRect(const QWidget* element)
{
    return element ? element->geometry() : QRect();
}

/// Whether nothing of the widget can be seen, since it lies outside of a widget around it.
bool isClippedAway(const QWidget* widget)
{
    QRect rect = widget->rect();
    while (!widget->isWindow() && widget->parentWidget()) {
        rect.translate(widget->pos());
        widget = widget->parentWidget();
        rect &= widget->rect();
        if (rect.isEmpty()) {
            return true;
        }
    }
    return false;
}

/// Asks for a repaint after a show, which Qt clips and compares with all siblings at a cost of its own for each
/// row; in a long list most rows are out of sight. Scrolling into sight repaints them anyway.
bool isUselessUpdate(const QEvent* event, const QWidget* widget)
{
    return event->type() == QEvent::UpdateLater && !widget->graphicsEffect() && isClippedAway(widget);
}

/// The buttons of a row. No meta object of its own, for style sheets know it as ElidedButton.
class ItemElement : public ElidedButton
{
public:
    using ElidedButton::ElidedButton;

protected:
    bool event(QEvent* event) override
    {
        // A push button asks its layout for another pass when this comes, with the first turn of the event loop.
        // It has been dressed long before, and its row has been laid out with the size it has since.
        if (event->type() == QEvent::PolishRequest && testAttribute(Qt::WA_WState_Polished)) {
            return QAbstractButton::event(event);
        }
        return isUselessUpdate(event, this) || ElidedButton::event(event);
    }
};
}

const QString Item::sPopoverWidgetItem = QStringLiteral("PopoverWidgetItem");
std::shared_ptr<vx::ISecurityManager> Item::s_securityManager;

Item::Item(QWidget* parent, QFlags<EItemFlag> flags, int id, const QString& objectName, const QString& text,
    const QString& additionalText)
    : QWidget(parent)
    , m_id(id)
    , m_flags(flags)
    , m_dragMimeType(QStringLiteral("text/plain"))
{
    static const int s_flagsType
        = qRegisterMetaType<vx::PopoverWidget::EItemPerformedFlags>("vx::PopoverWidget::EItemPerformedFlags");
    Q_UNUSED(s_flagsType)

    m_busyWidget = new BadgeWidget(this);
    m_busyWidget->setObjectName(QStringLiteral("popoverBusy"));

    setObjectName(objectName);
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
    setFocusPolicy(Qt::NoFocus);

    m_mainLayout = createItemLayout(Qt::Alignment(), m_spacing);
    if (!flags) {
        m_mainLayout->addWidget(m_busyWidget);
        setLayout(m_mainLayout);
    } else {
        m_leftLayout = createItemLayout(Qt::AlignLeft, m_spacing);
        m_rightLayout = createItemLayout(Qt::AlignRight, m_spacing);
        if (flags.testFlag(eifCentered)) {
            m_mainLayout->addItem(createItemStretch());
        }
        m_mainLayout->addLayout(m_leftLayout);
        m_mainLayout->addLayout(m_rightLayout);
        if (flags.testFlag(eifCentered)) {
            m_mainLayout->addItem(createItemStretch());
        }
        setLayout(m_mainLayout);
    }

    if (flags.testFlag(eifIcon)) {
        m_iconElement = createElement(QStringLiteral("icon"), QString(), true);
        m_leftLayout->addWidget(m_iconElement);
        m_leftLayout->setSizeConstraint(QLayout::SetMinAndMaxSize);
        m_iconElement->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
    }
    if (flags.testFlag(eifText) && !text.isEmpty()) {
        m_textElement = createElement(QStringLiteral("text"), ItemRules::escaped(text), true);
        m_leftLayout->addWidget(m_textElement);
    }
    if (flags.testFlag(eifAdditionalText)) {
        m_additionalTextElement
            = createElement(QStringLiteral("additionalText"), ItemRules::escaped(additionalText), false);
        m_rightLayout->addWidget(m_additionalTextElement);
    }
    if (flags == eifIcon) {
        setIconText(text);
    }
    if (m_rightLayout) {
        m_rightLayout->addWidget(m_busyWidget);
    }

    setAttribute(Qt::WA_MacShowFocusRect, false);
    Item::setBusy(false, false);
}

Item::~Item() = default;

ElidedButton* Item::createElement(const QString& objectName, const QString& text, bool fillsBackground)
{
    auto* const element = new ItemElement(text, this);
    element->setFlat(true);
    element->setAutoFillBackground(fillsBackground);
    element->setObjectName(objectName);
    element->setAttribute(Qt::WA_TransparentForMouseEvents);
    element->setCheckable(true);
    element->setFocusPolicy(Qt::NoFocus);
    m_lastElement = element;
    return element;
}

EContainerFlag Item::defaultItemFlags()
{
    return static_cast<EContainerFlag>(0);
}

void Item::setText(const QString& text)
{
    if (m_textElement) {
        m_textElement->setText(ItemRules::escaped(text));
        Q_EMIT layoutChanged();
    }
}

QString Item::text()
{
    return m_textElement ? m_textElement->text() : QString();
}

void Item::setCurrentText(const QString& /*text*/)
{
}

QString Item::currentText()
{
    return {};
}

void Item::setAdditionalText(const QString& text)
{
    if (m_additionalTextElement) {
        m_additionalTextElement->setText(text);
        Q_EMIT layoutChanged();
    }
}

QString Item::additionalText()
{
    return m_additionalTextElement ? m_additionalTextElement->text() : QString();
}

void Item::setValue(const QVariant& value)
{
    if (value.type() != QVariant::String) {
        return;
    }
    const QPointer<Item> self(this);
    if (m_additionalTextElement) {
        m_additionalTextElement->setText(ItemRules::escaped(value.toString()));
        Q_EMIT layoutChanged();
    }
    if (self) {
        update();
    }
}

QVariant Item::value()
{
    return m_additionalTextElement ? QVariant(m_additionalTextElement->text()) : QVariant();
}

QVariant Item::userData()
{
    return m_userData;
}

bool Item::isChecked() const
{
    return (m_iconElement && m_iconElement->isChecked()) || (m_textElement && m_textElement->isChecked());
}

void Item::setChecked(bool checked)
{
    // The buttons report the change to whoever listens to them.
    const QPointer<Item> self(this);
    if (m_iconElement) {
        m_iconElement->setChecked(checked);
    }
    if (self && m_textElement) {
        m_textElement->setChecked(checked);
    }
    if (self) {
        updateSelectionDrawing();
        Q_EMIT layoutChanged();
    }
}

void Item::setBusy(bool busy, bool hideLast)
{
    if (busy) {
        if (hideLast && m_lastElement) {
            m_lastElement->hide();
        }
        m_busyWidget->show();
        m_busyWidget->setBadgeBusy(true);
    } else {
        m_busyWidget->setBadgeBusy(false);
        m_busyWidget->hide();
        // In a row that is being made it is not hidden; to show it would dress it, too early for the style sheets
        // of the popover.
        if (m_lastElement && m_lastElement->isHidden()) {
            m_lastElement->show();
        }
    }
    Q_EMIT layoutChanged();
}

void Item::setBusyText(const QString& text, bool hideLast)
{
    if (m_lastElement) {
        m_lastElement->setVisible(!hideLast);
        m_busyWidget->setVisible(!text.isEmpty());
        m_busyWidget->setBadgeLabel(text);
    }
    Q_EMIT layoutChanged();
}

QWidget* Item::getFocusItem()
{
    return nullptr;
}

void Item::setElideMode(Qt::TextElideMode mode)
{
    for (ElidedButton* element : {m_iconElement, m_textElement, m_additionalTextElement}) {
        if (element) {
            element->setElideMode(mode);
        }
    }
}

void Item::cancelAnimations()
{
}

void Item::onItemScrolled()
{
}

QFlags<EItemPerformedFlag> Item::getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button)
{
    return ItemRules::hit(
        {elementRect(m_iconElement), elementRect(m_textElement), elementRect(m_additionalTextElement)}, pos,
        button);
}

void Item::performSingleClick(QFlags<EItemPerformedFlag> flags)
{
    Q_EMIT itemPerformed(m_id, QVariant(text()), m_userData, flags | eipDoubleClick);
}

int Item::id() const
{
    return m_id;
}

QFlags<EItemFlag> Item::itemFlags() const
{
    return m_flags;
}

ElidedButton* Item::iconElement() const
{
    return m_iconElement;
}

ElidedButton* Item::textElement() const
{
    return m_textElement;
}

ElidedButton* Item::additionalTextElement() const
{
    return m_additionalTextElement;
}

BadgeWidget* Item::busyWidget() const
{
    return m_busyWidget;
}

void Item::setUserData(const QVariant& userData)
{
    m_userData = userData;
}

void Item::setIconText(const QString& text)
{
    if (m_iconElement) {
        m_iconElement->setText(ItemRules::escaped(text));
        Q_EMIT layoutChanged();
    }
}

void Item::setSpacing(int spacing)
{
    m_spacing = spacing;
    for (QHBoxLayout* layout : {m_mainLayout, m_leftLayout, m_rightLayout}) {
        if (layout) {
            // Beyond the size of a widget Qt's layouts count pixel by pixel for minutes.
            layout->setSpacing(qMin(spacing, QWIDGETSIZE_MAX));
        }
    }
}

int Item::spacing() const
{
    return m_spacing;
}

void Item::setLeftMargin(int margin)
{
    QMargins margins = m_mainLayout->contentsMargins();
    margins.setLeft(margin);
    m_mainLayout->setContentsMargins(margins);
}

int Item::leftMargin() const
{
    return m_mainLayout->contentsMargins().left();
}

void Item::setRightMargin(int margin)
{
    QMargins margins = m_mainLayout->contentsMargins();
    margins.setRight(margin);
    m_mainLayout->setContentsMargins(margins);
}

int Item::rightMargin() const
{
    return m_mainLayout->contentsMargins().right();
}

void Item::setEnableShadow(bool enable)
{
    if (m_iconElement) {
        QGraphicsDropShadowEffect* shadow = nullptr;
        if (enable) {
            shadow = new QGraphicsDropShadowEffect(m_iconElement);
            shadow->setColor(QColor(31, 31, 31, 47));
            shadow->setBlurRadius(2.0);
            shadow->setOffset(2.0, 2.0);
        }
        m_iconElement->setGraphicsEffect(shadow);
    }
    Q_EMIT layoutChanged();
}

bool Item::shadowEnabled() const
{
    // The effect is the icon's, so this is false: clients rely on it.
    return graphicsEffect() != nullptr;
}

void Item::setKeyboardFocus()
{
    if (QWidget* const widget = getFocusItem()) {
        widget->setFocus(Qt::MouseFocusReason);
    }
}

void Item::setDragEnabled(bool enabled)
{
    m_dragEnabled = enabled;
}

void Item::setDragMimeType(const QString& type)
{
    m_dragMimeType = type;
}

void Item::setDragMimeData(const QMap<QString, QByteArray>& formats)
{
    m_dragMimeData = formats;
}

void Item::setAdminOnly(bool adminOnly)
{
    m_adminOnly = adminOnly;
}

void Item::setSecurityCheck(const QString& right)
{
    m_securityCheck = right;
}

void Item::setSecurityManager(std::shared_ptr<vx::ISecurityManager> manager)
{
    s_securityManager = std::move(manager);
}

std::shared_ptr<vx::ISecurityManager> Item::securityManager()
{
    return s_securityManager;
}

bool Item::isProtected()
{
    const std::shared_ptr<vx::ISecurityManager> manager = s_securityManager;
    if (m_adminOnly) {
        m_protected = !manager || !manager->isAdministrator(true, false);
    } else if (!m_securityCheck.isEmpty() && manager) {
        m_protected = manager->isRightRefused(m_securityCheck, true, false, false);
    } else {
        m_protected = false;
    }
    return m_protected;
}

void Item::updateSelectionDrawing()
{
    if (!m_flags.testFlag(eifBoldSelection) || !m_textElement || m_textElement->text().isEmpty()) {
        return;
    }
    const bool checked = isChecked();
    QFont font = m_textElement->font();
    font.setFixedPitch(true);
    // Drawn closer together, bold letters take about the room of plain ones.
    font.setLetterSpacing(QFont::AbsoluteSpacing, checked ? -0.9 : 0.0);
    font.setBold(checked);
    m_textElement->setFont(font);
}

void Item::startDoubleClickTimer(QFlags<EItemPerformedFlag> flags)
{
    if (m_afterDoubleClick) {
        m_afterDoubleClick = false;
        return;
    }
    if (!m_doubleClickTimer) {
        m_doubleClickTimer = new QTimer(this);
        m_doubleClickTimer->setSingleShot(true);
        m_doubleClickTimer->setInterval(QApplication::doubleClickInterval() + c_DoubleClickGrace);
    }
    stopDoubleClickTimer();
    connect(m_doubleClickTimer.data(), &QTimer::timeout, this, [this, flags] { performSingleClick(flags); });
    m_doubleClickTimer->start();
}

void Item::stopDoubleClickTimer()
{
    if (m_doubleClickTimer) {
        m_doubleClickTimer->stop();
        m_doubleClickTimer->disconnect();
    }
}

void Item::performDoubleClick(QFlags<EItemPerformedFlag> flags)
{
    performSingleClick(flags | eipDoubleClick);
}

bool Item::event(QEvent* event)
{
    return isUselessUpdate(event, this) || QWidget::event(event);
}

bool Item::eventFilter(QObject* watched, QEvent* event)
{
    if ((event->type() == QEvent::MouseButtonPress || event->type() == QEvent::MouseButtonRelease)
        && isProtected()) {
        return true;
    }
    return QWidget::eventFilter(watched, event);
}

void Item::mousePressEvent(QMouseEvent* event)
{
    m_afterDoubleClick = false;
    if (event->button() == Qt::LeftButton) {
        m_dragStart = event->pos();
    }
    QWidget::mousePressEvent(event);
}

void Item::mouseMoveEvent(QMouseEvent* event)
{
    if (!m_dragEnabled
        || !ItemRules::startsDrag(
            event->buttons(), m_dragStart, event->pos(), QApplication::startDragDistance())) {
        QWidget::mouseMoveEvent(event);
        return;
    }
    startDrag();
}

void Item::mouseDoubleClickEvent(QMouseEvent* event)
{
    if (!m_flags.testFlag(eifDoubleClick)) {
        return;
    }
    stopDoubleClickTimer();
    m_afterDoubleClick = true;
    performSingleClick(getItemPerformedFlag(event->pos(), event->button()) | eipDoubleClick);
}

void Item::paintEvent(QPaintEvent* /*event*/)
{
    WidgetPrimitive::paint(this);
}

void Item::showEvent(QShowEvent* event)
{
    updateSelectionDrawing();
    QWidget::showEvent(event);
}

} // namespace PopoverWidget
} // namespace vx
