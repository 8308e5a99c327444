// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QObject>
#include <QString>
#include <QTimer>

class DhcpServerManager;

/// Keeps the state of a DhcpServerManager that of the service, whoever changes it: has it ask again when the service
/// manager announces on the system bus that the unit changed, and every five seconds while its state is `Updating`.
///
/// Announcements that arrive within a fifth of a second of the first one count as one. Where there is no system bus,
/// the timer is all there is.
class ServiceWatch final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(ServiceWatch)

public:
    /// Connects to the bus from the event loop, not yet here. `manager` must outlive the watch.
    explicit ServiceWatch(DhcpServerManager *manager, QObject *parent = nullptr);
    ~ServiceWatch() override;

private slots:
    void noteChange();

private:
    void connectToBus();
    void subscribe();

    QString m_connectionName; // the connection is its own, and closed with it
    QTimer m_burst;
    QTimer m_retry;
};
