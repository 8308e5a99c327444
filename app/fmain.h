// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "server/dhcpservermanager.h"

#include <QMainWindow>
#include <QModelIndex>

#include <memory>

class ConfigurationFile;
class DhcpdConfigModel;
class LeasePage;
class QString;
class ServiceControls;
class TopologyPage;

namespace Ui {
class FMain;
}

/// The program's window: the frame of its pages, which know the commands. It shows in modal boxes whatever they and the
/// models report.
///
/// The constructor reads the configuration and the leases and asks for the server's state.
class FMain final : public QMainWindow
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(FMain)

public:
    explicit FMain(QWidget *parent = nullptr);
    /// Stores the window's size.
    ~FMain() override;

public slots:
    void reload();
    void leaseReload();
    void save();
    void configChanged();
    void getInterfaces();
    void startStopServer();
    void handleServerStateChanged(DhcpServerManager::ServerStates state);
    void handleTreeContextMenuRequested(QPoint position);
    void handleTreeDoubleClicked(QModelIndex index);
    void handleAddArbitraryDeclaration();
    void handleEditArbitraryDeclaration();
    void handleAddArbitraryParam();
    void handleEditArbitraryParam();
    void handleAddSharedNetwork();
    void handleEditSharedNetwork();
    void handleAddSubnet();
    void handleEditSubnet();
    void handleAddRange();
    void handleEditRange();
    void handleAddHost();
    void handleEditHost();
    void handleAddFixedAddress();
    void handleEditFixedAddress();
    void handleAddRouters();
    void handleEditRouters();
    void handleAddDns();
    void handleEditDns();
    void handleAddNtp();
    void handleEditNtp();
    void handleAddDomainName();
    void handleEditDomainName();
    void handleAddMaxLeaseTime();
    void handleEditMaxLeaseTime();
    void handleAddDefaultLeaseTime();
    void handleEditDefaultLeaseTime();
    void handleEditMacAddress();
    void handleEdit();
    void handleAddStaticRoute();
    void handleEditStaticRoute();
    void handleAddBind9Settings();
    void handleTreeItemChanged(QModelIndex current);
    void handleTableContextMenuRequested(QPoint position);
    void handleReserveIp();
    void handleTableDoubleClicked(QModelIndex index);
    void currentTabChanged(int index);
    void searchLease(const QString &name);
    void selectNextLease();
    void selectPrevLease();

protected:
    void closeEvent(QCloseEvent *event) override;
    /// A window without a stored size is never larger than the screen.
    void showEvent(QShowEvent *event) override;

private:
    /// The tabs of mainTabWidget, by index.
    enum Tab
    {
        TopologyTab,
        LeasesTab
    };

    void setUpActions();
    void setUpService();
    void setUpTopology();
    void setUpLeases();
    void setUpKeys();

    void openTreeMenu(const QPoint &place);
    void goToLeaseSearch();
    void copyLease();

    void showError(const QString &text, const QString &reason = {});
    void showInformation(const QString &text);

    std::unique_ptr<Ui::FMain> m_ui;
    DhcpdConfigModel *m_configModel{};
    std::unique_ptr<ServiceControls> m_service;
    std::unique_ptr<ConfigurationFile> m_file;
    std::unique_ptr<TopologyPage> m_topology;
    std::unique_ptr<LeasePage> m_leases;
};
