// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Serving Cell Info": the serving cell's identity and access rights, from the baseband and from the
/// telephony service, whichever reported last.
class UTRANServingCellInfo final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Serving Cell Info"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0xD0E2, 0xFF0001}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;

private:
    /// 0xFF0001: every serving cell of the technology in turn, so that of several the last one stays. Where
    /// there are no cells nothing is done.
    void showServingCells(const Data& data) const;
};

} // namespace velmora
