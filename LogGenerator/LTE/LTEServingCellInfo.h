// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/CellSection.h"

namespace velmora {

/// "Serving Cell Info": identity, frequencies and bandwidths of the LTE cell that serves the phone, from the
/// baseband and from the telephony service: of what both report, whichever came last is shown.
class LTEServingCellInfo final : public CellSection {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Serving Cell Info"; }
    [[nodiscard]] std::span<const View> views() const override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    [[nodiscard]] const CellTable& cellTable() const override;
    void trace() const override;
    void check(const View& view, const Record& record) const override;
};

} // namespace velmora
