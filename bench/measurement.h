// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QElapsedTimer>

#include <limits>
#include <string>

namespace benchmark {
class State;
}

/// The shortest of several runs of one thing, in processor time of this process and by the clock on the wall.
class Measurement final
{
public:
    void begin();
    /// Ends the run that began last.
    void end();

    /// Reports both as counters, "cpu_ms" and "wall_ms" with `suffix`.
    void report(benchmark::State &state, const std::string &suffix = {}) const;

private:
    static constexpr double none{std::numeric_limits<double>::max()};

    QElapsedTimer m_sinceBegin;
    double m_processorAtBegin{};
    double m_processor{none};
    double m_wall{none};
};
