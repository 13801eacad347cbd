// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/ModemSection.h"

namespace velmora {

/// "Modem": the modem itself.
class ModemEquipment final : public ModemSectionOf<ModemEquipment> {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Modem"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void show(const Dictionary& message, FieldVisitor& visitor) const override;
    void describeShown(ContentVisitor& visitor) const override;
};

} // namespace velmora
