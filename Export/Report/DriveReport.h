// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/RuleSet.h"
#include "Analysis/Statistics/StatisticsGroups.h"
#include "Export/Report/ReportEvents.h"
#include "Export/Report/ReportInput.h"
#include "Export/Report/ReportTrack.h"
#include "Export/Report/TechnologyReport.h"
#include "Export/Report/TimeSpans.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

class MessageReader;

/// A page about recordings that follow each other, or about two that are compared: filled message by message,
/// and written at the end. Its memory does not grow with the number of messages. Main thread only.
class DriveReport {
public:
    struct Options {
        std::vector<std::string> files;    ///< their names, as the page shows them
        const RuleSet* rules = nullptr;    ///< of further events; null for none
        bool hasIdentities = false;        ///< of subscriber and phone, and their addresses
        std::string generator = "Velmora"; ///< what made the page, with its version
    };
    explicit DriveReport(Options options);

    /// For the messages of a technology. Its catalogue must outlive this.
    [[nodiscard]] TechnologyReport& of(const Catalogue& catalogue);
    /// A message of the input of that number, of whatever technology, before the report gets it.
    void count(MessageNumber message, Time time);
    /// What the reader of that input has met; at its end.
    void endInput(std::uint32_t input, const MessageReader& reader);
    /// Where the next input's receiver of positions was.
    void addTrack(const Track& track) { _track.add(track); }
    /// Not all of the input could be read or decoded. The latest reason is shown.
    void fail(std::uint32_t input, std::string reason);
    /// There are no more messages. Call it before `write`.
    void finish();

    /// Writes the page: `put` gets it in pieces.
    void write(const std::function<void(std::string_view)>& put) const;

    [[nodiscard]] const Options& options() const { return _options; }
    [[nodiscard]] std::span<const ReportInput> inputs() const { return _inputs; }
    [[nodiscard]] const std::vector<std::unique_ptr<TechnologyReport>>& technologies() const {
        return _technologies;
    }
    [[nodiscard]] const ReportEvents& events() const { return _events; }
    /// One for each of two inputs, of the same numbers; otherwise one. Empty without messages.
    [[nodiscard]] const std::vector<std::unique_ptr<GroupStatistics>>& groups() const {
        return _groups.groups();
    }
    /// Whether two inputs are compared.
    [[nodiscard]] bool isComparison() const { return _inputs.size() == 2; }
    /// How many messages the inputs before this one have: what makes a number of all messages of one of an
    /// input's.
    [[nodiscard]] std::uint64_t numbersBefore(std::uint32_t input) const;
    [[nodiscard]] const TimeSpans& spans() const { return _spans; }
    /// Empty where there are no positions.
    [[nodiscard]] const ReportTrack& track() const { return _track; }

private:
    Options _options;
    std::vector<ReportInput> _inputs;
    TimeSpans _spans;
    ReportTrack _track;
    ReportEvents _events;
    StatisticsGroups _groups;
    std::vector<std::unique_ptr<TechnologyReport>> _technologies;
};

} // namespace velmora
