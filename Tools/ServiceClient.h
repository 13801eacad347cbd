// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/VelmoraModel.h"
#include "Platform/Linux/MachineClock.h"
#include "Platform/Linux/MainLoop.h"
#include "Platform/Linux/Ports/LinuxMessagePorts.h"
#include "Platform/Linux/Ports/LinuxTelephonyService.h"
#include "Platform/Linux/QtMainQueue.h"

#include <string>

namespace velmora {

/// What a command needs to talk to the telephony service: the event loop and the machine's ports, queue and
/// clock. One per process; must outlive the model that uses its platform. Main thread only.
class ServiceClient {
public:
    MainLoop loop;
    QtMainQueue queue;
    LinuxMessagePorts ports{PortOptions::forClients()};
    LinuxTelephonyService telephony{ports};
    MachineClock clock;

    /// For a model whose local port has a name unique to this process, so that several watchers and recorders
    /// and the application can be connected at the same time.
    [[nodiscard]] ModelPlatform platform();
};

/// The other end's name in messages.
inline constexpr const char* serviceTitle = "the telephony service";

/// How to start a service, where none answers.
inline constexpr const char* serviceAdvice =
    "start one with velmora-telephonyd --source modemmanager (the modem) or "
    "velmora-telephonyd --source scenario:gsm,seed=1 (a synthetic drive)";

/// Why a command ends that has waited for the service: the problem with the connection, empty where there was
/// none but no message came, and what to do.
[[nodiscard]] std::string timeoutMessage(const std::string& problem, double seconds);
[[nodiscard]] std::string timeoutMessage(const ConnectionProblem& problem, double seconds);

/// What a user of the command line can do about the problem; empty where that is nothing.
[[nodiscard]] std::string adviceAgainst(const ConnectionProblem& problem);

} // namespace velmora
