// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasetextscan.h"

#include "leases/leasetextpattern.h"

LeaseTextScan::LeaseTextScan(const LeaseTextPattern &pattern, const LeaseTexts &texts)
    : m_pattern{pattern}
    , m_texts{texts}
    , m_candidate{pattern.nextCandidate(texts.memory(), 0)}
    , m_hasCandidates{m_candidate != texts.memory().size()}
{
}

bool LeaseTextScan::isIn(LeaseTexts::Id id)
{
    const std::string_view text{m_texts.at(id)};
    const std::string_view memory{m_texts.memory()};
    const auto begin = static_cast<std::size_t>(text.data() - memory.data());
    if (begin < m_begin)
        return m_pattern.isIn(text);
    if (begin > m_candidate) {
        m_begin = begin;
        m_candidate = m_pattern.nextCandidate(memory, begin);
    }
    return m_candidate < begin + text.size() && m_pattern.isIn(text);
}
