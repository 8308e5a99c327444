// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/lease.h"
#include "leases/leaseaddresspattern.h"
#include "leases/leasehits.h"
#include "leases/leaseneedle.h"
#include "leases/leasetextpattern.h"
#include "leases/leasetextscan.h"
#include "leases/leasetimepattern.h"

#include <vector>

class LeaseTable;
class LeaseTimeTexts;

/// A search for a text in the cells of a table of leases, as they are shown. It makes as few of the cells' texts as it
/// can: a million leases are searched in a few hundredths of a second.
class LeaseSearch final
{
public:
    /// Looks for `needle` in the leases that `table` holds.
    LeaseSearch(const LeaseTable &table, LeaseTimeTexts &timeTexts, LeaseNeedle needle);
    Q_DISABLE_COPY_MOVE(LeaseSearch)

    const LeaseNeedle &needle() const { return m_needle; }

    /// Whether the text is in any column of a row.
    bool contains(int row) const;

    /// All leases that have the text in any column; as find() below, for the leases that there were at the start.
    LeaseHits find() const;
    /// All leases that have the text in `column`; if `among` is given, only of those that it contains.
    LeaseHits find(LeaseColumn column, const LeaseHits *among = nullptr) const;

private:
    using Columns = std::vector<LeaseColumn>;

    static const Columns &allColumns();
    LeaseHits findIn(Columns columns, const LeaseHits *among) const;
    /// Whether the text may be in any cell of a column.
    bool canBeIn(LeaseColumn column) const;
    bool isInAny(const Lease &lease, const Columns &columns) const;
    bool isIn(const Lease &lease, LeaseColumn column) const;
    bool isInAddress(quint32 address) const;

    const LeaseTable &m_table;
    LeaseNeedle m_needle;
    LeaseAddressPattern m_addressPattern;
    LeaseTextPattern m_textPattern;
    LeaseTimePattern m_timePattern;
    mutable LeaseTextScan m_textScan;
};
