// SPDX-License-Identifier: GPL-3.0-or-later
#include "server/dhcpservermanager.h"
#include "server/servicewatch.h"
#include "tests/server/managerevents.h"
#include "tests/support/contexttranslator.h"
#include "tests/support/fakesystemctl.h"
#include "tests/support/temporaryroot.h"

#include <QDir>
#include <QFile>
#include <QMetaMethod>
#include <QProcess>
#include <QRegularExpression>
#include <QScopeGuard>
#include <QStandardPaths>
#include <QTest>

#include <csignal>
#include <limits>
#include <memory>

namespace {

using said::alreadyRunning;
using said::alreadyStopped;
using said::busy;
using said::running;
using said::stopped;
using said::updating;

using Slot = void (DhcpServerManager::*)();

QString failedOperation(const char *detail) { return said::failedOperation(QString::fromUtf8(detail)); }

QString failedQuery(const char *detail)
{
    return QStringLiteral("error: Checking DHCP-server status failed\n") + QString::fromUtf8(detail);
}

// A manager on a machine of its own, and everything that it has said so far, in order.
struct Machine
{
    explicit Machine(FakeSystemctl::State state)
        : systemctl{state}
        , manager{std::make_unique<DhcpServerManager>()}
    {
        said::record(*manager, events);
    }

    // A machine whose manager knows the state of the service already, with nothing recorded yet.
    static std::unique_ptr<Machine> known(FakeSystemctl::State state)
    {
        auto machine = std::make_unique<Machine>(state);
        machine->manager->checkRunning();
        machine->events.clear();
        return machine;
    }

    void call(Slot slot) const { ((*manager).*slot)(); }

    QStringList events;
    TemporaryRoot root;
    FakeSystemctl systemctl;
    QObject context;
    std::unique_ptr<DhcpServerManager> manager;
};

// The verbs given after the query with which known() begins.
QStringList afterFirstQuery(const QStringList &verbs) { return QStringList{QStringLiteral("status")} + verbs; }

// The fake's program is this shell script from now on.
void replaceSystemctl(const QByteArray &script)
{
    writeTestFile(QStandardPaths::findExecutable(QStringLiteral("systemctl")), "#!/bin/sh\n" + script);
}

// The lines of a script that answers one thing at its first call and another one later.
QByteArray answersInTurn(const QByteArray &first, const QByteArray &later)
{
    return "echo >>\"$0.turns\"\nif [ \"$(wc -l <\"$0.turns\")\" -eq 1 ]; then " + first + "; else " + later + "; fi\n";
}

// How often such a script has been called.
qint64 turns()
{
    QFile turns{QStandardPaths::findExecutable(QStringLiteral("systemctl")) + QStringLiteral(".turns")};
    return turns.open(QIODevice::ReadOnly) ? turns.size() : 0;
}

constexpr int longestOutput{64 * 1024};

// The most memory that this process has had at once, in KiB.
int peakMemory()
{
    static const QRegularExpression peak{QStringLiteral("VmHWM:\\s*(\\d+) kB")};
    return peak.match(QString::fromLatin1(readTestFile(QStringLiteral("/proc/self/status")))).captured(1).toInt();
}

FakeSystemctl::Reply deadServer() { return {"     Active: active (exited) since Mon\n", {}, 0, {}, 0}; }

// While it lives, Qt's warnings are recorded.
class WarningRecorder final
{
public:
    WarningRecorder()
        : m_former{qInstallMessageHandler(
              [](QtMsgType, const QMessageLogContext &, const QString &message) { messages().append(message); })}
    {
        messages().clear();
    }
    ~WarningRecorder() { qInstallMessageHandler(m_former); }
    Q_DISABLE_COPY_MOVE(WarningRecorder)

    QStringList recorded() const { return messages(); }

private:
    static QStringList &messages()
    {
        static QStringList messages;
        return messages;
    }

    QtMessageHandler m_former;
};

void addOperationRows()
{
    QTest::addColumn<Slot>("operation");
    QTest::addColumn<QString>("verb");
    QTest::addColumn<FakeSystemctl::State>("before");
    QTest::addRow("start") << Slot{&DhcpServerManager::runServer} << "start" << FakeSystemctl::Stopped;
    QTest::addRow("stop") << Slot{&DhcpServerManager::stopServer} << "stop" << FakeSystemctl::Running;
    QTest::addRow("restart") << Slot{&DhcpServerManager::restartServer} << "restart" << FakeSystemctl::Running;
}

QString stateName(FakeSystemctl::State state) { return state == FakeSystemctl::Running ? running : stopped; }

} // namespace

Q_DECLARE_METATYPE(Slot)
Q_DECLARE_METATYPE(FakeSystemctl::State)
Q_DECLARE_METATYPE(FakeSystemctl::Reply)
Q_DECLARE_METATYPE(QMetaMethod::MethodType)

class DhcpServerManagerTest final : public QObject
{
    Q_OBJECT

private slots:
    void hasTheInterfaceThatQueuedSignalsNeed_data();
    void hasTheInterfaceThatQueuedSignalsNeed();
    void textOfState_data();
    void textOfState();
    void textsAreTranslatedInTheObjectContext();
    void asksNothingUntilTold();
    void readsStateFromStatus_data();
    void readsStateFromStatus();
    void keepsKnownState_data();
    void keepsKnownState();
    void repeatsAnUnchangedState();
    void reportsCrashedQuery_data();
    void reportsCrashedQuery();
    void saysNothingWhenQueryCannotStart();
    void readsLimitedOutputOfQuery_data();
    void readsLimitedOutputOfQuery();
    void endsQueryThatPrintsWithoutEnd_data();
    void endsQueryThatPrintsWithoutEnd();
    void asksForPlainOutput();
    void waitsForSlowQuery();
    void callsSystemctlWithVerbAndUnit();
    void performsOperation_data();
    void performsOperation();
    void informsThatOperationIsNotNeeded_data();
    void informsThatOperationIsNotNeeded();
    void startsStoppedServiceOnRestart();
    void restartsServiceWhoseServerHasDied_data();
    void restartsServiceWhoseServerHasDied();
    void startsAgainOnceServiceWasStopped();
    void refusesOperationBeforeFirstQuery_data() { addOperationRows(); }
    void refusesOperationBeforeFirstQuery();
    void refusesOperationDuringAnother_data() { addOperationRows(); }
    void refusesOperationDuringAnother();
    void staysUpdatingWhenOutcomeIsUnclear_data() { addOperationRows(); }
    void staysUpdatingWhenOutcomeIsUnclear();
    void sendsCommandWhenQueryIsUnclear_data() { addOperationRows(); }
    void sendsCommandWhenQueryIsUnclear();
    void sendsCommandWhenQueryCrashes_data() { addOperationRows(); }
    void sendsCommandWhenQueryCrashes();
    void reportsFailedOperation_data();
    void reportsFailedOperation();
    void reportsOperationThatCannotStart_data() { addOperationRows(); }
    void reportsOperationThatCannotStart();
    void staysUpdatingWithoutSystemctl();
    void leavesNothingBehindAfterFailures();
    void readsLimitedOutputOfOperation_data();
    void readsLimitedOutputOfOperation();
    void endsOperationThatPrintsWithoutEnd();
    void doesNotTakeOutputOfOperationForStatus();
    void reportsEachOfManyOperationsOnce();
    void doesNotQueryDuringOperation();
    void endsQuietlyDuringOperation();
    void followsTheState_data();
    void followsTheState();
    void followsWithoutWaiting();
    void followsWhatChangesDuringQuery();
    void followsNothingDuringOperation();
    void watchesWithoutBus();
};

void DhcpServerManagerTest::hasTheInterfaceThatQueuedSignalsNeed_data()
{
    QTest::addColumn<QByteArray>("signature");
    QTest::addColumn<QMetaMethod::MethodType>("type");
    for (const char *signature : {"information(QString)", "error(QString)", "interfacesChanged(QString)",
                                  "serverStateChanged(DhcpServerManager::ServerStates)"})
        QTest::addRow("%s", signature) << QByteArray{signature} << QMetaMethod::Signal;
    for (const char *signature : {"runServer()", "stopServer()", "restartServer()", "checkRunning()",
                                  "handleProcessFinished(int,QProcess::ExitStatus)", "writeDHCPServerConfig(QString)",
                                  "writeDHCPServerConfig()"})
        QTest::addRow("%s", signature) << QByteArray{signature} << QMetaMethod::Slot;
}

void DhcpServerManagerTest::hasTheInterfaceThatQueuedSignalsNeed()
{
    QFETCH(const QByteArray, signature);
    const TemporaryRoot root;
    const DhcpServerManager manager;
    const QMetaObject *metaObject{manager.metaObject()};
    const int index{metaObject->indexOfMethod(signature)};
    QVERIFY(index >= 0);
    QTEST(metaObject->method(index).methodType(), "type");
    QVERIFY(QMetaType::type("DhcpServerManager::ServerStates") != QMetaType::UnknownType);
}

void DhcpServerManagerTest::textOfState_data()
{
    QTest::addColumn<int>("state");
    QTest::addColumn<QString>("text");
    QTest::addRow("updating") << 0 << "Updating DHCP-server status...";
    QTest::addRow("running") << 1 << "DHCP-server is running";
    QTest::addRow("stopped") << 2 << "DHCP-server is stopped";
    QTest::addRow("above") << 3 << QString{};
    QTest::addRow("below") << -1 << QString{};
    QTest::addRow("largest") << std::numeric_limits<int>::max() << QString{};
}

void DhcpServerManagerTest::textOfState()
{
    QFETCH(const int, state);
    QTEST(DhcpServerManager::stateText(static_cast<DhcpServerManager::ServerStates>(state)), "text");
}

void DhcpServerManagerTest::textsAreTranslatedInTheObjectContext()
{
    ContextTranslator translator;
    QVERIFY(QCoreApplication::installTranslator(&translator));
    Machine machine{FakeSystemctl::Running};
    QCOMPARE(machine.manager->serverStateText(), QStringLiteral("QObject|Updating DHCP-server status..."));
    machine.manager->runServer();
    machine.manager->checkRunning();
    machine.manager->runServer();
    machine.systemctl.setState(FakeSystemctl::Stopped);
    machine.manager->stopServer();
    machine.systemctl.setReply(QStringLiteral("status"), {{}, "lost", 0, {}, SIGKILL});
    machine.manager->checkRunning();
    machine.manager->handleProcessFinished(1, QProcess::NormalExit);
    machine.manager->readInterfacesFile(QStringLiteral("/no/such/file"));
    machine.manager->writeDHCPServerConfig(QStringLiteral("/no/such/file"));
    machine.events.removeAll(running);
    machine.events.removeAll(stopped);
    const QStringList expected{
        QStringLiteral("error: QObject|Some operation with DHCP-server already executes"),
        QStringLiteral("information: QObject|DHCP-server already running"),
        QStringLiteral("information: QObject|DHCP-server already stopped"),
        QStringLiteral("error: QObject|Checking DHCP-server status failed\nlost"),
        QStringLiteral("error: QObject|Operation with DHCP-server failed\n"),
        QStringLiteral("error: QObject|Checking DHCP-server status failed\nlost"),
        QStringLiteral("error: QObject|Unable to open file '/no/such/file' for read"),
        QStringLiteral("error: QObject|Unable to open file '%1' for read").arg(paths::serverDefaults()),
        QStringLiteral("error: QObject|Unable to open file '/no/such/file' for write"),
    };
    QCOMPARE(machine.events, expected);
}

void DhcpServerManagerTest::asksNothingUntilTold()
{
    const Machine machine{FakeSystemctl::Running};
    QVERIFY(!machine.manager->isServerRunning());
    QCOMPARE(machine.manager->serverStateText(), QStringLiteral("Updating DHCP-server status..."));
    QCOMPARE(machine.systemctl.calls(), QList<QStringList>{});
}

void DhcpServerManagerTest::readsStateFromStatus_data()
{
    QTest::addColumn<FakeSystemctl::Reply>("reply");
    QTest::addColumn<QStringList>("events");
    const auto status = [](FakeSystemctl::State state) { return FakeSystemctl::statusReply(state); };
    const auto saying = [](const char *output, int exitCode = 0) {
        return FakeSystemctl::Reply{output, {}, exitCode, {}, 0};
    };
    QTest::addRow("running") << status(FakeSystemctl::Running) << QStringList{running};
    QTest::addRow("stopped, exit code 3") << status(FakeSystemctl::Stopped) << QStringList{stopped};
    QTest::addRow("failed, exit code 3") << status(FakeSystemctl::Failed) << QStringList{stopped};
    QTest::addRow("activating") << status(FakeSystemctl::Activating) << QStringList{};
    QTest::addRow("deactivating") << status(FakeSystemctl::Deactivating) << QStringList{};
    QTest::addRow("no such unit") << status(FakeSystemctl::NoSuchUnit) << QStringList{};
    QTest::addRow("nothing printed") << saying("") << QStringList{};
    QTest::addRow("stopped, exit code 0") << saying("Active: inactive (dead)") << QStringList{stopped};
    QTest::addRow("running, exit code 3") << saying("Active: active (running)", 3) << QStringList{running};
    QTest::addRow("failed before running")
        << saying("Active: failed\nActive: active (running)\n") << QStringList{stopped, running};
    QTest::addRow("running before dead") << saying("Active: active (running)\nActive: inactive (dead)\n")
                                         << QStringList{stopped, running};
    QTest::addRow("dead and failed") << saying("Active: inactive (dead)\nActive: failed\n") << QStringList{stopped};
    QTest::addRow("inside a line") << saying("log: \"Active: active (running)\" it said") << QStringList{running};
    QTest::addRow("beside other bytes") << saying("\xff\xfe Active: failed \xc3") << QStringList{stopped};
    QTest::addRow("other letter case") << saying("active: active (running)\nACTIVE: FAILED\n") << QStringList{};
    QTest::addRow("active but exited") << saying("Active: active (exited)") << QStringList{stopped};
    QTest::addRow("exited before running")
        << saying("Active: active (exited)\nActive: active (running)\n") << QStringList{stopped, running};
    QTest::addRow("in colours")
        << saying("\x1b[0;1;32m\u25cf\x1b[0m x\n  Active: \x1b[0;1;32mactive (running)\x1b[0m since")
        << QStringList{running};
    QTest::addRow("in parts of several colours")
        << saying("Active: \x1b[38;5;185minactive\x1b[0m \x1b[1m(dead)\x1b[m") << QStringList{stopped};
    QTest::addRow("in a link") << saying("Active: \x1b]8;;file:///x\x07"
                                         "failed\x1b]8;;\x07 (Result)")
                               << QStringList{stopped};
    QTest::addRow("in a link of the other kind") << saying("Active: \x1b]8;;file:///x\x1b\\"
                                                           "failed\x1b]8;;\x1b\\")
                                                 << QStringList{stopped};
    QTest::addRow("behind a null byte") << FakeSystemctl::Reply{QByteArray{"x\0y\nActive: failed", 18}, {}, 0, {}, 0}
                                        << QStringList{stopped};
    QTest::addRow("parted by a null byte")
        << FakeSystemctl::Reply{QByteArray{"Active: \0failed", 15}, {}, 0, {}, 0} << QStringList{stopped};
    QTest::addRow("inactive, not dead") << saying("Active: inactive") << QStringList{};
    QTest::addRow("on the other channel")
        << FakeSystemctl::Reply{{}, "Active: active (running)", 0, {}, 0} << QStringList{};
}

void DhcpServerManagerTest::readsStateFromStatus()
{
    QFETCH(const FakeSystemctl::Reply, reply);
    QFETCH(const QStringList, events);
    Machine machine{FakeSystemctl::NoSuchUnit};
    machine.systemctl.setReply(QStringLiteral("status"), reply);
    machine.manager->checkRunning();
    QCOMPARE(machine.events, events);
    QCOMPARE(machine.manager->isServerRunning(), events.value(events.size() - 1) == running);
    QCOMPARE(machine.systemctl.verbs(), QStringList{QStringLiteral("status")});
}

void DhcpServerManagerTest::keepsKnownState_data()
{
    QTest::addColumn<FakeSystemctl::State>("unclear");
    QTest::addRow("activating") << FakeSystemctl::Activating;
    QTest::addRow("deactivating") << FakeSystemctl::Deactivating;
    QTest::addRow("no such unit") << FakeSystemctl::NoSuchUnit;
}

void DhcpServerManagerTest::keepsKnownState()
{
    QFETCH(const FakeSystemctl::State, unclear);
    const auto machine = Machine::known(FakeSystemctl::Running);
    machine->systemctl.setState(unclear);
    machine->manager->checkRunning();
    QCOMPARE(machine->events, QStringList{});
    QVERIFY(machine->manager->isServerRunning());
}

void DhcpServerManagerTest::repeatsAnUnchangedState()
{
    const auto machine = Machine::known(FakeSystemctl::Running);
    machine->manager->checkRunning();
    machine->manager->checkRunning();
    QCOMPARE(machine->events, (QStringList{running, running}));
}

void DhcpServerManagerTest::reportsCrashedQuery_data()
{
    QTest::addColumn<QByteArray>("errors");
    QTest::addColumn<QString>("event");
    QTest::addRow("text kept as printed")
        << QByteArray{"Failed to connect to bus\n"} << failedQuery("Failed to connect to bus\n");
    QTest::addRow("nothing printed") << QByteArray{} << failedQuery("");
    QTest::addRow("UTF-8") << QByteArray{"Nicht m\xc3\xb6glich\n"} << failedQuery("Nicht m\u00f6glich\n");
    QTest::addRow("not UTF-8") << QByteArray{"Nicht m\xf6glich\n"} << failedQuery("Nicht m\ufffdglich\n");
    QTest::addRow("a placeholder") << QByteArray{"100%1"} << failedQuery("100%1");
}

void DhcpServerManagerTest::reportsCrashedQuery()
{
    QFETCH(const QByteArray, errors);
    QFETCH(const QString, event);
    const auto machine = Machine::known(FakeSystemctl::Running);
    // What it printed before it crashed is ignored.
    machine->systemctl.setReply(QStringLiteral("status"), {"Active: failed\n", errors, 0, {}, SIGKILL});
    machine->manager->checkRunning();
    QCOMPARE(machine->events, QStringList{event});
    QVERIFY(machine->manager->isServerRunning());
}

void DhcpServerManagerTest::saysNothingWhenQueryCannotStart()
{
    const auto machine = Machine::known(FakeSystemctl::Running);
    machine->systemctl.setReply(QStringLiteral("status"), {"Active: failed\n", "lost\n", 0, {}, SIGKILL});
    machine->manager->checkRunning();
    machine->events.clear();

    machine->systemctl.setInstalled(false);
    machine->manager->checkRunning();
    QCoreApplication::processEvents();
    QCOMPARE(machine->events, QStringList{});
    QVERIFY(machine->manager->isServerRunning());

    machine->systemctl.setInstalled(true);
    machine->systemctl.setState(FakeSystemctl::Stopped);
    machine->manager->checkRunning();
    QCOMPARE(machine->events, QStringList{stopped});
}

void DhcpServerManagerTest::readsLimitedOutputOfQuery_data()
{
    QTest::addColumn<QByteArray>("output");
    QTest::addColumn<QStringList>("events");
    const QByteArray phrase{"Active: active (running)"};
    QTest::addRow("at the limit") << QByteArray(longestOutput - phrase.size(), '.') + phrase << QStringList{running};
    QTest::addRow("beyond it") << QByteArray(longestOutput, '.') + phrase << QStringList{};
    QTest::addRow("at the beginning of much") << phrase + QByteArray(300 * 1024, '.') << QStringList{running};
}

void DhcpServerManagerTest::readsLimitedOutputOfQuery()
{
    QFETCH(const QByteArray, output);
    QFETCH(const QStringList, events);
    Machine machine{FakeSystemctl::Stopped};
    machine.systemctl.setReply(QStringLiteral("status"), {output, "less\n", 0, {}, 0});
    machine.manager->checkRunning();
    QCOMPARE(machine.events, events);
}

void DhcpServerManagerTest::endsQueryThatPrintsWithoutEnd_data()
{
    QTest::addColumn<QByteArray>("channel");
    QTest::addRow("output") << QByteArray{};
    QTest::addRow("errors") << QByteArray{" >&2"};
}

void DhcpServerManagerTest::endsQueryThatPrintsWithoutEnd()
{
    QFETCH(const QByteArray, channel);
    const Machine machine{FakeSystemctl::Stopped};
    replaceSystemctl("echo 'Active: active (running)'; echo $$ >\"$0.pid\"; exec yes" + channel + '\n');
    const QString pid{QStandardPaths::findExecutable(QStringLiteral("systemctl")) + QStringLiteral(".pid")};
    const int before{peakMemory()};
    machine.manager->checkRunning();
    QCOMPARE(machine.events, QStringList{running});
    QVERIFY(peakMemory() - before < 4 * 1024);
    QVERIFY(!QFile::exists(QStringLiteral("/proc/") + QString::fromLatin1(readTestFile(pid)).trimmed()));
}

void DhcpServerManagerTest::asksForPlainOutput()
{
    const QVector<QByteArray> names{"LC_ALL", "SYSTEMD_COLORS", "SYSTEMD_PAGER", "SYSTEMD_URLIFY"};
    QVector<QByteArray> before;
    for (const QByteArray &name : names) {
        before.append(qgetenv(name));
        qputenv(name, "1");
    }
    const auto restore = qScopeGuard([&] {
        for (int i{0}; i < names.size(); ++i) {
            if (before.at(i).isNull())
                qunsetenv(names.at(i));
            else
                qputenv(names.at(i), before.at(i));
        }
    });
    const Machine machine{FakeSystemctl::Stopped};
    replaceSystemctl("[ \"$LC_ALL,$SYSTEMD_COLORS,${SYSTEMD_PAGER-x},$SYSTEMD_URLIFY\" = C,0,,0 ] && "
                     "echo 'Active: active (running)'\n");
    machine.manager->checkRunning();
    QCOMPARE(machine.events, QStringList{running});
}

// QProcess by itself gives up after 30 seconds.
void DhcpServerManagerTest::waitsForSlowQuery()
{
    Machine machine{FakeSystemctl::Stopped};
    FakeSystemctl::Reply late{FakeSystemctl::statusReply(FakeSystemctl::Running)};
    late.seconds = 31;
    machine.systemctl.setReply(QStringLiteral("status"), late);
    machine.manager->checkRunning();
    QCOMPARE(machine.events, QStringList{running});
}

void DhcpServerManagerTest::callsSystemctlWithVerbAndUnit()
{
    const auto machine = Machine::known(FakeSystemctl::Stopped);
    machine->manager->runServer();
    QTRY_COMPARE(machine->events, (QStringList{stopped, updating, running}));
    machine->manager->restartServer();
    QTRY_COMPARE(machine->events.size(), 6);
    machine->manager->stopServer();
    QTRY_COMPARE(machine->events.size(), 9);

    QList<QStringList> calls;
    for (const char *verb :
         {"status", "status", "start", "status", "status", "restart", "status", "status", "stop", "status"})
        calls.append({QString::fromLatin1(verb), QStringLiteral("isc-dhcp-server")});
    QCOMPARE(machine->systemctl.calls(), calls);
}

void DhcpServerManagerTest::performsOperation_data()
{
    QTest::addColumn<Slot>("operation");
    QTest::addColumn<FakeSystemctl::State>("before");
    QTest::addColumn<QString>("verb");
    QTest::addColumn<QStringList>("events");
    const Slot start{&DhcpServerManager::runServer};
    const Slot stop{&DhcpServerManager::stopServer};
    const Slot restart{&DhcpServerManager::restartServer};
    QTest::addRow("start") << start << FakeSystemctl::Stopped << "start" << QStringList{stopped, updating, running};
    QTest::addRow("start after failure") << start << FakeSystemctl::Failed << "start"
                                         << QStringList{stopped, updating, running};
    QTest::addRow("stop") << stop << FakeSystemctl::Running << "stop" << QStringList{running, updating, stopped};
    QTest::addRow("restart") << restart << FakeSystemctl::Running << "restart"
                             << QStringList{running, updating, running};
}

void DhcpServerManagerTest::performsOperation()
{
    QFETCH(const Slot, operation);
    QFETCH(const FakeSystemctl::State, before);
    QFETCH(const QString, verb);
    QFETCH(const QStringList, events);
    const auto machine = Machine::known(before);
    machine->call(operation);
    // The call does not wait for the command.
    QCOMPARE(machine->events, events.mid(0, 2));
    QCOMPARE(machine->manager->serverStateText(), QStringLiteral("Updating DHCP-server status..."));
    QTRY_COMPARE(machine->events, events);
    QCOMPARE(machine->systemctl.verbs(), afterFirstQuery({QStringLiteral("status"), verb, QStringLiteral("status")}));
    QCOMPARE(machine->manager->isServerRunning(), events.constLast() == running);
}

void DhcpServerManagerTest::informsThatOperationIsNotNeeded_data()
{
    QTest::addColumn<Slot>("operation");
    QTest::addColumn<FakeSystemctl::State>("believed");
    QTest::addColumn<FakeSystemctl::State>("found");
    QTest::addColumn<QString>("information");
    const Slot start{&DhcpServerManager::runServer};
    const Slot stop{&DhcpServerManager::stopServer};
    QTest::addRow("start") << start << FakeSystemctl::Running << FakeSystemctl::Running << alreadyRunning;
    QTest::addRow("start, started meanwhile")
        << start << FakeSystemctl::Stopped << FakeSystemctl::Running << alreadyRunning;
    QTest::addRow("stop") << stop << FakeSystemctl::Stopped << FakeSystemctl::Stopped << alreadyStopped;
    QTest::addRow("stop, failed meanwhile")
        << stop << FakeSystemctl::Running << FakeSystemctl::Failed << alreadyStopped;
}

void DhcpServerManagerTest::informsThatOperationIsNotNeeded()
{
    QFETCH(const Slot, operation);
    QFETCH(const FakeSystemctl::State, believed);
    QFETCH(const FakeSystemctl::State, found);
    QFETCH(const QString, information);
    const auto machine = Machine::known(believed);
    machine->systemctl.setState(found);
    machine->call(operation);
    QCOMPARE(machine->events, (QStringList{stateName(found), information}));
    QCOMPARE(machine->systemctl.verbs(), afterFirstQuery({QStringLiteral("status")}));
}

void DhcpServerManagerTest::startsStoppedServiceOnRestart()
{
    const auto machine = Machine::known(FakeSystemctl::Stopped);
    machine->manager->restartServer();
    QTRY_COMPARE(machine->events, (QStringList{stopped, stopped, updating, running}));
    QCOMPARE(machine->systemctl.verbs(), afterFirstQuery({QStringLiteral("status"), QStringLiteral("status"),
                                                          QStringLiteral("start"), QStringLiteral("status")}));
}

void DhcpServerManagerTest::restartsServiceWhoseServerHasDied_data()
{
    QTest::addColumn<Slot>("operation");
    QTest::addColumn<FakeSystemctl::State>("before");
    QTest::addColumn<QStringList>("events");
    const Slot start{&DhcpServerManager::runServer};
    const Slot restart{&DhcpServerManager::restartServer};
    QTest::addRow("start") << start << FakeSystemctl::Stopped << QStringList{stopped, updating, running};
    QTest::addRow("start of what ran") << start << FakeSystemctl::Running << QStringList{stopped, updating, running};
    QTest::addRow("restart") << restart << FakeSystemctl::Running << QStringList{stopped, stopped, updating, running};
}

void DhcpServerManagerTest::restartsServiceWhoseServerHasDied()
{
    QFETCH(const Slot, operation);
    QFETCH(const FakeSystemctl::State, before);
    QFETCH(const QStringList, events);
    const auto machine = Machine::known(before);
    machine->systemctl.setReply(QStringLiteral("status"), deadServer());
    machine->call(operation);
    QTRY_COMPARE(machine->events, events);
    QStringList verbs{machine->systemctl.verbs()};
    verbs.removeAll(QStringLiteral("status"));
    QCOMPARE(verbs, QStringList{QStringLiteral("restart")});
}

void DhcpServerManagerTest::startsAgainOnceServiceWasStopped()
{
    const auto machine = Machine::known(FakeSystemctl::Running);
    machine->systemctl.setReply(QStringLiteral("status"), deadServer());
    machine->manager->checkRunning();
    machine->systemctl.setState(FakeSystemctl::Stopped);
    machine->manager->runServer();
    QTRY_COMPARE(machine->events, (QStringList{stopped, stopped, updating, running}));
    QCOMPARE(machine->systemctl.verbs().at(3), QStringLiteral("start"));
}

void DhcpServerManagerTest::refusesOperationBeforeFirstQuery()
{
    QFETCH(const Slot, operation);
    Machine machine{FakeSystemctl::Stopped};
    machine.call(operation);
    QCOMPARE(machine.events, QStringList{busy});
    QCOMPARE(machine.systemctl.verbs(), QStringList{});
}

void DhcpServerManagerTest::refusesOperationDuringAnother()
{
    QFETCH(const Slot, operation);
    QFETCH(const FakeSystemctl::State, before);
    QFETCH(const QString, verb);
    const auto machine = Machine::known(before);
    machine->systemctl.hold(verb);
    machine->call(operation);
    const QStringList begun{stateName(before), updating};
    QCOMPARE(machine->events, begun);

    for (const Slot other :
         {&DhcpServerManager::runServer, &DhcpServerManager::stopServer, &DhcpServerManager::restartServer})
        machine->call(other);
    QCOMPARE(machine->events, (begun + QStringList{busy, busy, busy}));

    QTRY_COMPARE(machine->systemctl.verbs(), afterFirstQuery({QStringLiteral("status"), verb}));
    machine->events.clear();
    machine->systemctl.release(verb);
    QTRY_COMPARE(machine->events.size(), 1);
    QCOMPARE(machine->systemctl.verbs(), afterFirstQuery({QStringLiteral("status"), verb, QStringLiteral("status")}));
}

void DhcpServerManagerTest::staysUpdatingWhenOutcomeIsUnclear()
{
    QFETCH(const Slot, operation);
    QFETCH(const QString, verb);
    QFETCH(const FakeSystemctl::State, before);
    const auto machine = Machine::known(before);
    machine->systemctl.setReply(verb, {{}, {}, 0, FakeSystemctl::Activating, 0});
    machine->call(operation);
    QTRY_COMPARE(machine->systemctl.verbs(),
                 afterFirstQuery({QStringLiteral("status"), verb, QStringLiteral("status")}));
    QCOMPARE(machine->events, (QStringList{stateName(before), updating}));

    machine->events.clear();
    for (const Slot other :
         {&DhcpServerManager::runServer, &DhcpServerManager::stopServer, &DhcpServerManager::restartServer})
        machine->call(other);
    QCOMPARE(machine->events, (QStringList{busy, busy, busy}));

    machine->systemctl.setState(FakeSystemctl::Running);
    machine->manager->checkRunning();
    machine->manager->runServer();
    QCOMPARE(machine->events.mid(3), (QStringList{running, running, alreadyRunning}));
}

void DhcpServerManagerTest::sendsCommandWhenQueryIsUnclear()
{
    QFETCH(const Slot, operation);
    QFETCH(const QString, verb);
    QFETCH(const FakeSystemctl::State, before);
    const auto machine = Machine::known(before);
    machine->systemctl.setState(FakeSystemctl::Activating);
    machine->call(operation);
    QTRY_COMPARE(machine->events.size(), 2);
    QCOMPARE(machine->events, (QStringList{updating, verb == QLatin1String{"stop"} ? stopped : running}));
    QCOMPARE(machine->systemctl.verbs(), afterFirstQuery({QStringLiteral("status"), verb, QStringLiteral("status")}));
}

void DhcpServerManagerTest::sendsCommandWhenQueryCrashes()
{
    QFETCH(const Slot, operation);
    QFETCH(const QString, verb);
    QFETCH(const FakeSystemctl::State, before);
    const auto machine = Machine::known(before);
    machine->systemctl.setReply(QStringLiteral("status"), {{}, "lost\n", 0, {}, SIGKILL});
    machine->call(operation);
    QTRY_COMPARE(machine->events,
                 (QStringList{failedQuery("lost\n"), updating, verb == QLatin1String{"stop"} ? stopped : running}));
}

void DhcpServerManagerTest::reportsFailedOperation_data()
{
    QTest::addColumn<Slot>("operation");
    QTest::addColumn<QString>("verb");
    QTest::addColumn<FakeSystemctl::State>("before");
    QTest::addColumn<FakeSystemctl::Reply>("reply");
    QTest::addColumn<QStringList>("outcome");
    const Slot start{&DhcpServerManager::runServer};
    const Slot stop{&DhcpServerManager::stopServer};
    const Slot restart{&DhcpServerManager::restartServer};
    constexpr const char *jobFailed{
        "Job for isc-dhcp-server.service failed because the control process exited with error code.\n"
        "See \"systemctl status isc-dhcp-server.service\" and \"journalctl -xeu isc-dhcp-server.service\" for "
        "details.\n"};
    const auto failing = [](const char *errors, int exitCode, std::optional<FakeSystemctl::State> state = {}) {
        return FakeSystemctl::Reply{{}, errors, exitCode, state, 0};
    };
    const auto crashing = [](const char *errors, int signal) {
        return FakeSystemctl::Reply{{}, errors, 0, {}, signal};
    };
    QTest::addRow("start with a bad configuration")
        << start << "start" << FakeSystemctl::Stopped << failing(jobFailed, 1, FakeSystemctl::Failed)
        << QStringList{failedOperation(jobFailed), stopped};
    QTest::addRow("restart with a bad configuration")
        << restart << "restart" << FakeSystemctl::Running << failing(jobFailed, 1, FakeSystemctl::Failed)
        << QStringList{failedOperation(jobFailed), stopped};
    QTest::addRow("stop, still running") << stop << "stop" << FakeSystemctl::Running << failing("denied\n", 4)
                                         << QStringList{failedOperation("denied\n"), running};
    QTest::addRow("largest exit code") << start << "start" << FakeSystemctl::Stopped << failing("", 255)
                                       << QStringList{failedOperation(""), stopped};
    QTest::addRow("not UTF-8") << start << "start" << FakeSystemctl::Stopped << failing("m\xf6glich", 1)
                               << QStringList{failedOperation("m\ufffdglich"), stopped};
    QTest::addRow("start crashes") << start << "start" << FakeSystemctl::Stopped << crashing("oh\n", SIGKILL)
                                   << QStringList{failedOperation("oh\n"), stopped};
    QTest::addRow("stop crashes") << stop << "stop" << FakeSystemctl::Running << crashing("", SIGTERM)
                                  << QStringList{failedOperation(""), running};
    QTest::addRow("restart crashes") << restart << "restart" << FakeSystemctl::Running << crashing("oh", SIGHUP)
                                     << QStringList{failedOperation("oh"), running};
    QTest::addRow("complaint without failure")
        << start << "start" << FakeSystemctl::Stopped << failing("Warning: unit changed\n", 0, FakeSystemctl::Running)
        << QStringList{running};
}

void DhcpServerManagerTest::reportsFailedOperation()
{
    QFETCH(const Slot, operation);
    QFETCH(const QString, verb);
    QFETCH(const FakeSystemctl::State, before);
    QFETCH(const FakeSystemctl::Reply, reply);
    QFETCH(const QStringList, outcome);
    const auto machine = Machine::known(before);
    machine->systemctl.setReply(verb, reply);
    machine->call(operation);
    QTRY_COMPARE(machine->events, (QStringList{stateName(before), updating} + outcome));
    QCOMPARE(machine->systemctl.verbs(), afterFirstQuery({QStringLiteral("status"), verb, QStringLiteral("status")}));
}

void DhcpServerManagerTest::reportsOperationThatCannotStart()
{
    QFETCH(const Slot, operation);
    QFETCH(const FakeSystemctl::State, before);
    const auto machine = Machine::known(before);
    // The program is missing between the query before the command and the one after it.
    QObject::connect(machine->manager.get(), &DhcpServerManager::serverStateChanged, &machine->context,
                     [&machine](DhcpServerManager::ServerStates state) {
                         if (state == DhcpServerManager::Updating)
                             machine->systemctl.setInstalled(false);
                     });
    QObject::connect(machine->manager.get(), &DhcpServerManager::error, &machine->context,
                     [&machine] { machine->systemctl.setInstalled(true); });
    machine->call(operation);
    QTRY_COMPARE(machine->events.size(), 4);
    QCOMPARE(machine->events.mid(0, 2), (QStringList{stateName(before), updating}));
    const QString report{machine->events.at(2)};
    QVERIFY2(report.startsWith(failedOperation("")), qPrintable(report));
    QVERIFY2(report.size() > failedOperation("").size(), "the reason is missing");
    QCOMPARE(machine->events.at(3), stateName(before));
    QCOMPARE(machine->systemctl.verbs(), afterFirstQuery({QStringLiteral("status"), QStringLiteral("status")}));
}

void DhcpServerManagerTest::staysUpdatingWithoutSystemctl()
{
    const auto machine = Machine::known(FakeSystemctl::Stopped);
    machine->systemctl.setInstalled(false);
    machine->manager->runServer();
    QTRY_COMPARE(machine->events.size(), 2);
    QCOMPARE(machine->events.constFirst(), updating);
    QVERIFY(machine->events.constLast().startsWith(failedOperation("")));

    machine->systemctl.setInstalled(true);
    machine->manager->runServer();
    machine->manager->checkRunning();
    QCOMPARE(machine->events.mid(2), (QStringList{busy, stopped}));
}

void DhcpServerManagerTest::leavesNothingBehindAfterFailures()
{
    const QDir openFiles{QStringLiteral("/proc/self/fd")};
    const auto machine = Machine::known(FakeSystemctl::Stopped);
    // It is back for the query after the failure, which could trip over the remains of the command.
    connect(machine->manager.get(), &DhcpServerManager::serverStateChanged, &machine->context,
            [&machine](DhcpServerManager::ServerStates state) {
                if (state == DhcpServerManager::Updating)
                    machine->systemctl.setInstalled(false);
            });
    connect(machine->manager.get(), &DhcpServerManager::error, &machine->context,
            [&machine] { machine->systemctl.setInstalled(true); });
    QVector<QStringList::size_type> openAfterRound;
    const WarningRecorder warnings;
    for (int round{0}; round < 3; ++round) {
        machine->events.clear();
        machine->manager->runServer();
        QTRY_COMPARE(machine->events.size(), 4);
        openAfterRound.append(openFiles.entryList(QDir::NoDotAndDotDot | QDir::AllEntries | QDir::System).size());
    }
    QCOMPARE(openAfterRound, QVector<QStringList::size_type>(3, openAfterRound.constFirst()));
    QCOMPARE(warnings.recorded(), QStringList{}); // such as one about a closed descriptor
}

void DhcpServerManagerTest::readsLimitedOutputOfOperation_data()
{
    QTest::addColumn<int>("size");
    QTest::addRow("at the limit") << longestOutput;
    QTest::addRow("beyond it") << longestOutput + 1;
    QTest::addRow("far beyond it") << 300 * 1024;
}

void DhcpServerManagerTest::readsLimitedOutputOfOperation()
{
    QFETCH(const int, size);
    const auto machine = Machine::known(FakeSystemctl::Stopped);
    const QByteArray much(size, 'x');
    machine->systemctl.setReply(QStringLiteral("start"), {{}, much, 1, {}, 0});
    machine->manager->runServer();
    const QByteArray read{much.left(longestOutput)};
    QTRY_COMPARE(machine->events, (QStringList{stopped, updating, failedOperation(read.constData()), stopped}));
}

void DhcpServerManagerTest::endsOperationThatPrintsWithoutEnd()
{
    const auto machine = Machine::known(FakeSystemctl::Stopped);
    replaceSystemctl("[ $1 = start ] || { echo 'Active: failed'; exit 3; }\nexec yes\n");
    machine->manager->runServer();
    QTRY_COMPARE(machine->events, (QStringList{stopped, updating, failedOperation(""), stopped}));
}

void DhcpServerManagerTest::doesNotTakeOutputOfOperationForStatus()
{
    const auto machine = Machine::known(FakeSystemctl::Stopped);
    machine->systemctl.setReply(QStringLiteral("start"), {"Active: active (running)\n", "old\n", 0, {}, 0});
    machine->manager->runServer();
    QTRY_COMPARE(machine->events, (QStringList{stopped, updating, stopped}));

    // Nor is the complaint of one command taken for that of the next.
    machine->systemctl.setReply(QStringLiteral("start"), {{}, "new\n", 1, {}, 0});
    machine->events.clear();
    machine->manager->runServer();
    QTRY_COMPARE(machine->events, (QStringList{stopped, updating, failedOperation("new\n"), stopped}));
}

void DhcpServerManagerTest::reportsEachOfManyOperationsOnce()
{
    const auto machine = Machine::known(FakeSystemctl::Stopped);
    machine->systemctl.setReply(QStringLiteral("start"), {{}, "no\n", 1, {}, 0});
    QStringList events;
    for (int round{0}; round < 3; ++round) {
        machine->manager->runServer();
        events += {stopped, updating, failedOperation("no\n"), stopped};
        QTRY_COMPARE(machine->events, events);
    }
    QCOMPARE(machine->systemctl.verbs().size(), 1 + 3 * 3);
}

void DhcpServerManagerTest::doesNotQueryDuringOperation()
{
    const auto machine = Machine::known(FakeSystemctl::Stopped);
    machine->systemctl.hold(QStringLiteral("start"));
    machine->manager->runServer();
    machine->manager->checkRunning();
    QCOMPARE(machine->events, (QStringList{stopped, updating}));

    machine->systemctl.release(QStringLiteral("start"));
    QTRY_COMPARE(machine->events, (QStringList{stopped, updating, running}));
    QCOMPARE(machine->systemctl.verbs(),
             afterFirstQuery({QStringLiteral("status"), QStringLiteral("start"), QStringLiteral("status")}));
}

void DhcpServerManagerTest::endsQuietlyDuringOperation()
{
    const auto machine = Machine::known(FakeSystemctl::Stopped);
    machine->systemctl.hold(QStringLiteral("start"));
    machine->manager->runServer();
    const QStringList begun{afterFirstQuery({QStringLiteral("status"), QStringLiteral("start")})};
    QTRY_COMPARE(machine->systemctl.verbs(), begun);

    QTest::ignoreMessage(QtWarningMsg, QRegularExpression{QStringLiteral("QProcess: Destroyed while process")});
    machine->manager.reset();
    QCoreApplication::processEvents();
    QCOMPARE(machine->events, (QStringList{stopped, updating}));
    QCOMPARE(machine->systemctl.verbs(), begun);
}

void DhcpServerManagerTest::followsTheState_data()
{
    QTest::addColumn<FakeSystemctl::Reply>("reply");
    QTest::addColumn<QStringList>("events");
    const auto status = [](FakeSystemctl::State state) { return FakeSystemctl::statusReply(state); };
    QTest::addRow("as before") << status(FakeSystemctl::Running) << QStringList{};
    QTest::addRow("stopped") << status(FakeSystemctl::Stopped) << QStringList{stopped};
    QTest::addRow("failed") << status(FakeSystemctl::Failed) << QStringList{stopped};
    QTest::addRow("server died") << deadServer() << QStringList{stopped};
    QTest::addRow("unclear") << status(FakeSystemctl::Activating) << QStringList{};
    QTest::addRow("crashed") << FakeSystemctl::Reply{"Active: failed\n", "lost\n", 0, {}, SIGKILL} << QStringList{};
    QTest::addRow("failed before running")
        << FakeSystemctl::Reply{"Active: failed\nActive: active (running)\n", {}, 0, {}, 0} << QStringList{};
}

void DhcpServerManagerTest::followsTheState()
{
    QFETCH(const FakeSystemctl::Reply, reply);
    QFETCH(const QStringList, events);
    const auto machine = Machine::known(FakeSystemctl::Running);
    machine->systemctl.setReply(QStringLiteral("status"), reply);
    machine->manager->followState();
    QCOMPARE(machine->events, QStringList{});
    QTRY_COMPARE(machine->systemctl.verbs().size(), 2);
    QTRY_COMPARE(machine->events, events);
    // That nothing else comes is seen when the answer to a later query has come.
    machine->systemctl.setState(events.isEmpty() ? FakeSystemctl::Stopped : FakeSystemctl::Running);
    machine->manager->followState();
    QTRY_COMPARE(machine->events.size(), events.size() + 1);
    QCOMPARE(machine->events.constLast(), events.isEmpty() ? stopped : running);
}

void DhcpServerManagerTest::followsWithoutWaiting()
{
    const auto machine = Machine::known(FakeSystemctl::Running);
    replaceSystemctl(answersInTurn("sleep 1; echo 'Active: failed'", "echo 'Active: active (running)'"));
    machine->manager->followState();
    QTRY_COMPARE(turns(), 1);

    // What is asked meanwhile is newer, and the late answer no news.
    machine->manager->checkRunning();
    QTest::qWait(1500);
    QCOMPARE(machine->events, QStringList{running});
    QVERIFY(machine->manager->isServerRunning());
}

void DhcpServerManagerTest::followsWhatChangesDuringQuery()
{
    const auto machine = Machine::known(FakeSystemctl::Running);
    replaceSystemctl(answersInTurn("sleep 1; echo 'Active: active (running)'", "echo 'Active: failed'"));
    machine->manager->followState();
    QTRY_COMPARE(turns(), 1);
    for (int i{0}; i < 5; ++i)
        machine->manager->followState();
    QTRY_COMPARE(machine->events, QStringList{stopped});
    QTest::qWait(500);
    QCOMPARE(turns(), 2);
}

void DhcpServerManagerTest::followsNothingDuringOperation()
{
    const auto machine = Machine::known(FakeSystemctl::Stopped);
    machine->systemctl.hold(QStringLiteral("start"));
    machine->manager->runServer();
    machine->manager->followState();
    QCOMPARE(machine->events, (QStringList{stopped, updating}));
    machine->systemctl.release(QStringLiteral("start"));
    QTRY_COMPARE(machine->events, (QStringList{stopped, updating, running}));
    QCOMPARE(machine->systemctl.verbs(),
             afterFirstQuery({QStringLiteral("status"), QStringLiteral("start"), QStringLiteral("status")}));
}

// The timer is left, and nothing is said about what is missing.
void DhcpServerManagerTest::watchesWithoutBus()
{
    qputenv("DBUS_SYSTEM_BUS_ADDRESS", "unix:path=/no/such/socket");
    const WarningRecorder warnings;
    Machine machine{FakeSystemctl::Activating};
    const ServiceWatch watch{machine.manager.get()};
    machine.manager->checkRunning();
    QTRY_VERIFY_WITH_TIMEOUT(machine.systemctl.verbs().size() > 1, 30000);
    QCOMPARE(machine.events, QStringList{});
    machine.systemctl.setState(FakeSystemctl::Running);
    QTRY_COMPARE_WITH_TIMEOUT(machine.events, QStringList{running}, 30000);

    const QStringList::size_type queries{machine.systemctl.verbs().size()};
    QTest::qWait(6000); // a state that is known is not asked for again
    QCOMPARE(machine.systemctl.verbs().size(), queries);
    QCOMPARE(warnings.recorded(), QStringList{});
}

QTEST_GUILESS_MAIN(DhcpServerManagerTest)
#include "tst_dhcpservermanager.moc"
