// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// Failing calls for memory. Memory that Qt allocates with the C library's functions is left alone: Qt does
// not check whether it got it (QObject::connect does not), so that its callers cannot either. What it
// allocates with `new` is counted, but for what a QWaitCondition consists of: Qt's record of a thread has
// one, and its clean-up after that failure follows a pointer that is not set yet. For the main thread this is
// while the event loop is made, before a program has opened anything.

#include "FailingCalls.h"

#include <algorithm>
#include <cerrno>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <iterator>
#include <new>

#include <link.h>

extern "C" {
// NOLINTBEGIN(bugprone-reserved-identifier) the C library's own names of what is replaced here
void* __libc_malloc(std::size_t size);
void* __libc_calloc(std::size_t count, std::size_t size);
void* __libc_realloc(void* memory, std::size_t size);
void* __libc_memalign(std::size_t alignment, std::size_t size);
// NOLINTEND(bugprone-reserved-identifier)
}

namespace velmora::failing {

namespace {

/// Where a library's code lies.
struct Code {
    std::uintptr_t begin;
    std::uintptr_t end;
};
constinit Code spared[8] = {};
constinit std::size_t sparedCount = 0;

int noteSpared(dl_phdr_info* library, std::size_t, void*) {
    if (!std::strstr(library->dlpi_name, "/libQt6"))
        return 0;
    for (int i = 0; i < library->dlpi_phnum; ++i) {
        const auto& part = library->dlpi_phdr[i];
        if (part.p_type == PT_LOAD && (part.p_flags & PF_X) != 0 && sparedCount < std::size(spared)) {
            const std::uintptr_t begin = library->dlpi_addr + part.p_vaddr;
            spared[sparedCount++] = {begin, begin + part.p_memsz};
        }
    }
    return 0;
}

bool isSpared(const void* caller) {
    const auto address = reinterpret_cast<std::uintptr_t>(caller);
    return std::any_of(spared, spared + sparedCount,
                       [=](const Code& code) { return address >= code.begin && address < code.end; });
}

bool isOfWaitCondition(const void* caller) {
    Dl_info place = {};
    return isSpared(caller) && ::dladdr(caller, &place) != 0 && place.dli_sname &&
           std::strstr(place.dli_sname, "14QWaitConditionC");
}

bool failsFor(const void* caller) {
    return isCounted(Kind::Memory) && !isSpared(caller) && fails(Kind::Memory);
}

bool failsForNew(const void* caller) {
    return isCounted(Kind::Memory) && !isOfWaitCondition(caller) && fails(Kind::Memory);
}

} // namespace

void findSparedLibraries() {
    ::dl_iterate_phdr(noteSpared, nullptr);
}

} // namespace velmora::failing

using velmora::failing::failsFor;

extern "C" {

// The names that the C library gives the parameters say little.
// NOLINTBEGIN(readability-inconsistent-declaration-parameter-name)

void* malloc(std::size_t size) {
    return failsFor(__builtin_return_address(0)) ? nullptr : __libc_malloc(size);
}

void* calloc(std::size_t count, std::size_t size) {
    return failsFor(__builtin_return_address(0)) ? nullptr : __libc_calloc(count, size);
}

void* realloc(void* memory, std::size_t size) {
    return failsFor(__builtin_return_address(0)) ? nullptr : __libc_realloc(memory, size);
}

void* aligned_alloc(std::size_t alignment, std::size_t size) {
    return failsFor(__builtin_return_address(0)) ? nullptr : __libc_memalign(alignment, size);
}

void* memalign(std::size_t alignment, std::size_t size) {
    return failsFor(__builtin_return_address(0)) ? nullptr : __libc_memalign(alignment, size);
}

int posix_memalign(void** memory, std::size_t alignment, std::size_t size) {
    void* const made = failsFor(__builtin_return_address(0)) ? nullptr : __libc_memalign(alignment, size);
    if (!made)
        return ENOMEM;
    *memory = made;
    return 0;
}

// NOLINTEND(readability-inconsistent-declaration-parameter-name)

} // extern "C"

// Replaced as well, so that the caller is known to be a function of Qt and not the C++ library.
void* operator new(std::size_t size) {
    const bool isFailing = velmora::failing::failsForNew(__builtin_return_address(0));
    void* const memory = isFailing ? nullptr : __libc_malloc(size);
    if (!memory)
        throw std::bad_alloc();
    return memory;
}

void operator delete(void* memory) noexcept {
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}
