// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdlib>

// What a target defines, as libFuzzer calls it: once at first, and for each input.
extern "C" int LLVMFuzzerInitialize(int *argc, char ***argv);
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size);

/// Ends the program, which the fuzzer takes for a finding, unless `holds`.
inline void require(bool holds)
{
    if (!holds)
        std::abort();
}
