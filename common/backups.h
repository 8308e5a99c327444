// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QString>

namespace backups {

/// Keeps `content`, a version of the file at the absolute `path`, in the backup folder: readable by its owner only,
/// synced, named after the path and the time (UTC). Of each path the first version and the newest twenty stay; a file
/// with no valid time in its name is no version, and is left alone. Content that equals the newest version is not kept
/// again.
/// Returns the path of the version, empty when it could not be kept; `isNew`, if given, tells whether it was made now.
QString keep(const QString &path, const QByteArray &content, bool *isNew = nullptr);

/// Removes a `version` that keep() has made, for the room that it takes. Returns whether it is gone.
bool giveUp(const QString &version);

/// Keeps `content`, the content of `name` in the open `directory`, in that directory, as keep() does but without
/// removing older versions. Returns the name of the version, empty when it could not be kept.
QByteArray keepBeside(int directory, const QByteArray &name, const QByteArray &content);

} // namespace backups
