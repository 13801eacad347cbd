// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace velmora {

/// Checks the JSON objects in the text against a schema of the project's resources, by its file name, with a
/// validator that others wrote. Returns how many there are, in a line; where one is wrong, "status" and the
/// checker's complaint.
[[nodiscard]] std::string checkJSON(const std::string& schema, const std::string& text);

} // namespace velmora
