// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Non-Ranked UMTS Set": has no codes; it exists so that the display shows a section of this name.
class NonRankedUMTSSet final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Non-Ranked UMTS Set"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void trace() const override;
    void unknownCode(std::uint32_t logCode) const override;
};

} // namespace velmora
