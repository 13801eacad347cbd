// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Jobs/SpoolBudget.h"

#include <algorithm>
#include <new>

#include <sys/mman.h>
#include <sys/statvfs.h>

namespace velmora {

static_assert(std::atomic<std::uint64_t>::is_always_lock_free, "wanted one that processes can share");

SpoolBudget::SpoolBudget(std::uint64_t limit) : _limit(limit) {
    void* const shared =
        ::mmap(nullptr, sizeof *_held, PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
    if (shared != MAP_FAILED)
        _held = new (shared) std::atomic<std::uint64_t>(0);
}

SpoolBudget::~SpoolBudget() {
    if (_held)
        ::munmap(_held, sizeof *_held);
}

std::uint64_t SpoolBudget::limitIn(const char* directory) {
    constexpr std::uint64_t largest = std::uint64_t{4} << 30;
    struct statvfs status = {};
    if (::statvfs(directory, &status) != 0)
        return 0;
    return std::min(largest, static_cast<std::uint64_t>(status.f_bavail) * status.f_frsize / 4);
}

std::uint64_t SpoolBudget::take(std::uint64_t size) {
    if (!_held)
        return 0;
    const std::uint64_t earlier = _held->fetch_add(size);
    const std::uint64_t taken = std::min(size, _limit - std::min(_limit, earlier));
    giveBack(size - taken);
    return taken;
}

void SpoolBudget::giveBack(std::uint64_t size) {
    if (_held)
        _held->fetch_sub(size);
}

} // namespace velmora
