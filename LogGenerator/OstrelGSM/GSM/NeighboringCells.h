// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/CellSection.h"

#include <cstdint>
#include <vector>

namespace velmora {

/// "Neighboring Cells": one row per GSM neighbour, from the baseband or from the telephony service, whichever
/// reported last.
class NeighboringCells final : public CellSection {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Neighboring Cells"; }
    [[nodiscard]] std::span<const View> views() const override;
    void updateWithData(const Data& data, std::uint32_t logCode) override;
    /// The BSICs.
    [[nodiscard]] Value memory() const override;
    void setMemory(const Value& memory) override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    [[nodiscard]] const CellTable& cellTable() const override;
    void trace() const override;
    void check(const View& view, const Record& record) const override;

    /// ARFCNs with their BSICs: the entries of the latest 0x51FF, unchanged. They are shown with the next
    /// 0x5137.
    std::vector<std::uint8_t> arfcnToBsic;
    std::vector<std::uint8_t> _bsicsOfCells; ///< those at the arrival of the kept 0x5137
};

} // namespace velmora
