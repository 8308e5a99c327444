// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasetextscan.h"

#include "leases/leasetextpattern.h"

LeaseTextScan::LeaseTextScan(const LeaseTextPattern &pattern, const LeaseTexts &texts)
    : m_pattern{pattern}
    , m_texts{texts}
    , m_match{pattern.nextMatch(texts.memory(), 0)}
{
}

bool LeaseTextScan::isIn(LeaseTexts::Id id)
{
    const std::string_view memory{m_texts.memory()};
    const std::string_view text{m_texts.at(id)};
    const auto begin = static_cast<std::size_t>(text.data() - memory.data());
    if (begin < m_begin)
        return m_pattern.isIn(text);
    if (begin > m_match) {
        m_begin = begin;
        m_match = m_pattern.nextMatch(memory, begin);
    }
    return m_match < begin + text.size() && m_pattern.isIn(text);
}
