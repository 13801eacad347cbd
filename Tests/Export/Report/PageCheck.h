// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace velmora {

/// The first error of a report's page as HTML; empty for none. A page has the elements and attributes
/// that our own markup has and no others, nested, two scripts, and JSON in the first.
[[nodiscard]] std::string problemOfPage(std::string_view page);
/// The same of a text as JSON.
[[nodiscard]] bool isJSON(std::string_view text);

} // namespace velmora
