// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/fileattributes.h"

#include "common/posix.h"

#include <QMap>

#include <sys/stat.h>
#include <sys/xattr.h>
#include <unistd.h>

namespace {

constexpr mode_t permissionBits{07777};

using Attributes = QMap<QByteArray, QByteArray>;

// Signatures over the content that the kernel keeps by itself: those of the old content would be wrong for the new.
bool isContentSignature(const QByteArray &name) { return name == "security.ima" || name == "security.evm"; }

// Calls `get` for the length of a text and again for the text.
template<typename Get>
std::error_code fetch(Get get, QByteArray &text)
{
    const ssize_t length{get(nullptr, 0)};
    if (length < 0)
        return posix::lastError();
    text = QByteArray{static_cast<int>(length), '\0'};
    const ssize_t fetched{get(text.data(), static_cast<size_t>(text.size()))};
    if (fetched < 0)
        return posix::lastError();
    text.truncate(static_cast<int>(fetched));
    return {};
}

std::error_code readAttributes(int descriptor, Attributes &attributes)
{
    QByteArray names;
    const std::error_code error{
        fetch([&](char *data, size_t size) { return flistxattr(descriptor, data, size); }, names)};
    if (error == std::errc::operation_not_supported)
        return {};
    if (error)
        return error;
    const QList<QByteArray> present{names.split('\0')};
    for (const QByteArray &name : present) {
        if (name.isEmpty() || isContentSignature(name))
            continue;
        const auto get = [&](char *data, size_t size) { return fgetxattr(descriptor, name.constData(), data, size); };
        if (const std::error_code unread{fetch(get, attributes[name])})
            return unread;
    }
    return {};
}

std::error_code copyOwner(const FileStatus &from, const FileStatus &to, int descriptor)
{
    constexpr auto same = static_cast<uid_t>(-1);
    const uid_t owner{from.st_uid == to.st_uid ? same : from.st_uid};
    const gid_t group{from.st_gid == to.st_gid ? same : from.st_gid};
    if ((owner != same || group != same) && fchown(descriptor, owner, group) < 0)
        return posix::lastError();
    return {};
}

// The ACL is one of the extended attributes; one that the directory gave to the new file goes if the old had none.
std::error_code copyAttributes(int from, int to)
{
    Attributes wanted;
    Attributes present;
    if (const std::error_code error{readAttributes(from, wanted)})
        return error;
    if (const std::error_code error{readAttributes(to, present)})
        return error;
    for (auto it = wanted.cbegin(); it != wanted.cend(); ++it) {
        if (present.contains(it.key()) && present.value(it.key()) == it.value())
            continue;
        const auto size = static_cast<size_t>(it.value().size());
        if (fsetxattr(to, it.key().constData(), it.value().constData(), size, 0) < 0)
            return posix::lastError();
    }
    for (auto it = present.cbegin(); it != present.cend(); ++it) {
        if (!wanted.contains(it.key()) && fremovexattr(to, it.key().constData()) < 0)
            return posix::lastError();
    }
    return {};
}

} // namespace

std::error_code fileattributes::copy(int from, int to)
{
    FileStatus wanted{};
    FileStatus present{};
    if (fstat(from, &wanted) < 0 || fstat(to, &present) < 0)
        return posix::lastError();
    if (const std::error_code error{copyOwner(wanted, present, to)})
        return error;
    if (const std::error_code error{copyAttributes(from, to)})
        return error;
    // A new owner takes mode bits away and an ACL sets some, so the mode comes last and is looked at anew.
    if (fstat(to, &present) < 0)
        return posix::lastError();
    const mode_t mode{wanted.st_mode & permissionBits};
    if ((present.st_mode & permissionBits) != mode && fchmod(to, mode) < 0)
        return posix::lastError();
    return {};
}
