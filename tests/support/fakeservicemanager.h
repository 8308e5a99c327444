// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDBusConnection>
#include <QObject>
#include <QProcess>
#include <QString>

#include <memory>

/// A system bus of the test's own, with a stand-in for the service manager on it, which announces changes of units to
/// those who have subscribed.
class FakeServiceManager final : public QObject
{
    Q_OBJECT
    Q_CLASSINFO("D-Bus Interface", "org.freedesktop.systemd1.Manager")
    Q_DISABLE_COPY_MOVE(FakeServiceManager)

public:
    /// Has this process find the bus, and returns its address. To be called before main(), since the first use of any
    /// bus settles all addresses.
    static QString chooseAddress();
    explicit FakeServiceManager(const QString &address);
    ~FakeServiceManager() override;

    /// Whether the bus and the stand-in are there; where not, dbus-daemon is not installed.
    bool isRunning() const { return m_bus && m_bus->isConnected(); }
    /// Leaves the bus and forgets who has subscribed, and joins it again.
    void leave();
    void join();
    /// How many have subscribed so far.
    int subscribers() const { return m_subscribers; }
    /// Announces that properties of the unit at the end of an object's path changed, if anybody has subscribed.
    void announce(const QString &unit = QStringLiteral("isc_2ddhcp_2dserver_2eservice"));

public slots:
    Q_SCRIPTABLE void Subscribe() { ++m_subscribers; } // its name on the bus

private:
    QProcess m_daemon;
    std::unique_ptr<QDBusConnection> m_bus;
    int m_subscribers{};
};
