// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "common/filedescriptor.h"

#include <QByteArray>
#include <QVector>

#include <cerrno>
#include <limits>
#include <optional>
#include <system_error>

#include <sys/stat.h>

using FileStatus = struct stat;

/// System calls on files, repeated where a signal interrupts them. Errors are values; an empty one means success.
namespace posix {

/// What the last system call reported.
std::error_code lastError();

/// Calls `call` again for as long as a signal interrupts it.
template<typename Call>
auto retried(Call call)
{
    auto result = call();
    while (result < 0 && errno == EINTR)
        result = call();
    return result;
}

/// Opens `name` in `directory` (AT_FDCWD: the working one); never waits, never leaves the file to a child process.
FileDescriptor openAt(int directory, const QByteArray &name, int flags, mode_t mode = 0);

/// A file in memory that holds `content`, not left to child processes; closed when the system has none to give. `name`
/// is shown to whoever lists the open files.
FileDescriptor memoryFile(const QByteArray &name, const QByteArray &content);

/// The names in `directory`, in no order; none when it cannot be read.
QVector<QByteArray> entries(int directory);

/// Reads `count` bytes from `offset` on into `buffer`, fewer only where the file ends. Returns how many, nothing on an
/// error, which lastError() tells.
std::optional<std::size_t> readAt(int descriptor, qint64 offset, char *buffer, std::size_t count);

constexpr qint64 largestContent{std::numeric_limits<int>::max() - 64}; // QByteArray counts in int

/// Reads a regular file from its start, or a device that is empty (as /dev/null is); other kinds are refused, and files
/// that have more bytes than `limit`.
std::error_code readAll(int descriptor, QByteArray &content, qint64 limit = largestContent);

/// Writes the whole of `content` to the start of a regular file; what follows there stays.
std::error_code writeAll(int descriptor, const QByteArray &content);

std::error_code sync(int descriptor);

/// Syncs the names in `directory`; failure is ignored, as nobody could act on it.
void syncDirectory(int directory);

} // namespace posix
