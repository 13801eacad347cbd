// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Recording/Positions/FixAssembler.h"
#include "Recording/Positions/PositionSentence.h"

#include <cstdint>
#include <functional>
#include <optional>
#include <utility>
#include <vector>

namespace velmora {

/// Where a time lies, as seen from a range.
enum class RangeSide : std::uint8_t { Before, Within, After };

/// The sentences of a recording that a part of it keeps: those within the part's range of time, and of the
/// others those of one fix before it and one after it, since the first and the last messages lie between
/// these and the fixes within. Main thread only.
class SentencesOfRange {
public:
    using SideOf = std::function<RangeSide(Time time)>;
    /// The sentence's block in the recording.
    using Block = std::vector<std::uint8_t>;
    using Keep = std::function<void(Block block)>;

    /// `keep` gets the blocks, in the recording's order.
    SentencesOfRange(SideOf sideOf, Keep keep) : _sideOf(std::move(sideOf)), _keep(std::move(keep)) {}

    void add(const PositionSentence& sentence, Block block);
    /// A message of the range follows.
    void addMessage() { beginRange(); }
    /// The next block is of another section, or there is none.
    void endSection();

private:
    void beginRange();
    /// The sentences up to now are those of a fix, or of none.
    void endFix(const std::optional<Fix>& fix);

    SideOf _sideOf;
    Keep _keep;
    FixAssembler _assembler;
    std::vector<Block> _fixBefore; ///< the latest one before the range
    std::vector<Block> _present;   ///< those since the last fix that are not kept yet
    bool _reachesIn = false;       ///< the present sentences began within the range
    bool _isBegun = false;         ///< there has been something within the range
    bool _isComplete = false;      ///< so has the fix after it
};

} // namespace velmora
