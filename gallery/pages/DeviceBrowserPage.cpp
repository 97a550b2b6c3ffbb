// SPDX-License-Identifier: MIT
// Ten thousand made-up devices, searched while one types.
#include "DeviceBrowserPage.h"

#include <QtCore/QAbstractTableModel>
#include <QtCore/QElapsedTimer>
#include <QtCore/QEvent>
#include <QtGui/QLinearGradient>
#include <QtGui/QPainter>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QHeaderView>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QStyledItemDelegate>
#include <QtWidgets/QTableView>

#include "../Hand.h"
#include "models/FlexibleTableModel.h"
#include "models/MultiFilterModel.h"
#include "models/TableViewDelegate.h"

namespace gallery
{
namespace
{
constexpr int c_devices = 10000;
constexpr int c_pictures = 48;
constexpr int c_thumbnailWidth = 150;

enum DeviceColumn : int { dcName, dcPlace, dcAddress, dcState, dcCount };

const char* const s_places[] = {QT_TRANSLATE_NOOP("gallery::DeviceBrowserPage", "North gate"),
                                QT_TRANSLATE_NOOP("gallery::DeviceBrowserPage", "Car park"),
                                QT_TRANSLATE_NOOP("gallery::DeviceBrowserPage", "Loading ramp"),
                                QT_TRANSLATE_NOOP("gallery::DeviceBrowserPage", "Lobby")};
const char* const s_states[] = {QT_TRANSLATE_NOOP("gallery::DeviceBrowserPage", "online"),
                                QT_TRANSLATE_NOOP("gallery::DeviceBrowserPage", "offline")};

/// A synthetic view of a yard by day or night.
QImage makeThumbnail(int seed)
{
    QImage image(320, 180, QImage::Format_RGB32);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    const int hue = 195 + seed * 37 % 50;
    const int light = 70 + seed * 53 % 130;
    QLinearGradient sky(0, 0, 0, 110);
    sky.setColorAt(0, QColor::fromHsv(hue, 110, light));
    sky.setColorAt(1, QColor::fromHsv(hue, 50, qMin(255, light + 50)));
    painter.fillRect(QRect(0, 0, 320, 110), sky);
    painter.fillRect(QRect(0, 110, 320, 70), QColor::fromHsv(90 + seed % 40, 40, light * 2 / 3));
    painter.setPen(Qt::NoPen);
    for (int i = 0; i < 5; ++i) {
        const int height = 30 + (seed * 29 + i * 41) % 60;
        painter.setBrush(QColor::fromHsv((seed * 11 + i * 23) % 360, 35, light * 3 / 4));
        painter.drawRect(i * 70 - seed % 40, 112 - height, 52, height);
    }
    painter.setBrush(QColor(60, 62, 66));
    const QPointF road[] = {{120.0 + seed % 30, 110}, {150.0 + seed % 30, 110}, {280, 180}, {40, 180}};
    painter.drawConvexPolygon(road, 4);
    return image;
}

class DeviceList : public QAbstractTableModel
{
public:
    explicit DeviceList(QObject* parent)
        : QAbstractTableModel(parent)
    {
        for (int i = 0; i < c_pictures; ++i) {
            m_pictures << makeThumbnail(i);
        }
        for (const char* place : s_places) {
            m_places << DeviceBrowserPage::tr(place);
        }
        for (const char* state : s_states) {
            m_states << DeviceBrowserPage::tr(state);
        }
        m_names.reserve(c_devices);
        for (int i = 0; i < c_devices; ++i) {
            m_names << DeviceBrowserPage::tr("Building %1, %2, camera %3")
                           .arg(i % 23 + 1)
                           .arg(m_places.at(i * 7 / 5 % m_places.size()))
                           .arg(i + 1);
        }
    }

    int rowCount(const QModelIndex& parent) const override { return parent.isValid() ? 0 : c_devices; }
    int columnCount(const QModelIndex& parent) const override { return parent.isValid() ? 0 : int(dcCount); }

    QVariant data(const QModelIndex& index, int role) const override
    {
        const int row = index.row();
        if (!index.isValid()) {
            return QVariant();
        }
        if (role == Qt::DecorationRole && index.column() == dcName) {
            return m_pictures.at(row % c_pictures);
        }
        if (role != Qt::DisplayRole) {
            return QVariant();
        }
        switch (index.column()) {
        case dcName:
            return m_names.at(row);
        case dcPlace:
            return m_places.at(row * 7 / 5 % m_places.size());
        case dcAddress:
            return QStringLiteral("10.0.%1.%2").arg(row / 250).arg(row % 250 + 1);
        default:
            return m_states.at(row % 9 == 4 ? 1 : 0);
        }
    }

    QVariant headerData(int section, Qt::Orientation orientation, int role) const override
    {
        if (orientation != Qt::Horizontal || role != Qt::DisplayRole) {
            return QVariant();
        }
        const QString titles[] = {DeviceBrowserPage::tr("Name"), DeviceBrowserPage::tr("Place"),
                                  DeviceBrowserPage::tr("Address"), DeviceBrowserPage::tr("State")};
        return section >= 0 && section < dcCount ? titles[section] : QString();
    }

private:
    QVector<QImage> m_pictures;
    QStringList m_places;
    QStringList m_states;
    QStringList m_names;
};

/// The rows of the list as the cells of the wall.
class ThumbnailModel : public vx::FlexibleTableModel
{
public:
    ThumbnailModel(QAbstractItemModel* list, QObject* parent)
        : FlexibleTableModel(parent)
        , m_list(list)
    {
        connect(list, &QAbstractItemModel::layoutAboutToBeChanged, this, [this] { beginResetModel(); });
        connect(list, &QAbstractItemModel::layoutChanged, this, [this] { endResetModel(); });
    }

    int cellCount(const QModelIndex&) const override { return m_list->rowCount(); }

    QVariant cellData(int cell, int role) const override
    {
        if (cell >= m_list->rowCount()) {
            return QVariant();
        }
        return role == Qt::TextAlignmentRole ? QVariant(int(Qt::AlignAbsolute))
                                             : m_list->index(cell, dcName).data(role);
    }

private:
    QAbstractItemModel* m_list;
};

class ListDelegate : public QStyledItemDelegate
{
public:
    using QStyledItemDelegate::QStyledItemDelegate;

protected:
    void initStyleOption(QStyleOptionViewItem* option, const QModelIndex& index) const override
    {
        QStyledItemDelegate::initStyleOption(option, index);
        option->features.setFlag(QStyleOptionViewItem::HasDecoration, false); // the wall shows the pictures
        option->decorationSize = QSize();
        option->icon = QIcon();
    }
};
}

DeviceBrowserPage::DeviceBrowserPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
    , m_filtered(new vx::MultiFilterModel(this))
{
    // One change of layout for each letter: the cost grows with the number of devices alone.
    m_filtered->setRefreshMode(vx::MultiFilterModel::RefreshMode::Layout);
    m_filtered->setSourceModel(new DeviceList(this));
    m_thumbnails = new ThumbnailModel(m_filtered, this);

    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(12);
    layout->addWidget(makeCriteria());
    auto* views = new QHBoxLayout;
    views->setSpacing(12);
    views->addWidget(makeList(), 1);
    m_wall = makeWall();
    views->addWidget(m_wall, 1);
    layout->addLayout(views, 1);
    filter();
}

QWidget* DeviceBrowserPage::makeCriteria()
{
    QWidget* box = panel();
    auto* row = new QHBoxLayout(box);
    row->setContentsMargins(16, 10, 16, 10);
    row->setSpacing(10);
    m_search = new QLineEdit;
    m_search->setPlaceholderText(tr("Search in name and address"));
    m_search->setClearButtonEnabled(true);
    m_place = new QComboBox;
    m_place->addItem(tr("All places"));
    for (const char* place : s_places) {
        m_place->addItem(tr(place), tr(place));
    }
    m_state = new QComboBox;
    m_state->addItem(tr("All states"));
    for (const char* state : s_states) {
        m_state->addItem(tr(state), tr(state));
    }
    m_time = label(QString(), "hint");
    m_time->setMinimumWidth(190);
    m_time->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    row->addWidget(m_search, 1);
    row->addWidget(m_place);
    row->addWidget(m_state);
    row->addWidget(m_time);
    connect(m_search, &QLineEdit::textChanged, this, [this] { filter(); });
    connect(m_place, QOverload<int>::of(&QComboBox::currentIndexChanged), this, [this] { filter(); });
    connect(m_state, QOverload<int>::of(&QComboBox::currentIndexChanged), this, [this] { filter(); });
    return box;
}

QTableView* DeviceBrowserPage::makeList()
{
    auto* view = new QTableView;
    view->setModel(m_filtered);
    view->setItemDelegate(new ListDelegate(view));
    view->setSelectionBehavior(QAbstractItemView::SelectRows);
    view->setEditTriggers(QAbstractItemView::NoEditTriggers);
    view->setShowGrid(false);
    view->setAlternatingRowColors(true);
    view->verticalHeader()->hide();
    view->verticalHeader()->setDefaultSectionSize(26);
    view->horizontalHeader()->setSectionResizeMode(dcName, QHeaderView::Stretch);
    view->setColumnWidth(dcPlace, 92);
    view->setColumnWidth(dcAddress, 88);
    view->setColumnWidth(dcState, 62);
    view->horizontalHeader()->setHighlightSections(false);
    return view;
}

QTableView* DeviceBrowserPage::makeWall()
{
    auto* view = new QTableView;
    view->setModel(m_thumbnails);
    view->setItemDelegate(new vx::TableViewDelegate(view));
    view->setShowGrid(false);
    view->setEditTriggers(QAbstractItemView::NoEditTriggers);
    view->setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    view->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn); // or the width would depend on the columns
    view->horizontalHeader()->hide();
    view->verticalHeader()->hide();
    view->horizontalHeader()->setMinimumSectionSize(1);
    view->viewport()->installEventFilter(this);
    return view;
}

void DeviceBrowserPage::filter()
{
    QElapsedTimer timer;
    timer.start();
    // Required filters are never replaced, so all are given anew.
    m_filtered->removeFilters();
    if (m_place->currentIndex() > 0) {
        m_filtered->setRequiredFilter(
            dcPlace, QRegExp(m_place->currentData().toString(), Qt::CaseSensitive, QRegExp::FixedString), false);
    }
    if (m_state->currentIndex() > 0) {
        m_filtered->setRequiredFilter(
            dcState, QRegExp(m_state->currentData().toString(), Qt::CaseSensitive, QRegExp::FixedString), false);
    }
    m_filtered->setSearchFilters(
        {{{dcName, dcAddress}, QRegExp(m_search->text(), Qt::CaseInsensitive, QRegExp::FixedString)}});
    const int shown = m_filtered->rowCount();
    m_time->setText(tr("%1 of %2 devices, %3 ms")
                        .arg(shown)
                        .arg(c_devices)
                        .arg(QString::number(double(timer.nsecsElapsed()) / 1e6, 'f', 1)));
}

void DeviceBrowserPage::followWidth()
{
    const int width = m_wall->viewport()->width();
    const int columns = qMax(1, width / c_thumbnailWidth);
    m_thumbnails->setOrientation(Qt::Vertical, columns);
    m_wall->horizontalHeader()->setDefaultSectionSize(width / columns);
    m_wall->verticalHeader()->setDefaultSectionSize(width / columns * 9 / 16);
}

bool DeviceBrowserPage::eventFilter(QObject* watched, QEvent* event)
{
    if (m_wall != nullptr && watched == m_wall->viewport() && event->type() == QEvent::Resize) {
        followWidth();
    }
    return Page::eventFilter(watched, event);
}

void DeviceBrowserPage::rehearse(Hand& hand)
{
    hand.click(m_search, m_search->rect().center());
    for (const char* text : {"c", "ca", "cam", "camera 1", "camera 12"}) {
        hand.call(m_search, [this, text] { m_search->setText(QString::fromLatin1(text)); }).wait(120);
    }
    hand.click(m_wall->viewport(), QPoint(60, 40)).wait(200);
}
}
