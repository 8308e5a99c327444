// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/filestamp.h"

#include "common/posix.h"

#include <QFile>

#include <tuple>

#include <sys/stat.h>

FileStamp::FileStamp(const QString &path)
{
    FileStatus status{};
    if (::stat(QFile::encodeName(path).constData(), &status) < 0)
        return;
    m_device = status.st_dev;
    m_inode = status.st_ino;
    m_size = status.st_size;
    m_written = status.st_mtim;
}

bool FileStamp::operator==(const FileStamp &other) const
{
    const auto parts = [](const FileStamp &stamp) {
        return std::tuple{stamp.m_device, stamp.m_inode, stamp.m_size, stamp.m_written.tv_sec, stamp.m_written.tv_nsec};
    };
    return parts(*this) == parts(other);
}
