// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QList>
#include <QString>
#include <QStringList>
#include <QTemporaryDir>

#include <optional>

/// A `systemctl` that is found first through PATH while this object lives. It replays what the real one prints about
/// the DHCP server, follows what start, stop and restart do to it, and keeps a record of its calls.
class FakeSystemctl final
{
public:
    enum State
    {
        Running,
        Stopped,
        Failed,
        Activating,
        Deactivating,
        NoSuchUnit
    };

    /// What one verb answers.
    struct Reply
    {
        QByteArray output;          ///< on standard output
        QByteArray errors;          ///< on standard error
        int exitCode{};             ///< how it exits
        std::optional<State> state; ///< the state of the service from then on; none: as before
        int signal{};               ///< the signal that it kills itself with instead of exiting
        int seconds{};              ///< how long it takes before it answers
    };

    /// The service is in `state`; start, stop and restart succeed.
    explicit FakeSystemctl(State state = Stopped);
    ~FakeSystemctl();
    Q_DISABLE_COPY_MOVE(FakeSystemctl)

    /// What `systemctl status` answers in `state`.
    static Reply statusReply(State state);
    /// Puts the service into `state`: from now on "status" answers accordingly.
    void setState(State state);
    /// From now on `verb` answers so. For "status" this holds until the next setState(), or a command that changes the
    /// state.
    void setReply(const QString &verb, const Reply &reply);

    /// From now on `verb` waits for release() after it has recorded its call. Not for "status", which the program waits
    /// for.
    void hold(const QString &verb);
    void release(const QString &verb);

    /// Takes the program away, and every other of its name, or puts it back.
    void setInstalled(bool installed);

    /// The arguments of every call so far, in order.
    QList<QStringList> calls() const;
    /// The first argument of every call so far, in order.
    QStringList verbs() const;

private:
    QString filePath(const QString &name) const;
    void writeReply(const QString &folder, const Reply &reply);

    QTemporaryDir m_folder;
    QByteArray m_oldPath;
};
