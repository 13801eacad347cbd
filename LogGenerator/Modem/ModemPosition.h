// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/ModemSection.h"

namespace velmora {

/// "Position": where the modem is, as its receiver of satellites says.
class ModemPosition final : public ModemSectionOf<ModemPosition> {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Position"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void show(const Dictionary& message, FieldVisitor& visitor) const override;
    void describeShown(ContentVisitor& visitor) const override;
    [[nodiscard]] std::string stateOf(const Dictionary& message) const override;
};

} // namespace velmora
