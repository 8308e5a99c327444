// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/servicecontrols.h"

#include "app/commandguard.h"
#include "app/windowtext.h"
#include "server/interfacesdialog.h"
#include "server/servicewatch.h"
#include "ui_fmain.h"

#include <QLabel>
#include <QMessageBox>

#include <utility>

namespace {

constexpr int stateIndent{5};
constexpr int settlingMilliseconds{5000};

} // namespace

ServiceControls::ServiceControls(const Ui::FMain &ui, QWidget *window)
    : m_ui{ui}
    , m_window{window}
    , m_stateLabel{new QLabel{window}}
    , m_manager{std::make_unique<DhcpServerManager>(nullptr)}
    , m_watch{std::make_unique<ServiceWatch>(m_manager.get())}
{
    m_stateLabel->setIndent(stateIndent);
    m_stateLabel->setText(m_manager->serverStateText());
    ui.statusBar->addWidget(m_stateLabel);
    m_settling.setSingleShot(true);
    m_settling.setInterval(settlingMilliseconds);
    // Queued, so that a box opens between two operations, and not for an answer that has "failed" before "running".
    connect(m_manager.get(), &DhcpServerManager::serverStateChanged, this, &ServiceControls::watchStart,
            Qt::QueuedConnection);
    connect(ui.actionRestart, &QAction::triggered, this, [this] {
        if (mayStartCommand())
            m_manager->restartServer();
    });
}

ServiceControls::~ServiceControls() = default;

void ServiceControls::startOrStop()
{
    if (m_manager->isServerRunning())
        m_manager->stopServer();
    else
        m_manager->runServer();
}

void ServiceControls::showState(DhcpServerManager::ServerStates state)
{
    m_stateLabel->setText(m_manager->serverStateText());

    const auto offer = [action = m_ui.actionStartStopServer](const QString &icon, const QString &text) {
        action->setEnabled(true);
        action->setIcon(QIcon::fromTheme(icon));
        action->setText(text);
        action->setToolTip(text);
    };
    switch (state) {
    case DhcpServerManager::Running:
        offer(QStringLiteral("media-playback-stop"), WindowText::tr("Stop DHCP-server"));
        break;
    case DhcpServerManager::Stopped:
        offer(QStringLiteral("media-playback-start"), WindowText::tr("Start DHCP-server"));
        break;
    case DhcpServerManager::Updating:
        m_ui.actionStartStopServer->setEnabled(false);
        break;
    }
}

// A unit whose start is done as soon as the server's process is there, as Ubuntu's, starts with success also a server
// that then refuses its configuration.
void ServiceControls::watchStart(DhcpServerManager::ServerStates state)
{
    if (std::exchange(m_lastState, state) == DhcpServerManager::Updating)
        m_settling.start();
    if (m_settling.isActive())
        m_manager->reportDeath();
}

void ServiceControls::chooseInterfaces()
{
    m_manager->updateInterfaces();
    InterfacesDialog dialog{m_manager->interfaces(), m_window};
    if (dialog.exec() != QDialog::Accepted)
        return;
    const auto answer = QMessageBox::information(
        m_window, WindowText::tr("Information"),
        WindowText::tr("Current configuration in file will be rewrited.\nDo you want to save changes?"),
        QMessageBox::Save | QMessageBox::Cancel, QMessageBox::Save);
    if (answer == QMessageBox::Save)
        m_manager->setInterfaces(dialog.interfaces());
}
