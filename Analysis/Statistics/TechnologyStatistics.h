// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "Analysis/Picture/RadioPicture.h"
#include "Analysis/Statistics/CountedLeaves.h"
#include "Analysis/Statistics/HeldStates.h"
#include "Analysis/Statistics/ServingCells.h"
#include "Analysis/Statistics/StatisticsGroups.h"

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <map>
#include <optional>
#include <vector>

namespace velmora {

/// Makes the statistics of what the messages of one technology report. A time that goes back by at most
/// `largestStepBack` counts as none; where it goes back further, where no message came for more than
/// `longestSilence`, and where messages are missing, what held before is forgotten.
class TechnologyStatistics {
public:
    static constexpr std::chrono::seconds longestSilence{30};
    static constexpr std::chrono::seconds largestStepBack{1};
    /// Further squares count as one.
    static constexpr std::size_t mostSquares = 100'000;

    /// Catalogue and groups must outlive it.
    TechnologyStatistics(const Catalogue& catalogue, StatisticsGroups& groups);

    /// Only these times count. Call it before the first message; the default is all times.
    void setCounted(const CountedTimes& counted) { _counted = counted; }
    /// Whether it uses what messages report of the leaf.
    [[nodiscard]] bool wants(const CatalogueField& leaf) const;
    void report(const MessageReport& report);
    /// Messages may be missing between the latest one and the next.
    void interrupt();
    /// There are no more messages.
    void finish();

private:
    /// What decides to which group a message belongs.
    struct Place {
        bool counts = false; ///< whether the time counts; in no group where it does not
        std::uint32_t input = 0;
        Time minute{};
        std::uint32_t cell = ServingCells::unknown;

        friend bool operator==(const Place&, const Place&) = default;
    };

    /// The number of the square, as those of cells.
    [[nodiscard]] std::uint32_t numberOf(const std::optional<Square>& square);
    /// Names a group of a cell or a square.
    void name(GroupStatistics& group) const;
    [[nodiscard]] GroupKey keyOf(const Place& place) const;
    /// Time passes, from what has passed already up to there.
    void pass(Time time);
    /// What follows, from that time on, belongs to the group of this time, file and cell.
    void enter(Time time);
    void observe(const Observation& observation, Time time);
    [[nodiscard]] LeafStatistics* statisticsOf(const CatalogueField& leaf, CountedLeaf& use) {
        if (!use.statistics && _part)
            use.statistics = _groups.of(*_part, leaf, use.name);
        return use.statistics;
    }
    [[nodiscard]] WorstMinute& minutesOf(Role role, WorstMinute::Measure measure);
    [[nodiscard]] bool has(StatisticsPlan::By by) const { return _groups.plan().by == by; }

    const Catalogue& _catalogue;
    StatisticsGroups& _groups;
    CountedTimes _counted;
    RadioPicture _picture; ///< for cells alone
    HeldStates _held;
    ObservedText _texts;
    CountedLeaves _leaves;
    std::optional<Time> _now; ///< up to which time has passed; absent after an interruption
    Place _place;
    ServingCells _cells;
    std::map<Square, std::uint32_t> _squares; ///< their numbers, from 1 on
    std::vector<Square> _squaresByNumber;
    std::uint32_t _cell = ServingCells::unknown; ///< or the square
    GroupStatistics* _group = nullptr;           ///< the current one; null where nothing counts
    TechnologyPart* _part = nullptr;             ///< of the group
    std::uint32_t _input = 0;
};

} // namespace velmora
