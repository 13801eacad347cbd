// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Jobs/UsableProcessors.h"

#include <algorithm>
#include <memory>

#include <sched.h>

namespace velmora {

namespace {

struct FreeSet {
    void operator()(cpu_set_t* set) const { CPU_FREE(set); }
};

/// The number of processors where a set for so many holds all of the machine's; else 0.
std::size_t countWithSetFor(int processors) {
    const std::unique_ptr<cpu_set_t, FreeSet> set(CPU_ALLOC(processors));
    const std::size_t size = CPU_ALLOC_SIZE(processors);
    if (!set || ::sched_getaffinity(0, size, set.get()) != 0)
        return 0;
    return static_cast<std::size_t>(CPU_COUNT_S(size, set.get()));
}

} // namespace

std::size_t usableProcessors() {
    constexpr int mostProcessors = 1 << 16;
    std::size_t count = 0;
    for (int size = CPU_SETSIZE; count == 0 && size <= mostProcessors; size *= 2)
        count = countWithSetFor(size);
    return std::max<std::size_t>(count, 1);
}

} // namespace velmora
