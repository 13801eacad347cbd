// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace velmora {

/// Why no messages come from the telephony service, or why its technology is not known. Without one, all is
/// well or no attempt to connect has ended yet.
struct ConnectionProblem {
    enum class Kind : std::uint8_t {
        None,
        Lost,         ///< there was a connection; the next attempt follows at once
        Port,         ///< this program's port cannot be opened
        PortInUse,    ///< another process has its name
        NoService,    ///< no service listens
        Unreachable,  ///< one may, but cannot be connected to
        NoChannel,    ///< it opens no log channel
        ChannelGone,  ///< the log channel that it names cannot be connected to
        NoTechnology, ///< it does not answer GetTechnology, or its answer names none
        NoDecoder,    ///< it names a technology that has no decoder
        NotStarted,   ///< it does not take the start command
    };

    Kind kind = Kind::None;
    std::string cause; ///< as prose without a full stop, for a user; empty for none

    friend bool operator==(const ConnectionProblem&, const ConnectionProblem&) = default;
};

/// The cause in general, where no more is known than its kind.
[[nodiscard]] constexpr std::string_view causeOf(ConnectionProblem::Kind kind) {
    using Kind = ConnectionProblem::Kind;
    switch (kind) {
    case Kind::None: break;
    case Kind::Lost: return "the connection to the telephony service is lost";
    case Kind::Port: return "this program's port cannot be opened";
    case Kind::PortInUse: return "this program's port is in use";
    case Kind::NoService: return "no telephony service answers";
    case Kind::Unreachable: return "the telephony service cannot be reached";
    case Kind::NoChannel: return "the telephony service opens no log channel";
    case Kind::ChannelGone: return "the telephony service's log channel is not there";
    case Kind::NoTechnology: return "the telephony service does not name its technology";
    case Kind::NoDecoder: return "the telephony service's technology has no decoder here";
    case Kind::NotStarted: return "the telephony service does not take the start command";
    }
    return {};
}

/// What its user can do about a problem, as causeOf; empty where that depends on the program, or there is
/// nothing to be done.
[[nodiscard]] constexpr std::string_view wayOutOf(ConnectionProblem::Kind kind) {
    using Kind = ConnectionProblem::Kind;
    switch (kind) {
    case Kind::Port: return "mend that, or name another directory in VELMORA_PORT_DIR, for the service too";
    case Kind::PortInUse: return "end the program that has it";
    case Kind::Unreachable: return "start a service as the same user, with the same port directory";
    case Kind::NoTechnology: return "it may have no modem yet, which its own log says; if it has, restart it";
    case Kind::NoDecoder: return "start the service with another source";
    case Kind::NoChannel:
    case Kind::ChannelGone:
    case Kind::NotStarted: return "its own log may say why; restart it";
    case Kind::None:
    case Kind::Lost:
    case Kind::NoService: break;
    }
    return {};
}

} // namespace velmora
