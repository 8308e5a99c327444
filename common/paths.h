// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>

/// The files and directories of the machine that the program works on, as absolute paths.
///
/// They are functions, not constants, so that an executable chooses their definition when it is linked: the product's
/// are fixed, the tests' lie under a folder of their own.
namespace paths {

QString configuration();           ///< the DHCP server's configuration file
QString configurationDirectory();  ///< its directory, with a slash at the end
QString leases();                  ///< the DHCP server's lease database
QString leaseDirectory();          ///< its directory, with a slash at the end
QString serverDefaults();          ///< the service's defaults file, which names the served interfaces
QString bind9LocalConfiguration(); ///< the usual bind9 file for local zones
QString backupDirectory();         ///< where replaced versions of files are kept

} // namespace paths
