// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"

#include <cstddef>
#include <filesystem>

namespace velmora {

/// The whole content of a file of at most `maximumBytes`. The reason does not name the file; it is ready to
/// stand behind "file: ".
Result<Data> readFile(const std::filesystem::path& path, std::size_t maximumBytes);

/// Writes all of it to an open file. The reason is as readFile's.
Result<Done> writeAll(int descriptor, Bytes content);

/// Makes the file, or replaces its content, byte after byte: who reads it meanwhile sees part of it, and a
/// failure leaves what was written up to then. The reason is as readFile's.
Result<Done> writeFile(const std::filesystem::path& path, Bytes content);

/// Makes the file, or puts a new one with its permissions in its place, in one step: who reads it meanwhile
/// sees the old or the new content, and so does whoever comes after a failure. The reason is as readFile's.
Result<Done> replaceFile(const std::filesystem::path& path, Bytes content);

} // namespace velmora
