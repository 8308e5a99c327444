// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QtGlobal>

#include <ctime>

class QString;

/// What tells one state of the file at a path from another without reading it: which file it is, its size, and when it
/// was written. A symbolic link is followed; all missing files are alike.
class FileStamp final
{
public:
    FileStamp() = default;
    explicit FileStamp(const QString &path);

    bool operator==(const FileStamp &other) const;
    bool operator!=(const FileStamp &other) const { return !(*this == other); }

private:
    quint64 m_device{};
    quint64 m_inode{};
    qint64 m_size{-1};
    timespec m_written{};
};
