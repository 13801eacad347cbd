// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "RRC Info": the state of the radio-resource control.
class RRC_State final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "RRC Info"; }
    [[nodiscard]] std::span<const View> views() const override;
    /// A record below 15 bytes is logged as a warning and decoded as well: what it lacks reads as version 0
    /// and as mode 255, which is unknown.
    void updateWithData(const Data& data, std::uint32_t logCode) override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    void trace() const override;
    void unknownCode(std::uint32_t logCode) const override;
    void check(const View& view, const Record& record) const override;
};

} // namespace velmora
