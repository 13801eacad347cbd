// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MessagePort.h"
#include "PropertyLists/Value.h"

#include <optional>

namespace velmora {

/// The two commands that the model sends on a log channel. Both block, for a second each way at most, and a
/// failure is an error line.

/// The answer to "GetTechnology"; absent after any failure. It need not be a string.
[[nodiscard]] std::optional<Value> askTechnology(RemotePort& channel);
/// Whether the channel has taken the decoder's start command, which gets no reply.
[[nodiscard]] bool sendStartCommand(RemotePort& channel, const DictionaryRef& command);

} // namespace velmora
