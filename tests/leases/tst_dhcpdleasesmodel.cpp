// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/dhcpdleasesmodel.h"

#include "leases/leaseproxymodel.h"
#include "tests/common/childprocess.h"
#include "tests/leases/irregularleases.h"
#include "tests/leases/referencereader.h"
#include "tests/support/temporaryroot.h"
#include "tests/support/text.h"

#include <QAbstractItemModelTester>
#include <QFile>
#include <QRandomGenerator>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>

#include <cerrno>

#include <sys/stat.h>
#include <sys/syscall.h>

namespace {

/// These change the file in place, so that it is the same file afterwards.
void appendTo(const QString &path, const QByteArray &bytes)
{
    QFile file{path};
    QVERIFY(file.open(QIODevice::WriteOnly | QIODevice::Append));
    QCOMPARE(file.write(bytes), bytes.size());
}

void overwrite(const QString &path, qint64 offset, const QByteArray &bytes)
{
    QFile file{path};
    QVERIFY(file.open(QIODevice::ReadWrite));
    QVERIFY(file.seek(offset));
    QCOMPARE(file.write(bytes), bytes.size());
}

void replace(const QString &path, const QByteArray &bytes)
{
    const QString next{path + text(".new")};
    writeTestFile(next, bytes);
    QVERIFY(QFile::remove(path));
    QVERIFY(QFile::rename(next, path));
}

} // namespace

class DhcpdLeasesModelTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();

    void isATableOfSixColumns();
    void hasHeaders();
    void hasDataOnlyForTextRoles();
    void tellsTheNumbersOfAddresses();
    void isAFlatReadOnlyList();
    void showsFilesOfTheServer_data();
    void showsFilesOfTheServer();
    void reloadsInOneReset();
    void reportsWhatCannotBeRead_data();
    void reportsWhatCannotBeRead();
    void readsAnEmptyFileSilently();
    void readsFilesLargerThanAPiece();

    void updatesWithWhatWasAppended();
    void tellsHowMuchAnUpdateReads();
    void updateTakesBackAnEndThatTurnsOutToBeNone();
    void updateAnnouncesNewAndChangedRows();
    void updateJoinsRows_data();
    void updateJoinsRows();
    void updateAnnouncesMuchAsAReset();
    void updateOfAnUnchangedFileSaysNothing();
    void updateReadsTheWholeOfAnotherFile_data();
    void updateReadsTheWholeOfAnotherFile();
    void updateNoticesAnEditOfTheSameLength_data();
    void updateNoticesAnEditOfTheSameLength();
    void updateReadsEverythingAfterAnError();
    void updateEqualsReload();

private:
    std::unique_ptr<QTemporaryDir> m_folder;
    QString m_path;
};

void DhcpdLeasesModelTest::init()
{
    m_folder = std::make_unique<QTemporaryDir>();
    QVERIFY(m_folder->isValid());
    m_path = m_folder->filePath(text("dhcpd.leases"));
}

void DhcpdLeasesModelTest::isATableOfSixColumns()
{
    DhcpdLeasesModel model;
    QCOMPARE(model.rowCount(), 0);
    QCOMPARE(model.columnCount(), 6);
    writeTestFile(m_path, leaseBlock(0, 10, 1) + leaseBlock(0, 9, 2));
    model.reload(m_path);
    const LeaseRows expected{
        {text("10.0.0.9"), text("00:0c:01:02:03:12"), text("host-2"), text("active"), text("01:05:12 UTC 21 Nov 2026"),
         text("01:15:12 UTC 21 Nov 2026")},
        {text("10.0.0.10"), text("00:0c:01:02:03:11"), text("host-1"), text("free"), text("01:05:11 UTC 21 Nov 2026"),
         text("01:15:11 UTC 21 Nov 2026")},
    };
    QCOMPARE(rowsOf(model), expected);
    QCOMPARE(model.index(0, 2).data(Qt::EditRole).toString(), text("host-2"));
}

void DhcpdLeasesModelTest::hasHeaders()
{
    const DhcpdLeasesModel model;
    const QStringList headers{text("IP address"),    text("MAC address"),  text("Host name"),
                              text("Binding state"), text("Rental start"), text("Rental end")};
    for (int section{0}; section < headers.size(); ++section)
        QCOMPARE(model.headerData(section, Qt::Horizontal), QVariant{headers[section]});
    QVERIFY(!model.headerData(-1, Qt::Horizontal).isValid());
    QVERIFY(!model.headerData(6, Qt::Horizontal).isValid());
    QCOMPARE(model.headerData(0, Qt::Vertical), QVariant{0});
    QCOMPARE(model.headerData(41, Qt::Vertical), QVariant{41});
    for (const int role : {Qt::EditRole, Qt::DecorationRole, Qt::ToolTipRole, Qt::TextAlignmentRole}) {
        QVERIFY(!model.headerData(0, Qt::Horizontal, role).isValid());
        QVERIFY(!model.headerData(0, Qt::Vertical, role).isValid());
    }
}

void DhcpdLeasesModelTest::hasDataOnlyForTextRoles()
{
    DhcpdLeasesModel model;
    writeTestFile(m_path, leaseBlock(0, 1, 1));
    model.reload(m_path);
    const QModelIndex index{model.index(0, 0)};
    QVERIFY(index.isValid());
    QCOMPARE(model.data(index, Qt::DisplayRole).toString(), text("10.0.0.1"));
    QCOMPARE(model.data(index, Qt::EditRole).toString(), text("10.0.0.1"));
    for (const int role : {Qt::DecorationRole, Qt::ToolTipRole, Qt::CheckStateRole, Qt::UserRole})
        QVERIFY(!model.data(index, role).isValid());
    QVERIFY(!model.data({}, Qt::DisplayRole).isValid());
    QVERIFY(!model.index(1, 0).isValid());
    QVERIFY(!model.index(0, 6).isValid());
    QVERIFY(QFile::remove(m_path));
    model.reload(m_path);
    QVERIFY(!model.data(index, Qt::DisplayRole).isValid()); // an index of a row that has gone
}

/// By which the rows are ordered, also where the address is shown in another way or not at all.
void DhcpdLeasesModelTest::tellsTheNumbersOfAddresses()
{
    DhcpdLeasesModel model;
    LeaseProxyModel proxy;
    proxy.setSourceModel(&model);
    writeTestFile(m_path, "lease 10.0.0.10 {\n}\nlease 10.0.0.9 {\n}\nlease 255.255.255.255 {\n}\n"
                          "lease ::ffff:10.0.0.11 {\n}\nlease 2001:db8::1 {\n}\n");
    model.reload(m_path);
    const QVector<quint32> numbers{0, 0x0A000009, 0x0A00000A, 0x0A00000B, 0xFFFFFFFF};
    QCOMPARE(model.rowCount(), numbers.size());
    for (int row{0}; row < numbers.size(); ++row) {
        for (int column{0}; column < model.columnCount(); ++column) {
            QCOMPARE(model.index(row, column).data(DhcpdLeasesModel::AddressRole), QVariant{numbers[row]});
            QCOMPARE(proxy.index(row, column).data(DhcpdLeasesModel::AddressRole), QVariant{numbers[row]});
        }
    }
    QVERIFY(!model.data({}, DhcpdLeasesModel::AddressRole).isValid());
}

void DhcpdLeasesModelTest::isAFlatReadOnlyList()
{
    DhcpdLeasesModel model;
    const QAbstractItemModelTester tester{&model, QAbstractItemModelTester::FailureReportingMode::QtTest};
    writeTestFile(m_path, leaseBlock(0, 1, 1));
    model.reload(m_path);
    const QAbstractItemModel &asModel{model};
    QVERIFY(!asModel.hasChildren(model.index(0, 0)));
    QCOMPARE(model.rowCount(model.index(0, 0)), 0);
    QCOMPARE(model.flags(model.index(0, 1)), Qt::ItemIsSelectable | Qt::ItemIsEnabled | Qt::ItemNeverHasChildren);
    QVERIFY(!model.setData(model.index(0, 0), text("x")));
    QVERIFY(!asModel.parent(model.index(0, 0)).isValid());
    QCOMPARE(model.match(model.index(0, 5), Qt::DisplayRole, text("nov"), -1, Qt::MatchContains | Qt::MatchRecursive),
             QModelIndexList{model.index(0, 5)});
}

void DhcpdLeasesModelTest::showsFilesOfTheServer_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<LeaseRows>("rows");
    QTest::addRow("a server of its own") << text("data/plain.leases")
                                         << LeaseRows{
                                                {text("10.9.1.8"), text("00:0c:01:02:03:0d"), text(""), text("active"),
                                                 text("01:05:31 UTC 21 Nov 2026"), text("01:15:31 UTC 21 Nov 2026")},
                                                {text("10.9.1.20"), text("00:0c:01:02:03:0c"), text("a;b{c}"),
                                                 text("free"), text("01:05:40 UTC 21 Nov 2026"),
                                                 text("01:06:00 UTC 21 Nov 2026")},
                                                {text("10.9.1.21"), text("00:0c:01:02:03:7b"), text("with space"),
                                                 text("active"), text("01:05:30 UTC 21 Nov 2026"),
                                                 text("01:15:30 UTC 21 Nov 2026")},
                                            };
    QTest::addRow("one of a pair") << text("data/failover.leases")
                                   << LeaseRows{
                                          {text(""), text(""), text(""), text(""), text(""), text("")},
                                          {text("10.0.0.64"), text("b8:8d:12:56:2b:05"), text(""), text("backup"),
                                           text("18:39:57 UTC 16 Mar 2012"), text("")},
                                          {text("10.0.0.129"), text("3c:07:54:18:03:15"), text(""), text("free"),
                                           text("18:44:35 UTC 16 Mar 2012"), text("18:43:41 UTC 16 Mar 2012")},
                                      };
    QTest::addRow("hosts added at run time") << text("data/hosts.leases")
                                             << LeaseRows{
                                                    {text(""), text("10:10:10:10:10:10"), text(""), text("active"),
                                                     text("10:08:29 UTC 12 Jul 2014"), text("")},
                                                    {text("192.168.122.2"), text("00:aa:bb:cc:dd:ee"), text(""),
                                                     text("active"), text("10:08:29 UTC 12 Jul 2014"), text("")},
                                                };
}

void DhcpdLeasesModelTest::showsFilesOfTheServer()
{
    QFETCH(const QString, file);
    QFETCH(const LeaseRows, rows);
    DhcpdLeasesModel model;
    QSignalSpy errors{&model, &DhcpdLeasesModel::error};
    model.reload(file);
    QCOMPARE(errors.size(), 0);
    QCOMPARE(rowsOf(model), rows);
}

void DhcpdLeasesModelTest::reloadsInOneReset()
{
    DhcpdLeasesModel model;
    const QSignalSpy aboutToReset{&model, &QAbstractItemModel::modelAboutToBeReset};
    const QSignalSpy reset{&model, &QAbstractItemModel::modelReset};
    const QSignalSpy inserted{&model, &QAbstractItemModel::rowsInserted};
    const QSignalSpy changed{&model, &QAbstractItemModel::dataChanged};
    int rowsAtReset{-1};
    connect(&model, &QAbstractItemModel::modelReset, this, [&] { rowsAtReset = model.rowCount(); });
    writeTestFile(m_path, leaseBlock(0, 1, 1) + leaseBlock(0, 2, 1));
    model.reload(m_path);
    QCOMPARE(aboutToReset.size(), 1);
    QCOMPARE(reset.size(), 1);
    QCOMPARE(rowsAtReset, 2);
    replace(m_path, leaseBlock(0, 3, 1));
    model.reload(m_path);
    QCOMPARE(aboutToReset.size(), 2);
    QCOMPARE(reset.size(), 2);
    QCOMPARE(rowsAtReset, 1);
    QCOMPARE(model.index(0, 0).data().toString(), text("10.0.0.3"));
    QCOMPARE(inserted.size() + changed.size(), 0);
}

void DhcpdLeasesModelTest::reportsWhatCannotBeRead_data()
{
    QTest::addColumn<QString>("kind");
    for (const char *kind : {"missing", "directory", "pipe", "dangling link", "empty path"})
        QTest::addRow("%s", kind) << text(kind);
}

void DhcpdLeasesModelTest::reportsWhatCannotBeRead()
{
    QFETCH(const QString, kind);
    DhcpdLeasesModel model;
    QSignalSpy errors{&model, &DhcpdLeasesModel::error};
    const QSignalSpy resets{&model, &QAbstractItemModel::modelReset};
    writeTestFile(m_path, leaseBlock(0, 1, 1));
    model.reload(m_path);
    QCOMPARE(model.rowCount(), 1);

    QString path{m_folder->filePath(text("other"))};
    if (kind == text("directory"))
        path = m_folder->path();
    else if (kind == text("pipe"))
        QCOMPARE(::mkfifo(QFile::encodeName(path).constData(), 0600), 0);
    else if (kind == text("dangling link"))
        QVERIFY(QFile::link(m_folder->filePath(text("nothing")), path));
    else if (kind == text("empty path"))
        path.clear();
    model.reload(path);
    QCOMPARE(model.rowCount(), 0);
    QCOMPARE(resets.size(), 2);
    QCOMPARE(errors.size(), 1);
    QCOMPARE(errors.takeFirst().value(0).toString(), text("Unable to open file '%1' for read").arg(path));
    model.update(path);
    QCOMPARE(model.rowCount(), 0);
    QCOMPARE(errors.size(), 1);
    model.update(m_path);
    QCOMPARE(model.rowCount(), 1);
    QCOMPARE(errors.size(), 1);
}

void DhcpdLeasesModelTest::readsAnEmptyFileSilently()
{
    DhcpdLeasesModel model;
    const QSignalSpy errors{&model, &DhcpdLeasesModel::error};
    writeTestFile(m_path, {});
    model.reload(m_path);
    QCOMPARE(model.rowCount(), 0);
    QCOMPARE(errors.size(), 0);
    appendTo(m_path, leaseBlock(0, 1, 1));
    model.update(m_path);
    QCOMPARE(model.rowCount(), 1);
    QCOMPARE(errors.size(), 0);
}

void DhcpdLeasesModelTest::readsFilesLargerThanAPiece()
{
    QByteArray file;
    for (int i{0}; file.size() < 1'500'000; ++i)
        file += leaseBlock(i % 7, i % 251, i);
    file += "# " + QByteArray(600'000, 'x') + "\n" + leaseBlock(9, 9, 9);
    writeTestFile(m_path, file);
    DhcpdLeasesModel model;
    model.reload(m_path);
    QCOMPARE(model.rowCount(), 7 * 251 + 1);
    QCOMPARE(rowsOf(model), referenceRows(file));
}

void DhcpdLeasesModelTest::updatesWithWhatWasAppended()
{
    DhcpdLeasesModel model;
    const QSignalSpy resets{&model, &QAbstractItemModel::modelReset};
    QByteArray file{leaseBlock(0, 1, 1) + leaseBlock(0, 2, 2)};
    writeTestFile(m_path, file);
    model.reload(m_path);
    const QByteArray block{leaseBlock(0, 3, 3)};
    for (const char byte : block) { // as if the server wrote it byte by byte
        const QByteArray written{1, byte};
        file += written;
        appendTo(m_path, written);
        model.update(m_path);
        QCOMPARE(rowsOf(model), referenceRows(file));
    }
    QCOMPARE(model.rowCount(), 3);
    // Only when the brace that ended the block stood without its line feed it could still have become another line.
    QCOMPARE(resets.size(), 2);
}

void DhcpdLeasesModelTest::tellsHowMuchAnUpdateReads()
{
    DhcpdLeasesModel model;
    const QByteArray block{leaseBlock(0, 1, 1)};
    writeTestFile(m_path, block);
    QCOMPARE(model.bytesToRead(m_path), qint64{block.size()});
    model.reload(m_path);
    QCOMPARE(model.bytesToRead(m_path), qint64{0});
    const QByteArray more{leaseBlock(0, 2, 2)};
    appendTo(m_path, more);
    QCOMPARE(model.bytesToRead(m_path), qint64{more.size()});
    const QByteArray anew{leaseBlock(0, 3, 3) + leaseBlock(0, 4, 4) + leaseBlock(0, 5, 5)};
    writeTestFile(m_path, anew);
    QCOMPARE(model.bytesToRead(m_path), qint64{anew.size()});
    QVERIFY(QFile::remove(m_path));
    QCOMPARE(model.bytesToRead(m_path), qint64{0});
}

void DhcpdLeasesModelTest::updateTakesBackAnEndThatTurnsOutToBeNone()
{
    DhcpdLeasesModel model;
    writeTestFile(m_path, "lease 10.0.0.1 {\n}");
    model.reload(m_path);
    QCOMPARE(model.rowCount(), 1);
    appendTo(m_path, " 10.0.0.2 {\n");
    model.update(m_path);
    QCOMPARE(model.rowCount(), 0);
    appendTo(m_path, "}\n");
    model.update(m_path);
    QCOMPARE(model.rowCount(), 1);
    QCOMPARE(model.index(0, 0).data().toString(), text("10.0.0.2"));
}

void DhcpdLeasesModelTest::updateAnnouncesNewAndChangedRows()
{
    DhcpdLeasesModel model;
    const QAbstractItemModelTester tester{&model, QAbstractItemModelTester::FailureReportingMode::QtTest};
    writeTestFile(m_path, leaseBlock(0, 1, 1) + leaseBlock(0, 5, 2));
    model.reload(m_path);
    const QPersistentModelIndex last{model.index(1, 0)};
    const QSignalSpy resets{&model, &QAbstractItemModel::modelReset};
    QSignalSpy inserted{&model, &QAbstractItemModel::rowsInserted};
    QSignalSpy changed{&model, &QAbstractItemModel::dataChanged};
    connect(&model, &QAbstractItemModel::dataChanged, this, [&](const QModelIndex &first, const QModelIndex &end) {
        QCOMPARE(first, model.index(1, 0)); // nothing has come yet
        QCOMPARE(end, model.index(1, 5));
        QCOMPARE(model.rowCount(), 2);
    });

    appendTo(m_path, leaseBlock(0, 3, 3) + leaseBlock(0, 5, 4) + leaseBlock(0, 3, 5) + leaseBlock(0, 9, 6));
    model.update(m_path);
    QCOMPARE(resets.size(), 0);
    QCOMPARE(inserted.size(), 2);
    QCOMPARE(inserted[0].mid(1), (QVariantList{1, 1}));
    QCOMPARE(inserted[1].mid(1), (QVariantList{3, 3}));
    QCOMPARE(changed.size(), 1);
    QCOMPARE(last.row(), 2);
    QCOMPARE(last.data().toString(), text("10.0.0.5"));
    QCOMPARE(model.index(2, 2).data().toString(), text("host-4"));
    QCOMPARE(model.index(1, 2).data().toString(), text("host-5"));
    QCOMPARE(rowsOf(model), referenceRows(readTestFile(m_path)));
}

void DhcpdLeasesModelTest::updateJoinsRows_data()
{
    QTest::addColumn<QVector<int>>("octets");
    QTest::addColumn<QString>("changed");
    QTest::addColumn<QString>("inserted");

    // The leases before have the even octets from 100 to 198, in the rows from 0 to 49.
    const auto row = [](const char *name, const QVector<int> &octets, const char *changed, const char *inserted) {
        QTest::addRow("%s", name) << octets << text(changed) << text(inserted);
    };
    row("neighbours", {104, 100, 102}, "0-2 ", "");
    row("a small gap", {100, 116}, "0-8 ", "");
    row("a wide gap", {118, 100}, "0-0 9-9 ", "");
    row("new ones in one place", {3, 1, 2, 1}, "", "0-2 ");
    row("new ones at both ends", {200, 99, 201}, "", "0-0 51-52 ");
    row("new ones around an old one", {103, 101}, "", "1-1 3-3 ");
    row("both", {101, 198, 102, 199, 200}, "1-1 49-49 ", "1-1 51-52 ");
    row("the most ranges", {101, 103, 105, 107, 109, 111, 113, 115}, "", "1-1 3-3 5-5 7-7 9-9 11-11 13-13 15-15 ");
    row("too many ranges", {101, 103, 105, 107, 109, 111, 113, 115, 117, 198}, "49-49 ", "reset ");
}

void DhcpdLeasesModelTest::updateJoinsRows()
{
    QFETCH(const QVector<int>, octets);
    QFETCH(const QString, changed);
    QFETCH(const QString, inserted);
    DhcpdLeasesModel model;
    const QAbstractItemModelTester tester{&model, QAbstractItemModelTester::FailureReportingMode::QtTest};
    QByteArray file;
    for (int octet{100}; octet < 200; octet += 2)
        file += leaseBlock(0, octet, octet);
    writeTestFile(m_path, file);
    model.reload(m_path);

    QString announced;
    const auto note = [&announced](int first, int last) { announced += QStringLiteral("%1-%2 ").arg(first).arg(last); };
    connect(&model, &QAbstractItemModel::dataChanged, this,
            [&](const QModelIndex &first, const QModelIndex &last) { note(first.row(), last.row()); });
    connect(&model, &QAbstractItemModel::rowsInserted, this,
            [&](const QModelIndex & /*parent*/, int first, int last) { note(first, last); });
    connect(&model, &QAbstractItemModel::modelReset, this, [&] { announced += QLatin1String{"reset "}; });
    QByteArray more;
    for (int i{0}; i < octets.size(); ++i)
        more += leaseBlock(0, octets[i], 1000 + i);
    appendTo(m_path, more);
    model.update(m_path);
    QCOMPARE(announced, changed + inserted);
    QCOMPARE(rowsOf(model), referenceRows(file + more));
}

void DhcpdLeasesModelTest::updateAnnouncesMuchAsAReset()
{
    DhcpdLeasesModel model;
    QByteArray blocks;
    for (int i{0}; i < 200; ++i)
        blocks += leaseBlock(i % 2, i, i);
    writeTestFile(m_path, blocks);
    model.reload(m_path);
    const QSignalSpy resets{&model, &QAbstractItemModel::modelReset};
    const QSignalSpy inserted{&model, &QAbstractItemModel::rowsInserted};
    const QSignalSpy changed{&model, &QAbstractItemModel::dataChanged};
    QByteArray more{"# " + QByteArray(1 << 20, 'x') + "\n"};
    for (int i{0}; i < 200; ++i)
        more += leaseBlock(i % 3, i, 2 * i);
    appendTo(m_path, more);
    model.update(m_path);
    QCOMPARE(resets.size(), 1);
    QCOMPARE(inserted.size() + changed.size(), 0);
    QCOMPARE(rowsOf(model), referenceRows(blocks + more));
}

void DhcpdLeasesModelTest::updateOfAnUnchangedFileSaysNothing()
{
    DhcpdLeasesModel model;
    writeTestFile(m_path, leaseBlock(0, 1, 1));
    model.reload(m_path);
    const QSignalSpy resets{&model, &QAbstractItemModel::modelReset};
    const QSignalSpy changed{&model, &QAbstractItemModel::dataChanged};
    model.update(m_path);
    QCOMPARE(resets.size() + changed.size(), 0);
    QCOMPARE(model.rowCount(), 1);
}

void DhcpdLeasesModelTest::updateReadsTheWholeOfAnotherFile_data()
{
    QTest::addColumn<QString>("change");
    for (const char *change : {"replaced", "shorter", "other head", "other end", "other sample"})
        QTest::addRow("%s", change) << text(change);
}

void DhcpdLeasesModelTest::updateReadsTheWholeOfAnotherFile()
{
    QFETCH(const QString, change);
    QByteArray file;
    while (file.size() < 3'000'000)
        file += leaseBlock(0, 1, 1) + "# " + QByteArray(100'000, 'x') + "\n";
    file += leaseBlock(0, 2, 2);
    writeTestFile(m_path, file);
    DhcpdLeasesModel model;
    model.reload(m_path);
    QCOMPARE(model.rowCount(), 2);
    const QSignalSpy resets{&model, &QAbstractItemModel::modelReset};
    const QSignalSpy inserted{&model, &QAbstractItemModel::rowsInserted};

    if (change == text("replaced"))
        replace(m_path, file + leaseBlock(0, 3, 3));
    else if (change == text("shorter"))
        QVERIFY(QFile::resize(m_path, file.size() - 1));
    else if (change == text("other head"))
        overwrite(m_path, 100, "X");
    else if (change == text("other end"))
        overwrite(m_path, file.size() - 100, "X");
    else
        overwrite(m_path, 2 << 20, "XXXX");
    model.update(m_path);
    QCOMPARE(resets.size(), 1);
    QCOMPARE(inserted.size(), 0);
    QCOMPARE(rowsOf(model), referenceRows(readTestFile(m_path)));
}

void DhcpdLeasesModelTest::updateNoticesAnEditOfTheSameLength_data()
{
    QTest::addColumn<int>("lease");
    for (const int lease : {1, 60, 120, 180, 199})
        QTest::addRow("lease %d of 200", lease) << lease;
}

/// In a file of the size that most servers have: some 50 KiB.
void DhcpdLeasesModelTest::updateNoticesAnEditOfTheSameLength()
{
    QFETCH(const int, lease);
    QByteArray file;
    for (int i{0}; i < 200; ++i)
        file += leaseBlock(0, i, i % 7);
    QVERIFY(file.size() > 40'000 && file.size() < 60'000);
    writeTestFile(m_path, file);
    DhcpdLeasesModel model;
    model.reload(m_path);
    QCOMPARE(model.rowCount(), 200);

    const QByteArray::size_type block{file.indexOf(leaseBlock(0, lease, lease % 7))};
    const QByteArray::size_type mac{file.indexOf("hardware ethernet ", block) + int{sizeof "hardware ethernet"}};
    overwrite(m_path, mac, "ab:cd:ef");
    model.update(m_path);
    QVERIFY(model.index(lease, DhcpdLeasesModel::Mac).data().toString().startsWith(text("ab:cd:ef")));
    QCOMPARE(rowsOf(model), referenceRows(readTestFile(m_path)));
}

/// Each reading of a piece of the file fails once; in the end all of them fail.
void DhcpdLeasesModelTest::updateReadsEverythingAfterAnError()
{
    DhcpdLeasesModel model;
    writeTestFile(m_path, leaseBlock(0, 1, 1));
    model.reload(m_path);
    appendTo(m_path, leaseBlock(0, 2, 2));
    const auto outcomeOfUpdate = [&](const supervisor::Policy &policy) {
        const auto update = [&] {
            const QSignalSpy errors{&model, &DhcpdLeasesModel::error};
            model.update(m_path);
            return model.rowCount() * 10 + errors.size();
        };
        return supervisor::run(update, policy);
    };

    int readings{0};
    const supervisor::Outcome undisturbed{outcomeOfUpdate([&readings](int call, int) {
        readings += call == SYS_pread64 ? 1 : 0;
        return supervisor::proceed;
    })};
    if (!undisturbed.unsupported.isEmpty())
        QSKIP(qPrintable(undisturbed.unsupported));
    QCOMPARE(undisturbed.result, 20);
    QVERIFY(readings > 2);

    for (int failing{0}; failing < readings; ++failing) {
        int reading{0};
        const supervisor::Outcome failedOnce{outcomeOfUpdate(
            [&](int call, int) { return call == SYS_pread64 && reading++ == failing ? EIO : supervisor::proceed; })};
        QCOMPARE(failedOnce.result, 20);
    }
    const supervisor::Outcome failed{
        outcomeOfUpdate([](int call, int) { return call == SYS_pread64 ? EIO : supervisor::proceed; })};
    QCOMPARE(failed.result, 1);
}

/// Whatever happens to the file between two updates, the model shows what reading all of it would.
void DhcpdLeasesModelTest::updateEqualsReload()
{
    QRandomGenerator random{5};
    DhcpdLeasesModel model;
    const QAbstractItemModelTester tester{&model, QAbstractItemModelTester::FailureReportingMode::QtTest};
    const QSignalSpy resets{&model, &QAbstractItemModel::modelReset};
    writeTestFile(m_path, leaseBlock(0, 1, 1));
    constexpr int steps{1500};
    for (int step{0}; step < steps; ++step) {
        const QByteArray bytes{random.bounded(2) == 0 ? irregularLeaseFile(random)
                                                      : leaseBlock(random.bounded(2), random.bounded(20), step)};
        switch (random.bounded(12)) {
        case 0:
            replace(m_path, bytes);
            break;
        case 1:
            QVERIFY(QFile::resize(m_path, random.bounded(readTestFile(m_path).size() + 1)));
            break;
        case 2:
            writeTestFile(m_path, bytes); // truncated and written anew
            break;
        case 3: // while nobody looks, truncated and written beyond where it was
            writeTestFile(m_path, irregularLeaseFile(random) + readTestFile(m_path) + bytes);
            break;
        case 4:
        case 5: // not at the end of a line
            appendTo(m_path, bytes.left(random.bounded(bytes.size() + 1)));
            break;
        default:
            appendTo(m_path, bytes);
        }
        model.update(m_path);
        const QByteArray file{readTestFile(m_path)};
        QVERIFY2(rowsOf(model) == referenceRows(file), file.constData());
    }
    QVERIFY(resets.size() < steps * 3 / 4);
}

QTEST_GUILESS_MAIN(DhcpdLeasesModelTest)
#include "tst_dhcpdleasesmodel.moc"
