// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>

/// A lease to be made a reservation: its texts, copied, since the lease table may change at any time.
struct Reservation final
{
    QString address;
    QString mac;
    QString hostName; ///< as the client gave it
};
