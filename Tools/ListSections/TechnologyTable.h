// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// What the decoder of one binary technology does with each log code that it wants.
struct TechnologyTable {
    std::string_view name; ///< the short one: "Ostrel_GSM"
    /// The sections of a log code, each once, in calling order; empty where the decoder has no sections.
    std::map<std::uint32_t, std::vector<std::string>> sections;
    /// The name of the record of a log code, where the decoder has no sections.
    std::map<std::uint32_t, std::string> records;
};

/// The tables of all binary technologies, in the order in which the service names the technologies.
[[nodiscard]] std::vector<TechnologyTable> technologyTables();

} // namespace velmora
