// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "common/paths.h"
#include "common/textencoding.h"

#include <QMap>
#include <QObject>
#include <QProcess>
#include <QString>
#include <QStringList>

#include <functional>
#include <memory>

class ServiceCommand;
struct ServiceStatus;

/// The DHCP server as a service of this machine: its state, starting and stopping it, and the interfaces it serves.
///
/// The service is driven through `systemctl`, one command at a time: while the state is `Updating` every further
/// operation is refused. What the user must know leaves through error() and information().
class DhcpServerManager final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(DhcpServerManager)

public:
    enum ServerStates : qint32
    {
        Updating = 0, ///< an operation is under way, or the last query could not be interpreted
        Running = 1,
        Stopped = 2,
    };
    Q_ENUM(ServerStates)

    /// Collects the interfaces and reads the defaults file, but does not ask for the state of the service, which is
    /// `Updating` until the first checkRunning().
    explicit DhcpServerManager(QObject *parent = nullptr);
    /// A `systemctl` under way is killed and nothing more is reported; what it has already asked of the service manager
    /// goes on.
    ~DhcpServerManager() override;

    /// The state in words for the user.
    QString serverStateText() const;
    /// The words for `state`; the empty text for a value that is no state.
    static QString stateText(ServerStates state);
    bool isServerRunning() const;
    ServerStates state() const { return m_state; }
    /// Reports the last operation as failed if it was a start or restart that the service manager called a success, and
    /// the server has died since. An init script tells itself of a server that does not come up.
    void reportDeath();

    /// While an error() is reported: the system's reason for it; empty where there is none.
    const QString &errorReason() const { return m_errorReason; }

    /// Collects the system's interfaces and reads the defaults file again; an unsaved choice is lost.
    void updateInterfaces();
    /// Fills the map with the system's interfaces that have an IPv4 address, except loopback, none of them served. The
    /// map is empty when the system cannot list them.
    void collectSystemInterfaces();
    /// Reads the lines of the defaults file at `path` and marks the interfaces that it names as served; reports an
    /// error() when it cannot be read.
    void readInterfacesFile(const QString &path);
    /// Interface names, each with whether it is served.
    const QMap<QString, bool> &interfaces() const;
    /// Adopts the choice and writes the defaults file. An empty map or an equal one changes nothing.
    void setInterfaces(const QMap<QString, bool> &interfaces);

signals:
    /// An operation was not needed.
    void information(const QString &message);
    /// An operation was refused or failed, or a file could not be opened.
    void error(const QString &message);
    /// The state was set, possibly to the value that it already had.
    void serverStateChanged(const DhcpServerManager::ServerStates &state);
    /// The served interfaces changed, and the defaults file at `path` has to follow.
    void interfacesChanged(const QString &path);

public slots:
    /// Starts the service; the outcome arrives through serverStateChanged() and error().
    void runServer();
    /// Stops the service, in the same way.
    void stopServer();
    /// Restarts the service, in the same way; a stopped one is started.
    void restartServer();
    /// Asks for the state of the service and waits for the answer. An answer that says neither running nor stopped
    /// leaves the state as it is. Does nothing while an operation is under way, which ends with a query anyway.
    void checkRunning();
    /// Asks like checkRunning(), but on nobody's behalf: does not wait, and reports nothing but a state that is another
    /// one than before.
    void followState();
    /// The end of a start, stop or restart.
    void handleProcessFinished(int exitCode, QProcess::ExitStatus exitStatus);
    /// Puts the served interfaces of the map into the lines of the file at `path`: those that it has by now when it is
    /// the file read last, else those read last. When that fails, the choice is discarded for what the system and the
    /// file say, and an error() is reported; also where the file read last has no line for the choice, which is then
    /// not stored. A file that exists but could not be read is never overwritten.
    void writeDHCPServerConfig(const QString &path = paths::serverDefaults());

private:
    void noteStop(const ServiceStatus &status);
    void setState(ServerStates state);
    void operate(const QString &verb, ServerStates exceptIn, const std::function<void()> &instead);
    void handleProcessError(QProcess::ProcessError processError);
    void handleFollowingFinished(int exitCode, QProcess::ExitStatus exitStatus);
    void abandonFollowing();
    void reportFailedOperation(const QString &detail);
    void report(const QString &message, const QString &reason = {});
    QStringList adoptFile(const QByteArray &content);

    ServiceCommand *m_process;                   // of the operation under way, if any
    std::unique_ptr<ServiceCommand> m_following; // the query of followState()
    bool m_followAgain{};                        // the service may have changed since that query began
    ServerStates m_state{Updating};
    bool m_unitHasFailed{}; // the service is stopped, which nobody asked for
    bool m_unitIsActive{};  // the service counts as stopped, but for the service manager it is active
    bool m_wasStarted{};    // by the last operation, as far as it is known to have worked
    QString m_errorReason;
    QString m_filePath;      // of the defaults file read last
    QStringList m_fileLines; // with their terminators
    QMap<QString, bool> m_interfaces;
    TextEncoding m_fileEncoding;
    bool m_fileWasRead{};
};
