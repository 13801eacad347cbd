// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The technologies whose messages are records, by their short names.
[[nodiscard]] std::vector<std::string> recordTechnologies();

/// The sections of a technology's decoder that want a log code, each once, in calling order; none where the
/// decoder has no sections.
[[nodiscard]] std::vector<std::string> sectionsWanting(std::string_view technology, std::uint32_t code);

/// What a record of the technology without sections is called; empty where its decoder does not know the
/// code.
[[nodiscard]] std::string recordName(std::uint32_t code);

} // namespace velmora
