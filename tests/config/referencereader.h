// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "tests/config/confignode.h"

/// What a configuration's text holds, found character by character without regard to speed: the judge of the program's
/// reader. It knows no limit of nesting.
ConfigNode readByReference(const QString &text);

/// The deepest nesting of blocks in `node`, not counting itself.
int blockDepth(const ConfigNode &node);
