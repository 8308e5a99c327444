// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/support/fakeservicemanager.h"

#include <QDBusMessage>
#include <QVariantMap>

#include <unistd.h>

namespace {

QString serviceName() { return QStringLiteral("org.freedesktop.systemd1"); }
QString connectionName() { return QStringLiteral("FakeServiceManager"); }

} // namespace

QString FakeServiceManager::chooseAddress()
{
    const QString address{QStringLiteral("unix:abstract=orv-test-bus-%1").arg(getpid())};
    qputenv("DBUS_SYSTEM_BUS_ADDRESS", address.toLatin1());
    return address;
}

FakeServiceManager::FakeServiceManager(const QString &address)
{
    m_daemon.start(QStringLiteral("dbus-daemon"),
                   {QStringLiteral("--session"), QStringLiteral("--nofork"), QStringLiteral("--nopidfile"),
                    QStringLiteral("--nosyslog"), QStringLiteral("--print-address"),
                    QStringLiteral("--address=") + address});
    // The address is printed when the bus can be reached.
    if (!m_daemon.waitForReadyRead(-1))
        return;
    m_bus = std::make_unique<QDBusConnection>(QDBusConnection::connectToBus(address, connectionName()));
    m_bus->registerObject(QStringLiteral("/org/freedesktop/systemd1"), this, QDBusConnection::ExportScriptableSlots);
    join();
}

FakeServiceManager::~FakeServiceManager()
{
    m_bus.reset();
    QDBusConnection::disconnectFromBus(connectionName());
    m_daemon.kill();
    m_daemon.waitForFinished();
}

void FakeServiceManager::leave()
{
    m_bus->unregisterService(serviceName());
    m_subscribers = 0;
}

void FakeServiceManager::join() { m_bus->registerService(serviceName()); }

void FakeServiceManager::announce(const QString &unit)
{
    if (m_subscribers == 0)
        return;
    QDBusMessage signal{QDBusMessage::createSignal(QStringLiteral("/org/freedesktop/systemd1/unit/") + unit,
                                                   QStringLiteral("org.freedesktop.DBus.Properties"),
                                                   QStringLiteral("PropertiesChanged"))};
    signal << QStringLiteral("org.freedesktop.systemd1.Unit") << QVariantMap{} << QStringList{};
    m_bus->send(signal);
}
