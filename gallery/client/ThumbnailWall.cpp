// SPDX-License-Identifier: MIT
// All cameras as small pictures.
#include "ThumbnailWall.h"

#include "controls/SearchEdit.h"
#include "Fleet.h"
#include "FleetModel.h"
#include "models/MultiFilterModel.h"
#include "sliders/NicerScrollBar.h"
#include "ThumbnailDelegate.h"
#include "ThumbnailModel.h"

#include <QtCore/QTimerEvent>
#include <QtGui/QKeyEvent>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QHeaderView>
#include <QtWidgets/QLabel>
#include <QtWidgets/QTableView>
#include <QtWidgets/QVBoxLayout>

namespace client
{
namespace
{
constexpr int c_cellWidth = 170; // at least, if there is room for one
constexpr int c_scrollBarWidth = 12;
constexpr int c_refreshInterval = 500; // milliseconds; one picture each
}

ThumbnailWall::ThumbnailWall(Fleet& fleet, QWidget* parent)
    : QWidget(parent)
    , m_fleet(&fleet)
    , m_model(new FleetModel(fleet, this))
    , m_filter(new vx::MultiFilterModel(this))
    , m_cells(new ThumbnailModel(m_filter, this))
    , m_search(new vx::SearchEdit)
    , m_count(new QLabel)
    , m_table(new QTableView)
    , m_nothing(new QLabel)
{
    m_filter->setSourceModel(m_model);
    m_search->setObjectName(QStringLiteral("thumbnailSearch"));
    m_count->setObjectName(QStringLiteral("thumbnailCount"));
    m_count->setProperty("role", QStringLiteral("hint"));
    m_nothing->setObjectName(QStringLiteral("thumbnailNothing"));
    m_nothing->setProperty("role", QStringLiteral("hint"));
    m_nothing->setAlignment(Qt::AlignCenter);
    m_nothing->setWordWrap(true);
    makeTable();
    makeLayout();
    connect(m_search, &QLineEdit::textChanged, this,
        [this](const QString& text) { FleetModel::search(*m_filter, text); });
    connect(m_cells, &QAbstractItemModel::modelAboutToBeReset, this, [this] {
        if (m_table->currentIndex().isValid()) {
            m_current = m_cells->idAt(m_table->currentIndex());
        }
    });
    connect(m_cells, &QAbstractItemModel::modelReset, this, [this] {
        const QModelIndex current = m_cells->indexOf(m_current);
        if (current.isValid()) {
            m_table->setCurrentIndex(current);
        }
        showCount();
    });
    retranslate();
}

void ThumbnailWall::makeTable()
{
    m_table->setObjectName(QStringLiteral("thumbnailTable"));
    m_table->setModel(m_cells);
    m_table->setItemDelegate(new ThumbnailDelegate(m_table));
    m_table->setShowGrid(false);
    m_table->setEditTriggers(QAbstractItemView::NoEditTriggers);
    m_table->setSelectionMode(QAbstractItemView::SingleSelection);
    m_table->setTabKeyNavigation(false);
    m_table->setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    m_table->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_table->horizontalHeader()->hide();
    m_table->horizontalHeader()->setMinimumSectionSize(1);
    m_table->verticalHeader()->hide();
    m_table->verticalHeader()->setMinimumSectionSize(1);
    m_table->installEventFilter(this);
    m_table->viewport()->installEventFilter(this);
    new NicerScrollBar(m_table, Qt::Vertical, NicerScrollBar::epAutomatic, m_table);
    connect(m_table, &QTableView::doubleClicked, this, &ThumbnailWall::choose);
}

void ThumbnailWall::makeLayout()
{
    auto* bar = new QHBoxLayout;
    bar->setSpacing(12);
    bar->addWidget(m_search, 1);
    bar->addWidget(m_count);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    layout->addLayout(bar);
    layout->addWidget(m_table, 1);
    auto* over = new QVBoxLayout(m_table->viewport());
    over->addWidget(m_nothing);
    m_nothing->setAttribute(Qt::WA_TransparentForMouseEvents);
}

void ThumbnailWall::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        retranslate();
    }
}

void ThumbnailWall::retranslate()
{
    m_search->setPlaceholderText(tr("Search pictures"));
    m_search->setToolTip(tr("Words from name, place or address"));
    m_search->setAccessibleName(tr("Search pictures"));
    m_table->setAccessibleName(tr("Pictures of all cameras"));
    m_nothing->setText(tr("No camera matches the search."));
    showCount();
}

void ThumbnailWall::showCount()
{
    const int all = m_model->rowCount();
    const int shown = m_filter->rowCount();
    m_count->setText(shown < all ? tr("%1 of %2 cameras").arg(shown).arg(all) : tr("%1 cameras").arg(all));
    m_nothing->setVisible(shown == 0);
}

void ThumbnailWall::followWidth()
{
    const int width = qMax(1, m_table->viewport()->width() - c_scrollBarWidth);
    const int columns = qMax(1, width / c_cellWidth);
    m_cells->setOrientation(Qt::Vertical, columns);
    m_table->horizontalHeader()->setDefaultSectionSize(width / columns);
    m_table->verticalHeader()->setDefaultSectionSize(qMax(1, width / columns * 9 / 16));
}

bool ThumbnailWall::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == m_table->viewport() && event->type() == QEvent::Resize) {
        followWidth();
    }
    if (watched == m_table && event->type() == QEvent::KeyPress) {
        const int key = static_cast<QKeyEvent*>(event)->key();
        if (key == Qt::Key_Return || key == Qt::Key_Enter) {
            choose(m_table->currentIndex());
            return true;
        }
    }
    return QWidget::eventFilter(watched, event);
}

void ThumbnailWall::choose(const QModelIndex& index)
{
    const int id = m_cells->idAt(index);
    if (m_fleet && m_fleet->camera(id)) {
        Q_EMIT cameraChosen(id);
    }
}

void ThumbnailWall::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    m_refreshing.start(c_refreshInterval, this);
}

void ThumbnailWall::hideEvent(QHideEvent* event)
{
    m_refreshing.stop();
    QWidget::hideEvent(event);
}

void ThumbnailWall::timerEvent(QTimerEvent* event)
{
    if (event->timerId() == m_refreshing.timerId()) {
        refreshNext();
    } else {
        QWidget::timerEvent(event);
    }
}

// One after the other of those in sight.
void ThumbnailWall::refreshNext()
{
    const int columns = qMax(1, m_cells->columnCount());
    const int first = qMax(0, m_table->rowAt(0)) * columns;
    const int lastRow = m_table->rowAt(m_table->viewport()->height() - 1);
    const int end = lastRow < 0 ? m_cells->cellCount({}) : qMin(m_cells->cellCount({}), (lastRow + 1) * columns);
    if (first < end) {
        m_next = m_next + 1 < first || m_next + 1 >= end ? first : m_next + 1;
        m_model->refreshPicture(m_cells->idAt(m_cells->modelIndex(m_next)));
    }
}
}
