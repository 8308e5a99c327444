// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>

/// Sets the attributes that all windows of the application share. Called once, before the application object is made.
void orvSetAttributes();

/// Prepares the application for a desktop without the integration library: keeps the version and the description for
/// the Help menu, makes the bundled icons known and, where the desktop names no icon theme, picks an installed one.
/// Called once, after the application object was made.
void orvInit(const char *version, const char *description);

/// The description that `orvInit` was given, in English; empty before.
QString orvDescription();
