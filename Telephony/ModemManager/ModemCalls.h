// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MainQueue.h"
#include "Telephony/ModemManager/ModemFollower.h"

#include <chrono>
#include <functional>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// Calls to the followed modem, and delayed tasks, that are dropped when this ends; refused ones are logged
/// under the modem's name. Main thread only.
class ModemCalls {
public:
    /// The subject of the refused cell queries, which the shipped bus policy allows.
    static constexpr std::string_view cellSubject = "cells";

    /// Both must outlive it. Precondition: the follower has a modem.
    ModemCalls(MainQueue& queue, ModemFollower& follower);
    ModemCalls(const ModemCalls&) = delete;
    ModemCalls& operator=(const ModemCalls&) = delete;

    /// The modem's path.
    [[nodiscard]] const std::string& path() const { return _path; }

    void call(const BusCall& call, std::function<void(const BusReply&)> answered);
    void after(std::chrono::nanoseconds delay, std::function<void()> task);

    /// Logs once that the modem does not answer for `what`. The subjects are those of FaultLog.
    void reportFault(std::string_view subject, const BusReply& reply, std::string_view what);

private:
    MainQueue& _queue;
    ModemFollower& _follower;
    std::string _path;
    std::string _name; ///< "modem 0", for messages
    std::shared_ptr<bool> _alive = std::make_shared<bool>(true);
};

} // namespace velmora
