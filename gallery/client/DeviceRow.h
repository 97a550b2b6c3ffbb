// SPDX-License-Identifier: MIT
// One device in the list of devices.
#pragma once

#include "controls/iOSListWidgetItem.h"

class QLabel;
class QLineEdit;

namespace vx
{
class BadgeWidget;
class ElidedLabel;
}

namespace client
{
struct Camera;

/// Name, place and address of a camera, a dot that is green while it is online, and the number of its events. While
/// the list is edited a field for the name takes the place of the text.
class DeviceRow : public vx::iOSListWidgetItem
{
    Q_OBJECT

public:
    DeviceRow(vx::iOSListWidget* list, const Camera& camera);

    int id() const { return m_id; }
    /// A name that is being typed stays.
    void showCamera(const Camera& camera);
    /// Asks for the name that has been typed. One without letters is dropped.
    void commitName();
    void retranslate();

Q_SIGNALS:
    void nameTyped(int id, const QString& name);

private:
    struct Parts
    {
        QWidget* text;
        QLabel* dot;
        vx::ElidedLabel* name;
        vx::ElidedLabel* details;
        QWidget* field;
        QLineEdit* edit;
        QWidget* accessory;
        vx::BadgeWidget* badge;
    };

    static Parts makeParts();
    DeviceRow(vx::iOSListWidget* list, const Camera& camera, const Parts& parts);

    const int m_id;
    const Parts m_parts; // owned by the widget of the row
    QString m_name;
};
}
