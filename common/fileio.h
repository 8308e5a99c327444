// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QString>

#include <optional>

/// Reading and replacing whole files; the one place where the program writes to the machine's files.
namespace fileio {

/// The whole content of the file at `path`. Nothing when it cannot be read (also a directory), with the system's
/// reason in `reason` if given.
std::optional<QByteArray> readFile(const QString &path, QString *reason = nullptr);

/// Replaces the content of the file at `path`, or creates it: afterwards it holds wholly the old or wholly the new
/// content. Returns false when the new content is not in place, with the system's reason in `reason` if given.
bool replaceFile(const QString &path, const QByteArray &content, QString *reason = nullptr);

} // namespace fileio
