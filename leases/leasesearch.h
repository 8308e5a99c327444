// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leasepatterns.h"
#include "leases/leasetable.h"

#include <vector>

/// The leases in which a search found its text; to be used until the leases change.
class LeaseHits final
{
public:
    bool isEmpty() const { return m_isEmpty; }
    bool contains(int row) const { return m_isHit[static_cast<std::size_t>(m_table->placeInFile(row))]; }

private:
    friend class LeaseSearch;
    explicit LeaseHits(const LeaseTable &table)
        : m_table{&table}
        , m_isHit(static_cast<std::size_t>(table.size()))
    {
    }

    const LeaseTable *m_table;
    std::vector<bool> m_isHit; // in the order of the file
    bool m_isEmpty{true};
};

/// A search for a text in the cells of a table of leases, as they are shown. It makes as few of the cells' texts as it
/// can: a million leases are searched in a few hundredths of a second.
class LeaseSearch final
{
public:
    /// Looks for `needle` in the leases that `table` holds.
    LeaseSearch(const LeaseTable &table, LeaseTimeTexts &timeTexts, LeaseNeedle needle);
    Q_DISABLE_COPY_MOVE(LeaseSearch)

    const LeaseNeedle &needle() const { return m_needle; }

    /// Whether the text is in any column of a row, which may be new.
    bool contains(int row) const;
    bool contains(int row, int column) const;

    /// All leases that have the text in any column; as find() below, for the leases that there were at the start.
    LeaseHits find() const;
    /// All leases that have the text in `column`; if `among` is given, only of those that it contains.
    LeaseHits find(int column, const LeaseHits *among) const;

private:
    using Columns = std::vector<int>;

    template<typename IsInText>
    bool isIn(const Lease &lease, int column, IsInText &&isInText) const;
    template<typename IsInText>
    bool isInAny(const Lease &lease, const Columns &columns, IsInText &&isInText) const;
    bool isInAddress(quint32 address) const;
    bool isInText(LeaseTexts::Id id) const { return m_textPattern.isIn(m_table.texts().at(id)); }

    /// Whether it may be worth while to look into the cells of a column.
    bool canBeIn(int column) const;
    LeaseHits findIn(Columns columns, const LeaseHits *among) const;

    const LeaseTable &m_table;
    LeaseNeedle m_needle;
    LeaseAddressPattern m_addressPattern;
    LeaseTextPattern m_textPattern;
    LeaseTimePattern m_timePattern;
    mutable LeaseTextScan m_textScan; // of the texts that there were at the start
};
