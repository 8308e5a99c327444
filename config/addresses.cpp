// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/addresses.h"

#include <algorithm>

namespace addresses {

bool isUsable(const QHostAddress &address)
{
    return !address.isNull() && !address.isLoopback() && !address.isBroadcast();
}

bool isUsableList(const QString &list)
{
    const QStringList pieces{list.split(QLatin1Char{','})};
    return std::all_of(pieces.begin(), pieces.end(),
                       [](const QString &piece) { return isUsable(QHostAddress{piece}); });
}

std::optional<QNetworkAddressEntry> parseSubnet(const QString &text)
{
    const auto [address, prefixLength] = QHostAddress::parseSubnet(text);
    if (address.isNull() || prefixLength == -1)
        return {};
    QNetworkAddressEntry subnet;
    subnet.setIp(address);
    subnet.setPrefixLength(prefixLength);
    return subnet;
}

std::optional<QNetworkAddressEntry> subnetOf(const DhcpdConfigStatement &statement)
{
    QNetworkAddressEntry subnet;
    subnet.setIp(QHostAddress{statement.word(1)});
    subnet.setNetmask(QHostAddress{statement.word(3)});
    if (subnet.ip().isNull() || subnet.netmask().isNull() || subnet.prefixLength() == -1)
        return {};
    return subnet;
}

bool isUsableIn(const QNetworkAddressEntry &subnet, const QHostAddress &address)
{
    return isUsable(address) && address.isInSubnet(subnet.ip(), subnet.prefixLength());
}

} // namespace addresses
