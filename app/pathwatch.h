// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QElapsedTimer>
#include <QFileSystemWatcher>
#include <QObject>
#include <QString>
#include <QTimer>

/// Notices when a file is changed, replaced, removed or made, through a watcher of the file and one of its directory.
/// The directory may be removed, replaced and made again; a third watcher, of the nearest folder above that exists,
/// tells.
///
/// Notifications that arrive within 100 ms of the first one count as one; more, where what the last notice brought
/// about took so long that notices would take more than a quarter of the time. Both paths are watched anew after every
/// notice: a path whose file was replaced while somebody holds the old one open stays on the dead file otherwise.
class PathWatch final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(PathWatch)

public:
    /// Watches `file`, which need not exist, and `directory`; the watchers are children of `parent` too.
    PathWatch(const QString &file, const QString &directory, QObject *parent);

    /// Stops watching, for a change of the program's own, and watches again. A notice that was due by then is still
    /// given.
    void pause();
    void resume();
    /// Drops a notice that is due.
    void forget() { m_burst.stop(); }

signals:
    /// The file may have changed; also sent for other files of its directory.
    void changed();

private:
    void watchAbove();
    void noteAbove();
    void startBurst();
    void notify();

    QString m_file;
    QString m_directory;
    QFileSystemWatcher *m_fileWatcher{};
    QFileSystemWatcher *m_directoryWatcher{};
    QFileSystemWatcher m_aboveWatcher;
    QByteArray m_identity; // of the directory that is watched, empty while there is none
    QTimer m_burst;
    QElapsedTimer m_sinceNotice;
    qint64 m_pause{}; // milliseconds without a notice after the last one
};
