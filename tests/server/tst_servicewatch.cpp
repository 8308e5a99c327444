// SPDX-License-Identifier: GPL-3.0-or-later
#include "server/servicewatch.h"

#include "server/dhcpservermanager.h"
#include "tests/server/managerevents.h"
#include "tests/support/fakeservicemanager.h"
#include "tests/support/fakesystemctl.h"
#include "tests/support/temporaryroot.h"

#include <QElapsedTimer>
#include <QTest>

#include <memory>

namespace {

using said::running;
using said::stopped;

const QString busAddress{FakeServiceManager::chooseAddress()};

// A manager that knows the state of the service and whose watch is at work, with everything that it has said since.
struct Watched
{
    Watched(FakeServiceManager &bus, FakeSystemctl::State state)
        : systemctl{state}
    {
        const int subscribers{bus.subscribers()};
        manager.checkRunning();
        said::record(manager, events);
        // The query that follows the subscription.
        const auto isReady = [&] { return bus.subscribers() == subscribers + 1 && systemctl.verbs().size() == 2; };
        QTRY_VERIFY(isReady());
    }

    QStringList events;
    TemporaryRoot root;
    FakeSystemctl systemctl;
    DhcpServerManager manager;
    ServiceWatch watch{&manager};
};

} // namespace

class ServiceWatchTest final : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void cleanupTestCase() { m_bus.reset(); }

    void asksWhenTheUnitChanges();
    void asksOnceForABurst();
    void asksSeldomWhileTheUnitKeepsChanging();
    void asksNothingForOtherUnits();
    void noticesWhatChangedBeforeItSubscribed();
    void subscribesToServiceManagerThatJoinsLater();
    void repeatsNothingAfterAnOperation();

private:
    std::unique_ptr<FakeServiceManager> m_bus;
};

void ServiceWatchTest::initTestCase()
{
    m_bus = std::make_unique<FakeServiceManager>(busAddress);
    QVERIFY2(m_bus->isRunning(), "dbus-daemon is not installed");
}

void ServiceWatchTest::asksWhenTheUnitChanges()
{
    Watched service{*m_bus, FakeSystemctl::Stopped};
    service.systemctl.setState(FakeSystemctl::Running);
    m_bus->announce();
    QTRY_COMPARE(service.events, QStringList{running});
    service.systemctl.setState(FakeSystemctl::Failed);
    m_bus->announce();
    QTRY_COMPARE(service.events, (QStringList{running, stopped}));
}

void ServiceWatchTest::asksOnceForABurst()
{
    Watched service{*m_bus, FakeSystemctl::Stopped};
    for (int i{0}; i < 50; ++i)
        m_bus->announce();
    QTRY_COMPARE(service.systemctl.verbs().size(), 3);
    QTest::qWait(1000);
    QCOMPARE(service.systemctl.verbs().size(), 3);
    QCOMPARE(service.events, QStringList{});
}

void ServiceWatchTest::asksSeldomWhileTheUnitKeepsChanging()
{
    const Watched service{*m_bus, FakeSystemctl::Stopped};
    QElapsedTimer time;
    time.start();
    while (time.elapsed() < 1000) {
        m_bus->announce();
        QTest::qWait(10);
    }
    const qint64 bursts{time.elapsed() / 200 + 1};
    QTest::qWait(500);
    const QStringList::size_type queries{service.systemctl.verbs().size() - 2};
    QVERIFY(queries > 1);
    QVERIFY2(queries <= bursts, qPrintable(QString::number(queries)));
}

void ServiceWatchTest::asksNothingForOtherUnits()
{
    const Watched service{*m_bus, FakeSystemctl::Stopped};
    m_bus->announce(QStringLiteral("ssh_2eservice"));
    QTest::qWait(1000);
    QCOMPARE(service.systemctl.verbs().size(), 2);
}

void ServiceWatchTest::noticesWhatChangedBeforeItSubscribed()
{
    QStringList events;
    const TemporaryRoot root;
    FakeSystemctl systemctl{FakeSystemctl::Stopped};
    DhcpServerManager manager;
    const ServiceWatch watch{&manager};
    manager.checkRunning();
    said::record(manager, events);
    systemctl.setState(FakeSystemctl::Running);
    QTRY_COMPARE(events, QStringList{running});
}

void ServiceWatchTest::subscribesToServiceManagerThatJoinsLater()
{
    m_bus->leave();
    QStringList events;
    const TemporaryRoot root;
    FakeSystemctl systemctl{FakeSystemctl::Stopped};
    DhcpServerManager manager;
    const ServiceWatch watch{&manager};
    manager.checkRunning();
    said::record(manager, events);
    QTest::qWait(500);
    QCOMPARE(m_bus->subscribers(), 0);
    systemctl.setState(FakeSystemctl::Running);
    m_bus->join();
    QTRY_COMPARE(m_bus->subscribers(), 1);
    QTRY_COMPARE(events, QStringList{running});
    systemctl.setState(FakeSystemctl::Stopped);
    m_bus->announce();
    QTRY_COMPARE(events, (QStringList{running, stopped}));
}

// The service manager announces several changes while it does what was asked for.
void ServiceWatchTest::repeatsNothingAfterAnOperation()
{
    Watched service{*m_bus, FakeSystemctl::Stopped};
    service.systemctl.hold(QStringLiteral("start"));
    service.manager.runServer();
    m_bus->announce();
    QTest::qWait(500);
    QCOMPARE(service.events, (QStringList{stopped, said::updating}));
    service.systemctl.release(QStringLiteral("start"));
    QTRY_COMPARE(service.events.size(), 3);
    const QStringList::size_type queries{service.systemctl.verbs().size()};
    m_bus->announce();
    QTRY_COMPARE(service.systemctl.verbs().size(), queries + 1);
    QTest::qWait(500);
    QCOMPARE(service.events, (QStringList{stopped, said::updating, running}));
}

QTEST_GUILESS_MAIN(ServiceWatchTest)
#include "tst_servicewatch.moc"
