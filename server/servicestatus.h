// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

class QByteArray;

/// What "systemctl status" printed, UTF-8, says of the service. A text may say both, or neither.
struct ServiceStatus
{
    explicit ServiceStatus(const QByteArray &printed);

    bool stopped{};
    bool running{};
    bool exited{}; ///< the init script has done its work, but no server is left; it counts as stopped
    bool failed{}; ///< the server has died, or its unit could not be started
};
