// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Neighbor Cell List": one row per UTRAN cell that the phone measures. (The class keeps the baseband's own
/// spelling.)
class UTRANNeighbhorMeasurements final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Neighbor Cell List"; }
    [[nodiscard]] std::span<const View> views() const override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    void trace() const override;
    void unknownCode(std::uint32_t logCode) const override;
    void check(const View& view, const Record& record) const override;
};

} // namespace velmora
