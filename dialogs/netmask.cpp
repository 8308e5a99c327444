// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/netmask.h"

#include <QHostAddress>
#include <QNetworkAddressEntry>

QString netmaskText(const QHostAddress &network, int prefixLength)
{
    QNetworkAddressEntry entry;
    entry.setIp(network);
    entry.setPrefixLength(prefixLength);
    return entry.netmask().toString();
}

int prefixLength(const QString &netmask)
{
    return QHostAddress::parseSubnet(QStringLiteral("0.0.0.0/") + netmask).second;
}
