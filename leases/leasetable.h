// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leasetime.h"

#include <QByteArray>
#include <QHash>
#include <QString>

#include <optional>
#include <string>
#include <string_view>
#include <vector>

/// A piece of a lease file's text as Qt's bytes.
QByteArray leaseBytes(std::string_view text);
/// A piece of a lease file's text as it is shown.
QString decodeLeaseText(std::string_view text);

/// The texts of a table, one after the other in one piece of memory, each known by a number.
class LeaseTexts final
{
public:
    /// The number of a text. 0, also the default, is the empty text.
    using Id = quint32;

    LeaseTexts() { clear(); }

    void clear();
    void reserve(std::size_t bytes) { m_bytes.reserve(bytes); }
    Id add(std::string_view text);
    /// The text of a number that add() returned; valid until the next add().
    std::string_view at(Id id) const
    {
        const char *const text{m_bytes.data() + id};
        return *text == longText ? longTextAt(id) : std::string_view{text + 1, static_cast<unsigned char>(*text)};
    }
    /// The memory in which the texts lie in the order in which they were added, with other bytes between.
    std::string_view memory() const { return m_bytes; }

private:
    // A text's bytes follow their number, which takes one byte, or this one and eight more.
    static constexpr char longText{'\xFF'};

    std::string_view longTextAt(Id id) const;

    std::string m_bytes;
};

/// One lease, its texts as numbers into the table's LeaseTexts.
struct Lease
{
    quint32 address{};
    LeaseTexts::Id mac{};
    LeaseTexts::Id host{};
    LeaseTexts::Id state{};
    LeaseTime start;
    LeaseTime end;
};

/// The leases by address, one for each; a later one replaces an earlier one.
///
/// What is added is pending, and no row, until it is settled: all at once, which sorts but once, or one by one for a
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
    /// Makes room for the leases of a file of so many bytes.
    void reserveForFile(qint64 bytes);

    LeaseTexts &texts() { return m_texts; }
    const LeaseTexts &texts() const { return m_texts; }

    /// Adds a pending lease. `addressText` is given for an address that is not shown as its number would be.
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
    /// The text of an address that is not shown as its number would be; null for any other.
    const QString *oddAddressText(quint32 address) const;
    bool hasOddAddresses() const { return !m_addressTexts.isEmpty(); }

    /// The same leases in the order of the file. They and their texts lie in memory like this, so that reading all is
    /// several times as fast as by row.
    const Lease &inFileOrder(int place) const { return m_leases[static_cast<std::size_t>(place)]; }
    int placeInFile(int row) const { return static_cast<int>(m_rows[static_cast<std::size_t>(row)]); }

private:
    LeaseTexts m_texts;
    std::vector<Lease> m_leases; // in the order of the file; those from m_rows.size() on are pending
    std::vector<quint32> m_rows; // places in m_leases, by address
    QHash<quint32, QString> m_addressTexts;
};
