// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/packagemanager.h"

#include <QDir>
#include <QFile>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QTest>

#include <memory>

using OrvAdmin::PackageManager;

class PackageManagerTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void versionsOfInstalledPackages_data();
    void versionsOfInstalledPackages();
    void packageIsPassedAsOneWord();
    void noDatabaseIsEmpty_data();
    void noDatabaseIsEmpty();

private:
    void write(const QString &name, const QByteArray &content, bool executable = false) const;

    std::unique_ptr<QTemporaryDir> m_folder;
    QByteArray m_path{qgetenv("PATH")};
};

void PackageManagerTest::init()
{
    m_folder = std::make_unique<QTemporaryDir>();
    QVERIFY(m_folder->isValid());
}

void PackageManagerTest::cleanup()
{
    qputenv("PATH", m_path);
    qunsetenv("DPKG_ADMINDIR");
    m_folder.reset();
}

void PackageManagerTest::write(const QString &name, const QByteArray &content, bool executable) const
{
    QFile file{m_folder->filePath(name)};
    QVERIFY(file.open(QIODevice::WriteOnly));
    QCOMPARE(file.write(content), qint64{content.size()});
    if (executable)
        QVERIFY(file.setPermissions(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
}

void PackageManagerTest::versionsOfInstalledPackages_data()
{
    QTest::addColumn<QString>("package");
    QTest::addColumn<QStringList>("versions");
    QTest::addRow("installed") << QStringLiteral("bind9") << QStringList{QStringLiteral("1:9.18.28-1~deb12u2")};
    QTest::addRow("on hold") << QStringLiteral("held") << QStringList{QStringLiteral("2.0")};
    QTest::addRow("for two architectures")
        << QStringLiteral("libtwo") << QStringList{QStringLiteral("1.5-1"), QStringLiteral("1.5-1+b1")};
    QTest::addRow("removed, configuration left") << QStringLiteral("removed") << QStringList{};
    QTest::addRow("for one architecture, removed for another")
        << QStringLiteral("libmixed") << QStringList{QStringLiteral("3.0")};
    QTest::addRow("with triggers to run") << QStringLiteral("triggered") << QStringList{QStringLiteral("4.0")};
    QTest::addRow("waiting for triggers") << QStringLiteral("waiting") << QStringList{QStringLiteral("5.0")};
    QTest::addRow("half installed") << QStringLiteral("broken") << QStringList{};
    QTest::addRow("known by name only") << QStringLiteral("wanted") << QStringList{};
    QTest::addRow("unknown") << QStringLiteral("nonexistent") << QStringList{};
    QTest::addRow("beginning of a name") << QStringLiteral("bind") << QStringList{};
    QTest::addRow("no name") << QString{} << QStringList{};
    QTest::addRow("pattern") << QStringLiteral("bind*") << QStringList{};
    QTest::addRow("option") << QStringLiteral("--version") << QStringList{};
    QTest::addRow("shell") << QStringLiteral("bind9; echo installed 1") << QStringList{};
    QTest::addRow("line break") << QStringLiteral("bind9\n") << QStringList{};
}

void PackageManagerTest::versionsOfInstalledPackages()
{
    if (QStandardPaths::findExecutable(QStringLiteral("dpkg-query")).isEmpty())
        QSKIP("no dpkg-query on this machine");
    const auto entry = [](const char *name, const char *status, const char *architecture, const char *version,
                          const QByteArray &more = {}) {
        return QByteArrayLiteral("Package: ") + name + "\nStatus: " + status +
               "\nMaintainer: nobody <nobody@localhost>\nArchitecture: " + architecture +
               "\nMulti-Arch: same\nVersion: " + version + "\nDescription: of a test\n" +
               (QByteArray{status}.endsWith("config-files") ? QByteArrayLiteral("Config-Version: ") + version + "\n"
                                                            : QByteArray{}) +
               more + "\n";
    };
    write(QStringLiteral("arch"), "amd64\narm64\ni386\n");
    QVERIFY(QDir{m_folder->path()}.mkpath(QStringLiteral("updates")));
    QVERIFY(QDir{m_folder->path()}.mkpath(QStringLiteral("info")));
    write(QStringLiteral("status"),
          entry("bind9", "install ok installed", "amd64", "1:9.18.28-1~deb12u2") +
              entry("bind9-host", "install ok installed", "amd64", "9") +
              entry("held", "hold ok installed", "amd64", "2.0") +
              entry("libtwo", "install ok installed", "amd64", "1.5-1") +
              entry("libtwo", "install ok installed", "i386", "1.5-1+b1") +
              entry("removed", "deinstall ok config-files", "amd64", "1.0") +
              entry("libmixed", "install ok installed", "amd64", "3.0") +
              entry("libmixed", "deinstall ok config-files", "i386", "2.9") +
              entry("triggered", "install ok triggers-pending", "amd64", "4.0", "Triggers-Pending: ldconfig\n") +
              entry("waiting", "install ok triggers-awaited", "amd64", "5.0", "Triggers-Awaited: triggered\n") +
              entry("broken", "install reinstreq half-installed", "amd64", "1.0") +
              "Package: wanted\nStatus: install ok not-installed\nArchitecture: amd64\n\n");
    qputenv("DPKG_ADMINDIR", QFile::encodeName(m_folder->path()));

    QFETCH(const QString, package);
    QFETCH(const QStringList, versions);
    QStringList found{PackageManager::getInstalledPackagesVersions(package)};
    found.sort();
    QCOMPARE(found, versions);
}

void PackageManagerTest::packageIsPassedAsOneWord()
{
    write(QStringLiteral("dpkg-query"),
          "#!/bin/sh\nfor word; do :; done\n[ \"$word\" = lib.x-y+1 ] && echo installed 4.2\n", true);
    qputenv("PATH", QFile::encodeName(m_folder->path()));
    QCOMPARE(PackageManager::getInstalledPackagesVersions(QStringLiteral("lib.x-y+1")),
             QStringList{QStringLiteral("4.2")});
}

void PackageManagerTest::noDatabaseIsEmpty_data()
{
    QTest::addColumn<QByteArray>("program");
    QTest::addRow("missing") << QByteArray{};
    QTest::addRow("failing") << QByteArrayLiteral("#!/bin/sh\necho installed 1.0\nexit 2\n");
    QTest::addRow("crashing") << QByteArrayLiteral("#!/bin/sh\necho installed 1.0\nkill -SEGV $$\n");
    QTest::addRow("not a program") << QByteArrayLiteral("#!/nonexistent\n");
    QTest::addRow("hanging") << QByteArrayLiteral("#!/bin/sh\necho installed 1.0\nexec /bin/sleep 3600\n");
}

void PackageManagerTest::noDatabaseIsEmpty()
{
    QFETCH(const QByteArray, program);
    if (!program.isEmpty())
        write(QStringLiteral("dpkg-query"), program, true);
    qputenv("PATH", QFile::encodeName(m_folder->path()));
    QCOMPARE(PackageManager::getInstalledPackagesVersions(QStringLiteral("bind9")), QStringList{});
}

QTEST_GUILESS_MAIN(PackageManagerTest)
#include "tst_packagemanager.moc"
