// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/Detector.h"
#include "Analysis/Picture/RadioTechnology.h"

#include <optional>
#include <string_view>

namespace velmora {

/// Reports changes of the radio mode as those of a state machine, where no record states the machine's
/// states.
class ModeMachineDetector final : public Detector {
public:
    /// `name` must be a constant.
    explicit ModeMachineDetector(std::string_view name) : _name(name) {}

    [[nodiscard]] bool wants(const CatalogueField& /*leaf*/) const override { return false; }
    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    void interrupt(Time last, EventSink& sink) override;

private:
    std::string_view _name;
    std::optional<RadioMode> _mode; ///< the latest known one
    std::optional<Time> _since;
    MessageNumber _message;
};

} // namespace velmora
