// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Observations/Observation.h"
#include "Platform/Clock.h"
#include "Platform/Result.h"
#include "PropertyLists/Value.h"
#include "Recording/MessageReader.h"
#include "Recording/Refreshes/RefreshTicks.h"
#include "Tools/Analysed/AnalysisClock.h"
#include "Tools/Analysed/MessageAnalysis.h"
#include "Tools/Decode/UndecodedMessages.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// The decoder of one technology, its state, and the analysis that gets what its messages report.
class TechnologyFeed final : private ObservationSink {
public:
    /// Fails where the technology has no decoder. `first` gets the time of the first message of all
    /// technologies and must outlive the feed.
    [[nodiscard]] static Result<std::unique_ptr<TechnologyFeed>> make(const std::string& technology,
                                                                      AnalysisClock clock,
                                                                      const MakeAnalysis& make,
                                                                      std::optional<Time>& first);

    /// Decodes the next message, of the input of that number. Returns what prevented it, or nothing.
    [[nodiscard]] std::optional<std::string> decode(const LoggedMessage& message, std::uint32_t input);

    [[nodiscard]] MessageAnalysis& analysis() { return *_analysis; }
    [[nodiscard]] const LogGenerator& decoder() const { return *_decoder; }
    /// The short name.
    [[nodiscard]] const std::string& technology() const { return _technology; }

private:
    TechnologyFeed(std::string technology, AnalysisClock clock, std::optional<Time>& first);
    void observed(const ObservedMessage& message) override;
    [[nodiscard]] bool wants(const CatalogueField& leaf) const override { return _analysis->wants(leaf); }
    [[nodiscard]] bool wantsRowKeys() const override { return _analysis->wantsRowKeys(); }
    [[nodiscard]] Time timeOf(std::optional<Time> modem);

    std::string _technology;
    std::optional<Time>& _first;
    MessageTimes _times;
    MessageClock _clock; ///< the decoder's: arrival
    std::unique_ptr<LogGenerator> _decoder;
    Dictionary _state;
    std::unique_ptr<MessageAnalysis> _analysis; ///< destroyed before the decoder, whose catalogue it uses
    MessageNumber _message;                     ///< that is being decoded
};

} // namespace velmora
