// SPDX-License-Identifier: MIT
// Shows the value of a control in a balloon beside it.
#include "popover/PopoverBalloonWidget.h"

#include "CoreQt/Connect.h"
#include "popover/Container.h"
#include "popover/Controller.h"
#include "popover/Item.h"
#include "popover/Manager.h"

#include <QtCore/QSizeF>
#include <QtCore/QTimer>
#include <QtGui/QFont>
#include <QtGui/QFontDatabase>
#include <QtWidgets/QApplication>
#include <QtWidgets/QLabel>

#include <utility>

namespace vx
{
/// The content of a value balloon: dismisses it when its time is over.
class WidgetContainer : public PopoverWidget::Container
{
    Q_OBJECT

public:
    explicit WidgetContainer(QWidget* parent)
        : Container(parent, QStringLiteral("balloonWidget"), Qt::Vertical, Qt::AlignLeft)
        , m_timer(new QTimer(this))
    {
        m_timer->setSingleShot(true);
        m_timer->setInterval(3000); // ms
        vx::connect(m_timer, "2timeout()", this, "1timeout()");
    }

    QTimer* timer() const { return m_timer; }

public Q_SLOTS:
    void timeout() { Q_EMIT dismissPopover(); }

private:
    QTimer* m_timer;
};

using PopoverWidget::Balloon;
using PopoverWidget::Container;
using PopoverWidget::Controller;
using PopoverWidget::Item;
using PopoverWidget::Manager;

namespace
{
constexpr int c_ValueFontSize = 13; // pixels

const QFont& valueFont()
{
    static const QFont font = [] {
        QFont fixed = QFontDatabase::systemFont(QFontDatabase::FixedFont);
        fixed.setPixelSize(c_ValueFontSize);
        return fixed;
    }();
    return font;
}

// For a text the mouse goes through: it drives the control below.
Controller::EPopoverShowFlags showFlagsForText()
{
    return Controller::epsBalloon | Controller::epsNoFade | Controller::epsMouseTransparent;
}

template <class Map> typename Map::mapped_type firstThatContains(const Map& map, int value)
{
    for (auto it = map.cbegin(); it != map.cend(); ++it) {
        if (it.key().contains(value)) {
            return it.value();
        }
    }
    return {};
}
}

PopoverBalloonWidget::PopoverBalloonWidget(
    QWidget* owner, const QString& name, int controllerId, const QString& title)
    : m_owner(owner)
    , m_name(name)
    , m_controllerId(controllerId)
    , m_title(title)
{
}

PopoverBalloonWidget::PopoverBalloonWidget(const PopoverBalloonWidget& other) = default;
PopoverBalloonWidget& PopoverBalloonWidget::operator=(const PopoverBalloonWidget& other) = default;

PopoverBalloonWidget::~PopoverBalloonWidget()
{
    clearUnparentedBalloonItems();
    if (m_controller) {
        m_controller->deleteLater();
    }
}

void PopoverBalloonWidget::setBalloonTextMap(const QMap<vx::ValueRange, QString>& texts)
{
    m_textMap = texts;
}

void PopoverBalloonWidget::setBalloonItemMap(const QMap<vx::ValueRange, QPointer<Item>>& items)
{
    clearUnparentedBalloonItems();
    m_itemMap = items;
}

void PopoverBalloonWidget::setItemMapEnabled(bool enabled)
{
    m_itemMapEnabled = enabled;
}

void PopoverBalloonWidget::setBalloonFeatures(QFlags<Balloon::EBalloonFeature> features)
{
    m_features = features;
}

void PopoverBalloonWidget::setBalloonTitle(const QString& title)
{
    m_title = title;
    if (m_controller) {
        m_controller->setTitle(title);
    }
}

void PopoverBalloonWidget::setControllerID(int controllerId)
{
    m_controllerId = controllerId;
    if (m_controller && Manager::instance() != nullptr) {
        Manager::instance()->setControllerID(m_controller, controllerId);
    }
}

QWidget* PopoverBalloonWidget::obtainWindow()
{
    QWidget* const window = m_owner != nullptr ? m_owner->window() : nullptr;
    if (window != nullptr && window->isWindow() && window->graphicsProxyWidget() == nullptr) {
        return window;
    }
    return QApplication::activeWindow();
}

QPointer<Controller> PopoverBalloonWidget::getController()
{
    if (m_controller && m_container) {
        m_controller->setInWidget(obtainWindow());
        return m_controller;
    }
    Manager* const manager = Manager::instance();
    if (manager == nullptr) {
        return {};
    }
    if (m_controller) {
        // Its content is gone; under no id it cannot be handed out again.
        manager->setControllerID(m_controller, Manager::sDefaultControllerID);
        m_controller->deleteLater();
    }
    m_controller = manager->createController(m_controllerId, true, false, obtainWindow(), m_owner, m_title,
        QString(), Balloon::eadTop | Balloon::eadBottom | Balloon::eadLeft | Balloon::eadRight, QSizeF(),
        Balloon::escWidth | Balloon::escHeight);
    if (!m_controller) {
        return {};
    }
    m_container = new WidgetContainer(m_owner);
    m_controller->setContainer(m_container, m_features);
    if (m_controller->getContainer() != m_container) {
        m_container->hide(); // another control's popover under the same id, with its own content
    }
    m_controller->setPersistence(true);
    return m_controller;
}

bool PopoverBalloonWidget::hasController() const
{
    return !m_controller.isNull();
}

bool PopoverBalloonWidget::popoverOpen() const
{
    return m_controller && m_controller->isVisible();
}

void PopoverBalloonWidget::setBalloonText(const QString& text)
{
    const QPointer<Controller> controller = getController();
    if (!controller) {
        return;
    }
    if (!m_label) {
        Container* const container = controller->getContainer();
        if (container == nullptr) {
            return;
        }
        m_label = new QLabel;
        m_label->setFont(valueFont());
        container->addWidgetItem(m_label, QString(), -1);
    }
    m_label->setText(text);

    const QPointer<WidgetContainer> container = m_container;
    if (!controller->isActive() || !controller->isVisible()) {
        controller->setActive(true, showFlagsForText(), true);
    }
    if (container) {
        container->timer()->start();
        Q_EMIT container->layoutChanged();
    }
}

void PopoverBalloonWidget::updateBalloon()
{
    updateBalloon(0, 0, 0);
}

void PopoverBalloonWidget::updateBalloon(int value, int minimum, int maximum)
{
    if (!m_itemMapEnabled || !getBalloonItemForValue(value)) {
        const QString text = getBalloonTextForValue(value);
        if (text.isEmpty()) {
            if (m_controller) {
                m_controller->dismiss(true, false);
            }
            return;
        }
        // Held here, since what is called may delete the control and this object with it.
        const QPointer<Controller> controller = getController();
        setBalloonText(text);
        if (controller) {
            controller->setActive(true, showFlagsForText(), true);
        }
        return;
    }

    if (obtainWindow() == nullptr) {
        return;
    }
    const QPointer<Controller> controller = getController();
    const QPointer<Container> container = controller ? controller->getContainer() : nullptr;
    const QMap<vx::ValueRange, QPointer<Item>> items = m_itemMap; // calls may change the map
    for (auto it = items.cbegin(); it != items.cend() && container; ++it) {
        const vx::ValueRange range = it.key();
        const QPointer<Item> item = it.value();
        if (item && !container->hasItem(item)) {
            container->addItem(item, PopoverWidget::ecfDismiss);
        }
        if (item && range.contains(value)) {
            item->setChecked(true);
        }
        if (item && minimum < maximum) {
            item->setVisible(minimum <= range.first && range.second <= maximum);
        }
    }
    if (controller && container) {
        controller->setActive(true, Controller::epsBalloon | Controller::epsNoFade, true);
    }
}

QPointer<Item> PopoverBalloonWidget::getBalloonItemForValue(int value)
{
    return firstThatContains(m_itemMap, value);
}

QString PopoverBalloonWidget::getBalloonTextForValue(int value)
{
    return firstThatContains(m_textMap, value);
}

void PopoverBalloonWidget::clearUnparentedBalloonItems()
{
    for (auto it = m_itemMap.begin(); it != m_itemMap.end();) {
        if (*it && (*it)->parentWidget() == nullptr) {
            (*it)->deleteLater();
            it = m_itemMap.erase(it);
        } else {
            ++it;
        }
    }
}
}
#include "PopoverBalloonWidget.moc"
