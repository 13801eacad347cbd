// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Pseudonyms/Pseudonyms.h"
#include "Export/Tracks/PositionedReader.h"
#include "Platform/Fix.h"
#include "Tools/Analysed/AnalysisFeed.h"
#include "Tools/Log/DecoderLines.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// What a command reads for an analysis, and how.
struct AnalysedInput {
    std::vector<std::string> files; ///< "-" is standard input
    std::string technology;         ///< overrides a file's, or chooses one of several; empty for the files'
    std::optional<MaskOptions> masking; ///< absent for messages as they are
    bool showsProgress = true;          ///< of long files, on standard error where that is a terminal
    bool writesAsItGoes = false;        ///< the output is written to while files are read
    std::function<void(std::uint32_t input)> beginsFile = {}; ///< the next file, before its messages
    /// Gets the reader of the positions of the next file's messages, and null after them; null where
    /// positions are not needed.
    std::function<void(const PositionedReader* positions)> positions = {};
    /// Gets the fixes of the files: all that a message's position depends on before that message.
    std::function<void(const Fix& fix)> fixes = {};
    std::chrono::nanoseconds maximumGap = Track::defaultGap; ///< between fixes
    std::function<void()> beforeWaiting = {};                ///< more is waited for, as of a pipe
    std::function<bool()> whileWaiting = {};                 ///< as FileSource's hook
    std::function<bool()> isDone = {};                       ///< whether the rest need not be read
    /// A file has been opened, and nothing of it has been read.
    std::function<void(std::uint32_t input, MessageReader& reader)> opensFile = {};
    /// All of a file has been read that can be; its reader has what was lost, and its comments.
    std::function<void(std::uint32_t input, const MessageReader& reader)> endsFile = {};
    /// Not all of a file could be read or decoded; the reason has been reported.
    std::function<void(std::uint32_t input, const std::string& reason)> fails = {};
    std::function<void()> cleanUp = {}; ///< before the program ends on a failure of a decoder
};

/// Passes the messages of the files to the feed, one file after the other; `finish` is left to the caller.
/// What could not be read or decoded is reported on standard error. Returns whether all of it was.
[[nodiscard]] bool analyseFiles(const AnalysedInput& input, AnalysisFeed& feed, DecoderLines& lines);

} // namespace velmora
