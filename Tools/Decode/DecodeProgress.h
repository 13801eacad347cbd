// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// How far a long file has been decoded, as a line: "37 %, 85 MiB/s, 12 s left". Reads the clock at most once
/// a MiB, and shows a line at most five times a second.
class DecodeProgress {
public:
    /// Shorter input is done too soon for a progress line.
    static constexpr std::uint64_t smallestInput = std::uint64_t{64} << 20;

    using Print = std::function<void(std::string_view line)>;

    /// `size`: the input's, in bytes, above 0. `clock` must outlive it. Prints 0 % immediately.
    DecodeProgress(std::uint64_t size, const Clock& clock, Print print);

    /// The input has been read up to there.
    void at(std::uint64_t offset) {
        if (offset >= _nextUpdate)
            update(offset);
    }

private:
    void update(std::uint64_t offset);

    std::uint64_t _size;
    const Clock& _clock;
    Print _print;
    Time _started;
    Time _shown;
    std::uint64_t _nextUpdate;
};

/// The size of a regular file, "-" being standard input; absent for pipes, devices and missing files.
[[nodiscard]] std::optional<std::uint64_t> inputSize(const std::string& path);

} // namespace velmora
