// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QString>

/// The path of the real DHCP server: from the folder of fetched tools (environment variable ORV_TOOLS_DIR), through
/// PATH, or in /usr/sbin. Empty when there is none.
QString realDhcpd();

/// What `dhcpd`, the path of a DHCP server, first complains about in a configuration, as "line 3: expecting
/// semicolon."; empty when it accepts it. Its whole output when it gave no verdict that names a line.
QString complaintOf(const QString &dhcpd, const QByteArray &configuration);
