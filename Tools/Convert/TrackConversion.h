// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "Recording/MessageReader.h"
#include "Tools/Convert/Conversion.h"

namespace velmora {

class WorkContext;

/// Writes a file's track with its attributes and events to an open file, which the caller owns. Returns
/// whether all messages could be decoded. Fails where the file has no positions.
[[nodiscard]] Result<bool> convertToTrack(MessageReader& reader, const Conversion& conversion, int descriptor,
                                          WorkContext& context);

} // namespace velmora
