// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <random>

namespace velmora {

/// A scenario's pseudo-random numbers: the same seed results in the same numbers on every machine. The engine
/// is the standard one, whose numbers are fixed; the distributions are our own, since the standard library's
/// differ from one implementation to the next.
class ScenarioRandom {
public:
    explicit ScenarioRandom(std::uint64_t seed) : _engine(seed) {}

    /// Evenly spread over 0 <= x < 1, in steps of 2^-53.
    [[nodiscard]] double unit() { return static_cast<double>(_engine() >> 11) * 0x1p-53; }

    /// Evenly spread over low..high, both included. Precondition: low <= high.
    [[nodiscard]] int between(int low, int high) {
        return low + static_cast<int>(unit() * (static_cast<double>(high) - low + 1));
    }

    [[nodiscard]] bool chance(double probability) { return unit() < probability; }

    /// Near enough a normal distribution of mean 0 and deviation 1, within -6..6: the sum of twelve uniform
    /// numbers, which needs no function that libraries round differently.
    [[nodiscard]] double normal() {
        double sum = -6;
        for (int i = 0; i < 12; ++i)
            sum += unit();
        return sum;
    }

private:
    std::mt19937_64 _engine;
};

} // namespace velmora
