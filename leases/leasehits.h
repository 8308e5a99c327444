// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leasetable.h"

#include <vector>

/// The leases in which a search found its text; valid until the leases change.
class LeaseHits final
{
public:
    explicit LeaseHits(const LeaseTable &table);

    bool isEmpty() const { return m_count == 0; }
    bool isComplete() const { return m_count == m_isHit.size(); }
    bool contains(int row) const { return containsInFile(m_table->placeInFile(row)); }

    /// The same by the place in the file.
    bool containsInFile(int place) const { return m_isHit[static_cast<std::size_t>(place)]; }
    /// For a place that is not contained yet.
    void addInFile(int place);

private:
    const LeaseTable *m_table;
    std::vector<bool> m_isHit; // in the order of the file
    std::size_t m_count{0};
};
