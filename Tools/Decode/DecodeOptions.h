// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Tracks/Track.h"
#include "Tools/Decode/Paths/NodeSelection.h"
#include "Tools/Mask/MaskOption.h"
#include "Tools/Messages/MessageSelection.h"
#include "Tools/Text/CSVText.h"

#include <chrono>
#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log decode`: runs each file through its technology's decoder and shows what the screens show.
struct DecodeOptions {
    enum class Format {
        Text,      ///< the final display tree
        Json,      ///< one final object
        JsonLines, ///< an object on one line for each refresh or message
        Csv,       ///< a row for each refresh or message
    };
    enum class Every { Refresh, Message };

    Format format = Format::Text;
    Every every = Every::Refresh; ///< `Message` for JsonLines and Csv alone
    /// Observations instead of the display: none, a line for each value (JsonLines and Csv), or a row for
    /// each message (Csv).
    enum class Samples { None, Long, Wide } samples = Samples::None;
    NodeSelection selection; ///< not empty for Csv without or with wide samples
    /// For JsonLines and Csv at each refresh: older values are left out. Absent for no limit.
    std::optional<std::chrono::nanoseconds> maximumAge;
    bool hasPositions = false;                               ///< samples have the position of their message
    std::chrono::nanoseconds maximumGap = Track::defaultGap; ///< between fixes; with positions
    CSVGuard guard = CSVGuard::Off;                          ///< for Csv alone
    MessageSelection messages;
    std::string technology; ///< overrides the file's, or chooses one of several; empty for the file's
    bool isStrict = false;  ///< a message that ends the application ends decoding as well
    MaskOption mask;
    std::optional<std::size_t> jobs; ///< files that are decoded in parallel; absent: one a processor
    std::vector<std::string> files;
    /// Csv rows name their technology. Not an option: it follows from the files.
    bool hasTechnologyColumn = false;
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addDecode(CLI::App& app, DecodeOptions& options);

} // namespace velmora
