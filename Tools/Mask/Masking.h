// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskReport.h"
#include "Export/Masking/Sealing/MaskSeal.h"
#include "Platform/Linux/Files/AtomicFile.h"
#include "Platform/Result.h"
#include "Recording/MessageReader.h"
#include "Tools/Mask/MaskCommandOptions.h"

#include <string>

namespace velmora {

struct MaskOptions;
class MessageMask;
class WorkContext;

/// Masks the messages of a reader into an open file of the form that the output's name has. Returns whether
/// all messages are in it, but for those that masking leaves out. `title`: of the input.
[[nodiscard]] Result<bool> maskMessages(MessageReader& reader, const MaskCommandOptions& options,
                                        MessageMask& mask, const std::string& title, const AtomicFile& file,
                                        WorkContext& context);

} // namespace velmora
