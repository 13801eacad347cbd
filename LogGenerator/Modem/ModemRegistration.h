// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/ModemSection.h"

namespace velmora {

/// "Registration": whether and where the modem is registered.
class ModemRegistration final : public ModemSectionOf<ModemRegistration> {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Registration"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void show(const Dictionary& message, FieldVisitor& visitor) const override;
    void describeShown(ContentVisitor& visitor) const override;
};

} // namespace velmora
