// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

namespace velmora {

/// A sum of doubles that is rounded once, at the end, so that it does not depend on the order of its terms.
/// After an overflow it is no finite number.
class ExactSum {
public:
    void add(double value);
    /// The value so many times. Precondition: below 2^53 times.
    void add(double value, std::uint64_t times);
    void add(const ExactSum& other);

    /// The double that is nearest to the exact sum.
    [[nodiscard]] double value() const;

private:
    /// Their exact sum is the sum: no two have a bit of the same weight, and the largest is the last. At most
    /// about forty, since a double has no more range.
    std::vector<double> _parts;
};

} // namespace velmora
