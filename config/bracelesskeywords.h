// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <string_view>

/// Whether `word`, which may be in any letter case, makes a declaration of a statement without a block.
bool isBracelessKeyword(std::string_view word);
