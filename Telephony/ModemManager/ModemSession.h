// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/MainQueue.h"
#include "Telephony/ModemManager/CellPoller.h"
#include "Telephony/ModemManager/ModemCalls.h"
#include "Telephony/ModemManager/ModemFollower.h"
#include "Telephony/ModemManager/ModemParts.h"
#include "Telephony/ModemManager/Reports/ModemReport.h"
#include "Telephony/ModemManager/Reports/TrafficRates.h"
#include "Telephony/ModemManager/SignalRate.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// Queries the followed modem during its lifetime, which is while a client listens and the modem is present:
/// the cells periodically, and the position where the satellite receiver is on; SIMs and bearers once and
/// then when their signals arrive. Has ModemManager poll the levels too. A query is not repeated before its
/// answer, and none waits for another one for long. Main thread only.
class ModemSession {
public:
    /// Takes the root of a message of that code of LiveModemCode. Cells are reported at every measurement,
    /// the rest when it has changed.
    using Report = std::function<void(std::uint32_t code, const Dictionary& root)>;

    /// The delay that combines changes in quick succession into one report.
    static constexpr std::chrono::milliseconds reportDelay{100};

    /// Starts querying from the queue, not inside this call. All must outlive it. Precondition: the follower
    /// has a modem.
    ModemSession(MainQueue& queue, const Clock& clock, ModemFollower& follower, const RateMemory& memory,
                 Report report);
    ModemSession(const ModemSession&) = delete;
    ModemSession& operator=(const ModemSession&) = delete;

    /// Forwarded by the follower's observer.
    void modemChanged();
    void objectChanged(const std::string& path, const Array& arguments);

private:
    void simChanged();
    void followParts(const Modem& modem);
    void partChanged(const std::string& path, const ModemParts::Part& part, const Dictionary* changed);
    [[nodiscard]] ModemPart partAt(const std::string& path) const;
    [[nodiscard]] std::string reasonFor(const std::vector<std::string>& paths) const;
    void reportLater();
    void report();
    void cellsMeasured(const DictionaryRef& root);
    void send(std::uint32_t code, const DictionaryRef& root);

    const Clock& _clock;
    ModemFollower& _follower;
    Report _report;
    ModemCalls _calls;
    CellPoller _cells;
    Value _state; ///< the modem's at the last change
    Value _access;
    std::string _sim;                  ///< the active SIM's path; empty for none
    std::vector<std::string> _slots;   ///< the path of the SIM of each slot; empty for none
    std::vector<std::string> _bearers; ///< the bearers' paths
    TrafficRates _traffic;
    std::map<std::uint32_t, Value> _sent; ///< the last root by code
    bool _reporting = false;              ///< a report is on the queue
    ModemParts _parts;
    SignalRate _rate;
    std::shared_ptr<bool> _alive = std::make_shared<bool>(true);
};

/// More than any modem has; further ones are skipped.
inline constexpr std::size_t maximumBearers = 8;
inline constexpr std::size_t maximumSlots = 8;

} // namespace velmora
