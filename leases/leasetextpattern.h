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

    /// The offset in `memory`, from `from` on, of the first byte where the needle begins or that is not ASCII, or the
    /// size: no text before it has the needle. For a needle that is not empty.
    std::size_t nextMatch(std::string_view memory, std::size_t from) const;

private:
    /// The value that bytes must have; for letters whose case does not matter, after a bit is set.
    struct ByteTest
    {
        bool accepts(char byte) const { return difference(byte) == 0; }
        quint8 difference(char byte) const
        {
            return static_cast<quint8>((static_cast<quint8>(byte) | setBits) ^ value);
        }

        quint8 setBits;
        quint8 value;
    };

    /// Whether the needle is at `at` in ASCII text that goes to `end`.
    bool beginsAt(const char *at, const char *end) const;

    LeaseNeedle m_needle;
    bool m_canBeInAscii{true};
    std::vector<ByteTest> m_bytes;
};
