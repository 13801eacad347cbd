// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Memory/Allocations.h"

#include <cstdlib>
#include <new>
#include <stdexcept>

namespace velmora {

namespace {

thread_local bool isCounting = false;
thread_local std::uint64_t allocations = 0;
thread_local std::uint64_t failingAllocation = 0; ///< 0 for none

} // namespace

Allocations::Allocations(std::optional<std::uint64_t> failing) {
    if (isCounting)
        throw std::logic_error("allocations are counted already");
    isCounting = true;
    allocations = 0;
    failingAllocation = failing.value_or(0);
}

Allocations::~Allocations() {
    isCounting = false;
}

std::uint64_t Allocations::count() const {
    return allocations;
}

} // namespace velmora

// The program's own. The sanitizers' for arrays and for std::nothrow would not come to these by themselves.

void* operator new(std::size_t size) {
    using namespace velmora;
    if (isCounting && ++allocations == failingAllocation)
        throw std::bad_alloc();
    void* const memory = std::malloc(size > 0 ? size : 1);
    if (!memory)
        throw std::bad_alloc();
    return memory;
}

void* operator new[](std::size_t size) {
    return operator new(size);
}

void* operator new(std::size_t size, const std::nothrow_t&) noexcept {
    try {
        return operator new(size);
    } catch (const std::bad_alloc&) {
        return nullptr;
    }
}

void* operator new[](std::size_t size, const std::nothrow_t&) noexcept {
    return operator new(size, std::nothrow);
}

void operator delete(void* memory) noexcept {
    std::free(memory);
}

void operator delete[](void* memory) noexcept {
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}

void operator delete[](void* memory, std::size_t) noexcept {
    std::free(memory);
}
