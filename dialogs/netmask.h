// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

class QHostAddress;
class QString;

/// The dotted net mask of `prefixLength` bits for networks of the kind of `network`; empty when there is none.
QString netmaskText(const QHostAddress &network, int prefixLength);

/// The prefix length of a dotted IPv4 net mask; -1 when the text is no net mask.
int prefixLength(const QString &netmask);
