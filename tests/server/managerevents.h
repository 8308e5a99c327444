// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "server/dhcpservermanager.h"

#include <QString>
#include <QStringList>

/// What a DhcpServerManager says, each signal as one text: the name of the state, or the message after its kind.
namespace said {

inline const QString updating{QStringLiteral("Updating")};
inline const QString running{QStringLiteral("Running")};
inline const QString stopped{QStringLiteral("Stopped")};
inline const QString busy{QStringLiteral("error: Some operation with DHCP-server already executes")};
inline const QString alreadyRunning{QStringLiteral("information: DHCP-server already running")};
inline const QString alreadyStopped{QStringLiteral("information: DHCP-server already stopped")};

QString failedOperation(const QString &detail);

/// From now on everything that `manager` says is appended to `events`, which must outlive it.
void record(const DhcpServerManager &manager, QStringList &events);

} // namespace said
