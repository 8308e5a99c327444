// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasehits.h"

LeaseHits::LeaseHits(const LeaseTable &table)
    : m_table{&table}
    , m_isHit(static_cast<std::size_t>(table.size()))
{
}

void LeaseHits::addInFile(int place)
{
    m_isHit[static_cast<std::size_t>(place)] = true;
    ++m_count;
}
