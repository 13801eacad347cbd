// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/ModemSection.h"

namespace velmora {

/// "Secondary Cell": the second serving cell: that of NR in 5G non-standalone.
class ModemSecondaryCell final : public ModemSectionOf<ModemSecondaryCell> {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Secondary Cell"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void show(const Dictionary& message, FieldVisitor& visitor) const override;
    void describeShown(ContentVisitor& visitor) const override;
    [[nodiscard]] std::string stateOf(const Dictionary& message) const override;
    [[nodiscard]] bool reportsErrors() const override { return false; }
};

} // namespace velmora
