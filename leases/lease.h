// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "leases/leasetexts.h"
#include "leases/leasetime.h"

/// What a lease file says about one address, the texts by their numbers in the LeaseTexts of the lease's table.
struct Lease
{
    quint32 address{};
    LeaseTexts::Id mac{};
    LeaseTexts::Id host{};
    LeaseTexts::Id state{};
    LeaseTime start;
    LeaseTime end;
};

/// The columns in which a lease is shown.
enum class LeaseColumn
{
    Address,
    Mac,
    HostName,
    State,
    Start,
    End
};
