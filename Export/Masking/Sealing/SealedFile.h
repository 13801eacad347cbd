// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Sealing/MaskSeal.h"
#include "Platform/Result.h"
#include "PropertyLists/Value.h"
#include "Recording/Files/ChunkedInput.h"

#include <optional>
#include <string>

namespace velmora {

/// The seal of a file of log messages, gzip'd or not, if it has one and the file is as it was when it got it.
/// All of the file is read.
[[nodiscard]] std::optional<MaskSeal> readSeal(ChunkedInput input);

/// Makes the seal, with the digest, the description of a snapshot.
[[nodiscard]] Result<Done> sealSnapshot(const Value& root, MaskSeal seal);
/// The digest of a snapshot: of all but its description.
[[nodiscard]] Result<std::string> digestOfSnapshot(const Value& root);
/// The digest of a DLF log: of all after its version report.
[[nodiscard]] std::string digestOfLog(ChunkedInput input);

} // namespace velmora
