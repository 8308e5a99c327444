// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leasefile.h"
#include "leases/leaseparser.h"

#include <QByteArray>

#include <string_view>
#include <vector>

class LeaseTable;

/// Reads lease files into a table: whole ones, or what was appended to the one that was read last.
class LeaseReader final
{
public:
    explicit LeaseReader(LeaseTable &table);
    Q_DISABLE_COPY_MOVE(LeaseReader)

    /// Empties the table; what is read next is a whole file.
    void clear();

    /// Whether `file` is the one read last and begins with what was read then. A small file is compared as a whole, of
    /// a large one its beginning, its end and samples between.
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
    LeaseFile::Identity m_identity;
    qint64 m_position{0};
    std::vector<Sample> m_samples;
    QByteArray m_lastBytes; // those before m_position
};
