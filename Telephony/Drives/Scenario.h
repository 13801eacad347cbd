// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <chrono>
#include <string_view>

namespace velmora {

/// One message of a scenario and when it comes, counted from the scenario's start.
struct ScenarioEvent {
    std::chrono::nanoseconds offset{0};
    Data message;
};

/// A synthetic drive through a radio network: an endless list of messages that depends only on its seed. Its
/// player decides the speed.
class Scenario {
public:
    virtual ~Scenario() = default;
    /// The constant of its log technology.
    [[nodiscard]] virtual std::string_view technology() const = 0;
    /// The next message; offsets never go back.
    [[nodiscard]] virtual ScenarioEvent next() = 0;
};

} // namespace velmora
