// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "common/filedescriptor.h"

#include <QString>

#include <optional>

#include <sys/types.h>

/// A lease file opened for reading: a regular file, taken to be as long as it was then, whatever is written to it
/// meanwhile.
class LeaseFile final
{
public:
    /// What distinguishes a file from every other that exists at the same time.
    struct Identity
    {
        bool operator==(const Identity &other) const { return device == other.device && inode == other.inode; }

        dev_t device{};
        ino_t inode{};
    };

    explicit LeaseFile(const QString &path);

    bool isOpen() const { return m_file.isOpen(); }
    qint64 size() const { return m_size; }
    const Identity &identity() const { return m_identity; }

    /// Reads up to `count` bytes from `offset` on into `buffer`: fewer where the file ends, none beyond size(). Nothing
    /// on an error.
    std::optional<std::size_t> read(qint64 offset, char *buffer, std::size_t count) const;

private:
    FileDescriptor m_file;
    qint64 m_size{0};
    Identity m_identity;
};
