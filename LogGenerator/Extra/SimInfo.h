// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"
#include "LogGenerator/Extra/ExtraPayload.h"

namespace velmora {

/// "SIM Info": the SIM's elementary files, with the texts of the telephony service. Shared by the
/// technologies.
class SimInfo final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "SIM Info"; }
    [[nodiscard]] std::span<const View> views() const override;
    /// An unreadable payload raises LogCode_0xFF0000::UnknownDataException, which ends the program.
    void updateWithData(const Data& data, std::uint32_t logCode) override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;
    void describe(const View& view, ContentVisitor& visitor) const override;

private:
    void trace() const override;

    PayloadCache _payloads;
    Value _files; ///< of the record that is kept
};

} // namespace velmora
