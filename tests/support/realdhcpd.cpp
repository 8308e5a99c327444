// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/support/realdhcpd.h"

#include "tests/support/temporaryroot.h"

#include <QProcess>
#include <QRegularExpression>
#include <QStandardPaths>
#include <QTemporaryDir>

QString realDhcpd()
{
    const QString name{QStringLiteral("dhcpd")};
    const QString toolsFolder{qEnvironmentVariable("ORV_TOOLS_DIR")};
    const QStringList folders[]{{toolsFolder + QStringLiteral("/isc-dhcp-server/usr/sbin")},
                                {/* those of PATH */},
                                {QStringLiteral("/usr/sbin")}};
    for (const QStringList &searched : folders) {
        if (QString path{QStandardPaths::findExecutable(name, searched)}; !path.isEmpty())
            return path;
    }
    return {};
}

QString complaintOf(const QString &dhcpd, const QByteArray &configuration)
{
    const QTemporaryDir folder;
    const QString file{folder.filePath(QStringLiteral("dhcpd.conf"))};
    const QString leases{folder.filePath(QStringLiteral("dhcpd.leases"))};
    writeTestFile(file, configuration);
    writeTestFile(leases, {});

    QProcess process;
    process.setProcessChannelMode(QProcess::MergedChannels);
    process.start(dhcpd, {QStringLiteral("-t"), QStringLiteral("-cf"), file, QStringLiteral("-lf"), leases});
    const bool hasExited{process.waitForFinished(-1) && process.exitStatus() == QProcess::NormalExit};
    if (hasExited && process.exitCode() == 0)
        return {};
    const QString output{QString::fromUtf8(process.readAll())};
    const QRegularExpression complaint{QRegularExpression::escape(file) + QStringLiteral(" (line [0-9]+: .*)")};
    const QRegularExpressionMatch match{complaint.match(output)};
    return match.hasMatch() ? match.captured(1) : process.errorString() + output;
}
