// SPDX-License-Identifier: GPL-3.0-or-later
// What the DHCP server itself says of the configurations that edits make.
#include "config/bind9reader.h"
#include "tests/config/editedmodel.h"
#include "tests/support/realdhcpd.h"
#include "tests/support/temporaryroot.h"
#include "tests/support/text.h"

#include <QTemporaryDir>
#include <QTest>

namespace {

using Edit = EditCase::Edit;
using Model = DhcpdConfigModel;

constexpr auto base = R"(authoritative;
default-lease-time 600;
max-lease-time 7200;
option domain-name "a.org";
option domain-name-servers 10.0.0.1;
subnet 10.0.0.0 netmask 255.255.255.0 {
    range 10.0.0.10 10.0.0.20;
    option routers 10.0.0.1;
}
shared-network office {
    subnet 10.1.0.0 netmask 255.255.0.0 {
    }
}
group servers {
    host grouped {
    }
}
key known {
    algorithm hmac-sha256;
    secret "Zm9vYmFy";
}
host single {
    hardware ethernet 00:11:22:33:44:55;
    fixed-address 10.0.0.5;
}
)";

constexpr auto bind9File = R"(//
// Do any local configuration here
//
include "ddns.key";   /* root:bind, 0640 */

view "inside" {
    match-clients { 10.0.0.0/8; localhost; };
    zone "example.org" IN {   # the hosts
        type master;
        file "/var/lib/bind/db.example.org";
        allow-transfer { key "transfer"; 10.0.0.2; };
        allow-update { !{ !10.0.0.0/8; any; }; key "ddns-update"; };
    };
    zone "0.0.10.in-addr.arpa" {
        type master;
        file "/var/lib/bind/db.10.0.0";
        update-policy { grant LOCAL. zonesub ANY; };
    };
    zone "known.org" { type primary; file "x"; allow-update { key known; }; };
    zone "static.org" { type master; file "x"; allow-update { none; }; };
    zone "unknown.org" { type master; file "x"; allow-update { key "nowhere"; }; };
    zone "." { type hint; file "/usr/share/dns/root.hints"; };
};

key "local" { secret bG9jYWw/bG9jYWw/; algorithm "hmac-sha512"; };
key "transfer" { algorithm hmac-sha256; secret "dHJhbnNmZXI="; };
)";

constexpr auto bind9Key = R"(key "ddns-update" {
	algorithm hmac-sha256;
	secret "4uUJfgXuw/FbCvUKD9Yb3u4WQ6QZqYpFxUeq7VQkJvI=";
};
)";

Edit addBind9(const char *content)
{
    return [=](Model &model, const QModelIndex &parent) {
        const QTemporaryDir folder;
        writeTestFile(folder.filePath(QStringLiteral("ddns.key")), bind9Key);
        const QString file{folder.filePath(QStringLiteral("named.conf.local"))};
        writeTestFile(file, content);
        QVERIFY(model.addBind9(bind9::prepared(file, model.keyNames(parent)).statements, parent));
    };
}

Edit setText(const char *value)
{
    return
        [=](Model &model, const QModelIndex &index) { QVERIFY(model.setData(index.siblingAtColumn(1), text(value))); };
}

Edit addRoutes(bool ms)
{
    return [=](Model &model, const QModelIndex &parent) {
        model.addStaticRoutes({text("24"), text("192,168,1,0"), text("10,0,0,1")}, ms, parent);
    };
}

/// How the option of static routes is defined.
QString routeDefinition(bool ms)
{
    return ms ? text("option ms-classless-static-routes code 249 = array of unsigned integer 8;")
              : text("option classless-static-routes code 121 = array of unsigned integer 8;");
}

/// How many of the statements right below `parent` end with `words`.
int countBelow(const Model &model, const QModelIndex &parent, const QString &words)
{
    int count{};
    for (int row{}; row < model.rowCount(parent); ++row)
        count += model.statementFor(model.index(row, 0, parent))->joinedWords().endsWith(words) ? 1 : 0;
    return count;
}

using TimeOperation = bool (Model::*)(const QString &seconds, const QModelIndex &parent);

Edit addTime(TimeOperation add, const char *seconds)
{
    return [=](Model &model, const QModelIndex &parent) { QVERIFY((model.*add)(text(seconds), parent)); };
}

} // namespace

class VerdictTest final : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void addsFromBind9();
    void verdictOnEdit_data();
    void verdictOnEdit();
    void verdictOnRoutes_data();
    void verdictOnRoutes();
    void verdictOnKeyNames();

private:
    QString m_dhcpd;
};

void VerdictTest::initTestCase()
{
    m_dhcpd = realDhcpd();
    if (m_dhcpd.isEmpty())
        QSKIP("no dhcpd in the folder of ORV_TOOLS_DIR, in PATH or in /usr/sbin");
    QCOMPARE(complaintOf(m_dhcpd, base), QString{});
    QCOMPARE(complaintOf(m_dhcpd, "authoritative;\nhost;\n"), text("line 2: expecting a name for host declaration."));
}

// The file that the rows below add from bind9.
void VerdictTest::addsFromBind9()
{
    EditedModel edited{text("key known { }")};
    addBind9(bind9File)(edited.model(), edited.find({}));
    QCOMPARE(edited.outline(), text(R"(key|known {
key|"ddns-update" {
 algorithm|hmac-sha256
 secret|"4uUJfgXuw/FbCvUKD9Yb3u4WQ6QZqYpFxUeq7VQkJvI="
zone|example.org. {
 primary|127.0.0.1
 key|"ddns-update"
key|"local" {
 secret|"bG9jYWw/bG9jYWw/"
 algorithm|hmac-sha512
zone|0.0.10.in-addr.arpa. {
 primary|127.0.0.1
 key|"local"
zone|known.org. {
 primary|127.0.0.1
 key|known
key|"transfer" {
 algorithm|hmac-sha256
 secret|"dHJhbnNmZXI="
)"));
}

void VerdictTest::verdictOnEdit_data()
{
    QTest::addColumn<QString>("target");
    QTest::addColumn<EditCase::Edit>("edit");
    QTest::addColumn<QString>("complaint"); // without its line number

    const auto row = [](const char *name, const char *target, const Edit &edit, const char *complaint) {
        QTest::addRow("%s", name) << text(target) << edit << text(complaint);
    };
    const auto accepted = [&row](const char *name, const char *target, const Edit &edit) {
        row(name, target, edit, "");
    };

    accepted("subnet", "", addSubnet("10.2.0.7", "16"));
    accepted("subnet in a group", "group", addSubnet("10.2.0.0", "255.255.0.0"));
    accepted("subnet in a shared network", "shared-network", addSubnet("10.2.0.0", "16"));
    accepted("subnet with nothing else in it", "", addSubnet("10.2.0.0/31", ""));
    accepted("subnet of everything", "", addSubnet("0.0.0.0", "0"));
    accepted("range", "subnet 10.0", addRange("10.0.0.30", "10.0.0.40"));
    accepted("range of one address", "subnet 10.0", addRange("10.0.0.30", "10.0.0.30"));
    accepted("range edited", "range", setText("10.0.0.30 10.0.0.30"));
    accepted("host", "", addHost("pc", "00:11:22:33:44:56", "10.0.0.6"));
    accepted("host in a group", "group", addHost("pc.a_b.1", "", ""));
    accepted("host with an invalid MAC", "", addHost("pc", "zz", "127.0.0.1"));
    accepted("fixed address", "host grouped", addValue(&Model::addFixedAddress, "10.0.0.7"));
    accepted("fixed address replaced", "host single", addValue(&Model::addFixedAddress, "10.0.0.7"));
    accepted("routers", "subnet 10.1", addValue(&Model::addRouters, "10.1.0.1, 10.1.0.2"));
    accepted("routers replaced", "subnet 10.0", addValue(&Model::addRouters, "10.0.0.2,10.0.0.3"));
    accepted("DNS servers of a host", "host single", addValue(&Model::addDnsServers, "10.0.0.1"));
    accepted("DNS servers replaced", "", addValue(&Model::addDnsServers, "10.0.0.3, 10.0.0.4"));
    accepted("NTP servers", "group", addValue(&Model::addNtpServers, "10.0.0.3"));
    accepted("domain name", "shared-network", addValue(&Model::addDomainName, "\"example.org\""));
    accepted("domain name replaced", "", addValue(&Model::addDomainName, "\"example.org\""));
    accepted("domain name replaced twice", "", [](Model &model, const QModelIndex &parent) {
        model.addDomainName(text("\"b.org\""), parent);
        model.addDomainName(text("\"c.org\""), parent);
    });
    accepted("default lease time", "subnet 10.1", addTime(&Model::addDefaultLeaseTime, "0600"));
    accepted("max lease time replaced", "", addTime(&Model::addMaxLeaseTime, "4294967295"));
    accepted("static routes", "", addRoutes(false));
    accepted("static routes for MS systems", "", addRoutes(true));
    accepted("static routes of a subnet", "subnet 10.0", addRoutes(false));
    accepted("static routes of a host for MS systems", "host single", addRoutes(true));
    accepted("static routes of both kinds in both places", "host single", [](Model &model, const QModelIndex &host) {
        for (const bool ms : {false, true, false, true}) {
            addRoutes(ms)(model, host);
            addRoutes(ms)(model, model.parent(host));
        }
    });
    accepted("declaration", "subnet 10.1", [](Model &model, const QModelIndex &parent) {
        model.addDeclaration({text("pool"), QString{}}, parent);
        const QModelIndex pool{model.index(model.rowCount(parent) - 1, 0, parent)};
        QVERIFY(model.addParameter({text("allow unknown-clients")}, pool));
        QVERIFY(model.addDeclaration({text("range"), text("10.1.0.5"), text("10.1.0.9")}, pool));
    });
    accepted("parameter", "", [](Model &model, const QModelIndex &parent) {
        QVERIFY(model.addParameter({text("ddns-update-style"), text("interim")}, parent));
    });
    accepted("words replaced", "host single", [](Model &model, const QModelIndex &host) {
        QVERIFY(model.replaceWords(host, {text("host"), text("other")}));
    });
    accepted("statement removed", "subnet 10.0",
             [](Model &model, const QModelIndex &subnet) { model.removeStatement(subnet); });
    accepted("bind9", "", addBind9(bind9File));
    accepted("bind9 in a group before the known key", "group", addBind9(bind9File));
    accepted("bind9 twice", "", [](Model &model, const QModelIndex &parent) {
        addBind9(bind9File)(model, parent);
        addBind9(bind9File)(model, parent);
    });
    accepted("bind9 names like keywords", "",
             addBind9("key file { algorithm hmac-sha256; secret \"Zm9v\"; };"
                      "key zone { algorithm hmac-sha256; secret \"Zm9v\"; };"
                      "zone type { allow-update { key \"file\"; }; }; zone zone { allow-update { key zone; }; };"));
    accepted("bind9 zone of a known key", "", addBind9(R"(zone "a.org" { allow-update { key "KNOWN"; }; };)"));

    // What the model deliberately accepts although the server does not: names and addresses stay as the user typed
    // them. Whoever saves them is told of the server's complaint.
    row("shared network without a subnet", "", addValue(&Model::addSharedNetwork, "empty"),
        "empty shared-network decl");
    row("shared network with a space in its name", "", addValue(&Model::addSharedNetwork, "my office"),
        "expecting left brace.");
    row("host with a space in its name", "", addHost("my pc", "", ""), "expecting a name for host declaration.");
    row("host of a known name", "", addHost("single", "", ""), "host single: already exists");
    row("MAC with hyphens", "", addHost("pc", "00-11-22-33-44-55", ""), "expecting numeric value.");
    row("MAC with dots", "", addHost("pc", "0011.2233.4455", ""), "expecting semicolon.");
    row("MAC with a colon more", "", addHost("pc", "00:11:22:33:44:55:", ""), "expecting numeric value.");
    row("range that overlaps", "subnet 10.0", addRange("10.0.0.20", "10.0.0.30"), "lease 10.0.0.20 is declared twice!");
    row("short address in a list", "", addValue(&Model::addNtpServers, "10.1"), "too few numbers.");
    row("IPv6 address in a list", "", addValue(&Model::addNtpServers, "fe80::1"), "semicolon expected.");
    row("IPv6 subnet", "", addSubnet("fe80::", "64"), "expecting numeric value.");
    row("lease time with a sign", "", addTime(&Model::addMaxLeaseTime, "+5"), "expecting number.");
    // The definition goes one level up, which is the top of the file for most statements but not for all.
    row("static routes below the top level", "subnet 10.1", addRoutes(false), "option definitions may not be scoped.");
}

void VerdictTest::verdictOnEdit()
{
    QFETCH(QString, target);
    QFETCH(EditCase::Edit, edit);
    QFETCH(QString, complaint);
    EditedModel edited{text(base)};
    const QString before{edited.outline()};
    edit(edited.model(), edited.find(target));
    QVERIFY(edited.outline() != before);
    const QString verdict{complaintOf(m_dhcpd, edited.model().fileContent())};
    QCOMPARE(verdict.section(text(": "), 1), complaint);
}

// Wherever the server takes an option, as one that nothing is said about yet, that is defined already, or beside the
// other kind.
void VerdictTest::verdictOnRoutes_data()
{
    QTest::addColumn<QString>("configuration");
    QTest::addColumn<QString>("place");
    QTest::addColumn<bool>("ms");

    const struct
    {
        const char *name;
        const char *configuration;
        const char *place;
    } places[]{
        {"all networks", "", ""},
        {"subnet", "subnet 10.0.0.0 netmask 255.0.0.0 { }", "subnet"},
        {"subnet in a shared network", "shared-network n { subnet 10.0.0.0 netmask 255.0.0.0 { } }", "subnet"},
        {"subnet in a group", "group { subnet 10.0.0.0 netmask 255.0.0.0 { } }", "subnet"},
        {"shared network", "shared-network n { subnet 10.0.0.0 netmask 255.0.0.0 { } }", "shared-network"},
        {"shared network in a group", "group { shared-network n { subnet 10.0.0.0 netmask 255.0.0.0 { } } }",
         "shared-network"},
        {"pool", "subnet 10.0.0.0 netmask 255.0.0.0 { pool { range 10.0.0.5; } }", "pool"},
        {"pool in a shared network",
         "shared-network n { subnet 10.0.0.0 netmask 255.0.0.0 { } pool { range 10.0.0.5; } }", "pool"},
        {"group", "group { }", "group"},
        {"group in a group", "group a { group b { } }", "group b"},
        {"group in a subnet", "subnet 10.0.0.0 netmask 255.0.0.0 { group { } }", "group"},
        {"group in a shared network", "shared-network n { group { } subnet 10.0.0.0 netmask 255.0.0.0 { } }", "group"},
        {"host", "host h { }", "host"},
        {"host in a group", "group { host h { } }", "host"},
        {"host in a group in a group", "group { group { host h { } } }", "host"},
        {"host in a subnet", "subnet 10.0.0.0 netmask 255.0.0.0 { host h { } }", "host"},
        {"host in a shared network", "shared-network n { host h { } subnet 10.0.0.0 netmask 255.0.0.0 { } }", "host"},
        {"host in a subnet in a shared network",
         "shared-network n { subnet 10.0.0.0 netmask 255.0.0.0 { host h { } } }", "host"},
        {"host in a group in a subnet", "subnet 10.0.0.0 netmask 255.0.0.0 { group { host h { } } }", "host"},
        {"host in a pool", "subnet 10.0.0.0 netmask 255.0.0.0 { pool { host h { } range 10.0.0.5; } }", "host"},
        {"class", R"(class "c" { match hardware; })", "class"},
        {"class in a group", R"(group { class "c" { match hardware; } })", "class"},
        {"class in a subnet", R"(subnet 10.0.0.0 netmask 255.0.0.0 { class "c" { match hardware; } })", "class"},
        {"subclass", R"(class "c" { match hardware; } subclass "c" 1:00:11:22:33:44:55 { })", "subclass"},
        {"condition", "if known { }", "if"},
        {"alternative", "if known { } else { }", "else"},
        {"condition in a subnet", "subnet 10.0.0.0 netmask 255.0.0.0 { if known { } }", "if"},
        {"event", "on commit { }", "on"},
        {"event in a pool", "subnet 10.0.0.0 netmask 255.0.0.0 { pool { range 10.0.0.5; on commit { } } }", "on"},
    };
    const struct
    {
        const char *name;
        QString definitions;
    } beginnings[]{
        {"undefined", {}},
        {"defined", routeDefinition(false) + routeDefinition(true)},
        {"one defined", routeDefinition(false)},
        {"defined by another name", text("option routes-of-others code 121 = array of integer 8;")},
    };
    for (const auto &place : places) {
        for (const auto &beginning : beginnings) {
            for (const bool ms : {false, true}) {
                QTest::addRow("%s, %s%s", place.name, beginning.name, ms ? ", for MS systems" : "")
                    << beginning.definitions + text(place.configuration) << text(place.place) << ms;
            }
        }
    }
}

void VerdictTest::verdictOnRoutes()
{
    QFETCH(const QString, configuration);
    QFETCH(const QString, place);
    QFETCH(const bool, ms);
    QCOMPARE(complaintOf(m_dhcpd, configuration.toUtf8()), QString{});
    EditedModel edited{configuration};
    DhcpdConfigModel &model{edited.model()};
    const QStringList network{text("24"), text("192,168,1"), text("10,0,0,1")};
    const QStringList everything{text("0"), text("10,0,0,1")};
    for (const bool isMs : {ms, !ms, ms}) {
        model.addRoutes(isMs == ms ? network : everything, isMs, edited.find(place));
        QCOMPARE(complaintOf(m_dhcpd, model.fileContent()), QString{});
    }
    QCOMPARE(countBelow(model, edited.find(place), text(" 24, 192,168,1, 10,0,0,1")), 2);
    QCOMPARE(countBelow(model, edited.find(place), text(" 0, 10,0,0,1")), 1);
    for (const bool isMs : {false, true})
        QCOMPARE(model.fileContent().count(routeDefinition(isMs).toUtf8()), 1);
}

// The model relies on the way in which the server compares the names of keys.
void VerdictTest::verdictOnKeyNames()
{
    const QByteArray configuration{"key %1 { algorithm hmac-sha256; secret \"Zm9v\"; }\n"
                                   "zone a.org. { primary 127.0.0.1; key %2; }\n"};
    const auto isAccepted = [&](const char *definition, const char *reference) {
        QByteArray text{configuration};
        return complaintOf(m_dhcpd, text.replace("%1", definition).replace("%2", reference)).isEmpty();
    };
    QVERIFY(isAccepted("k", "k"));
    QVERIFY(isAccepted("\"k\"", "k"));
    QVERIFY(isAccepted("k", "\"K\""));
    QVERIFY(isAccepted("k.", "k."));
    QVERIFY(!isAccepted("k.", "k"));
    QVERIFY(!isAccepted("k", "k."));
    QVERIFY(!isAccepted("k", "l"));
}

QTEST_GUILESS_MAIN(VerdictTest)
#include "tst_verdict.moc"
