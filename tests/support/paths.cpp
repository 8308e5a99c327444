// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/paths.h"

namespace {

// The folder that stands for the machine's root directory; the test sets it before it makes anything that uses a path.
QString underTestRoot(const QString &path) { return qEnvironmentVariable("ORV_TEST_ROOT") + path; }

} // namespace

namespace paths {

QString configuration() { return underTestRoot(QStringLiteral("/etc/dhcp/dhcpd.conf")); }
QString configurationDirectory() { return underTestRoot(QStringLiteral("/etc/dhcp/")); }
QString leases() { return underTestRoot(QStringLiteral("/var/lib/dhcp/dhcpd.leases")); }
QString leaseDirectory() { return underTestRoot(QStringLiteral("/var/lib/dhcp/")); }
QString serverDefaults() { return underTestRoot(QStringLiteral("/etc/default/isc-dhcp-server")); }
QString bind9LocalConfiguration() { return underTestRoot(QStringLiteral("/etc/bind/named.conf.local")); }
QString backupDirectory() { return underTestRoot(QStringLiteral("/var/backups/orv-admin-dhcp/")); }

} // namespace paths
