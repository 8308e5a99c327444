// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/domaininputdialog.h"
#include "dialogs/hostinputdialog.h"
#include "dialogs/macinputdialog.h"
#include "dialogs/sharednetworkinputdialog.h"
#include "tests/support/dialogdriver.h"
#include "tests/support/modalboxes.h"
#include "tests/support/text.h"

#include <QApplication>
#include <QLineEdit>

class NameDialogsTest final : public QObject
{
    Q_OBJECT

private slots:
    void hostReturnsWhatWasSet();
    void hostIsTypedThroughItsFields();
    void hostNameNeedsNoDot();
    void hostWithoutNameIsNotSaved();
    void macReturnsItsColons();
    void macIsSavedUnfinished();
    void macIsTypedOver();
    void domainLosesAndGetsItsQuotes_data();
    void domainLosesAndGetsItsQuotes();
    void emptyDomainIsNotSaved();
    void sharedNetworkTakesAnyName_data();
    void sharedNetworkTakesAnyName();
};

void NameDialogsTest::hostReturnsWhatWasSet()
{
    HostInputDialog dialog;
    QCOMPARE(dialog.mac(), text(":::::"));
    dialog.setName(text("printer"));
    dialog.setMac(text("00:1a:2B:3c:4d:5e"));
    dialog.setIp(text("10.0.0.1"));
    QCOMPARE(dialog.name(), text("printer"));
    QCOMPARE(dialog.mac(), text("00:1a:2B:3c:4d:5e"));
    QCOMPARE(dialog.ip(), text("10.0.0.1"));
}

void NameDialogsTest::hostIsTypedThroughItsFields()
{
    HostInputDialog dialog;
    dialog.setMac(text("00:00:00:00:00:00"));
    driver::open(dialog);
    driver::retype(text("printer 1.example.org"));
    driver::press(Qt::Key_Tab);
    QTest::keyClicks(QApplication::focusWidget(), text("00:1a:2b:3c:4d:5e"));
    driver::press(Qt::Key_Tab);
    driver::retype(text("10.0.0.1000"));
    driver::press(Qt::Key_Return);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.name(), text("printer1.example.org"));
    QCOMPARE(dialog.mac(), text("00:1a:2b:3c:4d:5e"));
    QCOMPARE(dialog.ip(), text("10.0.0.100"));
}

void NameDialogsTest::hostNameNeedsNoDot()
{
    HostInputDialog dialog;
    driver::open(dialog);
    driver::retype(text("host1"));
    QVERIFY(!driver::find<QLineEdit>(dialog, text("hostName"))->hasAcceptableInput());
    driver::click(dialog, QDialogButtonBox::Save);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.name(), text("host1"));
    QCOMPARE(dialog.ip(), QString{});
}

void NameDialogsTest::hostWithoutNameIsNotSaved()
{
    ModalBoxes boxes;
    HostInputDialog dialog;
    dialog.setMac(text("00:1a:2b:3c:4d:5e"));
    dialog.setIp(text("10.0.0.1"));
    driver::open(dialog);
    driver::click(dialog, QDialogButtonBox::Save);
    QVERIFY(dialog.isVisible());
    dialog.setName(text("printer"));
    driver::click(dialog, QDialogButtonBox::Save);
    QVERIFY(!dialog.isVisible());
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
}

void NameDialogsTest::macReturnsItsColons()
{
    MacInputDialog dialog;
    dialog.setMac(text("00:1a:2b:3c:4d:5e"));
    QCOMPARE(dialog.mac(), text("00:1a:2b:3c:4d:5e"));
}

void NameDialogsTest::macIsSavedUnfinished()
{
    MacInputDialog dialog;
    driver::open(dialog);
    QTest::keyClicks(QApplication::focusWidget(), text("001"));
    driver::press(Qt::Key_Return);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.mac(), text("00:1::::"));

    MacInputDialog empty;
    driver::open(empty);
    driver::click(empty, QDialogButtonBox::Save);
    QCOMPARE(empty.result(), int{QDialog::Accepted});
}

void NameDialogsTest::macIsTypedOver()
{
    MacInputDialog dialog;
    dialog.setMac(text("00:00:00:00:00:00"));
    driver::open(dialog);
    QTest::keyClicks(QApplication::focusWidget(), text("aabbccddeeff"));
    QCOMPARE(dialog.mac(), text("aa:bb:cc:dd:ee:ff"));
}

void NameDialogsTest::domainLosesAndGetsItsQuotes_data()
{
    QTest::addColumn<QString>("set");
    QTest::addColumn<QString>("shown");
    QTest::addRow("quoted") << text("\"example.org\"") << text("example.org");
    QTest::addRow("bare") << text("example.org") << text("example.org");
    QTest::addRow("quotes within") << text("\"exa\"mple.org") << text("example.org");
}

void NameDialogsTest::domainLosesAndGetsItsQuotes()
{
    QFETCH(QString, set);
    QFETCH(QString, shown);
    DomainInputDialog dialog;
    dialog.setDomain(set);
    driver::open(dialog);
    QCOMPARE(driver::find<QLineEdit>(dialog, text("domainName"))->text(), shown);
    driver::press(Qt::Key_Return);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.domain(), text("\"example.org\""));
}

void NameDialogsTest::emptyDomainIsNotSaved()
{
    ModalBoxes boxes;
    DomainInputDialog dialog;
    driver::open(dialog);
    driver::press(Qt::Key_Return);
    driver::click(dialog, QDialogButtonBox::Save);
    QVERIFY(dialog.isVisible());
    QCOMPARE(dialog.domain(), text("\"\""));
    driver::find<QLineEdit>(dialog)->setFocus();
    driver::retype(text("\"office\""));
    driver::press(Qt::Key_Return);
    QVERIFY(!dialog.isVisible());
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.domain(), text("\"office\""));
}

void NameDialogsTest::sharedNetworkTakesAnyName_data()
{
    QTest::addColumn<QString>("name");
    QTest::addRow("name") << text("campus");
    QTest::addRow("words") << text("\"second floor\" {");
    QTest::addRow("nothing") << text("");
}

void NameDialogsTest::sharedNetworkTakesAnyName()
{
    QFETCH(QString, name);
    SharedNetworkInputDialog dialog;
    dialog.setName(text("old"));
    QCOMPARE(dialog.name(), text("old"));
    driver::open(dialog);
    driver::retype(name);
    driver::press(Qt::Key_Return);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.name(), name);
}

QTEST_MAIN(NameDialogsTest)
#include "tst_namedialogs.moc"
