// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <array>
#include <cstddef>
#include <optional>
#include <vector>

namespace velmora {

/// How strong the serving cell was over a drive, in a fixed number of equal spans of time.
class LevelBuckets {
public:
    static constexpr std::size_t count = 1024;

    struct Span {
        double sum = 0;
        std::size_t samples = 0;
    };

    /// The drive's first and last moment. `add` takes times outside of it as these.
    void setRange(Time first, Time last);
    void add(Time time, double level);

    /// Where in the drive a time lies: 0 at its beginning, 1 at its end.
    [[nodiscard]] double placeOf(Time time) const;
    /// The means of `columns` equal spans; absent where nothing was measured.
    [[nodiscard]] std::vector<std::optional<double>> means(std::size_t columns) const;

private:
    Time _first{};
    Time _last{};
    std::array<Span, count> _spans{};
};

} // namespace velmora
