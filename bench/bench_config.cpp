// SPDX-License-Identifier: GPL-3.0-or-later
#include "bench/inputs.h"
#include "config/dhcpdconfigmodel.h"

#include <benchmark/benchmark.h>

namespace {

void readConfiguration(benchmark::State &state)
{
    double memory{};
    for (auto _ : state) {
        state.PauseTiming();
        {
            const double before{inputs::heapBytes()};
            DhcpdConfigModel model{{QStringLiteral("Topology"), QStringLiteral("Value")}};
            state.ResumeTiming();
            model.read(inputs::configuration());
            state.PauseTiming();
            memory = inputs::heapBytes() - before;
        }
        state.ResumeTiming();
    }
    inputs::reportMemory(state, memory, inputs::configuration());
}

void serializeConfiguration(benchmark::State &state)
{
    DhcpdConfigModel model{{QStringLiteral("Topology"), QStringLiteral("Value")}};
    model.read(inputs::configuration());
    for (auto _ : state)
        benchmark::DoNotOptimize(model.fileContent());
}

BENCHMARK(readConfiguration)->Unit(benchmark::kMillisecond);
BENCHMARK(serializeConfiguration)->Unit(benchmark::kMillisecond);

} // namespace
