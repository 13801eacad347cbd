// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Neighboring Cells": one row per GSM neighbour, from the baseband or from the telephony service, whichever
/// reported last.
class NeighboringCells final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Neighboring Cells"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override {
        return {0x5137, 0x51FF, 0xFF0001};
    }
    void updateWithData(const Data& data, std::uint32_t logCode) override;

private:
    /// 0x5137: the neighbours that the baseband measures.
    void showMeasuredCells(const Record& record);
    /// 0x51FF: the BSICs. The rows that are shown stay as they are; the next 0x5137 shows them.
    void keepBSICs(const Record& record);
    /// 0xFF0001: the neighbours that the telephony service knows.
    void showKnownCells(const Data& data);

    /// ARFCNs with their BSICs: the entries of the latest 0x51FF as they stand there.
    std::vector<std::uint8_t> arfcnToBsic;
    std::vector<std::uint8_t> _measuredCells; ///< used again for each 0x5137
    std::vector<std::uint8_t> _knownCells;    ///< used again for each 0xFF0001
};

} // namespace velmora
