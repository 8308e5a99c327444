// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QRegularExpression>

/// A hardware address anywhere in a text, with colons or hyphens (mixed, or one more at the end), or in the dotted form
/// with anything around it. The looseness is deliberate.
const QRegularExpression &macRegExp();

/// A whole text that is a domain name in double quotes.
const QRegularExpression &domainRegExp();
