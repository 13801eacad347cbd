// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Scenario.h"

#include <cstdint>
#include <memory>
#include <span>
#include <string>
#include <string_view>

namespace velmora {

/// An entry of the registry's list.
struct ScenarioKind {
    std::string_view name;
    std::string_view description; ///< its text in `--help`
    std::unique_ptr<Scenario> (*make)(std::uint64_t seed);
};

/// All scenarios, in the order in which they are listed.
[[nodiscard]] std::span<const ScenarioKind> scenarioKinds();
/// The scenario of that name; null when there is none.
[[nodiscard]] const ScenarioKind* scenarioKindNamed(std::string_view name);
/// Their names, for messages: "gsm, lte".
[[nodiscard]] std::string scenarioNames();

} // namespace velmora
