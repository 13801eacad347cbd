// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Log/ConnectionLine.h"

#include <array>

namespace velmora {

namespace {

using Kind = ConnectionLine::Kind;

/// What the model writes while it connects, by the beginnings of its lines.
struct Row {
    std::string_view beginning;
    Kind kind;
    std::string_view problem;
};

constexpr std::array rows = {
    Row{"Could not create local message port", Kind::Cause, "this program's port cannot be opened"},
    Row{"Local messsage port already exists", Kind::Cause, "this program's port is in use"},
    Row{" ***** INVALIDATED ", Kind::LastOfAttempt, "the connection to the telephony service is lost"},
    Row{"Could not create VoxServerConnection", Kind::Cause, noService},
    Row{"_VoxServerConnectionNetworkMonitorCreateLogChannel returns error", Kind::Cause,
        "the telephony service opens no log channel"},
    Row{"Could not create a log channel", Kind::Cause, "the telephony service opens no log channel"},
    Row{"Could not create the remote port!", Kind::Cause, "the telephony service's log channel is not there"},
    Row{" ***** Could not send the GetTechnology command", Kind::Cause,
        "the telephony service does not name its technology"},
    Row{" ***** No response to GetTechnology", Kind::Cause,
        "the telephony service does not name its technology"},
    Row{" ***** Could not parse reply to GetTechnology", Kind::Cause,
        "the telephony service does not name its technology"},
    Row{" ***** Reply to GetTechnology had no answer", Kind::Cause,
        "the telephony service does not name its technology"},
    Row{" ***** Could not send the START command", Kind::LastOfAttempt,
        "the telephony service does not take the start command"},
    Row{"Could not create the ports necessary", Kind::LastOfAttempt, {}},
    Row{"No log generator technology works", Kind::LastOfAttempt, {}},
    Row{"Got log generated: (nil)", Kind::Cause, "the telephony service's technology has no decoder here"},
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
