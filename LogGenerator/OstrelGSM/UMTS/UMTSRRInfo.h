// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/CellSection.h"

namespace velmora {

/// "UMTS RR Info": the UMTS radio-resource state, the serving cell, transmit power and ciphering.
class UMTSRRInfo final : public CellSection {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "UMTS RR Info"; }
    [[nodiscard]] std::span<const View> views() const override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    [[nodiscard]] const CellTable& cellTable() const override;
    void trace() const override;
    void check(const View& view, const Record& record) const override;
};

} // namespace velmora
