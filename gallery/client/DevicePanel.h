// SPDX-License-Identifier: MIT
// The devices: searched, renamed, deleted, put in another order.
#pragma once

#include <QtCore/QPointer>
#include <QtCore/QTimer>
#include <QtWidgets/QWidget>

class QLabel;
class QPushButton;
class QScrollArea;

namespace vx
{
class MultiFilterModel;
class SearchEdit;
}

namespace client
{
class DeviceList;
class DeviceRow;
class Fleet;
class FleetModel;
class Session;

/// A search field over a list in the manner of a phone. It can be edited by those who have the right "edit-devices".
///
/// Object names: "deviceSearch", "deviceCount", "deviceEditButton", "deviceArea", "deviceList", "deviceNothing"; in
/// each row "deviceRow" with "deviceDot", "deviceName", "deviceDetails", "deviceNameEdit" and "deviceEvents".
class DevicePanel : public QWidget
{
    Q_OBJECT

public:
    DevicePanel(Fleet& fleet, Session& session, QWidget* parent = nullptr);
    ~DevicePanel() override;

Q_SIGNALS:
    /// A click of the user on a device.
    void cameraChosen(int id);

protected:
    void changeEvent(QEvent* event) override;

private:
    void makeLayout();
    void connectList();
    void connectFleet();
    void retranslate();
    void retranslateCount();
    void choose(int row);
    void setEditing(bool on);
    void applyRights();
    void applyMode();
    void applyFilter();
    void synchronize();
    void synchronizeRows();
    void fill();
    DeviceRow* addRow(int id);
    void showCamera(int id);
    bool isFiltered() const;

    QPointer<Fleet> m_fleet;
    QPointer<Session> m_session;
    FleetModel* const m_model;
    vx::MultiFilterModel* const m_filter;
    vx::SearchEdit* m_search;
    QLabel* m_count;
    QPushButton* m_edit;
    QScrollArea* m_area;
    DeviceList* m_list;
    QLabel* m_nothing;
    QTimer m_later;
    bool m_movable = false;
    bool m_removing = false;
};
}
