// SPDX-License-Identifier: MIT
// The code of docs/phone-list.md.
//! [list]
#include "controls/iOSListWidget.h"
#include "controls/iOSListWidgetItem.h"

//! [list]
#include "Snippets.h"

#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>

namespace snippets_phone_list
{
struct Device
{
    QString name;
    int id;
};
class DeviceModel : public QObject
{
public:
    void move(const QVariant&, const QVariant&) {}
    void remove(const QVariant&) {}
};
class Client : public QWidget
{
public:
    void build(const QVector<Device>& devices, QPushButton* edit, DeviceModel* model)
    {
        //! [list]
        auto* list = new vx::iOSListWidget(this, "devices");
        for (const Device& device : devices) {
            auto* row = new vx::iOSListWidgetItem(list, new QLabel(device.name), "device");
            row->setData(Qt::UserRole, device.id);
        }
        connect(edit, &QPushButton::clicked, list, &vx::iOSListWidget::toggleEditMode);
        connect(list, &vx::iOSListWidget::dataMoved, model, &DeviceModel::move);
        connect(list, &vx::iOSListWidget::itemRemoved, model,
            [model](const vx::iOSListWidget::TListWidgetItemPointer& row) { model->remove(row->data(Qt::UserRole)); });
        //! [list]
    }
};
}

namespace snippets
{
void phone_list()
{
    snippets_phone_list::Client client;
    snippets_phone_list::DeviceModel model;
    auto* edit = new QPushButton(&client);
    client.build({{"Gate", 1}, {"Yard", 2}}, edit, &model);
    client.show();
    edit->click();
    pause();
}
}
