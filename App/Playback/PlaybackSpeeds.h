// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace velmora {

/// How fast a recording is played, as a multiple of the drive's own time.
struct PlaybackSpeed {
    double factor;
    const char* title;
};

inline constexpr PlaybackSpeed playbackSpeeds[] = {{0.1, "0.1×"}, {0.2, "0.2×"}, {0.5, "0.5×"}, {1, "1×"},
                                                   {2, "2×"},     {5, "5×"},     {10, "10×"},   {20, "20×"},
                                                   {50, "50×"},   {100, "100×"}};
/// The index of the drive's own.
inline constexpr std::size_t normalPlaybackSpeed = 3;

[[nodiscard]] inline std::vector<std::string> playbackSpeedTitles() {
    std::vector<std::string> titles;
    for (const PlaybackSpeed& speed : playbackSpeeds)
        titles.emplace_back(speed.title);
    return titles;
}

} // namespace velmora
