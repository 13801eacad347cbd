// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MainQueue.h"
#include "Telephony/ModemManager/ModemFollower.h"
#include "Telephony/ModemManager/ModemReport.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Asks the followed modem for as long as it lives, which is while a client listens and that modem is there:
/// its cells at a steady pace, its SIM and bearers once and then by their signals. It has ModemManager poll
/// the levels too, and puts its rate back in the end. No question is asked again before its answer. Main
/// thread only.
class ModemSession {
public:
    /// Where what it learns goes. Files and contexts are told when they have changed, cells as often as they
    /// are measured.
    struct Reports {
        std::function<void(const Dictionaries&)> cells;
        std::function<void(const DictionaryRef&)> simFiles;
        std::function<void(const Dictionaries&)> contexts;
    };

    /// From one answer about the cells to the next question.
    static constexpr std::chrono::seconds cellInterval{3};
    /// A question that the modem or the bus refuses is asked again after so many turns of that interval: a
    /// minute. Whoever sits in front of it may have changed something.
    static constexpr int turnsAfterRefusal = 20;
    /// Cells take a modem on a serial line a while.
    static constexpr std::chrono::seconds cellTimeout{30};
    /// The rate, in seconds, at which ModemManager is to poll the levels.
    static constexpr std::uint32_t signalRate = 5;
    /// Changes that come one after the other are told together.
    static constexpr std::chrono::milliseconds settling{100};

    /// Begins to ask on the queue, not at once. All must outlive it. Precondition: the follower has a modem.
    ModemSession(MainQueue& queue, ModemFollower& follower, Reports reports);
    ~ModemSession();
    ModemSession(const ModemSession&) = delete;
    ModemSession& operator=(const ModemSession&) = delete;

    /// The follower's observer hands on what concerns the modem.
    void modemChanged();
    void objectChanged(const std::string& path, const Array& arguments);

private:
    /// A question that may be refused, and how many turns it is left out for.
    struct Question {
        std::string_view subject;
        int turns = 0;
    };
    /// The SIM or a bearer.
    struct Part {
        std::string_view interface;
        bool answered = false;    ///< whether with properties or with an error
        DictionaryRef properties; ///< null until they have been told
    };

    void turn();
    void askCells();
    void askPlace(Dictionaries cells);
    void endTurn(const Dictionaries& cells);
    void refused(Question& question, const BusReply& reply, std::string_view what);
    void tellFault(std::string_view subject, const BusReply& reply, std::string_view what);
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
    Question _cellQuestion{"cells"};
    Question _placeQuestion{"place"};
    int _partTurns = 0;                        ///< until the parts that could not be read are read again
    bool _cellsTold = false;                   ///< the last cells were some
    std::optional<std::uint32_t> _earlierRate; ///< what ModemManager's rate was; absent while it is not ours
    bool _hadSignal = false;
    Value _state;                       ///< the modem's when last looked at
    std::string _sim;                   ///< the SIM's path
    std::vector<std::string> _bearers;  ///< the bearers' paths
    std::map<std::string, Part> _parts; ///< by path
    Value _toldFiles;
    Value _toldContexts;
    bool _reporting = false; ///< a report is on the queue
    std::shared_ptr<bool> _alive = std::make_shared<bool>(true);
};

} // namespace velmora
