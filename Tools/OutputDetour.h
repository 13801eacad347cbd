// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

namespace velmora {

/// Keeps what may not be written to an output yet, since others write to it first.
class OutputDetour {
public:
    virtual ~OutputDetour() = default;

    /// Takes text that is about to be written; returns the rest that may be written now. May wait for that.
    [[nodiscard]] virtual std::string_view take(std::string_view text) = 0;
    /// Whether all others have ended.
    [[nodiscard]] virtual bool isFirst() = 0;
};

} // namespace velmora
