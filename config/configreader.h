// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/dhcpdconfigdeclaration.h"
#include "config/readinglosses.h"

#include <memory>
#include <string_view>

/// Reads the text of a configuration (in UTF-8) into a new "All network" declaration, whose parent is `top` but which
/// is not among its children yet. Any text gives a tree, syntax errors are not reported; nothing when blocks are nested
/// deeper than maximumBlockDepth. What the tree does not keep is noted in `losses`
/// if given.
std::unique_ptr<DhcpdConfigDeclaration> readConfiguration(std::string_view text, DhcpdConfigDeclaration &top,
                                                          ReadingLosses *losses = nullptr);
