// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QFile>
#include <QLocalServer>
#include <QObject>

/// A program's claim to be the only instance, held by a lock that the system releases however the process ends, and the
/// socket through which later instances talk to the first. Only processes of the same user are heard.
class SingleInstance final : public QObject
{
    Q_OBJECT

public:
    /// Lock and socket lie in `directory`, which must be private to the user; without one every instance is the first.
    SingleInstance(const QString &directory, const QString &id);
    Q_DISABLE_COPY_MOVE(SingleInstance)

    /// Whether another process holds the lock; otherwise this one takes it, unless it has it already, and listens.
    bool isOtherRunning();

    /// Sends `message` (at most 64 KiB of UTF-8) to the first instance and waits for its receipt, at most `timeout`
    /// milliseconds. False when this is the first instance or the receipt did not come.
    bool send(const QString &message, int timeout);

signals:
    void messageReceived(const QString &message);

private:
    void acceptClients();
    void receive(QLocalSocket *client);

    QString m_socketPath;
    QFile m_lockFile;
    QLocalServer m_server;
};
