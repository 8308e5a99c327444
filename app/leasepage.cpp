// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/leasepage.h"

#include "app/busycursor.h"
#include "app/gridcelldelegate.h"
#include "app/leasecolumns.h"
#include "app/leaseviewstate.h"
#include "app/pathwatch.h"
#include "app/searchfeedback.h"
#include "app/windowtext.h"
#include "common/paths.h"
#include "dialogs/buttons.h"
#include "ui_fmain.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QHeaderView>
#include <QMenu>

LeasePage::LeasePage(const Ui::FMain &ui, QWidget *window)
    : m_ui{ui}
    , m_menu{new QMenu{WindowText::tr("Actions"), window}}
{
    auto *watch = new PathWatch{paths::leases(), paths::leaseDirectory(), window};
    connect(watch, &PathWatch::changed, this, &LeasePage::update);

    // The model's error signal is deliberately not connected: a missing lease file is an empty table, not a message.
    reload();
    m_proxy.setSourceModel(&m_model);
    m_proxy.setFilterKeyColumn(-1);
    setUpTable();
    setUpSearch();

    m_menu->addAction(ui.aAddReserveIP);
    // Queued: the menu hides before it triggers what was chosen.
    connect(
        m_menu, &QMenu::aboutToHide, this, [this] { m_menuLease.reset(); }, Qt::QueuedConnection);
}

LeasePage::~LeasePage() = default;

void LeasePage::setUpTable()
{
    QTableView *table{m_ui.dhcpdLeaseTable};
    table->setSelectionMode(QAbstractItemView::SingleSelection);
    table->setSelectionBehavior(QAbstractItemView::SelectRows);
    table->setContextMenuPolicy(Qt::CustomContextMenu);
    table->verticalHeader()->setDefaultSectionSize(table->verticalHeader()->minimumSectionSize());
    table->setModel(&m_proxy);
    new GridCellDelegate{table};
    new LeaseColumns{table};
}

void LeasePage::setUpSearch()
{
    QLineEdit *field{m_ui.searchLease};
    m_searchFeedback = new SearchFeedback{field, &m_proxy};
    field->addAction(QIcon::fromTheme(QStringLiteral("edit-find")), QLineEdit::LeadingPosition)
        ->setText(WindowText::tr("Search"));
    field->setClearButtonEnabled(true);
    // Qt leaves its button without a text that could be said, and with a picture of the icon as it was at first.
    if (auto *clear = field->findChild<QAction *>(QStringLiteral("_q_qlineeditclearaction"))) {
        clear->setText(WindowText::tr("Clear the search"));
        clear->setIcon(QIcon::fromTheme(QStringLiteral("edit-clear"), clear->icon()));
    }

    m_ui.searchPrevLease->setIcon(QIcon::fromTheme(QStringLiteral("previous")));
    m_ui.searchNextLease->setIcon(QIcon::fromTheme(QStringLiteral("next")));
    for (QToolButton *button : {m_ui.searchPrevLease, m_ui.searchNextLease}) {
        buttons::pressByReturn(button);
        button->setAutoRaise(true);
        button->setEnabled(false);
    }
}

void LeasePage::reload()
{
    const BusyCursor busy{paths::leases()};
    m_model.reload(paths::leases());
}

void LeasePage::update()
{
    QTableView &table{*m_ui.dhcpdLeaseTable};
    const LeaseViewState viewState{table};
    const BusyCursor busy{m_model.bytesToRead(paths::leases())};
    m_model.update(paths::leases());
    viewState.restoreIn(table);
}

void LeasePage::search(const QString &text)
{
    m_matchPosition = 0;
    QTableView &table{*m_ui.dhcpdLeaseTable};
    const auto viewState = text.isEmpty() ? std::make_optional<LeaseViewState>(table) : std::nullopt;
    // The filter respects letter case, the search among the rows that it left does not, deliberately.
    m_proxy.setFilterFixedString(text);
    table.doItemsLayout(); // at once: scroll bars that come or go would have all painted twice

    const QModelIndexList first{matches(text, 1)};
    const bool isFound{!first.isEmpty()};
    m_searchFeedback->show(isFound || text.isEmpty());
    m_ui.searchPrevLease->setEnabled(isFound);
    m_ui.searchNextLease->setEnabled(isFound);
    if (isFound) {
        showMatch(first.first());
    } else if (viewState) {
        viewState->restoreIn(table); // the lease that was found stays current among all others
        table.scrollTo(table.currentIndex());
    }
}

void LeasePage::step(int step)
{
    const QModelIndexList all{matches(m_ui.searchLease->text(), -1)};
    const int position{m_matchPosition + step};
    if (position >= 0 && position < all.size())
        showMatch(all.at(position));

    const QModelIndexList selected{m_ui.dhcpdLeaseTable->selectionModel()->selectedIndexes()};
    if (selected.size() == 1)
        m_matchPosition = static_cast<int>(all.indexOf(selected.first()));
}

/// All matches of a text are in one column: the first that has any.
QModelIndexList LeasePage::matches(const QString &text, int hits) const
{
    if (text.isEmpty())
        return {};
    for (int column{0}; column < m_proxy.columnCount(); ++column) {
        const QModelIndexList found{m_proxy.match(m_proxy.index(0, column), Qt::DisplayRole, text, hits,
                                                  Qt::MatchContains | Qt::MatchRecursive)};
        if (!found.isEmpty())
            return found;
    }
    return {};
}

void LeasePage::showMatch(const QModelIndex &match)
{
    m_ui.dhcpdLeaseTable->selectionModel()->setCurrentIndex(match, QItemSelectionModel::ClearAndSelect);
    m_ui.dhcpdLeaseTable->scrollTo(match);
}

void LeasePage::openMenu(const QPoint &place)
{
    m_menuLease = leaseAt(m_ui.dhcpdLeaseTable->currentIndex());
    m_menu->popup(place);
}

void LeasePage::copyCurrent() const
{
    const QModelIndex current{m_ui.dhcpdLeaseTable->currentIndex()};
    if (!current.isValid())
        return;
    QStringList cells;
    for (int column{0}; column < m_proxy.columnCount(); ++column)
        cells.append(current.siblingAtColumn(column).data().toString());
    QGuiApplication::clipboard()->setText(cells.join(QLatin1Char{'\t'}));
}

void LeasePage::reserveCurrent() { request(m_menuLease ? m_menuLease : leaseAt(m_ui.dhcpdLeaseTable->currentIndex())); }

void LeasePage::reserve(const QModelIndex &index) { request(leaseAt(index)); }

std::optional<Reservation> LeasePage::leaseAt(const QModelIndex &index)
{
    if (!index.isValid())
        return {};
    const auto cell = [&index](int column) { return index.siblingAtColumn(column).data().toString(); };
    return Reservation{cell(DhcpdLeasesModel::Address), cell(DhcpdLeasesModel::Mac), cell(DhcpdLeasesModel::HostName)};
}

void LeasePage::request(const std::optional<Reservation> &lease)
{
    // A copy: the menu's lease is forgotten while the dialog is open.
    if (lease)
        emit reservationRequested(Reservation{*lease});
}
