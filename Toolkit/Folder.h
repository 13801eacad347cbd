// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

namespace velmora {

/// Opens the directory in the user's file manager; false where the desktop has none. Returns before the file
/// manager is up. Needs the application.
[[nodiscard]] bool openFolder(std::string_view path);

/// Opens the page in the user's browser, as above.
[[nodiscard]] bool openPage(std::string_view path);

} // namespace velmora
