// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/ConnectionProblem.h"

#include <cstdint>
#include <string>
#include <string_view>

namespace velmora {

/// What a log line says about the connection to the telephony service.
struct ConnectionLine {
    enum class Kind : std::uint8_t {
        Other,         ///< about something else
        Cause,         ///< why an attempt to connect failed, or that the connection is lost
        LastOfAttempt, ///< an attempt has failed
    };
    Kind kind = Kind::Other;
    std::string problem; ///< as prose, for a user; empty where the line has no cause
};

[[nodiscard]] ConnectionLine parseConnectionLine(std::string_view text);

/// The problem of an attempt that found no service.
inline constexpr std::string_view noService = causeOf(ConnectionProblem::Kind::NoService);

} // namespace velmora
