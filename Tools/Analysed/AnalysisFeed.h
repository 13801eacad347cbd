// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/Result.h"
#include "Recording/MessageReader.h"
#include "Tools/Analysed/AnalysisClock.h"
#include "Tools/Analysed/MessageAnalysis.h"
#include "Tools/Analysed/TechnologyFeed.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Decodes messages of files that follow each other, or of the service, and passes what they report to one
/// analysis a technology. Decoders and analyses continue from file to file, so that a recording that is cut
/// in two is analysed like the whole one. Main thread only.
class AnalysisFeed {
public:
    AnalysisFeed(AnalysisClock clock, MakeAnalysis make);
    AnalysisFeed(const AnalysisFeed&) = delete;
    AnalysisFeed& operator=(const AnalysisFeed&) = delete;

    /// The feed of the technology of that short name, which is made when it is first asked for. Fails where
    /// the name is empty or unknown. Stays where it is.
    [[nodiscard]] Result<TechnologyFeed*> of(const std::string& technology);
    /// Passes a loss to all analyses.
    void reportLoss(const InputLoss& loss);
    /// The connection that messages come by was lost: passed to all analyses.
    void interrupt();
    /// There are no more messages: passed to all analyses.
    void finish();

    /// The time of the first message of all, by the clock of the analysis; absent before.
    [[nodiscard]] std::optional<Time> first() const { return _first; }
    /// How many technologies there have been so far.
    [[nodiscard]] std::size_t technologies() const { return _technologies.size(); }

private:
    AnalysisClock _clock;
    MakeAnalysis _make;
    std::optional<Time> _first;
    std::vector<std::unique_ptr<TechnologyFeed>> _technologies; ///< in the order of their first messages
};

} // namespace velmora
