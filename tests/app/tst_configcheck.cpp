// SPDX-License-Identifier: GPL-3.0-or-later
// What becomes of a check that nobody waits for. The server's verdicts are tested where they are shown.
#include "app/configcheck.h"
#include "tests/app/testmachine.h"

#include <QPointer>
#include <QProcess>
#include <QTest>

#include <csignal>
#include <memory>

namespace {

int warnings = 0;

void countWarning(QtMsgType type, const QMessageLogContext & /*context*/, const QString & /*message*/)
{
    warnings += type == QtWarningMsg ? 1 : 0;
}

bool isRunning(qint64 process) { return kill(static_cast<pid_t>(process), 0) == 0; }

} // namespace

class ConfigCheckTest final : public QObject
{
    Q_OBJECT

private slots:
    void abandonedProcessGoesWhenItHasEnded();
    void abandonedProcessGoesWithTheParent();

private:
    /// Starts a check under `parent` that does not come to an end, and abandons it.
    static QProcess *abandonCheck(QObject *parent);
};

QProcess *ConfigCheckTest::abandonCheck(QObject *parent)
{
    const FakePrograms programs;
    programs.install(QStringLiteral("dhcpd"), "exec sleep 60\n");
    ConfigCheck check{parent};
    check.start({});
    return parent->findChild<QProcess *>();
}

void ConfigCheckTest::abandonedProcessGoesWhenItHasEnded()
{
    QObject parent;
    const QPointer<QProcess> process = abandonCheck(&parent);
    QVERIFY(process);
    const qint64 id = process->processId();
    QTRY_VERIFY(!process);
    QVERIFY(!isRunning(id));
}

void ConfigCheckTest::abandonedProcessGoesWithTheParent()
{
    auto parent = std::make_unique<QObject>();
    const QProcess *process = abandonCheck(parent.get());
    QVERIFY(process);
    const qint64 id = process->processId();

    const QtMessageHandler previous = qInstallMessageHandler(countWarning);
    parent.reset();
    qInstallMessageHandler(previous);
    QCOMPARE(warnings, 0);
    QVERIFY(!isRunning(id));
}

QTEST_GUILESS_MAIN(ConfigCheckTest)
#include "tst_configcheck.moc"
