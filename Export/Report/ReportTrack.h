// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Tracks/Track.h"
#include "Platform/Fix.h"

#include <cstddef>
#include <vector>

namespace velmora {

/// The way that recordings went, in bounded memory.
class ReportTrack {
public:
    static constexpr std::size_t most = 12288;

    /// Adds the track of the next file.
    void add(const Track& track);

    /// Of very many fixes every so many.
    [[nodiscard]] const std::vector<Fix>& fixes() const { return _fixes; }
    /// Whether there was no fix for longer than the largest gap before that one, so that no line leads there.
    [[nodiscard]] bool isBegin(std::size_t fix) const { return _isBegin[fix]; }
    /// Of all fixes, without gaps, in metres.
    [[nodiscard]] double length_m() const { return _length_m; }
    [[nodiscard]] bool isEmpty() const { return _fixes.empty(); }

private:
    void thin();

    std::vector<Fix> _fixes;
    std::vector<bool> _isBegin;
    double _length_m = 0;
};

} // namespace velmora
