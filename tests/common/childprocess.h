// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>
#include <QTest>

#include <functional>

/// Fails the test with what a child process tells by a text, if that is not empty; skips it when the text begins with
/// "skip: ".
#define QVERIFY_NO_PROBLEM(text)                                                                                       \
    do {                                                                                                               \
        const QString problemText{text};                                                                               \
        if (problemText.startsWith(QLatin1String("skip: ")))                                                           \
            QSKIP(qPrintable(problemText.mid(6)));                                                                     \
        QVERIFY2(problemText.isEmpty(), qPrintable(problemText));                                                      \
    } while (false)

/// Runs a function in a child process of which every system call waits for a verdict before the kernel acts on it, so
/// that a test can let any of them fail, end the process there, or change files just before it.
namespace supervisor {

/// What becomes of a call: `proceed`, `kill` the process before it, `pretend` that it succeeded without doing it, or a
/// positive number to fail with as errno.
using Verdict = int;
constexpr Verdict proceed{0};
constexpr Verdict kill{-1};
constexpr Verdict pretend{-2};

/// Called in this process with the number of a system call (SYS_...) and how many calls had a verdict before it.
using Policy = std::function<Verdict(int call, int index)>;

struct Outcome
{
    QString unsupported; ///< why the machine forbids it, empty when it does not
    bool killed{};
    int result{-1}; ///< what the function returned, -1 when it did not
};

/// Runs `function` (which returns 0 to 127) under `policy`. Calls that touch no file (memory, signals, clocks) proceed
/// without a verdict.
Outcome run(const std::function<int()> &function, const Policy &policy);

} // namespace supervisor

/// Runs `function` in a child process and returns the text that it returned; "the child died" when it did not.
QString inChild(const std::function<QString()> &function);

/// As inChild(), in a mount namespace of its own in which the child may mount. The text begins with "skip: " when the
/// machine forbids that.
QString inMountNamespace(const std::function<QString()> &function);
