// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

namespace velmora {

/// The page's own files, from Resources/report/; the build makes their source.
extern const std::string_view pageScript;
extern const std::string_view pageStyle;

} // namespace velmora
