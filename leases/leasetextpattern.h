// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leaseneedle.h"

#include <string_view>
#include <vector>

/// Tells whether a needle is in a text of a lease, from the bytes of the text alone where those are ASCII.
class LeaseTextPattern final
{
public:
    explicit LeaseTextPattern(LeaseNeedle needle);

    /// For a needle that is not empty.
    bool isIn(std::string_view bytes) const;

    /// The offset of the first byte of `memory`, from offset `from` on, that is worth a look with isIn(), or its size:
    /// no text before it has the needle.
    std::size_t nextCandidate(std::string_view memory, std::size_t from) const;

private:
    /// The value that bytes must have; for letters whose case does not matter, after a bit is set.
    struct ByteTest
    {
        bool accepts(char byte) const { return (static_cast<quint8>(byte) | setBits) == value; }

        quint8 setBits;
        quint8 value;
    };

    LeaseNeedle m_needle;
    bool m_canBeInAscii{true};
    std::vector<ByteTest> m_bytes;
    ByteTest m_first{};
    ByteTest m_second{};
};
