// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/posix.h"

#include <algorithm>
#include <memory>
#include <new>
#include <utility>

#include <dirent.h>
#include <fcntl.h>
#include <sys/mman.h>
#include <unistd.h>

namespace {

// How much a file may grow while it is read before the rest is left for a later reading.
constexpr qint64 growthLimit{16LL * 1024 * 1024};
constexpr qint64 growthStep{64LL * 1024};

std::error_code readRegular(int descriptor, qint64 size, QByteArray &content, qint64 largest)
{
    const qint64 limit{std::min(size + growthLimit, largest)};
    qint64 length{};
    content.clear();
    while (length == content.size() && length < limit) {
        content.resize(static_cast<int>(std::min(std::max(size, length) + growthStep, limit)));
        const auto room = static_cast<std::size_t>(content.size() - length);
        const std::optional<std::size_t> count{posix::readAt(descriptor, length, content.data() + length, room)};
        if (!count)
            return posix::lastError();
        length += static_cast<qint64>(*count);
    }
    content.truncate(static_cast<int>(length));
    return {};
}

bool isEmptyDevice(int descriptor)
{
    char byte{};
    return posix::retried([&] { return read(descriptor, &byte, sizeof byte); }) == 0;
}

} // namespace

namespace posix {

std::error_code lastError() { return {errno, std::generic_category()}; }

FileDescriptor openAt(int directory, const QByteArray &name, int flags, mode_t mode)
{
    return FileDescriptor{
        retried([&] { return openat(directory, name.constData(), flags | O_CLOEXEC | O_NONBLOCK | O_NOCTTY, mode); })};
}

FileDescriptor memoryFile(const QByteArray &name, const QByteArray &content)
{
    FileDescriptor file{memfd_create(name.constData(), MFD_CLOEXEC)};
    return file.isOpen() && !writeAll(file.get(), content) ? std::move(file) : FileDescriptor{};
}

QVector<QByteArray> entries(int directory)
{
    QVector<QByteArray> names;
    FileDescriptor readable{openAt(directory, QByteArrayLiteral("."), O_RDONLY | O_DIRECTORY)};
    const std::unique_ptr<DIR, int (*)(DIR *)> stream{fdopendir(readable.get()), closedir};
    if (stream)
        readable.release(); // the stream closes it
    while (const auto *entry = stream ? readdir(stream.get()) : nullptr)
        names.append(entry->d_name);
    return names;
}

std::optional<std::size_t> readAt(int descriptor, qint64 offset, char *buffer, std::size_t count)
{
    std::size_t done{};
    while (done < count) {
        const ssize_t got{retried(
            [&] { return pread(descriptor, buffer + done, count - done, offset + static_cast<qint64>(done)); })};
        if (got < 0)
            return std::nullopt;
        if (got == 0)
            break;
        done += static_cast<std::size_t>(got);
    }
    return done;
}

std::error_code readAll(int descriptor, QByteArray &content, qint64 limit)
{
    FileStatus status{};
    if (fstat(descriptor, &status) < 0)
        return lastError();
    if (S_ISDIR(status.st_mode))
        return std::make_error_code(std::errc::is_a_directory);
    if (S_ISCHR(status.st_mode) && isEmptyDevice(descriptor)) {
        content.clear();
        return {};
    }
    if (!S_ISREG(status.st_mode))
        return std::make_error_code(std::errc::operation_not_supported);
    if (status.st_size > limit)
        return std::make_error_code(std::errc::file_too_large);
    try {
        return readRegular(descriptor, status.st_size, content, limit);
    } catch (const std::bad_alloc &) {
        return std::make_error_code(std::errc::not_enough_memory);
    }
}

std::error_code writeAll(int descriptor, const QByteArray &content)
{
    for (int done{}; done < content.size();) {
        const auto rest = static_cast<size_t>(content.size() - done);
        const ssize_t count{retried([&] { return pwrite(descriptor, content.constData() + done, rest, done); })};
        if (count < 0)
            return lastError();
        if (count == 0)
            return std::make_error_code(std::errc::io_error);
        done += static_cast<int>(count);
    }
    return {};
}

std::error_code sync(int descriptor)
{
    return retried([&] { return fsync(descriptor); }) < 0 ? lastError() : std::error_code{};
}

void syncDirectory(int directory)
{
    const FileDescriptor readable{openAt(directory, QByteArrayLiteral("."), O_RDONLY | O_DIRECTORY)};
    if (readable.isOpen())
        sync(readable.get());
}

} // namespace posix
