// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/support/fakesystemctl.h"

#include "tests/support/temporaryroot.h"

#include <QDir>
#include <QFile>
#include <QTest>

#include <array>

namespace {

// Each verb has a folder beside the script: the commands to begin with, what to print on either channel, and the
// commands to end with. "status" is a link to the folder of the present state, so that those commands can change it.
constexpr const char *script{R"(#!/bin/sh
here=${0%/*}
printf '%s\n' "$@" '' >>"$here/calls"
while [ -e "$here/$1.held" ]; do sleep 0.01; done
reply=$here/$1
. "$reply/begin"
[ ! -s "$reply/errors" ] || cat "$reply/errors" >&2
[ ! -s "$reply/output" ] || cat "$reply/output"
. "$reply/end"
)"};

struct Status
{
    const char *name;
    int exitCode;
    const char *output;
    const char *errors;
};

// In the order of FakeSystemctl::State.
constexpr std::array<Status, 6> statusOfStates{{
    {"running", 0, R"(● isc-dhcp-server.service - LSB: DHCP server
     Loaded: loaded (/etc/init.d/isc-dhcp-server; generated)
     Active: active (running) since Mon 2026-03-02 08:14:31 UTC; 2h 5min ago
       Docs: man:systemd-sysv-generator(8)
    Process: 812 ExecStart=/etc/init.d/isc-dhcp-server start (code=exited, status=0/SUCCESS)
     CGroup: /system.slice/isc-dhcp-server.service
             └─829 /usr/sbin/dhcpd -4 -q -cf /etc/dhcp/dhcpd.conf lan0

Mar 02 08:14:29 gate systemd[1]: Starting isc-dhcp-server.service - LSB: DHCP server...
Mar 02 08:14:29 gate isc-dhcp-server[812]: Launching IPv4 server only.
Mar 02 08:14:29 gate dhcpd[829]: Wrote 0 leases to leases file.
Mar 02 08:14:29 gate dhcpd[829]: Server starting service.
Mar 02 08:14:31 gate isc-dhcp-server[812]: Starting ISC DHCPv4 server: dhcpd.
Mar 02 08:14:31 gate systemd[1]: Started isc-dhcp-server.service - LSB: DHCP server.
)",
     ""},
    {"stopped", 3, R"(○ isc-dhcp-server.service - LSB: DHCP server
     Loaded: loaded (/etc/init.d/isc-dhcp-server; generated)
     Active: inactive (dead) since Mon 2026-03-02 10:20:02 UTC; 4s ago
   Duration: 2h 5min 31.204s
       Docs: man:systemd-sysv-generator(8)
    Process: 812 ExecStart=/etc/init.d/isc-dhcp-server start (code=exited, status=0/SUCCESS)
    Process: 1207 ExecStop=/etc/init.d/isc-dhcp-server stop (code=exited, status=0/SUCCESS)

Mar 02 08:14:29 gate isc-dhcp-server[812]: Launching IPv4 server only.
Mar 02 08:14:29 gate dhcpd[829]: Wrote 0 leases to leases file.
Mar 02 08:14:29 gate dhcpd[829]: Server starting service.
Mar 02 08:14:31 gate isc-dhcp-server[812]: Starting ISC DHCPv4 server: dhcpd.
Mar 02 08:14:31 gate systemd[1]: Started isc-dhcp-server.service - LSB: DHCP server.
Mar 02 10:20:02 gate systemd[1]: Stopping isc-dhcp-server.service - LSB: DHCP server...
Mar 02 10:20:02 gate isc-dhcp-server[1207]: Stopping ISC DHCPv4 server: dhcpd.
Mar 02 10:20:02 gate systemd[1]: isc-dhcp-server.service: Deactivated successfully.
Mar 02 10:20:02 gate systemd[1]: Stopped isc-dhcp-server.service - LSB: DHCP server.
)",
     ""},
    {"failed", 3, R"(× isc-dhcp-server.service - LSB: DHCP server
     Loaded: loaded (/etc/init.d/isc-dhcp-server; generated)
     Active: failed (Result: exit-code) since Mon 2026-03-02 10:21:40 UTC; 7s ago
   Duration: 73ms
       Docs: man:systemd-sysv-generator(8)
    Process: 1311 ExecStart=/etc/init.d/isc-dhcp-server start (code=exited, status=1/FAILURE)

Mar 02 10:21:40 gate dhcpd[1326]: If you think you have received this message due to a bug rather
Mar 02 10:21:40 gate dhcpd[1326]: than a configuration issue please read the section on submitting
Mar 02 10:21:40 gate dhcpd[1326]: bugs on either our web page at www.isc.org or in the README file
Mar 02 10:21:40 gate dhcpd[1326]: before submitting a bug.  These pages explain the proper
Mar 02 10:21:40 gate dhcpd[1326]: process and the information we find helpful for debugging.
Mar 02 10:21:40 gate dhcpd[1326]:
Mar 02 10:21:40 gate dhcpd[1326]: exiting.
Mar 02 10:21:40 gate systemd[1]: isc-dhcp-server.service: Control process exited, code=exited, status=1/FAILURE
Mar 02 10:21:40 gate systemd[1]: isc-dhcp-server.service: Failed with result 'exit-code'.
Mar 02 10:21:40 gate systemd[1]: Failed to start isc-dhcp-server.service - LSB: DHCP server.
)",
     ""},
    {"activating", 3, R"(● isc-dhcp-server.service - LSB: DHCP server
     Loaded: loaded (/etc/init.d/isc-dhcp-server; generated)
     Active: activating (start) since Mon 2026-03-02 10:22:10 UTC; 1s ago
       Docs: man:systemd-sysv-generator(8)
  Cntrl PID: 1402 (isc-dhcp-server)
     CGroup: /system.slice/isc-dhcp-server.service
             └─1402 /bin/sh /etc/init.d/isc-dhcp-server start

Mar 02 10:22:10 gate systemd[1]: Starting isc-dhcp-server.service - LSB: DHCP server...
)",
     ""},
    {"deactivating", 3, R"(● isc-dhcp-server.service - LSB: DHCP server
     Loaded: loaded (/etc/init.d/isc-dhcp-server; generated)
     Active: deactivating (stop) since Mon 2026-03-02 10:23:24 UTC; 1s ago
       Docs: man:systemd-sysv-generator(8)
    Process: 1402 ExecStart=/etc/init.d/isc-dhcp-server start (code=exited, status=0/SUCCESS)
  Cntrl PID: 1451 (isc-dhcp-server)
     CGroup: /system.slice/isc-dhcp-server.service
             ├─1419 /usr/sbin/dhcpd -4 -q -cf /etc/dhcp/dhcpd.conf lan0
             └─1451 /bin/sh /etc/init.d/isc-dhcp-server stop

Mar 02 10:22:10 gate systemd[1]: Starting isc-dhcp-server.service - LSB: DHCP server...
Mar 02 10:22:10 gate isc-dhcp-server[1402]: Launching IPv4 server only.
Mar 02 10:22:10 gate dhcpd[1419]: Wrote 0 leases to leases file.
Mar 02 10:22:10 gate dhcpd[1419]: Server starting service.
Mar 02 10:22:12 gate isc-dhcp-server[1402]: Starting ISC DHCPv4 server: dhcpd.
Mar 02 10:22:12 gate systemd[1]: Started isc-dhcp-server.service - LSB: DHCP server.
Mar 02 10:23:24 gate systemd[1]: Stopping isc-dhcp-server.service - LSB: DHCP server...
)",
     ""},
    {"no-such-unit", 4, "", "Unit isc-dhcp-server.service could not be found.\n"},
}};

QString nameOf(FakeSystemctl::State state) { return QString::fromLatin1(statusOfStates.at(state).name); }

} // namespace

FakeSystemctl::FakeSystemctl(State state)
    : m_oldPath{qgetenv("PATH")}
{
    setInstalled(true);
    for (const State every : {Running, Stopped, Failed, Activating, Deactivating, NoSuchUnit})
        writeReply(nameOf(every), statusReply(every));
    setState(state);
    const auto leadingTo = [](State next) { return Reply{{}, {}, 0, next, 0}; };
    setReply(QStringLiteral("start"), leadingTo(Running));
    setReply(QStringLiteral("stop"), leadingTo(Stopped));
    setReply(QStringLiteral("restart"), leadingTo(Running));
}

FakeSystemctl::~FakeSystemctl() { qputenv("PATH", m_oldPath); }

FakeSystemctl::Reply FakeSystemctl::statusReply(State state)
{
    const Status &status{statusOfStates.at(state)};
    return {status.output, status.errors, status.exitCode, {}, 0};
}

void FakeSystemctl::setState(State state)
{
    const QString link{filePath(QStringLiteral("status"))};
    QFile::remove(link);
    QVERIFY(QFile::link(nameOf(state), link));
}

void FakeSystemctl::setReply(const QString &verb, const Reply &reply)
{
    const QString folder{QStringLiteral("reply-") + verb};
    writeReply(folder, reply);
    QFile::remove(filePath(verb));
    QVERIFY(QFile::link(folder, filePath(verb)));
}

void FakeSystemctl::hold(const QString &verb) { writeTestFile(filePath(verb + QStringLiteral(".held")), {}); }

void FakeSystemctl::release(const QString &verb) { QVERIFY(QFile::remove(filePath(verb + QStringLiteral(".held")))); }

void FakeSystemctl::setInstalled(bool installed)
{
    const QString program{filePath(QStringLiteral("systemctl"))};
    const QByteArray folder{QFile::encodeName(m_folder.path())};
    if (installed) {
        writeTestFile(program, script);
        QVERIFY(QFile::setPermissions(program, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
        qputenv("PATH", folder + ':' + m_oldPath);
    } else {
        QVERIFY(QFile::remove(program));
        qputenv("PATH", folder);
    }
}

QList<QStringList> FakeSystemctl::calls() const
{
    QList<QStringList> calls;
    QFile record{filePath(QStringLiteral("calls"))};
    if (!record.open(QIODevice::ReadOnly))
        return calls; // not called yet
    QStringList arguments;
    while (!record.atEnd()) {
        const QString argument{QString::fromLocal8Bit(record.readLine().chopped(1))};
        if (argument.isEmpty())
            calls.append(std::exchange(arguments, {}));
        else
            arguments.append(argument);
    }
    return calls;
}

QStringList FakeSystemctl::verbs() const
{
    QStringList verbs;
    for (const QStringList &arguments : calls())
        verbs.append(arguments.value(0));
    return verbs;
}

QString FakeSystemctl::filePath(const QString &name) const { return m_folder.filePath(name); }

void FakeSystemctl::writeReply(const QString &folder, const Reply &reply)
{
    QVERIFY(QDir{}.mkpath(filePath(folder)));
    const QDir replyFolder{filePath(folder)};
    writeTestFile(replyFolder.filePath(QStringLiteral("begin")),
                  reply.seconds ? "sleep " + QByteArray::number(reply.seconds) : QByteArray{});
    writeTestFile(replyFolder.filePath(QStringLiteral("output")), reply.output);
    writeTestFile(replyFolder.filePath(QStringLiteral("errors")), reply.errors);
    QString end;
    if (reply.state)
        end += QStringLiteral("ln -sfn %1 \"$here/status\"\n").arg(nameOf(*reply.state));
    end += reply.signal ? QStringLiteral("kill -%1 $$\n").arg(reply.signal)
                        : QStringLiteral("exit %1\n").arg(reply.exitCode);
    writeTestFile(replyFolder.filePath(QStringLiteral("end")), end.toLocal8Bit());
}
