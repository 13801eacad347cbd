// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/LogCodeParser.h"

namespace velmora::C2K {

/// 1x traffic frame error rate: an average over the frames of a traffic period, kept in the state under
/// "TrafficFER" as a fraction.
class TrafficFER final : public LogCodeParser {
public:
    [[nodiscard]] std::uint16_t logCode() const override { return 0x119D; }
    [[nodiscard]] std::string_view name() const override { return "Traffic FER"; }
    [[nodiscard]] std::optional<Reading> accept(const Record& record, Dictionary& state) const override;
    void decode(const Reading& reading, FieldVisitor& visitor) const override;
    void describe(ContentVisitor& visitor) const override;
};

} // namespace velmora::C2K
