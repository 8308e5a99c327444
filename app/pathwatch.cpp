// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/pathwatch.h"

#include <QFile>
#include <QFileSystemWatcher>

namespace {

constexpr int burstMilliseconds{100};

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

} // namespace

PathWatch::PathWatch(const QString &file, const QString &directory, QObject *parent)
    : QObject{parent}
    , m_file{file}
    , m_directory{directory}
    , m_fileWatcher{new QFileSystemWatcher{parent}}
    , m_directoryWatcher{new QFileSystemWatcher{parent}}
{
    m_burst.setSingleShot(true);
    m_burst.setInterval(burstMilliseconds);
    connect(&m_burst, &QTimer::timeout, this, &PathWatch::notify);

    // A running timer is not restarted: a file written to all the time is noticed ten times a second, not never.
    const auto startBurst = [this] {
        if (!m_burst.isActive())
            m_burst.start();
    };
    connect(m_directoryWatcher, &QFileSystemWatcher::directoryChanged, this, startBurst);
    connect(m_fileWatcher, &QFileSystemWatcher::fileChanged, this, startBurst);
    resume();
}

void PathWatch::pause()
{
    unwatch(m_directoryWatcher);
    unwatch(m_fileWatcher);
}

void PathWatch::resume()
{
    watch(m_directoryWatcher, m_directory);
    watch(m_fileWatcher, m_file);
}

void PathWatch::notify()
{
    // First watch anew, then tell: a change that happens while the receiver reads the file is a notice of its own.
    pause();
    resume();
    emit changed();
}
