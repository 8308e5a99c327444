// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QStringList>

/// The theme that every other falls back on; the bundled icons are part of it.
inline const QLatin1String fallbackIconTheme{"hicolor"};

/// The best installed icon theme below `searchPaths`: the first that has at least half of the icons `names`, its
/// parents' included but not the fallback theme's. A dark theme comes first for a dark palette and late for another, a
/// high-contrast one always late. Empty when no theme has half of them: a patchwork would look worse than the bundled
/// icons.
QString suitableIconTheme(const QStringList &searchPaths, const QStringList &names, bool darkPalette);
