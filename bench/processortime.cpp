// SPDX-License-Identifier: GPL-3.0-or-later
#include "bench/processortime.h"

#include <ctime>

double processorMilliseconds()
{
    timespec time{};
    clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &time);
    return static_cast<double>(time.tv_sec) * 1e3 + static_cast<double>(time.tv_nsec) / 1e6;
}
