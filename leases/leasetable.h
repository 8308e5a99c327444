// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/lease.h"
#include "leases/leasetexts.h"

#include <QHash>
#include <QString>

#include <array>
#include <optional>
#include <vector>

/// The leases by address, one for each; a later one replaces an earlier one.
///
/// What is added is pending and has no row until it is settled: all at once, or, for a model that announces what
/// changes, first the leases of addresses that have a row and then one range of new rows after the other.
class LeaseTable final
{
public:
    /// A range of rows.
    struct Rows
    {
        int first;
        int count;
    };

    void clear();
    /// Makes room for the leases of a file of that many bytes.
    void reserveForFile(qint64 bytes);

    /// The texts of one of the columns Mac, HostName and State.
    LeaseTexts &texts(LeaseColumn column) { return m_texts[static_cast<std::size_t>(column) - firstOfTexts]; }
    const LeaseTexts &texts(LeaseColumn column) const
    {
        return m_texts[static_cast<std::size_t>(column) - firstOfTexts];
    }

    /// A time of each day that leases were added with, also if they have been replaced since.
    const QHash<quint32, LeaseTime> &days() const { return m_days; }

    /// Adds a pending lease. `addressText` is given if the address is not shown the way its number would be.
    void add(const Lease &lease, const std::optional<QString> &addressText);

    void settleAll();
    /// Settles the pending leases of addresses that have a row already, and returns these rows in ascending order. For
    /// each other address its last lease stays pending.
    std::vector<int> settleKnown();
    /// After settleKnown(): the ranges of rows that the pending leases will be in, in ascending order.
    std::vector<Rows> newRows() const;
    /// Settles the pending leases of the first of these ranges.
    void settleFirst(const Rows &rows);

    int size() const { return static_cast<int>(m_rows.size()); }
    const Lease &at(int row) const { return m_leases[m_rows[static_cast<std::size_t>(row)]]; }
    QString addressText(quint32 address) const;
    /// The text of an address that is not shown the way its number would be; null for any other.
    const QString *irregularAddressText(quint32 address) const;
    const QHash<quint32, QString> &irregularAddresses() const { return m_addressTexts; }

    /// The same leases in the order of the file, in which they and their texts lie in memory: reading all of them is
    /// several times as fast as by row.
    const Lease &inFileOrder(int place) const { return m_leases[static_cast<std::size_t>(place)]; }
    int placeInFile(int row) const { return static_cast<int>(m_rows[static_cast<std::size_t>(row)]); }

private:
    static constexpr auto firstOfTexts = static_cast<std::size_t>(LeaseColumn::Mac);

    void addDay(LeaseTime time, LeaseTime &last);
    /// The first row with that address or a higher one.
    std::size_t lowerBound(quint32 address) const;

    std::array<LeaseTexts, 3> m_texts;
    QHash<quint32, LeaseTime> m_days; // by their keys
    LeaseTime m_lastStart;
    LeaseTime m_lastEnd;
    std::vector<Lease> m_leases; // in the order of the file; those from m_rows.size() on are pending
    std::vector<quint32> m_rows; // places in m_leases, by address
    QHash<quint32, QString> m_addressTexts;
};
