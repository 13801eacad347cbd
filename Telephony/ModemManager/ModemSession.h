// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MainQueue.h"
#include "Telephony/ModemManager/ModemFollower.h"
#include "Telephony/ModemManager/Reports/ModemReport.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Queries the followed modem during its lifetime, which is while a client listens and the modem is present:
/// the cells periodically, the SIM and bearers once and then when their signals arrive. Has ModemManager poll
/// the levels too, and restores its rate on destruction. A query is not repeated before its answer. Main
/// thread only.
class ModemSession {
public:
    /// The receivers of its reports. Files and contexts are reported when they have changed, cells at every
    /// measurement.
    struct Reports {
        std::function<void(const Dictionaries&)> cells;
        std::function<void(const DictionaryRef&)> simFiles;
        std::function<void(const Dictionaries&)> contexts;
    };

    /// The delay between the answer to a cell query and the next query.
    static constexpr std::chrono::seconds cellInterval{3};
    /// A refused query is retried after this many intervals, a minute: permissions may have changed
    /// meanwhile.
    static constexpr int pollsAfterRefusal = 20;
    /// The time-out of a cell query, which is slow on a serial line.
    static constexpr std::chrono::seconds cellTimeout{30};
    /// The rate, in seconds, at which ModemManager is to poll the levels.
    static constexpr std::uint32_t signalRate = 5;
    /// The delay that combines changes in quick succession into one report.
    static constexpr std::chrono::milliseconds reportDelay{100};

    /// Starts querying from the queue, not inside this call. All must outlive it. Precondition: the follower
    /// has a modem.
    ModemSession(MainQueue& queue, ModemFollower& follower, Reports reports);
    ~ModemSession();
    ModemSession(const ModemSession&) = delete;
    ModemSession& operator=(const ModemSession&) = delete;

    /// Forwarded by the follower's observer.
    void modemChanged();
    void objectChanged(const std::string& path, const Array& arguments);

private:
    /// A query that may be refused, and for how many intervals it is skipped.
    struct Query {
        std::string_view subject;
        int pollsToSkip = 0;
    };
    /// The SIM or a bearer.
    struct Part {
        std::string_view interface;
        bool answered = false;    ///< whether with properties or with an error
        DictionaryRef properties; ///< null until they have been reported
    };

    void poll();
    void requestCells();
    void askLocation(Dictionaries cells);
    void endPoll(const Dictionaries& cells);
    void refused(Query& query, const BusReply& reply, std::string_view what);
    void reportFault(std::string_view subject, const BusReply& reply, std::string_view what);
    void setSignalRate();
    void restoreSignalRate();

    void followParts();
    void readPart(const std::string& path);
    void reportLater();
    void report();
    void reportFiles(const Modem& modem);
    void reportContexts(const Modem& modem);

    void call(const BusCall& call, std::function<void(const BusReply&)> answered);
    /// Runs after the delay unless the session has ended.
    void after(std::chrono::nanoseconds delay, std::function<void()> task);

    MainQueue& _queue;
    ModemFollower& _follower;
    Reports _reports;
    std::string _path; ///< the modem's
    std::string _name; ///< "modem 0", for messages
    Query _cellQuery{"cells"};
    Query _locationQuery{"place"};
    int _partPolls = 0;                        ///< intervals until unreadable parts are retried
    bool _hadCells = false;                    ///< the last answer had cells
    std::optional<std::uint32_t> _earlierRate; ///< ModemManager's earlier rate; absent while it is unchanged
    bool _hadSignal = false;
    Value _state;                       ///< the modem's at the last change
    std::string _sim;                   ///< the SIM's path
    std::vector<std::string> _bearers;  ///< the bearers' paths
    std::map<std::string, Part> _parts; ///< by path
    Value _reportedFiles;
    Value _reportedContexts;
    bool _reporting = false; ///< a report is on the queue
    std::shared_ptr<bool> _alive = std::make_shared<bool>(true);
};

} // namespace velmora
