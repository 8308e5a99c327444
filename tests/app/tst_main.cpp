// SPDX-License-Identifier: GPL-3.0-or-later
// The program as it is shipped, started as a process of its own, on a virtual display where somebody must press a key.
#include <QDeadlineTimer>
#include <QDir>
#include <QFile>
#include <QProcess>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QTest>

#include <unistd.h>

namespace {

constexpr int patience = 60'000; // milliseconds until what never comes fails the test
constexpr uint nobody = 65534;

const QString program = QStringLiteral(ORV_PROGRAM);
const QString privateNetwork = QStringLiteral(ORV_PRIVATE_NETWORK);

bool isInstalled(const char *name) { return !QStandardPaths::findExecutable(QString::fromLatin1(name)).isEmpty(); }

/// Why no private network can be made here; empty when it can.
QByteArray refusalOfNetwork()
{
    QProcess process;
    process.start(privateNetwork, {QStringLiteral("true")});
    process.waitForFinished(patience);
    return process.exitStatus() == QProcess::NormalExit && process.exitCode() == 0
               ? QByteArray{}
               : "no private network: " + process.readAllStandardError();
}

/// A process whose messages are shown among those of the test.
class LoudProcess final : public QProcess
{
public:
    LoudProcess() { setProcessChannelMode(QProcess::ForwardedErrorChannel); }
};

/// A virtual display, and what a person does there.
class Display final
{
public:
    Display()
    {
        // Without -noreset the display starts anew when its last client leaves, and throws out who is just coming: the
        // program, when the look for its window is quicker.
        m_server.start(QStringLiteral("Xvfb"),
                       {QStringLiteral("-displayfd"), QStringLiteral("1"), QStringLiteral("-ac"),
                        QStringLiteral("-noreset"), QStringLiteral("-nolisten"), QStringLiteral("tcp"),
                        QStringLiteral("-screen"), QStringLiteral("0"), QStringLiteral("1280x1024x24")});
        while (!m_server.canReadLine() && m_server.waitForReadyRead(patience)) {
        }
        m_environment.insert(QStringLiteral("DISPLAY"),
                             QLatin1Char{':'} + QString::fromLatin1(m_server.readLine().trimmed()));
        m_environment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("xcb"));
    }
    ~Display()
    {
        m_server.terminate();
        m_server.waitForFinished();
    }
    Q_DISABLE_COPY_MOVE(Display)

    const QProcessEnvironment &environment() const { return m_environment; }

    /// The titles of the windows that can be seen: as soon as they are the expected ones, else when the program has
    /// ended or patience has.
    QStringList awaitTitles(const QStringList &expected, const QProcess &running) const
    {
        const QDeadlineTimer deadline{patience};
        QStringList seen = titles();
        while (seen != expected && running.state() != QProcess::NotRunning && !deadline.hasExpired()) {
            QTest::qWait(50);
            seen = titles();
        }
        return seen;
    }

    /// Gives the focus to the window with the title and presses the keys.
    void press(const QString &title, const QByteArray &keys) const
    {
        const QByteArray window = use("search --onlyvisible --name " + title.toUtf8().replace(' ', '.')).trimmed();
        use("windowfocus --sync " + window);
        for (const QByteArray &key : keys.split(' '))
            use("key --delay 50 " + key);
    }

private:
    QStringList titles() const
    {
        const QByteArray output = use("search --onlyvisible --name . getwindowname %@");
        return QString::fromUtf8(output).split(QLatin1Char{'\n'}, Qt::SkipEmptyParts);
    }

    QByteArray use(const QByteArray &arguments) const
    {
        LoudProcess xdotool;
        xdotool.setProcessEnvironment(m_environment);
        xdotool.start(QStringLiteral("xdotool"), QString::fromUtf8(arguments).split(QLatin1Char{' '}));
        xdotool.waitForFinished(patience);
        return xdotool.readAllStandardOutput();
    }

    LoudProcess m_server;
    QProcessEnvironment m_environment{QProcessEnvironment::systemEnvironment()};
};

} // namespace

class MainTest final : public QObject
{
    Q_OBJECT

private slots:
    void ordinaryUserIsRefused();
    void superuserGetsTheWindow();
    void secondStartEnds();
};

void MainTest::ordinaryUserIsRefused()
{
    if (!isInstalled("Xvfb") || !isInstalled("xdotool"))
        QSKIP("Xvfb and xdotool are needed to press the box's button");

    // The user's own folder, with a copy of the program, since he may not be able to reach the original.
    const QTemporaryDir folder;
    const QString copy = folder.filePath(QFileInfo{program}.fileName());
    QVERIFY(QFile::copy(program, copy));
    QStringList command{copy};
    if (getuid() == 0) {
        if (!isInstalled("setpriv"))
            QSKIP("setpriv is needed to become an ordinary user");
        for (const QString &path : {folder.path(), copy})
            QCOMPARE(chown(QFile::encodeName(path).constData(), nobody, nobody), 0);
        command = QStringList{QStringLiteral("setpriv"), QStringLiteral("--reuid=%1").arg(nobody),
                              QStringLiteral("--regid=%1").arg(nobody), QStringLiteral("--clear-groups")} +
                  command;
    }

    const Display display;
    auto environment = display.environment();
    environment.insert(QStringLiteral("DBUS_SESSION_BUS_ADDRESS"), QStringLiteral("disabled:"));
    for (const char *name : {"XDG_RUNTIME_DIR", "XDG_CONFIG_HOME", "XDG_CACHE_HOME", "HOME"})
        environment.insert(QString::fromLatin1(name), folder.path());
    LoudProcess process;
    process.setProcessEnvironment(environment);
    process.start(command.first(), command.mid(1));
    const QString title = QStringLiteral("Error");
    QCOMPARE(display.awaitTitles({title}, process), QStringList{title});
    display.press(title, "Return");
    QTRY_COMPARE_WITH_TIMEOUT(process.state(), QProcess::NotRunning, patience);
    QCOMPARE(process.exitStatus(), QProcess::NormalExit);
    QCOMPARE(process.exitCode(), 1);
    QVERIFY(!QDir{folder.path()}.exists(QStringLiteral("Unknown Organization"))); // no window that stored its size
}

void MainTest::superuserGetsTheWindow()
{
    if (!isInstalled("Xvfb") || !isInstalled("xdotool"))
        QSKIP("Xvfb and xdotool are needed to close the window");
    if (const QByteArray refusal = refusalOfNetwork(); !refusal.isEmpty())
        QSKIP(refusal.constData());

    const Display display;
    LoudProcess process;
    process.setProcessEnvironment(display.environment());
    process.start(privateNetwork,
                  {QStringLiteral("sh"), QStringLiteral("-c"),
                   QStringLiteral("\"$0\"; status=$?; cd \"$XDG_CONFIG_HOME\"; cat */*; exit $status"), program});
    const QString title = QStringLiteral("Configure DHCP server");
    QCOMPARE(display.awaitTitles({title}, process), QStringList{title});
    display.press(title, "alt+f Up Return"); // the last entry of the menu, Exit
    QTRY_COMPARE_WITH_TIMEOUT(process.state(), QProcess::NotRunning, patience);
    QCOMPARE(process.exitStatus(), QProcess::NormalExit);
    QCOMPARE(process.exitCode(), 0);
    QCOMPARE(process.readAllStandardOutput(), QByteArray{"[MainWindow]\nSize=@Size(960 640)\n"});
}

void MainTest::secondStartEnds()
{
    if (const QByteArray refusal = refusalOfNetwork(); !refusal.isEmpty())
        QSKIP(refusal.constData());
    // The first instance has asked for the server's state, which the network's service manager notes down, when
    // it has long been the first.
    LoudProcess process;
    process.start(privateNetwork, {QStringLiteral("sh"), QStringLiteral("-c"), QStringLiteral(R"("$0" & first=$!
                   until [ -e /run/private-network/service ]; do
                       kill -0 $first || { wait $first; echo "first: $?"; exit; }
                       sleep 0.1
                   done
                   "$0"; echo "second: $?"
                   kill -0 $first && echo "first runs"
                   kill $first)"),
                                   program});
    QVERIFY(process.waitForFinished(patience));
    QCOMPARE(process.readAllStandardOutput(), QByteArray{"second: 1\nfirst runs\n"});
}

QTEST_GUILESS_MAIN(MainTest)
#include "tst_main.moc"
