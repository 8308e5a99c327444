// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "tests/config/confignode.h"

/// Reads a configuration character by character, without regard to speed, for comparison with the program's reader. It
/// has no limit of nesting.
ConfigNode readByReference(const QString &text);

/// The deepest nesting of blocks in `node`, not counting `node` itself.
int blockDepth(const ConfigNode &node);
