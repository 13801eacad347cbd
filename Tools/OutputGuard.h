// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace velmora {

/// Why a command that reads `in` ("-": standard input) may not write `out`: it is the input, no regular file,
/// or exists although nothing may be overwritten. Empty where it may.
[[nodiscard]] std::string whyNotWritten(const std::string& in, const std::string& out, bool overwrites);

/// During its lifetime, of which there is one at a time, a signal from the user removes the file before it
/// ends the program.
class RemovedWhenInterrupted {
public:
    explicit RemovedWhenInterrupted(std::string_view name);
    ~RemovedWhenInterrupted();
    RemovedWhenInterrupted(const RemovedWhenInterrupted&) = delete;
    RemovedWhenInterrupted& operator=(const RemovedWhenInterrupted&) = delete;
};

} // namespace velmora
