// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/dhcpdconfigstatement.h"

#include <QByteArray>

/// The text (in UTF-8) of `statement` and everything under it, as it stands in a configuration file; null when it could
/// not be read again: when it would be longer than a text may be, or blocks nested deeper than maximumBlockDepth.
QByteArray serialize(const DhcpdConfigStatement &statement);
