// SPDX-License-Identifier: GPL-3.0-or-later
#include "bench/inputs.h"
#include "bench/measurement.h"
#include "config/dhcpdconfigmodel.h"

#include <benchmark/benchmark.h>

namespace {

void readConfiguration(benchmark::State &state)
{
    double memory{};
    Measurement reading;
    for (auto _ : state) {
        const double before{inputs::heapBytes()};
        DhcpdConfigModel model{{QStringLiteral("Topology"), QStringLiteral("Value")}};
        reading.begin();
        model.read(inputs::configuration());
        reading.end();
        memory = inputs::heapBytes() - before;
    }
    reading.report(state);
    inputs::reportMemory(state, memory, inputs::configuration());
}

void serializeConfiguration(benchmark::State &state)
{
    DhcpdConfigModel model{{QStringLiteral("Topology"), QStringLiteral("Value")}};
    model.read(inputs::configuration());
    Measurement writing;
    for (auto _ : state) {
        writing.begin();
        benchmark::DoNotOptimize(model.fileContent());
        writing.end();
    }
    writing.report(state);
}

BENCHMARK(readConfiguration)->Iterations(1);
BENCHMARK(serializeConfiguration)->Iterations(1);

} // namespace
