// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <system_error>

namespace velmora {

/// The system's text for an errno value ("No such file or directory").
[[nodiscard]] inline std::string errnoText(int error) {
    return std::generic_category().message(error);
}

} // namespace velmora
