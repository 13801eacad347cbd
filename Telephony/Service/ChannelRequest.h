// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"

#include <string>
#include <string_view>

namespace velmora {

/// The port to which a request for a log channel, {"CreateLogChannel": NAME}, asks that messages be sent. The
/// failure says why the request is malformed, and repeats nothing that is long or unprintable.
[[nodiscard]] Result<std::string> requestedPort(const Data& request);

/// Whether the name is the service's, or one of those that it gives to the channels' ports. A channel to such
/// a port would send the service its own messages, each of them an invalid command.
[[nodiscard]] bool isServicePort(std::string_view name);

/// A client's text for a log line: in quotes where it is short and printable, otherwise its size.
[[nodiscard]] std::string quotedForLog(std::string_view text);

} // namespace velmora
