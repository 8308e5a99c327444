// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasefile.h"

#include "common/posix.h"

#include <QFile>

#include <algorithm>

#include <fcntl.h>

LeaseFile::LeaseFile(const QString &path)
    : m_file{posix::openAt(AT_FDCWD, QFile::encodeName(path), O_RDONLY)}
{
    FileStatus status{};
    if (fstat(m_file.get(), &status) < 0 || !S_ISREG(status.st_mode)) {
        m_file = FileDescriptor{};
        return;
    }
    m_size = status.st_size;
    m_identity = {status.st_dev, status.st_ino};
}

std::optional<std::size_t> LeaseFile::read(qint64 offset, char *buffer, std::size_t count) const
{
    const qint64 left{std::max(m_size - offset, qint64{0})};
    return posix::readAt(m_file.get(), offset, buffer, std::min(count, static_cast<std::size_t>(left)));
}
