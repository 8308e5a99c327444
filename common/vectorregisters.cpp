// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/vectorregisters.h"

#if defined(__x86_64__)

#include <immintrin.h>

namespace {

[[gnu::target("avx")]] void clearUpperHalves() { _mm256_zeroupper(); }

} // namespace

void clearVectorRegisters()
{
    if (__builtin_cpu_supports("avx"))
        clearUpperHalves();
}

#else

void clearVectorRegisters() {}

#endif
