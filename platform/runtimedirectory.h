// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>

/// Whether `path` is a folder (no symbolic link to one) that belongs to this user and that nobody else can enter.
bool isPrivateDirectory(const QString &path);

/// Makes the folder `path` unless it exists. Returns whether it is private then.
bool makePrivateDirectory(const QString &path);

/// Where the program makes a folder of its own when the session has no runtime directory.
QString ownRuntimeDirectory();

/// The folder for this user's sockets and lock files: the session's runtime directory where it is private, else `own`,
/// made when it is missing. Empty when that is not private either; never a folder that others can enter.
QString runtimeDirectory(const QString &own = ownRuntimeDirectory());
