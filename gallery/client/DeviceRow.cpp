// SPDX-License-Identifier: MIT
// One device in the list of devices.
#include "DeviceRow.h"

#include "controls/iOSListWidget.h"
#include "Fleet.h"
#include "indicators/BadgeWidget.h"
#include "indicators/ElidedLabel.h"

#include <QtCore/QVariant>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QStyle>
#include <QtWidgets/QVBoxLayout>

namespace client
{
namespace
{
constexpr int c_rowHeight = 48;
constexpr int c_badgeSize = 18;
constexpr int c_nameLength = 60;

vx::ElidedLabel* line(const QString& name)
{
    auto* label = new vx::ElidedLabel;
    label->setObjectName(name);
    // Its hint is the whole text, for which the list may be too narrow.
    label->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
    return label;
}
}

DeviceRow::Parts DeviceRow::makeParts()
{
    Parts parts;
    parts.text = new QWidget;
    parts.dot = new QLabel;
    parts.dot->setObjectName(QStringLiteral("deviceDot"));
    parts.dot->setFixedSize(8, 8);
    parts.name = line(QStringLiteral("deviceName"));
    parts.details = line(QStringLiteral("deviceDetails"));
    parts.details->setProperty("role", QStringLiteral("hint"));
    auto* lines = new QVBoxLayout;
    lines->setSpacing(2);
    lines->addWidget(parts.name);
    lines->addWidget(parts.details);
    auto* layout = new QHBoxLayout(parts.text);
    layout->setContentsMargins(12, 4, 4, 4);
    layout->setSpacing(12);
    layout->addWidget(parts.dot, 0, Qt::AlignVCenter);
    layout->addLayout(lines, 1);

    // As high as the row, since rows put what is in them at their top.
    parts.field = new QWidget;
    parts.field->setFixedHeight(c_rowHeight);
    parts.edit = new QLineEdit;
    parts.edit->setObjectName(QStringLiteral("deviceNameEdit"));
    parts.edit->setMaxLength(c_nameLength);
    parts.edit->setMinimumWidth(60);
    auto* middle = new QHBoxLayout(parts.field);
    middle->setContentsMargins(2, 0, 2, 0);
    middle->addWidget(parts.edit);

    parts.accessory = new QWidget;
    parts.badge = new vx::BadgeWidget(parts.accessory);
    parts.badge->setObjectName(QStringLiteral("deviceEvents"));
    parts.badge->setAlignment(Qt::AlignCenter);
    parts.badge->setBadgeSize(QSize(c_badgeSize, c_badgeSize));
    auto* side = new QHBoxLayout(parts.accessory);
    side->setContentsMargins(0, 0, 14, 0);
    side->addWidget(parts.badge, 0, Qt::AlignCenter);
    return parts;
}

DeviceRow::DeviceRow(vx::iOSListWidget* list, const Camera& camera)
    : DeviceRow(list, camera, makeParts())
{
}

DeviceRow::DeviceRow(vx::iOSListWidget* list, const Camera& camera, const Parts& parts)
    : iOSListWidgetItem(list, parts.text, QStringLiteral("deviceRow"), QSize(), parts.field, nullptr, parts.accessory)
    , m_id(camera.id)
    , m_parts(parts)
{
    // The width is that of the list.
    setSizeHint(QSize(1, c_rowHeight));
    setData(Qt::UserRole, m_id);
    showCamera(camera);
    retranslate();
    connect(m_parts.edit, &QLineEdit::editingFinished, this, &DeviceRow::commitName);
}

void DeviceRow::showCamera(const Camera& camera)
{
    m_name = camera.name;
    m_parts.name->setText(m_name);
    m_parts.details->setText(QStringLiteral("%1 · %2").arg(camera.place, camera.address));
    if (!m_parts.edit->isModified()) {
        m_parts.edit->setText(m_name);
        m_parts.edit->setCursorPosition(0); // a long name shows its beginning
    }
    if (m_parts.dot->property("online") != QVariant(camera.online)) {
        m_parts.dot->setProperty("online", camera.online);
        m_parts.dot->style()->unpolish(m_parts.dot);
        m_parts.dot->style()->polish(m_parts.dot);
    }
    const QString accessible = camera.online ? tr("%1, online").arg(m_name) : tr("%1, offline").arg(m_name);
    m_parts.text->setAccessibleName(accessible);
    m_parts.dot->setToolTip(camera.online ? tr("Online") : tr("Offline"));
    m_parts.badge->setVisible(camera.events > 0);
    if (camera.events > 0) {
        m_parts.badge->setBadgeLabel(camera.events > 99 ? QStringLiteral("99+") : QString::number(camera.events));
        m_parts.badge->setFixedSize(m_parts.badge->sizeHint());
        m_parts.badge->setToolTip(tr("New events"));
    }
}

void DeviceRow::commitName()
{
    if (!m_parts.edit->isModified()) {
        return;
    }
    const QString name = m_parts.edit->text().simplified();
    m_parts.edit->setModified(false);
    m_parts.edit->setText(name.isEmpty() ? m_name : name);
    if (!name.isEmpty() && name != m_name) {
        Q_EMIT nameTyped(m_id, name);
    }
}

void DeviceRow::retranslate()
{
    m_parts.edit->setPlaceholderText(tr("Name of the camera"));
    m_parts.edit->setAccessibleName(tr("Name of the camera"));
    // Rows of the library take the language they are made in.
    const QWidget* const row = m_parts.text->parentWidget();
    if (auto* const button = row ? row->findChild<QPushButton*>(QStringLiteral("deleteButton")) : nullptr) {
        button->setText(tr("Delete"));
    }
}
}
