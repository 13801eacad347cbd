// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "BLER": the block error counts of the UMTS transport channels.
class BLER final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "BLER"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0x4116}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
