// SPDX-License-Identifier: GPL-3.0-or-later
// Which server a check asks, what it passes to it, and what becomes of a check that nobody waits for. The server's
// verdicts are tested where they are shown.
#include "app/configcheck.h"
#include "tests/app/testmachine.h"
#include "tests/common/childprocess.h"

#include <QCoreApplication>
#include <QFile>
#include <QPointer>
#include <QProcess>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>

#include <csignal>
#include <memory>

#include <sys/mount.h>

namespace {

int warnings{0};

void countWarning(QtMsgType type, const QMessageLogContext & /*context*/, const QString & /*message*/)
{
    warnings += type == QtWarningMsg ? 1 : 0;
}

bool isRunning(qint64 process) { return kill(static_cast<pid_t>(process), 0) == 0; }

const QByteArray endlessServer{"exec sleep 60\n"};

/// What `process` has open, as the system names it.
QString openFiles(const QString &process)
{
    QProcess list;
    list.start(QStringLiteral("ls"), {QStringLiteral("-l"), QStringLiteral("/proc/%1/fd").arg(process)});
    list.waitForFinished(-1);
    return QString::fromLocal8Bit(list.readAll());
}

} // namespace

class ConfigCheckTest final : public QObject
{
    Q_OBJECT

private slots:
    void asksTheServerInPathFirst_data();
    void asksTheServerInPathFirst();
    void passesTheTextToNoOtherProcess();
    void outputWithoutEndIsCutAndEnded();
    void abandonedProcessGoesWhenItHasEnded();
    void abandonedProcessGoesWithTheParent();

private:
    /// Starts a check under `parent` that does not come to an end, and abandons it.
    static QProcess *abandonCheck(QObject *parent);
};

void ConfigCheckTest::asksTheServerInPathFirst_data()
{
    QTest::addColumn<bool>("inPath");
    QTest::addRow("one in each place") << true;
    QTest::addRow("one in /usr/sbin only") << false;
}

void ConfigCheckTest::asksTheServerInPathFirst()
{
    QFETCH(const bool, inPath);
    const QString folder{QStringLiteral("/usr/sbin")};
    const QString name{QStringLiteral("/dhcpd")};
    const QTemporaryDir path;
    const QString server{path.path() + name};
    writeTestFile(server, "#!/bin/sh\n" + endlessServer);
    QVERIFY(QFile::setPermissions(server, QFile::ReadOwner | QFile::ExeOwner));

    QVERIFY_NO_PROBLEM(inMountNamespace([&]() -> QString {
        if (mount("none", QFile::encodeName(folder).constData(), "tmpfs", 0, nullptr) < 0)
            return QStringLiteral("skip: no tmpfs");
        if (!QFile::copy(server, folder + name))
            return QStringLiteral("cannot copy");
        qputenv("PATH", inPath ? QFile::encodeName(path.path()) + ":/bin" : QByteArray{"/bin"});
        QObject parent;
        ConfigCheck check{&parent};
        check.start({});
        const QProcess *process{parent.findChild<QProcess *>()};
        const QString program{process ? process->program() : QString{}};
        return program == (inPath ? server : folder + name) ? QString{}
                                                            : QLatin1Char{'\''} + program + QLatin1Char{'\''};
    }));
}

void ConfigCheckTest::passesTheTextToNoOtherProcess()
{
    const FakePrograms programs;
    programs.install(QStringLiteral("dhcpd"), endlessServer);
    QObject parent;
    ConfigCheck check{&parent};
    check.start("secret");
    const QProcess *process{parent.findChild<QProcess *>()};
    QVERIFY(process);
    const QString file{QStringLiteral("memfd:dhcpd.conf")};
    QTRY_VERIFY(openFiles(QString::number(process->processId())).contains(file));
    QVERIFY(openFiles(QString::number(QCoreApplication::applicationPid())).contains(file));
    const QString inOther{openFiles(QStringLiteral("self"))};
    QVERIFY2(!inOther.contains(file), qPrintable(inOther));
}

QProcess *ConfigCheckTest::abandonCheck(QObject *parent)
{
    const FakePrograms programs;
    programs.install(QStringLiteral("dhcpd"), endlessServer);
    ConfigCheck check{parent};
    check.start({});
    return parent->findChild<QProcess *>();
}

void ConfigCheckTest::outputWithoutEndIsCutAndEnded()
{
    const FakePrograms programs;
    programs.install(QStringLiteral("dhcpd"), "exec yes \"$3 line 2: no such thing\"\n");
    ConfigCheck check{this};
    QSignalSpy refusals{&check, &ConfigCheck::refused};
    check.start("authoritative;\n");
    const QPointer<QProcess> process{findChild<QProcess *>()};
    QVERIFY(process);
    QVERIFY(refusals.wait());
    QCOMPARE(refusals.constFirst().at(0).toString(), QStringLiteral("line 2: no such thing"));
    QCOMPARE(refusals.constFirst().at(1).toString().size(), 64 * 1024);
    QCOMPARE(process->state(), QProcess::NotRunning);
}

void ConfigCheckTest::abandonedProcessGoesWhenItHasEnded()
{
    QObject parent;
    const QPointer<QProcess> process{abandonCheck(&parent)};
    QVERIFY(process);
    const qint64 id{process->processId()};
    QTRY_VERIFY(!process);
    QVERIFY(!isRunning(id));
}

void ConfigCheckTest::abandonedProcessGoesWithTheParent()
{
    auto parent = std::make_unique<QObject>();
    const QProcess *process{abandonCheck(parent.get())};
    QVERIFY(process);
    const qint64 id{process->processId()};

    QtMessageHandler previous{qInstallMessageHandler(countWarning)};
    parent.reset();
    qInstallMessageHandler(previous);
    QCOMPARE(warnings, 0);
    QVERIFY(!isRunning(id));
}

QTEST_GUILESS_MAIN(ConfigCheckTest)
#include "tst_configcheck.moc"
