// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Tracks/Track.h"
#include "Tools/Decode/Paths/NodeSelection.h"
#include "Tools/Fields/RoleSelection.h"
#include "Tools/Messages/MessageSelection.h"

#include <chrono>
#include <string>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log convert`: a file of log messages in another form. The new file is renamed into place when
/// complete, so that no failure leaves part of one.
struct ConvertOptions {
    std::string file; ///< "-" for standard input
    /// The output; precondition: its name has a form, see `formFromName`.
    std::string out;
    MessageSelection messages;
    std::string track;       ///< a file of positions that the recording gets; empty for none
    NodeSelection selection; ///< the attributes of a track, with the roles
    RoleSelection roles;     ///< of both none for the serving cell's level and quality
    std::chrono::nanoseconds maximumGap = Track::defaultGap; ///< between the fixes of a track
    bool force = false;                                      ///< replace an existing file
    std::string technology;                                  ///< overrides the file's; empty for the file's
    std::string description;                                 ///< a snapshot's
    bool isStrict = false;                                   ///< for a snapshot: see DecodeOptions
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addConvert(CLI::App& app, ConvertOptions& options);

} // namespace velmora
