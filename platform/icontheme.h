// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QStringList>

/// The installed icon theme below `searchPaths` that has the most of the icons `names`, its parents' included. A dark
/// theme is taken for a dark palette only and a high-contrast one last, as long as another has at least half of the
/// names. Empty when no theme has half of them: a patchwork would look worse than the bundled icons.
QString suitableIconTheme(const QStringList &searchPaths, const QStringList &names, bool darkPalette);
