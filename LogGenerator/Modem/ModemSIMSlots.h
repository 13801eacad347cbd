// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/ModemSection.h"

namespace velmora {

/// "SIM Slots": the slots of a modem that has several, a row each.
class ModemSIMSlots final : public ModemSectionOf<ModemSIMSlots> {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "SIM Slots"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void show(const Dictionary& message, FieldVisitor& visitor) const override;
    void describeShown(ContentVisitor& visitor) const override;
    [[nodiscard]] std::string stateOf(const Dictionary& message) const override;
    [[nodiscard]] bool reportsErrors() const override { return false; }
};

} // namespace velmora
