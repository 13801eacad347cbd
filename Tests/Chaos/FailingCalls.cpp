// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// Preloaded into a program (LD_PRELOAD), this makes chosen calls of it fail: the N-th of a kind, once, a few
// times in a row, or for good. What is counted begins with `main`, so that N means the same in every run, and
// includes all threads and the children that the program forks.
//
//   VELMORA_FAIL="KIND AT TIMES ERRNO"
//       KIND   memory, read, write, sync, rename or open
//       AT     the first call that fails, from 1; 0 for none
//       TIMES  how many fail; 0 for all that follow
//   VELMORA_FAIL_COUNT=FILE
//       16 bytes: how many calls of the kind there were, how many of them failed
//   VELMORA_FAIL_ASKED
//       set: counts only between velmoraCountCalls(1) and velmoraCountCalls(0)

#include "FailingCalls.h"

#include <atomic>
#include <cerrno>
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <iterator>

#include <fcntl.h>
#include <sys/mman.h>
#include <unistd.h>

namespace velmora::failing {

namespace {

constexpr const char* kindNames[] = {"none", "memory", "read", "write", "sync", "rename", "open"};

struct Counts {
    std::atomic<std::uint64_t> calls;
    std::atomic<std::uint64_t> failed;
};

// Nothing in this library has a constructor or a destructor: the first calls come before the one, the last
// after the other.
constinit Counts ownCounts{};
constinit Counts* counts = &ownCounts;
constinit std::atomic<bool> counting{false};
constinit Kind chosen = Kind::None;
constinit std::uint64_t firstFailure = 0;
constinit std::uint64_t failures = 0; ///< 0 for all that follow
constinit int failureError = EIO;

int (*realMain)(int, char**, char**) = nullptr;

void configure() {
    const char* const wish = std::getenv("VELMORA_FAIL");
    char kind[16] = "none";
    unsigned long long at = 0;
    unsigned long long times = 0;
    if (!wish || std::sscanf(wish, "%15s %llu %llu %d", kind, &at, &times, &failureError) != 4)
        return;
    firstFailure = at;
    failures = times;
    for (std::size_t i = 0; i < sizeof kindNames / sizeof kindNames[0]; ++i)
        if (std::strcmp(kind, kindNames[i]) == 0)
            chosen = static_cast<Kind>(i);
    if (const char* const place = std::getenv("VELMORA_FAIL_COUNT")) {
        const int file = ::open(place, O_RDWR | O_CLOEXEC);
        void* const shared = ::mmap(nullptr, sizeof(Counts), PROT_READ | PROT_WRITE, MAP_SHARED, file, 0);
        ::close(file);
        if (shared != MAP_FAILED)
            counts = static_cast<Counts*>(shared);
    }
    findSparedLibraries();
    counting = std::getenv("VELMORA_FAIL_ASKED") == nullptr;
}

int countedMain(int count, char** arguments, char** environment) {
    configure();
    const int status = realMain(count, arguments, environment);
    counting = false;
    return status;
}

} // namespace

bool isCounted(Kind kind) {
    return kind == chosen && counting.load(std::memory_order_relaxed);
}

bool fails(Kind kind) {
    if (!isCounted(kind))
        return false;
    const std::uint64_t number = ++counts->calls;
    if (firstFailure == 0 || number < firstFailure || (failures != 0 && number >= firstFailure + failures))
        return false;
    ++counts->failed;
    errno = failureError;
    return true;
}

} // namespace velmora::failing

extern "C" {

// NOLINTBEGIN(bugprone-reserved-identifier,readability-inconsistent-declaration-parameter-name) the C
// library's own name; those that it gives the parameters say little

void velmoraCountCalls(int isCounting) {
    velmora::failing::counting = isCounting != 0;
}

int __libc_start_main(int (*programMain)(int, char**, char**), int count, char** arguments, void (*init)(),
                      void (*fini)(), void (*runtimeFini)(), void* stackEnd) {
    using namespace velmora::failing;
    realMain = programMain;
    return next(&__libc_start_main, "__libc_start_main")(countedMain, count, arguments, init, fini,
                                                         runtimeFini, stackEnd);
}

// NOLINTEND(bugprone-reserved-identifier,readability-inconsistent-declaration-parameter-name)

} // extern "C"
