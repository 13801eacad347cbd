// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/LargeAllocations.h"

#include <malloc.h>

namespace velmora {

namespace {

/// In bytes; the size that the library begins with, which setting it keeps it from changing.
constexpr int smallestLargeAllocation = 128 * 1024;

} // namespace

void returnLargeAllocations() {
#ifdef M_MMAP_THRESHOLD // not every C library keeps any
    ::mallopt(M_MMAP_THRESHOLD, smallestLargeAllocation);
#endif
}

} // namespace velmora
