// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/runtimedirectory.h"

#include <QDir>
#include <QFile>
#include <QScopeGuard>
#include <QTemporaryDir>
#include <QTest>

#include <memory>

#include <sys/stat.h>
#include <unistd.h>

namespace {

constexpr uid_t otherUser{65534};

} // namespace

class RuntimeDirectoryTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void sessionsDirectoryIsUsedWhenPrivate();
    void superusersFolderIsTheSameWithoutASession();
    void othersAreNot_data();
    void othersAreNot();
    void folderOfAnotherUserIsNotPrivate();
    void ownFolderIsMadePrivate_data();
    void ownFolderIsMadePrivate();
    void ownFolderIsOpenedToItsUser_data();
    void ownFolderIsOpenedToItsUser();
    void ownFolderMustBePrivate_data();
    void ownFolderMustBePrivate();
    void ownFolderIsNeverBelowTmp();

private:
    QString folder(const QString &name, mode_t mode) const;
    // The machine may have one for this user, which then comes before the program's own, but not for the superuser.
    QString expectedFallback() const { return geteuid() != 0 && isPrivateDirectory(m_ofUser) ? m_ofUser : own(); }
    QString own() const { return m_folder->filePath(QStringLiteral("made/own")); }

    const QString m_ofUser{QStringLiteral("/run/user/") + QString::number(geteuid())};
    std::unique_ptr<QTemporaryDir> m_folder;
};

void RuntimeDirectoryTest::init()
{
    m_folder = std::make_unique<QTemporaryDir>();
    QVERIFY(m_folder->isValid());
}

void RuntimeDirectoryTest::cleanup()
{
    qunsetenv("XDG_RUNTIME_DIR");
    m_folder.reset();
}

QString RuntimeDirectoryTest::folder(const QString &name, mode_t mode) const
{
    QString path{m_folder->filePath(name)};
    QDir{}.mkpath(path);
    chmod(QFile::encodeName(path).constData(), mode);
    return path;
}

void RuntimeDirectoryTest::sessionsDirectoryIsUsedWhenPrivate()
{
    if (geteuid() == 0)
        QCOMPARE(seteuid(otherUser), 0);
    const auto become = qScopeGuard([] { QCOMPARE(seteuid(getuid()), 0); });
    const QTemporaryDir here;
    const QString session{here.filePath(QStringLiteral("session"))};
    QCOMPARE(mkdir(QFile::encodeName(session).constData(), 0700), 0);
    qputenv("XDG_RUNTIME_DIR", QFile::encodeName(session));
    QCOMPARE(runtimeDirectory(own()), session);
    QVERIFY(!QFile::exists(own()));
}

void RuntimeDirectoryTest::superusersFolderIsTheSameWithoutASession()
{
    if (geteuid() != 0)
        QSKIP("only the superuser has one");
    QCOMPARE(runtimeDirectory(own()), own());
    for (const QString &name : {QStringLiteral("session"), QStringLiteral("other")}) {
        qputenv("XDG_RUNTIME_DIR", QFile::encodeName(folder(name, 0700)));
        QCOMPARE(runtimeDirectory(own()), own());
    }
}

void RuntimeDirectoryTest::othersAreNot_data()
{
    QTest::addColumn<QString>("session"); // {} stands for the test's folder
    QTest::addRow("unset") << QString{};
    QTest::addRow("relative") << QStringLiteral("relative");
    QTest::addRow("missing") << QStringLiteral("{}/missing");
    QTest::addRow("a file") << QStringLiteral("{}/file");
    QTest::addRow("open to everybody") << QStringLiteral("{}/open");
    QTest::addRow("open to the group") << QStringLiteral("{}/group");
    QTest::addRow("readable by others") << QStringLiteral("{}/readable");
    QTest::addRow("symbolic link") << QStringLiteral("{}/link");
    QTest::addRow("symbolic link and slash") << QStringLiteral("{}/link/");
}

void RuntimeDirectoryTest::othersAreNot()
{
    QFETCH(QString, session);
    const QString here{QDir::currentPath()};
    QVERIFY(QDir::setCurrent(m_folder->path()));
    folder(QStringLiteral("relative"), 0700);
    folder(QStringLiteral("open"), 0777);
    folder(QStringLiteral("group"), 0770);
    folder(QStringLiteral("readable"), 0705);
    QVERIFY(QFile::link(folder(QStringLiteral("session"), 0700), m_folder->filePath(QStringLiteral("link"))));
    QFile file{m_folder->filePath(QStringLiteral("file"))};
    QVERIFY(file.open(QIODevice::WriteOnly));
    QVERIFY(file.setPermissions(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));

    if (!session.isEmpty())
        qputenv("XDG_RUNTIME_DIR", QFile::encodeName(session.replace(QStringLiteral("{}"), m_folder->path())));
    QCOMPARE(runtimeDirectory(own()), expectedFallback());
    QVERIFY(QDir::setCurrent(here));
}

void RuntimeDirectoryTest::folderOfAnotherUserIsNotPrivate()
{
    if (geteuid() != 0)
        QSKIP("only the superuser can give a folder away");
    const QString session{folder(QStringLiteral("session"), 0700)};
    QVERIFY(isPrivateDirectory(session));
    QCOMPARE(chown(QFile::encodeName(session).constData(), otherUser, otherUser), 0);
    QVERIFY(!isPrivateDirectory(session));
    qputenv("XDG_RUNTIME_DIR", QFile::encodeName(session));
    QCOMPARE(runtimeDirectory(own()), expectedFallback());
}

void RuntimeDirectoryTest::ownFolderIsMadePrivate_data()
{
    QTest::addColumn<uint>("mask");
    for (const uint mask : {0U, 022U, 077U, 0277U, 0777U})
        QTest::addRow("umask %04o", mask) << mask;
}

void RuntimeDirectoryTest::ownFolderIsMadePrivate()
{
    QFETCH(const uint, mask);
    const mode_t before{umask(mask)};
    const bool isMade{makePrivateDirectory(own())};
    const mode_t after{umask(before)};
    QVERIFY(isMade);
    QCOMPARE(after, mode_t{mask});
    struct stat status
    {
    };
    QCOMPARE(lstat(QFile::encodeName(own()).constData(), &status), 0);
    QCOMPARE(status.st_mode, mode_t{S_IFDIR | 0700});
    QVERIFY(makePrivateDirectory(own()));
}

void RuntimeDirectoryTest::ownFolderIsOpenedToItsUser_data()
{
    QTest::addColumn<uint>("mode");
    for (const uint mode : {0U, 0100U, 0400U, 0500U, 0600U})
        QTest::addRow("mode %04o", mode) << mode;
}

void RuntimeDirectoryTest::ownFolderIsOpenedToItsUser()
{
    QFETCH(const uint, mode);
    const QString closed{folder(QStringLiteral("closed"), mode)};
    QVERIFY(!isPrivateDirectory(closed));
    QVERIFY(makePrivateDirectory(closed));
    QVERIFY(isPrivateDirectory(closed));
}

void RuntimeDirectoryTest::ownFolderMustBePrivate_data()
{
    QTest::addColumn<QString>("name");
    QTest::addRow("open to everybody") << QStringLiteral("open");
    QTest::addRow("open to the group but not to its user") << QStringLiteral("group");
    QTest::addRow("another user's") << QStringLiteral("other");
    QTest::addRow("symbolic link") << QStringLiteral("link");
    QTest::addRow("symbolic link to nothing") << QStringLiteral("dangling");
    QTest::addRow("a file") << QStringLiteral("file");
    QTest::addRow("below a file") << QStringLiteral("file/below");
}

void RuntimeDirectoryTest::ownFolderMustBePrivate()
{
    QFETCH(const QString, name);
    folder(QStringLiteral("open"), 0777);
    folder(QStringLiteral("group"), 0570);
    if (name == QLatin1String{"other"} &&
        chown(QFile::encodeName(folder(name, 0500)).constData(), otherUser, otherUser) != 0)
        QSKIP("only the superuser can give a folder away");
    const QString target{folder(QStringLiteral("target"), 0500)};
    QVERIFY(QFile::link(target, m_folder->filePath(QStringLiteral("link"))));
    QVERIFY(QFile::link(m_folder->filePath(QStringLiteral("nothing")), m_folder->filePath(QStringLiteral("dangling"))));
    QFile file{m_folder->filePath(QStringLiteral("file"))};
    QVERIFY(file.open(QIODevice::WriteOnly));

    QVERIFY(!makePrivateDirectory(m_folder->filePath(name)));
    QVERIFY(!isPrivateDirectory(target));
    QVERIFY(!QFile::exists(m_folder->filePath(QStringLiteral("nothing"))));
    if (geteuid() == 0 || !isPrivateDirectory(m_ofUser))
        QCOMPARE(runtimeDirectory(m_folder->filePath(name)), QString{});
}

void RuntimeDirectoryTest::ownFolderIsNeverBelowTmp()
{
    const QString own{ownRuntimeDirectory()};
    QVERIFY(own.endsWith(QStringLiteral("/orv-admin-dhcp")));
    if (geteuid() == 0)
        QCOMPARE(own, QStringLiteral("/run/orv-admin-dhcp"));
    QVERIFY(!own.startsWith(QStringLiteral("/tmp/")));
}

QTEST_GUILESS_MAIN(RuntimeDirectoryTest)
#include "tst_runtimedirectory.moc"
