// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "Recording/MessageReader.h"
#include "Tools/Convert/Conversion.h"

namespace velmora {

class WorkContext;

/// Writes what a file's messages report to an SQLite database, with its events and positions. Returns whether
/// all messages could be decoded. Memory does not grow with the file.
[[nodiscard]] Result<bool> convertToDatabase(MessageReader& reader, const Conversion& conversion,
                                             WorkContext& context);

} // namespace velmora
