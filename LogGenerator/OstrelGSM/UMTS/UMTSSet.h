// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

#include <vector>

namespace velmora {

/// "UMTS Set": the UMTS cells that are ranked for reselection, or the neighbours that the telephony service
/// knows, whichever were reported last; one row each.
class UMTSSet final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "UMTS Set"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0x4005, 0xFF0001}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;

private:
    /// 0x4005: the baseband's ranking.
    void showRankedCells(const Record& record);
    /// 0xFF0001: the neighbours that the telephony service knows.
    void showKnownCells(const Data& data);

    std::vector<std::uint8_t> _knownCells; ///< used again for each 0xFF0001
};

} // namespace velmora
