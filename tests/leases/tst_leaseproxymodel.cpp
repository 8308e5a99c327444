// SPDX-License-Identifier: GPL-3.0-or-later
#include "leases/leaseproxymodel.h"

#include "leases/dhcpdleasesmodel.h"
#include "tests/leases/irregularleases.h"
#include "tests/leases/referencereader.h"
#include "tests/leases/variedleases.h"
#include "tests/support/temporaryroot.h"
#include "tests/support/text.h"

#include <QAbstractItemModelTester>
#include <QFile>
#include <QRandomGenerator>
#include <QSignalSpy>
#include <QStandardItemModel>
#include <QTemporaryDir>
#include <QTest>

namespace {

/// Qt's own filter, for comparison.
class StockFilter final : public QSortFilterProxyModel
{
public:
    explicit StockFilter(QAbstractItemModel *model)
    {
        setSourceModel(model);
        setFilterKeyColumn(-1);
    }
};

void appendTo(const QString &path, const QByteArray &bytes)
{
    QFile file{path};
    QVERIFY(file.open(QIODevice::WriteOnly | QIODevice::Append));
    QCOMPARE(file.write(bytes), bytes.size());
}

} // namespace

class LeaseProxyModelTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void filtersAsQtDoes();
    void filtersInOneReset();
    void sameTextChangesNothing();
    void persistentIndexesDoNotOutliveAFilter();
    void respectsTheBaseFilter();
    void matchesAsQtDoes();
    void matchesInAFilteredTableAsQtDoes();
    void matchesInASortedTableAsQtDoes();
    void matchesOtherwiseAsQtDoes();
    void followsUpdates_data();
    void followsUpdates();
    void findsTextsThatAreNew();
    void followsReloads();
    void followsAnotherModel();
    void outlivesItsModel();
    void filtersOtherModels();

private:
    void load(const QByteArray &bytes);
    void compareMatches(QRandomGenerator &random, const QString &wanted);

    std::unique_ptr<QTemporaryDir> m_folder;
    QString m_path;
    std::unique_ptr<DhcpdLeasesModel> m_model;
    std::unique_ptr<LeaseProxyModel> m_proxy;
};

void LeaseProxyModelTest::init()
{
    m_folder = std::make_unique<QTemporaryDir>();
    m_path = m_folder->filePath(text("dhcpd.leases"));
    m_model = std::make_unique<DhcpdLeasesModel>();
    m_proxy = std::make_unique<LeaseProxyModel>();
    m_proxy->setSourceModel(m_model.get());
}

void LeaseProxyModelTest::cleanup()
{
    m_proxy.reset();
    m_model.reset();
}

void LeaseProxyModelTest::load(const QByteArray &bytes)
{
    writeTestFile(m_path, bytes);
    m_model->reload(m_path);
}

void LeaseProxyModelTest::filtersAsQtDoes()
{
    QRandomGenerator random{1};
    load(variedLeaseFile(random, 120));
    const QAbstractItemModelTester tester{m_proxy.get()};
    StockFilter stock{m_model.get()};
    for (const QString &wanted : searchTexts(random, *m_model, 250)) {
        m_proxy->setFilterFixedString(wanted);
        stock.setFilterFixedString(wanted);
        // Qt 6 makes a pattern of the text. Half of a character makes that invalid, and then it finds nothing.
        if (stock.filterRegularExpression().isValid())
            QCOMPARE(rowsOf(*m_proxy), rowsOf(stock));
    }
    m_proxy->setFilterFixedString({});
    QCOMPARE(rowsOf(*m_proxy), rowsOf(*m_model));
}

void LeaseProxyModelTest::filtersInOneReset()
{
    load(leaseBlock(0, 1, 0) + leaseBlock(0, 2, 1) + leaseBlock(0, 3, 2));
    QCOMPARE(m_proxy->rowCount(), 3);
    const QSignalSpy aboutToReset{m_proxy.get(), &QAbstractItemModel::modelAboutToBeReset};
    const QSignalSpy reset{m_proxy.get(), &QAbstractItemModel::modelReset};
    const QSignalSpy removed{m_proxy.get(), &QAbstractItemModel::rowsRemoved};
    const QSignalSpy inserted{m_proxy.get(), &QAbstractItemModel::rowsInserted};
    int layouts{0};
    connect(m_proxy.get(), &QAbstractItemModel::layoutChanged, this, [&layouts] { ++layouts; });
    int resets{0};
    for (const auto &[wanted, rows] : {std::pair{"active", 2}, {"host-1", 1}, {"nothing", 0}, {"", 3}}) {
        m_proxy->setFilterFixedString(text(wanted));
        QCOMPARE(m_proxy->rowCount(), rows);
        QCOMPARE(aboutToReset.count(), ++resets);
        QCOMPARE(reset.count(), resets);
    }
    QVERIFY(removed.isEmpty() && inserted.isEmpty());
    QCOMPARE(layouts, 0);
}

void LeaseProxyModelTest::sameTextChangesNothing()
{
    load(leaseBlock(0, 1, 0));
    const QSignalSpy reset{m_proxy.get(), &QAbstractItemModel::modelReset};
    m_proxy->setFilterFixedString(text(""));
    QCOMPARE(reset.count(), 0);
    m_proxy->setFilterFixedString(text("free"));
    m_proxy->setFilterFixedString(text("free"));
    QCOMPARE(reset.count(), 1);
}

void LeaseProxyModelTest::persistentIndexesDoNotOutliveAFilter()
{
    load(leaseBlock(0, 1, 0) + leaseBlock(0, 2, 1));
    const QPersistentModelIndex index{m_proxy->index(1, 2)};
    QVERIFY(index.isValid());
    m_proxy->setFilterFixedString(text("free"));
    QVERIFY(!index.isValid());
    QCOMPARE(m_proxy->index(0, 2).data().toString(), text("host-1"));
}

void LeaseProxyModelTest::respectsTheBaseFilter()
{
    QRandomGenerator random{2};
    load(variedLeaseFile(random, 60));
    QSortFilterProxyModel *base{m_proxy.get()};
    base->setFilterKeyColumn(-1);
    StockFilter stock{m_model.get()};
    for (const char *wanted : {"1", "free", "", "active", "7"}) {
        base->setFilterFixedString(text(wanted));
        stock.setFilterFixedString(text(wanted));
        QCOMPARE(rowsOf(*m_proxy), rowsOf(stock));
    }
    // As a view does, which asks for the rows as soon as it is told of a reset.
    connect(m_proxy.get(), &QAbstractItemModel::modelReset, this, [this] { m_proxy->rowCount(); });
    StockFilter both{&stock};
    both.setFilterFixedString(text("e"));
    m_proxy->setFilterFixedString(text("e"));
    QCOMPARE(rowsOf(*m_proxy), rowsOf(both));
    m_proxy->setFilterFixedString({});
    QCOMPARE(rowsOf(*m_proxy), rowsOf(stock));
    base->setFilterRegularExpression(text("^00:0c:[1-8]"));
    stock.setFilterRegularExpression(text("^00:0c:[1-8]"));
    m_proxy->setFilterFixedString(text("e"));
    QVERIFY(both.rowCount() > 0 && both.rowCount() < m_model->rowCount());
    QCOMPARE(rowsOf(*m_proxy), rowsOf(both));
    QCOMPARE(
        m_proxy->match(m_proxy->index(0, 0), Qt::DisplayRole, text("1"), -1, Qt::MatchContains),
        m_proxy->QSortFilterProxyModel::match(m_proxy->index(0, 0), Qt::DisplayRole, text("1"), -1, Qt::MatchContains));
    m_proxy->setFilterFixedString({});
    QCOMPARE(rowsOf(*m_proxy), rowsOf(stock));
}

/// Compares what match() finds with what Qt's own finds, from random places on.
void LeaseProxyModelTest::compareMatches(QRandomGenerator &random, const QString &wanted)
{
    const Qt::MatchFlags contains{Qt::MatchContains};
    for (const Qt::MatchFlags flags :
         {contains, contains | Qt::MatchRecursive, contains | Qt::MatchWrap, contains | Qt::MatchCaseSensitive,
          contains | Qt::MatchRecursive | Qt::MatchWrap | Qt::MatchCaseSensitive}) {
        for (const int hits : {-1, 1, random.bounded(2, 30)}) {
            const QModelIndex start{m_proxy->index(random.bounded(4) == 0 ? 0 : random.bounded(m_model->rowCount()),
                                                   random.bounded(m_model->columnCount()))};
            QCOMPARE(m_proxy->match(start, Qt::DisplayRole, wanted, hits, flags),
                     m_proxy->QSortFilterProxyModel::match(start, Qt::DisplayRole, wanted, hits, flags));
        }
    }
}

void LeaseProxyModelTest::matchesAsQtDoes()
{
    QRandomGenerator random{3};
    load(variedLeaseFile(random, 100));
    for (const QString &wanted : searchTexts(random, *m_model, 250))
        compareMatches(random, wanted);
}

void LeaseProxyModelTest::matchesInAFilteredTableAsQtDoes()
{
    QRandomGenerator random{4};
    load(variedLeaseFile(random, 100));
    for (const QString &wanted : searchTexts(random, *m_model, 250)) {
        m_proxy->setFilterFixedString(wanted.left(1));
        compareMatches(random, wanted);
        m_proxy->setFilterFixedString(wanted);
        compareMatches(random, wanted);
    }
}

void LeaseProxyModelTest::matchesInASortedTableAsQtDoes()
{
    QRandomGenerator random{5};
    load(variedLeaseFile(random, 60));
    m_proxy->sort(DhcpdLeasesModel::HostName, Qt::DescendingOrder);
    for (const QString &wanted : searchTexts(random, *m_model, 80))
        compareMatches(random, wanted);
    m_proxy->sort(-1);
    compareMatches(random, text("1"));
}

void LeaseProxyModelTest::matchesOtherwiseAsQtDoes()
{
    QRandomGenerator random{6};
    load(variedLeaseFile(random, 60));
    const QModelIndex first{m_proxy->index(0, DhcpdLeasesModel::State)};
    const auto compare = [this](const QModelIndex &start, int role, const QVariant &value, int hits,
                                Qt::MatchFlags flags) {
        const QModelIndexList expected{m_proxy->QSortFilterProxyModel::match(start, role, value, hits, flags)};
        QCOMPARE(m_proxy->match(start, role, value, hits, flags), expected);
        return;
    };
    const Qt::MatchFlags contains{Qt::MatchContains};
    for (const char *wanted : {"", "a", "active"}) {
        compare({}, Qt::DisplayRole, text(wanted), -1, contains);
        compare({}, Qt::DisplayRole, text(wanted), 1, contains | Qt::MatchRecursive | Qt::MatchWrap);
        compare(first, Qt::EditRole, text(wanted), -1, contains);
        compare(first, Qt::UserRole, text(wanted), -1, contains);
        compare(first, Qt::DisplayRole, text(wanted), 0, contains);
        compare(first, Qt::DisplayRole, text(wanted), -2, contains);
        compare(first, Qt::DisplayRole, text(wanted), -1, Qt::MatchStartsWith);
        compare(first, Qt::DisplayRole, text(wanted), -1, Qt::MatchEndsWith | Qt::MatchWrap);
        compare(first, Qt::DisplayRole, text(wanted), -1, Qt::MatchExactly);
        compare(first, Qt::DisplayRole, text(wanted), -1, Qt::MatchFixedString);
        compare(first, Qt::DisplayRole, text(wanted), -1, Qt::MatchRegularExpression);
    }
    compare(first, Qt::DisplayRole, 1, -1, contains);
    QVERIFY(!m_proxy->match(first, Qt::DisplayRole, text("ACTIVE"), -1, contains).isEmpty());
    QVERIFY(m_proxy->match(first, Qt::DisplayRole, text("ACTIVE"), -1, contains | Qt::MatchCaseSensitive).isEmpty());
}

void LeaseProxyModelTest::followsUpdates_data()
{
    QTest::addColumn<QString>("wanted");
    for (const char *wanted : {"", "active", "host-1", "10.0.1", "12 U", "nothing"})
        QTest::addRow("'%s'", wanted) << text(wanted);
}

/// Leases that are added, and others that no longer match, or do from now on.
void LeaseProxyModelTest::followsUpdates()
{
    QFETCH(const QString, wanted);
    QRandomGenerator random{7};
    load(leaseBlock(0, 1, 1) + leaseBlock(1, 2, 2));
    StockFilter stock{m_model.get()};
    const QAbstractItemModelTester tester{m_proxy.get()};
    stock.setFilterFixedString(wanted);
    m_proxy->setFilterFixedString(wanted);
    for (int i{0}; i < 150; ++i) {
        const int version{random.bounded(30) + i};
        const QString newName{QStringLiteral("host-%1").arg(version)};
        // The update must forget whatever is remembered of this.
        if (random.bounded(2) == 0) {
            m_proxy->setFilterFixedString({});
            m_proxy->setFilterFixedString(wanted);
        }
        compareMatches(random, newName);
        appendTo(m_path, leaseBlock(random.bounded(3), random.bounded(12), version));
        const QSignalSpy reset{m_proxy.get(), &QAbstractItemModel::modelReset};
        m_model->update(m_path);
        QCOMPARE(reset.count(), 0);
        QCOMPARE(rowsOf(*m_proxy), rowsOf(stock));
        compareMatches(random, newName);
        compareMatches(random, text("1"));
    }
}

/// A text that only the newest lease has, looked for before and after that came.
void LeaseProxyModelTest::findsTextsThatAreNew()
{
    load(leaseBlock(0, 1, 1));
    const auto found = [this] {
        return m_proxy
            ->match(m_proxy->index(0, DhcpdLeasesModel::HostName), Qt::DisplayRole, text("laptop"), -1,
                    Qt::MatchContains)
            .size();
    };
    QCOMPARE(found(), 0);
    appendTo(m_path, leaseBlock(0, 1, 2).replace("host-2", "laptop"));
    m_model->update(m_path);
    QCOMPARE(found(), 1);
    QCOMPARE(found(), 1);
}

void LeaseProxyModelTest::followsReloads()
{
    QRandomGenerator random{8};
    StockFilter stock{m_model.get()};
    stock.setFilterFixedString(text("host"));
    m_proxy->setFilterFixedString(text("host"));
    for (int i{0}; i < 20; ++i) {
        load(variedLeaseFile(random, random.bounded(100)));
        QCOMPARE(rowsOf(*m_proxy), rowsOf(stock));
        if (m_model->rowCount() > 0)
            compareMatches(random, text("HOST"));
    }
    load({});
    QCOMPARE(m_proxy->rowCount(), 0);
}

void LeaseProxyModelTest::followsAnotherModel()
{
    load(leaseBlock(0, 1, 0) + leaseBlock(0, 2, 1));
    m_proxy->setFilterFixedString(text("free"));
    QCOMPARE(m_proxy->rowCount(), 1);

    DhcpdLeasesModel other;
    m_proxy->setSourceModel(&other);
    QCOMPARE(m_proxy->rowCount(), 0);
    writeTestFile(m_path, leaseBlock(0, 1, 1) + leaseBlock(0, 2, 2) + leaseBlock(0, 3, 3));
    other.reload(m_path);
    QCOMPARE(m_proxy->rowCount(), 2);
    m_model->reload(m_path);
    QCOMPARE(m_proxy->rowCount(), 2);
    m_proxy->setSourceModel(nullptr);
    QCOMPARE(m_proxy->rowCount(), 0);
}

void LeaseProxyModelTest::outlivesItsModel()
{
    load(leaseBlock(0, 1, 0));
    m_proxy->setFilterFixedString(text("active"));
    QCOMPARE(m_proxy->rowCount(), 1);
    m_model.reset();
    QCOMPARE(m_proxy->rowCount(), 0);
    m_proxy->setFilterFixedString(text("free"));
    QCOMPARE(m_proxy->rowCount(), 0);
    QVERIFY(m_proxy->match({}, Qt::DisplayRole, text("active"), 1, Qt::MatchContains).isEmpty());
}

/// A model that is no lease table is filtered by the base alone.
void LeaseProxyModelTest::filtersOtherModels()
{
    QStandardItemModel other;
    for (const char *item : {"one", "two", "three"})
        other.appendRow(new QStandardItem{text(item)});
    m_proxy->setSourceModel(&other);
    m_proxy->setFilterFixedString(text("t"));
    QCOMPARE(m_proxy->rowCount(), 2);
    QCOMPARE(m_proxy->match(m_proxy->index(0, 0), Qt::DisplayRole, text("W"), -1, Qt::MatchContains).size(), 1);
}

QTEST_GUILESS_MAIN(LeaseProxyModelTest)
#include "tst_leaseproxymodel.moc"
