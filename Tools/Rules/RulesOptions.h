// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log rules`: whether rule files have mistakes, and what their tests find.
struct RulesOptions {
    enum class Action : std::uint8_t { Check, Test };

    Action action = Action::Check;
    std::vector<std::string> files; ///< none: the built-in rules and the user's
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addRules(CLI::App& app, RulesOptions& options);

} // namespace velmora
