// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Info/FileInfo.h"

#include <string>

namespace velmora {

/// What a file holds, as an object that conforms to velmora-log-info.schema.json, indented and with a line
/// feed at its end. `file`: as it was named in the call. `reader`: read to its end.
[[nodiscard]] std::string infoJson(const std::string& file, const FileInfo& info,
                                   const MessageReader& reader);

} // namespace velmora
