// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "TRCH BLER": one row per transport channel with its block error measurement.
class TRCHBLERMeasurement final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "TRCH BLER"; }
    [[nodiscard]] std::span<const View> views() const override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    void trace() const override;
    void unknownCode(std::uint32_t logCode) const override;
    void check(const View& view, const Record& record) const override;
};

} // namespace velmora
