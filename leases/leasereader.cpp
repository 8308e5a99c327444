// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasereader.h"

#include <QFile>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>

namespace {

// Small enough that a piece is still in the processor's cache when it is parsed.
constexpr std::size_t pieceSize{std::size_t{1} << 18U};

// Of what was read, so much at the beginning and at the end is compared, and a sample each so many bytes.
constexpr int comparedAtEnds{4096};
constexpr int sampleSize{64};
constexpr qint64 sampleDistance{1 << 20};

} // namespace

LeaseFile::LeaseFile(const QString &path)
{
    // O_NONBLOCK: do not wait for the writer of a pipe. For a regular file it means nothing.
    m_descriptor = ::open(QFile::encodeName(path).constData(), O_RDONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK);
    if (m_descriptor < 0) {
        return;
    }
    struct stat status
    {
    };
    if (::fstat(m_descriptor, &status) != 0 || !S_ISREG(status.st_mode)) {
        ::close(m_descriptor);
        m_descriptor = -1;
        return;
    }
    m_size = status.st_size;
    m_device = status.st_dev;
    m_inode = status.st_ino;
}

LeaseFile::~LeaseFile()
{
    if (m_descriptor >= 0) {
        ::close(m_descriptor);
    }
}

std::optional<std::size_t> LeaseFile::read(qint64 offset, char *buffer, std::size_t count) const
{
    const auto left{static_cast<std::size_t>(std::max(m_size - offset, qint64{0}))};
    const std::size_t wanted{std::min(count, left)};
    std::size_t done{0};
    while (done < wanted) {
        const ssize_t got{::pread(m_descriptor, buffer + done, wanted - done, offset + static_cast<qint64>(done))};
        if (got < 0 && errno != EINTR) {
            return {};
        }
        if (got == 0) { // the file was cut short meanwhile
            break;
        }
        done += static_cast<std::size_t>(std::max(got, ssize_t{0}));
    }
    return done;
}

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
    const auto isUnchanged{[&file](qint64 offset, const QByteArray &bytes) {
        QByteArray now{bytes.size(), Qt::Uninitialized};
        const auto size{static_cast<std::size_t>(now.size())};
        return file.read(offset, now.data(), size) == size && now == bytes;
    }};
    return m_position > 0 && m_parser.canContinue() && file.isOpen() && file.isSameFile(m_device, m_inode) &&
           file.size() >= m_position && isUnchanged(m_position - m_lastBytes.size(), m_lastBytes) &&
           std::all_of(m_samples.cbegin(), m_samples.cend(),
                       [&](const Sample &sample) { return isUnchanged(sample.offset, sample.bytes); });
}

bool LeaseReader::readOn(const LeaseFile &file)
{
    if (!file.isOpen()) {
        return false;
    }
    m_device = file.device();
    m_inode = file.inode();
    if (m_position == 0) {
        m_table.reserveForFile(file.size());
    }
    std::vector<char> piece(
        std::min(pieceSize, static_cast<std::size_t>(std::max(file.size() - m_position, qint64{0}))));
    while (m_position < file.size()) {
        const auto got{file.read(m_position, piece.data(), piece.size())};
        if (!got) {
            return false;
        }
        if (*got == 0) {
            break;
        }
        const std::string_view bytes{piece.data(), *got};
        remember(bytes);
        m_parser.feed(bytes);
        m_position += static_cast<qint64>(bytes.size());
    }
    m_parser.finish();
    return true;
}

/// Keeps samples of the bytes that stand at m_position in the file.
void LeaseReader::remember(std::string_view bytes)
{
    if (m_samples.empty() || m_position >= m_samples.back().offset + sampleDistance) {
        m_samples.push_back({m_position, {}});
    }
    const auto read{QByteArray::fromRawData(bytes.data(), static_cast<int>(bytes.size()))};
    QByteArray &sample{m_samples.back().bytes};
    // One that is not full yet ends where these bytes begin.
    sample += read.left((m_samples.size() == 1 ? comparedAtEnds : sampleSize) - sample.size());
    m_lastBytes += read.right(comparedAtEnds);
    m_lastBytes = m_lastBytes.right(comparedAtEnds);
}
