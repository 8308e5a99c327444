// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "common/filedescriptor.h"

#include <QByteArray>

#include <system_error>

#include <sys/types.h>

/// A new file beside the one that it is going to replace, readable by its owner only, gone again unless it was renamed.
///
/// Its name is recognisable and it is locked while its writer lives, so that a later writer can tell what a killed one
/// left behind and remove it.
class TemporaryFile final
{
public:
    /// `name` is the name in `directory` that the file will get; the directory stays open longer than this.
    TemporaryFile(int directory, const QByteArray &name);
    ~TemporaryFile();
    Q_DISABLE_COPY_MOVE(TemporaryFile)

    std::error_code open();
    int descriptor() const { return m_file.get(); }

    /// Takes the place of `name` in the directory.
    std::error_code renameTo(const QByteArray &name);

    /// Removes what killed writers of `name` left in `directory`: files of `owner` or of this process's user.
    static void removeLeftOvers(int directory, const QByteArray &name, uid_t owner);

private:
    std::error_code openOnce();

    int m_directory;
    QByteArray m_prefix;
    QByteArray m_temporaryName; // empty: no file of that name to remove
    FileDescriptor m_file;
};
