// SPDX-License-Identifier: GPL-3.0-or-later
// The main window's commands on files: saving, reloading, noticing changes, closing, the served interfaces.
#include "app/fmain.h"

#include "app/busycursor.h"
#include "app/configcheck.h"
#include "app/leaseplace.h"
#include "app/pathwatch.h"
#include "app/treeexpansion.h"
#include "common/fileio.h"
#include "common/paths.h"
#include "config/dhcpdconfigmodel.h"
#include "leases/dhcpdleasesmodel.h"
#include "server/interfacesdialog.h"
#include "ui_fmain.h"

#include <QCloseEvent>
#include <QHeaderView>
#include <QMessageBox>
#include <QTextEdit>

#include <utility>

void FMain::reload()
{
    if (m_ui->mainTabWidget->currentIndex() == LeasesTab) {
        readLeases();
        return;
    }
    const auto answer =
        QMessageBox::information(this, tr("Information"), tr("Do you want to reload configuration from file?"),
                                 QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes);
    if (answer == QMessageBox::Yes)
        reloadTopology();
}

void FMain::leaseReload()
{
    QTableView &table = *m_ui->dhcpdLeaseTable;
    const LeasePlace place{table};
    const BusyCursor busy{m_leasesModel->bytesToRead(paths::leases())};
    m_leasesModel->update(paths::leases());
    place.restoreIn(table);
}

void FMain::readLeases()
{
    const BusyCursor busy{paths::leases()};
    m_leasesModel->reload(paths::leases());
}

void FMain::reloadTopology()
{
    const BusyCursor busy{paths::configuration()};
    m_configModel->reload();
    showWholeTopology();
}

void FMain::showWholeTopology()
{
    QTreeView *tree = m_ui->topologyTree;
    m_treeExpansion->expandAll();
    tree->header()->resizeSections(QHeaderView::ResizeToContents);
    tree->setCurrentIndex(m_configModel->index(0, 0));
}

void FMain::configChanged()
{
    if (!m_ignoreNextChange)
        m_changedOutside = true;
    m_ignoreNextChange = false;
}

void FMain::save() { saveConfiguration(); }

FMain::SaveOutcome FMain::saveConfiguration()
{
    // Set before anything is asked and left set when the user cancels, deliberately: the next change by others then
    // goes unnoticed once.
    m_ignoreNextChange = true;
    const QByteArray content = m_configModel->fileContent();
    if (!confirmsSave(content))
        return SaveOutcome::Declined;

    if (!writeConfiguration())
        return SaveOutcome::Failed;
    m_ignoreNextChange = true;
    m_changedOutside = false;
    // A notice that was due from before the write is about a version that is gone.
    m_configWatch->forget();
    // The notice of the write itself, which the paused watch did not give; a second one if somebody else wrote
    // meanwhile.
    QMetaObject::invokeMethod(this, &FMain::configChanged, Qt::QueuedConnection);
    if (fileio::readFile(paths::configuration()) != content)
        QMetaObject::invokeMethod(this, &FMain::configChanged, Qt::QueuedConnection);
    reloadTopology();
    return SaveOutcome::Saved;
}

bool FMain::writeConfiguration()
{
    // An error is shown when the file is watched again: while a box is open, others may change it.
    m_heldErrors.emplace();
    bool written{};
    {
        const BusyCursor busy{paths::configuration()};
        m_configWatch->pause();
        written = m_configModel->write();
        m_configWatch->resume();
    }
    const QStringList errors = *std::exchange(m_heldErrors, std::nullopt);
    for (const QString &error : errors)
        showError(error);
    return written;
}

bool FMain::confirmsSave(const QByteArray &content)
{
    const QString text = m_changedOutside
                             ? tr("The configuration has been changed.\nDo you want to overwrite the configuration?")
                             : tr("Current configuration in file will be rewrited.\nDo you want to save changes?");
    QMessageBox box{QMessageBox::Information, tr("Information"), text, QMessageBox::Save | QMessageBox::Cancel, this};
    box.setDefaultButton(QMessageBox::Save);

    ConfigCheck check{this};
    connect(&check, &ConfigCheck::refused, &box, [&box](const QString &complaint, const QString &output) {
        box.setInformativeText(tr("The DHCP server refuses this configuration:\n%1").arg(complaint));
        box.setDetailedText(output);
        // Qt leaves the field for it without a name that could be said.
        if (auto *details = box.findChild<QTextEdit *>())
            details->setAccessibleName(tr("Answer of the DHCP server"));
    });
    check.start(content);
    return box.exec() == QMessageBox::Save;
}

void FMain::closeEvent(QCloseEvent *event)
{
    if (!m_configModel->isModified()) {
        event->accept();
        return;
    }
    const auto answer = QMessageBox::question(this, tr("Confirmation"), tr("There are unsaved changes, save?"),
                                              QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel);
    // After a Yes the window closes whatever became of the save, deliberately; what could not be written is kept.
    if (answer == QMessageBox::Yes && saveConfiguration() == SaveOutcome::Failed) {
        const QByteArray content = m_configModel->fileContent();
        if (!content.isNull())
            fileio::keepCopy(paths::configuration(), content);
    }
    event->setAccepted(answer == QMessageBox::Yes || answer == QMessageBox::No);
}

void FMain::getInterfaces()
{
    m_serverManager->updateInterfaces();
    InterfacesDialog dialog{m_serverManager->interfaces(), this};
    if (dialog.exec() != QDialog::Accepted)
        return;
    const auto answer = QMessageBox::information(
        this, tr("Information"), tr("Current configuration in file will be rewrited.\nDo you want to save changes?"),
        QMessageBox::Save | QMessageBox::Cancel, QMessageBox::Save);
    if (answer == QMessageBox::Save)
        m_serverManager->setInterfaces(dialog.interfaces());
}
