// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>

/// A text from a string literal, which QString takes only by name.
inline QString text(const char *utf8) { return QString::fromUtf8(utf8); }
