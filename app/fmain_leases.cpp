// SPDX-License-Identifier: GPL-3.0-or-later
// The main window's commands on the lease table: searching it and reserving an address.
#include "app/fmain.h"

#include "app/treeexpansion.h"
#include "config/dhcpdconfigmodel.h"
#include "dialogs/hostinputdialog.h"
#include "leases/dhcpdleasesmodel.h"
#include "leases/leaseproxymodel.h"
#include "ui_fmain.h"

#include <QMenu>
#include <QMessageBox>
#include <QRegularExpression>

namespace {

constexpr auto foundStyle = "QLineEdit { color: black; }";
constexpr auto notFoundStyle = "QLineEdit { color: red; }";

/// The name without the characters that would end it in the configuration: the client chose it, and might write
/// statements of its own there.
QString withoutSyntax(QString name)
{
    static const QRegularExpression syntax{QStringLiteral("[\"#;{}\\x00-\\x1f]")};
    return name.remove(syntax);
}

} // namespace

/// All matches of a text are in one column: the first that has any.
QModelIndexList FMain::leaseMatches(const QString &text, int hits) const
{
    if (text.isEmpty())
        return {};
    for (int column = 0; column < m_leaseProxy->columnCount(); ++column) {
        const QModelIndexList matches = m_leaseProxy->match(m_leaseProxy->index(0, column), Qt::DisplayRole, text, hits,
                                                            Qt::MatchContains | Qt::MatchRecursive);
        if (!matches.isEmpty())
            return matches;
    }
    return {};
}

void FMain::showLeaseMatch(const QModelIndex &match)
{
    m_ui->dhcpdLeaseTable->selectionModel()->setCurrentIndex(match, QItemSelectionModel::ClearAndSelect);
    m_ui->dhcpdLeaseTable->scrollTo(match);
}

void FMain::searchLease(const QString &name)
{
    m_matchPosition = 0;
    // The filter heeds letter case, the matches among what it left do not, deliberately.
    m_leaseProxy->setFilterFixedString(name);

    const QModelIndexList first = leaseMatches(name, 1);
    const bool found = !first.isEmpty();
    m_ui->searchLease->setStyleSheet(QLatin1String{found || name.isEmpty() ? foundStyle : notFoundStyle});
    m_ui->searchPrevLease->setEnabled(found);
    m_ui->searchNextLease->setEnabled(found);
    if (found)
        showLeaseMatch(first.first());
}

void FMain::selectNextLease() { stepToLease(1); }

void FMain::selectPrevLease() { stepToLease(-1); }

void FMain::stepToLease(int step)
{
    const QModelIndexList matches = leaseMatches(m_ui->searchLease->text(), -1);
    const int position = m_matchPosition + step;
    if (position >= 0 && position < matches.size())
        showLeaseMatch(matches.at(position));

    const QModelIndexList selected = m_ui->dhcpdLeaseTable->selectionModel()->selectedIndexes();
    if (selected.size() == 1)
        m_matchPosition = matches.indexOf(selected.first());
}

void FMain::handleTableContextMenuRequested(QPoint position)
{
    if (!m_ui->dhcpdLeaseTable->indexAt(position).isValid())
        return;
    m_menuLease = leaseAt(m_ui->dhcpdLeaseTable->currentIndex());
    m_leaseMenu->popup(QCursor::pos());
}

void FMain::handleTableDoubleClicked(QModelIndex index) { reserve(leaseAt(index)); }

void FMain::handleReserveIp() { reserve(m_menuLease ? m_menuLease : leaseAt(m_ui->dhcpdLeaseTable->currentIndex())); }

std::optional<FMain::LeaseTexts> FMain::leaseAt(const QModelIndex &index)
{
    if (!index.isValid())
        return {};
    const auto cell = [&index](int column) { return index.siblingAtColumn(column).data().toString(); };
    return LeaseTexts{cell(DhcpdLeasesModel::Address), cell(DhcpdLeasesModel::Mac), cell(DhcpdLeasesModel::HostName)};
}

void FMain::reserve(const std::optional<LeaseTexts> &lease)
{
    // Without a configuration there is nothing that the host could be added to.
    const QModelIndex network = m_configModel->index(0, 0);
    if (!lease || !network.isValid())
        return;
    const LeaseTexts &texts = *lease;
    HostInputDialog dialog{this};
    dialog.setWindowTitle(tr("Reserve an IP address"));
    dialog.setIp(texts.address);
    dialog.setMac(texts.mac);
    dialog.setName(withoutSyntax(texts.hostName));
    dialog.adjustSize();
    if (dialog.exec() != QDialog::Accepted)
        return;

    addHostTo(network, dialog.name(), dialog.mac(), dialog.ip());
    const auto answer =
        QMessageBox::information(this, tr("Information"), tr("The IP address is reserved.\nGo to topology?"),
                                 QMessageBox::Yes | QMessageBox::No);
    if (answer != QMessageBox::Yes)
        return;
    m_ui->mainTabWidget->setCurrentIndex(TopologyTab);
    // The name as the lease has it is looked for, deliberately, even if another was typed.
    for (int row = 0; row < m_configModel->rowCount(network); ++row) {
        if (m_configModel->index(row, 1, network).data().toString() == texts.hostName) {
            m_ui->topologyTree->setCurrentIndex(m_configModel->index(row, 0, network));
            break;
        }
    }
}
