// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QString>
#include <QTemporaryDir>

/// A folder that stands for the machine's root directory while it exists: every path of common/paths.h lies in it.
/// The directories of those paths exist, the files do not.
class TemporaryRoot final
{
public:
    TemporaryRoot();
    ~TemporaryRoot();
    Q_DISABLE_COPY_MOVE(TemporaryRoot)

    /// The absolute path of `path`, given as on a real machine ("/etc/dhcp/dhcpd.conf").
    QString path(const QString &path) const;

private:
    QTemporaryDir m_folder;
};

/// Writes `content` over the file at `path`; fails the test when it cannot.
void writeTestFile(const QString &path, const QByteArray &content);
/// The content of the file at `path`; fails the test when it cannot be read.
QByteArray readTestFile(const QString &path);
