// SPDX-License-Identifier: MIT
// A sort and filter proxy with any number of row filters, some on one column, some over several.
#pragma once

#include <QtCore/QList>
#include <QtCore/QPair>
#include <QtCore/QRegExp>
#include <QtCore/QSortFilterProxyModel>
#include <QtCore/QVector>

#include "foundation/Export.h"
#include "models/FilterPattern.h"

namespace vx
{
/// A proxy model that holds two independent sets of row filters where QSortFilterProxyModel has one.
///
/// Required filters decide by a whole-field match in one column; search filters look for a pattern anywhere in any of
/// several columns. A row is shown when it passes all filters of both sets. Typical use is a device list in which
/// fixed criteria combine with what the user types into a search box.
///
/// Patterns are QRegExp objects; their syntax and case sensitivity are what the caller built into them. The text of a
/// cell is what the source model returns for filterRole(). Column numbers are not checked: a column outside of the
/// source model reads as an empty text. The filters of the base class (setFilterRegExp(), setFilterKeyColumn()) are
/// not consulted. Sorting is that of the base class.
///
/// Cost: each change of the filters calls invalidateFilter() once, which keeps selection and scroll position, but
/// removes and inserts rows run by run and takes time by the square of the number of rows when the rows that change
/// lie scattered. docs/models.md has figures. Use setSearchFilters() to replace the search filters with one such
/// call, and RefreshMode::Layout for models of more than about 20,000 rows.
class ZELKOV_WIDGETS_EXPORT MultiFilterModel : public QSortFilterProxyModel
{
    Q_OBJECT

public:
    /// A condition on one column.
    struct Filter
    {
        int column;     ///< column of the source model
        QRegExp regExp; ///< has to match the whole text
        bool exclude;   ///< the row passes if the text does not match
    };

    /// Columns of the source model and a pattern that has to be found in one of them.
    using SearchFilter = QPair<QVector<int>, QRegExp>;

    /// How a change of the filters is told to the views.
    enum class RefreshMode : int {
        Rows = 0, ///< invalidateFilter(): rows are removed and inserted
        Layout    ///< invalidate(): one change of layout, which also sorts again; time grows only with the row count
    };

    explicit MultiFilterModel(QObject* parent = nullptr);
    ~MultiFilterModel() override;

    /// Drops the filters of both sets.
    virtual void removeFilters();

    /// Adds a search filter: @p regExp has to be found in at least one of @p columns. An empty pattern is not added,
    /// but filters again; with an empty list of columns no row passes. There is no check for duplicates.
    virtual void addSearchFilter(const QVector<int>& columns, const QRegExp& regExp);

    /// Drops the search filters and keeps the required ones.
    virtual void clearSearchFilters();

    /// Adds the condition that the text in @p column matches @p regExp as a whole, or, with @p exclude, that it does
    /// not. An empty pattern and a filter that is already there are not added, but filter again. Nothing is ever
    /// replaced: a second pattern on the same column is one more condition.
    void setRequiredFilter(int column, const QRegExp& regExp, bool exclude);

    /// Replaces all search filters with one pass over the rows. Entries with an empty pattern are left out.
    void setSearchFilters(const QVector<SearchFilter>& filters);

    /// How changes of the filters are told to the views from now on; RefreshMode::Rows by default.
    void setRefreshMode(RefreshMode mode);
    RefreshMode refreshMode() const { return m_refreshMode; }

protected:
    bool filterAcceptsRow(int sourceRow, const QModelIndex& sourceParent) const override;

    /// Whether a row of the source model passes all of @p filters, in their order up to the first that fails.
    bool acceptRow(const QList<Filter>& filters, int row, const QModelIndex& parent) const;

    /// Whether each of @p filters is found in at least one of its columns. An entry without columns fails.
    bool acceptRow(const QVector<QPair<QVector<int>, QRegExp>>& filters, int row, const QModelIndex& parent) const;

    /// Both at once; the search filters are not looked at if a required one fails.
    bool acceptRow(const QList<Filter>& requiredFilters,
        const QVector<QPair<QVector<int>, QRegExp>>& searchFilters, int row, const QModelIndex& parent) const;

private:
    QString cellText(int row, int column, const QModelIndex& parent) const;
    void refresh();

    QList<Filter> m_requiredFilters;
    QVector<QPair<QVector<int>, QRegExp>> m_searchFilters;
    // The same patterns, prepared; entry by entry.
    QVector<FilterPattern> m_requiredPatterns;
    QVector<FilterPattern> m_searchPatterns;
    RefreshMode m_refreshMode = RefreshMode::Rows;
};
}
