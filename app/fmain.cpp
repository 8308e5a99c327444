// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/fmain.h"

#include "app/commandguard.h"
#include "app/configurationfile.h"
#include "app/keyboardmenu.h"
#include "app/leasepage.h"
#include "app/plainmessagebox.h"
#include "app/servicecontrols.h"
#include "app/topologypage.h"
#include "common/fileio.h"
#include "common/paths.h"
#include "config/dhcpdconfigmodel.h"
#include "dialogs/spokenfocus.h"
#include "platform/orvhelpmenu.h"
#include "platform/packagemanager.h"
#include "ui_fmain.h"

#include <QApplication>
#include <QCloseEvent>
#include <QScreen>
#include <QSettings>
#include <QShortcut>
#include <QStyle>

namespace {

constexpr auto sizeKey = "MainWindow/Size";

/// An action of the form, its theme icon, and the slot of the window that it triggers (none when another object's).
struct ActionRow
{
    QAction *Ui::FMain::*action;
    const char *icon;
    void (FMain::*slot)();
};

// The "Edit" action deliberately carries the "list-add" icon.
const ActionRow actionTable[]{
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
    {&Ui::FMain::aAddReserveIP, "computer", &FMain::handleReserveIp},
    {&Ui::FMain::aAddStaticRoute, "computer", &FMain::handleAddStaticRoute},
    {&Ui::FMain::aAddDHCPDynamicUpdate, "configure", &FMain::handleAddBind9Settings},
};

} // namespace

FMain::FMain(QWidget *parent)
    : QMainWindow{parent}
    , m_ui{std::make_unique<Ui::FMain>()}
{
    m_ui->setupUi(this);
    m_ui->menubar->addMenu(new OrvHelpMenu{this});
    setUpActions();
    setUpService();
    setUpTopology();
    setUpLeases();
    setUpKeys();
    connect(m_ui->mainTabWidget, &QTabWidget::currentChanged, this, &FMain::currentTabChanged);
    resize(QSettings{}.value(QLatin1String{sizeKey}, size()).toSize());
}

FMain::~FMain() { QSettings{}.setValue(QLatin1String{sizeKey}, size()); }

void FMain::setUpActions()
{
    for (const ActionRow &row : actionTable) {
        QAction *action{m_ui.get()->*row.action};
        action->setIcon(QIcon::fromTheme(QLatin1String{row.icon}));
        if (row.slot)
            connect(action, &QAction::triggered, this, row.slot);
    }
    // Qt 6 takes a second close during the first one's question for its answer.
    connect(m_ui->aExit, &QAction::triggered, this, [this] {
        if (mayStartCommand())
            close();
    });
}

void FMain::setUpService()
{
    m_service = std::make_unique<ServiceControls>(*m_ui, this);
    DhcpServerManager *manager{&m_service->manager()};
    connect(manager, &DhcpServerManager::error, this,
            [this, manager](const QString &message) { showError(message, manager->errorReason()); });
    connect(manager, &DhcpServerManager::information, this, &FMain::showInformation);
    connect(manager, &DhcpServerManager::serverStateChanged, this, &FMain::handleServerStateChanged);
    manager->checkRunning();
}

void FMain::setUpTopology()
{
    m_configModel = new DhcpdConfigModel{{tr("Topology"), tr("Value")}, this};
    connect(m_configModel, &DhcpdConfigModel::error, this,
            [this](const QString &message) { showError(message, m_configModel->errorReason()); });
    connect(m_configModel, &DhcpdConfigModel::dataChanged, this,
            [this] { m_ui->aSave->setEnabled(m_configModel->isModified()); });
    m_file = std::make_unique<ConfigurationFile>(m_configModel, this);

    const QTreeView *tree{m_ui->topologyTree};
    m_topology = std::make_unique<TopologyPage>(*m_ui, m_configModel, this);
    connect(tree->selectionModel(), &QItemSelectionModel::currentRowChanged, this, &FMain::handleTreeItemChanged);
    connect(tree, &QTreeView::customContextMenuRequested, this, &FMain::handleTreeContextMenuRequested);
    connect(tree, &QTreeView::doubleClicked, this, &FMain::handleTreeDoubleClicked);
    connect(m_file.get(), &ConfigurationFile::reloaded, m_topology.get(), &TopologyPage::showAll);
    connect(m_topology.get(), &TopologyPage::requested, this,
            [this] { m_ui->mainTabWidget->setCurrentIndex(TopologyTab); });
    m_topology->showAll();

    const auto bind9Versions = OrvAdmin::PackageManager::getInstalledPackagesVersions(QStringLiteral("bind9"));
    m_ui->aAddDHCPDynamicUpdate->setEnabled(!bind9Versions.isEmpty());
}

void FMain::setUpLeases()
{
    m_leases = std::make_unique<LeasePage>(*m_ui, this);
    const QTableView *table{m_ui->dhcpdLeaseTable};
    connect(table, &QTableView::customContextMenuRequested, this, &FMain::handleTableContextMenuRequested);
    connect(table, &QTableView::doubleClicked, this, &FMain::handleTableDoubleClicked);
    connect(m_ui->searchLease, &QLineEdit::textChanged, this, &FMain::searchLease);
    connect(m_ui->searchPrevLease, &QToolButton::clicked, this, &FMain::selectPrevLease);
    connect(m_ui->searchNextLease, &QToolButton::clicked, this, &FMain::selectNextLease);
    connect(m_leases.get(), &LeasePage::reservationRequested, m_topology.get(), &TopologyPage::reserve);
}

// What the keyboard reaches beside the actions, whose own shortcuts are in the form.
void FMain::setUpKeys()
{
    const struct
    {
        QList<QKeySequence> keys;
        QWidget *widget; // which must have the keyboard; any in the window if this is the window
        void (FMain::*slot)();
    } shortcuts[]{
        {{Qt::Key_Return, Qt::Key_Enter, Qt::Key_F2}, m_ui->topologyTree, &FMain::handleEdit},
        {QKeySequence::keyBindings(QKeySequence::Copy), m_ui->dhcpdLeaseTable, &FMain::copyLease},
        {QKeySequence::keyBindings(QKeySequence::Find), this, &FMain::goToLeaseSearch},
    };
    for (const auto &[keys, widget, slot] : shortcuts) {
        for (const QKeySequence &key : keys) {
            auto *shortcut = new QShortcut{key, widget};
            shortcut->setContext(widget == this ? Qt::WindowShortcut : Qt::WidgetShortcut);
            // An open menu has the keyboard without Qt taking it from the widget below.
            connect(shortcut, &QShortcut::activated, this, [this, slot = slot] {
                if (!QApplication::activePopupWidget())
                    (this->*slot)();
            });
        }
    }
    connect(new KeyboardMenu{m_ui->topologyTree}, &KeyboardMenu::requested, this, &FMain::openTreeMenu);
    connect(new KeyboardMenu{m_ui->dhcpdLeaseTable}, &KeyboardMenu::requested, m_leases.get(), &LeasePage::openMenu);
    new SpokenFocus{m_ui->topologyTree};
    new SpokenFocus{m_ui->dhcpdLeaseTable};
}

void FMain::goToLeaseSearch()
{
    m_ui->mainTabWidget->setCurrentIndex(LeasesTab);
    m_ui->searchLease->setFocus();
    m_ui->searchLease->selectAll();
}

void FMain::reload()
{
    if (!mayStartCommand())
        return;
    if (m_ui->mainTabWidget->currentIndex() == LeasesTab) {
        m_leases->reload();
        return;
    }
    const auto answer =
        QMessageBox::information(this, tr("Information"), tr("Do you want to reload configuration from file?"),
                                 QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes);
    if (answer == QMessageBox::Yes)
        m_file->reload();
}

void FMain::save()
{
    if (mayStartCommand())
        m_file->save();
}

void FMain::closeEvent(QCloseEvent *event)
{
    if (!mayStartCommand()) {
        event->ignore();
        return;
    }
    if (!m_configModel->isModified()) {
        event->accept();
        return;
    }
    const auto answer = QMessageBox::question(this, tr("Confirmation"), tr("There are unsaved changes, save?"),
                                              QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel);
    if (answer == QMessageBox::Yes) {
        // The window closes whatever becomes of the save, deliberately; what could not be written is kept.
        const SaveResult result{m_file->save()};
        if (!result.unwritten.isNull())
            fileio::keepCopy(paths::configuration(), result.unwritten);
    }
    event->setAccepted(answer == QMessageBox::Yes || answer == QMessageBox::No);
}

void FMain::showEvent(QShowEvent *event)
{
    if (!event->spontaneous() && !QSettings{}.contains(QLatin1String{sizeKey})) {
        const QSize frame{0, style()->pixelMetric(QStyle::PM_TitleBarHeight)}; // about what goes around the window
        resize(size().boundedTo(screen()->availableSize() - frame));
    }
    QMainWindow::showEvent(event);
}

void FMain::showError(const QString &text, const QString &reason)
{
    PlainMessageBox box{QMessageBox::Critical, tr("Error"), text, QMessageBox::Ok, this};
    box.setPlainInformativeText(reason);
    // A failed load reports from under the busy cursor.
    QGuiApplication::setOverrideCursor(QCursor{Qt::ArrowCursor});
    box.exec();
    QGuiApplication::restoreOverrideCursor();
}

void FMain::showInformation(const QString &text)
{
    PlainMessageBox{QMessageBox::Information, tr("Information"), text, QMessageBox::Ok, this}.exec();
}

void FMain::currentTabChanged(int index)
{
    if (index != TopologyTab && index != LeasesTab)
        return;
    for (QAction *action : {m_ui->aAddHost, m_ui->aAddSubnet, m_ui->aAddSharedNetwork})
        action->setEnabled(index == TopologyTab);
    if (index == LeasesTab)
        m_leases->reload();
}

void FMain::handleTreeItemChanged(QModelIndex current)
{
    if (m_ui->mainTabWidget->currentIndex() == TopologyTab)
        m_topology->enableAddActions(current);
}

void FMain::configChanged() { m_file->noteChange(); }

void FMain::getInterfaces()
{
    if (mayStartCommand())
        m_service->chooseInterfaces();
}

void FMain::startStopServer()
{
    if (mayStartCommand())
        m_service->startOrStop();
}

void FMain::handleServerStateChanged(DhcpServerManager::ServerStates state) { m_service->showState(state); }

void FMain::handleTreeContextMenuRequested(QPoint /*position*/) { openTreeMenu(QCursor::pos()); }

void FMain::openTreeMenu(const QPoint &place)
{
    if (mayStartCommand())
        m_topology->openMenu(place);
}

void FMain::handleTreeDoubleClicked(QModelIndex index) { m_topology->edit(index); }

void FMain::handleEdit() { m_topology->editCurrent(); }

void FMain::handleAddArbitraryDeclaration() { m_topology->declarations().addArbitrary(); }

void FMain::handleEditArbitraryDeclaration() { m_topology->declarations().editArbitrary(); }

void FMain::handleAddArbitraryParam() { m_topology->parameters().addArbitrary(); }

void FMain::handleEditArbitraryParam() { m_topology->parameters().editArbitrary(); }

void FMain::handleAddSharedNetwork() { m_topology->declarations().addSharedNetwork(); }

void FMain::handleEditSharedNetwork() { m_topology->declarations().editSharedNetwork(); }

void FMain::handleAddSubnet() { m_topology->declarations().addSubnet(); }

void FMain::handleEditSubnet() { m_topology->declarations().editSubnet(); }

void FMain::handleAddRange() { m_topology->declarations().addRange(); }

void FMain::handleEditRange() { m_topology->declarations().editRange(); }

void FMain::handleAddHost() { m_topology->declarations().addHost(); }

void FMain::handleEditHost() { m_topology->declarations().editHost(); }

void FMain::handleAddFixedAddress() { m_topology->declarations().addFixedAddress(); }

void FMain::handleEditFixedAddress() { m_topology->declarations().editFixedAddress(); }

void FMain::handleAddRouters() { m_topology->parameters().add("routers"); }

void FMain::handleEditRouters() { m_topology->parameters().edit("routers"); }

void FMain::handleAddDns() { m_topology->parameters().add("domain-name-servers"); }

void FMain::handleEditDns() { m_topology->parameters().edit("domain-name-servers"); }

void FMain::handleAddNtp() { m_topology->parameters().add("ntp-servers"); }

void FMain::handleEditNtp() { m_topology->parameters().edit("ntp-servers"); }

void FMain::handleAddDomainName() { m_topology->parameters().add("domain-name"); }

void FMain::handleEditDomainName() { m_topology->parameters().edit("domain-name"); }

void FMain::handleAddMaxLeaseTime() { m_topology->parameters().add("max-lease-time"); }

void FMain::handleEditMaxLeaseTime() { m_topology->parameters().edit("max-lease-time"); }

void FMain::handleAddDefaultLeaseTime() { m_topology->parameters().add("default-lease-time"); }

void FMain::handleEditDefaultLeaseTime() { m_topology->parameters().edit("default-lease-time"); }

void FMain::handleEditMacAddress() { m_topology->parameters().edit("hardware"); }

void FMain::handleAddStaticRoute() { m_topology->declarations().addStaticRoute(); }

void FMain::handleEditStaticRoute() { m_topology->declarations().editStaticRoute(); }

void FMain::handleAddBind9Settings() { m_topology->declarations().addBind9Settings(); }

void FMain::leaseReload() { m_leases->update(); }

void FMain::handleTableContextMenuRequested(QPoint position)
{
    if (m_ui->dhcpdLeaseTable->indexAt(position).isValid())
        m_leases->openMenu(QCursor::pos());
}

void FMain::copyLease() { m_leases->copyCurrent(); }

void FMain::handleReserveIp() { m_leases->reserveCurrent(); }

void FMain::handleTableDoubleClicked(QModelIndex index) { m_leases->reserve(index); }

void FMain::searchLease(const QString &name) { m_leases->search(name); }

void FMain::selectNextLease() { m_leases->step(1); }

void FMain::selectPrevLease() { m_leases->step(-1); }
