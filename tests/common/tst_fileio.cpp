// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/fileio.h"

#include "common/paths.h"
#include "common/posix.h"
#include "common/textencoding.h"
#include "tests/common/childprocess.h"
#include "tests/support/temporaryroot.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QMap>
#include <QRegularExpression>
#include <QTest>
#include <QThread>

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <cstdio>
#include <cstring>
#include <memory>

#include <fcntl.h>
#include <grp.h>
#include <sys/file.h>
#include <sys/mount.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <sys/un.h>
#include <sys/wait.h>
#include <sys/xattr.h>
#include <unistd.h>

namespace {

constexpr uid_t nobody{65534};
constexpr gid_t serverGroup{12345};

const QByteArray aclName{"system.posix_acl_access"};
const QByteArray defaultAclName{"system.posix_acl_default"};

// An ACL as the kernel stores it: owner rw, user 4711 r, group r, mask r, others nothing.
QByteArray acl()
{
    struct Entry
    {
        quint16 tag, permissions;
        quint32 id;
    };
    constexpr quint32 nobodyNamed{0xFFFFFFFF};
    constexpr std::array<Entry, 5> entries{{{0x01, 6, nobodyNamed},
                                            {0x02, 4, 4711},
                                            {0x04, 4, nobodyNamed},
                                            {0x10, 4, nobodyNamed},
                                            {0x20, 0, nobodyNamed}}};
    const quint32 version{2};
    return QByteArray{reinterpret_cast<const char *>(&version), sizeof version} +
           QByteArray{reinterpret_cast<const char *>(entries.data()), sizeof entries};
}

QByteArray local(const QString &path) { return QFile::encodeName(path); }

bool setAttribute(const QString &path, const QByteArray &name, const QByteArray &value)
{
    return setxattr(local(path).constData(), name.constData(), value.constData(), static_cast<size_t>(value.size()),
                    0) == 0;
}

FileStatus statusOf(const QString &path)
{
    FileStatus status{};
    lstat(local(path).constData(), &status);
    return status;
}

// Owner, group, mode and extended attributes (the ACL is one) of the file, to compare.
QString attributesOf(const QString &path)
{
    const FileStatus status{statusOf(path)};
    QStringList parts{QStringLiteral("%1:%2 %3").arg(status.st_uid).arg(status.st_gid).arg(status.st_mode, 0, 8)};
    std::array<char, 4096> names{};
    std::array<char, 4096> value{};
    const ssize_t length{listxattr(local(path).constData(), names.data(), names.size())};
    for (const QByteArray &name : QByteArray{names.data(), static_cast<int>(qMax<ssize_t>(length, 0))}.split('\0')) {
        const ssize_t size{getxattr(local(path).constData(), name.constData(), value.data(), value.size())};
        if (size >= 0)
            parts += QString::fromLatin1(name + '=' + QByteArray{value.data(), static_cast<int>(size)}.toHex());
    }
    return parts.join(QLatin1Char{' '});
}

QStringList namesIn(const QString &directory)
{
    return QDir{directory}.entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot);
}

QByteArray contentOf(const QString &path)
{
    QFile file{path};
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray{};
}

bool addName(const QString &path, const QString &name)
{
    return link(local(path).constData(), local(name).constData()) == 0;
}

bool put(const QString &path, const QByteArray &content)
{
    QFile file{path};
    return file.open(QIODevice::WriteOnly) && file.write(content) == content.size();
}

// The difference of two values as a text, empty when there is none; for what a child process finds.
template<typename T>
QString difference(const char *what, const T &actual, const T &expected)
{
    if (actual == expected)
        return {};
    const std::unique_ptr<char[]> actualText{QTest::toString(actual)};
    const std::unique_ptr<char[]> expectedText{QTest::toString(expected)};
    return QStringLiteral("%1: %2 instead of %3; ")
        .arg(QLatin1String{what}, QString::fromUtf8(actualText.get()).left(200),
             QString::fromUtf8(expectedText.get()).left(200));
}

QString errorText(int error) { return QString::fromLocal8Bit(std::strerror(error)); }

const QByteArray oldContent{QByteArray{"# the old content\n"}.repeated(9000)};
const QByteArray newContent{QByteArray{"# new\n"}.repeated(40000)};
const QByteArray laterContent{"# later\n"};

// Saves to `path` and tells how far the outcome is from `saved` with the file, its attributes and its directory right.
QString problemOfSaving(const QString &path, const QByteArray &content, bool saved, const QByteArray &before)
{
    const QString attributes{attributesOf(path)};
    const QStringList names{namesIn(QFileInfo{path}.path())};
    QString reason;
    const bool result{fileio::replaceFile(path, content, &reason)};
    return difference("saved", result, saved) + difference("content", contentOf(path), saved ? content : before) +
           difference("attributes", attributesOf(path), attributes) +
           difference("names", namesIn(QFileInfo{path}.path()), names) +
           (reason.isEmpty() == saved ? QString{} : QStringLiteral("reason: ") + reason);
}

// Runs `function` in a child process that is not the superuser.
QString unprivileged(const std::function<QString()> &function)
{
    return inChild([&] {
        if (geteuid() == 0 && (setgroups(0, nullptr) < 0 || setresgid(nobody, nobody, nobody) < 0 ||
                               setresuid(nobody, nobody, nobody) < 0))
            return QStringLiteral("skip: cannot become another user");
        return function();
    });
}

// Gives a path to the user of unprivileged().
void giveAway(const QString &path)
{
    if (geteuid() == 0)
        QCOMPARE(lchown(local(path).constData(), nobody, nobody), 0);
}

supervisor::Outcome saveSupervised(const QString &path, const QByteArray &content, const supervisor::Policy &policy)
{
    return supervisor::run([&] { return fileio::replaceFile(path, content) ? 0 : 1; }, policy);
}

// Syncing takes most of the time of a save and makes no difference to a machine that keeps running.
supervisor::Verdict unlessSync(int call, int /*index*/ = 0)
{
    return call == SYS_fsync ? supervisor::pretend : supervisor::proceed;
}

// How a file may stand where it is to be replaced.
enum class Standing
{
    Plain,
    Absent,
    Linked,
    SeveralNames,
    SeveralNamesAndNoBackups
};

} // namespace

Q_DECLARE_METATYPE(Standing)

class FileIoTest final : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase() { umask(S_IWGRP | S_IWOTH); }
    void init() { makeRoot(); }
    void cleanup() { m_root.reset(); }

    void readsAnyBytes_data();
    void readsAnyBytes();
    void refusesToRead_data();
    void refusesToRead();
    void readsTheEmptyDevice();
    void readsAFileWhoseSizeIsNotKnown();
    void refusesAFileThatIsTooLong();
    void refusesAFileWithoutPermission();
    void endsReadingAFileThatGrows();
    void readsThroughInterruptions();
    void readErrorGivesNothing();

    void createsWithTheUsersMask_data();
    void createsWithTheUsersMask();
    void leavesNothingOpenWhereFoldersCannotBeListed();
    void replacesWithAnyBytes_data();
    void replacesWithAnyBytes();
    void keepsMode_data();
    void keepsMode();
    void keepsOwnerAndGroup();
    void keepsAclAndAttributes();
    void takesNoAclFromTheDirectory();
    void renamesOverTheOldFile();
    void followsLinks_data();
    void followsLinks();
    void refusesALoopOfLinks();
    void keepsSeveralNames();
    void refusesWhatIsNoFile_data();
    void refusesWhatIsNoFile();
    void writesDevicesUnchecked_data();
    void writesDevicesUnchecked();
    void writesToAPipe();
    void survivesAPipeWithoutReader();
    void givesUpOnAPipeThatNobodyEmpties();

    void followsNoLinkThatWasSwappedIn_data();
    void followsNoLinkThatWasSwappedIn();

    void failsWhenFull_data();
    void failsWhenFull();
    void savesWhereThereIsRoomForOneCopyOnly_data();
    void savesWhereThereIsRoomForOneCopyOnly();
    void overwritesNothingWhenThereIsNoRoom();
    void failsInPlaceWhenFullAndRoomCannotBeReserved();
    void failsBeyondTheSizeLimit_data();
    void failsBeyondTheSizeLimit();
    void failsOnAReadOnlyFileSystem();
    void failsWithoutPermissionForTheFile();
    void failsWithoutPermissionForTheDirectoryOfANewFile();
    void writesInPlaceWhereTheDirectoryCannotBeWritten();
    void refusesToWriteInPlaceWithoutAKeptCopy();
    void writesABindMountedFile_data();
    void writesABindMountedFile();
    void writesInPlaceWhenTheAttributesCannotBeGiven_data();
    void writesInPlaceWhenTheAttributesCannotBeGiven();

    void writesInPlaceWhereRenamingIsRefused_data();
    void writesInPlaceWhereRenamingIsRefused();
    void cleansWhatAKilledSaveLeft();
    void leavesWhatIsNoLeftOver();
    void savesANameOfFullLength();
    void savesOfSeveralProcessesDoNotMix();

    void killedAtEveryStep_data() { addStandings(); }
    void killedAtEveryStep();
    void failedAtEveryStep_data();
    void failedAtEveryStep();

private:
    void makeRoot();
    static void addStandings();
    QString directory() const { return paths::configurationDirectory(); }
    QString standFile(Standing standing);
    QString problemAfterwards(Standing standing, const QString &path, const QString &attributes, bool damageAllowed);

    std::unique_ptr<TemporaryRoot> m_root;
};

void FileIoTest::readsAnyBytes_data()
{
    QTest::addColumn<QByteArray>("content");
    QTest::addRow("empty") << QByteArray{""};
    QTest::addRow("text") << QByteArray{"subnet\n"};
    QTest::addRow("NUL and high bytes") << QByteArray{"\0\xFF\r\n\0", 5};
    QTest::addRow("large") << QByteArray{"0123456789abcdef"}.repeated(100000);
}

void FileIoTest::readsAnyBytes()
{
    QFETCH(QByteArray, content);
    writeTestFile(paths::configuration(), content);
    QString reason;
    QCOMPARE(fileio::readFile(paths::configuration(), &reason), std::optional{content});
    QVERIFY(reason.isEmpty());
}

void FileIoTest::refusesToRead_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("error");
    QTest::addRow("missing") << QStringLiteral("missing") << ENOENT;
    QTest::addRow("directory") << QStringLiteral(".") << EISDIR;
    QTest::addRow("pipe") << QStringLiteral("pipe") << EOPNOTSUPP;
    QTest::addRow("socket") << QStringLiteral("socket") << ENXIO;
    QTest::addRow("endless device") << QStringLiteral("/dev/zero") << EOPNOTSUPP;
}

void FileIoTest::refusesToRead()
{
    QFETCH(QString, name);
    QFETCH(int, error);
    QVERIFY(mkfifo(local(directory() + QStringLiteral("pipe")).constData(), 0600) == 0);
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    qstrncpy(address.sun_path, local(directory() + QStringLiteral("socket")).constData(), sizeof address.sun_path);
    const int socketDescriptor{socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0)};
    QVERIFY(bind(socketDescriptor, reinterpret_cast<const sockaddr *>(&address), sizeof address) == 0);
    close(socketDescriptor);

    QString reason;
    QVERIFY(!fileio::readFile(QDir{directory()}.filePath(name), &reason));
    QCOMPARE(reason, errorText(error));
}

void FileIoTest::readsTheEmptyDevice()
{
    QCOMPARE(fileio::readFile(QStringLiteral("/dev/null")), std::optional{QByteArray{}});
}

void FileIoTest::readsAFileWhoseSizeIsNotKnown()
{
    const std::optional<QByteArray> content{fileio::readFile(QStringLiteral("/proc/self/status"))};
    QVERIFY(content && content->startsWith("Name:") && content->endsWith('\n'));
}

void FileIoTest::refusesAFileThatIsTooLong()
{
    writeTestFile(paths::configuration(), "x");
    for (const off_t size : {off_t{TextEncoding::longestText} + 1, off_t{3} << 30}) {
        QCOMPARE(truncate(local(paths::configuration()).constData(), size), 0);
        QString reason;
        QVERIFY(!fileio::readFile(paths::configuration(), &reason));
        QCOMPARE(reason, errorText(EFBIG));
    }
}

void FileIoTest::refusesAFileWithoutPermission()
{
    writeTestFile(paths::configuration(), oldContent);
    QCOMPARE(chmod(local(paths::configuration()).constData(), 0), 0);
    giveAway(m_root->path({}));
    giveAway(paths::configuration());
    QVERIFY_NO_PROBLEM(unprivileged([] {
        QString reason;
        const bool read{fileio::readFile(paths::configuration(), &reason)};
        return difference("read", read, false) + difference("reason", reason, errorText(EACCES));
    }));
}

void FileIoTest::endsReadingAFileThatGrows()
{
    writeTestFile(paths::configuration(), oldContent);
    const pid_t writer{fork()};
    if (writer == 0) {
        const int file{open(local(paths::configuration()).constData(), O_WRONLY | O_APPEND | O_CLOEXEC)};
        for (int i{}; i < 1000 && write(file, newContent.constData(), static_cast<size_t>(newContent.size())) > 0;
             ++i) {
        }
        _exit(0);
    }
    while (QFileInfo{paths::configuration()}.size() == oldContent.size())
        QThread::yieldCurrentThread();
    const std::optional<QByteArray> content{fileio::readFile(paths::configuration())};
    kill(writer, SIGKILL);
    waitpid(writer, nullptr, 0);
    QVERIFY(content && content->startsWith(oldContent + newContent.left(6)));
}

void FileIoTest::readsThroughInterruptions()
{
    writeTestFile(paths::configuration(), oldContent);
    const auto read = [] { return fileio::readFile(paths::configuration()) == oldContent ? 0 : 1; };
    QMap<int, int> interrupted;
    const supervisor::Outcome outcome{supervisor::run(read, [&](int call, int) {
        const bool mayBeInterrupted{call == SYS_openat || call == SYS_pread64};
        return mayBeInterrupted && interrupted[call]++ < 2 ? EINTR : supervisor::proceed;
    })};
    if (!outcome.unsupported.isEmpty())
        QSKIP(qPrintable(outcome.unsupported));
    QCOMPARE(interrupted.size(), 2);
    QCOMPARE(outcome.result, 0);
}

void FileIoTest::readErrorGivesNothing()
{
    writeTestFile(paths::configuration(), oldContent);
    const auto read = [] {
        QString reason;
        return !fileio::readFile(paths::configuration(), &reason) && reason == errorText(EIO) ? 0 : 1;
    };
    const supervisor::Outcome outcome{
        supervisor::run(read, [](int call, int) { return call == SYS_pread64 ? EIO : supervisor::proceed; })};
    if (!outcome.unsupported.isEmpty())
        QSKIP(qPrintable(outcome.unsupported));
    QCOMPARE(outcome.result, 0);
}

void FileIoTest::createsWithTheUsersMask_data()
{
    QTest::addColumn<uint>("mask");
    QTest::addColumn<uint>("mode");
    QTest::addRow("usual") << 0022U << 0644U;
    QTest::addRow("private") << 0077U << 0600U;
    QTest::addRow("none") << 0000U << 0644U;
}

void FileIoTest::createsWithTheUsersMask()
{
    QFETCH(uint, mask);
    QFETCH(uint, mode);
    const mode_t before{umask(mask)};
    const bool saved{fileio::replaceFile(paths::configuration(), newContent)};
    QCOMPARE(umask(before), mask);
    QVERIFY(saved);
    QCOMPARE(readTestFile(paths::configuration()), newContent);
    QCOMPARE(statusOf(paths::configuration()).st_mode & 07777U, mode);
    QCOMPARE(namesIn(directory()), QStringList{QStringLiteral("dhcpd.conf")});
}

// Folders are listed only to clear up after earlier saves, so that a save succeeds without.
void FileIoTest::leavesNothingOpenWhereFoldersCannotBeListed()
{
    writeTestFile(paths::configuration(), oldContent);
    const auto openFiles = [] {
        std::array<FileStatus, 100> statuses{};
        int descriptor{};
        return std::count_if(statuses.begin(), statuses.end(),
                             [&descriptor](FileStatus &status) { return fstat(descriptor++, &status) == 0; });
    };
    const auto save = [&] {
        const auto before = openFiles();
        return fileio::replaceFile(paths::configuration(), newContent) && openFiles() == before ? 0 : 1;
    };
    // Of what a save calls, only the opening of a directory's stream asks for the flags of a descriptor.
    int refused{};
    const supervisor::Outcome outcome{supervisor::run(save, [&](int call, int) {
        refused += call == SYS_fcntl ? 1 : 0;
        return call == SYS_fcntl ? ENOMEM : unlessSync(call);
    })};
    if (!outcome.unsupported.isEmpty())
        QSKIP(qPrintable(outcome.unsupported));
    QVERIFY(refused > 0);
    QCOMPARE(outcome.result, 0);
    QCOMPARE(contentOf(paths::configuration()), newContent);
}

void FileIoTest::replacesWithAnyBytes_data() { readsAnyBytes_data(); }

void FileIoTest::replacesWithAnyBytes()
{
    QFETCH(QByteArray, content);
    writeTestFile(paths::configuration(), oldContent);
    QVERIFY_NO_PROBLEM(problemOfSaving(paths::configuration(), content, true, oldContent));
}

void FileIoTest::keepsMode_data()
{
    QTest::addColumn<uint>("mode");
    for (const uint mode : {0600U, 0640U, 0644U, 0664U, 0666U, 0755U, 0600U | S_ISGID})
        QTest::addRow("%o", mode) << mode;
}

void FileIoTest::keepsMode()
{
    QFETCH(uint, mode);
    writeTestFile(paths::configuration(), oldContent);
    QCOMPARE(chmod(local(paths::configuration()).constData(), mode), 0);
    QVERIFY_NO_PROBLEM(problemOfSaving(paths::configuration(), newContent, true, oldContent));
}

void FileIoTest::keepsOwnerAndGroup()
{
    if (geteuid() != 0)
        QSKIP("only the superuser gives files away");
    writeTestFile(paths::configuration(), oldContent);
    for (const uid_t owner : {uid_t{0}, nobody}) {
        QCOMPARE(chown(local(paths::configuration()).constData(), owner, serverGroup), 0);
        QCOMPARE(chmod(local(paths::configuration()).constData(), 0640), 0);
        const ino_t inode{statusOf(paths::configuration()).st_ino};
        QVERIFY_NO_PROBLEM(problemOfSaving(paths::configuration(), newContent, true, oldContent));
        QVERIFY(statusOf(paths::configuration()).st_ino != inode);
    }
}

void FileIoTest::keepsAclAndAttributes()
{
    writeTestFile(paths::configuration(), oldContent);
    if (!setAttribute(paths::configuration(), aclName, acl()) ||
        !setAttribute(paths::configuration(), "user.note", "a\0b"))
        QSKIP("the file system has no ACLs or no extended attributes");
    const ino_t inode{statusOf(paths::configuration()).st_ino};
    QVERIFY_NO_PROBLEM(problemOfSaving(paths::configuration(), newContent, true, oldContent));
    QVERIFY(statusOf(paths::configuration()).st_ino != inode);
    QVERIFY(attributesOf(paths::configuration()).contains(QString::fromLatin1(acl().toHex())));
}

void FileIoTest::takesNoAclFromTheDirectory()
{
    writeTestFile(paths::configuration(), oldContent);
    if (!setAttribute(directory(), defaultAclName, acl()))
        QSKIP("the file system has no ACLs");
    const ino_t inode{statusOf(paths::configuration()).st_ino};
    QVERIFY_NO_PROBLEM(problemOfSaving(paths::configuration(), newContent, true, oldContent));
    QVERIFY(statusOf(paths::configuration()).st_ino != inode);
    QVERIFY(!attributesOf(paths::configuration()).contains(QString::fromLatin1(aclName)));
}

void FileIoTest::renamesOverTheOldFile()
{
    writeTestFile(paths::configuration(), oldContent);
    QFile reader{paths::configuration()};
    QVERIFY(reader.open(QIODevice::ReadOnly));
    QVERIFY(fileio::replaceFile(paths::configuration(), newContent));
    QCOMPARE(reader.readAll(), oldContent);
    QCOMPARE(readTestFile(paths::configuration()), newContent);
}

void FileIoTest::followsLinks_data()
{
    QTest::addColumn<QString>("target");
    QTest::addColumn<bool>("exists");
    QTest::addRow("relative") << QStringLiteral("../real/file") << true;
    QTest::addRow("absolute") << QStringLiteral("%1/etc/real/file") << true;
    QTest::addRow("relative, dangling") << QStringLiteral("../real/file") << false;
    QTest::addRow("absolute, dangling") << QStringLiteral("%1/etc/real/file") << false;
    QTest::addRow("of a link") << QStringLiteral("../real/link") << true;
    QTest::addRow("of a link, dangling") << QStringLiteral("../real/link") << false;
    QTest::addRow("through a directory's link") << QStringLiteral("../realdir/file") << true;
}

void FileIoTest::followsLinks()
{
    QFETCH(QString, target);
    QFETCH(bool, exists);
    const QString file{m_root->path(QStringLiteral("/etc/real/file"))};
    QVERIFY(QDir{}.mkdir(m_root->path(QStringLiteral("/etc/real"))));
    QVERIFY(QFile::link(QStringLiteral("file"), m_root->path(QStringLiteral("/etc/real/link"))));
    QVERIFY(QFile::link(QStringLiteral("real"), m_root->path(QStringLiteral("/etc/realdir"))));
    if (exists)
        writeTestFile(file, oldContent);
    const QString fullTarget{target.startsWith(QLatin1Char{'%'}) ? target.arg(m_root->path({})) : target};
    QVERIFY(symlink(local(fullTarget).constData(), local(paths::configuration()).constData()) == 0);

    QVERIFY(fileio::replaceFile(paths::configuration(), newContent));

    QVERIFY(S_ISLNK(statusOf(paths::configuration()).st_mode));
    QVERIFY(S_ISREG(statusOf(file).st_mode));
    QCOMPARE(readTestFile(file), newContent);
    QCOMPARE(readTestFile(paths::configuration()), newContent);
    QCOMPARE(namesIn(directory()), QStringList{QStringLiteral("dhcpd.conf")});
    QCOMPARE(namesIn(m_root->path(QStringLiteral("/etc/real"))),
             (QStringList{QStringLiteral("file"), QStringLiteral("link")}));
}

void FileIoTest::refusesALoopOfLinks()
{
    QVERIFY(QFile::link(QStringLiteral("other"), paths::configuration()));
    QVERIFY(QFile::link(QStringLiteral("dhcpd.conf"), directory() + QStringLiteral("other")));
    QString reason;
    QVERIFY(!fileio::replaceFile(paths::configuration(), newContent, &reason));
    QCOMPARE(reason, errorText(ELOOP));
    QCOMPARE(namesIn(directory()), (QStringList{QStringLiteral("dhcpd.conf"), QStringLiteral("other")}));
}

void FileIoTest::keepsSeveralNames()
{
    writeTestFile(paths::configuration(), oldContent);
    const QString other{directory() + QStringLiteral("other")};
    QVERIFY(addName(paths::configuration(), other));
    for (const QByteArray &content : {newContent, laterContent}) {
        QVERIFY_NO_PROBLEM(problemOfSaving(paths::configuration(), content, true, oldContent));
        QCOMPARE(readTestFile(other), content);
    }
    QCOMPARE(statusOf(paths::configuration()).st_nlink, nlink_t{2});
}

void FileIoTest::refusesWhatIsNoFile_data()
{
    QTest::addColumn<QString>("name");
    QTest::addRow("directory") << QStringLiteral("directory");
    QTest::addRow("directory with a slash") << QStringLiteral("directory/");
    QTest::addRow("in a directory that is missing") << QStringLiteral("missing/dhcpd.conf");
    QTest::addRow("in a file") << QStringLiteral("file/dhcpd.conf");
    QTest::addRow("no name") << QString{};
}

void FileIoTest::refusesWhatIsNoFile()
{
    QFETCH(QString, name);
    QVERIFY(QDir{directory()}.mkdir(QStringLiteral("directory")));
    writeTestFile(directory() + QStringLiteral("file"), oldContent);
    const QStringList names{namesIn(directory())};
    QString reason;
    QVERIFY(!fileio::replaceFile(directory() + name, newContent, &reason));
    QVERIFY(!reason.isEmpty());
    QCOMPARE(namesIn(directory()), names);
    QVERIFY(namesIn(directory() + QStringLiteral("directory")).isEmpty());
    QCOMPARE(readTestFile(directory() + QStringLiteral("file")), oldContent);
}

void FileIoTest::writesDevicesUnchecked_data()
{
    QTest::addColumn<QString>("device");
    QTest::addRow("null") << QStringLiteral("/dev/null");
    QTest::addRow("full") << QStringLiteral("/dev/full");
}

void FileIoTest::writesDevicesUnchecked()
{
    QFETCH(QString, device);
    QVERIFY(QFile::link(device, paths::configuration()));
    QVERIFY(fileio::replaceFile(paths::configuration(), newContent));
    QVERIFY(S_ISCHR(statusOf(device).st_mode));
}

void FileIoTest::writesToAPipe()
{
    QCOMPARE(mkfifo(local(paths::configuration()).constData(), 0600), 0);
    const int reader{open(local(paths::configuration()).constData(), O_RDONLY | O_NONBLOCK | O_CLOEXEC)};
    QVERIFY(reader >= 0);
    QVERIFY(fileio::replaceFile(paths::configuration(), laterContent));
    std::array<char, 100> buffer{};
    const ssize_t length{read(reader, buffer.data(), buffer.size())};
    close(reader);
    QCOMPARE((QByteArray{buffer.data(), static_cast<int>(length)}), laterContent);
    QVERIFY(S_ISFIFO(statusOf(paths::configuration()).st_mode));
}

void FileIoTest::survivesAPipeWithoutReader()
{
    QCOMPARE(mkfifo(local(paths::configuration()).constData(), 0600), 0);
    QString reason;
    QVERIFY(!fileio::replaceFile(paths::configuration(), newContent, &reason));
    QCOMPARE(reason, errorText(ENXIO));

    // One whose reader goes away while it is written to; the content is larger than what a pipe holds.
    std::signal(SIGPIPE, SIG_DFL);
    const pid_t reader{fork()};
    if (reader == 0) {
        const int pipe{open(local(paths::configuration()).constData(), O_RDONLY | O_CLOEXEC)};
        char byte{};
        _exit(read(pipe, &byte, 1) == 1 ? 0 : 1);
    }
    bool written{};
    QTRY_VERIFY((written = written || fileio::replaceFile(paths::configuration(), newContent)));
    int status{-1};
    waitpid(reader, &status, 0);
    QCOMPARE(status, 0);
}

void FileIoTest::givesUpOnAPipeThatNobodyEmpties()
{
    QCOMPARE(mkfifo(local(paths::configuration()).constData(), 0600), 0);
    const int reader{open(local(paths::configuration()).constData(), O_RDONLY | O_NONBLOCK | O_CLOEXEC)};
    QVERIFY(fileio::replaceFile(paths::configuration(), newContent));
    close(reader);
}

void FileIoTest::followsNoLinkThatWasSwappedIn_data()
{
    QTest::addColumn<int>("opening");
    QTest::addColumn<bool>("saved");
    QTest::addColumn<QString>("reason");
    // The directory is opened first, and listed between the two.
    QTest::addRow("before the file is opened") << 1 << false << errorText(ELOOP);
    QTest::addRow("before the old content is read") << 3 << true << QString{};
}

// Somebody puts a link to another file in place of the one that was found.
void FileIoTest::followsNoLinkThatWasSwappedIn()
{
    QFETCH(int, opening);
    QFETCH(bool, saved);
    QFETCH(QString, reason);
    const QString other{m_root->path(QStringLiteral("/etc/other"))};
    writeTestFile(other, "another file\n");
    writeTestFile(paths::configuration(), oldContent);
    QVERIFY(QFile::link(other, directory() + QStringLiteral("link")));

    int openings{};
    bool swapped{};
    const auto save = [&] {
        QString told;
        const bool done{fileio::replaceFile(paths::configuration(), newContent, &told)};
        return done == saved && told == reason ? 0 : 1;
    };
    const supervisor::Outcome outcome{supervisor::run(save, [&](int call, int) {
        if (call == SYS_openat && openings++ == opening) {
            swapped = std::rename(local(directory() + QStringLiteral("link")).constData(),
                                  local(paths::configuration()).constData()) == 0;
        }
        return supervisor::proceed;
    })};
    if (!outcome.unsupported.isEmpty())
        QSKIP(qPrintable(outcome.unsupported));
    QVERIFY(swapped);
    QCOMPARE(outcome.result, 0);
    QCOMPARE(readTestFile(other), QByteArray{"another file\n"});
    QCOMPARE(contentOf(paths::configuration()), saved ? newContent : QByteArray{"another file\n"});
    QVERIFY(namesIn(paths::backupDirectory()).isEmpty()); // neither file was read
}

void FileIoTest::failsWhenFull_data()
{
    QTest::addColumn<bool>("severalNames");
    QTest::addColumn<bool>("backupsInside");
    QTest::addRow("renamed") << false << false;
    QTest::addRow("renamed, backups on the same file system") << false << true;
    QTest::addRow("in place") << true << false;
}

void FileIoTest::failsWhenFull()
{
    QFETCH(bool, severalNames);
    QFETCH(bool, backupsInside);
    QVERIFY_NO_PROBLEM(inMountNamespace([&]() -> QString {
        const QString full{backupsInside ? m_root->path({}) : directory()};
        if (mount("none", local(full).constData(), "tmpfs", 0, "size=64k") < 0)
            return QStringLiteral("skip: no tmpfs");
        QDir{}.mkpath(directory());
        QDir{}.mkpath(QFileInfo{QDir::cleanPath(paths::backupDirectory())}.path());
        const QByteArray small{oldContent.left(20000)};
        if (!put(paths::configuration(), small))
            return QStringLiteral("cannot write");
        if (severalNames && !addName(paths::configuration(), directory() + QStringLiteral("other")))
            return QStringLiteral("cannot link");
        const QString problem{problemOfSaving(paths::configuration(), newContent, false, small)};
        return problem + problemOfSaving(paths::configuration(), laterContent, true, small);
    }));
}

void FileIoTest::savesWhereThereIsRoomForOneCopyOnly_data()
{
    QTest::addColumn<int>("size");
    QTest::addColumn<QByteArray>("kept");
    // Of 64 KiB, with a file of 24 KiB.
    QTest::addRow("room for both") << 12 * 1024 << QByteArray(24 * 1024, 'o');
    QTest::addRow("room for one") << 24 * 1024 << QByteArray{};
    QTest::addRow("room for one, and all of it") << 40 * 1024 << QByteArray{};
}

void FileIoTest::savesWhereThereIsRoomForOneCopyOnly()
{
    QFETCH(int, size);
    QFETCH(QByteArray, kept);
    QVERIFY_NO_PROBLEM(inMountNamespace([&]() -> QString {
        if (mount("none", local(m_root->path({})).constData(), "tmpfs", 0, "size=64k") < 0)
            return QStringLiteral("skip: no tmpfs");
        QDir{}.mkpath(directory());
        QDir{}.mkpath(QFileInfo{QDir::cleanPath(paths::backupDirectory())}.path());
        const QByteArray before(24 * 1024, 'o');
        if (!put(paths::configuration(), before))
            return QStringLiteral("cannot write");
        const QString problem{problemOfSaving(paths::configuration(), QByteArray(size, 'n'), true, before)};
        const QStringList versions{namesIn(paths::backupDirectory())};
        const QString version{paths::backupDirectory() + versions.value(0)};
        return problem + difference("versions", static_cast<int>(versions.size()), kept.isEmpty() ? 0 : 1) +
               difference("kept", versions.isEmpty() ? QByteArray{} : contentOf(version), kept);
    }));
}

void FileIoTest::overwritesNothingWhenThereIsNoRoom()
{
    QVERIFY_NO_PROBLEM(inMountNamespace([&]() -> QString {
        if (mount("none", local(directory()).constData(), "tmpfs", 0, "size=64k") < 0)
            return QStringLiteral("skip: no tmpfs");
        const QByteArray small{oldContent.left(20000)};
        if (!put(paths::configuration(), small) ||
            !addName(paths::configuration(), directory() + QStringLiteral("other")))
            return QStringLiteral("cannot write");
        supervisor::Outcome outcome;
        for (int step{}; step == 0 || outcome.killed; ++step) {
            QDir{paths::backupDirectory()}.removeRecursively();
            outcome = saveSupervised(paths::configuration(), newContent, [step](int call, int index) {
                return index == step ? supervisor::kill : unlessSync(call);
            });
            if (!outcome.unsupported.isEmpty())
                return QStringLiteral("skip: ") + outcome.unsupported;
            if (contentOf(paths::configuration()) != small)
                return QStringLiteral("damaged at step %1").arg(step);
        }
        return difference("saved", outcome.result, 1);
    }));
}

void FileIoTest::failsInPlaceWhenFullAndRoomCannotBeReserved()
{
    QVERIFY_NO_PROBLEM(inMountNamespace([&]() -> QString {
        if (mount("none", local(directory()).constData(), "tmpfs", 0, "size=64k") < 0)
            return QStringLiteral("skip: no tmpfs");
        const QByteArray small{oldContent.left(20000)};
        if (!put(paths::configuration(), small) ||
            !addName(paths::configuration(), directory() + QStringLiteral("other")))
            return QStringLiteral("cannot write");
        const supervisor::Outcome outcome{supervisor::run(
            [&] { return problemOfSaving(paths::configuration(), newContent, false, small).isEmpty() ? 0 : 1; },
            [](int call, int) { return call == SYS_fallocate ? EOPNOTSUPP : supervisor::proceed; })};
        if (!outcome.unsupported.isEmpty())
            return QStringLiteral("skip: ") + outcome.unsupported;
        return difference("saving", outcome.result, 0) +
               difference("content", contentOf(paths::configuration()), small);
    }));
}

void FileIoTest::failsBeyondTheSizeLimit_data()
{
    QTest::addColumn<bool>("severalNames");
    QTest::addRow("renamed") << false;
    QTest::addRow("in place") << true;
}

void FileIoTest::failsBeyondTheSizeLimit()
{
    QFETCH(bool, severalNames);
    const QByteArray small{oldContent.left(20000)};
    writeTestFile(paths::configuration(), small);
    if (severalNames)
        QVERIFY(addName(paths::configuration(), directory() + QStringLiteral("other")));
    QVERIFY_NO_PROBLEM(inChild([&] {
        const rlimit limit{100000, 100000};
        setrlimit(RLIMIT_FSIZE, &limit);
        return problemOfSaving(paths::configuration(), newContent, false, small);
    }));
}

void FileIoTest::failsOnAReadOnlyFileSystem()
{
    writeTestFile(paths::configuration(), oldContent);
    QVERIFY_NO_PROBLEM(inMountNamespace([&]() -> QString {
        const QByteArray folder{local(directory())};
        if (mount(folder.constData(), folder.constData(), nullptr, MS_BIND, nullptr) < 0 ||
            mount("none", folder.constData(), nullptr, MS_BIND | MS_REMOUNT | MS_RDONLY, nullptr) < 0)
            return QStringLiteral("skip: no bind mount");
        QString reason;
        const bool created{fileio::replaceFile(directory() + QStringLiteral("new"), newContent, &reason)};
        return difference("created", created, false) + difference("reason", reason, errorText(EROFS)) +
               problemOfSaving(paths::configuration(), newContent, false, oldContent);
    }));
}

void FileIoTest::failsWithoutPermissionForTheFile()
{
    writeTestFile(paths::configuration(), oldContent);
    QCOMPARE(chmod(local(paths::configuration()).constData(), 0444), 0);
    for (const QString &path : {m_root->path({}), directory(), paths::configuration()})
        giveAway(path);
    QVERIFY_NO_PROBLEM(
        unprivileged([] { return problemOfSaving(paths::configuration(), newContent, false, oldContent); }));
}

void FileIoTest::failsWithoutPermissionForTheDirectoryOfANewFile()
{
    for (const QString &path : {m_root->path({}), directory()})
        giveAway(path);
    QCOMPARE(chmod(local(directory()).constData(), 0555), 0);
    QVERIFY_NO_PROBLEM(unprivileged([] {
        QString reason;
        const bool saved{fileio::replaceFile(paths::configuration(), newContent, &reason)};
        return difference("saved", saved, false) + difference("reason", reason, errorText(EACCES));
    }));
    QCOMPARE(chmod(local(directory()).constData(), 0755), 0);
    QVERIFY(namesIn(directory()).isEmpty());
}

void FileIoTest::writesInPlaceWhereTheDirectoryCannotBeWritten()
{
    writeTestFile(paths::configuration(), oldContent);
    const QString backups{QFileInfo{QDir::cleanPath(paths::backupDirectory())}.path()};
    for (const QString &path : {m_root->path({}), directory(), paths::configuration(), backups})
        giveAway(path);
    QCOMPARE(chmod(local(directory()).constData(), 0555), 0);
    QVERIFY_NO_PROBLEM(
        unprivileged([] { return problemOfSaving(paths::configuration(), newContent, true, oldContent); }));
    QCOMPARE(chmod(local(directory()).constData(), 0755), 0);
    const QStringList kept{namesIn(paths::backupDirectory())};
    QCOMPARE(kept.size(), 1);
    QCOMPARE(readTestFile(paths::backupDirectory() + kept.first()), oldContent);
}

void FileIoTest::refusesToWriteInPlaceWithoutAKeptCopy()
{
    writeTestFile(paths::configuration(), oldContent);
    writeTestFile(QDir::cleanPath(paths::backupDirectory()), "not a folder");
    for (const QString &path : {m_root->path({}), directory(), paths::configuration()})
        giveAway(path);
    QCOMPARE(chmod(local(directory()).constData(), 0555), 0);
    QVERIFY_NO_PROBLEM(
        unprivileged([] { return problemOfSaving(paths::configuration(), newContent, false, oldContent); }));
    QCOMPARE(chmod(local(directory()).constData(), 0755), 0);
}

void FileIoTest::writesABindMountedFile_data()
{
    QTest::addColumn<QString>("options");
    QTest::addColumn<bool>("readOnly");
    QTest::addRow("in a directory that can be written") << QString{} << false;
    QTest::addRow("in a read-only directory") << QStringLiteral("size=64k") << true;
    QTest::addRow("in a directory without room") << QStringLiteral("size=4k,nr_inodes=2") << false;
}

void FileIoTest::writesABindMountedFile()
{
    QFETCH(QString, options);
    QFETCH(bool, readOnly);
    const QString outside{m_root->path(QStringLiteral("/outside"))};
    writeTestFile(outside, oldContent);
    QVERIFY_NO_PROBLEM(inMountNamespace([&]() -> QString {
        const QByteArray folder{local(directory())};
        const QByteArray file{local(paths::configuration())};
        if (!options.isEmpty() && mount("none", folder.constData(), "tmpfs", 0, options.toLatin1().constData()) < 0)
            return QStringLiteral("skip: no tmpfs");
        if (!put(paths::configuration(), {}))
            return QStringLiteral("cannot write");
        if (readOnly && mount("none", folder.constData(), nullptr, MS_REMOUNT | MS_RDONLY, nullptr) < 0)
            return QStringLiteral("skip: no read-only mount");
        if (mount(local(outside).constData(), file.constData(), nullptr, MS_BIND, nullptr) < 0)
            return QStringLiteral("skip: no bind mount");
        QString problem{problemOfSaving(paths::configuration(), newContent, true, oldContent)};
        if (umount(file.constData()) < 0)
            problem += QStringLiteral("cannot unmount; ");
        return problem + difference("covered content", contentOf(paths::configuration()), QByteArray{""});
    }));
    QCOMPARE(readTestFile(outside), newContent);
}

void FileIoTest::writesInPlaceWhenTheAttributesCannotBeGiven_data()
{
    QTest::addColumn<int>("call");
    QTest::addRow("owner") << SYS_fchown;
    QTest::addRow("ACL and attributes") << SYS_fsetxattr;
    QTest::addRow("mode") << SYS_fchmod;
}

void FileIoTest::writesInPlaceWhenTheAttributesCannotBeGiven()
{
    QFETCH(int, call);
    const QString path{standFile(Standing::Plain)};
    // Bits that an ACL or a new owner does not bring along.
    QCOMPARE(chmod(local(path).constData(), 01640), 0);
    const ino_t inode{statusOf(path).st_ino};
    bool refused{};
    const supervisor::Outcome outcome{
        supervisor::run([&] { return problemOfSaving(path, newContent, true, oldContent).isEmpty() ? 0 : 1; },
                        [&](int each, int) {
                            refused = refused || each == call;
                            return each == call ? EPERM : supervisor::proceed;
                        })};
    if (!outcome.unsupported.isEmpty())
        QSKIP(qPrintable(outcome.unsupported));
    if (!refused)
        QSKIP("not the superuser, or a file system without ACLs: nothing to give");
    QCOMPARE(outcome.result, 0);
    QCOMPARE(statusOf(path).st_ino, inode);
}

void FileIoTest::writesInPlaceWhereRenamingIsRefused_data()
{
    QTest::addColumn<int>("error");
    for (const int error : {EBUSY, EPERM, EACCES, EXDEV})
        QTest::addRow("%s", std::strerror(error)) << error;
}

void FileIoTest::writesInPlaceWhereRenamingIsRefused()
{
    QFETCH(int, error);
    const QString path{standFile(Standing::Plain)};
    const ino_t inode{statusOf(path).st_ino};
    int renamings{};
    const auto save = [&] { return problemOfSaving(path, newContent, true, oldContent).isEmpty() ? 0 : 1; };
    const supervisor::Outcome outcome{supervisor::run(save, [&](int call, int) {
        // The first renaming is that of the backup.
        return call == SYS_renameat && renamings++ == 1 ? error : supervisor::proceed;
    })};
    if (!outcome.unsupported.isEmpty())
        QSKIP(qPrintable(outcome.unsupported));
    QCOMPARE(outcome.result, 0);
    QCOMPARE(renamings, 2);
    QCOMPARE(statusOf(path).st_ino, inode);
}

void FileIoTest::cleansWhatAKilledSaveLeft()
{
    writeTestFile(paths::configuration(), oldContent);
    const QString leftOver{directory() + QStringLiteral(".dhcpd.conf.orv-a1b2c3")};
    writeTestFile(leftOver, "half of the new con");
    if (geteuid() == 0) {
        // Killed after the new file was given to the old one's owner.
        QCOMPARE(chown(local(leftOver).constData(), nobody, nobody), 0);
        QCOMPARE(chown(local(paths::configuration()).constData(), nobody, nobody), 0);
    }
    QVERIFY(fileio::replaceFile(paths::configuration(), newContent));
    QCOMPARE(namesIn(directory()), QStringList{QStringLiteral("dhcpd.conf")});
}

void FileIoTest::leavesWhatIsNoLeftOver()
{
    writeTestFile(paths::configuration(), oldContent);
    const QString live{directory() + QStringLiteral(".dhcpd.conf.orv-living")};
    for (const char *name :
         {".dhcpd.conf.orv-living", ".dhcpd.conf.orv-longer1", ".other.orv-a1b2c3", "dhcpd.conf.orv-a1b2c3"})
        writeTestFile(directory() + QString::fromLatin1(name), "x");
    QVERIFY(QDir{directory()}.mkdir(QStringLiteral(".dhcpd.conf.orv-folder")));
    QVERIFY(QFile::link(QStringLiteral("dhcpd.conf"), directory() + QStringLiteral(".dhcpd.conf.orv-linked")));
    if (geteuid() == 0) {
        writeTestFile(directory() + QStringLiteral(".dhcpd.conf.orv-others"), "x");
        QCOMPARE(chown(local(directory() + QStringLiteral(".dhcpd.conf.orv-others")).constData(), nobody, nobody), 0);
    }
    const int lock{open(local(live).constData(), O_RDONLY | O_CLOEXEC)};
    QCOMPARE(flock(lock, LOCK_EX), 0);
    const QStringList names{namesIn(directory())};

    QVERIFY(fileio::replaceFile(paths::configuration(), newContent));
    QCOMPARE(namesIn(directory()), names);

    close(lock);
    QVERIFY(fileio::replaceFile(paths::configuration(), newContent));
    QVERIFY(!QFileInfo::exists(live));
}

void FileIoTest::savesANameOfFullLength()
{
    const QString path{directory() + QString{255, QLatin1Char{'n'}}};
    writeTestFile(path, oldContent);
    writeTestFile(directory() + QLatin1Char{'.'} + QString{243, QLatin1Char{'n'}} + QStringLiteral(".orv-a1b2c3"),
                  "left over");
    QVERIFY(fileio::replaceFile(path, newContent));
    QCOMPARE(readTestFile(path), newContent);
    QCOMPARE(namesIn(directory()).size(), 1);
    QCOMPARE(namesIn(paths::backupDirectory()).size(), 1);
}

void FileIoTest::savesOfSeveralProcessesDoNotMix()
{
    constexpr int processes{4};
    constexpr int saves{15};
    writeTestFile(paths::configuration(), oldContent);
    std::array<pid_t, processes> children{};
    for (int i{}; i < processes; ++i) {
        children.at(static_cast<size_t>(i)) = fork();
        if (children.at(static_cast<size_t>(i)) == 0) {
            bool saved{true};
            for (int j{}; j < saves; ++j) {
                const QByteArray content{50000 + i, static_cast<char>('a' + i)};
                saved = fileio::replaceFile(paths::configuration(), content) && saved;
            }
            _exit(saved ? 0 : 1);
        }
    }
    for (const pid_t child : children) {
        int status{-1};
        waitpid(child, &status, 0);
        QCOMPARE(status, 0);
    }
    const QByteArray content{readTestFile(paths::configuration())};
    QCOMPARE(content, (QByteArray{50000 + content.at(0) - 'a', content.at(0)}));
    QCOMPARE(namesIn(directory()), QStringList{QStringLiteral("dhcpd.conf")});
}

// A root directory without a backup folder.
void FileIoTest::makeRoot()
{
    m_root.reset();
    m_root = std::make_unique<TemporaryRoot>();
    QDir{}.rmdir(paths::backupDirectory());
}

void FileIoTest::addStandings()
{
    QTest::addColumn<Standing>("standing");
    QTest::addRow("a file") << Standing::Plain;
    QTest::addRow("a new file") << Standing::Absent;
    QTest::addRow("through a link") << Standing::Linked;
    QTest::addRow("in place") << Standing::SeveralNames;
    QTest::addRow("in place, no backup folder") << Standing::SeveralNamesAndNoBackups;
}

// Makes everything anew for one save, with all the attributes that this user and file system allow.
QString FileIoTest::standFile(Standing standing)
{
    makeRoot();
    if (standing == Standing::Absent)
        return paths::configuration();
    const bool linked{standing == Standing::Linked};
    const QString file{linked ? directory() + QStringLiteral("real") : paths::configuration()};
    writeTestFile(file, oldContent);
    chmod(local(file).constData(), 0640);
    setAttribute(file, aclName, acl());
    setAttribute(file, "user.note", "kept");
    if (geteuid() == 0)
        [&] { QCOMPARE(chown(local(file).constData(), nobody, serverGroup), 0); }();
    if (linked)
        [&] { QVERIFY(QFile::link(QStringLiteral("real"), paths::configuration())); }();
    if (standing == Standing::SeveralNames || standing == Standing::SeveralNamesAndNoBackups)
        [&] { QVERIFY(addName(file, directory() + QStringLiteral("other"))); }();
    if (standing == Standing::SeveralNamesAndNoBackups)
        writeTestFile(QDir::cleanPath(paths::backupDirectory()), "not a folder");
    return paths::configuration();
}

// What is wrong after a save that was disturbed, and after one more that was not.
QString FileIoTest::problemAfterwards(Standing standing, const QString &path, const QString &attributes,
                                      bool damageAllowed)
{
    QStringList expectedNames{QStringLiteral("dhcpd.conf")};
    if (standing == Standing::Linked)
        expectedNames += QStringLiteral("real");
    const bool inPlace{standing == Standing::SeveralNames || standing == Standing::SeveralNamesAndNoBackups};
    if (inPlace)
        expectedNames += QStringLiteral("other");

    QString problem;
    const bool exists{QFileInfo::exists(path)};
    const QByteArray content{contentOf(path)};
    const bool whole{(exists ? content == oldContent : standing == Standing::Absent) || content == newContent};
    if (!whole) {
        bool kept{};
        for (const QString &folder : {paths::backupDirectory(), directory()}) {
            for (const QString &name : namesIn(folder)) {
                const bool isTemporary{name.startsWith(QLatin1Char{'.'})};
                kept = kept || (!isTemporary && contentOf(QDir{folder}.filePath(name)) == oldContent);
            }
        }
        if (!inPlace || !damageAllowed || !kept)
            problem += QStringLiteral("damaged; ");
    }
    if (standing != Standing::Absent)
        problem += difference("attributes", attributesOf(QFileInfo{path}.canonicalFilePath()), attributes);

    problem += difference("next save", saveSupervised(path, laterContent, unlessSync).result, 0);
    problem += difference("next content", contentOf(path), laterContent);
    if (standing != Standing::Absent)
        problem += difference("next attributes", attributesOf(QFileInfo{path}.canonicalFilePath()), attributes);
    // Copies that were kept beside the file are no temporary files: they may be all that is left of the old content.
    const QStringList names{namesIn(directory())
                                .filter(QRegularExpression{standing == Standing::SeveralNamesAndNoBackups
                                                               ? QStringLiteral("^(?!dhcpd\\.conf\\.orv-\\d{8}T)")
                                                               : QString{}})};
    problem += difference("names", names, expectedNames);
    problem += difference("temporary backups", namesIn(paths::backupDirectory()).filter(QStringLiteral(".orv-")), {});
    return problem;
}

void FileIoTest::killedAtEveryStep()
{
    QFETCH(Standing, standing);
    int steps{};
    for (bool ended{}; !ended; ++steps) {
        const QString path{standFile(standing)};
        const QString attributes{attributesOf(QFileInfo{path}.canonicalFilePath())};
        int last{};
        const supervisor::Outcome outcome{saveSupervised(path, newContent, [&](int call, int index) {
            last = call;
            return index == steps ? supervisor::kill : unlessSync(call);
        })};
        if (!outcome.unsupported.isEmpty())
            QSKIP(qPrintable(outcome.unsupported));
        ended = !outcome.killed;
        if (ended)
            QCOMPARE(outcome.result, 0);
        const QString problem{problemAfterwards(standing, path, attributes, !ended)};
        QVERIFY2(problem.isEmpty(),
                 qPrintable(QStringLiteral("step %1, call %2: %3").arg(steps).arg(last).arg(problem)));
    }
    QVERIFY2(steps > 20, qPrintable(QString::number(steps)));
}

void FileIoTest::failedAtEveryStep_data()
{
    QTest::addColumn<Standing>("standing");
    QTest::addColumn<int>("error");
    for (const int error : {EIO, EPERM, EINTR}) {
        const QByteArray name{std::strerror(error)};
        QTest::addRow("a file: %s", name.constData()) << Standing::Plain << error;
        QTest::addRow("a new file: %s", name.constData()) << Standing::Absent << error;
        QTest::addRow("through a link: %s", name.constData()) << Standing::Linked << error;
        QTest::addRow("in place: %s", name.constData()) << Standing::SeveralNames << error;
        QTest::addRow("in place, no backup folder: %s", name.constData())
            << Standing::SeveralNamesAndNoBackups << error;
    }
}

void FileIoTest::failedAtEveryStep()
{
    QFETCH(Standing, standing);
    QFETCH(int, error);
    int steps{};
    for (bool reached{true}; reached; ++steps) {
        const QString path{standFile(standing)};
        const QString attributes{attributesOf(QFileInfo{path}.canonicalFilePath())};
        int failed{};
        reached = false;
        const supervisor::Outcome outcome{saveSupervised(path, newContent, [&](int call, int index) {
            reached = reached || index == steps;
            failed = index == steps ? call : failed;
            return index == steps ? error : unlessSync(call);
        })};
        if (!outcome.unsupported.isEmpty())
            QSKIP(qPrintable(outcome.unsupported));
        QString problem{difference("saved", outcome.result == 0, contentOf(path) == newContent)};
        problem += problemAfterwards(standing, path, attributes, false);
        QVERIFY2(problem.isEmpty(),
                 qPrintable(QStringLiteral("step %1, call %2: %3").arg(steps).arg(failed).arg(problem)));
    }
    QVERIFY2(steps > 20, qPrintable(QString::number(steps)));
}

QTEST_GUILESS_MAIN(FileIoTest)
#include "tst_fileio.moc"
