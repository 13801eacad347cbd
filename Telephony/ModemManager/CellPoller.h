// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/ModemManager/ModemCalls.h"
#include "Telephony/ModemManager/ModemFollower.h"
#include "Telephony/ModemManager/Reports/CellReport.h"

#include <chrono>
#include <functional>
#include <string>
#include <string_view>

namespace velmora {

/// Polls the cells of the followed modem, its place in the network where the cells name none, and the
/// position while the satellite receiver is on. A query is not repeated before its answer. Main thread only.
class CellPoller {
public:
    /// The delay between the answer to a cell query and the next query.
    static constexpr std::chrono::seconds cellInterval{3};
    /// A refused query is retried after this many intervals, a minute: permissions may have changed
    /// meanwhile.
    static constexpr int pollsAfterRefusal = 20;
    /// The time-outs. Cells are slow on a serial line.
    static constexpr std::chrono::seconds cellTimeout{30};
    static constexpr std::chrono::seconds locationTimeout{10};
    /// How long cells without a serving cell wait for its place in the network.
    static constexpr std::chrono::seconds placePatience{1};

    /// Takes the root of a message of the cells.
    using Report = std::function<void(const DictionaryRef& root)>;
    /// The location has been answered.
    using Located = std::function<void()>;

    /// The calls and the follower must outlive it.
    CellPoller(ModemCalls& calls, ModemFollower& follower, Report report, Located located);
    CellPoller(const CellPoller&) = delete;
    CellPoller& operator=(const CellPoller&) = delete;

    /// Queries the cells now, and then periodically.
    void poll();
    /// Polls the position from now on if the satellite receiver has been turned on.
    void satellitesChanged();
    /// What was refused is asked for again, and the next `reportIfDue` reports.
    void stateChanged();
    /// The place was named on the earlier technology.
    void accessChanged() { _cells.location = {}; }
    /// Drops every answer.
    void clear();
    /// Reports without a measurement where a change requires it.
    void reportIfDue();

    /// The last answer; none where it was refused, and why.
    [[nodiscard]] const Value& location() const { return _location; }
    [[nodiscard]] const std::string& locationReason() const { return _locationReason; }

private:
    /// A query that may be refused, and for how many intervals it is skipped.
    struct Query {
        std::string_view subject;
        int pollsToSkip = 0;
        bool isPending = false;
    };

    void cellsAnswered(const BusReply& reply);
    void cellsKnown();
    void pollPosition();
    void requestLocation();
    void locationAnswered(const BusReply& reply);
    void report();
    void refused(Query& query, const BusReply& reply, std::string_view what);

    ModemCalls& _calls;
    ModemFollower& _follower;
    Report _report;
    Located _located;
    Query _cellQuery{ModemCalls::cellSubject};
    Query _locationQuery{"place"};
    CellAnswer _cells;
    bool _awaitsPlace = false; ///< the cells wait for the place
    bool _isDue = true;        ///< the cells are reported without a measurement too
    Value _location;
    std::string _locationReason;
    bool _positionRuns = false; ///< the position is being polled
};

} // namespace velmora
