// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <system_error>

namespace fileattributes {

/// Gives the open file `to` the owner, group, ACL, extended attributes and mode of the open file `from`, changing only
/// what differs. Stops at the first that cannot be given, and reports it.
std::error_code copy(int from, int to);

} // namespace fileattributes
