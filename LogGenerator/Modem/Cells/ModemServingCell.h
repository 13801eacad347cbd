// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/ModemSection.h"

namespace velmora {

/// "Serving Cell": the first serving cell, whatever its radio technology.
class ModemServingCell final : public ModemSectionOf<ModemServingCell> {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Serving Cell"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void show(const Dictionary& message, FieldVisitor& visitor) const override;
    void describeShown(ContentVisitor& visitor) const override;
    [[nodiscard]] std::string stateOf(const Dictionary& message) const override;
    void checkMessage(const Dictionary& message) const override;
};

} // namespace velmora
