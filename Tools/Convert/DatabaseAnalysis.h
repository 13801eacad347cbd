// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/RuleSet.h"
#include "Analysis/Statistics/LeafChoice.h"
#include "Export/Database/RecordingDatabase.h"
#include "Tools/Events/EventAnalysis.h"
#include "Tools/Messages/MessageSelection.h"

#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// What of a recording goes into its database.
struct DatabaseChoice {
    const LeafChoice& leaves;
    const MessageSelection& messages;
    std::optional<Time> first; ///< the time of the first message, once there was one

    [[nodiscard]] bool isIn(Time time) const { return isIn(time, time); }
    /// Whether any of the time from `begin` to `end` is in it.
    [[nodiscard]] bool isIn(Time begin, Time end) const {
        const TimeRange& range = messages.range;
        const Time start = first.value_or(begin);
        return TimeRange{range.from, std::nullopt}.contains(end, start) &&
               TimeRange{std::nullopt, range.to}.contains(begin, start);
    }
};

/// Puts the messages, values and events of a technology into a database. All messages are decoded, since
/// those that are left out may be what later ones depend on.
class DatabaseAnalysis final : public MessageAnalysis, private EventSink {
public:
    DatabaseAnalysis(const Catalogue& catalogue, const RuleSet& rules, DatabaseChoice& choice,
                     RecordingDatabase& database);

    void report(const MessageReport& report) override;
    void reportUndecoded(const UndecodedReport& report) override;
    void reportLoss(const InputLoss& loss) override { _events.reportLoss(loss); }
    void reportNote(const InputNote& note) override { _events.reportNote(note); }
    void finish() override { _events.finish(); }

private:
    /// In which rows the leaf is wanted; absent where it is not.
    struct Wanted {
        bool isKnown = false;
        std::optional<LeafChoice::Leaf> leaf;
    };

    void happened(const Event& event) override;
    [[nodiscard]] bool isWanted(const Observation& observation);
    void noteServing(const Observation& observation);

    std::string _technology;
    DatabaseChoice& _choice;
    RecordingDatabase& _database;
    EventAnalysis _events;
    std::vector<Wanted> _wanted; ///< by the leaf's index in the catalogue
    ObservedText _texts;
    std::string _channel; ///< serving, as it was reported last
    std::string _cell;
};

} // namespace velmora
