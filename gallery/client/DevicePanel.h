// SPDX-License-Identifier: MIT
// The devices: searched, renamed, deleted, put in another order.
#pragma once

#include <QtWidgets/QWidget>

namespace client
{
class Fleet;
class Session;

/// A search field over a list in the manner of a phone. It can be edited by those who have the right "edit-devices".
class DevicePanel : public QWidget
{
    Q_OBJECT

public:
    DevicePanel(Fleet& fleet, Session& session, QWidget* parent = nullptr);

Q_SIGNALS:
    /// A click of the user on a device.
    void cameraChosen(int id);

private:
    Fleet& m_fleet;
    Session& m_session;
};
}
