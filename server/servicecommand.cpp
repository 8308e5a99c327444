// SPDX-License-Identifier: GPL-3.0-or-later
#include "server/servicecommand.h"

#include <QProcessEnvironment>
#include <QStandardPaths>

#include <cerrno>
#include <system_error>

namespace {

constexpr int longestOutput{64 * 1024}; // bytes, of each channel

QProcessEnvironment plainEnvironment()
{
    QProcessEnvironment environment{QProcessEnvironment::systemEnvironment()};
    environment.insert(QStringLiteral("LC_ALL"), QStringLiteral("C"));
    environment.insert(QStringLiteral("SYSTEMD_COLORS"), QStringLiteral("0"));
    environment.insert(QStringLiteral("SYSTEMD_PAGER"), QString{});
    environment.insert(QStringLiteral("SYSTEMD_URLIFY"), QStringLiteral("0"));
    return environment;
}

} // namespace

ServiceCommand::ServiceCommand(QObject *parent)
    : QProcess{parent}
{
    // Emptied as it comes, so that never more than what a pipe holds waits beside what is kept.
    connect(this, &QProcess::readyReadStandardOutput, this, [this] { collect(m_output, readAllStandardOutput()); });
    connect(this, &QProcess::readyReadStandardError, this, [this] { collect(m_errors, readAllStandardError()); });
}

// A call that is still under way is ended by the base class, which may read from it once more.
ServiceCommand::~ServiceCommand() { disconnect(this, nullptr, this, nullptr); }

void ServiceCommand::send(const QString &verb)
{
    m_output.clear();
    m_errors.clear();
    m_printedTooMuch = false;
    const QString program{QStandardPaths::findExecutable(QStringLiteral("systemctl"))};
    if (program.isEmpty()) {
        // Qt 6.4 leaves a descriptor open each time that it starts a program which is not there.
        setErrorString(QString::fromLocal8Bit(std::generic_category().message(ENOENT).c_str()));
        emit errorOccurred(FailedToStart);
        return;
    }
    start(program, {verb, QStringLiteral("isc-dhcp-server")}, QIODevice::ReadWrite);
}

void ServiceCommand::askForStatus()
{
    setProcessEnvironment(plainEnvironment());
    send(QStringLiteral("status"));
}

QString ServiceCommand::complaint() const { return QString::fromUtf8(m_errors.constData(), m_errors.size()); }

void ServiceCommand::collect(QByteArray &collected, const QByteArray &printed)
{
    const QByteArray::size_type room{longestOutput - collected.size()};
    collected += printed.left(room);
    if (printed.size() <= room || m_printedTooMuch)
        return;
    m_printedTooMuch = true;
    kill();
}
