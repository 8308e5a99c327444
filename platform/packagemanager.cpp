// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/packagemanager.h"

#include <QProcess>
#include <QRegularExpression>

namespace {

constexpr int longestWait{5000}; // milliseconds

// Not everything that dpkg-query accepts is the name of a package: it also takes patterns and options.
bool isPackageName(const QString &text)
{
    static const QRegularExpression name{QStringLiteral("\\A[a-z0-9][a-z0-9+.-]+\\z")};
    return name.match(text).hasMatch();
}

} // namespace

namespace OrvAdmin {

QStringList PackageManager::getInstalledPackagesVersions(const QString &package)
{
    if (!isPackageName(package))
        return {};
    QProcess query;
    query.start(QStringLiteral("dpkg-query"),
                {QStringLiteral("--show"), QStringLiteral("--showformat=${db:Status-Status} ${Version}\\n"), package},
                QIODevice::ReadOnly);
    if (!query.waitForFinished(longestWait)) {
        query.kill();
        query.waitForFinished(longestWait);
        return {};
    }
    if (query.exitStatus() != QProcess::NormalExit || query.exitCode() != 0)
        return {};
    // A removed package whose configuration files were left is still in the database. One with triggers left to run is
    // there whole.
    const QStringList installed{QStringLiteral("installed"), QStringLiteral("triggers-awaited"),
                                QStringLiteral("triggers-pending")};
    const QStringList packages{QString::fromLatin1(query.readAllStandardOutput()).split(QLatin1Char{'\n'})};
    QStringList versions;
    for (const QString &line : packages) {
        const auto statusEnd = line.indexOf(QLatin1Char{' '});
        if (installed.contains(line.left(statusEnd)))
            versions.append(line.mid(statusEnd + 1));
    }
    return versions;
}

} // namespace OrvAdmin
