// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/pathwatch.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <algorithm>

#include <sys/stat.h>

namespace {

constexpr qint64 burstMilliseconds{100};
constexpr qint64 pauseForEachMillisecond{3}; // of what a notice brought about

void unwatch(QFileSystemWatcher *watcher)
{
    const QStringList paths{watcher->files() + watcher->directories()};
    if (!paths.isEmpty())
        watcher->removePaths(paths);
}

void watch(QFileSystemWatcher *watcher, const QString &path)
{
    if (QFile::exists(path))
        watcher->addPath(path);
}

// Tells the directory at `path` from every other one that there is at the time; empty where there is none.
QByteArray identityOf(const QString &path)
{
    struct stat status
    {
    };
    if (stat(QFile::encodeName(path).constData(), &status) < 0)
        return {};
    return QByteArray::number(static_cast<qulonglong>(status.st_dev)) + ':' +
           QByteArray::number(static_cast<qulonglong>(status.st_ino));
}

QString parentOf(const QString &path) { return QFileInfo{QDir::cleanPath(path)}.path(); }

QString nearestAbove(const QString &path)
{
    QString above{parentOf(path)};
    while (!QFile::exists(above) && above != parentOf(above))
        above = parentOf(above);
    return above;
}

} // namespace

PathWatch::PathWatch(const QString &file, const QString &directory, QObject *parent)
    : QObject{parent}
    , m_file{file}
    , m_directory{directory}
    , m_fileWatcher{new QFileSystemWatcher{parent}}
    , m_directoryWatcher{new QFileSystemWatcher{parent}}
{
    m_burst.setSingleShot(true);
    connect(&m_burst, &QTimer::timeout, this, &PathWatch::notify);

    connect(m_directoryWatcher, &QFileSystemWatcher::directoryChanged, this, &PathWatch::startBurst);
    connect(m_fileWatcher, &QFileSystemWatcher::fileChanged, this, &PathWatch::startBurst);
    connect(&m_aboveWatcher, &QFileSystemWatcher::directoryChanged, this, &PathWatch::noteAbove);
    resume();
}

void PathWatch::pause()
{
    unwatch(&m_aboveWatcher);
    unwatch(m_directoryWatcher);
    unwatch(m_fileWatcher);
}

void PathWatch::resume()
{
    watchAbove();
    m_identity = identityOf(m_directory);
    watch(m_directoryWatcher, m_directory);
    watch(m_fileWatcher, m_file);
}

void PathWatch::watchAbove()
{
    // A folder that is made before the one above it is watched is not announced by that one.
    for (QString above; above != nearestAbove(m_directory);) {
        above = nearestAbove(m_directory);
        unwatch(&m_aboveWatcher);
        watch(&m_aboveWatcher, above);
    }
}

// Most changes above have nothing to do with the directory: files come and go beside it.
void PathWatch::noteAbove()
{
    watchAbove();
    if (identityOf(m_directory) != m_identity)
        startBurst();
}

// A running timer is not restarted: a file written to all the time is noticed ten times a second, not never.
void PathWatch::startBurst()
{
    if (m_burst.isActive())
        return;
    const qint64 pauseLeft{m_sinceNotice.isValid() ? m_pause - m_sinceNotice.elapsed() : 0};
    m_burst.start(static_cast<int>(std::max(burstMilliseconds, pauseLeft)));
}

void PathWatch::notify()
{
    // First watch anew, then tell: a change that happens while the receiver reads the file is a notice of its own.
    pause();
    resume();
    QElapsedTimer time;
    time.start();
    emit changed();
    m_pause = pauseForEachMillisecond * time.elapsed();
    m_sinceNotice.start();
}
