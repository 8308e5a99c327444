// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leaseparser.h"
#include "leases/leasetable.h"

#include <QByteArray>
#include <QString>

#include <sys/types.h>

#include <optional>
#include <string_view>
#include <vector>

/// A lease file opened for reading: a regular file, as long as it was then, whatever is written to it meanwhile.
class LeaseFile final
{
public:
    explicit LeaseFile(const QString &path);
    ~LeaseFile();
    Q_DISABLE_COPY_MOVE(LeaseFile)

    bool isOpen() const { return m_descriptor >= 0; }
    qint64 size() const { return m_size; }
    bool isSameFile(dev_t device, ino_t inode) const { return device == m_device && inode == m_inode; }
    dev_t device() const { return m_device; }
    ino_t inode() const { return m_inode; }

    /// Reads up to `count` bytes from `offset` on into `buffer`: fewer where the file ends, none beyond size(). Nothing
    /// on an error.
    std::optional<std::size_t> read(qint64 offset, char *buffer, std::size_t count) const;

private:
    int m_descriptor{-1};
    qint64 m_size{0};
    dev_t m_device{};
    ino_t m_inode{};
};

/// Reads lease files into a table: whole ones, or what was appended to the one that was read last.
class LeaseReader final
{
public:
    explicit LeaseReader(LeaseTable &table);
    Q_DISABLE_COPY_MOVE(LeaseReader)

    /// Empties the table; what is read next is a whole file.
    void clear();

    /// Whether `file` is the one read last and begins with what was read then. Its beginning, its end and samples
    /// between are compared.
    bool continues(const LeaseFile &file) const;
    /// The number of bytes read so far.
    qint64 position() const { return m_position; }

    /// Reads `file` from position() to its end; its leases are pending in the table. Returns false if it cannot be.
    bool readOn(const LeaseFile &file);

private:
    /// Bytes read at some offset, to recognise the file by.
    struct Sample
    {
        qint64 offset;
        QByteArray bytes;
    };

    void remember(std::string_view bytes);

    LeaseTable &m_table;
    LeaseParser m_parser;
    dev_t m_device{};
    ino_t m_inode{};
    qint64 m_position{0};
    std::vector<Sample> m_samples;
    QByteArray m_lastBytes; // those before m_position
};
