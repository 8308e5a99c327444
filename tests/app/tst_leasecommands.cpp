// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/fmain.h"
#include "common/paths.h"
#include "config/dhcpdconfigmodel.h"
#include "dialogs/hostinputdialog.h"
#include "leases/dhcpdleasesmodel.h"
#include "tests/app/testmachine.h"
#include "tests/support/dialogdriver.h"
#include "tests/support/modalboxes.h"
#include "tests/support/temporaryroot.h"

#include <QAction>
#include <QApplication>
#include <QContextMenuEvent>
#include <QDialogButtonBox>
#include <QFile>
#include <QHeaderView>
#include <QHelpEvent>
#include <QLineEdit>
#include <QMenu>
#include <QPushButton>
#include <QScrollBar>
#include <QTableView>
#include <QTest>
#include <QTextDocumentFragment>
#include <QToolButton>
#include <QToolTip>
#include <QTreeView>

namespace {

const QString foundStyle{QStringLiteral("QLineEdit { color: black; }")};
const QString notFoundStyle{QStringLiteral("QLineEdit { color: red; }")};

QByteArray lease(const QByteArray &address, const QByteArray &name, const QByteArray &state = "active",
                 const QByteArray &mac = "00:00:5e:00:53:01", const QByteArray &end = "2026/03/02 20:00:00")
{
    return "lease " + address + " {\n  starts 1 2026/03/02 08:00:00;\n  ends 1 " + end + ";\n  binding state " + state +
           ";\n  hardware ethernet " + mac + ";\n  client-hostname \"" + name + "\";\n}\n";
}

const QByteArray longName{"a-name-that-is-quite-a-lot-longer-than-the-names-of-all-others"};

// Of the addresses from 10.0.0.0 to 10.0.0.199, from 10.0.1.0 to 10.0.1.199 and so on.
QByteArray manyLeases(int count = 400)
{
    QByteArray leases;
    for (int i{0}; i < count; ++i)
        leases += lease("10.0." + QByteArray::number(i / 200) + '.' + QByteArray::number(i % 200), "some");
    return leases;
}

// Ways in which a program adds leases to the file $1.
void addReloads()
{
    QTest::addColumn<QByteArray>("command");
    QTest::addRow("appended to") << QByteArray{R"(cat >>"$1")"};
    QTest::addRow("replaced") << QByteArray{R"(cat "$1" - >"$1.new"; mv "$1.new" "$1")"};
    QTest::addRow("replaced, the old one kept")
        << QByteArray{R"(ln -f "$1" "$1~"; cat "$1" - >"$1.new"; mv "$1.new" "$1")"};
    QTest::addRow("written anew") << QByteArray{R"({ cat "$1"; cat; } >"$1.all"; cat "$1.all" >"$1")"};
}

const QByteArray configuration{R"(ddns-hostname gamma;
subnet 10.0.0.0 netmask 255.255.255.0 {
    host nested {
    }
}
host delta {
}
host delta {
    fixed-address 10.0.0.77;
}
)"};

/// The window with the leases in front, driven the way a user does it.
struct Site final
{
    explicit Site(const TestMachine &machine)
        : window{machine.openWindow()}
        , table{window->findChild<QTableView *>(QStringLiteral("dhcpdLeaseTable"))}
        , field{window->findChild<QLineEdit *>(QStringLiteral("searchLease"))}
        , previous{window->findChild<QToolButton *>(QStringLiteral("searchPrevLease"))}
        , next{window->findChild<QToolButton *>(QStringLiteral("searchNextLease"))}
        , tabs{window->findChild<QTabWidget *>(QStringLiteral("mainTabWidget"))}
        , tree{window->findChild<QTreeView *>(QStringLiteral("topologyTree"))}
        , model{window->findChild<DhcpdConfigModel *>()}
    {
        clickTab(*window, 1);
    }

    QString cell(int row, int column) const { return table->model()->index(row, column).data().toString(); }
    QStringList addresses() const
    {
        QStringList texts;
        for (int row{0}; row < table->model()->rowCount(); ++row)
            texts.append(cell(row, DhcpdLeasesModel::Address));
        return texts;
    }
    QString currentAddress() const
    {
        return table->currentIndex().siblingAtColumn(DhcpdLeasesModel::Address).data().toString();
    }
    QString topAddress() const { return cell(table->rowAt(0), DhcpdLeasesModel::Address); }
    bool stepsAreEnabled() const { return previous->isEnabled() && next->isEnabled(); }
    bool stepsAreDisabled() const { return !previous->isEnabled() && !next->isEnabled(); }

    int rowOf(const char *address) const { return static_cast<int>(addresses().indexOf(QString::fromLatin1(address))); }
    QPoint centre(const char *address, int column = 0) const
    {
        const QModelIndex index{table->model()->index(rowOf(address), column)};
        table->scrollTo(index);
        return table->visualRect(index).center();
    }
    void click(const char *address, int column = 0) const
    {
        QTest::mouseClick(table->viewport(), Qt::LeftButton, {}, centre(address, column));
    }
    void doubleClick(const char *address) const
    {
        click(address);
        QTest::mouseDClick(table->viewport(), Qt::LeftButton, {}, centre(address));
    }
    void rightClick(QPoint position) const
    {
        QTest::mouseClick(table->viewport(), Qt::RightButton, {}, position);
        QContextMenuEvent event{QContextMenuEvent::Mouse, position, table->viewport()->mapToGlobal(position)};
        QApplication::sendEvent(table->viewport(), &event);
    }
    bool isShownWhole(const char *address, int column) const
    {
        const auto &view = static_cast<const QAbstractItemView &>(*table);
        return table->columnWidth(column) >=
               view.sizeHintForIndex(table->model()->index(rowOf(address), column)).width();
    }

    QWidget *header() const { return table->horizontalHeader()->viewport(); }
    QPoint borderBehind(int column) const
    {
        const QHeaderView &view{*table->horizontalHeader()};
        return {view.sectionViewportPosition(column) + view.sectionSize(column) - 1, view.height() / 2};
    }
    void enterHeader() const
    {
        QEvent enter{QEvent::Enter};
        QApplication::sendEvent(header(), &enter);
    }
    void drag(int column, int distance) const
    {
        enterHeader();
        const QPoint border{borderBehind(column)};
        QTest::mousePress(header(), Qt::LeftButton, {}, border);
        const QPoint end{border + QPoint{distance, 0}};
        QMouseEvent move{QEvent::MouseMove, end, Qt::NoButton, Qt::LeftButton, {}};
        QApplication::sendEvent(header(), &move);
        QTest::mouseRelease(header(), Qt::LeftButton, {}, end);
    }
    void doubleClickBorder(int column) const { QTest::mouseDClick(header(), Qt::LeftButton, {}, borderBehind(column)); }

    /// The text that the tip over a cell shows; empty when there is none.
    QString toolTip(const char *address, int column) const
    {
        QToolTip::hideText();
        const QPoint position{centre(address, column)};
        QHelpEvent help{QEvent::ToolTip, position, table->viewport()->mapToGlobal(position)};
        QApplication::sendEvent(table->viewport(), &help);
        return QTextDocumentFragment::fromHtml(QToolTip::text()).toPlainText();
    }

    void type(const QString &text) const { QTest::keyClicks(field, text); }
    void press(QToolButton *button) const { QTest::mouseClick(button, Qt::LeftButton); }

    /// The values of the children of the "All network" node.
    QStringList values() const
    {
        QStringList texts;
        const QModelIndex network{model->index(0, 0)};
        for (int row{0}; row < model->rowCount(network); ++row)
            texts.append(model->index(row, 1, network).data().toString());
        return texts;
    }

    std::unique_ptr<FMain> window;
    QTableView *table;
    QLineEdit *field;
    QToolButton *previous;
    QToolButton *next;
    QTabWidget *tabs;
    QTreeView *tree;
    DhcpdConfigModel *model;
};

ModalBoxes::Box goToTopology()
{
    return {QMessageBox::Information, QStringLiteral("Information"),
            QStringLiteral("The IP address is reserved.\nGo to topology?"), QMessageBox::Yes | QMessageBox::No,
            QMessageBox::Yes};
}

void save(HostInputDialog *dialog) { driver::click(*dialog, QDialogButtonBox::Save); }

} // namespace

class LeaseCommandsTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void search_data();
    void search();
    void searchForAnEnd();
    void searchSaysHowManyAreFound();
    void clearedSearchKeepsTheFoundLease();
    void clearedSearchShowsEverything();
    void matchesAreScrolledTo();
    void stepsDoNotWrap();
    void stepsVisitOneColumn();
    void stepsForgetASelectedRow();
    void stepsNeedAText();

    void menuOpensOverALease();
    void dialogShowsTheLease_data();
    void dialogShowsTheLease();
    void cancelledReservationChangesNothing();
    void reservationIsAdded();
    void reservationGoesToTopology_data();
    void reservationGoesToTopology();
    void reservationLeavesOutSyntax_data();
    void reservationLeavesOutSyntax();
    void reservationTakesTheTypedValues();
    void reservationOutlivesAReload();
    void reservationNeedsAConfiguration();
    void reservationNeedsALease();

    void rowsAreAsTallAsALine();
    void placeIsKeptOverAutomaticReloads_data();
    void placeIsKeptOverAutomaticReloads();
    void horizontalPlaceIsKeptOverAutomaticReloads_data();
    void horizontalPlaceIsKeptOverAutomaticReloads();
    void leaseThatIsOnlyCurrentIsNotSelected_data();
    void leaseThatIsOnlyCurrentIsNotSelected();
    void columnsShowWhatIsScrolledTo();
    void searchKeepsTheRoomOfTheNumbers();
    void columnsShowWhatArrives_data();
    void columnsShowWhatArrives();
    void columnsAreTheUsersToDrag();
    void cutTextHasAToolTip();
    void searchIsKeptOverAutomaticReloads();
    void leaseThatLeavesTheFilterHasNoSuccessor();
    void busyCursorShowsWhileMuchIsRead_data();
    void busyCursorShowsWhileMuchIsRead();
    void clientsNameAddsNoStatements();

private:
    std::unique_ptr<TestMachine> m_machine;
};

void LeaseCommandsTest::init()
{
    m_machine = std::make_unique<TestMachine>();
    writeTestFile(paths::configuration(), configuration);
    writeTestFile(paths::leases(),
                  lease("10.0.0.11", "gamma", "free") + lease("10.0.0.9", "Alpha") +
                      lease("10.0.0.10", "beta", "active", "00:00:5e:AC:53:02") +
                      lease("10.0.1.9", "at-10.0.0.1", "backup", "00:00:5e:00:53:04", "2031/07/19 03:04:05") +
                      lease("10.0.1.10", "alphabet", "free"));
}

void LeaseCommandsTest::cleanup() { m_machine.reset(); }

void LeaseCommandsTest::search_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("shown");
    QTest::addColumn<QString>("first"); // the first match, none for a search that finds nothing
    QTest::addColumn<int>("column");

    const auto row = [](const char *name, const char *text, const char *shown, const char *first, int column) {
        QTest::addRow("%s", name) << QString::fromLatin1(text) << QString::fromLatin1(shown)
                                  << QString::fromLatin1(first) << column;
    };
    row("address", "10.0.1", "10.0.1.9 10.0.1.10", "10.0.1.9", DhcpdLeasesModel::Address);
    row("address and name", "10.0.0.1", "10.0.0.10 10.0.0.11 10.0.1.9", "10.0.0.10", DhcpdLeasesModel::Address);
    row("name", "beta", "10.0.0.10", "10.0.0.10", DhcpdLeasesModel::HostName);
    row("part of a name", "bet", "10.0.0.10 10.0.1.10", "10.0.0.10", DhcpdLeasesModel::HostName);
    row("letter case", "alpha", "10.0.1.10", "10.0.1.10", DhcpdLeasesModel::HostName);
    row("other letter case", "Alpha", "10.0.0.9", "10.0.0.9", DhcpdLeasesModel::HostName);
    row("matches ignore case", "ac", "10.0.0.9 10.0.0.10 10.0.1.9", "10.0.0.10", DhcpdLeasesModel::Mac);
    row("state", "free", "10.0.0.11 10.0.1.10", "10.0.0.11", DhcpdLeasesModel::State);
    row("no pattern", "10.0.0.*", "", "", -1);
    row("nothing", "zeta", "", "", -1);
    row("nothing in this case", "BETA", "", "", -1);
}

void LeaseCommandsTest::search()
{
    QFETCH(QString, text);
    QFETCH(QString, shown);
    QFETCH(QString, first);
    QFETCH(int, column);
    const Site site{*m_machine};
    site.type(text);
    QCOMPARE(site.addresses().join(QLatin1Char{' '}), shown);
    if (first.isEmpty()) {
        QCOMPARE(site.field->styleSheet(), notFoundStyle);
        QVERIFY(site.stepsAreDisabled());
    } else {
        QCOMPARE(site.field->styleSheet(), foundStyle);
        QVERIFY(site.stepsAreEnabled());
        QCOMPARE(site.currentAddress(), first);
        QCOMPARE(site.table->currentIndex().column(), column);
        QCOMPARE(site.table->selectionModel()->selectedIndexes(), QModelIndexList{site.table->currentIndex()});
    }
}

void LeaseCommandsTest::searchForAnEnd()
{
    const Site site{*m_machine};
    const QString end{site.cell(site.rowOf("10.0.1.9"), DhcpdLeasesModel::End)};
    QVERIFY(!end.isEmpty());
    site.type(end);
    QCOMPARE(site.addresses(), QStringList{QStringLiteral("10.0.1.9")});
    QCOMPARE(site.table->currentIndex().column(), int{DhcpdLeasesModel::End});
    QVERIFY(site.stepsAreEnabled());
}

void LeaseCommandsTest::searchSaysHowManyAreFound()
{
    const Site site{*m_machine};
    QCOMPARE(site.field->accessibleDescription(), QString{});
    site.type(QStringLiteral("10.0.0."));
    QCOMPARE(site.field->accessibleDescription(), QStringLiteral("Leases found: 4"));
    site.type(QStringLiteral("11"));
    QCOMPARE(site.field->accessibleDescription(), QStringLiteral("Leases found: 1"));
    runOutside(paths::leases(), R"(cat >>"$1")", lease("10.0.0.110", "new"));
    QTRY_COMPARE(site.field->accessibleDescription(), QStringLiteral("Leases found: 2"));
    site.type(QStringLiteral("nothing"));
    QCOMPARE(site.field->accessibleDescription(), QStringLiteral("No leases found"));
    site.field->clear();
    QCOMPARE(site.field->accessibleDescription(), QString{});
}

void LeaseCommandsTest::clearedSearchKeepsTheFoundLease()
{
    QByteArray content;
    for (int number{1}; number < 200; ++number)
        content += lease("10.0.2." + QByteArray::number(number), "pc-" + QByteArray::number(number));
    writeTestFile(paths::leases(), content);
    const Site site{*m_machine};
    site.type(QStringLiteral("pc-150"));
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.2.150"));
    site.field->clear();
    QCOMPARE(site.table->model()->rowCount(), 199);
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.2.150"));
    QVERIFY(site.table->viewport()->rect().intersects(site.table->visualRect(site.table->currentIndex())));
}

void LeaseCommandsTest::clearedSearchShowsEverything()
{
    const Site site{*m_machine};
    const QStringList all{site.addresses()};
    QCOMPARE(all.join(QLatin1Char{' '}), QStringLiteral("10.0.0.9 10.0.0.10 10.0.0.11 10.0.1.9 10.0.1.10"));
    for (const QString &text : {QStringLiteral("beta"), QStringLiteral("zeta")}) {
        site.type(text);
        QVERIFY(site.addresses() != all);
        QTest::keyClick(site.field, Qt::Key_A, Qt::ControlModifier);
        QTest::keyClick(site.field, Qt::Key_Delete);
        QCOMPARE(site.addresses(), all);
        QCOMPARE(site.field->styleSheet(), foundStyle);
        QVERIFY(site.stepsAreDisabled());
    }
}

void LeaseCommandsTest::matchesAreScrolledTo()
{
    QByteArray leases;
    for (int i{0}; i < 200; ++i)
        leases += lease("10.0.0." + QByteArray::number(i), "some");
    writeTestFile(paths::leases(), leases);
    const Site site{*m_machine};
    const auto currentIsShown = [&site] {
        return site.table->viewport()->rect().contains(site.table->visualRect(site.table->currentIndex()));
    };
    site.type(QStringLiteral("some"));
    QCOMPARE(site.table->model()->rowCount(), 200);
    for (int i{0}; i < 199; ++i)
        site.press(site.next);
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.0.199"));
    QVERIFY(currentIsShown());
    QTest::keyClick(site.field, Qt::Key_Backspace);
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.0.0"));
    QVERIFY(currentIsShown());
}

void LeaseCommandsTest::stepsDoNotWrap()
{
    const Site site{*m_machine};
    site.type(QStringLiteral("10.0.0."));
    QStringList visited{site.currentAddress()};
    for (QToolButton *button :
         {site.previous, site.next, site.next, site.next, site.previous, site.previous, site.previous, site.next}) {
        site.press(button);
        visited.append(site.currentAddress());
        QCOMPARE(site.table->selectionModel()->selectedIndexes(), QModelIndexList{site.table->currentIndex()});
    }
    QCOMPARE(visited.join(QLatin1Char{' '}),
             QStringLiteral("10.0.0.9 10.0.0.9 10.0.0.10 10.0.0.11 10.0.0.11 10.0.0.10 10.0.0.9 10.0.0.9 10.0.0.10"));
}

void LeaseCommandsTest::stepsVisitOneColumn()
{
    const Site site{*m_machine};
    site.type(QStringLiteral("10.0.0.1"));
    QCOMPARE(site.table->model()->rowCount(), 3);
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.0.10"));
    for (int i{0}; i < 3; ++i)
        site.press(site.next);
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.0.11")); // rather than the one with the text in its name
}

// After the user has selected a whole row, stepping goes on from the last match that was stepped to.
void LeaseCommandsTest::stepsForgetASelectedRow()
{
    const Site site{*m_machine};
    site.type(QStringLiteral("10.0.0."));
    site.click("10.0.0.11");
    QCOMPARE(site.table->selectionModel()->selectedIndexes().size(), 6);
    site.press(site.next);
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.0.10"));
    site.press(site.next);
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.0.11"));

    site.click("10.0.0.9");
    site.press(site.next); // there is none after the last
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.0.9"));
    QCOMPARE(site.table->selectionModel()->selectedIndexes().size(), 6);
    site.press(site.previous);
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.0.10"));
}

void LeaseCommandsTest::stepsNeedAText()
{
    const Site site{*m_machine};
    site.click("10.0.0.10");
    site.window->selectNextLease();
    site.window->selectPrevLease();
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.0.10"));
    QVERIFY(site.stepsAreDisabled());
}

void LeaseCommandsTest::menuOpensOverALease()
{
    const Site site{*m_machine};
    ModalBoxes boxes;
    boxes.expectMenu([&site](QMenu *menu) {
        QCOMPARE(menu->title(), QStringLiteral("Actions"));
        QCOMPARE(menu->actions(), QList<QAction *>{site.window->findChild<QAction *>(QStringLiteral("aAddReserveIP"))});
        QTest::mouseClick(menu, Qt::LeftButton, {}, menu->actionGeometry(menu->actions().first()).center());
    });
    QString address;
    boxes.expectDialog<HostInputDialog>([&address](HostInputDialog *dialog) {
        address = dialog->ip();
        driver::click(*dialog, QDialogButtonBox::Cancel);
    });
    site.rightClick(site.centre("10.0.0.10", 2));
    boxes.verify();
    QCOMPARE(address, QStringLiteral("10.0.0.10"));

    const QPoint beside{5, site.table->viewport()->height() - 5};
    QVERIFY(!site.table->indexAt(beside).isValid());
    site.rightClick(beside); // opens nothing
    QTest::qWait(0);
}

void LeaseCommandsTest::dialogShowsTheLease_data()
{
    QTest::addColumn<bool>("byAction");
    QTest::addRow("double click") << false;
    QTest::addRow("action") << true;
}

void LeaseCommandsTest::dialogShowsTheLease()
{
    QFETCH(bool, byAction);
    const Site site{*m_machine};
    site.type(QStringLiteral("10.0.0.1")); // now the rows of the table are not those of the model
    ModalBoxes boxes;
    boxes.expectDialog<HostInputDialog>([&site](HostInputDialog *dialog) {
        QCOMPARE(dialog->windowTitle(), QStringLiteral("Reserve an IP address"));
        QCOMPARE(dialog->parent(), site.window.get());
        QCOMPARE(dialog->ip(), QStringLiteral("10.0.1.9"));
        QCOMPARE(dialog->mac(), QStringLiteral("00:00:5e:00:53:04"));
        QCOMPARE(dialog->name(), QStringLiteral("at-10.0.0.1"));
        QCOMPARE(dialog->size(), dialog->sizeHint());
        driver::click(*dialog, QDialogButtonBox::Cancel);
    });
    if (byAction) {
        site.click("10.0.1.9", 4);
        site.window->findChild<QAction *>(QStringLiteral("aAddReserveIP"))->trigger();
    } else {
        site.doubleClick("10.0.1.9");
    }
    boxes.verify();
}

void LeaseCommandsTest::cancelledReservationChangesNothing()
{
    const Site site{*m_machine};
    const QByteArray before{site.model->fileContent()};
    ModalBoxes boxes;
    boxes.expectDialog<HostInputDialog>([](HostInputDialog *dialog) { QTest::keyClick(dialog, Qt::Key_Escape); });
    site.doubleClick("10.0.0.10");
    boxes.verify();
    QCOMPARE(site.model->fileContent(), before);
    QVERIFY(!site.model->isModified());
    QCOMPARE(site.tabs->currentIndex(), 1);
}

void LeaseCommandsTest::reservationIsAdded()
{
    const Site site{*m_machine};
    const QStringList before{site.values()};
    site.tree->collapseAll();
    ModalBoxes boxes;
    boxes.expectDialog<HostInputDialog>(save);
    boxes.expectBox(goToTopology(), QMessageBox::No);
    site.doubleClick("10.0.1.9"); // is in no subnet of the configuration
    boxes.verify();

    QCOMPARE(site.tabs->currentIndex(), 1);
    QCOMPARE(site.values(), before + QStringList{QStringLiteral("at-10.0.0.1")});
    QVERIFY(site.model->isModified());
    const QByteArray content{site.model->fileContent()};
    QVERIFY(content.contains("host at-10.0.0.1 {"));
    QVERIFY(content.contains("hardware ethernet 00:00:5e:00:53:04;"));
    QVERIFY(content.contains("fixed-address 10.0.1.9;"));
    const QModelIndex network{site.model->index(0, 0)};
    QCOMPARE(site.tree->currentIndex(), network);
    // The tree is not in view, so the commands that add to it stay disabled.
    QVERIFY(!site.window->findChild<QAction *>(QStringLiteral("aAddHost"))->isEnabled());
    QVERIFY(site.tree->isExpanded(network));
    for (int row{1}; row < site.model->rowCount(network); ++row) {
        const QModelIndex child{site.model->index(row, 0, network)};
        QCOMPARE(site.tree->isExpanded(child), site.model->hasChildren(child));
    }
}

void LeaseCommandsTest::reservationGoesToTopology_data()
{
    QTest::addColumn<QByteArray>("leaseName");
    QTest::addColumn<QString>("typedName"); // null: as in the lease
    QTest::addColumn<int>("row");           // the child of the network that is current afterwards; -1: none of them
    // The children of the network: ddns-hostname gamma, the subnet, two hosts delta, and the new one.
    QTest::addRow("new host") << QByteArray{"beta"} << QString{} << 4;
    QTest::addRow("name changed") << QByteArray{"beta"} << QStringLiteral("eta") << -1;
    QTest::addRow("name changed, the old one there")
        << QByteArray{"delta"} << QStringLiteral("eta") << 2; // the first of the two
    QTest::addRow("any statement of this value") << QByteArray{"gamma"} << QString{} << 0;
    QTest::addRow("no deeper statement") << QByteArray{"nested"} << QStringLiteral("eta") << -1;
    QTest::addRow("letter case") << QByteArray{"DELTA"} << QStringLiteral("eta") << -1;
}

void LeaseCommandsTest::reservationGoesToTopology()
{
    QFETCH(QByteArray, leaseName);
    QFETCH(QString, typedName);
    QFETCH(int, row);
    writeTestFile(paths::leases(), lease("10.0.0.10", leaseName));
    const Site site{*m_machine};
    ModalBoxes boxes;
    boxes.expectDialog<HostInputDialog>([&typedName](HostInputDialog *dialog) {
        if (!typedName.isNull())
            dialog->setName(typedName);
        save(dialog);
    });
    boxes.expectBox(goToTopology(), QMessageBox::Yes);
    site.doubleClick("10.0.0.10");
    boxes.verify();
    QCOMPARE(site.tabs->currentIndex(), 0);
    const QModelIndex network{site.model->index(0, 0)};
    QCOMPARE(site.model->rowCount(network), 5);
    const QModelIndex current{site.tree->currentIndex()};
    QCOMPARE(current.isValid() && current.parent() == network ? current.row() : -1, row);
}

void LeaseCommandsTest::reservationLeavesOutSyntax_data()
{
    QTest::addColumn<QByteArray>("leaseName");
    QTest::addColumn<QString>("name");
    QTest::addRow("end of a statement") << QByteArray{"pc; deny booting"} << QStringLiteral("pc-deny-booting");
    QTest::addRow("block") << QByteArray{"pc { } host x"} << QStringLiteral("pc-host-x");
    QTest::addRow("comment") << QByteArray{"pc#1"} << QStringLiteral("pc-1");
    QTest::addRow("quotes") << QByteArray{R"(\"pc\")"} << QStringLiteral("pc");
    QTest::addRow("tab") << QByteArray{"p\tc"} << QStringLiteral("p-c");
    QTest::addRow("lowest control characters") << QByteArray{"p\x01\x02"
                                                             "c"}
                                               << QStringLiteral("p-c");
    QTest::addRow("highest control character") << QByteArray{"p\x1f"
                                                             "c"}
                                               << QStringLiteral("p-c");
    QTest::addRow("nothing left") << QByteArray{"\xC3\xA4 !"} << QString{};
    QTest::addRow("name of two labels") << QByteArray{"My_PC-2.lan"} << QStringLiteral("My_PC-2.lan");
    QTest::addRow("signs at the ends") << QByteArray{"(pc)"} << QStringLiteral("pc");
    QTest::addRow("other signs") << QByteArray{"p!$%&'()*+,-./:<=>?@[]^_`|~c"} << QStringLiteral("p--.-_-c");
}

void LeaseCommandsTest::reservationLeavesOutSyntax()
{
    QFETCH(QByteArray, leaseName);
    QFETCH(QString, name);
    writeTestFile(paths::leases(), lease("10.0.0.10", leaseName));
    const Site site{*m_machine};
    ModalBoxes boxes;
    boxes.expectDialog<HostInputDialog>([&name](HostInputDialog *dialog) {
        QCOMPARE(dialog->name(), name);
        QTest::keyClick(dialog, Qt::Key_Escape);
    });
    site.doubleClick("10.0.0.10");
}

void LeaseCommandsTest::reservationTakesTheTypedValues()
{
    const Site site{*m_machine};
    ModalBoxes boxes;
    boxes.expectDialog<HostInputDialog>([](HostInputDialog *dialog) {
        dialog->setName(QStringLiteral("eta"));
        dialog->setMac(QStringLiteral("00:00:5e:00:53:ff"));
        dialog->setIp(QStringLiteral("10.0.0.200"));
        save(dialog);
    });
    boxes.expectBox(goToTopology(), Qt::Key_Escape);
    site.doubleClick("10.0.0.10");
    boxes.verify();
    QCOMPARE(site.tabs->currentIndex(), 1);
    const QByteArray content{site.model->fileContent()};
    QVERIFY(content.contains("host eta {"));
    QVERIFY(content.contains("hardware ethernet 00:00:5e:00:53:ff;"));
    QVERIFY(content.contains("fixed-address 10.0.0.200;"));
}

void LeaseCommandsTest::reservationOutlivesAReload()
{
    const Site site{*m_machine};
    ModalBoxes boxes;
    boxes.expectDialog<HostInputDialog>([&site](HostInputDialog *dialog) {
        runOutside(paths::leases(), R"(cat >"$1")", lease("10.9.9.9", "other"));
        QTRY_COMPARE(site.table->model()->rowCount(), 1);
        QCOMPARE(dialog->ip(), QStringLiteral("10.0.0.10"));
        save(dialog);
    });
    boxes.expectBox(goToTopology(), QMessageBox::Yes);
    site.doubleClick("10.0.0.10");
    boxes.verify();
    QCOMPARE(site.tree->currentIndex().siblingAtColumn(1).data().toString(), QStringLiteral("beta"));
    QVERIFY(site.model->fileContent().contains("fixed-address 10.0.0.10;"));
}

void LeaseCommandsTest::reservationNeedsAConfiguration()
{
    QVERIFY(QFile::remove(paths::configuration()));
    ModalBoxes boxes;
    boxes.expectBox(cannotRead(), QMessageBox::Ok);
    const Site site{*m_machine};
    boxes.verify();
    site.doubleClick("10.0.0.10");
    site.window->findChild<QAction *>(QStringLiteral("aAddReserveIP"))->trigger();
    QCOMPARE(site.model->rowCount(), 0);
}

void LeaseCommandsTest::reservationNeedsALease()
{
    QVERIFY(QFile::remove(paths::leases()));
    const ModalBoxes noBox;
    const Site site{*m_machine};
    site.window->findChild<QAction *>(QStringLiteral("aAddReserveIP"))->trigger();
    QVERIFY(!site.model->isModified());
}

void LeaseCommandsTest::rowsAreAsTallAsALine()
{
    const QByteArray longName{QByteArray{"a name of many words "}.repeated(40)};
    writeTestFile(paths::leases(), lease("10.0.0.10", "short") + lease("10.0.0.11", longName) + lease("10.0.0.12", "") +
                                       lease("10.0.0.13", "\xe2\x80\xa8 two lines"));
    const Site site{*m_machine};
    const int line{site.table->fontMetrics().height()};
    QCOMPARE(site.table->model()->rowCount(), 4);
    for (int row{0}; row < 4; ++row) {
        QCOMPARE(site.table->rowHeight(row), site.table->rowHeight(0));
        QVERIFY(site.table->rowHeight(row) >= line);
        QVERIFY(site.table->rowHeight(row) < line + line / 2);
    }
}

void LeaseCommandsTest::placeIsKeptOverAutomaticReloads_data() { addReloads(); }

void LeaseCommandsTest::placeIsKeptOverAutomaticReloads()
{
    QFETCH(QByteArray, command);
    writeTestFile(paths::leases(), manyLeases());
    const Site site{*m_machine};
    site.click("10.0.1.100", 2);
    site.table->verticalScrollBar()->setValue(site.rowOf("10.0.0.150"));
    QCOMPARE(site.topAddress(), QStringLiteral("10.0.0.150"));

    // Rows appear above, between and below those that are shown.
    QByteArray more;
    for (const char *address : {"9.0.0.1", "10.0.0.201", "10.0.0.202", "11.0.0.1"})
        more += lease(address, "more");
    for (int round{0}; round < 2; ++round) {
        runOutside(paths::leases(), command, more);
        QTRY_COMPARE(site.table->model()->rowCount(), 404 + round);
        QCOMPARE(site.currentAddress(), QStringLiteral("10.0.1.100"));
        QCOMPARE(site.table->currentIndex().column(), 2);
        QCOMPARE(site.table->selectionModel()->selectedRows(2), QModelIndexList{site.table->currentIndex()});
        QCOMPARE(site.topAddress(), QStringLiteral("10.0.0.150"));
        more = lease("9.0.0.2", "once more");
    }
}

void LeaseCommandsTest::horizontalPlaceIsKeptOverAutomaticReloads_data() { addReloads(); }

void LeaseCommandsTest::horizontalPlaceIsKeptOverAutomaticReloads()
{
    QFETCH(QByteArray, command);
    writeTestFile(paths::leases(), manyLeases());
    const Site site{*m_machine};
    site.window->resize(500, 500);
    QTRY_VERIFY(site.table->horizontalScrollBar()->maximum() > 0);
    site.table->horizontalScrollBar()->setValue(1);
    runOutside(paths::leases(), command, lease("10.0.0.3", "other") + lease("10.0.0.201", "other"));
    QTRY_COMPARE(site.table->model()->rowCount(), 401);
    QCOMPARE(site.table->horizontalScrollBar()->value(), 1);
}

void LeaseCommandsTest::leaseThatIsOnlyCurrentIsNotSelected_data() { addReloads(); }

void LeaseCommandsTest::leaseThatIsOnlyCurrentIsNotSelected()
{
    QFETCH(QByteArray, command);
    const Site site{*m_machine};
    site.click("10.0.0.11");
    site.table->clearSelection();
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.0.11"));
    runOutside(paths::leases(), command, lease("10.0.0.1", "before"));
    QTRY_COMPARE(site.table->model()->rowCount(), 6);
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.0.11"));
    QVERIFY(!site.table->selectionModel()->hasSelection());
}

void LeaseCommandsTest::columnsShowWhatIsScrolledTo()
{
    writeTestFile(paths::leases(), manyLeases() + lease("10.0.1.150", longName));
    const Site site{*m_machine};
    QVERIFY(!site.isShownWhole("10.0.1.150", DhcpdLeasesModel::HostName));
    const int before{site.table->columnWidth(DhcpdLeasesModel::HostName)};
    site.table->verticalScrollBar()->setValue(site.rowOf("10.0.1.149"));
    QTRY_VERIFY(site.isShownWhole("10.0.1.150", DhcpdLeasesModel::HostName));

    const int wide{site.table->columnWidth(DhcpdLeasesModel::HostName)};
    QVERIFY(wide > before);
    site.table->verticalScrollBar()->setValue(0);
    QCoreApplication::processEvents();
    QCOMPARE(site.table->columnWidth(DhcpdLeasesModel::HostName), wide);
}

void LeaseCommandsTest::searchKeepsTheRoomOfTheNumbers()
{
    writeTestFile(paths::leases(), manyLeases(10'000) + lease("10.0.99.1", "only"));
    const Site site{*m_machine};
    const auto left = [&site] {
        site.window->grab(); // has it laid out
        return site.table->viewport()->mapTo(site.window.get(), QPoint{}).x();
    };
    const int before{left()};
    QCoreApplication::processEvents();
    for (const char *text : {"o", "nl", "y", "?"}) {
        site.type(QString::fromLatin1(text));
        QCOMPARE(left(), before);
    }
    QCOMPARE(site.table->model()->rowCount(), 0);
    site.field->clear();
    QCOMPARE(left(), before);
}

void LeaseCommandsTest::columnsShowWhatArrives_data() { addReloads(); }

void LeaseCommandsTest::columnsShowWhatArrives()
{
    QFETCH(QByteArray, command);
    const Site site{*m_machine};
    for (const bool isUsers : {false, true}) {
        if (isUsers)
            site.enterHeader();
        const QByteArray name{longName + (isUsers ? "and-longer" : "")};
        runOutside(paths::leases(), command, lease("10.0.0.10", name));
        QTRY_COMPARE(site.cell(site.rowOf("10.0.0.10"), DhcpdLeasesModel::HostName), QString::fromLatin1(name));
        QTRY_VERIFY(site.isShownWhole("10.0.0.10", DhcpdLeasesModel::HostName));
    }
}

void LeaseCommandsTest::columnsAreTheUsersToDrag()
{
    const Site site{*m_machine};
    const int fitting{site.table->columnWidth(DhcpdLeasesModel::Mac)};
    site.drag(DhcpdLeasesModel::Mac, 40);
    QCOMPARE(site.table->columnWidth(DhcpdLeasesModel::Mac), fitting + 40);
    site.drag(DhcpdLeasesModel::Mac, -70);
    QCOMPARE(site.table->columnWidth(DhcpdLeasesModel::Mac), fitting - 30);

    runOutside(paths::leases(), R"(cat >>"$1")", lease("10.0.0.1", longName));
    QTRY_VERIFY(site.isShownWhole("10.0.0.1", DhcpdLeasesModel::HostName));
    QCOMPARE(site.table->columnWidth(DhcpdLeasesModel::Mac), fitting - 30);

    site.doubleClickBorder(DhcpdLeasesModel::Mac);
    QTRY_VERIFY(site.isShownWhole("10.0.0.1", DhcpdLeasesModel::Mac));
}

void LeaseCommandsTest::cutTextHasAToolTip()
{
    writeTestFile(paths::leases(), lease("10.0.0.1", "<img src=x>") + lease("10.0.0.2", "b"));
    const Site site{*m_machine};
    QVERIFY(site.isShownWhole("10.0.0.1", DhcpdLeasesModel::HostName));
    QCOMPARE(site.toolTip("10.0.0.1", DhcpdLeasesModel::HostName), QString{});
    site.drag(DhcpdLeasesModel::HostName, 20 - site.table->columnWidth(DhcpdLeasesModel::HostName));
    QCOMPARE(site.toolTip("10.0.0.1", DhcpdLeasesModel::HostName), QStringLiteral("<img src=x>"));
    QTRY_COMPARE(site.toolTip("10.0.0.1", DhcpdLeasesModel::Mac), QString{}); // a tip goes slowly
}

void LeaseCommandsTest::leaseThatLeavesTheFilterHasNoSuccessor()
{
    writeTestFile(paths::leases(), lease("10.0.0.1", "a") + lease("10.0.0.2", "b") + lease("10.0.0.3", "c"));
    const Site site{*m_machine};
    site.type(QStringLiteral("active"));
    site.click("10.0.0.2", 2);
    runOutside(paths::leases(), R"(cat >>"$1")", lease("10.0.0.2", "b", "free"));
    QTRY_COMPARE(site.table->model()->rowCount(), 2);
    QTRY_VERIFY(!site.table->currentIndex().isValid());
    QVERIFY(!site.table->selectionModel()->hasSelection());
}

void LeaseCommandsTest::busyCursorShowsWhileMuchIsRead_data()
{
    QTest::addColumn<int>("before"); // leases
    QTest::addColumn<QByteArray>("command");
    QTest::addColumn<int>("written");
    QTest::addColumn<int>("after");
    QTest::addColumn<bool>("busy");
    const QByteArray replace{R"(cat >"$1.new"; mv "$1.new" "$1")"};
    const int many{32'000};
    QTest::addRow("few, replaced") << 1 << replace << 2 << 2 << false;
    QTest::addRow("few, replaced by many") << 1 << replace << many << many << true;
    QTest::addRow("many, replaced") << many << replace << many - 1 << many - 1 << true;
    QTest::addRow("many, appended to") << many << QByteArray{R"(sed s/10.0/9.0/ >>"$1")"} << 1 << many + 1 << false;
}

void LeaseCommandsTest::busyCursorShowsWhileMuchIsRead()
{
    QFETCH(int, before);
    QFETCH(QByteArray, command);
    QFETCH(int, written);
    QFETCH(int, after);
    QFETCH(bool, busy);
    const auto leases = [](int count) {
        QByteArray text;
        for (int i{0}; i < count; ++i)
            text += lease("10.0." + QByteArray::number(i / 200) + '.' + QByteArray::number(i % 200), "some");
        return text;
    };
    writeTestFile(paths::leases(), leases(before));
    const Site site{*m_machine};

    bool wasBusy{false};
    const auto look = [&wasBusy] { wasBusy = isCursorBusy(); };
    const QAbstractItemModel *model{site.table->model()};
    connect(model, &QAbstractItemModel::modelReset, this, look);
    connect(model, &QAbstractItemModel::rowsInserted, this, look);
    runOutside(paths::leases(), command, leases(written));
    QTRY_COMPARE(model->rowCount(), after);
    QCOMPARE(wasBusy, busy);
    QVERIFY(!QGuiApplication::overrideCursor());
}

void LeaseCommandsTest::clientsNameAddsNoStatements()
{
    writeTestFile(paths::leases(), lease("10.0.0.1", "x;} include #y{"));
    const Site site{*m_machine};
    ModalBoxes boxes;
    boxes.expectDialog<HostInputDialog>([](HostInputDialog *dialog) {
        QCOMPARE(dialog->name(), QStringLiteral("x-include-y"));
        driver::click(*dialog, QDialogButtonBox::Cancel);
    });
    site.doubleClick("10.0.0.1");
    boxes.verify();
}

void LeaseCommandsTest::searchIsKeptOverAutomaticReloads()
{
    const Site site{*m_machine};
    site.type(QStringLiteral("bet"));
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.0.10"));
    site.press(site.next);
    QCOMPARE(site.currentAddress(), QStringLiteral("10.0.1.10"));

    for (const char *command : {R"(cat >>"$1")", R"(cat "$1" - >"$1.new"; mv "$1.new" "$1")"}) {
        const int before{site.table->model()->rowCount()};
        const QByteArray address{"9.0.0." + QByteArray::number(before)};
        runOutside(paths::leases(), command, lease(address, "alphabet") + lease("8.0.0.1", "other"));
        QTRY_COMPARE(site.table->model()->rowCount(), before + 1); // the filter still applies
        QCOMPARE(site.field->text(), QStringLiteral("bet"));
        QCOMPARE(site.field->styleSheet(), foundStyle);
        QVERIFY(site.stepsAreEnabled());
        QCOMPARE(site.currentAddress(), QStringLiteral("10.0.1.10"));
        QCOMPARE(site.table->currentIndex().column(), int{DhcpdLeasesModel::HostName});
    }

    // The colour for no match stays as well, although there is one now.
    QTest::keyClick(site.field, Qt::Key_A, Qt::ControlModifier);
    site.type(QStringLiteral("zeta"));
    QCOMPARE(site.field->styleSheet(), notFoundStyle);
    runOutside(paths::leases(), R"(cat >>"$1")", lease("9.0.0.99", "zeta"));
    QTRY_COMPARE(site.addresses(), QStringList{QStringLiteral("9.0.0.99")});
    QCOMPARE(site.field->styleSheet(), notFoundStyle);
    QVERIFY(site.stepsAreDisabled());
}

QTEST_MAIN(LeaseCommandsTest)
#include "tst_leasecommands.moc"
