// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leaseproxymodel.h"

#include "common/qtversions.h"
#include "leases/dhcpdleasesmodel.h"
#include "leases/leaseneedle.h"
#include "leases/leasesearch.h"

#include <algorithm>

namespace {

// So few are asked one by one in less time than all of a million at once.
constexpr int fewRows{1000};

} // namespace

LeaseProxyModel::LeaseProxyModel(QObject *parent)
    : QSortFilterProxyModel{parent}
{
}

LeaseProxyModel::~LeaseProxyModel() = default;

void LeaseProxyModel::setSourceModel(QAbstractItemModel *model)
{
    for (const QMetaObject::Connection &connection : m_connections)
        disconnect(connection);
    // Before the base connects itself, so that what is known of the old leases is forgotten when it asks about the new.
    if (model) {
        m_connections = {
            connect(model, &QAbstractItemModel::modelReset, this, &LeaseProxyModel::searchAgain),
            connect(model, &QAbstractItemModel::rowsAboutToBeInserted, this, &LeaseProxyModel::forgetFound),
            connect(model, &QAbstractItemModel::dataChanged, this, &LeaseProxyModel::forgetFound),
        };
    }
    search(model);
    QSortFilterProxyModel::setSourceModel(model);
}

void LeaseProxyModel::setFilterFixedString(const QString &text)
{
    if (!leases()) {
        QSortFilterProxyModel::setFilterFixedString(text);
        return;
    }
    if (text == m_text)
        return;
    beginResetModel();
    m_text = text;
    searchAgain();
    // Upon the reset the base asks about all rows anew. Its own ways to have that done would move rows one by one, or
    // ask twice where a row is current.
    m_showsAll = !m_search && hasEmptyFilter(*this);
    endResetModel();
    m_showsAll = false;
}

QModelIndexList LeaseProxyModel::match(const QModelIndex &start, int role, const QVariant &value, int hits,
                                       Qt::MatchFlags flags) const
{
    const DhcpdLeasesModel *model{leases()};
    if (!model || !isSearchable(start, role, hits, flags))
        return QSortFilterProxyModel::match(start, role, value, hits, flags);
    const QModelIndex first{mapToSource(start)};
    const LeaseNeedle needle{value.toString(),
                             flags.testFlag(Qt::MatchCaseSensitive) ? Qt::CaseSensitive : Qt::CaseInsensitive};
    if (!m_lastMatch || !(m_lastMatch->needle() == needle))
        m_lastMatch = model->search(needle);
    QModelIndexList matches{firstMatches(start, hits)};
    if (matches.size() == hits)
        return matches;
    matches.clear();
    const LeaseHits found{m_lastMatch->find(static_cast<LeaseColumn>(first.column()), m_found ? &*m_found : nullptr)};
    if (found.isEmpty())
        return matches;
    const int rows{model->rowCount()};
    const int end{rows + (flags.testFlag(Qt::MatchWrap) ? first.row() : 0)};
    for (int i{first.row()}; i < end && matches.size() != hits; ++i) {
        const int row{i < rows ? i : i - rows};
        if (!found.contains(row))
            continue;
        if (const QModelIndex match{mapFromSource(model->index(row, first.column()))}; match.isValid())
            matches.append(match);
    }
    return matches;
}

/// Those matches of m_lastMatch that are in a few rows from `start` on, where one is if many rows have the text.
QModelIndexList LeaseProxyModel::firstMatches(const QModelIndex &start, int most) const
{
    QModelIndexList matches;
    const int end{std::min(start.row() + fewRows, rowCount())};
    for (int row{start.row()}; row < end && matches.size() < most; ++row) {
        const QModelIndex match{index(row, start.column())};
        if (m_lastMatch->contains(mapToSource(match).row(), static_cast<LeaseColumn>(start.column())))
            matches.append(match);
    }
    return matches;
}

bool LeaseProxyModel::filterAcceptsRow(int row, const QModelIndex &parent) const
{
    return m_showsAll || isAccepted(row, parent);
}

bool LeaseProxyModel::isAccepted(int row, const QModelIndex &parent) const
{
    const bool isFound{!m_search || (m_found ? m_found->contains(row) : m_search->contains(row))};
    return isFound && QSortFilterProxyModel::filterAcceptsRow(row, parent);
}

const DhcpdLeasesModel *LeaseProxyModel::leases() const
{
    return qobject_cast<const DhcpdLeasesModel *>(sourceModel());
}

bool LeaseProxyModel::isSearchable(const QModelIndex &start, int role, int hits, Qt::MatchFlags flags) const
{
    // There are no levels to recurse into.
    constexpr Qt::MatchFlags supported{Qt::MatchCaseSensitive | Qt::MatchWrap | Qt::MatchRecursive};
    return (flags & ~supported) == Qt::MatchContains && role == Qt::DisplayRole && (hits > 0 || hits == -1) &&
           start.model() == this && hasIndex(start.row(), start.column()) && sortColumn() < 0;
}

void LeaseProxyModel::search(const QAbstractItemModel *model)
{
    forgetFound();
    m_search.reset();
    const auto *searched = qobject_cast<const DhcpdLeasesModel *>(model);
    if (searched && !m_text.isEmpty()) {
        m_search = searched->search({m_text, Qt::CaseSensitive});
        m_found.emplace(m_search->find());
    }
}

void LeaseProxyModel::searchAgain() { search(sourceModel()); }

void LeaseProxyModel::forgetFound()
{
    m_found.reset();
    m_lastMatch.reset();
}
