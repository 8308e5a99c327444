// SPDX-License-Identifier: GPL-3.0-or-later
// What the DHCP server itself says of a file after every command of the topology tree.
#include "common/paths.h"
#include "config/dhcpdconfigmodel.h"
#include "tests/app/topologywindow.h"
#include "tests/support/dialogdriver.h"
#include "tests/support/realdhcpd.h"

#include <QDialog>
#include <QMenuBar>
#include <QTest>

namespace {

constexpr auto configuration = R"(authoritative;
min-lease-time 60;
subnet 10.0.0.0 netmask 255.255.255.0 {
    range dynamic-bootp 10.0.0.10 10.0.0.20;
}
key old {
    algorithm hmac-md5;
    secret "b2xk";
}
host single {
    hardware ethernet 00:11:22:33:44:55;
}
)";

constexpr auto bind9Configuration = R"(key "ddns" {
    algorithm hmac-sha256;
    secret "Zm9vYmFy";
};
zone "example.org" IN {
    type master;
    file "/var/lib/bind/db.example.org";
    allow-update { key "ddns"; };
};
)";

constexpr auto saved = R"(authoritative ;
min-lease-time 120;
option classless-static-routes code 121 = array of integer 8;
option classless-static-routes 24, 192,168,1, 10,0,0,3;
option ms-classless-static-routes code 249 = array of unsigned integer 8;
subnet 10.0.0.0 netmask 255.255.255.0 {
    option routers 10.0.0.1, 10.0.0.3;
    option domain-name-servers 10.0.0.1, 10.0.0.2;
    option ntp-servers 10.0.0.1, 10.0.0.4;
    option domain-name "b.example.org";
    default-lease-time 7200;
    max-lease-time 172800;
    range dynamic-bootp 10.0.0.10 10.0.0.25;
    range 10.0.0.101 10.0.0.199;
    pool  {
        allow unknown-clients;
        range 10.0.0.210 10.0.0.219;
    }
}
host single {
    hardware ethernet 00:11:22:33:44:88;
    option ms-classless-static-routes 16, 172,16, 10,0,0,1;
    fixed-address 10.0.0.6;
}
shared-network attic {
    subnet 192.168.2.0 netmask 255.255.255.128 {
    }
}
subnet 10.1.0.0 netmask 255.255.0.0 {
}
host b.lan {
    hardware ethernet 00:11:22:33:44:77;
    fixed-address 10.0.0.8;
}
key "ddns" {
    algorithm hmac-sha256;
    secret "Zm9vYmFy";
}
zone example.org. {
    primary 127.0.0.1;
    key "ddns";
}
)";

/// A command of a statement's menu, and what is typed into its dialog.
struct Step
{
    const char *statement;
    QStringList entries;
    Fill fill{};
    bool isAdvanced{};
};

void saveThroughTheMenu(const TopologyWindow &window, ModalBoxes &boxes)
{
    auto *bar = driver::find<QMenuBar>(window.window());
    boxes.expectMenu(text("Save"));
    boxes.expectBox(saveQuestion(), QMessageBox::Save);
    QTest::mouseClick(bar, Qt::LeftButton, {}, bar->actionGeometry(bar->actions().first()).center());
    boxes.verify();
}

} // namespace

class TopologyVerdictTest final : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void serverAcceptsWhatEveryCommandMade();
    void serverAcceptsRoutesWhereverTheyAreOffered_data();
    void serverAcceptsRoutesWhereverTheyAreOffered();

private:
    QString m_server;
};

void TopologyVerdictTest::initTestCase()
{
    // Looked for before a window puts another server into PATH.
    m_server = realDhcpd();
    if (m_server.isEmpty())
        QSKIP("no dhcpd in the folder of ORV_TOOLS_DIR, in PATH or in /usr/sbin");
}

void TopologyVerdictTest::serverAcceptsWhatEveryCommandMade()
{
    const TopologyWindow window{configuration};
    ModalBoxes boxes;

    const QStringList edit{list("Edit")};
    const QString same{};
    const Step steps[]{
        {"subnet", option("Add gateways"), addAddresses(list("10.0.0.1"))},
        {"option routers", edit, addAddresses(list("10.0.0.3"))},
        {"subnet", option("Add DNS servers"), addAddresses(list("10.0.0.1"))},
        {"option domain-name-servers", edit, addAddresses(list("10.0.0.2"))},
        {"subnet", option("Add NTP servers"), addAddresses(list("10.0.0.1"))},
        {"option ntp-servers", edit, addAddresses(list("10.0.0.4"))},
        {"subnet", option("Add domain name")},
        {"option domain-name ", edit, type(list("b.example.org"))},
        {"subnet", parameter("Add default lease time"), type({same, same, text("1")})},
        {"default-lease-time", edit, type({same, same, text("2")})},
        {"subnet", parameter("Add max lease time"), type({same, text("1")})},
        {"max-lease-time", edit, type({same, text("2")})},
        {"min-lease-time", edit, type({same, same, same, text("2")})},
        {"range dynamic", edit, type({same, text("10.0.0.25")})},
        {"subnet", list("Add range"), type(list("10.0.0.100 | 10.0.0.200"))},
        {"range 10.0.0.100", edit, type(list("10.0.0.101 | 10.0.0.199"))},
        {"subnet", list("Add arbitrary declaration"), type(list("group")), true},
        {"group", edit, type(list("pool ")), true},
        {"pool", parameter("Add arbitrary parameter"), type(list("deny unknown-clients")), true},
        {"deny", edit, type(list("allow unknown-clients")), true},
        {"pool", list("Add arbitrary declaration"), type(list("range 10.0.0.210 10.0.0.219")), true},
        {"", list("Add shared network"), type(list("lab"))},
        {"shared-network", edit, type(list("attic"))},
        {"shared-network", list("Add subnet")},
        {"subnet 192", edit, type(list("192.168.2.0/25"))},
        {"", list("Add subnet"), type(list("10.1.0.0/16"))},
        {"", list("Add host"), type(list("a.lan | 001122334466 | 10.0.0.7"))},
        {"host a", edit, type(list("b.lan | 001122334477 | 10.0.0.8"))},
        {"host single", list("Add fixed IP"), type(list("10.0.0.5"))},
        {"fixed-address 10.0.0.5", edit, type(list("10.0.0.6"))},
        {"hardware ethernet 00:11:22:33:44:55", edit, type(list("001122334488"))},
        {"", list("Add static route"), addRoute(list("255.255.255.0 | 192.168.1.0 | 10.0.0.1"), false)},
        {"option classless-static-routes 24", edit, typeInCell(0, 2, text("10.0.0.3"))},
        {"option classless-static-routes code", edit,
         type(list("option classless-static-routes code 121 = array of integer 8")), true},
        {"host single", list("Add static route"), addRoute(list("255.255.0.0 | 172.16.0.0 | 10.0.0.1"), true)},
    };
    const auto answer = [&](const Step &step) {
        if (step.isAdvanced)
            boxes.expectBox(advancedBox(), QMessageBox::Yes);
        boxes.expectDialog<QDialog>([&](QDialog *dialog) {
            if (step.fill)
                step.fill(boxes, dialog);
            save(*dialog);
        });
    };
    for (const Step &step : steps) {
        const int before{window.notices()};
        window.choose(boxes, text(step.statement), step.entries, [&] { answer(step); });
        QVERIFY2(window.notices() > before, step.statement);
    }
    window.choose(boxes, text("key old"), list("Remove"));
    writeTestFile(paths::bind9LocalConfiguration(), bind9Configuration);
    window.choose(boxes, {}, option("Add DHCP dynamic zone update"), [&] {
        boxes.expectBox({QMessageBox::Information, text("Information"),
                         text("Add configuration to automatically configure binding with bind9 DNS server?"),
                         QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes},
                        QMessageBox::Yes);
        boxes.expectFileDialog(paths::bind9LocalConfiguration());
    });

    saveThroughTheMenu(window, boxes);
    const QByteArray file{readTestFile(paths::configuration())};
    QCOMPARE(complaintOf(m_server, file), QString{});
    QCOMPARE(QString::fromUtf8(file), text(saved));
    QVERIFY(!window.offersSave());
}

void TopologyVerdictTest::serverAcceptsRoutesWhereverTheyAreOffered_data()
{
    QTest::addColumn<QByteArray>("site");
    QTest::addColumn<QString>("place");
    QTest::addColumn<bool>("ms");

    const struct
    {
        const char *name;
        const char *configuration;
        const char *place;
    } places[]{
        {"all networks", "", ""},
        {"host", "host h { }", "host"},
        {"host in a group", "group { host h { } }", "host"},
        {"host in a group in a group", "group { group { host h { } } }", "host"},
        {"host in a subnet", "subnet 10.0.0.0 netmask 255.0.0.0 { host h { } }", "host"},
        {"host in a group in a subnet", "subnet 10.0.0.0 netmask 255.0.0.0 { group { host h { } } }", "host"},
        {"host in a pool", "subnet 10.0.0.0 netmask 255.0.0.0 { pool { host h { } range 10.0.0.5; } }", "host"},
        {"host in a shared network", "shared-network n { host h { } subnet 10.0.0.0 netmask 255.0.0.0 { } }", "host"},
        {"host in a subnet in a shared network",
         "shared-network n { subnet 10.0.0.0 netmask 255.0.0.0 { host h { } } }", "host"},
    };
    const QByteArray definitions{"option classless-static-routes code 121 = array of unsigned integer 8;\n"
                                 "option ms-classless-static-routes code 249 = array of unsigned integer 8;\n"};
    for (const auto &place : places) {
        for (const bool ms : {false, true}) {
            for (const bool isDefined : {false, true}) {
                QTest::addRow("%s%s, %s", place.name, ms ? ", for MS systems" : "", isDefined ? "defined" : "undefined")
                    << (isDefined ? definitions : QByteArray{}) + place.configuration << text(place.place) << ms;
            }
        }
    }
}

void TopologyVerdictTest::serverAcceptsRoutesWhereverTheyAreOffered()
{
    QFETCH(const QByteArray, site);
    QFETCH(const QString, place);
    QFETCH(const bool, ms);
    const TopologyWindow window{site};
    ModalBoxes boxes;
    window.choose(boxes, place, list("Add static route"), [&] {
        boxes.expectDialog<QDialog>([&](QDialog *dialog) {
            addRoute(list("255.255.0.0 | 172.16.0.0 | 10.0.0.1"), ms)(boxes, dialog);
            save(*dialog);
        });
    });
    const QString option{ms ? text("option ms-classless-static-routes") : text("option classless-static-routes")};
    QCOMPARE(window.model().parent(window.find(option + text(" 16, 172,16, 10,0,0,1"))), window.find(place));
    QCOMPARE(complaintOf(m_server, window.content()), QString{});
}

QTEST_MAIN(TopologyVerdictTest)
#include "tst_topologyverdict.moc"
