// SPDX-License-Identifier: GPL-3.0-or-later
#include "server/dhcpservermanager.h"
#include "server/servicewatch.h"
#include "tests/server/managerevents.h"
#include "tests/support/fakesystemctl.h"
#include "tests/support/temporaryroot.h"

#include <QFile>
#include <QProcess>
#include <QRegularExpression>
#include <QScopeGuard>
#include <QSysInfo>
#include <QTest>

#include <array>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

namespace {

using said::alreadyRunning;
using said::alreadyStopped;
using said::busy;
using said::failedOperation;
using said::running;
using said::stopped;
using said::updating;

// How long the service manager may take for what it does sooner or later; asking it over and over again makes it
// much slower.
constexpr int patience{20'000};

constexpr const char *holdingPipe{"/run/hold"};
const QString initScript{QStringLiteral("/etc/init.d/isc-dhcp-server")};
const QString initScriptAside{QStringLiteral("/root/isc-dhcp-server")};
const QString jobFailed{QStringLiteral(
    "Job for isc-dhcp-server.service failed because the control process exited with error code.\n"
    "See \"systemctl status isc-dhcp-server.service\" and \"journalctl -xeu isc-dhcp-server.service\" for details.\n")};

using Slot = void (DhcpServerManager::*)();

struct Answer
{
    QString output;
    QString errors;
    int exitCode{};
};

Answer run(const QString &program, const QStringList &arguments)
{
    QProcess process;
    process.start(program, arguments);
    process.waitForFinished(-1);
    return {QString::fromUtf8(process.readAllStandardOutput()), QString::fromUtf8(process.readAllStandardError()),
            process.exitCode()};
}

Answer systemctl(const QString &verb)
{
    return run(QStringLiteral("systemctl"), {verb, QStringLiteral("isc-dhcp-server")});
}

void reloadUnits() { run(QStringLiteral("systemctl"), {QStringLiteral("daemon-reload")}); }

QString status() { return systemctl(QStringLiteral("status")).output; }

QString journal()
{
    return run(QStringLiteral("journalctl"), {QStringLiteral("--unit=isc-dhcp-server"), QStringLiteral("--no-pager")})
        .output;
}

// The servers that run, each as its process id, a space and its command line.
QStringList servers()
{
    return run(QStringLiteral("pgrep"), {QStringLiteral("-ax"), QStringLiteral("dhcpd")})
        .output.split(QLatin1Char{'\n'}, Qt::SkipEmptyParts);
}

void writeConfiguration(const QByteArray &more = {})
{
    writeTestFile(paths::configuration(),
                  "subnet 10.20.10.0 netmask 255.255.255.0 { range 10.20.10.100 10.20.10.109; }\n" + more);
}

void start()
{
    if (servers().isEmpty())
        QCOMPARE(systemctl(QStringLiteral("restart")).errors, QString{});
    QTRY_COMPARE_WITH_TIMEOUT(servers().size(), 1, patience);
}

void stop()
{
    QCOMPARE(systemctl(QStringLiteral("stop")).errors, QString{});
    QTRY_COMPARE_WITH_TIMEOUT(servers(), QStringList{}, patience);
}

void killServer()
{
    run(QStringLiteral("pkill"), {QStringLiteral("-KILL"), QStringLiteral("-x"), QStringLiteral("dhcpd")});
}

// What a status says about the unit, without what varies with the time and the machine.
QString description(QString status)
{
    static const std::array<std::pair<QRegularExpression, QString>, 4> differing{{
        {QRegularExpression{QStringLiteral("\\n\\n.*"), QRegularExpression::DotMatchesEverythingOption}, {}},
        {QRegularExpression{QStringLiteral("(?<= since |Duration: ).*")}, {}},
        {QRegularExpression{QStringLiteral("(?<=Process: |PID: |├─|└─)[0-9]+")}, {}},
        {QRegularExpression{QStringLiteral("\\n *(Tasks|Memory|CPU|Invocation|Job): .*")},
         {}}, // only where they are counted
    }};
    for (const auto &[pattern, replacement] : differing)
        status.replace(pattern, replacement);
    return status;
}

// The lines of a journal, without time, machine and process id.
QStringList messages(const QString &journal)
{
    static const QRegularExpression line{QStringLiteral("^\\w{3} \\d{2} \\S+ \\S+ ([^[]+)\\[\\d+\\](: .*)$"),
                                         QRegularExpression::MultilineOption};
    QStringList messages;
    for (auto matches = line.globalMatch(journal); matches.hasNext();) {
        const QRegularExpressionMatch match{matches.next()};
        messages.append(match.captured(1) + match.captured(2));
    }
    return messages;
}

// The messages of `expected` that the service manager has not logged about the service.
QStringList notLogged(QStringList expected)
{
    for (const QString &message : messages(journal()))
        expected.removeAll(message);
    return expected;
}

// Fails the test unless the real status is what FakeSystemctl prints for `state`.
void compareWithRecording(FakeSystemctl::State state)
{
    const FakeSystemctl::Reply recorded{FakeSystemctl::statusReply(state)};
    const QString output{QString::fromUtf8(recorded.output)};
    QTRY_COMPARE_WITH_TIMEOUT(description(status()), description(output), patience);
    QTRY_COMPARE_WITH_TIMEOUT(notLogged(messages(output)), QStringList{}, patience);
    const Answer real{systemctl(QStringLiteral("status"))};
    QCOMPARE(real.errors, QString::fromUtf8(recorded.errors));
    QCOMPARE(real.exitCode, recorded.exitCode);
}

// A manager that knows the state of the service, and what it has said since.
struct Manager
{
    Manager()
    {
        service.checkRunning();
        said::record(service, events);
    }

    QStringList events;
    DhcpServerManager service;
};

} // namespace

Q_DECLARE_METATYPE(Slot)

// The real systemctl, init script and server, in the container of scripts/service-container.
class RealServiceTest final : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void init();
    void cleanup();

    void readsThatItWasNeverStarted();
    void startsOnTheChosenInterface();
    void startsOnce();
    void restarts();
    void stopsOnce();
    void startsStoppedServiceOnRestart();
    void reportsFailedStart();
    void reportsFailedRestart();
    void restartsServiceWhoseServerDied_data();
    void restartsServiceWhoseServerDied();
    void followsServerThatDies();
    void followsCommandsOfOthers();
    void followsServiceThatIsJustStarting();
    void reportsMaskedService();
    void reportsServiceThatIsNotInstalled();

private:
    void hold(const QByteArray &argument);
    void awaitHold();
    void release();

    QByteArray m_defaultsAsInstalled;
    QByteArray m_defaults; // with an interface to serve
    int m_pipe{-1};        // what the init script waits for
};

void RealServiceTest::initTestCase()
{
    // The test changes the service and its files.
    if (QSysInfo::machineHostName() != QLatin1String{"service-container"})
        QFAIL("Only for the container of scripts/service-container");
    m_defaultsAsInstalled = readTestFile(paths::serverDefaults());
    QVERIFY(m_defaultsAsInstalled.contains("\nINTERFACESv4=\"\"\n"));
    m_defaults = m_defaultsAsInstalled;
    m_defaults.replace("INTERFACESv4=\"\"", "INTERFACESv4=\"lan0\"");
}

void RealServiceTest::init()
{
    writeConfiguration();
    writeTestFile(paths::serverDefaults(), m_defaults);
    systemctl(QStringLiteral("reset-failed")); // also forgets earlier starts, of which only a few are allowed in a row
}

void RealServiceTest::cleanup()
{
    if (QTest::currentTestFailed())
        qInfo("%s\n%s", qPrintable(status()), qPrintable(journal()));
    if (m_pipe != -1)
        release();
}

// From now on the init script, called with `argument`, waits until release().
void RealServiceTest::hold(const QByteArray &argument)
{
    QFile::remove(QFile::decodeName(holdingPipe));
    QCOMPARE(mkfifo(holdingPipe, 0600), 0);
    writeTestFile(paths::serverDefaults(),
                  m_defaults + "[ \"$1\" != " + argument + " ] || read -r _ <" + holdingPipe + '\n');
}

// Returns once the init script is waiting.
void RealServiceTest::awaitHold()
{
    QTRY_VERIFY_WITH_TIMEOUT((m_pipe = ::open(holdingPipe, O_WRONLY | O_NONBLOCK | O_CLOEXEC)) != -1, patience);
}

void RealServiceTest::release()
{
    QCOMPARE(::write(m_pipe, "\n", 1), ssize_t{1});
    QCOMPARE(::close(std::exchange(m_pipe, -1)), 0);
}

void RealServiceTest::readsThatItWasNeverStarted()
{
    const Answer status{systemctl(QStringLiteral("status"))};
    QVERIFY2(status.output.contains(QLatin1String{"Active: inactive (dead)\n"}), qPrintable(status.output));
    QCOMPARE(status.exitCode, 3);
    QStringList events;
    DhcpServerManager service;
    said::record(service, events);
    service.checkRunning();
    QCOMPARE(events, QStringList{stopped});
}

void RealServiceTest::startsOnTheChosenInterface()
{
    stop();
    writeTestFile(paths::serverDefaults(), m_defaultsAsInstalled);
    Manager manager;
    QCOMPARE(manager.service.interfaces(), (QMap<QString, bool>{{QStringLiteral("lan0"), false}}));
    manager.service.setInterfaces({{QStringLiteral("lan0"), true}});
    manager.service.runServer();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, (QStringList{stopped, updating, running}), patience);
    QCOMPARE(servers().size(), 1);
    QVERIFY2(servers().constFirst().endsWith(QLatin1String{" -cf /etc/dhcp/dhcpd.conf lan0"}),
             qPrintable(servers().constFirst()));
    compareWithRecording(FakeSystemctl::Running);
}

void RealServiceTest::startsOnce()
{
    stop();
    hold("start");
    Manager manager;
    manager.service.runServer();
    manager.service.runServer();
    QCOMPARE(manager.events, (QStringList{stopped, updating, busy}));

    awaitHold();
    compareWithRecording(FakeSystemctl::Activating);
    Manager other;
    other.service.checkRunning();
    QCOMPARE(other.events, QStringList{});

    manager.events.clear();
    release();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, QStringList{running}, patience);
    const QStringList started{servers()};
    QCOMPARE(started.size(), 1);

    manager.service.runServer();
    QCOMPARE(manager.events, (QStringList{running, running, alreadyRunning}));
    QCOMPARE(servers(), started);
}

void RealServiceTest::restarts()
{
    start();
    const QString before{servers().constFirst()};
    Manager manager;
    manager.service.restartServer();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, (QStringList{running, updating, running}), patience);
    QTRY_COMPARE_WITH_TIMEOUT(servers().size(), 1, patience);
    QVERIFY(servers().constFirst() != before);
}

void RealServiceTest::stopsOnce()
{
    start();
    hold("stop");
    Manager manager;
    manager.service.stopServer();
    manager.service.stopServer();
    QCOMPARE(manager.events, (QStringList{running, updating, busy}));

    awaitHold();
    compareWithRecording(FakeSystemctl::Deactivating);
    Manager other;
    other.service.checkRunning();
    QCOMPARE(other.events, QStringList{});

    manager.events.clear();
    release();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, QStringList{stopped}, patience);
    QTRY_COMPARE_WITH_TIMEOUT(servers(), QStringList{}, patience);
    compareWithRecording(FakeSystemctl::Stopped);

    manager.service.stopServer();
    QCOMPARE(manager.events, (QStringList{stopped, stopped, alreadyStopped}));
}

void RealServiceTest::startsStoppedServiceOnRestart()
{
    stop();
    Manager manager;
    manager.service.restartServer();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, (QStringList{stopped, stopped, updating, running}), patience);
    QCOMPARE(servers().size(), 1);
}

void RealServiceTest::reportsFailedStart()
{
    stop();
    writeConfiguration("no sense;\n");
    Manager manager;
    manager.service.runServer();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, (QStringList{stopped, updating, failedOperation(jobFailed), stopped}),
                              patience);
    QCOMPARE(servers(), QStringList{});

    writeConfiguration();
    manager.events.clear();
    manager.service.runServer();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, (QStringList{stopped, updating, running}), patience);
}

void RealServiceTest::reportsFailedRestart()
{
    start();
    writeConfiguration("no sense;\n");
    Manager manager;
    manager.service.restartServer();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, (QStringList{running, updating, failedOperation(jobFailed), stopped}),
                              patience);
    QTRY_COMPARE_WITH_TIMEOUT(servers(), QStringList{}, patience);
    compareWithRecording(FakeSystemctl::Failed);
}

void RealServiceTest::restartsServiceWhoseServerDied_data()
{
    QTest::addColumn<Slot>("operation");
    QTest::addColumn<QStringList>("events");
    QTest::addRow("start") << Slot{&DhcpServerManager::runServer} << QStringList{stopped, updating, running};
    QTest::addRow("restart") << Slot{&DhcpServerManager::restartServer}
                             << QStringList{stopped, stopped, updating, running};
}

void RealServiceTest::restartsServiceWhoseServerDied()
{
    QFETCH(const Slot, operation);
    QFETCH(const QStringList, events);
    start();
    Manager manager;
    killServer();
    QTRY_VERIFY_WITH_TIMEOUT(status().contains(QLatin1String{"Active: active (exited)"}), patience);
    manager.service.checkRunning();
    QCOMPARE(manager.events, QStringList{stopped});
    manager.events.clear();
    (manager.service.*operation)();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, events, patience);
    QCOMPARE(servers().size(), 1);
}

void RealServiceTest::followsServerThatDies()
{
    start();
    Manager manager;
    const ServiceWatch watch{&manager.service};
    QTest::qWait(1000); // for its subscription and the query that follows
    QCOMPARE(manager.events, QStringList{});
    killServer();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, QStringList{stopped}, patience);
    manager.service.runServer();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, (QStringList{stopped, stopped, updating, running}), patience);
    QCOMPARE(servers().size(), 1);
}

void RealServiceTest::followsCommandsOfOthers()
{
    stop();
    Manager manager;
    const ServiceWatch watch{&manager.service};
    QTest::qWait(1000);
    QCOMPARE(systemctl(QStringLiteral("start")).exitCode, 0);
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, QStringList{running}, patience);
    QCOMPARE(systemctl(QStringLiteral("stop")).exitCode, 0);
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, (QStringList{running, stopped}), patience);
    QCOMPARE(systemctl(QStringLiteral("restart")).exitCode, 0);
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, (QStringList{running, stopped, running}), patience);

    // Between its two halves the service may be seen stopped, but it is never left so, and nothing is told twice.
    QCOMPARE(systemctl(QStringLiteral("restart")).exitCode, 0);
    QTest::qWait(2000);
    QVERIFY(manager.service.isServerRunning());
    for (int i{1}; i < manager.events.size(); ++i)
        QVERIFY(manager.events.at(i) != manager.events.at(i - 1));
}

void RealServiceTest::followsServiceThatIsJustStarting()
{
    stop();
    hold("start");
    run(QStringLiteral("systemctl"),
        {QStringLiteral("start"), QStringLiteral("--no-block"), QStringLiteral("isc-dhcp-server")});
    awaitHold();
    Manager manager;
    const ServiceWatch watch{&manager.service};
    manager.service.runServer();
    QCOMPARE(manager.events, QStringList{busy});
    manager.events.clear();
    release();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, QStringList{running}, patience);
    manager.service.stopServer();
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, (QStringList{running, running, updating, stopped}), patience);
}

void RealServiceTest::reportsMaskedService()
{
    stop();
    QCOMPARE(systemctl(QStringLiteral("mask")).exitCode, 0);
    const auto unmask = qScopeGuard([] { systemctl(QStringLiteral("unmask")); });
    Manager manager;
    manager.service.runServer();
    const QString refusal{
        QStringLiteral("Failed to start isc-dhcp-server.service: Unit isc-dhcp-server.service is masked.\n")};
    QTRY_COMPARE_WITH_TIMEOUT(manager.events, (QStringList{stopped, updating, failedOperation(refusal), stopped}),
                              patience);
}

void RealServiceTest::reportsServiceThatIsNotInstalled()
{
    stop();
    Manager manager;
    {
        QVERIFY(QFile::rename(initScript, initScriptAside));
        const auto reinstall = qScopeGuard([] {
            QFile::rename(initScriptAside, initScript);
            reloadUnits();
        });
        reloadUnits();
        compareWithRecording(FakeSystemctl::NoSuchUnit);
        manager.service.runServer();
        const QString refusal{
            QStringLiteral("Failed to start isc-dhcp-server.service: Unit isc-dhcp-server.service not found.\n")};
        QTRY_COMPARE_WITH_TIMEOUT(manager.events, (QStringList{updating, failedOperation(refusal)}), patience);
        manager.service.runServer();
        QCOMPARE(manager.events.constLast(), busy);
    }
    manager.events.clear();
    manager.service.checkRunning();
    QCOMPARE(manager.events, QStringList{stopped});
}

QTEST_GUILESS_MAIN(RealServiceTest)
#include "tst_realservice.moc"
