// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Mobile Allocation": the hopping sequence number and the channels that are hopped over.
class MobileAllocation final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Mobile Allocation"; }
    [[nodiscard]] std::span<const View> views() const override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;

private:
    void trace() const override;
    void check(const View& view, const Record& record) const override;
};

} // namespace velmora
