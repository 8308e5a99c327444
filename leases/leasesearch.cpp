// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasesearch.h"

#include "leases/dhcpdleasesmodel.h"

#include <algorithm>

namespace {

const std::vector<int> &allColumns()
{
    static const std::vector<int> columns{DhcpdLeasesModel::Address,  DhcpdLeasesModel::Mac,
                                          DhcpdLeasesModel::HostName, DhcpdLeasesModel::State,
                                          DhcpdLeasesModel::Start,    DhcpdLeasesModel::End};
    return columns;
}

} // namespace

LeaseSearch::LeaseSearch(const LeaseTable &table, LeaseTimeTexts &timeTexts, LeaseNeedle needle)
    : m_table{table}
    , m_needle{std::move(needle)}
    , m_addressPattern{m_needle}
    , m_textPattern{m_needle}
    , m_timePattern{m_needle, timeTexts}
    , m_textScan{m_textPattern, table.texts()}
{
}

bool LeaseSearch::contains(int row) const
{
    return isInAny(m_table.at(row), allColumns(), [this](LeaseTexts::Id id) { return isInText(id); });
}

bool LeaseSearch::contains(int row, int column) const
{
    return isIn(m_table.at(row), column, [this](LeaseTexts::Id id) { return isInText(id); });
}

LeaseHits LeaseSearch::find() const { return findIn(allColumns(), nullptr); }

LeaseHits LeaseSearch::find(int column, const LeaseHits *among) const { return findIn({column}, among); }

LeaseHits LeaseSearch::findIn(Columns columns, const LeaseHits *among) const
{
    LeaseHits hits{m_table};
    columns.erase(std::remove_if(columns.begin(), columns.end(), [this](int column) { return !canBeIn(column); }),
                  columns.end());
    if (columns.empty()) {
        return hits;
    }
    for (int row{0}; row < m_table.size(); ++row) {
        const auto place{static_cast<std::size_t>(row)};
        if ((!among || among->m_isHit[place]) && isInAny(m_table.inFileOrder(row), columns, m_textScan)) {
            hits.m_isHit[place] = true;
            hits.m_isEmpty = false;
        }
    }
    return hits;
}

bool LeaseSearch::canBeIn(int column) const
{
    switch (column) {
    case DhcpdLeasesModel::Address:
        return m_needle.text.isEmpty() || m_table.hasOddAddresses() || m_addressPattern.canBeIn();
    case DhcpdLeasesModel::Mac:
    case DhcpdLeasesModel::HostName:
    case DhcpdLeasesModel::State:
        return m_textScan.hasCandidates();
    default:
        return true;
    }
}

template<typename IsInText>
bool LeaseSearch::isInAny(const Lease &lease, const Columns &columns, IsInText &&isInText) const
{
    return std::any_of(columns.begin(), columns.end(), [&](int column) { return isIn(lease, column, isInText); });
}

template<typename IsInText>
bool LeaseSearch::isIn(const Lease &lease, int column, IsInText &&isInText) const
{
    if (m_needle.text.isEmpty()) {
        return true;
    }
    switch (column) {
    case DhcpdLeasesModel::Address:
        return isInAddress(lease.address);
    case DhcpdLeasesModel::Mac:
        return isInText(lease.mac);
    case DhcpdLeasesModel::HostName:
        return isInText(lease.host);
    case DhcpdLeasesModel::State:
        return isInText(lease.state);
    case DhcpdLeasesModel::Start:
        return m_timePattern.isIn(lease.start);
    case DhcpdLeasesModel::End:
        return m_timePattern.isIn(lease.end);
    default:
        return false;
    }
}

bool LeaseSearch::isInAddress(quint32 address) const
{
    const QString *const oddText{m_table.oddAddressText(address)};
    return oddText ? m_needle.isIn(*oddText) : m_addressPattern.isIn(address);
}
