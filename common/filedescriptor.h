// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QVector>

#include <cerrno>
#include <limits>
#include <system_error>

#include <sys/stat.h>

using FileStatus = struct stat;

/// An open file, closed with its owner.
class FileDescriptor final
{
public:
    explicit FileDescriptor(int descriptor = -1);
    ~FileDescriptor();
    FileDescriptor(FileDescriptor &&other) noexcept;
    FileDescriptor &operator=(FileDescriptor &&other) noexcept;
    Q_DISABLE_COPY(FileDescriptor)

    bool isOpen() const { return m_descriptor >= 0; }
    int get() const { return m_descriptor; }
    /// The descriptor, for another owner to close.
    int release();

private:
    int m_descriptor;
};

/// The calls of the system that the functions for whole files share. Errors are values; none is an empty one.
namespace posix {

/// What the last call of the system reported.
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

/// The names in `directory`, in no order; none when it cannot be read.
QVector<QByteArray> entries(int directory);

constexpr qint64 largestContent{std::numeric_limits<int>::max() - 64}; // QByteArray counts in int

/// Reads a regular file from its start, or a device that is empty (as /dev/null is); other kinds are refused, and files
/// that have more bytes than `limit`.
std::error_code readAll(int descriptor, QByteArray &content, qint64 limit = largestContent);

/// Writes the whole of `content` to the start of a regular file; what follows there stays.
std::error_code writeAll(int descriptor, const QByteArray &content);

std::error_code sync(int descriptor);

/// Makes the names in `directory` last; a file system that cannot is not an error that anyone could act on.
void syncDirectory(int directory);

} // namespace posix
