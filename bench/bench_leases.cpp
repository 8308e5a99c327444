// SPDX-License-Identifier: GPL-3.0-or-later
#include "bench/inputs.h"
#include "bench/measurement.h"
#include "leases/dhcpdleasesmodel.h"

#include <benchmark/benchmark.h>

namespace {

void loadLeases(benchmark::State &state)
{
    double memory{};
    Measurement loading;
    for (auto _ : state) {
        const double before{inputs::heapBytes()};
        DhcpdLeasesModel model;
        loading.begin();
        model.reload(inputs::leases());
        loading.end();
        memory = inputs::heapBytes() - before;
    }
    loading.report(state);
    inputs::reportMemory(state, memory, inputs::leases());
}

BENCHMARK(loadLeases)->Iterations(1);

} // namespace
