// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/singleinstance.h"

#include <QDir>
#include <QFileInfo>
#include <QLocalSocket>
#include <QProcess>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>
#include <QtEndian>

#include <memory>

#include <sched.h>
#include <sys/file.h>
#include <sys/mount.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

const QString instanceName{QStringLiteral("orv_test_instance")};
const QString superusersFolder{QStringLiteral("/run/orv-admin-dhcp")};
constexpr uid_t otherUser{65534};

enum StrangersFate
{
    Refused,
    Dropped,
    Answered
};

// Connects and sends `bytes` as another user would, from a process of its own.
StrangersFate sendAsOtherUser(const QString &socketPath, const QByteArray &bytes)
{
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    qstrncpy(address.sun_path, QFile::encodeName(socketPath).constData(), sizeof(address.sun_path));
    const pid_t child{fork()};
    if (child == 0) {
        char answer{};
        const int descriptor{socket(AF_UNIX, SOCK_STREAM, 0)};
        if (setresuid(otherUser, otherUser, otherUser) != 0 ||
            connect(descriptor, reinterpret_cast<const sockaddr *>(&address), sizeof(address)) != 0)
            _exit(Refused);
        send(descriptor, bytes.constData(), static_cast<size_t>(bytes.size()), MSG_NOSIGNAL);
        _exit(read(descriptor, &answer, 1) > 0 ? Answered : Dropped);
    }
    int status{};
    waitpid(child, &status, 0);
    return static_cast<StrangersFate>(WEXITSTATUS(status));
}

struct Kill
{
    void operator()(QProcess *process) const
    {
        process->kill();
        process->waitForFinished();
        delete process;
    }
};

using Instance = std::unique_ptr<QProcess, Kill>;

QByteArray framed(const QByteArray &text, quint32 announcedSize)
{
    QByteArray header(sizeof(quint32), Qt::Uninitialized);
    qToBigEndian(announcedSize, header.data());
    return header + text;
}

QByteArray framed(const QByteArray &text) { return framed(text, static_cast<quint32>(text.size())); }

} // namespace

class QtSingleApplicationTest final : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void init();
    void cleanup();

    void laterInstanceRaisesTheFirstAndEnds();
    void superuserHasOneInstanceWhereverItLogsIn_data();
    void superuserHasOneInstanceWhereverItLogsIn();
    void instanceMadeUnderAnyUmaskIsFound_data();
    void instanceMadeUnderAnyUmaskIsFound();
    void superuserWithoutAFolderIsToldSo_data();
    void superuserWithoutAFolderIsToldSo();
    void lockAndSocketOfAKilledInstanceDoNotBlock();
    void leftOverFilesOfAnyContentDoNotBlock();
    void oneOfTwoStartedTogetherWins();
    void instanceThatIsJustStartingIsWaitedFor();
    void laterInstanceGivesUpSilently();
    void busyInstanceIsGivenUpSilently();
    void longestMessageArrivesAndALongerOneIsRefused();
    void nonsenseIsDropped_data();
    void nonsenseIsDropped();
    void silentClientIsDroppedAndKeepsNobodyWaiting();
    void clientThatLeavesEarlyDoesNoHarm();
    void otherUsersAreKeptOut();
    void withoutAFolderEveryInstanceIsTheFirst_data();
    void withoutAFolderEveryInstanceIsTheFirst();

private:
    Instance start(int timeout = 30000, int busy = 0) const;
    Instance startFirst(int busy = 0) const;
    static QStringList outputAtEnd(QProcess &process);
    QString folder() const { return geteuid() == 0 ? superusersFolder : m_session->path(); }
    QString path(const char *suffix) const
    {
        return folder() + QLatin1Char{'/'} + instanceName + QLatin1String{suffix};
    }

    std::unique_ptr<QTemporaryDir> m_session; // the runtime directory of the session
    QString m_sessionPath;                    // what instances are told that it is
};

// Returns the next line, once all of it is there.
#define EXPECT_LINE(PROCESS, LINE)                                                                                     \
    do {                                                                                                               \
        QTRY_VERIFY_WITH_TIMEOUT((PROCESS)->canReadLine() || (PROCESS)->state() == QProcess::NotRunning, 30000);       \
        QCOMPARE((PROCESS)->readLine().trimmed(), QByteArray{LINE});                                                   \
    } while (false)

// The superuser's instances meet in /run: here in one of the test's own, and where the machine does not allow that, an
// ordinary user's are tested.
void QtSingleApplicationTest::initTestCase()
{
    if (geteuid() != 0)
        return;
    if (unshare(CLONE_NEWNS) == 0 && mount("none", "/", nullptr, MS_REC | MS_PRIVATE, nullptr) == 0 &&
        mount("none", "/run", "tmpfs", 0, "mode=0755") == 0)
        return;
    QCOMPARE(setresgid(otherUser, otherUser, otherUser), 0);
    QCOMPARE(setresuid(otherUser, otherUser, otherUser), 0);
    if (!QFileInfo{QStringLiteral(ORV_TEST_INSTANCE)}.isExecutable())
        QSKIP("an ordinary user cannot start the program that was built here");
}

void QtSingleApplicationTest::init()
{
    m_session = std::make_unique<QTemporaryDir>();
    QVERIFY(m_session->isValid());
    m_sessionPath = m_session->path();
    if (geteuid() == 0)
        QVERIFY(QDir{}.mkdir(superusersFolder));
    QCOMPARE(chmod(QFile::encodeName(folder()).constData(), 0700), 0);
}

void QtSingleApplicationTest::cleanup()
{
    m_session.reset();
    if (geteuid() == 0)
        QDir{superusersFolder}.removeRecursively();
}

Instance QtSingleApplicationTest::start(int timeout, int busy) const
{
    Instance process{new QProcess};
    QProcessEnvironment environment{QProcessEnvironment::systemEnvironment()};
    environment.insert(QStringLiteral("XDG_RUNTIME_DIR"), m_sessionPath);
    process->setProcessEnvironment(environment);
    process->setProcessChannelMode(QProcess::ForwardedErrorChannel);
    process->start(QStringLiteral(ORV_TEST_INSTANCE), {QString::number(timeout), QString::number(busy)});
    return process;
}

Instance QtSingleApplicationTest::startFirst(int busy) const
{
    auto process = start(0, busy);
    [&process] { EXPECT_LINE(process, "first"); }();
    return process;
}

QStringList QtSingleApplicationTest::outputAtEnd(QProcess &process)
{
    process.waitForFinished();
    return QString::fromUtf8(process.readAll()).split(QLatin1Char{'\n'}, Qt::SkipEmptyParts);
}

void QtSingleApplicationTest::laterInstanceRaisesTheFirstAndEnds()
{
    const auto first = startFirst();
    const auto later = start();
    QCOMPARE(outputAtEnd(*later), QStringList({QStringLiteral("sent"), QStringLiteral("windows: 0")}));
    QCOMPARE(later->exitCode(), 1);
    EXPECT_LINE(first, "message: raise");
    EXPECT_LINE(first, "in front");
}

void QtSingleApplicationTest::superuserHasOneInstanceWhereverItLogsIn_data()
{
    QTest::addColumn<bool>("isFirstInSession");
    QTest::addColumn<bool>("isLaterInSession");
    QTest::addRow("with a session, then without") << true << false;
    QTest::addRow("without a session, then with") << false << true;
    QTest::addRow("with two sessions") << true << true;
}

void QtSingleApplicationTest::superuserHasOneInstanceWhereverItLogsIn()
{
    if (geteuid() != 0)
        QSKIP("only for the superuser, in a mount namespace");
    QFETCH(const bool, isFirstInSession);
    QFETCH(const bool, isLaterInSession);
    const QTemporaryDir otherSession;
    m_sessionPath = isFirstInSession ? m_session->path() : QString{};
    const auto first = startFirst();
    m_sessionPath = isLaterInSession ? otherSession.path() : QString{};
    const auto later = start();
    QCOMPARE(outputAtEnd(*later), QStringList({QStringLiteral("sent"), QStringLiteral("windows: 0")}));
    EXPECT_LINE(first, "message: raise");
}

void QtSingleApplicationTest::instanceMadeUnderAnyUmaskIsFound_data()
{
    QTest::addColumn<uint>("mask");
    for (const uint mask : {0U, 077U, 0277U, 0777U})
        QTest::addRow("umask %04o", mask) << mask;
}

void QtSingleApplicationTest::instanceMadeUnderAnyUmaskIsFound()
{
    QFETCH(const uint, mask);
    if (geteuid() == 0)
        QVERIFY(QDir{}.rmdir(superusersFolder));
    const mode_t before{umask(mask)};
    const auto first = startFirst();
    umask(before);
    for (const char *suffix : {".lock", ".socket"})
        QVERIFY2(QFile::permissions(path(suffix)) & QFile::WriteOwner, suffix);
    const auto later = start();
    QCOMPARE(outputAtEnd(*later).value(0), QStringLiteral("sent"));
    EXPECT_LINE(first, "message: raise");
}

void QtSingleApplicationTest::superuserWithoutAFolderIsToldSo_data()
{
    QTest::addColumn<QString>("trap");
    QTest::addRow("open to others") << QStringLiteral("open");
    QTest::addRow("of another user") << QStringLiteral("owner");
    QTest::addRow("a file") << QStringLiteral("file");
}

void QtSingleApplicationTest::superuserWithoutAFolderIsToldSo()
{
    if (geteuid() != 0)
        QSKIP("only for the superuser, in a mount namespace");
    QFETCH(const QString, trap);
    const QByteArray name{QFile::encodeName(superusersFolder)};
    if (trap == QLatin1String{"open"})
        QCOMPARE(chmod(name.constData(), 0755), 0);
    if (trap == QLatin1String{"owner"})
        QCOMPARE(chown(name.constData(), otherUser, otherUser), 0);
    if (trap == QLatin1String{"file"}) {
        QVERIFY(QDir{}.rmdir(superusersFolder));
        QFile file{superusersFolder};
        QVERIFY(file.open(QIODevice::WriteOnly));
    }
    const auto refused = start();
    const QStringList output{outputAtEnd(*refused)};
    QVERIFY2(output.value(0).startsWith(QLatin1String{"box: The program does not start, "}),
             qPrintable(output.join(QLatin1Char{'\n'})));
    QVERIFY(output.constFirst().contains(superusersFolder));
    QCOMPARE(output.value(1), QStringLiteral("not sent"));
    QCOMPARE(refused->exitCode(), 1);
    QFile::remove(superusersFolder);
}

void QtSingleApplicationTest::lockAndSocketOfAKilledInstanceDoNotBlock()
{
    const auto killed = startFirst();
    killed->kill();
    QVERIFY(killed->waitForFinished());
    QVERIFY(QFile::exists(path(".lock")));
    QVERIFY(QFile::exists(path(".socket")));

    const auto first = startFirst();
    const auto later = start();
    QCOMPARE(outputAtEnd(*later).value(0), QStringLiteral("sent"));
    EXPECT_LINE(first, "message: raise");
}

// For example a lock file with the process id of something else that runs, or of a process on another machine.
void QtSingleApplicationTest::leftOverFilesOfAnyContentDoNotBlock()
{
    for (const char *suffix : {".lock", ".socket"}) {
        QFile file{path(suffix)};
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(QByteArray::number(getpid()) + "\ninit\nanother-host\n");
    }
    const auto first = startFirst();
    const auto later = start();
    QCOMPARE(outputAtEnd(*later).value(0), QStringLiteral("sent"));
    EXPECT_LINE(first, "message: raise");
}

void QtSingleApplicationTest::oneOfTwoStartedTogetherWins()
{
    for (int round{0}; round < 5; ++round) {
        const auto one = start();
        const auto two = start();
        QTRY_VERIFY_WITH_TIMEOUT(one->canReadLine() && two->canReadLine(), 30000);
        QStringList lines{QString::fromUtf8(one->readLine()).trimmed(), QString::fromUtf8(two->readLine()).trimmed()};
        const bool oneIsFirst{lines.constFirst() == QStringLiteral("first")};
        lines.sort();
        QCOMPARE(lines, QStringList({QStringLiteral("first"), QStringLiteral("sent")}));
        QProcess *winner{oneIsFirst ? one.get() : two.get()};
        QProcess *loser{oneIsFirst ? two.get() : one.get()};
        QVERIFY(loser->state() == QProcess::NotRunning || loser->waitForFinished());
        QCOMPARE(loser->exitCode(), 1);
        EXPECT_LINE(winner, "message: raise");
    }
}

void QtSingleApplicationTest::instanceThatIsJustStartingIsWaitedFor()
{
    QFile lock{path(".lock")};
    QVERIFY(lock.open(QIODevice::ReadWrite));
    QCOMPARE(flock(lock.handle(), LOCK_EX), 0);
    const auto later = start();
    // By now it has found nobody listening, and must not have given up.
    QVERIFY(!later->waitForFinished(1000));

    QLocalServer server;
    QVERIFY(server.listen(path(".socket")));
    QVERIFY(server.waitForNewConnection(30000));
    QLocalSocket *client{server.nextPendingConnection()};
    const QByteArray expected{framed("raise")};
    QTRY_COMPARE_WITH_TIMEOUT(client->bytesAvailable(), qint64{expected.size()}, 30000);
    QCOMPARE(client->readAll(), expected);
    client->write("ack");
    client->flush();
    QCOMPARE(outputAtEnd(*later), QStringList({QStringLiteral("sent"), QStringLiteral("windows: 0")}));
}

void QtSingleApplicationTest::laterInstanceGivesUpSilently()
{
    QFile lock{path(".lock")};
    QVERIFY(lock.open(QIODevice::ReadWrite));
    QCOMPARE(flock(lock.handle(), LOCK_EX), 0);
    const auto later = start(200);
    QCOMPARE(outputAtEnd(*later), QStringList({QStringLiteral("not sent"), QStringLiteral("windows: 0")}));
    QCOMPARE(later->exitCode(), 1);
}

void QtSingleApplicationTest::busyInstanceIsGivenUpSilently()
{
    const auto first = startFirst(1000000);
    const auto later = start(200);
    QCOMPARE(outputAtEnd(*later), QStringList({QStringLiteral("not sent"), QStringLiteral("windows: 0")}));
    QCOMPARE(later->exitCode(), 1);
}

void QtSingleApplicationTest::longestMessageArrivesAndALongerOneIsRefused()
{
    const auto first = startFirst();
    SingleInstance later{folder(), instanceName};
    QVERIFY(later.isOtherRunning());
    QVERIFY(later.send(QString{64 * 1024, QLatin1Char{'x'}}, 30000));
    EXPECT_LINE(first, "message: 65536");
    EXPECT_LINE(first, "in front");
    QVERIFY(!later.send(QString{64 * 1024 + 1, QLatin1Char{'x'}}, 30000));
    QVERIFY(later.send(QString::fromUtf8("grüße\n"), 30000));
    EXPECT_LINE(first, "message: grüße");
}

void QtSingleApplicationTest::nonsenseIsDropped_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addRow("garbage") << QByteArray::fromHex("fffe00010203deadbeef");
    QTest::addRow("text") << QByteArrayLiteral("GET / HTTP/1.0\r\n\r\n");
    QTest::addRow("one byte too long") << framed(QByteArray(64 * 1024 + 1, 'x'));
    QTest::addRow("many megabytes") << framed(QByteArray(32 * 1024 * 1024, 'x'));
    QTest::addRow("the longest length") << framed({}, 0xffffffff);
}

void QtSingleApplicationTest::nonsenseIsDropped()
{
    QFETCH(const QByteArray, bytes);
    const auto first = startFirst();
    QLocalSocket client;
    QSignalSpy disconnected{&client, &QLocalSocket::disconnected};
    client.connectToServer(path(".socket"));
    QVERIFY(client.waitForConnected(30000));
    client.write(bytes);
    QTRY_COMPARE_WITH_TIMEOUT(disconnected.count(), 1, 30000);
    QCOMPARE(client.readAll(), QByteArray{});

    SingleInstance later{folder(), instanceName};
    QVERIFY(later.send(QStringLiteral("raise"), 30000));
    EXPECT_LINE(first, "message: raise");
}

void QtSingleApplicationTest::silentClientIsDroppedAndKeepsNobodyWaiting()
{
    const auto first = startFirst();
    QLocalSocket silent;
    QLocalSocket halfway;
    QSignalSpy silentDropped{&silent, &QLocalSocket::disconnected};
    QSignalSpy halfwayDropped{&halfway, &QLocalSocket::disconnected};
    silent.connectToServer(path(".socket"));
    halfway.connectToServer(path(".socket"));
    QVERIFY(silent.waitForConnected(30000));
    QVERIFY(halfway.waitForConnected(30000));
    halfway.write(framed("ra", 5));

    SingleInstance later{folder(), instanceName};
    QVERIFY(later.send(QStringLiteral("raise"), 30000));
    EXPECT_LINE(first, "message: raise");
    EXPECT_LINE(first, "in front");
    QTRY_COMPARE_WITH_TIMEOUT(silentDropped.count(), 1, 30000);
    QTRY_COMPARE_WITH_TIMEOUT(halfwayDropped.count(), 1, 30000);
    QVERIFY(!first->canReadLine());
}

void QtSingleApplicationTest::clientThatLeavesEarlyDoesNoHarm()
{
    const auto first = startFirst();
    for (const QByteArray &bytes : {QByteArray{}, framed("ra", 5), framed("left")}) {
        QLocalSocket client;
        client.connectToServer(path(".socket"));
        QVERIFY(client.waitForConnected(30000));
        client.write(bytes);
        client.flush();
        client.abort();
    }
    EXPECT_LINE(first, "message: left");
    EXPECT_LINE(first, "in front");
    SingleInstance later{folder(), instanceName};
    QVERIFY(later.send(QStringLiteral("raise"), 30000));
    EXPECT_LINE(first, "message: raise");
}

void QtSingleApplicationTest::otherUsersAreKeptOut()
{
    if (geteuid() != 0)
        QSKIP("only the superuser can act as another user");
    const auto first = startFirst();
    QCOMPARE(sendAsOtherUser(path(".socket"), framed("intruder")), Refused);

    // With the folder and the socket open to everybody, the server itself has to tell users apart.
    QCOMPARE(chmod(QFile::encodeName(folder()).constData(), 0755), 0);
    QCOMPARE(chmod(QFile::encodeName(path(".socket")).constData(), 0777), 0);
    QCOMPARE(sendAsOtherUser(path(".socket"), framed("intruder")), Dropped);

    SingleInstance later{folder(), instanceName};
    QVERIFY(later.send(QStringLiteral("raise"), 30000));
    EXPECT_LINE(first, "message: raise");
}

void QtSingleApplicationTest::withoutAFolderEveryInstanceIsTheFirst_data()
{
    QTest::addColumn<QString>("folder");
    QTest::addRow("none") << QString{};
    QTest::addRow("missing") << QStringLiteral("/nonexistent");
}

void QtSingleApplicationTest::withoutAFolderEveryInstanceIsTheFirst()
{
    QFETCH(const QString, folder);
    SingleInstance one{folder, instanceName};
    SingleInstance two{folder, instanceName};
    QVERIFY(!one.isOtherRunning());
    QVERIFY(!two.isOtherRunning());
    QVERIFY(!two.send(QStringLiteral("raise"), 1000));
}

QTEST_GUILESS_MAIN(QtSingleApplicationTest)
#include "tst_qtsingleapplication.moc"
