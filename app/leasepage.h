// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "app/reservation.h"
#include "leases/dhcpdleasesmodel.h"
#include "leases/leaseproxymodel.h"

#include <QModelIndexList>
#include <QObject>

#include <optional>

class QMenu;
class QPoint;
class QString;
class QWidget;
class SearchFeedback;

namespace Ui {
class FMain;
}

/// The tab "Leases": the leases as a table that follows the lease file, the search in it, and asking for a reservation.
class LeasePage final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(LeasePage)

public:
    /// Reads the lease file; `window` is the parent of the menu and of the file's watchers.
    LeasePage(const Ui::FMain &ui, QWidget *window);
    ~LeasePage() override;

    /// Reads the whole lease file.
    void reload();
    /// Brings the table up to date with the lease file; the user stays where he is in it.
    void update();

    /// Shows only the leases that have `text`, and goes to the first match.
    void search(const QString &text);
    /// Goes to the next match (1) or the one before (-1), if there is one.
    void step(int step);

    /// Offers the commands on the current lease, in a menu at a place on the screen.
    void openMenu(const QPoint &place);
    /// Puts the cells of the current lease into the clipboard, separated by tabs.
    void copyCurrent() const;
    /// Asks for a reservation of the lease that the menu is about, or of the current one.
    void reserveCurrent();
    void reserve(const QModelIndex &index);

signals:
    /// The user wants a host for a lease.
    void reservationRequested(const Reservation &lease);

private:
    void setUpTable();
    void setUpSearch();
    QModelIndexList matches(const QString &text, int hits) const;
    void showMatch(const QModelIndex &match);
    static std::optional<Reservation> leaseAt(const QModelIndex &index);
    void request(const std::optional<Reservation> &lease);

    const Ui::FMain &m_ui;
    DhcpdLeasesModel m_model;
    LeaseProxyModel m_proxy;
    QMenu *m_menu;                          // the window's
    std::optional<Reservation> m_menuLease; // the one that the open menu is about
    SearchFeedback *m_searchFeedback{};     // the search field's
    int m_matchPosition{};
};
