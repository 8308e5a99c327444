// SPDX-License-Identifier: GPL-3.0-or-later
// What the main window offers to those who use the keyboard, beside the shortcuts of its actions.
#include "tests/app/topologywindow.h"

#include "common/paths.h"
#include "tests/support/dialogdriver.h"
#include "tests/support/temporaryroot.h"

#include <QApplication>
#include <QClipboard>
#include <QContextMenuEvent>
#include <QDialogButtonBox>
#include <QLineEdit>
#include <QMenu>
#include <QTabWidget>
#include <QTableView>
#include <QTextBrowser>
#include <QTreeView>

namespace {

const QByteArray configuration{R"(default-lease-time 600;
subnet 10.0.0.0 netmask 255.255.255.0 {
    range 10.0.0.10 10.0.0.20;
}
group servers {
}
)"};

QByteArray lease(int number)
{
    const QByteArray text{QByteArray::number(number)};
    return "lease 10.0.0." + text + " {\n  starts 1 2026/03/02 08:00:00;\n  ends 1 2026/03/02 20:00:00;\n" +
           "  binding state active;\n  hardware ethernet 00:00:5e:00:53:01;\n  client-hostname \"pc-" + text +
           "\";\n}\n";
}

/// What the toolkit makes of the menu key: the keyboard's widget is told, with the place of its cursor.
void pressMenuKey()
{
    QWidget *widget{QApplication::focusWidget()};
    const QPoint cursor{widget->inputMethodQuery(Qt::ImCursorRectangle).toRect().center()};
    QContextMenuEvent event{QContextMenuEvent::Keyboard, cursor, widget->mapToGlobal(cursor)};
    QApplication::sendEvent(widget, &event);
}

using Press = void (*)();

void addMenuKeys()
{
    QTest::addColumn<Press>("press");
    QTest::addRow("menu key") << Press{pressMenuKey};
    QTest::addRow("Shift+F10") << Press{[] { driver::press(Qt::Key_F10, Qt::ShiftModifier); }};
}

/// Whether the menu opened directly below the current row of the view, at the row's beginning.
bool isBelowCurrentRow(const QMenu &menu, const QAbstractItemView &view)
{
    const QRect row{view.visualRect(view.currentIndex())};
    return view.viewport()->rect().contains(row.topLeft()) &&
           menu.geometry().topLeft() == view.viewport()->mapToGlobal(row.bottomLeft());
}

} // namespace

Q_DECLARE_METATYPE(Press)

class WindowKeysTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup() { m_site.reset(); }

    void keyEditsTheCurrentStatement_data();
    void keyEditsTheCurrentStatement();
    void keyEditsNothingAboveTheStatements();
    void menuOfTheTreeOpensAtTheCurrentRow_data() { addMenuKeys(); }
    void menuOfTheTreeOpensAtTheCurrentRow();
    void menuOfTheTreeOpensAtARowOutOfSight_data() { addMenuKeys(); }
    void menuOfTheTreeOpensAtARowOutOfSight();
    void menuOfTheLeasesOpensAtTheCurrentRow_data() { addMenuKeys(); }
    void menuOfTheLeasesOpensAtTheCurrentRow();
    void menuOfTheLeasesNeedsALease_data() { addMenuKeys(); }
    void menuOfTheLeasesNeedsALease();
    void menuOpensAtTheMouseOtherwise();
    void keysDoNothingWhileAMenuIsOpen();
    void findGoesToTheSearch_data();
    void findGoesToTheSearch();
    void copyTakesTheLeaseAsARow_data();
    void copyTakesTheLeaseAsARow();
    void copyNeedsALease();
    void copyInTheSearchTakesItsText();
    void helpKeyOpensTheManual();
    void tabGoesInReadingOrder();
    void keysChangeTheTab();

private:
    QTableView *table() const { return driver::find<QTableView>(m_site->window(), text("dhcpdLeaseTable")); }
    QLineEdit *search() const { return driver::find<QLineEdit>(m_site->window(), text("searchLease")); }
    int tab() const { return driver::find<QTabWidget>(m_site->window())->currentIndex(); }
    void showLeases(const QByteArray &leases) const;

    std::unique_ptr<TopologyWindow> m_site;
};

void WindowKeysTest::init()
{
    m_site = std::make_unique<TopologyWindow>(configuration);
    QCursor::setPos(m_site->window().mapToGlobal(QPoint{500, 400}));
    QApplication::clipboard()->setText(text("before"));
}

/// Shows the leases, with the keyboard in the table.
void WindowKeysTest::showLeases(const QByteArray &leases) const
{
    writeTestFile(paths::leases(), leases);
    clickTab(m_site->window(), 1);
    table()->setFocus();
    QCOMPARE(QApplication::focusWidget(), table());
}

void WindowKeysTest::keyEditsTheCurrentStatement_data()
{
    QTest::addColumn<Qt::Key>("key");
    QTest::addRow("Return") << Qt::Key_Return;
    QTest::addRow("Enter") << Qt::Key_Enter;
    QTest::addRow("F2") << Qt::Key_F2;
}

void WindowKeysTest::keyEditsTheCurrentStatement()
{
    QFETCH(Qt::Key, key);
    ModalBoxes boxes;
    for (const auto &[statement, title] :
         {std::pair{"default-lease-time", "Edit default lease time"}, std::pair{"range", "Edit range"}}) {
        for (const int column : {0, 1}) {
            m_site->select(text(statement), column);
            boxes.expectDialog<QDialog>([title = title](QDialog *dialog) {
                QCOMPARE(dialog->windowTitle(), text(title));
                driver::press(Qt::Key_Escape);
            });
            driver::press(key);
            boxes.verify();
        }
    }
}

void WindowKeysTest::keyEditsNothingAboveTheStatements()
{
    const ModalBoxes noBox;
    m_site->select({});
    for (const Qt::Key key : {Qt::Key_Return, Qt::Key_Enter, Qt::Key_F2})
        driver::press(key);
}

void WindowKeysTest::menuOfTheTreeOpensAtTheCurrentRow()
{
    QFETCH(Press, press);
    ModalBoxes boxes;
    for (const char *statement : {"", "subnet", "range"}) {
        m_site->select(text(statement));
        boxes.expectMenu([this](QMenu *menu) {
            QVERIFY(isBelowCurrentRow(*menu, m_site->tree()));
            menu->close();
        });
        press();
        boxes.verify();
    }
}

void WindowKeysTest::menuOfTheTreeOpensAtARowOutOfSight()
{
    QFETCH(Press, press);
    QByteArray many;
    for (int i{0}; i < 100; ++i)
        many += "group g" + QByteArray::number(i) + " {\n}\n";
    m_site.reset();
    m_site = std::make_unique<TopologyWindow>(many);
    m_site->select(text("group g0"));
    m_site->tree().scrollToBottom();
    QVERIFY(!m_site->isInView(m_site->find(text("group g0"))));
    ModalBoxes boxes;
    boxes.expectMenu([this](QMenu *menu) {
        QVERIFY(isBelowCurrentRow(*menu, m_site->tree()));
        menu->close();
    });
    press();
}

void WindowKeysTest::menuOfTheLeasesOpensAtTheCurrentRow()
{
    QFETCH(Press, press);
    showLeases(lease(1) + lease(2) + lease(3));
    driver::press(Qt::Key_Down);
    ModalBoxes boxes;
    boxes.expectMenu([this](QMenu *menu) {
        QVERIFY(isBelowCurrentRow(*menu, *table()));
        QTest::keyClick(menu, Qt::Key_Down);
        QTest::keyClick(menu, Qt::Key_Return);
    });
    boxes.expectDialog<QDialog>([](QDialog *dialog) {
        QCOMPARE(driver::find<QLineEdit>(*dialog, text("hostIp"))->text(), text("10.0.0.2"));
        driver::press(Qt::Key_Escape);
    });
    press();
}

void WindowKeysTest::menuOfTheLeasesNeedsALease()
{
    QFETCH(Press, press);
    showLeases({});
    const ModalBoxes noMenu;
    press();
}

void WindowKeysTest::menuOpensAtTheMouseOtherwise()
{
    m_site->select(text("range"));
    ModalBoxes boxes;
    boxes.expectMenu([](QMenu *menu) {
        QCOMPARE(menu->geometry().topLeft(), QCursor::pos());
        menu->close();
    });
    m_site->window().handleTreeContextMenuRequested(m_site->tree().visualRect(m_site->tree().currentIndex()).center());
}

void WindowKeysTest::keysDoNothingWhileAMenuIsOpen()
{
    m_site->select(text("range"));
    ModalBoxes boxes;
    boxes.expectMenu([this](QMenu *menu) {
        QTest::keyClick(menu, Qt::Key_F2);
        QTest::keyClick(menu, Qt::Key_F10, Qt::ShiftModifier);
        QTest::keyClick(menu, Qt::Key_F, Qt::ControlModifier);
        QCOMPARE(tab(), 0);
        QVERIFY(menu->isVisible());
        menu->close();
    });
    pressMenuKey();
}

void WindowKeysTest::findGoesToTheSearch_data()
{
    QTest::addColumn<int>("from");
    QTest::addRow("topology") << 0;
    QTest::addRow("leases") << 1;
}

void WindowKeysTest::findGoesToTheSearch()
{
    QFETCH(int, from);
    search()->setText(text("pc"));
    clickTab(m_site->window(), from);
    QTest::keyClick(m_site->window().windowHandle(), Qt::Key_F, Qt::ControlModifier);
    QCOMPARE(tab(), 1);
    QCOMPARE(QApplication::focusWidget(), search());
    QCOMPARE(search()->selectedText(), text("pc"));
}

void WindowKeysTest::copyTakesTheLeaseAsARow_data()
{
    QTest::addColumn<Qt::Key>("key");
    QTest::addRow("Ctrl+C") << Qt::Key_C;
    QTest::addRow("Ctrl+Insert") << Qt::Key_Insert;
}

void WindowKeysTest::copyTakesTheLeaseAsARow()
{
    QFETCH(Qt::Key, key);
    showLeases(lease(1) + lease(2));
    for (const Qt::Key arrow : {Qt::Key_Down, Qt::Key_Right})
        driver::press(arrow);
    driver::press(key, Qt::ControlModifier);
    QCOMPARE(QApplication::clipboard()->text(), text("10.0.0.2\t00:00:5e:00:53:01\tpc-2\tactive\t"
                                                     "08:00:00 UTC 2 Mar 2026\t20:00:00 UTC 2 Mar 2026"));
}

void WindowKeysTest::copyNeedsALease()
{
    showLeases({});
    driver::press(Qt::Key_C, Qt::ControlModifier);
    QCOMPARE(QApplication::clipboard()->text(), text("before"));
}

void WindowKeysTest::copyInTheSearchTakesItsText()
{
    showLeases(lease(1));
    driver::click(search());
    QTest::keyClicks(search(), text("pc"));
    driver::press(Qt::Key_A, Qt::ControlModifier);
    driver::press(Qt::Key_C, Qt::ControlModifier);
    QCOMPARE(QApplication::clipboard()->text(), text("pc"));
}

void WindowKeysTest::helpKeyOpensTheManual()
{
    QTest::keyClick(m_site->window().windowHandle(), Qt::Key_F1);
    const auto *manual = m_site->window().findChild<QTextBrowser *>();
    QVERIFY(manual);
    QVERIFY(manual->isVisible());
}

void WindowKeysTest::tabGoesInReadingOrder()
{
    const auto namesOnTheWay = [](int steps) {
        QStringList names;
        for (int i{0}; i < steps; ++i) {
            names.append(QApplication::focusWidget()->objectName());
            driver::press(Qt::Key_Tab);
        }
        return names;
    };
    m_site->tree().setFocus();
    QCOMPARE(namesOnTheWay(3), list("topologyTree | qt_tabwidget_tabbar | topologyTree"));

    showLeases(lease(1) + lease(2));
    search()->setFocus();
    QTest::keyClicks(search(), text("pc"));
    QCOMPARE(namesOnTheWay(6), list("searchLease | searchPrevLease | searchNextLease | dhcpdLeaseTable | "
                                    "qt_tabwidget_tabbar | searchLease"));
}

void WindowKeysTest::keysChangeTheTab()
{
    m_site->tree().setFocus();
    driver::press(Qt::Key_Tab, Qt::ControlModifier);
    QCOMPARE(tab(), 1);
    QCOMPARE(QApplication::focusWidget(), search());
    driver::press(Qt::Key_Tab, Qt::ControlModifier);
    QCOMPARE(tab(), 0);
    QCOMPARE(QApplication::focusWidget(), &m_site->tree());
}

QTEST_MAIN(WindowKeysTest)
#include "tst_windowkeys.moc"
