// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/leaseviewstate.h"

#include "leases/dhcpdleasesmodel.h"

#include <QScrollBar>
#include <QTableView>

namespace {

quint32 addressAt(const QAbstractItemModel &leases, int row)
{
    return leases.index(row, DhcpdLeasesModel::Address).data(DhcpdLeasesModel::AddressRole).toUInt();
}

std::optional<quint32> addressOf(const QModelIndex &index)
{
    return index.isValid() ? std::optional{addressAt(*index.model(), index.row())} : std::nullopt;
}

// What is selected: the row of the current cell, that cell alone, or nothing, since a cell can be current only.
QItemSelectionModel::SelectionFlags selectionIn(const QTableView &table)
{
    switch (table.selectionModel()->selectedIndexes().size()) {
    case 0:
        return QItemSelectionModel::NoUpdate;
    case 1:
        return QItemSelectionModel::ClearAndSelect;
    default:
        return QItemSelectionModel::ClearAndSelect | QItemSelectionModel::Rows;
    }
}

/// The first row whose address is not below `address`; the number of rows when there is none.
int lowerBound(const QAbstractItemModel &leases, quint32 address)
{
    int first{0};
    int last{leases.rowCount()};
    while (first < last) {
        const int middle{first + (last - first) / 2};
        if (addressAt(leases, middle) < address)
            first = middle + 1;
        else
            last = middle;
    }
    return first;
}

} // namespace

LeaseViewState::LeaseViewState(const QTableView &table)
    : m_current{addressOf(table.currentIndex())}
    , m_column{table.currentIndex().column()}
    , m_selection{selectionIn(table)}
    , m_top{addressOf(table.indexAt({0, 0}))}
    , m_left{table.horizontalScrollBar()->value()}
{
}

void LeaseViewState::restoreIn(QTableView &table) const
{
    const QAbstractItemModel &leases{*table.model()};
    // When the current row goes, the table makes its neighbour current; another lease than the user chose.
    if (addressOf(table.currentIndex()) != m_current) {
        const int row{m_current ? lowerBound(leases, *m_current) : leases.rowCount()};
        if (row < leases.rowCount() && addressAt(leases, row) == *m_current)
            table.selectionModel()->setCurrentIndex(leases.index(row, m_column), m_selection);
        else
            table.selectionModel()->clear();
    }
    if (m_top && addressOf(table.indexAt({0, 0})) != m_top)
        table.verticalScrollBar()->setValue(lowerBound(leases, *m_top));
    table.horizontalScrollBar()->setValue(m_left);
}
