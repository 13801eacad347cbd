// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace velmora {

/// The text with U+FFFD for each byte that is no UTF-8, which readers of columns refuse; the text itself
/// where there is none. `storage` holds what is changed.
[[nodiscard]] std::string_view validText(std::string_view text, std::string& storage);

} // namespace velmora
