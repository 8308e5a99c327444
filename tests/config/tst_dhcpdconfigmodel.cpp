// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/dhcpdconfigmodel.h"
#include "tests/config/confignode.h"
#include "tests/support/temporaryroot.h"

#include <QDir>
#include <QFile>
#include <QMetaMethod>
#include <QSignalSpy>
#include <QTest>

#include <thread>
#include <unistd.h>

namespace {

const QStringList headerLabels{QStringLiteral("Topology"), QStringLiteral("Value")};

const QByteArray sample{"authoritative;\n"
                        "subnet 10.0.0.0 netmask 255.255.255.0 {\n"
                        "  range 10.0.0.10 10.0.0.20;\n"
                        "  option routers 10.0.0.1;\n"
                        "}\n"
                        "shared-network office { group { host a { hardware ethernet 00:11:22:33:44:55; } } }\n"};

QString readError(const QString &path) { return QStringLiteral("Unable to open file '%1' for read").arg(path); }
QString writeError(const QString &path) { return QStringLiteral("Unable to open file '%1' for write").arg(path); }

// Every signal with which a model reports a change, and error().
class Signals final
{
public:
    explicit Signals(const DhcpdConfigModel &model)
        : dataChanged{&model, &QAbstractItemModel::dataChanged}
        , error{&model, &DhcpdConfigModel::error}
        , beginRemove{&model, &QAbstractItemModel::rowsAboutToBeRemoved}
        , endRemove{&model, &QAbstractItemModel::rowsRemoved}
        , beginReset{&model, &QAbstractItemModel::modelAboutToBeReset}
        , endReset{&model, &QAbstractItemModel::modelReset}
        , inserted{&model, &QAbstractItemModel::rowsInserted}
    {
    }

    /// How often each was emitted: error, data, begin and end of removal, begin and end of reset, insertion.
    std::vector<int> counts() const
    {
        std::vector<int> counts;
        for (const QSignalSpy *spy :
             {&error, &dataChanged, &beginRemove, &endRemove, &beginReset, &endReset, &inserted})
            counts.push_back(static_cast<int>(spy->size()));
        return counts;
    }

    QSignalSpy dataChanged;
    QSignalSpy error;
    QSignalSpy beginRemove;
    QSignalSpy endRemove;
    QSignalSpy beginReset;
    QSignalSpy endReset;
    QSignalSpy inserted;
};

void compareMeansEverything(const QList<QVariant> &dataChanged)
{
    QVERIFY(!dataChanged[0].toModelIndex().isValid());
    QVERIFY(!dataChanged[1].toModelIndex().isValid());
    QVERIFY(dataChanged[2].value<QVector<int>>().isEmpty());
}

// A theme in which every icon that the model names exists, with a colour of its own.
void makeIconTheme(const QString &folder)
{
    QVERIFY(QDir{}.mkpath(folder + QStringLiteral("/test/16x16/any")));
    writeTestFile(folder + QStringLiteral("/test/index.theme"),
                  "[Icon Theme]\nName=test\nDirectories=16x16/any\n[16x16/any]\nSize=16\nType=Fixed\n");
    for (const char *name : {"network", "configure", "computer", "preferences-system-network"}) {
        QPixmap pixmap{16, 16};
        pixmap.fill(Qt::red);
        QVERIFY(pixmap.save(folder + QStringLiteral("/test/16x16/any/%1.png").arg(QLatin1String{name})));
    }
    QIcon::setThemeSearchPaths({folder});
    QIcon::setThemeName(QStringLiteral("test"));
}

} // namespace

Q_DECLARE_METATYPE(QMetaMethod::MethodType)

class DhcpdConfigModelTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void methodCanBeInvoked_data();
    void methodCanBeInvoked();
    void startsEmpty();
    void showsTheTree();
    void knowsParents();
    void countsColumnsByWords();
    void refusesIndexesThatAreNotThere();
    void hasTheIndexesThatItsCountsPromise();
    void showsHeaderLabels();
    void showsTexts();
    void showsIcons_data();
    void showsIcons();
    void itemsAreNotEditable();
    void leavesAreMarkedOnRequest();
    void findsStatements();

    void readTellsOneDataChange();
    void readTwiceAppends();
    void readRefuses_data();
    void readRefuses();
    void readKeepsTreeWhenRefused();
    void readsAnyContent_data();
    void readsAnyContent();
    void readsFileThatChangesMeanwhile();
    void parseAppends();
    void reloadReadsAnew();
    void reloadOfMissingFileLeavesNothing();

    void writesTheTree();
    void writeLeavesModified();
    void writeReportsFailure();
    void writesNothingFromNothing();
    void keepsTheEncoding();
    void defaultsToTheServersFile();

    void setDataTakesEditRoleAndValueColumns_data();
    void setDataTakesEditRoleAndValueColumns();
    void removesRows_data();
    void removesRows();
    void removesRowsBelowStatements();
    void removesStatement();
    void removesNoStatementWithoutParent();

private:
    std::unique_ptr<TemporaryRoot> m_root;
    std::unique_ptr<DhcpdConfigModel> m_model;

    QString readSample();
    QModelIndex allNetwork() const { return m_model->index(0, 0); }
};

void DhcpdConfigModelTest::init()
{
    m_root = std::make_unique<TemporaryRoot>();
    m_model = std::make_unique<DhcpdConfigModel>(headerLabels);
}

void DhcpdConfigModelTest::cleanup()
{
    m_model.reset();
    m_root.reset();
}

QString DhcpdConfigModelTest::readSample()
{
    QString path{m_root->path(QStringLiteral("/sample.conf"))};
    writeTestFile(path, sample);
    m_model->read(path);
    return path;
}

void DhcpdConfigModelTest::methodCanBeInvoked_data()
{
    QTest::addColumn<QByteArray>("signature");
    QTest::addColumn<QMetaMethod::MethodType>("kind");
    QTest::addColumn<QByteArray>("returned");
    const auto row = [](const char *signature, QMetaMethod::MethodType kind, const char *returned = "void") {
        QTest::addRow("%s", signature) << QByteArray{signature} << kind << QByteArray{returned};
    };
    row("error(QString)", QMetaMethod::Signal);
    row("reload(QString)", QMetaMethod::Slot);
    row("reload()", QMetaMethod::Slot);
    row("read(QString)", QMetaMethod::Slot);
    row("read()", QMetaMethod::Slot);
    row("write(QString)", QMetaMethod::Slot, "bool");
    row("write()", QMetaMethod::Slot, "bool");
}

void DhcpdConfigModelTest::methodCanBeInvoked()
{
    QFETCH(QByteArray, signature);
    QFETCH(QMetaMethod::MethodType, kind);
    QFETCH(QByteArray, returned);
    const QMetaObject &type{DhcpdConfigModel::staticMetaObject};
    const int index{type.indexOfMethod(signature.constData())};
    QVERIFY(index >= 0);
    QCOMPARE(type.method(index).methodType(), kind);
    QCOMPARE(QByteArray{type.method(index).typeName()}, returned);
}

void DhcpdConfigModelTest::startsEmpty()
{
    QCOMPARE(m_model->rowCount(), 0);
    QCOMPARE(m_model->columnCount(), 2);
    QVERIFY(!m_model->isModified());
    QVERIFY(!m_model->index(0, 0).isValid());
    QVERIFY(m_model->statementFor({})->isRoot());
}

void DhcpdConfigModelTest::showsTheTree()
{
    readSample();
    QCOMPARE(m_model->rowCount(), 1);
    QCOMPARE(m_model->rowCount(allNetwork()), 3);
    QCOMPARE(m_model->rowCount(m_model->index(0, 1)), 0);
    const QModelIndex subnet{m_model->index(1, 0, allNetwork())};
    QCOMPARE(subnet.data().toString(), QStringLiteral("Subnet"));
    QCOMPARE(m_model->rowCount(subnet), 2);
    QCOMPARE(m_model->index(0, 0, subnet).data().toString(), QStringLiteral("Gateways"));
    QCOMPARE(m_model->index(1, 0, subnet).data().toString(), QStringLiteral("Range"));
    QCOMPARE(m_model->rowCount(m_model->index(0, 0, subnet)), 0);
}

void DhcpdConfigModelTest::knowsParents()
{
    readSample();
    QVERIFY(!m_model->parent(QModelIndex{}).isValid());
    QVERIFY(!m_model->parent(allNetwork()).isValid());
    for (int row{}; row < 3; ++row)
        QCOMPARE(m_model->parent(m_model->index(row, 1, allNetwork())), allNetwork());
    const QModelIndex network{m_model->index(2, 0, allNetwork())};
    const QModelIndex group{m_model->index(0, 0, network)};
    QCOMPARE(m_model->parent(group), network);
    QCOMPARE(m_model->parent(group).column(), 0);
    QCOMPARE(m_model->parent(m_model->index(0, 0, group)), group);
}

void DhcpdConfigModelTest::countsColumnsByWords()
{
    readSample();
    QCOMPARE(m_model->columnCount(), 2);
    QCOMPARE(m_model->columnCount(allNetwork()), 2);
    QCOMPARE(m_model->columnCount(m_model->index(1, 0, allNetwork())), 4);
    const DhcpdConfigModel wide{{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")}};
    QCOMPARE(wide.columnCount(), 3);
}

void DhcpdConfigModelTest::refusesIndexesThatAreNotThere()
{
    readSample();
    QVERIFY(!m_model->index(1, 0).isValid());
    QVERIFY(!m_model->index(-1, 0).isValid());
    QVERIFY(!m_model->index(0, 2).isValid());
    QVERIFY(!m_model->index(0, -1).isValid());
    QVERIFY(!m_model->index(3, 0, allNetwork()).isValid());
    QVERIFY(!m_model->index(0, 0, m_model->index(0, 0, allNetwork())).isValid());
    QVERIFY(m_model->index(0, 3, m_model->index(1, 0, allNetwork())).isValid());
}

// Compares index() and parent() with the counts of rows and columns under every cell, one beyond each end.
void DhcpdConfigModelTest::hasTheIndexesThatItsCountsPromise()
{
    QVERIFY(m_model->parse(QStringLiteral("a; b c d e { f g; h { i j k; range 1 2; } } group { l m; }")));
    QVERIFY(m_model->parse(QStringLiteral("a b { c; }")));
    QVERIFY(m_model->replaceWords(m_model->index(2, 0, allNetwork()), {})); // the group has no words now
    QVector<QModelIndex> parents{QModelIndex{}};
    int valid{};
    for (int i{}; i < parents.size(); ++i) {
        const QModelIndex parent{parents.at(i)};
        const DhcpdConfigStatement &statement{*m_model->statementFor(parent)};
        for (int row{-1}; row <= statement.childCount(); ++row) {
            for (int column{-1}; column <= statement.wordCount(); ++column) {
                const QModelIndex index{m_model->index(row, column, parent)};
                QCOMPARE(index.isValid(), m_model->hasIndex(row, column, parent));
                if (!index.isValid())
                    continue;
                ++valid;
                QCOMPARE(index.row(), row);
                QCOMPARE(index.column(), column);
                QCOMPARE(m_model->statementFor(index), statement.child(row));
                QCOMPARE(m_model->parent(index), parent);
                parents += index;
            }
        }
    }
    // The top two rows, then each child as often as its parent has words.
    QCOMPARE(valid, 2 * 2 + 3 * 2 + 2 * 4 + 2 * 2 + 1 * 2 + 1 * 2);
}

void DhcpdConfigModelTest::showsHeaderLabels()
{
    QCOMPARE(m_model->headerData(0, Qt::Horizontal), QVariant{QStringLiteral("Topology")});
    QCOMPARE(m_model->headerData(1, Qt::Horizontal), QVariant{QStringLiteral("Value")});
    for (const int section : {-1, 2}) {
        const QVariant label{m_model->headerData(section, Qt::Horizontal)};
        QCOMPARE(label.type(), QVariant::String);
        QVERIFY(label.toString().isEmpty());
    }
    QVERIFY(!m_model->headerData(0, Qt::Vertical).isValid());
    QVERIFY(!m_model->headerData(0, Qt::Horizontal, Qt::DecorationRole).isValid());
    QVERIFY(!m_model->headerData(0, Qt::Horizontal, Qt::EditRole).isValid());
}

void DhcpdConfigModelTest::showsTexts()
{
    readSample();
    const QModelIndex subnet{m_model->index(1, 0, allNetwork())};
    QCOMPARE(allNetwork().data(), QVariant{QStringLiteral("All network")});
    QCOMPARE(m_model->index(0, 1).data(), QVariant{QString{QLatin1String{""}}});
    for (const int role : {Qt::DisplayRole, Qt::EditRole}) {
        QCOMPARE(subnet.data(role), QVariant{QStringLiteral("Subnet")});
        QCOMPARE(subnet.siblingAtColumn(1).data(role), QVariant{QStringLiteral("10.0.0.0 / 255.255.255.0")});
        QCOMPARE(m_model->index(0, 2, subnet).data(role), QVariant{QStringLiteral("10.0.0.1")});
    }
    for (const int role : {int{Qt::ToolTipRole}, int{Qt::UserRole}, int{Qt::CheckStateRole}, int{Qt::FontRole}})
        QVERIFY(!subnet.data(role).isValid());
    QVERIFY(!m_model->data({}, Qt::DisplayRole).isValid());
}

void DhcpdConfigModelTest::showsIcons_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("icon");
    const struct
    {
        const char *text;
        const char *icon;
    } rows[]{
        {"next-server a;", "configure"},
        {"shared-network a;", "configure"},
        {"host a;", "configure"},
        {"shared-network a {}", "network"},
        {"SHARED-NETWORK a {}", "network"},
        {"host a {}", "computer"},
        {"subnet a {}", "preferences-system-network"},
        {"group {}", "preferences-system-network"},
        {"range a;", "preferences-system-network"},
        {"anything {}", "preferences-system-network"},
    };
    for (const auto &row : rows)
        QTest::addRow("%s", row.text) << QString::fromLatin1(row.text) << QString::fromLatin1(row.icon);
}

void DhcpdConfigModelTest::showsIcons()
{
    makeIconTheme(m_root->path(QStringLiteral("/icons")));
    QFETCH(QString, text);
    QVERIFY(m_model->parse(text));
    const auto icon = [](const QModelIndex &index) { return index.data(Qt::DecorationRole).value<QIcon>().name(); };
    const QModelIndex statement{m_model->index(0, 0, allNetwork())};
    QTEST(icon(statement), "icon");
    QTEST(icon(statement), "icon");
    QCOMPARE(icon(allNetwork()), QStringLiteral("network"));
    QVERIFY(!statement.siblingAtColumn(1).data(Qt::DecorationRole).isValid());
}

void DhcpdConfigModelTest::itemsAreNotEditable()
{
    readSample();
    QCOMPARE(m_model->flags({}), Qt::ItemFlags{});
    QCOMPARE(m_model->flags(allNetwork()), Qt::ItemIsSelectable | Qt::ItemIsEnabled);
    QCOMPARE(m_model->flags(m_model->index(1, 1, allNetwork())), Qt::ItemIsSelectable | Qt::ItemIsEnabled);
}

void DhcpdConfigModelTest::leavesAreMarkedOnRequest()
{
    QVERIFY(m_model->parse(QStringLiteral("a b; pool { c d; } group { }")));
    const auto isMarked = [this](int row) {
        return m_model->index(row, 0, allNetwork()).flags().testFlag(Qt::ItemNeverHasChildren);
    };
    QVERIFY(!isMarked(0) && !isMarked(1) && !isMarked(2));
    m_model->markLeaves(true);
    QVERIFY(isMarked(0) && !isMarked(1) && isMarked(2));
    QVERIFY(!allNetwork().flags().testFlag(Qt::ItemNeverHasChildren));
    m_model->markLeaves(false);
    QVERIFY(!isMarked(0) && !isMarked(1) && !isMarked(2));
}

void DhcpdConfigModelTest::findsStatements()
{
    readSample();
    QCOMPARE(m_model->statementFor({})->keyword(), QStringLiteral("Topology"));
    QCOMPARE(m_model->statementFor({})->child(0), m_model->statementFor(allNetwork()));
    const QModelIndex subnet{m_model->index(1, 1, allNetwork())};
    QCOMPARE(m_model->statementFor(subnet)->keyword(), QStringLiteral("subnet"));
}

void DhcpdConfigModelTest::readTellsOneDataChange()
{
    const Signals sent{*m_model};
    readSample();
    QCOMPARE(sent.counts(), (std::vector<int>{0, 1, 0, 0, 0, 0, 0}));
    compareMeansEverything(sent.dataChanged[0]);
    QVERIFY(!m_model->isModified());
}

void DhcpdConfigModelTest::readTwiceAppends()
{
    const QString path{readSample()};
    m_model->read(path);
    QCOMPARE(m_model->rowCount(), 2);
    QCOMPARE(nodeOf(*m_model->statementFor(m_model->index(0, 0))),
             nodeOf(*m_model->statementFor(m_model->index(1, 0))));
    QVERIFY(m_model->write(path));
    QCOMPARE(readTestFile(path).count("authoritative ;\n"), 2);
}

void DhcpdConfigModelTest::readRefuses_data()
{
    QTest::addColumn<QString>("path");
    QTest::addRow("missing file") << QStringLiteral("/missing.conf");
    QTest::addRow("missing folder") << QStringLiteral("/missing/dhcpd.conf");
    QTest::addRow("folder") << QStringLiteral("/etc/dhcp");
    QTest::addRow("blocks nested too deep") << QStringLiteral("/deep.conf");
    QTest::addRow("too long for a text") << QStringLiteral("/long.conf");
}

void DhcpdConfigModelTest::readRefuses()
{
    writeTestFile(m_root->path(QStringLiteral("/deep.conf")), QByteArray{"a {"}.repeated(501));
    writeTestFile(m_root->path(QStringLiteral("/long.conf")), "a b;\n");
    QVERIFY(QFile::resize(m_root->path(QStringLiteral("/long.conf")), qint64{1} << 30)); // of holes
    QFETCH(QString, path);
    path = m_root->path(path);
    const Signals sent{*m_model};
    m_model->read(path);
    QCOMPARE(sent.counts(), (std::vector<int>{1, 0, 0, 0, 0, 0, 0}));
    QCOMPARE(sent.error[0][0].toString(), readError(path));
    QCOMPARE(m_model->rowCount(), 0);
    QVERIFY(!m_model->isModified());
}

void DhcpdConfigModelTest::readKeepsTreeWhenRefused()
{
    readSample();
    QVERIFY(m_model->removeRows(0, 1, allNetwork()));
    const ConfigNode before{nodeOf(*m_model->statementFor({}))};
    m_model->read(m_root->path(QStringLiteral("/missing.conf")));
    QCOMPARE(nodeOf(*m_model->statementFor({})), before);
    QVERIFY(m_model->isModified());
    QVERIFY(!m_model->parse(QStringLiteral("a {").repeated(501)));
    QCOMPARE(nodeOf(*m_model->statementFor({})), before);
}

void DhcpdConfigModelTest::readsAnyContent_data()
{
    QTest::addColumn<QByteArray>("content");
    QTest::addColumn<QByteArray>("written");
    const auto addRow = [](const char *name, const QByteArray &content, const QByteArray &written) {
        QTest::addRow("%s", name) << content << written;
    };
    addRow("empty file", "", "");
    addRow("NUL bytes", QByteArray{"a\0b c\0;\0", 8}, QByteArray{"a\0b c\0;\n", 8});
    addRow("UTF-8", "host zürich { }", "host zürich {\n}\n");
    addRow("not UTF-8", "a z\xFCrich; b \x80\xFF;", "a z\xFCrich;\nb \x80\xFF;\n");
    addRow("comment at the end", "a b;\n# end", "a b;\n");
    addRow("CR LF", "a b;\r\n", "a b;\n");
}

void DhcpdConfigModelTest::readsAnyContent()
{
    QFETCH(QByteArray, content);
    const QString path{m_root->path(QStringLiteral("/any.conf"))};
    writeTestFile(path, content);
    m_model->read(path);
    QCOMPARE(m_model->rowCount(), 1);
    QTEST(m_model->fileContent(), "written");
    QVERIFY(m_model->write(path));
    QTEST(readTestFile(path), "written");
}

void DhcpdConfigModelTest::readsFileThatChangesMeanwhile()
{
    const QString path{m_root->path(QStringLiteral("/changing.conf"))};
    const QByteArray content{QByteArray{"host a { next-server b; }\n"}.repeated(100'000)};
    writeTestFile(path, content);
    std::atomic<bool> stop{false};
    std::thread other{[&] {
        const QByteArray name{QFile::encodeName(path)};
        for (off_t size{}; !stop; size = (size + 300'007) % (off_t{2} * content.size())) {
            if (::truncate(name.constData(), size) != 0)
                return;
        }
    }};
    for (int i{}; i < 10; ++i) {
        m_model->reload(path);
        QCOMPARE(m_model->rowCount(), 1);
        QVERIFY(m_model->rowCount(allNetwork()) <= 100'000);
    }
    stop = true;
    other.join();
}

void DhcpdConfigModelTest::parseAppends()
{
    const Signals sent{*m_model};
    QVERIFY(m_model->parse(QStringLiteral("a b;")));
    QVERIFY(m_model->parse(QString{}));
    QCOMPARE(m_model->rowCount(), 2);
    QCOMPARE(m_model->rowCount(allNetwork()), 1);
    QCOMPARE(sent.counts(), std::vector<int>(7, 0));
}

void DhcpdConfigModelTest::reloadReadsAnew()
{
    const QString path{readSample()};
    const ConfigNode before{nodeOf(*m_model->statementFor({}))};
    QVERIFY(m_model->removeRows(0, 1, allNetwork()));
    const Signals sent{*m_model};
    m_model->reload(path);
    QCOMPARE(nodeOf(*m_model->statementFor({})), before);
    QVERIFY(!m_model->isModified());
    QCOMPARE(sent.counts(), (std::vector<int>{0, 2, 1, 1, 0, 0, 0}));
    m_model->reload(path);
    QCOMPARE(m_model->rowCount(), 1);
}

void DhcpdConfigModelTest::reloadOfMissingFileLeavesNothing()
{
    const QString missing{m_root->path(QStringLiteral("/missing.conf"))};
    readSample();
    for (int i{}; i < 2; ++i) { // the second time there is nothing to remove
        const Signals sent{*m_model};
        m_model->reload(missing);
        QCOMPARE(m_model->rowCount(), 0);
        QVERIFY(m_model->isModified());
        QCOMPARE(sent.error.size(), 1);
        QCOMPARE(sent.error[0][0].toString(), readError(missing));
    }
}

void DhcpdConfigModelTest::writesTheTree()
{
    const QString path{readSample()};
    const Signals sent{*m_model};
    QVERIFY(m_model->write(path));
    const QByteArray expected{"authoritative ;\n"
                              "subnet 10.0.0.0 netmask 255.255.255.0 {\n"
                              "    option routers 10.0.0.1;\n"
                              "    range 10.0.0.10 10.0.0.20;\n"
                              "}\n"
                              "shared-network office {\n"
                              "    group  {\n"
                              "        host a {\n"
                              "            hardware ethernet 00:11:22:33:44:55;\n"
                              "        }\n"
                              "    }\n"
                              "}\n"};
    QCOMPARE(readTestFile(path), expected);
    QCOMPARE(m_model->fileContent(), expected);
    QCOMPARE(sent.counts(), std::vector<int>(7, 0));
    const ConfigNode before{nodeOf(*m_model->statementFor({}))};
    m_model->reload(path);
    QCOMPARE(nodeOf(*m_model->statementFor({})), before);
}

void DhcpdConfigModelTest::writeLeavesModified()
{
    const QString path{readSample()};
    QVERIFY(m_model->write(path));
    QVERIFY(!m_model->isModified());
    QVERIFY(m_model->removeRows(0, 3, allNetwork()));
    QVERIFY(m_model->write(path));
    QVERIFY(m_model->isModified());
    QCOMPARE(readTestFile(path), QByteArray{});
}

void DhcpdConfigModelTest::writeReportsFailure()
{
    readSample();
    const ConfigNode before{nodeOf(*m_model->statementFor({}))};
    for (const char *unwritable : {"/missing/dhcpd.conf", "/etc/dhcp"}) {
        const QString path{m_root->path(QString::fromLatin1(unwritable))};
        const Signals sent{*m_model};
        QVERIFY(!m_model->write(path));
        QCOMPARE(sent.counts(), (std::vector<int>{1, 0, 0, 0, 0, 0, 0}));
        QCOMPARE(sent.error[0][0].toString(), writeError(path));
    }
    QCOMPARE(nodeOf(*m_model->statementFor({})), before);
}

void DhcpdConfigModelTest::writesNothingFromNothing()
{
    const QString path{m_root->path(QStringLiteral("/sample.conf"))};
    writeTestFile(path, sample);
    const Signals sent{*m_model};
    QVERIFY(!m_model->write(path));
    QCOMPARE(sent.error.size(), 1);
    QCOMPARE(sent.error[0][0].toString(), writeError(path));
    QCOMPARE(readTestFile(path), sample);
}

void DhcpdConfigModelTest::keepsTheEncoding()
{
    const QString latin1{m_root->path(QStringLiteral("/latin1.conf"))};
    writeTestFile(latin1, "option x \"Z\xFCrich\";\n");
    m_model->read(latin1);
    const QModelIndex option{m_model->index(0, 1, allNetwork())};
    QCOMPARE(option.data().toString(), QStringLiteral("\"Zürich\""));
    QVERIFY(m_model->setData(option, QStringLiteral("\"Genève\"")));
    // A file that cannot be read leaves the encoding as it is.
    m_model->read(m_root->path(QStringLiteral("/missing.conf")));
    QVERIFY(m_model->write(latin1));
    QCOMPARE(readTestFile(latin1), QByteArray{"option x \"Gen\xE8ve\";\n"});

    writeTestFile(latin1, "option x \"Zürich\";\n");
    m_model->reload(latin1);
    QCOMPARE(m_model->fileContent(), QByteArray{"option x \"Zürich\";\n"});
}

void DhcpdConfigModelTest::defaultsToTheServersFile()
{
    writeTestFile(paths::configuration(), sample);
    m_model->read();
    QCOMPARE(m_model->rowCount(), 1);
    m_model->reload();
    QCOMPARE(m_model->rowCount(), 1);
    QVERIFY(m_model->write());
    QCOMPARE(readTestFile(paths::configuration()), m_model->fileContent());
}

void DhcpdConfigModelTest::setDataTakesEditRoleAndValueColumns_data()
{
    QTest::addColumn<int>("column");
    QTest::addColumn<int>("role");
    QTest::addColumn<bool>("result");
    QTest::addRow("value") << 1 << int{Qt::EditRole} << true;
    QTest::addRow("a further column") << 2 << int{Qt::EditRole} << true;
    QTest::addRow("label") << 0 << int{Qt::EditRole} << false;
    QTest::addRow("display role") << 1 << int{Qt::DisplayRole} << false;
    QTest::addRow("invalid index") << -1 << int{Qt::EditRole} << false;
}

void DhcpdConfigModelTest::setDataTakesEditRoleAndValueColumns()
{
    QFETCH(int, column);
    QFETCH(int, role);
    QFETCH(bool, result);
    QVERIFY(m_model->parse(QStringLiteral("group a { host b {} }")));
    const QModelIndex group{m_model->index(0, 0, allNetwork())};
    m_model->statementFor(group)->insertWords(2, 1); // a third column below it
    const QModelIndex index{m_model->index(0, column, group)};
    const Signals sent{*m_model};
    QCOMPARE(m_model->setData(index, QStringLiteral("x"), role), result);
    QCOMPARE(m_model->isModified(), result);
    QCOMPARE(sent.counts(), (std::vector<int>{0, result ? 1 : 0, 0, 0, 0, 0, 0}));
    if (result)
        compareMeansEverything(sent.dataChanged[0]);
    QCOMPARE(m_model->statementFor(group)->child(0)->joinedWords(),
             result ? QStringLiteral("host x") : QStringLiteral("host b"));
}

void DhcpdConfigModelTest::removesRows_data()
{
    QTest::addColumn<int>("row");
    QTest::addColumn<int>("count");
    QTest::addColumn<bool>("result");
    QTest::addColumn<QString>("left");
    QTest::addRow("one") << 0 << 1 << true << QStringLiteral("bcd");
    QTest::addRow("parameters and declarations") << 1 << 2 << true << QStringLiteral("ad");
    QTest::addRow("all") << 0 << 4 << true << QString{};
    QTest::addRow("none") << 2 << 0 << true << QStringLiteral("abcd");
    QTest::addRow("none at the end") << 4 << 0 << true << QStringLiteral("abcd");
    QTest::addRow("before the start") << -1 << 1 << false << QStringLiteral("abcd");
    QTest::addRow("too many") << 2 << 3 << false << QStringLiteral("abcd");
    QTest::addRow("beyond the end") << 4 << 1 << false << QStringLiteral("abcd");
    QTest::addRow("less than none") << 1 << -1 << false << QStringLiteral("abcd");
    QTest::addRow("overflow") << 1 << std::numeric_limits<int>::max() << false << QStringLiteral("abcd");
}

void DhcpdConfigModelTest::removesRows()
{
    QFETCH(int, row);
    QFETCH(int, count);
    QFETCH(bool, result);
    QVERIFY(m_model->parse(QStringLiteral("a;b;c{}d{}")));
    const QPersistentModelIndex last{m_model->index(3, 0, allNetwork())};
    const Signals sent{*m_model};
    QCOMPARE(m_model->removeRows(row, count, allNetwork()), result);
    const int removals{result && count > 0 ? 1 : 0};
    QCOMPARE(sent.counts(), (std::vector<int>{0, result ? 1 : 0, removals, removals, 0, 0, 0}));
    QCOMPARE(m_model->isModified(), result);
    if (removals > 0) {
        QCOMPARE(sent.beginRemove[0][0].toModelIndex(), allNetwork());
        QCOMPARE(sent.beginRemove[0][1].toInt(), row);
        QCOMPARE(sent.beginRemove[0][2].toInt(), row + count - 1);
    }
    QString left;
    for (int i{}; i < m_model->rowCount(allNetwork()); ++i)
        left += m_model->index(i, 0, allNetwork()).data().toString();
    QTEST(left, "left");
    if (last.isValid())
        QCOMPARE(last.data().toString(), QStringLiteral("d"));
}

void DhcpdConfigModelTest::removesRowsBelowStatements()
{
    readSample();
    const QModelIndex subnet{m_model->index(1, 0, allNetwork())};
    for (const int count : {0, 1})
        QVERIFY(!m_model->removeRows(0, count, m_model->index(0, 0, allNetwork()))); // a parameter
    QVERIFY(!m_model->isModified());
    QVERIFY(m_model->removeRows(1, 1, subnet));
    QCOMPARE(m_model->rowCount(subnet), 1);
    QVERIFY(m_model->removeRows(0, 1));
    QCOMPARE(m_model->rowCount(), 0);
}

void DhcpdConfigModelTest::removesStatement()
{
    readSample();
    const Signals sent{*m_model};
    m_model->removeStatement(m_model->index(1, 1, allNetwork()));
    QCOMPARE(sent.counts(), (std::vector<int>{0, 1, 0, 0, 1, 1, 0}));
    compareMeansEverything(sent.dataChanged[0]);
    QVERIFY(m_model->isModified());
    QCOMPARE(m_model->fileContent(), QByteArray{"authoritative ;\n"
                                                "shared-network office {\n"
                                                "    group  {\n"
                                                "        host a {\n"
                                                "            hardware ethernet 00:11:22:33:44:55;\n"
                                                "        }\n"
                                                "    }\n"
                                                "}\n"});
    m_model->removeStatement(m_model->index(0, 0, allNetwork()));
    QCOMPARE(m_model->rowCount(allNetwork()), 1);
    m_model->removeStatement(allNetwork());
    QCOMPARE(m_model->rowCount(), 0);
}

void DhcpdConfigModelTest::removesNoStatementWithoutParent()
{
    readSample();
    const Signals sent{*m_model};
    m_model->removeStatement({});
    QCOMPARE(sent.counts(), std::vector<int>(7, 0));
    QCOMPARE(m_model->rowCount(), 1);
    QVERIFY(!m_model->isModified());
}

QTEST_MAIN(DhcpdConfigModelTest)
#include "tst_dhcpdconfigmodel.moc"
