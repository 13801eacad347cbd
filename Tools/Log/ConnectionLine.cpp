// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Log/ConnectionLine.h"

#include <array>

namespace velmora {

namespace {

using Kind = ConnectionLine::Kind;
using Problem = ConnectionProblem::Kind;

/// What the model writes while it connects, by the beginnings of its lines.
struct Row {
    std::string_view beginning;
    Kind kind;
    std::string_view problem;
};

constexpr std::array rows = {
    Row{"Could not create local message port", Kind::Cause, causeOf(Problem::Port)},
    Row{"Local messsage port already exists", Kind::Cause, causeOf(Problem::PortInUse)},
    Row{" ***** INVALIDATED ", Kind::LastOfAttempt, causeOf(Problem::Lost)},
    Row{"Could not create VoxServerConnection", Kind::Cause, noService},
    Row{"_VoxServerConnectionNetworkMonitorCreateLogChannel returns error", Kind::Cause,
        causeOf(Problem::NoChannel)},
    Row{"Could not create a log channel", Kind::Cause, causeOf(Problem::NoChannel)},
    Row{"Could not create the remote port!", Kind::Cause, causeOf(Problem::ChannelGone)},
    Row{" ***** Could not send the GetTechnology command", Kind::Cause, causeOf(Problem::NoTechnology)},
    Row{" ***** No response to GetTechnology", Kind::Cause, causeOf(Problem::NoTechnology)},
    Row{" ***** Could not parse reply to GetTechnology", Kind::Cause, causeOf(Problem::NoTechnology)},
    Row{" ***** Reply to GetTechnology had no answer", Kind::Cause, causeOf(Problem::NoTechnology)},
    Row{" ***** Could not send the START command", Kind::LastOfAttempt, causeOf(Problem::NotStarted)},
    Row{"Could not create the ports necessary", Kind::LastOfAttempt, {}},
    Row{"No log generator technology works", Kind::LastOfAttempt, {}},
    Row{"Got log generated: (nil)", Kind::Cause, causeOf(Problem::NoDecoder)},
};

} // namespace

ConnectionLine parseConnectionLine(std::string_view text) {
    constexpr std::string_view port = "Message port ";
    if (text.starts_with(port)) {
        // "Message port NAME: REASON"; a port's name has no blank.
        const std::size_t colon = text.find(": ", port.size());
        return {Kind::Cause, std::string(colon == text.npos ? text : text.substr(colon + 2))};
    }
    for (const Row& row : rows)
        if (text.starts_with(row.beginning))
            return {row.kind, std::string(row.problem)};
    return {};
}

} // namespace velmora
