// SPDX-License-Identifier: MIT
// Every row that a popover can hold.
#pragma once

#include "../Page.h"

#include "popover/Controller.h"
#include "popover/PopoverFlags.h"

#include <QtCore/QPointer>
#include <QtCore/QVector>

#include <functional>
#include <memory>

class QCheckBox;
class QPushButton;

namespace vx
{
namespace PopoverWidget
{
class Container;
class Item;
class SliderItem;
}
}

namespace gallery
{
class PopoverRowsPage : public Page
{
    Q_OBJECT

public:
    explicit PopoverRowsPage(SignalLog& log, QWidget* parent = nullptr);
    ~PopoverRowsPage() override;

    void rehearse(Hand& hand) override;

private:
    class Rights;
    using Container = vx::PopoverWidget::Container;
    using Controller = vx::PopoverWidget::Controller;
    using Item = vx::PopoverWidget::Item;

    QPushButton* addButton(const QString& text, Container* (PopoverRowsPage::*fill)());
    QWidget* makeSettings();
    void open(QPushButton* button, Container* (PopoverRowsPage::*fill)());
    void setBusy(bool busy);
    void addHandle();
    /// Adds a row that takes the right, and is watched.
    Item* add(Container* container, Item* row, const QString& name);
    /// Gives the row a context menu that calls the action.
    void addReset(Item* row, const std::function<void()>& action);
    static Container* column();

    Container* texts();
    Container* choices();
    Container* values();
    Container* settings();

    std::shared_ptr<Rights> m_rights;
    QCheckBox* m_busy = nullptr;
    QVector<QPushButton*> m_buttons;
    QVector<QPointer<Controller>> m_open;
    QVector<QPointer<Item>> m_rows;
    QPointer<vx::PopoverWidget::SliderItem> m_slider;
};
}
