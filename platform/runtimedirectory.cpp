// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/runtimedirectory.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QStandardPaths>

#include <optional>

#include <sys/stat.h>
#include <unistd.h>

namespace {

/// Who may do what with the folder `path` (no symbolic link to one) of this user; nothing where that is none.
std::optional<mode_t> accessToOwnDirectory(const QString &path)
{
    struct stat status
    {
    };
    // A trailing slash would make lstat() follow a symbolic link.
    if (!QDir::isAbsolutePath(path) || lstat(QFile::encodeName(QDir::cleanPath(path)).constData(), &status) != 0 ||
        !S_ISDIR(status.st_mode) || status.st_uid != geteuid())
        return {};
    return status.st_mode & ACCESSPERMS;
}

} // namespace

OwnersUmask::OwnersUmask()
    : m_before{umask(S_IRWXG | S_IRWXO)}
{
}

OwnersUmask::~OwnersUmask() { umask(m_before); }

bool isPrivateDirectory(const QString &path) { return accessToOwnDirectory(path) == mode_t{S_IRWXU}; }

bool makePrivateDirectory(const QString &path)
{
    const QByteArray name{QFile::encodeName(path)};
    if (!QFileInfo::exists(path)) {
        const OwnersUmask mask;
        QDir{}.mkpath(QFileInfo{path}.path());
        mkdir(name.constData(), S_IRWXU);
    } else if (const auto access = accessToOwnDirectory(path); access && (*access & (S_IRWXG | S_IRWXO)) == 0) {
        // Left by a version that let a umask close it to its own user. Others cannot have put anything into it.
        chmod(name.constData(), S_IRWXU);
    }
    return isPrivateDirectory(path);
}

QString ownRuntimeDirectory()
{
    const QString parent{geteuid() == 0 ? QStringLiteral("/run")
                                        : QStandardPaths::writableLocation(QStandardPaths::GenericCacheLocation)};
    return parent + QStringLiteral("/orv-admin-dhcp");
}

QString runtimeDirectory(const QString &own)
{
    // A superuser has a session in one place and none in another, by "sudo" or at a console.
    if (geteuid() == 0)
        return makePrivateDirectory(own) ? own : QString{};
    for (const QString &session :
         {qEnvironmentVariable("XDG_RUNTIME_DIR"), QStringLiteral("/run/user/") + QString::number(geteuid())}) {
        if (isPrivateDirectory(session))
            return session;
    }
    return makePrivateDirectory(own) ? own : QString{};
}

void provideRuntimeDirectory()
{
    const QString directory{qEnvironmentVariableIsEmpty("XDG_RUNTIME_DIR") ? runtimeDirectory() : QString{}};
    if (!directory.isEmpty())
        qputenv("XDG_RUNTIME_DIR", QFile::encodeName(directory));
}
