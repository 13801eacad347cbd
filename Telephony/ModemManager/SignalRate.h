// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MainQueue.h"
#include "Telephony/ModemManager/ModemFollower.h"
#include "Telephony/ModemManager/RateMemory.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// Has ModemManager poll a modem's levels, unless it does so often enough already, and puts its rate back on
/// destruction if it is still the one that was set here. Main thread only.
class SignalRate {
public:
    /// In seconds.
    static constexpr std::uint32_t rate = 5;
    /// The least time between two attempts: other programs may set the rate too.
    static constexpr std::chrono::minutes pause{1};

    using Refused = std::function<void(const BusReply&)>;

    /// `refused` runs where ModemManager does not set the rate. All must outlive it.
    SignalRate(MainQueue& queue, ModemFollower& follower, const RateMemory& memory, std::string path,
               Refused refused);
    ~SignalRate();
    SignalRate(const SignalRate&) = delete;
    SignalRate& operator=(const SignalRate&) = delete;

    /// Something of the modem has changed. `again` allows another attempt after a refusal.
    void modemChanged(bool again);

    /// Puts the rate back that an earlier run of this service has left changed, and forgets it.
    static void restoreRemembered(ModemFollower& follower, const RateMemory& memory);

private:
    void set(std::uint32_t earlier);
    void release();

    MainQueue& _queue;
    ModemFollower& _follower;
    const RateMemory& _memory;
    std::string _path;
    Refused _refused;
    std::optional<std::uint32_t> _earlier; ///< present while the rate is ours
    std::uint32_t _seen = 0;               ///< the rate as it was last published
    bool _wasThere = false;                ///< the modem had levels at the last change
    bool _wasRefused = false;
    bool _pausing = false;
    std::shared_ptr<bool> _alive = std::make_shared<bool>(true);
};

} // namespace velmora
