// SPDX-License-Identifier: MIT
// The code of docs/models.md.
//! [filter]
#include "models/MultiFilterModel.h"

//! [filter]
//! [table]
#include "models/FlexibleTableModel.h"

//! [table]
//! [delegate]
#include "models/TableViewDelegate.h"

//! [delegate]
#include "Snippets.h"

#include <QtGui/QStandardItemModel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QTableView>
#include <QtWidgets/QVBoxLayout>

namespace snippets_models
{
enum Column
{
    NameColumn,
    PlaceColumn,
    StateColumn
};

//! [table]
class Cameras : public vx::FlexibleTableModel
{
public:
    using FlexibleTableModel::FlexibleTableModel;
    void setImages(const QVector<QImage>& images)
    {
        beginResetModel();
        m_images = images;
        endResetModel();
    }
    int cellCount(const QModelIndex&) const override { return m_images.size(); }
    QVariant cellData(int cell, int role) const override
    {
        return cell < m_images.size() && role == Qt::DecorationRole ? m_images.at(cell) : QVariant();
    }

private:
    QVector<QImage> m_images;
};
//! [table]

class Client : public QWidget
{
public:
    void build(QStandardItemModel* devices, QLineEdit* searchBox, QTableView* view)
    {
        //! [filter]
        auto* model = new vx::MultiFilterModel(view);
        model->setSourceModel(devices);
        model->setRequiredFilter(StateColumn, QRegExp("online", Qt::CaseSensitive, QRegExp::FixedString), false);
        connect(searchBox, &QLineEdit::textChanged, model, [model](const QString& text) {
            model->setSearchFilters({{{NameColumn, PlaceColumn}, QRegExp(text, Qt::CaseInsensitive, QRegExp::FixedString)}});
        });
        //! [filter]
        searchBox->setText("gate");
        Q_ASSERT(model->rowCount() == 1);
    }
    void wall(const QVector<QImage>& images, QTableView* view)
    {
        auto* cameras = new Cameras(view);
        cameras->setImages(images);
        //! [wrap]
        cameras->setOrientation(Qt::Vertical, qMax(1, view->viewport()->width() / 200));
        //! [wrap]
        view->setModel(cameras);
        //! [delegate]
        auto* delegate = new vx::TableViewDelegate(view);
        delegate->setScaleFont(true);
        view->setItemDelegate(delegate);
        //! [delegate]
    }
};
}

namespace snippets
{
void models()
{
    snippets_models::Client client;
    QStandardItemModel devices;
    for (const char* name : {"Gate", "Yard"}) {
        devices.appendRow({new QStandardItem(name), new QStandardItem("north"), new QStandardItem("online")});
    }
    auto* layout = new QVBoxLayout(&client);
    auto* box = new QLineEdit;
    auto* view = new QTableView;
    layout->addWidget(box);
    layout->addWidget(view);
    client.build(&devices, box, view);
    QImage image(32, 24, QImage::Format_RGB32);
    image.fill(Qt::green);
    client.wall({image, image, image}, view);
    client.show();
    pause();
}
}
