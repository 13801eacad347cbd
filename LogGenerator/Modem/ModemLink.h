// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/ModemSection.h"

namespace velmora {

/// "Link": access technologies, signal quality and every level, by radio technology.
class ModemLink final : public ModemSectionOf<ModemLink> {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Link"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void show(const Dictionary& message, FieldVisitor& visitor) const override;
    void describeShown(ContentVisitor& visitor) const override;
};

} // namespace velmora
