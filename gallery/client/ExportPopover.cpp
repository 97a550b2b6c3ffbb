// SPDX-License-Identifier: MIT
// Asks how to export.
#include "ExportPopover.h"

#include <QtCore/QDateTime>
#include <QtCore/QEvent>
#include <QtGui/QPainter>
#include <QtWidgets/QButtonGroup>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QRadioButton>

#include "Fleet.h"
#include "ZelkovUtils/TimeUtils.h"
#include "popover/Container.h"
#include "popover/HeaderContainer.h"
#include "popover/Manager.h"
#include "popover/items/CheckItem.h"
#include "popover/items/ComboBoxItem.h"
#include "popover/items/DateTimeItem.h"
#include "popover/items/EditItem.h"
#include "popover/items/PushItem.h"
#include "popover/items/RadioItem.h"
#include "popover/items/Separator.h"
#include "popover/items/SliderItem.h"
#include "popover/items/iOSCheckItem.h"

namespace client
{
namespace
{
using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::CheckItem;
using vx::PopoverWidget::ComboBoxItem;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::DateTimeItem;
using vx::PopoverWidget::EContainerFlags;
using vx::PopoverWidget::EditItem;
using vx::PopoverWidget::eifAdditionalText;
using vx::PopoverWidget::eifCentered;
using vx::PopoverWidget::eifControl;
using vx::PopoverWidget::eifText;
using vx::PopoverWidget::EItemFlags;
using vx::PopoverWidget::HeaderContainer;
using vx::PopoverWidget::iOSCheckItem;
using vx::PopoverWidget::Item;
using vx::PopoverWidget::Manager;
using vx::PopoverWidget::PushItem;
using vx::PopoverWidget::RadioItem;
using vx::PopoverWidget::Separator;
using vx::PopoverWidget::SliderItem;

enum Row : int
{
    rCameras = 1,
    rFormat = 2, // three of them
    rQuality = 5,
    rSound,
    rClock,
    rFrom,
    rTo,
    rFile,
    rProtect,
    rPassword,
    rExport,
    rCancel
};

const EItemFlags s_usual = eifText | eifControl;
const int s_width = 340;
const int s_rowHeight = 31;
const int s_buttonHeight = 50;
const int s_fieldWidth = 190;
const int s_handle = 1;

QString rowName(const char* text)
{
    return QString::fromLatin1(text);
}

// Rows have a text element only if they are made with a text; the real ones come with retranslate().
QString someText()
{
    return QStringLiteral(" ");
}
}

ExportPopover::ExportPopover(const Fleet& fleet, int camera, qint64 begin, qint64 end, QObject* parent)
    : QObject(parent)
    , m_fleet(fleet)
    , m_camera(camera)
    , m_begin(begin)
    , m_end(end)
{
}

ExportPopover::~ExportPopover()
{
    delete m_handle.data();
    if (m_controller) {
        m_controller->dismiss(false, true); // which ends ask()
    }
}

QString ExportPopover::cameraName() const
{
    const Camera* const camera = m_fleet.camera(m_camera);
    return camera ? camera->name : QString();
}

void ExportPopover::add(Container* list, Item* row)
{
    row->setFixedSize(s_width, s_rowHeight);
    list->addItem(row, EContainerFlags());
}

Container* ExportPopover::makeRows()
{
    auto* list = new Container(nullptr, rowName("exportRows"), Qt::Vertical, Qt::AlignTop);
    list->setLeftMargin(0);
    list->setTopMargin(4);
    list->setRightMargin(0);
    list->setBottomMargin(0);
    makeChoices(list);
    makeFileRows(list);
    return list;
}

void ExportPopover::makeChoices(Container* list)
{
    auto* cameras = new ComboBoxItem(
        someText(), rowName("exportCameras"), rCameras, {cameraName(), someText()}, s_usual, nullptr);
    cameras->comboBox()->setFixedWidth(s_fieldWidth);
    cameras->setValue(m_options.cameras.size() > 1 ? 1 : 0);
    add(list, cameras);

    auto* group = new QButtonGroup(list);
    for (int i = 0; i < 3; ++i) {
        add(list, new RadioItem(someText(), rowName("exportFormat%1").arg(i), rFormat + i,
                      i == m_options.format, group, s_usual, nullptr));
    }

    m_quality = new SliderItem(
        someText(), rowName("exportQuality"), rQuality, s_usual | eifAdditionalText, nullptr);
    m_quality->slider()->setMinimumSize(s_fieldWidth - 50, 30);
    add(list, m_quality);
    add(list, new iOSCheckItem(
                  someText(), rowName("exportSound"), rSound, m_options.sound, s_usual, nullptr));
    add(list, new CheckItem(someText(), rowName("exportClock"), rClock, m_options.clock, s_usual, nullptr));
}

void ExportPopover::makeFileRows(Container* list)
{
    list->addWidgetItem(new Separator(nullptr), rowName("exportLine"), 0);
    const QString format = TimeUtils::getDateTimeFormat(true, true);
    for (const int id : {rFrom, rTo}) {
        const qint64 time = id == rFrom ? m_options.from : m_options.to;
        auto* row = new DateTimeItem(someText(), QDateTime::fromMSecsSinceEpoch(time), Qt::LocalTime, format,
            rowName(id == rFrom ? "exportFrom" : "exportTo"), id, s_usual, nullptr);
        row->dateTimeEdit()->setDateTimeRange(
            QDateTime::fromMSecsSinceEpoch(m_begin), QDateTime::fromMSecsSinceEpoch(m_end));
        row->dateTimeEdit()->setFixedWidth(s_fieldWidth);
        add(list, row);
    }
    const auto edit = [this, list](const char* name, int id, const QString& text) {
        auto* row = new EditItem(someText(), QString(), rowName(name), id, s_usual, nullptr);
        row->lineEdit()->setFixedWidth(s_fieldWidth);
        row->lineEdit()->setText(text);
        connect(row->lineEdit(), &QLineEdit::textChanged, this, &ExportPopover::check);
        add(list, row);
        return row;
    };
    edit("exportFile", rFile, m_options.fileName);
    add(list, new CheckItem(
                  someText(), rowName("exportProtect"), rProtect, !m_options.password.isEmpty(), s_usual, nullptr));
    EditItem* const password = edit("exportPassword", rPassword, m_options.password);
    password->lineEdit()->setEchoMode(QLineEdit::Password);
}

Container* ExportPopover::makeButtons()
{
    auto* bar = new HeaderContainer(nullptr, rowName("exportButtons"), Qt::Horizontal, Qt::AlignTop);
    bar->setSpacing(8);
    const EItemFlags flags = eifText | eifCentered;
    bar->addItem(new PushItem(someText(), QString(), rowName("exportCancel"), rCancel, flags, nullptr),
        EContainerFlags());
    bar->addItem(new PushItem(someText(), QString(), rowName("exportAccept"), rExport, flags, nullptr),
        EContainerFlags());
    bar->setFixedHeight(s_buttonHeight); // or they would take the room that the rows need
    return bar;
}

bool ExportPopover::ask(QWidget* target, const ExportOptions& suggested)
{
    Manager* const manager = Manager::instance();
    if (m_controller || !manager) {
        return false;
    }
    m_options = suggested;
    m_controller = manager->createController(manager->getUniquePopoverID(), false, false, target, target, QString(),
        rowName("exportPopover"), Balloon::EArrowDirections(QFlag(15)), QSizeF(), Balloon::ESizeConstraints());
    m_rows = makeRows();
    m_buttons = makeButtons();
    m_rows->addFooter(m_buttons);
    m_rows->installEventFilter(this);
    retranslate();
    check();
    m_controller->setContainer(m_rows, Balloon::ebfTitle | Balloon::ebfClose);
    connect(m_controller.data(), &Controller::balloonOpened, this, &ExportPopover::makeHandle);
    connect(m_controller.data(), &Controller::itemPerformed, this,
        [this](int id, const QVariant& value) { perform(id, value); });
    connect(m_controller.data(), &Controller::shouldAccept, this, &ExportPopover::accept);

    const QPointer<ExportPopover> alive(this);
    const int result = m_controller->exec(QDialogButtonBox::NoButton);
    return alive && result == 1;
}

// A handle becomes a child of the window that the slider stands in by now.
void ExportPopover::makeHandle()
{
    vx::MultiNubsieSlider* const slider = m_quality ? m_quality->slider() : nullptr;
    if (!slider || !slider->getNubsies().isEmpty()) {
        return;
    }
    QPixmap knob(64, 64);
    knob.fill(Qt::transparent);
    QPainter painter(&knob);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(QColor(0, 0, 0, 70), 3));
    painter.setBrush(slider->palette().highlight());
    painter.drawEllipse(QRectF(3, 3, 58, 58));
    painter.end();
    slider->addNubsie(rowName("quality"), m_options.quality, 10, 100, s_handle);
    slider->setFeatures(s_handle, vx::Nubsie::enfDraggable | vx::Nubsie::enfMoveable | vx::Nubsie::enfLiveDrag);
    slider->setFeatures(QFlags<vx::MultiNubsieSlider::EMultiNubsieSliderFeatures>());
    slider->setStandardSize(s_handle, QSize(18, 18));
    slider->setDraggedSize(s_handle, QSize(22, 22));
    slider->setIcon(s_handle, knob);
    slider->setDrawTrack(true);
    // It would stay in the window after the popover.
    m_handle = slider->getNubsies().value(0);
    m_handle->setClipWidget(m_rows->parentWidget()); // the rows may scroll
    connect(m_controller.data(), &Controller::balloonClosed, m_handle.data(), &QObject::deleteLater);
}

void ExportPopover::perform(int id, const QVariant& value)
{
    switch (id) {
    case rQuality:
        m_options.quality = value.toList().value(1).toInt();
        m_quality->setAdditionalText(tr("%1 %").arg(m_options.quality));
        break;
    case rFrom:
    case rTo: takeRange(); break;
    case rProtect: check(); break;
    case rExport: accept(); break;
    case rCancel:
        m_controller->setRejected();
        m_controller->dismiss(true, true);
        break;
    default: break;
    }
}

void ExportPopover::takeRange()
{
    if (m_settingRange) {
        return;
    }
    m_options.from = m_rows->getItemValue(rFrom).toDateTime().toMSecsSinceEpoch();
    m_options.to = m_rows->getItemValue(rTo).toDateTime().toMSecsSinceEpoch();
    check();
    if (m_options.from < m_options.to) {
        Q_EMIT rangeChosen(m_options.from, m_options.to);
    }
}

void ExportPopover::setRange(qint64 from, qint64 to)
{
    if (!m_rows || (from == m_options.from && to == m_options.to)) {
        return;
    }
    m_settingRange = true;
    m_options.from = from;
    m_options.to = to;
    m_rows->setItemValue(rFrom, QDateTime::fromMSecsSinceEpoch(from), false);
    m_rows->setItemValue(rTo, QDateTime::fromMSecsSinceEpoch(to), false);
    m_settingRange = false;
    check();
}

// Without a file name, a password that was promised or any time there is nothing to export.
void ExportPopover::check()
{
    if (!m_rows || !m_buttons) {
        return;
    }
    Item* const password = m_rows->getItem(rPassword);
    const bool isProtected = m_rows->getItemValue(rProtect).toBool();
    password->setEnabled(isProtected);
    const bool isComplete = !m_rows->getItemValue(rFile).toString().trimmed().isEmpty()
        && m_options.from < m_options.to
        && (!isProtected || !m_rows->getItemValue(rPassword).toString().isEmpty());
    m_buttons->getItem(rExport)->setEnabled(isComplete);
}

void ExportPopover::accept()
{
    if (!m_rows || !m_buttons->getItem(rExport)->isEnabled()) {
        return;
    }
    m_options.cameras.clear();
    if (m_rows->getItemValue(rCameras).toInt() == 0) {
        m_options.cameras << m_camera;
    } else {
        for (const Camera& camera : m_fleet.cameras()) {
            m_options.cameras << camera.id;
        }
    }
    for (int i = 0; i < 3; ++i) {
        if (m_rows->getItemValue(rFormat + i).toBool()) {
            m_options.format = ExportOptions::Format(i);
        }
    }
    m_options.sound = m_rows->getItemValue(rSound).toBool();
    m_options.clock = m_rows->getItemValue(rClock).toBool();
    m_options.fileName = m_rows->getItemValue(rFile).toString().trimmed();
    m_options.password = m_rows->getItemValue(rProtect).toBool() ? m_rows->getItemValue(rPassword).toString() : QString();
    m_controller->setAccepted();
    m_controller->dismiss(true, true);
}

void ExportPopover::retranslate()
{
    if (!m_rows || !m_buttons || !m_controller) {
        return;
    }
    m_controller->setTitle(tr("Export"));
    const QPair<int, QString> texts[] = {{rCameras, tr("Cameras")}, {rFormat, tr("MP4, for any player")},
        {rFormat + 1, tr("MKV, smaller")}, {rFormat + 2, tr("As recorded")}, {rQuality, tr("Quality")},
        {rSound, tr("With sound")}, {rClock, tr("Time in the picture")}, {rFrom, tr("From")}, {rTo, tr("To")},
        {rFile, tr("File name")}, {rProtect, tr("Protect by a password")}, {rPassword, tr("Password")}};
    for (const QPair<int, QString>& text : texts) {
        m_rows->getItem(text.first)->setText(text.second);
    }
    m_quality->setAdditionalText(tr("%1 %").arg(m_options.quality));
    static_cast<ComboBoxItem*>(m_rows->getItem(rCameras))
        ->comboBox()
        ->setItemText(1, tr("All (%1)").arg(m_fleet.cameras().size()));
    m_buttons->getItem(rExport)->setText(tr("Export"));
    m_buttons->getItem(rCancel)->setText(tr("Cancel"));
}

bool ExportPopover::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() == QEvent::LanguageChange && watched == m_rows) {
        retranslate();
    }
    return QObject::eventFilter(watched, event);
}
}
