// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <atomic>
#include <cstdint>

namespace velmora {

/// How much the spools of all jobs may hold together, counted in memory that their processes share. Without
/// that memory they may hold nothing.
class SpoolBudget {
public:
    explicit SpoolBudget(std::uint64_t limit);
    ~SpoolBudget();
    SpoolBudget(const SpoolBudget&) = delete;
    SpoolBudget& operator=(const SpoolBudget&) = delete;

    /// What spools in that directory may hold: 4 GiB, and at most a quarter of what is free there.
    [[nodiscard]] static std::uint64_t limitIn(const char* directory);

    /// How many of so many bytes there is room for; they are counted from now on.
    [[nodiscard]] std::uint64_t take(std::uint64_t size);
    void giveBack(std::uint64_t size);

private:
    std::uint64_t _limit;
    std::atomic<std::uint64_t>* _held = nullptr;
};

} // namespace velmora
