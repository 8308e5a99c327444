// SPDX-License-Identifier: GPL-3.0-or-later
#include "server/dhcpservermanager.h"
#include "tests/support/temporaryroot.h"

#include <QProcess>
#include <QTest>

#include <cerrno>
#include <sched.h>
#include <system_error>
#include <unistd.h>

namespace {

using Interfaces = QMap<QString, bool>;

// Gives the process a network of its own, in which it may make interfaces. Returns why that failed, or an empty text.
QString enterOwnNetwork()
{
    const uid_t user{getuid()};
    if (unshare(user == 0 ? CLONE_NEWNET : CLONE_NEWUSER | CLONE_NEWNET) == -1) {
        return QStringLiteral("no network namespace: %1")
            .arg(QString::fromStdString(std::system_category().message(errno)));
    }
    if (user != 0)
        writeTestFile(QStringLiteral("/proc/self/uid_map"), "0 " + QByteArray::number(user) + " 1\n");
    return {};
}

// Runs `ip` with the words of `command`. Returns what went wrong, or an empty text.
QString ip(const QString &command)
{
    QProcess process;
    process.start(QStringLiteral("ip"), command.split(QLatin1Char{' '}));
    const bool hasRun{process.waitForFinished(-1)};
    if (hasRun && process.exitCode() == 0)
        return {};
    const QString reason{hasRun ? QString::fromLocal8Bit(process.readAllStandardError()) : process.errorString()};
    return QStringLiteral("ip %1: %2").arg(command, reason);
}

} // namespace

// Virtual interfaces of every kind that matters, in a network that has none.
class SystemInterfacesTest final : public QObject
{
    Q_OBJECT

public:
    explicit SystemInterfacesTest(QString noOwnNetwork)
        : m_noOwnNetwork{std::move(noOwnNetwork)}
    {
    }

private slots:
    void initTestCase();
    void offersNothingWithoutInterfaces();
    void offersInterfacesWithIpv4Address();

private:
    Interfaces collected() const;

    QString m_noOwnNetwork;
    TemporaryRoot m_root;
};

void SystemInterfacesTest::initTestCase()
{
    if (!m_noOwnNetwork.isEmpty())
        QSKIP(qPrintable(m_noOwnNetwork));
}

void SystemInterfacesTest::offersNothingWithoutInterfaces()
{
    QCOMPARE(ip(QStringLiteral("link set lo up")), QString{});
    QCOMPARE(collected(), Interfaces{});
}

void SystemInterfacesTest::offersInterfacesWithIpv4Address()
{
    for (const char *link : {"link add up0 type veth peer name down0", "link add none0 type veth peer name six0"}) {
        const QString refusal{ip(QString::fromLatin1(link))};
        if (!refusal.isEmpty())
            QSKIP(qPrintable(refusal));
    }
    for (const char *command :
         {"link set up0 up", "link set none0 up", "link set six0 up", "addr add 192.0.2.1/24 dev up0",
          "addr add 198.51.100.1/24 dev up0", "addr add 203.0.113.1/24 dev down0", "addr add 127.0.0.2/8 dev lo"})
        QCOMPARE(ip(QString::fromLatin1(command)), QString{});
    // six0 has at least the link's own IPv6 address, unless the kernel has no IPv6.
    const Interfaces expected{{QStringLiteral("down0"), false}, {QStringLiteral("up0"), false}};
    QCOMPARE(collected(), expected);

    writeTestFile(paths::serverDefaults(), "INTERFACESv4=\"up0 gone0\"\n");
    const Interfaces marked{
        {QStringLiteral("down0"), false}, {QStringLiteral("gone0"), true}, {QStringLiteral("up0"), true}};
    QCOMPARE(collected(), marked);
}

Interfaces SystemInterfacesTest::collected() const
{
    const DhcpServerManager manager;
    return manager.interfaces();
}

int main(int argc, char **argv)
{
    // First of all, since a process with threads cannot enter a user namespace.
    SystemInterfacesTest test{enterOwnNetwork()};
    QCoreApplication application{argc, argv};
    return QTest::qExec(&test, argc, argv);
}
#include "tst_systeminterfaces.moc"
