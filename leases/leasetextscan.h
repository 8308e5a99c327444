// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leasetexts.h"

class LeaseTextPattern;

/// Applies a pattern to many texts of a column, of which few have the needle: one pass over the memory in which they
/// lie finds where the next one is, and all before are answered by their place. It is fast if they are asked for in the
/// order in which they were added.
class LeaseTextScan final
{
public:
    /// `pattern` has a needle that is not empty.
    LeaseTextScan(const LeaseTextPattern &pattern, const LeaseTexts &texts);

    /// Whether the needle may be in any of the texts.
    bool hasMatches() const { return m_match != m_texts.memory().size(); }
    bool isIn(LeaseTexts::Id id);

private:
    const LeaseTextPattern &m_pattern;
    const LeaseTexts &m_texts;
    // Offsets in the memory of the texts: none that begins between the one and the other has the needle.
    std::size_t m_begin{0};
    std::size_t m_match;
};
