// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/LogCodeParser.h"

namespace velmora::C2K {

/// The serving system: its identities, and whether the phone is roaming in it.
class SystemIdentification final : public LogCodeParser {
public:
    [[nodiscard]] std::uint16_t logCode() const override { return 0x134F; }
    [[nodiscard]] std::string_view name() const override { return "System identification"; }
    [[nodiscard]] std::optional<Reading> accept(const Record& record, Dictionary& state) const override;
    void decode(const Reading& reading, FieldVisitor& visitor) const override;
    void describe(ContentVisitor& visitor) const override;
};

} // namespace velmora::C2K
