// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "GSM Neighbor Cell List": empty after every record. The rows of the measured GSM cells are made and then
/// discarded, as intended: the list does not show them. (The class keeps the baseband's own spelling.)
class GSMNeighbhorMeasurements final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "GSM Neighbor Cell List"; }
    [[nodiscard]] std::span<const View> views() const override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

    /// Names the rows of a 0xD00E record, one per GSM cell, which the section does not show. Precondition:
    /// the record has 17 bytes.
    static void visitNeighbours(const Record& record, FieldVisitor& visitor);

private:
    void trace() const override;
    void unknownCode(std::uint32_t logCode) const override;
    void check(const View& view, const Record& record) const override;
};

} // namespace velmora
