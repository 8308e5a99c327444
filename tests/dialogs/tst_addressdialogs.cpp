// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/ipinputdialog.h"
#include "dialogs/multipleipinputdialog.h"
#include "dialogs/rangeinputdialog.h"
#include "dialogs/subnetinputdialog.h"
#include "tests/support/contexttranslator.h"
#include "tests/support/dialogdriver.h"
#include "tests/support/modalboxes.h"
#include "tests/support/text.h"

#include <QApplication>
#include <QGroupBox>
#include <QLineEdit>
#include <QListWidget>
#include <QMetaEnum>
#include <QPushButton>

namespace {

/// Clicks an entry of the list where a user would.
void clickEntry(QListWidget *list, int row, Qt::KeyboardModifiers modifiers = {})
{
    QTest::mouseClick(list->viewport(), Qt::LeftButton, modifiers, list->visualItemRect(list->item(row)).center());
}

} // namespace

class AddressDialogsTest final : public QObject
{
    Q_OBJECT

private slots:
    void subnetReturnsWhatWasSet();
    void typedPrefixFillsAndLocksTheNetmask();
    void prefixCannotExceed32();
    void setPrefixFillsAndLocksTheNetmask_data();
    void setPrefixFillsAndLocksTheNetmask();
    void subnetIsSavedWhateverItHolds();
    void rangeReturnsWhatWasSet();
    void rangeMayEndBeforeItStarts();
    void rangeIsSavedEmpty();
    void addressReturnsWhatWasSet();
    void addressIsSavedUnfinished();
    void listCaptionCanBeSet();
    void listKeepsValidAddresses_data();
    void listKeepsValidAddresses();
    void emptyListIsNotSaved();
    void addAppendsAnAddress_data();
    void addAppendsAnAddress();
    void cancelledAddAppendsNothing();
    void removeDeletesTheSelectedEntries();
    void removeIsDisabledWithAnEmptyList();
    void listIsEditedWithTheKeyboardAlone_data();
    void listIsEditedWithTheKeyboardAlone();
};

void AddressDialogsTest::subnetReturnsWhatWasSet()
{
    SubnetInputDialog dialog;
    QCOMPARE(dialog.address(), QString{});
    QCOMPARE(dialog.netmask(), QString{});
    dialog.setAddress(text("192.168.1.0"));
    dialog.setNetmask(text("255.255.255.0"));
    QCOMPARE(dialog.address(), text("192.168.1.0"));
    QCOMPARE(dialog.netmask(), text("255.255.255.0"));
    QVERIFY(driver::find<QLineEdit>(dialog, text("netmask"))->isEnabled());
}

void AddressDialogsTest::typedPrefixFillsAndLocksTheNetmask()
{
    SubnetInputDialog dialog;
    driver::open(dialog);
    const auto *netmask = driver::find<QLineEdit>(dialog, text("netmask"));
    driver::retype(text("10.0.0.0/8"));
    QCOMPARE(dialog.address(), text("10.0.0.0"));
    QCOMPARE(dialog.netmask(), text("255.0.0.0"));
    QVERIFY(!netmask->isEnabled());

    driver::press(Qt::Key_Backspace);
    QCOMPARE(dialog.netmask(), text("255.0.0.0"));
    QVERIFY(!netmask->isEnabled());
    driver::press(Qt::Key_Backspace);
    QCOMPARE(dialog.address(), text("10.0.0.0"));
    QCOMPARE(dialog.netmask(), text("255.0.0.0"));
    QVERIFY(netmask->isEnabled());

    driver::press(Qt::Key_Tab);
    driver::retype(text("255.255.0.0"));
    driver::press(Qt::Key_Return);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.netmask(), text("255.255.0.0"));
}

void AddressDialogsTest::prefixCannotExceed32()
{
    SubnetInputDialog dialog;
    driver::open(dialog);
    driver::retype(text("192.168.1.0/33"));
    QCOMPARE(driver::find<QLineEdit>(dialog, text("address"))->text(), text("192.168.1.0/3"));
    driver::press(Qt::Key_2);
    QCOMPARE(dialog.netmask(), text("255.255.255.255"));
}

void AddressDialogsTest::setPrefixFillsAndLocksTheNetmask_data()
{
    QTest::addColumn<QString>("typed");
    QTest::addColumn<QString>("address");
    QTest::addColumn<QString>("netmask");
    QTest::addColumn<bool>("editable");
    QTest::addRow("24") << text("192.168.1.0/24") << text("192.168.1.0") << text("255.255.255.0") << false;
    QTest::addRow("0") << text("0.0.0.0/0") << text("0.0.0.0") << text("0.0.0.0") << false;
    QTest::addRow("30") << text("10.1.2.4/30") << text("10.1.2.4") << text("255.255.255.252") << false;
    QTest::addRow("not finished") << text("192.168.1.0/") << text("192.168.1.0") << text("254.0.0.0") << false;
    QTest::addRow("too long") << text("192.168.1.0/33") << text("192.168.1.0") << text("254.0.0.0") << false;
    QTest::addRow("no address") << text("999.1.1.0/24") << text("999.1.1.0") << text("254.0.0.0") << false;
    QTest::addRow("only a prefix") << text("/24") << QString{} << text("255.255.255.0") << false;
    QTest::addRow("no prefix") << text("10.0.0.0") << text("10.0.0.0") << text("254.0.0.0") << true;
    QTest::addRow("nothing") << QString{} << QString{} << text("254.0.0.0") << true;
}

void AddressDialogsTest::setPrefixFillsAndLocksTheNetmask()
{
    QFETCH(QString, typed);
    QFETCH(bool, editable);
    SubnetInputDialog dialog;
    dialog.setNetmask(text("254.0.0.0"));
    dialog.setAddress(typed);
    QTEST(dialog.address(), "address");
    QTEST(dialog.netmask(), "netmask");
    QCOMPARE(driver::find<QLineEdit>(dialog, text("netmask"))->isEnabled(), editable);
}

void AddressDialogsTest::subnetIsSavedWhateverItHolds()
{
    SubnetInputDialog dialog;
    driver::open(dialog);
    driver::retype(text("10.0"));
    driver::click(dialog, QDialogButtonBox::Save);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.address(), text("10.0"));
}

void AddressDialogsTest::rangeReturnsWhatWasSet()
{
    RangeInputDialog dialog;
    dialog.setStartIp(text("10.0.0.10"));
    dialog.setEndIp(text("10.0.0.20"));
    QCOMPARE(dialog.startIp(), text("10.0.0.10"));
    QCOMPARE(dialog.endIp(), text("10.0.0.20"));
}

void AddressDialogsTest::rangeMayEndBeforeItStarts()
{
    RangeInputDialog dialog;
    driver::open(dialog);
    driver::retype(text("10.0.0.200"));
    driver::press(Qt::Key_Tab);
    driver::retype(text("10.0.0.256"));
    driver::press(Qt::Key_Return);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.startIp(), text("10.0.0.200"));
    QCOMPARE(dialog.endIp(), text("10.0.0.25"));
}

void AddressDialogsTest::rangeIsSavedEmpty()
{
    RangeInputDialog dialog;
    driver::open(dialog);
    driver::click(dialog, QDialogButtonBox::Save);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
}

void AddressDialogsTest::addressReturnsWhatWasSet()
{
    IpInputDialog dialog;
    dialog.setIp(text("999.0.0.1"));
    QCOMPARE(dialog.ip(), text("999.0.0.1"));
}

void AddressDialogsTest::addressIsSavedUnfinished()
{
    IpInputDialog dialog;
    driver::open(dialog);
    driver::retype(text("10.a0"));
    driver::press(Qt::Key_Return);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.ip(), text("10.0"));
}

void AddressDialogsTest::listCaptionCanBeSet()
{
    MultipleIpInputDialog dialog;
    dialog.setLabel(text("Gateways:"));
    QCOMPARE(driver::find<QGroupBox>(dialog, text("ipGroup"))->title(), text("Gateways:"));
}

void AddressDialogsTest::listKeepsValidAddresses_data()
{
    QTest::addColumn<QString>("set");
    QTest::addColumn<QString>("listed");
    QTest::addRow("one") << text("10.0.0.1") << text("10.0.0.1");
    QTest::addRow("without spaces") << text("10.0.0.1,10.0.0.2") << text("10.0.0.1, 10.0.0.2");
    QTest::addRow("mixed") << text("10.0.0.1 ,10.0.0.2,,127.0.0.1,255.255.255.255") << text("10.0.0.1, 10.0.0.2");
    QTest::addRow("spaces within") << text("1 0.0. 0.1") << text("10.0.0.1");
    QTest::addRow("twice the same") << text("10.0.0.1, 10.0.0.1") << text("10.0.0.1, 10.0.0.1");
    QTest::addRow("leading zeros") << text("010.000.000.001") << text("8.0.0.1");
    QTest::addRow("another loopback") << text("127.9.9.9, 10.0.0.1") << text("10.0.0.1");
    QTest::addRow("names") << text("ns.example.org, 10.0.0.1") << text("10.0.0.1");
    QTest::addRow("too big") << text("10.0.0.256") << QString{};
    QTest::addRow("nothing") << QString{} << QString{};
}

void AddressDialogsTest::listKeepsValidAddresses()
{
    QFETCH(QString, set);
    QFETCH(QString, listed);
    MultipleIpInputDialog dialog;
    dialog.setIps(set);
    QCOMPARE(dialog.ips(), listed);
    const auto *list = driver::find<QListWidget>(dialog, text("ipList"));
    QCOMPARE(list->count(), listed.isEmpty() ? 0 : listed.count(QLatin1Char{','}) + 1);
    QVERIFY(!driver::find<QPushButton>(dialog, text("removeButton"))->isEnabled());
}

void AddressDialogsTest::emptyListIsNotSaved()
{
    ModalBoxes boxes;
    MultipleIpInputDialog dialog;
    driver::open(dialog);
    driver::click(dialog, QDialogButtonBox::Save);
    driver::press(Qt::Key_Return);
    QVERIFY(dialog.isVisible());
    dialog.setIps(text("10.0.0.1"));
    driver::press(Qt::Key_Return);
    QVERIFY(!dialog.isVisible());
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
}

void AddressDialogsTest::addAppendsAnAddress_data()
{
    QTest::addColumn<QString>("typed");
    QTest::addColumn<QString>("listed");
    QTest::addRow("address") << text("10.0.0.2") << text("10.0.0.1, 10.0.0.2");
    QTest::addRow("the same again") << text("10.0.0.1") << text("10.0.0.1, 10.0.0.1");
    QTest::addRow("no address") << text("999.0.0.2") << text("10.0.0.1");
    QTest::addRow("loopback") << text("127.0.0.1") << text("10.0.0.1");
    QTest::addRow("broadcast") << text("255.255.255.255") << text("10.0.0.1");
    QTest::addRow("nothing") << QString{} << text("10.0.0.1");
}

void AddressDialogsTest::addAppendsAnAddress()
{
    QFETCH(QString, typed);
    MultipleIpInputDialog dialog;
    dialog.setIps(text("10.0.0.1"));
    driver::open(dialog);

    ModalBoxes boxes;
    boxes.expectDialog<IpInputDialog>([&](IpInputDialog *ipDialog) {
        QCOMPARE(ipDialog->parentWidget(), &dialog);
        QCOMPARE(ipDialog->windowTitle(), text("Add IP"));
        driver::retype(typed);
        driver::press(Qt::Key_Return);
    });
    driver::click(driver::find<QPushButton>(dialog, text("addButton")));
    QTEST(dialog.ips(), "listed");
    QVERIFY(dialog.isVisible());
}

void AddressDialogsTest::cancelledAddAppendsNothing()
{
    ContextTranslator translator;
    QCoreApplication::installTranslator(&translator);
    MultipleIpInputDialog dialog;
    driver::open(dialog);
    ModalBoxes boxes;
    boxes.expectDialog<IpInputDialog>([](IpInputDialog *ipDialog) {
        QCOMPARE(ipDialog->windowTitle(), text("MultipleIpInputDialog|Add IP"));
        driver::retype(text("10.0.0.2"));
        driver::click(*ipDialog, QDialogButtonBox::Cancel);
    });
    driver::click(driver::find<QPushButton>(dialog, text("addButton")));
    QCOMPARE(dialog.ips(), QString{});
}

void AddressDialogsTest::removeDeletesTheSelectedEntries()
{
    MultipleIpInputDialog dialog;
    dialog.setIps(text("10.0.0.1, 10.0.0.2, 10.0.0.3, 10.0.0.4"));
    driver::open(dialog);
    auto *list = driver::find<QListWidget>(dialog, text("ipList"));
    auto *remove = driver::find<QPushButton>(dialog, text("removeButton"));
    clickEntry(list, 1);
    QVERIFY(remove->isEnabled());
    driver::click(remove);
    QCOMPARE(dialog.ips(), text("10.0.0.1, 10.0.0.3, 10.0.0.4"));
    QVERIFY(remove->isEnabled());

    clickEntry(list, 0);
    clickEntry(list, 2, Qt::ControlModifier);
    driver::click(remove);
    QCOMPARE(dialog.ips(), text("10.0.0.3"));
}

void AddressDialogsTest::removeIsDisabledWithAnEmptyList()
{
    MultipleIpInputDialog dialog;
    dialog.setIps(text("10.0.0.1"));
    driver::open(dialog);
    auto *remove = driver::find<QPushButton>(dialog, text("removeButton"));
    clickEntry(driver::find<QListWidget>(dialog, text("ipList")), 0);
    driver::click(remove);
    QCOMPARE(dialog.ips(), QString{});
    QVERIFY(!remove->isEnabled());
}

void AddressDialogsTest::listIsEditedWithTheKeyboardAlone_data()
{
    QTest::addColumn<Qt::Key>("key");
    for (const Qt::Key key : {Qt::Key_Return, Qt::Key_Enter, Qt::Key_Space})
        QTest::addRow("%s", QMetaEnum::fromType<Qt::Key>().valueToKey(key)) << key;
}

void AddressDialogsTest::listIsEditedWithTheKeyboardAlone()
{
    QFETCH(Qt::Key, key);
    MultipleIpInputDialog dialog;
    driver::open(dialog);
    const auto *list = driver::find<QListWidget>(dialog);
    const auto *add = driver::find<QPushButton>(dialog, text("addButton"));
    const auto *remove = driver::find<QPushButton>(dialog, text("removeButton"));
    const auto *save = driver::find<QDialogButtonBox>(dialog)->button(QDialogButtonBox::Save);

    ModalBoxes boxes;
    QCOMPARE(QApplication::focusWidget(), list);
    driver::press(Qt::Key_Tab);
    for (const char *address : {"10.0.0.1", "10.0.0.2"}) {
        QCOMPARE(QApplication::focusWidget(), add);
        QVERIFY(save->isDefault());
        boxes.expectDialog<IpInputDialog>([address](IpInputDialog * /*ipDialog*/) {
            QTest::keyClicks(QApplication::focusWidget(), text(address));
            driver::press(Qt::Key_Return);
        });
        driver::press(key);
        boxes.verify();
    }
    QCOMPARE(dialog.ips(), text("10.0.0.1, 10.0.0.2"));

    driver::press(Qt::Key_Backtab);
    for (const auto &[row, left] : {std::pair{Qt::Key_End, "10.0.0.1"}, std::pair{Qt::Key_Space, ""}}) {
        QCOMPARE(QApplication::focusWidget(), list);
        driver::press(row);
        driver::press(Qt::Key_Tab);
        driver::press(Qt::Key_Tab);
        QCOMPARE(QApplication::focusWidget(), remove);
        driver::press(key);
        QCOMPARE(dialog.ips(), text(left));
        if (*left) {
            driver::press(Qt::Key_Backtab);
            driver::press(Qt::Key_Backtab);
        }
    }
    // Beside the last one there is nothing to remove, and the keyboard stays in the list.
    QCOMPARE(QApplication::focusWidget(), list);
    QVERIFY(dialog.isVisible());
}

QTEST_MAIN(AddressDialogsTest)
#include "tst_addressdialogs.moc"
