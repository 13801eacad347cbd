// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Serving Cell Info": identity, frequencies and bandwidths of the LTE cell that serves the phone, from the
/// baseband and from the telephony service: of what both report, whichever came last is shown.
class LTEServingCellInfo final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Serving Cell Info"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override {
        return {0xB0C2, 0xB0C1, 0xFF0001};
    }
    void updateWithData(const Data& data, std::uint32_t logCode) override;

private:
    /// 0xB0C2: the cell as the baseband knows it.
    void showCell(const Record& record);
    /// 0xFF0001: the first serving LTE cell that the telephony service knows.
    void showServingCell(const Data& data);
};

} // namespace velmora
