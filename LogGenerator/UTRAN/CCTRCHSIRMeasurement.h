// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "CCTRCH SIR": one row per coded composite transport channel with its signal-to-interference ratios. It
/// reads the records of "TRCH BLER", after that section.
class CCTRCHSIRMeasurement final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "CCTRCH SIR"; }
    [[nodiscard]] std::span<const View> views() const override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    void trace() const override;
    void unknownCode(std::uint32_t logCode) const override;
    void check(const View& view, const Record& record) const override;
};

} // namespace velmora
