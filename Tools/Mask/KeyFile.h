// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskKey.h"
#include "Platform/Result.h"

#include <string>

namespace velmora {

/// The key in a file, which only its owner may be able to read. The reason names the file.
[[nodiscard]] Result<MaskKey> readKeyFile(const std::string& path);

/// The key in that file, or a random one where there is no name.
[[nodiscard]] Result<MaskKey> keyFor(const std::string& path);

/// Makes a file with a random key, for its user alone. Fails where the file exists. The reason names it.
[[nodiscard]] Result<Done> makeKeyFile(const std::string& path);

} // namespace velmora
