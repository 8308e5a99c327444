// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/fileio.h"

#include "common/backups.h"
#include "common/fileattributes.h"
#include "common/posix.h"
#include "common/temporaryfile.h"
#include "common/textencoding.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <array>
#include <climits>
#include <csignal>
#include <ctime>

#include <fcntl.h>
#include <poll.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

using ExtendedStatus = struct statx;

constexpr int longestLinkChain{40}; // as the kernel's
constexpr int pipePatience{1000};   // ms to wait until somebody reads from a full pipe

// Makes a write past the size limit or to a pipe without a reader fail instead of ending the process.
class FatalSignalsBlocked final
{
public:
    FatalSignalsBlocked()
    {
        sigemptyset(&m_signals);
        sigaddset(&m_signals, SIGPIPE);
        sigaddset(&m_signals, SIGXFSZ);
        pthread_sigmask(SIG_BLOCK, &m_signals, &m_before);
    }

    ~FatalSignalsBlocked()
    {
        const timespec noTime{};
        while (posix::retried([&] { return sigtimedwait(&m_signals, nullptr, &noTime); }) > 0) {
        }
        pthread_sigmask(SIG_SETMASK, &m_before, nullptr);
    }

    Q_DISABLE_COPY_MOVE(FatalSignalsBlocked)

private:
    sigset_t m_signals{};
    sigset_t m_before{};
};

// Where a file is once every symbolic link at the end of its path is followed.
struct Location
{
    QByteArray directory;
    QByteArray name;

    QString path() const
    {
        const QFileInfo parent{QFile::decodeName(directory)};
        const QString canonical{parent.canonicalFilePath()};
        return QDir{canonical.isEmpty() ? QDir::cleanPath(parent.absoluteFilePath()) : canonical}.filePath(
            QFile::decodeName(name));
    }
};

Location split(const QByteArray &path)
{
    const QByteArray::size_type slash{path.lastIndexOf('/')};
    return {slash < 0 ? QByteArrayLiteral("./") : path.left(slash + 1), path.mid(slash + 1)};
}

std::error_code locate(const QString &path, Location &location)
{
    location = split(QFile::encodeName(path));
    for (int i{}; i < longestLinkChain; ++i) {
        std::array<char, PATH_MAX> target{};
        const QByteArray link{location.directory + location.name};
        const ssize_t length{readlink(link.constData(), target.data(), target.size())};
        if (length < 0)
            return {}; // not a link, or nothing there, or opening it will tell
        const QByteArray next{target.data(), static_cast<int>(length)};
        location = split(next.startsWith('/') ? next : location.directory + next);
    }
    return std::make_error_code(std::errc::too_many_symbolic_link_levels);
}

void writeUnchecked(int descriptor, const QByteArray &content)
{
    for (int done{}; done < content.size();) {
        const auto rest = static_cast<size_t>(content.size() - done);
        const ssize_t count{posix::retried([&] { return write(descriptor, content.constData() + done, rest); })};
        if (count > 0) {
            done += static_cast<int>(count);
            continue;
        }
        pollfd full{descriptor, POLLOUT, 0};
        if (count == 0 || errno != EAGAIN || poll(&full, 1, pipePatience) <= 0)
            return;
    }
}

// Whether the file is itself a mount point. Where the kernel cannot tell, the renaming will.
bool isMountPoint(int descriptor)
{
    ExtendedStatus status{};
    return statx(descriptor, "", AT_EMPTY_PATH, STATX_BASIC_STATS, &status) == 0 &&
           (status.stx_attributes & STATX_ATTR_MOUNT_ROOT) != 0;
}

mode_t newFileMode()
{
    const mode_t mask{umask(0)};
    umask(mask);
    return (S_IRUSR | S_IWUSR | S_IRGRP | S_IROTH) & ~mask;
}

// An attempt to rename a new file over the old one.
struct Attempt
{
    std::error_code error;
    bool mayWriteInPlace{}; // the directory or the attributes were in the way, not the content
};

Attempt refusedByDirectory(std::error_code error)
{
    for (const std::errc refusal :
         {std::errc::device_or_resource_busy, std::errc::permission_denied, std::errc::operation_not_permitted,
          std::errc::read_only_file_system, std::errc::cross_device_link}) {
        if (error == refusal)
            return {error, true};
    }
    return {error, false};
}

bool isLackOfRoom(std::error_code error) { return error.value() == ENOSPC || error.value() == EDQUOT; }

Attempt replaceByRename(int directory, const QByteArray &name, const FileDescriptor &old, const QByteArray &content)
{
    TemporaryFile file{directory, name};
    if (const std::error_code error{file.open()})
        return refusedByDirectory(error);
    if (const std::error_code error{posix::writeAll(file.descriptor(), content)})
        return {error};
    if (old.isOpen()) {
        if (const std::error_code error{fileattributes::copy(old.get(), file.descriptor())})
            return {error, true};
    } else if (fchmod(file.descriptor(), newFileMode()) < 0) {
        return {posix::lastError()};
    }
    if (const std::error_code error{posix::sync(file.descriptor())})
        return {error};
    if (const std::error_code error{file.renameTo(name)})
        return refusedByDirectory(error);
    // The new content is in place from here on, whether the directory can be synced or not.
    posix::syncDirectory(directory);
    return {};
}

std::error_code overwrite(int descriptor, const QByteArray &content)
{
    if (const std::error_code error{posix::writeAll(descriptor, content)})
        return error;
    if (posix::retried([&] { return ftruncate(descriptor, content.size()); }) < 0)
        return posix::lastError();
    return posix::sync(descriptor);
}

// Takes the room for `size` bytes before anything is overwritten, where the file system can.
std::error_code reserve(int descriptor, off_t size, off_t oldSize)
{
    if (size <= oldSize || posix::retried([&] { return fallocate(descriptor, FALLOC_FL_KEEP_SIZE, 0, size); }) == 0)
        return {};
    const std::error_code error{posix::lastError()};
    for (const int noRoom : {ENOSPC, EDQUOT, EFBIG}) {
        if (error.value() != noRoom)
            continue;
        // Gives back what was taken; the content stays as it is, whatever comes of this.
        static_cast<void>(posix::retried([&] { return ftruncate(descriptor, oldSize); }));
        return error;
    }
    return {};
}

QString text(std::error_code error) { return QString::fromLocal8Bit(error.message().c_str()); }

// Returns the reason why the new content is not in place, empty when it is.
QString writeInPlace(int directory, const QByteArray &name, const FileDescriptor &old, const QByteArray &oldContent,
                     const QByteArray &content, const QString &keptAs)
{
    const QByteArray beside{keptAs.isEmpty() ? backups::keepBeside(directory, name, oldContent) : QByteArray{}};
    if (keptAs.isEmpty() && beside.isEmpty())
        return QCoreApplication::translate("fileio", "The old content cannot be kept while it is overwritten");

    std::error_code error{reserve(old.get(), content.size(), oldContent.size())};
    if (!error) {
        error = overwrite(old.get(), content);
        if (error && overwrite(old.get(), oldContent)) {
            const QString copy{beside.isEmpty() ? keptAs : QFile::decodeName(beside)};
            return QCoreApplication::translate("fileio", "%1. The file is damaged, its old content is kept in %2")
                .arg(text(error), copy);
        }
    }
    if (!beside.isEmpty())
        unlinkat(directory, beside.constData(), 0);
    return error ? text(error) : QString{};
}

// Returns the reason why the new content is not in place, empty when it is.
QString replace(const QString &path, const QByteArray &content)
{
    Location location;
    if (const std::error_code error{locate(path, location)})
        return text(error);
    const FileDescriptor directory{posix::openAt(AT_FDCWD, location.directory, O_PATH | O_DIRECTORY)};
    if (!directory.isOpen())
        return text(posix::lastError());
    // A file that may not be written is not replaced either, although the directory would allow it.
    const FileDescriptor old{posix::openAt(directory.get(), location.name, O_WRONLY | O_NOFOLLOW)};
    if (!old.isOpen() && errno != ENOENT)
        return text(posix::lastError());
    FileStatus status{};
    if (old.isOpen() && fstat(old.get(), &status) < 0)
        return text(posix::lastError());
    if (old.isOpen() && !S_ISREG(status.st_mode)) {
        writeUnchecked(old.get(), content);
        return {};
    }

    TemporaryFile::removeLeftOvers(directory.get(), location.name, old.isOpen() ? status.st_uid : geteuid());
    QByteArray oldContent;
    std::error_code unread;
    QString keptAs;
    bool isKeptNow{};
    if (old.isOpen()) {
        const FileDescriptor readable{posix::openAt(directory.get(), location.name, O_RDONLY | O_NOFOLLOW)};
        unread = readable.isOpen() ? posix::readAll(readable.get(), oldContent) : posix::lastError();
        if (!unread)
            keptAs = backups::keep(location.path(), oldContent, &isKeptNow);
    }
    if (!old.isOpen() || (status.st_nlink == 1 && !isMountPoint(old.get()))) {
        Attempt attempt{replaceByRename(directory.get(), location.name, old, content)};
        // The save comes first where there is room for one of the two only.
        if (isKeptNow && isLackOfRoom(attempt.error) && backups::giveUp(keptAs)) {
            keptAs.clear();
            attempt = replaceByRename(directory.get(), location.name, old, content);
        }
        if (!attempt.error)
            return {};
        if (!old.isOpen() || !attempt.mayWriteInPlace)
            return text(attempt.error);
    }
    return unread ? text(unread) : writeInPlace(directory.get(), location.name, old, oldContent, content, keptAs);
}

void report(const QString &problem, QString *reason)
{
    if (reason)
        *reason = problem;
}

} // namespace

namespace fileio {

std::optional<QByteArray> readFile(const QString &path, QString *reason)
{
    const FileDescriptor file{posix::openAt(AT_FDCWD, QFile::encodeName(path), O_RDONLY)};
    QByteArray content;
    const std::error_code error{file.isOpen() ? posix::readAll(file.get(), content, TextEncoding::longestText)
                                              : posix::lastError()};
    if (!error)
        return content;
    report(text(error), reason);
    return std::nullopt;
}

bool replaceFile(const QString &path, const QByteArray &content, QString *reason)
{
    const FatalSignalsBlocked signalsBlocked;
    const QString problem{replace(path, content)};
    if (problem.isEmpty())
        return true;
    report(problem, reason);
    return false;
}

QString keepCopy(const QString &path, const QByteArray &content)
{
    const FatalSignalsBlocked signalsBlocked;
    Location location;
    return locate(path, location) ? QString{} : backups::keep(location.path(), content);
}

} // namespace fileio
