// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/ModemSection.h"

namespace velmora {

/// "Packet Data Contexts": the bearers with their addresses, a row each.
class ModemContexts final : public ModemSectionOf<ModemContexts> {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Packet Data Contexts"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void show(const Dictionary& message, FieldVisitor& visitor) const override;
    void describeShown(ContentVisitor& visitor) const override;
    [[nodiscard]] std::string stateOf(const Dictionary& message) const override;
};

} // namespace velmora
