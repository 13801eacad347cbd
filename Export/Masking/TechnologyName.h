// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/MessageReader.h"

#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// The short name of a message's technology; empty where the file does not name it.
[[nodiscard]] inline std::string technologyOf(const LoggedMessage& message, const MessageReader& reader) {
    const std::vector<std::string> names = reader.technologies();
    return message.technology < names.size() ? names[message.technology] : std::string();
}

} // namespace velmora
