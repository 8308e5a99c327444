// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/lease.h"
#include "leases/leaseaddresspattern.h"
#include "leases/leasehits.h"
#include "leases/leaseneedle.h"
#include "leases/leasetextpattern.h"
#include "leases/leasetimepattern.h"

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
    /// Whether the text is in one column of a row.
    bool contains(int row, LeaseColumn column) const;

    /// All leases that have the text in any column.
    LeaseHits find() const;
    /// All leases that have the text in `column`; if `among` is given, only of those that it contains.
    LeaseHits find(LeaseColumn column, const LeaseHits *among = nullptr) const;

private:
    bool isIn(const Lease &lease, LeaseColumn column) const;
    bool isInAddress(quint32 address) const;
    bool canBeInAddress() const;
    bool isInText(LeaseColumn column, LeaseTexts::Id text) const;

    /// Adds the leases that have the text in a column.
    void addHits(LeaseHits &hits, LeaseColumn column, const LeaseHits *among) const;
    template<typename IsIn>
    void addHitsIf(LeaseHits &hits, const LeaseHits *among, const IsIn &isIn) const;
    void addTextHits(LeaseHits &hits, LeaseColumn column, LeaseTexts::Id Lease::*text, const LeaseHits *among) const;
    void addTimeHits(LeaseHits &hits, LeaseTime Lease::*time, const LeaseHits *among) const;

    const LeaseTable &m_table;
    LeaseNeedle m_needle;
    LeaseAddressPattern m_addressPattern;
    LeaseTextPattern m_textPattern;
    LeaseTimePattern m_timePattern;
};
