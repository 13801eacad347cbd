// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <optional>

namespace velmora {

/// Counts what this thread gets from `new` for as long as it lives, and has one of it fail: with
/// std::bad_alloc, as where memory is short. One at a time.
class Allocations {
public:
    /// `failing`: the allocation that fails, from 1; none without.
    explicit Allocations(std::optional<std::uint64_t> failing = std::nullopt);
    ~Allocations();
    Allocations(const Allocations&) = delete;
    Allocations& operator=(const Allocations&) = delete;

    [[nodiscard]] std::uint64_t count() const;
};

} // namespace velmora
