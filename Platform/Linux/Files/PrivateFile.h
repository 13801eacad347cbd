// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"

#include <cstddef>
#include <string>

namespace velmora {

/// The content of a file that only its owner may be able to read: fails for one that others can. Fails too
/// for one of more than `longest` bytes. The reason names the file.
[[nodiscard]] Result<Data> readPrivateFile(const std::string& path, std::size_t longest);

} // namespace velmora
