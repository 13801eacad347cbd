// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskReport.h"

#include <string>
#include <string_view>

namespace velmora {

/// What was done to a file, a line for each class, without values.
[[nodiscard]] std::string reportText(std::string_view title, const MaskReport& report);
/// What masking would do to a file, a line for each class.
[[nodiscard]] std::string leftText(std::string_view title, const MaskReport& report);

} // namespace velmora
