// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Tracks/Track.h"
#include "Platform/Fix.h"
#include "Recording/MessageReader.h"
#include "Recording/Positions/FixAssembler.h"

#include <chrono>
#include <vector>

namespace velmora {

/// Collects the fixes of a file while its messages are read: about 120 bytes a fix. For what needs the whole
/// track; `PositionedReader` has the positions while messages are read.
class TrackCollector {
public:
    /// Nothing has been read of `reader`, which must outlive it.
    explicit TrackCollector(MessageReader& reader);
    TrackCollector(const TrackCollector&) = delete;
    TrackCollector& operator=(const TrackCollector&) = delete;
    ~TrackCollector();

    /// The track of what has been read, which is taken out. Call it once, when the messages have been read.
    [[nodiscard]] Track takeTrack(std::chrono::nanoseconds maximumGap = Track::defaultGap);

private:
    MessageReader& _reader;
    FixAssembler _assembler;
    std::vector<Fix> _fixes;
};

} // namespace velmora
