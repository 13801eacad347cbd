// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/LogCodeParser.h"

namespace velmora::C2K {

/// 1x status: device state, both receive chains, active set. Outside a traffic period it closes the average
/// of the frame error rate (see TrafficFER).
class OneXStatus final : public LogCodeParser {
public:
    [[nodiscard]] std::uint16_t logCode() const override { return 0x119C; }
    [[nodiscard]] std::string_view name() const override { return "1x status"; }
    [[nodiscard]] std::optional<Reading> accept(const Record& record, Dictionary& state) const override;
    void decode(const Reading& reading, FieldVisitor& visitor) const override;
    void describe(ContentVisitor& visitor) const override;
};

} // namespace velmora::C2K
