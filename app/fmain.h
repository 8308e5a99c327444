// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "server/dhcpservermanager.h"

#include <QMainWindow>
#include <QModelIndexList>

#include <memory>
#include <optional>

class DhcpdConfigModel;
class DhcpdConfigStatement;
class DhcpdLeasesModel;
class LeaseProxyModel;
class PathWatch;
class QLabel;
class QMenu;
class QString;
class TopologyMenus;
class TreeExpansion;

namespace Ui {
class FMain;
}

/// The program's window: the configuration as a tree, the leases as a table, the server's state in the status bar, and
/// the commands on them.
///
/// The constructor reads the configuration and the leases and asks for the server's state. Whatever the models and the
/// server manager report is shown in modal boxes.
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

private:
    /// The tabs of mainTabWidget, by index.
    enum Tab
    {
        TopologyTab,
        LeasesTab
    };

    void showError(const QString &text);
    void showInformation(const QString &text);

    void setUpActions();
    void setUpServer();
    void setUpTopology();
    void setUpLeases();
    void setUpSearch();
    void restoreSize();

    /// Reads the whole lease file.
    void readLeases();

    enum class SaveOutcome
    {
        Saved,
        Declined,
        Failed
    };
    SaveOutcome saveConfiguration();
    /// Asks whether to write `content` over the configuration, and tells if the server refuses it.
    bool confirmsSave(const QByteArray &content);
    /// Writes the model to the configuration file without noticing that as a change.
    bool writeConfiguration();
    void reloadTopology();
    void showWholeTopology();

    using KindTest = bool (*)(const DhcpdConfigStatement &);

    /// Opens the editor that fits the statement at `index`; nothing for the nodes above the file's statements.
    void editStatement(const QModelIndex &index);
    void removeCurrentStatement();

    /// The tree's current index where it is a declaration's; else invalid.
    QModelIndex currentDeclaration() const;
    /// The tree's current index where it is that of a statement of the kind, as the file has it; else invalid.
    QModelIndex currentOfKind(KindTest isKind) const;
    /// What is open in the tree after an add besides the declaration that was added to.
    enum class OpenBranches
    {
        AsBefore,
        All
    };
    /// Runs `change`, which may add children to the declaration at `parent`, and shows what was added.
    template<typename Change>
    void addTo(const QModelIndex &parent, const Change &change, OpenBranches open = OpenBranches::AsBefore);
    /// Asks with a `Dialog` made ready by `fill(dialog)` and, when it is accepted, calls `add(dialog, parent)` with the
    /// current declaration.
    template<typename Dialog, typename Fill, typename Add>
    void addThroughDialog(const QString &title, const Fill &fill, const Add &add,
                          OpenBranches open = OpenBranches::AsBefore);
    /// Asks with a `Dialog` made ready by `fill(dialog, statement)` from the current statement, if that is of the kind;
    /// when it is accepted with another value than shown, calls `handOver(index, value, shown value)`.
    template<typename Dialog, typename Fill, typename Value, typename HandOver>
    void editThroughDialog(const QString &title, KindTest isKind, const Fill &fill, const Value &value,
                           const HandOver &handOver);
    /// The same for a value that is one text, which goes to the model's setData().
    template<typename Dialog, typename Fill, typename Value>
    void editValueThroughDialog(const QString &title, KindTest isKind, const Fill &fill, const Value &value);

    /// Asks whether to go on with a free-text command.
    bool resumesAdvancedEditing();
    void addArbitrary(const QString &title, const QString &label,
                      bool (DhcpdConfigModel::*add)(const QStringList &, const QModelIndex &));
    void editArbitrary(const QString &title, const QString &label, KindTest isKind);
    void addAddressList(const QString &title, const QString &label,
                        void (DhcpdConfigModel::*add)(const QString &, const QModelIndex &));
    void editAddressList(const QString &title, const QString &label, KindTest isKind);
    void addLeaseTime(const QString &title, bool (DhcpdConfigModel::*add)(const QString &, const QModelIndex &));
    void editLeaseTime(const QString &title, KindTest isKind);
    void editOtherLeaseTime();

    QModelIndexList leaseMatches(const QString &text, int hits) const;
    void showLeaseMatch(const QModelIndex &match);
    void stepToLease(int step);
    /// The texts of a lease, copied, since the table may change while a menu or dialog is open.
    struct LeaseTexts
    {
        QString address;
        QString mac;
        QString hostName;
    };
    /// The lease at an index of the lease table.
    static std::optional<LeaseTexts> leaseAt(const QModelIndex &index);
    /// Offers to add a host for a lease.
    void reserve(const std::optional<LeaseTexts> &lease);
    /// Adds a host and opens the whole tree.
    void addHostTo(const QModelIndex &network, const QString &name, const QString &mac, const QString &ip);

    std::unique_ptr<Ui::FMain> m_ui;
    QLabel *m_statusLabel{};
    std::unique_ptr<DhcpServerManager> m_serverManager;
    DhcpdConfigModel *m_configModel{};
    std::unique_ptr<DhcpdLeasesModel> m_leasesModel;
    TreeExpansion *m_treeExpansion{};
    PathWatch *m_configWatch{};
    PathWatch *m_leaseWatch{};
    std::unique_ptr<LeaseProxyModel> m_leaseProxy;
    QMenu *m_leaseMenu{};
    std::optional<LeaseTexts> m_menuLease; // the one that the open lease menu is about
    int m_matchPosition{};
    QStringList m_bind9Versions;
    std::unique_ptr<TopologyMenus> m_topologyMenus;
    std::optional<QStringList> m_heldErrors; // while errors are to be shown later
    bool m_ignoreNextChange{};
    bool m_changedOutside{};
};
