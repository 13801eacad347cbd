// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <pugixml.hpp>

#include <cstddef>

namespace velmora {

/// Limits pugixml's memory during its lifetime: a document of nothing but tags and attributes takes many
/// times its own size. pugixml has one allocator per process, hence the static; main thread only.
class PugixmlMemoryBudget {
public:
    explicit PugixmlMemoryBudget(std::size_t bytes)
        : _allocate(pugi::get_memory_allocation_function()),
          _deallocate(pugi::get_memory_deallocation_function()) {
        left = bytes;
        exhausted = false;
        allocate = _allocate;
        pugi::set_memory_management_functions(&allocateWithin, _deallocate);
    }
    ~PugixmlMemoryBudget() { pugi::set_memory_management_functions(_allocate, _deallocate); }
    PugixmlMemoryBudget(const PugixmlMemoryBudget&) = delete;
    PugixmlMemoryBudget& operator=(const PugixmlMemoryBudget&) = delete;

    /// Whether the limit was hit; otherwise a failed allocation means that the machine is out of memory.
    [[nodiscard]] bool isExhausted() const { return exhausted; }

private:
    static void* allocateWithin(std::size_t size) {
        exhausted = exhausted || size > left;
        if (size > left)
            return nullptr;
        left -= size;
        return allocate(size);
    }

    static inline std::size_t left = 0;
    static inline bool exhausted = false;
    static inline pugi::allocation_function allocate = nullptr;

    pugi::allocation_function _allocate;
    pugi::deallocation_function _deallocate;
};

} // namespace velmora
