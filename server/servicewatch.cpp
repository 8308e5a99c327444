// SPDX-License-Identifier: GPL-3.0-or-later
#include "server/servicewatch.h"

#include "server/dhcpservermanager.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusServiceWatcher>
#include <QUuid>

namespace {

constexpr int burstMilliseconds{200};
constexpr int retryMilliseconds{5000};

QString serviceManager() { return QStringLiteral("org.freedesktop.systemd1"); }

// The unit isc-dhcp-server.service, with what a path may not hold as the hexadecimal number of its character.
QString unitPath() { return QStringLiteral("/org/freedesktop/systemd1/unit/isc_2ddhcp_2dserver_2eservice"); }

// Without it the service manager announces nothing.
QDBusMessage subscription()
{
    QDBusMessage call{QDBusMessage::createMethodCall(serviceManager(), QStringLiteral("/org/freedesktop/systemd1"),
                                                     QStringLiteral("org.freedesktop.systemd1.Manager"),
                                                     QStringLiteral("Subscribe"))};
    call.setAutoStartService(false);
    return call;
}

} // namespace

ServiceWatch::ServiceWatch(DhcpServerManager *manager, QObject *parent)
    : QObject{parent}
    , m_connectionName{QUuid::createUuid().toString()}
{
    m_burst.setSingleShot(true);
    m_burst.setInterval(burstMilliseconds);
    connect(&m_burst, &QTimer::timeout, manager, &DhcpServerManager::followState);

    m_retry.setInterval(retryMilliseconds);
    connect(&m_retry, &QTimer::timeout, manager, &DhcpServerManager::followState);
    const auto retryWhileUpdating = [this](DhcpServerManager::ServerStates state) {
        if (state != DhcpServerManager::Updating)
            m_retry.stop();
        else if (!m_retry.isActive())
            m_retry.start();
    };
    connect(manager, &DhcpServerManager::serverStateChanged, this, retryWhileUpdating);
    retryWhileUpdating(manager->state());
    QTimer::singleShot(0, this, &ServiceWatch::connectToBus);
}

ServiceWatch::~ServiceWatch() { QDBusConnection::disconnectFromBus(m_connectionName); }

void ServiceWatch::connectToBus()
{
    QDBusConnection bus{QDBusConnection::connectToBus(QDBusConnection::SystemBus, m_connectionName)};
    if (!bus.isConnected())
        return;
    // Qt knows signals of the bus by their names only.
    bus.connect(serviceManager(), unitPath(), QStringLiteral("org.freedesktop.DBus.Properties"),
                QStringLiteral("PropertiesChanged"), this, SLOT(noteChange()));
    // Where the first to use the bus starts it, the service manager joins it later.
    auto *joining = new QDBusServiceWatcher{serviceManager(), bus, QDBusServiceWatcher::WatchForRegistration, this};
    connect(joining, &QDBusServiceWatcher::serviceRegistered, this, &ServiceWatch::subscribe);
    subscribe();
}

void ServiceWatch::subscribe()
{
    const QDBusConnection bus{m_connectionName};
    auto *subscribed = new QDBusPendingCallWatcher{bus.asyncCall(subscription()), this};
    connect(subscribed, &QDBusPendingCallWatcher::finished, this, [this, subscribed] {
        subscribed->deleteLater();
        // What happened between the first query and the subscription was not announced.
        if (!subscribed->isError())
            noteChange();
    });
}

// A running timer is not restarted: a unit that changes all the time is noticed five times a second, not never.
void ServiceWatch::noteChange()
{
    if (!m_burst.isActive())
        m_burst.start();
}
