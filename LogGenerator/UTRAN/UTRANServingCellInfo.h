// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/CellSection.h"

namespace velmora {

/// "Serving Cell Info": the serving cell's identity and access rights, from the baseband and from the
/// telephony service, whichever reported last.
class UTRANServingCellInfo final : public CellSection {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Serving Cell Info"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    [[nodiscard]] const CellTable& cellTable() const override;
    void trace() const override;
    void unknownCode(std::uint32_t logCode) const override;
    void noCells() const override;
};

} // namespace velmora
