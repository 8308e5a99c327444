// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/bracelesskeywords.h"

#include "config/wordlist.h"

#include <algorithm>
#include <array>

namespace {

constexpr std::string_view keywords[]{"range", "subclass", "fixed-address"};

// Whether a word with that first byte may be one of them: most words are told apart by it. Beyond ASCII there are case
// variants of ASCII letters.
constexpr std::array<bool, 256> firstBytes{[] {
    std::array<bool, 256> table{};
    for (const std::string_view keyword : keywords) {
        constexpr std::size_t caseDistance{'a' - 'A'};
        const std::size_t first{static_cast<unsigned char>(keyword.front())};
        table[first] = table[first - caseDistance] = true;
    }
    for (std::size_t byte{0x80}; byte < table.size(); ++byte)
        table[byte] = true;
    return table;
}()};

} // namespace

bool isBracelessKeyword(std::string_view word)
{
    return !word.empty() && firstBytes[static_cast<unsigned char>(word.front())] &&
           std::any_of(std::begin(keywords), std::end(keywords),
                       [word](std::string_view keyword) { return equalsIgnoringCase(word, keyword); });
}
