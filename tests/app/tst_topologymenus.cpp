// SPDX-License-Identifier: GPL-3.0-or-later
// Which commands the topology tree offers for which statement: its context menus, and the editors behind "Edit" and the
// double click.
#include "tests/app/topologywindow.h"
#include "tests/support/contexttranslator.h"
#include "tests/support/dialogdriver.h"

#include <QAction>
#include <QApplication>
#include <QCursor>
#include <QDialog>
#include <QMenu>
#include <QTest>
#include <QTreeView>

namespace {

constexpr auto configuration = R"(authoritative;
default-lease-time 600;
MAX-Lease-Time 7200;
min-lease-time 300;
option domain-name "a.org";
option Domain-Name-Servers 10.0.0.1;
OPTION ntp-servers 10.0.0.1;
option time-offset 0;
option classless-static-routes code 121 = array of unsigned integer 8;
option ms-classless-static-routes code 249 = array of unsigned integer 8;
option classless-static-routes 24, 192,168,1,0, 10,0,0,1;
option ms-classless-static-routes 24, 192,168,2,0, 10,0,0,2;
option classless-static-routes 24, code;
hardware token-ring 00:11:22:33:44:66;
subnet 10.0.0.0 netmask 255.255.255.0 {
    range 10.0.0.10 10.0.0.20;
    option routers 10.0.0.1;
}
SUBNET 10.2.0.0 netmask 255.255.255.0 {
    RANGE 10.2.0.10 10.2.0.20;
}
shared-network office {
    subnet 10.1.0.0 netmask 255.255.0.0 {
        pool {
            range 10.1.0.10 10.1.0.20;
        }
    }
}
Shared-Network attic {
}
group servers {
    host grouped {
        fixed-address 10.0.0.6;
    }
}
key known {
    algorithm hmac-sha256;
}
zone example.org. {
    primary 127.0.0.1;
}
class "phones" {
    match hardware;
}
subclass "phones" 1:00:11:22:33:44:55;
SUBCLASS "phones" 1:00:11:22:33:44:66;
failover peer "x" {
    primary;
}
host single {
    hardware ethernet 00:11:22:33:44:55;
    FIXED-address 10.0.0.5;
}
Host other {
    HARDWARE Ethernet 00:11:22:33:44:77;
}
)";

/// The entries of a menu: object names of actions, "-" for a separator, and the title of a submenu behind ">".
QStringList entriesOf(const QMenu &menu)
{
    QStringList entries;
    for (const QAction *action : menu.actions()) {
        if (action->isSeparator())
            entries.append(text("-"));
        else
            entries.append(action->menu() ? QLatin1Char{'>'} + action->menu()->title() : action->objectName());
    }
    return entries;
}

QMenu *submenuOf(const QMenu &menu)
{
    for (const QAction *action : menu.actions()) {
        if (action->menu())
            return action->menu();
    }
    return nullptr;
}

void dismiss(QMenu *menu) { QTest::keyClick(menu, Qt::Key_Escape); }

} // namespace

class TopologyMenusTest final : public QObject
{
    Q_OBJECT

private slots:
    void statementHasItsMenu_data();
    void statementHasItsMenu();
    void submenusAreShared();
    void menuOpensAtTheMouse();
    void menuIsOfTheCurrentStatement();
    void noMenuWithoutAStatement();
    void textsAreTranslatedAsTheWindows();
    void editorFitsTheStatement_data();
    void editorFitsTheStatement();
    void nothingIsEditedAboveTheStatements();
};

void TopologyMenusTest::statementHasItsMenu_data()
{
    QTest::addColumn<QString>("statement");
    QTest::addColumn<QString>("entries");

    const QString root{text("aAddSharedNetwork aAddSubnet aAddHost aAddStaticRoute - aAddDeclaration >Add parameter")};
    const QString subnet{text("aAddRange - aAddDeclaration - >Add parameter - actionEdit actionRemove")};
    const QString sharedNetwork{text("aAddSubnet - aAddDeclaration - >Add parameter - actionEdit actionRemove")};
    const QString host{text("aAddFixedIp - aAddDeclaration - aAddStaticRoute - >Add parameter - actionEdit "
                            "actionRemove")};
    const QString other{text("aAddDeclaration - >Add parameter - actionEdit actionRemove")};
    const QString leaf{text("actionEdit actionRemove")};
    const auto row = [](const char *statement, const QString &entries) {
        QTest::addRow("%s", *statement ? statement : "All network") << text(statement) << entries;
    };

    row("", root);
    for (const char *statement : {"subnet", "SUBNET", "subnet 10.1"})
        row(statement, subnet);
    for (const char *statement : {"shared-network", "Shared-Network"})
        row(statement, sharedNetwork);
    for (const char *statement : {"host single", "Host other", "host grouped"})
        row(statement, host);
    for (const char *statement : {"group", "pool", "key", "zone", "class", "failover"})
        row(statement, other);
    for (const char *statement :
         {"range", "RANGE", "range 10.1", "fixed-address", "FIXED-address", "subclass", "SUBCLASS"})
        row(statement, leaf);
    for (const char *statement :
         {"authoritative", "default-lease-time", "option domain-name", "option routers", "option classless",
          "hardware ethernet", "hardware token-ring", "algorithm", "primary 127.0.0.1"})
        row(statement, leaf);
}

void TopologyMenusTest::statementHasItsMenu()
{
    QFETCH(QString, statement);
    QFETCH(QString, entries);
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    window.openMenu(boxes, statement, [&](QMenu *menu) {
        QCOMPARE(menu->title(), text("Actions"));
        QCOMPARE(entriesOf(*menu).join(QLatin1Char{' '}), entries);
        dismiss(menu);
    });
    QCOMPARE(window.tree().currentIndex(), window.find(statement));
    QCOMPARE(window.changes(), QStringList{});
}

void TopologyMenusTest::submenusAreShared()
{
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    QMenu *shared{};
    for (const char *statement : {"", "subnet", "shared-network", "host", "group"}) {
        window.openMenu(boxes, text(statement), [&](QMenu *menu) {
            QMenu *parameters{submenuOf(*menu)};
            QVERIFY(parameters);
            if (!shared)
                shared = parameters;
            QCOMPARE(parameters, shared);
            dismiss(menu);
        });
    }
    if (!shared)
        QFAIL("no menu has the submenu");
    QCOMPARE(entriesOf(*shared).join(QLatin1Char{' '}),
             text(">Add option - aAddDefaultLeaseTime aAddMaxLeaseTime - aAddParam"));
    QCOMPARE(entriesOf(*submenuOf(*shared)).join(QLatin1Char{' '}),
             text("aAddRouters aAddDns aAddNtpServers aAddDomainName aAddDHCPDynamicUpdate"));
}

void TopologyMenusTest::menuOpensAtTheMouse()
{
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    const QPoint place{120, 130};
    QCursor::setPos(place);
    window.openMenu(boxes, text("subnet"), [&](QMenu *menu) {
        QCOMPARE(menu->pos(), place);
        dismiss(menu);
    });
}

// As when the menu key asks for it.
void TopologyMenusTest::menuIsOfTheCurrentStatement()
{
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    window.select(text("host single"), 1);
    boxes.expectMenu([](QMenu *menu) {
        QCOMPARE(entriesOf(*menu).first(), text("aAddFixedIp"));
        dismiss(menu);
    });
    window.window().handleTreeContextMenuRequested({});
}

void TopologyMenusTest::noMenuWithoutAStatement()
{
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    window.tree().setCurrentIndex({});
    window.window().handleTreeContextMenuRequested({});
    QCoreApplication::processEvents();
    QVERIFY(!QApplication::activePopupWidget());
}

void TopologyMenusTest::textsAreTranslatedAsTheWindows()
{
    ContextTranslator translator;
    QCoreApplication::installTranslator(&translator);
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    window.openMenu(boxes, text("subnet"), [](QMenu *menu) {
        QCOMPARE(menu->title(), text("FMain|Actions"));
        QMenu *parameters{submenuOf(*menu)};
        QCOMPARE(parameters->title(), text("FMain|Add parameter"));
        QCOMPARE(submenuOf(*parameters)->title(), text("FMain|Add option"));
        dismiss(menu);
    });
    ModalBoxes::Box warning{advancedBox()};
    warning.title = text("FMain|") + warning.title;
    warning.text = text("FMain|") + warning.text;
    boxes.expectBox(warning, QMessageBox::Yes);
    boxes.expectDialog<QDialog>([](QDialog *dialog) {
        QCOMPARE(dialog->windowTitle(), text("FMain|Edit arbitrary declaration"));
        QCOMPARE(shownIn(*dialog).first(), text("FMain|Declaration:"));
        driver::click(*dialog, QDialogButtonBox::Cancel);
    });
    window.doubleClick(text("group"));
    QCoreApplication::removeTranslator(&translator);
}

void TopologyMenusTest::editorFitsTheStatement_data()
{
    QTest::addColumn<QString>("statement");
    QTest::addColumn<bool>("warns");
    QTest::addColumn<QString>("title");

    const auto row = [](const char *statement, const char *title) {
        const bool warns{text(title).startsWith(text("Edit arbitrary")) || text(statement).contains(text(" code"))};
        QTest::addRow("%s", statement) << text(statement) << warns << text(title);
    };
    row("shared-network", "Edit shared network");
    row("Shared-Network", "Edit shared network");
    row("subnet", "Edit subnet");
    row("SUBNET", "Edit subnet");
    row("range 10.0", "Edit range");
    row("RANGE", "Edit range");
    row("range 10.1", "Edit range");
    row("host single", "Edit host");
    row("Host other", "Edit host");
    row("fixed-address", "Edit fixed address");
    row("FIXED-address", "Edit fixed address");
    for (const char *statement : {"group", "pool", "key", "zone", "class", "subclass", "failover"})
        row(statement, "Edit arbitrary declaration");
    row("option routers", "Edit gateways");
    row("option Domain-Name-Servers", "Edit DNS servers");
    row("OPTION ntp-servers", "Edit NTP servers");
    row("option domain-name", "Edit domain name");
    row("hardware ethernet", "Edit MAC address");
    row("HARDWARE Ethernet", "Edit MAC address");
    row("default-lease-time", "Edit default lease time");
    row("MAX-Lease-Time", "Edit max lease time");
    row("min-lease-time", "Edit time");
    row("option classless-static-routes code 121", "Edit static route");
    row("option ms-classless-static-routes code 249", "Edit static route");
    row("option classless-static-routes 24, 192", "Edit static route");
    row("option ms-classless-static-routes 24", "Edit static route");
    row("option classless-static-routes 24, code", "Edit static route"); // no routes that the dialog could show
    for (const char *statement : {"authoritative", "option time-offset", "hardware token-ring", "match", "primary 1"})
        row(statement, "Edit arbitrary parameter");
}

void TopologyMenusTest::editorFitsTheStatement()
{
    QFETCH(QString, statement);
    QFETCH(bool, warns);
    QFETCH(QString, title);
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    int opened{};
    const auto expectEditor = [&] {
        if (warns)
            boxes.expectBox(advancedBox(), QMessageBox::Yes);
        boxes.expectDialog<QDialog>([&](QDialog *dialog) {
            ++opened;
            QCOMPARE(dialog->windowTitle(), title);
            QCOMPARE(dialog->parentWidget(), &window.window());
            driver::click(*dialog, QDialogButtonBox::Cancel);
        });
    };
    const QStringList open{window.openBranches()};
    for (const int column : {0, 1}) {
        expectEditor();
        window.doubleClick(statement, column);
        expectEditor();
        window.action("actionEdit").trigger();
    }
    window.choose(boxes, statement, {text("Edit")}, expectEditor);
    QCOMPARE(opened, 5);
    QCOMPARE(window.openBranches(), open);
    QCOMPARE(window.changes(), QStringList{});
    QVERIFY(!window.offersSave());
}

void TopologyMenusTest::nothingIsEditedAboveTheStatements()
{
    const TopologyWindow window{configuration};
    const ModalBoxes boxes; // fails the test when anything opens
    const QStringList open{window.openBranches()};
    for (const int column : {0, 1}) {
        window.doubleClick({}, column);
        window.action("actionEdit").trigger();
    }
    window.window().handleTreeDoubleClicked({});
    window.tree().setCurrentIndex({});
    window.action("actionEdit").trigger();
    QCOMPARE(window.openBranches(), open);
    QCOMPARE(window.notices(), 0);
}

QTEST_MAIN(TopologyMenusTest)
#include "tst_topologymenus.moc"
