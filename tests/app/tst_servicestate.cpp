// SPDX-License-Identifier: GPL-3.0-or-later
// What the window shows of a service that others start and stop.
#include "app/fmain.h"
#include "tests/app/testmachine.h"
#include "tests/support/fakeservicemanager.h"

#include <QAction>
#include <QCoreApplication>
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

QAction *restart(const FMain &window) { return window.findChild<QAction *>(QStringLiteral("actionRestart")); }

FakeSystemctl::Reply successWith(FakeSystemctl::State state) { return {{}, {}, 0, state, 0}; }

const QString isRunning{QStringLiteral("DHCP-server is running")};
const QString isStopped{QStringLiteral("DHCP-server is stopped")};

ModalBoxes::Box failureBox(const QString &detail)
{
    return errorBox(QStringLiteral("Operation with DHCP-server failed\n") + detail);
}

} // namespace

Q_DECLARE_METATYPE(FakeSystemctl::State)

class ServiceStateTest final : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void cleanupTestCase() { m_bus.reset(); }

    void followsWhatOthersDo();
    void becomesUsableWhenServiceHasStarted();
    void tellsOfServerThatDiesInItsStart();
    void tellsOfServerThatDiesSoonAfterItsStart_data();
    void tellsOfServerThatDiesSoonAfterItsStart();
    void tellsOfFailedStartOnce();
    void doesNotTakeStopForDeath();
    void doesNotBlameStartForLaterDeath();

private:
    std::unique_ptr<FMain> openWindow(const TestMachine &machine) const;
    void change(TestMachine &machine, const FMain &window, FakeSystemctl::State state) const;

    std::unique_ptr<FakeServiceManager> m_bus;
};

void ServiceStateTest::initTestCase()
{
    m_bus = std::make_unique<FakeServiceManager>(busAddress);
    QVERIFY2(m_bus->isRunning(), "dbus-daemon is not installed");
}

// A window that is told of changes.
std::unique_ptr<FMain> ServiceStateTest::openWindow(const TestMachine &machine) const
{
    const int subscribers{m_bus->subscribers()};
    auto window = machine.openWindow();
    [&] { QTRY_COMPARE(m_bus->subscribers(), subscribers + 1); }();
    return window;
}

// Somebody else changes the service, which the window shows then, with all that it does about it.
void ServiceStateTest::change(TestMachine &machine, const FMain &window, FakeSystemctl::State state) const
{
    machine.systemctl().setState(state);
    m_bus->announce();
    QTRY_COMPARE(shownState(window), state == FakeSystemctl::Running ? isRunning : isStopped);
    QCoreApplication::processEvents();
}

void ServiceStateTest::followsWhatOthersDo()
{
    TestMachine machine{FakeSystemctl::Running};
    const auto window = openWindow(machine);
    QCOMPARE(shownState(*window), isRunning);

    // The server is killed.
    machine.systemctl().setReply(QStringLiteral("status"), {"Active: active (exited)\n", {}, 0, {}, 0});
    m_bus->announce();
    QTRY_COMPARE(shownState(*window), isStopped);
    QCOMPARE(startOrStop(*window)->text(), QStringLiteral("Start DHCP-server"));
    startOrStop(*window)->trigger();
    QTRY_COMPARE(shownState(*window), isRunning);
    QVERIFY(machine.systemctl().verbs().contains(QStringLiteral("restart")));

    change(machine, *window, FakeSystemctl::Stopped);
    change(machine, *window, FakeSystemctl::Running);
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

void ServiceStateTest::tellsOfServerThatDiesInItsStart()
{
    TestMachine machine;
    machine.systemctl().setReply(QStringLiteral("start"), successWith(FakeSystemctl::Failed));
    const auto window = openWindow(machine);
    ModalBoxes boxes;
    for (QAction *action : {startOrStop(*window), restart(*window)}) {
        boxes.expectBox(failureBox(isStopped), QMessageBox::Ok);
        action->trigger();
        boxes.verify();
        QCOMPARE(shownState(*window), isStopped);
        QCOMPARE(startOrStop(*window)->text(), QStringLiteral("Start DHCP-server"));
    }
}

void ServiceStateTest::tellsOfServerThatDiesSoonAfterItsStart_data()
{
    QTest::addColumn<FakeSystemctl::State>("state");
    QTest::addRow("start") << FakeSystemctl::Stopped;
    QTest::addRow("restart") << FakeSystemctl::Running;
}

void ServiceStateTest::tellsOfServerThatDiesSoonAfterItsStart()
{
    QFETCH(const FakeSystemctl::State, state);
    TestMachine machine{state};
    const auto window = openWindow(machine);
    ModalBoxes boxes;
    (state == FakeSystemctl::Running ? restart(*window) : startOrStop(*window))->trigger();
    QTRY_COMPARE(shownState(*window), isRunning);

    machine.systemctl().setState(FakeSystemctl::Failed);
    boxes.expectBox(failureBox(isStopped), QMessageBox::Ok);
    m_bus->announce();
    boxes.verify();
    QCOMPARE(shownState(*window), isStopped);
}

void ServiceStateTest::tellsOfFailedStartOnce()
{
    TestMachine machine;
    machine.systemctl().setReply(QStringLiteral("start"), {{}, "Job failed.\n", 1, FakeSystemctl::Failed, 0});
    const auto window = openWindow(machine);
    ModalBoxes boxes;
    boxes.expectBox(failureBox(QStringLiteral("Job failed.\n")), QMessageBox::Ok);
    startOrStop(*window)->trigger();
    boxes.verify();
    QTRY_COMPARE(shownState(*window), isStopped);
    QCoreApplication::processEvents();
}

void ServiceStateTest::doesNotTakeStopForDeath()
{
    TestMachine machine;
    const auto window = openWindow(machine);
    ModalBoxes boxes;
    startOrStop(*window)->trigger();
    QTRY_COMPARE(shownState(*window), isRunning);
    change(machine, *window, FakeSystemctl::Stopped);

    // A server that ends badly when it is told to end.
    startOrStop(*window)->trigger();
    QTRY_COMPARE(shownState(*window), isRunning);
    machine.systemctl().setReply(QStringLiteral("stop"), successWith(FakeSystemctl::Failed));
    startOrStop(*window)->trigger();
    QTRY_COMPARE(shownState(*window), isStopped);
    QCoreApplication::processEvents();
}

void ServiceStateTest::doesNotBlameStartForLaterDeath()
{
    TestMachine machine;
    const auto window = openWindow(machine);
    ModalBoxes boxes;
    startOrStop(*window)->trigger();
    QTRY_COMPARE(shownState(*window), isRunning);
    QTest::qWait(6000); // longer than a death is looked for
    change(machine, *window, FakeSystemctl::Failed);
}

QTEST_MAIN(ServiceStateTest)
#include "tst_servicestate.moc"
