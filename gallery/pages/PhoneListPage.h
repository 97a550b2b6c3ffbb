// SPDX-License-Identifier: MIT
// Page "Phone-style list": devices that can be renamed, deleted and put in another order.
#pragma once

#include "../Page.h"

class QPushButton;

namespace vx
{
class iOSListWidget;
}

namespace gallery
{
class PhoneListPage : public Page
{
    Q_OBJECT

public:
    explicit PhoneListPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

private:
    void addDevice(const QString& name, const QString& state);

    vx::iOSListWidget* m_list;
    QPushButton* m_edit;
    int m_number = 0;
};
}
