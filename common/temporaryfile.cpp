// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/temporaryfile.h"

#include "common/posix.h"

#include <QRandomGenerator>

#include <algorithm>
#include <array>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

constexpr int suffixLength{6};
constexpr int longestName{255};
constexpr int attempts{100};

QByteArray prefixFor(const QByteArray &name)
{
    static const QByteArray mark{QByteArrayLiteral(".orv-")};
    return '.' + name.left(longestName - 1 - mark.size() - suffixLength) + mark;
}

QByteArray randomSuffix()
{
    constexpr std::array<char, 37> letters{"abcdefghijklmnopqrstuvwxyz0123456789"};
    QByteArray suffix{suffixLength, '\0'};
    std::generate(suffix.begin(), suffix.end(), [&] {
        return letters.at(QRandomGenerator::system()->bounded(static_cast<quint32>(letters.size() - 1)));
    });
    return suffix;
}

bool isLeftOver(const FileDescriptor &file, uid_t owner)
{
    FileStatus status{};
    return file.isOpen() && fstat(file.get(), &status) == 0 && S_ISREG(status.st_mode) &&
           (status.st_uid == owner || status.st_uid == geteuid()) && flock(file.get(), LOCK_EX | LOCK_NB) == 0;
}

} // namespace

TemporaryFile::TemporaryFile(int directory, const QByteArray &name)
    : m_directory{directory}
    , m_prefix{prefixFor(name)}
{
}

TemporaryFile::~TemporaryFile()
{
    if (!m_temporaryName.isEmpty())
        unlinkat(m_directory, m_temporaryName.constData(), 0);
}

std::error_code TemporaryFile::open()
{
    std::error_code error{openOnce()};
    for (int i{1}; i < attempts && error == std::errc::file_exists; ++i)
        error = openOnce();
    return error;
}

std::error_code TemporaryFile::openOnce()
{
    const QByteArray name{m_prefix + randomSuffix()};
    m_file = posix::openAt(m_directory, name, O_RDWR | O_CREAT | O_EXCL | O_NOFOLLOW, S_IRUSR | S_IWUSR);
    if (!m_file.isOpen())
        return posix::lastError();
    m_temporaryName = name;
    if (posix::retried([this] { return flock(m_file.get(), LOCK_EX); }) < 0)
        return posix::lastError();
    FileStatus status{};
    if (fstat(m_file.get(), &status) < 0)
        return posix::lastError();
    if (status.st_nlink > 0)
        return {};
    // Another process took the file for a left-over in the moment before it was locked.
    m_temporaryName.clear();
    return std::make_error_code(std::errc::file_exists);
}

std::error_code TemporaryFile::renameTo(const QByteArray &name)
{
    if (renameat(m_directory, m_temporaryName.constData(), m_directory, name.constData()) < 0)
        return posix::lastError();
    m_temporaryName.clear();
    return {};
}

void TemporaryFile::removeLeftOvers(int directory, const QByteArray &name, uid_t owner)
{
    const QByteArray prefix{prefixFor(name)};
    const QVector<QByteArray> entries{posix::entries(directory)};
    for (const QByteArray &entry : entries) {
        if (entry.size() != prefix.size() + suffixLength || !entry.startsWith(prefix))
            continue;
        // The lock is held until the name is gone, so that its writer cannot be one that is just beginning.
        const FileDescriptor file{posix::openAt(directory, entry, O_RDONLY | O_NOFOLLOW)};
        if (isLeftOver(file, owner))
            unlinkat(directory, entry.constData(), 0);
    }
}
