// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasesearch.h"

#include "leases/leasetable.h"

#include <algorithm>
#include <utility>

LeaseSearch::LeaseSearch(const LeaseTable &table, LeaseTimeTexts &timeTexts, LeaseNeedle needle)
    : m_table{table}
    , m_needle{std::move(needle)}
    , m_addressPattern{m_needle}
    , m_textPattern{m_needle}
    , m_timePattern{m_needle, timeTexts}
    , m_textScan{m_textPattern, table.texts()}
{
}

bool LeaseSearch::contains(int row) const { return isInAny(m_table.at(row), allColumns()); }

LeaseHits LeaseSearch::find() const { return findIn(allColumns(), nullptr); }

LeaseHits LeaseSearch::find(LeaseColumn column, const LeaseHits *among) const { return findIn({column}, among); }

const LeaseSearch::Columns &LeaseSearch::allColumns()
{
    static const Columns columns{LeaseColumn::Address, LeaseColumn::Mac,   LeaseColumn::HostName,
                                 LeaseColumn::State,   LeaseColumn::Start, LeaseColumn::End};
    return columns;
}

LeaseHits LeaseSearch::findIn(Columns columns, const LeaseHits *among) const
{
    LeaseHits hits{m_table};
    columns.erase(
        std::remove_if(columns.begin(), columns.end(), [this](LeaseColumn column) { return !canBeIn(column); }),
        columns.end());
    if (columns.empty())
        return hits;
    for (int place{0}; place < m_table.size(); ++place) {
        if ((!among || among->containsInFile(place)) && isInAny(m_table.inFileOrder(place), columns))
            hits.addInFile(place);
    }
    return hits;
}

bool LeaseSearch::canBeIn(LeaseColumn column) const
{
    switch (column) {
    case LeaseColumn::Address:
        return m_table.hasIrregularAddresses() || m_addressPattern.canBeIn();
    case LeaseColumn::Mac:
    case LeaseColumn::HostName:
    case LeaseColumn::State:
        return m_textScan.hasCandidates();
    default:
        return true;
    }
}

bool LeaseSearch::isInAny(const Lease &lease, const Columns &columns) const
{
    return std::any_of(columns.begin(), columns.end(), [&](LeaseColumn column) { return isIn(lease, column); });
}

bool LeaseSearch::isIn(const Lease &lease, LeaseColumn column) const
{
    if (m_needle.text.isEmpty())
        return true;
    switch (column) {
    case LeaseColumn::Address:
        return isInAddress(lease.address);
    case LeaseColumn::Mac:
        return m_textScan.isIn(lease.mac);
    case LeaseColumn::HostName:
        return m_textScan.isIn(lease.host);
    case LeaseColumn::State:
        return m_textScan.isIn(lease.state);
    case LeaseColumn::Start:
        return m_timePattern.isIn(lease.start);
    case LeaseColumn::End:
        return m_timePattern.isIn(lease.end);
    }
    return false;
}

bool LeaseSearch::isInAddress(quint32 address) const
{
    const QString *irregular{m_table.irregularAddressText(address)};
    return irregular ? m_needle.isIn(*irregular) : m_addressPattern.isIn(address);
}
