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
#include "Export/Report/StartContexts.h"
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
    struct ShownBand {
        const StateBand* band;
        std::optional<std::uint32_t> input; ///< whose states these are, where two are compared
    };
    [[nodiscard]] std::vector<ShownBand> bands() const;
    /// Of the inputs one after the other.
    [[nodiscard]] const std::deque<StartContexts>& startContexts() const { return _startContexts; }

private:
    /// How a leaf's observations are used.
    struct Use {
        bool isKnown = false;
        Role role = Role::None;
        std::array<ChartedLeaf*, 2> series{}; ///< by group
    };

    /// What bands show by name.
    struct States {
        std::optional<RadioTechnology> technology = {};
        std::optional<RadioMode> mode = {};
        std::optional<LevelClass> levelClass = {};
        friend bool operator==(const States&, const States&) = default;
    };

    struct Bands {
        StateBand technology{"radio technology"};
        StateBand levelClass{"level class"};
        StateBand mode{"mode"};
        StateBand radio{"radio state"};
        StateBand registration{"registration"};
        StateBand cell{"serving cell"};
        States states; ///< that they have

        [[nodiscard]] std::array<StateBand*, 6> all() {
            return {&technology, &levelClass, &mode, &radio, &registration, &cell};
        }
    };

    [[nodiscard]] const Use& useOf(const CatalogueField& leaf);
    /// The group of the message's input, see `extremes`.
    [[nodiscard]] std::size_t groupOf(MessageNumber message) const { return _isByFile ? message.input : 0; }
    /// The next message is the first of an input.
    void beginInput();
    [[nodiscard]] std::chrono::nanoseconds pass(Time time);
    void observe(const MessageReport& report);
    /// A value of a row of the message.
    void addNeighbour(ChartedLeaf& series, double value);
    void classify();
    void setBands(const MessageReport& report);
    void endBands(Time time);
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
    std::vector<ChartedLeaf*> _neighbourSeries;      ///< that the current message has values of
    std::array<Bands, 2> _bands;                     ///< by group
    std::uint32_t _bandCell = ServingCells::unknown; ///< the cell's number, in its band
    std::deque<StartContexts> _startContexts;
    const ReportEvents& _events;
    std::optional<LevelClass> _class;                ///< of the serving cell's level
    std::optional<RadioTechnology> _classTechnology; ///< that it is for
    std::optional<double> _classLevel;
    std::optional<Time> _last; ///< of the latest message; absent after an interruption
    std::optional<MessageNumber> _lastMessage;
};

} // namespace velmora
