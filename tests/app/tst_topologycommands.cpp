// SPDX-License-Identifier: GPL-3.0-or-later
// The commands of the topology tree that add and remove statements.
#include "common/paths.h"
#include "config/dhcpdconfigmodel.h"
#include "tests/app/topologywindow.h"

#include <QAction>
#include <QDir>
#include <QFileDialog>
#include <QFileInfo>
#include <QScrollBar>
#include <QTest>
#include <QTreeView>

namespace {

constexpr auto configuration = R"(default-lease-time 600;
option domain-name "a.org";
subnet 10.0.0.0 netmask 255.255.255.0 {
    range 10.0.0.10 10.0.0.20;
    option routers 10.0.0.1;
}
subnet 10.3.0.0 {
    authoritative;
}
shared-network office {
    subnet 10.1.0.0 netmask 255.255.0.0 {
        authoritative;
    }
}
group servers {
    host grouped {
        fixed-address 10.0.0.6;
    }
}
host single {
    hardware ethernet 00:11:22:33:44:55;
}
)";

constexpr auto everyPlace = R"(option classless-static-routes code 121 = array of unsigned integer 8;
subnet 10.1.0.0 netmask 255.255.255.0 {
}
shared-network office {
    subnet 10.2.0.0 netmask 255.255.255.0 {
    }
}
group printers {
    allow booting;
}
host plotter {
    hardware ethernet 00:11:22:33:44:55;
}
)";

constexpr auto bind9Configuration = R"(// local zones
zone "example.org" IN {
    type master;
    file "/var/lib/bind/db.example.org";
    allow-update { key "ddns"; };
};
key "ddns" {
    algorithm hmac-sha256;
    secret "Zm9vYmFy";
};
)";

const ModalBoxes::Box bind9Box{
    QMessageBox::Information, QStringLiteral("Information"),
    QStringLiteral("Add configuration to automatically configure binding with bind9 DNS server?"),
    QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes};

/// A command that adds through a dialog, as chosen from a statement's menu.
struct AddCase
{
    QString parent;
    QStringList entries;
    Input input;
    QStringList changes;
    bool isAdvanced{}; ///< asks first, and expands the whole tree afterwards
    QString child{};   ///< what was added to the parent; none when a statement there was changed
};

Input subnetInput(const QStringList &typed)
{
    return {text("Add subnet"), list("Address: | 192.168.1.0/24 | Netmask: | 255.255.255.0"), type(typed)};
}

Input rangeInput(const QStringList &defaults, const QStringList &typed)
{
    return {text("Add range"), {text("Start IP:"), defaults.at(0), text("End IP:"), defaults.at(1)}, type(typed)};
}

Input hostInput(const QStringList &typed)
{
    return {text("Add host"), list("Name: |  | MAC address: | 00:00:00:00:00:00 | Fixed IP: | "), type(typed)};
}

Input addressesInput(const char *title, const char *label, const QStringList &added)
{
    return {text(title), {text(label), QString{}}, addAddresses(added)};
}

Input domainInput(const QStringList &typed)
{
    return {text("Add domain name"), list("Domain name: | example.org"), type(typed)};
}

Input timeInput(const char *title, const QStringList &typed)
{
    return {text(title), list("Mounth: | 0 | Days: | 0 | 0 h | : | 0 m | : | 0 s"), type(typed)};
}

Input routesInput(const Fill &fill)
{
    return {text("Add static route"), {text("Static routes"), QString{}, text("[ ] Route for MS systems")}, fill};
}

Input sharedNetworkInput(const QStringList &typed)
{
    return {text("Add shared network"), list("Name: | "), type(typed)};
}

Input fixedAddressInput(const QStringList &typed) { return {text("Add fixed address"), list("IP: | "), type(typed)}; }

Input declarationInput(const QStringList &typed)
{
    return {text("Add arbitrary declaration"), list("Declaration: | "), type(typed)};
}

Input parameterInput(const QStringList &typed)
{
    return {text("Add arbitrary parameter"), list("Parameter: | "), type(typed)};
}

QStringList sorted(QStringList texts)
{
    texts.sort();
    return texts;
}

/// Saves, which writes the configuration as the window has it.
void compareFile(const TopologyWindow &window, ModalBoxes &boxes)
{
    QCOMPARE(window.saveToFile(boxes), window.content());
    QVERIFY(!window.offersSave());
}

} // namespace

Q_DECLARE_METATYPE(AddCase)

using Slot = void (FMain::*)();
Q_DECLARE_METATYPE(Slot)

class TopologyCommandsTest final : public QObject
{
    Q_OBJECT

private slots:
    void addPutsTheStatementIn_data() { addCases(); }
    void addPutsTheStatementIn();
    void addWorksInEveryPlace_data();
    void addWorksInEveryPlace();
    void routeTakesTheDefinitionThatIsThere();
    void cancelledAddChangesNothing_data() { addCases(); }
    void cancelledAddChangesNothing();
    void addedStatementIsScrolledTo_data();
    void addedStatementIsScrolledTo();
    void declinedWarningOpensNothing_data();
    void declinedWarningOpensNothing();
    void refusedAddSaysWhy_data();
    void refusedAddSaysWhy();
    void addNeedsADeclaration_data();
    void addNeedsADeclaration();
    void rangeIsOfferedForTheSubnet_data();
    void rangeIsOfferedForTheSubnet();
    void bind9AddsZonesAndKeys();
    void bind9IsGivenUp_data();
    void bind9IsGivenUp();
    void bind9IsRefused_data();
    void bind9IsRefused();
    void bind9ZonesThatAreLeftOutAreNamed_data();
    void bind9ZonesThatAreLeftOutAreNamed();
    void removeTakesTheStatementOut_data();
    void removeTakesTheStatementOut();
    void removeTakesNothingAboveTheStatements();

private:
    static void addCases();
};

void TopologyCommandsTest::addCases()
{
    QTest::addColumn<AddCase>("add");
    QTest::addColumn<QStringList>("shown");
    const auto row = [](const char *name, const AddCase &add, const char *shown) {
        QTest::addRow("%s", name) << add << list(shown);
    };

    row("shared network",
        {{},
         list("Add shared network"),
         sharedNetworkInput(list("lab")),
         list("+shared-network lab"),
         false,
         text("shared-network lab")},
        "+Shared network: lab");
    row("subnet",
        {{},
         list("Add subnet"),
         subnetInput(list("10.2.0.7/16")),
         list("+subnet 10.2.0.0 netmask 255.255.0.0"),
         false,
         text("subnet 10.2")},
        "+Subnet: 10.2.0.0 / 255.255.0.0");
    row("subnet with a netmask",
        {{},
         list("Add subnet"),
         subnetInput(list("10.2.0.0 | 255.255.128.0")),
         list("+subnet 10.2.0.0 netmask 255.255.128.0"),
         false,
         text("subnet 10.2")},
        "+Subnet: 10.2.0.0 / 255.255.128.0");
    row("subnet as offered",
        {text("shared-network"), list("Add subnet"), subnetInput({}),
         list("+shared-network office > subnet 192.168.1.0 netmask 255.255.255.0"), false, text("subnet 192")},
        "+Subnet: 192.168.1.0 / 255.255.255.0");
    row("subnet typed",
        {text("shared-network"), list("Add subnet"), subnetInput(list("10.4.0.0 | 255.255.254.0")),
         list("+shared-network office > subnet 10.4.0.0 netmask 255.255.254.0"), false, text("subnet 10.4")},
        "+Subnet: 10.4.0.0 / 255.255.254.0");
    row("range",
        {text("subnet 10.0"), list("Add range"),
         rangeInput(list("10.0.0.1 | 10.0.0.254"), list("10.0.0.30 | 10.0.0.40")),
         list("+subnet 10.0.0.0 netmask 255.255.255.0 > range 10.0.0.30 10.0.0.40;"), false, text("range 10.0.0.30")},
        "+Range: 10.0.0.30 - 10.0.0.40");
    row("host",
        {{},
         list("Add host"),
         hostInput(list("pc.lan | 001122334466 | 10.0.0.7")),
         list("+host pc.lan | +host pc.lan > hardware ethernet 00:11:22:33:44:66; | "
              "+host pc.lan > fixed-address 10.0.0.7;"),
         false,
         text("host pc.lan")},
        "+Host: pc.lan | +MAC address: 00:11:22:33:44:66 | +Fixed address: 10.0.0.7");
    row("host with a name only",
        {{},
         list("Add host"),
         hostInput(list("pc.lan")),
         list("+host pc.lan | +host pc.lan > hardware ethernet 00:00:00:00:00:00;"),
         false,
         text("host pc.lan")},
        "+Host: pc.lan | +MAC address: 00:00:00:00:00:00");
    row("host with an address of no host",
        {{},
         list("Add host"),
         hostInput({text("pc.lan"), QString{}, text("127.0.0.1")}),
         list("+host pc.lan | +host pc.lan > hardware ethernet 00:00:00:00:00:00;"),
         false,
         text("host pc.lan")},
        "+Host: pc.lan | +MAC address: 00:00:00:00:00:00");
    row("fixed address",
        {text("host single"), list("Add fixed IP"), fixedAddressInput(list("10.0.0.8")),
         list("+host single > fixed-address 10.0.0.8;"), false, text("fixed-address 10.0.0.8")},
        "+Fixed address: 10.0.0.8");
    row("fixed address again",
        {text("host grouped"), list("Add fixed IP"), fixedAddressInput(list("10.0.0.8")),
         list("-group servers > host grouped > fixed-address 10.0.0.6; | "
              "+group servers > host grouped > fixed-address 10.0.0.8;")},
        "-Fixed address: 10.0.0.6 | +Fixed address: 10.0.0.8");
    row("gateways",
        {text("subnet 10.1"), option("Add gateways"),
         addressesInput("Add gateways", "Gateways:", list("10.1.0.1 | 10.1.0.2")),
         list("+shared-network office > subnet 10.1.0.0 netmask 255.255.0.0 > option routers 10.1.0.1, 10.1.0.2;"),
         false, text("option routers 10.1")},
        "+Gateways: 10.1.0.1, 10.1.0.2");
    row("gateways again",
        {text("subnet 10.0"), option("Add gateways"), addressesInput("Add gateways", "Gateways:", list("10.0.0.2")),
         list("-subnet 10.0.0.0 netmask 255.255.255.0 > option routers 10.0.0.1; | "
              "+subnet 10.0.0.0 netmask 255.255.255.0 > option routers 10.0.0.2;")},
        "-Gateways: 10.0.0.1 | +Gateways: 10.0.0.2");
    row("DNS servers",
        {{},
         option("Add DNS servers"),
         addressesInput("Add DNS servers", "DNS servers:", list("10.0.0.3")),
         list("+option domain-name-servers 10.0.0.3;"),
         false,
         text("option domain-name-servers")},
        "+DNS servers: 10.0.0.3");
    row("NTP servers",
        {text("group"), option("Add NTP servers"), addressesInput("Add NTP servers", "NTP servers:", list("10.0.0.4")),
         list("+group servers > option ntp-servers 10.0.0.4;"), false, text("option ntp-servers")},
        "+NTP servers: 10.0.0.4");
    row("domain name as offered",
        {text("host single"), option("Add domain name"), domainInput({}),
         list("+host single > option domain-name \"example.org\";"), false, text("option domain-name \"example")},
        "+Domain name: \"example.org\"");
    row("domain name again",
        {{},
         option("Add domain name"),
         domainInput(list("b.net")),
         list(R"(-option domain-name "a.org"; | +option domain-name "b.net" ;)")},
        "-Domain name: \"a.org\" | +Domain name: \"b.net\"");
    row("default lease time",
        {text("shared-network"), parameter("Add default lease time"),
         timeInput("Add default lease time", list("0 | 1 | 2 | 3 | 4")),
         list("+shared-network office > default-lease-time 93784;"), false, text("default-lease-time 9")},
        "+Default lease time: 1 days 2 hours 3 minutes 4 seconds");
    row("default lease time again",
        {{},
         parameter("Add default lease time"),
         timeInput("Add default lease time", list("1")),
         list("-default-lease-time 600; | +default-lease-time 2592000;")},
        "-Default lease time: 10 minutes | +Default lease time: 1 mounth");
    row("max lease time",
        {{},
         parameter("Add max lease time"),
         timeInput("Add max lease time", list("12 | 31 | 24 | 60 | 60")),
         list("+max-lease-time 33872460;"),
         false,
         text("max-lease-time")},
        "+Max lease time: 13 mounth 2 days 1 hours 1 minutes");
    row("static route",
        {{},
         list("Add static route"),
         routesInput(addRoute(list("255.255.255.0 | 192.168.1.0 | 10.0.0.1"), false)),
         list("+option classless-static-routes code 121 = array of unsigned integer 8; | "
              "+option classless-static-routes 24, 192,168,1, 10,0,0,1;"),
         false,
         text("option classless-static-routes 24")},
        "+Static route: code 121 = array of unsigned integer 8 | +Static route: 24, 192,168,1, 10,0,0,1");
    row("static route for MS systems",
        {text("host single"), list("Add static route"),
         routesInput(addRoute(list("255.255.0.0 | 172.16.0.0 | 10.0.0.1"), true)),
         list("+option ms-classless-static-routes code 249 = array of unsigned integer 8; | "
              "+host single > option ms-classless-static-routes 16, 172,16, 10,0,0,1;"),
         false, text("option ms-classless-static-routes 16")},
        "+Static route MS: code 249 = array of unsigned integer 8 | +Static route MS: 16, 172,16, 10,0,0,1");
    row("declaration",
        {text("subnet 10.0"), list("Add arbitrary declaration"), declarationInput(list("pool")),
         list("+subnet 10.0.0.0 netmask 255.255.255.0 > pool "), true, text("pool")},
        "+pool");
    row("parameter",
        {text("group"), parameter("Add arbitrary parameter"), parameterInput(list("option time-offset 3600")),
         list("+group servers > option time-offset 3600;"), true, text("option time-offset")},
        "+time-offset: 3600");
}

void TopologyCommandsTest::addPutsTheStatementIn()
{
    QFETCH(AddCase, add);
    QFETCH(QStringList, shown);
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    QVERIFY(!window.offersSave());

    // Some branches are closed, the parent among them.
    window.tree().collapse(window.find(text("subnet 10.3")));
    if (!add.parent.isEmpty())
        window.tree().collapse(window.find(add.parent));
    QStringList open{window.openBranches()};

    window.choose(boxes, add.parent, add.entries, [&] {
        if (add.isAdvanced)
            boxes.expectBox(advancedBox(), QMessageBox::Yes);
        expectSaved(boxes, add.input);
    });
    QCOMPARE(window.changes(), add.changes);
    QCOMPARE(window.shownChanges(), shown);
    QVERIFY(window.offersSave());
    QCOMPARE(window.notices(), 1);
    QCOMPARE(window.resets(), add.child.isEmpty() ? 0 : 1);

    QCOMPARE(window.tree().currentIndex().siblingAtColumn(0), window.find(add.parent));
    if (add.child.isEmpty()) {
        QCOMPARE(window.openBranches(), open);
        compareFile(window, boxes);
        return;
    }
    const QModelIndex child{window.find(add.child)};
    QCOMPARE(child.parent(), window.find(add.parent));
    QVERIFY(window.isInView(child));
    if (add.isAdvanced) {
        window.tree().expandAll();
        open = window.openBranches();
        QVERIFY(open.contains(text("subnet 10.3.0.0")));
    } else if (!add.parent.isEmpty()) {
        window.tree().collapse(window.find(add.parent));
    }
    QCOMPARE(window.openBranches(), open);
    compareFile(window, boxes);
}

void TopologyCommandsTest::addWorksInEveryPlace_data()
{
    QTest::addColumn<QString>("place");
    QTest::addColumn<QString>("blocks"); // in front of the statements that are added
    const auto row = [](const char *place, const char *block) {
        QTest::addRow("%s", *block ? block : "All network")
            << text(place) << (*block ? text(block) + text(" > ") : QString{});
    };
    row("", "");
    row("subnet 10.1", "subnet 10.1.0.0 netmask 255.255.255.0");
    row("shared-network", "shared-network office");
    row("group", "group printers");
    row("host", "host plotter");
}

void TopologyCommandsTest::addWorksInEveryPlace()
{
    QFETCH(QString, place);
    QFETCH(QString, blocks);
    struct Command
    {
        QStringList entries;
        Input input;
        const char *statement;
        const char *shown;
        bool isAdvanced{};
    };
    const Command commands[]{
        {list("Add arbitrary declaration"), declarationInput(list("on release")), "on release", "on: release", true},
        {parameter("Add arbitrary parameter"), parameterInput(list("option time-offset 3600")),
         "option time-offset 3600;", "time-offset: 3600", true},
        {parameter("Add default lease time"), timeInput("Add default lease time", list("0 | 1 | 2 | 3 | 4")),
         "default-lease-time 93784;", "Default lease time: 1 days 2 hours 3 minutes 4 seconds"},
        {parameter("Add max lease time"), timeInput("Add max lease time", list("2 | 1")), "max-lease-time 5270400;",
         "Max lease time: 2 mounth 1 days"},
        {option("Add gateways"), addressesInput("Add gateways", "Gateways:", list("10.1.0.1 | 10.1.0.2")),
         "option routers 10.1.0.1, 10.1.0.2;", "Gateways: 10.1.0.1, 10.1.0.2"},
        {option("Add DNS servers"), addressesInput("Add DNS servers", "DNS servers:", list("10.1.0.3")),
         "option domain-name-servers 10.1.0.3;", "DNS servers: 10.1.0.3"},
        {option("Add NTP servers"), addressesInput("Add NTP servers", "NTP servers:", list("10.1.0.4")),
         "option ntp-servers 10.1.0.4;", "NTP servers: 10.1.0.4"},
        {option("Add domain name"), domainInput(list("lab.example.org")), "option domain-name \"lab.example.org\";",
         "Domain name: \"lab.example.org\""},
    };
    const TopologyWindow window{everyPlace};
    ModalBoxes boxes;
    QStringList changes;
    QStringList shown;
    for (const Command &command : commands) {
        window.choose(boxes, place, command.entries, [&] {
            if (command.isAdvanced)
                boxes.expectBox(advancedBox(), QMessageBox::Yes);
            expectSaved(boxes, command.input);
        });
        changes.append(QLatin1Char{'+'} + blocks + text(command.statement));
        shown.append(QLatin1Char{'+'} + text(command.shown));
        QCOMPARE(sorted(window.changes()), sorted(changes));
        QCOMPARE(sorted(window.shownChanges()), sorted(shown));
    }
    compareFile(window, boxes);
}

void TopologyCommandsTest::routeTakesTheDefinitionThatIsThere()
{
    const TopologyWindow window{everyPlace};
    ModalBoxes boxes;
    window.choose(boxes, text("host"), list("Add static route"), [&] {
        expectSaved(boxes, routesInput(addRoute(list("255.255.128.0 | 192.168.0.0 | 10.1.0.3"), false)));
    });
    QCOMPARE(window.changes(), list("+host plotter > option classless-static-routes 17, 192,168,0, 10,1,0,3;"));
    QCOMPARE(window.shownChanges(), list("+Static route: 17, 192,168,0, 10,1,0,3"));
    compareFile(window, boxes);
}

void TopologyCommandsTest::cancelledAddChangesNothing()
{
    QFETCH(AddCase, add);
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    window.tree().collapse(window.find(text("subnet 10.3")));
    const QStringList open{window.openBranches()};
    window.choose(boxes, add.parent, add.entries, [&] {
        if (add.isAdvanced)
            boxes.expectBox(advancedBox(), Qt::Key_Return);
        expectCancelled(boxes, add.input);
    });
    QCOMPARE(window.changes(), QStringList{});
    QCOMPARE(window.notices(), 0);
    QVERIFY(!window.offersSave());
    QCOMPARE(window.openBranches(), open);
    QCOMPARE(window.tree().currentIndex(), window.find(add.parent));
}

void TopologyCommandsTest::addedStatementIsScrolledTo_data()
{
    QTest::addColumn<AddCase>("add");
    QTest::addRow("declaration") << AddCase{{},    list("Add host"),    hostInput(list("new.lan")), {},
                                            false, text("host new.lan")};
    QTest::addRow("parameter") << AddCase{{},
                                          list("Add parameter | Add max lease time"),
                                          timeInput("Add max lease time", list("1")),
                                          {},
                                          false,
                                          text("max-lease-time")};
    QTest::addRow("arbitrary declaration") << AddCase{
        {}, list("Add arbitrary declaration"), declarationInput(list("group last")), {}, true, text("group last")};
}

void TopologyCommandsTest::addedStatementIsScrolledTo()
{
    QFETCH(AddCase, add);
    QByteArray many{configuration};
    many += "group closed {\n";
    for (int i{0}; i < 300; ++i)
        many += "host g" + QByteArray::number(i) + " {\n hardware ethernet 00:11:22:33:44:55;\n}\n";
    many += "}\n";
    for (int i{0}; i < 300; ++i)
        many += "host h" + QByteArray::number(i) + " {\n hardware ethernet 00:11:22:33:44:55;\n}\n";
    for (int i{0}; i < 100; ++i)
        many += "option option-" + QByteArray::number(128 + i) + " 1;\n";
    const TopologyWindow window{many};
    window.tree().collapse(window.find(text("group closed")));
    ModalBoxes boxes;
    window.choose(boxes, add.parent, add.entries, [&] {
        if (add.isAdvanced)
            boxes.expectBox(advancedBox(), QMessageBox::Yes);
        expectSaved(boxes, add.input);
    });
    QVERIFY(window.isInView(window.find(add.child)));
    QCOMPARE(window.tree().currentIndex(), window.find(add.parent));
}

void TopologyCommandsTest::declinedWarningOpensNothing_data()
{
    QTest::addColumn<QStringList>("entries");
    QTest::addColumn<bool>("closes");
    for (const bool closes : {false, true}) {
        const char *how{closes ? "closed" : "No"};
        QTest::addRow("declaration, %s", how) << list("Add arbitrary declaration") << closes;
        QTest::addRow("parameter, %s", how) << parameter("Add arbitrary parameter") << closes;
        QTest::addRow("edit, %s", how) << list("Edit") << closes;
    }
}

void TopologyCommandsTest::declinedWarningOpensNothing()
{
    QFETCH(QStringList, entries);
    QFETCH(bool, closes);
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    window.tree().collapse(window.find(text("subnet 10.0")));
    const QStringList open{window.openBranches()};
    window.choose(boxes, text("group"), entries, [&] {
        if (closes)
            boxes.expectBox(advancedBox(), Qt::Key_Escape);
        else
            boxes.expectBox(advancedBox(), QMessageBox::No);
    });
    QCOMPARE(window.changes(), QStringList{});
    QCOMPARE(window.notices(), 0);
    QCOMPARE(window.openBranches(), open);
}

void TopologyCommandsTest::refusedAddSaysWhy_data()
{
    QTest::addColumn<QString>("parent");
    QTest::addColumn<Slot>("command");
    QTest::addColumn<Input>("input");
    QTest::addColumn<QString>("error");
    const auto row = [](const char *name, const char *parent, Slot command, const Input &input, const char *error) {
        QTest::addRow("%s", name) << text(parent) << command << input << text(error);
    };

    row("shared network in a subnet", "subnet 10.0", &FMain::handleAddSharedNetwork, sharedNetworkInput(list("lab")),
        "Error adding shared-network. Can not add shared-network to 'subnet'");
    row("subnet in a host", "host single", &FMain::handleAddSubnet, subnetInput({}),
        "Error adding subnet. Can not add subnet to 'host'");
    row("invalid subnet", "", &FMain::handleAddSubnet, subnetInput(list("999.0.0.0 | 255.0.0.0")),
        "Error adding subnet. Invalid subnet '999.0.0.0/255.0.0.0'");
    row("range in a shared network", "shared-network", &FMain::handleAddRange,
        rangeInput({QString{}, QString{}}, list("10.0.0.1 | 10.0.0.2")),
        "Error adding range. Invalid attributes of parent subnet");
    row("range in the network of all", "", &FMain::handleAddRange,
        rangeInput({QString{}, QString{}}, list("10.0.0.1 | 10.0.0.2")),
        "Error adding range. Invalid attributes of parent subnet");
    row("range outside", "subnet 10.0", &FMain::handleAddRange,
        rangeInput(list("10.0.0.1 | 10.0.0.254"), {text("10.0.1.1"), QString{}}),
        "Error adding range. Invalid start IP '10.0.1.1'");
    row("range backwards", "subnet 10.0", &FMain::handleAddRange,
        rangeInput(list("10.0.0.1 | 10.0.0.254"), list("10.0.0.9 | 10.0.0.8")),
        "Error adding range. Invalid end IP '10.0.0.8'");
    row("host in a subnet", "subnet 10.0", &FMain::handleAddHost, hostInput(list("pc.lan")),
        "Error adding host. Can not add host to 'subnet'");
    row("fixed address in a group", "group", &FMain::handleAddFixedAddress, fixedAddressInput(list("10.0.0.8")),
        "Error adding fixed address. Can not add to 'group'");
    row("invalid fixed address", "host single", &FMain::handleAddFixedAddress, fixedAddressInput(list("10.0.0.999")),
        "Error adding fixed address. Invalid IP '10.0.0.999'");
    row("loopback as fixed address", "host single", &FMain::handleAddFixedAddress, fixedAddressInput(list("127.0.0.1")),
        "Error adding fixed address. Invalid IP '127.0.0.1'");
    row("invalid domain name", "", &FMain::handleAddDomainName, domainInput(list("local")),
        "Invalid domain name '\"local\"'");
    row("no default lease time", "", &FMain::handleAddDefaultLeaseTime, timeInput("Add default lease time", {}),
        "Invalid time in seconds '0'");
    row("no max lease time", "", &FMain::handleAddMaxLeaseTime, timeInput("Add max lease time", {}),
        "Invalid time in seconds '0'");
    row("no route", "", &FMain::handleAddStaticRoute, routesInput({}),
        "Error adding static route. Static route parametrs can not be empty.");
    row("declaration in a range", "range", &FMain::handleAddArbitraryDeclaration, declarationInput(list("pool")),
        "Error adding declaration. Can not add declaration to 'range'");
    row("parameter in a range", "range", &FMain::handleAddArbitraryParam, parameterInput(list("authoritative")),
        "Error adding parameter. Can not add parameter to 'range'");
}

void TopologyCommandsTest::refusedAddSaysWhy()
{
    QFETCH(QString, parent);
    QFETCH(Slot, command);
    QFETCH(Input, input);
    QFETCH(QString, error);
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    window.select(parent);
    if (input.title.startsWith(text("Add arbitrary")))
        boxes.expectBox(advancedBox(), QMessageBox::Yes);
    expectSaved(boxes, input, error);
    (window.window().*command)();
    boxes.verify();
    QCOMPARE(window.changes(), QStringList{});
    QCOMPARE(window.notices(), 0);
    QCOMPARE(window.resets(), 0);
    QVERIFY(!window.offersSave());
    QCOMPARE(window.tree().currentIndex(), window.find(parent));
}

void TopologyCommandsTest::addNeedsADeclaration_data()
{
    QTest::addColumn<Slot>("command");
    const auto row = [](const char *name, Slot command) { QTest::addRow("%s", name) << command; };
    row("shared network", &FMain::handleAddSharedNetwork);
    row("subnet", &FMain::handleAddSubnet);
    row("range", &FMain::handleAddRange);
    row("host", &FMain::handleAddHost);
    row("fixed address", &FMain::handleAddFixedAddress);
    row("gateways", &FMain::handleAddRouters);
    row("DNS servers", &FMain::handleAddDns);
    row("NTP servers", &FMain::handleAddNtp);
    row("domain name", &FMain::handleAddDomainName);
    row("max lease time", &FMain::handleAddMaxLeaseTime);
    row("default lease time", &FMain::handleAddDefaultLeaseTime);
    row("static route", &FMain::handleAddStaticRoute);
    row("declaration", &FMain::handleAddArbitraryDeclaration);
    row("parameter", &FMain::handleAddArbitraryParam);
    row("bind9", &FMain::handleAddBind9Settings);
}

void TopologyCommandsTest::addNeedsADeclaration()
{
    QFETCH(Slot, command);
    const TopologyWindow window{configuration};
    const ModalBoxes boxes; // fails the test when anything opens
    for (const char *parameter : {"default-lease-time", "option routers", "hardware"}) {
        window.select(text(parameter));
        (window.window().*command)();
    }
    window.tree().setCurrentIndex({});
    (window.window().*command)();
    QCOMPARE(window.changes(), QStringList{});
    QCOMPARE(window.notices(), 0);
}

void TopologyCommandsTest::rangeIsOfferedForTheSubnet_data()
{
    QTest::addColumn<QByteArray>("subnet");
    QTest::addColumn<QStringList>("offered");
    QTest::addRow("/24") << QByteArray{"192.168.1.0 netmask 255.255.255.0"} << list("192.168.1.1 | 192.168.1.254");
    QTest::addRow("/31") << QByteArray{"10.0.0.0 netmask 255.255.255.254"} << list("10.0.0.1 | 10.0.0.1");
    QTest::addRow("/32") << QByteArray{"10.0.0.1 netmask 255.255.255.255"} << list("10.0.0.2 | 10.0.0.1");
    QTest::addRow("/0") << QByteArray{"0.0.0.0 netmask 0.0.0.0"} << list("0.0.0.1 | 255.255.255.254");
    QTest::addRow("not an address") << QByteArray{"lan netmask 255.255.255.0"} << QStringList{QString{}, QString{}};
    QTest::addRow("no netmask") << QByteArray{"10.0.0.0"} << QStringList{QString{}, QString{}};
    QTest::addRow("not a netmask") << QByteArray{"10.0.0.0 netmask lan"} << QStringList{QString{}, QString{}};
    QTest::addRow("without words") << QByteArray{} << QStringList{QString{}, QString{}};
}

void TopologyCommandsTest::rangeIsOfferedForTheSubnet()
{
    QFETCH(QByteArray, subnet);
    QFETCH(QStringList, offered);
    const TopologyWindow window{"subnet " + subnet + " {\n}\n"};
    ModalBoxes boxes;
    window.choose(boxes, text("subnet"), list("Add range"), [&] { expectCancelled(boxes, rangeInput(offered, {})); });
}

void TopologyCommandsTest::bind9AddsZonesAndKeys()
{
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    const QString file{paths::bind9LocalConfiguration()};
    writeTestFile(file, bind9Configuration);
    window.tree().collapse(window.find(text("subnet 10.0")));
    window.tree().collapse(window.find(text("group")));
    QVERIFY(window.action("aAddDHCPDynamicUpdate").isEnabled());
    window.choose(boxes, text("group"), option("Add DHCP dynamic zone update"), [&] {
        boxes.expectBox(bind9Box, QMessageBox::Yes);
        boxes.expectFileDialog(file);
    });
    QCOMPARE(window.changes(), list("+group servers > key \"ddns\" | "
                                    "+group servers > key \"ddns\" > algorithm hmac-sha256; | "
                                    "+group servers > key \"ddns\" > secret \"Zm9vYmFy\"; | "
                                    "+group servers > zone example.org. | "
                                    "+group servers > zone example.org. > primary 127.0.0.1; | "
                                    "+group servers > zone example.org. > key \"ddns\";"));
    QCOMPARE(window.shownChanges(), list("+Key information: \"ddns\" | +Key generation algorithm: hmac-sha256 | "
                                         "+Generated secret: \"Zm9vYmFy\" | +Zone served by DNS server: example.org. | "
                                         "+Master DNS Server: 127.0.0.1 | +Key: \"ddns\""));
    QVERIFY(window.offersSave());
    QCOMPARE(window.notices(), 1);
    QCOMPARE(window.tree().currentIndex(), window.find(text("group")));
    QVERIFY(window.isInView(window.find(text("zone"))));
    const QStringList open{window.openBranches()};
    window.tree().expandAll();
    QCOMPARE(open, window.openBranches());
}

void TopologyCommandsTest::bind9IsGivenUp_data()
{
    QTest::addColumn<bool>("asksForTheFile");
    QTest::addRow("at the question") << false;
    QTest::addRow("at the file") << true;
}

void TopologyCommandsTest::bind9IsGivenUp()
{
    QFETCH(bool, asksForTheFile);
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    writeTestFile(paths::bind9LocalConfiguration(), bind9Configuration);
    window.tree().collapse(window.find(text("group")));
    const QStringList open{window.openBranches()};
    window.choose(boxes, {}, option("Add DHCP dynamic zone update"), [&] {
        boxes.expectBox(bind9Box, asksForTheFile ? Qt::Key_Return : Qt::Key_Escape);
        if (!asksForTheFile)
            return;
        boxes.expectDialog<QFileDialog>([&](QFileDialog *dialog) {
            QCOMPARE(dialog->directory(), QFileInfo{paths::bind9LocalConfiguration()}.dir());
            QCOMPARE(dialog->acceptMode(), QFileDialog::AcceptOpen);
            QTest::keyClick(dialog, Qt::Key_Escape);
        });
    });
    QCOMPARE(window.changes(), QStringList{});
    QCOMPARE(window.notices(), 0);
    QCOMPARE(window.openBranches(), open);
}

void TopologyCommandsTest::bind9IsRefused_data()
{
    QTest::addColumn<QString>("parent");
    QTest::addColumn<QByteArray>("file");
    QTest::addColumn<QString>("error");
    const QString empty{text("Error adding bind9. bind9 can not be empty.")};
    QTest::addRow("empty file") << QString{} << QByteArray{} << empty;
    QTest::addRow("comments only") << QString{} << QByteArray{"// zone \"a.org\" { };\n# nothing\n/* here */\n"}
                                   << empty;
    QTest::addRow("subnet") << text("subnet 10.0") << QByteArray{bind9Configuration}
                            << text("Error adding bind9. Can not add bind9 to 'subnet'");
    QTest::addRow("shared network") << text("shared-network") << QByteArray{bind9Configuration}
                                    << text("Error adding bind9. Can not add bind9 to 'shared-network'");
    QTest::addRow("host") << text("host single") << QByteArray{bind9Configuration}
                          << text("Error adding bind9. Can not add bind9 to 'host'");
    QTest::addRow("host, empty file") << text("host single") << QByteArray{}
                                      << text("Error adding bind9. Can not add bind9 to 'host'");
}

void TopologyCommandsTest::bind9IsRefused()
{
    QFETCH(QString, parent);
    QFETCH(QByteArray, file);
    QFETCH(QString, error);
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    writeTestFile(paths::bind9LocalConfiguration(), file);
    window.choose(boxes, parent, option("Add DHCP dynamic zone update"), [&] {
        boxes.expectBox(bind9Box, QMessageBox::Yes);
        boxes.expectFileDialog(paths::bind9LocalConfiguration());
        boxes.expectBox(errorBox(error), QMessageBox::Ok);
    });
    QCOMPARE(window.changes(), QStringList{});
    QCOMPARE(window.notices(), 0);
    QVERIFY(!window.offersSave());
}

void TopologyCommandsTest::bind9ZonesThatAreLeftOutAreNamed_data()
{
    QTest::addColumn<QByteArray>("file");
    QTest::addColumn<QString>("error");
    QTest::addColumn<QString>("told");
    QTest::addColumn<QStringList>("changes");
    QTest::addRow("nothing is left") << QByteArray{"zone \"a.org\" { type master; file \"a\"; };\n"}
                                     << text("Error adding bind9. bind9 can not be empty.")
                                     << text("These zones were left out:\na.org: no key may update it")
                                     << QStringList{};
    QTest::addRow("some are left")
        << QByteArray{"zone \"a.org\" { type master; allow-update { key k; }; };\n"
                      "zone \"<b>.org\" { type master; allow-update { key k; }; };\n"
                      "zone \"c.org\" { type master; allow-update { key nowhere; }; };\n"
                      "key k { algorithm hmac-sha256; secret Zm9vYmFy; };\n"}
        << QString{}
        << text("These zones were left out:\n<b>.org: the DHCP server does not accept its name\n"
                "c.org: its key 'nowhere' is not known")
        << list("+key k | +key k > algorithm hmac-sha256; | +key k > secret Zm9vYmFy; | +zone a.org. | "
                "+zone a.org. > primary 127.0.0.1; | +zone a.org. > key k;");
}

void TopologyCommandsTest::bind9ZonesThatAreLeftOutAreNamed()
{
    QFETCH(QByteArray, file);
    QFETCH(QString, error);
    QFETCH(QString, told);
    QFETCH(QStringList, changes);
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    writeTestFile(paths::bind9LocalConfiguration(), file);
    window.choose(boxes, {}, option("Add DHCP dynamic zone update"), [&] {
        boxes.expectBox(bind9Box, QMessageBox::Yes);
        boxes.expectFileDialog(paths::bind9LocalConfiguration());
        if (!error.isEmpty())
            boxes.expectBox(errorBox(error), QMessageBox::Ok);
        boxes.expectBox({QMessageBox::Information, text("Information"), told}, QMessageBox::Ok);
    });
    QCOMPARE(window.changes(), changes);
}

void TopologyCommandsTest::removeTakesTheStatementOut_data()
{
    QTest::addColumn<QString>("statement");
    QTest::addColumn<QString>("parent");
    QTest::addColumn<QStringList>("changes");
    QTest::addColumn<QStringList>("shown");
    const auto row = [](const char *statement, const char *parent, const char *changes, const char *shown) {
        QTest::addRow("%s", statement) << text(statement) << text(parent) << list(changes) << list(shown);
    };
    row("default-lease-time", "", "-default-lease-time 600;", "-Default lease time: 10 minutes");
    row("option domain-name", "", "-option domain-name \"a.org\";", "-Domain name: \"a.org\"");
    row("range", "subnet 10.0.0.0 netmask 255.255.255.0",
        "-subnet 10.0.0.0 netmask 255.255.255.0 > range 10.0.0.10 10.0.0.20;", "-Range: 10.0.0.10 - 10.0.0.20");
    row("option routers", "subnet 10.0.0.0 netmask 255.255.255.0",
        "-subnet 10.0.0.0 netmask 255.255.255.0 > option routers 10.0.0.1;", "-Gateways: 10.0.0.1");
    row("fixed-address", "host grouped", "-group servers > host grouped > fixed-address 10.0.0.6;",
        "-Fixed address: 10.0.0.6");
    row("hardware", "host single", "-host single > hardware ethernet 00:11:22:33:44:55;",
        "-MAC address: 00:11:22:33:44:55");
    row("subnet 10.0", "",
        "-subnet 10.0.0.0 netmask 255.255.255.0 | -subnet 10.0.0.0 netmask 255.255.255.0 > option routers 10.0.0.1; | "
        "-subnet 10.0.0.0 netmask 255.255.255.0 > range 10.0.0.10 10.0.0.20;",
        "-Subnet: 10.0.0.0 / 255.255.255.0 | -Gateways: 10.0.0.1 | -Range: 10.0.0.10 - 10.0.0.20");
    row("shared-network", "",
        "-shared-network office | -shared-network office > subnet 10.1.0.0 netmask 255.255.0.0 | "
        "-shared-network office > subnet 10.1.0.0 netmask 255.255.0.0 > authoritative ;",
        "-Shared network: office | -Subnet: 10.1.0.0 / 255.255.0.0 | -authoritative");
    row("group", "",
        "-group servers | -group servers > host grouped | -group servers > host grouped > fixed-address 10.0.0.6;",
        "-Group: servers | -Host: grouped | -Fixed address: 10.0.0.6");
    row("host single", "", "-host single | -host single > hardware ethernet 00:11:22:33:44:55;",
        "-Host: single | -MAC address: 00:11:22:33:44:55");
}

void TopologyCommandsTest::removeTakesTheStatementOut()
{
    QFETCH(QString, statement);
    QFETCH(QString, parent);
    QFETCH(QStringList, changes);
    QFETCH(QStringList, shown);
    const TopologyWindow window{configuration};
    ModalBoxes boxes; // nothing is asked
    window.tree().collapse(window.find(text("subnet 10.3")));
    window.choose(boxes, statement, list("Remove"));
    QCOMPARE(window.changes(), changes);
    QCOMPARE(window.shownChanges(), shown);
    QVERIFY(window.offersSave());
    QCOMPARE(window.notices(), 1);
    QCOMPARE(window.current(), parent);
    QCOMPARE(window.tree().currentIndex(), window.find(parent));
    const QStringList open{window.openBranches()};
    window.tree().expandAll();
    QCOMPARE(open, window.openBranches());
    compareFile(window, boxes);
}

void TopologyCommandsTest::removeTakesNothingAboveTheStatements()
{
    const TopologyWindow window{configuration};
    const ModalBoxes boxes;
    for (const int column : {0, 1}) {
        window.select({}, column);
        window.action("actionRemove").trigger();
    }
    window.tree().setCurrentIndex({});
    window.action("actionRemove").trigger();
    QCOMPARE(window.changes(), QStringList{});
    QCOMPARE(window.notices(), 0);
    QCOMPARE(window.model().rowCount(), 1);
}

QTEST_MAIN(TopologyCommandsTest)
#include "tst_topologycommands.moc"
