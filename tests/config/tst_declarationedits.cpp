// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/config/editedmodel.h"
#include "tests/support/text.h"

#include <QTest>

namespace {

using Edit = EditCase::Edit;

Edit addSharedNetwork(const char *name)
{
    return [=](DhcpdConfigModel &model, const QModelIndex &parent) { model.addSharedNetwork(text(name), parent); };
}

Edit addFixedAddress(const char *address)
{
    return [=](DhcpdConfigModel &model, const QModelIndex &parent) { model.addFixedAddress(text(address), parent); };
}

// The operations that return whether they added anything.
using WordsOperation = bool (DhcpdConfigModel::*)(const QStringList &words, const QModelIndex &parent);

Edit addWords(WordsOperation add, const QStringList &words, bool isAdded = true)
{
    return [=](DhcpdConfigModel &model, const QModelIndex &parent) { QCOMPARE((model.*add)(words, parent), isAdded); };
}

// A configuration of `depth` blocks, each within the one before; the innermost is a `kind`.
QString nestedBlocks(int depth, const char *kind)
{
    return text("group { ").repeated(depth - 1) + text(kind) + text(" { ") + text("} ").repeated(depth);
}

QModelIndex innermost(const DhcpdConfigModel &model)
{
    QModelIndex index;
    while (model.rowCount(index) > 0)
        index = model.index(0, 0, index);
    return index;
}

// Fails the test unless the model can read the file that it would write.
void verifyIsReadAgain(const EditedModel &edited)
{
    const QByteArray content{edited.model().fileContent()};
    QVERIFY(!content.isNull());
    DhcpdConfigModel model{{text("Topology"), text("Value")}};
    QVERIFY(model.parse(QString::fromUtf8(content)));
    QCOMPARE(model.fileContent(), content);
}

constexpr auto subnet = "subnet 10.0.0.0 netmask 255.255.255.0 { range 10.0.0.10 10.0.0.20; }";

} // namespace

class DeclarationEditsTest final : public QObject
{
    Q_OBJECT

private slots:
    void adds_data();
    void adds();
    void refuses_data();
    void refuses();
    void addsNoBlocksThatCouldNotBeRead_data();
    void addsNoBlocksThatCouldNotBeRead();
    void addsLinesToTheDeepestBlock_data();
    void addsLinesToTheDeepestBlock();
    void makesNoBlockOfADeepestLine_data();
    void makesNoBlockOfADeepestLine();
    void computesDefaultRange_data();
    void computesDefaultRange();
    void removesStatement();
    void removesNothingWithoutParent();
    void replacesWords_data();
    void replacesWords();
    void doesNotReplaceWordsOfRoots();
    void doesNotModifyWhenWordsAreTheSame();
    void namesKeys();
};

void DeclarationEditsTest::adds_data()
{
    QTest::addColumn<EditCase>("edit");

    const auto row = [](const char *name, const char *before, const char *target, const Edit &edit, const char *after,
                        int resets = 1) {
        QTest::addRow("%s", name) << EditCase{text(before), text(target), edit, text(after), resets};
    };

    row("shared network: all network", "", "", addSharedNetwork("office"), "shared-network|office {\n");
    row("shared network: top", "", "top", addSharedNetwork("office"), "shared-network|office {\n");
    row("shared network: group", "GROUP { }", "GROUP", addSharedNetwork("office"),
        "GROUP| {\n shared-network|office {\n");
    row("shared network: behind the others", "authoritative; host a { } x y;", "", addSharedNetwork("office"),
        "authoritative|\nx|y\nhost|a {\nshared-network|office {\n");
    row("shared network: name unchecked", "", "", addSharedNetwork("my office"), "shared-network|my office {\n");
    row("shared network: empty name", "", "", addSharedNetwork(""), "shared-network| {\n");

    row("subnet: prefix length", "", "", addSubnet("10.0.0.7", "24"), "subnet|10.0.0.0|netmask|255.255.255.0 {\n");
    row("subnet: netmask", "", "", addSubnet("10.0.0.7", "255.255.0.0"), "subnet|10.0.0.0|netmask|255.255.0.0 {\n");
    row("subnet: no mask", "", "", addSubnet("10.1", ""), "subnet|10.1.0.0|netmask|255.255.0.0 {\n");
    row("subnet: prefix in the address", "", "", addSubnet("10.1.2.3/30", ""),
        "subnet|10.1.2.0|netmask|255.255.255.252 {\n");
    row("subnet: everything", "", "", addSubnet("0.0.0.0", "0"), "subnet|0.0.0.0|netmask|0.0.0.0 {\n");
    row("subnet: one address", "", "", addSubnet("10.0.0.1", "32"), "subnet|10.0.0.1|netmask|255.255.255.255 {\n");
    row("subnet: top", "", "top", addSubnet("10.0.0.0", "24"), "subnet|10.0.0.0|netmask|255.255.255.0 {\n");
    row("subnet: group", "group { }", "group", addSubnet("10.0.0.0", "24"),
        "group| {\n subnet|10.0.0.0|netmask|255.255.255.0 {\n");
    row("subnet: shared network", "Shared-Network a { }", "Shared-Network", addSubnet("10.0.0.0", "24"),
        "Shared-Network|a {\n subnet|10.0.0.0|netmask|255.255.255.0 {\n");
    row("subnet: there already", "subnet 10.0.0.0 netmask 255.0.0.0 { }", "", addSubnet("10.0.0.0", "8"),
        "subnet|10.0.0.0|netmask|255.0.0.0 {\nsubnet|10.0.0.0|netmask|255.0.0.0 {\n");

    const auto rangeRow = [&row](const char *name, const char *start, const char *end, const char *range) {
        row(name, subnet, "subnet", addRange(start, end),
            qPrintable(QStringLiteral("subnet|10.0.0.0|netmask|255.255.255.0 {\n range|10.0.0.10|10.0.0.20 {\n %1 {\n")
                           .arg(text(range))));
    };
    rangeRow("range", "10.0.0.30", "10.0.0.40", "range|10.0.0.30|10.0.0.40");
    rangeRow("range: one address", "10.0.0.30", "10.0.0.30", "range|10.0.0.30|10.0.0.30");
    rangeRow("range: overlap", "10.0.0.10", "10.0.0.20", "range|10.0.0.10|10.0.0.20");
    rangeRow("range: first and last of the subnet", "10.0.0.0", "10.0.0.255", "range|10.0.0.0|10.0.0.255");
    rangeRow("range: normalised", "10.0.30", "10.40", "range|10.0.0.30|10.0.0.40");

    row("host", "", "", addHost("pc", "00:11:22:33:44:55", "10.0.0.5"),
        "host|pc {\n hardware|ethernet|00:11:22:33:44:55\n fixed-address|10.0.0.5 {\n");
    row("host: top", "", "top", addHost("pc", "", ""), "host|pc {\n");
    row("host: group", "group g { }", "group", addHost("pc", "", ""), "group|g {\n host|pc {\n");
    row("host: name alone", "", "", addHost("pc", "", ""), "host|pc {\n");
    row("host: name with a space", "", "", addHost("my pc", "", ""), "host|\"my pc\" {\n");
    row("host: name of a space", "", "", addHost(" ", "", ""), "host|\" \" {\n");
    row("host: name with a tab", "", "", addHost("my\tpc", "", ""), "host|my\tpc {\n");
    row("host: quoted name", "", "", addHost("\"my pc\"", "", ""), "host|\"\"my pc\"\" {\n");
    row("host: invalid MAC", "", "", addHost("pc", "zz", ""), "host|pc {\n hardware|ethernet|00:00:00:00:00:00\n");
    row("host: loose MAC", "", "", addHost("pc", "x 0011.2233.4455", ""),
        "host|pc {\n hardware|ethernet|x 0011.2233.4455\n");
    row("host: normalised address", "", "", addHost("pc", "", "10.5"), "host|pc {\n fixed-address|10.0.0.5 {\n");
    row("host: null address", "", "", addHost("pc", "", "0.0.0.0"), "host|pc {\n fixed-address|0.0.0.0 {\n");
    for (const char *address : {"127.0.0.1", "255.255.255.255", "10.0.0.256", "a name"}) {
        row(qPrintable(QStringLiteral("host: address %1").arg(text(address))), "", "", addHost("pc", "", address),
            "host|pc {\n");
    }
    row("host: there already", "host pc { }", "", addHost("pc", "", ""), "host|pc {\nhost|pc {\n");

    row("fixed address", "host a { }", "host", addFixedAddress("10.0.0.5"), "host|a {\n fixed-address|10.0.0.5 {\n");
    row("fixed address: normalised", "HOST a { }", "HOST", addFixedAddress("10.5"),
        "HOST|a {\n fixed-address|10.0.0.5 {\n");
    row("fixed address: replaces", "host a { Fixed-Address old; }", "host", addFixedAddress("10.0.0.5"),
        "host|a {\n Fixed-Address|10.0.0.5 {\n", 0);
    row("fixed address: replaces the first", "host a { x { } fixed-address b, c d; fixed-address e; }", "host",
        addFixedAddress("10.5"), "host|a {\n x| {\n fixed-address|10.0.0.5 {\n fixed-address|e {\n", 0);

    row("declaration", "", "", addWords(&DhcpdConfigModel::addDeclaration, split("pool|a b||\"c")),
        "pool|a b||\"c {\n");
    row("declaration: top", "", "top", addWords(&DhcpdConfigModel::addDeclaration, split("pool")), "pool {\n");
    row("declaration: subnet", "subnet a { }", "subnet", addWords(&DhcpdConfigModel::addDeclaration, split("pool|")),
        "subnet|a {\n pool| {\n");
    row("declaration: fixed address", "fixed-address a;", "fixed",
        addWords(&DhcpdConfigModel::addDeclaration, split("b")), "fixed-address|a {\n b {\n");
    row("parameter", "", "", addWords(&DhcpdConfigModel::addParameter, split("option|a b||\"c")), "option|a b||\"c\n");
    row("parameter: before declarations", "a { } b c;", "",
        addWords(&DhcpdConfigModel::addParameter, split("authoritative")), "b|c\nauthoritative\na| {\n");
    row("parameter: named as a declaration", "", "", addWords(&DhcpdConfigModel::addParameter, split("range|a|b")),
        "range|a|b\n");

    row("bind9", "", "",
        addWords(&DhcpdConfigModel::addBind9,
                 split(R"(key|"k"|algorithm|hmac-md5|secret|"YQ=="|zone|a.|primary|127.0.0.1|key|"k")")),
        "key|\"k\" {\n algorithm|hmac-md5\n secret|\"YQ==\"\nzone|a. {\n primary|127.0.0.1\n key|\"k\"\n");
    row("bind9: group", "group { }", "group",
        addWords(&DhcpdConfigModel::addBind9, split("zone|a.|primary|127.0.0.1|key|k")),
        "group| {\n zone|a. {\n  primary|127.0.0.1\n  key|k\n");
    row("bind9: group of four words shifts the next", "", "",
        addWords(&DhcpdConfigModel::addBind9, split("zone|a.|primary|127.0.0.1|zone|b.|primary|127.0.0.1|key|k")),
        "zone|a. {\n primary|127.0.0.1\n zone|b.\nprimary|127.0.0.1 {\n key|k\n");
    row("bind9: cut short", "", "top", addWords(&DhcpdConfigModel::addBind9, split("zone|a.|primary")),
        "zone|a. {\n primary|\n");
    row("bind9: words with blanks", "", "", addWords(&DhcpdConfigModel::addBind9, split("zone|a b  c|x y|")),
        "zone|a|b||c {\n x|y|\n");
}

void DeclarationEditsTest::adds()
{
    QFETCH(EditCase, edit);
    verifyEdit(edit);
}

void DeclarationEditsTest::refuses_data()
{
    QTest::addColumn<Refusal>("refusal");

    const auto row = [](const char *before, const char *target, const Edit &edit, const char *error) {
        QTest::addRow("%s: %s: %s", error, before, target) << Refusal{text(before), text(target), edit, text(error)};
    };
    // Every parent that `operation` refuses, and the message that names it.
    const auto holderRows = [&row](const std::vector<std::pair<const char *, const char *>> &holders, const Edit &edit,
                                   const char *error) {
        for (const auto &[holder, keyword] : holders)
            row(holder, keyword, edit, qPrintable(text(error).arg(text(keyword))));
    };

    holderRows({{"host a { }", "host"}, {"Subnet a { }", "Subnet"}, {"range a b;", "range"}, {"group;", "group"}},
               addSharedNetwork("a"), "Error adding shared-network. Can not add shared-network to '%1'");
    row("shared-network a { }", "shared-network", addSharedNetwork("a"),
        "Error adding shared-network. Can not add shared-network to 'shared-network'");

    for (const auto &[address, mask, shown] : {
             std::tuple{"10.0.0.0", "33", "10.0.0.0/33"},
             std::tuple{"10.0.0.0", "255.0.255.0", "10.0.0.0/255.0.255.0"},
             std::tuple{"10.0.0.0", "-1", "10.0.0.0/-1"},
             std::tuple{"10.0.0.0/24", "24", "10.0.0.0/24/24"},
             std::tuple{"abc", "", "abc"},
             std::tuple{"", "", ""},
         }) {
        const QString error{QStringLiteral("Error adding subnet. Invalid subnet '%1'").arg(text(shown))};
        row("", "", addSubnet(address, mask), qPrintable(error));
        row("host a { }", "host", addSubnet(address, mask), qPrintable(error)); // checked before the parent
    }
    holderRows({{"host a { }", "host"},
                {"subnet a { }", "subnet"},
                {"pool { }", "pool"},
                {"shared-network;", "shared-network"},
                {"group;", "group"}},
               addSubnet("10.0.0.0", "24"), "Error adding subnet. Can not add subnet to '%1'");

    holderRows({{"subnet 10.0.0.0 netmask 255.0.0.0;", "subnet"},
                {"a b;", "a"},
                {"host a b { }", "host"},
                {"pool a b c { }", "pool"}},
               addRange("10.0.0.1", "10.0.0.2"), "Error adding range. Can not add range to '%1'");
    for (const char *target : {"", "top", "shared-network", "pool", "subnet"}) {
        row("shared-network a { pool { } } subnet a { }", target, addRange("", ""),
            "Error adding range. Invalid attributes of parent subnet");
    }
    for (const char *words : {"a netmask 255.0.0.0", "10.0.0.0 netmask a", "10.0.0.0 netmask 255.0.255.0",
                              "10.0.0.0 netmask", "10.0.0.0 255.0.0.0 netmask"}) {
        row(qPrintable(QStringLiteral("subnet %1 { }").arg(text(words))), "subnet", addRange("", ""),
            "Error adding range. Invalid parent subnet");
    }
    for (const char *start : {"", "abc", "10.0.1.1", "127.0.0.1", "255.255.255.255", "::1"}) {
        row(subnet, "subnet", addRange(start, "bad"),
            qPrintable(QStringLiteral("Error adding range. Invalid start IP '%1'").arg(text(start))));
    }
    for (const char *end : {"", "abc", "10.0.1.1", "127.0.0.1", "255.255.255.255", "10.0.0.4"}) {
        row(subnet, "subnet", addRange("10.0.0.5", end),
            qPrintable(QStringLiteral("Error adding range. Invalid end IP '%1'").arg(text(end))));
    }
    row("subnet 0.0.0.0 netmask 0.0.0.0 { }", "subnet", addRange("127.0.0.1", "128.0.0.1"),
        "Error adding range. Invalid start IP '127.0.0.1'");
    row("subnet 0.0.0.0 netmask 0.0.0.0 { }", "subnet", addRange("10.0.0.1", "255.255.255.255"),
        "Error adding range. Invalid end IP '255.255.255.255'");

    for (const char *name : {"pc", ""}) {
        holderRows({{"subnet a { }", "subnet"},
                    {"shared-network a { }", "shared-network"},
                    {"host a { }", "host"},
                    {"group;", "group"}},
                   addHost(name, "", ""), "Error adding host. Can not add host to '%1'");
    }
    row("", "", addHost("", "zz", "10.0.0.1"), "Error adding host. Host name can not be empty.");

    for (const char *address : {"10.0.0.1", "abc"}) {
        holderRows({{"subnet a { }", "subnet"}, {"host a;", "host"}, {"group { }", "group"}}, addFixedAddress(address),
                   "Error adding fixed address. Can not add to '%1'");
    }
    row("", "", addFixedAddress("10.0.0.1"), "Error adding fixed address. Can not add to 'All network'");
    row("", "top", addFixedAddress("10.0.0.1"), "Error adding fixed address. Can not add to 'Topology'");
    for (const char *address : {"", "abc", "127.0.0.1", "255.255.255.255"}) {
        row("host a { fixed-address b; }", "host", addFixedAddress(address),
            qPrintable(QStringLiteral("Error adding fixed address. Invalid IP '%1'").arg(text(address))));
    }

    for (const auto &[before, target] : {std::pair{"range a b;", "range"}, std::pair{"SubClass a b { }", "SubClass"},
                                         std::pair{"option a b;", "option"}}) {
        row(before, target, addWords(&DhcpdConfigModel::addDeclaration, split("a"), false),
            qPrintable(QStringLiteral("Error adding declaration. Can not add declaration to '%1'").arg(text(target))));
        row(before, target, addWords(&DhcpdConfigModel::addParameter, split("a"), false),
            qPrintable(QStringLiteral("Error adding parameter. Can not add parameter to '%1'").arg(text(target))));
    }

    for (const QStringList &statements : {QStringList{}, split("zone|a")}) {
        holderRows({{"subnet a { }", "subnet"}, {"shared-network a { }", "shared-network"}, {"group;", "group"}},
                   addWords(&DhcpdConfigModel::addBind9, statements, false),
                   "Error adding bind9. Can not add bind9 to '%1'");
    }
    for (const char *target : {"", "top"}) {
        row("", target, addWords(&DhcpdConfigModel::addBind9, {}, false),
            "Error adding bind9. bind9 can not be empty.");
    }
}

void DeclarationEditsTest::refuses()
{
    QFETCH(Refusal, refusal);
    verifyRefusal(refusal);
}

void DeclarationEditsTest::addsNoBlocksThatCouldNotBeRead_data()
{
    QTest::addColumn<QString>("holder");
    QTest::addColumn<EditCase::Edit>("edit");
    QTest::addColumn<QString>("error");

    const auto row = [](const char *holder, const Edit &edit, const char *error) {
        QTest::addRow("%s", error) << text(holder) << edit << text(error);
    };
    row("group", addSharedNetwork("a"), "Error adding shared-network. Can not add shared-network to 'group'");
    row("group", addSubnet("10.0.0.0", "24"), "Error adding subnet. Can not add subnet to 'group'");
    row("shared-network", addSubnet("10.0.0.0", "24"), "Error adding subnet. Can not add subnet to 'shared-network'");
    row("group", addHost("pc", "", ""), "Error adding host. Can not add host to 'group'");
    row(
        "group",
        [](DhcpdConfigModel &model, const QModelIndex &parent) {
            model.addBind9(split("zone|a.|primary|127.0.0.1|key|k"), parent);
        },
        "Error adding bind9. Can not add bind9 to 'group'");
    row(
        "pool", [](DhcpdConfigModel &model, const QModelIndex &parent) { model.addDeclaration(split("a|b"), parent); },
        "Error adding declaration. Can not add declaration to 'pool'");
}

void DeclarationEditsTest::addsNoBlocksThatCouldNotBeRead()
{
    QFETCH(QString, holder);
    QFETCH(EditCase::Edit, edit);
    QFETCH(QString, error);

    EditedModel deep{nestedBlocks(maximumBlockDepth - 1, qPrintable(holder))};
    edit(deep.model(), innermost(deep.model()));
    deep.verifyChange(1);
    verifyIsReadAgain(deep);

    const QString deepest{nestedBlocks(maximumBlockDepth, qPrintable(holder))};
    EditedModel refused{deepest};
    edit(refused.model(), innermost(refused.model()));
    refused.verifyRefusal(error);
    QCOMPARE(refused.outline(), EditedModel{deepest}.outline());
}

void DeclarationEditsTest::addsLinesToTheDeepestBlock_data()
{
    QTest::addColumn<QString>("holder");
    QTest::addColumn<EditCase::Edit>("edit");

    QTest::addRow("range") << text("subnet 10.0.0.0 netmask 255.0.0.0") << addRange("10.0.0.1", "10.0.0.2");
    QTest::addRow("fixed address") << text("host a") << addFixedAddress("10.0.0.1");
    QTest::addRow("parameter") << text("pool") << addWords(&DhcpdConfigModel::addParameter, split("a|b"));
}

void DeclarationEditsTest::addsLinesToTheDeepestBlock()
{
    QFETCH(QString, holder);
    QFETCH(EditCase::Edit, edit);
    EditedModel edited{nestedBlocks(maximumBlockDepth, qPrintable(holder))};
    edit(edited.model(), innermost(edited.model()));
    edited.verifyChange(1);
    verifyIsReadAgain(edited);
}

void DeclarationEditsTest::makesNoBlockOfADeepestLine_data()
{
    QTest::addColumn<EditCase::Edit>("edit");
    QTest::addColumn<QString>("error");

    const auto row = [](const Edit &edit, const char *error) { QTest::addRow("%s", error) << edit << text(error); };
    row([](DhcpdConfigModel &model, const QModelIndex &line) { QVERIFY(!model.replaceWords(line, split("group|a"))); },
        "Error editing 'fixed-address'. The block would be nested too deeply.");
    row(addWords(&DhcpdConfigModel::addParameter, split("a|b"), false),
        "Error adding parameter. Can not add parameter to 'fixed-address'");
    row([](DhcpdConfigModel &model, const QModelIndex &line) { model.addRouters(text("10.0.0.1"), line); },
        "Error adding gateways. Can not add to 'fixed-address'");
    const auto routes = [&row](void (DhcpdConfigModel::*add)(const QStringList &, bool, const QModelIndex &), bool ms) {
        row([=](DhcpdConfigModel &model,
                const QModelIndex &line) { (model.*add)(split("24|10,0,0|10.0.0.1"), ms, line); },
            "Error adding static route. Can not add static rout to 'fixed-address'");
    };
    routes(&DhcpdConfigModel::addStaticRoutes, false);
    routes(&DhcpdConfigModel::addRoutes, true);
}

void DeclarationEditsTest::makesNoBlockOfADeepestLine()
{
    QFETCH(EditCase::Edit, edit);
    QFETCH(QString, error);
    const QString deepest{nestedBlocks(maximumBlockDepth, "host a")
                              .replace(QLatin1String{"host a {"}, QLatin1String{"host a { fixed-address 10.0.0.1;"})};
    EditedModel edited{deepest};
    QVERIFY(edited.model().replaceWords(edited.find(text("fixed-address")), split("fixed-address|10.0.0.1")));
    edit(edited.model(), edited.find(text("fixed-address")));
    edited.verifyRefusal(error);
    QCOMPARE(edited.outline(), EditedModel{deepest}.outline());
    verifyIsReadAgain(edited);
}

void DeclarationEditsTest::computesDefaultRange_data()
{
    QTest::addColumn<QString>("subnet");
    QTest::addColumn<QString>("expected");

    for (const auto &[subnet, expected] : {
             std::pair{"192.168.1.0/24", "192.168.1.1|192.168.1.254"},
             std::pair{"192.168.1.77/24", "192.168.1.1|192.168.1.254"},
             std::pair{"192.168.1.0/255.255.255.0", "192.168.1.1|192.168.1.254"},
             std::pair{"10.1", "10.1.0.1|10.1.255.254"},
             std::pair{"10.0.0.4/30", "10.0.0.5|10.0.0.6"},
             std::pair{"10.0.0.4/31", "10.0.0.5|10.0.0.5"},
             std::pair{"10.0.0.4/32", "10.0.0.5|10.0.0.4"},
             std::pair{"255.255.255.255/32", "0.0.0.0|255.255.255.255"},
             std::pair{"255.255.255.254/31", "255.255.255.255|255.255.255.255"},
             std::pair{"0.0.0.0/0", "0.0.0.1|255.255.255.254"},
             std::pair{"128.0.0.0/1", "128.0.0.1|255.255.255.254"},
             std::pair{"10.0.0.0/33", "|"},
             std::pair{"10.0.0.0/", "|"},
             std::pair{"/", "|"},
             std::pair{"abc", "|"},
             std::pair{"", "|"},
         })
        QTest::addRow("%s", subnet) << text(subnet) << text(expected);
}

void DeclarationEditsTest::computesDefaultRange()
{
    QFETCH(QString, subnet);
    QFETCH(QString, expected);
    QCOMPARE(DhcpdConfigModel::defaultRange(subnet).join(QLatin1Char{'|'}), expected);
}

void DeclarationEditsTest::removesStatement()
{
    const auto remove = [](DhcpdConfigModel &model, const QModelIndex &index) { model.removeStatement(index); };
    const QString before{text("a b; c { d e; f { } } g { }")};
    verifyEdit({before, text("a"), remove, text("c| {\n d|e\n f| {\ng| {\n")});
    verifyEdit({before, text("c"), remove, text("a|b\ng| {\n")});
    verifyEdit({before, text("d"), remove, text("a|b\nc| {\n f| {\ng| {\n")});
    verifyEdit({before, text("f"), remove, text("a|b\nc| {\n d|e\ng| {\n")});
    verifyEdit({before, QString{}, remove, QString{}});
}

void DeclarationEditsTest::removesNothingWithoutParent()
{
    EditedModel edited{text("a b;")};
    edited.model().removeStatement({});
    QCOMPARE(edited.outline(), text("a|b\n"));
    QVERIFY(!edited.model().isModified());
}

void DeclarationEditsTest::replacesWords_data()
{
    QTest::addColumn<EditCase>("edit");

    const auto row = [](const char *name, const char *before, const char *target, const char *newWords,
                        const char *after) {
        const auto replace = [=](DhcpdConfigModel &model, const QModelIndex &index) {
            QVERIFY(model.replaceWords(index, split(newWords)));
        };
        QTest::addRow("%s", name) << EditCase{text(before), text(target), replace, text(after), 0};
    };
    row("parameter", "a b;", "a", "c|d e|f", "c|d e|f\n");
    row("fewer words", "a b c;", "a", "a|b", "a|b\n");
    row("one word split", "a b;", "a", "a b", "a b\n");
    row("empty word behind", "a b;", "a", "a|b|", "a|b|\n");
    row("declaration", "a { b c; d { } }", "a", "x|y", "x|y {\n b|c\n d| {\n");
    row("group", "group { }", "group", "group|x", "group|x {\n");
    row("letter case", "a b;", "a", "A|b", "A|b\n");
}

void DeclarationEditsTest::replacesWords()
{
    QFETCH(EditCase, edit);
    verifyEdit(edit);
}

void DeclarationEditsTest::doesNotReplaceWordsOfRoots()
{
    EditedModel edited{text("a b;")};
    QVERIFY(!edited.model().replaceWords(edited.find(text("top")), split("x|y")));
    QVERIFY(!edited.model().replaceWords(edited.find({}), split("x|y")));
    QCOMPARE(edited.model().data(edited.find({})).toString(), text("All network"));
    QCOMPARE(edited.model().headerData(0, Qt::Horizontal).toString(), text("Topology"));
    QVERIFY(!edited.model().isModified());
}

void DeclarationEditsTest::doesNotModifyWhenWordsAreTheSame()
{
    EditedModel edited{text("a b; authoritative;")};
    QSignalSpy changes{&edited.model(), &QAbstractItemModel::dataChanged};
    QVERIFY(edited.model().replaceWords(edited.find(text("a b")), split("a|b")));
    QVERIFY(edited.model().replaceWords(edited.find(text("auth")), split("authoritative|")));
    QCOMPARE(changes.size(), 0);
    QVERIFY(!edited.model().isModified());
}

void DeclarationEditsTest::namesKeys()
{
    EditedModel edited{
        text("key \"a\" { } zone z { key x; } group g { KEY b. { } shared-network n { key { } } key c { } }"
             "key d { } key y;")};
    const auto namesAt = [&](const char *target) { return edited.model().keyNames(edited.find(text(target))); };
    QCOMPARE(namesAt("top"), split("a|b.||c|d"));
    QCOMPARE(namesAt(""), split("a|b.||c|d"));
    QCOMPARE(namesAt("group"), split("a|b.||c"));
    QCOMPARE(namesAt("zone"), split("a"));
    QCOMPARE(EditedModel{text("a { }")}.model().keyNames(), QStringList{});
}

QTEST_GUILESS_MAIN(DeclarationEditsTest)
#include "tst_declarationedits.moc"
