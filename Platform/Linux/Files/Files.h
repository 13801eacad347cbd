// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"

#include <cstddef>
#include <filesystem>
#include <system_error>

namespace velmora {

/// The entire content of a file of at most `maximumBytes`. The reason does not name the file; it is to be
/// appended to "file: ".
Result<Data> readFile(const std::filesystem::path& path, std::size_t maximumBytes);

/// Writes all of it to an open file. The reason is as readFile's.
Result<Done> writeAll(int descriptor, Bytes content);

/// Creates the file, for its user alone, or overwrites its content in place: a concurrent reader sees part of
/// it, and a failure leaves it partly written. The reason is as readFile's.
Result<Done> writeFile(const std::filesystem::path& path, Bytes content);

/// Creates the directory, for its user alone, and those above it; nothing where it exists already.
[[nodiscard]] std::error_code makePrivateDirectory(const std::filesystem::path& path);

/// Creates the file, or atomically replaces it by a new one with the same permissions: a reader sees the old
/// or the new content, also after a failure. The reason is as readFile's.
Result<Done> replaceFile(const std::filesystem::path& path, Bytes content);

} // namespace velmora
