// SPDX-License-Identifier: MIT
// The two filter sets of the multi-filter proxy.
#include "models/MultiFilterModel.h"

namespace vx
{
MultiFilterModel::MultiFilterModel(QObject* parent)
    : QSortFilterProxyModel(parent)
{
}

MultiFilterModel::~MultiFilterModel() = default;

void MultiFilterModel::removeFilters()
{
    m_requiredFilters.clear();
    m_requiredPatterns.clear();
    m_searchFilters.clear();
    m_searchPatterns.clear();
    refresh();
}

void MultiFilterModel::addSearchFilter(const QVector<int>& columns, const QRegExp& regExp)
{
    if (!regExp.isEmpty()) {
        m_searchFilters.append(qMakePair(columns, regExp));
        m_searchPatterns.append(FilterPattern(regExp));
    }
    refresh();
}

void MultiFilterModel::clearSearchFilters()
{
    m_searchFilters.clear();
    m_searchPatterns.clear();
    refresh();
}

void MultiFilterModel::setRequiredFilter(int column, const QRegExp& regExp, bool exclude)
{
    bool add = !regExp.isEmpty();
    for (int i = 0; add && i < m_requiredFilters.size(); ++i) {
        const Filter& filter = m_requiredFilters.at(i);
        add = filter.column != column || filter.exclude != exclude || filter.regExp != regExp;
    }
    if (add) {
        m_requiredFilters.append(Filter {column, regExp, exclude});
        m_requiredPatterns.append(FilterPattern(regExp));
    }
    refresh();
}

void MultiFilterModel::setSearchFilters(const QVector<SearchFilter>& filters)
{
    m_searchFilters.clear();
    m_searchPatterns.clear();
    for (const SearchFilter& filter : filters) {
        if (!filter.second.isEmpty()) {
            m_searchFilters.append(filter);
            m_searchPatterns.append(FilterPattern(filter.second));
        }
    }
    refresh();
}

void MultiFilterModel::setRefreshMode(RefreshMode mode)
{
    m_refreshMode = mode;
}

bool MultiFilterModel::filterAcceptsRow(int sourceRow, const QModelIndex& sourceParent) const
{
    for (int i = 0; i < m_requiredFilters.size(); ++i) {
        const Filter& filter = m_requiredFilters.at(i);
        const QString text = cellText(sourceRow, filter.column, sourceParent);
        if (m_requiredPatterns.at(i).matchesWhole(text) == filter.exclude) {
            return false;
        }
    }
    for (int i = 0; i < m_searchFilters.size(); ++i) {
        bool found = false;
        for (const int column : m_searchFilters.at(i).first) {
            if (m_searchPatterns.at(i).isFoundIn(cellText(sourceRow, column, sourceParent))) {
                found = true;
                break;
            }
        }
        if (!found) {
            return false;
        }
    }
    return true;
}

bool MultiFilterModel::acceptRow(const QList<Filter>& filters, int row, const QModelIndex& parent) const
{
    for (const Filter& filter : filters) {
        if (filter.regExp.exactMatch(cellText(row, filter.column, parent)) == filter.exclude) {
            return false;
        }
    }
    return true;
}

bool MultiFilterModel::acceptRow(
    const QVector<QPair<QVector<int>, QRegExp>>& filters, int row, const QModelIndex& parent) const
{
    for (const SearchFilter& filter : filters) {
        bool found = false;
        for (const int column : filter.first) {
            if (filter.second.indexIn(cellText(row, column, parent), 0, QRegExp::CaretAtZero) >= 0) {
                found = true;
                break;
            }
        }
        if (!found) {
            return false;
        }
    }
    return true;
}

bool MultiFilterModel::acceptRow(const QList<Filter>& requiredFilters,
    const QVector<QPair<QVector<int>, QRegExp>>& searchFilters, int row, const QModelIndex& parent) const
{
    return acceptRow(requiredFilters, row, parent) && acceptRow(searchFilters, row, parent);
}

QString MultiFilterModel::cellText(int row, int column, const QModelIndex& parent) const
{
    const QAbstractItemModel* const source = sourceModel();
    return source != nullptr ? source->data(source->index(row, column, parent), filterRole()).toString() : QString();
}

void MultiFilterModel::refresh()
{
    if (m_refreshMode == RefreshMode::Layout) {
        invalidate();
    } else {
        invalidateFilter();
    }
}
}
