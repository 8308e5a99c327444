// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>
#include <QStringList>

/// A text of the program or of a test's own, which `QStringLiteral` would only make longer.
inline QString text(const char *utf8) { return QString::fromUtf8(utf8); }

/// The words between the bars of a text.
inline QStringList split(const char *words) { return text(words).split(QLatin1Char{'|'}); }
