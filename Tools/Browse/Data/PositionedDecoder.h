// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "Platform/Result.h"
#include "Playback/PlayedDecoder.h"
#include "Tools/Browse/Data/BrowsedFile.h"

#include <cstdint>
#include <memory>

namespace velmora {

/// A decoder that a pass observes from some message of a file on: it goes on where it can, and otherwise
/// begins at a checkpoint of the index. Main thread only.
class PositionedDecoder {
public:
    /// Both must outlive it.
    PositionedDecoder(const BrowsedFile& file, ObservationSink& sink) : _file(file), _sink(sink) {}
    ~PositionedDecoder();
    PositionedDecoder(const PositionedDecoder&) = delete;
    PositionedDecoder& operator=(const PositionedDecoder&) = delete;

    /// Stands at that position or before it. `lead`: so many messages before it have been decoded, where the
    /// file has them. The result is whether it began anew, at `beginning`.
    Result<bool> standBefore(std::uint64_t position, std::uint64_t lead = 0);
    /// The time of the latest message before the first that it has decoded.
    [[nodiscard]] Time beginning() const { return _beginning; }

    /// Precondition: `standBefore` has succeeded.
    [[nodiscard]] PlayedDecoder* operator->() const { return _decoder.get(); }

private:
    void end();

    const BrowsedFile& _file;
    ObservationSink& _sink;
    std::unique_ptr<PlayedDecoder> _decoder;
    Time _beginning{};
};

} // namespace velmora
