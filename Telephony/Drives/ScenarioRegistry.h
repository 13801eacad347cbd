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

/// A scenario that there is: one line in the registry's list.
struct ScenarioKind {
    std::string_view name;
    std::string_view description; ///< what `--help` says of it
    std::unique_ptr<Scenario> (*make)(std::uint64_t seed);
};

/// All scenarios, in the order in which they are listed.
[[nodiscard]] std::span<const ScenarioKind> scenarioKinds();
/// The scenario of that name; null when there is none.
[[nodiscard]] const ScenarioKind* scenarioKindNamed(std::string_view name);
/// Their names, for messages: "gsm, lte".
[[nodiscard]] std::string scenarioNames();

} // namespace velmora
