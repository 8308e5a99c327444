// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/dhcpdconfigmodel.h"
#include "tests/config/confignode.h"

#include <QSignalSpy>
#include <QTest>

namespace {

struct Row
{
    const char *statement;
    const char *value;
    const char *words; // afterwards; null: as before
    const char *error; // null: none
};

QString joinedByBars(const DhcpdConfigStatement &statement) { return nodeOf(statement).words.join(QLatin1Char{'|'}); }

} // namespace

class DhcpdConfigChecksTest final : public QObject
{
    Q_OBJECT

private slots:
    void changesParameter_data();
    void changesParameter();
    void changesDeclaration_data();
    void changesDeclaration();
    void changesRange_data();
    void changesRange();
    void rangeNeedsItsSubnet_data();
    void rangeNeedsItsSubnet();
    void leavesRootsAlone();
    void needsWordsToStandBehind();

private:
    static void addRows(const std::vector<Row> &rows);
    static void change(DhcpdConfigModel &model, const QModelIndex &statement);
};

void DhcpdConfigChecksTest::addRows(const std::vector<Row> &rows)
{
    QTest::addColumn<QString>("statement");
    QTest::addColumn<QString>("value");
    QTest::addColumn<QString>("words");
    QTest::addColumn<QString>("message");
    for (const Row &row : rows) {
        QTest::addRow("%s: %s", row.statement, row.value)
            << QString::fromUtf8(row.statement) << QString::fromUtf8(row.value) << QString::fromUtf8(row.words)
            << QString::fromUtf8(row.error);
    }
}

// Sets the value of the current row of the table, and compares the statement and the error that come of it.
void DhcpdConfigChecksTest::change(DhcpdConfigModel &model, const QModelIndex &statement)
{
    QFETCH(QString, value);
    QFETCH(QString, words);
    QFETCH(QString, message);
    QVERIFY(statement.isValid());
    QSignalSpy errors{&model, &DhcpdConfigModel::error};
    QSignalSpy changes{&model, &QAbstractItemModel::dataChanged};
    QSignalSpy resets{&model, &QAbstractItemModel::modelReset};
    const ConfigNode before{nodeOf(*model.statementFor({}))};

    const bool accepted{!words.isNull()};
    QCOMPARE(model.setData(statement, value), accepted);
    QCOMPARE(model.isModified(), accepted);
    QCOMPARE(changes.size(), accepted ? 1 : 0);
    QCOMPARE(resets.size(), 0);
    if (accepted)
        QCOMPARE(joinedByBars(*model.statementFor(statement)), words);
    else
        QCOMPARE(nodeOf(*model.statementFor({})), before);
    QCOMPARE(errors.size(), message.isNull() ? 0 : 1);
    if (!message.isNull())
        QCOMPARE(errors[0][0].toString(), message);
}

void DhcpdConfigChecksTest::changesParameter_data()
{
    addRows({
        {"hardware ethernet 1 2", "00:11:22:33:44:55", "hardware|ethernet|00:11:22:33:44:55", nullptr},
        {"hardware ethernet 1", "00-11-22-aa-BB-cc", "hardware|ethernet|00-11-22-aa-BB-cc", nullptr},
        {"hardware ethernet 1", "00:11-22:33-44:55", "hardware|ethernet|00:11-22:33-44:55", nullptr},
        {"hardware ethernet 1", "00:11:22:33:44:55:", "hardware|ethernet|00:11:22:33:44:55:", nullptr},
        {"hardware ethernet 1", "0011.2233.4455", "hardware|ethernet|0011.2233.4455", nullptr},
        {"hardware ethernet 1", "x0011.2233.4455", "hardware|ethernet|x0011.2233.4455", nullptr},
        {"hardware ethernet 1", "0011.2233.4455.y", "hardware|ethernet|0011.2233.4455.y", nullptr},
        {"HARDWARE Ethernet 1", "zz", nullptr, "Invalid MAC 'zz'"},
        {"hardware ethernet 1", "", nullptr, "Invalid MAC ''"},
        {"hardware ethernet 1", "00:11:22:33:44", nullptr, "Invalid MAC '00:11:22:33:44'"},
        {"hardware ethernet 1", "00:11:22:33:44:5g", nullptr, "Invalid MAC '00:11:22:33:44:5g'"},
        {"hardware ethernet 1", "00:11:22:33:44:55 x", nullptr, "Invalid MAC '00:11:22:33:44:55 x'"},
        {"hardware token-ring 1", "zz", "hardware|zz", nullptr},

        {"option routers 1 2 3", "10.0.0.1", "option|routers|10.0.0.1", nullptr},
        {"option routers 1", "10.0.0.1,10.0.0.2", "option|routers|10.0.0.1,10.0.0.2", nullptr},
        {"option routers 1", "10.0.0.1, 10.0.0.2", "option|routers|10.0.0.1, 10.0.0.2", nullptr},
        {"option routers 1", "0.0.0.0", "option|routers|0.0.0.0", nullptr},
        {"option domain-name-servers 1", "10.0.0.1", "option|domain-name-servers|10.0.0.1", nullptr},
        {"option ntp-servers 1", "10.0.0.1", "option|ntp-servers|10.0.0.1", nullptr},
        {"option routers 1", "10.0.0.1;10.0.0.2", nullptr, "Invalid one or more IP in list '10.0.0.1;10.0.0.2'"},
        {"option routers 1", "10.0.0.1,", nullptr, "Invalid one or more IP in list '10.0.0.1,'"},
        {"option routers 1", "10.0.0.1,,10.0.0.2", nullptr, "Invalid one or more IP in list '10.0.0.1,,10.0.0.2'"},
        {"option routers 1", "", nullptr, "Invalid one or more IP in list ''"},
        {"option routers 1", "%1", nullptr, "Invalid one or more IP in list '%1'"},
        {"option domain-name-servers 1", "127.0.0.1", nullptr, "Invalid one or more IP in list '127.0.0.1'"},
        {"option ntp-servers 1", "10.0.0.1,255.255.255.255", nullptr,
         "Invalid one or more IP in list '10.0.0.1,255.255.255.255'"},
        {"OPTION Routers 1", "x", nullptr, "Invalid one or more IP in list 'x'"},

        {"option domain-name 1 2", "\"example.org\"", "option|domain-name|\"example.org\"", nullptr},
        {"option domain-name 1", "\"a.b-c.museum\"", "option|domain-name|\"a.b-c.museum\"", nullptr},
        {"option domain-name 1", "example.org", nullptr, "Invalid domain name 'example.org'"},
        {"option domain-name 1", "\"example.abcdefg\"", nullptr, "Invalid domain name '\"example.abcdefg\"'"},
        {"option domain-name 1", "\"example\"", nullptr, "Invalid domain name '\"example\"'"},
        {"option domain-name 1", "\"-a.org\"", nullptr, "Invalid domain name '\"-a.org\"'"},
        {"option domain-name 1", "x\"example.org\"", nullptr, "Invalid domain name 'x\"example.org\"'"},
        {"option domain-name 1", "", nullptr, "Invalid domain name ''"},

        {"option host-name 1 2", "anything at all", "option|host-name|anything at all", nullptr},
        {"option classless-static-routes 1", "8, 10", "option|classless-static-routes|8, 10", nullptr},
        {"option", "x", "option||x", nullptr},

        {"default-lease-time 600 x", "1", "default-lease-time|1", nullptr},
        {"max-lease-time 600", "007200", "max-lease-time|007200", nullptr},
        {"max-lease-time 600", "4294967295", "max-lease-time|4294967295", nullptr},
        {"min-lease-time 600", "0", nullptr, "Invalid time in seconds '0"},
        {"max-lease-time 600", "-5", nullptr, "Invalid time in seconds '-5"},
        {"max-lease-time 600", "abc", nullptr, "Invalid time in seconds 'abc"},
        {"DEFAULT-LEASE-TIME 600", "600 s", nullptr, "Invalid time in seconds '600 s"},
        {"default-lease-time 600", "", nullptr, "Invalid time in seconds '"},

        {"authoritative", "x", "authoritative|x", nullptr},
        {"filename a b c", "\"x y\"", "filename|\"x y\"", nullptr},
        {"filename a", "", "filename|", nullptr},
    });
}

void DhcpdConfigChecksTest::changesParameter()
{
    QFETCH(QString, statement);
    DhcpdConfigModel model{{QStringLiteral("a"), QStringLiteral("b")}};
    QVERIFY(model.parse(statement + QLatin1Char{';'}));
    const QModelIndex index{model.index(0, 1, model.index(0, 0))};
    QVERIFY(model.statementFor(index)->isParam());
    change(model, index);
}

void DhcpdConfigChecksTest::changesDeclaration_data()
{
    addRows({
        {"subnet 1 netmask 2 x {}", "10.1.2.0/24", "subnet|10.1.2.0|netmask|255.255.255.0", nullptr},
        {"subnet 1 {}", "10.1.2.0/255.255.255.0", "subnet|10.1.2.0|netmask|255.255.255.0", nullptr},
        {"subnet 1 netmask 2 {}", "10.0.0.5/24", "subnet|10.0.0.0|netmask|255.255.255.0", nullptr},
        {"SUBNET 1 netmask 2 {}", "10.1", "SUBNET|10.1.0.0|netmask|255.255.0.0", nullptr},
        {"subnet 1 netmask 2 {}", "10.0.0.0/33", nullptr, "Error editing subnet. Invalid subnet '10.0.0.0/33'"},
        {"subnet 1 netmask 2 {}", "abc", nullptr, "Error editing subnet. Invalid subnet 'abc'"},
        {"subnet 1 netmask 2 {}", "", nullptr, "Error editing subnet. Invalid subnet ''"},
        {"subnet 1 netmask 2 {}", "10.0.0.0/255.0.255.0", nullptr,
         "Error editing subnet. Invalid subnet '10.0.0.0/255.0.255.0'"},

        {"fixed-address 1, 2;", "10.0.0.5", "fixed-address|10.0.0.5", nullptr},
        {"fixed-address 1;", "010.0.0.5", "fixed-address|8.0.0.5", nullptr},
        {"fixed-address 1;", "10.5", "fixed-address|10.0.0.5", nullptr},
        {"fixed-address 1;", "0.0.0.0", "fixed-address|0.0.0.0", nullptr},
        {"fixed-address 1;", "127.0.0.1", nullptr, "Invalid IP '127.0.0.1'"},
        {"fixed-address 1;", "127.1.2.3", nullptr, "Invalid IP '127.1.2.3'"},
        {"fixed-address 1;", "255.255.255.255", nullptr, "Invalid IP '255.255.255.255'"},
        {"fixed-address 1;", "10.0.0.256", nullptr, "Invalid IP '10.0.0.256'"},
        {"fixed-address 1;", "", nullptr, "Invalid IP ''"},

        {"group a {}", "b", nullptr, nullptr},
        {"GROUP {}", "b", nullptr, nullptr},
        {"host a b c {}", "my pc", "host|my pc", nullptr},
        {"shared-network a {}", "", "shared-network|", nullptr},
        {"key a {}", "b", "key|b", nullptr},
        {"zone a. {}", "b.", "zone|b.", nullptr},
        {"subclass \"a\" b;", "c", "subclass|c", nullptr},
        {"anything {}", "b", "anything|b", nullptr},
    });
}

void DhcpdConfigChecksTest::changesDeclaration()
{
    QFETCH(QString, statement);
    DhcpdConfigModel model{{QStringLiteral("a"), QStringLiteral("b")}};
    QVERIFY(model.parse(statement));
    const QModelIndex index{model.index(0, 1, model.index(0, 0))};
    QVERIFY(model.statementFor(index)->isDeclaration());
    change(model, index);
}

void DhcpdConfigChecksTest::changesRange_data()
{
    const char *range{"range 1 2 x"};
    addRows({
        {range, "10.0.0.20 10.0.0.50", "range|10.0.0.20|10.0.0.50", nullptr},
        {range, "10.0.0.20 10.0.0.20", "range|10.0.0.20|10.0.0.20", nullptr},
        {"range", "10.0.20 10.0.0.50 x", "range|10.0.0.20|10.0.0.50", nullptr},
        {"RANGE dynamic-bootp 1 2", "10.0.0.0 10.0.0.255", "RANGE|10.0.0.0|10.0.0.255", nullptr},
        {range, "10.0.0.50 10.0.0.20", nullptr, "Error editing range. Invalid end IP '10.0.0.20'"},
        {range, "10.0.0.20 - 10.0.0.50", nullptr, "Error editing range. Invalid end IP ''"},
        {range, "10.0.0.20  10.0.0.50", nullptr, "Error editing range. Invalid end IP ''"},
        {range, "10.0.0.20", nullptr, "Error editing range. Invalid end IP ''"},
        {range, "10.0.0.20 10.0.1.1", nullptr, "Error editing range. Invalid end IP '10.0.1.1'"},
        {range, "", nullptr, "Error editing range. Invalid start IP ''"},
        {range, " 10.0.0.20 10.0.0.50", nullptr, "Error editing range. Invalid start IP ''"},
        {range, "x 10.0.0.50", nullptr, "Error editing range. Invalid start IP ''"},
        {range, "10.0.1.1 10.0.0.50", nullptr, "Error editing range. Invalid start IP '10.0.1.1'"},
        {range, "10.1 10.50", "range|10.0.0.1|10.0.0.50", nullptr},
        {range, "10.1.1 10.50", nullptr, "Error editing range. Invalid start IP '10.1.0.1'"},
        {range, "::1 10.0.0.50", nullptr, "Error editing range. Invalid start IP '::1'"},
    });
}

void DhcpdConfigChecksTest::changesRange()
{
    QFETCH(QString, statement);
    for (const char *place :
         {"subnet 10.0.0.0 netmask 255.255.255.0 { %1; }", "SUBNET 10.0.0.0 netmask 255.255.255.0 { pool { %1; } }"}) {
        DhcpdConfigModel model{{QStringLiteral("a"), QStringLiteral("b")}};
        QVERIFY(model.parse(QString::fromLatin1(place).arg(statement)));
        QModelIndex index{model.index(0, 0, model.index(0, 0))};
        while (model.rowCount(index) > 0)
            index = model.index(0, 0, index);
        change(model, index.siblingAtColumn(1));
        if (QTest::currentTestFailed())
            return;
    }
}

void DhcpdConfigChecksTest::rangeNeedsItsSubnet_data()
{
    const char *value{"10.0.0.20 10.0.0.50"};
    addRows({
        {"shared-network a { %1 }", value, nullptr, "Error editing range. Can not edit range in 'All network'"},
        {"%1", value, nullptr, "Error editing range. Can not edit range in 'Topology'"},
        {"subnet 10.0.0.0 netmask 255.0.0.0 { a { b { %1 } } }", value, nullptr,
         "Error editing range. Can not edit range in 'a'"},
        {"subnet { %1 }", value, nullptr, "Error editing range. Invalid attributes of parent subnet"},
        {"subnet 10.0.0.0 { %1 }", value, nullptr, "Error editing range. Invalid attributes of parent subnet"},
        {"subnet 10.0.0.0 { pool { %1 } }", value, nullptr, "Error editing range. Invalid attributes of parent subnet"},
        {"subnet 10.0.0.0 netmask { %1 }", value, nullptr, "Error editing range. Invalid parent subnet"},
        {"subnet x netmask 255.0.0.0 { %1 }", value, nullptr, "Error editing range. Invalid parent subnet"},
        {"subnet 10.0.0.0 netmask x { %1 }", value, nullptr, "Error editing range. Invalid parent subnet"},
        {"subnet 10.0.0.0 netmask 255.0.255.0 { %1 }", value, nullptr, "Error editing range. Invalid parent subnet"},
        {"subnet 127.0.0.0 netmask 255.0.0.0 { %1 }", "127.0.0.1 127.0.0.2", nullptr,
         "Error editing range. Invalid start IP '127.0.0.1'"},
        {"subnet 255.255.255.0 netmask 255.255.255.0 { %1 }", "255.255.255.1 255.255.255.255", nullptr,
         "Error editing range. Invalid end IP '255.255.255.255'"},
        // The nearest subnet decides; otherwise the keyword of the range's own parent does not matter.
        {"subnet 10.0.0.0 netmask 255.0.0.0 { host a { %1 } }", value, "range|10.0.0.20|10.0.0.50", nullptr},
        {"subnet 10.9.0.0 netmask 255.255.0.0 { subnet 10.0.0.0 netmask 255.255.0.0 { %1 } }", value,
         "range|10.0.0.20|10.0.0.50", nullptr},
    });
}

void DhcpdConfigChecksTest::rangeNeedsItsSubnet()
{
    QFETCH(QString, statement);
    DhcpdConfigModel model{{QStringLiteral("Topology"), QStringLiteral("Value")}};
    QVERIFY(model.parse(statement.arg(QStringLiteral("range 1 2;"))));
    QModelIndex index{model.index(0, 0)};
    while (model.rowCount(index) > 0)
        index = model.index(0, 0, index);
    change(model, index.siblingAtColumn(1));
}

void DhcpdConfigChecksTest::leavesRootsAlone()
{
    DhcpdConfigModel model{{QStringLiteral("Topology"), QStringLiteral("Value")}};
    QVERIFY(model.parse(QString{}));
    QSignalSpy errors{&model, &DhcpdConfigModel::error};
    QVERIFY(!model.setData(model.index(0, 1), QStringLiteral("x")));
    QCOMPARE(errors.size(), 0);
    QCOMPARE(model.statementFor(model.index(0, 0))->joinedWords(), QStringLiteral("All network "));
    QVERIFY(!model.isModified());
}

void DhcpdConfigChecksTest::needsWordsToStandBehind()
{
    DhcpdConfigModel model{{QStringLiteral("Topology"), QStringLiteral("Value")}};
    QVERIFY(model.parse(QStringLiteral("option x;")));
    const QModelIndex option{model.index(0, 1, model.index(0, 0))};
    QVERIFY(model.statementFor(option)->removeWords(1, 1));
    QVERIFY(!model.setData(option, QStringLiteral("value")));
    QCOMPARE(joinedByBars(*model.statementFor(option)), QStringLiteral("option"));
    QVERIFY(!model.isModified());
}

QTEST_GUILESS_MAIN(DhcpdConfigChecksTest)
#include "tst_dhcpdconfigchecks.moc"
