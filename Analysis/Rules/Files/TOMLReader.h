// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Files/TOMLNode.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <variant>

namespace velmora {

/// Why a TOML document could not be read.
struct TOMLError {
    TextPosition position;
    std::string text;
};

/// Reads a document of TOML 1.0. Values may be in each other up to a depth of `deepestTOML`, and a key may
/// have as many parts.
[[nodiscard]] std::variant<TOMLNode, TOMLError> readTOML(std::string_view text);

inline constexpr std::size_t deepestTOML = 16;

/// Where a key has more than `deepestTOML` parts: the parser would make so many tables in each other, and
/// end by recursion as deep. Absent where none has, and where the document has a mistake before.
[[nodiscard]] std::optional<TextPosition> longKey(std::string_view text);

} // namespace velmora
