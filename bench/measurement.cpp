// SPDX-License-Identifier: GPL-3.0-or-later
#include "bench/measurement.h"

#include "bench/processortime.h"

#include <benchmark/benchmark.h>

#include <algorithm>

void Measurement::begin()
{
    m_sinceBegin.start();
    m_processorAtBegin = processorMilliseconds();
}

void Measurement::end()
{
    m_processor = std::min(m_processor, processorMilliseconds() - m_processorAtBegin);
    m_wall = std::min(m_wall, static_cast<double>(m_sinceBegin.nsecsElapsed()) / 1e6);
}

void Measurement::report(benchmark::State &state, const std::string &suffix) const
{
    state.counters["cpu_ms" + suffix] = m_processor;
    state.counters["wall_ms" + suffix] = m_wall;
}
