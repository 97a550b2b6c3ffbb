// SPDX-License-Identifier: MIT
// The item models and their delegate, each working for a view.
#include <QtCore/QStringListModel>
#include <QtGui/QImage>
#include <QtWidgets/QTableView>

#include "models/FlexibleTableModel.h"
#include "models/MultiFilterModel.h"
#include "models/TableViewDelegate.h"

#include "Registry.h"

namespace zelkovtest
{
namespace
{
using vx::FlexibleTableModel;
using vx::MultiFilterModel;
using vx::TableViewDelegate;

class Thumbnails : public FlexibleTableModel
{
public:
    using FlexibleTableModel::FlexibleTableModel;

    int cellCount(const QModelIndex&) const override { return 7; }

    QVariant cellData(int cell, int role) const override
    {
        if (cell >= 7) {
            return QVariant();
        }
        switch (role) {
        case Qt::DisplayRole:
            return QStringLiteral("a camera with a long name %1").arg(cell);
        case Qt::TextAlignmentRole:
            return int(Qt::AlignAbsolute) | cell * 32;
        case Qt::DecorationRole: {
            QImage image(20 + cell, 10, QImage::Format_RGB32);
            image.fill(Qt::darkGreen);
            return image;
        }
        default:
            return QVariant();
        }
    }
};

void render(const Subject& subject)
{
    subject.widget->grab();
}

Entry multiFilterModel()
{
    Entry entry;
    entry.name = "MultiFilterModel";
    entry.header = "models/MultiFilterModel.h";
    entry.kind = Kind::Object;
    entry.create = [](QWidget* host) {
        QTableView* const view = new QTableView(host);
        QStringList names;
        for (int i = 0; i < 40; ++i) {
            names << QStringLiteral("camera %1").arg(i);
        }
        MultiFilterModel* const model = new MultiFilterModel(view);
        model->setSourceModel(new QStringListModel(names, model));
        view->setModel(model);
        view->setSortingEnabled(true);
        return Subject {model, view};
    };
    // No signals of its own.
    entry.exercise = {{"filters", {},
        {[](const Subject& subject) {
             MultiFilterModel* const model = static_cast<MultiFilterModel*>(subject.object.data());
             model->addSearchFilter({0, 7}, QRegExp(QStringLiteral("camera 1")));
             model->setRequiredFilter(0, QRegExp(QStringLiteral("camera .3")), true);
         },
            render, call(&MultiFilterModel::clearSearchFilters), render, call(&MultiFilterModel::removeFilters)}}};
    entry.setters = {setter("setRequiredFilter", &MultiFilterModel::setRequiredFilter)};
    return entry;
}

Entry flexibleTableModel()
{
    Entry entry;
    entry.name = "FlexibleTableModel";
    entry.header = "models/FlexibleTableModel.h";
    entry.kind = Kind::Object;
    entry.create = [](QWidget* host) {
        QTableView* const view = new QTableView(host);
        FlexibleTableModel* const model = new Thumbnails(view);
        view->setModel(model);
        return Subject {model, view};
    };
    entry.exercise = {{"wrap", {},
        {[](const Subject& subject) {
             static_cast<FlexibleTableModel*>(subject.object.data())->setOrientation(Qt::Vertical, 3);
         },
            render}}};
    // A view makes a section for each column, so that the number of columns cannot be an extreme one here.
    return entry;
}

Entry tableViewDelegate()
{
    Entry entry;
    entry.name = "TableViewDelegate";
    entry.header = "models/TableViewDelegate.h";
    entry.kind = Kind::Object;
    entry.create = [](QWidget* host) {
        QTableView* const view = new QTableView(host);
        Thumbnails* const model = new Thumbnails(view);
        model->setOrientation(Qt::Vertical, 3);
        view->setModel(model);
        TableViewDelegate* const delegate = new TableViewDelegate(view);
        view->setItemDelegate(delegate);
        return Subject {delegate, view};
    };
    entry.exercise = {{"paint", {},
        {render, call(&TableViewDelegate::setScaleFont, true), render,
            call(&TableViewDelegate::setPictureCacheLimit, 0), render}}};
    entry.setters = {
        setter("setScaleFont", &TableViewDelegate::setScaleFont),
        setter("setPictureCacheLimit", &TableViewDelegate::setPictureCacheLimit),
    };
    return entry;
}
}

std::vector<Entry> modelsEntries()
{
    return {flexibleTableModel(), multiFilterModel(), tableViewDelegate(),
        valueClass("FilterPattern", "models/FilterPattern.h"), valueClass("TableShape", "models/TableShape.h")};
}
}
