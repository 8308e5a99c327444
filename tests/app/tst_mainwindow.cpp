// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/fmain.h"
#include "common/paths.h"
#include "leases/dhcpdleasesmodel.h"
#include "platform/orvhelpmenu.h"
#include "tests/app/testmachine.h"
#include "tests/support/modalboxes.h"
#include "tests/support/temporaryroot.h"
#include "tests/support/text.h"

#include <QDir>
#include <QFileSystemWatcher>
#include <QHeaderView>
#include <QImage>
#include <QLabel>
#include <QLayout>
#include <QLineEdit>
#include <QMenuBar>
#include <QMetaMethod>
#include <QScreen>
#include <QSettings>
#include <QSortFilterProxyModel>
#include <QStatusBar>
#include <QTableView>
#include <QTest>
#include <QToolBar>
#include <QToolButton>
#include <QTreeView>

namespace {

const QByteArray configuration{R"(default-lease-time 600;
shared-network campus {
    subnet 10.0.1.0 netmask 255.255.255.0 {
        option routers 10.0.1.1;
    }
}
subnet 10.0.2.0 netmask 255.255.255.0 {
    host printer {
        hardware ethernet 00:00:5e:00:53:01;
    }
}
)"};

QByteArray lease(const QByteArray &address)
{
    return "lease " + address + " {\n  hardware ethernet 00:00:5e:00:53:02;\n  binding state active;\n}\n";
}

// The row to take at each level, from the top of the tree down.
using Place = QVector<int>;
const Place root{0};
const Place defaultLeaseTime{0, 0};
const Place sharedNetwork{0, 1};
const Place innerSubnet{0, 1, 0};
const Place subnet{0, 2};
const Place host{0, 2, 0};

QModelIndex indexOf(const QTreeView *tree, const Place &place)
{
    QModelIndex index;
    for (int row : place)
        index = tree->model()->index(row, 0, index);
    return index;
}

void click(QTreeView *tree, const Place &place)
{
    const QModelIndex index{indexOf(tree, place)};
    QVERIFY(index.isValid());
    QTest::mouseClick(tree->viewport(), Qt::LeftButton, {}, tree->visualRect(index).center());
    QCOMPARE(tree->currentIndex(), index);
}

QTreeView *treeOf(const FMain &window) { return window.findChild<QTreeView *>(QStringLiteral("topologyTree")); }

QTableView *tableOf(const FMain &window) { return window.findChild<QTableView *>(QStringLiteral("dhcpdLeaseTable")); }

QAction *actionOf(const FMain &window, const char *name)
{
    return window.findChild<QAction *>(QString::fromLatin1(name));
}

QLabel *statusLabelOf(const FMain &window)
{
    return window.findChild<QStatusBar *>(QStringLiteral("statusBar"))->findChild<QLabel *>();
}

QStringList namesOf(const QList<QAction *> &actions)
{
    QStringList names;
    for (const QAction *action : actions)
        names.append(action->isSeparator() ? QStringLiteral("-") : action->objectName());
    return names;
}

QStringList enabledOf(const FMain &window, const QStringList &names)
{
    QStringList enabled;
    for (const QString &name : names) {
        if (window.findChild<QAction *>(name)->isEnabled())
            enabled.append(name);
    }
    return enabled;
}

QStringList enabledAddActions(const FMain &window)
{
    return enabledOf(window,
                     {QStringLiteral("aAddSharedNetwork"), QStringLiteral("aAddSubnet"), QStringLiteral("aAddHost")});
}

struct ActionRow
{
    const char *name;
    const char *text;
    const char *toolTip;
    const char *shortcut;
    const char *icon;
};

// Where an action has no tool tip of its own, Qt shows its text.
const ActionRow actionTable[]{
    {"aReload", "Reload", "Reload", "F5", "view-refresh"},
    {"aSave", "Save", "Save", "Ctrl+S", "document-save"},
    {"aExit", "Exit", "Exit", "", "application-exit"},
    {"actionRestart", "Restart DHCP-server", "Restart DHCP-server", "", "view-restore"},
    {"actionInterfaces", "Select interfaces", "Select interfaces", "", "configure"},
    {"actionStartStopServer", "Start DHCP-server", "Start or stop DHCP-server", "Ctrl+R", "media-playback-start"},
    {"aAddSubnet", "Add subnet", "Add subnet", "", "preferences-system-network"},
    {"aAddSharedNetwork", "Add shared network", "Add shared network", "", "network"},
    {"aAddHost", "Add host", "Add host", "", "computer"},
    {"aAddRange", "Add range", "Add range", "", "preferences-system-network"},
    {"aAddParam", "Add arbitrary parameter", "Add arbitrary parameter", "", "configure"},
    {"aAddDeclaration", "Add arbitrary declaration", "Add arbitrary declaration", "", "preferences-system-network"},
    {"actionEdit", "Edit", "Edit", "", "list-add"},
    {"actionRemove", "Remove", "Remove", "", "list-remove"},
    {"aAddFixedIp", "Add fixed IP", "Add fixed IP", "", "preferences-system-network"},
    {"aAddDns", "Add DNS servers", "Add DNS servers", "", "configure"},
    {"aAddDomainName", "Add domain name", "Add domain name", "", "configure"},
    {"aAddRouters", "Add gateways", "Add gateways", "", "configure"},
    {"aAddNtpServers", "Add NTP servers", "Add NTP servers", "", "configure"},
    {"aAddDefaultLeaseTime", "Add default lease time", "Add default lease time", "", "configure"},
    {"aAddMaxLeaseTime", "Add max lease time", "Add max lease time", "", "configure"},
    {"aAddReserveIP", "Reserve an IP address", "Reserve an IP address", "", "computer"},
    {"aAddStaticRoute", "Add static route", "Add static route", "", "computer"},
    {"aAddDHCPDynamicUpdate", "Add DHCP dynamic zone update", "Add DHCP dynamic zone update", "", "configure"},
};

// An icon theme with all icons of the window, in use while this object lives.
class IconTheme final
{
public:
    IconTheme()
    {
        const QString theme{m_folder.filePath(QStringLiteral("test-theme"))};
        QVERIFY(QDir{}.mkpath(theme + QStringLiteral("/16x16")));
        writeTestFile(theme + QStringLiteral("/index.theme"),
                      "[Icon Theme]\nName=Test\nDirectories=16x16\n[16x16]\nSize=16\nType=Fixed\n");
        QImage image{16, 16, QImage::Format_RGB32};
        image.fill(Qt::black);
        QStringList names{QStringLiteral("media-playback-stop"), QStringLiteral("edit-find"),
                          QStringLiteral("previous"), QStringLiteral("next")};
        for (const ActionRow &row : actionTable)
            names.append(QString::fromLatin1(row.icon));
        for (const QString &name : qAsConst(names))
            QVERIFY(image.save(QStringLiteral("%1/16x16/%2.png").arg(theme, name)));
        QIcon::setThemeSearchPaths({m_folder.path()});
        QIcon::setThemeName(QStringLiteral("test-theme"));
    }
    ~IconTheme()
    {
        QIcon::setThemeSearchPaths(m_formerPaths);
        QIcon::setThemeName(m_formerName);
    }
    Q_DISABLE_COPY_MOVE(IconTheme)

private:
    QTemporaryDir m_folder;
    QStringList m_formerPaths{QIcon::themeSearchPaths()};
    QString m_formerName{QIcon::themeName()};
};

ModalBoxes::Box informationBox(const QString &text)
{
    return {QMessageBox::Information, QStringLiteral("Information"), text, QMessageBox::Ok, QMessageBox::Ok};
}

} // namespace

Q_DECLARE_METATYPE(FakeSystemctl::State)

class MainWindowTest final : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void widgetsHaveTheirNames_data();
    void widgetsHaveTheirNames();
    void widgetsStandInOrder_data();
    void widgetsStandInOrder();
    void propertiesOfWidgets_data();
    void propertiesOfWidgets();
    void actions_data();
    void actions();
    void actionsComeInOrder();
    void missingIconLeavesNone();
    void menusAndToolBar();
    void slotCanBeInvoked_data();
    void slotCanBeInvoked();
    void actionOpensItsWindows_data();
    void actionOpensItsWindows();
    void exitClosesTheWindow();
    void removeTakesTheCurrentStatementAway();
    void headersOfTheTree();
    void rowsOfTheTreeAreEquallyTall();
    void modelsAndTheirParents();
    void searchRowHasIcons();

    void startsOnTheExpandedTopology();
    void selectionEnablesAddActions_data();
    void selectionEnablesAddActions();
    void tabsEnableAddActions();
    void leasesTabReadsTheFileEachTime();
    void saveFollowsUnsavedChanges();

    void serverStateIsShown_data();
    void serverStateIsShown();
    void unknownServerStateLeavesTheAction();
    void serverIsStartedRestartedAndStopped();
    void operationUnderWayIsShown();
    void serverMessagesAreShownInBoxes();
    void boxesBelongToTheWindow();

    void dynamicUpdateNeedsBind9_data();
    void dynamicUpdateNeedsBind9();
    void watchesFilesAndTheirDirectories();

    void sizeIsTheFormsAtFirst();
    void firstSizeFitsTheScreen();
    void sizeIsRestored_data();
    void sizeIsRestored();
    void sizeIsStoredAtTheEndOnly();

    void configurationThatCannotBeReadIsReported_data();
    void configurationThatCannotBeReadIsReported();
    void missingLeaseFileIsAnEmptyTable();

private:
    std::unique_ptr<TestMachine> m_machine;
};

void MainWindowTest::init()
{
    m_machine = std::make_unique<TestMachine>();
    writeTestFile(paths::configuration(), configuration);
    writeTestFile(paths::leases(), lease("10.0.1.50"));
}

void MainWindowTest::cleanup() { m_machine.reset(); }

void MainWindowTest::widgetsHaveTheirNames_data()
{
    QTest::addColumn<QByteArray>("type");
    QTest::addColumn<QString>("within");
    const auto row = [](const char *name, const char *type, const char *within) {
        QTest::addRow("%s", name) << QByteArray{type} << QString::fromLatin1(within);
    };
    row("centralwidget", "QWidget", "FMain");
    row("verticalLayout", "QVBoxLayout", "centralwidget");
    row("swMode", "QStackedWidget", "centralwidget");
    row("mainPage", "QWidget", "swMode");
    row("verticalLayout_3", "QVBoxLayout", "mainPage");
    row("mainTabWidget", "QTabWidget", "mainPage");
    row("horizontalLayout", "QHBoxLayout", "mainTabWidget");
    row("topologyTree", "QTreeView", "mainTabWidget");
    row("tab_2", "QWidget", "mainTabWidget");
    row("horizontalLayout_2", "QHBoxLayout", "tab_2");
    row("leasLayoutVertical", "QVBoxLayout", "tab_2");
    row("leasFormLayout", "QFormLayout", "tab_2");
    row("leasLayoutHorizontal", "QHBoxLayout", "tab_2");
    row("searchLease", "QLineEdit", "tab_2");
    row("searchPrevLease", "QToolButton", "tab_2");
    row("searchNextLease", "QToolButton", "tab_2");
    row("dhcpdLeaseTable", "QTableView", "tab_2");
    row("menubar", "QMenuBar", "FMain");
    row("menu_File", "QMenu", "menubar");
    row("menuServer", "QMenu", "menubar");
    row("statusBar", "QStatusBar", "FMain");
    row("toolBar", "QToolBar", "FMain");
}

void MainWindowTest::widgetsHaveTheirNames()
{
    QFETCH(QByteArray, type);
    QFETCH(QString, within);
    const FMain window;
    QCOMPARE(window.objectName(), QStringLiteral("FMain"));
    QVERIFY(!window.parent());
    const QString name{QString::fromLatin1(QTest::currentDataTag())};
    const QObjectList found{window.findChildren<QObject *>(name)};
    QCOMPARE(found.size(), 1);
    QVERIFY(found.first()->inherits(type.constData()));
    const QObject *around{within == window.objectName() ? &window : window.findChild<QObject *>(within)};
    QVERIFY(around);
    QVERIFY(around->findChildren<QObject *>(name) == found);
}

void MainWindowTest::widgetsStandInOrder_data()
{
    QTest::addColumn<QString>("first");
    QTest::addColumn<QString>("second");
    QTest::addColumn<int>("tab");
    QTest::addColumn<bool>("below"); // rather than to the right
    const auto row = [](const char *first, const char *second, int tab, bool below) {
        QTest::addRow("%s, %s", first, second)
            << QString::fromLatin1(first) << QString::fromLatin1(second) << tab << below;
    };
    row("menubar", "toolBar", 0, true);
    row("toolBar", "topologyTree", 0, true);
    row("topologyTree", "statusBar", 0, true);
    row("toolBar", "searchLease", 1, true);
    row("searchLease", "searchPrevLease", 1, false);
    row("searchPrevLease", "searchNextLease", 1, false);
    row("searchLease", "dhcpdLeaseTable", 1, true);
    row("searchNextLease", "dhcpdLeaseTable", 1, true);
    row("dhcpdLeaseTable", "statusBar", 1, true);
}

void MainWindowTest::widgetsStandInOrder()
{
    QFETCH(QString, first);
    QFETCH(QString, second);
    QFETCH(int, tab);
    QFETCH(bool, below);
    const auto window = m_machine->openWindow();
    clickTab(*window, tab);
    const auto placeOf = [&window](const QString &name) {
        const auto *widget = window->findChild<QWidget *>(name);
        return widget && widget->isVisible() ? QRect{widget->mapTo(window.get(), QPoint{}), widget->size()} : QRect{};
    };
    const QRect before{placeOf(first)};
    const QRect after{placeOf(second)};
    QVERIFY(!before.isEmpty() && !after.isEmpty());
    if (below)
        QVERIFY(before.bottom() < after.top());
    else
        QVERIFY(before.right() < after.left() && before.top() < after.bottom() && after.top() < before.bottom());
}

void MainWindowTest::propertiesOfWidgets_data()
{
    QTest::addColumn<QString>("widget");
    QTest::addColumn<QByteArray>("property");
    QTest::addColumn<QVariant>("value");

    const auto row = [](const char *widget, const char *property, const QVariant &value) {
        QTest::addRow("%s %s", widget, property) << QString::fromLatin1(widget) << QByteArray{property} << value;
    };
    row("FMain", "windowTitle", QStringLiteral("Configure DHCP server"));
    row("swMode", "count", 1);
    row("swMode", "currentIndex", 0);
    row("mainTabWidget", "count", 2);
    row("mainTabWidget", "currentIndex", 0);
    row("topologyTree", "contextMenuPolicy", int{Qt::CustomContextMenu});
    row("searchLease", "placeholderText", QStringLiteral("Search"));
    row("searchLease", "clearButtonEnabled", true);
    row("searchPrevLease", "text", QStringLiteral("..."));
    row("searchPrevLease", "autoRaise", true);
    row("searchPrevLease", "enabled", false);
    row("searchNextLease", "text", QStringLiteral("..."));
    row("searchNextLease", "autoRaise", true);
    row("searchNextLease", "enabled", false);
    row("dhcpdLeaseTable", "selectionMode", int{QAbstractItemView::SingleSelection});
    row("dhcpdLeaseTable", "selectionBehavior", int{QAbstractItemView::SelectRows});
    row("dhcpdLeaseTable", "contextMenuPolicy", int{Qt::CustomContextMenu});
    row("menu_File", "title", QStringLiteral("&File"));
    row("menuServer", "title", QStringLiteral("Server"));
    row("toolBar", "windowTitle", QStringLiteral("toolBar"));
}

void MainWindowTest::propertiesOfWidgets()
{
    QFETCH(QString, widget);
    QFETCH(QByteArray, property);
    QFETCH(QVariant, value);
    const auto window = m_machine->openWindow();
    const auto *found = widget == window->objectName() ? window.get() : window->findChild<QWidget *>(widget);
    QVERIFY(found);
    const QVariant actual{found->property(property.constData())};
    if (value.userType() == QMetaType::Int)
        QCOMPARE(actual.toInt(), value.toInt()); // of an enumeration, whose text Qt 6 takes from its names
    else
        QCOMPARE(actual.toString(), value.toString());
}

void MainWindowTest::actions_data()
{
    QTest::addColumn<int>("number");
    for (std::size_t i{0}; i < std::size(actionTable); ++i)
        QTest::addRow("%s", actionTable[i].name) << static_cast<int>(i);
}

void MainWindowTest::actions()
{
    QFETCH(int, number);
    const ActionRow &row{actionTable[number]};
    const IconTheme theme;
    m_machine->systemctl().setState(FakeSystemctl::NoSuchUnit); // so that no state changes a text
    const FMain window;

    const QAction *action{actionOf(window, row.name)};
    QVERIFY(action);
    QCOMPARE(action->text(), QString::fromLatin1(row.text));
    QCOMPARE(action->toolTip(), QString::fromLatin1(row.toolTip));
    QCOMPARE(action->shortcut(), QKeySequence{QString::fromLatin1(row.shortcut)});
    QCOMPARE(action->icon().name(), QString::fromLatin1(row.icon));
    QVERIFY(!action->icon().isNull());
}

void MainWindowTest::actionsComeInOrder()
{
    const FMain window;
    QStringList names{namesOf(window.findChildren<QAction *>(QString{}, Qt::FindDirectChildrenOnly))};
    names.removeAll({});
    QStringList expected;
    for (const ActionRow &row : actionTable)
        expected.append(QString::fromLatin1(row.name));
    QCOMPARE(names, expected);
}

void MainWindowTest::missingIconLeavesNone()
{
    const IconTheme theme;
    QIcon::setThemeName(QStringLiteral("no-such-theme"));
    const FMain window;
    for (const ActionRow &row : actionTable)
        QVERIFY2(actionOf(window, row.name)->icon().isNull(), row.name);
}

void MainWindowTest::menusAndToolBar()
{
    const FMain window;
    const auto actionsIn = [&window](const char *name) {
        return namesOf(window.findChild<QWidget *>(QString::fromLatin1(name))->actions()).join(QLatin1Char{' '});
    };
    QCOMPARE(actionsIn("menu_File"), QStringLiteral("aReload aSave - aExit"));
    QCOMPARE(actionsIn("menuServer"), QStringLiteral("actionStartStopServer actionRestart - actionInterfaces"));
    QCOMPARE(actionsIn("toolBar"), QStringLiteral("actionStartStopServer actionRestart - aSave aReload - "
                                                  "aAddSharedNetwork aAddSubnet aAddHost"));

    const QList<QAction *> menus{window.menuBar()->actions()};
    QCOMPARE(menus.size(), 3);
    QCOMPARE(menus.at(0)->menu()->objectName(), QStringLiteral("menu_File"));
    QCOMPARE(menus.at(1)->menu()->objectName(), QStringLiteral("menuServer"));
    const auto *help = qobject_cast<OrvHelpMenu *>(menus.at(2)->menu());
    QVERIFY(help);
    QCOMPARE(help->parent(), &window);
    QCOMPARE(window.toolBarArea(window.findChild<QToolBar *>(QStringLiteral("toolBar"))), Qt::TopToolBarArea);
    QCOMPARE(window.menuBar()->objectName(), QStringLiteral("menubar"));

    const auto *tabs = window.findChild<QTabWidget *>(QStringLiteral("mainTabWidget"));
    QCOMPARE(tabs->tabText(0), QStringLiteral("Topology"));
    QCOMPARE(tabs->tabText(1), QStringLiteral("Leases"));
    const auto *label = statusLabelOf(window);
    QVERIFY(label);
    QCOMPARE(label->indent(), 5);
}

void MainWindowTest::slotCanBeInvoked_data()
{
    QTest::addColumn<QByteArray>("signature");
    for (const char *signature : {
             "reload()",
             "leaseReload()",
             "save()",
             "configChanged()",
             "getInterfaces()",
             "startStopServer()",
             "handleServerStateChanged(DhcpServerManager::ServerStates)",
             "handleTreeContextMenuRequested(QPoint)",
             "handleTreeDoubleClicked(QModelIndex)",
             "handleAddArbitraryDeclaration()",
             "handleEditArbitraryDeclaration()",
             "handleAddArbitraryParam()",
             "handleEditArbitraryParam()",
             "handleAddSharedNetwork()",
             "handleEditSharedNetwork()",
             "handleAddSubnet()",
             "handleEditSubnet()",
             "handleAddRange()",
             "handleEditRange()",
             "handleAddHost()",
             "handleEditHost()",
             "handleAddFixedAddress()",
             "handleEditFixedAddress()",
             "handleAddRouters()",
             "handleEditRouters()",
             "handleAddDns()",
             "handleEditDns()",
             "handleAddNtp()",
             "handleEditNtp()",
             "handleAddDomainName()",
             "handleEditDomainName()",
             "handleAddMaxLeaseTime()",
             "handleEditMaxLeaseTime()",
             "handleAddDefaultLeaseTime()",
             "handleEditDefaultLeaseTime()",
             "handleEditMacAddress()",
             "handleEdit()",
             "handleAddStaticRoute()",
             "handleEditStaticRoute()",
             "handleAddBind9Settings()",
             "handleTreeItemChanged(QModelIndex)",
             "handleTableContextMenuRequested(QPoint)",
             "handleReserveIp()",
             "handleTableDoubleClicked(QModelIndex)",
             "currentTabChanged(int)",
             "searchLease(QString)",
             "selectNextLease()",
             "selectPrevLease()",
         })
        QTest::addRow("%s", signature) << QByteArray{signature};
}

void MainWindowTest::slotCanBeInvoked()
{
    QFETCH(QByteArray, signature);
    const QMetaObject &type{FMain::staticMetaObject};
    const int index{type.indexOfMethod(signature.constData())};
    QVERIFY(index >= 0);
    QCOMPARE(type.method(index).methodType(), QMetaMethod::Slot);
    QCOMPARE(QByteArray{type.method(index).typeName()}, QByteArray{"void"});
}

void MainWindowTest::actionOpensItsWindows_data()
{
    QTest::addColumn<Place>("current");
    QTest::addColumn<QStringList>("windows");

    const auto row = [](const char *action, const Place &current, const QStringList &windows) {
        QTest::addRow("%s", action) << current << windows;
    };
    const QString information{QStringLiteral("Information")};
    const QString warning{QStringLiteral("Warning!")};
    row("aReload", root, {information});
    row("aSave", root, {information});
    row("actionInterfaces", root, {QStringLiteral("Select interfaces")});
    row("aAddSubnet", root, {QStringLiteral("Add subnet")});
    row("aAddSharedNetwork", root, {QStringLiteral("Add shared network")});
    row("aAddHost", root, {QStringLiteral("Add host")});
    row("aAddRange", subnet, {QStringLiteral("Add range")});
    row("aAddParam", root, {warning, QStringLiteral("Add arbitrary parameter")});
    row("aAddDeclaration", root, {warning, QStringLiteral("Add arbitrary declaration")});
    row("actionEdit", subnet, {QStringLiteral("Edit subnet")});
    row("aAddFixedIp", host, {QStringLiteral("Add fixed address")});
    row("aAddDns", root, {QStringLiteral("Add DNS servers")});
    row("aAddDomainName", root, {QStringLiteral("Add domain name")});
    row("aAddRouters", root, {QStringLiteral("Add gateways")});
    row("aAddNtpServers", root, {QStringLiteral("Add NTP servers")});
    row("aAddDefaultLeaseTime", root, {QStringLiteral("Add default lease time")});
    row("aAddMaxLeaseTime", root, {QStringLiteral("Add max lease time")});
    row("aAddReserveIP", root, {QStringLiteral("Reserve an IP address")});
    row("aAddStaticRoute", root, {QStringLiteral("Add static route")});
    row("aAddDHCPDynamicUpdate", root, {information});
}

void MainWindowTest::actionOpensItsWindows()
{
    QFETCH(Place, current);
    QFETCH(QStringList, windows);
    m_machine->programs().install(QStringLiteral("dpkg-query"), "echo installed 1:9.18\n");
    const auto window = m_machine->openWindow();
    tableOf(*window)->setCurrentIndex(tableOf(*window)->model()->index(0, 0));
    click(treeOf(*window), current);
    QAction *action{actionOf(*window, QTest::currentDataTag())};
    action->setEnabled(true); // when it is enabled is for another test

    ModalBoxes boxes;
    QStringList opened;
    for (int i{0}; i < windows.size(); ++i) {
        const bool goOn{i + 1 < windows.size()};
        boxes.expectDialog<QDialog>([&opened, goOn](QDialog *dialog) {
            opened.append(dialog->windowTitle());
            QTest::keyClick(dialog, goOn ? Qt::Key_Return : Qt::Key_Escape);
        });
    }
    action->trigger();
    boxes.verify();
    QCOMPARE(opened, windows);
}

void MainWindowTest::exitClosesTheWindow()
{
    const auto window = m_machine->openWindow();
    actionOf(*window, "aExit")->trigger();
    QVERIFY(!window->isVisible());
}

void MainWindowTest::removeTakesTheCurrentStatementAway()
{
    const auto window = m_machine->openWindow();
    QTreeView *tree{treeOf(*window)};
    const int count{tree->model()->rowCount(indexOf(tree, root))};
    click(tree, sharedNetwork);
    actionOf(*window, "actionRemove")->trigger();
    QCOMPARE(tree->model()->rowCount(indexOf(tree, root)), count - 1);
}

void MainWindowTest::headersOfTheTree()
{
    const FMain window;
    const QAbstractItemModel *model{treeOf(window)->model()};
    QCOMPARE(model->columnCount(), 2);
    QCOMPARE(model->headerData(0, Qt::Horizontal).toString(), QStringLiteral("Topology"));
    QCOMPARE(model->headerData(1, Qt::Horizontal).toString(), QStringLiteral("Value"));
}

void MainWindowTest::rowsOfTheTreeAreEquallyTall()
{
    // With the sign that Unicode has for a line break.
    writeTestFile(paths::configuration(), configuration + "option motd \"one\xe2\x80\xa8two\xe2\x80\xa8three\";\n");
    const auto window = m_machine->openWindow();
    const QTreeView *tree{treeOf(*window)};
    const QRect first{tree->visualRect(indexOf(tree, root))};
    QVERIFY(first.height() >= tree->fontMetrics().height());
    QVERIFY(first.height() < 2 * tree->fontMetrics().height());
    int rows{0};
    for (QModelIndex index{indexOf(tree, root)}; index.isValid(); index = tree->indexBelow(index)) {
        const QRect row{tree->visualRect(index)};
        QCOMPARE(row.height(), first.height());
        QCOMPARE(row.top(), first.top() + rows * first.height());
        ++rows;
    }
    QVERIFY(rows > 5);
}

void MainWindowTest::modelsAndTheirParents()
{
    const FMain window;
    QCOMPARE(treeOf(window)->model()->parent(), &window);
    const auto *proxy = qobject_cast<QSortFilterProxyModel *>(tableOf(window)->model());
    QVERIFY(proxy);
    QVERIFY(!proxy->parent());
    QVERIFY(qobject_cast<DhcpdLeasesModel *>(proxy->sourceModel()));
    QVERIFY(!proxy->sourceModel()->parent());
    for (int section{0}; section < proxy->columnCount(); ++section)
        QCOMPARE(tableOf(window)->horizontalHeader()->sectionResizeMode(section), QHeaderView::ResizeToContents);
}

void MainWindowTest::searchRowHasIcons()
{
    const IconTheme theme;
    const FMain window;
    const auto iconOf = [&window](const char *button) {
        return window.findChild<QToolButton *>(QString::fromLatin1(button))->icon().name();
    };
    QCOMPARE(iconOf("searchPrevLease"), QStringLiteral("previous"));
    QCOMPARE(iconOf("searchNextLease"), QStringLiteral("next"));
    const QList<QAction *> inField{window.findChild<QLineEdit *>(QStringLiteral("searchLease"))->actions()};
    QCOMPARE(inField.size(), 1);
    QCOMPARE(inField.first()->icon().name(), QStringLiteral("edit-find"));
}

void MainWindowTest::startsOnTheExpandedTopology()
{
    const auto window = m_machine->openWindow();
    const QTreeView *tree{treeOf(*window)};
    QVERIFY(!actionOf(*window, "aSave")->isEnabled());
    QCOMPARE(tree->currentIndex(), indexOf(tree, root));
    for (const Place &place : {root, sharedNetwork, innerSubnet, subnet, host})
        QVERIFY(tree->isExpanded(indexOf(tree, place)));
    const QAbstractItemView *view{tree};
    for (int section{0}; section < tree->header()->count(); ++section)
        QVERIFY(tree->header()->sectionSize(section) >= view->sizeHintForColumn(section));
    QCOMPARE(enabledAddActions(*window).size(), 3);
}

void MainWindowTest::selectionEnablesAddActions_data()
{
    QTest::addColumn<Place>("place");
    QTest::addColumn<QStringList>("enabled");
    QTest::addRow("all networks") << root
                                  << QStringList{QStringLiteral("aAddSharedNetwork"), QStringLiteral("aAddSubnet"),
                                                 QStringLiteral("aAddHost")};
    QTest::addRow("shared network") << sharedNetwork << QStringList{QStringLiteral("aAddSubnet")};
    QTest::addRow("subnet") << subnet << QStringList{};
    QTest::addRow("subnet of a shared network") << innerSubnet << QStringList{};
    QTest::addRow("host") << host << QStringList{};
    QTest::addRow("parameter") << defaultLeaseTime << QStringList{};
}

void MainWindowTest::selectionEnablesAddActions()
{
    QFETCH(Place, place);
    QFETCH(QStringList, enabled);
    const auto window = m_machine->openWindow();
    // Both from where nothing can be added and from where everything can.
    for (const Place &before : {defaultLeaseTime, root}) {
        click(treeOf(*window), before);
        click(treeOf(*window), place);
        QCOMPARE(enabledAddActions(*window), enabled);
        window->handleTreeItemChanged({});
        QCOMPARE(enabledAddActions(*window), enabled);
    }
}

void MainWindowTest::tabsEnableAddActions()
{
    const auto window = m_machine->openWindow();
    click(treeOf(*window), host);
    clickTab(*window, 1);
    QCOMPARE(enabledAddActions(*window), QStringList{});
    clickTab(*window, 0);
    QCOMPARE(enabledAddActions(*window).size(), 3); // whatever is current in the tree
    clickTab(*window, 1);
    QCOMPARE(enabledAddActions(*window), QStringList{});
}

void MainWindowTest::leasesTabReadsTheFileEachTime()
{
    // A directory that is not there at the start is not watched.
    QVERIFY(QDir{paths::leaseDirectory()}.removeRecursively());
    const auto window = m_machine->openWindow();
    QVERIFY(QDir{}.mkpath(paths::leaseDirectory()));
    QByteArray leases;
    for (int round{1}; round <= 3; ++round) {
        leases += lease("10.0.1." + QByteArray::number(round));
        writeTestFile(paths::leases(), leases);
        QCOMPARE(tableOf(*window)->model()->rowCount(), round - 1);
        clickTab(*window, 1);
        QCOMPARE(tableOf(*window)->model()->rowCount(), round);
        clickTab(*window, 0);
    }
}

void MainWindowTest::saveFollowsUnsavedChanges()
{
    const auto window = m_machine->openWindow();
    click(treeOf(*window), host);
    QVERIFY(!actionOf(*window, "aSave")->isEnabled());
    actionOf(*window, "actionRemove")->trigger();
    QVERIFY(actionOf(*window, "aSave")->isEnabled());

    ModalBoxes boxes;
    boxes.expectDialog<QMessageBox>([](QMessageBox *box) { QTest::keyClick(box, Qt::Key_Return); });
    QTest::keyClick(window.get(), Qt::Key_S, Qt::ControlModifier);
    boxes.verify();
    QVERIFY(!actionOf(*window, "aSave")->isEnabled());
}

void MainWindowTest::serverStateIsShown_data()
{
    QTest::addColumn<FakeSystemctl::State>("state");
    QTest::addColumn<QString>("label");
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("toolTip");
    QTest::addColumn<QString>("icon");
    const QString start{QStringLiteral("Start DHCP-server")};
    const QString stop{QStringLiteral("Stop DHCP-server")};
    QTest::addRow("running") << FakeSystemctl::Running << QStringLiteral("DHCP-server is running") << stop << stop
                             << QStringLiteral("media-playback-stop");
    QTest::addRow("stopped") << FakeSystemctl::Stopped << QStringLiteral("DHCP-server is stopped") << start << start
                             << QStringLiteral("media-playback-start");
    QTest::addRow("failed") << FakeSystemctl::Failed << QStringLiteral("DHCP-server is stopped") << start << start
                            << QStringLiteral("media-playback-start");
    QTest::addRow("unknown") << FakeSystemctl::NoSuchUnit << QStringLiteral("Updating DHCP-server status...") << start
                             << QStringLiteral("Start or stop DHCP-server") << QStringLiteral("media-playback-start");
}

void MainWindowTest::serverStateIsShown()
{
    QFETCH(FakeSystemctl::State, state);
    const IconTheme theme;
    m_machine->systemctl().setState(state);
    const FMain window;
    const QAction *action{actionOf(window, "actionStartStopServer")};
    QTEST(statusLabelOf(window)->text(), "label");
    QTEST(action->text(), "text");
    QTEST(action->toolTip(), "toolTip");
    QTEST(action->icon().name(), "icon");
    QVERIFY(action->isEnabled());
    QCOMPARE(m_machine->systemctl().verbs(), QStringList{QStringLiteral("status")});
}

void MainWindowTest::unknownServerStateLeavesTheAction()
{
    const IconTheme theme;
    FMain window;
    statusLabelOf(window)->clear();
    const QAction *action{actionOf(window, "actionStartStopServer")};
    window.handleServerStateChanged(static_cast<DhcpServerManager::ServerStates>(7));
    QVERIFY(action->isEnabled());
    QCOMPARE(action->text(), QStringLiteral("Start DHCP-server"));
    QCOMPARE(action->icon().name(), QStringLiteral("media-playback-start"));
    QCOMPARE(statusLabelOf(window)->text(), QStringLiteral("DHCP-server is stopped"));
}

void MainWindowTest::serverIsStartedRestartedAndStopped()
{
    const auto window = m_machine->openWindow();
    const QAction *action{actionOf(*window, "actionStartStopServer")};
    const QLabel *label{statusLabelOf(*window)};

    QTest::keyClick(window.get(), Qt::Key_R, Qt::ControlModifier);
    QTRY_COMPARE(label->text(), QStringLiteral("DHCP-server is running"));
    QCOMPARE(action->text(), QStringLiteral("Stop DHCP-server"));
    auto *toolBar = window->findChild<QToolBar *>(QStringLiteral("toolBar"));
    QTest::mouseClick(toolBar->widgetForAction(actionOf(*window, "actionRestart")), Qt::LeftButton);
    QCOMPARE(label->text(), QStringLiteral("Updating DHCP-server status..."));
    QTRY_COMPARE(label->text(), QStringLiteral("DHCP-server is running"));
    QTest::keyClick(window.get(), Qt::Key_R, Qt::ControlModifier);
    QTRY_COMPARE(label->text(), QStringLiteral("DHCP-server is stopped"));
    QCOMPARE(action->text(), QStringLiteral("Start DHCP-server"));

    QStringList commands{m_machine->systemctl().verbs()};
    commands.removeAll(QStringLiteral("status"));
    QCOMPARE(commands, (QStringList{QStringLiteral("start"), QStringLiteral("restart"), QStringLiteral("stop")}));
    for (const QStringList &call : m_machine->systemctl().calls())
        QCOMPARE(call.mid(1), QStringList{QStringLiteral("isc-dhcp-server")});
}

void MainWindowTest::operationUnderWayIsShown()
{
    m_machine->systemctl().hold(QStringLiteral("start"));
    const auto window = m_machine->openWindow();
    const QAction *action{actionOf(*window, "actionStartStopServer")};
    QTest::keyClick(window.get(), Qt::Key_R, Qt::ControlModifier);
    QVERIFY(!action->isEnabled());
    QCOMPARE(statusLabelOf(*window)->text(), QStringLiteral("Updating DHCP-server status..."));

    ModalBoxes boxes;
    boxes.expectBox(errorBox(QStringLiteral("Some operation with DHCP-server already executes")), QMessageBox::Ok);
    actionOf(*window, "actionRestart")->trigger();
    boxes.verify();

    m_machine->systemctl().release(QStringLiteral("start"));
    QTRY_VERIFY(action->isEnabled());
    QCOMPARE(statusLabelOf(*window)->text(), QStringLiteral("DHCP-server is running"));
}

void MainWindowTest::serverMessagesAreShownInBoxes()
{
    const auto window = m_machine->openWindow();
    ModalBoxes boxes;
    m_machine->systemctl().setReply(QStringLiteral("start"), {{}, "Job failed.\n", 1, {}, 0});
    boxes.expectBox(errorBox(QStringLiteral("Operation with DHCP-server failed\nJob failed.\n")), QMessageBox::Ok);
    QTest::keyClick(window.get(), Qt::Key_R, Qt::ControlModifier);
    boxes.verify();
    QTRY_COMPARE(statusLabelOf(*window)->text(), QStringLiteral("DHCP-server is stopped"));

    m_machine->systemctl().setState(FakeSystemctl::Running); // started by somebody else
    boxes.expectBox(informationBox(QStringLiteral("DHCP-server already running")), QMessageBox::Ok);
    QTest::keyClick(window.get(), Qt::Key_R, Qt::ControlModifier);
    boxes.verify();
}

void MainWindowTest::boxesBelongToTheWindow()
{
    const auto window = m_machine->openWindow();
    QVERIFY(QFile::remove(paths::configuration()));
    ModalBoxes boxes;
    boxes.expectDialog<QMessageBox>([](QMessageBox *box) { QTest::keyClick(box, Qt::Key_Return); });
    boxes.expectDialog<QMessageBox>([&window](QMessageBox *box) {
        QCOMPARE(box->windowTitle(), QStringLiteral("Error"));
        QCOMPARE(box->parent(), window.get());
        QTest::keyClick(box, Qt::Key_Return);
    });
    QTest::keyClick(window.get(), Qt::Key_F5);
    boxes.verify();

    m_machine->systemctl().setState(FakeSystemctl::Running);
    boxes.expectDialog<QMessageBox>([&window](QMessageBox *box) {
        QCOMPARE(box->windowTitle(), QStringLiteral("Information"));
        QCOMPARE(box->parent(), window.get());
        QTest::keyClick(box, Qt::Key_Return);
    });
    QTest::keyClick(window.get(), Qt::Key_R, Qt::ControlModifier);
    boxes.verify();
}

void MainWindowTest::dynamicUpdateNeedsBind9_data()
{
    QTest::addColumn<QByteArray>("answer");
    QTest::addColumn<bool>("enabled");
    QTest::addRow("installed") << QByteArray{"echo installed 1:9.18.33\n"} << true;
    QTest::addRow("removed") << QByteArray{"echo config-files 1:9.18.33\n"} << false;
    QTest::addRow("unknown") << QByteArray{"exit 1\n"} << false;
}

void MainWindowTest::dynamicUpdateNeedsBind9()
{
    QFETCH(QByteArray, answer);
    QFETCH(bool, enabled);
    const QByteArray record{"printf '%s\\n' \"$*\" >>\"${0%/*}/asked\"\n"};
    const QByteArray opposite{enabled ? "exit 1\n" : "echo installed 1:9.18.33\n"};
    m_machine->programs().install(QStringLiteral("dpkg-query"), record + answer);
    const auto window = m_machine->openWindow();
    const QAction *action{actionOf(*window, "aAddDHCPDynamicUpdate")};
    QCOMPARE(action->isEnabled(), enabled);

    // Installing or removing the package later changes nothing.
    m_machine->programs().install(QStringLiteral("dpkg-query"), record + opposite);
    click(treeOf(*window), subnet);
    clickTab(*window, 1);
    clickTab(*window, 0);
    ModalBoxes boxes;
    boxes.expectDialog<QMessageBox>([](QMessageBox *box) { QTest::keyClick(box, Qt::Key_Return); });
    QTest::keyClick(window.get(), Qt::Key_F5);
    boxes.verify();
    QCOMPARE(action->isEnabled(), enabled);
    const QByteArray asked{readTestFile(m_machine->programs().file(QStringLiteral("asked")))};
    QCOMPARE(asked.count('\n'), 1);
    QVERIFY(asked.endsWith(" bind9\n"));
}

void MainWindowTest::watchesFilesAndTheirDirectories()
{
    const FMain window;
    QList<QStringList> watched;
    const auto watchers = window.findChildren<QFileSystemWatcher *>(QString{}, Qt::FindDirectChildrenOnly);
    for (const QFileSystemWatcher *watcher : watchers)
        watched.append(watcher->files() + watcher->directories());
    const QList<QStringList> expected{
        {paths::configuration()}, {paths::configurationDirectory()}, {paths::leases()}, {paths::leaseDirectory()}};
    QCOMPARE(watched, expected);
}

void MainWindowTest::sizeIsTheFormsAtFirst()
{
    const FMain window;
    QCOMPARE(window.size(), QSize(960, 640));
}

void MainWindowTest::firstSizeFitsTheScreen()
{
    const QSize screen{QGuiApplication::primaryScreen()->availableSize()};
    QVERIFY(screen.width() < 960); // the form's
    const auto window = m_machine->openWindow();
    QCOMPARE(window->width(), screen.width());
    QVERIFY(window->frameGeometry().height() <= screen.height());
}

void MainWindowTest::sizeIsRestored_data()
{
    QTest::addColumn<QSize>("size");
    QTest::addRow("usual") << QSize{1100, 700};
    QTest::addRow("larger than the screen") << QGuiApplication::primaryScreen()->size() * 3;
}

void MainWindowTest::sizeIsRestored()
{
    QFETCH(QSize, size);
    QSettings{}.setValue(QStringLiteral("MainWindow/Size"), size);
    const auto window = m_machine->openWindow();
    QCOMPARE(window->size(), size);
}

void MainWindowTest::sizeIsStoredAtTheEndOnly()
{
    const QString key{QStringLiteral("MainWindow/Size")};
    auto window = m_machine->openWindow();
    window->resize(1010, 710);
    window->close();
    QVERIFY(!QSettings{}.contains(key));
    window.reset();
    QCOMPARE(QSettings{}.value(key).toSize(), QSize(1010, 710));
    QCOMPARE(QSettings{}.allKeys(), QStringList{key});
}

void MainWindowTest::configurationThatCannotBeReadIsReported_data()
{
    QTest::addColumn<bool>("directory");
    QTest::addRow("missing") << false;
    QTest::addRow("directory in its place") << true;
}

void MainWindowTest::configurationThatCannotBeReadIsReported()
{
    QFETCH(bool, directory);
    QVERIFY(QFile::remove(paths::configuration()));
    if (directory)
        QVERIFY(QDir{}.mkpath(paths::configuration()));
    ModalBoxes boxes;
    boxes.expectBox(directory ? cannotRead(text("Is a directory")) : cannotRead(), QMessageBox::Ok);
    const FMain window;
    boxes.verify();
    QCOMPARE(treeOf(window)->model()->rowCount(), 0);
    QVERIFY(!treeOf(window)->currentIndex().isValid());
    QVERIFY(!actionOf(window, "aSave")->isEnabled());
    QCOMPARE(tableOf(window)->model()->rowCount(), 1);
}

void MainWindowTest::missingLeaseFileIsAnEmptyTable()
{
    QVERIFY(QFile::remove(paths::leases()));
    const ModalBoxes noBox;
    const auto window = m_machine->openWindow();
    QCOMPARE(tableOf(*window)->model()->rowCount(), 0);
    QCOMPARE(tableOf(*window)->model()->columnCount(), 6);
    clickTab(*window, 1);
    QCOMPARE(tableOf(*window)->model()->rowCount(), 0);
}

QTEST_MAIN(MainWindowTest)
#include "tst_mainwindow.moc"
