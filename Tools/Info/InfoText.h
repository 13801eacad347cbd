// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Info/FileInfo.h"

#include <string>

namespace velmora {

/// What a file holds, as `info` prints it for people. `reader`: read to its end.
[[nodiscard]] std::string infoText(const FileInfo& info, const MessageReader& reader);

} // namespace velmora
