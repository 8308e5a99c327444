// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/routemodel.h"
#include "dialogs/staticrouteinputdialog.h"
#include "tests/support/contexttranslator.h"
#include "tests/support/dialogdriver.h"
#include "tests/support/modalboxes.h"
#include "tests/support/temporaryroot.h"
#include "tests/support/text.h"

#include <QAccessible>
#include <QApplication>
#include <QCheckBox>
#include <QDir>
#include <QIcon>
#include <QImage>
#include <QLineEdit>
#include <QMetaEnum>
#include <QPushButton>
#include <QTableView>
#include <QTemporaryDir>

namespace {

const ModalBoxes::Box emptyCell{QMessageBox::Information, QStringLiteral("Information"),
                                QStringLiteral("There is an empty cell.\nTo add, fill in the cell.")};

QTableView *table(const StaticRouteInputDialog &dialog)
{
    return driver::find<QTableView>(dialog, text("StaticRouteTable"));
}

QPushButton *button(const StaticRouteInputDialog &dialog, const char *name)
{
    return driver::find<QPushButton>(dialog, text(name));
}

QStringList cells(const StaticRouteInputDialog &dialog)
{
    const QAbstractItemModel *model{table(dialog)->model()};
    QStringList texts;
    for (int row{0}; row < model->rowCount(); ++row) {
        for (int column{0}; column < model->columnCount(); ++column)
            texts.append(model->index(row, column).data().toString());
    }
    return texts;
}

QPoint center(const QTableView *view, int row, int column)
{
    return view->visualRect(view->model()->index(row, column)).center();
}

void clickCell(const StaticRouteInputDialog &dialog, int row, int column, Qt::KeyboardModifiers modifiers = {})
{
    QTableView *view{table(dialog)};
    QTest::mouseClick(view->viewport(), Qt::LeftButton, modifiers, center(view, row, column));
}

/// Opens the editor of a cell with a double click and types over its text.
void typeInCell(const StaticRouteInputDialog &dialog, int row, int column, const QString &typed)
{
    QTableView *view{table(dialog)};
    clickCell(dialog, row, column);
    QTest::mouseDClick(view->viewport(), Qt::LeftButton, {}, center(view, row, column));
    QVERIFY(qobject_cast<QLineEdit *>(QApplication::focusWidget()));
    driver::retype(typed);
}

} // namespace

class StaticRouteInputDialogTest final : public QObject
{
    Q_OBJECT

private slots:
    void readsAndWritesOptionValues_data();
    void readsAndWritesOptionValues();
    void msRoutesAreTicked();
    void kindCanBeLocked();
    void routesAreTypedInPlace();
    void screenReaderSaysWhichColumnIsEdited();
    void addAppendsAnEmptyRow();
    void emptyCellKeepsItOpen_data();
    void emptyCellKeepsItOpen();
    void boxIsTranslatedInTheContextOfTheDialog();
    void withoutRoutesItIsAccepted();
    void openEditorIsTakenOver_data();
    void openEditorIsTakenOver();
    void escapeLeavesTheEditorFirst();
    void removeFollowsClicks();
    void removeTakesOnlyTheCurrentRow();
    void buttonsShowThemeIcons();
    void returnPressesTheFocusedButton_data();
    void returnPressesTheFocusedButton();
    void routesAreTypedWithTheKeyboardAlone();
    void routesAreRemovedWithTheKeyboardAlone();
};

void StaticRouteInputDialogTest::readsAndWritesOptionValues_data()
{
    QTest::addColumn<QString>("value");
    QTest::addColumn<QStringList>("shown");
    QTest::addColumn<QStringList>("words");
    const auto add = [](const char *name, const char *value, const QStringList &shown, const QStringList &words) {
        QTest::addRow("%s", name) << text(value) << shown << words;
    };
    add("one route", "24, 192,168,1,0, 192,168,1,1", {text("255.255.255.0"), text("192.168.1.0"), text("192.168.1.1")},
        {text("24"), text("192,168,1,0"), text("192,168,1,1")});
    add("two routes", "16, 172,16,0,0, 10,0,0,1, 30, 10,1,1,4, 10,0,0,2",
        {text("255.255.0.0"), text("172.16.0.0"), text("10.0.0.1"), text("255.255.255.252"), text("10.1.1.4"),
         text("10.0.0.2")},
        {text("16"), text("172,16,0,0"), text("10,0,0,1"), text("30"), text("10,1,1,4"), text("10,0,0,2")});
    add("network of one octet read as prefix length", "8, 10, 10,0,0,1",
        {text("255.0.0.0"), text("255.192.0.0"), text("10.0.0.1")}, {text("8"), text("10"), text("10,0,0,1")});
    add("network that is a mask", "8, 192,0,0,0, 10,0,0,1", {text("255.0.0.0"), text("192.0.0.0"), text("10.0.0.1")},
        {text("8"), text("2"), text("10,0,0,1")});
    add("host route", "32, 10,1,1,4, 10,0,0,2", {text("255.255.255.255"), text("10.1.1.4"), text("10.0.0.2")},
        {text("255,255,255,255"), text("10,1,1,4"), text("10,0,0,2")});
    add("shortest mask", "1, 128,0,0,1, 10,0,0,2", {text("128.0.0.0"), text("128.0.0.1"), text("10.0.0.2")},
        {text("1"), text("128,0,0,1"), text("10,0,0,2")});
    add("network of two octets", "16, 172,16, 10,0,0,1", {text("255.255.0.0"), text("172.16"), text("10.0.0.1")},
        {text("16"), text("172,16"), text("10,0,0,1")});
}

void StaticRouteInputDialogTest::readsAndWritesOptionValues()
{
    QFETCH(QString, value);
    StaticRouteInputDialog dialog;
    dialog.setRoutes(value, false);
    QTEST(cells(dialog), "shown");
    QTEST(dialog.routes(), "words");
    driver::open(dialog);
    driver::press(Qt::Key_Return);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
}

void StaticRouteInputDialogTest::msRoutesAreTicked()
{
    StaticRouteInputDialog dialog;
    QVERIFY(!dialog.isMsRoute());
    dialog.setRoutes(QString{}, false);
    QVERIFY(!dialog.isMsRoute());
    dialog.setRoutes(QString{}, true);
    QVERIFY(dialog.isMsRoute());
    driver::open(dialog);
    QTest::keyClick(driver::find<QCheckBox>(dialog, text("checkBoxMS")), Qt::Key_Space);
    QVERIFY(!dialog.isMsRoute());
}

void StaticRouteInputDialogTest::kindCanBeLocked()
{
    StaticRouteInputDialog dialog;
    dialog.setRoutes(text("24, 192,168,1,0, 192,168,1,1"), true);
    dialog.lockMsRoute();
    driver::open(dialog);
    auto *kind = driver::find<QCheckBox>(dialog, text("checkBoxMS"));
    QVERIFY(!kind->isEnabled());
    QTest::keyClick(kind, Qt::Key_Space);
    QTest::mouseClick(kind, Qt::LeftButton, {}, QPoint{8, kind->height() / 2});
    QVERIFY(dialog.isMsRoute());
}

void StaticRouteInputDialogTest::routesAreTypedInPlace()
{
    StaticRouteInputDialog dialog;
    driver::open(dialog);
    driver::click(button(dialog, "addButton"));
    typeInCell(dialog, 0, 0, text("255.0.0.0"));
    driver::press(Qt::Key_Return);
    QCoreApplication::processEvents();
    QVERIFY(dialog.isVisible());
    QCOMPARE(cells(dialog), (QStringList{text("255.0.0.0"), QString{}, QString{}}));

    typeInCell(dialog, 0, 1, text("10.0.0.0"));
    driver::press(Qt::Key_Tab);
    QTRY_VERIFY(qobject_cast<QLineEdit *>(QApplication::focusWidget()));
    driver::retype(text("192.168.1.1"));
    driver::press(Qt::Key_Return);
    QTRY_COMPARE(cells(dialog), (QStringList{text("255.0.0.0"), text("10.0.0.0"), text("192.168.1.1")}));

    driver::click(dialog, QDialogButtonBox::Yes);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.routes(), (QStringList{text("8"), text("10,0,0,0"), text("192,168,1,1")}));
}

void StaticRouteInputDialogTest::screenReaderSaysWhichColumnIsEdited()
{
    StaticRouteInputDialog dialog;
    driver::open(dialog);
    driver::click(button(dialog, "addButton"));
    QStringList said;
    for (int column{0}; column < table(dialog)->model()->columnCount(); ++column) {
        typeInCell(dialog, 0, column, QString{});
        said.append(QAccessible::queryAccessibleInterface(QApplication::focusWidget())->text(QAccessible::Name));
        driver::press(Qt::Key_Escape);
    }
    QCOMPARE(said, (QStringList{text("Net mask"), text("IP net"), text("Gateway")}));
}

void StaticRouteInputDialogTest::addAppendsAnEmptyRow()
{
    StaticRouteInputDialog dialog;
    dialog.setRoutes(text("24, 192,168,1,0, 192,168,1,1"), false);
    driver::open(dialog);
    driver::click(button(dialog, "addButton"));
    QCOMPARE(cells(dialog), (QStringList{text("255.255.255.0"), text("192.168.1.0"), text("192.168.1.1"), QString{},
                                         QString{}, QString{}}));
    QVERIFY(!button(dialog, "removeButton")->isEnabled());
}

void StaticRouteInputDialogTest::emptyCellKeepsItOpen_data()
{
    QTest::addColumn<QString>("value");
    QTest::addRow("last word missing") << text("24, 192,168,1,0");
    QTest::addRow("words") << text("24, abc, 192,168,1,1");
    QTest::addRow("prefix length 0") << text("0, 192,168,1,0, 192,168,1,1");
    QTest::addRow("prefix length 33") << text("33, 192,168,1,0, 192,168,1,1");
    QTest::addRow("negative prefix length") << text("-1, 192,168,1,0, 192,168,1,1");
    QTest::addRow("nothing") << QString{};
}

void StaticRouteInputDialogTest::emptyCellKeepsItOpen()
{
    QFETCH(QString, value);
    StaticRouteInputDialog dialog;
    dialog.setRoutes(value, false);
    driver::open(dialog);
    const QStringList before{cells(dialog)};
    QCOMPARE(before.size(), 3);
    QVERIFY(before.contains(QString{}));

    ModalBoxes boxes;
    boxes.expectBox(emptyCell, QMessageBox::Ok);
    boxes.expectBox(emptyCell, Qt::Key_Return);
    driver::click(dialog, QDialogButtonBox::Yes);
    QVERIFY(dialog.isVisible());
    driver::press(Qt::Key_Return);
    QVERIFY(dialog.isVisible());
    QCOMPARE(cells(dialog), before);
}

void StaticRouteInputDialogTest::boxIsTranslatedInTheContextOfTheDialog()
{
    ContextTranslator translator;
    QCoreApplication::installTranslator(&translator);
    StaticRouteInputDialog dialog;
    driver::open(dialog);
    driver::click(button(dialog, "addButton"));
    ModalBoxes boxes;
    boxes.expectBox({QMessageBox::Information, text("StaticRouteInputDialog|Information"),
                     text("StaticRouteInputDialog|There is an empty cell.\nTo add, fill in the cell.")},
                    QMessageBox::Ok);
    driver::click(dialog, QDialogButtonBox::Yes);
}

void StaticRouteInputDialogTest::withoutRoutesItIsAccepted()
{
    ModalBoxes boxes;
    StaticRouteInputDialog dialog;
    driver::open(dialog);
    driver::click(dialog, QDialogButtonBox::Yes);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.routes(), QStringList{});
}

void StaticRouteInputDialogTest::openEditorIsTakenOver_data()
{
    QTest::addColumn<bool>("byKey");
    QTest::addRow("by mouse") << false;
    QTest::addRow("by key") << true;
}

void StaticRouteInputDialogTest::openEditorIsTakenOver()
{
    QFETCH(bool, byKey);
    StaticRouteInputDialog dialog;
    dialog.setRoutes(text("24, 192,168,1,0, 192,168,1,1"), false);
    driver::open(dialog);
    typeInCell(dialog, 0, 2, text("192.168.1.254"));
    if (byKey)
        driver::press(Qt::Key_Y, Qt::AltModifier);
    else
        driver::click(dialog, QDialogButtonBox::Yes);
    QTRY_VERIFY(!dialog.isVisible());
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
    QCOMPARE(dialog.routes(), (QStringList{text("24"), text("192,168,1,0"), text("192,168,1,254")}));
}

void StaticRouteInputDialogTest::escapeLeavesTheEditorFirst()
{
    StaticRouteInputDialog dialog;
    dialog.setRoutes(text("24, 192,168,1,0, 192,168,1,1"), false);
    driver::open(dialog);
    typeInCell(dialog, 0, 2, text("192.168.1.254"));
    driver::press(Qt::Key_Escape);
    QVERIFY(dialog.isVisible());
    QCOMPARE(dialog.routes().constLast(), text("192,168,1,1"));
}

void StaticRouteInputDialogTest::removeFollowsClicks()
{
    StaticRouteInputDialog dialog;
    dialog.setRoutes(text("24, 192,168,1,0, 192,168,1,1, 8, 10,0,0,0, 10,0,0,1"), false);
    driver::open(dialog);
    auto *remove = button(dialog, "removeButton");
    QVERIFY(!remove->isEnabled());
    clickCell(dialog, 0, 2);
    QVERIFY(remove->isEnabled());
    driver::click(remove);
    QCOMPARE(cells(dialog), (QStringList{text("255.0.0.0"), text("10.0.0.0"), text("10.0.0.1")}));
    QVERIFY(!remove->isEnabled());
    clickCell(dialog, 0, 0);
    driver::click(remove);
    QCOMPARE(cells(dialog), QStringList{});
    QVERIFY(!remove->isEnabled());
}

void StaticRouteInputDialogTest::removeTakesOnlyTheCurrentRow()
{
    StaticRouteInputDialog dialog;
    dialog.setRoutes(text("24, 192,168,1,0, 192,168,1,1, 8, 10,0,0,0, 10,0,0,1"), false);
    driver::open(dialog);
    clickCell(dialog, 0, 0);
    clickCell(dialog, 1, 1, Qt::ControlModifier);
    QCOMPARE(table(dialog)->selectionModel()->selectedRows().size(), 2);
    driver::click(button(dialog, "removeButton"));
    QCOMPARE(cells(dialog), (QStringList{text("255.255.255.0"), text("192.168.1.0"), text("192.168.1.1")}));
}

void StaticRouteInputDialogTest::buttonsShowThemeIcons()
{
    const QTemporaryDir folder;
    const QDir theme{folder.filePath(text("test"))};
    QVERIFY(theme.mkpath(text("actions")));
    writeTestFile(theme.filePath(text("index.theme")),
                  "[Icon Theme]\nName=Test\nDirectories=actions\n[actions]\nSize=16\n");
    QImage image{16, 16, QImage::Format_RGB32};
    image.fill(Qt::black);
    for (const char *name : {"list-add", "list-remove"})
        QVERIFY(image.save(theme.filePath(text("actions/%1.png").arg(text(name)))));
    QIcon::setThemeSearchPaths({folder.path()});
    QIcon::setThemeName(text("test"));

    const StaticRouteInputDialog dialog;
    QCOMPARE(button(dialog, "addButton")->icon().name(), text("list-add"));
    QCOMPARE(button(dialog, "removeButton")->icon().name(), text("list-remove"));
}

void StaticRouteInputDialogTest::returnPressesTheFocusedButton_data()
{
    QTest::addColumn<Qt::Key>("key");
    for (const Qt::Key key : {Qt::Key_Return, Qt::Key_Enter, Qt::Key_Space})
        QTest::addRow("%s", QMetaEnum::fromType<Qt::Key>().valueToKey(key)) << key;
}

void StaticRouteInputDialogTest::returnPressesTheFocusedButton()
{
    QFETCH(Qt::Key, key);
    StaticRouteInputDialog dialog;
    driver::open(dialog);
    button(dialog, "addButton")->setFocus();
    driver::press(key);
    driver::press(key);
    QVERIFY(dialog.isVisible());
    QCOMPARE(cells(dialog).size(), 6);
    auto *boxButtons = driver::find<QDialogButtonBox>(dialog);
    QVERIFY(boxButtons->button(QDialogButtonBox::Yes)->isDefault());
    boxButtons->button(QDialogButtonBox::Cancel)->setFocus();
    driver::press(key);
    QVERIFY(!dialog.isVisible());
    QCOMPARE(dialog.result(), int{QDialog::Rejected});
}

void StaticRouteInputDialogTest::routesAreTypedWithTheKeyboardAlone()
{
    StaticRouteInputDialog dialog;
    dialog.setRoutes(text("24, 192,168,1,0, 192,168,1,1"), false);
    driver::open(dialog);
    QCOMPARE(QApplication::focusWidget(), table(dialog));
    driver::press(Qt::Key_Tab);
    driver::press(Qt::Key_Return);
    driver::press(Qt::Key_Backtab);
    driver::press(Qt::Key_2); // opens the editor in the new row
    QTest::keyClicks(QApplication::focusWidget(), text("55.0.0.0"));
    driver::press(Qt::Key_Tab);
    driver::retype(text("10.0.0.0"));
    driver::press(Qt::Key_Tab);
    driver::retype(text("192.168.1.2"));
    driver::press(Qt::Key_Return);
    QTRY_COMPARE(cells(dialog), (QStringList{text("255.255.255.0"), text("192.168.1.0"), text("192.168.1.1"),
                                             text("255.0.0.0"), text("10.0.0.0"), text("192.168.1.2")}));
    QTRY_COMPARE(QApplication::focusWidget(), table(dialog));
    driver::press(Qt::Key_Return);
    QCOMPARE(dialog.result(), int{QDialog::Accepted});
}

void StaticRouteInputDialogTest::routesAreRemovedWithTheKeyboardAlone()
{
    StaticRouteInputDialog dialog;
    dialog.setRoutes(text("24, 192,168,1,0, 192,168,1,1, 8, 10,0,0,0, 10,0,0,1, 16, 172,16,0,0, 10,0,0,2"), false);
    driver::open(dialog);
    auto *remove = button(dialog, "removeButton");
    QVERIFY(!remove->isEnabled());
    for (const auto &[arrow, left] :
         {std::pair{Qt::Key_Down, text("255.255.255.0, 255.255.0.0")}, std::pair{Qt::Key_Right, text("255.255.0.0")},
          std::pair{Qt::Key_End, QString{}}}) {
        QCOMPARE(QApplication::focusWidget(), table(dialog));
        driver::press(arrow);
        QVERIFY(remove->isEnabled());
        driver::press(Qt::Key_Tab);
        driver::press(Qt::Key_Tab);
        QCOMPARE(QApplication::focusWidget(), remove);
        driver::press(Qt::Key_Return);
        QStringList masks;
        for (int i{0}; i < cells(dialog).size(); i += 3)
            masks.append(cells(dialog).at(i));
        QCOMPARE(masks.join(text(", ")), left);
        QVERIFY(!remove->isEnabled());
    }
}

QTEST_MAIN(StaticRouteInputDialogTest)
#include "tst_staticrouteinputdialog.moc"
