// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QString>

#include <optional>

/// Reading and replacing whole files; the one place where the program writes to the machine's files.
namespace fileio {

/// The whole content of the file at `path`. Nothing when it cannot be read (also a directory or a pipe) or is longer
/// than a text may be, with the system's reason in `reason` if given. Never waits; of a file that grows meanwhile, at
/// least what it held at first.
std::optional<QByteArray> readFile(const QString &path, QString *reason = nullptr);

/// Replaces the content of the file at `path`, or creates it: afterwards it holds wholly the old or wholly the new
/// content, under the owner, group, mode, ACL and extended attributes that it had. A symbolic link is followed. The old
/// content is kept among the backups where that can be done and leaves room for the new one. Returns false when the new
/// content is not in place, with the system's reason in `reason` if given.
///
/// The file is renamed over. Where that cannot serve (it is bind-mounted, has several names, or its attributes cannot
/// be given to a new one) it is written in place, but only after a synced copy of the old content was kept; on an error
/// the old content is written back. To a device or pipe `content` is written unchecked.
bool replaceFile(const QString &path, const QByteArray &content, QString *reason = nullptr);

/// Keeps `content`, which could not be written to `path`, among the backups of that file. Returns the path of the copy,
/// empty when it could not be kept either.
QString keepCopy(const QString &path, const QByteArray &content);

} // namespace fileio
