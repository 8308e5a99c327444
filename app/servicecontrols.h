// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "server/dhcpservermanager.h"

#include <QObject>
#include <QTimer>

#include <memory>

class QLabel;
class ServiceWatch;

namespace Ui {
class FMain;
}

/// The DHCP server as a service in the window: its state in the status bar, the actions on it, and the choice of the
/// interfaces that it serves.
class ServiceControls final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(ServiceControls)

public:
    /// Asks nothing about the service yet; `window` is the parent of dialogs.
    ServiceControls(const Ui::FMain &ui, QWidget *window);
    ~ServiceControls() override;

    DhcpServerManager &manager() { return *m_manager; }
    void startOrStop();
    void showState(DhcpServerManager::ServerStates state);
    void chooseInterfaces();

private:
    void watchStart(DhcpServerManager::ServerStates state);

    const Ui::FMain &m_ui;
    QWidget *m_window;
    QLabel *m_stateLabel; // the status bar's
    std::unique_ptr<DhcpServerManager> m_manager;
    std::unique_ptr<ServiceWatch> m_watch;
    DhcpServerManager::ServerStates m_lastState{DhcpServerManager::Updating};
    QTimer m_settling; // runs for a while after an operation
};
