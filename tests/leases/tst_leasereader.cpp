// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leasereader.h"

#include "common/posix.h"
#include "leases/leasefile.h"
#include "leases/leasetable.h"
#include "tests/common/childprocess.h"
#include "tests/leases/irregularleases.h"
#include "tests/leases/referencereader.h"
#include "tests/support/temporaryroot.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QTest>

#include <sys/mount.h>

/// Files that change between being opened and being read.
class LeaseReaderTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void readsAsMuchAsThereWasWhenOpened();
    void endsWhereTheFileWasCut_data();
    void endsWhereTheFileWasCut();
    void readsTheOpenedFileAfterItWasReplaced();
    void isNotContinuedByAnother();
    void isNotContinuedByAFileOnAnotherDevice();
    void noticesChangesInWhatCameInSmallPieces_data();
    void noticesChangesInWhatCameInSmallPieces();

private:
    std::unique_ptr<QTemporaryDir> m_folder;
    QString m_path;
    LeaseTable m_table;
    LeaseReader m_reader{m_table};
};

void LeaseReaderTest::init()
{
    m_folder = std::make_unique<QTemporaryDir>();
    m_path = m_folder->filePath(QStringLiteral("dhcpd.leases"));
    m_reader.clear();
}

void LeaseReaderTest::readsAsMuchAsThereWasWhenOpened()
{
    const QByteArray before{leaseBlock(0, 1, 1)};
    const QByteArray after{before + leaseBlock(0, 2, 2)};
    writeTestFile(m_path, before);
    const LeaseFile file{m_path};
    writeTestFile(m_path, after);
    QVERIFY(m_reader.readOn(file));
    QCOMPARE(m_reader.position(), qint64{before.size()});
    m_table.settleAll();
    QCOMPARE(rowsOf(m_table), referenceRows(before));

    const LeaseFile grown{m_path};
    QVERIFY(m_reader.continues(grown));
    QVERIFY(m_reader.readOn(grown));
    m_table.settleAll();
    QCOMPARE(rowsOf(m_table), referenceRows(after));
}

void LeaseReaderTest::endsWhereTheFileWasCut_data()
{
    QTest::addColumn<int>("size");
    for (const int size : {0, 1, 100, 270, 300})
        QTest::addRow("%d bytes", size) << size;
}

void LeaseReaderTest::endsWhereTheFileWasCut()
{
    QFETCH(const int, size);
    const QByteArray text{leaseBlock(0, 1, 1) + leaseBlock(0, 2, 2)};
    writeTestFile(m_path, text);
    const LeaseFile file{m_path};
    QVERIFY(QFile::resize(m_path, size));
    QVERIFY(m_reader.readOn(file));
    m_table.settleAll();
    QCOMPARE(m_reader.position(), qint64{size});
    QCOMPARE(rowsOf(m_table), referenceRows(text.left(size)));
}

void LeaseReaderTest::readsTheOpenedFileAfterItWasReplaced()
{
    const QByteArray text{leaseBlock(0, 1, 1)};
    writeTestFile(m_path, text);
    const LeaseFile file{m_path};
    QVERIFY(QFile::remove(m_path));
    writeTestFile(m_path, text + leaseBlock(0, 2, 2));
    QVERIFY(m_reader.readOn(file));
    m_table.settleAll();
    QCOMPARE(rowsOf(m_table), referenceRows(text));
    QVERIFY(!m_reader.continues(LeaseFile{m_path}));
}

void LeaseReaderTest::isNotContinuedByAnother()
{
    writeTestFile(m_path, leaseBlock(0, 1, 1));
    QVERIFY(!m_reader.continues(LeaseFile{m_path})); // nothing was read yet
    QVERIFY(m_reader.readOn(LeaseFile{m_path}));
    QVERIFY(m_reader.continues(LeaseFile{m_path}));
    QVERIFY(!m_reader.continues(LeaseFile{m_folder->filePath(QStringLiteral("none"))}));
    const QString copy{m_folder->filePath(QStringLiteral("copy"))};
    QVERIFY(QFile::copy(m_path, copy));
    QVERIFY(!m_reader.continues(LeaseFile{copy}));
    m_reader.clear();
    QVERIFY(!m_reader.continues(LeaseFile{m_path}));
    QCOMPARE(m_table.size(), 0);
}

/// A copy that has the same inode number, as another file system gives to its first file.
void LeaseReaderTest::isNotContinuedByAFileOnAnotherDevice()
{
    const QString folder{m_folder->filePath(QStringLiteral("folder"))};
    const QString path{folder + QStringLiteral("/dhcpd.leases")};
    QVERIFY(QDir{}.mkdir(folder));
    const auto mountWithLeases = [&] {
        if (mount("none", QFile::encodeName(folder).constData(), "tmpfs", 0, nullptr) < 0)
            return false;
        QFile file{path};
        const QByteArray text{leaseBlock(0, 1, 1)};
        return file.open(QIODevice::WriteOnly) && file.write(text) == text.size();
    };
    const auto inodeNumber = [&] {
        FileStatus status{};
        return stat(QFile::encodeName(path).constData(), &status) == 0 ? status.st_ino : 0;
    };
    QVERIFY_NO_PROBLEM(inMountNamespace([&]() -> QString {
        if (!mountWithLeases())
            return QStringLiteral("skip: no tmpfs");
        const ino_t inode{inodeNumber()};
        if (!m_reader.readOn(LeaseFile{path}) || !m_reader.continues(LeaseFile{path}))
            return QStringLiteral("not continued by itself");
        if (!mountWithLeases())
            return QStringLiteral("skip: no second tmpfs");
        if (inodeNumber() != inode)
            return QStringLiteral("skip: the first files of two file systems have different inode numbers");
        return m_reader.continues(LeaseFile{path}) ? QStringLiteral("continued by another") : QString{};
    }));
}

void LeaseReaderTest::noticesChangesInWhatCameInSmallPieces_data()
{
    constexpr int sampleDistance{1 << 20};
    QTest::addColumn<QVector<int>>("sizes"); // of the file each time that it is read
    QTest::addColumn<int>("changed");        // the offset of a byte that is another then
    QTest::addRow("beginning") << QVector<int>{1, 20'000} << 1000;
    QTest::addRow("last compared byte of the beginning") << QVector<int>{1, 2, 4000, 4095, 20'000} << 4095;
    QTest::addRow("last byte of a small file") << QVector<int>{65'535} << 65'534;
    QTest::addRow("middle of a small file") << QVector<int>{300, 60'000} << 30'000;
    QTest::addRow("beginning of a large file") << QVector<int>{1, 65'537, 200'000} << 65'535;
    QTest::addRow("sample") << QVector<int>{sampleDistance, sampleDistance + 10, sampleDistance + 20'000}
                            << sampleDistance + 40;
}

void LeaseReaderTest::noticesChangesInWhatCameInSmallPieces()
{
    QFETCH(const QVector<int>, sizes);
    QFETCH(const int, changed);
    QByteArray text(sizes.last(), '#');
    for (const int size : sizes) {
        writeTestFile(m_path, text.left(size));
        QVERIFY(m_reader.readOn(LeaseFile{m_path}));
        QCOMPARE(m_reader.position(), qint64{size});
    }
    QVERIFY(m_reader.continues(LeaseFile{m_path}));
    text[changed] = '!';
    writeTestFile(m_path, text);
    QVERIFY(!m_reader.continues(LeaseFile{m_path}));
}

QTEST_GUILESS_MAIN(LeaseReaderTest)
#include "tst_leasereader.moc"
