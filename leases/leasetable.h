// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/lease.h"
#include "leases/leasetexts.h"

#include <QHash>
#include <QString>

#include <optional>
#include <vector>

/// The leases by address, one for each; a later one replaces an earlier one.
///
/// What is added is pending and has no row until it is settled: all at once, which sorts only once, or one by one for a
/// model that announces each change.
class LeaseTable final
{
public:
    /// Where a pending lease goes: to a new row, or in place of the lease in that row.
    struct Place
    {
        int row;
        bool isNew;
    };

    void clear();
    /// Makes room for the leases of a file of that many bytes.
    void reserveForFile(qint64 bytes);

    LeaseTexts &texts() { return m_texts; }
    const LeaseTexts &texts() const { return m_texts; }

    /// Adds a pending lease. `addressText` is given if the address is not shown the way its number would be.
    void add(const Lease &lease, const std::optional<QString> &addressText);

    bool hasPending() const { return m_rows.size() < m_leases.size(); }
    void settleAll();
    /// The place of the pending lease that was added first.
    Place placeOfNext() const;
    /// Moves the pending lease that was added first to its place.
    void settleNext();

    int size() const { return static_cast<int>(m_rows.size()); }
    const Lease &at(int row) const { return m_leases[m_rows[static_cast<std::size_t>(row)]]; }
    QString addressText(quint32 address) const;
    /// The text of an address that is not shown the way its number would be; null for any other.
    const QString *irregularAddressText(quint32 address) const;
    bool hasIrregularAddresses() const { return !m_addressTexts.isEmpty(); }

    /// The same leases in the order of the file, in which they and their texts lie in memory: reading all of them is
    /// several times as fast as by row.
    const Lease &inFileOrder(int place) const { return m_leases[static_cast<std::size_t>(place)]; }
    int placeInFile(int row) const { return static_cast<int>(m_rows[static_cast<std::size_t>(row)]); }

private:
    LeaseTexts m_texts;
    std::vector<Lease> m_leases; // in the order of the file; those from m_rows.size() on are pending
    std::vector<quint32> m_rows; // places in m_leases, by address
    QHash<quint32, QString> m_addressTexts;
};
