// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <functional>
#include <string>
#include <vector>

namespace velmora {

class LogGenerator;

/// A technology's names of log codes.
struct CodeNames {
    const char* heading = "sections";
    /// Returns the names of a code, none for one without subscriber. Null without a decoder.
    std::function<std::vector<std::string>(std::uint32_t code)> namesOf;
};

/// `decoder` may be null; it is used for as long as the names are.
[[nodiscard]] CodeNames codeNames(const LogGenerator* decoder);

} // namespace velmora
