// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Messages/MessageSelection.h"

#include <string>

namespace CLI {
class App;
}

namespace velmora {

/// Adds `--from`, `--to` and `--code`. `cold` is a clause for the help of those after which decoding starts
/// without what earlier messages leave. Parsing fills `selection`, which must outlive `command`.
void addSelection(CLI::App& command, MessageSelection& selection, const std::string& cold);

/// Adds `--from` and `--to` alone, with these descriptions. Parsing fills `range`, which must outlive
/// `command`.
void addRange(CLI::App& command, TimeRange& range, const std::string& from, const std::string& to);

/// What a TIME is, for the command's footer.
inline constexpr const char* timeHelp =
    "A TIME is ISO 8601 (UTC unless it has a zone), seconds since 1970, or +SECONDS after the file's\n"
    "first message.\n";

} // namespace velmora
