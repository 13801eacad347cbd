// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <stdexcept>
#include <string>

namespace velmora {

/// An assertion about what a serialized-object baseband sends that does not hold. It is not caught and ends
/// the program, naming the description, the source file and the line.
class AssertionFailure : public std::logic_error {
public:
    AssertionFailure(const std::string& description, const std::string& file, int line)
        : std::logic_error(description + " (" + file + ":" + std::to_string(line) + ")") {}
};

} // namespace velmora
