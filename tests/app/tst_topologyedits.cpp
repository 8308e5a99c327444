// SPDX-License-Identifier: GPL-3.0-or-later
// The commands of the topology tree that edit statements.
#include "config/dhcpdconfigmodel.h"
#include "tests/app/topologywindow.h"
#include "tests/support/dialogdriver.h"

#include <QAction>
#include <QDialog>
#include <QTest>
#include <QTreeView>

namespace {

// Much of it is written as only a person does it.
constexpr auto configuration = R"(default-lease-time 600;
max-lease-time 40000000;
min-lease-time -1;
option domain-name "a.org";
option domain-name-servers 10.0.0.1,
    10.0.0.2 , 10.0.0.3;
option routers 10.0.0.1,10.0.0.2;
option routers gate.a.org, 10.0.0.1;
option ntp-servers;
option ntp-servers 10.0.0.4;
option classless-static-routes code 121 = array of unsigned integer 8;
option classless-static-routes 24, 192,168,1,0, 10,0,0,1;
option ms-classless-static-routes 24, 192,168,2,0,
    10,0,0,2;
option time-offset 3600;
authoritative;
subnet 10.0.0.0 netmask 255.255.255.0 {
    range 10.0.0.100 10.0.0.110;
    range dynamic-bootp 10.0.0.10 10.0.0.20;
    range DYNAMIC-BOOTP 10.0.0.40 10.0.0.50;
    range 10.0.0.30;
}
subnet 10.3.0.0 {
}
subnet 10.4.0.0 netmask 255.255.255.0 {
}
shared-network lab {
}
shared-network "my office" {
}
group servers {
}
class "phones" {
}
subclass "phones" 1:00:11:22:33:44:55;
host full {
    hardware ethernet 00:11:22:33:44:55;
    fixed-address 10.0.0.5;
}
host bare {
}
host hard {
    hardware ethernet 00:11:22:33:44:66;
}
host fixed {
    fixed-address 10.0.0.6;
}
host "my pc" {
    hardware ethernet 0011.2233.4455;
    fixed-address 10.0.0.7,
        10.0.0.8;
}
)";

/// An edit through a dialog.
struct Edit
{
    QString statement;
    Input input;
    QStringList changes{};
};

Input addresses(const char *title, const char *label, const char *shown)
{
    return {text(title), {text(label), text(shown)}};
}

Input time(const char *title, const char *shown)
{
    QStringList all{text("Mounth:"), QString{}, text("Days:"), QString{}, QString{},
                    text(":"),       QString{}, text(":"),     QString{}};
    const QStringList fields{list(shown)};
    const int places[]{1, 3, 4, 6, 8};
    for (int i{0}; i < fields.size(); ++i)
        all[places[i]] = fields.at(i);
    return {text(title), all};
}

Input subnet(const char *address, const char *mask)
{
    return {text("Edit subnet"), {text("Address:"), text(address), text("Netmask:"), text(mask)}};
}

Input range(const char *start, const char *end)
{
    return {text("Edit range"), {text("Start IP:"), text(start), text("End IP:"), text(end)}};
}

Input host(const char *name, const char *mac, const char *ip)
{
    return {text("Edit host"),
            {text("Name:"), text(name), text("MAC address:"), text(mac), text("Fixed IP:"), text(ip)}};
}

Input routes(const char *cells, const char *box)
{
    return {text("Edit static route"), {text("Static routes"), text(cells), text(box)}};
}

Input named(const char *title, const char *label, const char *value)
{
    return {text(title), {text(label), text(value)}};
}

Input parameterInput(const char *words) { return named("Edit arbitrary parameter", "Parameter:", words); }
Input declarationInput(const char *words) { return named("Edit arbitrary declaration", "Declaration:", words); }
Input definitionInput(const char *words) { return named("Edit static route", "Parameter:", words); }

Input with(Input input, const Fill &fill)
{
    input.fill = fill;
    return input;
}

/// Whether the warning comes before the dialog.
bool isAdvanced(const Input &input)
{
    return input.shown.first() == text("Parameter:") || input.shown.first() == text("Declaration:");
}

/// Opens the editor with a double click and saves.
void edit(const TopologyWindow &window, const QString &statement, const Input &input, const QString &error = {})
{
    ModalBoxes boxes;
    if (isAdvanced(input))
        boxes.expectBox(advancedBox(), QMessageBox::Yes);
    expectSaved(boxes, input, error);
    window.doubleClick(statement);
    boxes.verify();
}

} // namespace

Q_DECLARE_METATYPE(Edit)

using Slot = void (FMain::*)();
Q_DECLARE_METATYPE(Slot)

class TopologyEditsTest final : public QObject
{
    Q_OBJECT

private slots:
    void unchangedEditChangesNothing_data();
    void unchangedEditChangesNothing();
    void changedFieldReachesTheStatement_data() { changeCases(); }
    void changedFieldReachesTheStatement();
    void cancelledEditChangesNothing_data() { changeCases(); }
    void cancelledEditChangesNothing();
    void refusedEditSaysWhy_data();
    void refusedEditSaysWhy();
    void leaseTimesOfAnySizeAreKept_data();
    void leaseTimesOfAnySizeAreKept();
    void whatADialogCannotShowIsEditedAsText_data();
    void whatADialogCannotShowIsEditedAsText();
    void noBreakSpaceSurvivesAnEdit();
    void addressOfABareHostIsAdded();
    void hostNameIsTakenAsTyped();
    void editNeedsItsKindOfStatement_data();
    void editNeedsItsKindOfStatement();

private:
    static void changeCases();
};

void TopologyEditsTest::unchangedEditChangesNothing_data()
{
    QTest::addColumn<Edit>("unchanged");
    const auto row = [](const char *statement, const Input &input) {
        QTest::addRow("%s", statement) << Edit{text(statement), input};
    };

    row("default-lease-time", time("Edit default lease time", "0 | 0 | 0 h | 10 m | 0 s"));
    row("max-lease-time", named("Edit max lease time", "Parameter:", "max-lease-time 40000000"));
    row("min-lease-time", named("Edit time", "Parameter:", "min-lease-time -1"));
    row("option domain-name \"", named("Edit domain name", "Domain name:", "a.org"));
    row("option domain-name-servers", addresses("Edit DNS servers", "DNS servers:", "10.0.0.1, 10.0.0.2, 10.0.0.3"));
    row("option routers 10", addresses("Edit gateways", "Gateways:", "10.0.0.1, 10.0.0.2"));
    row("option routers gate", named("Edit gateways", "Parameter:", "option routers gate.a.org, 10.0.0.1"));
    row("option classless-static-routes code",
        definitionInput("option classless-static-routes code 121 = array of unsigned integer 8"));
    row("option classless-static-routes 24",
        routes("255.255.255.0, 192.168.1.0, 10.0.0.1", "[ ]* Route for MS systems"));
    row("option ms-classless", routes("255.255.255.0, 192.168.2.0, 10.0.0.2", "[x]* Route for MS systems"));
    row("option time-offset", parameterInput("option time-offset 3600"));
    row("authoritative", parameterInput("authoritative "));
    row("subnet 10.0", subnet("10.0.0.0", "255.255.255.0"));
    row("subnet 10.3", subnet("10.3.0.0", ""));
    row("range 10.0.0.100", range("10.0.0.100", "10.0.0.110"));
    row("range dynamic", range("10.0.0.10", "10.0.0.20"));
    row("range DYNAMIC", range("10.0.0.40", "10.0.0.50"));
    row("range 10.0.0.30", range("10.0.0.30", ""));
    row("shared-network lab", named("Edit shared network", "Name:", "lab"));
    row("shared-network \"", named("Edit shared network", "Name:", "my office"));
    row("group", declarationInput("group servers"));
    row("subclass", declarationInput("subclass \"phones\" 1:00:11:22:33:44:55"));
    row("host full", host("full", "00:11:22:33:44:55", "10.0.0.5"));
    row("host bare", host("bare", "00:00:00:00:00:00", ""));
    row("host hard", host("hard", "00:11:22:33:44:66", ""));
    row("host fixed", host("fixed", "00:00:00:00:00:00", "10.0.0.6"));
    row("host \"", named("Edit host", "Declaration:", "host \"my pc\""));
    row("fixed-address 10.0.0.5", named("Edit fixed address", "IP:", "10.0.0.5"));
    row("fixed-address 10.0.0.7", named("Edit fixed address", "Declaration:", "fixed-address 10.0.0.7, 10.0.0.8"));
    row("hardware ethernet 00:11", named("Edit MAC address", "MAC address:", "00:11:22:33:44:55"));
    row("hardware ethernet 0011", named("Edit MAC address", "Parameter:", "hardware ethernet 0011.2233.4455"));
}

void TopologyEditsTest::unchangedEditChangesNothing()
{
    QFETCH(Edit, unchanged);
    const TopologyWindow window{configuration};
    window.tree().collapse(window.find(text("host bare")));
    const QStringList open{window.openBranches()};
    edit(window, unchanged.statement, unchanged.input);
    QCOMPARE(window.changes(), QStringList{});
    QCOMPARE(window.notices(), 0);
    QVERIFY(!window.offersSave());
    QCOMPARE(window.openBranches(), open);
}

void TopologyEditsTest::changeCases()
{
    QTest::addColumn<Edit>("change");
    QTest::addColumn<QStringList>("shown");
    const auto row = [](const char *name, const char *statement, const Input &input, const char *changes,
                        const char *shown) {
        QTest::addRow("%s", name) << Edit{text(statement), input, *changes ? list(changes) : QStringList{}}
                                  << (*shown ? list(shown) : QStringList{});
    };
    const QString same{};

    row("default lease time", "default-lease-time",
        with(time("Edit default lease time", "0 | 0 | 0 h | 10 m | 0 s"), type({same, same, text("1")})),
        "-default-lease-time 600; | +default-lease-time 4200;",
        "-Default lease time: 10 minutes | +Default lease time: 1 hours 10 minutes");
    row("max lease time", "max-lease-time",
        with(named("Edit max lease time", "Parameter:", "max-lease-time 40000000"),
             type(list("max-lease-time 2592000"))),
        "-max-lease-time 40000000; | +max-lease-time 2592000;",
        "-Max lease time: 15 mounth 12 days 23 hours 6 minutes 40 seconds | +Max lease time: 1 mounth");
    row("other lease time", "min-lease-time",
        with(named("Edit time", "Parameter:", "min-lease-time -1"), type(list("min-lease-time 60"))),
        "-min-lease-time -1; | +min-lease-time 60;", "-min-lease-time | +min-lease-time: 1 minutes");
    row("domain name", "option domain-name \"",
        with(named("Edit domain name", "Domain name:", "a.org"), type(list("b.example.net"))),
        R"(-option domain-name "a.org"; | +option domain-name "b.example.net";)",
        R"(-Domain name: "a.org" | +Domain name: "b.example.net")");
    row("DNS servers", "option domain-name-servers",
        with(addresses("Edit DNS servers", "DNS servers:", "10.0.0.1, 10.0.0.2, 10.0.0.3"),
             addAddresses(list("10.0.0.4"))),
        "-option domain-name-servers 10.0.0.1, 10.0.0.2 , 10.0.0.3; | "
        "+option domain-name-servers 10.0.0.1, 10.0.0.2, 10.0.0.3, 10.0.0.4;",
        "-DNS servers: 10.0.0.1, 10.0.0.2 , 10.0.0.3 | +DNS servers: 10.0.0.1, 10.0.0.2, 10.0.0.3, 10.0.0.4");
    row("gateways", "option routers 10",
        with(addresses("Edit gateways", "Gateways:", "10.0.0.1, 10.0.0.2"), addAddresses(list("10.0.0.3"))),
        "-option routers 10.0.0.1,10.0.0.2; | +option routers 10.0.0.1, 10.0.0.2, 10.0.0.3;",
        "-Gateways: 10.0.0.1,10.0.0.2 | +Gateways: 10.0.0.1, 10.0.0.2, 10.0.0.3");
    row("NTP servers", "option ntp-servers 10",
        with(addresses("Edit NTP servers", "NTP servers:", "10.0.0.4"), addAddresses(list("10.0.0.11"))),
        "-option ntp-servers 10.0.0.4; | +option ntp-servers 10.0.0.4, 10.0.0.11;",
        "-NTP servers: 10.0.0.4 | +NTP servers: 10.0.0.4, 10.0.0.11");
    row("static route", "option classless-static-routes 24",
        with(routes("255.255.255.0, 192.168.1.0, 10.0.0.1", "[ ]* Route for MS systems"),
             typeInCell(0, 2, text("10.0.0.9"))),
        "-option classless-static-routes 24, 192,168,1,0, 10,0,0,1; | "
        "+option classless-static-routes 24, 192,168,1, 10,0,0,9;",
        "-Static route: 24, 192,168,1,0, 10,0,0,1 | +Static route: 24, 192,168,1, 10,0,0,9");
    row("static route for MS systems", "option ms-classless",
        with(routes("255.255.255.0, 192.168.2.0, 10.0.0.2", "[x]* Route for MS systems"),
             typeInCell(0, 0, text("255.255.0.0"))),
        "-option ms-classless-static-routes 24, 192,168,2,0, 10,0,0,2; | "
        "+option ms-classless-static-routes 16, 192,168, 10,0,0,2;",
        "-Static route MS: 24, 192,168,2,0, 10,0,0,2 | +Static route MS: 16, 192,168, 10,0,0,2");
    row("definition of the option", "option classless-static-routes code",
        with(definitionInput("option classless-static-routes code 121 = array of unsigned integer 8"),
             type(list("option classless-static-routes code 121 = array of integer 8"))),
        "-option classless-static-routes code 121 = array of unsigned integer 8; | "
        "+option classless-static-routes code 121 = array of integer 8;",
        "-Static route: code 121 = array of unsigned integer 8 | +Static route: code 121 = array of integer 8");
    row("parameter", "option time-offset",
        with(parameterInput("option time-offset 3600"), type(list("ping-check true"))),
        "-option time-offset 3600; | +ping-check true;", "-time-offset: 3600 | +ping-check: true");
    row("parameter of one word", "authoritative", with(parameterInput("authoritative "), type(list("ping-check true"))),
        "-authoritative ; | +ping-check true;", "-authoritative | +ping-check: true");
    row("group", "group", with(declarationInput("group servers"), type(list("group printers"))),
        "-group servers | +group printers", "-Group: servers | +Group: printers");
    row("keyword of a group", "group", with(declarationInput("group servers"), type(list("class \"pc\""))),
        "-group servers | +class \"pc\"", R"(-Group: servers | +class: "pc")");
    row("subclass", "subclass",
        with(declarationInput("subclass \"phones\" 1:00:11:22:33:44:55"),
             type(list("subclass \"phones\" 1:00:11:22:33:44:66"))),
        R"(-subclass "phones" 1:00:11:22:33:44:55; | +subclass "phones" 1:00:11:22:33:44:66;)",
        R"(-subclass: "phones" 1:00:11:22:33:44:55 | +subclass: "phones" 1:00:11:22:33:44:66)");
    row("address of a subnet", "subnet 10.4", with(subnet("10.4.0.0", "255.255.255.0"), type(list("10.5.0.0/16"))),
        "-subnet 10.4.0.0 netmask 255.255.255.0 | +subnet 10.5.0.0 netmask 255.255.0.0",
        "-Subnet: 10.4.0.0 / 255.255.255.0 | +Subnet: 10.5.0.0 / 255.255.0.0");
    row("netmask of a subnet", "subnet 10.4",
        with(subnet("10.4.0.0", "255.255.255.0"), type({same, text("255.255.0.0")})),
        "-subnet 10.4.0.0 netmask 255.255.255.0 | +subnet 10.4.0.0 netmask 255.255.0.0",
        "-Subnet: 10.4.0.0 / 255.255.255.0 | +Subnet: 10.4.0.0 / 255.255.0.0");
    row("netmask that was missing", "subnet 10.3", with(subnet("10.3.0.0", ""), type({same, text("255.255.0.0")})),
        "-subnet 10.3.0.0 | +subnet 10.3.0.0 netmask 255.255.0.0",
        "-Subnet: 10.3.0.0 / | +Subnet: 10.3.0.0 / 255.255.0.0");
    row("range", "range 10.0.0.100", with(range("10.0.0.100", "10.0.0.110"), type(list("10.0.0.101 | 10.0.0.101"))),
        "-subnet 10.0.0.0 netmask 255.255.255.0 > range 10.0.0.100 10.0.0.110; | "
        "+subnet 10.0.0.0 netmask 255.255.255.0 > range 10.0.0.101 10.0.0.101;",
        "-Range: 10.0.0.100 - 10.0.0.110 | +Range: 10.0.0.101 - 10.0.0.101");
    row("range for BOOTP", "range dynamic", with(range("10.0.0.10", "10.0.0.20"), type({same, text("10.0.0.25")})),
        "-subnet 10.0.0.0 netmask 255.255.255.0 > range dynamic-bootp 10.0.0.10 10.0.0.20; | "
        "+subnet 10.0.0.0 netmask 255.255.255.0 > range dynamic-bootp 10.0.0.10 10.0.0.25;",
        "");
    row("range for BOOTP in capitals", "range DYNAMIC",
        with(range("10.0.0.40", "10.0.0.50"), type({same, text("10.0.0.55")})),
        "-subnet 10.0.0.0 netmask 255.255.255.0 > range DYNAMIC-BOOTP 10.0.0.40 10.0.0.50; | "
        "+subnet 10.0.0.0 netmask 255.255.255.0 > range DYNAMIC-BOOTP 10.0.0.40 10.0.0.55;",
        "");
    row("range of one address", "range 10.0.0.30", with(range("10.0.0.30", ""), type({same, text("10.0.0.35")})),
        "-subnet 10.0.0.0 netmask 255.255.255.0 > range 10.0.0.30; | "
        "+subnet 10.0.0.0 netmask 255.255.255.0 > range 10.0.0.30 10.0.0.35;",
        "-Range: 10.0.0.30 - | +Range: 10.0.0.30 - 10.0.0.35");
    row("shared network", "shared-network \"",
        with(named("Edit shared network", "Name:", "my office"), type(list("attic"))),
        "-shared-network \"my office\" | +shared-network attic",
        R"(-Shared network: "my office" | +Shared network: attic)");
    row("shared network with a space", "shared-network lab",
        with(named("Edit shared network", "Name:", "lab"), type(list("big lab"))),
        "-shared-network lab | +shared-network \"big lab\"", R"(-Shared network: lab | +Shared network: "big lab")");
    row("fixed address", "fixed-address 10.0.0.7",
        with(named("Edit fixed address", "Declaration:", "fixed-address 10.0.0.7, 10.0.0.8"),
             type(list("fixed-address 10.0.0.9"))),
        R"(-host "my pc" > fixed-address 10.0.0.7, 10.0.0.8; | +host "my pc" > fixed-address 10.0.0.9;)",
        "-Fixed address: 10.0.0.7, 10.0.0.8 | +Fixed address: 10.0.0.9");
    row("MAC address", "hardware ethernet 0011",
        with(named("Edit MAC address", "Parameter:", "hardware ethernet 0011.2233.4455"),
             type(list("hardware ethernet aa:bb:cc:dd:ee:ff"))),
        R"(-host "my pc" > hardware ethernet 0011.2233.4455; | +host "my pc" > hardware ethernet aa:bb:cc:dd:ee:ff;)",
        "-MAC address: 0011.2233.4455 | +MAC address: aa:bb:cc:dd:ee:ff");

    const Input full{host("full", "00:11:22:33:44:55", "10.0.0.5")};
    row("host, all", "host full", with(full, type(list("a.lan | 001122334477 | 10.0.0.9"))),
        "-host full | -host full > hardware ethernet 00:11:22:33:44:55; | -host full > fixed-address 10.0.0.5; | "
        "+host a.lan | +host a.lan > hardware ethernet 00:11:22:33:44:77; | +host a.lan > fixed-address 10.0.0.9;",
        "-Host: full | -MAC address: 00:11:22:33:44:55 | -Fixed address: 10.0.0.5 | +Host: a.lan | +MAC address: "
        "00:11:22:33:44:77 | +Fixed address: 10.0.0.9");
    row("host, name", "host bare", with(host("bare", "00:00:00:00:00:00", ""), type(list("a.lan"))),
        "-host bare | +host a.lan", "-Host: bare | +Host: a.lan");
    row("host, MAC", "host full", with(full, type({same, text("001122334477")})),
        "-host full > hardware ethernet 00:11:22:33:44:55; | +host full > hardware ethernet 00:11:22:33:44:77;",
        "-MAC address: 00:11:22:33:44:55 | +MAC address: 00:11:22:33:44:77");
    row("host, address", "host full", with(full, type({same, same, text("10.0.0.9")})),
        "-host full > fixed-address 10.0.0.5; | +host full > fixed-address 10.0.0.9;",
        "-Fixed address: 10.0.0.5 | +Fixed address: 10.0.0.9");
    row("host, MAC of one without", "host fixed",
        with(host("fixed", "00:00:00:00:00:00", "10.0.0.6"), type({same, text("001122334477")})), "", "");
    row("host, MAC of a bare one", "host bare",
        with(host("bare", "00:00:00:00:00:00", ""), type({same, text("001122334477")})), "", "");
    row("host, address of one without hardware", "host fixed",
        with(host("fixed", "00:00:00:00:00:00", "10.0.0.6"), type({same, same, text("10.0.0.9")})),
        "-host fixed > fixed-address 10.0.0.6; | +host fixed > fixed-address 10.0.0.9;",
        "-Fixed address: 10.0.0.6 | +Fixed address: 10.0.0.9");
    row("host, address of one without", "host hard",
        with(host("hard", "00:11:22:33:44:66", ""), type({same, same, text("10.0.0.9")})),
        "+host hard > fixed-address 10.0.0.9;", "+Fixed address: 10.0.0.9");
    row("host of which not all is shown", "host \"",
        with(named("Edit host", "Declaration:", "host \"my pc\""), type(list("host box"))),
        R"(-host "my pc" | -host "my pc" > hardware ethernet 0011.2233.4455; | )"
        R"(-host "my pc" > fixed-address 10.0.0.7, 10.0.0.8; | +host box | )"
        "+host box > hardware ethernet 0011.2233.4455; | +host box > fixed-address 10.0.0.7, 10.0.0.8;",
        R"(-Host: "my pc" | +Host: box)");
}

void TopologyEditsTest::changedFieldReachesTheStatement()
{
    QFETCH(Edit, change);
    QFETCH(QStringList, shown);
    const TopologyWindow window{configuration};
    window.tree().collapse(window.find(text("host hard")));
    const QStringList open{window.openBranches()};
    edit(window, change.statement, change.input);
    QCOMPARE(window.changes(), change.changes);
    QCOMPARE(window.shownChanges(), shown);
    QCOMPARE(window.offersSave(), !change.changes.isEmpty());
    QCOMPARE(window.notices() > 0, !change.changes.isEmpty());
    const bool isAdded{change.changes.size() == 1};
    QCOMPARE(window.resets(), isAdded ? 1 : 0);
    if (!isAdded)
        QCOMPARE(window.openBranches().size(), open.size()); // some have other words now
    QVERIFY(window.tree().currentIndex().isValid());
    if (window.offersSave()) {
        ModalBoxes boxes;
        QCOMPARE(window.saveToFile(boxes), window.content());
    }
}

void TopologyEditsTest::cancelledEditChangesNothing()
{
    QFETCH(Edit, change);
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    if (isAdvanced(change.input))
        boxes.expectBox(advancedBox(), QMessageBox::Yes);
    expectCancelled(boxes, change.input);
    window.doubleClick(change.statement);
    boxes.verify();
    QCOMPARE(window.changes(), QStringList{});
    QCOMPARE(window.notices(), 0);
    QVERIFY(!window.offersSave());
}

void TopologyEditsTest::refusedEditSaysWhy_data()
{
    QTest::addColumn<Edit>("refused");
    QTest::addColumn<QString>("error");
    const auto row = [](const char *name, const char *statement, const Input &input, const char *error) {
        QTest::addRow("%s", name) << Edit{text(statement), input} << text(error);
    };
    const QString same{};

    row("no time", "default-lease-time",
        with(time("Edit default lease time", "0 | 0 | 0 h | 10 m | 0 s"), type(list("0 | 0 | 0 | 0 | 0"))),
        "Invalid time in seconds '0");
    row("domain name", "option domain-name \"",
        with(named("Edit domain name", "Domain name:", "a.org"), type(list("local"))),
        "Invalid domain name '\"local\"'");
    row("subnet", "subnet 10.4", with(subnet("10.4.0.0", "255.255.255.0"), type(list("999.4.0.0"))),
        "Error editing subnet. Invalid subnet '999.4.0.0/255.255.255.0'");
    row("subnet without an address", "subnet 10.3", with(subnet("10.3.0.0", ""), type({text("")})),
        "Error editing subnet. Invalid subnet ''");
    row("range outside", "range 10.0.0.100", with(range("10.0.0.100", "10.0.0.110"), type(list("10.0.1.1"))),
        "Error editing range. Invalid start IP '10.0.1.1'");
    row("range backwards", "range dynamic", with(range("10.0.0.10", "10.0.0.20"), type({same, text("10.0.0.9")})),
        "Error editing range. Invalid end IP '10.0.0.9'");
    row("range in a bare subnet", "range 10.0.0.30", with(range("10.0.0.30", ""), type(list("10.0.0.31"))),
        "Error editing range. Invalid end IP ''");
    row("fixed address", "fixed-address 10.0.0.5",
        with(named("Edit fixed address", "IP:", "10.0.0.5"), type(list("127.0.0.1"))), "Invalid IP '127.0.0.1'");
    row("MAC address", "hardware ethernet 00:11:22:33:44:55",
        with(named("Edit MAC address", "MAC address:", "00:11:22:33:44:55"), type(list("0011"))),
        "Invalid MAC '00:11::::'");
    row("host's address taken away", "host full",
        with(host("full", "00:11:22:33:44:55", "10.0.0.5"), type({same, same, text("")})), "Invalid IP ''");
    row("address of a bare host", "host bare",
        with(host("bare", "00:00:00:00:00:00", ""), type({same, same, text("127.0.0.1")})),
        "Error adding fixed address. Invalid IP '127.0.0.1'");
    row("host's MAC", "host full", with(host("full", "00:11:22:33:44:55", "10.0.0.5"), type({same, text("00")})),
        "Invalid MAC '00:::::'");
}

void TopologyEditsTest::refusedEditSaysWhy()
{
    QFETCH(Edit, refused);
    QFETCH(QString, error);
    const TopologyWindow window{configuration};
    edit(window, refused.statement, refused.input, error);
    QCOMPARE(window.changes(), QStringList{});
    QCOMPARE(window.notices(), 0);
    QVERIFY(!window.offersSave());
}

// The dialog holds a little more than a year; what it cannot show is edited as text.
void TopologyEditsTest::leaseTimesOfAnySizeAreKept_data()
{
    QTest::addColumn<QByteArray>("seconds");
    for (const char *seconds : {"2147483647", "2147483648", "4294967295", "9223372036854775807", "-2147483649",
                                "-9223372036854775808", "9223372036854775808", "infinite", "600 s", "0600"})
        QTest::addRow("%s", seconds) << QByteArray{seconds};
}

void TopologyEditsTest::leaseTimesOfAnySizeAreKept()
{
    QFETCH(QByteArray, seconds);
    const TopologyWindow window{"max-lease-time " + seconds + ";\n"};
    const Input input{named("Edit max lease time", "Parameter:", "max-lease-time " + seconds)};
    edit(window, text("max-lease-time"), input);
    QCOMPARE(window.changes(), QStringList{});
    edit(window, text("max-lease-time"), with(input, type(list("max-lease-time 7"))));
    QCOMPARE(window.changes(),
             (QStringList{text("-max-lease-time %1;").arg(QString::fromLatin1(seconds)), text("+max-lease-time 7;")}));
}

void TopologyEditsTest::whatADialogCannotShowIsEditedAsText_data()
{
    QTest::addColumn<QByteArray>("content");
    QTest::addColumn<QString>("statement");
    QTest::addColumn<QString>("title");
    const auto row = [](const char *name, const char *content, const char *statement, const char *title) {
        QTest::addRow("%s", name) << QByteArray{content} << text(statement) << text(title);
    };
    row("names of DNS servers", "option domain-name-servers ns1.example.org, ns2.example.org;\n",
        "option domain-name-servers ns1.example.org, ns2.example.org", "Edit DNS servers");
    row("name among gateways", "option routers gw.example.org, 10.0.0.1;\n", "option routers gw.example.org, 10.0.0.1",
        "Edit gateways");
    row("address of no host", "option ntp-servers 10.0.0.1, 127.0.0.1;\n", "option ntp-servers 10.0.0.1, 127.0.0.1",
        "Edit NTP servers");
    row("several domain names", "option domain-name a.org;\n", "option domain-name a.org", "Edit domain name");
    row("two addresses", "host a {\nfixed-address 10.0.0.1, 10.0.0.2;\n}\n", "fixed-address 10.0.0.1, 10.0.0.2",
        "Edit fixed address");
    row("name for an address", "host a {\nfixed-address a.example.org;\n}\n", "fixed-address a.example.org",
        "Edit fixed address");
    row("range with another word", "subnet 10.0.0.0 netmask 255.255.255.0 {\nrange 10.0.0.5 10.0.0.9 more;\n}\n",
        "range 10.0.0.5 10.0.0.9 more", "Edit range");
    row("subnet with another word", "subnet 10.0.0.0 netmask 255.255.255.0 more {\n}\n",
        "subnet 10.0.0.0 netmask 255.255.255.0 more", "Edit subnet");
    row("host with two hardware lines",
        "host a {\nhardware ethernet 00:11:22:33:44:55;\nhardware ethernet 00:11:22:33:44:66;\n}\n", "host a",
        "Edit host");
    row("host with two fixed addresses", "host a {\nfixed-address 10.0.0.1;\nfixed-address 10.0.0.2;\n}\n", "host a",
        "Edit host");
    row("routes that are none", "option classless-static-routes 24, 192,168;\n",
        "option classless-static-routes 24, 192,168", "Edit static route");
}

void TopologyEditsTest::whatADialogCannotShowIsEditedAsText()
{
    QFETCH(QByteArray, content);
    QFETCH(QString, statement);
    QFETCH(QString, title);
    const TopologyWindow window{content};
    const bool isBlock{window.model().hasChildren(window.find(statement)) || statement.startsWith(text("subnet")) ||
                       statement.startsWith(text("range")) || statement.startsWith(text("fixed-address"))};
    const Input input{title, {text(isBlock ? "Declaration:" : "Parameter:"), statement}};
    edit(window, statement, input);
    QCOMPARE(window.changes(), QStringList{});
    edit(window, statement, with(input, type({statement + text("x")})));
    const QStringList changes{window.changes()};
    QVERIFY(changes.join(QLatin1Char{' '}).contains(statement + QLatin1Char{'x'}));
}

void TopologyEditsTest::noBreakSpaceSurvivesAnEdit()
{
    const TopologyWindow window{text("option vend \"a\u00a0b\";\n").toUtf8()};
    edit(window, text("option vend"),
         {text("Edit arbitrary parameter"),
          {text("Parameter:"), text("option vend \"a b\"")}, // as QTextEdit gives its text
          [](ModalBoxes & /*boxes*/, QDialog * /*dialog*/) {
              driver::press(Qt::Key_Home);
              driver::press(Qt::Key_Delete);
          }});
    QCOMPARE(window.changes(), (QStringList{text("-option vend \"a\u00a0b\";"), text("+ption vend \"a\u00a0b\";")}));
}

void TopologyEditsTest::addressOfABareHostIsAdded()
{
    const TopologyWindow window{configuration};
    edit(window, text("host bare"),
         with(host("bare", "00:00:00:00:00:00", ""), type({QString{}, QString{}, text("10.0.0.9")})));
    QCOMPARE(window.changes(), list("+host bare > fixed-address 10.0.0.9;"));
    QCOMPARE(window.tree().currentIndex(), window.find(text("host bare")));
    QVERIFY(window.isInView(window.find(text("fixed-address 10.0.0.9"))));
}

void TopologyEditsTest::hostNameIsTakenAsTyped()
{
    const TopologyWindow window{"host \"my pc\" {\n}\n"};
    const auto takeQuotesOff = [](ModalBoxes & /*boxes*/, QDialog * /*dialog*/) {
        for (const Qt::Key key : {Qt::Key_Home, Qt::Key_Delete, Qt::Key_End, Qt::Key_Backspace, Qt::Key_Backspace})
            driver::press(key);
    };
    edit(window, text("host \""), with(host("\"my pc\"", "00:00:00:00:00:00", ""), takeQuotesOff));
    QCOMPARE(window.changes(), list("-host \"my pc\" | +host my p"));
}

void TopologyEditsTest::editNeedsItsKindOfStatement_data()
{
    QTest::addColumn<Slot>("command");
    QTest::addColumn<QStringList>("fitting");
    const auto row = [](const char *name, Slot command, const char *fitting) {
        QTest::addRow("%s", name) << command << list(fitting);
    };
    row("shared network", &FMain::handleEditSharedNetwork, "shared-network lab");
    row("subnet", &FMain::handleEditSubnet, "subnet 10.0");
    row("range", &FMain::handleEditRange, "range 10.0.0.100");
    row("host", &FMain::handleEditHost, "host full");
    row("fixed address", &FMain::handleEditFixedAddress, "fixed-address");
    row("gateways", &FMain::handleEditRouters, "option routers");
    row("DNS servers", &FMain::handleEditDns, "option domain-name-servers");
    row("NTP servers", &FMain::handleEditNtp, "option ntp-servers");
    row("domain name", &FMain::handleEditDomainName, "option domain-name ");
    row("MAC address", &FMain::handleEditMacAddress, "hardware");
    row("default lease time", &FMain::handleEditDefaultLeaseTime, "default-lease-time");
    row("max lease time", &FMain::handleEditMaxLeaseTime, "max-lease-time");
    row("static route", &FMain::handleEditStaticRoute,
        "option classless-static-routes code | option classless-static-routes 24 | option ms-classless");
    row("declaration", &FMain::handleEditArbitraryDeclaration,
        "shared-network lab | subnet 10.0 | range 10.0.0.100 | host full | fixed-address | group | subclass");
    row("parameter", &FMain::handleEditArbitraryParam,
        "option routers | option domain-name-servers | option ntp-servers | option domain-name  | hardware | "
        "default-lease-time | max-lease-time | min-lease-time | option classless-static-routes code | "
        "option classless-static-routes 24 | option ms-classless | authoritative");
}

void TopologyEditsTest::editNeedsItsKindOfStatement()
{
    QFETCH(Slot, command);
    QFETCH(QStringList, fitting);
    const TopologyWindow window{configuration};
    const ModalBoxes boxes; // fails the test when anything opens
    const QStringList all{list(" | shared-network lab | subnet 10.0 | range 10.0.0.100 | host full | fixed-address | "
                               "option routers | option domain-name-servers | option ntp-servers | "
                               "option domain-name  | hardware | default-lease-time | max-lease-time | "
                               "min-lease-time | option classless-static-routes code | "
                               "option classless-static-routes 24 | option ms-classless | group | subclass | "
                               "authoritative")};
    int tried{};
    for (const QString &statement : all) {
        if (fitting.contains(statement))
            continue;
        ++tried;
        window.select(statement);
        (window.window().*command)();
    }
    QCOMPARE(tried, all.size() - fitting.size());
    window.tree().setCurrentIndex({});
    (window.window().*command)();
    QCOMPARE(window.notices(), 0);
}

QTEST_MAIN(TopologyEditsTest)
#include "tst_topologyedits.moc"
