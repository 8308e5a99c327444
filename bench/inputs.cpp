// SPDX-License-Identifier: GPL-3.0-or-later
#include "bench/inputs.h"

#include <QFileInfo>

#include <benchmark/benchmark.h>

#include <malloc.h>

namespace inputs {

QString configuration() { return qEnvironmentVariable("ORV_BENCH_CONFIGURATION"); }
QString leases() { return qEnvironmentVariable("ORV_BENCH_LEASES"); }

QStringList keys() { return qEnvironmentVariable("ORV_BENCH_KEYS").split(QLatin1Char{'\n'}); }

double heapBytes()
{
    const struct mallinfo2 info
    {
        mallinfo2()
    };
    return static_cast<double>(info.uordblks + info.hblkhd);
}

void reportMemory(benchmark::State &state, double bytes, const QString &path)
{
    state.counters["bytes_per_byte"] = bytes / static_cast<double>(QFileInfo{path}.size());
}

} // namespace inputs
