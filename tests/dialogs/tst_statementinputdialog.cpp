// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/statementinputdialog.h"
#include "tests/support/dialogdriver.h"
#include "tests/support/modalboxes.h"
#include "tests/support/text.h"

#include <QApplication>
#include <QLabel>
#include <QTextEdit>

class StatementInputDialogTest final : public QObject
{
    Q_OBJECT

private slots:
    void labelCanBeSet();
    void splitsAtEverySpace_data();
    void splitsAtEverySpace();
    void returnBreaksTheLine();
    void controlReturnSaves_data();
    void controlReturnSaves();
    void emptyStatementIsNotSaved();
    void textIsTakenPlain();
};

void StatementInputDialogTest::labelCanBeSet()
{
    StatementInputDialog dialog;
    dialog.setLabelText(text("Declaration:"));
    QCOMPARE(driver::find<QLabel>(dialog, text("attrsLabel"))->text(), text("Declaration:"));
}

void StatementInputDialogTest::splitsAtEverySpace_data()
{
    QTest::addColumn<QString>("set");
    QTest::addColumn<QStringList>("words");
    QTest::addRow("nothing") << QString{} << QStringList{QString{}, QString{}};
    QTest::addRow("one word") << text("authoritative") << QStringList{text("authoritative"), QString{}};
    QTest::addRow("two words") << text("ping-check true") << QStringList{text("ping-check"), text("true")};
    QTest::addRow("three words") << text("option mtu 1400") << QStringList{text("option"), text("mtu"), text("1400")};
    QTest::addRow("leading space") << text(" mtu") << QStringList{QString{}, text("mtu")};
    QTest::addRow("two spaces") << text("a  b") << QStringList{text("a"), QString{}, text("b")};
    QTest::addRow("trailing space") << text("a ") << QStringList{text("a"), QString{}};
    QTest::addRow("a space") << text(" ") << QStringList{QString{}, QString{}};
    QTest::addRow("lines and tabs") << text("a\nb c\td") << QStringList{text("a\nb"), text("c\td")};
}

void StatementInputDialogTest::splitsAtEverySpace()
{
    QFETCH(QString, set);
    StatementInputDialog dialog;
    dialog.setStatementText(set);
    QTEST(dialog.statementWords(), "words");
}

void StatementInputDialogTest::returnBreaksTheLine()
{
    StatementInputDialog dialog;
    driver::open(dialog);
    QTest::keyClicks(QApplication::focusWidget(), text("class \"x\""));
    driver::press(Qt::Key_Return);
    QTest::keyClicks(QApplication::focusWidget(), text("y"));
    QVERIFY(dialog.isVisible());
    driver::click(dialog, QDialogButtonBox::Save);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.statementWords(), (QStringList{text("class"), text("\"x\"\ny")}));
}

void StatementInputDialogTest::controlReturnSaves_data()
{
    QTest::addColumn<Qt::Key>("key");
    QTest::addColumn<Qt::KeyboardModifiers>("modifiers");
    QTest::addRow("Return") << Qt::Key_Return << Qt::KeyboardModifiers{Qt::ControlModifier};
    QTest::addRow("Enter") << Qt::Key_Enter << (Qt::ControlModifier | Qt::KeypadModifier);
    // QDialog itself takes the key for Save only when it is told that the key is the keypad's.
    QTest::addRow("Enter of an unknown place") << Qt::Key_Enter << Qt::KeyboardModifiers{Qt::ControlModifier};
}

void StatementInputDialogTest::controlReturnSaves()
{
    QFETCH(Qt::Key, key);
    QFETCH(Qt::KeyboardModifiers, modifiers);
    StatementInputDialog dialog;
    driver::open(dialog);
    driver::press(key, modifiers);
    QVERIFY(dialog.isVisible());
    QTest::keyClicks(QApplication::focusWidget(), text("authoritative"));
    driver::press(key, modifiers);
    QVERIFY(!dialog.isVisible());
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.statementWords(), (QStringList{text("authoritative"), QString{}}));
}

void StatementInputDialogTest::emptyStatementIsNotSaved()
{
    ModalBoxes boxes;
    StatementInputDialog dialog;
    driver::open(dialog);
    driver::click(dialog, QDialogButtonBox::Save);
    QVERIFY(dialog.isVisible());
    dialog.setStatementText(text(" "));
    driver::click(dialog, QDialogButtonBox::Save);
    QVERIFY(!dialog.isVisible());
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
}

void StatementInputDialogTest::textIsTakenPlain()
{
    StatementInputDialog dialog;
    dialog.setStatementText(text("option x \"<b>bold</b> &amp;\""));
    QCOMPARE(dialog.statementWords(), (QStringList{text("option"), text("x"), text("\"<b>bold</b>"), text("&amp;\"")}));
}

QTEST_MAIN(StatementInputDialogTest)
#include "tst_statementinputdialog.moc"
