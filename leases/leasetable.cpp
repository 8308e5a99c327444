// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasetable.h"

#include <QHostAddress>

#include <algorithm>
#include <array>
#include <limits>
#include <numeric>

namespace {

// How much room is made ahead, by the size of a usual block and of the texts in it. Memory that turns out not to be
// needed is never touched.
constexpr qint64 bytesPerLease{256};
constexpr qint64 bytesPerTextByte{16};
constexpr qint64 mostBytesAhead{qint64{1} << 30};

// When so many are pending they are settled, so that a file of many blocks for few addresses does not fill the memory.
constexpr std::size_t manyPending{std::size_t{1} << 20U};

// An address and a place in the list of leases in one number; sorting keeps the leases of an address in their order.
quint64 sortKey(quint32 address, std::size_t place) { return quint64{address} << 32U | place; }
quint32 addressOf(quint64 key) { return static_cast<quint32>(key >> 32U); }
quint32 placeOf(quint64 key) { return static_cast<quint32>(key); }

/// Sorts by the addresses, and keeps those of one address in their order: byte by byte from the lowest one on, which is
/// several times as fast as comparing a million of them.
void sortByAddress(std::vector<quint64> &keys)
{
    constexpr unsigned addressBegin{32};
    constexpr unsigned bitsOfByte{8};
    constexpr unsigned bitsOfKey{64};
    std::vector<quint64> sorted(keys.size());
    for (unsigned shift{addressBegin}; shift < bitsOfKey; shift += bitsOfByte) {
        const auto byteOf = [shift](quint64 key) { return static_cast<std::size_t>(key >> shift & 0xFFU); };
        std::array<std::size_t, 256> places{};
        for (const quint64 key : keys)
            ++places.at(byteOf(key));
        std::exclusive_scan(places.begin(), places.end(), places.begin(), std::size_t{0});
        for (const quint64 key : keys)
            sorted[places.at(byteOf(key))++] = key;
        keys.swap(sorted);
    }
}

} // namespace

void LeaseTable::clear() { *this = LeaseTable{}; }

void LeaseTable::reserveForFile(qint64 bytes)
{
    const auto ahead = static_cast<std::size_t>(std::min(bytes, mostBytesAhead));
    m_leases.reserve(ahead / bytesPerLease);
    texts(LeaseColumn::Mac).reserve(ahead / bytesPerTextByte);
    texts(LeaseColumn::HostName).reserve(ahead / bytesPerTextByte);
}

void LeaseTable::add(const Lease &lease, const std::optional<QString> &addressText)
{
    if (m_leases.size() - m_rows.size() >= std::max(manyPending, m_rows.size()))
        settleAll();
    m_leases.push_back(lease);
    addDay(lease.start, m_lastStart);
    addDay(lease.end, m_lastEnd);
    if (addressText)
        m_addressTexts.insert(lease.address, *addressText);
    else if (!m_addressTexts.isEmpty())
        m_addressTexts.remove(lease.address);
}

void LeaseTable::settleAll()
{
    const std::size_t settled{m_rows.size()};
    std::vector<quint64> keys;
    keys.reserve(m_leases.size() - settled);
    for (std::size_t place{settled}; place < m_leases.size(); ++place)
        keys.push_back(sortKey(m_leases[place].address, place));
    sortByAddress(keys);

    // Merge the last lease of each address into the rows. One whose address has a row already takes the place of the
    // old one; `rowOf` has the rows of the others, and no row for leases that were replaced by later ones.
    constexpr quint32 none{std::numeric_limits<quint32>::max()};
    std::vector<quint32> rows;
    std::vector<quint32> rowOf(keys.size(), none);
    rows.reserve(m_leases.size());
    auto old = m_rows.cbegin();
    for (auto key = keys.cbegin(); key != keys.cend(); ++key) {
        const quint32 address{addressOf(*key)};
        const bool isLast{key + 1 == keys.cend() || addressOf(*(key + 1)) != address};
        if (!isLast)
            continue;
        while (old != m_rows.cend() && m_leases[*old].address < address)
            rows.push_back(*old++);
        if (old != m_rows.cend() && m_leases[*old].address == address) {
            m_leases[*old] = m_leases[placeOf(*key)];
        } else {
            rowOf[placeOf(*key) - settled] = static_cast<quint32>(rows.size());
            rows.push_back(placeOf(*key));
        }
    }
    rows.insert(rows.end(), old, m_rows.cend());

    std::size_t end{settled};
    for (std::size_t place{settled}; place < m_leases.size(); ++place) {
        if (const quint32 row{rowOf[place - settled]}; row != none) {
            m_leases[end] = m_leases[place];
            rows[row] = static_cast<quint32>(end++);
        }
    }
    m_leases.resize(end);
    m_rows = std::move(rows);
}

std::vector<int> LeaseTable::settleKnown()
{
    const auto pending = m_leases.begin() + size();
    std::stable_sort(pending, m_leases.end(), [](const Lease &a, const Lease &b) { return a.address < b.address; });
    std::vector<int> known;
    auto kept = pending;
    for (auto lease = pending; lease != m_leases.end(); ++lease) {
        if (lease + 1 != m_leases.end() && (lease + 1)->address == lease->address)
            continue; // there is a later one
        const std::size_t row{lowerBound(lease->address)};
        if (row < m_rows.size() && m_leases[m_rows[row]].address == lease->address) {
            m_leases[m_rows[row]] = *lease;
            known.push_back(static_cast<int>(row));
        } else {
            *kept++ = *lease;
        }
    }
    m_leases.erase(kept, m_leases.end());
    return known;
}

std::vector<LeaseTable::Rows> LeaseTable::newRows() const
{
    std::vector<Rows> ranges;
    std::size_t next{m_rows.size()}; // the old row that the range goes before
    int settled{0};
    for (std::size_t place{m_rows.size()}; place < m_leases.size(); ++place, ++settled) {
        const std::size_t row{lowerBound(m_leases[place].address)};
        if (ranges.empty() || row != next)
            ranges.push_back({static_cast<int>(row) + settled, 0});
        ++ranges.back().count;
        next = row;
    }
    return ranges;
}

void LeaseTable::settleFirst(const Rows &rows)
{
    std::vector<quint32> places(static_cast<std::size_t>(rows.count));
    std::iota(places.begin(), places.end(), static_cast<quint32>(m_rows.size()));
    m_rows.insert(m_rows.begin() + rows.first, places.cbegin(), places.cend());
}

std::size_t LeaseTable::lowerBound(quint32 address) const
{
    const auto row = std::lower_bound(m_rows.cbegin(), m_rows.cend(), address, [this](quint32 place, quint32 wanted) {
        return m_leases[place].address < wanted;
    });
    return static_cast<std::size_t>(row - m_rows.cbegin());
}

/// Adds the day of a time; `last` is the one before, which is most often of the same day.
void LeaseTable::addDay(LeaseTime time, LeaseTime &last)
{
    if (time.dateKey() != last.dateKey() && time.isValid())
        m_days.insert(time.dateKey(), time);
    last = time;
}

QString LeaseTable::addressText(quint32 address) const
{
    const QString *text{irregularAddressText(address)};
    return text ? *text : QHostAddress{address}.toString();
}

const QString *LeaseTable::irregularAddressText(quint32 address) const
{
    const auto text = m_addressTexts.constFind(address);
    return text != m_addressTexts.cend() ? &*text : nullptr;
}
