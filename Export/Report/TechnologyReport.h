// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Classes/LevelClasses.h"
#include "Analysis/Engine/EventEngine.h"
#include "Analysis/Statistics/TechnologyStatistics.h"
#include "Export/Report/CellRows.h"
#include "Export/Report/ChartedLeaf.h"
#include "Export/Report/LeafExtremes.h"
#include "Export/Report/NeighbourRows.h"
#include "Export/Report/StateBand.h"
#include "Export/Report/TimeShares.h"

#include <array>
#include <chrono>
#include <cstddef>
#include <cstdint>
#include <deque>
#include <memory>
#include <optional>
#include <string_view>
#include <vector>

namespace velmora {

class ReportEvents;

/// What a page says of the messages of one technology.
class TechnologyReport {
public:
    /// All must outlive it; `classes` may be null. Statistics by file have extremes by file.
    TechnologyReport(const Catalogue& catalogue, const LevelClasses* classes, StatisticsGroups& groups,
                     ReportEvents& events);
    TechnologyReport(const TechnologyReport&) = delete;
    TechnologyReport& operator=(const TechnologyReport&) = delete;

    /// A detector of further events.
    void add(std::unique_ptr<Detector> detector) { _engine.add(std::move(detector)); }

    void report(const MessageReport& report);
    /// The message could not be decoded.
    void reportUndecoded(MessageNumber message, Time time, Time arrival);
    /// The reader found damage before that message.
    void damaged(MessageNumber message, std::string_view reason);
    void interrupt();
    void finish();

    [[nodiscard]] const Catalogue& catalogue() const { return _engine.picture().catalogue(); }
    [[nodiscard]] const CellRows& cells() const { return _cells; }
    [[nodiscard]] const NeighbourRows& neighbours() const { return _neighbours; }
    /// Of the group of that number: the input's where statistics are by file, otherwise 0.
    [[nodiscard]] const LeafExtremes& extremes(std::size_t group) const { return _extremes[group]; }
    [[nodiscard]] const TimeShares& shares(std::size_t group) const { return _shares[group]; }
    /// Those that have values.
    [[nodiscard]] const std::deque<ChartedLeaf>& series() const { return _series; }
    [[nodiscard]] std::vector<const StateBand*> bands() const;

private:
    /// How a leaf's observations are used.
    struct Use {
        bool isKnown = false;
        Role role = Role::None;
        ChartedLeaf* series = nullptr;
    };

    /// What bands show by name.
    struct States {
        std::optional<RadioTechnology> technology = {};
        std::optional<RadioMode> mode = {};
        std::optional<LevelClass> levelClass = {};
        friend bool operator==(const States&, const States&) = default;
    };

    [[nodiscard]] const Use& useOf(const CatalogueField& leaf);
    [[nodiscard]] std::chrono::nanoseconds pass(Time time);
    void observe(const MessageReport& report);
    /// A value of a row of the message.
    void addNeighbour(ChartedLeaf& series, double value);
    void classify();
    void setBands(const MessageReport& report);
    void forget(Time time);

    const LevelClasses* _classes;
    EventEngine _engine;
    TechnologyStatistics _statistics;
    CellRows _cells;
    NeighbourRows _neighbours;
    bool _isByFile;
    std::array<LeafExtremes, 2> _extremes;
    std::array<TimeShares, 2> _shares;
    std::vector<Use> _uses; ///< by the leaf's index
    std::deque<ChartedLeaf> _series;
    std::vector<ChartedLeaf*> _neighbourSeries; ///< that the current message has values of
    StateBand _technologyBand{"radio technology"};
    StateBand _modeBand{"mode"};
    StateBand _radioBand{"radio state"};
    StateBand _classBand{"level class"};
    StateBand _registrationBand{"registration"};
    StateBand _cellBand{"serving cell"};
    States _bandStates;                              ///< that the bands have
    std::uint32_t _bandCell = ServingCells::unknown; ///< the cell's number, in that band
    std::optional<LevelClass> _class;                ///< of the serving cell's level
    std::optional<RadioTechnology> _classTechnology; ///< that it is for
    std::optional<double> _classLevel;
    std::optional<Time> _last; ///< of the latest message; absent after an interruption
};

} // namespace velmora
