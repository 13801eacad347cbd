// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// What a fuzzing engine calls. VELMORA_FUZZ_TARGET is the function that makes the target.

#include "Fuzz/FuzzTargets.h"
#include "Fuzz/QuietProcess.h"

#include <cstddef>
#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* bytes, std::size_t size) {
    static const velmora::QuietProcess quiet;
    static const auto target = velmora::VELMORA_FUZZ_TARGET();
    target->run({bytes, size});
    return 0;
}
