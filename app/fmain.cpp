// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/fmain.h"

#include "app/pathwatch.h"
#include "app/topologymenus.h"
#include "app/treeexpansion.h"
#include "common/paths.h"
#include "config/dhcpdconfigdeclaration.h"
#include "config/dhcpdconfigmodel.h"
#include "leases/dhcpdleasesmodel.h"
#include "leases/leaseproxymodel.h"
#include "platform/orvhelpmenu.h"
#include "platform/packagemanager.h"
#include "ui_fmain.h"

#include <QGuiApplication>
#include <QHeaderView>
#include <QLabel>
#include <QMenu>
#include <QMessageBox>
#include <QSettings>

namespace {

constexpr int statusIndent = 5;
constexpr int measuredRows = 50; // of the lease table, for the widths of its columns
constexpr auto sizeKey = "MainWindow/Size";

/// An action of the form, its theme icon, and the slot of the window that it triggers (none when another object's).
struct ActionRow
{
    QAction *Ui::FMain::*action;
    const char *icon;
    void (FMain::*slot)();
};

// The "Edit" action deliberately carries the "list-add" icon.
const ActionRow actionTable[] = {
    {&Ui::FMain::aReload, "view-refresh", &FMain::reload},
    {&Ui::FMain::aSave, "document-save", &FMain::save},
    {&Ui::FMain::aExit, "application-exit", nullptr},
    {&Ui::FMain::actionRestart, "view-restore", nullptr},
    {&Ui::FMain::actionInterfaces, "configure", &FMain::getInterfaces},
    {&Ui::FMain::actionStartStopServer, "media-playback-start", &FMain::startStopServer},
    {&Ui::FMain::aAddSubnet, "preferences-system-network", &FMain::handleAddSubnet},
    {&Ui::FMain::aAddSharedNetwork, "network", &FMain::handleAddSharedNetwork},
    {&Ui::FMain::aAddHost, "computer", &FMain::handleAddHost},
    {&Ui::FMain::aAddRange, "preferences-system-network", &FMain::handleAddRange},
    {&Ui::FMain::aAddParam, "configure", &FMain::handleAddArbitraryParam},
    {&Ui::FMain::aAddDeclaration, "preferences-system-network", &FMain::handleAddArbitraryDeclaration},
    {&Ui::FMain::actionEdit, "list-add", &FMain::handleEdit},
    {&Ui::FMain::actionRemove, "list-remove", nullptr},
    {&Ui::FMain::aAddFixedIp, "preferences-system-network", &FMain::handleAddFixedAddress},
    {&Ui::FMain::aAddDns, "configure", &FMain::handleAddDns},
    {&Ui::FMain::aAddDomainName, "configure", &FMain::handleAddDomainName},
    {&Ui::FMain::aAddRouters, "configure", &FMain::handleAddRouters},
    {&Ui::FMain::aAddNtpServers, "configure", &FMain::handleAddNtp},
    {&Ui::FMain::aAddDefaultLeaseTime, "configure", &FMain::handleAddDefaultLeaseTime},
    {&Ui::FMain::aAddMaxLeaseTime, "configure", &FMain::handleAddMaxLeaseTime},
    {&Ui::FMain::aAddReserveIP, "computer", &FMain::handleReserveIp},
    {&Ui::FMain::aAddStaticRoute, "computer", &FMain::handleAddStaticRoute},
    {&Ui::FMain::aAddDHCPDynamicUpdate, "configure", &FMain::handleAddBind9Settings},
};

QIcon themeIcon(const char *name) { return QIcon::fromTheme(QLatin1String{name}); }

} // namespace

FMain::FMain(QWidget *parent)
    : QMainWindow{parent}
    , m_ui{std::make_unique<Ui::FMain>()}
{
    m_ui->setupUi(this);
    m_ui->menubar->addMenu(new OrvHelpMenu{this});
    setUpActions();
    setUpServer();
    setUpTopology();
    setUpLeases();
    m_topologyMenus = std::make_unique<TopologyMenus>(*m_ui, this);
    setUpSearch();
    connect(m_ui->mainTabWidget, &QTabWidget::currentChanged, this, &FMain::currentTabChanged);
    restoreSize();
}

FMain::~FMain() { QSettings{}.setValue(QLatin1String{sizeKey}, size()); }

void FMain::setUpActions()
{
    for (const ActionRow &row : actionTable) {
        QAction *action = m_ui.get()->*row.action;
        action->setIcon(themeIcon(row.icon));
        if (row.slot)
            connect(action, &QAction::triggered, this, row.slot);
    }
    connect(m_ui->aExit, &QAction::triggered, this, &FMain::close);
    connect(m_ui->actionRemove, &QAction::triggered, this, &FMain::removeCurrentStatement);
}

void FMain::setUpServer()
{
    m_statusLabel = new QLabel{this};
    m_statusLabel->setIndent(statusIndent);
    m_ui->statusBar->addWidget(m_statusLabel);

    m_serverManager = std::make_unique<DhcpServerManager>(nullptr);
    m_statusLabel->setText(m_serverManager->serverStateText());
    DhcpServerManager *manager = m_serverManager.get();
    connect(manager, &DhcpServerManager::error, this, &FMain::showError);
    connect(manager, &DhcpServerManager::information, this, &FMain::showInformation);
    connect(manager, &DhcpServerManager::serverStateChanged, this, &FMain::handleServerStateChanged);
    connect(m_ui->actionRestart, &QAction::triggered, manager, &DhcpServerManager::restartServer);
    manager->checkRunning();
}

void FMain::setUpTopology()
{
    m_configModel = new DhcpdConfigModel{{tr("Topology"), tr("Value")}, this};
    connect(m_configModel, &DhcpdConfigModel::error, this, &FMain::showError);
    connect(m_configModel, &DhcpdConfigModel::dataChanged, this,
            [this] { m_ui->aSave->setEnabled(m_configModel->isModified()); });

    m_configModel->read();
    QTreeView *tree = m_ui->topologyTree;
    tree->setModel(m_configModel);
    m_treeExpansion = new TreeExpansion{tree};
    connect(tree->selectionModel(), &QItemSelectionModel::currentRowChanged, this, &FMain::handleTreeItemChanged);
    showWholeTopology();
    tree->setContextMenuPolicy(Qt::CustomContextMenu);
    connect(tree, &QTreeView::customContextMenuRequested, this, &FMain::handleTreeContextMenuRequested);
    connect(tree, &QTreeView::doubleClicked, this, &FMain::handleTreeDoubleClicked);

    m_configWatch = new PathWatch{paths::configuration(), paths::configurationDirectory(), this};
    connect(m_configWatch, &PathWatch::changed, this, &FMain::configChanged);

    m_bind9Versions = OrvAdmin::PackageManager::getInstalledPackagesVersions(QStringLiteral("bind9"));
    m_ui->aAddDHCPDynamicUpdate->setEnabled(!m_bind9Versions.isEmpty());
}

void FMain::setUpLeases()
{
    m_leaseWatch = new PathWatch{paths::leases(), paths::leaseDirectory(), this};
    connect(m_leaseWatch, &PathWatch::changed, this, &FMain::leaseReload);

    // The model's error signal is deliberately not connected: a missing lease file is an empty table, not a message.
    m_leasesModel = std::make_unique<DhcpdLeasesModel>(nullptr);
    readLeases();

    QTableView *table = m_ui->dhcpdLeaseTable;
    table->setSelectionMode(QAbstractItemView::SingleSelection);
    table->setSelectionBehavior(QAbstractItemView::SelectRows);
    table->setContextMenuPolicy(Qt::CustomContextMenu);
    table->horizontalHeader()->setSectionResizeMode(QHeaderView::ResizeToContents);
    table->horizontalHeader()->setResizeContentsPrecision(measuredRows);
    table->verticalHeader()->setDefaultSectionSize(table->verticalHeader()->minimumSectionSize());
    connect(table, &QTableView::customContextMenuRequested, this, &FMain::handleTableContextMenuRequested);
    connect(table, &QTableView::doubleClicked, this, &FMain::handleTableDoubleClicked);

    m_leaseMenu = new QMenu{tr("Actions"), this};
    m_leaseMenu->addAction(m_ui->aAddReserveIP);
    // Queued: the menu hides before it triggers what was chosen.
    connect(
        m_leaseMenu, &QMenu::aboutToHide, this, [this] { m_menuLease.reset(); }, Qt::QueuedConnection);

    m_leaseProxy = std::make_unique<LeaseProxyModel>(nullptr);
    m_leaseProxy->setSourceModel(m_leasesModel.get());
    m_leaseProxy->setFilterKeyColumn(-1);
    table->setModel(m_leaseProxy.get());
}

void FMain::setUpSearch()
{
    m_ui->searchLease->addAction(themeIcon("edit-find"), QLineEdit::LeadingPosition)->setText(tr("Search"));
    m_ui->searchLease->setClearButtonEnabled(true);
    // Qt leaves its button without a text that could be said.
    if (auto *clear = m_ui->searchLease->findChild<QAction *>(QStringLiteral("_q_qlineeditclearaction")))
        clear->setText(tr("Clear the search"));
    connect(m_ui->searchLease, &QLineEdit::textChanged, this, &FMain::searchLease);

    struct StepButton
    {
        QToolButton *button;
        const char *icon;
        void (FMain::*slot)();
    };
    for (const StepButton &step : {StepButton{m_ui->searchPrevLease, "previous", &FMain::selectPrevLease},
                                   StepButton{m_ui->searchNextLease, "next", &FMain::selectNextLease}}) {
        step.button->setIcon(themeIcon(step.icon));
        step.button->setAutoRaise(true);
        step.button->setEnabled(false);
        connect(step.button, &QToolButton::clicked, this, step.slot);
    }
}

void FMain::restoreSize() { resize(QSettings{}.value(QLatin1String{sizeKey}, size()).toSize()); }

void FMain::showError(const QString &text)
{
    if (m_heldErrors) {
        m_heldErrors->append(text);
        return;
    }
    // A failed load reports from under the busy cursor.
    QGuiApplication::setOverrideCursor(QCursor{Qt::ArrowCursor});
    QMessageBox::critical(this, tr("Error"), text, QMessageBox::Ok);
    QGuiApplication::restoreOverrideCursor();
}

void FMain::showInformation(const QString &text)
{
    QMessageBox::information(this, tr("Information"), text, QMessageBox::Ok);
}

void FMain::startStopServer()
{
    if (m_serverManager->isServerRunning())
        m_serverManager->stopServer();
    else
        m_serverManager->runServer();
}

void FMain::handleServerStateChanged(DhcpServerManager::ServerStates state)
{
    m_statusLabel->setText(m_serverManager->serverStateText());

    QAction *action = m_ui->actionStartStopServer;
    const auto offer = [action](const char *icon, const QString &text) {
        action->setEnabled(true);
        action->setIcon(themeIcon(icon));
        action->setText(text);
        action->setToolTip(text);
    };
    switch (state) {
    case DhcpServerManager::Running:
        offer("media-playback-stop", tr("Stop DHCP-server"));
        break;
    case DhcpServerManager::Stopped:
        offer("media-playback-start", tr("Start DHCP-server"));
        break;
    case DhcpServerManager::Updating:
        action->setEnabled(false);
        break;
    }
}

void FMain::handleTreeItemChanged(QModelIndex current)
{
    const auto *statement = static_cast<DhcpdConfigStatement *>(current.internalPointer());
    if (!statement || m_ui->mainTabWidget->currentIndex() != TopologyTab)
        return;
    const bool root = statement->isDeclaration() && statement->isRoot();
    const bool sharedNetwork = statement->isDeclaration() && statement->isSharedNetwork();
    m_ui->aAddSharedNetwork->setEnabled(root);
    m_ui->aAddSubnet->setEnabled(root || sharedNetwork);
    m_ui->aAddHost->setEnabled(root);
}

void FMain::currentTabChanged(int index)
{
    if (index != TopologyTab && index != LeasesTab)
        return;
    for (QAction *action : {m_ui->aAddHost, m_ui->aAddSubnet, m_ui->aAddSharedNetwork})
        action->setEnabled(index == TopologyTab);
    if (index == LeasesTab)
        readLeases();
}
