// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Comparison/ObservedDisplay.h"
#include "Analysis/Statistics/StatisticsGroups.h"
#include "Tools/Analysed/AnalysisFeed.h"
#include "Tools/Diff/DiffOptions.h"

#include <memory>
#include <string>
#include <vector>

namespace velmora {

class DecoderLines;

/// One side of a comparison, read from its file: displays or statistics, and the decoders whose catalogues
/// they use.
class DiffSide {
public:
    enum class What { Displays, Statistics };

    DiffSide(const DiffInput& input, const DiffOptions& options, What what);
    DiffSide(const DiffSide&) = delete;
    DiffSide& operator=(const DiffSide&) = delete;

    /// Returns whether all of the file was read, or all up to the time.
    [[nodiscard]] bool read(DecoderLines& lines);

    [[nodiscard]] bool hasMessages() const { return _feed.technologies() > 0; }

    struct Display {
        std::string technology; ///< the short name
        ObservedDisplay values;
    };
    [[nodiscard]] const std::vector<std::unique_ptr<Display>>& displays() const { return _displays; }
    /// Of all messages; empty without any.
    [[nodiscard]] const GroupStatistics& statistics() const;
    [[nodiscard]] const DiffInput& input() const { return _input; }

private:
    [[nodiscard]] std::unique_ptr<MessageAnalysis> makeAnalysis(const Catalogue& catalogue);

    const DiffInput& _input;
    const DiffOptions& _options;
    What _what;
    bool _isDone = false;
    std::vector<std::unique_ptr<Display>> _displays; ///< in the order of their first messages
    GroupStatistics _none;
    StatisticsGroups _groups;
    AnalysisFeed _feed; ///< destroyed before what its analyses use
};

} // namespace velmora
