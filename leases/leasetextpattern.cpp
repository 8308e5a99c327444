// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasetextpattern.h"

#include "leases/leasetexts.h"

#include <algorithm>
#include <array>
#include <numeric>
#include <utility>

namespace {

constexpr quint8 mark{0x80}; // which no ASCII byte has

bool isAscii(char byte) { return (static_cast<quint8>(byte) & mark) == 0; }

bool isAscii(std::string_view text)
{
    return isAscii(std::accumulate(text.begin(), text.end(), '\0',
                                   [](char all, char byte) { return static_cast<char>(all | byte); }));
}

} // namespace

LeaseTextPattern::LeaseTextPattern(LeaseNeedle needle)
    : m_needle{std::move(needle)}
{
    const bool ignoresCase{m_needle.sensitivity == Qt::CaseInsensitive};
    for (const QChar character : qAsConst(m_needle.text)) {
        const QChar folded{ignoresCase ? character.toCaseFolded() : character};
        m_canBeInAscii = m_canBeInAscii && folded.unicode() < 0x80;
        const bool isLetter{folded >= QLatin1Char{'a'} && folded <= QLatin1Char{'z'}};
        const auto caseBit = static_cast<quint8>(ignoresCase && isLetter ? 'a' ^ 'A' : 0);
        m_bytes.push_back({caseBit, static_cast<quint8>(folded.unicode())});
    }
}

bool LeaseTextPattern::isIn(std::string_view bytes) const
{
    if (!isAscii(bytes))
        return m_needle.isIn(decodeLeaseText(bytes));
    return m_canBeInAscii && std::search(bytes.begin(), bytes.end(), m_bytes.begin(), m_bytes.end(),
                                         [](char byte, ByteTest test) { return test.accepts(byte); }) != bytes.end();
}

bool LeaseTextPattern::beginsAt(const char *at, const char *end) const
{
    return m_canBeInAscii && static_cast<std::size_t>(end - at) >= m_bytes.size() &&
           std::equal(m_bytes.begin(), m_bytes.end(), at, [](ByteTest test, char byte) { return test.accepts(byte); });
}

/// Most bytes are ruled out by three of the needle's, without a branch and in bytes alone, so that the processor takes
/// many at once.
std::size_t LeaseTextPattern::nextMatch(std::string_view memory, std::size_t from) const
{
    const char *at{memory.data() + from};
    const char *end{memory.data() + memory.size()};
    const auto isMatch = [this, end](const char &byte) { return !isAscii(byte) || beginsAt(&byte, end); };

    constexpr std::size_t block{64};
    const std::size_t toLast{m_bytes.size() - 1};
    const std::size_t toMiddle{toLast / 2};
    std::array<quint8, block> marks{};
    for (; static_cast<std::size_t>(end - at) >= block + toLast; at += block) {
        quint8 all{0};
        for (std::size_t i{0}; i < block; ++i) {
            const quint8 different{static_cast<quint8>(m_bytes[0].difference(at[i]) |
                                                       m_bytes[toMiddle].difference(at[i + toMiddle]) |
                                                       m_bytes[toLast].difference(at[i + toLast]))};
            marks[i] = different == 0 ? mark : static_cast<quint8>(at[i]) & mark;
            all |= marks[i];
        }
        if (all == 0)
            continue;
        for (auto next = marks.begin(); (next = std::find(next, marks.end(), mark)) != marks.end(); ++next) {
            if (const char &byte{at[next - marks.begin()]}; isMatch(byte))
                return static_cast<std::size_t>(&byte - memory.data());
        }
    }
    return static_cast<std::size_t>(std::find_if(at, end, isMatch) - memory.data());
}
