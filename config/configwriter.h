// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/dhcpdconfigstatement.h"

#include <QByteArray>

/// The text (in UTF-8) of `statement` and everything under it, as it stands in a configuration file; null when it would
/// be longer than 1 GiB.
QByteArray serialize(const DhcpdConfigStatement &statement);
