// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>

namespace velmora {

/// A size for people: "512 bytes", "88 KiB", "3.4 MiB".
[[nodiscard]] std::string sizeText(std::uint64_t bytes);

} // namespace velmora
