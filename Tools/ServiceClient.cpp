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

std::string adviceAgainst(const ConnectionProblem& problem) {
    return problem.kind == ConnectionProblem::Kind::NoService ? serviceAdvice
                                                              : std::string(wayOutOf(problem.kind));
}

std::string timeoutMessage(const ConnectionProblem& problem, double seconds) {
    char time[32];
    std::snprintf(time, sizeof time, " after %g s", seconds);
    if (problem.cause.empty())
        return std::string(serviceTitle) + " has sent nothing" + time;
    const std::string advice = adviceAgainst(problem);
    return problem.cause + time + (advice.empty() ? std::string() : "; " + advice);
}

std::string timeoutMessage(const std::string& problem, double seconds) {
    using Kind = ConnectionProblem::Kind;
    return timeoutMessage(ConnectionProblem{problem == noService ? Kind::NoService : Kind::None, problem},
                          seconds);
}

} // namespace velmora
