// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/singleinstance.h"

#include "platform/runtimedirectory.h"

#include <QDeadlineTimer>
#include <QLocalSocket>
#include <QThread>
#include <QTimer>
#include <QtEndian>

#include <sys/file.h>
#include <sys/socket.h>
#include <unistd.h>

namespace {

constexpr quint32 longestMessage{64 * 1024}; // bytes
constexpr int headerSize{sizeof(quint32)};   // the message's length, big endian
constexpr int clientPatience{5000};          // milliseconds until a client that has sent no whole message is dropped
constexpr unsigned long retryInterval{20};   // milliseconds
const QByteArray receipt{QByteArrayLiteral("ack")};

// The folder keeps other users out already; this does so even where its mode was loosened.
bool isSameUser(const QLocalSocket &client)
{
    ucred peer{};
    socklen_t size{sizeof(peer)};
    return getsockopt(static_cast<int>(client.socketDescriptor()), SOL_SOCKET, SO_PEERCRED, &peer, &size) == 0 &&
           peer.uid == geteuid();
}

int remainingTime(const QDeadlineTimer &deadline) { return static_cast<int>(deadline.remainingTime()); }

} // namespace

SingleInstance::SingleInstance(const QString &directory, const QString &id)
{
    if (!directory.isEmpty()) {
        m_socketPath = directory + QLatin1Char{'/'} + id + QStringLiteral(".socket");
        m_lockFile.setFileName(directory + QLatin1Char{'/'} + id + QStringLiteral(".lock"));
    }
    connect(&m_server, &QLocalServer::newConnection, this, &SingleInstance::acceptClients);
}

bool SingleInstance::isOtherRunning()
{
    if (m_socketPath.isEmpty() || m_lockFile.isOpen())
        return false;
    const OwnersUmask mask;
    if (!m_lockFile.open(QIODevice::ReadWrite))
        return false;
    if (flock(m_lockFile.handle(), LOCK_EX | LOCK_NB) != 0) {
        const bool otherHoldsIt{errno == EWOULDBLOCK};
        m_lockFile.close();
        return otherHoldsIt;
    }
    // The process that left a socket file behind is gone, or it would still hold the lock.
    QLocalServer::removeServer(m_socketPath);
    m_server.listen(m_socketPath);
    return false;
}

bool SingleInstance::send(const QString &message, int timeout)
{
    const QByteArray text{message.toUtf8()};
    const auto size = static_cast<quint32>(text.size());
    if (size > longestMessage || !isOtherRunning())
        return false;

    const QDeadlineTimer deadline{timeout};
    QLocalSocket server;
    server.connectToServer(m_socketPath);
    // An instance that is just starting holds the lock before it listens.
    while (!server.waitForConnected(remainingTime(deadline))) {
        if (deadline.hasExpired())
            return false;
        QThread::msleep(retryInterval);
        server.connectToServer(m_socketPath);
    }

    QByteArray header(headerSize, Qt::Uninitialized);
    qToBigEndian(size, header.data());
    server.write(header + text);
    while (server.bytesAvailable() < receipt.size()) {
        if (!server.waitForReadyRead(remainingTime(deadline)))
            return false;
    }
    return server.read(receipt.size()) == receipt;
}

void SingleInstance::acceptClients()
{
    while (m_server.hasPendingConnections()) {
        QLocalSocket *client{m_server.nextPendingConnection()};
        connect(client, &QLocalSocket::disconnected, client, &QObject::deleteLater);
        if (!isSameUser(*client)) {
            client->abort();
            continue;
        }
        client->setReadBufferSize(headerSize + longestMessage);
        connect(client, &QLocalSocket::readyRead, this, [this, client] { receive(client); });
        QTimer::singleShot(clientPatience, client, &QLocalSocket::abort);
    }
}

void SingleInstance::receive(QLocalSocket *client)
{
    if (client->bytesAvailable() < headerSize)
        return;
    const auto size = qFromBigEndian<quint32>(client->peek(headerSize).constData());
    if (size > longestMessage) {
        client->abort();
        return;
    }
    if (client->bytesAvailable() < headerSize + qint64{size})
        return;
    client->skip(headerSize);
    const QString message{QString::fromUtf8(client->read(size))};
    // The receipt goes first, since what the message starts here may take long.
    client->write(receipt);
    client->flush();
    client->disconnectFromServer();
    emit messageReceived(message);
}
