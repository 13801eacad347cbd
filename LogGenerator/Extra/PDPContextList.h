// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"
#include "LogGenerator/Extra/ExtraPayload.h"

namespace velmora {

/// "PDP Context Info": the active packet-data contexts, one row each, with the texts of the telephony
/// service. Shared by the technologies.
class PDPContextList final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "PDP Context Info"; }
    [[nodiscard]] std::span<const View> views() const override;
    void updateWithData(const Data& data, std::uint32_t logCode) override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    void trace() const override;

    PayloadCache _payloads;
    Value _contexts; ///< of the record that is kept: an array
};

} // namespace velmora
