// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/support/modalboxes.h"

#include "dialogs/ipinputdialog.h"
#include "dialogs/macinputdialog.h"
#include "dialogs/multipleipinputdialog.h"
#include "tests/support/dialogdriver.h"

#include <QApplication>
#include <QFileDialog>
#include <QLineEdit>
#include <QListWidget>
#include <QMenu>
#include <QPushButton>
#include <QTemporaryDir>
#include <QTest>
#include <QTimer>

namespace {

ModalBoxes::Box question()
{
    return {QMessageBox::Warning, QStringLiteral("Warning!"), QStringLiteral("Do you want to resume?"),
            QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes};
}

QMessageBox::StandardButton ask(const ModalBoxes::Box &box = question())
{
    QMessageBox messageBox{box.icon, box.title, box.text, box.buttons};
    messageBox.setDefaultButton(box.defaultButton);
    messageBox.setInformativeText(box.informativeText);
    messageBox.setDetailedText(box.detailedText);
    return static_cast<QMessageBox::StandardButton>(messageBox.exec());
}

} // namespace

Q_DECLARE_METATYPE(ModalBoxes::Box)
Q_DECLARE_METATYPE(QMessageBox::StandardButton)

class ModalBoxesTest final : public QObject
{
    Q_OBJECT

private slots:
    void pressesTheAnswerOfABox_data();
    void pressesTheAnswerOfABox();
    void answersABoxByKey();
    void answersAStaticBox();
    void reportsEveryDifference_data();
    void reportsEveryDifference();
    void rejectsAnUnexpectedBox();
    void rejectsAnotherBoxThanTheExpected();
    void reportsAnAnswerThatABoxLacks();
    void reportsADialogLeftOpen();
    void reportsWhatNeverOpened();
    void verifyWaitsForALateBox();
    void leavesModelessDialogsAlone();
    void drivesNestedDialogs();
    void openerIsActiveAgain();
    void choosesAFile();
    void triggersAContextMenuAction();
    void rejectsAnUnexpectedMenu();
};

void ModalBoxesTest::pressesTheAnswerOfABox_data()
{
    QTest::addColumn<QMessageBox::StandardButton>("answer");
    QTest::addRow("yes") << QMessageBox::Yes;
    QTest::addRow("no") << QMessageBox::No;
}

void ModalBoxesTest::pressesTheAnswerOfABox()
{
    QFETCH(QMessageBox::StandardButton, answer);
    ModalBoxes boxes;
    boxes.expectBox(question(), answer);
    QCOMPARE(ask(), answer);
}

void ModalBoxesTest::answersABoxByKey()
{
    ModalBoxes boxes;
    boxes.expectBox(question(), Qt::Key_Return);
    boxes.expectBox(question(), Qt::Key_Escape);
    QCOMPARE(ask(), QMessageBox::Yes);
    QCOMPARE(ask(), QMessageBox::No);
}

void ModalBoxesTest::answersAStaticBox()
{
    ModalBoxes boxes;
    boxes.expectBox({QMessageBox::Information, QStringLiteral("Information"), QStringLiteral("Done.")},
                    QMessageBox::Ok);
    QCOMPARE(QMessageBox::information(nullptr, QStringLiteral("Information"), QStringLiteral("Done.")),
             QMessageBox::Ok);
}

void ModalBoxesTest::reportsEveryDifference_data()
{
    QTest::addColumn<ModalBoxes::Box>("actual");
    QTest::addColumn<QString>("part");
    const auto add = [](const char *part, const auto &change) {
        ModalBoxes::Box box{question()};
        change(box);
        QTest::addRow("%s", part) << box << QString::fromLatin1(part);
    };
    add("icon", [](auto &box) { box.icon = QMessageBox::Critical; });
    add("title", [](auto &box) { box.title = QStringLiteral("Error"); });
    add("text", [](auto &box) { box.text = QStringLiteral("Do you want to go?"); });
    add("set of buttons", [](auto &box) { box.buttons |= QMessageBox::Cancel; });
    add("default button", [](auto &box) { box.defaultButton = QMessageBox::No; });
    add("informative text", [](auto &box) { box.informativeText = QStringLiteral("Be careful."); });
    add("detailed text", [](auto &box) { box.detailedText = QStringLiteral("In detail."); });
}

void ModalBoxesTest::reportsEveryDifference()
{
    QFETCH(ModalBoxes::Box, actual);
    QFETCH(QString, part);
    QStringList failures;
    ModalBoxes boxes{[&](const QString &failure) { failures.append(failure); }};
    boxes.expectBox(question(), QMessageBox::Yes);
    QCOMPARE(ask(actual), QMessageBox::Yes);
    boxes.verify();
    QCOMPARE(failures.size(), 1);
    QVERIFY2(failures.constFirst().contains(QStringLiteral("the %1 is").arg(part)), qPrintable(failures.constFirst()));
}

void ModalBoxesTest::rejectsAnUnexpectedBox()
{
    QStringList failures;
    ModalBoxes boxes{[&](const QString &failure) { failures.append(failure); }};
    QVERIFY(ask() != QMessageBox::Yes);
    IpInputDialog dialog;
    QCOMPARE(dialog.exec(), int{QDialog::Rejected});
    boxes.verify();
    QCOMPARE(failures,
             (QStringList{QStringLiteral("unexpected: QMessageBox \"Warning!\" saying \"Do you want to resume?\""),
                          QStringLiteral("unexpected: IpInputDialog \"Dialog\"")}));
}

void ModalBoxesTest::rejectsAnotherBoxThanTheExpected()
{
    QStringList failures;
    ModalBoxes boxes{[&](const QString &failure) { failures.append(failure); }};
    boxes.expectDialog<IpInputDialog>([](IpInputDialog *) { QFAIL("not an address dialog"); });
    MacInputDialog dialog;
    QCOMPARE(dialog.exec(), int{QDialog::Rejected});
    boxes.verify();
    QCOMPARE(failures, QStringList{QStringLiteral("unexpected: MacInputDialog \"Dialog\", expected IpInputDialog")});
}

void ModalBoxesTest::reportsAnAnswerThatABoxLacks()
{
    QStringList failures;
    ModalBoxes boxes{[&](const QString &failure) { failures.append(failure); }};
    boxes.expectBox(question(), QMessageBox::Cancel);
    QVERIFY(ask() != QMessageBox::Yes);
    boxes.verify();
    QCOMPARE(failures.size(), 2);
    QVERIFY2(failures.constFirst().contains(QStringLiteral("has no such button to press")),
             qPrintable(failures.constFirst()));
}

void ModalBoxesTest::reportsADialogLeftOpen()
{
    QStringList failures;
    ModalBoxes boxes{[&](const QString &failure) { failures.append(failure); }};
    boxes.expectDialog<IpInputDialog>([](IpInputDialog *) {});
    IpInputDialog dialog;
    QCOMPARE(dialog.exec(), int{QDialog::Rejected});
    boxes.verify();
    QCOMPARE(failures, QStringList{QStringLiteral("left open: IpInputDialog \"Dialog\"")});
}

void ModalBoxesTest::reportsWhatNeverOpened()
{
    QStringList failures;
    ModalBoxes boxes{[&](const QString &failure) { failures.append(failure); }};
    boxes.expectBox(question(), QMessageBox::Yes);
    boxes.verify();
    QCOMPARE(failures,
             QStringList{QStringLiteral("never opened: QMessageBox \"Warning!\" saying \"Do you want to resume?\"")});
}

void ModalBoxesTest::verifyWaitsForALateBox()
{
    ModalBoxes boxes;
    boxes.expectBox(question(), QMessageBox::No);
    QMessageBox::StandardButton answer{QMessageBox::NoButton};
    QTimer::singleShot(100, this, [&] { answer = ask(); });
    boxes.verify();
    QCOMPARE(answer, QMessageBox::No);
}

void ModalBoxesTest::leavesModelessDialogsAlone()
{
    QStringList failures;
    ModalBoxes boxes{[&](const QString &failure) { failures.append(failure); }};
    IpInputDialog dialog;
    driver::open(dialog);
    QCoreApplication::processEvents();
    QVERIFY(dialog.isVisible());
    QCOMPARE(failures, QStringList{});
}

void ModalBoxesTest::drivesNestedDialogs()
{
    ModalBoxes boxes;
    boxes.expectDialog<MultipleIpInputDialog>([](MultipleIpInputDialog *dialog) {
        driver::click(driver::find<QPushButton>(*dialog, QStringLiteral("addButton")));
        QCOMPARE(driver::find<QListWidget>(*dialog)->count(), 1);
        QVERIFY(ask() == QMessageBox::Yes);
        driver::click(*dialog, QDialogButtonBox::Save);
    });
    boxes.expectDialog<IpInputDialog>([](IpInputDialog *dialog) {
        QCOMPARE(QApplication::focusWidget(), driver::find<QLineEdit>(*dialog));
        driver::retype(QStringLiteral("10.0.0.1"));
        driver::press(Qt::Key_Return);
    });
    boxes.expectBox(question(), QMessageBox::Yes);
    MultipleIpInputDialog dialog;
    QCOMPARE(dialog.exec(), int{QDialog::Accepted});
    QCOMPARE(dialog.ips(), QStringLiteral("10.0.0.1"));
}

void ModalBoxesTest::openerIsActiveAgain()
{
    ModalBoxes boxes;
    IpInputDialog dialog;
    driver::open(dialog);
    boxes.expectBox(question(), QMessageBox::Yes);
    ask();
    QCOMPARE(QApplication::activeWindow(), &dialog);
    QCOMPARE(QApplication::focusWidget(), driver::find<QLineEdit>(dialog));
}

void ModalBoxesTest::choosesAFile()
{
    const QTemporaryDir folder;
    const QString path{folder.filePath(QStringLiteral("named.conf.local"))};
    QFile file{path};
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.close();

    ModalBoxes boxes;
    boxes.expectFileDialog(path);
    QCOMPARE(QFileDialog::getOpenFileName(nullptr, QString{}, folder.path()), path);
    boxes.expectDialog<QFileDialog>([](QFileDialog *dialog) { driver::click(*dialog, QDialogButtonBox::Cancel); });
    QCOMPARE(QFileDialog::getOpenFileName(nullptr, QString{}, folder.path()), QString{});
}

void ModalBoxesTest::triggersAContextMenuAction()
{
    QMenu menu;
    menu.addAction(QStringLiteral("Edit"));
    menu.addSeparator();
    const QAction *remove{menu.addAction(QStringLiteral("Remove"))};
    QMenu *submenu{menu.addMenu(QStringLiteral("Add"))};
    QAction *addHost{submenu->addAction(QStringLiteral("Add host"))};

    ModalBoxes boxes;
    boxes.expectMenu(QStringLiteral("Remove"));
    QCOMPARE(menu.exec(QPoint{10, 10}), remove);
    boxes.expectMenu([&](QMenu *opened) {
        QTest::mouseClick(opened, Qt::LeftButton, {}, opened->actionGeometry(submenu->menuAction()).center());
        QTRY_VERIFY(submenu->isVisible());
        QTest::mouseClick(submenu, Qt::LeftButton, {}, submenu->actionGeometry(addHost).center());
    });
    QCOMPARE(menu.exec(QPoint{10, 10}), addHost);
}

void ModalBoxesTest::rejectsAnUnexpectedMenu()
{
    QStringList failures;
    ModalBoxes boxes{[&](const QString &failure) { failures.append(failure); }};
    QMenu menu;
    menu.addAction(QStringLiteral("Edit"));
    QVERIFY(!menu.exec(QPoint{10, 10}));
    boxes.verify();
    QCOMPARE(failures, QStringList{QStringLiteral("unexpected: QMenu")});
}

QTEST_MAIN(ModalBoxesTest)
#include "tst_modalboxes.moc"
