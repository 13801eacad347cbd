// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/ServiceClient.h"

#include "Tools/Log/ConnectionLine.h"

#include <cstdio>
#include <string>

#include <unistd.h>

namespace velmora {

ModelPlatform ServiceClient::platform() {
    return {ports, queue, telephony, clock, []() -> std::optional<std::string> {
                return logChannelPortName("com.velmora.log." + std::to_string(::getpid()));
            }};
}

std::string timeoutMessage(const std::string& problem, double seconds) {
    char time[32];
    std::snprintf(time, sizeof time, " after %g s", seconds);
    if (problem.empty())
        return std::string(serviceTitle) + " has sent nothing" + time;
    return problem + time + (problem == noService ? std::string("; ") + serviceAdvice : std::string());
}

} // namespace velmora
