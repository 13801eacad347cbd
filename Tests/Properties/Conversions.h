// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Properties/GivenMessages.h"
#include "Tools/Convert/Conversion.h"

#include <string>
#include <vector>

/// Files of log messages in memory, converted as `velmora-log convert` does.

namespace velmora {

/// A recording of the messages.
[[nodiscard]] Data recordingOf(const std::vector<GivenMessage>& messages, const std::string& technology);

/// The file in that form; throws std::runtime_error with the reason where it has none, and where some message
/// was left out.
[[nodiscard]] Data converted(const Data& file, FileForm form, const std::string& technology);

/// Its messages with their times; throws std::runtime_error where some part of it cannot be read.
[[nodiscard]] std::vector<GivenMessage> messagesOf(const Data& file);
/// The same without their times.
[[nodiscard]] std::vector<Data> bytesOf(const std::vector<GivenMessage>& messages);

/// The messages of a recording's last five refreshes, which is what a snapshot of it holds; an element for
/// each refresh.
[[nodiscard]] std::vector<std::vector<Data>> lastRefreshes(const std::vector<GivenMessage>& messages);

} // namespace velmora
