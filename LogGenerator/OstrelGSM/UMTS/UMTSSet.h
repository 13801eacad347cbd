// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/CellSection.h"

#include <vector>

namespace velmora {

/// "UMTS Set": the UMTS cells that are ranked for reselection, or the neighbours that the telephony service
/// reports, whichever arrived last; one row each.
class UMTSSet final : public CellSection {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "UMTS Set"; }
    [[nodiscard]] std::span<const View> views() const override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    [[nodiscard]] const CellTable& cellTable() const override;
    void trace() const override;
    void check(const View& view, const Record& record) const override;
};

} // namespace velmora
