// SPDX-License-Identifier: MIT
// The devices: searched, renamed, deleted, put in another order.
#include "DevicePanel.h"

#include "controls/SearchEdit.h"
#include "DeviceList.h"
#include "DeviceRow.h"
#include "Fleet.h"
#include "FleetModel.h"
#include "models/MultiFilterModel.h"
#include "Session.h"
#include "sliders/NicerScrollBar.h"

#include <QtCore/QEvent>
#include <QtCore/QSignalBlocker>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>
#include <QtWidgets/QVBoxLayout>

namespace client
{
namespace
{
constexpr int c_barWidth = 12;
}

DevicePanel::DevicePanel(Fleet& fleet, Session& session, QWidget* parent)
    : QWidget(parent)
    , m_fleet(&fleet)
    , m_session(&session)
    , m_model(new FleetModel(fleet, this))
    , m_filter(new vx::MultiFilterModel(this))
    , m_search(new vx::SearchEdit)
    , m_count(new QLabel)
    , m_edit(new QPushButton)
    , m_area(new QScrollArea)
    , m_list(new DeviceList(*m_area))
    , m_nothing(new QLabel)
{
    m_filter->setSourceModel(m_model);
    m_later.setSingleShot(true);
    m_later.setInterval(0);
    m_search->setObjectName(QStringLiteral("deviceSearch"));
    m_count->setObjectName(QStringLiteral("deviceCount"));
    m_count->setProperty("role", QStringLiteral("hint"));
    m_edit->setObjectName(QStringLiteral("deviceEditButton"));
    m_edit->setCheckable(true);
    m_area->setObjectName(QStringLiteral("deviceArea"));
    m_nothing->setObjectName(QStringLiteral("deviceNothing"));
    m_nothing->setProperty("role", QStringLiteral("hint"));
    m_nothing->setAlignment(Qt::AlignCenter);
    m_nothing->setWordWrap(true);
    m_nothing->setMargin(16);
    makeLayout();
    connectList();
    connectFleet();
    fill();
    applyRights();
    retranslate();
}

DevicePanel::~DevicePanel()
{
    // Fields say goodbye when they lose the focus, which is too late for a name.
    for (int row = 0; row < m_list->count(); ++row) {
        if (DeviceRow* const device = m_list->deviceAt(row)) {
            device->disconnect(this);
        }
    }
    m_list->disconnect(this);
    m_search->disconnect(this);
}

void DevicePanel::makeLayout()
{
    auto* content = new QWidget;
    content->setObjectName(QStringLiteral("deviceContent"));
    auto* rows = new QVBoxLayout(content);
    rows->setContentsMargins(0, 0, 0, 0);
    rows->setSpacing(0);
    rows->addWidget(m_list);
    rows->addWidget(m_nothing);
    rows->addStretch(1);
    m_area->setWidget(content);
    m_area->setWidgetResizable(true);
    m_area->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_area->setFocusPolicy(Qt::NoFocus);
    new NicerScrollBar(m_area, Qt::Vertical, NicerScrollBar::epAutomatic, m_area);

    auto* bar = new QHBoxLayout;
    bar->addWidget(m_count, 1);
    bar->addWidget(m_edit);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    layout->addWidget(m_search);
    layout->addLayout(bar);
    layout->addWidget(m_area, 1);
    setMinimumWidth(240);
}

void DevicePanel::connectList()
{
    connect(m_search, &QLineEdit::textChanged, this, [this](const QString& text) {
        FleetModel::search(*m_filter, text);
        applyFilter();
    });
    connect(m_edit, &QPushButton::toggled, this, &DevicePanel::setEditing);
    connect(m_list, &QListWidget::itemClicked, this, [this](QListWidgetItem* item) { choose(m_list->row(item)); });
    connect(m_list, &DeviceList::rowEntered, this, &DevicePanel::choose);
    connect(m_list, &DeviceList::dragFinished, this, [this] { m_later.start(); });
    // It comes before the rows have moved: both are the cameras as they stand now.
    connect(m_list, &vx::iOSListWidget::dataMoved, this, [this](const QVariant& from, const QVariant& to) {
        if (m_fleet && m_movable) {
            m_fleet->move(m_fleet->indexOf(from.toInt()), m_fleet->indexOf(to.toInt()));
        }
    });
    connect(m_list, &vx::iOSListWidget::itemRemoved, this, [this](const vx::iOSListWidget::TListWidgetItemPointer& item) {
        if (m_fleet && !m_removing) {
            m_fleet->remove(item->data(Qt::UserRole).toInt());
        }
    });
}

void DevicePanel::connectFleet()
{
    connect(m_fleet, &Fleet::renamed, this, &DevicePanel::showCamera);
    connect(m_fleet, &Fleet::onlineChanged, this, &DevicePanel::showCamera);
    connect(m_fleet, &Fleet::eventsChanged, this, &DevicePanel::showCamera);
    // Later: the list may be in the middle of a drop, or of deleting one of its rows.
    connect(m_fleet, &Fleet::orderChanged, &m_later, QOverload<>::of(&QTimer::start));
    connect(m_fleet, &Fleet::renamed, &m_later, QOverload<>::of(&QTimer::start));
    connect(&m_later, &QTimer::timeout, this, &DevicePanel::synchronize);
    connect(m_session, &Session::roleChanged, this, &DevicePanel::applyRights);
}

void DevicePanel::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        retranslate();
    }
}

void DevicePanel::retranslate()
{
    m_search->setPlaceholderText(tr("Search devices"));
    m_search->setToolTip(tr("Words from name, place or address"));
    m_search->setAccessibleName(tr("Search devices"));
    m_list->setAccessibleName(tr("Devices"));
    m_edit->setText(m_edit->isChecked() ? tr("Done") : tr("Edit"));
    m_nothing->setText(tr("No device matches the search."));
    retranslateCount();
    for (int row = 0; row < m_list->count(); ++row) {
        DeviceRow* const device = m_list->deviceAt(row);
        const Camera* const camera = device && m_fleet ? m_fleet->camera(device->id()) : nullptr;
        if (camera) {
            device->retranslate();
            device->showCamera(*camera);
        }
    }
}

void DevicePanel::retranslateCount()
{
    const int all = m_model->rowCount();
    const int shown = m_filter->rowCount();
    m_count->setText(isFiltered() ? tr("%1 of %2 devices").arg(shown).arg(all) : tr("%1 devices").arg(all));
}

bool DevicePanel::isFiltered() const
{
    return !m_search->text().trimmed().isEmpty();
}

void DevicePanel::choose(int row)
{
    const DeviceRow* const device = m_list->deviceAt(row);
    if (device && !m_list->editMode() && m_fleet && m_fleet->camera(device->id())) {
        Q_EMIT cameraChosen(device->id());
    }
}

void DevicePanel::setEditing(bool on)
{
    // The last field has the focus still.
    for (int row = 0; !on && row < m_list->count(); ++row) {
        if (DeviceRow* const device = m_list->deviceAt(row)) {
            device->commitName();
        }
    }
    m_edit->setText(on ? tr("Done") : tr("Edit"));
    applyMode();
}

void DevicePanel::applyRights()
{
    const bool refused = !m_session || m_session->isRightRefused(QStringLiteral("edit-devices"), true, false, false);
    if (refused) {
        m_edit->setChecked(false);
    }
    m_edit->setVisible(!refused);
}

void DevicePanel::applyMode()
{
    // What a drag did in a part of the devices would be a riddle.
    m_movable = m_edit->isChecked() && !isFiltered();
    for (int row = 0; row < m_list->count(); ++row) {
        if (DeviceRow* const device = m_list->deviceAt(row)) {
            device->setMovable(m_movable);
        }
    }
    m_list->setEditMode(m_edit->isChecked());
    // The bar must not lie over the grips.
    m_area->widget()->layout()->setContentsMargins(0, 0, m_edit->isChecked() ? c_barWidth : 0, 0);
}

void DevicePanel::applyFilter()
{
    for (int row = 0; row < m_list->count(); ++row) {
        const DeviceRow* const device = m_list->deviceAt(row);
        const QModelIndex source = m_model->index(device ? m_model->rowOf(device->id()) : -1, 0);
        m_list->setRowHidden(row, !m_filter->mapFromSource(source).isValid());
    }
    m_list->fitHeight();
    m_nothing->setVisible(m_filter->rowCount() == 0);
    retranslateCount();
    if (m_movable != (m_edit->isChecked() && !isFiltered())) {
        applyMode();
    }
}

void DevicePanel::showCamera(int id)
{
    DeviceRow* const device = m_list->device(id);
    const Camera* const camera = m_fleet ? m_fleet->camera(id) : nullptr;
    if (device && camera) {
        device->showCamera(*camera);
    }
}

void DevicePanel::synchronize()
{
    if (m_list->isDragging() || !m_fleet) {
        return; // until the drag is finished
    }
    synchronizeRows();
    applyFilter();
}

void DevicePanel::synchronizeRows()
{
    m_removing = true;
    for (int row = m_list->count() - 1; row >= 0; --row) {
        const DeviceRow* const device = m_list->deviceAt(row);
        if (!device || !m_fleet->camera(device->id())) {
            m_list->deleteItem(m_list->item(row));
        }
    }
    m_removing = false;
    const QVector<Camera>& cameras = m_fleet->cameras();
    for (int row = 0; row < cameras.size(); ++row) {
        const DeviceRow* const device = m_list->deviceAt(row);
        if (!device && row >= m_list->count()) {
            addRow(cameras.at(row).id);
        } else if (!device || device->id() != cameras.at(row).id) {
            fill();
            return;
        }
    }
}

void DevicePanel::fill()
{
    const DeviceRow* const old = m_list->deviceAt(m_list->currentRow());
    const int current = old ? old->id() : -1;
    const int scrolled = m_area->verticalScrollBar()->value();
    {
        const QSignalBlocker quiet(m_list);
        m_list->clear();
        for (const Camera& camera : m_fleet->cameras()) {
            addRow(camera.id);
        }
        if (DeviceRow* const device = m_list->device(current)) {
            m_list->setCurrentItem(device);
        }
    }
    applyMode();
    applyFilter();
    m_area->verticalScrollBar()->setValue(scrolled);
}

DeviceRow* DevicePanel::addRow(int id)
{
    auto* device = new DeviceRow(m_list, *m_fleet->camera(id));
    device->setMovable(m_movable);
    device->setEditMode(m_edit->isChecked());
    connect(device, &DeviceRow::nameTyped, this, [this](int camera, const QString& name) {
        if (m_fleet) {
            m_fleet->rename(camera, name);
        }
    });
    return device;
}
}
