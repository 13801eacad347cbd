// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Text/CSVText.h"

#include <CLI/CLI.hpp>

#include <cstdint>
#include <functional>
#include <string>
#include <vector>

namespace velmora {

/// What the options of several commands have in common. Checks fail with what the option got and what it
/// expected.

/// Accepts the texts for which `isValid` holds; `expected` describes them in messages.
[[nodiscard]] CLI::Validator validator(std::function<bool(const std::string&)> isValid,
                                       const std::string& expected);
[[nodiscard]] CLI::Validator oneOf(const std::vector<std::string>& words);
/// A whole number from 1 to `most`, in decimal digits alone.
[[nodiscard]] CLI::Validator countUpTo(std::uint64_t most);
/// A time in seconds, at most what the event loop's timers hold, which is 24 days.
[[nodiscard]] CLI::Validator positiveSeconds();

/// `--technology`, with a description that begins with `purpose`.
void addTechnology(CLI::App& command, std::string& technology, const std::string& purpose);
/// The same with a description of its own, which the names follow.
void addTechnologyOption(CLI::App& command, std::string& technology, const std::string& description);

/// `--safe`, which turns the guard of CSV's cells on.
void addSafe(CLI::App& command, CSVGuard& guard);
/// To be called when all options are known: `--safe` is a usage error with another format.
void checkSafe(CSVGuard guard, bool isCSV);

} // namespace velmora
