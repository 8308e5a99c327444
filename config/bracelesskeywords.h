// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/wordlist.h"

#include <algorithm>
#include <array>
#include <string_view>

/// Keywords that make a declaration of a statement without a block.
inline constexpr std::string_view bracelessKeywords[]{"range", "subclass", "fixed-address"};

/// Whether a word with that first byte may be one of them: most words are told apart by it. Beyond ASCII there are case
/// variants of ASCII letters.
inline constexpr std::array<bool, 256> bracelessKeywordStarts{[] {
    std::array<bool, 256> table{};
    for (const std::string_view keyword : bracelessKeywords) {
        constexpr std::size_t caseDistance{'a' - 'A'};
        const std::size_t first{static_cast<unsigned char>(keyword.front())};
        table[first] = table[first - caseDistance] = true;
    }
    for (std::size_t byte{0x80}; byte < table.size(); ++byte)
        table[byte] = true;
    return table;
}()};

inline bool isBracelessKeyword(std::string_view word)
{
    return !word.empty() && bracelessKeywordStarts[static_cast<unsigned char>(word.front())] &&
           std::any_of(std::begin(bracelessKeywords), std::end(bracelessKeywords),
                       [word](std::string_view keyword) { return equalsIgnoringCase(word, keyword); });
}
