// SPDX-License-Identifier: GPL-3.0-or-later
// What the window shows of a service that others start and stop.
#include "app/fmain.h"
#include "tests/app/testmachine.h"
#include "tests/support/fakeservicemanager.h"

#include <QAction>
#include <QLabel>
#include <QStatusBar>
#include <QTest>

#include <memory>

namespace {

const QString busAddress{FakeServiceManager::chooseAddress()};

QString shownState(const FMain &window)
{
    QString state;
    const auto labels = window.findChild<QStatusBar *>()->findChildren<QLabel *>();
    for (const QLabel *label : labels)
        state += label->text();
    return state;
}

QAction *startOrStop(const FMain &window)
{
    return window.findChild<QAction *>(QStringLiteral("actionStartStopServer"));
}

const QString isRunning{QStringLiteral("DHCP-server is running")};
const QString isStopped{QStringLiteral("DHCP-server is stopped")};

} // namespace

class ServiceStateTest final : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void cleanupTestCase() { m_bus.reset(); }

    void followsWhatOthersDo();
    void becomesUsableWhenServiceHasStarted();

private:
    std::unique_ptr<FakeServiceManager> m_bus;
};

void ServiceStateTest::initTestCase()
{
    m_bus = std::make_unique<FakeServiceManager>(busAddress);
    QVERIFY2(m_bus->isRunning(), "dbus-daemon is not installed");
}

void ServiceStateTest::followsWhatOthersDo()
{
    TestMachine machine{FakeSystemctl::Running};
    const auto window = machine.openWindow();
    QTRY_COMPARE(m_bus->subscribers(), 1);
    QCOMPARE(shownState(*window), isRunning);

    // The server is killed.
    machine.systemctl().setReply(QStringLiteral("status"), {"Active: active (exited)\n", {}, 0, {}, 0});
    m_bus->announce();
    QTRY_COMPARE(shownState(*window), isStopped);
    QCOMPARE(startOrStop(*window)->text(), QStringLiteral("Start DHCP-server"));
    startOrStop(*window)->trigger();
    QTRY_COMPARE(shownState(*window), isRunning);
    QVERIFY(machine.systemctl().verbs().contains(QStringLiteral("restart")));

    machine.systemctl().setState(FakeSystemctl::Stopped);
    m_bus->announce();
    QTRY_COMPARE(shownState(*window), isStopped);
    machine.systemctl().setState(FakeSystemctl::Running);
    m_bus->announce();
    QTRY_COMPARE(shownState(*window), isRunning);
    QCOMPARE(startOrStop(*window)->text(), QStringLiteral("Stop DHCP-server"));
}

void ServiceStateTest::becomesUsableWhenServiceHasStarted()
{
    TestMachine machine{FakeSystemctl::Activating};
    const auto window = machine.openWindow();
    QCOMPARE(shownState(*window), QStringLiteral("Updating DHCP-server status..."));
    machine.systemctl().setState(FakeSystemctl::Running);
    QTRY_COMPARE_WITH_TIMEOUT(shownState(*window), isRunning, 30000);
    QVERIFY(startOrStop(*window)->isEnabled());
}

QTEST_MAIN(ServiceStateTest)
#include "tst_servicestate.moc"
