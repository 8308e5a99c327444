// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>

#include <sys/types.h>

/// While it lives, what this process makes is for its user alone, and for that user wholly, whatever the umask is.
class OwnersUmask final
{
public:
    OwnersUmask();
    ~OwnersUmask();
    Q_DISABLE_COPY_MOVE(OwnersUmask)

private:
    mode_t m_before;
};

/// Whether `path` is a folder (no symbolic link to one) that belongs to this user and that nobody else can enter.
bool isPrivateDirectory(const QString &path);

/// Makes the folder `path` unless it exists, and lets this user do everything in one of his that is closed to others.
/// Returns whether it is private then.
bool makePrivateDirectory(const QString &path);

/// Where the program makes a folder of its own: the superuser's, and that of users without a session.
QString ownRuntimeDirectory();

/// The folder for this user's sockets and lock files, the same wherever the user logs in: the superuser's is `own`,
/// that of others the session's runtime directory where it is private, else `own`, made when it is missing. Empty when
/// that is not private either; never a folder that others can enter.
QString runtimeDirectory(const QString &own = ownRuntimeDirectory());

/// Names that folder to Qt where no session has named one, for which Qt would make one of its own among the temporary
/// files of everybody. To be called before the application object is made.
void provideRuntimeDirectory();
