// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>

/// The bundled manual page in the language of the default locale, or else in English, as HTML; `orvInit` makes it
/// known.
QString manualPageHtml();
