// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// What a decoder's log line is about, read from its text.
struct LineText {
    std::optional<std::uint32_t> code; ///< the log code that it names, if it does
    std::string_view what;             ///< the rest: "unknown log message"

    /// " of 0xB0C1", or empty without a code.
    [[nodiscard]] std::string subject() const;
};

/// `text` has to outlive the result.
[[nodiscard]] LineText parseLine(std::string_view text);

/// Whether the line reports nothing but that an object of the program was made or destroyed.
[[nodiscard]] bool isLifecycleLine(std::string_view text);

/// Appends the text with each number as "#".
void appendWithoutNumbers(std::string& key, std::string_view text);

} // namespace velmora
