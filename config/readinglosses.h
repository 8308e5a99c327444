// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <vector>

/// What of a configuration's text its tree does not keep, so that a save loses or changes it. Lines are counted from 1,
/// each is named once.
struct ReadingLosses final
{
    int comments{};
    std::vector<int> quotedTextLines{}; ///< with quoted texts that are split, squeezed or end elsewhere
    std::vector<int> statementLines{};  ///< with statements that become blocks
    std::vector<int> carriageReturnLines{};
};
