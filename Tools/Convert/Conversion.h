// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/LeafChoice.h"
#include "Analysis/Tracks/Track.h"
#include "Platform/Clock.h"
#include "Platform/Fix.h"
#include "Platform/Result.h"
#include "Recording/MessageReader.h"
#include "Tools/Messages/MessageSelection.h"

#include <chrono>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

class WorkContext;

/// The forms of a file of log messages, by suffix.
enum class FileForm {
    Recording, ///< ".pcapng"
    Snapshot,  ///< ".velmora"
    DLFLog,    ///< ".dlf"
    GPX,       ///< ".gpx", a track
    GeoJSON,   ///< ".geojson", a track
    KML,       ///< ".kml", a track
    Database,  ///< ".sqlite"
};

[[nodiscard]] constexpr bool isTrack(FileForm form) {
    return form == FileForm::GPX || form == FileForm::GeoJSON || form == FileForm::KML;
}

/// Whether the form holds messages as they arrived.
[[nodiscard]] constexpr bool holdsMessages(FileForm form) {
    return !isTrack(form) && form != FileForm::Database;
}

/// Absent where the name ends in none of them.
[[nodiscard]] std::optional<FileForm> formFromName(std::string_view name);
/// "NAME that ends in" any of these: ".pcapng, .velmora, .dlf".
inline constexpr const char* formSuffixes = ".pcapng, .velmora, .dlf, .gpx, .geojson, .kml or .sqlite";
/// Of the forms that hold messages.
inline constexpr const char* messageSuffixes = ".pcapng, .velmora or .dlf";

/// What is converted, and into what.
struct Conversion {
    FileForm form = FileForm::Recording;
    std::string title;                     ///< of the input
    std::string path;                      ///< of the input; "-" is standard input
    std::string name;                      ///< of the output
    std::string temporary;                 ///< its name while it is written
    std::string technology;                ///< overrides the input's, or chooses one; empty for the input's
    std::vector<std::string> technologies; ///< see DecodingRequest
    MessageSelection messages;             ///< others are left out
    std::string description;               ///< a snapshot's
    bool isStrict = false; ///< see DecodingRequest; for a snapshot, for which the messages are decoded
    LeafChoice attributes; ///< of a track; the values of a database
    std::chrono::nanoseconds maximumGap = Track::defaultGap; ///< between the fixes of a track
    /// Of a track that the recording gets, in the order of their times; empty for none.
    std::vector<Fix> positions;
    /// The input's number of refreshes (see countRefreshes), if it could be read twice: a snapshot needs the
    /// history of the last of them only, and skipping the rest is much faster.
    std::optional<std::uint64_t> refreshes;
};

/// Reads messages to their end and writes the selected ones to an open file, which the caller owns. A
/// recording has all of them with their times; a DLF log has those that it can hold, and the others are
/// reported; a track is made of the positions (see convertToTrack), a database of what the messages report
/// (see convertToDatabase); a snapshot is the one that the
/// application would have written after the last refresh, and messages that could not be decoded are
/// reported. Returns whether all selected messages were written. Fails where such a file cannot be made of
/// them, or cannot be written; `context` gets each record's number, exceptions of the decoders pass through.
[[nodiscard]] Result<bool> convertMessages(MessageReader& reader, const Conversion& conversion,
                                           int descriptor, WorkContext& context);

} // namespace velmora
