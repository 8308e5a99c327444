// SPDX-License-Identifier: GPL-3.0-or-later
#include "server/dhcpservermanager.h"

namespace {

void startCommand(QProcess &process, const QString &verb)
{
    process.start(QStringLiteral("systemctl"), {verb, QStringLiteral("isc-dhcp-server")}, QIODevice::ReadWrite);
}

} // namespace

DhcpServerManager::DhcpServerManager(QObject *parent)
    : QObject{parent}
    , m_process{new QProcess{this}}
{
    qRegisterMetaType<DhcpServerManager::ServerStates>("DhcpServerManager::ServerStates");
    connect(this, &DhcpServerManager::interfacesChanged, this, &DhcpServerManager::writeDHCPServerConfig);
    connect(m_process, qOverload<int, QProcess::ExitStatus>(&QProcess::finished), this,
            &DhcpServerManager::handleProcessFinished);
    // Queued, because a process that could not be started is cleaned up only after its signal and cannot be reused
    // before.
    connect(m_process, &QProcess::errorOccurred, this, &DhcpServerManager::handleProcessError, Qt::QueuedConnection);
    updateInterfaces();
}

DhcpServerManager::~DhcpServerManager() = default;

QString DhcpServerManager::serverStateText() const { return stateText(m_state); }

QString DhcpServerManager::stateText(ServerStates state)
{
    switch (state) {
    case Updating:
        return QObject::tr("Updating DHCP-server status...");
    case Running:
        return QObject::tr("DHCP-server is running");
    case Stopped:
        return QObject::tr("DHCP-server is stopped");
    }
    return {};
}

bool DhcpServerManager::isServerRunning() const { return m_state == Running; }

void DhcpServerManager::runServer()
{
    operate(QStringLiteral("start"), Running, [this] { emit information(QObject::tr("DHCP-server already running")); });
}

void DhcpServerManager::stopServer()
{
    operate(QStringLiteral("stop"), Stopped, [this] { emit information(QObject::tr("DHCP-server already stopped")); });
}

void DhcpServerManager::restartServer()
{
    operate(QStringLiteral("restart"), Stopped, [this] { runServer(); });
}

void DhcpServerManager::checkRunning()
{
    if (m_process->state() != QProcess::NotRunning)
        return;
    QProcess query;
    startCommand(query, QStringLiteral("status"));
    query.waitForFinished(-1);

    if (query.exitStatus() != QProcess::NormalExit) {
        emit error(
            QObject::tr("Checking DHCP-server status failed\n%1").arg(QString::fromUtf8(query.readAllStandardError())));
        return;
    }
    // The exit code is deliberately not looked at: it is not 0 for a stopped service either.
    const QString status{QString::fromUtf8(query.readAllStandardOutput())};
    if (status.contains(QLatin1String{"Active: inactive (dead)"}) || status.contains(QLatin1String{"Active: failed"}))
        setState(Stopped);
    // Deliberately no "else": of a text that has both, running is what counts.
    if (status.contains(QLatin1String{"Active: active (running)"}))
        setState(Running);
}

void DhcpServerManager::handleProcessFinished(int exitCode, QProcess::ExitStatus exitStatus)
{
    if (exitCode != 0 || exitStatus == QProcess::CrashExit)
        reportFailedOperation(QString::fromUtf8(m_process->readAllStandardError()));
    checkRunning();
}

void DhcpServerManager::setState(ServerStates state)
{
    m_state = state;
    emit serverStateChanged(m_state);
}

// Sends the service the command `verb`, or calls `instead` when the service turns out to be in the state `exceptIn`.
void DhcpServerManager::operate(const QString &verb, ServerStates exceptIn, const std::function<void()> &instead)
{
    if (m_state == Updating) {
        emit error(QObject::tr("Some operation with DHCP-server already executes"));
        return;
    }
    checkRunning();
    if (m_state == exceptIn) {
        instead();
        return;
    }
    setState(Updating);
    startCommand(*m_process, verb);
}

void DhcpServerManager::handleProcessError(QProcess::ProcessError processError)
{
    // Every other error is followed by the end of the process, which is reported then.
    if (processError != QProcess::FailedToStart)
        return;
    reportFailedOperation(m_process->errorString());
    checkRunning();
}

void DhcpServerManager::reportFailedOperation(const QString &detail)
{
    emit error(QObject::tr("Operation with DHCP-server failed\n%1").arg(detail));
}
