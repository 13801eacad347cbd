// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Files/TOMLNode.h"
#include "Analysis/Rules/RuleError.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The mistakes of a rule file that is being read.
class FileErrors {
public:
    /// File and errors must outlive it.
    FileErrors(const std::string& file, std::string_view content, std::vector<RuleError>& errors)
        : _file(file), _content(content), _errors(errors) {}

    void add(TextPosition position, std::string text);
    /// A mistake at that byte of a text whose value is at the position. It is given as a place in the file
    /// unless the text has escapes before.
    void addInText(const TOMLNode& text, std::size_t offset, std::string mistake);

    /// Whether there are so many that the rest of the file is not worth reading.
    [[nodiscard]] bool isFull() const { return _count >= most; }
    [[nodiscard]] std::size_t count() const { return _count; }

    static constexpr std::size_t most = 20;

private:
    const std::string& _file;
    std::string_view _content;
    std::vector<RuleError>& _errors;
    std::size_t _count = 0;
};

/// Where the byte of a text is whose value begins at `start` with its quotes.
[[nodiscard]] TextPosition positionInText(std::string_view file, TextPosition start, std::size_t offset);

} // namespace velmora
