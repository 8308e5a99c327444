// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/backups.h"

#include "common/paths.h"
#include "common/posix.h"
#include "common/temporaryfile.h"

#include <QCryptographicHash>
#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <chrono>
#include <utility>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

constexpr int newestKept{20};
constexpr int longestBaseName{200};
constexpr qint64 microsecondsPerMillisecond{1000};

// 20251121T014800.123456Z: sorts by time.
constexpr int stampLength{23};
constexpr int millisecondsLength{19};

QString stampFormat() { return QStringLiteral("yyyyMMdd'T'HHmmss.zzz"); }

QByteArray stampOf(qint64 microseconds)
{
    const QDateTime time{QDateTime::fromMSecsSinceEpoch(microseconds / microsecondsPerMillisecond, Qt::UTC)};
    return time.toString(stampFormat()).toLatin1() +
           QByteArray::number(microseconds % microsecondsPerMillisecond).rightJustified(3, '0') + 'Z';
}

qint64 microsecondsOf(const QByteArray &stamp)
{
    QDateTime time{QDateTime::fromString(QString::fromLatin1(stamp.left(millisecondsLength)), stampFormat())};
    time.setTimeSpec(Qt::UTC);
    return time.toMSecsSinceEpoch() * microsecondsPerMillisecond + stamp.mid(millisecondsLength, 3).toLongLong();
}

// Whether there is such a time, and one after it that can be written in the same way.
bool isStamp(const QByteArray &stamp)
{
    const qint64 time{microsecondsOf(stamp)};
    return stampOf(time) == stamp && stampOf(time + 1).size() == stampLength;
}

qint64 now()
{
    using namespace std::chrono;
    return duration_cast<microseconds>(system_clock::now().time_since_epoch()).count();
}

// The whole path is in the name, so that files of one name in different directories are told apart.
QByteArray baseName(const QString &path)
{
    const QByteArray full{QFile::encodeName(path)};
    QByteArray name{full.mid(full.startsWith('/') ? 1 : 0)};
    name.replace('%', "%25").replace('+', "%2B").replace('/', '+');
    return name.size() <= longestBaseName ? name : QCryptographicHash::hash(full, QCryptographicHash::Sha1).toHex();
}

// A folder that others could write to, or a link that they could redirect, must not receive what only the superuser may
// see.
FileDescriptor openBackupFolder()
{
    const QString path{QDir::cleanPath(paths::backupDirectory())}; // without its slash, which would follow a link
    const QByteArray name{QFile::encodeName(path)};
    if (mkdir(name.constData(), S_IRWXU) < 0 && errno == ENOENT && QDir{}.mkpath(QFileInfo{path}.path()))
        mkdir(name.constData(), S_IRWXU);
    FileDescriptor folder{posix::openAt(AT_FDCWD, name, O_RDONLY | O_DIRECTORY | O_NOFOLLOW)};
    FileStatus status{};
    const bool safe{folder.isOpen() && fstat(folder.get(), &status) == 0 && status.st_uid == geteuid() &&
                    (status.st_mode & (S_IWGRP | S_IWOTH)) == 0};
    return safe ? std::move(folder) : FileDescriptor{};
}

// The versions of one file in one folder.
class Series final
{
public:
    // A version is named `name`, then `mark`, then its time.
    Series(int folder, const QByteArray &name, const QByteArray &mark)
        : m_folder{folder}
        , m_name{name}
        , m_prefix{name + mark}
    {
        const QVector<QByteArray> entries{posix::entries(folder)};
        for (const QByteArray &entry : entries) {
            if (entry.startsWith(m_prefix) && isStamp(entry.mid(m_prefix.size())))
                m_versions.append(entry);
        }
        std::sort(m_versions.begin(), m_versions.end());
    }

    // The name of the version that holds `content`, empty when it could not be written.
    QByteArray add(const QByteArray &content)
    {
        TemporaryFile::removeLeftOvers(m_folder, m_name, geteuid());
        if (newestIs(content))
            return m_versions.last();
        QByteArray version{m_prefix + nextStamp()};
        TemporaryFile file{m_folder, m_name};
        if (file.open() || posix::writeAll(file.descriptor(), content) || posix::sync(file.descriptor()) ||
            file.renameTo(version))
            return {};
        posix::syncDirectory(m_folder);
        m_versions.append(version);
        m_hasAdded = true;
        return version;
    }

    bool hasAdded() const { return m_hasAdded; }

    void removeAllButFirstAndNewest()
    {
        for (int i{1}; i < m_versions.size() - newestKept; ++i)
            unlinkat(m_folder, m_versions.at(i).constData(), 0);
    }

private:
    bool newestIs(const QByteArray &content) const
    {
        if (m_versions.isEmpty())
            return false;
        const FileDescriptor file{posix::openAt(m_folder, m_versions.last(), O_RDONLY | O_NOFOLLOW)};
        QByteArray newest;
        return file.isOpen() && !posix::readAll(file.get(), newest) && newest == content;
    }

    // Later than that of every version there is, also after the clock was set back.
    QByteArray nextStamp() const
    {
        const QByteArray stamp{stampOf(now())};
        const QByteArray newest{m_versions.isEmpty() ? QByteArray{} : m_versions.last().mid(m_prefix.size())};
        return stamp > newest ? stamp : stampOf(microsecondsOf(newest) + 1);
    }

    int m_folder;
    QByteArray m_name;
    QByteArray m_prefix;
    QVector<QByteArray> m_versions; // oldest first
    bool m_hasAdded{};
};

} // namespace

namespace backups {

QString keep(const QString &path, const QByteArray &content, bool *isNew)
{
    const FileDescriptor folder{openBackupFolder()};
    if (!folder.isOpen())
        return {};
    Series series{folder.get(), baseName(path), QByteArrayLiteral(".")};
    const QByteArray version{series.add(content)};
    series.removeAllButFirstAndNewest();
    if (isNew)
        *isNew = series.hasAdded();
    return version.isEmpty() ? QString{} : QDir{paths::backupDirectory()}.filePath(QFile::decodeName(version));
}

bool giveUp(const QString &version)
{
    const FileDescriptor folder{openBackupFolder()};
    const QByteArray name{QFile::encodeName(QFileInfo{version}.fileName())};
    return folder.isOpen() && unlinkat(folder.get(), name.constData(), 0) == 0;
}

QByteArray keepBeside(int directory, const QByteArray &name, const QByteArray &content)
{
    return Series{directory, name, QByteArrayLiteral(".orv-")}.add(content);
}

} // namespace backups
