// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leasetexts.h"

class LeaseTextPattern;

/// Applies a pattern to many of a table's texts, of which few have the needle: one pass over the memory in which they
/// lie finds where the next one can be, and all before are answered by their place. It is fast if they are asked for in
/// the order in which they were added. A search in a million leases takes up to half less time with it.
class LeaseTextScan final
{
public:
    LeaseTextScan(const LeaseTextPattern &pattern, const LeaseTexts &texts);

    /// Whether the needle is in a text, also in one that was added since.
    bool isIn(LeaseTexts::Id id);

    /// Whether the needle may be in any of the texts that there were at the start.
    bool hasCandidates() const { return m_hasCandidates; }

private:
    const LeaseTextPattern &m_pattern;
    const LeaseTexts &m_texts;
    // Offsets in the memory of the texts: those from the one to the other do not have the needle.
    std::size_t m_begin{0};
    std::size_t m_candidate;
    bool m_hasCandidates;
};
