// SPDX-License-Identifier: GPL-3.0-or-later
#include "server/dhcpservermanager.h"

#include "server/servicecommand.h"
#include "server/servicestatus.h"

#include <QSignalBlocker>

#include <utility>

namespace {

bool wasAnswered(const ServiceCommand &query)
{
    return query.exitStatus() == QProcess::NormalExit || query.printedTooMuch();
}

} // namespace

DhcpServerManager::DhcpServerManager(QObject *parent)
    : QObject{parent}
    , m_process{new ServiceCommand{this}}
    , m_following{std::make_unique<ServiceCommand>()}
{
    qRegisterMetaType<DhcpServerManager::ServerStates>("DhcpServerManager::ServerStates");
    connect(this, &DhcpServerManager::interfacesChanged, this, &DhcpServerManager::writeDHCPServerConfig);
    connect(m_process, qOverload<int, QProcess::ExitStatus>(&QProcess::finished), this,
            &DhcpServerManager::handleProcessFinished);
    // Queued, because a process that could not be started is cleaned up only after its signal and cannot be reused
    // before.
    connect(m_process, &QProcess::errorOccurred, this, &DhcpServerManager::handleProcessError, Qt::QueuedConnection);
    connect(m_following.get(), qOverload<int, QProcess::ExitStatus>(&QProcess::finished), this,
            &DhcpServerManager::handleFollowingFinished);
    updateInterfaces();
}

DhcpServerManager::~DhcpServerManager() { abandonFollowing(); }

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
    abandonFollowing();
    ServiceCommand query;
    query.askForStatus();
    query.waitForFinished(-1);

    // The exit code is deliberately not looked at: it is not 0 for a stopped service either.
    if (!wasAnswered(query)) {
        report(QObject::tr("Checking DHCP-server status failed\n%1").arg(query.complaint()));
        return;
    }
    const ServiceStatus status{query.output()};
    if (status.stopped) {
        noteStop(status);
        setState(Stopped);
    }
    // Deliberately no "else": of a text that has both, running is what counts.
    if (status.running)
        setState(Running);
}

void DhcpServerManager::followState()
{
    if (m_process->state() != QProcess::NotRunning)
        return;
    if (m_following->state() != QProcess::NotRunning) {
        m_followAgain = true;
        return;
    }
    m_following->askForStatus();
}

void DhcpServerManager::handleFollowingFinished(int /*exitCode*/, QProcess::ExitStatus /*exitStatus*/)
{
    const bool again{std::exchange(m_followAgain, false)};
    if (wasAnswered(*m_following)) {
        const ServiceStatus status{m_following->output()};
        if (status.stopped && !status.running)
            noteStop(status);
        if (status.running && m_state != Running)
            setState(Running);
        else if (status.stopped && !status.running && m_state != Stopped)
            setState(Stopped);
    }
    if (again)
        followState();
}

// What is asked or done from now on makes the answer old.
void DhcpServerManager::abandonFollowing()
{
    m_followAgain = false;
    if (m_following->state() == QProcess::NotRunning)
        return;
    const QSignalBlocker silent{m_following.get()};
    m_following->kill();
    m_following->waitForFinished(-1);
}

void DhcpServerManager::handleProcessFinished(int exitCode, QProcess::ExitStatus exitStatus)
{
    if (exitCode != 0 || exitStatus == QProcess::CrashExit)
        reportFailedOperation(m_process->complaint());
    checkRunning();
}

void DhcpServerManager::noteStop(const ServiceStatus &status)
{
    m_unitHasFailed = status.failed;
    m_unitIsActive = status.exited;
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
        report(QObject::tr("Some operation with DHCP-server already executes"));
        return;
    }
    m_wasStarted = false;
    checkRunning();
    if (m_state == exceptIn) {
        instead();
        return;
    }
    // To a service that is active although its server has died, "start" does nothing.
    const bool needsRestart{m_state == Stopped && m_unitIsActive};
    m_wasStarted = verb != QLatin1String{"stop"};
    setState(Updating);
    m_process->send(needsRestart ? QStringLiteral("restart") : verb);
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
    m_wasStarted = false;
    report(QObject::tr("Operation with DHCP-server failed\n%1").arg(detail));
}

void DhcpServerManager::reportDeath()
{
    if (m_wasStarted && m_state == Stopped && m_unitHasFailed)
        reportFailedOperation(serverStateText());
}

void DhcpServerManager::report(const QString &message, const QString &reason)
{
    m_errorReason = reason;
    emit error(message);
}
