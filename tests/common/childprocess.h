// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>

#include <functional>

/// Runs a function in a child process of which every system call is judged before the kernel acts on it, so that a test
/// can let any of them fail or end the process there.
namespace syscalljudge {

/// What becomes of a call: `proceed`, `kill` the process before it, `pretend` that it succeeded without doing it, or a
/// positive number to fail with as errno.
using Verdict = int;
constexpr Verdict proceed{0};
constexpr Verdict kill{-1};
constexpr Verdict pretend{-2};

/// Gets the number of the system call (SYS_...) and how many were judged before it.
using Judge = std::function<Verdict(int call, int index)>;

struct Outcome
{
    QString unsupported; ///< why the machine forbids it, empty when it does not
    bool killed{};
    int result{-1}; ///< what the function returned, -1 when it did not
};

/// Runs `function` (which returns 0 to 127) under `judge`. Calls that touch no file (memory, signals, clocks) proceed
/// without a judgement.
Outcome run(const std::function<int()> &function, const Judge &judge);

} // namespace syscalljudge

/// Runs `function` in a child process and returns the text that it returned; "the child died" when it did not.
QString inChild(const std::function<QString()> &function);

/// As inChild(), in a mount namespace of its own in which the child may mount. The text begins with "skip: " when the
/// machine forbids that.
QString inMountNamespace(const std::function<QString()> &function);
