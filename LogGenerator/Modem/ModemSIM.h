// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/ModemSection.h"

namespace velmora {

/// "SIM": the SIM that is in use.
class ModemSIM final : public ModemSectionOf<ModemSIM> {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "SIM"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void show(const Dictionary& message, FieldVisitor& visitor) const override;
    void describeShown(ContentVisitor& visitor) const override;
};

} // namespace velmora
