// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/MessageReader.h"
#include "Tools/Decode/UndecodedMessages.h"
#include "Tools/Info/MessageSummary.h"
#include "Tools/Messages/CodeNames.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// What a file holds of one technology.
struct TechnologyInfo {
    std::string name; ///< empty where the file does not say it
    MessageSummary summary;
    CodeNames names;
};

/// What a file holds of positions.
struct PositionInfo {
    std::uint64_t fixes = 0;
    std::optional<Time> first; ///< of them
    std::optional<Time> last;
    std::uint64_t messages = 0; ///< with a position
};

/// What a file holds, beside what its reader says.
struct FileInfo {
    std::vector<TechnologyInfo> technologies; ///< in the file's order; at least one
    PositionInfo positions;
    UndecodedMessages undecoded;
};

} // namespace velmora
