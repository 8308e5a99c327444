// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/backups.h"
#include "common/fileio.h"
#include "common/paths.h"
#include "common/posix.h"
#include "tests/support/temporaryroot.h"

#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QRegularExpression>
#include <QTest>

#include <memory>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

constexpr int newestKept{20};

QString folder() { return QDir::cleanPath(paths::backupDirectory()); }

// The names of the kept versions, oldest first.
QStringList versions() { return QDir{folder()}.entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot); }

QVector<QByteArray> contents()
{
    QVector<QByteArray> all;
    for (const QString &version : versions())
        all.append(readTestFile(folder() + QLatin1Char{'/'} + version));
    return all;
}

uint modeOf(const QString &path)
{
    FileStatus status{};
    lstat(QFile::encodeName(path).constData(), &status);
    return status.st_mode & 07777U;
}

QByteArray numbered(int number) { return "version " + QByteArray::number(number) + '\n'; }

} // namespace

class BackupsTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup() { m_root.reset(); }

    void keepsWhatASaveReplaces();
    void keepsNothingForANewFile();
    void isReadableByTheOwnerOnly();
    void isNamedAfterThePathAndTheTime();
    void keepsTheFirstAndTheNewestTwenty();
    void keepsTheSameContentOnce();
    void keepsFilesOfDifferentPathsApart_data();
    void keepsFilesOfDifferentPathsApart();
    void takesALinkForItsTarget();
    void keepsOrderAfterTheClockWasSetBack();
    void keepsEveryVersionBesideNamesWithoutATime_data();
    void keepsEveryVersionBesideNamesWithoutATime();
    void givesUpOnlyWhatIsThere();
    void keepsFilesWithLongPaths();
    void cleansWhatAKilledSaveLeft();
    void makesTheFoldersAbove();
    void savesWithoutAUsableFolder_data();
    void savesWithoutAUsableFolder();
    void keepsACopyOfWhatCannotBeWritten();
    void tellsWhenACopyCannotBeKept();

private:
    std::unique_ptr<TemporaryRoot> m_root;
};

void BackupsTest::init()
{
    m_root = std::make_unique<TemporaryRoot>();
    QDir{}.rmdir(folder());
}

void BackupsTest::keepsWhatASaveReplaces()
{
    writeTestFile(paths::configuration(), "# by hand\n");
    QVERIFY(fileio::replaceFile(paths::configuration(), "first\n"));
    QVERIFY(fileio::replaceFile(paths::configuration(), "second\n"));
    QCOMPARE(contents(), (QVector<QByteArray>{"# by hand\n", "first\n"}));
}

void BackupsTest::keepsNothingForANewFile()
{
    QVERIFY(fileio::replaceFile(paths::configuration(), "first\n"));
    QVERIFY(versions().isEmpty());
}

void BackupsTest::isReadableByTheOwnerOnly()
{
    writeTestFile(paths::configuration(), "secret\n");
    QVERIFY(QFile::setPermissions(paths::configuration(), QFile::ReadOwner | QFile::WriteOwner | QFile::ReadOther));
    const mode_t mask{umask(0)};
    const bool saved{fileio::replaceFile(paths::configuration(), "new\n")};
    umask(mask);
    QVERIFY(saved);
    QCOMPARE(modeOf(folder()), 0700U);
    QCOMPARE(versions().size(), 1);
    QCOMPARE(modeOf(folder() + QLatin1Char{'/'} + versions().first()), 0600U);
}

void BackupsTest::isNamedAfterThePathAndTheTime()
{
    const QDateTime before{QDateTime::currentDateTimeUtc()};
    const QString version{backups::keep(QStringLiteral("/etc/dhcp/dhcpd.conf"), "x")};
    const QDateTime after{QDateTime::currentDateTimeUtc()};

    const QRegularExpression pattern{QStringLiteral("/etc\\+dhcp\\+dhcpd\\.conf\\.(\\d{8}T\\d{6}\\.\\d{3})\\d{3}Z$")};
    const QRegularExpressionMatch match{pattern.match(version)};
    QVERIFY2(match.hasMatch(), qPrintable(version));
    QDateTime time{QDateTime::fromString(match.captured(1), QStringLiteral("yyyyMMdd'T'HHmmss.zzz"))};
    time.setTimeSpec(Qt::UTC);
    QVERIFY(before <= time && time <= after);
}

void BackupsTest::keepsTheFirstAndTheNewestTwenty()
{
    constexpr int saves{30};
    writeTestFile(paths::configuration(), numbered(0));
    for (int i{1}; i <= saves; ++i)
        QVERIFY(fileio::replaceFile(paths::configuration(), numbered(i)));

    QVector<QByteArray> expected{numbered(0)};
    for (int i{saves - newestKept}; i < saves; ++i)
        expected.append(numbered(i));
    QCOMPARE(contents(), expected);
}

void BackupsTest::keepsTheSameContentOnce()
{
    writeTestFile(paths::configuration(), "old\n");
    // A save that fails again and again must not drive older versions out.
    for (int i{}; i < 3; ++i)
        QVERIFY(!backups::keep(paths::configuration(), "old\n").isEmpty());
    QVERIFY(fileio::replaceFile(paths::configuration(), "new\n"));
    QVERIFY(fileio::replaceFile(paths::configuration(), "old\n"));
    QVERIFY(fileio::replaceFile(paths::configuration(), "new\n"));
    QCOMPARE(contents(), (QVector<QByteArray>{"old\n", "new\n", "old\n"}));
}

void BackupsTest::keepsFilesOfDifferentPathsApart_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("other");
    QTest::addRow("names") << QStringLiteral("/etc/dhcp/dhcpd.conf") << QStringLiteral("/etc/default/isc-dhcp-server");
    QTest::addRow("directories") << QStringLiteral("/etc/dhcp/dhcpd.conf") << QStringLiteral("/srv/dhcp/dhcpd.conf");
    QTest::addRow("separators") << QStringLiteral("/etc/dhcp/a/b") << QStringLiteral("/etc/dhcp/a+b");
    QTest::addRow("escapes") << QStringLiteral("/etc/dhcp/a+b") << QStringLiteral("/etc/dhcp/a%2Bb");
    QTest::addRow("a name that begins the other")
        << QStringLiteral("/etc/dhcpd.conf") << QStringLiteral("/etc/dhcpd.conf.20250101T000000.000000Z");
}

void BackupsTest::keepsFilesOfDifferentPathsApart()
{
    QFETCH(QString, path);
    QFETCH(QString, other);
    constexpr int count{newestKept + 5};
    for (int i{}; i < count; ++i) {
        QVERIFY(!backups::keep(path, numbered(i)).isEmpty());
        QVERIFY(!backups::keep(other, numbered(i)).isEmpty());
    }
    QCOMPARE(versions().size(), 2 * (newestKept + 1));
}

void BackupsTest::takesALinkForItsTarget()
{
    const QString real{m_root->path(QStringLiteral("/etc/real"))};
    writeTestFile(real, "one\n");
    QVERIFY(QFile::link(real, paths::configuration()));
    QVERIFY(fileio::replaceFile(paths::configuration(), "two\n"));
    QVERIFY(fileio::replaceFile(real, "three\n"));
    QVERIFY(!fileio::keepCopy(paths::configuration(), "four\n").isEmpty());
    QCOMPARE(contents(), (QVector<QByteArray>{"one\n", "two\n", "four\n"}));
    for (const QString &version : versions())
        QVERIFY(version.contains(QLatin1String{"+etc+real."}));
}

void BackupsTest::keepsOrderAfterTheClockWasSetBack()
{
    const QString first{backups::keep(QStringLiteral("/f"), numbered(0))};
    QVERIFY(QFile::rename(first, folder() + QStringLiteral("/f.20991231T235959.999999Z")));
    for (int i{1}; i <= 3; ++i)
        QVERIFY(!backups::keep(QStringLiteral("/f"), numbered(i)).isEmpty());
    QCOMPARE(contents(), (QVector<QByteArray>{numbered(0), numbered(1), numbered(2), numbered(3)}));
    QCOMPARE(versions().last(), QStringLiteral("f.21000101T000000.000002Z"));
}

void BackupsTest::keepsEveryVersionBesideNamesWithoutATime_data()
{
    QTest::addColumn<QString>("name");
    QTest::addRow("no such month") << QStringLiteral("f.20259921T014800.123456Z");
    QTest::addRow("digits only") << QStringLiteral("f.99999999T999999.999999Z");
    QTest::addRow("no digits") << QStringLiteral("f.zzzzzzzzTzzzzzz.zzzzzzZ");
    QTest::addRow("no microseconds") << QStringLiteral("f.20251121T014800.123xyzZ");
    QTest::addRow("the last time there is") << QStringLiteral("f.99991231T235959.999999Z");
}

void BackupsTest::keepsEveryVersionBesideNamesWithoutATime()
{
    QFETCH(const QString, name);
    QVERIFY(!backups::keep(QStringLiteral("/f"), numbered(0)).isEmpty());
    writeTestFile(folder() + QLatin1Char{'/'} + name, "not ours\n");
    constexpr int count{newestKept + 5};
    for (int i{1}; i <= count; ++i)
        QVERIFY(!backups::keep(QStringLiteral("/f"), numbered(i)).isEmpty());

    QCOMPARE(readTestFile(folder() + QLatin1Char{'/'} + name), QByteArray{"not ours\n"});
    QVector<QByteArray> expected{numbered(0)};
    for (int i{count - newestKept + 1}; i <= count; ++i)
        expected.append(numbered(i));
    QVector<QByteArray> kept{contents()};
    QVERIFY(kept.removeOne("not ours\n"));
    QCOMPARE(kept, expected);
}

void BackupsTest::givesUpOnlyWhatIsThere()
{
    bool isNew{false};
    const QString version{backups::keep(QStringLiteral("/f"), "one\n", &isNew)};
    QVERIFY(isNew);
    backups::keep(QStringLiteral("/f"), "one\n", &isNew);
    QVERIFY(!isNew);
    QVERIFY(backups::giveUp(version));
    QVERIFY(!backups::giveUp(version));
    QVERIFY(versions().isEmpty());
}

void BackupsTest::keepsFilesWithLongPaths()
{
    const QString path{QString{QStringLiteral("/long")}.repeated(200)};
    QVERIFY(!backups::keep(path + QLatin1Char{'a'}, "a").isEmpty());
    QVERIFY(!backups::keep(path + QLatin1Char{'b'}, "b").isEmpty());
    QVERIFY(!backups::keep(path + QLatin1Char{'a'}, "a").isEmpty());
    QCOMPARE(versions().size(), 2);
}

void BackupsTest::cleansWhatAKilledSaveLeft()
{
    QVERIFY(!backups::keep(QStringLiteral("/f"), "one\n").isEmpty());
    writeTestFile(folder() + QStringLiteral("/.f.orv-a1b2c3"), "half a vers");
    QVERIFY(!backups::keep(QStringLiteral("/f"), "two\n").isEmpty());
    QCOMPARE(contents(), (QVector<QByteArray>{"one\n", "two\n"}));
}

void BackupsTest::makesTheFoldersAbove()
{
    QVERIFY(QDir{m_root->path(QStringLiteral("/var"))}.removeRecursively());
    QVERIFY(!backups::keep(QStringLiteral("/f"), "one\n").isEmpty());
    QCOMPARE(modeOf(folder()), 0700U);
}

void BackupsTest::savesWithoutAUsableFolder_data()
{
    QTest::addColumn<QString>("trap");
    QTest::addRow("a file in its place") << QStringLiteral("file");
    QTest::addRow("a link to a folder of ours") << QStringLiteral("link");
    QTest::addRow("writable by the group") << QStringLiteral("group");
    QTest::addRow("writable by everyone") << QStringLiteral("everyone");
    QTest::addRow("of another user") << QStringLiteral("owner");
}

void BackupsTest::savesWithoutAUsableFolder()
{
    QFETCH(QString, trap);
    const QString elsewhere{m_root->path(QStringLiteral("/elsewhere"))};
    const QByteArray name{QFile::encodeName(folder())};
    QVERIFY(QDir{}.mkdir(elsewhere));
    writeTestFile(paths::configuration(), "old\n");
    if (trap == QLatin1String{"file"})
        writeTestFile(folder(), "x");
    else if (trap == QLatin1String{"link"})
        QVERIFY(QFile::link(elsewhere, folder()));
    else
        QVERIFY(QDir{}.mkdir(folder()));
    if (trap == QLatin1String{"group"})
        QCOMPARE(chmod(name.constData(), 0770), 0);
    if (trap == QLatin1String{"everyone"})
        QCOMPARE(chmod(name.constData(), 01777), 0);
    if (trap == QLatin1String{"owner"}) {
        if (geteuid() != 0)
            QSKIP("only the superuser gives files away");
        QCOMPARE(chown(name.constData(), 65534, 65534), 0);
    }

    QVERIFY(backups::keep(paths::configuration(), "old\n").isEmpty());
    QVERIFY(fileio::replaceFile(paths::configuration(), "new\n"));

    QCOMPARE(readTestFile(paths::configuration()), QByteArray{"new\n"});
    QVERIFY(QDir{elsewhere}.isEmpty());
    QVERIFY(versions().isEmpty());
}

void BackupsTest::keepsACopyOfWhatCannotBeWritten()
{
    writeTestFile(paths::configuration(), "old\n");
    const QString copy{fileio::keepCopy(paths::configuration(), "not written\n")};
    QCOMPARE(readTestFile(copy), QByteArray{"not written\n"});
    QCOMPARE(modeOf(copy), 0600U);
    QCOMPARE(readTestFile(paths::configuration()), QByteArray{"old\n"});

    const QString other{fileio::keepCopy(m_root->path(QStringLiteral("/missing/directory/dhcpd.conf")), "x")};
    QVERIFY2(other.contains(QLatin1String{"+missing+directory+dhcpd.conf."}), qPrintable(other));
}

void BackupsTest::tellsWhenACopyCannotBeKept()
{
    writeTestFile(folder(), "not a folder");
    QVERIFY(fileio::keepCopy(paths::configuration(), "x").isEmpty());
}

QTEST_GUILESS_MAIN(BackupsTest)
#include "tst_backups.moc"
