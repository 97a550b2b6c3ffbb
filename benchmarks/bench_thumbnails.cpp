// SPDX-License-Identifier: MIT
// What a wall of thumbnails costs: a page of cells beside bare blits of ready pictures, and a step of scrolling
// beside a widget that does nothing but scroll and blit.
#include <benchmark/benchmark.h>

#include <QtGui/QFontDatabase>
#include <QtGui/QPaintEvent>
#include <QtGui/QPainter>
#include <QtGui/QPixmap>
#include <QtWidgets/QApplication>
#include <QtWidgets/QHeaderView>
#include <QtWidgets/QScrollBar>
#include <QtWidgets/QStyledItemDelegate>
#include <QtWidgets/QTableView>

#include "models/FlexibleTableModel.h"
#include "models/TableViewDelegate.h"

namespace
{
constexpr int c_columns = 8;
const QSize c_cell(200, 150);

QImage makePicture(int seed, const QSize& size)
{
    QImage image(size, QImage::Format_RGB32);
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width(); ++x) {
            image.setPixel(x, y, qRgb((x + seed * 9) % 256, (y + seed * 5) % 256, (x + y) % 256));
        }
    }
    return image;
}

class Cells : public vx::FlexibleTableModel
{
public:
    explicit Cells(int count)
        : FlexibleTableModel(nullptr)
        , m_count(count)
    {
        for (int i = 0; i < 64; ++i) {
            m_pictures << makePicture(i, QSize(320, 180));
            m_names << QStringLiteral("Building %1, north gate, camera %2").arg(i % 7).arg(i);
        }
        setOrientation(Qt::Vertical, c_columns);
    }

    int cellCount(const QModelIndex&) const override { return m_count; }
    QVariant cellData(int cell, int role) const override
    {
        if (cell >= m_count) {
            return QVariant();
        }
        switch (role) {
        case Qt::DisplayRole:
            return m_names.at(cell % 64);
        case Qt::DecorationRole:
            return m_pictures.at(cell % 64);
        case Qt::TextAlignmentRole:
            return int(Qt::AlignCenter);
        default:
            return QVariant();
        }
    }

private:
    int m_count;
    QVector<QImage> m_pictures;
    QStringList m_names;
};

QRect cellRect(int cell)
{
    return QRect(QPoint(cell % c_columns * c_cell.width(), cell / c_columns * c_cell.height()), c_cell);
}

QImage page(int cells)
{
    return QImage(c_columns * c_cell.width(), (cells + c_columns - 1) / c_columns * c_cell.height(),
        QImage::Format_ARGB32_Premultiplied);
}

/// Ready pictures at the size of the cells: the floor.
void pageBareBlits(benchmark::State& state)
{
    const int cells = int(state.range(0));
    QVector<QImage> ready;
    for (int i = 0; i < cells; ++i) {
        ready << makePicture(i, c_cell).convertToFormat(QImage::Format_ARGB32_Premultiplied);
    }
    QImage image = page(cells);
    for (auto _ : state) {
        QPainter painter(&image);
        for (int i = 0; i < cells; ++i) {
            painter.drawImage(cellRect(i).topLeft(), ready.at(i));
        }
    }
}
BENCHMARK(pageBareBlits)->Arg(48)->Arg(60)->Unit(benchmark::kMicrosecond);

void pageDelegate(benchmark::State& state)
{
    const int cells = int(state.range(0));
    Cells model(cells);
    vx::TableViewDelegate delegate(nullptr);
    QImage image = page(cells);
    for (auto _ : state) {
        QPainter painter(&image);
        QStyleOptionViewItem option;
        for (int i = 0; i < cells; ++i) {
            option.rect = cellRect(i);
            delegate.paint(&painter, option, model.modelIndex(i));
        }
    }
}
BENCHMARK(pageDelegate)->Arg(48)->Arg(60)->Unit(benchmark::kMicrosecond);

/// The plain way: scale and elide in every paint.
void pageScaledAndElidedEachTime(benchmark::State& state)
{
    const int cells = int(state.range(0));
    Cells model(cells);
    QImage image = page(cells);
    for (auto _ : state) {
        QPainter painter(&image);
        for (int i = 0; i < cells; ++i) {
            const QRect rect = cellRect(i);
            painter.drawImage(rect.adjusted(10, 10, -1, -1), model.cellData(i, Qt::DecorationRole).value<QImage>());
            QRect bar = rect;
            bar.setTop(rect.bottom() - 20);
            painter.fillRect(bar, QColor(109, 110, 113, 185));
            const QRect inner = bar.adjusted(4, 0, -4, 0);
            const QString text = model.cellData(i, Qt::DisplayRole).toString();
            QFont font = QFontDatabase::systemFont(QFontDatabase::FixedFont);
            int size = 12;
            font.setPixelSize(size);
            while (QFontMetrics(font).horizontalAdvance(text) > inner.width() && size >= 8) {
                font.setPixelSize(--size);
            }
            painter.setFont(font);
            painter.setPen(Qt::white);
            painter.drawText(inner, Qt::AlignLeft | Qt::AlignVCenter,
                QFontMetrics(font).elidedText(text, Qt::ElideLeft, inner.width()));
        }
    }
}
BENCHMARK(pageScaledAndElidedEachTime)->Arg(48)->Arg(60)->Unit(benchmark::kMicrosecond);

/// Scrolls by 16 pixels and blits what comes into view.
class BareScroll : public QWidget
{
public:
    BareScroll()
    {
        for (int i = 0; i < 64; ++i) {
            m_ready << QPixmap::fromImage(makePicture(i, c_cell));
        }
        setAttribute(Qt::WA_OpaquePaintEvent);
    }

    void advance(int pixels)
    {
        m_offset += pixels;
        scroll(0, -pixels);
    }

protected:
    void paintEvent(QPaintEvent* event) override
    {
        QPainter painter(this);
        for (const QRect& rect : event->region()) {
            const int first = (rect.top() + m_offset) / c_cell.height();
            const int last = (rect.bottom() + m_offset) / c_cell.height();
            for (int row = first; row <= last; ++row) {
                for (int column = 0; column < c_columns; ++column) {
                    painter.drawPixmap(column * c_cell.width(), row * c_cell.height() - m_offset,
                        m_ready.at((row * c_columns + column) % 64));
                }
            }
        }
    }

private:
    QVector<QPixmap> m_ready;
    int m_offset = 0;
};

void scrollBare(benchmark::State& state)
{
    BareScroll widget;
    widget.resize(c_columns * c_cell.width(), 6 * c_cell.height());
    widget.show();
    QApplication::processEvents();
    for (auto _ : state) {
        widget.advance(16);
        QApplication::processEvents();
    }
}
BENCHMARK(scrollBare)->Unit(benchmark::kMicrosecond);

/// A delegate that does nothing but blit: what the item view costs by itself.
class BareDelegate : public QStyledItemDelegate
{
public:
    BareDelegate()
    {
        for (int i = 0; i < 64; ++i) {
            m_ready << QPixmap::fromImage(makePicture(i, c_cell));
        }
    }

    void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override
    {
        painter->drawPixmap(option.rect.topLeft(), m_ready.at((index.row() * c_columns + index.column()) % 64));
    }

private:
    QVector<QPixmap> m_ready;
};

void scrollTable(benchmark::State& state, QAbstractItemDelegate& delegate)
{
    Cells model(int(state.range(0)));
    QTableView view;
    view.setFrameShape(QFrame::NoFrame);
    view.setShowGrid(false);
    view.setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    view.setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view.setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view.horizontalHeader()->hide();
    view.verticalHeader()->hide();
    view.horizontalHeader()->setDefaultSectionSize(c_cell.width());
    view.verticalHeader()->setDefaultSectionSize(c_cell.height());
    view.setItemDelegate(&delegate);
    view.setModel(&model);
    view.resize(c_columns * c_cell.width(), 6 * c_cell.height());
    view.show();
    QApplication::processEvents();
    QScrollBar* const bar = view.verticalScrollBar();
    for (auto _ : state) {
        bar->setValue(bar->value() + 16 > bar->maximum() ? 0 : bar->value() + 16);
        QApplication::processEvents();
    }
}

void scrollWall(benchmark::State& state)
{
    vx::TableViewDelegate delegate(nullptr);
    scrollTable(state, delegate);
}
BENCHMARK(scrollWall)->Arg(1000)->Arg(10000)->Arg(100000)->Unit(benchmark::kMicrosecond);

void scrollWallBareDelegate(benchmark::State& state)
{
    BareDelegate delegate;
    scrollTable(state, delegate);
}
BENCHMARK(scrollWallBareDelegate)->Arg(1000)->Arg(100000)->Unit(benchmark::kMicrosecond);
}

int main(int argc, char* argv[])
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
