// SPDX-License-Identifier: GPL-3.0-or-later
#include "bench/inputs.h"
#include "leases/dhcpdleasesmodel.h"

#include <benchmark/benchmark.h>

namespace {

void loadLeases(benchmark::State &state)
{
    double memory{};
    for (auto _ : state) {
        state.PauseTiming();
        {
            const double before{inputs::heapBytes()};
            DhcpdLeasesModel model;
            state.ResumeTiming();
            model.reload(inputs::leases());
            state.PauseTiming();
            memory = inputs::heapBytes() - before;
        }
        state.ResumeTiming();
    }
    inputs::reportMemory(state, memory, inputs::leases());
}

BENCHMARK(loadLeases)->Unit(benchmark::kMillisecond);

} // namespace
