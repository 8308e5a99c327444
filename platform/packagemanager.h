// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QStringList>

namespace OrvAdmin {

/// What the machine's package database knows.
class PackageManager final
{
public:
    /// The versions of the installed package named `package`, one for each architecture that it is installed for. Empty
    /// when it is not installed or unknown, or when the database cannot be queried.
    static QStringList getInstalledPackagesVersions(const QString &package);
};

} // namespace OrvAdmin
