// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasesearch.h"

#include "leases/leasetable.h"
#include "leases/leasetextscan.h"

#include <algorithm>
#include <array>
#include <utility>

namespace {

// Those first that take the least time for a lease: most often one of them spares the others.
constexpr std::array columns{LeaseColumn::State,   LeaseColumn::Start, LeaseColumn::End,
                             LeaseColumn::Address, LeaseColumn::Mac,   LeaseColumn::HostName};

} // namespace

LeaseSearch::LeaseSearch(const LeaseTable &table, LeaseTimeTexts &timeTexts, LeaseNeedle needle)
    : m_table{table}
    , m_needle{std::move(needle)}
    , m_addressPattern{m_needle}
    , m_textPattern{m_needle}
    , m_timePattern{m_needle, timeTexts}
{
}

bool LeaseSearch::contains(int row) const
{
    const Lease &lease{m_table.at(row)};
    return std::any_of(columns.begin(), columns.end(), [&](LeaseColumn column) { return isIn(lease, column); });
}

bool LeaseSearch::contains(int row, LeaseColumn column) const { return isIn(m_table.at(row), column); }

LeaseHits LeaseSearch::find() const
{
    LeaseHits hits{m_table};
    for (const LeaseColumn column : columns) {
        if (!hits.isComplete())
            addHits(hits, column, nullptr);
    }
    return hits;
}

LeaseHits LeaseSearch::find(LeaseColumn column, const LeaseHits *among) const
{
    LeaseHits hits{m_table};
    addHits(hits, column, among);
    return hits;
}

bool LeaseSearch::isIn(const Lease &lease, LeaseColumn column) const
{
    if (m_needle.text.isEmpty())
        return true;
    switch (column) {
    case LeaseColumn::Address:
        return isInAddress(lease.address);
    case LeaseColumn::Mac:
        return isInText(column, lease.mac);
    case LeaseColumn::HostName:
        return isInText(column, lease.host);
    case LeaseColumn::State:
        return isInText(column, lease.state);
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

bool LeaseSearch::canBeInAddress() const
{
    const QHash<quint32, QString> &irregular{m_table.irregularAddresses()};
    return m_addressPattern.canBeIn() || std::any_of(irregular.cbegin(), irregular.cend(),
                                                     [this](const QString &text) { return m_needle.isIn(text); });
}

bool LeaseSearch::isInText(LeaseColumn column, LeaseTexts::Id text) const
{
    return m_textPattern.isIn(m_table.texts(column).at(text));
}

void LeaseSearch::addHits(LeaseHits &hits, LeaseColumn column, const LeaseHits *among) const
{
    if (m_needle.text.isEmpty()) {
        addHitsIf(hits, among, [](const Lease & /*lease*/) { return true; });
        return;
    }
    switch (column) {
    case LeaseColumn::Address:
        if (canBeInAddress())
            addHitsIf(hits, among, [this](const Lease &lease) { return isInAddress(lease.address); });
        break;
    case LeaseColumn::Mac:
        addTextHits(hits, column, &Lease::mac, among);
        break;
    case LeaseColumn::HostName:
        addTextHits(hits, column, &Lease::host, among);
        break;
    case LeaseColumn::State:
        addTextHits(hits, column, &Lease::state, among);
        break;
    case LeaseColumn::Start:
        addTimeHits(hits, &Lease::start, among);
        break;
    case LeaseColumn::End:
        addTimeHits(hits, &Lease::end, among);
        break;
    }
}

template<typename IsIn>
void LeaseSearch::addHitsIf(LeaseHits &hits, const LeaseHits *among, const IsIn &isIn) const
{
    for (int place{0}; place < m_table.size(); ++place) {
        if (!hits.containsInFile(place) && (!among || among->containsInFile(place)) && isIn(m_table.inFileOrder(place)))
            hits.addInFile(place);
    }
}

void LeaseSearch::addTextHits(LeaseHits &hits, LeaseColumn column, LeaseTexts::Id Lease::*text,
                              const LeaseHits *among) const
{
    LeaseTextScan scan{m_textPattern, m_table.texts(column)};
    if (scan.hasMatches())
        addHitsIf(hits, among, [&scan, text](const Lease &lease) { return scan.isIn(lease.*text); });
}

void LeaseSearch::addTimeHits(LeaseHits &hits, LeaseTime Lease::*time, const LeaseHits *among) const
{
    const auto canBeIn = [this](LeaseTime day) { return m_timePattern.canBeOn(day); };
    if (std::any_of(m_table.days().cbegin(), m_table.days().cend(), canBeIn))
        addHitsIf(hits, among, [this, time](const Lease &lease) { return m_timePattern.isIn(lease.*time); });
}
