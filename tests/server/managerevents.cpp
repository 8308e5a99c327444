// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/server/managerevents.h"

#include <QMetaEnum>

namespace said {

QString failedOperation(const QString &detail)
{
    return QStringLiteral("error: Operation with DHCP-server failed\n") + detail;
}

void record(const DhcpServerManager &manager, QStringList &events)
{
    QObject::connect(&manager, &DhcpServerManager::serverStateChanged, &manager,
                     [&events](DhcpServerManager::ServerStates state) {
                         const QMetaEnum states{QMetaEnum::fromType<DhcpServerManager::ServerStates>()};
                         events.append(QString::fromLatin1(states.valueToKey(state)));
                     });
    QObject::connect(&manager, &DhcpServerManager::error, &manager,
                     [&events](const QString &message) { events.append(QStringLiteral("error: ") + message); });
    QObject::connect(&manager, &DhcpServerManager::information, &manager,
                     [&events](const QString &message) { events.append(QStringLiteral("information: ") + message); });
}

} // namespace said
