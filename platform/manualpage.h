// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>

/// The bundled manual page as HTML; `orvInit` makes it known.
QString manualPageHtml();
