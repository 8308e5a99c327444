// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasereader.h"

#include "common/vectorregisters.h"
#include "leases/leasetable.h"

#include <algorithm>
#include <optional>

namespace {

// Small enough that a piece is still in the processor's cache when it is parsed.
constexpr std::size_t pieceSize{std::size_t{1} << 18U};

// How much of what was read is compared: at the beginning, which is all of a small file, at the end, and in samples at
// regular distances.
constexpr int comparedAtBeginning{1 << 16};
constexpr int comparedAtEnd{4096};
constexpr int sampleSize{64};
constexpr qint64 sampleDistance{1 << 20};

} // namespace

LeaseReader::LeaseReader(LeaseTable &table)
    : m_table{table}
    , m_parser{table}
{
}

void LeaseReader::clear()
{
    m_parser.clear();
    m_position = 0;
    m_samples.clear();
    m_lastBytes.clear();
}

bool LeaseReader::continues(const LeaseFile &file) const
{
    const auto isUnchanged = [&file](qint64 offset, const QByteArray &bytes) {
        QByteArray now{bytes.size(), Qt::Uninitialized};
        const auto size = static_cast<std::size_t>(now.size());
        return file.read(offset, now.data(), size) == size && now == bytes;
    };
    return m_position > 0 && m_parser.canContinue() && file.identity() == m_identity && file.size() >= m_position &&
           isUnchanged(m_position - m_lastBytes.size(), m_lastBytes) &&
           std::all_of(m_samples.cbegin(), m_samples.cend(),
                       [&](const Sample &sample) { return isUnchanged(sample.offset, sample.bytes); });
}

bool LeaseReader::readOn(const LeaseFile &file)
{
    if (!file.isOpen())
        return false;
    m_identity = file.identity();
    if (m_position == 0)
        m_table.reserveForFile(file.size());
    std::vector<char> piece(pieceSize);
    clearVectorRegisters();
    while (m_position < file.size()) {
        const std::optional<std::size_t> got{file.read(m_position, piece.data(), piece.size())};
        if (!got)
            return false;
        if (*got == 0)
            break;
        const std::string_view bytes{piece.data(), *got};
        remember(bytes);
        m_parser.feed(bytes);
        m_position += static_cast<qint64>(bytes.size());
    }
    m_parser.finish();
    return true;
}

/// Keeps samples of `bytes`, which are at m_position in the file.
void LeaseReader::remember(std::string_view bytes)
{
    if (m_samples.empty() || m_position >= m_samples.back().offset + sampleDistance)
        m_samples.push_back({m_position, {}});
    const QByteArray read{QByteArray::fromRawData(bytes.data(), static_cast<int>(bytes.size()))};
    QByteArray &sample{m_samples.back().bytes};
    // A sample that is not full yet ends where these bytes begin.
    sample += read.left((m_samples.size() == 1 ? comparedAtBeginning : sampleSize) - sample.size());
    m_lastBytes += read.right(comparedAtEnd);
    m_lastBytes = m_lastBytes.right(comparedAtEnd);
}
