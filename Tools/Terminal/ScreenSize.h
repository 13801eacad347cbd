// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>

namespace velmora {

/// A terminal's size, in characters.
struct ScreenSize {
    std::size_t columns = 80;
    std::size_t rows = 24;
};

} // namespace velmora
