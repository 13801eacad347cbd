// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "Recording/Pcapng/PcapngReader.h"
#include "Tools/Convert/Conversion.h"

namespace velmora {

/// Makes a recording of a recording, in an open file, which the caller owns: what is not known here is kept.
[[nodiscard]] Result<bool> convertRecording(PcapngReader& reader, const Conversion& conversion,
                                            int descriptor);

} // namespace velmora
