// SPDX-License-Identifier: GPL-3.0-or-later
#include "server/dhcpservermanager.h"
#include "tests/support/temporaryroot.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QNetworkInterface>
#include <QSignalSpy>
#include <QTest>

#include <algorithm>
#include <sys/fsuid.h>
#include <unistd.h>

namespace {

using Choice = QMap<QString, bool>;

QString couldNotRead(const QString &path) { return QStringLiteral("Unable to open file '%1' for read").arg(path); }
QString notStored(const QString &path)
{
    return QStringLiteral("The choice of interfaces is not stored, since file '%1' has no line with 'INTERFACESv4'")
        .arg(path);
}
QString couldNotWrite(const QString &path) { return QStringLiteral("Unable to open file '%1' for write").arg(path); }

// The texts of the errors that `spy` has seen.
QStringList errorsOf(const QSignalSpy &spy)
{
    QStringList errors;
    for (const QList<QVariant> &arguments : spy)
        errors.append(arguments.constFirst().toString());
    return errors;
}

// From now on the reasons of errors are appended to `reasons`, each while it is reported.
void recordReasons(const DhcpServerManager &manager, QStringList &reasons)
{
    QObject::connect(&manager, &DhcpServerManager::error, &manager, [&] { reasons.append(manager.errorReason()); });
}

// The map to expect: the interfaces of this machine, and those of `served` with the flag set.
Choice machineInterfacesAnd(const QStringList &served)
{
    const TemporaryRoot root;
    DhcpServerManager manager;
    manager.collectSystemInterfaces();
    Choice interfaces{manager.interfaces()};
    for (const QString &name : served)
        interfaces.insert(name, true);
    return interfaces;
}

// While it lives, files are opened as an unprivileged user opens them, even where the test runs as the superuser.
class WithoutPrivileges final
{
public:
    WithoutPrivileges()
    {
        if (geteuid() == 0)
            setfsuid(65534);
    }
    ~WithoutPrivileges() { setfsuid(geteuid()); }
    Q_DISABLE_COPY_MOVE(WithoutPrivileges)
};

constexpr QFile::Permissions everyoneMayEnter{QFile::ReadOwner | QFile::ExeOwner | QFile::ReadGroup | QFile::ExeGroup |
                                              QFile::ReadOther | QFile::ExeOther};
constexpr QFile::Permissions everyoneMayChange{everyoneMayEnter | QFile::WriteOwner | QFile::WriteGroup |
                                               QFile::WriteOther};
constexpr QFile::Permissions everyoneMayRead{QFile::ReadOwner | QFile::ReadGroup | QFile::ReadOther};

QString defaultsFolder() { return QFileInfo{paths::serverDefaults()}.absolutePath(); }

} // namespace

class ServedInterfacesTest final : public QObject
{
    Q_OBJECT

private slots:
    void offersInterfacesOfTheMachine();
    void readsServedNames_data();
    void readsServedNames();
    void forgetsNamesThatTheFileNoLongerHas();
    void reportsUnreadableFile_data();
    void reportsUnreadableFile();
    void writesChoice_data();
    void writesChoice();
    void keepsWhatOthersChangeMeanwhile_data();
    void keepsWhatOthersChangeMeanwhile();
    void makesFileAgainThatWasRemovedMeanwhile();
    void writesLinesThatItRead_data();
    void writesLinesThatItRead();
    void writesToAnotherPath();
    void ignoresEmptyChoice();
    void ignoresEqualChoice();
    void announcesChangedChoice();
    void createsMissingFileWithoutTheChoice();
    void neverOverwritesFileThatItCouldNotRead();
    void neverOverwritesFileThatAppearedUnread();
    void givesChoiceUpWhenWriteFails();
    void doesNotWriteOverDirectory();
};

void ServedInterfacesTest::offersInterfacesOfTheMachine()
{
    Choice expected;
    for (const QNetworkInterface &interface : QNetworkInterface::allInterfaces()) {
        const QList<QNetworkAddressEntry> addresses{interface.addressEntries()};
        const auto isIpv4 = [](const QNetworkAddressEntry &address) {
            return address.ip().protocol() == QAbstractSocket::IPv4Protocol;
        };
        if (std::any_of(addresses.cbegin(), addresses.cend(), isIpv4) &&
            !interface.flags().testFlag(QNetworkInterface::IsLoopBack))
            expected.insert(interface.name(), false);
    }
    const TemporaryRoot root;
    const DhcpServerManager manager;
    QCOMPARE(manager.interfaces(), expected);
}

void ServedInterfacesTest::readsServedNames_data()
{
    QTest::addColumn<QByteArray>("content");
    QTest::addColumn<QStringList>("served");
    const auto row = [](const char *name, const QByteArray &content, const QStringList &served) {
        QTest::addRow("%s", name) << content << served;
    };
    const auto names = [](std::initializer_list<const char *> list) {
        QStringList strings;
        for (const char *name : list)
            strings.append(QString::fromUtf8(name));
        return strings;
    };
    row("empty file", "", {});
    row("no key", "# comment\nOPTIONS=\"-4\"\n", {});
    row("one name", "INTERFACESv4=\"srv0\"\n", names({"srv0"}));
    row("two names", "INTERFACESv4=\"srv0 srv1\"\n", names({"srv0", "srv1"}));
    row("no names", "INTERFACESv4=\"\"\n", {});
    row("one space", "INTERFACESv4=\" \"\n", names({""}));
    row("two spaces in a row", "INTERFACESv4=\"srv0  srv1\"\n", names({"srv0", "", "srv1"}));
    row("space at the start", "INTERFACESv4=\" srv0\"\n", names({"", "srv0"}));
    row("space at the end", "INTERFACESv4=\"srv0 \"\n", names({"srv0", ""}));
    row("tab is no separator", "INTERFACESv4=\"srv0\tsrv1\"\n", names({"srv0\tsrv1"}));
    row("commented out", "#INTERFACESv4=\"eth9\"\n", names({"eth9"}));
    row("key anywhere in the line", "export MY_INTERFACESv4_OLD=\"srv0\"\n", names({"srv0"}));
    row("key in other letter case", "interfacesV4=\"srv0\"\n", {});
    row("IPv6 only", "INTERFACESv6=\"srv6\"\n", {});
    row("both kinds", "INTERFACESv4=\"srv4\"\nINTERFACESv6=\"srv6\"\n", names({"srv4"}));
    row("no closing quote", "INTERFACESv4=\"srv0 srv1\n", names({"srv0", "srv1"}));
    row("second equals sign", "INTERFACESv4=\"srv0=srv1\"\n", names({"srv0"}));
    row("text after the quotes", "INTERFACESv4=\"srv0\" # and \"srv1\"\n", names({"srv0"}));
    row("text before the quotes", "INTERFACESv4= x\"srv0\"\n", names({"srv0"}));
    row("unquoted", "INTERFACESv4=srv0\n", names({"srv0"}));
    row("unquoted, two names", "INTERFACESv4=srv0 srv1\n", names({"srv0 srv1"}));
    row("single quotes", "INTERFACESv4='srv0'\n", names({"'srv0'"}));
    row("nothing after the equals sign", "INTERFACESv4=\n", names({""}));
    row("no equals sign", "# see INTERFACESv4\n", names({"# see INTERFACESv4"}));
    row("last line decides", "INTERFACESv4=\"srv0\"\nINTERFACESv4=\"srv1\"\n", names({"srv1"}));
    row("last line decides, without names", "INTERFACESv4=\"srv0\"\nINTERFACESv4=\"\"\n", {});
    row("last line decides, commented out", "INTERFACESv4=\"srv0\"\n#INTERFACESv4=\"srv1\"\n", names({"srv1"}));
    row("unquoted last", "INTERFACESv4=\"srv0\"\nINTERFACESv4=srv1\n", names({"srv1"}));
    row("unquoted first", "INTERFACESv4=srv1\nINTERFACESv4=\"srv0\"\n", names({"srv0"}));
    row("remark last", "INTERFACESv4=\"srv0\"\n# INTERFACESv4\n", names({"# INTERFACESv4"}));
    row("other lines between keep the names", "INTERFACESv4=\"srv0\"\nX=\"y\"\n\n", names({"srv0"}));
    row("no terminator at the end", "X=1\nINTERFACESv4=\"srv0\"", names({"srv0"}));
    row("CR LF", "X=1\r\nINTERFACESv4=\"srv0 srv1\"\r\n", names({"srv0", "srv1"}));
    row("CR LF, unquoted", "INTERFACESv4=srv0\r\n", names({"srv0"}));
    row("UTF-8", "INTERFACESv4=\"b\xc3\xbcro\"\n", names({"b\u00fcro"}));
    row("Latin-1", "# B\xfcro\nINTERFACESv4=\"b\xfcro\"\n", names({"b\u00fcro"}));
}

void ServedInterfacesTest::readsServedNames()
{
    QFETCH(const QByteArray, content);
    QFETCH(const QStringList, served);
    const Choice expected{machineInterfacesAnd(served)};
    const TemporaryRoot root;
    writeTestFile(paths::serverDefaults(), content);
    const DhcpServerManager manager;
    QCOMPARE(manager.interfaces(), expected);
}

void ServedInterfacesTest::forgetsNamesThatTheFileNoLongerHas()
{
    const Choice expected{machineInterfacesAnd({QStringLiteral("srv1")})};
    const TemporaryRoot root;
    writeTestFile(paths::serverDefaults(), "INTERFACESv4=\"srv0\"\n");
    DhcpServerManager manager;
    writeTestFile(paths::serverDefaults(), "INTERFACESv4=\"srv1\"\n");
    manager.updateInterfaces();
    QCOMPARE(manager.interfaces(), expected);
}

void ServedInterfacesTest::reportsUnreadableFile_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("reason");
    const QString missing{QStringLiteral("No such file or directory")};
    QTest::addRow("missing") << QStringLiteral("/etc/default/absent") << missing;
    QTest::addRow("missing folder") << QStringLiteral("/absent/isc-dhcp-server") << missing;
    QTest::addRow("directory") << QStringLiteral("/etc/default") << QStringLiteral("Is a directory");
}

void ServedInterfacesTest::reportsUnreadableFile()
{
    QFETCH(const QString, path);
    QFETCH(const QString, reason);
    const Choice expected{machineInterfacesAnd({QStringLiteral("srv0")})};
    const TemporaryRoot root;
    writeTestFile(paths::serverDefaults(), "INTERFACESv4=\"srv0\"\n");
    DhcpServerManager manager;
    const QSignalSpy errors{&manager, &DhcpServerManager::error};
    QStringList reasons;
    recordReasons(manager, reasons);
    manager.readInterfacesFile(root.path(path));
    QCOMPARE(errorsOf(errors), QStringList{couldNotRead(root.path(path))});
    QCOMPARE(reasons, QStringList{reason});
    manager.runServer(); // refused, which has no reason of the system's
    QCOMPARE(reasons.size(), 2);
    QCOMPARE(reasons.constLast(), QString{});
    QCOMPARE(manager.interfaces(), expected);
}

void ServedInterfacesTest::writesChoice_data()
{
    QTest::addColumn<QByteArray>("before");
    QTest::addColumn<Choice>("choice");
    QTest::addColumn<QByteArray>("after");
    const auto row = [](const char *name, const QByteArray &before, const Choice &choice, const QByteArray &after) {
        QTest::addRow("%s", name) << before << choice << after;
    };
    const QString a{QStringLiteral("srv0")};
    const QString b{QStringLiteral("srv1")};
    const QString c{QStringLiteral("srv2")};
    const QByteArray plain{"INTERFACESv4=\"x\"\n"};
    row("all", plain, {{a, true}, {b, true}}, "INTERFACESv4=\"srv0 srv1\"\n");
    row("none", plain, {{a, false}, {b, false}}, "INTERFACESv4=\"\"\n");
    row("last of the map", plain, {{a, false}, {b, true}}, "INTERFACESv4=\"srv1\"\n");
    row("not the last of the map", plain, {{a, true}, {b, false}}, "INTERFACESv4=\"srv0 \"\n");
    row("in the middle", plain, {{a, false}, {b, true}, {c, false}}, "INTERFACESv4=\"srv1 \"\n");
    row("first and last", plain, {{a, true}, {b, false}, {c, true}}, "INTERFACESv4=\"srv0 srv2\"\n");
    row("only one", plain, {{a, true}}, "INTERFACESv4=\"srv0\"\n");
    row("in order of names", plain, {{c, true}, {QStringLiteral("Srv"), true}, {a, true}},
        "INTERFACESv4=\"Srv srv0 srv2\"\n");
    row("empty name", plain, {{QString{}, true}, {a, true}}, "INTERFACESv4=\" srv0\"\n");
    row("other lines stay", "# first\n\n  INTERFACESv6=\"x\"\t\n" + plain + "DHCPDv4_CONF=/etc/x #\n", {{a, true}},
        "# first\n\n  INTERFACESv6=\"x\"\t\nINTERFACESv4=\"srv0\"\nDHCPDv4_CONF=/etc/x #\n");
    row("commented line becomes active", "#INTERFACESv4=\"eth9\"\n", {{a, true}}, "INTERFACESv4=\"srv0\"\n");
    row("every line with the key", "#INTERFACESv4=\"eth9\"\nX=1\nINTERFACESv4=\"x\" # y\n", {{a, true}},
        "INTERFACESv4=\"srv0\"\nX=1\nINTERFACESv4=\"srv0\"\n");
    row("unquoted line is lost", "X=1\nINTERFACESv4=eth9\nY=2\n", {{a, true}}, "X=1\nY=2\n");
    row("remark is lost", "# INTERFACESv4 below\nINTERFACESv4=\"\"\n", {{a, true}}, "INTERFACESv4=\"srv0\"\n");
    row("no key", "X=1\n", {{a, true}}, "X=1\n");
    row("empty file", "", {{a, true}}, "");
    row("empty lines at the end", "INTERFACESv4=\"\"\n\n\n", {{a, true}}, "INTERFACESv4=\"srv0\"\n\n\n");
    row("no terminator at the end", "INTERFACESv4=\"\"\nX=1", {{a, true}}, "INTERFACESv4=\"srv0\"\nX=1");
    row("no terminator of the line with the key", "X=1\nINTERFACESv4=\"\"", {{a, true}}, "X=1\nINTERFACESv4=\"srv0\"");
    row("CR LF stays", "X=1\r\nINTERFACESv4=\"\"\r\n\r\n", {{a, true}}, "X=1\r\nINTERFACESv4=\"srv0\"\r\n\r\n");
    row("each line keeps its terminator", "X=1\r\nINTERFACESv4=\"\"\nY=2\r\n#INTERFACESv4=\"\"\r\nZ=3\n", {{a, true}},
        "X=1\r\nINTERFACESv4=\"srv0\"\nY=2\r\nINTERFACESv4=\"srv0\"\r\nZ=3\n");
    row("CR inside a line stays", "# a\rb\r\r\nINTERFACESv4=\"\"\n", {{a, true}},
        "# a\rb\r\r\nINTERFACESv4=\"srv0\"\n");
    row("lost line before the end", "X=1\r\nINTERFACESv4=eth9", {{a, true}}, "X=1\r\n");
    row("UTF-8 stays", "# B\xc3\xbcro\nINTERFACESv4=\"\"\n", {{QStringLiteral("b\u00fcro"), true}},
        "# B\xc3\xbcro\nINTERFACESv4=\"b\xc3\xbcro\"\n");
    row("Latin-1 stays", "# B\xfcro\nINTERFACESv4=\"\"\n", {{a, true}}, "# B\xfcro\nINTERFACESv4=\"srv0\"\n");
}

void ServedInterfacesTest::writesChoice()
{
    QFETCH(const QByteArray, before);
    QFETCH(const Choice, choice);
    QFETCH(const QByteArray, after);
    const TemporaryRoot root;
    writeTestFile(paths::serverDefaults(), before);
    DhcpServerManager manager;
    const QSignalSpy errors{&manager, &DhcpServerManager::error};
    manager.setInterfaces(choice);
    QCOMPARE(readTestFile(paths::serverDefaults()), after);
    QCOMPARE(manager.interfaces(), choice);
    const bool isStored{after.contains("INTERFACESv4")};
    QCOMPARE(errorsOf(errors), isStored ? QStringList{} : QStringList{notStored(paths::serverDefaults())});
    QCOMPARE(manager.errorReason(), QString{});
}

void ServedInterfacesTest::keepsWhatOthersChangeMeanwhile_data()
{
    QTest::addColumn<QByteArray>("meanwhile");
    QTest::addColumn<QByteArray>("after");
    const auto row = [](const char *name, const QByteArray &meanwhile, const QByteArray &after) {
        QTest::addRow("%s", name) << meanwhile << after;
    };
    row("line added", "X=1\nINTERFACESv4=\"srv0\"\nADDED=1\n", "X=1\nINTERFACESv4=\"srv1\"\nADDED=1\n");
    row("line removed", "INTERFACESv4=\"srv0\"\n", "INTERFACESv4=\"srv1\"\n");
    row("another choice", "X=1\nINTERFACESv4=\"srv2\"\n", "X=1\nINTERFACESv4=\"srv1\"\n");
    row("line of the key moved", "INTERFACESv4=\"srv0\"\r\nX=1\n", "INTERFACESv4=\"srv1\"\r\nX=1\n");
    row("another encoding", "X=\xfc\nINTERFACESv4=\"srv0\"\n", "X=\xfc\nINTERFACESv4=\"srv1\"\n");
    row("line of the key removed", "X=1\nADDED=1\n", "X=1\nADDED=1\n");
}

void ServedInterfacesTest::keepsWhatOthersChangeMeanwhile()
{
    QFETCH(const QByteArray, meanwhile);
    QFETCH(const QByteArray, after);
    const TemporaryRoot root;
    writeTestFile(paths::serverDefaults(), "X=1\nINTERFACESv4=\"srv0\"\n");
    DhcpServerManager manager;
    const QSignalSpy errors{&manager, &DhcpServerManager::error};
    writeTestFile(paths::serverDefaults(), meanwhile);
    const Choice choice{{QStringLiteral("srv0"), false}, {QStringLiteral("srv1"), true}};
    manager.setInterfaces(choice);
    QCOMPARE(readTestFile(paths::serverDefaults()), after);
    QCOMPARE(manager.interfaces(), choice);
    QCOMPARE(errors.size(), after.contains("INTERFACESv4") ? 0 : 1);
}

void ServedInterfacesTest::makesFileAgainThatWasRemovedMeanwhile()
{
    const TemporaryRoot root;
    writeTestFile(paths::serverDefaults(), "X=1\nINTERFACESv4=\"srv0\"\n");
    DhcpServerManager manager;
    const QSignalSpy errors{&manager, &DhcpServerManager::error};
    QVERIFY(QFile::remove(paths::serverDefaults()));
    manager.setInterfaces({{QStringLiteral("srv1"), true}});
    QCOMPARE(readTestFile(paths::serverDefaults()), QByteArray{"X=1\nINTERFACESv4=\"srv1\"\n"});
    QCOMPARE(errorsOf(errors), QStringList{});
}

void ServedInterfacesTest::writesLinesThatItRead_data()
{
    QTest::addColumn<QByteArray>("content");
    QTest::addRow("ASCII") << QByteArray{"# x\n\n\tX=\"y z\"  \n"};
    QTest::addRow("UTF-8") << QByteArray{"# B\xc3\xbcro \xe2\x82\xac \xf0\x9f\x96\xa7\n"};
    QTest::addRow("Latin-1") << QByteArray{"# B\xfcro \x80\xff\n"};
    QTest::addRow("null byte") << QByteArray{"# a\0b\n", 6};
    QTest::addRow("long line") << QByteArray{200'000, 'x'} + '\n';
    QTest::addRow("many lines") << QByteArray{"line\n"}.repeated(20'000);
    QTest::addRow("CR LF") << QByteArray{"# x\r\n\r\n"};
    QTest::addRow("CR only") << QByteArray{"\r\r# x\r\n"};
}

void ServedInterfacesTest::writesLinesThatItRead()
{
    QFETCH(const QByteArray, content);
    const TemporaryRoot root;
    writeTestFile(paths::serverDefaults(), content + "INTERFACESv4=\"x\"\n" + content);
    DhcpServerManager manager;
    manager.setInterfaces({{QStringLiteral("srv0"), true}});
    QCOMPARE(readTestFile(paths::serverDefaults()), content + "INTERFACESv4=\"srv0\"\n" + content);
}

void ServedInterfacesTest::writesToAnotherPath()
{
    const TemporaryRoot root;
    const QByteArray before{"X=1\nINTERFACESv4=\"srv0\"\n"};
    writeTestFile(paths::serverDefaults(), before);
    DhcpServerManager manager;
    manager.setInterfaces({{QStringLiteral("srv0"), true}});
    const QString other{root.path(QStringLiteral("/etc/default/other"))};
    manager.writeDHCPServerConfig(other);
    QCOMPARE(readTestFile(other), before);
    manager.writeDHCPServerConfig();
    QCOMPARE(readTestFile(paths::serverDefaults()), before);
}

void ServedInterfacesTest::ignoresEmptyChoice()
{
    const TemporaryRoot root;
    const QByteArray content{"INTERFACESv4=\"srv0  \"\n"};
    writeTestFile(paths::serverDefaults(), content);
    DhcpServerManager manager;
    const Choice before{manager.interfaces()};
    const QSignalSpy changes{&manager, &DhcpServerManager::interfacesChanged};
    manager.setInterfaces({});
    QCOMPARE(manager.interfaces(), before);
    QCOMPARE(changes.size(), 0);
    QCOMPARE(readTestFile(paths::serverDefaults()), content);
}

void ServedInterfacesTest::ignoresEqualChoice()
{
    const TemporaryRoot root;
    writeTestFile(paths::serverDefaults(), "INTERFACESv4=\"srv0 srv1\"\n");
    DhcpServerManager manager;
    const QSignalSpy changes{&manager, &DhcpServerManager::interfacesChanged};
    const QByteArray meanwhile{"# somebody else's\n"};
    writeTestFile(paths::serverDefaults(), meanwhile);
    manager.setInterfaces(Choice{manager.interfaces()});
    QCOMPARE(changes.size(), 0);
    QCOMPARE(readTestFile(paths::serverDefaults()), meanwhile);
}

void ServedInterfacesTest::announcesChangedChoice()
{
    const TemporaryRoot root;
    writeTestFile(paths::serverDefaults(), "INTERFACESv4=\"srv0\"\n");
    DhcpServerManager manager;
    Choice choice{manager.interfaces()};
    choice.insert(QStringLiteral("srv0"), false);
    const QSignalSpy changes{&manager, &DhcpServerManager::interfacesChanged};
    manager.setInterfaces(choice);
    QCOMPARE(changes.size(), 1);
    QCOMPARE(changes.constFirst(), QList<QVariant>{paths::serverDefaults()});
    QCOMPARE(manager.interfaces(), choice);
    QCOMPARE(readTestFile(paths::serverDefaults()), QByteArray{"INTERFACESv4=\"\"\n"});
}

void ServedInterfacesTest::createsMissingFileWithoutTheChoice()
{
    const TemporaryRoot root;
    DhcpServerManager manager;
    const QSignalSpy errors{&manager, &DhcpServerManager::error};
    const Choice choice{{QStringLiteral("srv0"), true}};
    manager.setInterfaces(choice);
    QCOMPARE(errorsOf(errors), QStringList{notStored(paths::serverDefaults())});
    QCOMPARE(readTestFile(paths::serverDefaults()), QByteArray{});
    QCOMPARE(manager.interfaces(), choice);
}

void ServedInterfacesTest::neverOverwritesFileThatItCouldNotRead()
{
    const TemporaryRoot root;
    const QByteArray content{"INTERFACESv4=\"srv0\"\n"};
    const QString path{paths::serverDefaults()};
    writeTestFile(path, content);
    QVERIFY(QFile::setPermissions(path, {}));
    QVERIFY(QFile::setPermissions(root.path({}), everyoneMayEnter | QFile::WriteOwner));
    QVERIFY(QFile::setPermissions(defaultsFolder(), everyoneMayChange));
    {
        const WithoutPrivileges withoutPrivileges;
        DhcpServerManager manager;
        const Choice before{manager.interfaces()};
        const QSignalSpy errors{&manager, &DhcpServerManager::error};
        QStringList reasons;
        recordReasons(manager, reasons);
        manager.setInterfaces({{QStringLiteral("srv1"), true}});
        QCOMPARE(errorsOf(errors), (QStringList{couldNotRead(path), couldNotWrite(path)}));
        const QString reason{QStringLiteral("Permission denied")};
        QCOMPARE(reasons, (QStringList{reason, reason}));
        QCOMPARE(manager.interfaces(), before);
    }
    QVERIFY(QFile::setPermissions(path, everyoneMayRead));
    QCOMPARE(readTestFile(path), content);
}

void ServedInterfacesTest::neverOverwritesFileThatAppearedUnread()
{
    const Choice expected{machineInterfacesAnd({QStringLiteral("srv0")})};
    const TemporaryRoot root;
    DhcpServerManager manager;
    const QSignalSpy errors{&manager, &DhcpServerManager::error};
    const QByteArray content{"# just installed\nINTERFACESv4=\"srv0\"\n"};
    writeTestFile(paths::serverDefaults(), content);
    manager.setInterfaces({{QStringLiteral("srv1"), true}});
    QCOMPARE(errorsOf(errors), QStringList{couldNotWrite(paths::serverDefaults())});
    QCOMPARE(readTestFile(paths::serverDefaults()), content);

    // The failure read the file again, so the next choice can be written.
    QCOMPARE(manager.interfaces(), expected);
    manager.setInterfaces({{QStringLiteral("srv1"), true}});
    QCOMPARE(readTestFile(paths::serverDefaults()), QByteArray{"# just installed\nINTERFACESv4=\"srv1\"\n"});
}

void ServedInterfacesTest::givesChoiceUpWhenWriteFails()
{
    const TemporaryRoot root;
    const QByteArray content{"X=1\nINTERFACESv4=\"srv0\"\n"};
    const QString path{paths::serverDefaults()};
    writeTestFile(path, content);
    DhcpServerManager manager;
    const Choice before{manager.interfaces()};
    QVERIFY(QFile::setPermissions(path, everyoneMayRead));
    QVERIFY(QFile::setPermissions(root.path({}), everyoneMayEnter | QFile::WriteOwner));
    QVERIFY(QFile::setPermissions(defaultsFolder(), everyoneMayEnter));
    {
        const WithoutPrivileges withoutPrivileges;
        QStringList errors;
        QStringList reasons;
        recordReasons(manager, reasons);
        Choice whenReported;
        connect(&manager, &DhcpServerManager::error, &manager, [&](const QString &message) {
            errors.append(message);
            whenReported = manager.interfaces();
        });
        manager.setInterfaces({{QStringLiteral("srv1"), true}});
        QCOMPARE(errors, QStringList{couldNotWrite(path)});
        QCOMPARE(whenReported, before);
        QCOMPARE(reasons, QStringList{QStringLiteral("Permission denied")});
    }
    QCOMPARE(readTestFile(path), content);
    QCOMPARE(QDir{defaultsFolder()}.entryList(QDir::Files), QStringList{QFileInfo{path}.fileName()});

    QVERIFY(QFile::setPermissions(defaultsFolder(), everyoneMayChange));
    QVERIFY(QFile::setPermissions(path, everyoneMayRead | QFile::WriteOwner));
    manager.setInterfaces({{QStringLiteral("srv1"), true}});
    QCOMPARE(readTestFile(path), QByteArray{"X=1\nINTERFACESv4=\"srv1\"\n"});
}

void ServedInterfacesTest::doesNotWriteOverDirectory()
{
    const TemporaryRoot root;
    writeTestFile(paths::serverDefaults(), "INTERFACESv4=\"srv0\"\n");
    DhcpServerManager manager;
    const QSignalSpy errors{&manager, &DhcpServerManager::error};
    manager.writeDHCPServerConfig(defaultsFolder());
    QCOMPARE(errorsOf(errors), QStringList{couldNotWrite(defaultsFolder())});
    QCOMPARE(manager.errorReason(), QStringLiteral("Is a directory"));
    QVERIFY(QFileInfo{defaultsFolder()}.isDir());
}

QTEST_GUILESS_MAIN(ServedInterfacesTest)
#include "tst_servedinterfaces.moc"
