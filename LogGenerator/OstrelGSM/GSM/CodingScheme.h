// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Coding Scheme": has no codes; it exists so that the display shows a section of this name.
class CodingScheme final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Coding Scheme"; }
    [[nodiscard]] std::span<const View> views() const override;

private:
    void trace() const override;
    void unknownCode(std::uint32_t logCode) const override;
};

} // namespace velmora
