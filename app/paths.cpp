// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/paths.h"

namespace paths {

QString configuration() { return QStringLiteral("/etc/dhcp/dhcpd.conf"); }
QString configurationDirectory() { return QStringLiteral("/etc/dhcp/"); }
QString leases() { return QStringLiteral("/var/lib/dhcp/dhcpd.leases"); }
QString leaseDirectory() { return QStringLiteral("/var/lib/dhcp/"); }
QString serverDefaults() { return QStringLiteral("/etc/default/isc-dhcp-server"); }
QString bind9LocalConfiguration() { return QStringLiteral("/etc/bind/named.conf.local"); }
QString backupDirectory() { return QStringLiteral("/var/backups/orv-admin-dhcp/"); }

} // namespace paths
