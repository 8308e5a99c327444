// SPDX-License-Identifier: GPL-3.0-or-later
// While a command's dialog is open, no other command starts, and a tree that is reset all the same harms nothing.
#include "tests/app/topologywindow.h"

#include "config/dhcpdconfigmodel.h"

#include <QAction>
#include <QApplication>
#include <QFileDialog>
#include <QMenu>
#include <QMessageBox>
#include <QTest>
#include <QTreeView>

namespace {

constexpr auto configuration = R"(option domain-name "a.org";
option domain-name-servers 10.0.0.1;
option routers 10.0.0.1;
option ntp-servers 10.0.0.1;
option classless-static-routes code 121 = array of unsigned integer 8;
option classless-static-routes 24, 192,168,1, 10,0,0,1;
default-lease-time 600;
max-lease-time 7200;
min-lease-time 300;
authoritative;
shared-network office {
}
subnet 10.0.0.0 netmask 255.255.255.0 {
    range 10.0.0.10 10.0.0.20;
}
group servers {
}
host full {
    hardware ethernet 00:11:22:33:44:55;
    fixed-address 10.0.0.5;
}
)";

using Slot = void (FMain::*)();

/// Whatever a desktop's menu or a screen reader can reach.
void triggerAll(const FMain &window)
{
    for (QAction *action : window.findChildren<QAction *>()) {
        const bool isCommand{!action->objectName().isEmpty() && !action->menu()};
        if (isCommand) {
            action->setEnabled(true);
            action->trigger();
        }
    }
}

void reject(const QDialog &dialog) { QTest::keyClick(const_cast<QDialog *>(&dialog), Qt::Key_Escape); }

} // namespace

Q_DECLARE_METATYPE(Slot)

class CommandGuardTest final : public QObject
{
    Q_OBJECT

private slots:
    void noCommandStartsInADialog_data() { commands(); }
    void noCommandStartsInADialog();
    void noCommandStartsInABox();
    void resetUnderADialogEndsTheCommand_data() { commands(); }
    void resetUnderADialogEndsTheCommand();
    void windowStaysOpenUnderADialog();

private:
    static void commands();
    /// Runs the command on the statement, answers the questions before its dialog, and does `use` in that.
    static void run(const TopologyWindow &window, ModalBoxes &boxes, const QString &statement, Slot command, bool asks,
                    const std::function<void(QDialog *dialog)> &use);
};

void CommandGuardTest::commands()
{
    QTest::addColumn<QString>("statement");
    QTest::addColumn<Slot>("command");
    QTest::addColumn<bool>("asks");
    const auto row = [](const char *name, const char *statement, Slot command, bool asks = false) {
        QTest::addRow("%s", name) << text(statement) << command << asks;
    };
    row("add shared network", "", &FMain::handleAddSharedNetwork);
    row("add subnet", "", &FMain::handleAddSubnet);
    row("add range", "subnet", &FMain::handleAddRange);
    row("add host", "", &FMain::handleAddHost);
    row("add fixed address", "host", &FMain::handleAddFixedAddress);
    row("add gateways", "subnet", &FMain::handleAddRouters);
    row("add DNS servers", "subnet", &FMain::handleAddDns);
    row("add NTP servers", "subnet", &FMain::handleAddNtp);
    row("add domain name", "subnet", &FMain::handleAddDomainName);
    row("add max lease time", "subnet", &FMain::handleAddMaxLeaseTime);
    row("add default lease time", "subnet", &FMain::handleAddDefaultLeaseTime);
    row("add static route", "subnet", &FMain::handleAddStaticRoute);
    row("add declaration", "group", &FMain::handleAddArbitraryDeclaration, true);
    row("add parameter", "group", &FMain::handleAddArbitraryParam, true);
    row("edit shared network", "shared-network", &FMain::handleEditSharedNetwork);
    row("edit subnet", "subnet", &FMain::handleEditSubnet);
    row("edit range", "range", &FMain::handleEditRange);
    row("edit host", "host", &FMain::handleEditHost);
    row("edit fixed address", "fixed-address", &FMain::handleEditFixedAddress);
    row("edit gateways", "option routers", &FMain::handleEditRouters);
    row("edit DNS servers", "option domain-name-servers", &FMain::handleEditDns);
    row("edit NTP servers", "option ntp-servers", &FMain::handleEditNtp);
    row("edit domain name", "option domain-name ", &FMain::handleEditDomainName);
    row("edit max lease time", "max-lease-time", &FMain::handleEditMaxLeaseTime);
    row("edit default lease time", "default-lease-time", &FMain::handleEditDefaultLeaseTime);
    row("edit another lease time", "min-lease-time", &FMain::handleEdit);
    row("edit MAC address", "hardware", &FMain::handleEditMacAddress);
    row("edit static route", "option classless-static-routes 24", &FMain::handleEditStaticRoute);
    row("edit definition of routes", "option classless-static-routes code", &FMain::handleEditStaticRoute, true);
    row("edit declaration", "group", &FMain::handleEditArbitraryDeclaration, true);
    row("edit parameter", "authoritative", &FMain::handleEditArbitraryParam, true);
}

void CommandGuardTest::run(const TopologyWindow &window, ModalBoxes &boxes, const QString &statement, Slot command,
                           bool asks, const std::function<void(QDialog *dialog)> &use)
{
    window.select(statement);
    if (asks)
        boxes.expectBox(advancedBox(), QMessageBox::Yes);
    boxes.expectDialog<QDialog>(use);
    (window.window().*command)();
    boxes.verify();
}

void CommandGuardTest::noCommandStartsInADialog()
{
    QFETCH(QString, statement);
    QFETCH(Slot, command);
    QFETCH(bool, asks);
    const TopologyWindow window{configuration};
    ModalBoxes boxes; // fails the test when another dialog opens
    run(window, boxes, statement, command, asks, [&window](QDialog *dialog) {
        triggerAll(window.window());
        window.window().handleReserveIp();
        QCOMPARE(QApplication::activeModalWidget(), dialog);
        reject(*dialog);
    });
    QCOMPARE(window.changes(), QStringList{});
    QCOMPARE(window.resets(), 0);
    QVERIFY(window.window().isVisible());
}

void CommandGuardTest::noCommandStartsInABox()
{
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    boxes.expectDialog<QMessageBox>([&window](QMessageBox *box) {
        triggerAll(window.window());
        QCOMPARE(QApplication::activeModalWidget(), box);
        reject(*box);
    });
    window.window().reload();
    boxes.verify();
    QCOMPARE(window.changes(), QStringList{});
}

void CommandGuardTest::resetUnderADialogEndsTheCommand()
{
    QFETCH(QString, statement);
    QFETCH(Slot, command);
    QFETCH(bool, asks);
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    QByteArray reloaded;
    run(window, boxes, statement, command, asks, [&](QDialog *dialog) {
        window.model().reload();
        reloaded = window.content();
        dialog->accept();
        if (dialog->isVisible()) // it asks for a value first
            reject(*dialog);
    });
    QCOMPARE(window.content(), reloaded);
    QVERIFY(!window.offersSave());
}

void CommandGuardTest::windowStaysOpenUnderADialog()
{
    const TopologyWindow window{configuration};
    ModalBoxes boxes;
    run(window, boxes, text("host"), &FMain::handleEditHost, false, [&window](QDialog *dialog) {
        window.window().close();
        QVERIFY(window.window().isVisible());
        reject(*dialog);
    });
}

QTEST_MAIN(CommandGuardTest)
#include "tst_commandguard.moc"
