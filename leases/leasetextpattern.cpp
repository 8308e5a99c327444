// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasetextpattern.h"

#include "leases/leasetexts.h"

#include <algorithm>
#include <numeric>
#include <utility>

namespace {

bool isAscii(char byte) { return static_cast<quint8>(byte) < 0x80; }

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
    constexpr ByteTest any{0xFF, 0xFF};
    constexpr ByteTest none{0xFF, 0};
    m_first = !m_canBeInAscii ? none : m_bytes.empty() ? any : m_bytes[0];
    m_second = m_bytes.size() < 2 ? any : m_bytes[1];
}

bool LeaseTextPattern::isIn(std::string_view bytes) const
{
    if (!isAscii(bytes))
        return m_needle.isIn(decodeLeaseText(bytes));
    return m_canBeInAscii && std::search(bytes.begin(), bytes.end(), m_bytes.begin(), m_bytes.end(),
                                         [](char byte, ByteTest test) { return test.accepts(byte); }) != bytes.end();
}

std::size_t LeaseTextPattern::nextCandidate(std::string_view memory, std::size_t from) const
{
    // Without a branch for each byte, so that the processor takes many at once.
    constexpr int block{64};
    const auto hasCandidate = [first = m_first, second = m_second](const char *at) {
        unsigned found{0};
        for (int i{0}; i < block; ++i) {
            const bool isCandidate{
                (static_cast<unsigned>(first.accepts(at[i])) & static_cast<unsigned>(second.accepts(at[i + 1]))) != 0};
            found |= static_cast<unsigned>(isCandidate) | static_cast<unsigned>(!isAscii(at[i]));
        }
        return found != 0;
    };
    const char *at{memory.data() + from};
    const char *end{memory.data() + memory.size()};
    while (end - at > block && !hasCandidate(at))
        at += block;
    at = std::find_if(at, end, [this, end](const char &byte) {
        return !isAscii(byte) || (m_first.accepts(byte) && (&byte + 1 == end || m_second.accepts(*(&byte + 1))));
    });
    return static_cast<std::size_t>(at - memory.data());
}
