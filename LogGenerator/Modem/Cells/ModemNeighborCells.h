// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/ModemSection.h"

namespace velmora {

/// "Neighbor Cells": the neighbours of any radio technology, by falling level.
class ModemNeighborCells final : public ModemSectionOf<ModemNeighborCells> {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Neighbor Cells"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void show(const Dictionary& message, FieldVisitor& visitor) const override;
    void describeShown(ContentVisitor& visitor) const override;
    [[nodiscard]] std::string stateOf(const Dictionary& message) const override;
    [[nodiscard]] bool reportsErrors() const override { return false; }
};

} // namespace velmora
