// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/dhcpdconfigstatement.h"

#include <QHostAddress>
#include <QNetworkAddressEntry>
#include <QString>

#include <optional>

/// Checks on addresses that the configuration model's edits share.
namespace addresses {

/// Whether a host can have the address: it is neither null, loopback nor broadcast.
bool isUsable(const QHostAddress &address);

/// Whether `list` is addresses that hosts can have, with commas between them.
bool isUsableList(const QString &list);

/// The network that `text` names, for example as "10.1.2.0/24"; nothing when it names none.
std::optional<QNetworkAddressEntry> parseSubnet(const QString &text);

/// The network of a subnet statement; nothing when its words name none.
std::optional<QNetworkAddressEntry> subnetOf(const DhcpdConfigStatement &statement);

/// Whether a host in `subnet` can have the address.
bool isUsableIn(const QNetworkAddressEntry &subnet, const QHostAddress &address);

} // namespace addresses
