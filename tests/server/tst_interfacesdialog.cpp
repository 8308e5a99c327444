// SPDX-License-Identifier: GPL-3.0-or-later
#include "server/interfacesdialog.h"
#include "tests/support/contexttranslator.h"
#include "tests/support/dialogdriver.h"

#include <QCheckBox>
#include <QDialogButtonBox>
#include <QGroupBox>
#include <QLabel>
#include <QPushButton>
#include <QScreen>
#include <QScrollArea>
#include <QScrollBar>
#include <QTest>
#include <QVBoxLayout>

#include <algorithm>

namespace {

using Choice = QMap<QString, bool>;

Choice interfacesOf(int count)
{
    Choice interfaces;
    for (int number{0}; number < count; ++number)
        interfaces.insert(QStringLiteral("vlan%1").arg(number, 4, 10, QLatin1Char{'0'}), number % 2 == 0);
    return interfaces;
}

QStringList textsOf(const QList<QCheckBox *> &checkBoxes)
{
    QStringList texts;
    for (const QCheckBox *checkBox : checkBoxes)
        texts.append(checkBox->text());
    return texts;
}

// The check box with the text `name`; ends the test without one.
QCheckBox *checkBoxOf(const InterfacesDialog &dialog, const QString &name)
{
    for (QCheckBox *checkBox : dialog.findChildren<QCheckBox *>()) {
        if (checkBox->text() == name)
            return checkBox;
    }
    qFatal("no check box %s", qPrintable(name));
}

// Clicks the box of `checkBox`, where a mouse would.
void click(QCheckBox *checkBox) { QTest::mouseClick(checkBox, Qt::LeftButton, {}, {8, checkBox->height() / 2}); }

} // namespace

Q_DECLARE_METATYPE(QDialogButtonBox::StandardButton)

class InterfacesDialogTest final : public QObject
{
    Q_OBJECT

private slots:
    void hasListAboveButtons();
    void listsInterfacesInOrder_data();
    void listsInterfacesInOrder();
    void saysThatThereAreNone();
    void textsAreTranslatedInTheDialogContext();
    void returnsWhatIsChecked();
    void endsAsButtonSays_data();
    void endsAsButtonSays();
    void endsAsKeySays_data();
    void endsAsKeySays();
    void scrollsBeyondTwoThirdsOfTheScreen();
    void keepsButtonsOnScreen();
};

void InterfacesDialogTest::hasListAboveButtons()
{
    const InterfacesDialog dialog{{{QStringLiteral("eth0"), true}}};
    QCOMPARE(dialog.windowTitle(), QStringLiteral("Select interfaces"));
    auto *layout = qobject_cast<QVBoxLayout *>(dialog.layout());
    QVERIFY(layout);
    QCOMPARE(layout->count(), 2);
    auto *groupBox = qobject_cast<QGroupBox *>(layout->itemAt(0)->widget());
    QVERIFY(groupBox);
    QCOMPARE(groupBox->title(), QStringLiteral("Available interfaces"));
    QVERIFY(qobject_cast<QVBoxLayout *>(groupBox->layout()));
    auto *buttonBox = qobject_cast<QDialogButtonBox *>(layout->itemAt(1)->widget());
    QVERIFY(buttonBox);
    QCOMPARE(buttonBox->orientation(), Qt::Horizontal);
    QCOMPARE(buttonBox->standardButtons(), QDialogButtonBox::Save | QDialogButtonBox::Cancel);
}

void InterfacesDialogTest::listsInterfacesInOrder_data()
{
    QTest::addColumn<Choice>("interfaces");
    QTest::addColumn<QStringList>("texts");
    const QString eth0{QStringLiteral("eth0")};
    const QString eth1{QStringLiteral("eth1")};
    const QString eth10{QStringLiteral("eth10")};
    const QString upper{QStringLiteral("WAN")};
    QTest::addRow("one") << Choice{{eth0, true}} << QStringList{eth0};
    QTest::addRow("several") << Choice{{eth1, true}, {eth10, false}, {eth0, false}} << QStringList{eth0, eth1, eth10};
    QTest::addRow("capitals first") << Choice{{eth0, true}, {upper, true}} << QStringList{upper, eth0};
    QTest::addRow("empty name") << Choice{{eth0, false}, {QString{}, true}} << QStringList{QString{}, eth0};
    QTest::addRow("any text") << Choice{{QStringLiteral("a & <b>b</b>"), true}}
                              << QStringList{QStringLiteral("a & <b>b</b>")};
}

void InterfacesDialogTest::listsInterfacesInOrder()
{
    QFETCH(const Choice, interfaces);
    QFETCH(const QStringList, texts);
    const InterfacesDialog dialog{interfaces};
    const auto *groupBox = dialog.findChild<QGroupBox *>();
    QList<QCheckBox *> checkBoxes;
    for (int item{0}; item < groupBox->layout()->count(); ++item)
        checkBoxes.append(qobject_cast<QCheckBox *>(groupBox->layout()->itemAt(item)->widget()));
    QVERIFY(!checkBoxes.contains(nullptr));
    QCOMPARE(textsOf(checkBoxes), texts);
    for (const QCheckBox *checkBox : qAsConst(checkBoxes))
        QCOMPARE(checkBox->isChecked(), interfaces.value(checkBox->text()));
    QCOMPARE(dialog.interfaces(), interfaces);
}

void InterfacesDialogTest::saysThatThereAreNone()
{
    const InterfacesDialog dialog{{}};
    const auto *groupBox = dialog.findChild<QGroupBox *>();
    QCOMPARE(groupBox->layout()->count(), 1);
    const auto *label = qobject_cast<QLabel *>(groupBox->layout()->itemAt(0)->widget());
    QVERIFY(label);
    QCOMPARE(label->text(), QStringLiteral("Available interfaces are not found!"));
    QCOMPARE(dialog.findChildren<QCheckBox *>().size(), 0);
    QCOMPARE(dialog.interfaces(), Choice{});
}

void InterfacesDialogTest::textsAreTranslatedInTheDialogContext()
{
    ContextTranslator translator;
    QVERIFY(QCoreApplication::installTranslator(&translator));
    const InterfacesDialog dialog{{}};
    const auto *groupBox = dialog.findChild<QGroupBox *>();
    QCOMPARE(dialog.windowTitle(), QStringLiteral("QDialog|Select interfaces"));
    QCOMPARE(groupBox->title(), QStringLiteral("QDialog|Available interfaces"));
    QCOMPARE(groupBox->findChild<QLabel *>()->text(), QStringLiteral("QDialog|Available interfaces are not found!"));
}

void InterfacesDialogTest::returnsWhatIsChecked()
{
    const QString eth0{QStringLiteral("eth0")};
    const QString eth1{QStringLiteral("eth1")};
    const QString eth2{QStringLiteral("eth2")};
    InterfacesDialog dialog{{{eth0, true}, {eth1, false}, {eth2, true}}};
    dialog.show();
    QVERIFY(QTest::qWaitForWindowExposed(&dialog));
    click(checkBoxOf(dialog, eth0));
    click(checkBoxOf(dialog, eth1));
    QCOMPARE(dialog.interfaces(), (Choice{{eth0, false}, {eth1, true}, {eth2, true}}));
    QTest::keyClick(checkBoxOf(dialog, eth1), Qt::Key_Space);
    QCOMPARE(dialog.interfaces(), (Choice{{eth0, false}, {eth1, false}, {eth2, true}}));
}

void InterfacesDialogTest::endsAsButtonSays_data()
{
    QTest::addColumn<QDialogButtonBox::StandardButton>("button");
    QTest::addColumn<int>("result");
    QTest::addRow("save") << QDialogButtonBox::Save << int{QDialog::Accepted};
    QTest::addRow("cancel") << QDialogButtonBox::Cancel << int{QDialog::Rejected};
}

void InterfacesDialogTest::endsAsButtonSays()
{
    QFETCH(const QDialogButtonBox::StandardButton, button);
    QFETCH(const int, result);
    for (const Choice &interfaces : {Choice{{QStringLiteral("eth0"), true}}, Choice{}}) {
        InterfacesDialog dialog{interfaces};
        dialog.setResult(-1);
        dialog.show();
        QVERIFY(QTest::qWaitForWindowExposed(&dialog));
        driver::click(dialog, button);
        QVERIFY(!dialog.isVisible());
        QCOMPARE(dialog.result(), result);
    }
}

void InterfacesDialogTest::endsAsKeySays_data()
{
    QTest::addColumn<Qt::Key>("key");
    QTest::addColumn<int>("result");
    QTest::addRow("return") << Qt::Key_Return << int{QDialog::Accepted};
    QTest::addRow("escape") << Qt::Key_Escape << int{QDialog::Rejected};
}

void InterfacesDialogTest::endsAsKeySays()
{
    QFETCH(const Qt::Key, key);
    InterfacesDialog dialog{{{QStringLiteral("eth0"), true}}};
    dialog.setResult(-1);
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    QTest::keyClick(dialog.focusWidget(), key);
    QVERIFY(!dialog.isVisible());
    QTEST(dialog.result(), "result");
}

void InterfacesDialogTest::scrollsBeyondTwoThirdsOfTheScreen()
{
    const int screenHeight{QGuiApplication::primaryScreen()->availableGeometry().height()};
    const auto heightOf = [](int count) { return InterfacesDialog{interfacesOf(count)}.sizeHint().height(); };
    const int rowHeight{heightOf(2) - heightOf(1)};
    const int longest{1 + (screenHeight * 2 / 3 - heightOf(1)) / rowHeight};
    QVERIFY(heightOf(1) + longest * rowHeight < screenHeight); // one more would fit the screen

    for (const int count : {longest, longest + 1}) {
        InterfacesDialog dialog{interfacesOf(count)};
        dialog.show();
        QVERIFY(QTest::qWaitForWindowExposed(&dialog));
        QVERIFY(dialog.height() * 3 <= screenHeight * 2);
        const QList<QCheckBox *> checkBoxes{dialog.findChildren<QCheckBox *>()};
        QCOMPARE(checkBoxes.size(), count);
        const auto isVisible = [](const QCheckBox *checkBox) {
            return checkBox->visibleRegion() == QRegion{checkBox->rect()};
        };
        QCOMPARE(std::all_of(checkBoxes.begin(), checkBoxes.end(), isVisible), count == longest);
        const auto *area = dialog.findChild<QScrollArea *>();
        QCOMPARE(area && area->verticalScrollBar()->isVisible(), count > longest);
    }
}

void InterfacesDialogTest::keepsButtonsOnScreen()
{
    const Choice interfaces{interfacesOf(200)};
    InterfacesDialog dialog{interfaces};
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    QVERIFY(dialog.height() <= dialog.screen()->availableGeometry().height());
    const auto *buttonBox = dialog.findChild<QDialogButtonBox *>();
    QVERIFY(dialog.rect().contains(buttonBox->geometry()));
    QCOMPARE(buttonBox->visibleRegion(), QRegion{buttonBox->rect()});

    // The list is whole and wide enough.
    QCOMPARE(dialog.interfaces(), interfaces);
    const auto *scrollArea = dialog.findChild<QScrollArea *>();
    QVERIFY(scrollArea->viewport()->width() >= dialog.findChild<QGroupBox *>()->minimumSizeHint().width());
    QCheckBox *last{checkBoxOf(dialog, interfaces.lastKey())};

    // A check box that gets the focus is scrolled into view.
    QCOMPARE(dialog.focusWidget(), checkBoxOf(dialog, interfaces.firstKey()));
    QVERIFY(last->visibleRegion().isEmpty());
    for (int key{1}; key < interfaces.size(); ++key)
        QTest::keyClick(dialog.focusWidget(), Qt::Key_Tab);
    QCOMPARE(dialog.focusWidget(), last);
    QVERIFY(!last->visibleRegion().isEmpty());
    QTest::keyClick(last, Qt::Key_Tab);
    QVERIFY(buttonBox->isAncestorOf(dialog.focusWidget()));
    QTest::keyClick(dialog.focusWidget(), Qt::Key_Tab);
    QVERIFY(buttonBox->isAncestorOf(dialog.focusWidget()));
    QTest::keyClick(dialog.focusWidget(), Qt::Key_Tab);
    QCOMPARE(dialog.focusWidget(), checkBoxOf(dialog, interfaces.firstKey()));

    QTest::keyClick(last, Qt::Key_Space);
    driver::click(dialog, QDialogButtonBox::Save);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QVERIFY(dialog.interfaces().last() != interfaces.last());
}

QTEST_MAIN(InterfacesDialogTest)
#include "tst_interfacesdialog.moc"
