// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/SampleRing.h"

#include <cstddef>
#include <memory>

namespace velmora {

/// The memory of a program's series: all of them together take at most `byteLimit`, whatever is appended.
/// The 32 MiB of the default hold 24 hours of 20 series with a sample a second, and more of fewer series. A
/// ring lives as long as its users; the store may go before its rings.
class SampleStore {
public:
    static constexpr std::size_t defaultByteLimit = std::size_t(32) << 20;

    explicit SampleStore(std::size_t byteLimit = defaultByteLimit);
    ~SampleStore();

    /// A new series whose values count for at most that long.
    [[nodiscard]] std::shared_ptr<SampleRing> makeSeries(std::int64_t gapLimit_ns);
    /// What the rings and the blocks kept for reuse take now.
    [[nodiscard]] std::size_t byteCount() const;

private:
    std::shared_ptr<SamplePool> _pool;
};

} // namespace velmora
