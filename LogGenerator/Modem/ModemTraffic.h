// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/ModemSection.h"

namespace velmora {

/// "Traffic": the counters and rates of the connected bearers, a row each.
class ModemTraffic final : public ModemSectionOf<ModemTraffic> {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Traffic"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void show(const Dictionary& message, FieldVisitor& visitor) const override;
    void describeShown(ContentVisitor& visitor) const override;
    [[nodiscard]] std::string stateOf(const Dictionary& message) const override;
};

} // namespace velmora
