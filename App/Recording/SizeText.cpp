// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Recording/SizeText.h"

#include <array>
#include <cstdio>

namespace velmora {

std::string sizeText(std::uint64_t bytes) {
    constexpr std::uint64_t unit = 1024;
    if (bytes < unit)
        return std::to_string(bytes) + (bytes == 1 ? " byte" : " bytes");
    if (bytes < unit * unit)
        return std::to_string(bytes / unit) + " KiB";
    const bool isLarge = bytes >= unit * unit * unit;
    const auto scale = static_cast<double>(isLarge ? unit * unit * unit : unit * unit);
    std::array<char, 32> text{};
    std::snprintf(text.data(), text.size(), "%.1f %s", static_cast<double>(bytes) / scale,
                  isLarge ? "GiB" : "MiB");
    return text.data();
}

} // namespace velmora
